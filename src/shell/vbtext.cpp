#include "shell/vbtext.hpp"

#include "format/displayformat.hpp"

namespace arbolex::shell {

namespace {

/// The text without its surrounding blanks (every kind of white space), as
/// plain characters: a character outside Latin-1 is no digit either way.
std::string plain(const QString &text) {
    return text.trimmed().toStdString();
}

} // namespace

bool isNumeric(const QString &text) {
    return format::isNumeric(plain(text));
}

double val(const QString &text) {
    return format::val(plain(text));
}

} // namespace arbolex::shell
