// The work's fields, what its table says, its cash flow and its document.
#include "work/standwork.hpp"

#include "engine/grow.hpp"
#include "prices/prices.hpp"
#include "rotation/yieldclass.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "work/incrementrows.hpp"

#include <cmath>

namespace arbolex::work {

namespace {

std::size_t index(WorkField field) {
    return static_cast<std::size_t>(field);
}

} // namespace

std::string_view workFieldName(WorkField field) {
    static constexpr std::array<std::string_view, kWorkFieldCount> kNames = {
        "txtFromA", "txtFromN", "txtFromH", "txtFromB",
        "txtFromD", "txtToA",   "txtByA",   "txtNetArea"};
    return kNames.at(index(field));
}

bool WorkSnapshot::sameWork(const WorkSnapshot &other) const {
    return identification == other.identification && modelId == other.modelId &&
           fields == other.fields && siteIndexText == other.siteIndexText &&
           layout == other.layout && rows == other.rows && standingVolume == other.standingVolume &&
           felled == other.felled && cashFlowFirstYear == other.cashFlowFirstYear &&
           cashFlow == other.cashFlow && interestRate == other.interestRate &&
           establishmentCost == other.establishmentCost && annualCost == other.annualCost &&
           priceSetInUse == other.priceSetInUse && pricesInUse == other.pricesInUse;
}

StandWork::StandWork(engine::Grow &grow, prices::Prices &prices, shell::ErrorLog &log)
    : m_grow(grow), m_prices(prices), m_log(log) {}

// ---- The fields ---------------------------------------------------------------------------

void StandWork::setField(WorkField field, const QString &text) {
    QString &f = m_fields.at(index(field));
    if (f == text) {
        return;
    }
    f = text;
    emit fieldChanged(field);
    emit changed();
}

double StandWork::netArea() const {
    return shell::val(field(WorkField::NetArea));
}

void StandWork::setSiteIndexText(const QString &text) {
    if (m_siteIndexText == text) {
        return;
    }
    m_siteIndexText = text;
    emit siteIndexChanged();
    emit changed();
}

void StandWork::showSiteIndex(bool known) {
    setSiteIndexText(known ? shell::formatNumber(m_grow.siteIndex(), u"#.0") : QString());
}

void StandWork::SetGrowFrom(float age, float basalArea, float stocking, float topHeight,
                            float targetAge, float step) {
    using shell::formatNumber;
    // The age is written only forward: a field that already holds a later age keeps it.
    if (age > 0.0f && static_cast<float>(shell::val(field(WorkField::FromAge))) < age) {
        setField(WorkField::FromAge, formatNumber(age, u"##0"));
    }
    if (basalArea > 0.0f) {
        setField(WorkField::FromBasalArea, formatNumber(basalArea, u"##0.00"));
    }
    if (stocking > 0.0f) {
        setField(WorkField::FromStocking, formatNumber(stocking, u"#####0"));
    }
    if (topHeight > 0.0f) {
        setField(WorkField::FromHeight, formatNumber(topHeight, u"##0.0"));
    }
    if (targetAge > 0.0f) {
        setField(WorkField::ToAge, formatNumber(targetAge, u"##0"));
    }
    if (step >= 0.0f) {
        setField(WorkField::ByStep, formatNumber(step, u"##0"));
    }
}

void StandWork::copyRowToFields(int row) {
    const QStringList &cells = m_table.row(row).cells;
    setField(WorkField::FromAge, cells.value(kColAge));
    setField(WorkField::FromHeight, cells.value(kColTopHeight));
    setField(WorkField::FromStocking, cells.value(kColStocking));
    setField(WorkField::FromBasalArea, cells.value(kColBasalArea));
    // The diameter follows the row too, so the pair never disagrees.
    setField(WorkField::FromDbh, cells.value(kColDbh));
}

// ---- The table ----------------------------------------------------------------------------

void StandWork::select(int row, int endRow) {
    m_table.select(row, endRow);
}

void StandWork::setHeaderLayout(HeaderLayout layout) {
    if (m_table.headerLayout() == layout) {
        return;
    }
    m_table.setHeaderLayout(layout);
    notifyTable(1);
}

void StandWork::notifyTable(int firstRow) {
    emit tableChanged(firstRow);
    emit changed();
}

bool StandWork::felled() const {
    for (int r = m_table.lastRow(); r >= 1; --r) {
        if (m_table.row(r).finalCut) {
            return true;
        }
    }
    return false;
}

bool StandWork::thinned() const {
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        if (m_table.row(r).isThinning()) {
            return true;
        }
    }
    return false;
}

