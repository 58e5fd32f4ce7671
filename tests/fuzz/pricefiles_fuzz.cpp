// GetPricesFromFiles over the five price and category files, cut from one
// input at form feeds (\f) in reading order: "CURPRIC.qdm", "OVRA_PRIC.qdm",
// "USRPRIC.qdm", "AvPRIC_npv.qdm", "UD_Assort.qdm". A part the input does not
// reach is a missing file.
//
// Beyond not crashing: what was read, written back by the exit's writers and
// read again, must come back the same.
#include "prices/pricedata.hpp"
#include "scratchfolder.hpp"
#include "shell/errorlog.hpp"

#include <array>
#include <cstdlib>

namespace {

using namespace arbolex;
using prices::PriceData;

constexpr std::array kFiles = {prices::kCurrentPricesFile, prices::kPrivatePricesFile,
                               prices::kUserPricesFile, prices::kAveragePricesFile,
                               prices::kUserAssortmentsFile};

void writeParts(const QString &folder, const QList<QByteArray> &parts) {
    for (std::size_t i = 0; i < kFiles.size(); ++i) {
        if (i < static_cast<std::size_t>(parts.size())) {
            fuzz::writeFile(folder, kFiles[i], parts[static_cast<qsizetype>(i)]);
        } else {
            QFile::remove(QDir(folder).filePath(QLatin1String(kFiles[i])));
        }
    }
}

PriceData read(const QString &folder) {
    PriceData data;
    shell::ErrorLog log(fuzz::nowhere());
    prices::GetPricesFromFiles(folder, data, log);
    return data;
}

/// A name holding a double quote cannot be written back quoted: the format
/// has no escape for it.
bool namesSurvive(const PriceData &data) {
    for (const prices::UserCategory &c : data.categories) {
        if (c.name.contains(QLatin1Char('"'))) {
            return false;
        }
    }
    return true;
}

void requireSame(const PriceData &a, const PriceData &b) {
    bool same = a.current == b.current && a.userDefined == b.userDefined &&
                a.longTermAverage == b.longTermAverage;
    for (std::size_t i = 0; i < a.categories.size(); ++i) {
        same = same && a.categories[i].name == b.categories[i].name &&
               a.categories[i].smallEnd == b.categories[i].smallEnd &&
               a.categories[i].bigEnd == b.categories[i].bigEnd;
    }
    if (!same) {
        qFatal("price data written at exit does not read back the same");
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QString folder = fuzz::scratchFolder();
    const QList<QByteArray> parts = fuzz::inputBytes(data, size).split('\f');
    writeParts(folder, parts);
    const PriceData first = read(folder);
    if (!namesSurvive(first)) {
        return 0;
    }
    // The exit writes three price lists and the categories; the private-sector
    // file is never written, so it stays as the input gave it.
    shell::ErrorLog log(fuzz::nowhere());
    prices::WritePricesInFiles(prices::kWriteAllPrices, folder, first, log);
    prices::WriteUserDefinedAssortmentsInFile(folder, first, log);
    requireSame(first, read(folder));
    return 0;
}
