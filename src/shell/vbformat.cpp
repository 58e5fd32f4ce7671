#include "shell/vbformat.hpp"

#include "format/displayformat.hpp"

namespace arbolex::shell {

namespace {

QString fromStd(const std::string &text) {
    return QString::fromLatin1(text.data(), static_cast<qsizetype>(text.size()));
}

} // namespace

QString formatNumber(double value, QStringView pattern) {
    return fromStd(format::formatNumber(value, pattern.toLatin1().toStdString()));
}

QString generalNumber(double value) {
    return fromStd(format::generalNumber(value));
}

QString singleText(float value) {
    return fromStd(format::singleText(value));
}

} // namespace arbolex::shell
