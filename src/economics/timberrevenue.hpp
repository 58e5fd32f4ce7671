#pragma once

#include <map>

namespace arbolex::economics {

/// Timber revenue of the sub-compartment by year of the projection, euro per
/// hectare: what the thinnings and the final cut earn at long-term average
/// prices. The cash flow reads it; clearing the projection empties it.
class TimberRevenue {
public:
    /// The revenue of the harvest at `age` (one harvest a year: a thinning
    /// that is overwritten replaces its revenue).
    void set(int age, double euroPerHa) { m_byAge[age] = euroPerHa; }
    double at(int age) const {
        const auto found = m_byAge.find(age);
        return found == m_byAge.end() ? 0.0 : found->second;
    }
    void clear() { m_byAge.clear(); }
    const std::map<int, double> &byAge() const { return m_byAge; }

private:
    std::map<int, double> m_byAge;
};

} // namespace arbolex::economics
