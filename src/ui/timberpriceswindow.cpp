#include "ui/timberpriceswindow.hpp"

#include "economics/timberpricesmessages.hpp"
#include "economics/timberpriceswindowlogic.hpp"
#include "ui/controltext.hpp"
#include "ui/fieldinput.hpp"

#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QVBoxLayout>

namespace arbolex::ui {

using economics::kPriceBlockCount;
using economics::TimberPricesControl;
using economics::TimberPricesItem;
using economics::TimberPricesWindowLogic;
using prices::kPriceClassCount;

namespace {

std::size_t slot(TimberPricesControl c) {
    return static_cast<std::size_t>(c);
}

std::size_t at(int index) {
    return static_cast<std::size_t>(index);
}

/// Width of a price field, in digits of the window's font: room for "-9999.00".
constexpr int kPriceDigits = 8;

/// Rows of the grid of lists: the frame's title, the option button, the
/// description, a gap, then one row per price class and the frame's bottom.
constexpr int kTitleRow = 0;
constexpr int kOptionRow = 1;
constexpr int kDescriptionRow = 2;
constexpr int kFirstPriceRow = 4;
constexpr int kBottomRow = kFirstPriceRow + kPriceClassCount;

/// Columns of a block: margin, content, margin, gap to the next block. Column
/// 0 holds the class captions, column 1 is the gap after them.
constexpr int kColumnsPerBlock = 4;
constexpr int kFirstBlockColumn = 2;
constexpr int kFrameMargin = 10;
constexpr int kBlockGap = 10;

/// Option button and description of each block, in block order.
constexpr TimberPricesControl kOptions[kPriceBlockCount] = {
    TimberPricesControl::OptCurentPrices, TimberPricesControl::OptUserPrices,
    TimberPricesControl::OptNPVprices, TimberPricesControl::OptOvraPrices};
constexpr TimberPricesControl kDescriptions[kPriceBlockCount] = {
    TimberPricesControl::lblCTP, TimberPricesControl::lblUTP, TimberPricesControl::lblnpvTP,
    TimberPricesControl::lblOVRA_TP};

QFont bold(QFont font) {
    font.setBold(true);
    return font;
}

} // namespace

TimberPricesWindow::TimberPricesWindow(QWidget *main)
    : TimberPricesToolWindow(main, QStringLiteral("frmTimberPrices"),
                             economics::text::timberPricesCaption(),
                             &TimberPricesWindowLogic::cmdClosePricesList_Click) {
    // Wide enough for the longest option caption beside its indicator.
    m_blockWidth = fontMetrics().horizontalAdvance(economics::text::optNPVprices()) + 36;

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(14, 10, 14, 12);
    layout->setSpacing(12);
    layout->addLayout(buildLists());
    layout->addLayout(buildNotes());
    layout->addLayout(buildCommands());
    layout->setSizeConstraint(QLayout::SetFixedSize);

    // Keyboard order: the lists left to right, then the commands.
    QWidget *previous = nullptr;
    for (int b = 0; b < kPriceBlockCount; ++b) {
        QWidget *option = control({kOptions[b], 0});
        if (previous != nullptr) {
            setTabOrder(previous, option);
        }
        previous = option;
        for (int k = 0; k < kPriceClassCount; ++k) {
            QWidget *field = m_fields.at(at(b * kPriceClassCount + k));
            setTabOrder(previous, field);
            previous = field;
        }
    }
    setTabOrder(previous, control({TimberPricesControl::cmdChangePrices, 0}));
    setTabOrder(control({TimberPricesControl::cmdChangePrices, 0}),
                control({TimberPricesControl::cmdClosePricesList, 0}));
}

// ---- Building the window ------------------------------------------------------------

QLabel *TimberPricesWindow::addLabel(TimberPricesControl control, bool wrapped) {
    auto *label = new QLabel(this);
    label->setObjectName(economics::controlName({control, 0}));
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(wrapped);
    label->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    m_controls.at(slot(control)) = label;
    return label;
}

QLayout *TimberPricesWindow::buildLists() {
    // One grid for the captions and the four blocks, so every price lines up
    // with its class; each frame is drawn behind the cells of its block.
    auto *grid = new QGridLayout;
    grid->setHorizontalSpacing(0);
    grid->setVerticalSpacing(4);

    for (int b = 0; b < kPriceBlockCount; ++b) {
        auto *frame = new QGroupBox(this);
        frame->setObjectName(economics::controlName({TimberPricesControl::fraTimbPrice, b}));
        frame->setFont(bold(frame->font()));
        m_frames.at(at(b)) = frame;
        const int column = kFirstBlockColumn + b * kColumnsPerBlock;
        grid->addWidget(frame, kTitleRow, column, kBottomRow + 1, 3);
        grid->setColumnMinimumWidth(column, kFrameMargin);
        grid->setColumnMinimumWidth(column + 2, kFrameMargin);
        if (b + 1 < kPriceBlockCount) {
            grid->setColumnMinimumWidth(column + 3, kBlockGap);
        }
    }
    grid->setRowMinimumHeight(kTitleRow, fontMetrics().height() + 2);
    grid->setRowMinimumHeight(kFirstPriceRow - 1, 2);
    grid->setRowMinimumHeight(kBottomRow, 4);
    grid->setColumnMinimumWidth(1, 12);

    auto *heading = new QLabel(economics::text::classHeading(), this);
    heading->setFont(bold(heading->font()));
    heading->setAlignment(Qt::AlignRight | Qt::AlignBottom);
    grid->addWidget(heading, kDescriptionRow, 0);
    for (int k = 0; k < kPriceClassCount; ++k) {
        auto *caption = new QLabel(this);
        caption->setObjectName(economics::controlName({TimberPricesControl::lblTimbCat, k}));
        caption->setTextFormat(Qt::PlainText);
        caption->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
        m_categories.at(at(k)) = caption;
        grid->addWidget(caption, kFirstPriceRow + k, 0);
    }

    for (int b = 0; b < kPriceBlockCount; ++b) {
        const int column = kFirstBlockColumn + b * kColumnsPerBlock + 1;
        auto *option = new QRadioButton(this);
        option->setObjectName(economics::controlName({kOptions[b], 0}));
        m_controls.at(slot(kOptions[b])) = option;
        // Only the user's click reaches the handler; the logic checking the
        // button does not.
        const TimberPricesControl which = kOptions[b];
        connect(option, &QRadioButton::clicked, this, [this, which] {
            if (logic() != nullptr) {
                logic()->press(which);
            }
        });
        grid->addWidget(option, kOptionRow, column, Qt::AlignLeft | Qt::AlignTop);

        QLabel *description = addLabel(kDescriptions[b], true);
        description->setFixedWidth(m_blockWidth);
        grid->addWidget(description, kDescriptionRow, column, Qt::AlignLeft | Qt::AlignTop);

        for (int k = 0; k < kPriceClassCount; ++k) {
            const int index = b * kPriceClassCount + k;
            auto *field = new QLineEdit(this);
            field->setObjectName(economics::controlName({TimberPricesControl::txtTimbVal, index}));
            field->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
            field->setFixedWidth(
                field->fontMetrics().horizontalAdvance(QString(kPriceDigits, u'0')) + 16);
            // Only the user's own list ever takes typing, and only through
            // the key filter: no pasting, no dropping.
            field->setReadOnly(true);
            field->setContextMenuPolicy(Qt::NoContextMenu);
            field->setAcceptDrops(false);
            watchKeys(field); // in the order of their index
            m_fields.at(at(index)) = field;
            grid->addWidget(field, kFirstPriceRow + k, column, Qt::AlignHCenter);
        }
    }
    return grid;
}

QLayout *TimberPricesWindow::buildNotes() {
    auto *notes = new QGridLayout;
    notes->setHorizontalSpacing(10);
    notes->setVerticalSpacing(6);
    const std::pair<TimberPricesControl, TimberPricesControl> rows[] = {
        {TimberPricesControl::lblNote, TimberPricesControl::lblNote2},
        {TimberPricesControl::lblNote_OVRA1, TimberPricesControl::lblNote_OVRA2}};
    int r = 0;
    for (const auto &[heading, body] : rows) {
        QLabel *title = addLabel(heading, false);
        title->setFont(bold(title->font()));
        notes->addWidget(title, r, 0);
        notes->addWidget(addLabel(body, true), r, 1);
        ++r;
    }
    notes->setColumnStretch(1, 1);
    return notes;
}

QLayout *TimberPricesWindow::buildCommands() {
    auto *row = new QHBoxLayout;
    row->setSpacing(8);
    const auto add = [this, row](TimberPricesControl c) {
        auto *button = new QPushButton(this);
        button->setObjectName(economics::controlName({c, 0}));
        button->setAutoDefault(false);
        button->setMinimumWidth(
            button->fontMetrics().horizontalAdvance(economics::text::closePricesList()) + 40);
        m_controls.at(slot(c)) = button;
        row->addWidget(button);
        return button;
    };
    QPushButton *assortPrices = add(TimberPricesControl::cmdAssortPrices);
    QPushButton *carbonPrice = add(TimberPricesControl::cmdCarbonPrice);
    row->addStretch(1);
    QPushButton *change = add(TimberPricesControl::cmdChangePrices);
    QPushButton *closeList = add(TimberPricesControl::cmdClosePricesList);
    connect(assortPrices, &QPushButton::clicked, this,
            [this] { run(&TimberPricesWindowLogic::cmdAssortPrices_Click); });
    connect(carbonPrice, &QPushButton::clicked, this,
            [this] { run(&TimberPricesWindowLogic::cmdCarbonPrice_Click); });
    connect(change, &QPushButton::clicked, this,
            [this] { run(&TimberPricesWindowLogic::cmdChangePrices_Click); });
    connect(closeList, &QPushButton::clicked, this,
            [this] { run(&TimberPricesWindowLogic::cmdClosePricesList_Click); });
    return row;
}

// ---- ITimberPricesView ------------------------------------------------------------------

QWidget *TimberPricesWindow::control(TimberPricesItem item) const {
    switch (item.control) {
    case TimberPricesControl::txtTimbVal:
        return m_fields.at(at(item.index));
    case TimberPricesControl::lblTimbCat:
        return m_categories.at(at(item.index));
    case TimberPricesControl::fraTimbPrice:
        return m_frames.at(at(item.index));
    default:
        return m_controls.at(slot(item.control));
    }
}

QString TimberPricesWindow::text(TimberPricesItem item) const {
    return controlText(control(item));
}

void TimberPricesWindow::setText(TimberPricesItem item, const QString &value) {
    setControlText(control(item), value);
}

void TimberPricesWindow::setNegative(int field, bool negative) {
    QLineEdit *edit = m_fields.at(at(field));
    QPalette colours = edit->palette();
    colours.setColor(QPalette::Text,
                     negative ? QColor(255, 0, 0) : palette().color(QPalette::Text));
    edit->setPalette(colours);
}

bool TimberPricesWindow::isChecked(TimberPricesControl option) const {
    auto *button = qobject_cast<QRadioButton *>(control({option, 0}));
    return button != nullptr && button->isChecked();
}

void TimberPricesWindow::setChecked(TimberPricesControl option, bool checked) {
    if (auto *button = qobject_cast<QRadioButton *>(control({option, 0}))) {
        button->setChecked(checked);
    }
}

void TimberPricesWindow::setUserPricesEditable(bool editable) {
    const int first = prices::kUserPrices * kPriceClassCount;
    for (int k = 0; k < kPriceClassCount; ++k) {
        m_fields.at(at(first + k))->setReadOnly(!editable);
    }
}

// ---- Keys ---------------------------------------------------------------------------------

bool TimberPricesWindow::refusesKey(int field, const QKeyEvent &key) {
    return logic() != nullptr && refusedPriceKey(key, [&](QChar typed) {
               return logic()->txtTimbVal_KeyPress(field, typed);
           });
}

} // namespace arbolex::ui
