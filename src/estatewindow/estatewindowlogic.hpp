#pragma once

// The logic of the estate window `frmEstate`: File → Open Estate… runs every
// sub-compartment of an estate table away from the window's thread, with
// progress and Cancel; the results go into a sortable table and the harvest
// forecast into a chart by year and species. A sub-compartment opened from
// the table becomes a new document of the main window, grown, thinned and
// felled by its regime through the main window's own commands.

#include "charts/estatecharts.hpp"
#include "estate/estaterun.hpp"
#include "estatewindow/estateresultsmodel.hpp"
#include "estatewindow/iestateview.hpp"

#include <QString>
#include <QStringList>

#include <atomic>
#include <optional>
#include <vector>

namespace arbolex::document {
class DocumentController;
}

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::work {
class StandWork;
}

namespace arbolex::workflow {
class IMainCommands;
}

namespace arbolex::estatewindow {

class EstateWindowLogic {
public:
    EstateWindowLogic(work::StandWork &work, workflow::IMainCommands &main,
                      document::DocumentController &documents, IEstateView &view,
                      shell::IInteractive &interactive);

    /// File → Open Estate…: the table the user chooses, run.
    void mnuOpenEstate_Click();
    /// Runs the estate table `path` (CSV or any GIS layer). A table that
    /// cannot be read, or a run that is cancelled, leaves what is shown as it
    /// was; the input is only read.
    void openEstate(const QString &path);
    /// The run stops at its next report of progress.
    void cancel() { m_cancel = true; }
    bool running() const { return m_running; }

    /// What the run gives rows that leave a column empty: no thinning, the
    /// economic rotation, this year, the main window's interest rate and the
    /// long-term average prices, as the economics window values a rotation.
    estate::EstateDefaults defaults() const;
    /// Threads that grow rows (default: every core) and rows per chunk,
    /// which is also how often progress is reported.
    void setRunSettings(const estate::RunSettings &settings) { m_settings = settings; }

    /// Double-click on row `row` of the table (the model's row): after the
    /// question about unsaved work, the sub-compartment as a new document.
    void openSubCompartment(int row);

    // ---- What the window shows -------------------------------------------------------
    EstateResultsModel &model() { return m_model; }
    const charts::HarvestForecast &forecast() const { return m_forecast; }
    /// The estate's file, empty before the first run.
    const QString &estateFile() const { return m_file; }
    /// "12 sub-compartments, 1 not grown. …"
    const QString &summaryText() const { return m_summary; }

private:
    work::StandWork &m_standWork;
    workflow::IMainCommands &m_main;
    document::DocumentController &m_documents;
    IEstateView &m_view;
    shell::IInteractive &m_interactive;
    estate::RunSettings m_settings;
    std::atomic<bool> m_cancel = false;
    bool m_running = false;

    EstateResultsModel m_model;
    charts::HarvestForecast m_forecast;
    QString m_file;
    QString m_summary;
    /// The layout and defaults of the shown run, to plan a row again.
    std::optional<estate::Layout> m_layout;
    estate::EstateDefaults m_defaults;
};

} // namespace arbolex::estatewindow