int StandWork::lastStandRow() const {
    for (int r = m_table.lastRow(); r >= 1; --r) {
        const TableRow &row = m_table.row(r);
        if (row.isGrowth() || row.isThinning()) {
            return r;
        }
    }
    return 0;
}

double StandWork::standingVolume() const {
    const int stand = lastStandRow();
    return stand > 0 ? m_table.row(stand).record.volume : 0.0;
}

TimberRevenue StandWork::timberRevenue() const {
    TimberRevenue revenue;
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        const TableRow &row = m_table.row(r);
        if (row.timberRevenue != 0.0) {
            revenue.add(static_cast<int>(std::nearbyint(row.record.age)), row.timberRevenue);
        }
    }
    return revenue;
}

int StandWork::yieldClass() const {
    std::vector<double> mai;
    for (const int r : incrementRows(m_table)) {
        mai.push_back(m_table.row(r).numbers[kNumMai]);
    }
    return rotation::yieldClass(mai);
}

// ---- The cash flow ------------------------------------------------------------------------

void StandWork::layOutCashFlow() {
    m_cashFlow.SetRotationLength(
        static_cast<int>(std::nearbyint(m_table.row(1).numbers[kNumAge])),
        static_cast<int>(std::nearbyint(m_table.row(m_table.lastRow()).numbers[kNumAge])));
    m_cashFlow.DimNPVArrays();
    cashFlowEdited();
}

void StandWork::resetCashFlow() {
    m_cashFlow.reset();
    cashFlowEdited();
}

void StandWork::cashFlowEdited() {
    emit cashFlowChanged();
    emit changed();
}

std::vector<rotation::CashFlowEntry> StandWork::cashFlowEntries() const {
    std::vector<rotation::CashFlowEntry> entries;
    for (int i = 0; i < m_cashFlow.years(); ++i) {
        const double cost = m_cashFlow.matrix(kCfCost, i);
        const double other = m_cashFlow.matrix(kCfOtherRevenues, i);
        if (cost != 0.0 || other != 0.0) {
            entries.push_back(
                {static_cast<int>(std::nearbyint(m_cashFlow.matrix(kCfYear, i))), cost, other});
        }
    }
    return entries;
}

void StandWork::setCosts(double establishment, double annual) {
    if (establishment == m_establishmentCost && annual == m_annualCost) {
        return;
    }
    m_establishmentCost = establishment;
    m_annualCost = annual;
    emit costsChanged();
    emit changed();
}

rotation::Economics StandWork::economics() const {
    rotation::Economics e;
    e.ratePercent = m_cashFlow.interestRate();
    e.establishmentCost = m_establishmentCost;
    e.annualCost = m_annualCost;
    e.entries = cashFlowEntries();
    // The cash flow's own prices: the long-term averages, as their absolute values.
    prices::Prices longTerm;
    longTerm.data() = m_prices.data();
    longTerm.selectPriceSet(prices::kLongTermPrices);
    e.prices = longTerm.pricesInUse();
    e.assortmentPrices = m_prices.data().assortmentPrices;
    e.carbon = m_prices.data().carbon.pricing;
    e.carbonParameters = m_prices.data().carbon.parameters;
    return e;
}

double StandWork::defaultEstablishmentCost() const {
    return m_prices.data().costs.establishment;
}

double StandWork::defaultAnnualCost() const {
    return m_prices.data().costs.annual;
}

void StandWork::resetCosts() {
    setCosts(defaultEstablishmentCost(), defaultAnnualCost());
}

// ---- The document ---------------------------------------------------------------------------

