#pragma once

// A whole program without a screen: the engine, the prices, the error log and
// the main window's logic over a headless view. The runner and the grow
// shortcut of the command-line program drive it.

#include "assortments/assortuserlogic.hpp"
#include "assortments/assortwindowlogic.hpp"
#include "assortments/headlessassortview.hpp"
#include "economics/assortpriceswindowlogic.hpp"
#include "economics/economicswindowlogic.hpp"
#include "economics/headlessassortpricesview.hpp"
#include "economics/headlesstimberpricesview.hpp"
#include "economics/inpvview.hpp"
#include "economics/npvwindowlogic.hpp"
#include "economics/timberpriceswindowlogic.hpp"
#include "engine/grow.hpp"
#include "prices/prices.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"
#include "shell/iclipboard.hpp"
#include "shell/interactive.hpp"
#include "thinning/headlessthinview.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "workflow/headlessmainview.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QList>
#include <QTextStream>

namespace arbolex::cli {

/// Raised when a script cannot go on (a question nobody answered). It is not
/// a run-time failure of the program, so handlers let it through.
struct ScriptStop {
    QString reason;
};

/// Message boxes become lines on the output: "MSG<TAB>title<TAB>text<TAB>style"
/// and "ASK<TAB>title<TAB>text<TAB>answer", CR and LF written as \r and \n.
/// Questions take their answers from a queue.
class PrintingInteractive : public shell::IInteractive {
public:
    explicit PrintingInteractive(QTextStream &out) : m_out(out) {}

    void message(const QString &title, const QString &text, int style) override;
    bool askYesNo(const QString &title, const QString &text) override;

    void queueAnswer(bool yes) { m_answers.append(yes); }
    int messagesShown() const { return m_messages; }

    static QString escaped(QString text);

private:
    QTextStream &m_out;
    QList<bool> m_answers;
    int m_messages = 0;
};

/// The objects of one run of the program.
class HeadlessSession {
public:
    HeadlessSession(const QString &dataFolder, QTextStream &out);

    workflow::MainWindowLogic &main() { return m_main; }
    workflow::HeadlessMainView &mainView() { return m_mainView; }
    thinning::ThinWindowLogic &thinning() { return m_thin; }
    thinning::HeadlessThinView &thinView() { return m_thinView; }
    assortments::AssortWindowLogic &assort() { return m_assort; }
    assortments::HeadlessAssortView &assortView() { return m_assortView; }
    assortments::AssortUserLogic &assortUser() { return m_assortUser; }
    assortments::HeadlessAssortUserView &assortUserView() { return m_assortUserView; }
    PrintingInteractive &interactive() { return m_interactive; }
    economics::NpvWindowLogic &npv() { return m_npv; }
    economics::HeadlessNpvView &npvView() { return m_npvView; }
    shell::HeadlessClipboard &clipboard() { return m_clipboard; }
    economics::TimberPricesWindowLogic &timberPrices() { return m_timberPrices; }
    economics::HeadlessTimberPricesView &timberPricesView() { return m_timberPricesView; }
    economics::EconomicsWindowLogic &economics() { return m_economics; }
    economics::HeadlessEconomicsView &economicsView() { return m_economicsView; }
    economics::AssortPricesWindowLogic &assortPrices() { return m_assortPrices; }
    economics::HeadlessAssortPricesView &assortPricesView() { return m_assortPricesView; }

private:
    shell::ErrorLog m_log;
    PrintingInteractive m_interactive;
    shell::EngineReport m_report;
    engine::Grow m_grow;
    prices::Prices m_prices;
    workflow::HeadlessMainView m_mainView;
    workflow::MainWindowLogic m_main;
    thinning::HeadlessThinView m_thinView;
    thinning::ThinWindowLogic m_thin;
    shell::HeadlessClipboard m_clipboard;
    economics::HeadlessNpvView m_npvView;
    economics::NpvWindowLogic m_npv;
    economics::HeadlessTimberPricesView m_timberPricesView;
    economics::TimberPricesWindowLogic m_timberPrices{m_prices, m_log, m_timberPricesView};
    assortments::HeadlessAssortView m_assortView;
    assortments::AssortWindowLogic m_assort;
    assortments::HeadlessAssortUserView m_assortUserView;
    assortments::AssortUserLogic m_assortUser;
    economics::HeadlessEconomicsView m_economicsView;
    economics::EconomicsWindowLogic m_economics{m_main, m_thin, m_economicsView, m_interactive};
    economics::HeadlessAssortPricesView m_assortPricesView;
    economics::AssortPricesWindowLogic m_assortPrices{m_prices.data(), m_log, m_assortPricesView,
                                                      m_interactive};
};

} // namespace arbolex::cli
