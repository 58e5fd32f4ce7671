#include "ui/estatewindow.hpp"

#include "engine/vectorstate.hpp"
#include "estatewindow/estatemessages.hpp"
#include "estatewindow/estatewindowlogic.hpp"

#include <QBarCategoryAxis>
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
#include <QStackedBarSeries>
#include <QTabWidget>
#include <QTableView>
#include <QThread>
#include <QToolTip>
#include <QVBoxLayout>
#include <QValueAxis>

#include <array>

namespace arbolex::ui {

namespace text = estatewindow::text;
using estatewindow::EstateResultsModel;

namespace {

/// Colours of the species, in the order of their names.
constexpr std::array<QRgb, 8> kSpeciesColours = {0x2e7d32, 0x1b6ca8, 0xb8860b, 0x8b3a3a,
                                                 0x6a4c93, 0x00838f, 0xd2691e, 0x555555};
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
    const estatewindow::ForecastChart &forecast = m_logic->forecast();
    auto *chart = new QChart;
    chart->setTitle(text::chartTitle());
    QFont font = chart->titleFont();
    font.setBold(true);
    font.setPointSizeF(font.pointSizeF() * 1.1);
    chart->setTitleFont(font);
    chart->setAnimationOptions(QChart::NoAnimation);
    chart->legend()->setAlignment(Qt::AlignBottom);
    chart->setMargins(QMargins(6, 6, 6, 6));

    auto *series = new QStackedBarSeries;
    series->setBarWidth(0.8);
    for (qsizetype s = 0; s < forecast.species.size(); ++s) {
        auto *set = new QBarSet(forecast.species[s]);
        const QColor colour(
            kSpeciesColours.at(static_cast<std::size_t>(s) % kSpeciesColours.size()));
        set->setColor(colour);
        set->setBorderColor(colour.darker(130));
        for (const double v : forecast.volumes[static_cast<std::size_t>(s)]) {
            set->append(v);
        }
        const QString species = forecast.species[s];
        connect(set, &QBarSet::hovered, this, [this, set, species](bool status, int index) {
            if (!status) {
                QToolTip::hideText();
                return;
            }
            const int year = m_logic->forecast().years.at(static_cast<std::size_t>(index));
            QToolTip::showText(QCursor::pos(), species + QStringLiteral(" ") +
                                                   QString::number(year) + QStringLiteral(": ") +
                                                   QLocale().toString(set->at(index), 'f', 0) +
                                                   QStringLiteral(" m³"));
        });
        series->append(set);
    }
    chart->addSeries(series);

    auto *years = new QBarCategoryAxis;
    for (const int year : forecast.years) {
        years->append(QString::number(year));
    }
    years->setTitleText(text::chartYearAxis());
    years->setLabelsAngle(-90);
    QFont small = years->labelsFont();
    small.setPointSizeF(small.pointSizeF() * 0.85);
    years->setLabelsFont(small);
    years->setGridLineVisible(false);
    chart->addAxis(years, Qt::AlignBottom);
    series->attachAxis(years);

    auto *volume = new QValueAxis;
    volume->setTitleText(text::chartValueAxis());
    volume->setLabelFormat(QStringLiteral("%.0f"));
    chart->addAxis(volume, Qt::AlignLeft);
    series->attachAxis(volume);
    volume->setMin(0.0);
    volume->applyNiceNumbers();

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
