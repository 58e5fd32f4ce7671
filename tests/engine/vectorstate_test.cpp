// Every batch of numeric work runs from a clean vector state, whatever ran
// before it: the upper halves of the vector registers are left in use (as Qt's
// string hash leaves them), a batch is entered, and the processor's own record
// of the state in use (XINUSE) is read inside the batch where it calls out, or
// as it returns. Skipped where the processor cannot show the state.
#include "engine/grow.hpp"
#include "engine/vectorprobe.hpp"
#include "engine/vectorstate.hpp"
#include "estate/estatefixture.hpp"
#include "estate/estaterun.hpp"
#include "rotation/optimiser.hpp"
#include "rotation/uncertainty.hpp"
#include "valuation/forestvalue.hpp"

#include <gtest/gtest.h>

#include <atomic>
#include <cctype>
#include <functional>
#include <ostream>
#include <string>
#include <vector>

namespace arbolex::engine {
namespace {

constexpr rotation::Stand kSitka{0, 15.0f, 2500.0f, 7.0f, 20.0f};

/// Dirty, if the processor can tell: "in use" after a 256-bit instruction.
bool dirty() {
    dirtyUpperVectorState();
    return upperVectorStateInUse().value_or(false);
}

class VectorStateTest : public ::testing::Test {
protected:
    void SetUp() override {
        if (const char *why = testing::whyStateCannotBeSeen()) {
            GTEST_SKIP() << why;
        }
    }

    /// True when the state is in use now; counts it in `m_dirtyInside`.
    bool probe() {
        const bool inUse = *upperVectorStateInUse();
        m_dirtyInside += inUse ? 1 : 0;
        return inUse;
    }

    rotation::Economics money() const { return estate::testing::testDefaults().economics; }

