#include "document/documentreader.hpp"

#include "engine/catalogue.hpp"
#include "prices/prices.hpp"

#include <QFile>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <cmath>
#include <limits>
#include <optional>

namespace arbolex::document {

namespace {

using work::RowKind;
using work::TableRow;

// Limits of what a sub-compartment can hold; anything beyond is damage.
constexpr int kMaxRows = 5000;
constexpr qsizetype kMaxCellLength = 64;
constexpr qsizetype kMaxLabelLength = 16;
constexpr qsizetype kMaxFieldLength = 32;
constexpr qsizetype kMaxNameLength = 200;
constexpr qsizetype kMaxNotesLength = 4000;
constexpr qsizetype kMaxOperationLength = 500;
constexpr int kMaxCashFlowYears = 1000;
/// Oldest age a row may carry, years (the models end at 60).
constexpr double kMaxAge = 200.0;
constexpr double kMaxStocking = 100000.0;
constexpr double kMaxTopHeight = 100.0;
constexpr double kMaxBasalArea = 1000.0;
constexpr double kMaxVolume = 100000.0;
constexpr double kMaxInterestRate = 1000.0;
constexpr double kMaxPrice = 1.0e6;
/// Highest establishment or yearly cost, euro/ha.
constexpr double kMaxCost = 1.0e6;

/// Why a document was refused; thrown only inside this file.
struct Refused {
    QString reason;
};

[[noreturn]] void refuse(const QString &reason) {
    throw Refused{reason};
}

QString name(const char *key) {
    return QLatin1String(key);
}

/// Reads the fields of one JSON object, naming the place of a fault ("row 3").
class ObjectReader {
public:
    ObjectReader(QJsonObject object, QString place)
        : m_object(std::move(object)), m_place(std::move(place)) {}

    QJsonValue value(const char *key) const {
        QJsonValue v = m_object.value(name(key));
        if (v.isUndefined()) {
            refuse(m_place + QStringLiteral(" has no \"") + name(key) + QStringLiteral("\""));
        }
        return v;
    }

    [[noreturn]] void wrong(const char *key, const QString &what) const {
        refuse(m_place + QStringLiteral(": \"") + name(key) + QStringLiteral("\" ") + what);
    }

    QString string(const char *key, qsizetype maxLength) const {
        const QJsonValue v = value(key);
        if (!v.isString()) {
            wrong(key, QStringLiteral("is not a text"));
        }
        if (v.toString().size() > maxLength) {
            wrong(key, QStringLiteral("is longer than ") + QString::number(maxLength) +
                           QStringLiteral(" characters"));
        }
        return v.toString();
    }

    /// A number in [low, high] when the field is there; std::nullopt when it
    /// is not (a field a document of an older version does not have).
    std::optional<double> optionalNumber(const char *key, double low, double high) const {
        if (!m_object.contains(name(key))) {
            return std::nullopt;
        }
        return number(key, low, high);
    }

    bool boolean(const char *key) const {
        const QJsonValue v = value(key);
        if (!v.isBool()) {
            wrong(key, QStringLiteral("is not true or false"));
        }
        return v.toBool();
    }

    /// A number in [low, high]; with `anyValue` also infinity and NaN, as
    /// the writer spells them.
    double number(const char *key, double low, double high, bool anyValue = false) const {
        return numberOf(value(key), key, low, high, anyValue);
    }

    double numberOf(const QJsonValue &v, const char *key, double low, double high,
                    bool anyValue) const {
        double x = 0.0;
        if (v.isDouble()) {
            x = v.toDouble();
        } else if (anyValue && v.isString()) {
            const QString s = v.toString();
            if (s == QLatin1String("NaN")) {
                return std::numeric_limits<double>::quiet_NaN();
            }
            if (s == QLatin1String("Infinity") || s == QLatin1String("-Infinity")) {
                return s.startsWith(u'-') ? -std::numeric_limits<double>::infinity()
                                          : std::numeric_limits<double>::infinity();
            }
            wrong(key, QStringLiteral("is not a number"));
        } else {
            wrong(key, QStringLiteral("is not a number"));
        }
        if (!anyValue && !(x >= low && x <= high)) {
            wrong(key, QStringLiteral("is ") + QString::number(x) + QStringLiteral(", outside [") +
                           QString::number(low) + QStringLiteral(", ") + QString::number(high) +
                           u']');
        }
        return x;
    }

    int integer(const char *key, int low, int high) const {
        const double x = number(key, low, high);
        if (x != std::floor(x)) {
            wrong(key, QStringLiteral("is not a whole number"));
        }
        return static_cast<int>(x);
    }

