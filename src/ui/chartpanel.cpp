#include "ui/chartpanel.hpp"

#include "charts/chartmessages.hpp"
#include "charts/reportmessages.hpp"
#include "report/chartbuilder.hpp"
#include "report/chartexport.hpp"

#include <QAreaSeries>
#include <QChartView>
#include <QCursor>
#include <QFileDialog>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QStackedLayout>
#include <QTabWidget>
#include <QToolTip>
#include <QVBoxLayout>
#include <QXYSeries>

namespace arbolex::ui {

namespace {

QString tabCaption(ChartPanel::Chart chart) {
    switch (chart) {
    case ChartPanel::kStand:
        return charts::text::titleStand();
    case ChartPanel::kIncrements:
        return charts::text::titleIncrements();
    case ChartPanel::kCarbon:
        return charts::text::titleCarbon();
    default:
        return charts::text::titleCashFlow();
    }
}

QString tabLabel(ChartPanel::Chart chart) {
    switch (chart) {
    case ChartPanel::kStand:
        return charts::text::tabStand();
    case ChartPanel::kIncrements:
        return charts::text::tabIncrements();
    case ChartPanel::kCarbon:
        return charts::text::tabCarbon();
    default:
        return charts::text::tabCashFlow();
    }
}

/// What an empty tab says.
QString emptyText(ChartPanel::Chart chart) {
    switch (chart) {
    case ChartPanel::kCashFlow:
        return charts::text::emptyCashFlow();
    case ChartPanel::kCarbon:
        return charts::text::emptyCarbon();
    default:
        return charts::text::emptyStand();
    }
}

std::size_t slot(ChartPanel::Chart chart) {
    return static_cast<std::size_t>(chart);
}

} // namespace

ChartPanel::ChartPanel(QWidget *parent) : QWidget(parent) {
    setObjectName(QStringLiteral("chartPanel"));
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    m_tabs = new QTabWidget(this);
    m_tabs->setDocumentMode(true);
    for (int c = 0; c < kChartCount; ++c) {
        const auto chart = static_cast<Chart>(c);
        auto *page = new QWidget(m_tabs);
        auto *stack = new QStackedLayout(page);
        auto *view = new QChartView(page);
        view->setRenderHint(QPainter::Antialiasing);
        view->setMinimumSize(360, 260);
        auto *empty = new QLabel(emptyText(chart), page);
        empty->setAlignment(Qt::AlignCenter);
        empty->setWordWrap(true);
        empty->setStyleSheet(QStringLiteral("color: #666666; padding: 24px;"));
        stack->addWidget(empty);
        stack->addWidget(view);
        m_views.at(slot(chart)) = view;
        m_empty.at(slot(chart)) = empty;
        m_tabs->addTab(page, tabLabel(chart));
    }
    layout->addWidget(m_tabs, 1);

    auto *buttons = new QHBoxLayout;
    buttons->addStretch(1);
    auto *png = new QPushButton(charts::text::buttonExportPng(), this);
    png->setObjectName(QStringLiteral("cmdExportPng"));
    auto *svg = new QPushButton(charts::text::buttonExportSvg(), this);
    svg->setObjectName(QStringLiteral("cmdExportSvg"));
    buttons->addWidget(png);
    buttons->addWidget(svg);
    layout->addLayout(buttons);
    connect(png, &QPushButton::clicked, this, [this] { exportAs(QStringLiteral("png")); });
    connect(svg, &QPushButton::clicked, this, [this] { exportAs(QStringLiteral("svg")); });
    // A chart is laid out only when its tab is in view: laying out the three
    // after every grow cost more than the grow.
    connect(m_tabs, &QTabWidget::currentChanged, this, [this](int tab) {
        if (tab >= 0 && tab < kChartCount && !m_drawn.at(static_cast<std::size_t>(tab))) {
            draw(static_cast<Chart>(tab));
        }
    });
}

void ChartPanel::showCharts(const charts::RotationCharts &drawn) {
    m_data = {drawn.stand, drawn.increments, drawn.cashFlow, drawn.carbon};
    m_drawn.fill(false);
    draw(current());
}

const charts::ChartData &ChartPanel::data(Chart chart) const {
    return m_data.at(slot(chart));
}

QChartView *ChartPanel::view(Chart chart) const {
    return m_views.at(slot(chart));
}

ChartPanel::Chart ChartPanel::current() const {
    return static_cast<Chart>(m_tabs->currentIndex());
}

void ChartPanel::setCurrent(Chart chart) {
    m_tabs->setCurrentIndex(chart);
}

void ChartPanel::draw(Chart chart) {
    m_drawn.at(slot(chart)) = true;
    QChartView *view = m_views.at(slot(chart));
    const charts::ChartData &data = m_data.at(slot(chart));
    auto *stack = static_cast<QStackedLayout *>(view->parentWidget()->layout());
    if (data.empty()) {
        stack->setCurrentWidget(m_empty.at(slot(chart)));
        return;
    }
    QChart *old = view->chart();
    QChart *drawn = report::buildChart(data);
    view->setChart(drawn); // the view owns the new chart
    delete old;
    for (QAbstractSeries *series : drawn->series()) {
        const QVariant index = series->property(report::kSeriesIndexProperty);
        if (!index.isValid()) {
            continue; // a mark: its label says it all
        }
        const int i = index.toInt();
        const auto onHover = [this, chart, i](const QPointF &point, bool state) {
            hovered(chart, i, point.x(), point.y(), state);
        };
        if (auto *xy = qobject_cast<QXYSeries *>(series)) {
            connect(xy, &QXYSeries::hovered, this, onHover);
        } else if (auto *area = qobject_cast<QAreaSeries *>(series)) {
            connect(area, &QAreaSeries::hovered, this, onHover);
        }
    }
    stack->setCurrentWidget(view);
}

void ChartPanel::hovered(Chart chart, int series, double x, double y, bool state) {
    if (!state) {
        QToolTip::hideText();
        return;
    }
    const charts::ChartData &data = m_data.at(slot(chart));
    const charts::ChartSeries &s = data.series.at(static_cast<std::size_t>(series));
    charts::ChartPoint point;
    if (report::nearestPoint(s, x, y, point)) {
        QToolTip::showText(QCursor::pos(), report::hoverText(data, s, point), this);
    }
}

bool ChartPanel::exportCurrent(const QString &path) const {
    const Chart chart = current();
    const charts::ChartData &data = m_data.at(slot(chart));
    const QSize size = m_views.at(slot(chart))->size().expandedTo(QSize(640, 420));
    if (QFileInfo(path).suffix().compare(QLatin1String("svg"), Qt::CaseInsensitive) == 0) {
        return report::saveChartSvg(data, path, size);
    }
    return report::saveChartPng(data, path, size);
}

void ChartPanel::exportAs(const QString &suffix) {
    if (m_data.at(slot(current())).empty()) {
        return;
    }
    const QString name = tabCaption(current()).toLower().replace(u' ', u'-');
    const QString filter =
        suffix == QLatin1String("svg") ? charts::text::filterSvg() : charts::text::filterPng();
    QString path = QFileDialog::getSaveFileName(this, charts::text::titleExportChart(),
                                                name + u'.' + suffix, filter);
    if (path.isEmpty()) {
        return;
    }
    if (QFileInfo(path).suffix().isEmpty()) {
        path += u'.' + suffix;
    }
    const bool ok = exportCurrent(path);
    if (m_exported) {
        m_exported(path, ok);
    }
}

} // namespace arbolex::ui