    std::atomic<int> m_dirtyInside{0};
};

/// Entries that do their whole batch before they return: the state is read as
/// they return, before anything else can run.
struct Entry {
    const char *name;
    std::function<void()> run;
};

void PrintTo(const Entry &entry, std::ostream *out) {
    *out << entry.name;
}

class VectorStateEntryTest : public VectorStateTest, public ::testing::WithParamInterface<Entry> {};

TEST_P(VectorStateEntryTest, ReturnsWithTheStateCleanAfterAHashDirtiedIt) {
    const std::function<void()> &run = GetParam().run;
    ASSERT_TRUE(dirty());
    run();
    const bool inUse = probe();
    EXPECT_FALSE(inUse) << GetParam().name << " ran its batch with the upper state in use";
}

rotation::GrowthPath grownPath() {
    Grow grow;
    rotation::GrowthFailure failure;
    return rotation::growPath(grow, kSitka, {20, 5, 40.0f, 35}, failure).value();
}

INSTANTIATE_TEST_SUITE_P(
    Batches, VectorStateEntryTest,
    ::testing::Values(Entry{"Grow::PROJ",
                            [] {
                                Grow grow;
                                grow.GetModel(0);
                                grow.SiteIndex(15.0f, 7.0f);
                                grow.TM(grow.siteIndex());
                                std::vector<StandState> states;
                                // Dirty again between the set-up and the projection, as a
                                // window's formatting may.
                                dirtyUpperVectorState();
                                grow.PROJ(15.0f, 20.0f, 2500.0f, 7.0f, 60.0f, 1.0f, states);
                            }},
                      Entry{"Grow::NEWTON",
                            [] {
                                Grow grow;
                                grow.GetModel(0);
                                float nr = 0.0f;
                                float gr = 0.0f;
                                dirtyUpperVectorState();
                                grow.NEWTON(2500.0f, 30.0f, 12.0f, 100.0f, nr, gr);
                            }},
                      Entry{"rotation::growPath",
                            [] {
                                Grow grow;
                                rotation::GrowthFailure failure;
                                rotation::growPath(grow, kSitka, {20, 5, 40.0f, 35}, failure);
                            }},
                      Entry{"rotation::valueRotation",
                            [] {
                                const rotation::GrowthPath path = grownPath();
                                dirtyUpperVectorState();
                                rotation::valueRotation(path, 48,
                                                        estate::testing::testDefaults().economics);
                            }},
                      Entry{"rotation::monteCarlo",
                            [] {
                                const rotation::GrowthPath path = grownPath();
                                rotation::MonteCarloSettings settings;
                                settings.draws = 50;
                                dirtyUpperVectorState();
                                rotation::monteCarlo(
                                    path, 48, estate::testing::testDefaults().economics, settings);
                            }},
                      Entry{"valuation::internalRateOfReturn",
                            [] {
                                const std::vector<double> flows = {-1500.0, -20.0, -20.0, 4000.0};
                                dirtyUpperVectorState();
                                valuation::internalRateOfReturn(flows);
                            }}),
    [](const ::testing::TestParamInfo<Entry> &entry) {
        std::string name;
        for (const char *c = entry.param.name; *c != '\0'; ++c) {
            if (std::isalnum(static_cast<unsigned char>(*c)) != 0) {
                name += *c;
            }
        }
        return name;
    });

TEST_F(VectorStateTest, TheOptimiserSearchesCleanEvenAfterItsProgressCallbackDirtiesTheState) {
    Grow grow;
    rotation::OptimiserSettings settings;
    settings.thinFrom = {18, 22};
    settings.thinEvery = {5};
    settings.thinVolume = {40.0f};
    settings.refine = false;
    rotation::GrowthFailure failure;
    int calls = 0;
    ASSERT_TRUE(dirty());
    // Inside the search: each call reads the state the search ran in, then
    // dirties it as a progress bar of a window would.
    const auto result =
        rotation::optimise(grow, kSitka, money(), settings, failure, [this, &calls](double) {
            probe();
            ++calls;
            dirtyUpperVectorState();
            return true;
        });
    ASSERT_TRUE(result.has_value()) << failure.text;
    EXPECT_GE(calls, 2);
    EXPECT_EQ(m_dirtyInside, 0);
}

/// Rows enough for several chunks on every thread.
class ManyRows : public estate::IRowSource {
public:
    bool next(estate::EstateRow &row) override {
        if (m_next == 40) {
            return false;
        }
        row.line = ++m_next + 1;
        row.values = estate::testing::with(estate::testing::sitkaRow(), "age",
                                           std::to_string(15 + m_next % 5));
        return true;
    }

private:
    int m_next = 0;
};

/// Reads the state on the thread that grew each row, just after it grew it,
/// and dirties it again as a sink built on another library may.
class ProbingSink : public estate::IRowSink {
public:
    explicit ProbingSink(const std::function<void()> &probe) : m_probe(probe) {}
    void prepare(const estate::EstateRow & /*row*/, estate::RowResult &result) const override {
        m_probe();
        dirtyUpperVectorState();
        result.prepared = "probed";
    }
    void write(const estate::EstateRow & /*row*/, const estate::RowResult &result) override {
        m_written += result.prepared == "probed" ? 1 : 0;
        dirtyUpperVectorState();
    }
    int written() const { return m_written; }

private:
    const std::function<void()> &m_probe;
    int m_written = 0;
};

TEST_F(VectorStateTest, EstateRowsGrowCleanOnTheCallersThreadAndOnWorkersStartedDirty) {
    const estate::Layout layout = estate::testing::testLayout();
    const estate::EstateDefaults defaults = estate::testing::testDefaults();
    const std::function<void()> probeRow = [this] {
        probe();
    };
    for (const int threads : {1, 2}) {
        SCOPED_TRACE(threads);
        m_dirtyInside = 0;
        ManyRows source;
        ProbingSink sink(probeRow);
        estate::RunSettings settings;
        settings.threads = threads;
        settings.chunkRows = 4;
        // Workers are started from this thread, dirty.
        ASSERT_TRUE(dirty());
        estate::runEstate(source, sink, layout, defaults, settings);
        EXPECT_EQ(sink.written(), 40);
        EXPECT_EQ(m_dirtyInside, 0);
    }
}

} // namespace
} // namespace arbolex::engine
