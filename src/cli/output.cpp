#include "cli/output.hpp"

#include "estate/csvfile.hpp"
#include "estate/tablefile.hpp"
#include "valuation/discounting.hpp"

#include <QLocale>

#include <cstdio>
#include <stdexcept>

namespace arbolex::cli {

QString formatNumber(double x) {
    char text[32];
    std::snprintf(text, sizeof text, "%.9g", x);
    return QString::fromLatin1(text);
}

Format readFormat(const Options &options, Format fallback) {
    if (!options.has(kFormatOption)) {
        return fallback;
    }
    const QString word = options.text(kFormatOption);
    for (const Format f : {Format::kTsv, Format::kCsv, Format::kJson}) {
        if (word == formatWord(f)) {
            return f;
        }
    }
    throw UsageError{QStringLiteral("--format takes tsv, csv or json")};
}

QString formatWord(Format format) {
    switch (format) {
    case Format::kCsv:
        return QStringLiteral("csv");
    case Format::kJson:
        return QStringLiteral("json");
    case Format::kTsv:
        break;
    }
    return QStringLiteral("tsv");
}

QString formatOptionHelp() {
    return QStringLiteral("  --format tsv|csv|json     output format (default tsv; docs/cli.md)\n");
}

Value Value::word(const QString &text) {
    return {Kind::kWord, text};
}

Value Value::note(const QString &text) {
    return {Kind::kNote, text};
}

Value Value::whole(qint64 n) {
    return {Kind::kFigure, QString::number(n)};
}

Value Value::number(double x) {
    return {Kind::kFigure, formatNumber(x)};
}

Value Value::exact(double x) {
    return {Kind::kFigure, QString::number(x, 'g', QLocale::FloatingPointShortest)};
}

Value Value::money(const std::optional<double> &euro) {
    return euro ? number(valuation::roundToCents(*euro)) : Value();
}

Value Value::printed(const QString &text) {
    const QString figure = text.trimmed();
    return figure.isEmpty() ? Value() : Value(Kind::kFigure, figure);
}

QJsonValue Value::json() const {
    switch (m_kind) {
    case Kind::kWord:
        return m_text;
    case Kind::kFigure: {
        bool ok = false;
        const double x = m_text.toDouble(&ok); // C locale, as the text was printed
        return ok ? QJsonValue(x) : QJsonValue(m_text);
    }
    case Kind::kNothing:
    case Kind::kNote:
        break;
    }
    return QJsonValue::Null;
}

QJsonObject toJson(const Fields &fields) {
    QJsonObject o;
    for (const Field &f : fields) {
        o.insert(f.key, f.value.json());
    }
    return o;
}

void Table::add(std::vector<Value> row) {
    if (row.size() != static_cast<std::size_t>(m_columns.size())) {
        throw std::logic_error("a row of " + std::to_string(row.size()) + " cells under " +
                               std::to_string(m_columns.size()) + " columns");
    }
    m_rows.push_back(std::move(row));
}

QJsonObject Table::jsonRow(std::size_t i) const {
    QJsonObject o;
    const std::vector<Value> &row = m_rows.at(i);
    for (std::size_t c = 0; c < row.size(); ++c) {
        o.insert(m_columns.at(static_cast<qsizetype>(c)), row[c].json());
    }
    return o;
}

QJsonArray Table::json() const {
    QJsonArray rows;
    for (std::size_t i = 0; i < m_rows.size(); ++i) {
        rows.append(jsonRow(i));
    }
    return rows;
}

void TextOutput::comment(const QString &key, const Value &value) {
    line({QStringLiteral("# ") + key, value.text()});
}

void TextOutput::comments(const Fields &fields) {
    for (const Field &f : fields) {
        comment(f.key, f.value);
    }
}

void TextOutput::blank() {
    m_text.push_back('\n');
}

void TextOutput::title(const QString &name) {
    blank();
    line({QStringLiteral("# ") + name});
}

void TextOutput::fields(const Fields &fields) {
    for (const Field &f : fields) {
        line({f.key, f.value.text()});
    }
}

void TextOutput::table(const Table &table) {
    line(table.columns());
    for (const std::vector<Value> &row : table.rows()) {
        QStringList cells;
        cells.reserve(static_cast<qsizetype>(row.size()));
        for (const Value &v : row) {
            cells << v.text();
        }
        line(cells);
    }
}

void TextOutput::line(const QStringList &cells) {
    const bool csv = m_format == Format::kCsv;
    for (qsizetype i = 0; i < cells.size(); ++i) {
        if (i > 0) {
            m_text.push_back(csv ? ',' : '\t');
        }
        const std::string cell = cells[i].toStdString();
        if (csv) {
            estate::appendCsvField(m_text, cell);
        } else {
            estate::appendTsvField(m_text, cell);
        }
    }
    m_text.push_back('\n');
}

} // namespace arbolex::cli