void StandWork::setIdentification(const SubCompartment &id) {
    if (m_identification == id) {
        return;
    }
    m_identification = id;
    emit identificationChanged();
    emit changed();
}

void StandWork::setDocumentTitle(const QString &name, bool modified) {
    if (name == m_documentName && modified == m_modified) {
        return;
    }
    m_documentName = name;
    m_modified = modified;
    emit documentTitleChanged();
}

QString StandWork::documentCaption() const {
    if (m_documentName.isEmpty()) {
        return {};
    }
    return QStringLiteral("   ----  ") + m_documentName +
           (m_modified ? QStringLiteral(" *") : QString());
}

WorkSnapshot StandWork::snapshot() const {
    WorkSnapshot s;
    s.identification = m_identification;
    s.modelId = m_grow.modelId();
    s.fields = m_fields;
    s.siteIndexText = m_siteIndexText;
    s.siteIndex = m_grow.siteIndex();
    s.layout = m_table.headerLayout();
    s.rows.reserve(static_cast<std::size_t>(m_table.lastRow()));
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        s.rows.push_back(m_table.row(r));
    }
    s.currentRow = m_table.currentRow();
    s.selectionEnd = m_table.selectionEnd();
    s.standingVolume = standingVolume();
    s.felled = felled();
    s.cashFlowFirstYear = m_cashFlow.firstYear();
    for (int i = 0; i < m_cashFlow.years(); ++i) {
        s.cashFlow.push_back(m_cashFlow.record(i));
    }
    s.interestRate = m_cashFlow.interestRate();
    s.establishmentCost = m_establishmentCost;
    s.annualCost = m_annualCost;
    s.priceSetInUse = m_prices.priceSetInUse();
    s.pricesInUse = m_prices.pricesInUse();
    return s;
}

void StandWork::restore(const WorkSnapshot &s) {
    m_table.clear(s.layout);
    m_identification = s.identification;
    for (const TableRow &row : s.rows) {
        m_table.append(row);
    }
    m_table.select(s.currentRow, s.selectionEnd);
    for (const WorkField f : kWorkFields) {
        m_fields.at(index(f)) = s.fields.at(index(f));
        emit fieldChanged(f);
    }
    m_siteIndexText = s.siteIndexText;
    emit siteIndexChanged();
    // The engine continues from the site index the last projection used.
    m_grow.setSiteIndex(s.siteIndex);
    if (s.siteIndex > 0.0f) {
        m_grow.TM(s.siteIndex);
    }
    m_cashFlow.setInterestRate(s.interestRate);
    if (s.cashFlow.empty()) {
        m_cashFlow.reset();
    } else {
        const int years = static_cast<int>(s.cashFlow.size());
        m_cashFlow.SetRotationLength(s.cashFlowFirstYear, s.cashFlowFirstYear + years - 1);
        m_cashFlow.DimNPVArrays();
        for (int i = 0; i < years; ++i) {
            const CashFlowRecord &r = s.cashFlow.at(static_cast<std::size_t>(i));
            m_cashFlow.setOperation(i, r.operation);
            m_cashFlow.setMatrix(kCfYear, i, r.year);
            m_cashFlow.setMatrix(kCfCost, i, r.cost);
            m_cashFlow.setMatrix(kCfTimberRevenue, i, r.timberRevenue);
            m_cashFlow.setMatrix(kCfOtherRevenues, i, r.otherRevenues);
            m_cashFlow.setMatrix(kCfTotalRevenues, i, r.totalRevenues);
            m_cashFlow.setMatrix(kCfCashFlow, i, r.cashFlow);
            m_cashFlow.setMatrix(kCfDiscountedCashFlow, i, r.discountedCashFlow);
        }
    }
    m_prices.restoreInUse(s.priceSetInUse, s.pricesInUse);
    // A document written before the work had its costs takes the defaults.
    m_establishmentCost = s.establishmentCost.value_or(defaultEstablishmentCost());
    m_annualCost = s.annualCost.value_or(defaultAnnualCost());
    emit identificationChanged();
    emit cashFlowChanged();
    emit costsChanged();
    notifyTable(1);
}

} // namespace arbolex::work
