#include "cli/units.hpp"

#include <algorithm>
#include <iterator>

namespace arbolex::cli::units {

namespace {

struct KeyUnit {
    const char *key;
    const char *unit;
};

/// Keys of the outputs of one stand and of every run record.
constexpr KeyUnit kStandUnits[] = {
    // the stand and its growth
    {"model", kNumber},
    {"age", kYears},
    {"present_age", kYears},
    {"to", kYears},
    {"by", kYears},
    {"height", kMetres},
    {"top_height", kMetres},
    {"site_index", kMetres},
    {"stocking", kStemsPerHa},
    {"basal_area", kSquareMetresPerHa},
    {"dbh", kCentimetres},
    {"volume", kCubicMetresPerHa},
    {"volume_to_7cm", kCubicMetresPerHa},
    {"mean_tree_volume", kCubicMetres},
    {"mai", kCubicMetresPerHaYear},
    {"cai", kCubicMetresPerHaYear},
    {"yield_class", kCubicMetresPerHaYear},
    {"percent", kPercent},
    {"7-14 cm", kCubicMetresPerHa},
    {"14-20 cm", kCubicMetresPerHa},
    {">20 cm", kCubicMetresPerHa},
    // thinnings: as prescribed, and the grid's removal and running totals
    {"residual_ba", kSquareMetresPerHa},
    {"residual_stocking", kStemsPerHa},
    {"residual_volume", kCubicMetresPerHa},
    {"thin_from", kYears},
    {"thin_every", kYears},
    {"thin_until", kYears},
    {"thin_volume", kCubicMetresPerHa},
    {"thin_stocking", kStemsPerHa},
    {"thin_dbh", kCentimetres},
    {"thin_basal_area", kSquareMetresPerHa},
    {"thin_mean_tree_volume", kCubicMetres},
    {"thin_value", kEuroPerHa},
    {"thin_total_volume", kCubicMetres},
    {"thin_total_value", kEuro},
    {"production_stocking", kStemsPerHa},
    {"production_dbh", kCentimetres},
    {"production_basal_area", kSquareMetresPerHa},
    {"production_mean_tree_volume", kCubicMetres},
    {"production_volume", kCubicMetresPerHa},
    {"production_total_volume", kCubicMetres},
    // rotations and their money
    {"rotation", kYears},
    {"economic_rotation", kYears},
    {"biological_rotation", kYears},
    {"rate", kPercentPerYear},
    {"irr", kPercentPerYear},
    {"rate_range", kPercentPerYear},
    {"npv", kEuroPerHa},
    {"lev", kEuroPerHa},
    {"eaa", kEuroPerHaYear},
    {"forest_value", kEuroPerHa},
    {"break_even_price_factor", kNumber},
    {"revenue", kEuroPerHa},
    {"cost", kEuroPerHa},
    {"establishment_cost", kEuroPerHa},
    {"annual_cost", kEuroPerHaYear},
    {"price", kEuroPerCubicMetre},
    // the search and the draws
    {"regimes_grown", kNumber},
    {"gain", kEuroPerHa},
    {"max_removal", kPercent},
    {"min_stocking", kStemsPerHa},
    {"top", kNumber},
    {"draws", kNumber},
    {"seed", kNumber},
    {"price_spread", kNumber},
    {"cost_spread", kNumber},
    {"p5", kEuroPerHa},
    {"p50", kEuroPerHa},
    {"p95", kEuroPerHa},
    {"probability_npv_below_zero", kNumber},
    {"npv_lowest", kEuroPerHa},
    {"npv_highest", kEuroPerHa},
    {"counts", kNumber},
    {"npv_low", kEuroPerHa},
    {"npv_high", kEuroPerHa},
    {"lev_low", kEuroPerHa},
    {"lev_high", kEuroPerHa},
    // an estate run's options
    {"year", kCalendarYear},
    {"threads", kNumber},
};

/// Keys of the estate's files whose unit differs from one stand's, or that
/// only the estate has.
constexpr KeyUnit kEstateUnits[] = {
    {"line", kNumber},
    {"thinnings", kNumber},
    {"thinning_volume_ha", kCubicMetresPerHa},
    {"thinning_volume", kCubicMetres},
    {"final_cut_age", kYears},
    {"final_cut_year", kCalendarYear},
    {"final_cut_volume_ha", kCubicMetresPerHa},
    {"final_cut_volume", kCubicMetres},
    {"max_mai", kCubicMetresPerHaYear},
    {"mai_final_cut", kCubicMetresPerHaYear},
    {"npv_ha", kEuroPerHa},
    {"npv", kEuro},
    {"lev_ha", kEuroPerHa},
    {"lev", kEuro},
    {"forest_value_ha", kEuroPerHa},
    {"forest_value", kEuro},
    {"revenue", kEuro},
};

template <std::size_t N> const char *find(const KeyUnit (&table)[N], QStringView key) {
    const auto found = std::find_if(std::begin(table), std::end(table), [&](const KeyUnit &k) {
        return key.compare(QLatin1String(k.key)) == 0;
    });
    return found == std::end(table) ? nullptr : found->unit;
}

} // namespace

const char *unitOf(QStringView key, Table table) {
    if (table == Table::kEstate) {
        if (const char *unit = find(kEstateUnits, key)) {
            return unit;
        }
    }
    return find(kStandUnits, key);
}

} // namespace arbolex::cli::units
