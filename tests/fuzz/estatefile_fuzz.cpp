// An estate file as `arbolex-cli estate` reads it: written as a CSV file,
// opened through GDAL, its rows grown on two threads and the results,
// forecast and errors written to a scratch folder.
#include "estateio/estatefiles.hpp"
#include "scratchfolder.hpp"

using namespace arbolex;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QString folder = fuzz::scratchFolder();
    const QString path = fuzz::writeFile(folder, "estate.csv", fuzz::inputBytes(data, size));
    estateio::EstateJob job;
    job.input = path.toStdString();
    job.outFolder = (folder + QStringLiteral("/out")).toStdString();
    job.defaults.regime = {20, 5, 40.0f, std::nullopt};
    job.defaults.economics.ratePercent = 3.0;
    job.defaults.year = 2026;
    job.settings.threads = 2;
    job.settings.chunkRows = 4;
    estateio::EstateCallbacks callbacks;
    // A long input is cut short: the reader is what is fuzzed, not the engine.
    callbacks.progress = [](long long done, long long) {
        return done < 64;
    };
    try {
        (void)estateio::runEstateFiles(job, callbacks);
    } catch (const estateio::GdalError &) {
    }
    return 0;
}
