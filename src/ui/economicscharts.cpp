#include "ui/economicscharts.hpp"

#include "economics/economicsformat.hpp"
#include "economics/economicsmessages.hpp"

#include <QAreaSeries>
#include <QBarCategoryAxis>
#include <QBarSet>
#include <QCategoryAxis>
#include <QChart>
#include <QHorizontalStackedBarSeries>
#include <QLineSeries>
#include <QPen>
#include <QValueAxis>

#include <algorithm>
#include <cmath>
#include <limits>

namespace arbolex::ui {

namespace et = economics::economicstext;

namespace {

// Colours that stay apart for readers with the common colour deficiencies.
const QColor kBlue(0, 114, 178);
const QColor kGreen(0, 158, 115);
const QColor kOrange(230, 159, 0);
const QColor kVermilion(213, 94, 0);
const QColor kGrey(110, 110, 110);

/// A value axis from `low` to `high` whose labels carry thousands separators:
/// a category axis labelled at round values (about six of them).
QCategoryAxis *moneyAxis(double low, double high, const QString &title) {
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
    const double first = std::floor(low / step) * step;
    const double last = std::ceil(high / step) * step;
    auto *axis = new QCategoryAxis;
    axis->setLabelsPosition(QCategoryAxis::AxisLabelsPositionOnValue);
    axis->setRange(first, last);
    for (double v = first; v <= last + step / 2.0; v += step) {
        axis->append(economics::euroText(v), v);
    }
    axis->setTitleText(title);
    axis->setGridLineVisible(true);
    return axis;
}

QChart *newChart(const QString &title) {
    auto *chart = new QChart;
    chart->setTitle(title);
    QFont font = chart->titleFont();
    font.setBold(true);
    font.setPointSizeF(font.pointSizeF() * 1.1);
    chart->setTitleFont(font);
    chart->legend()->setAlignment(Qt::AlignBottom);
    // Room on the right for the last label of the bottom axis.
    chart->setMargins(QMargins(6, 6, 28, 6));
    chart->setAnimationOptions(QChart::NoAnimation);
    return chart;
}

QLineSeries *line(const QString &name, const QColor &colour, qreal width,
                  Qt::PenStyle style = Qt::SolidLine) {
    auto *series = new QLineSeries;
    series->setName(name);
    QPen pen(colour);
    pen.setWidthF(width);
    pen.setStyle(style);
    series->setPen(pen);
    return series;
}

/// A vertical mark at `x` from `low` to `high` on the chart's axes.
void mark(QChart *chart, QAbstractAxis *xAxis, QAbstractAxis *yAxis, double x, double low,
          double high, const QString &name, const QColor &colour) {
    QLineSeries *series = line(name, colour, 1.6, Qt::DashLine);
    series->append(x, low);
    series->append(x, high);
    chart->addSeries(series);
    series->attachAxis(xAxis);
    series->attachAxis(yAxis);
}

QString capitalised(const std::string &text) {
    QString s = QString::fromStdString(text);
    if (!s.isEmpty()) {
        s[0] = s[0].toUpper();
    }
    return s;
}

} // namespace

QChart *rotationChart(const rotation::RotationExplorer &explorer, const QString &title) {
    QChart *chart = newChart(title);
    if (explorer.rows.empty()) {
        return chart;
    }
    QLineSeries *npv = line(et::seriesNpv(), kBlue, 2.4);
    QLineSeries *lev = line(et::seriesLev(), kGreen, 2.4);
    QLineSeries *mai = line(et::seriesMai(), kOrange, 2.0, Qt::DotLine);
    double low = 0.0;
    double high = 0.0;
    double maiHigh = 0.0;
    for (const rotation::RotationRow &row : explorer.rows) {
        if (row.npv) {
            npv->append(row.age, *row.npv);
            low = std::min(low, *row.npv);
            high = std::max(high, *row.npv);
        }
        if (row.lev) {
            lev->append(row.age, *row.lev);
            low = std::min(low, *row.lev);
            high = std::max(high, *row.lev);
        }
        mai->append(row.age, row.mai);
        maiHigh = std::max(maiHigh, row.mai);
    }
    auto *ages = new QValueAxis;
    ages->setRange(explorer.rows.front().age, explorer.rows.back().age);
    ages->setLabelFormat(QStringLiteral("%d"));
    ages->setTickType(QValueAxis::TicksDynamic);
    ages->setTickAnchor(0);
    ages->setTickInterval(5);
    ages->setMinorTickCount(4);
    ages->setTitleText(et::axisRotationAge());
    QCategoryAxis *money = moneyAxis(low, high, et::axisMoney());
    auto *increment = new QValueAxis;
    increment->setRange(0.0, std::ceil(maiHigh * 1.15));
    increment->setLabelFormat(QStringLiteral("%.0f"));
    increment->setTitleText(et::axisMai());
    increment->setGridLineVisible(false);
    chart->addAxis(ages, Qt::AlignBottom);
    chart->addAxis(money, Qt::AlignLeft);
    chart->addAxis(increment, Qt::AlignRight);
    for (QLineSeries *s : {npv, lev}) {
        chart->addSeries(s);
        s->attachAxis(ages);
        s->attachAxis(money);
    }
    chart->addSeries(mai);
    mai->attachAxis(ages);
    mai->attachAxis(increment);
    if (explorer.biologicalRotation > 0) {
        mark(chart, ages, money, explorer.biologicalRotation, money->min(), money->max(),
             et::markBiological() + QStringLiteral(": ") +
                 QString::number(explorer.biologicalRotation) + QStringLiteral(" yr"),
             kVermilion);
    }
    if (explorer.economicRotation > 0) {
        mark(chart, ages, money, explorer.economicRotation, money->min(), money->max(),
             et::markEconomic() + QStringLiteral(": ") +
                 QString::number(explorer.economicRotation) + QStringLiteral(" yr"),
             kGrey);
    }
    return chart;
}

QChart *tornadoChart(const std::vector<rotation::TornadoBar> &bars, double base, bool lev,
                     const QString &title) {
    QChart *chart = newChart(title);
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
            shown.push_back({capitalised(b.factor) + QStringLiteral("<br>") +
                                 economics::euroText(*low) + QStringLiteral(" to ") +
                                 economics::euroText(*high) + QStringLiteral(" €/ha"),
                             *low - base, *high - base});
        }
    }
    // The widest swing on top: bar categories run from the bottom up.
    std::sort(shown.begin(), shown.end(), [](const Bar &a, const Bar &b) {
        return std::fabs(a.high - a.low) < std::fabs(b.high - b.low);
    });
    auto *lowSet = new QBarSet(et::seriesLow());
    auto *highSet = new QBarSet(et::seriesHigh());
    lowSet->setColor(kVermilion);
    highSet->setColor(kBlue);
    QStringList names;
    double extent = 1.0;
    for (const Bar &b : shown) {
        lowSet->append(b.low);
        highSet->append(b.high);
        names << b.name;
        extent = std::max({extent, std::fabs(b.low), std::fabs(b.high)});
    }
    auto *series = new QHorizontalStackedBarSeries;
    series->append(lowSet);
    series->append(highSet);
    series->setBarWidth(0.6);
    chart->addSeries(series);
    auto *factors = new QBarCategoryAxis;
    factors->append(names);
    QCategoryAxis *change =
        moneyAxis(-extent * 1.05, extent * 1.05,
                  QStringLiteral("Change from ") + economics::euroText(base) +
                      (lev ? QStringLiteral(" €/ha (LEV)") : QStringLiteral(" €/ha (NPV)")));
    chart->addAxis(factors, Qt::AlignLeft);
    chart->addAxis(change, Qt::AlignBottom);
    series->attachAxis(factors);
    series->attachAxis(change);
    return chart;
}

