#pragma once

// The readers read files, so every input of a harness is first written to a
// file of a scratch folder: one folder per process, removed when it ends, in
// memory (/dev/shm) where the system has it, as a disk would slow every run.

#include <QByteArray>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QString>
#include <QTemporaryDir>

#include <cstddef>
#include <cstdint>

namespace arbolex::fuzz {

/// The scratch folder of this process.
inline QString scratchFolder() {
    static const QTemporaryDir folder(QFileInfo(QStringLiteral("/dev/shm")).isWritable()
                                          ? QStringLiteral("/dev/shm/arbolex-fuzz-XXXXXX")
                                          : QDir::tempPath() +
                                                QStringLiteral("/arbolex-fuzz-XXXXXX"));
    return folder.path();
}

/// A folder that does not exist, for an error log that loses its lines: a
/// harness meets thousands of failures a second.
inline QString nowhere() {
    return QDir(scratchFolder()).filePath(QStringLiteral("no-such-folder"));
}

/// The fuzzer's input as bytes (no copy).
inline QByteArray inputBytes(const std::uint8_t *data, std::size_t size) {
    return QByteArray::fromRawData(reinterpret_cast<const char *>(data),
                                   static_cast<qsizetype>(size));
}

/// Writes `bytes` as `name` in `folder` and returns the file's path.
inline QString writeFile(const QString &folder, const char *name, const QByteArray &bytes) {
    const QString path = QDir(folder).filePath(QLatin1String(name));
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate) ||
        file.write(bytes) != bytes.size()) {
        qFatal("cannot write the scratch file %s", qPrintable(path));
    }
    return path;
}

} // namespace arbolex::fuzz
