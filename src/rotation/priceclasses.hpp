#pragma once

// The 13 mean-tree-volume classes of a price list. Their captions are the one
// definition of the class bounds: the timber prices window shows them and
// every price lookup, in the windows and in a rotation, reads the bounds back
// from these texts.

#include <array>
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

/// Price class 0 to 12 of a mean tree volume (m³ per tree), the bounds read
/// from the captions with a parser that ignores the locale: class 0 when its
/// upper bound is ≥ the volume (zero and negative volumes too), class 1 to 11
/// when lower bound ≤ volume ≤ upper bound, class 12 for everything else,
/// including volumes in the 0.001 gaps between two classes (0.0745 is class 12).
int priceClassOf(double meanTreeVolume);

} // namespace arbolex::rotation
