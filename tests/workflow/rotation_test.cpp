// Closing a rotation: the final cut and its yield class, the summary, the cash
// flow it lays out, deleting rows to go back, and copying the tables.
#include "thinning/thinningfixture.hpp"

#include "economics/npvwindowlogic.hpp"
#include "prices/pricelookup.hpp"
#include "rotation/yieldclass.hpp"
#include "shell/iclipboard.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::testing {
namespace {

using namespace workflow;
using namespace work;

/// A Sitka spruce stand (age 15, 2500 stems/ha, 9 m, 22 m²/ha, 10 ha)
/// grown to 30, thinned by 50 m³/ha and grown on to 60 by 5.
class RotationTest : public ThinningTest {
protected:
    RotationTest() { prices.selectPriceSet(prices::kCurrentPrices); }

    /// The stand, its net area and the age it is grown to, in `into`.
    static void typeSitka(workflow::MainWindowLogic &into, const QString &netArea,
                          const QString &to) {
        typeFields(into, {{MainControl::txtFromA, QStringLiteral("15")},
                          {MainControl::txtFromN, QStringLiteral("2500")},
                          {MainControl::txtFromH, QStringLiteral("9")},
                          {MainControl::txtFromB, QStringLiteral("22")},
                          {MainControl::txtNetArea, netArea},
                          {MainControl::txtToA, to},
                          {MainControl::txtByA, QStringLiteral("5")}});
    }

    void growThinAndGrow(const QString &netArea = QStringLiteral("10")) {
        typeSitka(logic, netArea, QStringLiteral("30"));
        logic.cmdGrow_Click();
        logic.cmdThin_Click();
        typeThin(ThinControl::txtRemV, QStringLiteral("50"));
        thin.cmdThin_Click();
        thin.cmdAccept_Click();
        type(MainControl::txtToA, QStringLiteral("60"));
        logic.cmdGrow_Click();
    }

