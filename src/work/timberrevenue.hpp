#pragma once

#include <map>

namespace arbolex::work {

/// Timber revenue of the sub-compartment by year of the projection, euro per
/// hectare: what the thinnings and the final cut earn at long-term average
/// prices, rebuilt from the rows of the projection table whenever they change. The cash flow reads
/// it; clearing the projection empties it.
class TimberRevenue {
public:
    /// Adds a harvest to the revenue of `age` (a thinning and the final cut
    /// of the same year add up).
    void add(int age, double euroPerHa) { m_byAge[age] += euroPerHa; }
    double at(int age) const {
        const auto found = m_byAge.find(age);
        return found == m_byAge.end() ? 0.0 : found->second;
    }
    void clear() { m_byAge.clear(); }
    const std::map<int, double> &byAge() const { return m_byAge; }

private:
    std::map<int, double> m_byAge;
};

} // namespace arbolex::work
