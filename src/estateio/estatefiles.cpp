#include "estateio/estatefiles.hpp"

#include "estate/csvfile.hpp"

#include <filesystem>

namespace arbolex::estateio {

namespace {

std::vector<std::string> names(const std::vector<estate::ResultColumn> &columns) {
    std::vector<std::string> out;
    out.reserve(columns.size());
    for (const estate::ResultColumn &c : columns) {
        out.push_back(c.name);
    }
    return out;
}

/// Writes each row's results and lists the rows that were not grown.
class FileSink : public estate::IRowSink {
public:
    FileSink(const estate::Layout &layout, const std::string &folder, const LayerReader &reader,
             const EstateCallbacks &callbacks)
        : m_layout(layout), m_callbacks(callbacks),
          m_results(folder + "/" + kResultsFile, names(estate::resultColumns(layout))),
          m_errors(folder + "/" + kErrorsFile, estate::errorColumns()) {
        if (!reader.isTable()) {
            const TableWriter::Geometry geometry{reader.spatialReference(), reader.geometryType()};
            m_layerResults = std::make_unique<TableWriter>(folder + "/" + kResultsLayerFile,
                                                           estate::resultColumns(layout), geometry);
        }
    }

    void prepare(const estate::EstateRow &row, estate::RowResult &result) const override {
        std::vector<std::string> values;
        estate::resultValues(m_layout, row.line, row.values, result, values);
        result.prepared = estate::csvLine(values);
    }

    void write(const estate::EstateRow &row, const estate::RowResult &result) override {
        m_results.writeLine(result.prepared);
        if (m_layerResults) {
            estate::resultValues(m_layout, row.line, row.values, result, m_values);
            m_layerResults->write(m_values, row.extra.get());
        }
        if (result.status != estate::RowStatus::kOk) {
            m_errors.write(
                {std::to_string(row.line), estate::rowId(m_layout, row.values), result.message});
        }
        if (m_callbacks.failureLine) {
            for (const std::string &line : result.logLines) {
                m_callbacks.failureLine(line);
            }
        }
    }

    void close() {
        m_results.close();
        m_errors.close();
        if (m_layerResults) {
            m_layerResults->close();
        }
    }

private:
    const estate::Layout &m_layout;
    const EstateCallbacks &m_callbacks;
    estate::CsvFile m_results;
    estate::CsvFile m_errors;
    std::unique_ptr<TableWriter> m_layerResults;
    std::vector<std::string> m_values;
};

void writeForecast(const std::string &path, const estate::Forecast &forecast, int firstYear) {
    estate::CsvFile table(path, estate::forecastColumns());
    for (const estate::Forecast::Line &line : forecast.lines(firstYear)) {
        table.write(estate::forecastValues(line));
    }
    table.close();
}

} // namespace

estate::RunSummary runEstateFiles(const EstateJob &job, const EstateCallbacks &callbacks) {
    LayerReader reader(job.input, job.layer, true);
    std::string problem;
    const std::optional<estate::Layout> layout = estate::layoutOf(reader.columnNames(), problem);
    if (!layout) {
        throw GdalError("\"" + job.input + "\": " + problem);
    }
    std::error_code made;
    std::filesystem::create_directories(job.outFolder, made);
    if (made) {
        throw GdalError("cannot create the folder \"" + job.outFolder + "\": " + made.message());
    }
    try {
        FileSink sink(*layout, job.outFolder, reader, callbacks);
        estate::EstateProgress progress;
        if (callbacks.progress) {
            // Counting the rows costs a pass over the input: only for a progress line.
            progress = [&callbacks, inputRows = reader.rowCount()](long long done) {
                return callbacks.progress(done, inputRows);
            };
        }
        estate::RunSummary summary =
            estate::runEstate(reader, sink, *layout, job.defaults, job.settings, progress);
        sink.close();
        writeForecast(job.outFolder + "/" + kForecastFile, summary.forecast, job.defaults.year);
        return summary;
    } catch (const estate::CsvFileError &error) {
        throw GdalError(error.what());
    }
}

} // namespace arbolex::estateio
