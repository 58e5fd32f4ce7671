#pragma once

// A headless session and its script runner, for the runner's tests.

#include "cli/scriptrunner.hpp"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::testing {

/// A young Sitka spruce stand typed into the main window: 15 years,
/// 2500 stems/ha, 7 m, 20 m²/ha.
constexpr const char *kYoungStand =
    "model 0\nset txtFromA 15\nset txtFromN 2500\nset txtFromH 7\nset txtFromB 20\n";

class RunnerTest : public ::testing::Test {
protected:
    /// Runs `lines` against a fresh session; returns what it printed.
    cli::ScriptRunner::Outcome run(const QStringList &lines) {
        outcome = runner.run(lines);
        out.flush();
        return outcome;
    }
    /// Runs a script given as one text, its lines split at line ends.
    cli::ScriptRunner::Outcome runScript(const QString &script) {
        return run(script.split(QLatin1Char('\n')));
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
