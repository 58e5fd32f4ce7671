#include "ui/npvwindow.hpp"

#include "economics/economicsmessages.hpp"
#include "economics/npvmessages.hpp"
#include "economics/npvwindowlogic.hpp"
#include "ui/fieldinput.hpp"
#include "ui/stringgridmodel.hpp"

#include <QApplication>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QScreen>
#include <QScrollBar>
#include <QTableView>
#include <QVBoxLayout>

namespace arbolex::ui {

using economics::NpvControl;
namespace et = economics::text;

namespace {
std::size_t slot(NpvControl c) {
    return static_cast<std::size_t>(c);
}
} // namespace

NpvWindow::NpvWindow(QWidget *main) : QDialog(main) {
    setObjectName(QStringLiteral("frmNPV"));
    setWindowTitle(et::npvCaption());
    setModal(false);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(12, 12, 12, 12);
    layout->setSpacing(10);

    m_grid = new QTableView(this);
    m_grid->setObjectName(QStringLiteral("NPV_Grid"));
    m_grid->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_grid->setSelectionMode(QAbstractItemView::SingleSelection);
    m_grid->setSelectionBehavior(QAbstractItemView::SelectItems);
    m_grid->setAlternatingRowColors(true);
    m_grid->verticalHeader()->hide();
    m_grid->verticalHeader()->setDefaultSectionSize(m_grid->fontMetrics().height() + 8);
    m_grid->horizontalHeader()->setDefaultAlignment(
        Qt::Alignment::fromInt(Qt::AlignCenter | Qt::TextWordWrap));
    m_grid->setToolTip(et::hintGrid());
    m_grid->installEventFilter(this);
    layout->addWidget(m_grid, 1);

    auto *bottom = new QHBoxLayout;
    bottom->setSpacing(10);
    auto *rateLabel = new QLabel(et::labelInterestRate(), this);
    auto *rate = new QLineEdit(this);
    rate->setObjectName(QStringLiteral("txtInterestRate"));
    rate->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    rate->setFixedWidth(rate->fontMetrics().horizontalAdvance(QStringLiteral("000.0000")) + 16);
    rate->installEventFilter(this);
    rateLabel->setBuddy(rate);
    auto *npvLabel = new QLabel(et::labelNetPresentValue(), this);
    auto *npv = new QLineEdit(this);
    npv->setObjectName(QStringLiteral("txtNPV"));
    npv->setReadOnly(true);
    npv->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    npv->setFixedWidth(npv->fontMetrics().horizontalAdvance(QStringLiteral("-00000000")) + 16);
    QFont bold = npv->font();
    bold.setBold(true);
    npv->setFont(bold);
    auto *compute = new QPushButton(et::buttonCompute(), this);
    compute->setObjectName(QStringLiteral("cmdNPV"));
    compute->setAutoDefault(false);
    auto *copy = new QPushButton(et::buttonCopy(), this);
    copy->setObjectName(QStringLiteral("CmdCopyToClipboard"));
    copy->setAutoDefault(false);
    auto *closeButton = new QPushButton(et::buttonClose(), this);
    closeButton->setObjectName(QStringLiteral("cmdClose"));
    closeButton->setAutoDefault(false);
    bottom->addWidget(rateLabel);
    bottom->addWidget(rate);
    bottom->addSpacing(16);
    bottom->addWidget(npvLabel);
    bottom->addWidget(npv);
    bottom->addStretch(1);
    bottom->addWidget(compute);
    bottom->addWidget(copy);
    m_economicsButton = new QPushButton(economics::economicstext::buttonEconomics(), this);
    m_economicsButton->setObjectName(QStringLiteral("cmdEconomics"));
    m_economicsButton->setToolTip(economics::economicstext::hintEconomics());
    m_economicsButton->setAutoDefault(false);
    bottom->addWidget(m_economicsButton);
    bottom->addWidget(closeButton);
    layout->addLayout(bottom);

    m_controls.at(slot(NpvControl::txtInterestRate)) = rate;
    m_controls.at(slot(NpvControl::txtNPV)) = npv;
    m_controls.at(slot(NpvControl::cmdNPV)) = compute;
    m_controls.at(slot(NpvControl::CmdCopyToClipboard)) = copy;
    m_controls.at(slot(NpvControl::cmdClose)) = closeButton;

    connect(compute, &QPushButton::clicked, this, [this] {
        if (m_logic != nullptr) {
            m_logic->cmdNPV_Click();
        }
    });
    connect(copy, &QPushButton::clicked, this, [this] {
        if (m_logic != nullptr) {
            m_logic->CmdCopyToClipboard_Click();
        }
    });
    connect(closeButton, &QPushButton::clicked, this, [this] {
        if (m_logic != nullptr) {
            m_logic->cmdClose_Click();
        }
    });
}

void NpvWindow::attach(economics::NpvWindowLogic &logic) {
    m_logic = &logic;
    m_model = new StringGridModel([&logic] { return logic.grid(); }, this);
    m_model->setTextColumns({work::kCfYear, work::kCfOperation});
    m_grid->setModel(m_model);
    connect(m_grid->selectionModel(), &QItemSelectionModel::currentChanged, this,
            [this](const QModelIndex &current) {
                if (!m_followingLogic && m_logic != nullptr && current.isValid()) {
                    m_logic->selectCell(current.row() + 1, current.column());
                }
            });
}

QWidget *NpvWindow::control(NpvControl c) const {
    return m_controls.at(slot(c));
}

QString NpvWindow::text(NpvControl c) const {
    if (auto *field = qobject_cast<QLineEdit *>(control(c))) {
        return field->text();
    }
    if (auto *button = qobject_cast<QPushButton *>(control(c))) {
        return button->text();
    }
    return {};
}

void NpvWindow::setText(NpvControl c, const QString &value) {
    if (auto *field = qobject_cast<QLineEdit *>(control(c))) {
        field->setText(value);
    } else if (auto *button = qobject_cast<QPushButton *>(control(c))) {
        button->setText(value);
    }
}

void NpvWindow::focus(NpvControl c) {
    focusControl(control(c));
}

void NpvWindow::gridChanged() {
    if (m_model == nullptr) {
        return;
    }
    emit cashFlowChanged();
    const bool reset = m_model->rowCount() != static_cast<int>(m_logic->grid().size()) - 1;
    m_model->refresh();
    if (reset) {
        fitColumns();
    }
}

void NpvWindow::fitColumns() {
    QHeaderView *header = m_grid->horizontalHeader();
    // Captions wrap onto two lines, so each column is as wide as its longer
    // half caption or its widest number.
    const QFontMetrics metrics = header->fontMetrics();
    int total = 0;
    for (int c = 0; c < m_model->columnCount(); ++c) {
        const QString caption = m_model->headerData(c, Qt::Horizontal).toString();
        const qsizetype paren = caption.indexOf(u'(');
        const QString widest = paren > 0 ? std::max(caption.left(paren), caption.mid(paren),
                                                    [&](auto &a, auto &b) {
                                                        return metrics.horizontalAdvance(a) <
                                                               metrics.horizontalAdvance(b);
                                                    })
                                         : caption;
        m_grid->resizeColumnToContents(c);
        const int width = std::max(m_grid->columnWidth(c), metrics.horizontalAdvance(widest) + 24);
        m_grid->setColumnWidth(c, c == work::kCfOperation ? std::max(width, 160) : width);
        total += m_grid->columnWidth(c);
    }
    header->setFixedHeight(metrics.height() * 2 + 14);
    const int scrollRoom = m_widened ? m_grid->verticalScrollBar()->sizeHint().width() : 0;
    m_grid->setMinimumWidth(total + 2 * m_grid->frameWidth() + scrollRoom);
}

void NpvWindow::setCurrentCell(int row, int column) {
    if (m_model == nullptr || row < 1 || row > m_model->rowCount()) {
        return;
    }
    m_followingLogic = true;
    const QModelIndex index = m_model->index(row - 1, column);
    m_grid->selectionModel()->setCurrentIndex(index, QItemSelectionModel::ClearAndSelect);
    m_grid->scrollTo(index);
    m_followingLogic = false;
}

void NpvWindow::setGridWidened(bool widened) {
    m_widened = widened;
    if (m_model != nullptr) {
        fitColumns();
    }
}

void NpvWindow::showWindow() {
    if (!isVisible()) {
        adjustSize();
        const QRect screen = parentWidget() != nullptr
                                 ? parentWidget()->screen()->availableGeometry()
                                 : QApplication::primaryScreen()->availableGeometry();
        resize(width(), std::min(screen.height() * 4 / 5, 640));
        move(screen.center() - rect().center());
    }
    show();
    raise();
    activateWindow();
    m_grid->setFocus();
}

void NpvWindow::close() {
    hide();
}

bool NpvWindow::isShown() const {
    return isVisible();
}

bool NpvWindow::eventFilter(QObject *watched, QEvent *event) {
    if (m_logic == nullptr) {
        return QDialog::eventFilter(watched, event);
    }
    if (watched == m_grid && event->type() == QEvent::KeyPress) {
        const auto *key = static_cast<QKeyEvent *>(event);
        if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter) {
            m_logic->NPV_Grid_KeyPress(u'\r');
            return true;
        }
        if (key->key() == Qt::Key_Backspace) {
            m_logic->NPV_Grid_KeyPress(u'\b');
            return true;
        }
        const QString typed = key->text();
        if (!typed.isEmpty() && typed.at(0).isPrint() &&
            !(key->modifiers() & (Qt::ControlModifier | Qt::AltModifier))) {
            for (const QChar c : typed) {
                m_logic->NPV_Grid_KeyPress(c);
            }
            return true;
        }
        if (key->matches(QKeySequence::Copy)) {
            m_logic->CmdCopyToClipboard_Click();
            return true;
        }
        return QDialog::eventFilter(watched, event);
    }
    if (watched == control(NpvControl::txtInterestRate)) {
        if (event->type() == QEvent::KeyPress) {
            const auto *key = static_cast<QKeyEvent *>(event);
            const QString typed = key->text();
            if (!typed.isEmpty() && typed.at(0).isPrint() &&
                !m_logic->txtInterestRate_KeyPress(typed.at(0))) {
                return true;
            }
        } else if (event->type() == QEvent::FocusOut) {
            const Qt::FocusReason reason = static_cast<QFocusEvent *>(event)->reason();
            if (reason != Qt::ActiveWindowFocusReason && reason != Qt::PopupFocusReason) {
                m_logic->txtInterestRate_LostFocus();
            }
        }
    }
    return QDialog::eventFilter(watched, event);
}

} // namespace arbolex::ui
