#pragma once

// A whole program without a screen: the session over headless views. The
// runner and the grow shortcut of the command-line program drive it.

#include "assortments/headlessassortview.hpp"
#include "cli/scripttarget.hpp"
#include "economics/headlessassortpricesview.hpp"
#include "economics/headlesscarbonpriceview.hpp"
#include "economics/headlesstimberpricesview.hpp"
#include "economics/ieconomicsview.hpp"
#include "economics/inpvview.hpp"
#include "estatewindow/iestateview.hpp"
#include "session/session.hpp"
#include "shell/iclipboard.hpp"
#include "shell/interactive.hpp"
#include "thinning/headlessthinview.hpp"
#include "workflow/headlessmainview.hpp"

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

/// A whole program without a screen: the session over headless views.
class HeadlessSession : public ScriptTarget {
public:
    HeadlessSession(const QString &dataFolder, QTextStream &out);

    session::Session &session() override { return m_session; }
    void queueAnswer(bool yes) override { m_interactive.queueAnswer(yes); }
    QString clipboardText() const override { return m_clipboard.text(); }
    work::StandWork &work() { return m_session.work(); }
    workflow::MainWindowLogic &main() { return m_session.main(); }
    workflow::HeadlessMainView &mainView() { return m_mainView; }
    thinning::ThinWindowLogic &thinning() { return m_session.thinning(); }
    thinning::HeadlessThinView &thinView() { return m_thinView; }
    assortments::AssortWindowLogic &assort() { return m_session.assort(); }
    assortments::HeadlessAssortView &assortView() { return m_assortView; }
    assortments::AssortUserLogic &assortUser() { return m_session.assortUser(); }
    assortments::HeadlessAssortUserView &assortUserView() { return m_assortUserView; }
    PrintingInteractive &interactive() { return m_interactive; }
    economics::NpvWindowLogic &npv() { return m_session.npv(); }
    economics::HeadlessNpvView &npvView() { return m_npvView; }
    shell::HeadlessClipboard &clipboard() { return m_clipboard; }
    economics::TimberPricesWindowLogic &timberPrices() { return m_session.timberPrices(); }
    economics::HeadlessTimberPricesView &timberPricesView() { return m_timberPricesView; }
    economics::EconomicsWindowLogic &economics() { return m_session.economics(); }
    economics::HeadlessEconomicsView &economicsView() { return m_economicsView; }
    economics::AssortPricesWindowLogic &assortPrices() { return m_session.assortPrices(); }
    economics::HeadlessAssortPricesView &assortPricesView() { return m_assortPricesView; }
    economics::CarbonPriceWindowLogic &carbonPrice() { return m_session.carbonPrice(); }
    economics::HeadlessCarbonPriceView &carbonPriceView() { return m_carbonPriceView; }

private:
    PrintingInteractive m_interactive;
    workflow::HeadlessMainView m_mainView;
    thinning::HeadlessThinView m_thinView;
    shell::HeadlessClipboard m_clipboard;
    economics::HeadlessNpvView m_npvView;
    economics::HeadlessTimberPricesView m_timberPricesView;
    assortments::HeadlessAssortView m_assortView;
    assortments::HeadlessAssortUserView m_assortUserView;
    economics::HeadlessEconomicsView m_economicsView;
    economics::HeadlessAssortPricesView m_assortPricesView;
    economics::HeadlessCarbonPriceView m_carbonPriceView;
    estatewindow::HeadlessEstateView m_estateView;
    session::Session m_session;
};

} // namespace arbolex::cli
