// The price windows driven by the headless runner: what a script may reach
// in them. What they do is tested with the windows.
#include "mocks/programservices.hpp"

#include "cli/scriptrunner.hpp"

#include <QSettings>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

/// A session over a copy of the shipped data, loaded as the program loads it.
class RunnerPricesTest : public ::testing::Test {
protected:
    RunnerPricesTest() { session.main().Form_Load(settings, QRect(0, 0, 1280, 800)); }

    QStringList run(const QStringList &lines) {
        outcome = runner.run(lines);
        out.flush();
        return output.split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    }

    QTemporaryDir dir;
    bool copied = copyShippedData(dir.path());
    QString output;
    QTextStream out{&output};
    QSettings settings{dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    cli::HeadlessSession session{dir.path(), out};
    cli::ScriptRunner runner{session, out};
    cli::ScriptRunner::Outcome outcome;
};

TEST_F(RunnerPricesTest, EditsChoosesAndPrintsThePrices) {
    const QStringList lines =
        run(QStringLiteral(
                "press cmdShowTimberPrice\n"
                "set frmTimberPrices.txtTimbVal(13) 9\n" // refused: no Allow Changes yet
                "print frmTimberPrices.txtTimbVal(13)\npress frmTimberPrices.cmdChangePrices\n"
                "print frmTimberPrices.cmdChangePrices\n"
                "set frmTimberPrices.txtTimbVal(13) 12.5\nset frmTimberPrices.txtTimbVal(14)\n"
                "set frmTimberPrices.txtTimbVal(0) 1\n" // refused: current prices
                "press frmTimberPrices.cmdChangePrices\n"
                "print frmTimberPrices.txtTimbVal(13)\nprint frmTimberPrices.txtTimbVal(14)\n"
                "print frmTimberPrices.txtTimbVal(0)\npress frmTimberPrices.OptUserPrices\n"
                "print frmTimberPrices.OptUserPrices\nprint frmTimberPrices.OptCurentPrices\n"
                "print frmTimberPrices.lblOVRA_TP\npress frmTimberPrices.cmdClosePricesList")
                .split(QLatin1Char('\n')));
    ASSERT_TRUE(outcome.ok()) << outcome.error.toStdString();
    EXPECT_EQ(lines, (QStringList{QStringLiteral("4.00"), QStringLiteral("Accept Changes"),
                                  QStringLiteral("12.5"), QStringLiteral("0"),
                                  QStringLiteral("4.10"), QStringLiteral("1"), QStringLiteral("0"),
                                  QStringLiteral("Average private sector standing roundwood "
                                                 "prices (\u20ac / m3) for the period"),
                                  QStringLiteral("January 2025 to December 2025")}));
    EXPECT_EQ(session.main().prices().priceSetInUse(), prices::kUserPrices);
    EXPECT_EQ(session.main().prices().pricesInUse()[0], 12.5);
    EXPECT_FALSE(session.timberPricesView().isShown());
}

TEST_F(RunnerPricesTest, RefusesWhatTheWindowDoesNotHave) {
    struct Case {
        const char *line;
        const char *error;
    };
    const Case cases[] = {
        {"set frmTimberPrices.txtTimbVal(52) 1", "no field named 'frmTimberPrices.txtTimbVal(52)'"},
        {"set frmTimberPrices.lblTimbCat(0) 1", "no field named 'frmTimberPrices.lblTimbCat(0)'"},
        {"press frmTimberPrices.txtTimbVal(1)", "no command named 'frmTimberPrices.txtTimbVal(1)'"},
        {"press frmTimberPrices.OptPrices", "no command named 'frmTimberPrices.OptPrices'"},
        {"set frmAssortPrices.txtAsmtVal(3) 1", "no field named 'frmAssortPrices.txtAsmtVal(3)'"},
        {"set frmAssortPrices.lblAsmtCat(0) 1", "no field named 'frmAssortPrices.lblAsmtCat(0)'"},
        {"press frmAssortPrices.txtAsmtVal(0)", "no command named 'frmAssortPrices.txtAsmtVal(0)'"},
    };
    for (const Case &c : cases) {
        EXPECT_EQ(runner.runLine(QLatin1String(c.line)), QString::fromUtf8(c.error)) << c.line;
    }
}

} // namespace
} // namespace arbolex::testing
