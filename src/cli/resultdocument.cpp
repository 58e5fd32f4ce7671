#include "cli/resultdocument.hpp"

#include "shell/version.hpp"

#include <QCryptographicHash>
#include <QDateTime>
#include <QFile>
#include <QJsonDocument>

#include <stdexcept>

namespace arbolex::cli {

namespace {

/// Adds to `out` the unit of every key of `object` (and of the objects and
/// arrays within) that names a figure.
class UnitCollector {
public:
    UnitCollector(units::Table table, const std::map<QString, const char *> &own, QJsonObject &out)
        : m_table(table), m_own(own), m_out(out) {}

    void collect(const QJsonObject &object) {
        for (auto it = object.begin(); it != object.end(); ++it) {
            const QJsonValue value = it.value();
            if (value.isObject()) {
                collect(value.toObject());
            } else if (value.isArray()) {
                collectArray(it.key(), value.toArray());
            } else {
                note(it.key(), value.isDouble());
            }
        }
    }

    /// The key's unit, if it has one; a figure must have one.
    void note(const QString &key, bool isFigure) {
        const auto own = m_own.find(key);
        const char *unit = own != m_own.end() ? own->second : units::unitOf(key, m_table);
        if (unit != nullptr) {
            m_out.insert(key, QLatin1String(unit));
        } else if (isFigure) {
            throw std::logic_error("the output key \"" + key.toStdString() + "\" has no unit");
        }
    }

private:
    void collectArray(const QString &key, const QJsonArray &array) {
        bool figures = false;
        for (const auto &element : array) {
            if (element.isObject()) {
                collect(element.toObject());
            }
            figures = figures || element.isDouble();
        }
        note(key, figures);
    }

    units::Table m_table;
    const std::map<QString, const char *> &m_own;
    QJsonObject &m_out;
};

} // namespace

QString inputKey(const char *option) {
    return QString::fromLatin1(option).replace(QLatin1Char('-'), QLatin1Char('_'));
}

QJsonValue fileSha256(const QString &path) {
    QFile file(path);
    QCryptographicHash hash(QCryptographicHash::Sha256);
    if (!file.open(QIODevice::ReadOnly) || !hash.addData(&file)) {
        return QJsonValue::Null;
    }
    return QString::fromLatin1(hash.result().toHex());
}

RunRecord::RunRecord(const QString &command) {
    m_record.insert(QStringLiteral("program"), QStringLiteral("arbolex-cli"));
    m_record.insert(QStringLiteral("version"), shell::programVersion());
    m_record.insert(QStringLiteral("command"), command);
    m_record.insert(QStringLiteral("started"),
                    QDateTime::currentDateTimeUtc().toString(Qt::ISODate));
}

void RunRecord::input(const QString &key, const Value &value) {
    m_inputs.insert(key, value.json());
}

void RunRecord::input(const QString &key, const QJsonArray &values) {
    m_inputs.insert(key, values);
}

void RunRecord::inputs(const Fields &fields) {
    for (const Field &f : fields) {
        input(f.key, f.value);
    }
}

void RunRecord::setFormat(Format format) {
    input(inputKey(kFormatOption), Value::word(formatWord(format)));
}

void RunRecord::insert(const QString &key, const QJsonValue &value) {
    m_record.insert(key, value);
}

void RunRecord::fileRead(const QString &name, const QString &path) {
    m_files.append(
        QJsonObject{{QStringLiteral("name"), name}, {QStringLiteral("sha256"), fileSha256(path)}});
}

QJsonObject RunRecord::json() const {
    QJsonObject o = m_record;
    o.insert(QStringLiteral("inputs"), m_inputs);
    o.insert(QStringLiteral("files"), m_files);
    return o;
}

ResultDocument::ResultDocument(const RunRecord &run, units::Table table)
    : m_run(run.json()), m_table(table) {}

void ResultDocument::insert(const QString &key, const QJsonValue &value) {
    m_members.insert(key, value);
}

void ResultDocument::insert(const Fields &fields) {
    for (const Field &f : fields) {
        insert(f.key, f.value.json());
    }
}

void ResultDocument::setUnit(const QString &key, const char *unit) {
    m_ownUnits[key] = unit;
}

void ResultDocument::addStreamedFigures(const QStringList &keys) {
    m_streamedFigures += keys;
}

QJsonObject ResultDocument::json() const {
    QJsonObject document = m_members;
    document.insert(QStringLiteral("run"), m_run);
    QJsonObject unitsOfKeys;
    UnitCollector collector(m_table, m_ownUnits, unitsOfKeys);
    collector.collect(document);
    for (const QString &key : m_streamedFigures) {
        collector.note(key, true);
    }
    document.insert(QStringLiteral("units"), unitsOfKeys);
    return document;
}

QByteArray ResultDocument::bytes() const {
    return QJsonDocument(json()).toJson(QJsonDocument::Indented);
}

} // namespace arbolex::cli

namespace arbolex::cli {

QByteArray fieldsAndTable(Format format, const RunRecord &run, const Fields &fields,
                          const QString &name, const Table &table, bool oneRow) {
    if (format == Format::kJson) {
        ResultDocument document(run);
        document.insert(fields);
        document.insert(name, oneRow ? QJsonValue(table.jsonRow(0)) : QJsonValue(table.json()));
        return document.bytes();
    }
    TextOutput text(format);
    text.comments(fields);
    text.table(table);
    return text.bytes();
}

} // namespace arbolex::cli
