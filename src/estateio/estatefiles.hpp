#pragma once

// An estate from a file to a folder of results: the input read through GDAL,
// every row grown and valued, and subcompartments.csv, forecast.csv,
// errors.csv (or .tsv, or .json) and, for a GIS layer, subcompartments.gpkg
// written.

#include "estate/estaterun.hpp"
#include "estate/tablefile.hpp"
#include "estateio/gdallayer.hpp"

#include <functional>
#include <string>

namespace arbolex::estateio {

/// The result tables' names, before the format's ending.
inline constexpr const char *kResultsTable = "subcompartments";
inline constexpr const char *kForecastTable = "forecast";
inline constexpr const char *kErrorsTable = "errors";
inline constexpr const char *kResultsLayerFile = "subcompartments.gpkg";

/// The file name of a result table in a format ("forecast.tsv").
std::string resultFileName(const char *table, estate::TableFormat format);

struct EstateJob {
    /// The input: a CSV file with a header row or any vector layer GDAL reads.
    std::string input;
    /// Its layer; empty for the first.
    std::string layer;
    /// Folder of the results (created when missing).
    std::string outFolder;
    estate::EstateDefaults defaults;
    estate::RunSettings settings;
    /// Format of the result tables.
    estate::TableFormat format = estate::TableFormat::kCsv;
    /// For JSON, the members that open the document of a table with
    /// `columns` (its run record and units), rendered by the caller.
    std::function<std::string(const std::vector<estate::ResultColumn> &columns)> jsonMembers;
};

/// What a run tells its caller besides the result files.
struct EstateCallbacks {
    /// Rows done so far and the rows of the input (-1 when not known);
    /// returns false to stop.
    std::function<bool(long long rowsDone, long long rowsInInput)> progress;
    /// An engine failure line, for the error log.
    std::function<void(const std::string &line)> failureLine;
};

/// Runs the estate. Throws GdalError when the input cannot be read at all
/// (a missing file, a missing column) or a result cannot be written; a bad
/// row never throws: it is counted, listed in errors.csv and marked in the
/// results.
estate::RunSummary runEstateFiles(const EstateJob &job, const EstateCallbacks &callbacks = {});

} // namespace arbolex::estateio
