#pragma once

// An estate from a file to a folder of results: the input read through GDAL,
// every row grown and valued, and subcompartments.csv, forecast.csv,
// errors.csv (and, for a GIS layer, subcompartments.gpkg) written.

#include "estate/estaterun.hpp"
#include "estateio/gdallayer.hpp"

#include <functional>
#include <string>

namespace arbolex::estateio {

inline constexpr const char *kResultsFile = "subcompartments.csv";
inline constexpr const char *kResultsLayerFile = "subcompartments.gpkg";
inline constexpr const char *kForecastFile = "forecast.csv";
inline constexpr const char *kErrorsFile = "errors.csv";

struct EstateJob {
    /// The input: a CSV file with a header row or any vector layer GDAL reads.
    std::string input;
    /// Its layer; empty for the first.
    std::string layer;
    /// Folder of the results (created when missing).
    std::string outFolder;
    estate::EstateDefaults defaults;
    estate::RunSettings settings;
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
