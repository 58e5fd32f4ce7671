#pragma once

// The text part of the report as HTML for a QTextDocument: the title block,
// the stand at the start, the projection table, the summary and the cash
// flow. Tables carry their captions in a header that every page repeats.

#include "charts/reportcontent.hpp"

#include <QString>

namespace arbolex::report {

/// The report's text as HTML; `printed` is the date and time shown in the
/// title block.
QString reportHtml(const charts::ReportContent &content, const QString &printed);

/// The text of the economics page in the three parts laid out around its
/// chart: the head across the page, the figures beside the chart and the
/// optimiser's regimes under both (empty without them).
struct EconomicsHtml {
    QString head;
    QString figures;
    QString regimes;
};
EconomicsHtml economicsHtml(const charts::EconomicsPage &page);

/// The text of the carbon page: the head (title, identification and totals)
/// across the page, the constants beside the chart, and the account year by
/// year on the pages after it.
struct CarbonHtml {
    QString head;
    QString constants;
    QString yearly;
};
CarbonHtml carbonHtml(const charts::CarbonPage &page);

/// One table as HTML: the groups (when any) over the captions in the header,
/// then the rows.
QString tableHtml(const charts::ReportTable &table);

} // namespace arbolex::report