    economics::NpvWindowLogic &npv = session.npv();
};

TEST_F(RotationTest, FinalCutFellsTheStandingCropAndValuesIt) {
    growThinAndGrow();
    const int rows = logic.table().rowCount();
    const double standing = work.standingVolume();
    logic.cmdFinalCut_Click();
    ASSERT_EQ(logic.table().rowCount(), rows) << "the last growth row is the one felled";
    const TableRow &felled = lastRow();
    EXPECT_TRUE(felled.finalCut);
    EXPECT_EQ(felled.label, QStringLiteral("FC yr"));
    EXPECT_EQ(felled.cells[kColAge], QStringLiteral("60"));

    // The standing crop becomes the removal; its volume in "0.0".
    EXPECT_EQ(felled.cells[kColVolumePerHa], shell::formatNumber(standing, u"0.0"));
    for (int c = kColStocking; c <= kColVolumePerHa; ++c) {
        EXPECT_EQ(felled.cells[c + 6], felled.cells[c]) << "column " << c;
    }
    const double trees = std::nearbyint(shell::val(felled.cells[kColStocking]));
    const double meanTree = shell::val(felled.cells[kColVolumePerTree]);
    const auto k = static_cast<std::size_t>(prices::priceClassOf(meanTree, interactive));
    const double price = prices.pricesInUse()[k];
    EXPECT_EQ(felled.cells[kColValuePerHa], shell::formatNumber(standing * price, u"0"));
    EXPECT_EQ(felled.cells[kColThinTotalVolume],
              shell::formatNumber(trees * meanTree * 10, u"##0"));
    EXPECT_EQ(felled.cells[kColThinTotalValue],
              shell::formatNumber(trees * meanTree * price * 10, u"##0"));
    EXPECT_TRUE(felled.cells[kColSeparator2].isEmpty());
    for (int c = kColTotStocking; c <= kColTotVolume; ++c) {
        EXPECT_EQ(felled.cells[c], QStringLiteral("0")) << "column " << c;
    }
    // The cash flow earns the long-term average price of the same class.
    EXPECT_EQ(work.timberRevenue().at(60), standing * prices.data().longTermAverage[k]);
    EXPECT_GT(work.timberRevenue().at(30), 0.0);

    // The rotation is closed.
    EXPECT_FALSE(view.isEnabled(MainControl::cmdGrow));
    EXPECT_FALSE(view.isEnabled(MainControl::cmdThin));
    EXPECT_FALSE(view.isEnabled(MainControl::cmdFinalCut));
    logic.cmdGrow_Click();
    logic.cmdThin_Click();
    logic.cmdFinalCut_Click();
    EXPECT_EQ(logic.table().rowCount(), rows);
    EXPECT_FALSE(thinView.isShown());
}

TEST_F(RotationTest, FinalCutFixesAnEvenYieldClassAndOffersTheNetPresentValue) {
    growThinAndGrow();
    std::vector<double> mai;
    for (int r = 1; r <= logic.table().lastRow(); ++r) {
        if (logic.table().row(r).isGrowth()) {
            mai.push_back(logic.table().row(r).numbers[kNumMai]);
        }
    }
    logic.cmdFinalCut_Click();
    const int yc = rotation::yieldClass(mai);
    EXPECT_GT(yc, 0);
    EXPECT_EQ(yc % 2, 0);
    EXPECT_EQ(view.text(MainControl::lblYC), QString::number(yc));

    ASSERT_EQ(interactive.questions.size(), 1);
    EXPECT_EQ(interactive.questions[0].text, text::npvOffer());
    EXPECT_TRUE(view.isEnabled(MainControl::cmdNPV));
    // The cash flow runs from the first year of the table to the final cut.
    EXPECT_EQ(work.cashFlow().rotationLength(), 45);
    EXPECT_EQ(work.cashFlow().firstYear(), 15);
    logic.cmdNPV_Click();
    EXPECT_TRUE(npvView.isShown());
    EXPECT_EQ(npv.grid().size(), 47u);
}

TEST_F(RotationTest, DecliningTheNetPresentValueLeavesItOff) {
    growThinAndGrow(QString());
    interactive.answers = {false};
    logic.cmdFinalCut_Click();
    EXPECT_FALSE(view.isEnabled(MainControl::cmdNPV));
    EXPECT_EQ(work.cashFlow().years(), 0);
    logic.cmdNPV_Click();
    EXPECT_FALSE(npvView.isShown());
    // Without a net area the sub-compartment totals are 0.
    EXPECT_EQ(lastRow().cells[kColThinTotalVolume], QStringLiteral("0"));
    EXPECT_EQ(lastRow().cells[kColThinTotalValue], QStringLiteral("0"));
}

TEST_F(RotationTest, FinalCutAfterAThinningFellsWhatTheThinningLeft) {
    // The MAI is still rising at 30: the felling must not read as culmination.
    previewThinning(QStringLiteral("50"));
    thin.cmdAccept_Click();
    const int thinRow = logic.table().lastRow();
    const QStringList thinCells = logic.table().row(thinRow).cells;
    const double thinningRevenue = work.timberRevenue().at(30);
    logic.cmdFinalCut_Click();

    ASSERT_EQ(logic.table().lastRow(), thinRow + 1);
    EXPECT_EQ(logic.table().row(thinRow).cells, thinCells) << "the thinning keeps its row";
    const TableRow &felled = lastRow();
    EXPECT_TRUE(felled.finalCut);
    EXPECT_EQ(felled.record.age, 30.0f);
    EXPECT_EQ(felled.record.stocking, logic.table().row(thinRow).record.stocking);
    EXPECT_EQ(felled.cells[kColThinStocking], thinCells[kColStocking]);
    // Both harvests of the year earn their revenue.
    EXPECT_GT(work.timberRevenue().at(30), thinningRevenue);
    EXPECT_DOUBLE_EQ(work.timberRevenue().at(30), thinningRevenue + felled.timberRevenue);
    EXPECT_EQ(view.text(MainControl::lblYC), QStringLiteral("0"));
}

TEST_F(RotationTest, SummaryCarriesTheStartTheThinningsTheFinalCutAndTotals) {
    logic.cmdSummary_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, QStringLiteral("Sorry!  Nothing to summurize."));
    EXPECT_FALSE(logic.showingSummary());

    growThinAndGrow();
    logic.cmdFinalCut_Click();
    logic.cmdSummary_Click();
    EXPECT_TRUE(logic.showingSummary());
    EXPECT_TRUE(view.summaryShown());

    const std::vector<QStringList> grid = logic.summaryGrid();
    QStringList events;
    for (std::size_t r = 1; r < grid.size(); ++r) {
        events << grid[r].value(0);
    }
    EXPECT_EQ(events, (QStringList{QStringLiteral("Start"), QStringLiteral("Thinning"),
                                   QStringLiteral("Final cut"), QStringLiteral("Total production"),
                                   QStringLiteral("Total thinned"), QStringLiteral("Maximum MAI"),
                                   QStringLiteral("Yield class")}));
    const QStringList &header = grid[0];
    const auto at = [&](int row, const QString &caption) {
        return grid[static_cast<std::size_t>(row)].value(header.indexOf(caption));
    };
    EXPECT_EQ(at(1, QStringLiteral("Age")), QStringLiteral("15"));
    EXPECT_EQ(at(2, QStringLiteral("Age")), QStringLiteral("30"));
    EXPECT_EQ(at(3, QStringLiteral("Age")), QStringLiteral("60"));
    // Total production: everything thinned plus the final cut.
    const TableRow &thinning = logic.table().row(5);
    const double total = thinning.record.removedVolume + lastRow().numbers[kNumRemovedVolume];
    EXPECT_EQ(at(4, QStringLiteral("Total production V/ha")), shell::formatNumber(total, u"###0"));
    EXPECT_EQ(at(5, QStringLiteral("Thinning V/ha")), QStringLiteral("50"));
    EXPECT_EQ(at(7, QStringLiteral("Increment MAI")), view.text(MainControl::lblYC));

