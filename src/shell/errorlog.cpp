#include "shell/errorlog.hpp"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QLocale>

namespace arbolex::shell {

ErrorLog::ErrorLog(const QString &dataFolder)
    : m_path(QDir(dataFolder).filePath(QStringLiteral("ErrorLog.txt"))) {}

void ErrorLog::append(const QString &message) {
    const QDateTime now = QDateTime::currentDateTime();
    const QLocale locale = QLocale::system();
    const QString line = message + QLatin1Char(' ') +
                         locale.toString(now.date(), QLocale::ShortFormat) + QLatin1Char(' ') +
                         now.time().toString(QStringLiteral("HH:mm:ss")) + QStringLiteral("\r\n");
    QFile file(m_path);
    if (file.open(QIODevice::WriteOnly | QIODevice::Append)) {
        file.write(line.toUtf8());
    }
}

} // namespace arbolex::shell
