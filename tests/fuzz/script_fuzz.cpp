// The runner's script reader: the main window's load over the shipped data,
// then the lines of the input, as `arbolex-cli run` does (without the
// unload, so that the data folder stays as shipped for the next input).
#include "cli/scriptrunner.hpp"
#include "scratchfolder.hpp"

#include <QDirIterator>

using namespace arbolex;

namespace {

/// A copy of the shipped data folder, made once.
QString dataFolder() {
    static const QString folder = [] {
        const QString path = QDir(fuzz::scratchFolder()).filePath(QStringLiteral("data"));
        QDir().mkpath(path);
        QDirIterator shipped(QStringLiteral(ARBOLEX_DATA_SOURCE), QDir::Files);
        while (shipped.hasNext()) {
            shipped.next();
            QFile::copy(shipped.filePath(), QDir(path).filePath(shipped.fileName()));
        }
        return path;
    }();
    return folder;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QString folder = dataFolder();
    QString printed;
    QTextStream out(&printed);
    {
        cli::HeadlessSession session(folder, out);
        QSettings settings(QDir(fuzz::scratchFolder()).filePath(QStringLiteral("settings.ini")),
                           QSettings::IniFormat);
        (void)cli::runScriptText(fuzz::inputBytes(data, size), session, settings, out);
    }
    QFile::remove(QDir(folder).filePath(QStringLiteral("ErrorLog.txt")));
    return 0;
}
