#include "ui/reportmenu.hpp"

#include "charts/reportfailure.hpp"
#include "charts/reportmessages.hpp"
#include "report/reportwriter.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QAction>
#include <QApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <QMainWindow>
#include <QMenu>
#include <QPageLayout>
#include <QPrintDialog>
#include <QPrinter>

namespace arbolex::ui {

ReportMenu::ReportMenu(QMainWindow &window) : QObject(&window), m_window(window) {
    m_export = new QAction(text::menuExportReport(), this);
    m_export->setObjectName(QStringLiteral("mnuExportReport"));
    m_print = new QAction(text::menuPrint(), this);
    m_print->setObjectName(QStringLiteral("mnuPrint"));
    m_print->setShortcut(QKeySequence::Print);
    connect(m_export, &QAction::triggered, this, &ReportMenu::chooseAndExport);
    connect(m_print, &QAction::triggered, this, &ReportMenu::print);
}

void ReportMenu::addTo(QMenu &file) {
    QAction *before = nullptr;
    for (QAction *entry : file.actions()) {
        if (entry->objectName() == QLatin1String("mnuClose")) {
            before = entry;
            break;
        }
    }
    file.insertAction(before, m_export);
    file.insertAction(before, m_print);
    file.insertSeparator(before);
}

bool ReportMenu::exportReport(const QString &path) {
    if (m_logic == nullptr) {
        return false;
    }
    QApplication::setOverrideCursor(Qt::WaitCursor);
    const int pages = report::writeReportPdf(content(), path, report::printedNow());
    QApplication::restoreOverrideCursor();
    if (pages == 0) {
        charts::reportOutputFailure(
            m_logic->interactive(), m_logic->errorLog(), charts::text::titleExportReport(),
            charts::text::writeFailed(path), QStringLiteral(" in frmMain.mnuExportReport_Click()"));
    }
    return pages > 0;
}

charts::ReportContent ReportMenu::content() const {
    return m_economics != nullptr ? charts::reportContent(m_logic->work(), *m_economics)
                                  : charts::reportContent(m_logic->work());
}

void ReportMenu::chooseAndExport() {
    QString path = QFileDialog::getSaveFileName(&m_window, charts::text::titleExportReport(),
                                                QStringLiteral("report.pdf"), text::filterPdf());
    if (path.isEmpty()) {
        return;
    }
    if (QFileInfo(path).suffix().isEmpty()) {
        path += QStringLiteral(".pdf");
    }
    exportReport(path);
}

void ReportMenu::print() {
    if (m_logic == nullptr) {
        return;
    }
    QPrinter printer(QPrinter::HighResolution);
    printer.setPageLayout(report::reportPageLayout());
    printer.setDocName(charts::text::reportTitle());
    QPrintDialog dialog(&printer, &m_window);
    if (dialog.exec() != QDialog::Accepted) {
        return;
    }
    QApplication::setOverrideCursor(Qt::WaitCursor);
    const int pages = report::paintReport(printer, content(), report::printedNow());
    QApplication::restoreOverrideCursor();
    if (pages == 0) {
        charts::reportOutputFailure(m_logic->interactive(), m_logic->errorLog(),
                                    charts::text::reportTitle(), charts::text::printFailed(),
                                    QStringLiteral(" in frmMain.mnuPrint_Click()"));
    }
}

} // namespace arbolex::ui
