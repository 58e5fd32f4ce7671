// The windows as a user opens them, drawn off screen: the net present value
// window on a 60-year cash flow, from the command to the window laid out.
#include "economics/npvwindowlogic.hpp"
#include "engine/grow.hpp"
#include "prices/prices.hpp"
#include "shell/errorlog.hpp"
#include "shell/iclipboard.hpp"
#include "shell/interactive.hpp"
#include "silentinteractive.hpp"
#include "ui/npvwindow.hpp"
#include "work/mdlnpv.hpp"
#include "work/standwork.hpp"

#include <QApplication>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

namespace {

using arbolex::bench::SilentInteractive;

void BM_ShowNpvWindow60Years(benchmark::State &state) {
    QTemporaryDir dir;
    arbolex::shell::ErrorLog log(dir.path());
    SilentInteractive interactive;
    arbolex::shell::HeadlessClipboard clipboard;
    arbolex::engine::Grow grow;
    arbolex::prices::Prices prices;
    arbolex::work::StandWork work(grow, prices, log);
    work.cashFlow().SetRotationLength(0, 60);
    work.cashFlow().DimNPVArrays();
    for (auto _ : state) {
        arbolex::ui::NpvWindow window;
        arbolex::economics::NpvWindowLogic npv(work, window, interactive, clipboard);
        window.attach(npv);
        npv.Form_Load();
        npv.cmdNPV_Click();
        window.showWindow();
        QCoreApplication::processEvents();
        benchmark::DoNotOptimize(window.isShown());
        window.close();
    }
}
BENCHMARK(BM_ShowNpvWindow60Years)->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char **argv) {
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
