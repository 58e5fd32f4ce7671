#pragma once

// "--name value" options of a subcommand, read strictly: an unknown option, a
// missing value, a stray word or a value that is not a number stops the
// command with exit status 2 and says what is wrong.

#include <QHash>
#include <QString>
#include <QStringList>

#include <initializer_list>
#include <vector>

namespace arbolex::cli {

/// A command line the program cannot run; `text` says why.
struct UsageError {
    QString text;
};

class Options {
public:
    /// Reads `arguments` as "--name value" pairs among the `known` names
    /// (written without the leading dashes); "--data-dir" is known to every
    /// command. Throws UsageError.
    Options(const QStringList &arguments, const std::vector<const char *> &known);

    bool has(const char *name) const;

    /// The value as typed (a file name). Throws UsageError when the option is absent.
    QString text(const char *name) const { return value(name); }
    /// A finite number. Throws UsageError when the option is absent or its
    /// value is not a number.
    double number(const char *name) const;
    /// A finite number above 0, in single precision as stand quantities are.
    float positive(const char *name) const;
    /// A finite number in single precision.
    float single(const char *name) const;
    /// A whole number from `low` to `high`.
    int wholeNumber(const char *name, int low, int high) const;

    /// Exactly one of `names` must be given; returns its index.
    int oneOf(std::initializer_list<const char *> names) const;

private:
    QString value(const char *name) const;

    QHash<QString, QString> m_values;
};

} // namespace arbolex::cli
