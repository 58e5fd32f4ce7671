#pragma once

#include "prices/pricedata.hpp"
#include "rotation/priceclasses.hpp"

#include <QLatin1String>
#include <QLocale>

#include <array>

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::prices {

/// Captions of the 13 mean-tree-volume classes (m³ per tree), shown by the
/// timber prices window as `lblTimbCat`(0 to 12): the texts of
/// rotation::kTimberCategoryCaptions. The price lookup reads the class bounds
/// back from these texts, so they are part of the design: the bounds have
/// three decimals and leave gaps of 0.001 m³ between classes.
inline constexpr std::array<QLatin1String, kPriceClassCount> kTimberCategoryCaptions = [] {
    std::array<QLatin1String, kPriceClassCount> captions{};
    for (std::size_t i = 0; i < captions.size(); ++i) {
        const std::string_view text = rotation::kTimberCategoryCaptions[i];
        captions[i] = QLatin1String(text.data(), static_cast<qsizetype>(text.size()));
    }
    return captions;
}();

/// The price-class lookup of the windows: rotation::walkPriceClasses with the
/// bounds converted under `locale`, as the user's own number conversion does.
rotation::PriceClassWalk walkPriceClasses(double meanTreeVolume, const QLocale &locale);

/// Standing price, euro per m³, of a mean tree volume (m³ per tree), always
/// from the current prices and with its sign, whichever list is in use. When a
/// caption does not convert under `locale`, shows "Error 13  Type mismatch in
/// line N in procedure TrouveIndicePrix of Feuille frmMain", logs nothing and
/// returns 0.
double TrouveIndicePrix(double meanTreeVolume, const PriceList &current,
                        shell::IInteractive &interactive,
                        const QLocale &locale = QLocale::system());

/// Price class 0 to 12 of a mean tree volume, by the same walk; after a caption
/// that does not convert, shows the same message as TrouveIndicePrix and returns 0.
int priceClassOf(double meanTreeVolume, shell::IInteractive &interactive,
                 const QLocale &locale = QLocale::system());

} // namespace arbolex::prices
