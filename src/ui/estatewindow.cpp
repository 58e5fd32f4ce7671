#include "ui/estatewindow.hpp"

#include "charts/estatecharts.hpp"
#include "engine/vectorstate.hpp"
#include "estatewindow/estatemessages.hpp"
#include "estatewindow/estatewindowlogic.hpp"
#include "report/chartbuilder.hpp"

#include <QAbstractBarSeries>
#include <QBarSet>
#include <QChart>
#include <QChartView>
#include <QCursor>
#include <QFileDialog>
#include <QFileInfo>
#include <QHeaderView>
#include <QLabel>
#include <QMenu>
#include <QProgressDialog>
#include <QScreen>
#include <QSortFilterProxyModel>
#include <QTabWidget>
#include <QTableView>
#include <QThread>
#include <QToolTip>
#include <QVBoxLayout>

namespace arbolex::ui {

namespace text = estatewindow::text;
using estatewindow::EstateResultsModel;

namespace {

/// A row that was not grown: pale red behind dark red.
constexpr QRgb kNotGrownBackground = 0xfbe3e4;
constexpr QRgb kNotGrownText = 0x9b1c1c;
/// Widest column of a figure, pixels.
constexpr int kFigureColumnWidth = 78;

} // namespace

/// Sorts by the model's numbers and marks the rows that were not grown.
class EstateSortModel : public QSortFilterProxyModel {
public:
    using QSortFilterProxyModel::QSortFilterProxyModel;

