#pragma once

// A headless session and its script runner, for the runner's tests.

#include "cli/scriptrunner.hpp"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::testing {

class RunnerTest : public ::testing::Test {
protected:
    /// Runs `lines` against a fresh session; returns what it printed.
    cli::ScriptRunner::Outcome run(const QStringList &lines) {
        outcome = runner.run(lines);
        out.flush();
        return outcome;
    }
    QStringList printed() const { return output.split(QLatin1Char('\n'), Qt::SkipEmptyParts); }

    QTemporaryDir dir;
    QString output;
    QTextStream out{&output};
    cli::HeadlessSession session{dir.path(), out};
    cli::ScriptRunner runner{session, out};
    cli::ScriptRunner::Outcome outcome;
};

} // namespace arbolex::testing
