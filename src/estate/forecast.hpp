#pragma once

// The harvest forecast of an estate: thinning volume, final-cut volume and
// revenue by calendar year, for the whole estate and by species. Kept in whole
// litres and cents, so the forecasts of any split of the estate add up to the
// forecast of the whole, exactly.

#include "estate/resulttable.hpp"
#include "estate/rowresult.hpp"

#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace arbolex::estate {

/// The species word of the estate's total rows.
inline constexpr const char *kAllSpecies = "all";

struct ForecastTotals {
    std::int64_t thinningLitres = 0;
    std::int64_t finalCutLitres = 0;
    std::int64_t revenueCents = 0;
    /// Net carbon removal and carbon units issued, kg CO₂e.
    std::int64_t carbonRemovalKg = 0;
    std::int64_t carbonUnitsKg = 0;

    ForecastTotals &operator+=(const ForecastTotals &o) {
        thinningLitres += o.thinningLitres;
        finalCutLitres += o.finalCutLitres;
        revenueCents += o.revenueCents;
        carbonRemovalKg += o.carbonRemovalKg;
        carbonUnitsKg += o.carbonUnitsKg;
        return *this;
    }
    bool operator==(const ForecastTotals &) const = default;
};

class Forecast {
public:
    /// Adds the harvests of a row that was grown.
    void add(const RowResult &row);
    /// Adds one line of a forecast ("all" lines are the sums, and skipped).
    void add(int year, const std::string &species, const ForecastTotals &totals,
             bool withCarbon = false);
    void add(const Forecast &other);

    /// One line of the table; its carbon only when the rows had theirs.
    struct Line {
        int year = 0;
        std::string species;
        ForecastTotals totals;
        bool withCarbon = false;
    };
    /// Every calendar year from `firstYear` to the last harvest: the estate's
    /// line ("all"), then one line per species harvested that year, by name.
    std::vector<Line> lines(int firstYear) const;

    bool operator==(const Forecast &) const = default;

private:
    std::map<std::pair<int, std::string>, ForecastTotals> m_bySpecies;
    /// True once a row or a line brought its carbon.
    bool m_withCarbon = false;
};

/// Columns of the forecast table.
std::vector<ResultColumn> forecastColumns();
/// The values of a line as the table writes them (m³ to the litre, euro to the cent).
std::vector<std::string> forecastValues(const Forecast::Line &line);
/// A line read back from its values; std::nullopt when they are not a line.
std::optional<Forecast::Line> forecastLine(const std::vector<std::string> &values);

} // namespace arbolex::estate
