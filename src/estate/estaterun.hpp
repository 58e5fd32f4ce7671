#pragma once

// An estate run: rows from a source, each grown and valued by a pool of
// threads, results handed to a sink in input order whatever the number of
// threads. Only a few chunks of rows are ever held, so memory does not grow
// with the estate. The window and the command-line program both run an
// estate through here.

#include "estate/forecast.hpp"
#include "estate/layout.hpp"
#include "estate/rowplan.hpp"
#include "estate/rowresult.hpp"

#include <functional>
#include <memory>

namespace arbolex::estate {

/// A row of the input.
struct EstateRow {
    /// Line of the row: for a table with a header, the header is line 1; for
    /// a layer, the feature's position from 1.
    long long line = 0;
    RowValues values;
    /// What the source keeps of the row for its sink (a GIS layer's geometry).
    std::shared_ptr<void> extra;
};

class IRowSource {
public:
    virtual ~IRowSource() = default;
    /// The next row; false at the end of the input.
    virtual bool next(EstateRow &row) = 0;
};

class IRowSink {
public:
    virtual ~IRowSink() = default;
    /// Called once for every row, on the thread that grew it, in any order
    /// and on several threads at once: may fill `result.prepared`.
    virtual void prepare(const EstateRow & /*row*/, RowResult & /*result*/) const {}
    /// Called once for every row, in input order.
    virtual void write(const EstateRow &row, const RowResult &result) = 0;
};

struct RunSettings {
    /// Threads that grow rows; 1 grows them on the caller's thread.
    int threads = 1;
    /// This run's share of the rows: every shardCount-th row from the
    /// shardIndex-th (0-based).
    int shardIndex = 0;
    int shardCount = 1;
    /// Rows handed to a thread at a time.
    std::size_t chunkRows = 256;
};

/// Rows done so far; returns false to stop the run.
using EstateProgress = std::function<bool(long long rowsDone)>;

struct RunSummary {
    long long rows = 0;
    long long refused = 0;
    long long failed = 0;
    bool cancelled = false;
    Forecast forecast;
};

/// Runs every row of `source` in this run's share through the rotation and
/// hands it to `sink`. An exception of the source or the sink stops the run
/// (the threads end first) and is passed on.
RunSummary runEstate(IRowSource &source, IRowSink &sink, const Layout &layout,
                     const EstateDefaults &defaults, const RunSettings &settings,
                     const EstateProgress &progress = {});

} // namespace arbolex::estate
