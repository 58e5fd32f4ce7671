#pragma once

#include "charts/reportcontent.hpp"

#include <QObject>

class QAction;
class QMainWindow;
class QMenu;

namespace arbolex::economics {
class EconomicsWindowLogic;
}
namespace arbolex::workflow {
class MainWindowLogic;
}

namespace arbolex::ui {

/// The report entries of the File menu: Export Report… writes the report of
/// the sub-compartment as a PDF, Print… sends the same pages to a printer.
class ReportMenu : public QObject {
    Q_OBJECT
public:
    /// The entries, not yet in a menu; dialogs open over `window`.
    explicit ReportMenu(QMainWindow &window);

    /// Puts the entries into the File menu, before its Close entry when it
    /// has one (Close and Exit stay last), else at its end.
    void addTo(QMenu &file);

    void attach(workflow::MainWindowLogic &logic) { m_logic = &logic; }
    /// The economics window's logic that values the rotation for the report's
    /// economics page; without it the report has none.
    void attachEconomics(economics::EconomicsWindowLogic &economics) { m_economics = &economics; }

    /// Writes the report to `path`; false (after telling the user and the
    /// error log) when it cannot be written.
    bool exportReport(const QString &path);

    QAction *exportAction() const { return m_export; }
    QAction *printAction() const { return m_print; }

private:
    void chooseAndExport();
    void print();
    /// What the report shows of the work as it stands.
    charts::ReportContent content() const;

    QMainWindow &m_window;
    workflow::MainWindowLogic *m_logic = nullptr;
    economics::EconomicsWindowLogic *m_economics = nullptr;
    QAction *m_export = nullptr;
    QAction *m_print = nullptr;
};

} // namespace arbolex::ui
