#pragma once

// The 13 mean-tree-volume classes of a price list. Their captions are the one
// definition of the class bounds: the timber prices window shows them and
// every price lookup, in the windows and in a rotation, reads the bounds back
// from these texts.

#include <array>
#include <cstddef>
#include <string_view>

namespace arbolex::rotation {

/// Number of mean-tree-volume classes of a price list.
inline constexpr int kPriceClassCount = 13;

/// Thirteen standing timber prices, euro per m³, indexed 0 to 12 by mean tree
/// volume class.
using PriceList = std::array<double, kPriceClassCount>;

/// Captions of the 13 mean-tree-volume classes (m³ per tree), `lblTimbCat`(0
/// to 12) of the timber prices window. The bounds have three decimals and
/// leave gaps of 0.001 m³ between classes.
inline constexpr std::array<std::string_view, kPriceClassCount> kTimberCategoryCaptions = {
    "Up to .074:",   ".075 to .124:", ".125 to .174:",  ".175 to .224:", ".225 to .274:",
    ".275 to .424:", ".425 to .499:", ".500 to .599:",  ".600 to .699:", ".700 to .799:",
    ".800 to .899:", ".900 to .999:", "1.000 and Over:"};

/// Upper bound text of a caption: of its last 5 characters, the first 4.
constexpr std::string_view upperBoundText(std::string_view caption) {
    return caption.substr(caption.size() - 5, 4);
}

/// Lower bound text of a caption: its first 4 characters.
constexpr std::string_view lowerBoundText(std::string_view caption) {
    return caption.substr(0, 4);
}

/// Which bound of a caption a lookup reads.
enum class PriceBound { kLower, kUpper };

/// Statement numbers of the three caption conversions, as a failed lookup
/// reports them.
enum PriceLookupLine : int { kFirstUpperBound = 10, kLowerBound = 20, kUpperBound = 30 };

/// Outcome of walking the class captions for one mean tree volume.
struct PriceClassWalk {
    /// Class 0 to 12 that holds the volume; 0 after a failure.
    int priceClass = 0;
    /// Statement number of the bound that did not convert; 0 when every bound did.
    int failedLine = 0;

    bool failed() const { return failedLine != 0; }
};

/// The text of one bound of caption `index`.
constexpr std::string_view boundText(std::size_t index, PriceBound side) {
    return side == PriceBound::kLower ? lowerBoundText(kTimberCategoryCaptions[index])
                                      : upperBoundText(kTimberCategoryCaptions[index]);
}

/// The price-class lookup: finds the class of `meanTreeVolume` (m³ per tree)
/// from the captions in ascending order, reading each bound with
/// `read(index, side)` (std::optional<double>, empty when the text does not
/// convert) only when the walk needs it. Class 0 when its upper bound is ≥ the
/// volume (zero and negative volumes too), class 1 to 11 when lower bound ≤
/// volume ≤ upper bound (the upper bound read only when the lower one holds),
/// class 12 for everything else, including volumes that fall in the 0.001
/// gaps between two classes (0.0745 is class 12, the top price); the caption
/// of class 12 is never read. A bound that does not convert ends the walk with
/// class 0 and the statement number of that conversion.
template <typename ReadBound>
PriceClassWalk walkPriceClasses(double meanTreeVolume, ReadBound &&read) {
    PriceClassWalk walk;
    constexpr std::size_t lastClass = kPriceClassCount - 1;
    for (std::size_t i = 0; i < lastClass; ++i) {
        if (i > 0) {
            const auto lower = read(i, PriceBound::kLower);
            if (!lower) {
                walk.failedLine = kLowerBound;
                return walk;
            }
            if (!(*lower <= meanTreeVolume)) {
                continue;
            }
        }
        const auto upper = read(i, PriceBound::kUpper);
        if (!upper) {
            walk.failedLine = i == 0 ? kFirstUpperBound : kUpperBound;
            return walk;
        }
        if (*upper >= meanTreeVolume) {
            walk.priceClass = static_cast<int>(i);
            return walk;
        }
    }
    walk.priceClass = static_cast<int>(lastClass);
    return walk;
}

/// Price class 0 to 12 of a mean tree volume (m³ per tree) by walkPriceClasses,
/// the bounds read in the C notation whatever the user's locale (so no bound
/// fails).
int priceClassOf(double meanTreeVolume);

} // namespace arbolex::rotation
