// One stand, one rotation: random stands and regimes of every model, typed
// into the main window by the runner (grow by one year, thin by volume,
// accept, grow on, fell, NPV), valued by `arbolex-cli rotation` and as rows of
// `arbolex-cli estate`, give the same NPV to the cent and the same final-cut
// volume, or are all refused with the same message. The optimiser's best
// regime for each stand, applied from the economics window, replays without a
// message and is worth in the table what the optimiser said it was.
#include "cli/clirun.hpp"
#include "cli/headlesssession.hpp"
#include "cli/scriptrunner.hpp"

#include "engine/catalogue.hpp"
#include "prices/pricedata.hpp"
#include "prices/prices.hpp"
#include "rotation/rotation.hpp"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>
#include <QTextStream>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <map>
#include <optional>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

/// A stand as a forester types it, with the regime and the final cut.
struct Case {
    int model = 0;
    int age = 0;
    int stocking = 0;
    QString height;
    QString basalArea;
    rotation::Regime regime;
    int rotation = 0;
    QString rate;
};

/// What one way of valuing a case gave: the NPV and the final-cut volume, or
/// the message it was refused with.
struct Valued {
    std::optional<double> npv;
    double finalCutVolume = 0.0;
    QString refusal;
    /// The yield class the main window shows at the end, or the estate's.
    int yieldClass = 0;
};

std::ostream &operator<<(std::ostream &os, const Valued &v) {
    if (!v.refusal.isEmpty()) {
        return os << "refused: " << v.refusal.toStdString();
    }
    return os << "NPV " << (v.npv ? QString::number(*v.npv, 'f', 2).toStdString() : "none")
              << ", final cut " << v.finalCutVolume << " m3/ha";
}

/// Equal to the cent, or refused with the same words.
void expectSame(const Valued &a, const Valued &b, const std::string &what) {
    SCOPED_TRACE(what);
    EXPECT_EQ(a.refusal, b.refusal) << a << " / " << b;
    if (a.refusal.isEmpty() && b.refusal.isEmpty()) {
        ASSERT_TRUE(a.npv && b.npv) << a << " / " << b;
        EXPECT_EQ(std::llround(*a.npv * 100.0), std::llround(*b.npv * 100.0)) << a << " / " << b;
        EXPECT_NEAR(a.finalCutVolume, b.finalCutVolume, 0.005) << a << " / " << b;
    }
}

/// The cases: `perModel` stands of every model, drawn as the estate generator
/// draws plausible stands (12 to 30 years, site index 10 to 22 m), thinned
/// models with a regime of light to very heavy thinnings, felled between the
/// first age after the regime's first thinning and the age limit.
/// Models without a thinning response.
constexpr std::array<int, 11> kUnthinned = {1, 3, 5, 7, 9, 11, 13, 15, 17, 18, 20};

std::vector<Case> drawCases(int perModel) {
    std::uint64_t seed = 0x9E3779B97F4A7C15ull;
    auto uniform = [&seed](double low, double high) {
        seed = seed * 6364136223846793005ull + 1442695040888963407ull;
        return low + (high - low) * static_cast<double>(seed >> 11) / 9007199254740992.0;
    };
    const QString rates[] = {QStringLiteral("2"), QStringLiteral("3.5"), QStringLiteral("5")};
    std::vector<Case> cases;
    for (int i = 0; i < perModel; ++i) {
        for (int model = 0; model < engine::kModelCount; ++model) {
            Case c;
            c.model = model;
            c.age = 12 + static_cast<int>(uniform(0, 19));
            const double site = uniform(10, 22);
            c.height = QString::number(std::max(5.3, site * std::pow(c.age / 30.0, 0.9)), 'f', 1);
            c.stocking = static_cast<int>(2800 - 45 * (c.age - 12) - uniform(0, 400));
            c.basalArea = QString::number(12 + (c.age - 12) * 1.1 + uniform(0, 8), 'f', 1);
            const int limit = rotation::modelAgeLimit(static_cast<std::int16_t>(model));
            int earliest = c.age + 5;
            // The models with a thinning response get a regime; one case in
            // four of the others whose Thin button is on is given one too,
            // which the thinning window refuses.
            const bool responds =
                std::find(kUnthinned.begin(), kUnthinned.end(), model) == kUnthinned.end();
            if (responds || ((model + i) % 4 == 1 && engine::IsThinnedModel(model))) {
                c.regime.thinFrom = std::max(c.age + 1, 18 + static_cast<int>(uniform(0, 8)));
                c.regime.thinEvery = 3 + static_cast<int>(uniform(0, 4));
                // One regime in four removes 80 to 130 m³/ha at a time.
                c.regime.thinVolume = static_cast<float>(
                    uniform(0, 1) < 0.25 ? 80 + static_cast<int>(uniform(0, 50))
                                         : 25 + static_cast<int>(uniform(0, 40)));
                earliest = c.regime.thinFrom + 1;
            }
            c.rotation = std::min(limit, earliest + static_cast<int>(uniform(0, limit - earliest)));
            c.rate = rates[cases.size() % 3];
            cases.push_back(c);
        }
    }
    return cases;
}

