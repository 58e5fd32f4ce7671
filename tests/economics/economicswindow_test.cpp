// The economics window: its figures are the rotation library's for the stand,
// regime and final cut of the table; bad input keeps what is shown; the
// optimiser can be cancelled; Apply writes what a user would have typed.
#include "thinning/thinningfixture.hpp"

#include "economics/economicsformat.hpp"
#include "economics/economicsmessages.hpp"
#include "economics/economicswindowlogic.hpp"
#include "economics/npvwindowlogic.hpp"
#include "prices/prices.hpp"

namespace arbolex::testing {
namespace {

using economics::EconomicsControl;
using workflow::MainControl;

class EconomicsWindowTest : public ThinningTest {
protected:
    economics::HeadlessEconomicsView &view = economicsView;
    economics::EconomicsWindowLogic &economics = session.economics();
};

TEST_F(EconomicsWindowTest, FiguresAreTheRotationLibrarysForTheTablesRotation) {
    typeRotation({20, 25, 30}, {QStringLiteral("40")}, 45);
    work.cashFlow().setInterestRate(3.0);
    economics.cmdEconomics_Click();
    economics.typeText(EconomicsControl::txtEstablishmentCost, QStringLiteral("1800"));
    economics.typeText(EconomicsControl::txtAnnualCost, QStringLiteral("15"));
    economics.cmdCompute_Click();
    ASSERT_TRUE(economics.valued()) << view.text(EconomicsControl::lblRegime).toStdString();

    // The same rotation asked of the library directly.
    rotation::Economics money;
    money.ratePercent = 3.0;
    money.establishmentCost = 1800.0;
    money.annualCost = 15.0;
    prices::Prices longTerm;
    longTerm.data() = prices.data();
    longTerm.selectPriceSet(prices::kLongTermPrices);
    money.prices = longTerm.pricesInUse();
    const rotation::Regime regime{20, 5, 40.0f, 30};
    engine::Grow own;
    rotation::GrowthFailure failure;
    const auto path = rotation::growPath(own, {0, 15.0f, 2500.0f, 7.0f, 20.0f}, regime, failure);
    ASSERT_TRUE(path);
    const rotation::RotationValue expected = rotation::valueRotation(*path, 45, money);
    const rotation::RotationExplorer explorer = rotation::exploreRotations(*path, regime, money);

    const rotation::RotationValue &shown = *economics.value();
    EXPECT_EQ(economics.rotationAge(), 45);
    EXPECT_EQ(shown.npv, expected.npv);
    EXPECT_EQ(shown.lev, expected.lev);
    EXPECT_EQ(shown.forestValue, expected.forestValue);
    EXPECT_EQ(shown.irr.ratePercent, expected.irr.ratePercent);
    EXPECT_EQ(shown.breakEvenPriceFactor, expected.breakEvenPriceFactor);
    EXPECT_EQ(economics.explorer().economicRotation, explorer.economicRotation);
    EXPECT_EQ(economics.explorer().biologicalRotation, explorer.biologicalRotation);
    EXPECT_EQ(view.text(EconomicsControl::lblNPV), economics::euroPerHaText(expected.npv));
    EXPECT_EQ(view.text(EconomicsControl::lblLEV), economics::euroPerHaText(expected.lev));
    // Every panel names its rate.
    EXPECT_TRUE(view.text(EconomicsControl::lblRate).startsWith(QStringLiteral("At 3.00 %")));
    EXPECT_TRUE(view.text(EconomicsControl::lblIRR).endsWith(QStringLiteral("% a year")));
    EXPECT_FALSE(view.text(EconomicsControl::lblRegime).contains(QStringLiteral("irregular")));
    // The Monte Carlo draws come with the figures.
    ASSERT_TRUE(economics.monteCarlo());
    EXPECT_TRUE(view.text(EconomicsControl::lblMonteCarlo).contains(QStringLiteral("10,000")));

    // Valued by assortments instead, at the assortment prices in use.
    prices.data().assortmentPrices = {10.0, 28.0, 48.0};
    economics.typeText(EconomicsControl::cboValuation, QStringLiteral("Assortment"));
    economics.cmdCompute_Click();
    money.valuation = rotation::Valuation::kAssortments;
    money.assortmentPrices = {10.0, 28.0, 48.0};
    const rotation::RotationValue byClass = rotation::valueRotation(*path, 45, money);
    EXPECT_EQ(economics.value()->npv, byClass.npv);
    EXPECT_EQ(economics.value()->lev, byClass.lev);
    EXPECT_NE(byClass.npv, expected.npv);
    EXPECT_TRUE(view.text(EconomicsControl::lblRate).contains(QStringLiteral("assortment prices")));
}

TEST_F(EconomicsWindowTest, StandTodayIsWorthWhatTheNetPresentValueWindowSays) {
    // The costs a new work starts with, as shipped.
    work.resetCosts();
    ASSERT_GT(work.establishmentCost(), 0.0);
    economics::NpvWindowLogic &npv = session.npv();
    struct Table {
        std::vector<int> ages;
        QStringList volumes;
        int finalCut;
    };
    // A regular regime, and one the explorer can only take as its means.
    const Table tables[] = {
        {{20, 25, 30}, {QStringLiteral("40")}, 45},
        {{20, 25, 32}, {QStringLiteral("30"), QStringLiteral("50"), QStringLiteral("40")}, 48}};
    for (const Table &t : tables) {
        typeRotation(t.ages, t.volumes, t.finalCut);
        ASSERT_EQ(work.cashFlow().firstYear(), 15);
        npv.Form_Load();
        npv.typeInCell(2, work::kCfCost, QStringLiteral("1200"));              // age 16
        npv.typeInCell(14, work::kCfOtherRevenues, QStringLiteral("300.5"));   // age 28
        npv.typeInCell(t.finalCut - 14, work::kCfCost, QStringLiteral("450")); // the final cut
        npv.cmdNPV_Click();
        const double npvWindow = work.cashFlow().SumNPV();

        economics.cmdEconomics_Click();
        ASSERT_TRUE(economics.valued()) << view.text(EconomicsControl::lblRegime).toStdString();
        const rotation::RotationValue shown = *economics.value();
        EXPECT_EQ(shown.npv, npvWindow) << t.finalCut;
        EXPECT_EQ(view.text(EconomicsControl::lblNPV), economics::euroPerHaText(npvWindow));
        // The table's own thinnings, not a regular regime.
        ASSERT_EQ(shown.thinnings.size(), t.ages.size());
        for (std::size_t i = 0; i < t.ages.size(); ++i) {
            EXPECT_EQ(shown.thinnings[i].age, t.ages[i]);
        }
        EXPECT_EQ(economics.rotationAge(), t.finalCut);
        // Planting is paid for: the return and the break-even are figures.
        EXPECT_EQ(shown.irr.outcome, valuation::IrrOutcome::kRoot);
        ASSERT_TRUE(shown.breakEvenPriceFactor.has_value());
        EXPECT_GT(*shown.breakEvenPriceFactor, 0.0);
        // That the establishment cost counts in the bare land's figures only
        // is the rotation library's (rotation_test.cpp).
    }
}

TEST_F(EconomicsWindowTest, CostsAreInputsOfTheWork) {
    typeRotation({20}, {QStringLiteral("40")}, 40);
    work.setCosts(2000.0, 12.5);
    economics.cmdEconomics_Click();
    EXPECT_EQ(view.text(EconomicsControl::txtEstablishmentCost), QStringLiteral("2000"));
    EXPECT_EQ(view.text(EconomicsControl::txtAnnualCost), QStringLiteral("12.5"));
    EXPECT_EQ(economics.economics().annualCost, 12.5);

    // Typed and computed, a cost becomes the work's, announced as a change.
    int announced = 0;
    QObject::connect(&work, &work::StandWork::costsChanged, [&] { ++announced; });
    economics.typeText(EconomicsControl::txtEstablishmentCost, QStringLiteral("2600"));
    economics.cmdCompute_Click();
    EXPECT_EQ(work.establishmentCost(), 2600.0);
    EXPECT_EQ(announced, 1);
    economics.cmdCompute_Click();
    EXPECT_EQ(announced, 1) << "the same costs again change nothing";
    // A document written before the work had costs: document_test.cpp.
}

TEST_F(EconomicsWindowTest, IrregularThinningsAreValuedAsTheirMeansAndSaidSo) {
    typeRotation({20, 25, 32}, {QStringLiteral("30"), QStringLiteral("50"), QStringLiteral("40")},
                 0);
    economics.cmdEconomics_Click();
    ASSERT_TRUE(economics.valued());
    EXPECT_EQ(economics.regime().thinFrom, 20);
    EXPECT_EQ(economics.regime().thinEvery, 6);
    EXPECT_EQ(economics.regime().thinUntil, 32);
    EXPECT_NEAR(economics.regime().thinVolume, 40.0f, 0.01f);
    const QString note = view.text(EconomicsControl::lblRegime);
    EXPECT_TRUE(note.contains(QStringLiteral("irregular (at 20, 25 and 32 years, 30 to 50")))
        << note.toStdString();
    // Without a final cut the economic rotation is valued.
    EXPECT_EQ(economics.rotationAge(), economics.explorer().economicRotation);
    EXPECT_TRUE(note.contains(QStringLiteral("economic rotation")));
}

TEST_F(EconomicsWindowTest, BadInputIsRefusedAndKeepsWhatIsShown) {
    typeRotation({20}, {QStringLiteral("40")}, 40);
    economics.cmdEconomics_Click();
    ASSERT_TRUE(economics.valued());
    const QString npv = view.text(EconomicsControl::lblNPV);
    const int draws = economics.monteCarlo()->histogram.empty() ? 0 : 1;

    const struct {
        EconomicsControl field;
        QString typed;
        EconomicsControl command;
        QString message;
        EconomicsControl focus;
    } cases[] = {
        {EconomicsControl::txtInterestRate, QStringLiteral("0"), EconomicsControl::cmdCompute,
         economics::economicstext::faultRate(), EconomicsControl::txtInterestRate},
        {EconomicsControl::txtAnnualCost, QStringLiteral("-5"), EconomicsControl::cmdCompute,
         economics::economicstext::faultCost(), EconomicsControl::txtAnnualCost},
        {EconomicsControl::txtDraws, QStringLiteral("5"), EconomicsControl::cmdMonteCarlo,
         economics::economicstext::faultDraws(), EconomicsControl::txtDraws},
        {EconomicsControl::txtRateHigh, QStringLiteral("1"), EconomicsControl::cmdMonteCarlo,
         economics::economicstext::faultRateRange(), EconomicsControl::txtRateLow},
        {EconomicsControl::txtCarbonSpread, QStringLiteral("150"), EconomicsControl::cmdMonteCarlo,
         economics::economicstext::faultSpread(), EconomicsControl::txtCarbonSpread},
    };
    for (const auto &c : cases) {
        const QString before = view.text(c.field);
        interactive.messages.clear();
        economics.typeText(c.field, c.typed);
        economics.press(c.command);
        ASSERT_EQ(interactive.messages.size(), 1) << c.typed.toStdString();
        EXPECT_EQ(interactive.messages.front().text, c.message);
        EXPECT_EQ(view.focused(), c.focus);
        EXPECT_EQ(view.text(EconomicsControl::lblNPV), npv);
        EXPECT_EQ(economics.monteCarlo()->histogram.empty() ? 0 : 1, draws);
        economics.typeText(c.field, before);
    }
    EXPECT_EQ(work.cashFlow().interestRate(), 5.0) << "a refused rate is not kept";
}

TEST_F(EconomicsWindowTest, CancelStopsTheOptimiser) {
    typeRotation({20}, {QStringLiteral("40")}, 40);
    economics.cmdEconomics_Click();
    view.onProgress = [&](double fraction) {
        if (fraction > 0.2) {
            economics.cmdCancel_Click();
        }
    };
    economics.cmdOptimise_Click();
    EXPECT_FALSE(economics.optimising());
    EXPECT_LT(view.progress().back(), 1.0);
    EXPECT_TRUE(view.text(EconomicsControl::lblOptimiser).startsWith(QStringLiteral("Cancelled")));
    EXPECT_TRUE(view.isEnabled(EconomicsControl::cmdOptimise));
    EXPECT_FALSE(view.isEnabled(EconomicsControl::cmdCancel));
}

TEST_F(EconomicsWindowTest, ApplyWritesTheTableAUserWouldTypeAndKeepsTheTypedCashFlow) {
    typeRotation({20}, {QStringLiteral("40")}, 40);
    session.npv().Form_Load();
    session.npv().typeInCell(2, work::kCfCost, QStringLiteral("1200")); // age 16
    economics.cmdEconomics_Click();
    ASSERT_EQ(economics.economics().entries.size(), 1u);
    EXPECT_EQ(economics.economics().entries.front().age, 16);
    EXPECT_TRUE(view.text(EconomicsControl::lblRate).contains(QStringLiteral("costs 1,200 €/ha")))
        << view.text(EconomicsControl::lblRate).toStdString();
    economics.cmdOptimise_Click();
    ASSERT_EQ(economics.regimes().size(), 5u);
    EXPECT_EQ(view.progress().back(), 1.0);
    // The first regime of the five that thins more than once.
    int rank = 0;
    for (std::size_t i = 0; i < economics.regimes().size() && rank == 0; ++i) {
        const rotation::Regime &g = economics.regimes()[i].regime;
        if (g.thins() && g.thinUntil.value_or(0) > g.thinFrom) {
            rank = static_cast<int>(i) + 1;
        }
    }
    ASSERT_GT(rank, 0);
    const rotation::Candidate chosen = economics.regimes()[static_cast<std::size_t>(rank - 1)];
    economics.cmdApply_Click(rank);
    const std::vector<QStringList> applied = tableCells();
    // The typed cost stays, and the applied regime scores as the optimiser said.
    EXPECT_EQ(work.cashFlow().matrix(work::kCfCost, 1), 1200.0);
    ASSERT_TRUE(economics.yourRegime());
    EXPECT_DOUBLE_EQ(economics.yourRegime()->lev, chosen.lev);
    EXPECT_EQ(economics.regimes().size(), 5u) << "the same stand and money keep the regimes";

    // The same regime typed by hand.
    std::vector<int> ages;
    for (int a = chosen.regime.thinFrom; a <= *chosen.regime.thinUntil;
         a += chosen.regime.thinEvery) {
        ages.push_back(a);
    }
    typeRotation(ages, {shell::singleText(chosen.regime.thinVolume)}, chosen.rotation);
    EXPECT_EQ(tableCells(), applied);
    EXPECT_TRUE(work.felled());

    // The window now reads the regime from the table.
    economics.cmdCompute_Click();
    EXPECT_EQ(economics.regime().thinFrom, chosen.regime.thinFrom);
    EXPECT_EQ(economics.regime().thinUntil, chosen.regime.thinUntil);
    EXPECT_EQ(economics.rotationAge(), chosen.rotation);
}

} // namespace
} // namespace arbolex::testing
