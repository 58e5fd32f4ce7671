#include "ui/carbonpricewindow.hpp"

#include "economics/carbonpricemessages.hpp"
#include "economics/carbonpricewindowlogic.hpp"
#include "economics/timberpricesmessages.hpp"
#include "ui/controltext.hpp"
#include "ui/fieldinput.hpp"

#include <QButtonGroup>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QStyle>
#include <QTableWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace arbolex::ui {

using economics::CarbonPriceControl;
using economics::CarbonPriceWindowLogic;
using C = economics::CarbonPriceControl;
namespace ct = economics::carbontext;

namespace {

/// Width of the price field, in digits of the window's font: room for "10000.00".
constexpr int kPriceDigits = 9;
/// Width of the window's text, in average characters of its font.
constexpr int kTextChars = 124;
/// Tallest the constants' table grows before it scrolls, pixels.
constexpr int kTallestTable = 600;

std::size_t slot(C c) {
    return static_cast<std::size_t>(c);
}

QFont bold(QFont font) {
    font.setBold(true);
    return font;
}

} // namespace

CarbonPriceWindow::CarbonPriceWindow(QWidget *parent)
    : CarbonPriceToolWindow(parent, QStringLiteral("frmCarbonPrice"), ct::carbonPriceCaption(),
                            &CarbonPriceWindowLogic::cmdCloseCarbonPrice_Click) {
    const auto named = [this](C c, QWidget *widget) {
        widget->setObjectName(economics::carbonPriceControlName(c));
        m_controls.at(slot(c)) = widget;
        return widget;
    };
    const int textWidth = fontMetrics().averageCharWidth() * kTextChars;
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(16, 12, 16, 12);
    layout->setSpacing(12);

    auto *description = new QLabel(this);
    description->setTextFormat(Qt::PlainText);
    description->setWordWrap(true);
    description->setFixedWidth(textWidth);
    layout->addWidget(named(C::lblCarbonDesc, description));

    auto *priceRow = new QHBoxLayout;
    priceRow->setSpacing(8);
    auto *priceCaption = new QLabel(ct::labelPrice(), this);
    priceCaption->setFont(bold(priceCaption->font()));
    auto *price = new QLineEdit(this);
    price->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    price->setFixedWidth(price->fontMetrics().horizontalAdvance(QString(kPriceDigits, u'0')) + 16);
    // Typing only through the key filter: no pasting, no dropping.
    price->setReadOnly(true);
    price->setContextMenuPolicy(Qt::NoContextMenu);
    price->setAcceptDrops(false);
    watchKeys(price);
    priceCaption->setBuddy(price);
    priceRow->addWidget(priceCaption);
    priceRow->addWidget(named(C::txtCarbonPrice, price));
    priceRow->addWidget(new QLabel(ct::unitPrice(), this));
    priceRow->addStretch(1);
    layout->addLayout(priceRow);

    auto *payment = new QGridLayout;
    payment->setHorizontalSpacing(14);
    payment->setVerticalSpacing(6);
    auto *paid = new QLabel(ct::headingPayment(), this);
    paid->setFont(bold(paid->font()));
    payment->addWidget(paid, 0, 0, 1, 2);
    auto *options = new QButtonGroup(this);
    const std::array<std::pair<C, C>, 3> rows = {{{C::OptPaymentNone, C::lblPaymentNone},
                                                  {C::OptPaymentFlow, C::lblPaymentFlow},
                                                  {C::OptPaymentUnits, C::lblPaymentUnits}}};
    int r = 1;
    for (const auto &[option, explanation] : rows) {
        auto *button = new QRadioButton(this);
        options->addButton(button);
        const C which = option;
        // Only the user's click reaches the logic; the logic checking it does not.
        connect(button, &QRadioButton::clicked, this, [this, which] {
            if (logic() != nullptr) {
                logic()->press(which);
            }
        });
        payment->addWidget(named(option, button), r, 0);
        auto *line = new QLabel(this);
        line->setTextFormat(Qt::PlainText);
        line->setStyleSheet(QStringLiteral("color: #4a4a4a;"));
        payment->addWidget(named(explanation, line), r, 1);
        ++r;
    }
    payment->setColumnStretch(1, 1);
    layout->addLayout(payment);

    auto *heading = new QLabel(this);
    heading->setTextFormat(Qt::PlainText);
    heading->setWordWrap(true);
    heading->setFixedWidth(textWidth);
    heading->setFont(bold(heading->font()));
    layout->addWidget(named(C::lblConstants, heading));
    m_constants = new QTableWidget(this);
    m_constants->setObjectName(QStringLiteral("grdConstants"));
    m_constants->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_constants->setSelectionMode(QAbstractItemView::NoSelection);
    m_constants->setFocusPolicy(Qt::NoFocus);
    m_constants->setWordWrap(true);
    m_constants->verticalHeader()->hide();
    m_constants->horizontalHeader()->setStretchLastSection(true);
    m_constants->horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    m_constants->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_constants->setFixedWidth(textWidth);
    layout->addWidget(m_constants);

    auto *commands = new QHBoxLayout;
    commands->setSpacing(8);
    commands->addStretch(1);
    auto *change = new QPushButton(this);
    auto *close = new QPushButton(this);
    for (QPushButton *button : {change, close}) {
        button->setAutoDefault(false);
        button->setMinimumWidth(
            button->fontMetrics().horizontalAdvance(economics::text::acceptChanges()) + 40);
        commands->addWidget(button);
    }
    named(C::cmdChangeCarbonPrice, change);
    named(C::cmdCloseCarbonPrice, close);
    layout->addLayout(commands);
    layout->setSizeConstraint(QLayout::SetFixedSize);

    connect(change, &QPushButton::clicked, this,
            [this] { run(&CarbonPriceWindowLogic::cmdChangeCarbonPrice_Click); });
    connect(close, &QPushButton::clicked, this,
            [this] { run(&CarbonPriceWindowLogic::cmdCloseCarbonPrice_Click); });
    setEditable(false);
}

