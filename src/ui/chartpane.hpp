#pragma once

#include <QWidget>

class QAction;

namespace arbolex::workflow {
class MainWindowLogic;
}

namespace arbolex::ui {

class ChartPanel;

/// The chart panel beside the projection table, following the table and the
/// cash flow. View → Charts shows or hides it; the splitter beside it sets
/// its width.
class ChartPane : public QWidget {
    Q_OBJECT
public:
    explicit ChartPane(QWidget *parent = nullptr);

    void attach(workflow::MainWindowLogic &logic);
    ChartPanel *panel() const { return m_panel; }
    /// The checkable entry that shows or hides the pane.
    QAction *toggleViewAction() const { return m_toggle; }

    /// Draws the charts again once the current command has finished: a loop
    /// of thinnings changes the table many times but is drawn once.
    void refreshSoon();
    /// Draws the charts again now (a hidden pane waits until it is shown).
    void refresh();

protected:
    void showEvent(QShowEvent *event) override;

private:
    ChartPanel *m_panel = nullptr;
    QAction *m_toggle = nullptr;
    workflow::MainWindowLogic *m_logic = nullptr;
    bool m_pending = false;
    bool m_stale = false;
};

} // namespace arbolex::ui
