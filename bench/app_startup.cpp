// The desktop program from launch to its main window on screen (offscreen,
// introduction skipped), as a whole process.
#include <QDir>
#include <QFile>
#include <QProcess>
#include <QProcessEnvironment>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

namespace {

void BM_DesktopStartToMainWindow(benchmark::State &state) {
    const QString program = QStringLiteral(ARBOLEX_BIN_DIR "/arbolex");
    if (!QFile::exists(program)) {
        state.SkipWithError("the desktop program was not built");
        return;
    }
    QTemporaryDir dir;
    const QDir data(QStringLiteral(ARBOLEX_BIN_DIR));
    for (const QString &name : data.entryList({QStringLiteral("*.qdm"), QStringLiteral("*.dat")})) {
        QFile::copy(data.filePath(name), dir.filePath(name));
    }
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    environment.insert(QStringLiteral("XDG_CONFIG_HOME"), dir.filePath(QStringLiteral("config")));
    for (auto _ : state) {
        QProcess p;
        p.setProcessEnvironment(environment);
        p.start(program, {QStringLiteral("--no-intro"), QStringLiteral("--quit-when-shown"),
                          QStringLiteral("--data-dir"), dir.path()});
        if (!p.waitForFinished(10000) || p.exitCode() != 0) {
            state.SkipWithError("the desktop program failed to start");
            break;
        }
    }
}
BENCHMARK(BM_DesktopStartToMainWindow)->Unit(benchmark::kMillisecond)->Iterations(10);

} // namespace
