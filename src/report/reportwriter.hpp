#pragma once

// The report on paper: the text pages (tables repeat their header on every
// page) followed by one page per chart, drawn as vectors, the economics page
// when the rotation was valued and the carbon account once the rotation has
// a final cut, each page with a footer. The same
// painting serves the PDF file and the printer.

#include "charts/reportcontent.hpp"

#include <QString>

class QPageLayout;
class QPagedPaintDevice;

namespace arbolex::report {

/// Paints the report on the pages of `device`, laid out for its page size and
/// margins; `printed` is the date shown in the title block. Returns the
/// number of pages, 0 when the device cannot be painted on.
int paintReport(QPagedPaintDevice &device, const charts::ReportContent &content,
                const QString &printed);

/// Writes the report as an A4 landscape PDF at `path`; the number of pages,
/// 0 when the file cannot be written.
int writeReportPdf(const charts::ReportContent &content, const QString &path,
                   const QString &printed);

/// The report's page: A4 landscape with margins of 12 mm.
QPageLayout reportPageLayout();

/// Date and time as the title block shows it, e.g. "23/11/2026 14:05".
QString printedNow();

} // namespace arbolex::report