    logic.cmdSummary_Click();
    EXPECT_FALSE(view.summaryShown());
}

TEST_F(RotationTest, DeletingRowsReopensTheRotationWhereItWas) {
    growThinAndGrow();
    logic.cmdFinalCut_Click();
    // From the thinning at 30 to the end: the unthinned stand at 30 is left.
    logic.select(5, logic.table().lastRow());
    interactive.answers = {false};
    logic.cmdDeleteRows_Click();
    EXPECT_TRUE(work.felled()) << "No keeps every row";
    ASSERT_EQ(interactive.questions.size(), 2);
    EXPECT_TRUE(interactive.questions[1].text.startsWith(QStringLiteral("PLEASE CONFIRM - ")));

    logic.select(5, logic.table().lastRow());
    logic.cmdDeleteRows_Click();
    ASSERT_EQ(logic.table().lastRow(), 4);
    EXPECT_FALSE(work.felled());
    EXPECT_TRUE(work.timberRevenue().byAge().empty());
    EXPECT_EQ(work.cashFlow().years(), 0);
    EXPECT_TRUE(view.isEnabled(MainControl::cmdGrow));
    EXPECT_TRUE(view.isEnabled(MainControl::cmdThin));
    EXPECT_FALSE(view.isEnabled(MainControl::cmdNPV));
    EXPECT_FALSE(work.thinned());
    EXPECT_EQ(logic.table().headerLayout(), HeaderLayout::WithMoney);
    EXPECT_EQ(view.text(MainControl::txtFromA), QStringLiteral("30"));
    EXPECT_EQ(view.text(MainControl::lblYC), QString()) << "the MAI has not culminated by 30";

    // Growing on from the new last row gives the rows a projection without
    // the thinning gives.
    type(MainControl::txtToA, QStringLiteral("60"));
    logic.cmdGrow_Click();
    const std::vector<QStringList> continued = tableCells();

    SessionServices freshRun(dir.path());
    MainWindowLogic &fresh = freshRun.logic;
    fresh.mnuModel_Click(0);
    typeSitka(fresh, QStringLiteral("10"), QStringLiteral("60"));
    fresh.cmdGrow_Click();
    ASSERT_EQ(fresh.table().lastRow(), static_cast<int>(continued.size()));
    for (int r = 1; r <= fresh.table().lastRow(); ++r) {
        EXPECT_EQ(fresh.table().row(r).cells, continued[static_cast<std::size_t>(r) - 1])
            << "row " << r;
    }
}

TEST_F(RotationTest, FellingAndDeletingNeedARow) {
    logic.cmdFinalCut_Click();
    EXPECT_FALSE(work.felled());
    logic.cmdDeleteRows_Click();
    ASSERT_EQ(interactive.messages.size(), 2);
    EXPECT_EQ(interactive.messages[0].text, text::nothingToFell());
    EXPECT_EQ(interactive.messages[1].text, text::selectRowToDelete());
    growTo(QStringLiteral("30"));
    logic.select(1, 1);
    logic.cmdDeleteRows_Click();
    EXPECT_TRUE(logic.table().empty()) << "from the first row everything goes";
    EXPECT_TRUE(view.isEnabled(MainControl::cmdClear));
}

TEST_F(RotationTest, TablesCopyAsOneValuePerCellUnderTheirCaptions) {
    growThinAndGrow();
    logic.cmdFinalCut_Click();
    logic.CopyTable(false);
    const QStringList lines = clipboard.text().split(u'\n', Qt::SkipEmptyParts);
    ASSERT_EQ(lines.size(), logic.table().rowCount());
    const QStringList header = lines[0].split(u'\t');
    EXPECT_EQ(header.first(), QStringLiteral("Row")) << "each row's label first";
    EXPECT_FALSE(header.contains(QString())) << "no blank separator columns";
    for (const QString &line : lines) {
        EXPECT_EQ(line.split(u'\t').size(), header.size()) << line.toStdString();
    }
    EXPECT_TRUE(lines.last().startsWith(QStringLiteral("FC yr\t60\t")));
    EXPECT_TRUE(clipboard.html().startsWith(QStringLiteral("<table>")));

    logic.cmdSummary_Click();
    logic.CopyTable(true);
    EXPECT_TRUE(clipboard.text().startsWith(QStringLiteral("Event\tAge\t")));
    EXPECT_TRUE(clipboard.text().contains(QStringLiteral("\nFinal cut\t60\t")));
}

} // namespace
} // namespace arbolex::testing
