#include "shell/datahistory.hpp"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSaveFile>

#include <algorithm>
#include <utility>

namespace arbolex::shell {

namespace {

// A copy is named after its file and the moment it was kept, to the
// millisecond so that two exits in one second keep two copies:
// "CURPRIC.qdm@20261123-025510-123".
constexpr QChar kSeparator = QLatin1Char('@');
const QString kStampFormat = QStringLiteral("yyyyMMdd-HHmmss-zzz");

QByteArray contents(const QString &path) {
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

bool copyFile(const QString &from, const QString &to, QString &error) {
    QFile source(from);
    if (!source.open(QIODevice::ReadOnly)) {
        error = source.errorString();
        return false;
    }
    QSaveFile target(to);
    if (!target.open(QIODevice::WriteOnly) || target.write(source.readAll()) < 0 ||
        !target.commit()) {
        error = target.errorString();
        return false;
    }
    return true;
}

} // namespace

QString DataHistory::folderIn(const QString &userFolder) {
    return QDir(userFolder).filePath(QStringLiteral("history"));
}

DataHistory::DataHistory(QString folder) : m_folder(std::move(folder)) {}

QList<KeptCopy> DataHistory::copies() const {
    QList<KeptCopy> all;
    const QFileInfoList entries = QDir(m_folder).entryInfoList(QDir::Files, QDir::Name);
    for (const QFileInfo &entry : entries) {
        const QString name = entry.fileName();
        const qsizetype at = name.lastIndexOf(kSeparator);
        if (at <= 0) {
            continue;
        }
        const QDateTime keptAt = QDateTime::fromString(name.mid(at + 1), kStampFormat);
        if (!keptAt.isValid()) {
            continue;
        }
        all.append({name.left(at), keptAt, entry.size(), entry.absoluteFilePath()});
    }
    std::stable_sort(all.begin(), all.end(),
                     [](const KeptCopy &a, const KeptCopy &b) { return a.keptAt > b.keptAt; });
    return all;
}

QList<KeptCopy> DataHistory::copiesOf(const QString &fileName) const {
    QList<KeptCopy> same = copies();
    same.removeIf([&](const KeptCopy &copy) { return copy.fileName != fileName; });
    return same;
}

bool DataHistory::keep(const QString &path, QString *error) const {
    const QFileInfo file(path);
    if (!file.exists()) {
        return true;
    }
    QList<KeptCopy> kept = copiesOf(file.fileName());
    if (!kept.isEmpty() && contents(kept.front().path) == contents(path)) {
        return true;
    }
    QString why;
    if (!QDir().mkpath(m_folder)) {
        why = QStringLiteral("cannot create ") + m_folder;
    } else {
        QDateTime now = QDateTime::currentDateTime();
        if (!kept.isEmpty() && now <= kept.front().keptAt) {
            now = kept.front().keptAt.addMSecs(1); // the newest copy stays the newest
        }
        const QString name = file.fileName() + kSeparator + now.toString(kStampFormat);
        if (copyFile(path, QDir(m_folder).filePath(name), why)) {
            kept = copiesOf(file.fileName());
            for (qsizetype i = kCopiesKept; i < kept.size(); ++i) {
                QFile::remove(kept[i].path);
            }
            return true;
        }
    }
    if (error != nullptr) {
        *error = why;
    }
    return false;
}

bool DataHistory::restore(const KeptCopy &copy, const QString &dataFolder, QString &error) const {
    const QString target = QDir(dataFolder).filePath(copy.fileName);
    if (!keep(target, &error)) {
        return false;
    }
    return copyFile(copy.path, target, error);
}

} // namespace arbolex::shell
