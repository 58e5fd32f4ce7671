#pragma once

#include <QLatin1String>
#include <QString>

namespace arbolex::shell {

/// A trapped run-time failure: its classic number and description. Number 0
/// means no failure. Procedures that trap failures add their own statement
/// number and label when they write the failure to the error log.
struct RuntimeError {
    int number = 0;
    QString description;

    explicit operator bool() const { return number != 0; }

    static RuntimeError overflow() { return {6, QStringLiteral("Overflow")}; }
    static RuntimeError outOfMemory() { return {7, QStringLiteral("Out of memory")}; }
    static RuntimeError divisionByZero() { return {11, QStringLiteral("Division by zero")}; }
    static RuntimeError typeMismatch() { return {13, QStringLiteral("Type mismatch")}; }
    static RuntimeError badFileNameOrNumber() {
        return {52, QStringLiteral("Bad file name or number")};
    }
    static RuntimeError fileNotFound() { return {53, QStringLiteral("File not found")}; }
    static RuntimeError deviceIoError() { return {57, QStringLiteral("Device I/O error")}; }
    static RuntimeError inputPastEndOfFile() {
        return {62, QStringLiteral("Input past end of file")};
    }
    static RuntimeError pathFileAccessError() {
        return {75, QStringLiteral("Path/File access error")};
    }
    static RuntimeError pathNotFound() { return {76, QStringLiteral("Path not found")}; }
    /// A failure of the program itself, described by what it reported.
    static RuntimeError internal(const QString &what) { return {51, what}; }
};

/// Classic error numbers that callers branch on.
enum RuntimeErrorNumber : int {
    kErrOverflow = 6,
    kErrTypeMismatch = 13,
    kErrBadFileNameOrNumber = 52,
    kErrFileNotFound = 53,
    kErrInputPastEndOfFile = 62,
};

/// Log text of a failure in a module procedure or a private procedure of a
/// window: "Error " + number + `gap` + description + " in line " + line + label.
/// `gap` is one blank for most procedures, two for some ("Error 13  Type mismatch").
QString moduleErrorText(const RuntimeError &error, int line, const QString &label,
                        const QString &gap = QStringLiteral(" "));

/// Log text of a failure in a window event handler or a growth-model procedure:
/// "Error # :" + number + two blanks + description + " in line " + line + label.
QString handlerErrorText(const RuntimeError &error, int line, const QString &label);

} // namespace arbolex::shell
