#pragma once

#include "engine/grow.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <string>
#include <string_view>
#include <vector>

namespace arbolex::engine::testing {

/// Collects what the engine reports. A test that does not expect a report
/// fails when one arrives: call take() to consume the expected ones.
class RecordingReport : public IEngineReport {
public:
    struct Message {
        std::string title;
        std::string text;
        int style = 0;
    };

    void showMessage(std::string_view title, std::string_view text, int style) override {
        messages.push_back({std::string(title), std::string(text), style});
    }
    void logError(std::string_view message) override { logLines.emplace_back(message); }

    void clear() {
        messages.clear();
        logLines.clear();
    }

    /// Expects this message and no other, then clears what was reported.
    void take(std::string_view title, std::string_view text, int style) {
        ASSERT_EQ(messages.size(), 1u);
        EXPECT_EQ(messages[0].title, title);
        EXPECT_EQ(messages[0].text, text);
        EXPECT_EQ(messages[0].style, style);
        clear();
    }

    std::vector<Message> messages;
    std::vector<std::string> logLines;
};

/// Fixture with an engine whose every report fails the test unless the test
/// looked at it and cleared it.
class EngineTest : public ::testing::Test {
protected:
    void TearDown() override {
        for (const auto &m : report.messages) {
            ADD_FAILURE() << "unexpected message: " << m.title << " / " << m.text;
        }
        for (const auto &l : report.logLines) {
            ADD_FAILURE() << "unexpected log line: " << l;
        }
    }

    RecordingReport report;
    Grow grow{&report};
};

/// Relative closeness for values that honestly carry rounding.
inline ::testing::AssertionResult nearRel(double expected, double actual, double rel) {
    const double scale = std::max(std::fabs(expected), 1e-30);
    if (std::fabs(expected - actual) <= rel * scale) {
        return ::testing::AssertionSuccess();
    }
    return ::testing::AssertionFailure()
           << actual << " differs from " << expected << " by more than " << rel << " relative";
}

} // namespace arbolex::engine::testing
