#include "estateio/estatefiles.hpp"

#include <filesystem>

namespace arbolex::estateio {

namespace {

/// Writes each row's results and lists the rows that were not grown.
class FileSink : public estate::IRowSink {
public:
    FileSink(const estate::Layout &layout, const std::string &folder, const LayerReader &reader,
             const EstateCallbacks &callbacks)
        : m_layout(layout), m_callbacks(callbacks),
          m_results(folder + "/" + kResultsFile, estate::resultColumns(layout)),
          m_errors(folder + "/" + kErrorsFile, textColumns(estate::errorColumns())) {
        if (!reader.isTable()) {
            const TableWriter::Geometry geometry{reader.spatialReference(), reader.geometryType()};
            m_layerResults = std::make_unique<TableWriter>(
                folder + "/" + kResultsLayerFile, estate::resultColumns(layout), &geometry);
        }
    }

    void write(const estate::EstateRow &row, const estate::RowResult &result) override {
        estate::resultValues(m_layout, row.line, row.values, result, m_values);
        m_results.write(m_values);
        if (m_layerResults) {
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
    static std::vector<estate::ResultColumn> textColumns(const std::vector<std::string> &names) {
        std::vector<estate::ResultColumn> columns;
        for (const std::string &n : names) {
            columns.push_back({n, estate::ColumnType::kText});
        }
        return columns;
    }

    const estate::Layout &m_layout;
    const EstateCallbacks &m_callbacks;
    TableWriter m_results;
    TableWriter m_errors;
    std::unique_ptr<TableWriter> m_layerResults;
    std::vector<std::string> m_values;
};

void writeForecast(const std::string &path, const estate::Forecast &forecast, int firstYear) {
    std::vector<estate::ResultColumn> columns;
    for (const std::string &n : estate::forecastColumns()) {
        columns.push_back({n, estate::ColumnType::kText});
    }
    TableWriter table(path, columns);
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
    FileSink sink(*layout, job.outFolder, reader, callbacks);
    const long long inputRows = reader.rowCount();
    estate::EstateProgress progress;
    if (callbacks.progress) {
        progress = [&](long long done) {
            return callbacks.progress(done, inputRows);
        };
    }
    estate::RunSummary summary =
        estate::runEstate(reader, sink, *layout, job.defaults, job.settings, progress);
    sink.close();
    writeForecast(job.outFolder + "/" + kForecastFile, summary.forecast, job.defaults.year);
    return summary;
}

} // namespace arbolex::estateio
