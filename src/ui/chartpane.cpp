#include "ui/chartpane.hpp"

#include "charts/chartmessages.hpp"
#include "charts/reportcontent.hpp"
#include "charts/reportfailure.hpp"
#include "charts/reportmessages.hpp"
#include "ui/chartpanel.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QAction>
#include <QTimer>
#include <QVBoxLayout>

namespace arbolex::ui {

ChartPane::ChartPane(QWidget *parent) : QWidget(parent) {
    setObjectName(QStringLiteral("paneCharts"));
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    m_panel = new ChartPanel(this);
    layout->addWidget(m_panel);
    m_toggle = new QAction(charts::text::dockCharts(), this);
    m_toggle->setObjectName(QStringLiteral("mnuViewCharts"));
    m_toggle->setCheckable(true);
    m_toggle->setChecked(true);
    connect(m_toggle, &QAction::toggled, this, &QWidget::setVisible);
}

void ChartPane::attach(workflow::MainWindowLogic &logic) {
    m_logic = &logic;
    m_panel->onExported([this](const QString &path, bool ok) {
        if (!ok && m_logic != nullptr) {
            charts::reportOutputFailure(
                m_logic->interactive(), m_logic->errorLog(), charts::text::titleExportChart(),
                charts::text::writeFailed(path), QStringLiteral(" in frmMain.ExportChart()"));
        }
    });
    refresh();
}

void ChartPane::refreshSoon() {
    if (m_pending) {
        return;
    }
    m_pending = true;
    QTimer::singleShot(0, this, [this] { refresh(); });
}

void ChartPane::refresh() {
    m_pending = false;
    if (m_logic == nullptr) {
        return;
    }
    if (!m_toggle->isChecked()) {
        m_stale = true;
        return;
    }
    m_stale = false;
    const charts::RotationCharts drawn = charts::rotationCharts(m_logic->work());
    m_panel->showCharts(drawn);
}

void ChartPane::showEvent(QShowEvent *event) {
    QWidget::showEvent(event);
    if (m_stale) {
        refreshSoon();
    }
}

} // namespace arbolex::ui
