#include "estate/forecast.hpp"

#include "estate/rowplan.hpp"

#include <cinttypes>
#include <cstdio>
#include <cstdlib>

namespace arbolex::estate {

namespace {

/// A whole number of thousandths or hundredths as a decimal ("12.345").
std::string fixed(std::int64_t units, int decimals) {
    const std::int64_t scale = decimals == 3 ? 1000 : 100;
    const std::uint64_t magnitude = units < 0 ? static_cast<std::uint64_t>(-(units + 1)) + 1
                                              : static_cast<std::uint64_t>(units);
    char text[48];
    std::snprintf(text, sizeof text, "%s%" PRIu64 ".%0*" PRIu64, units < 0 ? "-" : "",
                  magnitude / static_cast<std::uint64_t>(scale), decimals,
                  magnitude % static_cast<std::uint64_t>(scale));
    return text;
}

/// Reads "12.345" (exactly `decimals` digits after the point, or none) back
/// into thousandths or hundredths.
std::optional<std::int64_t> units(const std::string &text, int decimals) {
    const std::size_t point = text.find('.');
    std::string digits = text.substr(0, point);
    std::string fraction = point == std::string::npos ? std::string() : text.substr(point + 1);
    if (fraction.size() > static_cast<std::size_t>(decimals)) {
        return std::nullopt;
    }
    fraction.append(static_cast<std::size_t>(decimals) - fraction.size(), '0');
    const std::optional<long long> whole = wholeNumber(digits + fraction);
    if (digits.empty() || !whole ||
        (!fraction.empty() && fraction.find_first_not_of("0123456789") != std::string::npos)) {
        return std::nullopt;
    }
    return *whole;
}

} // namespace

void Forecast::add(const RowResult &row) {
    m_withCarbon = m_withCarbon || row.hasCarbon;
    for (const ForecastEntry &h : row.harvests) {
        add(h.year, row.species,
            {h.thinningLitres, h.finalCutLitres, h.revenueCents, h.carbonRemovalKg,
             h.carbonUnitsKg});
    }
}

void Forecast::add(int year, const std::string &species, const ForecastTotals &totals,
                   bool withCarbon) {
    m_withCarbon = m_withCarbon || withCarbon;
    if (species != kAllSpecies) {
        m_bySpecies[{year, species}] += totals;
    }
}

void Forecast::add(const Forecast &other) {
    for (const auto &[key, totals] : other.m_bySpecies) {
        m_bySpecies[key] += totals;
    }
    m_withCarbon = m_withCarbon || other.m_withCarbon;
}

std::vector<Forecast::Line> Forecast::lines(int firstYear) const {
    std::vector<Line> out;
    if (m_bySpecies.empty()) {
        return out;
    }
    const int lastYear = m_bySpecies.rbegin()->first.first;
    auto next = m_bySpecies.begin();
    for (int year = firstYear; year <= lastYear; ++year) {
        Line all{year, kAllSpecies, {}, m_withCarbon};
        std::vector<Line> species;
        // Harvests before the first year (a stand older than its final cut
        // cannot have one) are skipped by the walk, not summed.
        while (next != m_bySpecies.end() && next->first.first < year) {
            ++next;
        }
        for (; next != m_bySpecies.end() && next->first.first == year; ++next) {
            all.totals += next->second;
            species.push_back({year, next->first.second, next->second, m_withCarbon});
        }
        out.push_back(all);
        out.insert(out.end(), species.begin(), species.end());
    }
    return out;
}

std::vector<ResultColumn> forecastColumns() {
    using enum ColumnType;
    return {{"year", kInteger},          {"species", kText}, {"thinning_volume", kReal},
            {"final_cut_volume", kReal}, {"revenue", kReal}, {"carbon_net_removal", kReal},
            {"carbon_units", kReal}};
}

std::vector<std::string> forecastValues(const Forecast::Line &line) {
    return {std::to_string(line.year),
            line.species,
            fixed(line.totals.thinningLitres, 3),
            fixed(line.totals.finalCutLitres, 3),
            fixed(line.totals.revenueCents, 2),
            line.withCarbon ? fixed(line.totals.carbonRemovalKg, 3) : std::string(),
            line.withCarbon ? fixed(line.totals.carbonUnitsKg, 3) : std::string()};
}

std::optional<Forecast::Line> forecastLine(const std::vector<std::string> &values) {
    if (values.size() != 7) {
        return std::nullopt;
    }
    const std::optional<long long> year = wholeNumber(values[0]);
    const auto thinning = units(values[2], 3);
    const auto finalCut = units(values[3], 3);
    const auto revenue = units(values[4], 2);
    // A forecast without carbon leaves both carbon cells empty.
    const bool withCarbon = !values[5].empty() || !values[6].empty();
    const auto removal = withCarbon ? units(values[5], 3) : std::optional<std::int64_t>(0);
    const auto issued = withCarbon ? units(values[6], 3) : std::optional<std::int64_t>(0);
    if (!year || values[1].empty() || !thinning || !finalCut || !revenue || !removal || !issued) {
        return std::nullopt;
    }
    return Forecast::Line{static_cast<int>(*year),
                          values[1],
                          {*thinning, *finalCut, *revenue, *removal, *issued},
                          withCarbon};
}

} // namespace arbolex::estate
