// The cash flow of a rotation and the net present value window: laying the
// rotation out by year, typing into the grid, the interest rate, computing,
// and copying.
#include "mocks/programservices.hpp"
#include "mocks/qtprinters.hpp"

#include "shell/vbformat.hpp"

#include "economics/npvmessages.hpp"
#include "economics/npvwindowlogic.hpp"
#include "shell/iclipboard.hpp"
#include "shell/testfiles.hpp"
#include "work/mdlnpv.hpp"

#include <QFile>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

using economics::NpvControl;
using namespace economics;
using namespace work;

/// A clipboard that refuses everything.
class RefusingClipboard : public shell::IClipboard {
public:
    bool setTable(const QString &, const QString &) override { return false; }
};

/// A rotation from age 20 to 60 with a thinning at 30 and the final cut at 60.
class NpvWindowTest : public ::testing::Test, protected ProgramServices {
protected:
    NpvWindowTest() {
        // A table whose thinning at 30 and final cut at 60 earn these revenues.
        WorkSnapshot rotation;
        for (const auto &[age, revenue] : {std::pair{30.0f, 588.4}, std::pair{60.0f, 55046.0}}) {
            TableRow row;
            row.record.age = age;
            row.timberRevenue = revenue;
            rotation.rows.push_back(row);
        }
        rotation.interestRate = work.cashFlow().interestRate();
        work.restore(rotation);
        cashFlow.SetRotationLength(20, 60);
        cashFlow.DimNPVArrays();
        npv.Form_Load();
    }

    QString cell(int row, int column) const { return npv.grid().at(row).value(column); }
    void key(QChar c) { npv.NPV_Grid_KeyPress(c); }

    StandWork work{grow, prices, log};
    CashFlow &cashFlow = work.cashFlow();
    HeadlessNpvView view;
    shell::HeadlessClipboard clipboard;
    NpvWindowLogic npv{work, view, interactive, clipboard};
};

TEST_F(NpvWindowTest, OpensOnEveryYearOfTheRotation) {
    ASSERT_EQ(npv.grid().size(), 42u); // header and 41 years
    EXPECT_EQ(cell(1, kCfYear), QStringLiteral("20"));
    EXPECT_EQ(cell(41, kCfYear), QStringLiteral("60"));
    EXPECT_EQ(cell(11, kCfTimberRevenue), QStringLiteral("588"));
    EXPECT_EQ(cashFlow.matrix(kCfTimberRevenue, 10), 588.4);
    EXPECT_EQ(cell(2, kCfCost), QStringLiteral("0"));
    EXPECT_EQ(view.text(NpvControl::txtInterestRate), QStringLiteral("5.00"));
    // Nothing computed yet.
    EXPECT_EQ(view.text(NpvControl::txtNPV), QStringLiteral("0"));
    EXPECT_TRUE(view.widened()); // 41 years need the scroll bar
}

TEST_F(NpvWindowTest, ComputesDiscountedCashFlowsFromTheFirstYear) {
    npv.cmdNPV_Click();
    // 588.40 at t = 10, 55046 at t = 40, at 5 %.
    const double thinning = std::nearbyint(588.4 / std::pow(1.05, 10) * 100.0) / 100.0;
    const double finalCut = std::nearbyint(55046.0 / std::pow(1.05, 40) * 100.0) / 100.0;
    EXPECT_EQ(cashFlow.matrix(kCfDiscountedCashFlow, 10), thinning);
    EXPECT_EQ(cashFlow.matrix(kCfDiscountedCashFlow, 40), finalCut);
    EXPECT_EQ(cashFlow.SumNPV(), thinning + finalCut);
    EXPECT_EQ(view.text(NpvControl::txtNPV), shell::formatNumber(thinning + finalCut, u"#0"));
    EXPECT_EQ(cell(11, kCfTotalRevenues), QStringLiteral("588"));
    EXPECT_EQ(cell(11, kCfCashFlow), QStringLiteral("588"));
    EXPECT_EQ(cell(12, kCfDiscountedCashFlow), QStringLiteral("0"));

    // At 0 % the net present value is the sum of the cash flows; a cost in
    // the first year takes exactly its amount off.
    npv.typeInterestRate(QStringLiteral("0"));
    npv.cmdNPV_Click();
    EXPECT_EQ(view.text(NpvControl::txtNPV), QStringLiteral("55634"));
    npv.typeInCell(1, kCfCost, QStringLiteral("1000"));
    npv.cmdNPV_Click();
    EXPECT_EQ(view.text(NpvControl::txtNPV), QStringLiteral("54634"));
    EXPECT_EQ(cell(1, kCfCashFlow), QStringLiteral("-1000"));
}

