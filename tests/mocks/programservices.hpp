#pragma once

// What every window of the program is given, for tests: a temporary data
// folder with its error log, scripted message boxes, the engine reporting
// through them, and the price lists.

#include "mocks/fakeinteractive.hpp"

#include "engine/grow.hpp"
#include "prices/prices.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

namespace arbolex::testing {

/// Copies the shipped data files into `folder`; true when all were copied.
inline bool copyShippedData(const QString &folder) {
    const QDir source(QStringLiteral(ARBOLEX_DATA_SOURCE));
    bool copied = true;
    for (const QString &name : source.entryList(QDir::Files)) {
        copied = QFile::copy(source.filePath(name), QDir(folder).filePath(name)) && copied;
    }
    return copied;
}

struct ProgramServices {
    QTemporaryDir dir;
    shell::ErrorLog log{dir.path()};
    FakeInteractive interactive;
    shell::EngineReport report{interactive, log};
    engine::Grow grow{&report};
    prices::Prices prices;
};

} // namespace arbolex::testing
