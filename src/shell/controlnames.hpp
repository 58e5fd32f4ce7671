#pragma once

// Controls are known by their names ("txtFromA", "cmdGrow"): a window's table
// of names, in the order of its control enumeration, turns one into the other.

#include <QLatin1String>
#include <QString>

#include <array>
#include <cstddef>
#include <optional>
#include <utility>

namespace arbolex::shell {

template <typename Control, std::size_t N>
QString controlNameIn(const std::array<const char *, N> &names, Control control) {
    return QLatin1String(names.at(static_cast<std::size_t>(control)));
}

template <typename Control, std::size_t N>
std::optional<Control> controlNamedIn(const std::array<const char *, N> &names,
                                      const QString &name) {
    for (std::size_t i = 0; i < N; ++i) {
        if (name == QLatin1String(names[i])) {
            return static_cast<Control>(i);
        }
    }
    return std::nullopt;
}

/// The control and element a name gives: "cmdGrow" a single control (index
/// 0), "txtTimbVal(13)" an element of a control array, within the
/// `elements(control)` elements it has (1 for a single control).
template <typename Control, std::size_t N, typename Elements>
std::optional<std::pair<Control, int>>
controlElementNamedIn(const std::array<const char *, N> &names, const QString &name,
                      Elements elements) {
    const qsizetype open = name.indexOf(QLatin1Char('('));
    const auto control = controlNamedIn<Control>(names, open < 0 ? name : name.left(open));
    if (!control) {
        return std::nullopt;
    }
    const bool isArray = elements(*control) > 1;
    if (open < 0) {
        return isArray ? std::nullopt : std::optional(std::pair(*control, 0));
    }
    if (!isArray || !name.endsWith(QLatin1Char(')'))) {
        return std::nullopt;
    }
    bool ok = false;
    const int index = name.mid(open + 1, name.size() - open - 2).toInt(&ok);
    if (!ok || index < 0 || index >= elements(*control)) {
        return std::nullopt;
    }
    return std::pair(*control, index);
}

} // namespace arbolex::shell
