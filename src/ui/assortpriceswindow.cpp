#include "ui/assortpriceswindow.hpp"

#include "economics/assortpricesmessages.hpp"
#include "economics/assortpriceswindowlogic.hpp"
#include "economics/timberpricesmessages.hpp"
#include "ui/controltext.hpp"
#include "ui/fieldinput.hpp"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace arbolex::ui {

using economics::AssortPricesControl;
using economics::AssortPricesItem;
using economics::AssortPricesWindowLogic;

namespace {

/// Width of a price field, in digits of the window's font: room for "9999.99".
constexpr int kPriceDigits = 8;
/// Width of the description, in average characters of the window's font.
constexpr int kDescriptionChars = 46;

std::size_t at(int index) {
    return static_cast<std::size_t>(index);
}

QFont bold(QFont font) {
    font.setBold(true);
    return font;
}

} // namespace

AssortPricesWindow::AssortPricesWindow(QWidget *parent)
    : AssortPricesToolWindow(parent, QStringLiteral("frmAssortPrices"),
                             economics::text::assortPricesCaption(),
                             &AssortPricesWindowLogic::cmdCloseAsmtPrices_Click) {
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(16, 12, 16, 12);
    layout->setSpacing(14);

    m_description = new QLabel(this);
    m_description->setObjectName(QStringLiteral("lblAsmtDesc"));
    m_description->setTextFormat(Qt::PlainText);
    m_description->setWordWrap(true);
    m_description->setFixedWidth(fontMetrics().averageCharWidth() * kDescriptionChars);
    layout->addWidget(m_description);

    auto *grid = new QGridLayout;
    grid->setHorizontalSpacing(12);
    grid->setVerticalSpacing(6);
    auto *classHeading = new QLabel(economics::text::assortClassHeading(), this);
    auto *priceHeading = new QLabel(economics::text::assortPriceHeading(), this);
    classHeading->setFont(bold(classHeading->font()));
    priceHeading->setFont(bold(priceHeading->font()));
    grid->addWidget(classHeading, 0, 0, Qt::AlignRight);
    // Room on the left, so the captions stand a little in from the edge.
    grid->setColumnMinimumWidth(0, classHeading->sizeHint().width() + 24);
    grid->addWidget(priceHeading, 0, 1, Qt::AlignHCenter);
    for (int k = 0; k < rotation::kAssortmentClassCount; ++k) {
        auto *caption = new QLabel(this);
        caption->setObjectName(economics::controlName({AssortPricesControl::lblAsmtCat, k}));
        caption->setTextFormat(Qt::PlainText);
        caption->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
        m_captions.at(at(k)) = caption;
        grid->addWidget(caption, k + 1, 0);

        auto *field = new QLineEdit(this);
        field->setObjectName(economics::controlName({AssortPricesControl::txtAsmtVal, k}));
        field->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
        field->setFixedWidth(field->fontMetrics().horizontalAdvance(QString(kPriceDigits, u'0')) +
                             16);
        // Typing only through the key filter: no pasting, no dropping.
        field->setReadOnly(true);
        field->setContextMenuPolicy(Qt::NoContextMenu);
        field->setAcceptDrops(false);
        watchKeys(field); // in the order of their index
        m_fields.at(at(k)) = field;
        grid->addWidget(field, k + 1, 1);

        auto *product = new QLabel(economics::text::productOf(k), this);
        product->setEnabled(false); // a quiet note beside the price
        grid->addWidget(product, k + 1, 2);
    }
    grid->setColumnStretch(3, 1);
    layout->addLayout(grid);

    auto *commands = new QHBoxLayout;
    commands->setSpacing(8);
    commands->addStretch(1);
    m_change = new QPushButton(this);
    m_change->setObjectName(QStringLiteral("cmdChangeAsmtPrices"));
    m_close = new QPushButton(this);
    m_close->setObjectName(QStringLiteral("cmdCloseAsmtPrices"));
    for (QPushButton *button : {m_change, m_close}) {
        button->setAutoDefault(false);
        button->setMinimumWidth(
            button->fontMetrics().horizontalAdvance(economics::text::acceptChanges()) + 40);
        commands->addWidget(button);
    }
    layout->addLayout(commands);
    layout->setSizeConstraint(QLayout::SetFixedSize);

    connect(m_change, &QPushButton::clicked, this,
            [this] { run(&AssortPricesWindowLogic::cmdChangeAsmtPrices_Click); });
    connect(m_close, &QPushButton::clicked, this,
            [this] { run(&AssortPricesWindowLogic::cmdCloseAsmtPrices_Click); });
}

QWidget *AssortPricesWindow::control(AssortPricesItem item) const {
    switch (item.control) {
    case AssortPricesControl::txtAsmtVal:
        return m_fields.at(at(item.index));
    case AssortPricesControl::lblAsmtCat:
        return m_captions.at(at(item.index));
    case AssortPricesControl::lblAsmtDesc:
        return m_description;
    case AssortPricesControl::cmdChangeAsmtPrices:
        return m_change;
    case AssortPricesControl::cmdCloseAsmtPrices:
        return m_close;
    }
    return nullptr;
}

QString AssortPricesWindow::text(AssortPricesItem item) const {
    return controlText(control(item));
}

void AssortPricesWindow::setText(AssortPricesItem item, const QString &value) {
    setControlText(control(item), value);
}

void AssortPricesWindow::setPricesEditable(bool editable) {
    for (QLineEdit *field : m_fields) {
        field->setReadOnly(!editable);
    }
    if (editable) {
        m_fields.front()->setFocus();
    }
}

bool AssortPricesWindow::refusesKey(int field, const QKeyEvent &key) {
    return logic() != nullptr && refusedPriceKey(key, [&](QChar typed) {
               return logic()->txtAsmtVal_KeyPress(field, typed);
           });
}

} // namespace arbolex::ui
