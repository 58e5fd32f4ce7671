#include "economics/tableregime.hpp"

#include "engine/grow.hpp"
#include "work/projectiontable.hpp"
#include "work/standwork.hpp"

#include <QLocale>

#include <algorithm>
#include <cmath>
#include <numeric>

namespace arbolex::economics {

namespace {

/// Removals closer than this count as the same volume, m³/ha: the volume
/// method leaves the typed removal up to single-precision rounding.
constexpr float kSameVolume = 0.05f;

int wholeAge(float age) {
    return static_cast<int>(std::nearbyint(age));
}

QString volumeText(double volume) {
    return QLocale(QLocale::English).toString(volume, 'f', volume == std::round(volume) ? 0 : 1);
}

/// "20, 25 and 30"
QString ageList(const std::vector<int> &ages) {
    QString list;
    for (std::size_t i = 0; i < ages.size(); ++i) {
        if (i > 0) {
            list += i + 1 == ages.size() ? QStringLiteral(" and ") : QStringLiteral(", ");
        }
        list += QString::number(ages[i]);
    }
    return list;
}

} // namespace

std::optional<rotation::Stand> standFromTable(const work::ProjectionTable &table,
                                              std::int16_t model) {
    for (int r = 1; r <= table.lastRow(); ++r) {
        const work::TableRow &row = table.row(r);
        if (row.isGrowth()) {
            // The stand before any thinning of that age.
            const work::RowRecord &s = row.record;
            return rotation::Stand{model, s.age, s.stocking + s.removedStocking, s.topHeight,
                                   s.basalArea + s.removedBasalArea};
        }
    }
    return std::nullopt;
}

TableRegime regimeFromTable(const work::ProjectionTable &table) {
    TableRegime t;
    for (int r = 1; r <= table.lastRow(); ++r) {
        const work::TableRow &row = table.row(r);
        if (row.finalCut) {
            t.finalCut = wholeAge(row.record.age);
        } else if (row.isThinning()) {
            t.ages.push_back(wholeAge(row.record.age));
            t.volumes.push_back(row.record.removedVolume);
        }
    }
    // A thinning in the year of the final cut is part of the final cut.
    while (t.finalCut && !t.ages.empty() && t.ages.back() >= *t.finalCut) {
        t.ages.pop_back();
        t.volumes.pop_back();
    }
    if (t.ages.empty()) {
        return t;
    }
    const auto n = static_cast<int>(t.ages.size());
    const float mean = std::accumulate(t.volumes.begin(), t.volumes.end(), 0.0f) /
                       static_cast<float>(t.volumes.size());
    const auto [lightest, heaviest] = std::minmax_element(t.volumes.begin(), t.volumes.end());
    bool sameIntervals = true;
    for (int i = 2; i < n; ++i) {
        sameIntervals = sameIntervals && t.ages[static_cast<std::size_t>(i)] -
                                                 t.ages[static_cast<std::size_t>(i - 1)] ==
                                             t.ages[1] - t.ages[0];
    }
    t.irregular = !sameIntervals || *heaviest - *lightest > kSameVolume;
    t.regime.thinFrom = t.ages.front();
    t.regime.thinUntil = t.ages.back();
    t.regime.thinEvery =
        n > 1 ? std::max(1, static_cast<int>(std::nearbyint(
                                static_cast<double>(t.ages.back() - t.ages.front()) / (n - 1))))
              : 1;
    // Read back to the hundredth of a m³/ha, so a typed removal comes back as typed.
    t.regime.thinVolume = std::round((t.irregular ? mean : t.volumes.front()) * 100.0f) / 100.0f;
    return t;
}

namespace {

/// A stand the table shows at a whole age: its volume before the harvests of
/// the age and after them, m³/ha.
struct Shown {
    int age = 0;
    float before = 0.0f;
    float after = 0.0f;
};

/// Standing volume before any harvest of each age from the first shown to
/// the last, m³/ha: shown where the table has a row, in a straight line from
/// the stand left at one row to the stand grown at the next between them.
std::vector<float> standingByAge(const std::vector<Shown> &shown) {
    std::vector<float> standing;
    for (std::size_t i = 0; i < shown.size(); ++i) {
        standing.push_back(shown[i].before);
        if (i + 1 == shown.size()) {
            break;
        }
        const Shown &from = shown[i];
        const Shown &to = shown[i + 1];
        for (int a = from.age + 1; a < to.age; ++a) {
            const double t = static_cast<double>(a - from.age) / (to.age - from.age);
            standing.push_back(
                static_cast<float>(from.after + t * (double{to.before} - double{from.after})));
        }
    }
    return standing;
}

} // namespace

std::optional<rotation::RotationHarvests>
harvestsFromTable(const work::ProjectionTable &table, std::int16_t model,
                  const engine::VolumeRatioCoefficients &volumeRatio) {
    rotation::RotationHarvests h;
    h.model = model;
    h.volumeRatio = volumeRatio;
    std::vector<Shown> shown;
    bool felled = false;
    for (int r = 1; r <= table.lastRow() && !felled; ++r) {
        const work::TableRow &row = table.row(r);
        const work::RowRecord &s = row.record;
        const int age = wholeAge(s.age);
        if (row.finalCut) {
            felled = true;
            h.rotation = age;
            h.finalCut = rotation::finalCutHarvest(
                h.rotation, {s.age, s.basalArea, s.stocking, s.topHeight, s.volume});
        } else if (row.isThinning()) {
            h.thinnings.push_back(rotation::thinningHarvest(
                age, s.removedVolume, s.removedStocking, s.removedBasalArea,
                {s.age, s.basalArea, s.stocking, s.topHeight, s.volume}));
        }
        if (row.isText()) {
            continue;
        }
        if (!shown.empty() && shown.back().age == age) {
            // A thinning, or the final cut, of the stand grown to this age.
            shown.back().after = row.finalCut ? 0.0f : s.volume;
        } else if (shown.empty() || shown.back().age < age) {
            shown.push_back({age, s.volume, s.volume});
        }
    }
    if (!felled) {
        return std::nullopt;
    }
    // The cash flow's first year.
    h.presentAge = static_cast<int>(std::nearbyint(table.row(1).numbers[work::kNumAge]));
    if (!shown.empty() && shown.front().age == h.presentAge && shown.back().age == h.rotation) {
        h.standing = standingByAge(shown);
    }
    return h;
}

std::optional<rotation::RotationValue> valueTableRotation(const work::StandWork &work,
                                                          const rotation::Economics &economics) {
    // The engine holds the model in use, whose volume-ratio function divides
    // the harvests as the economics window's path does.
    const engine::Grow &grow = work.grow();
    const auto harvests = harvestsFromTable(work.table(), grow.modelId(), grow.volumeRatio());
    if (!harvests) {
        return std::nullopt;
    }
    return rotation::valueHarvests(*harvests, economics, rotation::Appraisal::kWithoutRates);
}

QString describeTableRotation(const rotation::RotationHarvests &h) {
    const QString cut =
        QStringLiteral("final cut at ") + QString::number(h.rotation) + QStringLiteral(" years");
    if (h.thinnings.empty()) {
        return QStringLiteral("No thinning; ") + cut + QLatin1Char('.');
    }
    std::vector<int> ages;
    float lightest = h.thinnings.front().volume;
    float heaviest = lightest;
    for (const rotation::Harvest &t : h.thinnings) {
        ages.push_back(t.age);
        lightest = std::min(lightest, t.volume);
        heaviest = std::max(heaviest, t.volume);
    }
    // Removals closer than kSameVolume read as one volume, as the typed one.
    const QString volumes = heaviest - lightest > kSameVolume
                                ? volumeText(std::round(lightest * 10.0f) / 10.0f) +
                                      QStringLiteral(" to ") +
                                      volumeText(std::round(heaviest * 10.0f) / 10.0f)
                                : volumeText(std::round(lightest * 100.0f) / 100.0f);
    return (ages.size() > 1 ? QStringLiteral("Thinnings of ") : QStringLiteral("Thinning of ")) +
           volumes + QStringLiteral(" m³/ha at ") + ageList(ages) + QStringLiteral(" years; ") +
           cut + QLatin1Char('.');
}

QString describeRegime(const rotation::Regime &regime, int rotation) {
    const QString cut =
        QStringLiteral("final cut at ") + QString::number(rotation) + QStringLiteral(" years");
    if (!regime.thins()) {
        return QStringLiteral("No thinning; ") + cut + QLatin1Char('.');
    }
    std::vector<int> ages;
    const int until = regime.thinUntil.value_or(rotation - 1);
    for (int a = regime.thinFrom; a <= until && a < rotation; a += regime.thinEvery) {
        ages.push_back(a);
    }
    return QStringLiteral("Thinning ") + volumeText(regime.thinVolume) +
           QStringLiteral(" m³/ha at ") + ageList(ages) + QStringLiteral(" years; ") + cut +
           QLatin1Char('.');
}

QString irregularNote(const TableRegime &t, bool everyFigure) {
    if (!t.irregular) {
        return {};
    }
    const auto [lightest, heaviest] = std::minmax_element(t.volumes.begin(), t.volumes.end());
    return QStringLiteral("Your thinnings are irregular (at ") + ageList(t.ages) +
           QStringLiteral(" years, ") + volumeText(*lightest) + QStringLiteral(" to ") +
           volumeText(*heaviest) + QStringLiteral(" m³/ha). ") +
           (everyFigure ? QStringLiteral("Valued as a regular regime")
                        : QStringLiteral("The explorer and the optimiser take them as a regular "
                                         "regime")) +
           QStringLiteral(": their mean interval, ") + QString::number(t.regime.thinEvery) +
           QStringLiteral(" years, and their mean volume, ") + volumeText(t.regime.thinVolume) +
           QStringLiteral(" m³/ha.");
}

} // namespace arbolex::economics
