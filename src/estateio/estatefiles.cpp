#include "estateio/estatefiles.hpp"

#include "estate/csvfile.hpp"

#include <filesystem>

namespace arbolex::estateio {

namespace {

/// A result table of the job in its folder and format.
estate::ResultFile resultFile(const EstateJob &job, const char *table,
                              std::vector<estate::ResultColumn> columns) {
    const std::string members = job.format == estate::TableFormat::kJson && job.jsonMembers
                                    ? job.jsonMembers(columns)
                                    : std::string();
    return {job.outFolder + "/" + resultFileName(table, job.format), job.format, std::move(columns),
            members};
}

/// Writes each row's results and lists the rows that were not grown.
class FileSink : public estate::IRowSink {
public:
    FileSink(const estate::Layout &layout, const EstateJob &job, const LayerReader &reader,
             const EstateCallbacks &callbacks)
        : m_layout(layout), m_callbacks(callbacks),
          m_results(resultFile(job, kResultsTable, estate::resultColumns(layout))),
          m_errors(resultFile(job, kErrorsTable, estate::errorColumns())) {
        if (!reader.isTable()) {
            const TableWriter::Geometry geometry{reader.spatialReference(), reader.geometryType()};
            m_layerResults = std::make_unique<TableWriter>(job.outFolder + "/" + kResultsLayerFile,
                                                           estate::resultColumns(layout), geometry);
        }
    }

    void prepare(const estate::EstateRow &row, estate::RowResult &result) const override {
        // One vector of values per thread, its room kept from row to row.
        thread_local std::vector<std::string> values;
        estate::resultValues(m_layout, row.line, row.values, result, values);
        result.prepared = m_results.line(values);
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
    estate::ResultFile m_results;
    estate::ResultFile m_errors;
    std::unique_ptr<TableWriter> m_layerResults;
    std::vector<std::string> m_values;
};

void writeForecast(const EstateJob &job, const estate::Forecast &forecast) {
    estate::ResultFile table = resultFile(job, kForecastTable, estate::forecastColumns());
    for (const estate::Forecast::Line &line : forecast.lines(job.defaults.year)) {
        table.write(estate::forecastValues(line));
    }
    table.close();
}

} // namespace

std::string resultFileName(const char *table, estate::TableFormat format) {
    return std::string(table) + '.' + estate::fileExtension(format);
}

estate::RunSummary runEstateFiles(const EstateJob &job, const EstateCallbacks &callbacks) {
    LayerReader reader(job.input, job.layer, true);
    std::string problem;
    const std::optional<estate::Layout> layout = layoutOf(reader, problem);
    if (!layout) {
        throw GdalError("\"" + job.input + "\": " + problem);
    }
    std::error_code made;
    std::filesystem::create_directories(job.outFolder, made);
    if (made) {
        throw GdalError("cannot create the folder \"" + job.outFolder + "\": " + made.message());
    }
    try {
        FileSink sink(*layout, job, reader, callbacks);
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
        writeForecast(job, summary.forecast);
        return summary;
    } catch (const estate::CsvFileError &error) {
        throw GdalError(error.what());
    }
}

} // namespace arbolex::estateio
