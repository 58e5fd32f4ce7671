// arbolex-cli valuing by assortments: the output says which valuation it used,
// the final cut's classes are sold at the data folder's assortment prices or
// at those of --assortment-prices, and optimise and uncertainty follow.
#include "cli/clirun.hpp"
#include "mocks/programservices.hpp"
#include "shell/testfiles.hpp"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace {

using arbolex::cli::testing::Outcome;

const QString kRotation = QStringLiteral(
    "rotation --model 0 --age 15 --stocking 2500 --height 7 --basal-area 20 --rotation 50 "
    "--format json");

class AssortValuationCliTest : public ::testing::Test {
protected:
    QJsonObject json(const QString &commandLine) {
        const Outcome r = arbolex::cli::testing::runCli(
            commandLine.split(QLatin1Char(' '), Qt::SkipEmptyParts), m_data.path());
        EXPECT_EQ(r.exitCode, 0) << r.err.toStdString();
        return QJsonDocument::fromJson(r.out.join(QLatin1Char('\n')).toUtf8()).object();
    }

    static QJsonObject finalCut(const QJsonObject &o) {
        return o[QStringLiteral("final_cut")].toObject();
    }

    QTemporaryDir m_data;
    bool m_copied = arbolex::testing::copyShippedData(m_data.path());
};

TEST_F(AssortValuationCliTest, ClassesAreSoldAtTheAssortmentPrices) {
    const QJsonObject stand = json(kRotation);
    EXPECT_EQ(stand[QStringLiteral("valuation")].toString(), QStringLiteral("stand"));
    EXPECT_FALSE(finalCut(stand).contains(QStringLiteral("assortments")));

    const QJsonObject shipped = json(kRotation + QStringLiteral(" --valuation assortment"));
    EXPECT_EQ(shipped[QStringLiteral("valuation")].toString(), QStringLiteral("assortment"));
    const QJsonObject cut = finalCut(shipped);
    const QJsonObject classes = cut[QStringLiteral("assortments")].toObject();
    const double pulp = classes[QStringLiteral("7-14 cm")].toDouble();
    const double pallet = classes[QStringLiteral("14-20 cm")].toDouble();
    const double saw = classes[QStringLiteral(">20 cm")].toDouble();
    EXPECT_NEAR(pulp + pallet + saw, cut[QStringLiteral("volume")].toDouble(), 0.01);
    // The shipped AssortPrices.qdm: 10, 28 and 48 euro/m3.
    EXPECT_NEAR(cut[QStringLiteral("revenue")].toDouble(), pulp * 10 + pallet * 28 + saw * 48,
                0.01);
    EXPECT_NE(cut[QStringLiteral("revenue")], finalCut(stand)[QStringLiteral("revenue")]);

    const QString own = m_data.filePath(QStringLiteral("sawmill.qdm"));
    arbolex::testing::writeBytes(own, "0\r\n0\r\n60\r\n");
    const QJsonObject sawmill =
        json(kRotation + QStringLiteral(" --valuation assortment --assortment-prices ") + own);
    EXPECT_NEAR(finalCut(sawmill)[QStringLiteral("revenue")].toDouble(), saw * 60, 0.01);
}

TEST_F(AssortValuationCliTest, OptimiseAndUncertaintySayHowTheyValued) {
    const QString stand =
        QStringLiteral(" --model 0 --age 15 --stocking 2500 --height 7 --basal-area 20 --rate 3 "
                       "--valuation assortment --format json");
    const QJsonObject best = json(QStringLiteral("optimise") + stand + QStringLiteral(" --top 1"));
    EXPECT_EQ(best[QStringLiteral("valuation")].toString(), QStringLiteral("assortment"));
    EXPECT_EQ(best[QStringLiteral("best")].toArray().size(), 1);
    const QJsonObject drawn =
        json(QStringLiteral("uncertainty") + stand + QStringLiteral(" --draws 200"));
    EXPECT_EQ(drawn[QStringLiteral("valuation")].toString(), QStringLiteral("assortment"));
}

} // namespace
