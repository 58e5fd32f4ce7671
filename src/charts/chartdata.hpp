#pragma once

// What a chart shows, without drawing it: series of points on value axes,
// marks with their labels. The windows draw it on screen, the report on paper.

#include <QString>

#include <vector>

namespace arbolex::charts {

struct ChartPoint {
    double x = 0.0;
    double y = 0.0;
};

/// A value axis: its title carries the unit ("Stocking (stems/ha)").
struct ChartAxis {
    QString title;
    /// Drawn on the right of the plot, else on the left.
    bool right = false;
};

struct ChartSeries {
    enum class Style {
        Line, ///< points joined in order; two points at one x draw a vertical drop
        Bars, ///< one bar per point, from 0 to y
    };
    QString name;
    /// Unit of the values, as the hover text shows it ("m³/ha").
    QString unit;
    /// Index in ChartData::axes of the axis the values are read on.
    int axis = 0;
    Style style = Style::Line;
    std::vector<ChartPoint> points;
};

/// A labelled point: the culmination of the mean annual increment, the year
/// a rotation pays back.
struct ChartMark {
    ChartPoint at;
    int axis = 0;
    QString label;
};

struct ChartData {
    QString title;
    /// Title of the horizontal axis, with its unit ("Age (years)").
    QString xTitle;
    std::vector<ChartAxis> axes;
    std::vector<ChartSeries> series;
    std::vector<ChartMark> marks;
    /// A line under the title (the yield class, the net present value).
    QString note;

    /// True when no series holds a point.
    bool empty() const;
};

} // namespace arbolex::charts