std::vector<int> thinningAges(const rotation::Regime &regime, int rotation) {
    std::vector<int> ages;
    if (regime.thins()) {
        for (int a = regime.thinFrom; a < rotation; a += regime.thinEvery) {
            if (!regime.thinUntil || a <= *regime.thinUntil) {
                ages.push_back(a);
            }
        }
    }
    return ages;
}

/// A fresh desktop session driven by the runner, as a user starting the
/// program for one stand; prices as shipped.
class Window {
public:
    Window() {
        workflow::MainWindowLogic &main = session.main();
        prices::GetPricesFromFiles(QStringLiteral(ARBOLEX_DATA_SOURCE), main.prices().data(),
                                   main.errorLog());
        main.prices().selectPriceSet(prices::kCurrentPrices);
    }

    /// Runs `line`; true while the window has shown no message.
    bool step(const QString &line, Valued &v) {
        output.clear();
        const QString error = runner.runLine(line);
        out.flush();
        EXPECT_TRUE(error.isEmpty()) << line.toStdString() << ": " << error.toStdString();
        for (const QString &shown : output.split(QLatin1Char('\n'), Qt::SkipEmptyParts)) {
            if (shown.startsWith(QStringLiteral("MSG\t"))) {
                v.refusal = shown.section(QLatin1Char('\t'), 2, 2);
                return false;
            }
        }
        return true;
    }

    /// The NPV window's figure at the case's rate for the table as it stands.
    void npvOfTable(const Case &c, Valued &v) {
        for (const QString &line :
             {QStringLiteral("press cmdNPV"), QLatin1String("set frmNPV.txtInterestRate ") + c.rate,
              QStringLiteral("press frmNPV.cmdNPV"), QStringLiteral("press frmNPV.cmdClose")}) {
            if (!step(line, v)) {
                return;
            }
        }
        v.npv = session.work().cashFlow().SumNPV();
        v.finalCutVolume = session.work().standingVolume();
    }

    /// A new document with the case's stand typed in: the model chosen, the
    /// stand typed, the model chosen again so that its correction factor
    /// follows the stand's site index, one-year steps.
    bool typeStand(const Case &c, Valued &v) {
        const QString model = QLatin1String("model ") + QString::number(c.model);
        for (const QString &line : {model, QLatin1String("set txtFromA ") + QString::number(c.age),
                                    QLatin1String("set txtFromN ") + QString::number(c.stocking),
                                    QLatin1String("set txtFromH ") + c.height,
                                    QLatin1String("set txtFromB ") + c.basalArea, model,
                                    QStringLiteral("set txtByA 1")}) {
            if (!step(line, v)) {
                return false;
            }
        }
        return true;
    }

    /// The case typed into the main window as a forester types it, with the
    /// yield class the window shows where it ends.
    Valued typed(const Case &c) {
        Valued v = typedRotation(c);
        v.yieldClass = session.work().yieldClass();
        return v;
    }

    Valued typedRotation(const Case &c) {
        Valued v;
        if (!typeStand(c, v)) {
            return v;
        }
        for (const int age : thinningAges(c.regime, c.rotation)) {
            // After the first thinning the window offers to repeat it.
            if (session.work().thinned() && !step(QStringLiteral("answer no"), v)) {
                return v;
            }
            for (const QString &line :
                 {QLatin1String("set txtToA ") + QString::number(age),
                  QStringLiteral("press cmdGrow"), QStringLiteral("press cmdThin"),
                  QLatin1String("set frmThin.txtRemV ") +
                      QString::number(double{c.regime.thinVolume}),
                  QStringLiteral("press frmThin.cmdThin"),
                  QStringLiteral("press frmThin.cmdAccept")}) {
                if (!step(line, v)) {
                    return v;
                }
            }
        }
        for (const QString &line : {QLatin1String("set txtToA ") + QString::number(c.rotation),
                                    QStringLiteral("press cmdGrow"), QStringLiteral("answer yes"),
                                    QStringLiteral("press cmdFinalCut")}) {
            if (!step(line, v)) {
                return v;
            }
        }
        npvOfTable(c, v);
        return v;
    }

