#pragma once

// Runs the command-line program as a user runs it, on a data folder of its own.

#include <QProcess>
#include <QProcessEnvironment>
#include <QString>
#include <QStringList>

#include <gtest/gtest.h>

namespace arbolex::cli::testing {

struct Outcome {
    int exitCode = -1;
    QStringList out; ///< stdout lines
    QString err;
};

/// Runs arbolex-cli with `arguments` and `--data-dir dataFolder`.
inline Outcome runCli(QStringList arguments, const QString &dataFolder) {
    arguments << QStringLiteral("--data-dir") << dataFolder;
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.remove(QStringLiteral("ARBOLEX_DATA_DIR"));
    process.setProcessEnvironment(environment);
    process.start(QStringLiteral(ARBOLEX_CLI_PATH), arguments);
    EXPECT_TRUE(process.waitForFinished(30000)) << "arbolex-cli did not finish";
    Outcome r;
    r.exitCode = process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1;
    r.out = QString::fromUtf8(process.readAllStandardOutput())
                .split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    r.err = QString::fromUtf8(process.readAllStandardError());
    return r;
}

} // namespace arbolex::cli::testing
