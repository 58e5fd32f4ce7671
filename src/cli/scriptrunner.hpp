#pragma once

// The script language of the headless runner, one command per line:
//   model N                  choose model menu entry N
//   set CONTROL TEXT         type TEXT into a field as a user would, then leave it
//   press CONTROL            press a button or menu command
//   select ROW [ENDROW]      current row and end of the selection of flxMain
//   answer yes|no            the answer to the next question
//   wait                     until the work away from the window's thread is done
//   show WINDOW PAGE         a page of a window to the front (on the screen only)
//   time LINE                runs LINE, then prints "TIME<TAB>LINE<TAB>ms", the windows drawn
//   quit                     ends the desktop program once the script has run
//   print flxMain | CONTROL  the grid (header row first) or the text of a control;
//                            flxSummary, frmNPV.NPV_Grid and clipboard print tab-separated;
//                            flxSummaryCarbon the carbon block under the summary
//   set frmNPV.NPV_Grid(ROW,COL) TEXT  types TEXT into a cell of the cash flow
// A switched-off button cannot be pressed. `set CONTROL` alone empties the field.
//   save FILE | open FILE | new | print caption   the File menu (cli/documentscript.hpp)
//   identify forest|compartment|subcompartment|notes TEXT   the identification
//   press mnuIdentification  its dialog (on the screen only)
//   estate FILE              File > Open Estate… on FILE
//   press frmEstate.grdEstate(ROW)  opens row ROW (from 0) of the estate as a new document
// '#' starts a comment. Controls of other windows are named "window.name".
// `set CONTROL` with no text empties the field; an element of a control array
// carries its index ("frmTimberPrices.txtTimbVal(13)"); an option button
// prints 1 when chosen, else 0. The economics window: "press cmdEconomics",
// "press frmEconomics.cmdOptimise", "press frmEconomics.cmdApply(K)", "print
// frmEconomics" (cli/economicsscript.hpp).

#include "cli/headlesssession.hpp"
#include "cli/scripttarget.hpp"
#include "document/documentcontroller.hpp"

#include <QSettings>
#include <QStringList>
#include <QTextStream>

#include <functional>
#include <map>

namespace arbolex::cli {

class ScriptRunner {
public:
    ScriptRunner(ScriptTarget &session, QTextStream &out);

    /// Where and why a script stopped; `line` 0 when it ran to its end.
    struct Outcome {
        int line = 0;
        QString error;
        bool ok() const { return line == 0; }
    };

    /// Runs the lines in order and stops at the first line that is wrong.
    Outcome run(const QStringList &lines);

    /// Runs one line; returns an error text, empty when the line was fine.
    QString runLine(const QString &line);

private:
    QString set(const QString &control, const QString &text);
    QString press(const QString &control);
    QString print(const QString &control);

    ScriptTarget &m_session;
    QTextStream &m_out;
    std::map<QString, std::function<void()>> m_commands;
    /// The File menu; the document starts as the session stands when the runner starts.
    document::DocumentController &m_documents;
};

/// The main window's load, then the lines of `script` (UTF-8, split at line
/// feeds) until the first wrong one; the unload is left to the caller.
ScriptRunner::Outcome runScriptText(const QByteArray &script, ScriptTarget &session,
                                    QSettings &settings, QTextStream &out);

/// Runs SCRIPT against the data folder: the main window's load, the script,
/// the unload. Returns the exit status (0, or 2 for an error of the script).
int runScriptFile(const QString &scriptPath, const QString &dataFolder, QTextStream &out,
                  QTextStream &err);

} // namespace arbolex::cli
