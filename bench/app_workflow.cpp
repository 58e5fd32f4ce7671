// The window logic at the speed a user feels it: a grow command, a thinning
// preview, a whole thinning loop; and the headless runner as a whole process.
#include "cli/headlesssession.hpp"
#include "prices/pricedata.hpp"
#include "prices/prices.hpp"
#include "shell/errorlog.hpp"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QTextStream>

#include <benchmark/benchmark.h>

namespace {

using arbolex::thinning::ThinControl;
using arbolex::workflow::MainControl;

/// The program's windows without a screen; messages are thrown away.
struct Windows {
    QTemporaryDir dir;
    QFile silence{QStringLiteral("/dev/null")};
    QTextStream messages{&silence};
    arbolex::cli::HeadlessSession session{dir.path(), messages};
    arbolex::workflow::MainWindowLogic &main = session.main();
    arbolex::thinning::ThinWindowLogic &thin = session.thinning();
    arbolex::shell::ErrorLog &log = session.session().errorLog();
    arbolex::prices::Prices &prices = session.session().prices();
    arbolex::work::StandWork &work = session.work();

    Windows() {
        silence.open(QIODevice::WriteOnly);
        main.mnuModel_Click(0);
    }

    void typeStand(const char *age, const char *to, const char *by) {
        main.typeText(MainControl::txtFromA, QLatin1String(age));
        main.typeText(MainControl::txtFromN, QStringLiteral("2500"));
        main.typeText(MainControl::txtFromH, QStringLiteral("7"));
        main.typeText(MainControl::txtFromB, QStringLiteral("20"));
        main.typeText(MainControl::txtToA, QLatin1String(to));
        main.typeText(MainControl::txtByA, QLatin1String(by));
    }
};

/// Grow 10 → 60 by 1 year, from the checks to the last appended row.
void BM_GrowCommand10To60(benchmark::State &state) {
    for (auto _ : state) {
        state.PauseTiming();
        auto w = std::make_unique<Windows>();
        w->typeStand("10", "60", "1");
        w->main.typeText(MainControl::txtFromH, QStringLiteral("5"));
        state.ResumeTiming();
        w->main.cmdGrow_Click();
        benchmark::DoNotOptimize(w->main.table().rowCount());
        state.PauseTiming();
        if (w->main.table().rowCount() != 52 || w->session.interactive().messagesShown() != 0) {
            state.SkipWithError("the grow did not append 51 rows");
        }
        w.reset();
        state.ResumeTiming();
    }
}
BENCHMARK(BM_GrowCommand10To60)->Unit(benchmark::kMicrosecond);

/// A thinning preview by volume: checks, the Newton solve and the columns.
void BM_ThinPreviewByVolume(benchmark::State &state) {
    Windows w;
    w.typeStand("15", "30", "5");
    w.main.cmdGrow_Click();
    w.main.cmdThin_Click();
    for (auto _ : state) {
        w.thin.resetFields();
        w.thin.typeText(ThinControl::txtRemV, QStringLiteral("60"));
        w.thin.cmdThin_Click();
        benchmark::DoNotOptimize(w.thin.work().postBasalArea);
    }
    if (!w.thin.work().previewed || w.session.interactive().messagesShown() != 0) {
        state.SkipWithError("no preview");
    }
}
BENCHMARK(BM_ThinPreviewByVolume)->Unit(benchmark::kMicrosecond);

/// A whole thinning loop from age 20 to 60 every 5 years: nine passes of
/// accept, grow, thin and preview.
void BM_ThinningLoop20To60(benchmark::State &state) {
    for (auto _ : state) {
        state.PauseTiming();
        auto w = std::make_unique<Windows>();
        w->typeStand("15", "20", "5");
        w->main.cmdGrow_Click();
        w->main.cmdThin_Click();
        w->thin.typeText(ThinControl::txtRemV, QStringLiteral("30"));
        w->thin.cmdThin_Click();
        w->thin.typeText(ThinControl::txtThinFreq, QStringLiteral("5"));
        w->thin.typeText(ThinControl::txtThinUntil, QStringLiteral("60"));
        state.ResumeTiming();
        w->thin.cmdLoop_Click();
        state.PauseTiming();
        int thinnings = 0;
        for (int r = 1; r < w->main.table().rowCount(); ++r) {
            thinnings += w->main.table().row(r).isThinning() ? 1 : 0;
        }
        if (thinnings < 8) {
            state.SkipWithError("the loop stopped early");
        }
        w.reset();
        state.ResumeTiming();
    }
}
BENCHMARK(BM_ThinningLoop20To60)->Unit(benchmark::kMillisecond);

QString writeScript(const QTemporaryDir &dir, const QString &name, const QString &text) {
    QFile f(dir.filePath(name));
    f.open(QIODevice::WriteOnly);
    f.write(text.toUtf8());
    return f.fileName();
}

/// The runner as a whole process: start, load, script, unload, exit.
void runnerProcess(benchmark::State &state, const QString &script) {
    const QString cli = QStringLiteral(ARBOLEX_BIN_DIR "/arbolex-cli");
    QTemporaryDir dir;
    const QDir data(QStringLiteral(ARBOLEX_BIN_DIR));
    for (const QString &name : data.entryList({QStringLiteral("*.qdm"), QStringLiteral("*.dat")})) {
        QFile::copy(data.filePath(name), dir.filePath(name));
    }
    const QString path = writeScript(dir, QStringLiteral("bench.arb"), script);
    for (auto _ : state) {
        QProcess p;
        p.start(cli, {QStringLiteral("run"), path, QStringLiteral("--data-dir"), dir.path()});
        if (!p.waitForFinished(10000) || p.exitCode() != 0) {
            state.SkipWithError("the runner failed");
            break;
        }
    }
}

void BM_RunnerTwentyLines(benchmark::State &state) {
    runnerProcess(state, QStringLiteral("model 0\n"
                                        "set txtFromA 15\nset txtFromN 2500\nset txtFromH 7\n"
                                        "set txtFromB 20\nset txtToA 30\nset txtByA 5\n"
                                        "press cmdGrow\nprint lblSI\n"
                                        "set txtToA 50\npress cmdGrow\nprint lblYC\n"
                                        "select 3 3\npress cmdUseRow\nprint txtFromA\n"
                                        "press cmdClearAll\nset txtToA 40\nset txtByA 1\n"
                                        "print txtByA\nprint flxMain\n"));
}
BENCHMARK(BM_RunnerTwentyLines)->Unit(benchmark::kMillisecond);

void BM_RunnerThinningLoop(benchmark::State &state) {
    runnerProcess(state, QStringLiteral("model 0\n"
                                        "set txtFromA 15\nset txtFromN 2500\nset txtFromH 7\n"
                                        "set txtFromB 20\nset txtToA 20\nset txtByA 5\n"
                                        "press cmdGrow\npress cmdThin\n"
                                        "set frmThin.txtRemV 30\npress frmThin.cmdThin\n"
                                        "set frmThin.txtThinFreq 5\nset frmThin.txtThinUntil 60\n"
                                        "press frmThin.cmdLoop\nprint flxMain\n"));
}
BENCHMARK(BM_RunnerThinningLoop)->Unit(benchmark::kMillisecond);

} // namespace

