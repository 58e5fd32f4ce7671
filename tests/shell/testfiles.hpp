#pragma once

// Small file helpers shared by the shell and economics tests.

#include <QDate>
#include <QDir>
#include <QFile>
#include <QLocale>
#include <QRegularExpression>
#include <QStringList>

namespace arbolex::testing {

/// Writes `bytes` as the whole file; false when it could not.
inline bool writeBytes(const QString &path, const QByteArray &bytes) {
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size();
}

inline QByteArray readBytes(const QString &path) {
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

/// The messages of the error log in `folder`, without their date and time.
inline QStringList logMessages(const QString &folder) {
    // The date is in the user's short format, which may itself hold blanks.
    const QString today = QLocale::system().toString(QDate::currentDate(), QLocale::ShortFormat);
    const QRegularExpression stamp(QLatin1Char(' ') + QRegularExpression::escape(today) +
                                   QLatin1String(" \\d\\d:\\d\\d:\\d\\d$"));
    QStringList messages;
    const QString text =
        QString::fromUtf8(readBytes(QDir(folder).filePath(QStringLiteral("ErrorLog.txt"))));
    for (QString line : text.split(QStringLiteral("\r\n"), Qt::SkipEmptyParts)) {
        messages.append(line.remove(stamp));
    }
    return messages;
}

} // namespace arbolex::testing
