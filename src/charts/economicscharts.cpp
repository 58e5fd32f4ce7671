#include "charts/economicscharts.hpp"

#include "economics/economicsformat.hpp"
#include "economics/economicsmessages.hpp"
#include "economics/economicswindowlogic.hpp"

#include <algorithm>
#include <cmath>

namespace arbolex::charts {

namespace et = economics::economicstext;
using economics::EconomicsControl;
using economics::euroText;

namespace {

// Colours that stay apart for readers with the common colour deficiencies.
constexpr std::uint32_t kBlue = 0x0072b2;
constexpr std::uint32_t kGreen = 0x009e73;
constexpr std::uint32_t kOrange = 0xe69f00;
constexpr std::uint32_t kVermilion = 0xd55e00;
constexpr std::uint32_t kGrey = 0x6e6e6e;
constexpr std::uint32_t kReddishPurple = 0xcc79a7;

/// Line widths, pixels: the money a little bolder than the increment.
constexpr double kMoneyLine = 2.4;
constexpr double kIncrementLine = 2.0;
constexpr double kHistogramOutline = 1.2;
/// Share of a factor's band its tornado bar fills.
constexpr double kTornadoBar = 0.6;

ChartSeries series(const QString &name, const QString &unit, int axis, std::uint32_t colour) {
    ChartSeries s;
    s.name = name;
    s.unit = unit;
    s.axis = axis;
    s.colour = colour;
    return s;
}

QString capitalised(const std::string &text) {
    QString s = QString::fromStdString(text);
    if (!s.isEmpty()) {
        s[0] = s[0].toUpper();
    }
    return s;
}

/// "Biological: 52 yr".
QString rotationLabel(const QString &name, int age) {
    return name + QStringLiteral(": ") + QString::number(age) + QStringLiteral(" yr");
}

} // namespace

ChartAxis moneyAxis(double low, double high, const QString &title) {
    if (!(high > low)) {
        low -= 1.0;
        high += 1.0;
    }
    const double rough = (high - low) / 6.0;
    const double magnitude = std::pow(10.0, std::floor(std::log10(rough)));
    double step = magnitude;
    for (const double m : {1.0, 2.0, 2.5, 5.0, 10.0}) {
        if (m * magnitude >= rough) {
            step = m * magnitude;
            break;
        }
    }
    ChartAxis axis;
    axis.title = title;
    const double first = std::floor(low / step) * step;
    const double last = std::ceil(high / step) * step;
    axis.min = first;
    axis.max = last;
    for (double v = first; v <= last + step / 2.0; v += step) {
        axis.ticks.push_back({v, euroText(v)});
    }
    return axis;
}

ChartData rotationChart(const rotation::RotationExplorer &explorer, const QString &title,
                        int economicWithoutCarbon) {
    ChartData chart;
    chart.title = title;
    if (explorer.rows.empty()) {
        return chart;
    }
    const QString money = et::axisMoney();
    ChartSeries npv = series(et::seriesNpv(), money, kAxisMoney, kBlue);
    ChartSeries lev = series(et::seriesLev(), money, kAxisMoney, kGreen);
    ChartSeries mai = series(et::seriesMai(), QStringLiteral("m³/ha/yr"), kAxisMai, kOrange);
    npv.width = lev.width = kMoneyLine;
    mai.width = kIncrementLine;
    mai.pattern = ChartSeries::Pattern::Dotted;
    // The money axis always shows 0.
    double low = 0.0;
    double high = 0.0;
    double maiHigh = 0.0;
    for (const rotation::RotationRow &row : explorer.rows) {
        for (auto [value, line] : {std::pair{row.npv, &npv}, std::pair{row.lev, &lev}}) {
            if (value) {
                line->points.push_back({static_cast<double>(row.age), *value});
                low = std::min(low, *value);
                high = std::max(high, *value);
            }
        }
        mai.points.push_back({static_cast<double>(row.age), row.mai});
        maiHigh = std::max(maiHigh, row.mai);
    }
    chart.x.title = et::axisRotationAge();
    chart.x.min = explorer.rows.front().age;
    chart.x.max = explorer.rows.back().age;
    chart.x.step = 5.0;
    chart.x.minorTicks = 4;
    chart.x.decimals = 0;
    ChartAxis increment;
    increment.title = et::axisMai();
    increment.right = true;
    increment.min = 0.0;
    increment.max = std::ceil(maiHigh * 1.15);
    increment.decimals = 0;
    increment.grid = false;
    chart.axes = {moneyAxis(low, high, money), increment};
    chart.series = {std::move(npv), std::move(lev), std::move(mai)};
    if (explorer.biologicalRotation > 0) {
        chart.markers.push_back({static_cast<double>(explorer.biologicalRotation),
                                 rotationLabel(et::markBiological(), explorer.biologicalRotation),
                                 kVermilion, kAxisMoney});
    }
    if (explorer.economicRotation > 0) {
        chart.markers.push_back({static_cast<double>(explorer.economicRotation),
                                 rotationLabel(et::markEconomic(), explorer.economicRotation),
                                 kGrey, kAxisMoney});
    }
    if (economicWithoutCarbon > 0 && economicWithoutCarbon != explorer.economicRotation) {
        chart.markers.push_back(
            {static_cast<double>(economicWithoutCarbon),
             rotationLabel(et::markEconomicWithoutCarbon(), economicWithoutCarbon), kReddishPurple,
             kAxisMoney});
    }
    return chart;
}

ChartData tornadoChart(const std::vector<rotation::TornadoBar> &bars, double base, bool lev,
                       const QString &title) {
    struct Bar {
        QString name;
        double low;
        double high;
    };
    std::vector<Bar> shown;
    for (const rotation::TornadoBar &b : bars) {
        const std::optional<double> &low = lev ? b.levLow : b.npvLow;
        const std::optional<double> &high = lev ? b.levHigh : b.npvHigh;
        if (low && high) {
            shown.push_back({capitalised(b.factor) + QStringLiteral("<br>") + euroText(*low) +
                                 QStringLiteral(" to ") + euroText(*high) + QStringLiteral(" €/ha"),
                             *low - base, *high - base});
        }
    }
    // The widest swing on top: categories run from the bottom up.
    std::sort(shown.begin(), shown.end(), [](const Bar &a, const Bar &b) {
        return std::fabs(a.high - a.low) < std::fabs(b.high - b.low);
    });
    ChartData chart;
    chart.title = title;
    ChartSeries lowEnd = series(et::seriesLow(), et::axisMoney(), 0, kVermilion);
    ChartSeries highEnd = series(et::seriesHigh(), et::axisMoney(), 0, kBlue);
    double extent = 1.0;
    for (const Bar &b : shown) {
        const auto at = static_cast<double>(chart.categories.size());
        lowEnd.points.push_back({at, b.low});
        highEnd.points.push_back({at, b.high});
        chart.categories << b.name;
        extent = std::max({extent, std::fabs(b.low), std::fabs(b.high)});
    }
    for (ChartSeries *end : {&lowEnd, &highEnd}) {
        end->style = ChartSeries::Style::LyingBars;
        end->barWidth = kTornadoBar;
    }
    chart.series = {std::move(lowEnd), std::move(highEnd)};
    chart.axes = {
        moneyAxis(-extent * 1.05, extent * 1.05,
                  QStringLiteral("Change from ") + euroText(base) +
                      (lev ? QStringLiteral(" €/ha (LEV)") : QStringLiteral(" €/ha (NPV)")))};
    return chart;
}

ChartData histogramChart(const rotation::MonteCarloResult &result, const QString &title) {
    ChartData chart;
    chart.title = title;
    const auto bins = static_cast<int>(result.histogram.size());
    if (bins == 0) {
        return chart;
    }
    ChartSeries draws = series(et::axisDraws(), QString(), 0, kBlue);
    draws.style = ChartSeries::Style::Histogram;
    draws.width = kHistogramOutline;
    draws.barWidth =
        result.npvHighest > result.npvLowest ? (result.npvHighest - result.npvLowest) / bins : 1.0;
    int tallest = 1;
    for (int i = 0; i < bins; ++i) {
        const int count = result.histogram[static_cast<std::size_t>(i)];
        draws.points.push_back({result.npvLowest + i * draws.barWidth, static_cast<double>(count)});
        tallest = std::max(tallest, count);
    }
    chart.series = {std::move(draws)};
    chart.x =
        moneyAxis(std::min(result.npvLowest, 0.0), std::max(result.npvHighest, 0.0), et::axisNpv());
    ChartAxis count;
    count.title = et::axisDraws();
    count.min = 0.0;
    count.max = tallest * 1.1;
    count.rounded = true;
    count.decimals = 0;
    chart.axes = {count};
    const auto percentile = [&](const char *name, double value, std::uint32_t colour) {
        chart.markers.push_back(
            {value, QLatin1String(name) + QLatin1Char(' ') + euroText(value), colour, 0});
    };
    percentile("P5", result.npv.p5, kVermilion);
    percentile("P50", result.npv.p50, kGreen);
    percentile("P95", result.npv.p95, kGrey);
    return chart;
}

EconomicsCharts economicsCharts(economics::EconomicsWindowLogic &logic) {
    EconomicsCharts charts;
    const QString rate = QLatin1Char(' ') + et::atRate(logic.rateText());
    charts.rotations = rotationChart(logic.explorer(), et::panelRotations() + rate,
                                     logic.economicRotationWithoutCarbon());
    const auto &value = logic.value();
    if (value && value->npv && value->lev) {
        charts.tornadoNpv =
            tornadoChart(logic.tornado(), *value->npv, false, et::panelTornadoNpv() + rate);
        charts.tornadoLev =
            tornadoChart(logic.tornado(), *value->lev, true, et::panelTornadoLev() + rate);
    }
    if (const auto &draws = logic.monteCarlo()) {
        const economics::IEconomicsView &view = logic.view();
        charts.draws = histogramChart(
            *draws, et::panelMonteCarlo() + QStringLiteral(" (rate drawn from ") +
                        view.text(EconomicsControl::txtRateLow) + QStringLiteral(" to ") +
                        view.text(EconomicsControl::txtRateHigh) + QStringLiteral(" % a year)"));
    }
    return charts;
}

} // namespace arbolex::charts
