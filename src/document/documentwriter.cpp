#include "document/documentwriter.hpp"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSaveFile>

#include <cmath>

namespace arbolex::document {

namespace {

using work::TableRow;

QString name(const char *key) {
    return QLatin1String(key);
}

/// A number as JSON; JSON has no infinity or NaN, so those (a failed
/// projection's state) are written as the strings the reader takes back.
QJsonValue number(double value) {
    if (std::isnan(value)) {
        return QStringLiteral("NaN");
    }
    if (std::isinf(value)) {
        return value > 0 ? QStringLiteral("Infinity") : QStringLiteral("-Infinity");
    }
    return value;
}

QJsonObject identificationJson(const work::SubCompartment &id) {
    return {{name(key::forest), id.forest},
            {name(key::compartment), id.compartment},
            {name(key::subCompartment), id.subCompartment},
            {name(key::notes), id.notes}};
}

QJsonObject rowJson(const work::TableRow &row) {
    const work::RowRecord &r = row.record;
    const float values[] = {r.age,           r.topHeight, r.basalArea,        r.stocking,
                            r.volume,        r.dbh,       r.removedBasalArea, r.removedStocking,
                            r.removedVolume, r.postDbh};
    QJsonObject record;
    for (std::size_t i = 0; i < std::size(values); ++i) {
        record.insert(name(kRecordFields[i]), number(values[i]));
    }
    QJsonArray numbers;
    for (double n : row.numbers) {
        numbers.append(number(n));
    }
    return {{name(key::kind), name(kRowKindNames[static_cast<int>(row.kind) + 1])},
            {name(key::label), row.label},
            {name(key::cells), QJsonArray::fromStringList(row.cells)},
            {name(key::record), record},
            {name(key::numbers), numbers},
            {name(key::removedValue), number(row.removedValue)},
            {name(key::timberRevenue), number(row.timberRevenue)},
            {name(key::finalCut), row.finalCut}};
}

QJsonObject tableJson(const Document &d) {
    QJsonArray rows;
    for (const work::TableRow &row : d.rows) {
        rows.append(rowJson(row));
    }
    return {
        {name(key::layout),
         name(d.layout == work::HeaderLayout::WithMoney ? kLayoutWithMoney : kLayoutWithoutMoney)},
        {name(key::currentRow), d.currentRow},
        {name(key::selectionEnd), d.selectionEnd},
        {name(key::standingVolume), number(d.standingVolume)},
        {name(key::felled), d.felled},
        {name(key::rows), rows}};
}

QJsonObject cashFlowJson(const Document &d) {
    QJsonArray years;
    for (const work::CashFlowRecord &y : d.cashFlow) {
        years.append(QJsonObject{{name(key::year), y.year},
                                 {name(key::operation), y.operation},
                                 {name(key::cost), number(y.cost)},
                                 {name(key::timberRevenue), number(y.timberRevenue)},
                                 {name(key::otherRevenues), number(y.otherRevenues)},
                                 {name(key::totalRevenues), number(y.totalRevenues)},
                                 {name(key::cashFlowValue), number(y.cashFlow)},
                                 {name(key::discountedCashFlow), number(y.discountedCashFlow)}});
    }
    QJsonObject cashFlow{{name(key::interestRate), number(d.interestRate)},
                         {name(key::firstYear), d.cashFlowFirstYear},
                         {name(key::years), years}};
    if (d.establishmentCost) {
        cashFlow.insert(name(key::establishmentCost), number(*d.establishmentCost));
    }
    if (d.annualCost) {
        cashFlow.insert(name(key::annualCost), number(*d.annualCost));
    }
    return cashFlow;
}

} // namespace

QByteArray documentToJson(const Document &d) {
    QJsonObject fields;
    for (std::size_t i = 0; i < work::kWorkFields.size(); ++i) {
        const std::string_view name = work::workFieldName(work::kWorkFields.at(i));
        fields.insert(QLatin1String(name.data(), static_cast<qsizetype>(name.size())),
                      d.fields.at(i));
    }
    QJsonArray prices;
    for (double p : d.pricesInUse) {
        prices.append(number(p));
    }
    const QJsonObject body{{name(key::subCompartment), identificationJson(d.identification)},
                           {name(key::model), d.modelId},
                           {name(key::fields), fields},
                           {name(key::siteIndex), number(d.siteIndex)},
                           {name(key::siteIndexText), d.siteIndexText},
                           {name(key::table), tableJson(d)},
                           {name(key::cashFlow), cashFlowJson(d)},
                           {name(key::prices), QJsonObject{{name(key::setInUse), d.priceSetInUse},
                                                           {name(key::inUse), prices}}}};
    // A JSON object keeps its keys in alphabetical order; the format and its
    // version go first by hand, so a reader (or a person) meets them first.
    const QByteArray rest = QJsonDocument(body).toJson(QJsonDocument::Indented);
    QByteArray out = "{\n    \"";
    out += key::format;
    out += "\": \"";
    out += kFormatName; // plain letters: nothing to escape
    out += "\",\n    \"";
    out += key::version;
    out += "\": " + QByteArray::number(kFormatVersion) + ",\n";
    out += rest.mid(rest.indexOf('\n') + 1);
    return out;
}

bool writeDocumentFile(const QString &path, const Document &document, QString &reason) {
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly)) {
        reason = file.errorString();
        return false;
    }
    const QByteArray json = documentToJson(document);
    if (file.write(json) != json.size()) {
        reason = file.errorString();
        file.cancelWriting();
        return false;
    }
    if (!file.commit()) {
        reason = file.errorString();
        return false;
    }
    return true;
}

} // namespace arbolex::document
