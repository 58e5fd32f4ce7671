#include "report/reportdocument.hpp"

#include "charts/reportmessages.hpp"

namespace arbolex::report {

namespace text = charts::text;

namespace {

QString esc(const QString &s) {
    return s.trimmed().toHtmlEscaped();
}

/// Style of the report: small figures so that the whole projection fits the
/// width of a landscape page.
QString styleSheet() {
    return QStringLiteral(
        "body { font-family: 'DejaVu Sans', sans-serif; font-size: 8pt; color: #1a1a1a; }"
        "h1 { font-size: 15pt; color: #1b4f2a; margin-bottom: 2px; }"
        "h2 { font-size: 11pt; color: #1b4f2a; margin-top: 14px; margin-bottom: 4px; }"
        "table.grid { border-collapse: collapse; font-size: 6.5pt; }"
        "table.grid th { background-color: #e3ebe4; font-weight: bold; }"
        "table.grid th.group { background-color: #c9d8cc; }"
        "table.grid td { text-align: right; }"
        "table.grid td.label { text-align: left; }"
        "table.facts td { padding-right: 14px; }"
        ".caption { color: #555555; }"
        "p.note { color: #555555; }");
}

/// A two-column list of captions and values, the empty values left out.
QString factsHtml(const std::vector<std::pair<QString, QString>> &facts) {
    QString html = QStringLiteral("<table class=\"facts\" cellspacing=\"0\" cellpadding=\"1\">");
    for (const auto &[caption, value] : facts) {
        if (value.trimmed().isEmpty()) {
            continue;
        }
        html += QStringLiteral("<tr><td class=\"caption\">%1</td><td><b>%2</b></td></tr>")
                    .arg(esc(caption), esc(value));
    }
    return html + QStringLiteral("</table>");
}

/// A document of the report's style around `body`.
QString styled(const QString &body) {
    return QStringLiteral("<html><head><style>") + styleSheet() +
           QStringLiteral("</style></head><body>") + body + QStringLiteral("</body></html>");
}

} // namespace

QString tableHtml(const charts::ReportTable &table) {
    QString html = QStringLiteral("<table class=\"grid\" width=\"100%\" border=\"1\" "
                                  "cellspacing=\"0\" cellpadding=\"2\"><thead>");
    const bool grouped = std::any_of(table.groups.begin(), table.groups.end(),
                                     [](const QString &g) { return !g.trimmed().isEmpty(); });
    if (grouped) {
        html += QStringLiteral("<tr>");
        for (qsizetype c = 0; c < table.captions.size();) {
            const QString group = table.groups.value(c);
            qsizetype span = 1;
            while (c + span < table.captions.size() && table.groups.value(c + span) == group) {
                ++span;
            }
            html += QStringLiteral("<th class=\"group\" colspan=\"%1\">%2</th>")
                        .arg(span)
                        .arg(esc(group));
            c += span;
        }
        html += QStringLiteral("</tr>");
    }
    html += QStringLiteral("<tr>");
    for (const QString &caption : table.captions) {
        html += QStringLiteral("<th>%1</th>").arg(esc(caption));
    }
    html += QStringLiteral("</tr></thead><tbody>");
    for (const QStringList &row : table.rows) {
        html += QStringLiteral("<tr>");
        for (qsizetype c = 0; c < table.captions.size(); ++c) {
            // Names (of rows, of operations) on the left; numbers line up on the right.
            const QString cell = row.value(c).trimmed();
            bool number = cell.isEmpty();
            if (!number) {
                // Money reads "12,345" and "−1,234" (economics window).
                QString(cell).remove(u',').replace(u'\u2212', u'-').toDouble(&number);
            }
            html += c > 0 && number ? QStringLiteral("<td>%1</td>").arg(esc(cell))
                                    : QStringLiteral("<td class=\"label\">%1</td>").arg(esc(cell));
        }
        html += QStringLiteral("</tr>");
    }
    return html + QStringLiteral("</tbody></table>");
}

QString reportHtml(const charts::ReportContent &content, const QString &printed) {
    QString html = QStringLiteral("<h1>%1</h1>").arg(esc(text::reportTitle()));
    html += QStringLiteral("<table width=\"100%\" cellspacing=\"0\"><tr><td width=\"50%\">");
    html += factsHtml({{text::forest(), content.forest},
                       {text::compartment(), content.compartment},
                       {text::subCompartment(), content.subCompartment},
                       {text::description(), content.description},
                       {text::captionModel(), content.modelLabel},
                       {text::printed(), printed}});
    html += QStringLiteral("</td><td width=\"50%\">");
    html += factsHtml({{text::captionSiteIndex(), content.siteIndex},
                       {text::captionYieldClass(), content.yieldClass},
                       {text::netPresentValue(), content.netPresentValue},
                       {text::interestRate(), content.interestRate}});
    html += QStringLiteral("</td></tr></table>");

    html += QStringLiteral("<h2>%1</h2>").arg(esc(text::sectionInputs()));
    html += factsHtml(content.inputs);

    html += QStringLiteral("<h2>%1</h2>").arg(esc(text::sectionProjection()));
    html += content.projection.empty()
                ? QStringLiteral("<p class=\"note\">%1</p>").arg(esc(text::emptyTable()))
                : tableHtml(content.projection);
    if (!content.summary.empty()) {
        html += QStringLiteral("<h2>%1</h2>").arg(esc(text::sectionSummary()));
        html += tableHtml(content.summary);
    }
    html += QStringLiteral("<h2>%1</h2>").arg(esc(text::sectionCashFlow()));
    if (content.cashFlow.empty()) {
        html += QStringLiteral("<p class=\"note\">%1</p>").arg(esc(text::noCashFlow()));
    } else {
        html += factsHtml({{text::netPresentValue(), content.netPresentValue},
                           {text::interestRate(), content.interestRate}});
        html += tableHtml(content.cashFlow);
        html += QStringLiteral("<p class=\"note\">%1</p>").arg(esc(text::quietYearsLeftOut()));
    }
    return styled(html);
}

CarbonHtml carbonHtml(const charts::CarbonPage &page) {
    CarbonHtml html;
    html.head = styled(QStringLiteral("<h2>%1</h2><table width=\"100%\" cellspacing=\"0\"><tr>"
                                      "<td width=\"58%\">%2</td><td width=\"42%\"><b>%3</b>%4"
                                      "</td></tr></table>")
                           .arg(esc(page.title), factsHtml(page.identification),
                                esc(page.totalsTitle), factsHtml(page.totals)));
    html.constants = styled(QStringLiteral("<p><b>%1</b></p>").arg(esc(page.constantsTitle)) +
                            tableHtml(page.constants));
    html.yearly =
        styled(QStringLiteral("<h2>%1</h2>").arg(esc(page.yearlyTitle)) + tableHtml(page.yearly) +
               QStringLiteral("<p class=\"note\">%1</p>").arg(esc(page.yearlyNote)));
    return html;
}

EconomicsHtml economicsHtml(const charts::EconomicsPage &page) {
    EconomicsHtml html;
    html.head =
        styled(QStringLiteral("<h2>%1</h2><p><b>%2</b><br>%3<br>"
                              "<span class=\"caption\">%4</span></p>")
                   .arg(esc(page.title), esc(page.stand), esc(page.regime), esc(page.money)));
    html.figures = styled(factsHtml(page.figures));
    if (!page.regimes.empty()) {
        html.regimes = styled(
            QStringLiteral("<h2>%1</h2>").arg(esc(page.regimesTitle)) + tableHtml(page.regimes) +
            QStringLiteral("<p class=\"note\">%1</p>").arg(esc(page.regimesNote)));
    }
    return html;
}

} // namespace arbolex::report