    QVariant data(const QModelIndex &index, int role) const override {
        if (role == Qt::BackgroundRole || role == Qt::ForegroundRole) {
            if (QSortFilterProxyModel::data(index, EstateResultsModel::kNotGrownRole).toBool()) {
                return QColor(role == Qt::BackgroundRole ? kNotGrownBackground : kNotGrownText);
            }
            return {};
        }
        return QSortFilterProxyModel::data(index, role);
    }

protected:
    /// Rows without the figure stay at the bottom in either order.
    bool lessThan(const QModelIndex &left, const QModelIndex &right) const override {
        const bool hasLeft = left.data(sortRole()).isValid();
        const bool hasRight = right.data(sortRole()).isValid();
        if (hasLeft && hasRight) {
            return QSortFilterProxyModel::lessThan(left, right);
        }
        if (hasLeft == hasRight) {
            return false;
        }
        return sortOrder() == Qt::DescendingOrder ? !hasLeft : !hasRight;
    }
};

EstateWindow::EstateWindow(QWidget *parent) : QWidget(parent, Qt::Window) {
    setWindowTitle(text::titleEstate());
    auto *column = new QVBoxLayout(this);
    m_summary = new QLabel;
    column->addWidget(m_summary);
    m_tabs = new QTabWidget;
    column->addWidget(m_tabs, 1);

    m_table = new QTableView;
    m_sorted = new EstateSortModel(this);
    m_sorted->setSortRole(EstateResultsModel::kSortRole);
    m_table->setModel(m_sorted);
    m_table->setSortingEnabled(true);
    m_table->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_table->setSelectionMode(QAbstractItemView::SingleSelection);
    m_table->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_table->setAlternatingRowColors(true);
    m_table->verticalHeader()->setDefaultSectionSize(m_table->fontMetrics().height() + 6);
    m_table->horizontalHeader()->setStretchLastSection(true);
    m_table->horizontalHeader()->setDefaultAlignment(Qt::AlignCenter);
    m_tabs->addTab(m_table, text::tabTable());

    m_chart = new QChartView;
    m_chart->setRenderHint(QPainter::Antialiasing);
    m_tabs->addTab(m_chart, text::tabChart());

    connect(m_table, &QTableView::doubleClicked, this, [this](const QModelIndex &index) {
        if (m_logic != nullptr) {
            m_logic->openSubCompartment(m_sorted->mapToSource(index).row());
        }
    });
}

EstateWindow::~EstateWindow() {
    waitForWork();
}

void EstateWindow::attach(estatewindow::EstateWindowLogic &logic) {
    m_logic = &logic;
    m_sorted->setSourceModel(&logic.model());
}

QAction *EstateWindow::addOpenEntry(QMenu &fileMenu, QAction *after) {
    auto *entry = new QAction(text::openEstateMenu(), &fileMenu);
    const QList<QAction *> actions = fileMenu.actions();
    const qsizetype at = actions.indexOf(after);
    fileMenu.insertAction(at >= 0 && at + 1 < actions.size() ? actions[at + 1] : nullptr, entry);
    connect(entry, &QAction::triggered, this, [this] {
        if (m_logic != nullptr) {
            m_logic->mnuOpenEstate_Click();
        }
    });
    return entry;
}

void EstateWindow::waitForWork() {
    if (m_worker != nullptr) {
        if (m_logic != nullptr) {
            m_logic->cancel();
        }
        m_worker->wait();
    }
}

QString EstateWindow::chooseEstateFile() {
    return QFileDialog::getOpenFileName(parentWidget(), text::openEstateMenu().remove(u'&'),
                                        QString(), text::fileFilter());
}

void EstateWindow::setProgress(long long rowsDone, long long rowsInInput) {
    // Called from the run's thread: the dialog moves on the window's.
    QMetaObject::invokeMethod(
        this,
        [this, rowsDone, rowsInInput] {
            if (m_progress == nullptr) {
                return;
            }
            if (rowsInInput > 0) {
                m_progress->setMaximum(static_cast<int>(std::min<long long>(rowsInInput, 1 << 30)));
                m_progress->setValue(static_cast<int>(std::min(rowsDone, rowsInInput)));
            }
            m_progress->setLabelText(text::progressLabel() + QStringLiteral("\n") +
                                     QString::number(rowsDone) + QStringLiteral(" done"));
        },
        Qt::QueuedConnection);
}

void EstateWindow::runInBackground(std::function<void()> work, std::function<void()> done) {
    m_progress = new QProgressDialog(text::progressLabel(), text::cancelButton(), 0, 0,
                                     parentWidget() != nullptr ? parentWidget() : this);
    m_progress->setWindowTitle(text::titleEstate());
    m_progress->setWindowModality(Qt::WindowModal);
    m_progress->setMinimumDuration(300);
    m_progress->setAutoClose(false);
    m_progress->setAutoReset(false);
    connect(m_progress, &QProgressDialog::canceled, this, [this] {
        if (m_logic != nullptr) {
            m_logic->cancel();
        }
    });
    // The thread starts with the window thread's vector state, which Qt
    // leaves dirty (engine/vectorstate.hpp).
    m_worker = QThread::create([work = std::move(work)] {
        engine::clearUpperVectorState();
        work();
    });
    connect(m_worker, &QThread::finished, this, [this, done = std::move(done)] {
        m_worker->deleteLater();
        m_worker = nullptr;
        m_progress->deleteLater();
        m_progress = nullptr;
        done();
    });
    m_worker->start();
}

void EstateWindow::resultsChanged() {
    m_summary->setText(QStringLiteral("<b>") +
                       QFileInfo(m_logic->estateFile()).fileName().toHtmlEscaped() +
                       QStringLiteral("</b> — ") + m_logic->summaryText().toHtmlEscaped());
    m_table->sortByColumn(-1, Qt::AscendingOrder);
    m_table->resizeColumnsToContents();
    // The figures need little room: their two-line captions set the width.
    for (int c = EstateResultsModel::kAreaColumn; c < EstateResultsModel::kStatusColumn; ++c) {
        m_table->setColumnWidth(c, std::min(m_table->columnWidth(c), kFigureColumnWidth));
    }
    drawForecast();
}

void EstateWindow::drawForecast() {
    m_drawn = charts::harvestChart(m_logic->forecast());
    QChart *chart = report::buildChart(m_drawn, report::ChartLook::Window);
    for (QAbstractSeries *series : chart->series()) {
        auto *bars = qobject_cast<QAbstractBarSeries *>(series);
        for (QBarSet *set : bars != nullptr ? bars->barSets() : QList<QBarSet *>()) {
            const int s = set->property(report::kSeriesIndexProperty).toInt();
            connect(set, &QBarSet::hovered, this, [this, s](bool status, int index) {
                if (!status) {
                    QToolTip::hideText();
                    return;
                }
                const charts::ChartSeries &species = m_drawn.series.at(static_cast<std::size_t>(s));
                QToolTip::showText(
                    QCursor::pos(),
                    species.name + QLatin1Char(' ') + m_drawn.categories.value(index) +
                        QStringLiteral(": ") +
                        QLocale().toString(species.points.at(static_cast<std::size_t>(index)).y,
                                           'f', 0) +
                        QLatin1Char(' ') + species.unit);
            });
        }
    }
    QChart *old = m_chart->chart();
    m_chart->setChart(chart);
    delete old;
}

void EstateWindow::showWindow() {
    if (!isVisible()) {
        const QRect area = parentWidget() != nullptr ? parentWidget()->screen()->availableGeometry()
                                                     : screen()->availableGeometry();
        resize(std::min(area.width() - 40, 1180), std::min(area.height() - 40, 720));
        move(area.center() - rect().center());
    }
    show();
    raise();
    activateWindow();
}

} // namespace arbolex::ui
