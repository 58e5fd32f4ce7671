#include "rotation/priceclasses.hpp"

#include <charconv>
#include <limits>

namespace arbolex::rotation {

namespace {

struct ClassBounds {
    double lower = 0.0;
    double upper = 0.0;
};

/// A bound as the captions write it (".074", "1.000"), in the C notation
/// whatever the user's locale; a text that is not a number gives NaN, which
/// no volume falls under.
double parseBound(std::string_view text) {
    double value = 0.0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size()) {
        return std::numeric_limits<double>::quiet_NaN();
    }
    return value;
}

/// Bounds of classes 0 to 11, read once; class 12 is the catch-all and its
/// caption is never read.
const std::array<ClassBounds, kPriceClassCount - 1> &classBounds() {
    static const std::array<ClassBounds, kPriceClassCount - 1> bounds = [] {
        std::array<ClassBounds, kPriceClassCount - 1> b{};
        for (std::size_t i = 0; i < b.size(); ++i) {
            const std::string_view caption = kTimberCategoryCaptions[i];
            b[i].lower = i == 0 ? -std::numeric_limits<double>::infinity()
                                : parseBound(lowerBoundText(caption));
            b[i].upper = parseBound(upperBoundText(caption));
        }
        return b;
    }();
    return bounds;
}

} // namespace

int priceClassOf(double meanTreeVolume) {
    const auto &bounds = classBounds();
    for (std::size_t i = 0; i < bounds.size(); ++i) {
        if (bounds[i].lower <= meanTreeVolume && bounds[i].upper >= meanTreeVolume) {
            return static_cast<int>(i);
        }
    }
    return kPriceClassCount - 1;
}

} // namespace arbolex::rotation
