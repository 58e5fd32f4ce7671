#include "shell/tableexport.hpp"

namespace arbolex::shell {

namespace {

/// A cell as one spreadsheet value: no surrounding blanks, no tab or line break.
QString plainCell(const QString &cell) {
    QString text = cell.trimmed();
    for (QChar &c : text) {
        if (c == u'\t' || c == u'\r' || c == u'\n') {
            c = u' ';
        }
    }
    return text;
}

} // namespace

QString tabSeparated(const std::vector<QStringList> &rows) {
    QString out;
    for (const QStringList &row : rows) {
        QStringList cells;
        cells.reserve(row.size());
        for (const QString &cell : row) {
            cells << plainCell(cell);
        }
        out += cells.join(u'\t');
        out += u'\n';
    }
    return out;
}

QString htmlTable(const std::vector<QStringList> &rows) {
    QString out = QStringLiteral("<table>\n");
    bool header = true;
    for (const QStringList &row : rows) {
        out += QStringLiteral("<tr>");
        for (const QString &cell : row) {
            const QString tag = header ? QStringLiteral("th") : QStringLiteral("td");
            out += u'<' + tag + u'>' + plainCell(cell).toHtmlEscaped() + QStringLiteral("</") +
                   tag + u'>';
        }
        out += QStringLiteral("</tr>\n");
        header = false;
    }
    out += QStringLiteral("</table>\n");
    return out;
}

} // namespace arbolex::shell
