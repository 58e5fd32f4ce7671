#include "report/chartexport.hpp"

#include "report/chartbuilder.hpp"

#include <QGraphicsLayout>
#include <QGraphicsScene>
#include <QImage>
#include <QPainter>
#include <QSvgGenerator>

namespace arbolex::report {

namespace {

/// Pixel density of the PNG images, so that they stay sharp on paper and on
/// high-density screens.
constexpr qreal kPngScale = 2.0;

} // namespace

void paintChart(const charts::ChartData &data, QPainter &painter, const QRectF &target) {
    // A chart draws only inside a scene: a scene of its own, sized to the
    // target, laid out at once (there is no event loop to wait for).
    QGraphicsScene scene;
    QChart *chart = buildChart(data);
    scene.addItem(chart); // the scene owns the chart
    const QRectF area(QPointF(0.0, 0.0), target.size());
    scene.setSceneRect(area);
    chart->setGeometry(area);
    if (chart->layout() != nullptr) {
        chart->layout()->activate();
    }
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setRenderHint(QPainter::TextAntialiasing);
    scene.render(&painter, target, area);
    painter.restore();
}

bool saveChartPng(const charts::ChartData &data, const QString &path, QSize size) {
    QImage image(size * kPngScale, QImage::Format_ARGB32_Premultiplied);
    image.setDevicePixelRatio(kPngScale);
    image.fill(Qt::white);
    {
        QPainter painter(&image);
        paintChart(data, painter, QRectF(QPointF(0.0, 0.0), QSizeF(size)));
    }
    return image.save(path, "PNG");
}

bool saveChartSvg(const charts::ChartData &data, const QString &path, QSize size) {
    QSvgGenerator svg;
    svg.setFileName(path);
    svg.setSize(size);
    svg.setViewBox(QRect(QPoint(0, 0), size));
    svg.setTitle(data.title);
    svg.setDescription(data.note);
    QPainter painter;
    if (!painter.begin(&svg)) {
        return false;
    }
    painter.fillRect(QRect(QPoint(0, 0), size), Qt::white);
    paintChart(data, painter, QRectF(QPointF(0.0, 0.0), QSizeF(size)));
    return painter.end();
}

} // namespace arbolex::report
