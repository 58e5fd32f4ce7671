#pragma once

#include <QString>

namespace arbolex::shell {

/// The error log: one line per failure ("message date time", CR LF), appended
/// to "ErrorLog.txt" in the data folder and never truncated. It is meant to be
/// sent back by users; the program never reads it.
class ErrorLog {
public:
    /// Log in `dataFolder`/ErrorLog.txt.
    explicit ErrorLog(const QString &dataFolder);

    /// Appends `message`, a blank, the short date, a blank and the time.
    /// Writing is attempted once; a log that cannot be written loses the line.
    void append(const QString &message);

    QString path() const { return m_path; }

private:
    QString m_path;
};

} // namespace arbolex::shell
