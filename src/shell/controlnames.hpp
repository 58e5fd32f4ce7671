#pragma once

// Controls are known by their names ("txtFromA", "cmdGrow"): a window's table
// of names, in the order of its control enumeration, turns one into the other.

#include <QLatin1String>
#include <QString>

#include <array>
#include <cstddef>
#include <optional>

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

} // namespace arbolex::shell