/// The longest rotation the table holds (10 → 60 by 1 year, 51 rows):
/// the final cut with the net present value accepted, then the cash flow
/// with its timber revenues.
void BM_FinalCutAndCashFlow(benchmark::State &state) {
    for (auto _ : state) {
        state.PauseTiming();
        auto w = std::make_unique<Windows>();
        arbolex::prices::GetPricesFromFiles(QStringLiteral(ARBOLEX_BIN_DIR), w->prices.data(),
                                            w->log);
        w->prices.selectPriceSet(arbolex::prices::kCurrentPrices);
        w->typeStand("10", "60", "1");
        w->main.typeText(MainControl::txtFromH, QStringLiteral("5"));
        w->main.cmdGrow_Click();
        w->session.queueAnswer(true);
        state.ResumeTiming();
        w->main.cmdFinalCut_Click();
        w->work.cashFlow().LoadTimberRevenues(w->work.timberRevenue());
        const int years = w->work.cashFlow().ComputeCashFlow(w->log);
        benchmark::DoNotOptimize(w->work.cashFlow().SumNPV());
        state.PauseTiming();
        if (years != 51 || w->work.cashFlow().SumNPV() <= 0.0) {
            state.SkipWithError("the final cut laid out no 51-year cash flow");
        }
        w.reset();
        state.ResumeTiming();
    }
}
BENCHMARK(BM_FinalCutAndCashFlow)->Unit(benchmark::kMicrosecond);

/// The cash flow of a 60-year rotation alone: totals, discounting, the sum.
void BM_ComputeCashFlow60Years(benchmark::State &state) {
    QTemporaryDir dir;
    arbolex::shell::ErrorLog log(dir.path());
    arbolex::work::CashFlow flow;
    flow.SetRotationLength(0, 60);
    flow.DimNPVArrays();
    for (int i = 0; i < flow.years(); ++i) {
        flow.setMatrix(arbolex::work::kCfCost, i, 25.0 * i);
        flow.setMatrix(arbolex::work::kCfTimberRevenue, i, i % 5 == 0 ? 900.0 : 0.0);
    }
    for (auto _ : state) {
        benchmark::DoNotOptimize(flow.ComputeCashFlow(log));
        benchmark::DoNotOptimize(flow.SumNPV());
    }
}
BENCHMARK(BM_ComputeCashFlow60Years)->Unit(benchmark::kMicrosecond);

/// Opening the net present value window's logic on 60 years: the grid, the
/// timber revenues, the typed values and the net present value.
void BM_OpenNpvWindow60Years(benchmark::State &state) {
    Windows w;
    w.work.cashFlow().SetRotationLength(0, 60);
    w.work.cashFlow().DimNPVArrays();
    for (auto _ : state) {
        w.session.npv().Form_Load();
        benchmark::DoNotOptimize(w.session.npv().grid().size());
    }
}
BENCHMARK(BM_OpenNpvWindow60Years)->Unit(benchmark::kMicrosecond);

int main(int argc, char **argv) {
    QCoreApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
