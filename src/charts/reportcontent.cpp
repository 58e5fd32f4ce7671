#include "charts/reportcontent.hpp"
#include "work/worktexts.hpp"

#include "charts/carbonchart.hpp"
#include "charts/economicscharts.hpp"
#include "charts/reportmessages.hpp"
#include "charts/standcharts.hpp"
#include "economics/carbonformat.hpp"
#include "economics/carbonpricemessages.hpp"
#include "economics/economicsformat.hpp"
#include "economics/economicsmessages.hpp"
#include "economics/economicswindowlogic.hpp"
#include "economics/tableregime.hpp"
#include "engine/grow.hpp"
#include "engine/modeldescription.hpp"
#include "shell/vbformat.hpp"
#include "work/mdlnpv.hpp"
#include "work/standwork.hpp"
#include "work/subcompartment.hpp"

namespace arbolex::charts {

using shell::formatNumber;
using work::WorkField;

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

ComputedCashFlow computedCashFlow(work::StandWork &work) {
    ComputedCashFlow computed{work.cashFlow(), 0};
    if (computed.flow.years() > 0) {
        computed.flow.LoadTimberRevenues(work.timberRevenue());
        computed.years = computed.flow.ComputeCashFlow(work.errorLog());
    }
    return computed;
}

ReportTable cashFlowTable(const ComputedCashFlow &computed) {
    ReportTable table;
    if (computed.years == 0) {
        return table;
    }
    table.captions = work::text::cashFlowHeaders();
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
std::vector<std::pair<QString, QString>> inputs(const work::StandWork &work) {
    const work::ProjectionTable &table = work.table();
    const auto value = [&](int column, WorkField field) {
        return table.empty() ? work.field(field) : table.row(1).cells.value(column);
    };
    return {
        {text::inputAge(), value(work::kColAge, WorkField::FromAge)},
        {text::inputStocking(), value(work::kColStocking, WorkField::FromStocking)},
        {text::inputTopHeight(), value(work::kColTopHeight, WorkField::FromHeight)},
        {text::inputBasalArea(), value(work::kColBasalArea, WorkField::FromBasalArea)},
        {text::inputDbh(), value(work::kColDbh, WorkField::FromDbh)},
        {text::inputNetArea(), work.field(WorkField::NetArea)},
    };
}

/// The yield class as the main window shows it: fixed at the final cut, else
/// once the increment has culminated.
QString yieldClassText(const work::StandWork &work) {
    const int yc = work.yieldClass();
    return work.felled() || yc > 0 ? QString::number(yc) : QString();
}

/// The economics window's figures as it shows them now.
EconomicsPage economicsPage(economics::EconomicsWindowLogic &logic) {
    namespace et = economics::economicstext;
    using economics::EconomicsControl;
    const economics::IEconomicsView &view = logic.view();
    const QString rate = QLatin1Char(' ') + et::atRate(logic.rateText());
    EconomicsPage page;
    page.title = et::economicsCaption() + rate;
    page.stand = view.text(EconomicsControl::lblStand);
    page.regime = view.text(EconomicsControl::lblRegime);
    page.money = view.text(EconomicsControl::lblRate);
    for (const auto &[caption, label] : economics::valueFigures()) {
        page.figures.emplace_back(caption, view.text(label));
    }
    const auto sum = [&view](EconomicsControl timber, EconomicsControl carbon) {
        return view.text(timber) + QStringLiteral(" + ") + view.text(carbon);
    };
    page.figures.emplace_back(et::figureNpvSplit(),
                              sum(EconomicsControl::lblNpvTimber, EconomicsControl::lblNpvCarbon));
    page.figures.emplace_back(et::figureLevSplit(),
                              sum(EconomicsControl::lblLevTimber, EconomicsControl::lblLevCarbon));
    page.figures.emplace_back(et::figureCarbon(), view.text(EconomicsControl::lblCarbonRotation));
    page.rotations = rotationChart(logic.explorer(), et::panelRotations() + rate,
                                   logic.economicRotationWithoutCarbon());
    if (!logic.regimes().empty()) {
        std::vector<QStringList> grid = logic.regimeGrid();
        // Captions in two lines on screen run on in print.
        for (QString &caption : grid.front()) {
            caption.replace(QLatin1Char('\n'), QLatin1Char(' '));
        }
        page.regimesTitle = et::panelOptimiser() + rate;
        page.regimes = fromGrid(std::move(grid), {});
        page.regimesNote = view.text(EconomicsControl::lblOptimiser);
    }
    return page;
}

/// The carbon page of a felled table: its rotation valued with the work's
/// money, as the economics window values it.
std::optional<CarbonPage> carbonPage(const work::StandWork &work, const ReportContent &content) {
    const rotation::Economics money = work.economics();
    const std::int16_t model = work.grow().modelId();
    const auto harvests =
        economics::harvestsFromTable(work.table(), model, work.grow().volumeRatio());
    const auto value = economics::valueTableRotation(work, money);
    if (!harvests || !value || value->carbon.years.empty()) {
        return std::nullopt;
    }
    using economics::tonnesText;
    const carbon::Account &account = value->carbon;
    const carbon::AccountYear &cut = account.years.back();
    CarbonPage page;
    page.title = text::carbonTitle();
    QStringList place;
    for (const QString &part : {content.forest, content.compartment, content.subCompartment}) {
        if (!part.trimmed().isEmpty()) {
            place << part.trimmed();
        }
    }
    const std::string_view species = engine::speciesCode(model);
    const QString code =
        QString::fromLatin1(species.data(), static_cast<qsizetype>(species.size()));
    QString pricing = economics::pricingText(money.carbon);
    if (money.carbon.counts()) {
        pricing += QStringLiteral(", discounted at ") + economics::percentText(money.ratePercent) +
                   QStringLiteral(" % a year");
    }
    page.identification = {
        {text::carbonSubCompartment(), place.join(QStringLiteral(" · "))},
        {text::captionModel(), content.modelLabel},
        {text::carbonSpecies(),
         code + QStringLiteral(", ") +
             shell::generalNumber(money.carbonParameters.gravityOf(species)) +
             QStringLiteral(" t/m³")},
        {text::carbonRotation(), economics::describeTableRotation(*harvests)},
        {text::carbonPeriod(), text::carbonPeriodText(harvests->presentAge, harvests->rotation)},
        {text::carbonMoney(), pricing},
    };
    double productsAtEnd = 0.0;
    for (const double pool : account.poolsAtEnd) {
        productsAtEnd += pool;
    }
    page.totalsTitle = text::carbonTotals();
    page.totals = {
        {text::carbonAtFinalCut(), tonnesText(cut.trees + cut.harvested)},
        {text::carbonAverage(), tonnesText(account.longTermAverage)},
        {text::carbonNetRemoval(), tonnesText(cut.cumulativeNetRemoval)},
        {text::carbonUnits(), tonnesText(account.unitsTotal)},
        {text::carbonProductsAtEnd(), tonnesText(productsAtEnd)},
        {text::carbonNpv(), money.carbon.counts() ? economics::euroPerHaText(value->npvCarbon)
                                                  : economics::carbontext::notCounted()},
    };
    page.constantsTitle = text::carbonConstants();
    page.constants = fromGrid(
        economics::constantsGrid(carbon::Settings{money.carbon, money.carbonParameters}), {});
    page.yearlyTitle = text::carbonYearly();
    page.yearly.captions = text::carbonAccountCaptions();
    for (const carbon::AccountYear &y : account.years) {
        page.yearly.rows.push_back(
            {QString::number(y.age), tonnesText(y.trees), tonnesText(y.products),
             tonnesText(y.sequestration), tonnesText(y.harvested), tonnesText(y.emissions),
             tonnesText(y.netRemoval), tonnesText(y.cumulativeNetRemoval), tonnesText(y.units)});
    }
    page.yearlyNote = text::carbonYearlyNote();
    page.chart = carbonAccountChart(account);
    return page;
}

} // namespace

RotationCharts rotationCharts(work::StandWork &work) {
    const ComputedCashFlow computed = computedCashFlow(work);
    return {standDevelopment(work.table()), increments(work.table()),
            cashFlowChart(computed.flow, computed.years), carbonChart(work)};
}

ReportContent reportContent(work::StandWork &work) {
    ReportContent content;
    const work::SubCompartment &id = work.identification();
    content.forest = id.forest;
    content.compartment = id.compartment;
    content.subCompartment = id.subCompartment;
    content.description = id.notes;
    content.modelLabel = QString::fromStdString(work.grow().label());
    content.inputs = inputs(work);
    content.siteIndex = work.siteIndexText();
    content.yieldClass = yieldClassText(work);
    if (content.yieldClass.isEmpty()) {
        content.yieldClass = text::notCalculated();
    }
    content.projection = fromGrid(work.table().exportGrid(), work.table().exportGroups());
    if (const auto summary = work.summary()) {
        content.summary = fromGrid(work.summaryGrid(*summary), work.summaryGroups());
    }

    const ComputedCashFlow computed = computedCashFlow(work);
    content.cashFlow = cashFlowTable(computed);
    if (computed.years > 0) {
        content.netPresentValue = formatNumber(computed.flow.SumNPV(), u"#0");
        content.interestRate = formatNumber(computed.flow.interestRate(), u"0.00##");
    }
    content.standChart = standDevelopment(work.table());
    content.incrementChart = increments(work.table());
    content.cashFlowChart = cashFlowChart(computed.flow, computed.years);
    content.carbon = carbonPage(work, content);
    return content;
}

ReportContent reportContent(work::StandWork &work, economics::EconomicsWindowLogic &economics) {
    ReportContent content = reportContent(work);
    if (economics.figuresOfTable()) {
        content.economics = economicsPage(economics);
    }
    return content;
}

} // namespace arbolex::charts