TEST_F(NpvWindowTest, TypingFollowsTheColumnOfTheCell) {
    npv.selectCell(3, kCfCost);
    for (const QChar c : QStringLiteral("1x2.5.0")) {
        key(c);
    }
    EXPECT_EQ(cell(3, kCfCost), QStringLiteral("12.50"))
        << "the 0 went away, x and a 2nd point not";
    EXPECT_EQ(cashFlow.matrix(kCfCost, 2), 12.5);
    key(u'\b');
    key(u'\b');
    EXPECT_EQ(cell(3, kCfCost), QStringLiteral("12."));
    for (int i = 0; i < 5; ++i) {
        key(u'\b');
    }
    EXPECT_EQ(cell(3, kCfCost), QString());
    EXPECT_EQ(cashFlow.matrix(kCfCost, 2), 0.0) << "an empty cell counts as 0";

    npv.typeInCell(4, kCfOtherRevenues, QStringLiteral("250"));
    EXPECT_EQ(cashFlow.matrix(kCfOtherRevenues, 3), 250.0);

    npv.typeInCell(5, kCfOperation, QStringLiteral("Fence, 1.2 km!"));
    EXPECT_EQ(cashFlow.operation(4), QStringLiteral("Fence, 1.2 km!"));
    key(u'\b');
    EXPECT_EQ(cashFlow.operation(4), QStringLiteral("Fence, 1.2 km"));

    // The computed columns and the year take no input.
    for (const int column :
         {kCfYear, kCfTimberRevenue, kCfTotalRevenues, kCfCashFlow, kCfDiscountedCashFlow}) {
        npv.typeInCell(11, column, QStringLiteral("9"));
    }
    EXPECT_EQ(cell(11, kCfYear), QStringLiteral("30"));
    EXPECT_EQ(cashFlow.matrix(kCfTimberRevenue, 10), 588.4);
}

TEST_F(NpvWindowTest, EnterComputesAndMovesDownUntilTheLastRow) {
    npv.typeInCell(40, kCfCost, QStringLiteral("100"));
    key(u'\r');
    EXPECT_EQ(npv.currentRow(), 41);
    EXPECT_EQ(npv.currentColumn(), kCfCost);
    EXPECT_EQ(cell(40, kCfCashFlow), QStringLiteral("-100"));
    EXPECT_NE(view.text(NpvControl::txtNPV), QStringLiteral("0"));
    key(u'\r');
    EXPECT_EQ(npv.currentRow(), 41);
}

TEST_F(NpvWindowTest, AnEmptyInterestRateCannotBeLeft) {
    npv.typeInterestRate(QStringLiteral("3.5"));
    EXPECT_EQ(cashFlow.interestRate(), 3.5);
    npv.typeInterestRate(QStringLiteral("4.x5.2"));
    EXPECT_EQ(view.text(NpvControl::txtInterestRate), QStringLiteral("4.52"));
    EXPECT_TRUE(interactive.messages.isEmpty());

    npv.typeInterestRate(QString());
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(view.focused(), NpvControl::txtInterestRate);
    EXPECT_EQ(cashFlow.interestRate(), 4.52) << "the rate stays as it was";
}

TEST_F(NpvWindowTest, AnOverflowEndsTheComputationAtItsYear) {
    npv.cmdNPV_Click();
    const QString before = view.text(NpvControl::txtNPV);
    npv.typeInCell(1, kCfCost, QStringLiteral("7"));
    npv.typeInterestRate(QStringLiteral("99999999999999999999")); // 1e20 %: past t = 15
    npv.cmdNPV_Click();
    // The years before the factor overflows are computed.
    EXPECT_EQ(cashFlow.matrix(kCfCashFlow, 0), -7.0);
    EXPECT_EQ(cell(1, kCfDiscountedCashFlow), QStringLiteral("-7"));
    EXPECT_EQ(view.text(NpvControl::txtNPV), before) << "not summed again";
    EXPECT_TRUE(readBytes(log.path()).contains("Overflow in line "));
}

TEST_F(NpvWindowTest, CopiesTheGridAsTextAndHtml) {
    npv.typeInCell(1, kCfOperation, QStringLiteral("Planting <bare> & fenced"));
    npv.CmdCopyToClipboard_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, economics::text::copiedToClipboard());
    const QStringList lines = clipboard.text().split(u'\n', Qt::SkipEmptyParts);
    ASSERT_EQ(lines.size(), 42);
    EXPECT_EQ(lines[1].split(u'\t').value(1), QStringLiteral("Planting <bare> & fenced"));
    EXPECT_TRUE(
        clipboard.html().contains(QStringLiteral("<td>Planting &lt;bare&gt; &amp; fenced</td>")));

    RefusingClipboard refusing;
    NpvWindowLogic other(work, view, interactive, refusing);
    other.CmdCopyToClipboard_Click();
    EXPECT_EQ(interactive.messages.back().text, economics::text::copyFailed());
    EXPECT_EQ(interactive.messages.back().style, shell::kExclamation);
}

} // namespace
} // namespace arbolex::testing
