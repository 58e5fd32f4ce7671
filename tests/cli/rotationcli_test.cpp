// arbolex-cli rotation, run as a user runs it over the shipped price lists:
// its JSON figures hold together, the chosen rotation, price list and
// valuation are the ones used, and a command line that names no rotation
// exits with 2.
#include "cli/clirun.hpp"
#include "mocks/programservices.hpp"
#include "shell/testfiles.hpp"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <cmath>
#include <ostream>
#include <tuple>

namespace {

using arbolex::cli::testing::Outcome;

constexpr const char *kStandOptions =
    "--model 0 --age 15 --stocking 2500 --height 7 --basal-area 20";
const QString kStand = QStringLiteral("rotation ") + QLatin1String(kStandOptions);
constexpr const char *kRegime = "--thin-from 20 --thin-every 5 --thin-volume 40 --thin-until 35";

QStringList words(const QString &commandLine) {
    return commandLine.split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

class RotationCliTest : public ::testing::Test {
protected:
    Outcome run(const QString &commandLine) {
        return arbolex::cli::testing::runCli(words(commandLine), m_data.path());
    }

    /// The JSON document of a command that must succeed.
    QJsonObject json(const QString &commandLine) {
        const Outcome r = run(commandLine + QStringLiteral(" --format json"));
        EXPECT_EQ(r.exitCode, 0) << r.err.toStdString();
        return QJsonDocument::fromJson(r.out.join(QLatin1Char('\n')).toUtf8()).object();
    }

    QTemporaryDir m_data;
    bool m_copied = arbolex::testing::copyShippedData(m_data.path());
};

const QString kThinned = kStand + QLatin1Char(' ') + QLatin1String(kRegime);

TEST_F(RotationCliTest, JsonCarriesEveryFigureAndTheyHoldTogether) {
    const QJsonObject o = json(kThinned + QStringLiteral(" --rate 3 --establishment-cost 1500"));
    // Every figure is there: the schema says so (outputs_test.py).
    const int rotation = o[QStringLiteral("rotation")].toInt();
    EXPECT_EQ(rotation, o[QStringLiteral("economic_rotation")].toInt());
    const double lev = o[QStringLiteral("lev")].toDouble();
    EXPECT_NEAR(o[QStringLiteral("eaa")].toDouble(), lev * 0.03, 0.01);
    // Felled at R, replanted for ever: the stand today is its NPV and the
    // bare land's value discounted from the final cut.
    EXPECT_NEAR(o[QStringLiteral("forest_value")].toDouble(),
                o[QStringLiteral("npv")].toDouble() + lev / std::pow(1.03, rotation - 15), 0.02);
    const QJsonArray thinnings = o[QStringLiteral("thinnings")].toArray();
    ASSERT_EQ(thinnings.size(), 4);
    EXPECT_EQ(thinnings[3].toObject()[QStringLiteral("age")].toInt(), 35);
    const QJsonArray cashflow = o[QStringLiteral("cashflow")].toArray();
    ASSERT_EQ(cashflow.size(), rotation + 1);
    EXPECT_EQ(cashflow[0].toObject()[QStringLiteral("cost")].toDouble(), 1500.0);
    // The explorer's row at the rotation is the rotation itself; it starts
    // after the last thinning.
    const QJsonArray byAge = o[QStringLiteral("by_age")].toArray();
    EXPECT_EQ(byAge.first().toObject()[QStringLiteral("age")].toInt(), 36);
    const QJsonObject row = byAge[rotation - 36].toObject();
    EXPECT_EQ(row[QStringLiteral("lev")].toDouble(), lev);
    EXPECT_EQ(row[QStringLiteral("npv")], o[QStringLiteral("npv")]);
    EXPECT_TRUE(o[QStringLiteral("irr")].isDouble());
}

TEST_F(RotationCliTest, ChosenRotationAndPriceListAreTheOnesUsed) {
    // No cost at all, so that the revenue alone is valued.
    const QString unthinned =
        kStand + QStringLiteral(" --rotation 50 --establishment-cost 0 --annual-cost 0");
    const QJsonObject longTerm = json(unthinned);
    EXPECT_EQ(longTerm[QStringLiteral("rotation")].toInt(), 50);
    EXPECT_TRUE(longTerm[QStringLiteral("thinnings")].toArray().isEmpty());
    // A mean tree of .500 to .599 m³ sells at class 7: 30.4 €/m³ over the
    // long term, 32.15 €/m³ at current prices (the shipped lists).
    const QJsonObject cut = longTerm[QStringLiteral("final_cut")].toObject();
    ASSERT_EQ(cut[QStringLiteral("mean_tree_volume")].toDouble(), 0.55);
    const double volume = cut[QStringLiteral("volume")].toDouble();
    EXPECT_NEAR(cut[QStringLiteral("revenue")].toDouble(), volume * 30.4, 0.005);
    const QJsonObject current = json(unthinned + QStringLiteral(" --prices current"));
    EXPECT_NEAR(
        current[QStringLiteral("final_cut")].toObject()[QStringLiteral("revenue")].toDouble(),
        volume * 32.15, 0.005);
    // Revenue only: no rate makes it worth nothing.
    EXPECT_TRUE(longTerm[QStringLiteral("irr")].isNull());
    EXPECT_EQ(longTerm[QStringLiteral("irr_note")].toString(), QStringLiteral("no sign change"));
}

TEST_F(RotationCliTest, CostsAreTheDataFoldersUnlessGiven) {
    const auto record = [](const QJsonObject &o) {
        const QJsonObject run = o[QStringLiteral("run")].toObject();
        QStringList files;
        for (const QJsonValue &f : run[QStringLiteral("files")].toArray()) {
            files << f.toObject()[QStringLiteral("name")].toString();
        }
        return std::pair{run[QStringLiteral("inputs")].toObject(), files};
    };
    // The shipped costs: the establishment grant of a conifer plantation, no yearly cost.
    const QJsonObject shipped = json(kThinned);
    auto [inputs, files] = record(shipped);
    EXPECT_EQ(inputs[QStringLiteral("establishment_cost")].toDouble(), 3045.0);
    EXPECT_EQ(inputs[QStringLiteral("annual_cost")].toDouble(), 0.0);
    EXPECT_TRUE(files.contains(QStringLiteral("Costs.qdm")));
    const QJsonArray cashflow = shipped[QStringLiteral("cashflow")].toArray();
    EXPECT_EQ(cashflow[0].toObject()[QStringLiteral("cost")].toDouble(), 3045.0);
    EXPECT_EQ(cashflow[1].toObject()[QStringLiteral("cost")].toDouble(), 0.0);
    EXPECT_TRUE(shipped[QStringLiteral("irr")].isDouble());

    // An option wins over the file.
    std::tie(inputs, files) = record(json(kThinned + QStringLiteral(" --annual-cost 20")));
    EXPECT_EQ(inputs[QStringLiteral("establishment_cost")].toDouble(), 3045.0);
    EXPECT_EQ(inputs[QStringLiteral("annual_cost")].toDouble(), 20.0);

    // A damaged file stops a command that takes a cost from it; without a
    // file the costs are 0.
    const QString costs = QDir(m_data.path()).filePath(QStringLiteral("Costs.qdm"));
    arbolex::testing::writeBytes(costs, "3045\r\ncheap\r\n");
    const Outcome damaged = run(kThinned + QStringLiteral(" --establishment-cost 1000"));
    EXPECT_EQ(damaged.exitCode, 2);
    EXPECT_TRUE(damaged.err.contains(
        QLatin1String("costs \"Costs.qdm\": the annual cost (value 2) is not a number")))
        << damaged.err.toStdString();
    std::tie(inputs, files) =
        record(json(kThinned + QStringLiteral(" --establishment-cost 1000 --annual-cost 0")));
    EXPECT_EQ(inputs[QStringLiteral("establishment_cost")].toDouble(), 1000.0);
    ASSERT_TRUE(QFile::remove(costs));
    std::tie(inputs, files) = record(json(kThinned));
    EXPECT_EQ(inputs[QStringLiteral("establishment_cost")].toDouble(), 0.0);
    EXPECT_FALSE(files.contains(QStringLiteral("Costs.qdm")));
}

// Valued by assortments: the classes of the final cut are sold at the data
// folder's assortment prices or at those of --assortment-prices, and optimise
// and uncertainty say how they valued.
TEST_F(RotationCliTest, ClassesAreSoldAtTheAssortmentPrices) {
    const QString felled = kStand + QStringLiteral(" --rotation 50");
    const auto finalCut = [](const QJsonObject &o) {
        return o[QStringLiteral("final_cut")].toObject();
    };
    const QJsonObject stand = json(felled);
    EXPECT_EQ(stand[QStringLiteral("valuation")].toString(), QStringLiteral("stand"));
    EXPECT_FALSE(finalCut(stand).contains(QStringLiteral("assortments")));

    const QJsonObject shipped = json(felled + QStringLiteral(" --valuation assortment"));
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

    const QString own = m_data.filePath(QStringLiteral("sawmill.qdm"));
    arbolex::testing::writeBytes(own, "0\r\n0\r\n60\r\n");
    const QJsonObject sawmill =
        json(felled + QStringLiteral(" --valuation assortment --assortment-prices ") + own);
    EXPECT_NEAR(finalCut(sawmill)[QStringLiteral("revenue")].toDouble(), saw * 60, 0.01);

    const QString search =
        QLatin1String(kStandOptions) + QStringLiteral(" --rate 3 --valuation assortment");
    const QJsonObject best =
        json(QStringLiteral("optimise ") + search + QStringLiteral(" --top 1"));
    EXPECT_EQ(best[QStringLiteral("valuation")].toString(), QStringLiteral("assortment"));
    const QJsonObject drawn =
        json(QStringLiteral("uncertainty ") + search + QStringLiteral(" --draws 200"));
    EXPECT_EQ(drawn[QStringLiteral("valuation")].toString(), QStringLiteral("assortment"));
}

struct BadRotation {
    const char *arguments; ///< after the stand
    const char *complaint; ///< part of what stderr must say
    const char *command = "rotation";
};

void PrintTo(const BadRotation &c, std::ostream *os) {
    *os << c.command << ' ' << c.arguments;
}

class RotationCliBadArgumentsTest : public RotationCliTest,
                                    public ::testing::WithParamInterface<BadRotation> {};

TEST_P(RotationCliBadArgumentsTest, ExitsWithTwoAndSaysWhy) {
    const Outcome r =
        run(QLatin1String(GetParam().command) + QLatin1Char(' ') + QLatin1String(kStandOptions) +
            QLatin1Char(' ') + QLatin1String(GetParam().arguments));
    EXPECT_EQ(r.exitCode, 2);
    EXPECT_TRUE(r.out.isEmpty());
    EXPECT_TRUE(r.err.contains(QLatin1String(GetParam().complaint))) << r.err.toStdString();
}

INSTANTIATE_TEST_SUITE_P(
    Cli, RotationCliBadArgumentsTest,
    ::testing::Values(
        BadRotation{"--thin-from 20 --thin-every 5 --thin-volume 40 --thin-until 40 --rotation 40",
                    "the regime thins at age 40, not before the final cut at age 40"},
        BadRotation{"--thin-from 45 --thin-every 5 --thin-volume 40 --rotation 40",
                    "the regime thins at age 45"},
        BadRotation{"--rotation 61", "past the model's age limit 60"},
        BadRotation{"--rotation 10", "before the present age 15"},
        BadRotation{"--rate -1", "--rate must be above 0"},
        BadRotation{"--annual-cost -5", "--annual-cost must not be negative"},
        BadRotation{"--prices cheapest", "--prices takes current, user, longterm or private"},
        BadRotation{"--format xml", "--format takes tsv, csv or json"},
        BadRotation{"--thin-from 20 --thin-volume 40", "--thin-every is required"},
        BadRotation{"--thin-from 20 --thin-every 5 --thin-volume 900",
                    "FAULT - Proposed thinning leads to negative or zero Volume."},
        BadRotation{"--thin-from 10 --thin-every 5 --thin-volume 40", "before the present age 15"},
        BadRotation{"--valuation price", "--valuation takes stand or assortment"},
        BadRotation{"--assortment-prices p.qdm",
                    "--assortment-prices is for --valuation assortment"},
        BadRotation{"--valuation assortment --assortment-prices /nonexistent/p.qdm",
                    "assortment prices \"p.qdm\": File not found"}));

TEST_F(RotationCliTest, UnthinnedModelRefusesARegime) {
    const Outcome r = run(QStringLiteral(
        "rotation --model 1 --age 15 --stocking 2500 --height 7 --basal-area 20 --thin-from 20 "
        "--thin-every 5 --thin-volume 40"));
    EXPECT_EQ(r.exitCode, 2);
    EXPECT_TRUE(r.err.contains(QLatin1String("has no thinning response"))) << r.err.toStdString();
}

TEST_F(RotationCliTest, OptimisedRegimesGiveTheirFiguresBackToRotation) {
    const QJsonObject o = json(QStringLiteral("optimise") + kThinned.mid(8) +
                               QStringLiteral(" --rate 3 --establishment-cost 1500 --top 3"));
    const QJsonArray best = o[QStringLiteral("best")].toArray();
    ASSERT_EQ(best.size(), 3);
    const QJsonObject first = best[0].toObject();
    const QJsonObject current = o[QStringLiteral("current")].toObject();
    EXPECT_EQ(current[QStringLiteral("thin_until")].toInt(), 35);
    EXPECT_NEAR(o[QStringLiteral("gain")].toDouble(),
                first[QStringLiteral("lev")].toDouble() - current[QStringLiteral("lev")].toDouble(),
                0.011);
    for (const QJsonValue &regime : best) {
        const QJsonObject b = regime.toObject();
        QString line = kStand + QStringLiteral(" --rate 3 --establishment-cost 1500");
        if (!b[QStringLiteral("thin_from")].isNull()) {
            for (const char *key : {"thin_from", "thin_every", "thin_volume", "thin_until"}) {
                line += QStringLiteral(" --") +
                        QString::fromLatin1(key).replace(QLatin1Char('_'), QLatin1Char('-')) +
                        QLatin1Char(' ') + QString::number(b[QLatin1String(key)].toDouble());
            }
        }
        line +=
            QStringLiteral(" --rotation ") + QString::number(b[QStringLiteral("rotation")].toInt());
        const QJsonObject again = json(line);
        EXPECT_EQ(again[QStringLiteral("lev")], b[QStringLiteral("lev")]) << line.toStdString();
        EXPECT_EQ(again[QStringLiteral("npv")], b[QStringLiteral("npv")]) << line.toStdString();
    }
}

INSTANTIATE_TEST_SUITE_P(
    CliSearch, RotationCliBadArgumentsTest,
    ::testing::Values(
        BadRotation{"--objective profit", "--objective takes lev, npv, volume or carbon",
                    "optimise"},
        BadRotation{"--max-removal 150", "--max-removal is a percentage up to 100", "optimise"},
        BadRotation{"--top 0", "--top must be a whole number from 1 to 100", "optimise"},
        BadRotation{"--rate-range 4 2", "--rate-range: LO is above HI", "uncertainty"},
        BadRotation{"--rate-range 0 3", "\"0\" is not a rate above 0", "uncertainty"},
        BadRotation{"--rate-range 2", "--rate-range takes two rates", "uncertainty"},
        BadRotation{"--carbon-money units", "--carbon-money units needs --carbon-price",
                    "optimise"},
        BadRotation{"--carbon-price -5", "--carbon-price must be from 0 to 10000", "uncertainty"},
        BadRotation{"--carbon-price 5 --carbon-money monthly",
                    "--carbon-money takes flow, units or none", "optimise"},
        BadRotation{"--carbon-spread 0.2", "--carbon-spread needs --carbon-price", "uncertainty"}));

} // namespace