    /// The optimiser's best regime for the case's stand, applied from the
    /// economics window; `offered` gets the optimiser's own figures.
    Valued applied(const Case &c, Case &offered) {
        Valued v;
        // The economics window reads its stand from the table.
        if (!typeStand(c, v) ||
            !step(QLatin1String("set txtToA ") + QString::number(c.age + 1), v) ||
            !step(QStringLiteral("press cmdGrow"), v)) {
            return v;
        }
        for (const QString &line :
             {QStringLiteral("press cmdEconomics"),
              QLatin1String("set frmEconomics.txtInterestRate ") + c.rate,
              QStringLiteral("set frmEconomics.txtEstablishmentCost 0"),
              QStringLiteral("set frmEconomics.txtAnnualCost 0"),
              QStringLiteral("press frmEconomics.cmdOptimise"), QStringLiteral("wait")}) {
            if (!step(line, v)) {
                return v;
            }
        }
        const auto &best = session.economics().regimes();
        if (best.empty()) {
            v.refusal = QStringLiteral("the optimiser offered nothing");
            return v;
        }
        offered = c;
        offered.regime = best.front().regime;
        offered.rotation = best.front().rotation;
        if (!step(QStringLiteral("press frmEconomics.cmdApply(1)"), v) ||
            !step(QStringLiteral("press frmEconomics.cmdClose"), v)) {
            return v;
        }
        npvOfTable(c, v);
        return v;
    }

private:
    QTemporaryDir m_dir;
    QString output;
    QTextStream out{&output};
    cli::HeadlessSession session{m_dir.path(), out};
    cli::ScriptRunner runner{session, out};
};

QStringList standArguments(const Case &c) {
    QStringList a = QStringLiteral("--model %1 --age %2 --stocking %3 --height %4 --basal-area %5 "
                                   "--rotation %6 --rate %7 --establishment-cost 0 --annual-cost 0")
                        .arg(c.model)
                        .arg(c.age)
                        .arg(c.stocking)
                        .arg(c.height, c.basalArea)
                        .arg(c.rotation)
                        .arg(c.rate)
                        .split(QLatin1Char(' '));
    if (c.regime.thins()) {
        a << QStringLiteral("--thin-from") << QString::number(c.regime.thinFrom)
          << QStringLiteral("--thin-every") << QString::number(c.regime.thinEvery)
          << QStringLiteral("--thin-volume") << QString::number(double{c.regime.thinVolume});
        if (c.regime.thinUntil) {
            a << QStringLiteral("--thin-until") << QString::number(*c.regime.thinUntil);
        }
    }
    return a;
}

/// `arbolex-cli rotation` of the case.
Valued commandLine(const Case &c) {
    const cli::testing::Outcome run =
        cli::testing::runCli(QStringList{QStringLiteral("rotation")} + standArguments(c) +
                                 QStringList{QStringLiteral("--format"), QStringLiteral("json")},
                             QStringLiteral(ARBOLEX_DATA_SOURCE));
    Valued v;
    if (run.exitCode != 0) {
        v.refusal = run.err.trimmed().section(QStringLiteral(": "), 1);
        return v;
    }
    const QJsonObject doc =
        QJsonDocument::fromJson(run.out.join(QLatin1Char('\n')).toUtf8()).object();
    v.npv = doc.value(QStringLiteral("npv")).toDouble();
    v.finalCutVolume = doc.value(QStringLiteral("final_cut"))
                           .toObject()
                           .value(QStringLiteral("volume"))
                           .toDouble();
    return v;
}

