#include "estate/rowplan.hpp"

#include "engine/catalogue.hpp"
#include "rotation/standchecks.hpp"
#include "rotation/standmath.hpp"

#include <charconv>
#include <cmath>

namespace arbolex::estate {

namespace {

/// Largest area of one sub-compartment, ha.
constexpr double kLargestAreaHa = 100000.0;

/// Ages and intervals of a regime, years, as the command line takes them.
constexpr int kLongestAge = 200;

std::string_view trimmed(const std::string &text) {
    std::string_view s(text);
    while (!s.empty() && (s.front() == ' ' || s.front() == '\t')) {
        s.remove_prefix(1);
    }
    while (!s.empty() && (s.back() == ' ' || s.back() == '\t' || s.back() == '\r')) {
        s.remove_suffix(1);
    }
    return s;
}

class RowReader {
public:
    RowReader(const Layout &layout, const RowValues &values) : m_layout(layout), m_values(values) {}

    /// The text of a column, empty when the table has no such column.
    const std::string &text(Column c) const {
        static const std::string kNone;
        const int i = m_layout.at(c);
        return i >= 0 && static_cast<std::size_t>(i) < m_values.size()
                   ? m_values[static_cast<std::size_t>(i)]
                   : kNone;
    }
    bool empty(Column c) const { return trimmed(text(c)).empty(); }
    std::optional<double> value(Column c) const {
        return decimalNumber(text(c), m_layout.decimalComma);
    }
    std::optional<long long> whole(Column c) const {
        return wholeNumber(text(c), m_layout.decimalComma);
    }

private:
    const Layout &m_layout;
    const RowValues &m_values;
};

std::string columnName(Column c) {
    return std::string(kColumnNames[static_cast<std::size_t>(c)]);
}

/// A whole age or interval from the row, else from the command line; a value
/// that is not one is a fault.
struct AgeValue {
    std::optional<int> value;
    std::optional<std::string> fault;
};
AgeValue ageValue(const RowReader &row, Column c, std::optional<int> fallback, int lowest) {
    if (row.empty(c)) {
        return {fallback, std::nullopt};
    }
    const std::optional<long long> whole = row.whole(c);
    if (!whole || *whole < lowest || *whole > kLongestAge) {
        return {std::nullopt, "the " + columnName(c) + " \"" + row.text(c) +
                                  "\" is not a whole number from " + std::to_string(lowest) +
                                  " to " + std::to_string(kLongestAge)};
    }
    return {static_cast<int>(*whole), std::nullopt};
}

/// The row's regime: each empty thinning column takes the command line's value.
std::variant<rotation::Regime, std::string> regimeOf(const RowReader &row,
                                                     const rotation::Regime &defaults) {
    const bool defaultThins = defaults.thins();
    const AgeValue from =
        ageValue(row, Column::kThinFrom,
                 defaultThins ? std::optional<int>(defaults.thinFrom) : std::nullopt, 0);
    const AgeValue every =
        ageValue(row, Column::kThinEvery,
                 defaultThins ? std::optional<int>(defaults.thinEvery) : std::nullopt, 1);
    const AgeValue until = ageValue(row, Column::kThinUntil, defaults.thinUntil, 1);
    for (const AgeValue *v : {&from, &every, &until}) {
        if (v->fault) {
            return *v->fault;
        }
    }
    rotation::Regime regime;
    // A first thinning at age 0 is a rotation without thinning.
    if (!from.value || *from.value == 0) {
        return regime;
    }
    regime.thinFrom = *from.value;
    if (!every.value) {
        return std::string("the thinning regime has no thin_every");
    }
    regime.thinEvery = *every.value;
    if (row.empty(Column::kThinVolume)) {
        if (!defaultThins) {
            return std::string("the thinning regime has no thin_volume");
        }
        regime.thinVolume = defaults.thinVolume;
    } else {
        const std::optional<double> volume = row.value(Column::kThinVolume);
        if (!volume || !(*volume > 0.0)) {
            return "the thin_volume \"" + row.text(Column::kThinVolume) +
                   "\" is not a volume above 0 m3/ha";
        }
        regime.thinVolume = static_cast<float>(*volume);
    }
    regime.thinUntil = until.value;
    return regime;
}

} // namespace

std::optional<double> decimalNumber(const std::string &text, bool decimalComma) {
    std::string_view s = trimmed(text);
    if (!s.empty() && s.front() == '+') {
        s.remove_prefix(1);
    }
    // "12,4" is read as "12.4": one comma, and no point beside it.
    std::string pointed;
    const std::size_t comma = s.find(',');
    if (decimalComma && comma != std::string_view::npos) {
        if (s.find(',', comma + 1) != std::string_view::npos ||
            s.find('.') != std::string_view::npos) {
            return std::nullopt;
        }
        pointed.assign(s);
        pointed[comma] = '.';
        s = pointed;
    }
    double x = 0.0;
    const auto [end, error] = std::from_chars(s.data(), s.data() + s.size(), x);
    if (s.empty() || error != std::errc() || end != s.data() + s.size() || !std::isfinite(x)) {
        return std::nullopt;
    }
    return x;
}

std::optional<long long> wholeNumber(const std::string &text, bool decimalComma) {
    const std::optional<double> x = decimalNumber(text, decimalComma);
    if (!x || *x != std::trunc(*x) || std::fabs(*x) > 1e15) {
        return std::nullopt;
    }
    return static_cast<long long>(*x);
}

std::optional<std::int16_t> modelOf(const Layout &layout, const RowValues &values) {
    const std::optional<long long> model = RowReader(layout, values).whole(Column::kModel);
    if (!model || *model < 0 || *model >= engine::kModelCount) {
        return std::nullopt;
    }
    return static_cast<std::int16_t>(*model);
}

std::variant<RowPlan, std::string> planRow(const Layout &layout, const RowValues &values,
                                           const EstateDefaults &defaults) {
    const RowReader row(layout, values);
    RowPlan plan;
    const std::optional<std::int16_t> model = modelOf(layout, values);
    if (!model) {
        return "the model \"" + row.text(Column::kModel) + "\" is not a model from 0 to " +
               std::to_string(engine::kModelCount - 1);
    }
    plan.stand.model = *model;

    // The grow-from form check, in the window's order and words.
    const std::optional<double> age = row.value(Column::kAge);
    if (!age) {
        return std::string(rotation::standtext::kFaultFromAge);
    }
    const std::optional<double> stocking = row.value(Column::kStocking);
    if (!stocking) {
        return std::string(rotation::standtext::kFaultFromStocking);
    }
    const std::optional<double> height = row.value(Column::kTopHeight);
    if (!height) {
        return std::string(rotation::standtext::kFaultFromHeight);
    }
    const std::optional<double> basalArea = row.value(Column::kBasalArea);
    const std::optional<double> dbh = row.value(Column::kDbh);
    if (!basalArea && !dbh) {
        return std::string(rotation::standtext::kFaultFromBasalAreaOrDbh);
    }
    plan.stand.age = static_cast<float>(*age);
    plan.stand.stocking = static_cast<float>(*stocking);
    plan.stand.height = static_cast<float>(*height);
    // The basal area wins whenever it is given, as in the window.
    plan.stand.basalArea =
        basalArea ? static_cast<float>(*basalArea)
                  : rotation::basalAreaFromDbh(plan.stand.stocking, static_cast<float>(*dbh));

    if (row.empty(Column::kAreaHa)) {
        return std::string("the area_ha has no value");
    }
    const std::optional<double> area = row.value(Column::kAreaHa);
    if (!area || !(*area > 0.0)) {
        return "the area_ha \"" + row.text(Column::kAreaHa) + "\" is not an area above 0 ha";
    }
    // Larger is no sub-compartment; and the forecast's whole litres and cents
    // of a million such rows still add up within 64 bits.
    if (*area > kLargestAreaHa) {
        return "the area_ha \"" + row.text(Column::kAreaHa) +
               "\" is larger than a sub-compartment can be (100000 ha)";
    }
    plan.areaHa = *area;

    auto regime = regimeOf(row, defaults.regime);
    if (const auto *fault = std::get_if<std::string>(&regime)) {
        return *fault;
    }
    plan.regime = std::get<rotation::Regime>(regime);
    const AgeValue rotationAge = ageValue(row, Column::kRotation, defaults.rotation, 1);
    if (rotationAge.fault) {
        return *rotationAge.fault;
    }
    plan.rotation = rotationAge.value;
    return plan;
}

} // namespace arbolex::estate
