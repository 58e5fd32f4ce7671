#include "charts/reportcontent.hpp"

#include "charts/reportmessages.hpp"
#include "charts/standcharts.hpp"
#include "economics/npvmessages.hpp"
#include "shell/vbformat.hpp"
#include "work/mdlnpv.hpp"
#include "work/subcompartment.hpp"
#include "workflow/mainwindowlogic.hpp"

namespace arbolex::charts {

using shell::formatNumber;
using workflow::MainControl;

namespace {

/// A grid whose first row holds the captions.
ReportTable fromGrid(std::vector<QStringList> grid, QStringList groups) {
    ReportTable table;
    if (grid.empty()) {
        return table;
    }
    table.captions = grid.front();
    // The group row stands above the captions: "Thinning N/ha" prints as "N/ha".
    for (qsizetype c = 0; c < table.captions.size(); ++c) {
        const QString group = groups.value(c).trimmed();
        QString &caption = table.captions[c];
        if (!group.isEmpty() && caption.startsWith(group + u' ')) {
            caption = caption.mid(group.size() + 1);
        }
    }
    table.groups = std::move(groups);
    table.rows.assign(std::make_move_iterator(grid.begin() + 1),
                      std::make_move_iterator(grid.end()));
    return table;
}

/// The cash flow with the costs and revenues typed so far, computed; the
/// program's own cash flow keeps what its window last computed.
struct ComputedCashFlow {
    work::CashFlow flow;
    int years = 0;
};

ComputedCashFlow computedCashFlow(workflow::MainWindowLogic &logic) {
    ComputedCashFlow computed{logic.cashFlow(), 0};
    if (computed.flow.years() > 0) {
        computed.flow.LoadTimberRevenues(logic.timberRevenue());
        computed.years = computed.flow.ComputeCashFlow(logic.errorLog());
    }
    return computed;
}

ReportTable cashFlowTable(const ComputedCashFlow &computed) {
    ReportTable table;
    if (computed.years == 0) {
        return table;
    }
    table.captions = economics::text::npvHeaders();
    for (int i = 0; i < computed.years; ++i) {
        // Years without an operation, a cost or a revenue are left out.
        const bool quiet = computed.flow.operation(i).trimmed().isEmpty() &&
                           computed.flow.matrix(work::kCfCost, i) == 0.0 &&
                           computed.flow.matrix(work::kCfTotalRevenues, i) == 0.0;
        if (quiet) {
            continue;
        }
        QStringList row;
        row << QString::number(static_cast<int>(computed.flow.matrix(work::kCfYear, i)))
            << computed.flow.operation(i);
        for (int c = work::kCfCost; c < work::kCashFlowColumnCount; ++c) {
            row << formatNumber(computed.flow.matrix(c, i), u"#0");
        }
        table.rows.push_back(std::move(row));
    }
    return table;
}

/// The stand the projection started from: the table's first row, else the
/// grow-from fields as typed.
std::vector<std::pair<QString, QString>> inputs(workflow::MainWindowLogic &logic) {
    const work::ProjectionTable &table = logic.table();
    const auto value = [&](int column, MainControl field) {
        return table.empty() ? logic.view().text(field) : table.row(1).cells.value(column);
    };
    return {
        {text::inputAge(), value(work::kColAge, MainControl::txtFromA)},
        {text::inputStocking(), value(work::kColStocking, MainControl::txtFromN)},
        {text::inputTopHeight(), value(work::kColTopHeight, MainControl::txtFromH)},
        {text::inputBasalArea(), value(work::kColBasalArea, MainControl::txtFromB)},
        {text::inputDbh(), value(work::kColDbh, MainControl::txtFromD)},
        {text::inputNetArea(), logic.view().text(MainControl::txtNetArea)},
    };
}

} // namespace

RotationCharts rotationCharts(workflow::MainWindowLogic &logic) {
    const ComputedCashFlow computed = computedCashFlow(logic);
    return {standDevelopment(logic.table()), increments(logic.table()),
            cashFlowChart(computed.flow, computed.years)};
}

ReportContent reportContent(workflow::MainWindowLogic &logic) {
    ReportContent content;
    const work::SubCompartment &id = logic.identification();
    content.forest = id.forest;
    content.compartment = id.compartment;
    content.subCompartment = id.subCompartment;
    content.description = id.notes;
    content.modelLabel = QString::fromStdString(logic.grow().label());
    content.inputs = inputs(logic);
    content.siteIndex = logic.view().text(MainControl::lblSI);
    content.yieldClass = logic.view().text(MainControl::lblYC);
    if (content.yieldClass.isEmpty()) {
        content.yieldClass = text::notCalculated();
    }
    content.projection = fromGrid(logic.table().exportGrid(), logic.table().exportGroups());

    if (!logic.table().empty()) {
        // The summary of the table as it is now; the window keeps its view.
        const bool showingSummary = logic.showingSummary();
        if (logic.FillSummary() && !showingSummary) {
            logic.cmdSummary_Click();
        }
        content.summary = fromGrid(logic.summaryGrid(), logic.summaryGroups());
    }

    const ComputedCashFlow computed = computedCashFlow(logic);
    content.cashFlow = cashFlowTable(computed);
    if (computed.years > 0) {
        content.netPresentValue = formatNumber(computed.flow.SumNPV(), u"#0");
        content.interestRate = formatNumber(computed.flow.interestRate(), u"0.00##");
    }
    content.standChart = standDevelopment(logic.table());
    content.incrementChart = increments(logic.table());
    content.cashFlowChart = cashFlowChart(computed.flow, computed.years);
    return content;
}

} // namespace arbolex::charts
