#include "report/reportwriter.hpp"

#include "charts/reportmessages.hpp"
#include "report/chartexport.hpp"
#include "report/reportdocument.hpp"
#include "shell/version.hpp"

#include <QAbstractTextDocumentLayout>
#include <QDateTime>
#include <QPageLayout>
#include <QPageSize>
#include <QPainter>
#include <QPdfWriter>
#include <QTextDocument>

#include <cmath>
#include <vector>

namespace arbolex::report {

namespace {

/// The report is laid out in units of 1/96 inch, whatever the resolution of
/// the printer or the PDF.
constexpr qreal kLayoutDpi = 96.0;
/// Height kept at the foot of every page for its footer, layout units.
constexpr qreal kFooterHeight = 22.0;
/// Page margins, millimetres.
constexpr qreal kMarginMm = 12.0;
/// Share of the economics page's width the figures take beside the chart.
constexpr qreal kFiguresShare = 0.38;
/// Space between the parts of the economics page, layout units.
constexpr qreal kGap = 12.0;
/// Share of the carbon page's width the constants take beside the chart.
constexpr qreal kConstantsShare = 0.5;

void paintFooter(QPainter &painter, const QRectF &page, const QString &left, int number,
                 int count) {
    painter.save();
    // Pixels of the layout: a point size would be taken at the device's
    // resolution and then scaled once more.
    QFont font;
    font.setPixelSize(10);
    painter.setFont(font);
    painter.setPen(QColor(0x55, 0x55, 0x55));
    const QRectF band(page.left(), page.bottom() - kFooterHeight + 6.0, page.width(),
                      kFooterHeight - 6.0);
    painter.drawLine(QPointF(band.left(), band.top() - 3.0),
                     QPointF(band.right(), band.top() - 3.0));
    painter.drawText(band, Qt::AlignLeft | Qt::AlignVCenter, left);
    painter.drawText(band, Qt::AlignRight | Qt::AlignVCenter,
                     charts::text::page().arg(number).arg(count));
    painter.restore();
}

QString footerText(const charts::ReportContent &content) {
    QStringList parts{QStringLiteral("ARBOLEX %1").arg(shell::programVersion())};
    for (const QString &part :
         {content.forest, content.compartment, content.subCompartment, content.modelLabel}) {
        if (!part.trimmed().isEmpty()) {
            parts << part.trimmed();
        }
    }
    return parts.join(QStringLiteral("  ·  "));
}

/// A piece of the report's text laid out `width` wide.
void layOut(QTextDocument &document, const QString &html, qreal width) {
    document.setDocumentMargin(0.0);
    document.setTextWidth(width);
    document.setHtml(html);
}

void drawAt(QPainter &painter, QTextDocument &document, QPointF at) {
    painter.save();
    painter.translate(at);
    document.drawContents(&painter);
    painter.restore();
}

/// The economics page: its head across the top, the figures on the left
/// with the chart of NPV, LEV and MAI beside them, the optimiser's regimes
/// along the bottom.
void paintEconomics(QPainter &painter, const QSizeF &body, const charts::EconomicsPage &page) {
    const EconomicsHtml html = economicsHtml(page);
    QTextDocument head;
    layOut(head, html.head, body.width());
    QTextDocument figures;
    const qreal figuresWidth = body.width() * kFiguresShare;
    layOut(figures, html.figures, figuresWidth);
    QTextDocument regimes;
    layOut(regimes, html.regimes, body.width());
    const qreal top = head.size().height() + kGap;
    const qreal bottom =
        html.regimes.isEmpty() ? body.height() : body.height() - regimes.size().height();
    drawAt(painter, head, QPointF(0.0, 0.0));
    drawAt(painter, figures, QPointF(0.0, top));
    paintChart(page.rotations, painter,
               QRectF(QPointF(figuresWidth + kGap, top),
                      QPointF(body.width(), bottom - (html.regimes.isEmpty() ? 0.0 : kGap))));
    if (!html.regimes.isEmpty()) {
        drawAt(painter, regimes, QPointF(0.0, bottom));
    }
}

/// The carbon page: its head across the top, the constants with their
/// sources on the left and the chart of the account beside them.
void paintCarbon(QPainter &painter, const QSizeF &body, const charts::CarbonPage &page,
                 const CarbonHtml &html) {
    QTextDocument head;
    layOut(head, html.head, body.width());
    QTextDocument constants;
    const qreal constantsWidth = body.width() * kConstantsShare;
    layOut(constants, html.constants, constantsWidth);
    const qreal top = head.size().height() + kGap;
    drawAt(painter, head, QPointF(0.0, 0.0));
    drawAt(painter, constants, QPointF(0.0, top));
    paintChart(page.chart, painter,
               QRectF(QPointF(constantsWidth + kGap, top), QPointF(body.width(), body.height())));
}

} // namespace

int paintReport(QPagedPaintDevice &device, const charts::ReportContent &content,
                const QString &printed) {
    QPainter painter;
    if (!painter.begin(&device)) {
        return 0;
    }
    const qreal scale = device.logicalDpiX() / kLayoutDpi;
    painter.scale(scale, scale);
    const QRectF page(0.0, 0.0, device.width() / scale, device.height() / scale);
    const QSizeF body(page.width(), page.height() - kFooterHeight);

    QTextDocument document;
    document.setDocumentMargin(0.0);
    document.setPageSize(body);
    document.setHtml(reportHtml(content, printed));

    std::vector<const charts::ChartData *> charts;
    for (const charts::ChartData *c :
         {&content.standChart, &content.incrementChart, &content.cashFlowChart}) {
        if (!c->empty()) {
            charts.push_back(c);
        }
    }
    const int textPages = document.pageCount();
    // The carbon page, then its account year by year on pages of their own.
    CarbonHtml carbon;
    QTextDocument yearly;
    int yearlyPages = 0;
    if (content.carbon) {
        carbon = carbonHtml(*content.carbon);
        yearly.setDocumentMargin(0.0);
        yearly.setPageSize(body);
        yearly.setHtml(carbon.yearly);
        yearlyPages = yearly.pageCount();
    }
    const int pages = textPages + static_cast<int>(charts.size()) +
                      (content.economics.has_value() ? 1 : 0) +
                      (content.carbon.has_value() ? 1 + yearlyPages : 0);
    const QString footer = footerText(content);

    for (int p = 0; p < textPages; ++p) {
        if (p > 0) {
            device.newPage();
        }
        painter.save();
        painter.translate(0.0, -p * body.height());
        document.drawContents(&painter, QRectF(QPointF(0.0, p * body.height()), body));
        painter.restore();
        paintFooter(painter, page, footer, p + 1, pages);
    }
    for (std::size_t c = 0; c < charts.size(); ++c) {
        device.newPage();
        paintChart(*charts[c], painter, QRectF(QPointF(0.0, 0.0), body));
        paintFooter(painter, page, footer, textPages + static_cast<int>(c) + 1, pages);
    }
    int number = textPages + static_cast<int>(charts.size());
    if (content.economics) {
        device.newPage();
        paintEconomics(painter, body, *content.economics);
        paintFooter(painter, page, footer, ++number, pages);
    }
    if (content.carbon) {
        device.newPage();
        paintCarbon(painter, body, *content.carbon, carbon);
        paintFooter(painter, page, footer, ++number, pages);
        for (int p = 0; p < yearlyPages; ++p) {
            device.newPage();
            painter.save();
            painter.translate(0.0, -p * body.height());
            yearly.drawContents(&painter, QRectF(QPointF(0.0, p * body.height()), body));
            painter.restore();
            paintFooter(painter, page, footer, ++number, pages);
        }
    }
    painter.end();
    return pages;
}

int writeReportPdf(const charts::ReportContent &content, const QString &path,
                   const QString &printed) {
    QPdfWriter writer(path);
    writer.setPageLayout(reportPageLayout());
    writer.setResolution(300);
    writer.setTitle(charts::text::reportTitle());
    writer.setCreator(QStringLiteral("ARBOLEX %1").arg(shell::programVersion()));
    return paintReport(writer, content, printed);
}

QPageLayout reportPageLayout() {
    return {QPageSize(QPageSize::A4), QPageLayout::Landscape,
            QMarginsF(kMarginMm, kMarginMm, kMarginMm, kMarginMm), QPageLayout::Millimeter};
}

QString printedNow() {
    return QDateTime::currentDateTime().toString(QStringLiteral("dd/MM/yyyy HH:mm"));
}

} // namespace arbolex::report
