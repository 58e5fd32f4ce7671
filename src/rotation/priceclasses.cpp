#include "rotation/priceclasses.hpp"

#include <charconv>
#include <optional>

namespace arbolex::rotation {

namespace {

/// A bound as the captions write it (".074", "1.000"), in the C notation.
std::optional<double> parseBound(std::string_view text) {
    double value = 0.0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size()) {
        return std::nullopt;
    }
    return value;
}

struct CaptionBounds {
    std::array<std::optional<double>, kPriceClassCount> lower{};
    std::array<std::optional<double>, kPriceClassCount> upper{};
};

/// The bounds of every caption in the C notation, read once.
const CaptionBounds &captionBounds() {
    static const CaptionBounds bounds = [] {
        CaptionBounds b;
        for (std::size_t i = 0; i < kPriceClassCount; ++i) {
            b.lower[i] = parseBound(boundText(i, PriceBound::kLower));
            b.upper[i] = parseBound(boundText(i, PriceBound::kUpper));
        }
        return b;
    }();
    return bounds;
}

} // namespace

int priceClassOf(double meanTreeVolume) {
    const CaptionBounds &bounds = captionBounds();
    return walkPriceClasses(meanTreeVolume,
                            [&](std::size_t index, PriceBound side) {
                                return side == PriceBound::kLower ? bounds.lower[index]
                                                                  : bounds.upper[index];
                            })
        .priceClass;
}

} // namespace arbolex::rotation
