#include "ui/mainwindow.hpp"
#include "ui/fieldinput.hpp"

#include "assortments/assortmessages.hpp"
#include "document/documentmessages.hpp"
#include "economics/assortpricesmessages.hpp"
#include "economics/economicsmessages.hpp"
#include "engine/catalogue.hpp"
#include "ui/chartpane.hpp"
#include "ui/groupheaderview.hpp"
#include "ui/projectionmodel.hpp"
#include "ui/reportmenu.hpp"
#include "ui/restoredatadialog.hpp"
#include "ui/stringgridmodel.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QAction>
#include <QActionGroup>
#include <QApplication>
#include <QCloseEvent>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QMessageBox>
#include <QPushButton>
#include <QSplitter>
#include <QStackedWidget>
#include <QStyle>
#include <QTableView>
#include <QVBoxLayout>

#include <cmath>
#include <vector>

namespace arbolex::ui {

using workflow::MainControl;

namespace {

std::size_t slot(MainControl c) {
    return static_cast<std::size_t>(c);
}

/// Width of a numeric field, in digits of the window's font.
constexpr int kFieldDigits = 8;

/// Width of the narrow separator columns of the grid, pixels.
constexpr int kSeparatorWidth = 10;

using Logic = workflow::MainWindowLogic;

/// A command button of the panel: its caption and hint (none when null) and
/// the handler of the logic a click runs.
struct Command {
    MainControl control;
    QString (*caption)();
    QString (*hint)();
    void (Logic::*handler)();
};

/// The command buttons down the first column, then the second, in keyboard
/// order. The summary button's caption is the logic's ("GoTo Summary" or
/// "GoTo Stand Projections").
const Command kCommands[] = {
    {MainControl::cmdGrow, text::buttonGrow, nullptr, &Logic::cmdGrow_Click},
    // Only thinned models offer the thin command: the logic enables it.
    {MainControl::cmdThin, text::buttonThin, text::hintThin, &Logic::cmdThin_Click},
    {MainControl::cmdAssort, assortments::text::mainAssortButton, assortments::text::mainAssortHint,
     &Logic::cmdAssort_Click},
    {MainControl::cmdUseRow, text::buttonUseRow, text::hintUseRow, &Logic::UseFlxRow},
    {MainControl::cmdClear, text::buttonClear, nullptr, &Logic::cmdClear_Click},
    {MainControl::cmdClearAll, text::buttonClearAll, nullptr, &Logic::ClearAll},
    {MainControl::cmdFinalCut, text::buttonFinalCut, text::hintFinalCut, &Logic::cmdFinalCut_Click},
    {MainControl::cmdSummary, nullptr, text::hintSummary, &Logic::cmdSummary_Click},
    {MainControl::cmdNPV, text::buttonNpv, text::hintNpv, &Logic::cmdNPV_Click},
    {MainControl::cmdDeleteRows, text::buttonDeleteRows, text::hintDeleteRows,
     &Logic::cmdDeleteRows_Click},
    {MainControl::cmdShowTimberPrice, workflow::text::showTimberPrices, nullptr,
     &Logic::cmdShowTimberPrice_Click},
};
/// Buttons in the first column of the panel.
constexpr int kFirstColumnCommands = 6;

} // namespace

MainWindow::MainWindow(QWidget *parent) : QMainWindow(parent) {
    setObjectName(QStringLiteral("frmMain"));
    m_chartPane = new ChartPane(this);
    buildMenus();

    auto *central = new QWidget(this);
    auto *layout = new QVBoxLayout(central);
    layout->setContentsMargins(12, 10, 12, 12);
    layout->setSpacing(10);
    layout->addWidget(buildPanel());
    QLabel *title = addResult(MainControl::lblTableTitle);
    title->setFrameStyle(QFrame::NoFrame);
    title->setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    QFont bold = title->font();
    bold.setBold(true);
    title->setFont(bold);
    layout->addWidget(title);
    buildGrid();
    buildSummaryGrid();
    m_tables = new QStackedWidget(this);
    m_tables->addWidget(m_grid);
    // The summary with its carbon block under it.
    m_summaryPage = new QWidget(this);
    auto *summaryColumn = new QVBoxLayout(m_summaryPage);
    summaryColumn->setContentsMargins(0, 0, 0, 0);
    summaryColumn->setSpacing(6);
    summaryColumn->addWidget(m_summaryGrid, 1);
    m_summaryCarbon = new QLabel(m_summaryPage);
    m_summaryCarbon->setObjectName(QStringLiteral("flxSummaryCarbon"));
    m_summaryCarbon->setTextFormat(Qt::RichText);
    m_summaryCarbon->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_summaryCarbon->setContentsMargins(4, 2, 4, 4);
    summaryColumn->addWidget(m_summaryCarbon);
    m_tables->addWidget(m_summaryPage);
    // The charts beside the table; the splitter sets their share of the width.
    auto *beside = new QSplitter(Qt::Horizontal, this);
    beside->setChildrenCollapsible(false);
    beside->addWidget(m_tables);
    beside->addWidget(m_chartPane);
    beside->setStretchFactor(0, 3);
    beside->setStretchFactor(1, 2);
    layout->addWidget(beside, 1);
    layout->setSpacing(6);
    setCentralWidget(central);
}

MainWindow::~MainWindow() {
    while (m_busyDepth > 0) {
        setBusy(false);
    }
}

void MainWindow::attach(workflow::MainWindowLogic &logic, QSettings &settings) {
    m_logic = &logic;
    m_settings = &settings;
    m_model = new ProjectionModel(logic.table(), this);
    m_grid->setModel(m_model);
    connect(m_grid->selectionModel(), &QItemSelectionModel::selectionChanged, this,
            &MainWindow::selectionToLogic);
    connect(m_grid->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            &MainWindow::selectionToLogic);
    fitColumns();
    m_summaryModel = new StringGridModel([&logic] { return logic.summaryGrid(); }, this);
    m_summaryModel->setGroups([&logic] { return logic.summaryGroups(); });
    // Totals follow the rows of the start, the thinnings and the final cut.
    m_summaryGrid->setModel(m_summaryModel);
    m_chartPane->attach(logic);
    m_reportMenu->attach(logic);
}

void MainWindow::refreshCharts() {
    m_chartPane->refreshSoon();
}

void MainWindow::SetModelFromfrmModelChoice(int modelId) {
    if (m_logic != nullptr) {
        m_logic->SetModelFromfrmModelChoice(modelId);
    }
}

// ---- Building the window ------------------------------------------------------------

void MainWindow::buildMenus() {
    m_fileMenu = menuBar()->addMenu(document::text::menuFile());
    m_reportMenu = new ReportMenu(*this);
    QMenu *models = menuBar()->addMenu(text::menuModel());
    models->setObjectName(QStringLiteral("mnuModel"));
    models->setToolTipsVisible(true);
    m_modelActions = new QActionGroup(this);
    m_modelActions->setExclusive(true);
    for (int id = 0; id < engine::kModelCount; ++id) {
        QAction *entry = models->addAction(text::modelMenuEntry(id));
        entry->setToolTip(text::modelDetails(id));
        entry->setCheckable(true);
        entry->setData(id);
        m_modelActions->addAction(entry);
    }
    connect(m_modelActions, &QActionGroup::triggered, this, [this](QAction *entry) {
        if (m_logic == nullptr) {
            return;
        }
        m_logic->mnuModel_Click(entry->data().toInt());
        // A refused choice leaves the active model where it was.
        setActiveModel(m_logic->grow().modelId());
    });

    QMenu *edit = menuBar()->addMenu(text::menuEdit());
    QAction *copy = edit->addAction(text::menuCopy());
    copy->setObjectName(QStringLiteral("mnuCopyTable"));
    copy->setShortcut(QKeySequence::Copy);
    connect(copy, &QAction::triggered, this, [this] {
        if (m_logic != nullptr) {
            m_logic->CopyTable(m_logic->showingSummary());
        }
    });
    QAction *remove = edit->addAction(text::menuDeleteRows());
    connect(remove, &QAction::triggered, this, [this] {
        if (m_logic != nullptr) {
            m_logic->cmdDeleteRows_Click();
        }
    });
    QMenu *view = menuBar()->addMenu(text::menuView());
    view->addAction(m_chartPane->toggleViewAction());
    QMenu *assortMenu = menuBar()->addMenu(assortments::text::menuAssortments());
    m_assortUserAction = assortMenu->addAction(assortments::text::userMenu());
    m_assortUserAction->setObjectName(QStringLiteral("mnuAssortUser"));
    m_assortPricesAction = assortMenu->addAction(economics::text::assortPricesMenu());
    m_assortPricesAction->setObjectName(QStringLiteral("mnuAssortPrices"));

    QMenu *help = menuBar()->addMenu(text::menuHelp());
    connect(help->addAction(text::menuThreshold()), &QAction::triggered, this, [this] {
        if (m_logic != nullptr) {
            m_logic->TrhesholdInfo();
        }
    });
    connect(help->addAction(text::menuNotes()), &QAction::triggered, this, [this] {
        if (m_logic != nullptr) {
            m_logic->Warn();
        }
    });
    help->addSeparator();
    QAction *restore = help->addAction(text::menuRestoreData());
    restore->setObjectName(QStringLiteral("mnuRestoreData"));
    connect(restore, &QAction::triggered, this, [this] {
        if (m_logic != nullptr && m_dataHistory != nullptr) {
            RestoreDataDialog(*m_dataHistory, m_dataFolder, *m_logic, this).exec();
        }
    });
    connect(help->addAction(text::menuAbout()), &QAction::triggered, this, &MainWindow::about);
}

QLineEdit *MainWindow::addField(MainControl control) {
    auto *field = new QLineEdit(this);
    field->setObjectName(workflow::controlName(control));
    field->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    field->setFixedWidth(field->fontMetrics().horizontalAdvance(QString(kFieldDigits, u'0')) + 16);
    field->installEventFilter(this);
    // The work keeps what the field holds, typed or set.
    connect(field, &QLineEdit::textChanged, this, [this, control](const QString &text) {
        if (m_logic != nullptr) {
            m_logic->fields().fieldEdited(control, text);
        }
    });
    m_controls.at(slot(control)) = field;
    return field;
}

QLabel *MainWindow::addResult(MainControl control) {
    auto *label = new QLabel(this);
    label->setObjectName(workflow::controlName(control));
    label->setTextFormat(Qt::PlainText);
    label->setFrameStyle(QFrame::StyledPanel | QFrame::Sunken);
    label->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    label->setMinimumWidth(label->fontMetrics().horizontalAdvance(QString(6, u'0')) + 16);
    label->setTextInteractionFlags(Qt::TextSelectableByMouse);
    // As tall as the fields beside it, so the rows of every group line up.
    label->setMinimumHeight(QLineEdit().sizeHint().height());
    m_controls.at(slot(control)) = label;
    return label;
}

QPushButton *MainWindow::addButton(MainControl control, const QString &caption) {
    auto *button = new QPushButton(caption, this);
    button->setObjectName(workflow::controlName(control));
    button->setAutoDefault(false);
    button->setMinimumWidth(button->fontMetrics().horizontalAdvance(text::buttonClearAll()) + 40);
    m_controls.at(slot(control)) = button;
    return button;
}

QWidget *MainWindow::buildPanel() {
    auto *panel = new QWidget(this);
    auto *row = new QHBoxLayout(panel);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(12);

    // A label and its field, in columns (column, column + 1) of a grid.
    const auto place = [](QGridLayout *grid, int r, int column, const QString &caption,
                          QWidget *field) {
        auto *label = new QLabel(caption);
        label->setBuddy(field);
        grid->addWidget(label, r, column);
        grid->addWidget(field, r, column + 1);
    };
    const auto group = [this](const QString &title) {
        auto *box = new QGroupBox(title, this);
        auto *grid = new QGridLayout(box);
        grid->setHorizontalSpacing(10);
        grid->setVerticalSpacing(6);
        return std::pair{box, grid};
    };

    auto [from, fromGrid] = group(text::groupGrowFrom());
    place(fromGrid, 0, 0, text::labelFromA(), addField(MainControl::txtFromA));
    place(fromGrid, 1, 0, text::labelFromN(), addField(MainControl::txtFromN));
    place(fromGrid, 2, 0, text::labelFromH(), addField(MainControl::txtFromH));
    fromGrid->setColumnMinimumWidth(2, 8);
    place(fromGrid, 0, 3, text::labelFromB(), addField(MainControl::txtFromB));
    place(fromGrid, 1, 3, text::labelFromD(), addField(MainControl::txtFromD));
    fromGrid->setRowStretch(3, 1);
    row->addWidget(from);

    auto [to, toGrid] = group(text::groupGrowTo());
    place(toGrid, 0, 0, text::labelToA(), addField(MainControl::txtToA));
    place(toGrid, 1, 0, text::labelByA(), addField(MainControl::txtByA));
    place(toGrid, 2, 0, text::labelNetArea(), addField(MainControl::txtNetArea));
    toGrid->setRowStretch(3, 1);
    row->addWidget(to);

    auto [site, siteGrid] = group(text::groupSite());
    place(siteGrid, 0, 0, text::labelSI(), addResult(MainControl::lblSI));
    place(siteGrid, 1, 0, text::labelYC(), addResult(MainControl::lblYC));
    siteGrid->setRowStretch(2, 1);
    row->addWidget(site);

    row->addStretch(1);

    auto *commands = new QGridLayout;
    commands->setSpacing(6);
    for (int i = 0; i < static_cast<int>(std::size(kCommands)); ++i) {
        const Command &c = kCommands[i];
        QPushButton *button = addButton(c.control, c.caption != nullptr ? c.caption() : QString());
        if (c.hint != nullptr) {
            button->setToolTip(c.hint());
        }
        connect(button, &QPushButton::clicked, this, [this, handler = c.handler] {
            if (m_logic != nullptr) {
                (m_logic->*handler)();
            }
        });
        const bool first = i < kFirstColumnCommands;
        commands->addWidget(button, first ? i : i - kFirstColumnCommands, first ? 0 : 1);
    }
    QWidget *grow = control(MainControl::cmdGrow);
    QFont bold = grow->font();
    bold.setBold(true);
    grow->setFont(bold);
    QWidget *summary = control(MainControl::cmdSummary);
    summary->setMinimumWidth(
        summary->fontMetrics().horizontalAdvance(QStringLiteral("GoTo Stand Projections")) + 24);
    control(MainControl::cmdNPV)->setEnabled(false);
    // Beside NPV: the value of the rotation, its best age, the optimiser and
    // the uncertainty, in a window of its own.
    m_economicsButton = new QPushButton(economics::economicstext::buttonEconomics(), this);
    m_economicsButton->setObjectName(QStringLiteral("cmdEconomics"));
    m_economicsButton->setToolTip(economics::economicstext::hintEconomics());
    commands->addWidget(m_economicsButton, 5, 1);
    commands->setRowStretch(6, 1);
    row->addLayout(commands);

    // Keyboard order follows the stand description, then the projection.
    std::vector<MainControl> order = {MainControl::txtFromA, MainControl::txtFromN,
                                      MainControl::txtFromH, MainControl::txtFromB,
                                      MainControl::txtFromD, MainControl::txtToA,
                                      MainControl::txtByA,   MainControl::txtNetArea};
    for (const Command &c : kCommands) {
        order.push_back(c.control);
    }
    for (std::size_t i = 1; i < order.size(); ++i) {
        setTabOrder(control(order[i - 1]), control(order[i]));
    }
    return panel;
}

void MainWindow::buildGrid() {
    m_grid = new QTableView(this);
    m_grid->setObjectName(QStringLiteral("flxMain"));
    m_grid->setHorizontalHeader(new GroupHeaderView(ProjectionModel::GroupRole, m_grid));
    m_grid->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_grid->setSelectionMode(QAbstractItemView::ContiguousSelection);
    m_grid->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_grid->setAlternatingRowColors(true);
    m_grid->setWordWrap(false);
    m_grid->setCornerButtonEnabled(false);
    m_grid->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    m_grid->verticalHeader()->setDefaultSectionSize(m_grid->fontMetrics().height() + 8);
    m_grid->verticalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    // Wide enough for every row label from the start, so the columns do not
    // move when the first rows arrive.
    m_grid->verticalHeader()->setFixedWidth(
        m_grid->fontMetrics().horizontalAdvance(QStringLiteral("AC yr")) + 16);
    m_grid->horizontalHeader()->setMinimumSectionSize(kSeparatorWidth);
}

void MainWindow::buildSummaryGrid() {
    m_summaryGrid = new QTableView(this);
    m_summaryGrid->setObjectName(QStringLiteral("flxSummary"));
    m_summaryGrid->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_summaryGrid->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_summaryGrid->setAlternatingRowColors(true);
    m_summaryGrid->setWordWrap(false);
    m_summaryGrid->verticalHeader()->hide();
    m_summaryGrid->verticalHeader()->setDefaultSectionSize(m_grid->fontMetrics().height() + 8);
    // The same two-level header as the projections: groups over captions.
    m_summaryGrid->setHorizontalHeader(
        new GroupHeaderView(StringGridModel::GroupRole, m_summaryGrid));
}

void MainWindow::fitColumns() {
    m_model->spanTextRows(*m_grid);
    QHeaderView *header = m_grid->horizontalHeader();
    const int minimum = m_grid->fontMetrics().horizontalAdvance(QString(4, u'0')) + 10;
    for (int c = 0; c < m_model->columnCount(); ++c) {
        if (m_model->isSeparator(c)) {
            header->setSectionResizeMode(c, QHeaderView::Fixed);
            header->resizeSection(c, kSeparatorWidth);
        } else {
            header->setSectionResizeMode(c, QHeaderView::Interactive);
            const int fitted = std::max(contentWidth(c), header->sectionSizeHint(c));
            header->resizeSection(c, std::max(fitted, minimum));
        }
    }
}

int MainWindow::contentWidth(int column) const {
    // The cells are one line of plain text each: their advance in the row's
    // font is the width the item delegate asks for. Shaping every cell costs
    // more than the grow itself, so each text is first estimated by the sum of
    // its characters' advances, and only those that may be the widest are
    // shaped.
    QFont boldFont = m_grid->font();
    boldFont.setBold(true);
    const QFontMetricsF plain(m_grid->font());
    const QFontMetricsF bold(boldFont);
    struct Cell {
        QString text;
        const QFontMetricsF *metrics;
        qreal estimate;
    };
    std::vector<Cell> cells;
    qreal widestEstimate = 0;
    for (int r = 0; r < m_model->rowCount(); ++r) {
        if (m_model->isTextRow(r)) {
            continue; // the report spans the row and asks for no width
        }
        const QModelIndex index = m_model->index(r, column);
        QString text = m_model->data(index, Qt::DisplayRole).toString();
        if (text.isEmpty()) {
            continue;
        }
        const QFontMetricsF *metrics =
            m_model->data(index, Qt::FontRole).value<QFont>().bold() ? &bold : &plain;
        qreal estimate = 0;
        for (const QChar c : text) {
            estimate += metrics->horizontalAdvance(c);
        }
        widestEstimate = std::max(widestEstimate, estimate);
        cells.push_back({std::move(text), metrics, estimate});
    }
    qreal widest = 0;
    for (const Cell &cell : cells) {
        // Kerning moves a text by a fraction of a pixel at most.
        if (cell.estimate >= widestEstimate - 2.0) {
            widest = std::max(widest, cell.metrics->horizontalAdvance(cell.text));
        }
    }
    // The delegate's text margins on each side, and the grid line.
    const int margin =
        m_grid->style()->pixelMetric(QStyle::PM_FocusFrameHMargin, nullptr, m_grid) + 1;
    return static_cast<int>(std::ceil(widest)) + 2 * margin + (m_grid->showGrid() ? 1 : 0);
}

// ---- IMainView --------------------------------------------------------------------------

QWidget *MainWindow::control(MainControl c) const {
    return m_controls.at(slot(c));
}

QString MainWindow::text(MainControl c) const {
    QWidget *w = control(c);
    if (auto *field = qobject_cast<QLineEdit *>(w)) {
        return field->text();
    }
    if (auto *label = qobject_cast<QLabel *>(w)) {
        return label->text();
    }
    if (auto *button = qobject_cast<QPushButton *>(w)) {
        return button->text();
    }
    return m_absentText.at(slot(c));
}

void MainWindow::setText(MainControl c, const QString &value) {
    QWidget *w = control(c);
    if (auto *field = qobject_cast<QLineEdit *>(w)) {
        field->setText(value);
    } else if (auto *label = qobject_cast<QLabel *>(w)) {
        label->setText(value);
    } else if (auto *button = qobject_cast<QPushButton *>(w)) {
        button->setText(value);
    } else {
        m_absentText.at(slot(c)) = value;
    }
}

void MainWindow::setEnabled(MainControl c, bool enabled) {
    if (QWidget *w = control(c)) {
        w->setEnabled(enabled);
    }
}

bool MainWindow::isEnabled(MainControl c) const {
    const QWidget *w = control(c);
    return w == nullptr || w->isEnabled();
}

void MainWindow::setHint(MainControl c, const QString &hint) {
    if (QWidget *w = control(c)) {
        w->setToolTip(hint);
    }
}

void MainWindow::focus(MainControl c) {
    focusControl(control(c));
}

void MainWindow::setCaption(const QString &caption) {
    setWindowTitle(caption);
}

void MainWindow::setBusy(bool busy) {
    if (busy) {
        QApplication::setOverrideCursor(Qt::WaitCursor);
        ++m_busyDepth;
    } else if (m_busyDepth > 0) {
        QApplication::restoreOverrideCursor();
        --m_busyDepth;
    }
}

void MainWindow::tableChanged(int firstRow) {
    if (m_model == nullptr) {
        return;
    }
    m_model->refresh(firstRow);
    m_chartPane->refreshSoon();
    // Rewritten rows (a final cut) may hold wider numbers than before.
    fitColumns();
    selectionFromLogic();
    if (m_summaryModel != nullptr && m_logic->showingSummary()) {
        fitSummary();
    }
}

void MainWindow::showSummary(bool summary) {
    if (m_tables == nullptr || m_summaryModel == nullptr) {
        return;
    }
    if (summary) {
        fitSummary();
    }
    m_tables->setCurrentWidget(summary ? m_summaryPage : m_grid);
}

void MainWindow::showSummaryCarbon() {
    const workflow::CarbonSummary &carbon = m_logic->summaryCarbon();
    m_summaryCarbon->setVisible(!carbon.empty());
    if (carbon.empty()) {
        return;
    }
    // The captions over their values, one column each, as the summary reads.
    QString captions;
    QString values;
    for (const auto &[caption, value] : carbon.figures) {
        captions += QStringLiteral("<td style=\"padding: 2px 14px 2px 0\">") +
                    caption.toHtmlEscaped() + QStringLiteral("</td>");
        values += QStringLiteral("<td style=\"padding: 2px 14px 2px 0\"><b>") +
                  value.toHtmlEscaped() + QStringLiteral("</b></td>");
    }
    m_summaryCarbon->setText(QStringLiteral("<b>") + carbon.heading.toHtmlEscaped() +
                             QStringLiteral("</b><table style=\"margin-top: 4px\"><tr>") +
                             captions + QStringLiteral("</tr><tr>") + values +
                             QStringLiteral("</tr></table>"));
}

void MainWindow::fitSummary() {
    m_summaryModel->refresh();
    showSummaryCarbon();
    // The rotation's totals stand out below the rows it copied.
    m_summaryModel->setBoldFrom(m_logic->summaryTotalsFrom());
    const QFontMetrics metrics = m_summaryGrid->horizontalHeader()->fontMetrics();
    QFont boldFont = m_summaryGrid->font();
    boldFont.setBold(true);
    const QFontMetrics bold(boldFont);
    for (int c = 0; c < m_summaryModel->columnCount(); ++c) {
        int widest =
            metrics.horizontalAdvance(m_summaryModel->headerData(c, Qt::Horizontal).toString());
        for (int r = 0; r < m_summaryModel->rowCount(); ++r) {
            widest = std::max(
                widest, bold.horizontalAdvance(m_summaryModel->index(r, c).data().toString()));
        }
        m_summaryGrid->setColumnWidth(c, widest + 14);
    }
    // A group's band must hold its name: the last column of a narrow group
    // takes the missing room.
    const QFontMetrics band(boldFont);
    const int columns = m_summaryModel->columnCount();
    for (int first = 0; first < columns;) {
        const QString group =
            m_summaryModel->headerData(first, Qt::Horizontal, StringGridModel::GroupRole)
                .toString();
        int last = first;
        int width = m_summaryGrid->columnWidth(first);
        while (last + 1 < columns &&
               m_summaryModel->headerData(last + 1, Qt::Horizontal, StringGridModel::GroupRole)
                       .toString() == group) {
            ++last;
            width += m_summaryGrid->columnWidth(last);
        }
        const int needed = band.horizontalAdvance(group) + 16;
        if (width < needed) {
            m_summaryGrid->setColumnWidth(last, m_summaryGrid->columnWidth(last) + needed - width);
        }
        first = last + 1;
    }
}

void MainWindow::scrollToRow(int row) {
    if (m_model == nullptr || row < 1 || row > m_model->rowCount()) {
        return;
    }
    selectionFromLogic();
    m_grid->scrollTo(m_model->index(row - 1, 0), QAbstractItemView::PositionAtTop);
}

void MainWindow::setActiveModel(int modelId) {
    const QList<QAction *> entries = m_modelActions->actions();
    if (modelId >= 0 && modelId < entries.size()) {
        entries.at(modelId)->setChecked(true);
    }
}

QRect MainWindow::placement() const {
    return geometry();
}

void MainWindow::setPlacement(const QRect &placement) {
    setGeometry(placement);
}

// ---- Events --------------------------------------------------------------------------------

void MainWindow::closeEvent(QCloseEvent *event) {
    if (m_closeCheck && !m_closeCheck()) {
        event->ignore();
        return;
    }
    if (m_logic != nullptr && m_settings != nullptr) {
        m_logic->Form_Unload(*m_settings);
    }
    event->accept();
}

bool MainWindow::eventFilter(QObject *watched, QEvent *event) {
    const auto name = workflow::mainControlFromName(watched->objectName());
    if (!name || !workflow::isNumericField(*name) || control(*name) != watched) {
        return QMainWindow::eventFilter(watched, event);
    }
    if (event->type() == QEvent::KeyPress) {
        // Typed characters go through the key filter.
        if (refusedByKeyFilter(*static_cast<QKeyEvent *>(event))) {
            return true;
        }
    } else if (event->type() == QEvent::FocusOut && m_logic != nullptr) {
        // Switching to another window or opening a menu does not leave the field.
        const Qt::FocusReason reason = static_cast<QFocusEvent *>(event)->reason();
        if (reason != Qt::ActiveWindowFocusReason && reason != Qt::PopupFocusReason) {
            m_logic->leaveField(*name);
        }
    }
    return QMainWindow::eventFilter(watched, event);
}

// ---- The grid's selection -------------------------------------------------------------------

void MainWindow::selectionToLogic() {
    if (m_followingLogic || m_logic == nullptr) {
        return;
    }
    const QModelIndex current = m_grid->selectionModel()->currentIndex();
    const int currentRow = current.isValid() ? current.row() + 1 : 0;
    int first = currentRow;
    int last = currentRow;
    const QModelIndexList rows = m_grid->selectionModel()->selectedRows();
    if (!rows.isEmpty()) {
        first = rows.front().row() + 1;
        last = first;
        for (const QModelIndex &r : rows) {
            first = std::min(first, r.row() + 1);
            last = std::max(last, r.row() + 1);
        }
    }
    // The end of the selection is the row farthest from the current one.
    const int endRow = currentRow == first ? last : first;
    m_logic->select(currentRow, endRow);
}

void MainWindow::selectionFromLogic() {
    if (m_logic == nullptr || m_model == nullptr) {
        return;
    }
    const work::ProjectionTable &table = m_logic->table();
    m_followingLogic = true;
    QItemSelectionModel *selection = m_grid->selectionModel();
    const int current = table.currentRow();
    const int end = table.selectionEnd();
    if (current >= 1 && current <= m_model->rowCount()) {
        const int first = std::max(1, std::min(current, end));
        const int last = std::min(m_model->rowCount(), std::max(current, end));
        selection->setCurrentIndex(m_model->index(current - 1, 0), QItemSelectionModel::NoUpdate);
        selection->select(QItemSelection(m_model->index(first - 1, 0),
                                         m_model->index(last - 1, m_model->columnCount() - 1)),
                          QItemSelectionModel::ClearAndSelect);
    } else {
        selection->clear();
    }
    m_followingLogic = false;
}

void MainWindow::about() {
    QMessageBox::about(this, text::aboutTitle(), text::aboutText());
}

} // namespace arbolex::ui
