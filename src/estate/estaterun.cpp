#include "estate/estaterun.hpp"

#include "engine/vectorstate.hpp"
#include "estate/rowevaluator.hpp"

#include <condition_variable>
#include <deque>
#include <mutex>
#include <thread>
#include <vector>

namespace arbolex::estate {

namespace {

struct Chunk {
    std::vector<EstateRow> rows;
    std::vector<RowResult> results;
    bool done = false;
};

/// Reads up to `settings.chunkRows` rows of this run's share.
class ShareReader {
public:
    ShareReader(IRowSource &source, const RunSettings &settings)
        : m_source(source), m_settings(settings) {}

    /// False when the input has no more rows of the share.
    bool fill(Chunk &chunk) {
        while (chunk.rows.size() < m_settings.chunkRows) {
            EstateRow row;
            if (!m_source.next(row)) {
                break;
            }
            const long long ordinal = m_read++;
            if (ordinal % m_settings.shardCount == m_settings.shardIndex) {
                chunk.rows.push_back(std::move(row));
            }
        }
        return !chunk.rows.empty();
    }

private:
    IRowSource &m_source;
    const RunSettings &m_settings;
    long long m_read = 0;
};

void evaluate(RowEvaluator &evaluator, const IRowSink &sink, Chunk &chunk) {
    // The source and the sink (a GIS library) ran on this thread since the
    // last chunk, on the caller's thread.
    engine::clearUpperVectorState();
    chunk.results.clear();
    chunk.results.reserve(chunk.rows.size());
    for (const EstateRow &row : chunk.rows) {
        chunk.results.push_back(evaluator.evaluate(row.values));
        sink.prepare(row, chunk.results.back());
    }
}

/// Hands a finished chunk to the sink and counts it; false to stop.
class Delivery {
public:
    Delivery(IRowSink &sink, RunSummary &summary, const EstateProgress &progress)
        : m_sink(sink), m_summary(summary), m_progress(progress) {}

    bool operator()(const Chunk &chunk) {
        // Writing formats every figure; the source's library ran just before.
        engine::clearUpperVectorState();
        for (std::size_t i = 0; i < chunk.rows.size(); ++i) {
            const RowResult &r = chunk.results[i];
            m_sink.write(chunk.rows[i], r);
            ++m_summary.rows;
            m_summary.refused += r.status == RowStatus::kRefused ? 1 : 0;
            m_summary.failed += r.status == RowStatus::kFailed ? 1 : 0;
            m_summary.forecast.add(r);
        }
        if (m_progress && !m_progress(m_summary.rows)) {
            m_summary.cancelled = true;
            return false;
        }
        return true;
    }

private:
    IRowSink &m_sink;
    RunSummary &m_summary;
    const EstateProgress &m_progress;
};

/// Worker threads that evaluate chunks in any order; the caller reads,
/// queues and delivers them in order.
class Pool {
public:
    Pool(int threads, const Layout &layout, const EstateDefaults &defaults, const IRowSink &sink) {
        for (int t = 0; t < threads; ++t) {
            m_threads.emplace_back([this, &layout, &defaults, &sink] {
                // A thread starts with the vector state of the thread that
                // started it, which a library may have left dirty.
                engine::clearUpperVectorState();
                work(layout, defaults, sink);
            });
        }
    }
    Pool(const Pool &) = delete;
    Pool &operator=(const Pool &) = delete;
    ~Pool() {
        {
            const std::lock_guard lock(m_mutex);
            m_stopping = true;
            // A run stopped early leaves its queued chunks unread.
            m_pending.clear();
        }
        m_workReady.notify_all();
        for (std::thread &t : m_threads) {
            t.join();
        }
    }

    void submit(std::shared_ptr<Chunk> chunk) {
        {
            const std::lock_guard lock(m_mutex);
            m_pending.push_back(std::move(chunk));
        }
        m_workReady.notify_one();
    }

    void waitFor(const Chunk &chunk) {
        std::unique_lock lock(m_mutex);
        m_chunkDone.wait(lock, [&] { return chunk.done; });
    }

private:
    void work(const Layout &layout, const EstateDefaults &defaults, const IRowSink &sink) {
        RowEvaluator evaluator(layout, defaults);
        while (true) {
            std::shared_ptr<Chunk> chunk;
            {
                std::unique_lock lock(m_mutex);
                m_workReady.wait(lock, [&] { return m_stopping || !m_pending.empty(); });
                if (m_pending.empty()) {
                    return;
                }
                chunk = std::move(m_pending.front());
                m_pending.pop_front();
            }
            evaluate(evaluator, sink, *chunk);
            {
                const std::lock_guard lock(m_mutex);
                chunk->done = true;
            }
            m_chunkDone.notify_all();
        }
    }

    std::mutex m_mutex;
    std::condition_variable m_workReady;
    std::condition_variable m_chunkDone;
    std::deque<std::shared_ptr<Chunk>> m_pending;
    bool m_stopping = false;
    std::vector<std::thread> m_threads;
};

/// Chunks queued per thread: enough that no thread waits for the reader,
/// few enough that memory stays flat.
constexpr std::size_t kChunksPerThread = 4;

} // namespace

RunSummary runEstate(IRowSource &source, IRowSink &sink, const Layout &layout,
                     const EstateDefaults &defaults, const RunSettings &settings,
                     const EstateProgress &progress) {
    engine::clearUpperVectorState();
    RunSummary summary;
    ShareReader reader(source, settings);
    Delivery deliver(sink, summary, progress);
    if (settings.threads <= 1) {
        RowEvaluator evaluator(layout, defaults);
        Chunk chunk;
        while (reader.fill(chunk)) {
            evaluate(evaluator, sink, chunk);
            if (!deliver(chunk)) {
                break;
            }
            chunk.rows.clear();
        }
        return summary;
    }
    Pool pool(settings.threads, layout, defaults, sink);
    std::deque<std::shared_ptr<Chunk>> inOrder;
    const std::size_t limit = kChunksPerThread * static_cast<std::size_t>(settings.threads);
    bool more = true;
    while (more || !inOrder.empty()) {
        while (more && inOrder.size() < limit) {
            auto chunk = std::make_shared<Chunk>();
            more = reader.fill(*chunk);
            if (more) {
                inOrder.push_back(chunk);
                pool.submit(std::move(chunk));
            }
        }
        if (inOrder.empty()) {
            break;
        }
        pool.waitFor(*inOrder.front());
        if (!deliver(*inOrder.front())) {
            break;
        }
        inOrder.pop_front();
    }
    return summary;
}

} // namespace arbolex::estate
