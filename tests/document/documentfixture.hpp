#pragma once

// Two headless sessions of the program over one data folder, driven by the
// runner's script lines, for saving in one and opening in the other.

#include "mocks/programservices.hpp"

#include "cli/scriptrunner.hpp"
#include "document/document.hpp"

#include <QDir>
#include <QFile>
#include <QSettings>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <memory>

namespace arbolex::testing {

/// One run of the program without a screen, loaded from `folder`.
struct ScriptedSession {
    explicit ScriptedSession(const QString &dataFolder)
        : folder(dataFolder),
          settings(QDir(folder).filePath(QStringLiteral("settings.ini")), QSettings::IniFormat) {
        session.main().Form_Load(settings, QRect(0, 0, 1280, 800));
        runner = std::make_unique<cli::ScriptRunner>(session, out);
    }
    /// Runs script lines; fails the test at a wrong line.
    void run(const QString &script) {
        const cli::ScriptRunner::Outcome outcome = runner->run(script.split(u'\n'));
        EXPECT_TRUE(outcome.ok()) << outcome.line << ": " << outcome.error.toStdString();
        out.flush();
    }
    document::Document work() { return session.work().snapshot(); }

    QString folder;
    QString output;
    QTextStream out{&output};
    QSettings settings;
    cli::HeadlessSession session{folder, out};
    std::unique_ptr<cli::ScriptRunner> runner;
};

class DocumentTest : public ::testing::Test {
protected:
    DocumentTest() { copyShippedData(dir.path()); }

    std::unique_ptr<ScriptedSession> newSession() {
        return std::make_unique<ScriptedSession>(dir.path());
    }
    QString file(const QString &name) const { return QDir(dir.path()).filePath(name); }
    QByteArray bytes(const QString &path) const {
        QFile f(path);
        return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
    }

    QTemporaryDir dir;
};

/// Same work and the same place in the table.
inline void expectSameDocument(const document::Document &a, const document::Document &b) {
    EXPECT_TRUE(a.sameWork(b));
    EXPECT_EQ(a.currentRow, b.currentRow);
    EXPECT_EQ(a.selectionEnd, b.selectionEnd);
    ASSERT_EQ(a.rows.size(), b.rows.size());
    for (std::size_t r = 0; r < a.rows.size(); ++r) {
        EXPECT_EQ(a.rows[r].cells, b.rows[r].cells) << "row " << r + 1;
    }
}

} // namespace arbolex::testing
