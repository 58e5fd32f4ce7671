#pragma once

// What a script drives: a session and its windows, on the screen or without
// one. The runner reads the windows only through their views' interfaces, so
// the same script runs headless (arbolex-cli run) and in the desktop program
// (arbolex --script), where it sets up what the screenshots show.

#include "session/session.hpp"

#include <QString>

namespace arbolex::cli {

/// A script's line names no such control: "no field named 'frmThin.txtX'".
inline QString noControl(const QString &what, const QString &control) {
    return QStringLiteral("no ") + what + QStringLiteral(" named '") + control + QLatin1Char('\'');
}

class ScriptTarget {
public:
    virtual ~ScriptTarget() = default;

    virtual session::Session &session() = 0;
    /// The next question is answered `yes` without asking.
    virtual void queueAnswer(bool yes) = 0;
    /// What the clipboard holds, as text.
    virtual QString clipboardText() const = 0;
    /// Waits until the work the windows run away from the window's thread
    /// (the optimiser, an estate) is done; headless work is done at once.
    virtual void waitForWork() {}
    /// Lets the windows catch up with what the script did (draws them on the
    /// screen; nothing to do without one).
    virtual void settle() {}
    /// Ends the program once the script has run (the desktop program; the
    /// runner ends at the script's end anyway).
    virtual void quitAfterScript() {}
    /// Brings page `page` of window `window` to the front ("charts cashflow",
    /// "frmEconomics optimiser"); an error text, or empty when it was shown.
    virtual QString show(const QString &window, const QString &page) {
        return QStringLiteral("'show ") + window + QLatin1Char(' ') + page +
               QStringLiteral("': no window on the screen");
    }

    workflow::MainWindowLogic &main() { return session().main(); }
    thinning::ThinWindowLogic &thinning() { return session().thinning(); }
    economics::NpvWindowLogic &npv() { return session().npv(); }
    economics::TimberPricesWindowLogic &timberPrices() { return session().timberPrices(); }
    assortments::AssortWindowLogic &assort() { return session().assort(); }
    assortments::AssortUserLogic &assortUser() { return session().assortUser(); }
    economics::EconomicsWindowLogic &economics() { return session().economics(); }
    economics::AssortPricesWindowLogic &assortPrices() { return session().assortPrices(); }
    economics::CarbonPriceWindowLogic &carbonPrice() { return session().carbonPrice(); }
    estatewindow::EstateWindowLogic &estate() { return session().estate(); }

    workflow::IMainView &mainView() { return session().views().main; }
    thinning::IThinView &thinView() { return session().views().thin; }
    economics::INpvView &npvView() { return session().views().npv; }
    economics::ITimberPricesView &timberPricesView() { return session().views().timberPrices; }
    assortments::IAssortView &assortView() { return session().views().assort; }
    assortments::IAssortUserView &assortUserView() { return session().views().assortUser; }
    economics::IEconomicsView &economicsView() { return session().views().economics; }
    economics::IAssortPricesView &assortPricesView() { return session().views().assortPrices; }
    economics::ICarbonPriceView &carbonPriceView() { return session().views().carbonPrice; }
};

} // namespace arbolex::cli
