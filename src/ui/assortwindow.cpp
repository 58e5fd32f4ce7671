#include "ui/assortwindow.hpp"

#include "assortments/assortmessages.hpp"
#include "assortments/assortwindowlogic.hpp"

#include <QFrame>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QTableWidget>
#include <QVBoxLayout>

namespace arbolex::ui {

using assortments::AssortControl;
namespace at = assortments::text;

namespace {

std::size_t slot(AssortControl c) {
    return static_cast<std::size_t>(c);
}

/// Width of a value label, in digits of the window's font: room for "99999.00".
constexpr int kValueDigits = 9;

} // namespace

AssortWindow::AssortWindow(QWidget *parent) : QDialog(parent) {
    setObjectName(QStringLiteral("frmAssort"));
    setModal(true);

    auto *title = new QLabel(this);
    title->setObjectName(assortments::controlName(AssortControl::lblDesc));
    QFont big = title->font();
    big.setBold(true);
    big.setPointSizeF(big.pointSizeF() * 1.25);
    title->setFont(big);
    m_controls.at(slot(AssortControl::lblDesc)) = title;

    m_fixed = buildFixed();
    m_userTable = new QTableWidget(this);
    m_userTable->setObjectName(QStringLiteral("grdUserAssort"));
    m_userTable->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_userTable->setSelectionMode(QAbstractItemView::NoSelection);
    m_userTable->verticalHeader()->hide();
    m_userTable->setAlternatingRowColors(true);
    m_userTable->setFocusPolicy(Qt::NoFocus);
    m_userTable->hide();

    m_notes = new QLabel(at::notesFixed(), this);
    m_notes->setWordWrap(true);
    m_notes->setForegroundRole(QPalette::PlaceholderText);

    auto *buttons = new QHBoxLayout;
    buttons->addStretch(1);
    QPushButton *ok = addButton(AssortControl::cmdOK, at::okButton(), at::okHint());
    QPushButton *accept = addButton(AssortControl::cmdAccept, at::acceptButton(), at::acceptHint());
    QPushButton *cancel = addButton(AssortControl::cmdCancel, at::cancelButton(), at::cancelHint());
    ok->setDefault(true);
    buttons->addWidget(ok);
    buttons->addWidget(accept);
    buttons->addWidget(cancel);
    const auto press = [this](AssortControl c) {
        if (m_logic != nullptr) {
            m_logic->press(c);
        }
    };
    connect(ok, &QPushButton::clicked, this, [press] { press(AssortControl::cmdOK); });
    connect(accept, &QPushButton::clicked, this, [press] { press(AssortControl::cmdAccept); });
    connect(cancel, &QPushButton::clicked, this, [press] { press(AssortControl::cmdCancel); });

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(16, 14, 16, 14);
    layout->setSpacing(10);
    layout->addWidget(title);
    layout->addWidget(m_fixed);
    layout->addWidget(m_userTable);
    layout->addWidget(m_notes);
    layout->addLayout(buttons);
    layout->setSizeConstraint(QLayout::SetFixedSize);
}

QPushButton *AssortWindow::addButton(AssortControl control, const QString &caption,
                                     const QString &hint) {
    auto *button = new QPushButton(caption, this);
    button->setObjectName(assortments::controlName(control));
    button->setToolTip(hint);
    button->setAutoDefault(false);
    button->setMinimumWidth(button->fontMetrics().horizontalAdvance(at::acceptButton()) + 48);
    m_controls.at(slot(control)) = button;
    return button;
}

QWidget *AssortWindow::buildFixed() {
    auto *page = new QFrame(this);
    page->setFrameStyle(QFrame::StyledPanel | QFrame::Sunken);
    auto *grid = new QGridLayout(page);
    grid->setContentsMargins(14, 10, 14, 10);
    grid->setHorizontalSpacing(18);
    grid->setVerticalSpacing(8);

    const auto add = [&](AssortControl c, int row, int column, Qt::Alignment align, bool bold) {
        auto *label = new QLabel(page);
        label->setObjectName(assortments::controlName(c));
        label->setAlignment(align | Qt::AlignVCenter);
        if (bold) {
            QFont f = label->font();
            f.setBold(true);
            label->setFont(f);
        } else if (column > 0) {
            label->setMinimumWidth(
                label->fontMetrics().horizontalAdvance(QString(kValueDigits, u'0')));
            label->setTextInteractionFlags(Qt::TextSelectableByMouse);
        }
        grid->addWidget(label, row, column);
        m_controls.at(slot(c)) = label;
    };
    auto *heading = new QLabel(at::topDiameterColumn(), page);
    QFont bold = heading->font();
    bold.setBold(true);
    heading->setFont(bold);
    grid->addWidget(heading, 0, 0);
    add(AssortControl::lblVol, 0, 1, Qt::AlignRight, true);
    add(AssortControl::lblPct, 0, 2, Qt::AlignRight, true);
    auto *rule = new QFrame(page);
    rule->setFrameShape(QFrame::HLine);
    rule->setFrameShadow(QFrame::Sunken);
    grid->addWidget(rule, 1, 0, 1, 3);
    const std::array<std::array<AssortControl, 3>, 3> rows{{
        {AssortControl::lbl714, AssortControl::lblVol714, AssortControl::lblPct714},
        {AssortControl::lbl1420, AssortControl::lblVol1420, AssortControl::lblPct1420},
        {AssortControl::lbl20, AssortControl::lblVol20, AssortControl::lblPct20},
    }};
    for (std::size_t r = 0; r < rows.size(); ++r) {
        const int row = static_cast<int>(r) + 2;
        add(rows[r][0], row, 0, Qt::AlignLeft, false);
        add(rows[r][1], row, 1, Qt::AlignRight, false);
        add(rows[r][2], row, 2, Qt::AlignRight, false);
    }
    return page;
}

QWidget *AssortWindow::control(AssortControl c) const {
    return m_controls.at(slot(c));
}

QString AssortWindow::text(AssortControl c) const {
    if (const auto *label = qobject_cast<QLabel *>(control(c))) {
        return label->text();
    }
    if (const auto *button = qobject_cast<QPushButton *>(control(c))) {
        return button->text();
    }
    return {};
}

void AssortWindow::setText(AssortControl c, const QString &text) {
    if (auto *label = qobject_cast<QLabel *>(control(c))) {
        label->setText(text);
    }
}

void AssortWindow::setCaption(const QString &caption) {
    setWindowTitle(caption);
}

void AssortWindow::showFixedClasses() {
    m_userReport.reset();
    m_userTable->hide();
    m_fixed->show();
    m_notes->show();
}

void AssortWindow::showUserReport(const assortments::UserReport &report) {
    m_userReport = report;
    m_userTable->clear();
    m_userTable->setColumnCount(static_cast<int>(report.header.size()));
    m_userTable->setRowCount(static_cast<int>(report.rows.size()));
    m_userTable->setHorizontalHeaderLabels(report.header);
    for (std::size_t r = 0; r < report.rows.size(); ++r) {
        const QStringList &cells = report.rows[r];
        for (qsizetype c = 0; c < cells.size(); ++c) {
            auto *item = new QTableWidgetItem(cells[c]);
            // Names and bounds read left to right, numbers line up on the right.
            item->setTextAlignment(c < 2 ? Qt::AlignLeft | Qt::AlignVCenter
                                         : Qt::AlignRight | Qt::AlignVCenter);
            m_userTable->setItem(static_cast<int>(r), static_cast<int>(c), item);
        }
    }
    m_userTable->resizeColumnsToContents();
    for (int c = 0; c < m_userTable->columnCount(); ++c) {
        m_userTable->setColumnWidth(c, m_userTable->columnWidth(c) + 16);
    }
    // The table is as large as its contents, so no scroll bar hides a row.
    int width = 2 * m_userTable->frameWidth();
    for (int c = 0; c < m_userTable->columnCount(); ++c) {
        width += m_userTable->columnWidth(c);
    }
    int height =
        2 * m_userTable->frameWidth() + m_userTable->horizontalHeader()->sizeHint().height();
    for (int r = 0; r < m_userTable->rowCount(); ++r) {
        height += m_userTable->rowHeight(r);
    }
    m_userTable->setFixedSize(width, height);
    m_fixed->hide();
    m_userTable->show();
    m_notes->hide();
}

void AssortWindow::showReport() {
    open();
    raise();
    activateWindow();
}

void AssortWindow::close() {
    hide();
}

bool AssortWindow::isShown() const {
    return isVisible();
}

void AssortWindow::reject() {
    if (m_logic != nullptr) {
        m_logic->cmdCancel_Click();
    } else {
        QDialog::reject();
    }
}

} // namespace arbolex::ui