QChart *histogramChart(const rotation::MonteCarloResult &result, const QString &title) {
    QChart *chart = newChart(title);
    const auto bins = static_cast<int>(result.histogram.size());
    if (bins == 0) {
        return chart;
    }
    const double width =
        result.npvHighest > result.npvLowest ? (result.npvHighest - result.npvLowest) / bins : 1.0;
    auto *outline = new QLineSeries;
    auto *floor = new QLineSeries;
    int tallest = 1;
    for (int i = 0; i < bins; ++i) {
        const double left = result.npvLowest + i * width;
        const int count = result.histogram[static_cast<std::size_t>(i)];
        outline->append(left, count);
        outline->append(left + width, count);
        floor->append(left, 0.0);
        floor->append(left + width, 0.0);
        tallest = std::max(tallest, count);
    }
    auto *bars = new QAreaSeries(outline, floor);
    bars->setName(et::axisDraws());
    QColor fill = kBlue;
    fill.setAlpha(150);
    bars->setBrush(fill);
    bars->setPen(QPen(kBlue.darker(130), 1.2));
    chart->addSeries(bars);
    QCategoryAxis *npv =
        moneyAxis(std::min(result.npvLowest, 0.0), std::max(result.npvHighest, 0.0), et::axisNpv());
    auto *draws = new QValueAxis;
    draws->setRange(0, tallest * 1.1);
    draws->applyNiceNumbers();
    draws->setLabelFormat(QStringLiteral("%d"));
    draws->setTitleText(et::axisDraws());
    chart->addAxis(npv, Qt::AlignBottom);
    chart->addAxis(draws, Qt::AlignLeft);
    bars->attachAxis(npv);
    bars->attachAxis(draws);
    const double top = draws->max();
    mark(chart, npv, draws, result.npv.p5, 0.0, top,
         QStringLiteral("P5 ") + economics::euroText(result.npv.p5), kVermilion);
    mark(chart, npv, draws, result.npv.p50, 0.0, top,
         QStringLiteral("P50 ") + economics::euroText(result.npv.p50), kGreen);
    mark(chart, npv, draws, result.npv.p95, 0.0, top,
         QStringLiteral("P95 ") + economics::euroText(result.npv.p95), kGrey);
    return chart;
}

} // namespace arbolex::ui