/// The cases as rows of one estate per rate, by id.
std::map<QString, Valued> estateRows(const std::vector<Case> &cases, const QString &folder) {
    std::map<QString, Valued> rows;
    for (const QString &rate : {QStringLiteral("2"), QStringLiteral("3.5"), QStringLiteral("5")}) {
        const QString input = folder + QLatin1String("/estate-") + rate + QLatin1String(".csv");
        QFile file(input);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write("id,model,age,stocking,top_height,basal_area,area_ha,thin_from,thin_every,"
                   "thin_volume,rotation\n");
        for (std::size_t i = 0; i < cases.size(); ++i) {
            const Case &c = cases[i];
            if (c.rate != rate) {
                continue;
            }
            QStringList cells = QStringLiteral("%1,%2,%3,%4,%5,%6,1")
                                    .arg(i)
                                    .arg(c.model)
                                    .arg(c.age)
                                    .arg(c.stocking)
                                    .arg(c.height, c.basalArea)
                                    .split(QLatin1Char(','));
            cells << (c.regime.thins() ? QString::number(c.regime.thinFrom) : QStringLiteral("0"))
                  << (c.regime.thins() ? QString::number(c.regime.thinEvery) : QString())
                  << (c.regime.thins() ? QString::number(double{c.regime.thinVolume}) : QString())
                  << QString::number(c.rotation);
            file.write((cells.join(QLatin1Char(',')) + QLatin1Char('\n')).toUtf8());
        }
        file.close();
        const QString out = folder + QLatin1String("/out-") + rate;
        QDir().mkpath(out);
        cli::testing::runCli({QStringLiteral("estate"), input, QStringLiteral("--out"), out,
                              QStringLiteral("--rate"), rate,
                              QStringLiteral("--establishment-cost"), QStringLiteral("0"),
                              QStringLiteral("--annual-cost"), QStringLiteral("0"),
                              QStringLiteral("--format"), QStringLiteral("json")},
                             QStringLiteral(ARBOLEX_DATA_SOURCE));
        for (const char *table : {"subcompartments", "errors"}) {
            QFile result(out + QLatin1Char('/') + QLatin1String(table) + QLatin1String(".json"));
            EXPECT_TRUE(result.open(QIODevice::ReadOnly)) << table;
            const QJsonObject doc = QJsonDocument::fromJson(result.readAll()).object();
            for (const QJsonValue &row : doc.value(QStringLiteral("rows")).toArray()) {
                const QJsonObject r = row.toObject();
                Valued &v = rows[r.value(QStringLiteral("id")).toString()];
                if (r.contains(QStringLiteral("message"))) {
                    v.refusal = r.value(QStringLiteral("message")).toString();
                } else if (r.value(QStringLiteral("status")).toString() == QStringLiteral("ok")) {
                    v.npv = r.value(QStringLiteral("npv_ha")).toDouble();
                    v.yieldClass = r.value(QStringLiteral("yield_class")).toInt();
                    v.finalCutVolume = r.value(QStringLiteral("final_cut_volume_ha")).toDouble();
                }
            }
        }
    }
    return rows;
}

TEST(OneForestryTest, TheWindowTheLibraryAndTheEstateGiveOneRotation) {
    QTemporaryDir dir;
    const std::vector<Case> cases = drawCases(2);
    const std::map<QString, Valued> estate = estateRows(cases, dir.path());
    int refused = 0;
    for (std::size_t i = 0; i < cases.size(); ++i) {
        const Case &c = cases[i];
        const std::string what =
            "case " + std::to_string(i) + ": model " + std::to_string(c.model) + ", age " +
            std::to_string(c.age) + ", " + c.height.toStdString() + " m, " +
            c.basalArea.toStdString() + " m2/ha, thin from " + std::to_string(c.regime.thinFrom) +
            " every " + std::to_string(c.regime.thinEvery) + " by " +
            QString::number(double{c.regime.thinVolume}).toStdString() + ", felled at " +
            std::to_string(c.rotation) + ", " + c.rate.toStdString() + " %";
        const Valued window = Window().typed(c);
        expectSame(window, commandLine(c), what + " / rotation");
        const auto row = estate.find(QString::number(i));
        ASSERT_NE(row, estate.end()) << what;
        expectSame(window, row->second, what + " / estate");
        refused += window.refusal.isEmpty() ? 0 : 1;
        if (window.refusal.isEmpty()) {
            // The estate's yield class is the window's after growing on with
            // the regime to the age limit (or to where the window stops).
            Case toLimit = c;
            toLimit.rotation = rotation::modelAgeLimit(static_cast<std::int16_t>(c.model));
            EXPECT_EQ(row->second.yieldClass, Window().typed(toLimit).yieldClass) << what;
        }
    }
    // The draw must exercise both outcomes.
    EXPECT_GT(refused, 0);
    EXPECT_LT(refused, static_cast<int>(cases.size()) / 2);
}

TEST(OneForestryTest, WhatTheOptimiserOffersReplaysAndIsWorthWhatItSaid) {
    for (const Case &c : drawCases(1)) {
        const std::string what = "model " + std::to_string(c.model) + ", age " +
                                 std::to_string(c.age) + ", " + c.height.toStdString() + " m";
        // The economics window reads its stand from the table.
        Case offered;
        const Valued apply = Window().applied(c, offered);
        ASSERT_TRUE(apply.refusal.isEmpty()) << what << ": " << apply.refusal.toStdString();
        expectSame(apply, commandLine(offered), what + " / Apply against rotation");
        expectSame(apply, Window().typed(offered), what + " / Apply against the regime typed");
    }
}

} // namespace
} // namespace arbolex::testing
