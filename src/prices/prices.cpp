#include "prices/prices.hpp"

#include <cmath>

namespace arbolex::prices {

const PriceList *Prices::priceSet(std::int16_t set) const {
    switch (set) {
    case kCurrentPrices:
        return &m_data.current;
    case kUserPrices:
        return &m_data.userDefined;
    case kLongTermPrices:
        return &m_data.longTermAverage;
    case kPrivatePrices:
        return &m_data.privateSector;
    default:
        return nullptr;
    }
}

void Prices::selectPriceSet(std::int16_t set) {
    const PriceList *chosen = priceSet(set);
    if (chosen == nullptr) {
        return;
    }
    for (std::size_t i = 0; i < m_pricesInUse.size(); ++i) {
        m_pricesInUse[i] = std::fabs((*chosen)[i]);
    }
    m_priceSetInUse = set;
}

} // namespace arbolex::prices
