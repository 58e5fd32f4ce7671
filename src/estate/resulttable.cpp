#include "estate/resulttable.hpp"

#include "valuation/discounting.hpp"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>

namespace arbolex::estate {

namespace {

/// Room for any double written with a few decimals (DBL_MAX has 309 digits).
constexpr std::size_t kNumberRoom = 352;

/// `x` in `format` with `precision` digits: the text printf gives for the same
/// conversion ("%.9g", "%.3f"), byte for byte, without its parsing of a format
/// and its locale, which cost more than growing a year of the row.
std::string written(double x, std::chars_format format, int precision) {
    char text[kNumberRoom];
    const std::to_chars_result r = std::to_chars(text, text + sizeof text, x, format, precision);
    return {text, r.ptr};
}

/// A single-precision figure as every table prints it ("%.9g").
std::string quantity(double x) {
    return written(x, std::chars_format::general, 9);
}

/// Powers of ten to the decimals the tables print figures with.
constexpr std::array<double, 4> kPowersOfTen = {1.0, 10.0, 100.0, 1000.0};

/// A volume or an amount to a given number of decimals ("%.3f"): the exact
/// value rounded to the nearest, ties to even. Where the value scaled by
/// 10^decimals lies clearly away from a half, the whole number nearest the
/// exact product is that nearest the scaled double (within 2^-53 of it), and
/// its digits are written out with the point put in; near a half, to_chars
/// rounds the exact value.
std::string fixed(double x, int decimals) {
    if (decimals >= 0 && decimals < static_cast<int>(kPowersOfTen.size())) {
        const double scaled = std::fabs(x) * kPowersOfTen[static_cast<std::size_t>(decimals)];
        const double whole = std::floor(scaled);
        const double fraction = scaled - whole;
        if (scaled < 1e15 && std::fabs(fraction - 0.5) > scaled * 0x1p-51 + 1e-300) {
            const auto nearest = static_cast<std::uint64_t>(fraction > 0.5 ? whole + 1.0 : whole);
            std::array<char, 24> digits{};
            const char *end =
                std::to_chars(digits.data(), digits.data() + digits.size(), nearest).ptr;
            const auto count = static_cast<std::size_t>(end - digits.data());
            const auto places = static_cast<std::size_t>(decimals);
            std::string out;
            if (std::signbit(x)) {
                out.push_back('-'); // as printf: "-0.000" for a negative value that rounds to 0
            }
            if (count <= places) {
                out.push_back('0');
                if (places > 0) {
                    out.push_back('.');
                    out.append(places - count, '0');
                }
                out.append(digits.data(), count);
            } else {
                out.append(digits.data(), count - places);
                if (places > 0) {
                    out.push_back('.');
                    out.append(digits.data() + count - places, places);
                }
            }
            return out;
        }
    }
    return written(x, std::chars_format::fixed, decimals);
}

std::string money(const std::optional<double> &euro) {
    return euro ? fixed(valuation::roundToCents(*euro), 2) : std::string();
}

std::string moneyForArea(const std::optional<double> &euroPerHa, double areaHa) {
    return euroPerHa ? fixed(valuation::roundToCents(*euroPerHa * areaHa), 2) : std::string();
}

} // namespace

const std::vector<ResultColumn> &figureColumns() {
    using enum ColumnType;
    static const std::vector<ResultColumn> columns = {{"model_label", kText},
                                                      {"site_index", kReal},
                                                      {"yield_class", kInteger},
                                                      {"thinnings", kInteger},
                                                      {"thinning_volume_ha", kReal},
                                                      {"thinning_volume", kReal},
                                                      {"final_cut_age", kInteger},
                                                      {"final_cut_year", kInteger},
                                                      {"final_cut_volume_ha", kReal},
                                                      {"final_cut_volume", kReal},
                                                      {"max_mai", kReal},
                                                      {"mai_final_cut", kReal},
                                                      {"npv_ha", kReal},
                                                      {"npv", kReal},
                                                      {"lev_ha", kReal},
                                                      {"lev", kReal},
                                                      {"forest_value_ha", kReal},
                                                      {"forest_value", kReal},
                                                      {"carbon_stock_tco2e_ha", kReal},
                                                      {"carbon_ltas_tco2e_ha", kReal},
                                                      {"carbon_units", kReal},
                                                      {"npv_carbon_ha", kReal},
                                                      {"status", kText}};
    return columns;
}

void figureValues(const RowResult &row, std::vector<std::string> &values) {
    values.push_back(row.modelLabel);
    if (row.status != RowStatus::kOk) {
        values.insert(values.end(), figureColumns().size() - 2, std::string());
        values.emplace_back(statusWord(row.status));
        return;
    }
    const double area = row.areaHa;
    values.push_back(quantity(row.siteIndex));
    values.push_back(std::to_string(row.yieldClass));
    values.push_back(std::to_string(row.thinningCount));
    values.push_back(fixed(row.thinningVolume, 3));
    values.push_back(fixed(row.thinningVolume * area, 3));
    values.push_back(std::to_string(row.finalCutAge));
    values.push_back(std::to_string(row.finalCutYear));
    values.push_back(quantity(row.finalCutVolume));
    values.push_back(fixed(double{row.finalCutVolume} * area, 3));
    values.push_back(quantity(row.maxMai));
    values.push_back(quantity(row.finalCutMai));
    values.push_back(money(row.npv));
    values.push_back(moneyForArea(row.npv, area));
    values.push_back(money(row.lev));
    values.push_back(moneyForArea(row.lev, area));
    values.push_back(money(row.forestValue));
    values.push_back(moneyForArea(row.forestValue, area));
    if (row.hasCarbon) {
        values.push_back(quantity(row.carbonStock));
        values.push_back(quantity(row.carbonLongTermAverage));
        values.push_back(fixed(row.carbonUnits * area, 3));
        values.push_back(money(row.npvCarbon));
    } else {
        values.insert(values.end(), 4, std::string());
    }
    values.emplace_back(statusWord(row.status));
}

std::vector<ResultColumn> resultColumns(const Layout &layout) {
    std::vector<ResultColumn> columns = {{"line", ColumnType::kInteger}, {"id", ColumnType::kText}};
    for (const std::string &name : layout.carriedNames) {
        columns.push_back({name, ColumnType::kText});
    }
    columns.insert(columns.end(), figureColumns().begin(), figureColumns().end());
    return columns;
}

const std::string &rowId(const Layout &layout, const RowValues &input) {
    static const std::string kNone;
    const auto i = static_cast<std::size_t>(layout.at(Column::kId));
    return i < input.size() ? input[i] : kNone;
}

void resultValues(const Layout &layout, long long line, const RowValues &input,
                  const RowResult &row, std::vector<std::string> &values) {
    values.clear();
    values.push_back(std::to_string(line));
    values.push_back(rowId(layout, input));
    for (const int i : layout.carried) {
        const auto at = static_cast<std::size_t>(i);
        values.push_back(at < input.size() ? input[at] : std::string());
    }
    figureValues(row, values);
}

std::vector<ResultColumn> errorColumns() {
    return {
        {"line", ColumnType::kInteger}, {"id", ColumnType::kText}, {"message", ColumnType::kText}};
}

} // namespace arbolex::estate
