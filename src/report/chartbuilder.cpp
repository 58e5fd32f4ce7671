#include "report/chartbuilder.hpp"

#include <QAreaSeries>
#include <QBarCategoryAxis>
#include <QBarSet>
#include <QCategoryAxis>
#include <QFont>
#include <QHorizontalStackedBarSeries>
#include <QLegendMarker>
#include <QLineSeries>
#include <QPen>
#include <QScatterSeries>
#include <QStackedBarSeries>
#include <QValueAxis>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

namespace arbolex::report {

using charts::ChartAxis;
using charts::ChartData;
using charts::ChartPoint;
using charts::ChartSeries;
using Style = charts::ChartSeries::Style;

namespace {

/// Colours of the series in order: distinct in print and for colour-blind readers.
constexpr std::array<QRgb, 6> kPalette = {0x1b6ca8, 0x2e8b57, 0xb8860b,
                                          0x8b3a3a, 0x6a4c93, 0x555555};
constexpr QRgb kMarkColour = 0xc0392b;
/// Entries a legend holds in its own type.
constexpr std::size_t kRoomyLegend = 5;
/// Room at the ends of a year axis for the half width of a bar, years.
constexpr double kEndRoom = 0.4;
/// Width of a line, of a marker's dashes, pixels.
constexpr double kLineWidth = 2.0;
constexpr double kMarkerWidth = 1.6;
/// Opacity of a histogram's bins, of 255: the markers behind them show through.
constexpr int kBinOpacity = 150;
/// Outlines of bars a shade darker than their fill, percent.
constexpr int kOutlineShade = 130;

struct Range {
    double low = std::numeric_limits<double>::max();
    double high = std::numeric_limits<double>::lowest();
    void include(double v) {
        low = std::min(low, v);
        high = std::max(high, v);
    }
    bool valid() const { return low <= high; }
};

QFont sized(int pointSize, bool bold = false) {
    QFont font;
    font.setPointSize(pointSize);
    font.setBold(bold);
    return font;
}

QColor colourOf(const ChartSeries &s, std::size_t index) {
    return QColor(s.colour ? static_cast<QRgb>(*s.colour) : kPalette.at(index % kPalette.size()));
}

bool isBarChart(const ChartData &data) {
    return std::any_of(data.series.begin(), data.series.end(), [](const ChartSeries &s) {
        return s.style == Style::StackedBars || s.style == Style::LyingBars;
    });
}

bool lying(const ChartData &data) {
    return std::any_of(data.series.begin(), data.series.end(),
                       [](const ChartSeries &s) { return s.style == Style::LyingBars; });
}

/// The chart with its title, legend and margins.
QChart *newChart(const ChartData &data, ChartLook look) {
    auto *chart = new QChart;
    chart->setTitle(data.note.isEmpty()
                        ? data.title
                        : QStringLiteral("%1<br><span style=\"font-size:9pt; font-weight:normal\">"
                                         "%2</span>")
                              .arg(data.title.toHtmlEscaped(), data.note.toHtmlEscaped()));
    chart->legend()->setAlignment(Qt::AlignBottom);
    // A crowded legend in smaller type, so its names are not cut short.
    const bool crowded = data.series.size() + data.markers.size() > kRoomyLegend;
    if (look == ChartLook::Report) {
        chart->setTitleFont(sized(12, true));
        chart->legend()->setFont(sized(crowded ? 8 : 9));
        chart->setMargins(QMargins(6, 6, 6, 6));
        chart->setBackgroundRoundness(0);
        return chart;
    }
    if (crowded) {
        QFont small = chart->legend()->font();
        small.setPointSizeF(small.pointSizeF() * 0.85);
        chart->legend()->setFont(small);
    }
    QFont font = chart->titleFont();
    font.setBold(true);
    font.setPointSizeF(font.pointSizeF() * 1.1);
    chart->setTitleFont(font);
    // A value axis along the bottom centres its last label on the plot's
    // right edge: room for it.
    const bool valuesAlongBottom = !isBarChart(data) || lying(data);
    chart->setMargins(QMargins(6, 6, valuesAlongBottom ? 28 : 6, 6));
    chart->setAnimationOptions(QChart::NoAnimation);
    return chart;
}

/// An axis of values: labels at the data's ticks (a category axis), else at
/// steps of its own.
QValueAxis *valueAxis(const ChartAxis &a, ChartLook look) {
    QValueAxis *axis = nullptr;
    if (!a.ticks.empty()) {
        auto *labelled = new QCategoryAxis;
        labelled->setLabelsPosition(QCategoryAxis::AxisLabelsPositionOnValue);
        labelled->setRange(a.min.value_or(a.ticks.front().value),
                           a.max.value_or(a.ticks.back().value));
        for (const charts::AxisTick &tick : a.ticks) {
            labelled->append(tick.label, tick.value);
        }
        axis = labelled;
    } else {
        axis = new QValueAxis;
        if (look == ChartLook::Report) {
            axis->setLabelFormat(QStringLiteral("%.0f"));
        }
        if (a.decimals) {
            axis->setLabelFormat(QStringLiteral("%.") + QString::number(*a.decimals) +
                                 QLatin1Char('f'));
        }
        if (a.step > 0.0) {
            axis->setTickType(QValueAxis::TicksDynamic);
            axis->setTickAnchor(0.0);
            axis->setTickInterval(a.step);
        }
        if (a.minorTicks > 0) {
            axis->setMinorTickCount(a.minorTicks);
        }
    }
    axis->setTitleText(a.title);
    axis->setGridLineVisible(a.grid);
    if (look == ChartLook::Report) {
        axis->setTitleFont(sized(9));
        axis->setLabelsFont(sized(8));
        axis->setGridLineColor(QColor(0xdd, 0xdd, 0xdd));
        // Years between the labelled ages: faint, or the plot turns grey on paper.
        axis->setMinorGridLineColor(QColor(0xf0, 0xf0, 0xf0));
    }
    return axis;
}

/// The range the data sets, once the series are attached (a category axis
/// has its own from the start).
void setFixedRange(QValueAxis *axis, const ChartAxis &a) {
    if (!a.ticks.empty()) {
        return;
    }
    if (a.min && a.max) {
        axis->setRange(*a.min, *a.max);
    } else if (a.min) {
        axis->setMin(*a.min);
    } else if (a.max) {
        axis->setMax(*a.max);
    }
    if (a.rounded) {
        axis->applyNiceNumbers();
    }
}

/// A readable step: 1, 2, 2.5 or 5 times a power of ten, at least `rough`.
double niceStep(double rough) {
    if (!(rough > 0.0)) {
        return 1.0;
    }
    const double power = std::pow(10.0, std::floor(std::log10(rough)));
    for (const double factor : {1.0, 2.0, 2.5, 5.0, 10.0}) {
        if (factor * power >= rough) {
            return factor * power;
        }
    }
    return 10.0 * power;
}

/// Ranges of the value axes from 0 (or below, for money spent) to their
/// highest value in readable steps, every axis with the same number of steps
/// below and above 0: their zeros and grid lines are level.
void setAlignedRanges(const std::vector<QValueAxis *> &axes, std::vector<Range> ranges) {
    if (axes.empty()) {
        return;
    }
    constexpr double kSteps = 5.0;
    int below = 0;
    int above = 1;
    std::vector<double> steps;
    for (Range &range : ranges) {
        if (!range.valid()) {
            range = {0.0, 1.0};
        }
        range.include(0.0);
        const double step = niceStep((range.high - range.low) / kSteps);
        steps.push_back(step);
        below = std::max(below, static_cast<int>(std::ceil(-range.low / step - 1e-9)));
        above = std::max(above, static_cast<int>(std::ceil(range.high / step - 1e-9)));
    }
    for (std::size_t a = 0; a < axes.size(); ++a) {
        axes[a]->setRange(-below * steps[a], above * steps[a]);
        axes[a]->setTickCount(below + above + 1);
        // A small step (a top height in tenths) needs its decimals.
        if (steps[a] < 1.0) {
            axes[a]->setLabelFormat(QStringLiteral("%.1f"));
        }
    }
}

QPen linePen(QColor colour, double width, ChartSeries::Pattern pattern) {
    QPen pen(colour);
    pen.setWidthF(width);
    if (pattern == ChartSeries::Pattern::Dashed) {
        pen.setStyle(Qt::DashLine);
    } else if (pattern == ChartSeries::Pattern::Dotted) {
        pen.setStyle(Qt::DotLine);
    }
    return pen;
}

QXYSeries *lineSeries(const ChartSeries &s, QColor colour) {
    auto *line = new QLineSeries;
    for (const ChartPoint &p : s.points) {
        line->append(p.x, p.y);
    }
    line->setPen(linePen(colour, s.width > 0.0 ? s.width : kLineWidth, s.pattern));
    return line;
}

/// Bars centred on their x as filled outlines on the numeric axis.
QAreaSeries *barSeries(const ChartSeries &s, QColor colour) {
    auto *outline = new QLineSeries;
    auto *base = new QLineSeries;
    for (const ChartPoint &p : s.points) {
        const double left = p.x - s.barWidth / 2.0;
        const double right = p.x + s.barWidth / 2.0;
        outline->append(left, 0.0);
        outline->append(left, p.y);
        outline->append(right, p.y);
        outline->append(right, 0.0);
        base->append(left, 0.0);
        base->append(right, 0.0);
    }
    auto *bars = new QAreaSeries(outline, base);
    bars->setColor(colour);
    bars->setBorderColor(colour.darker(kOutlineShade));
    return bars;
}

/// Bins from their x to x + the bar width, side by side as one outline.
QAreaSeries *histogramSeries(const ChartSeries &s, QColor colour) {
    auto *outline = new QLineSeries;
    auto *floor = new QLineSeries;
    for (const ChartPoint &p : s.points) {
        outline->append(p.x, p.y);
        outline->append(p.x + s.barWidth, p.y);
        floor->append(p.x, 0.0);
        floor->append(p.x + s.barWidth, 0.0);
    }
    auto *bins = new QAreaSeries(outline, floor);
    QColor fill = colour;
    fill.setAlpha(kBinOpacity);
    bins->setBrush(fill);
    bins->setPen(QPen(colour.darker(kOutlineShade), s.width > 0.0 ? s.width : 1.0));
    return bins;
}

QAbstractSeries *xySeries(const ChartSeries &s, QColor colour) {
    switch (s.style) {
    case Style::Bars:
        return barSeries(s, colour);
    case Style::Histogram:
        return histogramSeries(s, colour);
    default:
        return lineSeries(s, colour);
    }
}

std::size_t axisIndex(int axis, std::size_t count) {
    return static_cast<std::size_t>(std::clamp<int>(axis, 0, static_cast<int>(count) - 1));
}

/// The markers: dashed lines over the whole range of their axis, in the legend.
void addMarkers(QChart *chart, const ChartData &data, QAbstractAxis *xAxis,
                const std::vector<QValueAxis *> &yAxes) {
    for (const charts::ChartMarker &m : data.markers) {
        QValueAxis *axis = yAxes.at(axisIndex(m.axis, yAxes.size()));
        auto *line = new QLineSeries;
        line->setName(m.label);
        line->setPen(linePen(QColor(static_cast<QRgb>(m.colour)), kMarkerWidth,
                             ChartSeries::Pattern::Dashed));
        line->append(m.x, axis->min());
        line->append(m.x, axis->max());
        chart->addSeries(line);
        line->attachAxis(xAxis);
        line->attachAxis(axis);
    }
}

/// Bars by category, stacked: the categories along the bottom (or up the
/// side, lying), the values on the first axis.
QChart *buildBarChart(const ChartData &data, ChartLook look) {
    QChart *chart = newChart(data, look);
    const bool across = lying(data);
    QAbstractBarSeries *bars =
        across ? static_cast<QAbstractBarSeries *>(new QHorizontalStackedBarSeries)
               : new QStackedBarSeries;
    bars->setBarWidth(data.series.front().barWidth);
    for (std::size_t i = 0; i < data.series.size(); ++i) {
        const ChartSeries &s = data.series[i];
        auto *set = new QBarSet(s.name);
        const QColor colour = colourOf(s, i);
        set->setColor(colour);
        if (!across) {
            set->setBorderColor(colour.darker(kOutlineShade));
        }
        for (const ChartPoint &p : s.points) {
            set->append(p.y);
        }
        set->setProperty(kSeriesIndexProperty, static_cast<int>(i));
        bars->append(set);
    }
    chart->addSeries(bars);

    auto *categories = new QBarCategoryAxis;
    categories->append(data.categories);
    categories->setTitleText(data.x.title);
    if (!across) {
        // A label under every bar: upright and smaller (years).
        categories->setLabelsAngle(-90);
        QFont small = categories->labelsFont();
        small.setPointSizeF(small.pointSizeF() * 0.85);
        categories->setLabelsFont(small);
    }
    categories->setGridLineVisible(data.x.grid);
    const ChartAxis values = data.axes.empty() ? ChartAxis{} : data.axes.front();
    QValueAxis *valuesAxis = valueAxis(values, look);
    chart->addAxis(categories, across ? Qt::AlignLeft : Qt::AlignBottom);
    chart->addAxis(valuesAxis, across ? Qt::AlignBottom : Qt::AlignLeft);
    bars->attachAxis(categories);
    bars->attachAxis(valuesAxis);
    setFixedRange(valuesAxis, values);
    return chart;
}

} // namespace

QChart *buildChart(const ChartData &data, ChartLook look) {
    if (data.series.empty()) {
        return newChart(data, look);
    }
    if (isBarChart(data)) {
        return buildBarChart(data, look);
    }
    QChart *chart = newChart(data, look);
    QValueAxis *xAxis = valueAxis(data.x, look);
    chart->addAxis(xAxis, Qt::AlignBottom);
    std::vector<QValueAxis *> yAxes;
    for (const ChartAxis &a : data.axes) {
        QValueAxis *axis = valueAxis(a, look);
        chart->addAxis(axis, a.right ? Qt::AlignRight : Qt::AlignLeft);
        yAxes.push_back(axis);
    }
    if (yAxes.empty()) {
        yAxes.push_back(valueAxis(ChartAxis{}, look));
        chart->addAxis(yAxes.back(), Qt::AlignLeft);
    }

    Range xRange;
    std::vector<Range> yRanges(yAxes.size());
    for (std::size_t i = 0; i < data.series.size(); ++i) {
        const ChartSeries &s = data.series[i];
        const std::size_t axis = axisIndex(s.axis, yAxes.size());
        QAbstractSeries *drawn = xySeries(s, colourOf(s, i));
        for (const ChartPoint &p : s.points) {
            xRange.include(p.x);
            yRanges[axis].include(p.y);
        }
        drawn->setName(s.name);
        drawn->setProperty(kSeriesIndexProperty, static_cast<int>(i));
        chart->addSeries(drawn);
        drawn->attachAxis(xAxis);
        drawn->attachAxis(yAxes[axis]);
    }

    for (const charts::ChartMark &m : data.marks) {
        auto *mark = new QScatterSeries;
        mark->append(m.at.x, m.at.y);
        mark->setMarkerSize(11.0);
        mark->setColor(QColor(kMarkColour));
        mark->setBorderColor(Qt::white);
        // A format without placeholders prints the label itself.
        mark->setPointLabelsFormat(m.label);
        mark->setPointLabelsVisible(true);
        mark->setPointLabelsClipping(false);
        mark->setPointLabelsFont(sized(9, true));
        mark->setPointLabelsColor(QColor(kMarkColour).darker(120));
        mark->setName(m.label);
        chart->addSeries(mark);
        const std::size_t axis = axisIndex(m.axis, yAxes.size());
        mark->attachAxis(xAxis);
        mark->attachAxis(yAxes[axis]);
        xRange.include(m.at.x);
        yRanges[axis].include(m.at.y);
        // The label beside the point says it all; the legend lists the series.
        for (QLegendMarker *marker : chart->legend()->markers(mark)) {
            marker->setVisible(false);
        }
    }

    if (data.x.fixed()) {
        setFixedRange(xAxis, data.x);
    } else {
        for (const charts::ChartMarker &m : data.markers) {
            xRange.include(m.x);
        }
        if (xRange.valid()) {
            // A mark's label is centred over its point: room for it at the ends.
            const double span = xRange.high - xRange.low;
            for (const charts::ChartMark &m : data.marks) {
                xRange.include(m.at.x + 0.15 * span);
                xRange.include(m.at.x - 0.15 * span);
            }
            // Whole years at the ends, and room for the bars' half widths.
            xAxis->setRange(std::floor(xRange.low - kEndRoom), std::ceil(xRange.high + kEndRoom));
        } else {
            xAxis->setRange(0.0, 1.0);
        }
        if (data.x.step <= 0.0) {
            xAxis->setTickType(QValueAxis::TicksDynamic);
            xAxis->setTickAnchor(0.0);
            xAxis->setTickInterval(xAxis->max() - xAxis->min() > 60.0 ? 10.0 : 5.0);
        }
    }
    // Axes the data leaves free share their zero and grid lines.
    std::vector<QValueAxis *> free;
    std::vector<Range> freeRanges;
    for (std::size_t a = 0; a < yAxes.size(); ++a) {
        const bool given = a < data.axes.size() && data.axes[a].fixed();
        if (given) {
            setFixedRange(yAxes[a], data.axes[a]);
        } else {
            free.push_back(yAxes[a]);
            freeRanges.push_back(yRanges[a]);
        }
    }
    setAlignedRanges(free, std::move(freeRanges));
    addMarkers(chart, data, xAxis, yAxes);
    return chart;
}

bool nearestPoint(const ChartSeries &series, double x, double y, ChartPoint &found) {
    if (series.points.empty()) {
        return false;
    }
    const auto distance = [x, y](const ChartPoint &p) {
        return std::pair{std::abs(p.x - x), std::abs(p.y - y)};
    };
    found = *std::min_element(series.points.begin(), series.points.end(),
                              [&distance](const ChartPoint &a, const ChartPoint &b) {
                                  return distance(a) < distance(b);
                              });
    return true;
}

QString hoverText(const ChartData &data, const ChartSeries &series, const ChartPoint &point) {
    const int decimals = std::abs(point.y) < 100.0 ? 1 : 0;
    return QStringLiteral("%1\n%2: %3\n%4 %5")
        .arg(series.name, data.x.title, QString::number(point.x, 'f', 0),
             QString::number(point.y, 'f', decimals), series.unit);
}

} // namespace arbolex::report
