#pragma once

// A whole program for tests: a session over headless views and scripted
// message boxes, on a temporary data folder. The logics are the session's,
// wired as the program wires them.

#include "mocks/fakeinteractive.hpp"

#include "assortments/headlessassortview.hpp"
#include "economics/headlessassortpricesview.hpp"
#include "economics/headlesscarbonpriceview.hpp"
#include "economics/headlesstimberpricesview.hpp"
#include "economics/ieconomicsview.hpp"
#include "economics/inpvview.hpp"
#include "estatewindow/iestateview.hpp"
#include "session/session.hpp"
#include "shell/iclipboard.hpp"
#include "thinning/headlessthinview.hpp"
#include "workflow/headlessmainview.hpp"

#include <QTemporaryDir>

namespace arbolex::testing {

struct SessionServices {
    /// A session on `folder`, or on a temporary folder of its own when empty.
    explicit SessionServices(const QString &folder = {})
        : dataFolder(folder.isEmpty() ? dir.path() : folder) {}

    QTemporaryDir dir;
    QString dataFolder;
    FakeInteractive interactive;
    workflow::HeadlessMainView view;
    thinning::HeadlessThinView thinView;
    assortments::HeadlessAssortView assortView;
    assortments::HeadlessAssortUserView userView;
    economics::HeadlessNpvView npvView;
    economics::HeadlessTimberPricesView pricesView;
    economics::HeadlessEconomicsView economicsView;
    economics::HeadlessAssortPricesView assortPricesView;
    economics::HeadlessCarbonPriceView carbonPriceView;
    estatewindow::HeadlessEstateView estateView;
    shell::HeadlessClipboard clipboard;
    session::Session session{dataFolder,
                             {view, thinView, assortView, userView, npvView, pricesView,
                              economicsView, assortPricesView, carbonPriceView, estateView,
                              interactive, clipboard}};
    shell::ErrorLog &log = session.errorLog();
    engine::Grow &grow = session.grow();
    prices::Prices &prices = session.prices();
    work::StandWork &work = session.work();
    workflow::MainWindowLogic &logic = session.main();
};

} // namespace arbolex::testing
