// An estate run: results in input order and identical whatever the number of
// threads, shards that together are the whole, and a run that can be stopped.
#include "estate/estaterun.hpp"

#include "estate/resulttable.hpp"
#include "estatefixture.hpp"

#include <gtest/gtest.h>

#include <cstdio>

namespace arbolex::estate {
namespace {

using testing::sitkaRow;
using testing::with;

/// A value made of a number ("S%d").
std::string text(const char *format, int n) {
    char buffer[32];
    std::snprintf(buffer, sizeof buffer, format, n);
    return buffer;
}

/// Rows of several models, ages and regimes, every seventh one bad.
class TestEstate : public IRowSource {
public:
    explicit TestEstate(int rows) : m_rows(rows) {}

    bool next(EstateRow &row) override {
        if (m_next == m_rows) {
            return false;
        }
        const int i = m_next++;
        row.line = i + 2;
        RowValues values = with(sitkaRow(), "id", text("S%d", i));
        values = with(values, "model", std::to_string(std::array{0, 2, 4, 8, 10, 16}[i % 6]));
        values = with(values, "age", std::to_string(15 + i % 6));
        values = with(values, "top_height", std::to_string(7 + i % 5));
        values = with(values, "area_ha", text("%d.5", 1 + i % 4));
        if (i % 3 == 0) {
            values = with(values, "rotation", std::to_string(45 + i % 9));
        }
        if (i % 7 == 3) {
            values = with(values, "stocking", "lots");
        }
        row.values = values;
        return true;
    }

private:
    int m_rows;
    int m_next = 0;
};

/// The results table as text.
class TableSink : public IRowSink {
public:
    explicit TableSink(const Layout &layout) : m_layout(layout) {}

    void write(const EstateRow &row, const RowResult &result) override {
        resultValues(m_layout, row.line, row.values, result, m_values);
        std::string line;
        for (const std::string &v : m_values) {
            line += v + ",";
        }
        lines.push_back(line);
    }

    std::vector<std::string> lines;

private:
    const Layout &m_layout;
    std::vector<std::string> m_values;
};

class EstateRunTest : public ::testing::Test {
protected:
    struct Run {
        RunSummary summary;
        std::vector<std::string> lines;
    };

    Run run(int rows, const RunSettings &settings, const EstateProgress &progress = {}) {
        TestEstate source(rows);
        TableSink sink(m_layout);
        RunSummary summary = runEstate(source, sink, m_layout, m_defaults, settings, progress);
        return {std::move(summary), std::move(sink.lines)};
    }

    Layout m_layout = testing::testLayout();
    EstateDefaults m_defaults = testing::testDefaults();
};

TEST_F(EstateRunTest, GivesTheSameResultsInInputOrderWhateverTheThreads) {
    const Run one = run(200, {1, 0, 1, 16});
    const Run three = run(200, {3, 0, 1, 5});
    ASSERT_EQ(one.lines.size(), 200U);
    EXPECT_EQ(three.lines, one.lines);
    EXPECT_EQ(three.summary.forecast, one.summary.forecast);
    EXPECT_EQ(three.summary.refused, one.summary.refused);
    EXPECT_EQ(three.summary.failed, one.summary.failed);
    // Every seventh row from the fourth has no stocking.
    for (std::size_t i = 3; i < one.lines.size(); i += 7) {
        EXPECT_NE(one.lines[i].find(",refused,"), std::string::npos) << one.lines[i];
    }
    EXPECT_EQ(one.lines[3].substr(0, 6), "5,S3,F");
    EXPECT_GE(one.summary.refused + one.summary.failed, 29);
    EXPECT_FALSE(one.summary.forecast.lines(2026).empty());
}

TEST_F(EstateRunTest, ShardsTogetherAreTheWholeEstateAndTheirForecastsAddUp) {
    const Run whole = run(100, {2, 0, 1, 8});
    Forecast merged;
    std::vector<std::string> lines;
    for (int k = 0; k < 3; ++k) {
        const Run part = run(100, {2, k, 3, 8});
        merged.add(part.summary.forecast);
        for (std::size_t i = 0; i < part.lines.size(); ++i) {
            // Row k, k + 3, k + 6, ... of the whole.
            EXPECT_EQ(part.lines[i], whole.lines[3 * i + static_cast<std::size_t>(k)]);
        }
        lines.insert(lines.end(), part.lines.begin(), part.lines.end());
    }
    EXPECT_EQ(lines.size(), whole.lines.size());
    EXPECT_EQ(merged, whole.summary.forecast);

    // Read back from its table, a forecast adds up just the same.
    Forecast reread;
    for (const Forecast::Line &l : whole.summary.forecast.lines(2026)) {
        const auto back = forecastLine(forecastValues(l));
        ASSERT_TRUE(back.has_value());
        reread.add(back->year, back->species, back->totals, back->withCarbon);
    }
    EXPECT_EQ(reread, whole.summary.forecast);
}

TEST_F(EstateRunTest, StopsWhenTheProgressSaysSo) {
    for (const int threads : {1, 2}) {
        long long seen = 0;
        const Run stopped = run(400, {threads, 0, 1, 10}, [&](long long done) {
            seen = done;
            return done < 30;
        });
        EXPECT_TRUE(stopped.summary.cancelled);
        EXPECT_EQ(stopped.lines.size(), 30U);
        EXPECT_EQ(seen, 30);
    }
}

} // namespace
} // namespace arbolex::estate
