#pragma once
// A short history of the data files the program writes at exit (price lists
// and categories): before a file is written over, the older one is copied
// here, dated, so a list lost through a file that could not be read at
// start-up (reading stops there, and the exit then writes empty lists) can be
// brought back.
#include <QDateTime>
#include <QList>
#include <QString>
#include <QStringList>

namespace arbolex::shell {

/// One kept copy of a data file.
struct KeptCopy {
    /// Name of the data file it is a copy of ("CURPRIC.qdm").
    QString fileName;
    /// When it was kept.
    QDateTime keptAt;
    /// Size, bytes.
    qint64 size = 0;
    /// Path of the copy.
    QString path;
};

class DataHistory {
public:
    /// Copies kept of each data file.
    static constexpr int kCopiesKept = 10;

    /// The history of the user whose data location is `userFolder`.
    static QString folderIn(const QString &userFolder);

    explicit DataHistory(QString folder);

    const QString &folder() const { return m_folder; }

    /// Keeps a dated copy of `path` unless it does not exist or equals the
    /// newest copy of the same name; then leaves the newest kCopiesKept copies
    /// of that name. Returns false with `error` set when the copy failed.
    bool keep(const QString &path, QString *error = nullptr) const;

    /// Every copy, newest first.
    QList<KeptCopy> copies() const;

    /// Puts `copy` back into `dataFolder` in place of the file of its name,
    /// which is kept first, so a restore can itself be undone. Returns false
    /// with `error` set when it could not.
    bool restore(const KeptCopy &copy, const QString &dataFolder, QString &error) const;

private:
    QList<KeptCopy> copiesOf(const QString &fileName) const;

    QString m_folder;
};

} // namespace arbolex::shell
