#pragma once

// What a chart shows, without drawing it: series of points or bars on value
// axes, marks and markers with their labels. One builder draws it, in the
// windows on screen and in the report on paper.

#include <QString>
#include <QStringList>

#include <cstdint>
#include <optional>
#include <vector>

namespace arbolex::charts {

struct ChartPoint {
    double x = 0.0;
    double y = 0.0;
};

/// A labelled value of an axis: "12,000" at 12000.
struct AxisTick {
    double value = 0.0;
    QString label;
};

/// A value axis: its title carries the unit ("Stocking (stems/ha)"). What is
/// left unset the builder chooses from the values.
struct ChartAxis {
    QString title;
    /// Drawn on the right of the plot, else on the left (value axes beside the plot).
    bool right = false;
    /// Ends of the axis.
    std::optional<double> min{};
    std::optional<double> max{};
    /// Ends moved out to round numbers, with labels at round steps between.
    bool rounded = false;
    /// Labels at these values and nowhere else (money with thousands separators).
    std::vector<AxisTick> ticks{};
    /// Labels every `step` from 0 (ages: every 5 years), `minorTicks` unlabelled ticks between.
    double step = 0.0;
    int minorTicks = 0;
    /// Decimals of the labels.
    std::optional<int> decimals{};
    /// Grid lines across the plot at the labels.
    bool grid = true;

    /// True when the chart's data sets the axis's range.
    bool fixed() const { return min || max || rounded || !ticks.empty(); }
};

struct ChartSeries {
    enum class Style {
        Line,        ///< points joined in order; two points at one x draw a vertical drop
        Bars,        ///< one bar per point, centred on x, from 0 to y
        StackedBars, ///< one bar per category (x its index), on top of the series before
        LyingBars,   ///< as StackedBars, lying: categories up the side, values along the bottom
        Histogram,   ///< one bin per point, from x to x + barWidth, y high
    };
    enum class Pattern { Solid, Dashed, Dotted };

    QString name;
    /// Unit of the values, as the hover text shows it ("m³/ha").
    QString unit;
    /// Index in ChartData::axes of the axis the values are read on.
    int axis = 0;
    Style style = Style::Line;
    std::vector<ChartPoint> points;
    /// Colour, 0xRRGGBB; unset, the builder's next colour.
    std::optional<std::uint32_t> colour{};
    /// Width of a line, pixels; 0, the builder's.
    double width = 0.0;
    Pattern pattern = Pattern::Solid;
    /// Width of a bar: in x units (years, €) for Bars and Histogram, a share
    /// of the category for StackedBars and LyingBars.
    double barWidth = 0.8;
};

/// A labelled point: the culmination of the mean annual increment, the year
/// a rotation pays back.
struct ChartMark {
    ChartPoint at;
    int axis = 0;
    QString label;
};

/// A dashed line across the whole height of the plot at `x`, named in the
/// legend: a rotation age, a percentile of the draws.
struct ChartMarker {
    double x = 0.0;
    QString label;
    std::uint32_t colour = 0;
    /// Index in ChartData::axes of the axis the line spans.
    int axis = 0;
};

struct ChartData {
    QString title;
    /// The horizontal axis, with its unit ("Age (years)"); of a bar chart,
    /// the axis of the categories.
    ChartAxis x;
    /// Names of the categories of a bar chart (years, factors), by x index.
    QStringList categories;
    std::vector<ChartAxis> axes;
    std::vector<ChartSeries> series;
    std::vector<ChartMark> marks;
    std::vector<ChartMarker> markers;
    /// A line under the title (the yield class, the net present value).
    QString note;

    /// True when no series holds a point.
    bool empty() const;
};

} // namespace arbolex::charts
