#pragma once

#include "prices/pricedata.hpp"

#include <cstdint>

namespace arbolex::prices {

/// Price set in use, as numbered by the option buttons of the timber prices
/// window (`OptCurentPrices` … `OptOvraPrices`). Not the selector of
/// WritePricesInFiles, where 3 means all three writable lists.
enum PriceSet : std::int16_t {
    kCurrentPrices = 0,
    kUserPrices = 1,
    kLongTermPrices = 2,
    kPrivatePrices = 3,
};

/// The program's prices: the four lists and user categories, the prices in
/// use, the price set in use and the price changes flag.
class Prices {
public:
    PriceData &data() { return m_data; }
    const PriceData &data() const { return m_data; }

    /// The list of a price set; nullptr for any other value.
    const PriceList *priceSet(std::int16_t set) const;

    /// Copies the chosen list into the prices in use, each price as its
    /// absolute value, and makes it the set in use. Other values do nothing.
    void selectPriceSet(std::int16_t set);
    /// Puts back a price set in use and the prices it had copied, as a saved
    /// sub-compartment valued its rows with them.
    void restoreInUse(std::int16_t set, const PriceList &prices) {
        m_priceSetInUse = set;
        m_pricesInUse = prices;
    }

    /// Prices read by the final-cut and thinning rows, euro per m³, never negative.
    const PriceList &pricesInUse() const { return m_pricesInUse; }
    std::int16_t priceSetInUse() const { return m_priceSetInUse; }

    /// True while the user may edit the user-defined prices.
    bool priceChanges() const { return m_priceChanges; }
    void setPriceChanges(bool on) { m_priceChanges = on; }

private:
    PriceData m_data;
    PriceList m_pricesInUse{};
    std::int16_t m_priceSetInUse = kCurrentPrices;
    bool m_priceChanges = false;
};

} // namespace arbolex::prices
