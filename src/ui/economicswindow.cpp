#include "ui/economicswindow.hpp"

#include "charts/economicscharts.hpp"
#include "economics/economicsformat.hpp"
#include "economics/economicsmessages.hpp"
#include "economics/economicswindowlogic.hpp"
#include "engine/vectorstate.hpp"
#include "report/chartbuilder.hpp"
#include "ui/fieldinput.hpp"
#include "ui/stringgridmodel.hpp"

#include <QApplication>
#include <QChart>
#include <QChartView>
#include <QComboBox>
#include <QFormLayout>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QProgressBar>
#include <QPushButton>
#include <QScreen>
#include <QTabWidget>
#include <QTableView>
#include <QThread>
#include <QVBoxLayout>

namespace arbolex::ui {

using economics::EconomicsControl;
using C = economics::EconomicsControl;
namespace et = economics::economicstext;

namespace {

std::size_t slot(EconomicsControl c) {
    return static_cast<std::size_t>(c);
}

QChartView *chartView(QWidget *parent) {
    auto *view = new QChartView(new QChart, parent);
    view->setRenderHint(QPainter::Antialiasing);
    view->setMinimumSize(420, 300);
    return view;
}

/// A row of "caption field" pairs.
QHBoxLayout *fieldRow(const std::vector<std::pair<QString, QWidget *>> &fields) {
    auto *row = new QHBoxLayout;
    row->setSpacing(6);
    for (const auto &[caption, widget] : fields) {
        auto *label = new QLabel(caption);
        label->setBuddy(widget);
        row->addWidget(label);
        row->addWidget(widget);
        row->addSpacing(10);
    }
    return row;
}

} // namespace

EconomicsWindow::EconomicsWindow(QWidget *main) : QDialog(main) {
    setObjectName(QStringLiteral("frmEconomics"));
    setWindowTitle(et::economicsCaption());
    setModal(false);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(14, 12, 14, 12);
    layout->setSpacing(8);

    QLabel *stand = label(C::lblStand);
    QFont big = stand->font();
    big.setBold(true);
    big.setPointSizeF(big.pointSizeF() * 1.15);
    stand->setFont(big);
    layout->addWidget(stand);
    QLabel *regime = label(C::lblRegime);
    regime->setWordWrap(true);
    layout->addWidget(regime);
    QLabel *rate = label(C::lblRate);
    rate->setStyleSheet(QStringLiteral("color: #4a4a4a;"));
    rate->setWordWrap(true);
    layout->addWidget(rate);

    QHBoxLayout *inputs =
        fieldRow({{et::labelInterestRate(), field(C::txtInterestRate, 7)},
                  {et::labelEstablishmentCost(), field(C::txtEstablishmentCost, 8)},
                  {et::labelAnnualCost(), field(C::txtAnnualCost, 6)}});
    control(C::txtEstablishmentCost)->setToolTip(et::hintEstablishmentCost());
    control(C::txtAnnualCost)->setToolTip(et::hintAnnualCost());
    inputs->addSpacing(8);
    inputs->addWidget(new QLabel(et::labelValuation(), this));
    inputs->addWidget(valuationChoice());
    inputs->addWidget(button(C::cmdCompute, et::buttonCompute()));
    inputs->addStretch(1);
    layout->addLayout(inputs);

    m_tabs = new QTabWidget(this);
    m_tabs->addTab(buildRotationTab(), et::tabRotation());
    m_tabs->addTab(buildOptimiserTab(), et::tabOptimiser());
    m_tabs->addTab(buildSensitivityTab(), et::tabSensitivity());
    m_tabs->addTab(buildMonteCarloTab(), et::tabMonteCarlo());
    connect(m_tabs, &QTabWidget::currentChanged, this, [this] { showPendingCharts(); });
    layout->addWidget(m_tabs, 1);

    auto *bottom = new QHBoxLayout;
    bottom->addStretch(1);
    bottom->addWidget(button(C::cmdClose, et::buttonClose()));
    layout->addLayout(bottom);

    for (const C c : {C::txtInterestRate, C::txtEstablishmentCost, C::txtAnnualCost}) {
        connect(qobject_cast<QLineEdit *>(control(c)), &QLineEdit::returnPressed, this, [this] {
            if (m_logic != nullptr) {
                m_logic->cmdCompute_Click();
            }
        });
    }
    for (const C c : {C::txtDraws, C::txtSeed, C::txtPriceSpread, C::txtRateLow, C::txtRateHigh,
                      C::txtCostSpread, C::txtCarbonSpread}) {
        connect(qobject_cast<QLineEdit *>(control(c)), &QLineEdit::returnPressed, this, [this] {
            if (m_logic != nullptr) {
                m_logic->cmdMonteCarlo_Click();
            }
        });
    }
}

EconomicsWindow::~EconomicsWindow() {
    if (m_worker != nullptr) {
        m_worker->wait();
    }
}

void EconomicsWindow::waitForWork() {
    if (m_worker != nullptr) {
        if (m_logic != nullptr) {
            m_logic->cmdCancel_Click();
        }
        m_worker->wait();
    }
}

QWidget *EconomicsWindow::buildRotationTab() {
    auto *tab = new QWidget;
    auto *row = new QHBoxLayout(tab);
    row->setSpacing(12);
    auto *figures = new QGroupBox;
    m_valueBox = figures;
    figures->setObjectName(QStringLiteral("fraValue"));
    auto *form = new QFormLayout(figures);
    form->setLabelAlignment(Qt::AlignLeft);
    form->setRowWrapPolicy(QFormLayout::DontWrapRows);
    form->setVerticalSpacing(9);
    for (const auto &[caption, c] : economics::valueFigures()) {
        QLabel *value = label(c);
        value->setWordWrap(true);
        value->setMinimumWidth(230);
        if (c == C::lblNPV || c == C::lblLEV) {
            QFont bold = value->font();
            bold.setBold(true);
            value->setFont(bold);
        }
        form->addRow(new QLabel(caption + QLatin1Char(':')), value);
    }
    form->addRow(buildCarbonFigures());
    auto *notes = new QLabel(et::figureNotes());
    notes->setWordWrap(true);
    notes->setStyleSheet(QStringLiteral("color: #4a4a4a;"));
    form->addRow(notes);
    figures->setFixedWidth(490);
    row->addWidget(figures);
    m_rotationChart = chartView(tab);
    row->addWidget(m_rotationChart, 1);
    return tab;
}

QWidget *EconomicsWindow::buildCarbonFigures() {
    auto *box = new QWidget;
    auto *grid = new QGridLayout(box);
    grid->setContentsMargins(0, 8, 0, 4);
    grid->setHorizontalSpacing(14);
    grid->setVerticalSpacing(5);
    QLabel *heading = label(C::lblCarbon);
    QFont bold = heading->font();
    bold.setBold(true);
    heading->setFont(bold);
    heading->setWordWrap(true);
    grid->addWidget(heading, 0, 0, 1, 4);
    const QString columns[] = {et::columnTimber(), et::columnCarbon(), et::columnTotal()};
    for (int c = 0; c < 3; ++c) {
        auto *caption = new QLabel(columns[c]);
        caption->setStyleSheet(QStringLiteral("color: #4a4a4a;"));
        grid->addWidget(caption, 1, c + 1, Qt::AlignRight);
    }
    const std::pair<QString, std::array<C, 3>> rows[] = {
        {et::rowNpv(), {C::lblNpvTimber, C::lblNpvCarbon, C::lblNpvTotal}},
        {et::rowLev(), {C::lblLevTimber, C::lblLevCarbon, C::lblLevTotal}}};
    int r = 2;
    for (const auto &[caption, values] : rows) {
        grid->addWidget(new QLabel(caption + QLatin1Char(':')), r, 0);
        for (int c = 0; c < 3; ++c) {
            QLabel *value = label(values.at(static_cast<std::size_t>(c)));
            value->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
            if (c == 2) {
                value->setFont(bold);
            }
            grid->addWidget(value, r, c + 1);
        }
        ++r;
    }
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(2, 1);
    grid->setColumnStretch(3, 1);
    QLabel *moves = label(C::lblCarbonRotation);
    moves->setWordWrap(true);
    grid->addWidget(moves, r, 0, 1, 4);
    return box;
}

QWidget *EconomicsWindow::buildOptimiserTab() {
    auto *tab = new QWidget;
    auto *column = new QVBoxLayout(tab);
    column->setSpacing(8);
    m_optimiserTitle = new QLabel;
    QFont bold = m_optimiserTitle->font();
    bold.setBold(true);
    m_optimiserTitle->setFont(bold);
    column->addWidget(m_optimiserTitle);
    auto *run = new QHBoxLayout;
    run->addWidget(button(C::cmdOptimise, et::buttonOptimise()));
    m_progress = new QProgressBar(tab);
    m_progress->setRange(0, 1000);
    m_progress->setValue(0);
    m_progress->setFormat(QStringLiteral("%p %"));
    run->addWidget(m_progress, 1);
    run->addWidget(button(C::cmdCancel, et::buttonCancel()));
    column->addLayout(run);
    column->addWidget(label(C::lblOptimiser));
    m_regimes = new QTableView(tab);
    m_regimes->setObjectName(QStringLiteral("grdRegimes"));
    m_regimes->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_regimes->setSelectionMode(QAbstractItemView::SingleSelection);
    m_regimes->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_regimes->setAlternatingRowColors(true);
    m_regimes->verticalHeader()->hide();
    m_regimes->horizontalHeader()->setDefaultAlignment(
        Qt::Alignment::fromInt(Qt::AlignCenter | Qt::TextWordWrap));
    m_regimes->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    m_regimes->horizontalHeader()->setMinimumSectionSize(60);
    const int headerHeight = m_regimes->fontMetrics().height() * 2 + 14;
    m_regimes->horizontalHeader()->setFixedHeight(headerHeight);
    // Five regimes and the user's: the table is as tall as its rows.
    const int rowHeight = m_regimes->verticalHeader()->defaultSectionSize();
    m_regimes->setFixedHeight(headerHeight + 6 * rowHeight + 2 * m_regimes->frameWidth() + 2);
    column->addWidget(m_regimes);
    const rotation::OptimiserSettings search;
    auto *notes =
        new QLabel(et::optimiserNotes(economics::quantityText(search.maxRemovalShare * 100.0, 0),
                                      economics::quantityText(search.minStocking, 0)));
    notes->setWordWrap(true);
    notes->setStyleSheet(QStringLiteral("color: #4a4a4a;"));
    column->addWidget(notes);
    column->addStretch(1);
    auto *apply = new QHBoxLayout;
    QWidget *applyButton = button(C::cmdApply, et::buttonApply());
    applyButton->setToolTip(et::hintApply());
    apply->addWidget(applyButton);
    auto *hint = new QLabel(et::hintApply());
    hint->setStyleSheet(QStringLiteral("color: #4a4a4a;"));
    apply->addWidget(hint, 1);
    column->addLayout(apply);
    return tab;
}

QWidget *EconomicsWindow::buildSensitivityTab() {
    auto *tab = new QWidget;
    auto *row = new QHBoxLayout(tab);
    m_tornadoNpv = chartView(tab);
    m_tornadoLev = chartView(tab);
    row->addWidget(m_tornadoNpv, 1);
    row->addWidget(m_tornadoLev, 1);
    return tab;
}

QWidget *EconomicsWindow::buildMonteCarloTab() {
    auto *tab = new QWidget;
    auto *column = new QVBoxLayout(tab);
    QHBoxLayout *inputs = fieldRow({{et::labelDraws(), field(C::txtDraws, 7)},
                                    {et::labelSeed(), field(C::txtSeed, 5)},
                                    {et::labelPriceSpread(), field(C::txtPriceSpread, 4)},
                                    {et::labelRateFrom(), field(C::txtRateLow, 5)},
                                    {et::labelRateTo(), field(C::txtRateHigh, 5)},
                                    {et::labelCostSpread(), field(C::txtCostSpread, 4)},
                                    {et::labelCarbonSpread(), field(C::txtCarbonSpread, 4)}});
    control(C::txtCarbonSpread)->setToolTip(et::hintCarbonSpread());
    inputs->addWidget(button(C::cmdMonteCarlo, et::buttonRun()));
    inputs->addStretch(1);
    column->addLayout(inputs);
    QLabel *summary = label(C::lblMonteCarlo);
    QFont bold = summary->font();
    bold.setBold(true);
    summary->setFont(bold);
    column->addWidget(summary);
    m_histogram = chartView(tab);
    column->addWidget(m_histogram, 1);
    return tab;
}

QWidget *EconomicsWindow::field(EconomicsControl c, int characters) {
    auto *edit = new QLineEdit(this);
    edit->setObjectName(economics::economicsControlName(c));
    edit->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    edit->setFixedWidth(edit->fontMetrics().horizontalAdvance(QString(characters, u'0')) + 16);
    m_controls.at(slot(c)) = edit;
    return edit;
}

QWidget *EconomicsWindow::valuationChoice() {
    auto *choice = new QComboBox(this);
    choice->setObjectName(economics::economicsControlName(C::cboValuation));
    choice->addItems({et::valuationStanding(), et::valuationAssortments()});
    m_controls.at(slot(C::cboValuation)) = choice;
    connect(choice, &QComboBox::activated, this, [this] {
        if (m_logic != nullptr) {
            m_logic->cmdCompute_Click();
        }
    });
    return choice;
}

QLabel *EconomicsWindow::label(EconomicsControl c) {
    auto *l = new QLabel(this);
    l->setObjectName(economics::economicsControlName(c));
    l->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_controls.at(slot(c)) = l;
    return l;
}

QWidget *EconomicsWindow::button(EconomicsControl c, const QString &caption) {
    auto *b = new QPushButton(caption, this);
    b->setObjectName(economics::economicsControlName(c));
    b->setAutoDefault(false);
    m_controls.at(slot(c)) = b;
    connect(b, &QPushButton::clicked, this, [this, c] {
        if (m_logic != nullptr) {
            m_logic->press(c);
        }
    });
    return b;
}

void EconomicsWindow::attach(economics::EconomicsWindowLogic &logic) {
    m_logic = &logic;
    m_regimeModel = new StringGridModel([&logic] { return logic.regimeGrid(); }, this);
    m_regimeModel->setTextColumns({0});
    m_regimes->setModel(m_regimeModel);
    // The rank is short; the figures share the rest.
    m_regimes->horizontalHeader()->setSectionResizeMode(0, QHeaderView::ResizeToContents);
    connect(m_regimes->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            [this](const QModelIndex &current) {
                if (m_logic != nullptr && current.isValid() &&
                    current.row() < static_cast<int>(m_logic->regimes().size())) {
                    m_logic->chooseRegime(current.row() + 1);
                }
            });
}

QWidget *EconomicsWindow::control(EconomicsControl c) const {
    return m_controls.at(slot(c));
}

QString EconomicsWindow::text(EconomicsControl c) const {
    if (auto *edit = qobject_cast<QLineEdit *>(control(c))) {
        return edit->text();
    }
    if (auto *choice = qobject_cast<QComboBox *>(control(c))) {
        return choice->currentText();
    }
    if (auto *l = qobject_cast<QLabel *>(control(c))) {
        return l->text();
    }
    if (auto *b = qobject_cast<QPushButton *>(control(c))) {
        return b->text();
    }
    return {};
}

void EconomicsWindow::setText(EconomicsControl c, const QString &value) {
    if (auto *edit = qobject_cast<QLineEdit *>(control(c))) {
        edit->setText(value);
    } else if (auto *choice = qobject_cast<QComboBox *>(control(c))) {
        const int found = choice->findText(value, Qt::MatchStartsWith);
        choice->setCurrentIndex(found >= 0 ? found : 0);
    } else if (auto *l = qobject_cast<QLabel *>(control(c))) {
        l->setText(value);
    } else if (auto *b = qobject_cast<QPushButton *>(control(c))) {
        b->setText(value);
    }
}

void EconomicsWindow::setEnabled(EconomicsControl c, bool enabled) {
    control(c)->setEnabled(enabled);
}

void EconomicsWindow::focus(EconomicsControl c) {
    focusControl(control(c));
}

void EconomicsWindow::showChart(QChartView *view, charts::ChartData chart) {
    // A chart on a tab out of view is drawn when its tab is shown: laying out
    // the sensitivity and Monte Carlo charts at every computation cost more
    // than all the figures.
    if (!m_tabs->currentWidget()->isAncestorOf(view)) {
        m_pendingCharts[view] = std::move(chart);
        return;
    }
    m_pendingCharts.erase(view);
    draw(view, chart);
}

void EconomicsWindow::draw(QChartView *view, const charts::ChartData &chart) {
    QChart *old = view->chart();
    view->setChart(report::buildChart(chart, report::ChartLook::Window));
    delete old;
}

void EconomicsWindow::showPendingCharts() {
    for (auto pending = m_pendingCharts.begin(); pending != m_pendingCharts.end();) {
        QChartView *view = pending->first;
        if (!m_tabs->currentWidget()->isAncestorOf(view)) {
            ++pending;
            continue;
        }
        const charts::ChartData chart = std::move(pending->second);
        pending = m_pendingCharts.erase(pending);
        draw(view, chart);
    }
}

void EconomicsWindow::figuresChanged() {
    if (m_logic == nullptr) {
        return;
    }
    m_valueBox->setTitle(et::panelValue() + QLatin1Char(' ') + et::atRate(m_logic->rateText()));
    charts::EconomicsCharts drawn = charts::economicsCharts(*m_logic);
    showChart(m_rotationChart, std::move(drawn.rotations));
    showChart(m_tornadoNpv, std::move(drawn.tornadoNpv));
    showChart(m_tornadoLev, std::move(drawn.tornadoLev));
    regimesChanged();
}

void EconomicsWindow::regimesChanged() {
    if (m_logic == nullptr) {
        return;
    }
    m_optimiserTitle->setText(et::panelOptimiser() + QLatin1Char(' ') +
                              et::atRate(m_logic->rateText()));
    m_regimeModel->setBoldFrom(static_cast<int>(m_logic->regimes().size()));
    m_regimeModel->refresh();
    if (!m_logic->regimes().empty()) {
        m_regimes->selectRow(m_logic->chosenRegime() - 1);
    }
}

void EconomicsWindow::monteCarloChanged() {
    if (m_logic != nullptr) {
        showChart(m_histogram, charts::economicsCharts(*m_logic).draws);
    }
}

void EconomicsWindow::setProgress(double fraction) {
    // Called from the optimiser's thread: the bar moves on the window's.
    const int value = qRound(fraction * 1000.0);
    QMetaObject::invokeMethod(
        m_progress, [bar = m_progress, value] { bar->setValue(value); }, Qt::QueuedConnection);
}

void EconomicsWindow::runInBackground(std::function<void()> work, std::function<void()> done) {
    // The thread starts with the window thread's vector state, which Qt
    // leaves dirty (engine/vectorstate.hpp).
    m_worker = QThread::create([work = std::move(work)] {
        engine::clearUpperVectorState();
        work();
    });
    connect(m_worker, &QThread::finished, this, [this, done = std::move(done)] {
        m_worker->deleteLater();
        m_worker = nullptr;
        done();
    });
    m_worker->start();
}

void EconomicsWindow::showWindow() {
    if (!isVisible()) {
        const QRect screen = parentWidget() != nullptr
                                 ? parentWidget()->screen()->availableGeometry()
                                 : QApplication::primaryScreen()->availableGeometry();
        resize(std::min(screen.width() - 40, 1200), std::min(screen.height() - 40, 780));
        move(screen.center() - rect().center());
    }
    show();
    raise();
    activateWindow();
}

void EconomicsWindow::close() {
    hide();
}

bool EconomicsWindow::isShown() const {
    return isVisible();
}

} // namespace arbolex::ui