QWidget *CarbonPriceWindow::control(C c) const {
    return m_controls.at(slot(c));
}

QString CarbonPriceWindow::text(C c) const {
    return controlText(control(c));
}

void CarbonPriceWindow::setText(C c, const QString &value) {
    setControlText(control(c), value);
}

bool CarbonPriceWindow::isChecked(C option) const {
    const auto *button = qobject_cast<const QRadioButton *>(control(option));
    return button != nullptr && button->isChecked();
}

void CarbonPriceWindow::setChecked(C option, bool checked) {
    if (auto *button = qobject_cast<QRadioButton *>(control(option))) {
        button->setChecked(checked);
    }
}

void CarbonPriceWindow::setEditable(bool editable) {
    auto *price = static_cast<QLineEdit *>(control(C::txtCarbonPrice));
    price->setReadOnly(!editable);
    for (const C option : {C::OptPaymentNone, C::OptPaymentFlow, C::OptPaymentUnits}) {
        control(option)->setEnabled(editable);
    }
    if (editable) {
        focusControl(price);
    }
}

void CarbonPriceWindow::setConstants(const std::vector<QStringList> &grid) {
    m_constants->clear();
    if (grid.empty()) {
        m_constants->setRowCount(0);
        return;
    }
    const QStringList &captions = grid.front();
    m_constants->setColumnCount(static_cast<int>(captions.size()));
    m_constants->setHorizontalHeaderLabels(captions);
    m_constants->setRowCount(static_cast<int>(grid.size()) - 1);
    for (std::size_t r = 1; r < grid.size(); ++r) {
        for (qsizetype c = 0; c < grid[r].size(); ++c) {
            auto *item = new QTableWidgetItem(grid[r][c]);
            item->setTextAlignment(c == 1 ? (Qt::AlignRight | Qt::AlignTop)
                                          : (Qt::AlignLeft | Qt::AlignTop));
            m_constants->setItem(static_cast<int>(r) - 1, static_cast<int>(c), item);
        }
    }
    // The names and values as wide as they are; the sources take the rest and wrap.
    m_constants->resizeColumnToContents(0);
    m_constants->resizeColumnToContents(1);
    m_constants->setColumnWidth(0, m_constants->columnWidth(0) + 12);
    m_constants->setColumnWidth(1, m_constants->columnWidth(1) + 12);
    // Known before the window is first laid out, so the rows are as tall as
    // their wrapped sources; a table taller than the most it shows keeps room
    // for its scroll bar.
    const auto layOutRows = [this](int scrollBar) {
        m_constants->setColumnWidth(2, m_constants->width() - 2 * m_constants->frameWidth() -
                                           m_constants->columnWidth(0) -
                                           m_constants->columnWidth(1) - scrollBar);
        m_constants->resizeRowsToContents();
        int height =
            m_constants->horizontalHeader()->sizeHint().height() + 2 * m_constants->frameWidth();
        for (int row = 0; row < m_constants->rowCount(); ++row) {
            height += m_constants->rowHeight(row);
        }
        return height;
    };
    int height = layOutRows(0);
    if (height > kTallestTable) {
        m_constants->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
        height = layOutRows(style()->pixelMetric(QStyle::PM_ScrollBarExtent));
    } else {
        m_constants->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    }
    m_constants->setFixedHeight(std::min(height, kTallestTable));
}

bool CarbonPriceWindow::refusesKey(int, const QKeyEvent &key) {
    return logic() != nullptr && refusedPriceKey(key, [&](QChar typed) {
               return logic()->txtCarbonPrice_KeyPress(typed);
           });
}

} // namespace arbolex::ui