    float single(const char *key, double low, double high, bool anyValue = false) const {
        const double x = number(key, low, high, anyValue);
        // A value a float cannot hold is damage, not a stand.
        if (std::isfinite(x) && std::fabs(x) > std::numeric_limits<float>::max()) {
            wrong(key, QStringLiteral("is too large"));
        }
        return static_cast<float>(x);
    }

    QJsonObject object(const char *key) const {
        const QJsonValue v = value(key);
        if (!v.isObject()) {
            wrong(key, QStringLiteral("is not a group of fields"));
        }
        return v.toObject();
    }

    QJsonArray array(const char *key, qsizetype minSize, qsizetype maxSize) const {
        const QJsonValue v = value(key);
        if (!v.isArray()) {
            wrong(key, QStringLiteral("is not a list"));
        }
        QJsonArray a = v.toArray();
        if (a.size() < minSize || a.size() > maxSize) {
            wrong(key, minSize == maxSize
                           ? QStringLiteral("does not hold ") + QString::number(minSize) +
                                 QStringLiteral(" entries")
                           : QStringLiteral("holds ") + QString::number(a.size()) +
                                 QStringLiteral(" entries, more than ") + QString::number(maxSize));
        }
        return a;
    }

    const QString &place() const { return m_place; }

private:
    QJsonObject m_object;
    QString m_place;
};

work::SubCompartment readIdentification(const ObjectReader &top) {
    const ObjectReader r(top.object(key::subCompartment),
                         QStringLiteral("the sub-compartment's identification"));
    work::SubCompartment id;
    id.forest = r.string(key::forest, kMaxNameLength);
    id.compartment = r.string(key::compartment, kMaxNameLength);
    id.subCompartment = r.string(key::subCompartment, kMaxNameLength);
    id.notes = r.string(key::notes, kMaxNotesLength);
    return id;
}

void readFields(const ObjectReader &top, Document &d) {
    const ObjectReader r(top.object(key::fields), QStringLiteral("the grow-from fields"));
    for (std::size_t i = 0; i < work::kWorkFields.size(); ++i) {
        const std::string_view name = work::workFieldName(work::kWorkFields.at(i));
        const QByteArray field(name.data(), static_cast<qsizetype>(name.size()));
        const QString text = r.string(field.constData(), kMaxFieldLength);
        // The fields take digits and the decimal point only: a minus sign
        // (a negative stocking) or a letter was never typed there.
        for (const QChar c : text) {
            if (!c.isDigit() && c != u'.') {
                r.wrong(field.constData(), QStringLiteral("holds \"") + text +
                                               QStringLiteral("\", not a number of 0 or more"));
            }
        }
        d.fields.at(i) = text;
    }
}

work::RowKind readKind(const ObjectReader &r) {
    const QString kind = r.string(key::kind, kMaxLabelLength);
    for (int k = 0; k < static_cast<int>(std::size(kRowKindNames)); ++k) {
        if (kind == QLatin1String(kRowKindNames[k])) {
            return static_cast<work::RowKind>(k - 1);
        }
    }
    r.wrong(key::kind, QStringLiteral("is \"") + kind + QStringLiteral("\", no kind of row"));
}

void readRecord(const ObjectReader &row, work::TableRow &t) {
    const ObjectReader r(row.object(key::record), row.place() + QStringLiteral(", its record"));
    // A failed projection's row keeps whatever the engine left in it; any
    // other row holds a stand and is checked as one.
    const bool any = t.kind == work::RowKind::Failed;
    work::RowRecord &rec = t.record;
    rec.age = r.single(kRecordFields[0], 0.0, kMaxAge);
    rec.topHeight = r.single(kRecordFields[1], 0.0, kMaxTopHeight, any);
    rec.basalArea = r.single(kRecordFields[2], 0.0, kMaxBasalArea, any);
    rec.stocking = r.single(kRecordFields[3], 0.0, kMaxStocking, any);
    rec.volume = r.single(kRecordFields[4], -kMaxVolume, kMaxVolume, any);
    rec.dbh = r.single(kRecordFields[5], 0.0, kMaxBasalArea, any);
    rec.removedBasalArea = r.single(kRecordFields[6], -kMaxBasalArea, kMaxBasalArea, any);
    rec.removedStocking = r.single(kRecordFields[7], -kMaxStocking, kMaxStocking, any);
    rec.removedVolume = r.single(kRecordFields[8], 0.0, kMaxVolume, any);
    rec.postDbh = r.single(kRecordFields[9], 0.0, kMaxBasalArea, any);
}

work::TableRow readRow(const QJsonValue &value, int index) {
    const QString place = QStringLiteral("row ") + QString::number(index);
    if (!value.isObject()) {
        refuse(place + QStringLiteral(" is not a group of fields"));
    }
    const ObjectReader r(value.toObject(), place);
    work::TableRow t;
    t.kind = readKind(r);
    t.label = r.string(key::label, kMaxLabelLength);
    for (const QJsonValue cell : r.array(key::cells, work::kColumnCount, work::kColumnCount)) {
        if (!cell.isString() || cell.toString().size() > kMaxCellLength) {
            r.wrong(key::cells, QStringLiteral("holds a cell that is not a short text"));
        }
        t.cells << cell.toString();
    }
    readRecord(r, t);
    const bool any = t.kind == work::RowKind::Failed;
    const QJsonArray numbers = r.array(key::numbers, work::kNumMai + 1, work::kNumMai + 1);
    for (std::size_t i = 0; i < t.numbers.size(); ++i) {
        t.numbers.at(i) = r.numberOf(numbers.at(static_cast<qsizetype>(i)), key::numbers,
                                     -kMaxVolume, kMaxVolume, any);
    }
    t.removedValue = r.number(key::removedValue, -kMaxPrice * kMaxVolume, kMaxPrice * kMaxVolume);
    t.timberRevenue = r.number(key::timberRevenue, -kMaxPrice * kMaxVolume, kMaxPrice * kMaxVolume);
    t.finalCut = r.boolean(key::finalCut);
    return t;
}

void readTable(const ObjectReader &top, Document &d) {
    const ObjectReader r(top.object(key::table), QStringLiteral("the projection table"));
    const QString layout = r.string(key::layout, kMaxLabelLength);
    if (layout == QLatin1String(kLayoutWithMoney)) {
        d.layout = work::HeaderLayout::WithMoney;
    } else if (layout == QLatin1String(kLayoutWithoutMoney)) {
        d.layout = work::HeaderLayout::WithoutMoney;
    } else {
        r.wrong(key::layout, QStringLiteral("is no layout of the table"));
    }
    const QJsonArray rows = r.array(key::rows, 0, kMaxRows);
    int finalCuts = 0;
    for (qsizetype i = 0; i < rows.size(); ++i) {
        work::TableRow row = readRow(rows.at(i), static_cast<int>(i) + 1);
        if (!d.rows.empty() && row.record.age < d.rows.back().record.age) {
            refuse(QStringLiteral("row ") + QString::number(i + 1) +
                   QStringLiteral(" is younger than the row before it: the rows are not in "
                                  "age order"));
        }
        finalCuts += row.finalCut ? 1 : 0;
        d.rows.push_back(std::move(row));
    }
    const int count = static_cast<int>(d.rows.size());
    d.currentRow = r.integer(key::currentRow, 0, count);
    d.selectionEnd = r.integer(key::selectionEnd, 0, count);
    d.standingVolume = r.number(key::standingVolume, -kMaxVolume, kMaxVolume);
    d.felled = r.boolean(key::felled);
    if (finalCuts > 1 || d.felled != (finalCuts == 1)) {
        r.wrong(key::felled, QStringLiteral("does not agree with the final-cut rows"));
    }
}

void readCashFlow(const ObjectReader &top, Document &d) {
    const ObjectReader r(top.object(key::cashFlow), QStringLiteral("the cash flow"));
    d.interestRate = r.number(key::interestRate, 0.0, kMaxInterestRate);
    d.cashFlowFirstYear = r.integer(key::firstYear, 0, std::numeric_limits<std::int16_t>::max());
    // Written since version 2; without them the work takes the default costs.
    d.establishmentCost = r.optionalNumber(key::establishmentCost, 0.0, kMaxCost);
    d.annualCost = r.optionalNumber(key::annualCost, 0.0, kMaxCost);
    const QJsonArray years = r.array(key::years, 0, kMaxCashFlowYears);
    if (!years.isEmpty() && !d.felled) {
        r.wrong(key::years, QStringLiteral("are laid out before the final cut"));
    }
    if (d.cashFlowFirstYear + years.size() - 1 > std::numeric_limits<std::int16_t>::max()) {
        r.wrong(key::years, QStringLiteral("run past the year 32767"));
    }
    constexpr double kMoney = kMaxPrice * kMaxVolume;
    for (qsizetype i = 0; i < years.size(); ++i) {
        const QString place =
            QStringLiteral("year ") + QString::number(i + 1) + QStringLiteral(" of the cash flow");
        if (!years.at(i).isObject()) {
            refuse(place + QStringLiteral(" is not a group of fields"));
        }
        const ObjectReader y(years.at(i).toObject(), place);
        work::CashFlowRecord rec;
        const int expected = d.cashFlowFirstYear + static_cast<int>(i);
        rec.year = static_cast<std::int16_t>(y.integer(key::year, expected, expected));
        rec.operation = y.string(key::operation, kMaxOperationLength);
        rec.cost = y.number(key::cost, -kMoney, kMoney);
        rec.timberRevenue = y.number(key::timberRevenue, -kMoney, kMoney);
        rec.otherRevenues = y.number(key::otherRevenues, -kMoney, kMoney);
        rec.totalRevenues = y.number(key::totalRevenues, -kMoney, kMoney);
        rec.cashFlow = y.number(key::cashFlowValue, -kMoney, kMoney);
        rec.discountedCashFlow = y.number(key::discountedCashFlow, -kMoney, kMoney);
        d.cashFlow.push_back(rec);
    }
}

void readPrices(const ObjectReader &top, Document &d) {
    const ObjectReader r(top.object(key::prices), QStringLiteral("the prices in use"));
    d.priceSetInUse = static_cast<std::int16_t>(
        r.integer(key::setInUse, prices::kCurrentPrices, prices::kPrivatePrices));
    const QJsonArray prices =
        r.array(key::inUse, rotation::kPriceClassCount, rotation::kPriceClassCount);
    for (std::size_t i = 0; i < d.pricesInUse.size(); ++i) {
        d.pricesInUse.at(i) =
            r.numberOf(prices.at(static_cast<qsizetype>(i)), key::inUse, 0.0, kMaxPrice, false);
    }
}

/// Line and column (from 1) of byte `offset` of `text`.
QString placeOf(const QByteArray &text, qsizetype offset) {
    offset = std::clamp<qsizetype>(offset, 0, text.size());
    const QByteArray before = text.left(offset);
    const qsizetype line = before.count('\n') + 1;
    const qsizetype column = offset - (before.lastIndexOf('\n') + 1) + 1;
    return QStringLiteral("line ") + QString::number(line) + QStringLiteral(", column ") +
           QString::number(column);
}

Document readDocument(const QByteArray &json) {
    if (json.trimmed().isEmpty()) {
        refuse(QStringLiteral("the file is empty"));
    }
    QJsonParseError error{};
    const QJsonDocument parsed = QJsonDocument::fromJson(json, &error);
    if (error.error != QJsonParseError::NoError) {
        refuse(QStringLiteral("it is damaged or cut short (") + error.errorString() +
               QStringLiteral(" at ") + placeOf(json, error.offset) + u')');
    }
    const QJsonObject top = parsed.object();
    if (!parsed.isObject() || top.value(name(key::format)).toString() != name(kFormatName)) {
        refuse(QStringLiteral("it is not an ARBOLEX sub-compartment"));
    }
    const QJsonValue version = top.value(name(key::version));
    if (!version.isDouble() || version.toDouble() < 1 ||
        version.toDouble() != std::floor(version.toDouble())) {
        refuse(QStringLiteral("it has no valid format version"));
    }
    if (version.toDouble() > kFormatVersion) {
        refuse(QStringLiteral("it was written by a newer version of ARBOLEX (format version ") +
               QString::number(version.toDouble()) +
               QStringLiteral("; this program reads versions up to ") +
               QString::number(kFormatVersion) + u')');
    }
    const ObjectReader r(top, QStringLiteral("the file"));
    Document d;
    d.identification = readIdentification(r);
    d.modelId = r.integer(key::model, 0, engine::kModelCount - 1);
    readFields(r, d);
    d.siteIndex = r.single(key::siteIndex, 0.0, kMaxTopHeight);
    d.siteIndexText = r.string(key::siteIndexText, kMaxFieldLength);
    readTable(r, d);
    readCashFlow(r, d);
    readPrices(r, d);
    return d;
}

} // namespace

std::optional<Document> documentFromJson(const QByteArray &json, QString &reason) {
    try {
        return readDocument(json);
    } catch (const Refused &refused) {
        reason = refused.reason;
    }
    return std::nullopt;
}

std::optional<Document> readDocumentFile(const QString &path, QString &reason) {
    QFile file(path);
    if (!QFileInfo(path).isFile() || !file.open(QIODevice::ReadOnly)) {
        reason = QStringLiteral("it cannot be read (") +
                 (QFileInfo::exists(path) ? file.errorString() : QStringLiteral("no such file")) +
                 u')';
        return std::nullopt;
    }
    if (file.size() > kMaxDocumentBytes) {
        reason = QStringLiteral("it is far too large for a sub-compartment");
        return std::nullopt;
    }
    return documentFromJson(file.readAll(), reason);
}

} // namespace arbolex::document
