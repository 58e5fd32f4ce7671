#pragma once

#include "workflow/imainview.hpp"

#include <QMainWindow>

#include <array>
#include <functional>

class QAction;
class QActionGroup;
class QLabel;
class QLineEdit;
class QMenu;
class QPushButton;
class QSettings;
class QStackedWidget;
class QTableView;

namespace arbolex::shell {
class DataHistory;
}
namespace arbolex::workflow {
class MainWindowLogic;
}

namespace arbolex::ui {

class ChartPane;
class ProjectionModel;
class ReportMenu;
class StringGridModel;

/// The main window `frmMain`: the grow-from panel, the commands, the
/// projection table `flxMain` and the model menu `mnuModel`. Everything it
/// shows is set by its logic through IMainView; everything the user does goes
/// straight to the logic's handlers.
class MainWindow : public QMainWindow, public workflow::IMainView {
    Q_OBJECT
public:
    explicit MainWindow(QWidget *parent = nullptr);
    ~MainWindow() override;

    /// Binds the window to its logic; `settings` receives the placement when
    /// the window closes. Both must outlive the window.
    void attach(workflow::MainWindowLogic &logic, QSettings &settings);

    /// The history Help → Restore data files… lists, of the data folder `dataFolder`.
    void attachDataHistory(const shell::DataHistory &history, const QString &dataFolder) {
        m_dataHistory = &history;
        m_dataFolder = dataFolder;
    }

    /// Takes the model chosen in the model choice window.
    void SetModelFromfrmModelChoice(int modelId);

    /// The widget of a control, nullptr for commands the window does not offer.
    QWidget *control(workflow::MainControl control) const;
    QTableView *grid() const { return m_grid; }
    QTableView *summaryGrid() const { return m_summaryGrid; }
    ProjectionModel *gridModel() const { return m_model; }
    QActionGroup *modelMenu() const { return m_modelActions; }
    /// The File menu, empty until the document menu fills it.
    QMenu *fileMenu() const { return m_fileMenu; }
    /// Asked before the window closes (unsaved work); false keeps it open.
    void setCloseCheck(std::function<bool()> check) { m_closeCheck = std::move(check); }
    /// The entry `mnuAssortUser` that opens the user categories window.
    QAction *assortUserAction() const { return m_assortUserAction; }
    /// The charts beside the table, and the report entries of the File menu.
    ChartPane *chartPane() const { return m_chartPane; }
    ReportMenu *reportMenu() const { return m_reportMenu; }
    /// Draws the charts again (the cash flow changed in its own window).
    void refreshCharts();
    /// The button "Economics…" that opens the economics window.
    QPushButton *economicsButton() const { return m_economicsButton; }
    /// The entry `mnuAssortPrices` that opens the assortment prices window.
    QAction *assortPricesAction() const { return m_assortPricesAction; }

    // IMainView
    QString text(workflow::MainControl control) const override;
    void setText(workflow::MainControl control, const QString &text) override;
    using QMainWindow::setEnabled;
    void setEnabled(workflow::MainControl control, bool enabled) override;
    bool isEnabled(workflow::MainControl control) const override;
    void setHint(workflow::MainControl control, const QString &hint) override;
    void focus(workflow::MainControl control) override;
    void setCaption(const QString &caption) override;
    QString caption() const override { return windowTitle(); }
    void setBusy(bool busy) override;
    void tableChanged(int firstRow) override;
    void scrollToRow(int row) override;
    void setActiveModel(int modelId) override;
    void showSummary(bool summary) override;
    QRect placement() const override;
    void setPlacement(const QRect &placement) override;

protected:
    void closeEvent(QCloseEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void buildMenus();
    QWidget *buildPanel();
    void buildGrid();
    void buildSummaryGrid();
    /// Reads the summary again and sizes its columns to captions and values.
    void fitSummary();
    /// The carbon block under the summary, as its logic last filled it.
    void showSummaryCarbon();
    QLineEdit *addField(workflow::MainControl control);
    QLabel *addResult(workflow::MainControl control);
    QPushButton *addButton(workflow::MainControl control, const QString &caption);
    void fitColumns();
    /// Width the cells of item column `column` need.
    int contentWidth(int column) const;
    /// Tells the logic the grid's current row and the end of its selection.
    void selectionToLogic();
    /// Shows the logic's current row and selection in the grid.
    void selectionFromLogic();
    void about();

    workflow::MainWindowLogic *m_logic = nullptr;
    const shell::DataHistory *m_dataHistory = nullptr;
    QString m_dataFolder;
    QSettings *m_settings = nullptr;

    std::array<QWidget *, workflow::kMainControlCount> m_controls{};
    /// Texts of the commands the window does not offer (yet).
    std::array<QString, workflow::kMainControlCount> m_absentText;

    QMenu *m_fileMenu = nullptr;
    std::function<bool()> m_closeCheck;
    QActionGroup *m_modelActions = nullptr;
    QAction *m_assortUserAction = nullptr;
    ChartPane *m_chartPane = nullptr;
    ReportMenu *m_reportMenu = nullptr;
    QPushButton *m_economicsButton = nullptr;
    QAction *m_assortPricesAction = nullptr;
    QTableView *m_grid = nullptr;
    ProjectionModel *m_model = nullptr;
    QTableView *m_summaryGrid = nullptr;
    QWidget *m_summaryPage = nullptr;
    QLabel *m_summaryCarbon = nullptr;
    StringGridModel *m_summaryModel = nullptr;
    QStackedWidget *m_tables = nullptr;
    /// Set while the grid follows the logic, so the change is not sent back.
    bool m_followingLogic = false;
    int m_busyDepth = 0;
};

} // namespace arbolex::ui
