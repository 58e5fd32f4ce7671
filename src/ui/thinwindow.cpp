#include "ui/thinwindow.hpp"
#include "ui/controltext.hpp"
#include "ui/fieldinput.hpp"

#include "assortments/assortmessages.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QCheckBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace arbolex::ui {

using thinning::ThinControl;
using thinning::ThinWindowLogic;

namespace {

std::size_t slot(ThinControl c) {
    return static_cast<std::size_t>(c);
}

/// Width of a stand value (field or label), in digits of the window's font:
/// room for "99999.00".
constexpr int kValueDigits = 8;
/// Width of a loop field, in digits: years.
constexpr int kLoopDigits = 4;

/// Rows of the details frame: the quantity and its control in each column
/// (Pre-thin, Thinning, Post-thin).
struct DetailRow {
    QString caption;
    std::array<ThinControl, 3> controls;
};

} // namespace

ThinWindow::ThinWindow(QWidget *main)
    : ThinToolWindow(main, QStringLiteral("frmThin"), text::thinTitle(),
                     &ThinWindowLogic::cmdCancel_Click) {
    auto *left = new QVBoxLayout;
    left->setSpacing(10);
    left->addWidget(buildDetails());
    left->addWidget(buildLoop());

    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(12, 10, 12, 12);
    layout->setSpacing(12);
    layout->addLayout(left);
    layout->addLayout(buildCommands());
    // The window is as large as its contents, no larger.
    layout->setSizeConstraint(QLayout::SetFixedSize);

    // Keyboard order: down each column as a forester fills a prescription,
    // then the loop, then the commands.
    const ThinControl order[] = {
        ThinControl::txtRemN,      ThinControl::txtRemB,      ThinControl::txtRemV,
        ThinControl::txtPostN,     ThinControl::txtPostB,     ThinControl::txtPostV,
        ThinControl::cmdThin,      ThinControl::cmdClear,     ThinControl::cmdAccept,
        ThinControl::cmdCancel,    ThinControl::chkActivLoop, ThinControl::txtThinFreq,
        ThinControl::txtThinUntil, ThinControl::cmdLoop};
    for (std::size_t i = 1; i < std::size(order); ++i) {
        setTabOrder(control(order[i - 1]), control(order[i]));
    }
}

// ---- Building the window ------------------------------------------------------------

QLineEdit *ThinWindow::addField(ThinControl control, int digits) {
    auto *field = new QLineEdit(this);
    field->setObjectName(thinning::controlName(control));
    field->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    field->setFixedWidth(field->fontMetrics().horizontalAdvance(QString(digits, u'0')) + 16);
    watchKeys(field);
    m_controls.at(slot(control)) = field;
    return field;
}

QLabel *ThinWindow::addResult(ThinControl control) {
    auto *label = new QLabel(this);
    label->setObjectName(thinning::controlName(control));
    label->setTextFormat(Qt::PlainText);
    label->setFrameStyle(QFrame::StyledPanel | QFrame::Sunken);
    label->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    label->setTextInteractionFlags(Qt::TextSelectableByMouse);
    // As wide and tall as the fields beside it, so rows and columns line up.
    const QLineEdit probe;
    label->setFixedWidth(label->fontMetrics().horizontalAdvance(QString(kValueDigits, u'0')) + 16);
    label->setFixedHeight(probe.sizeHint().height());
    label->setIndent(4);
    m_controls.at(slot(control)) = label;
    return label;
}

QPushButton *ThinWindow::addButton(ThinControl control, const QString &caption,
                                   const QString &hint) {
    auto *button = new QPushButton(caption, this);
    button->setObjectName(thinning::controlName(control));
    button->setToolTip(hint);
    button->setAutoDefault(false);
    button->setMinimumWidth(button->fontMetrics().horizontalAdvance(text::buttonThinAccept()) + 40);
    m_controls.at(slot(control)) = button;
    return button;
}

QWidget *ThinWindow::buildDetails() {
    auto *box = new QGroupBox(text::groupThinDetails(), this);
    box->setObjectName(QStringLiteral("fraThinDetails"));
    auto *grid = new QGridLayout(box);
    grid->setHorizontalSpacing(10);
    grid->setVerticalSpacing(6);

    const QString columns[] = {text::columnPreThin(), text::columnThinning(),
                               text::columnPostThin()};
    for (int c = 0; c < 3; ++c) {
        auto *heading = new QLabel(columns[c], box);
        QFont bold = heading->font();
        bold.setBold(true);
        heading->setFont(bold);
        heading->setAlignment(Qt::AlignCenter);
        grid->addWidget(heading, 0, c + 1);
    }
    auto *rule = new QFrame(box);
    rule->setFrameShape(QFrame::HLine);
    rule->setFrameShadow(QFrame::Sunken);
    grid->addWidget(rule, 1, 0, 1, 4);

    const DetailRow rows[] = {
        {text::rowThinStocking(),
         {ThinControl::lblPreN, ThinControl::txtRemN, ThinControl::txtPostN}},
        {text::rowThinBasalArea(),
         {ThinControl::lblPreB, ThinControl::txtRemB, ThinControl::txtPostB}},
        {text::rowThinVolume(),
         {ThinControl::lblPreV, ThinControl::txtRemV, ThinControl::txtPostV}},
        {text::rowThinMeanDbh(),
         {ThinControl::lblPreD, ThinControl::lblRemD, ThinControl::lblPostD}},
        {text::rowThinMeanVolume(),
         {ThinControl::lblPreMV, ThinControl::lblRemMV, ThinControl::lblPostMV}}};
    int r = 2;
    for (const DetailRow &row : rows) {
        grid->addWidget(new QLabel(row.caption, box), r, 0);
        for (std::size_t c = 0; c < row.controls.size(); ++c) {
            const ThinControl control = row.controls.at(c);
            QWidget *cell = thinning::isThinField(control)
                                ? static_cast<QWidget *>(addField(control, kValueDigits))
                                : static_cast<QWidget *>(addResult(control));
            grid->addWidget(cell, r, static_cast<int>(c) + 1, Qt::AlignHCenter);
        }
        ++r;
    }
    // One Assort button under each column: the crop before, the removal, the crop after.
    grid->addWidget(new QLabel(assortments::text::thinAssortRow(), box), r, 0);
    for (int c = 0; c < 3; ++c) {
        auto *button = new QPushButton(assortments::text::thinAssortButton(), box);
        button->setObjectName(QStringLiteral("cmdAssort(%1)").arg(c));
        button->setToolTip(assortments::text::thinAssortHint(c));
        button->setAutoDefault(false);
        button->setFixedWidth(m_controls.at(slot(ThinControl::lblPreN))->width());
        connect(button, &QPushButton::clicked, this, [this, c] {
            if (logic() != nullptr) {
                logic()->cmdAssort_Click(c);
            }
        });
        m_assortButtons.at(static_cast<std::size_t>(c)) = button;
        grid->addWidget(button, r, c + 1, Qt::AlignHCenter);
    }
    grid->setColumnMinimumWidth(0, box->fontMetrics().horizontalAdvance(text::rowThinBasalArea()) +
                                       12);
    return box;
}

QWidget *ThinWindow::buildLoop() {
    auto *box = new QGroupBox(text::groupLoop(), this);
    box->setObjectName(thinning::controlName(ThinControl::fraLoop));
    m_controls.at(slot(ThinControl::fraLoop)) = box;
    auto *row = new QHBoxLayout(box);
    row->setSpacing(8);

    auto *activate = new QCheckBox(text::checkActivLoop(), box);
    activate->setObjectName(thinning::controlName(ThinControl::chkActivLoop));
    m_controls.at(slot(ThinControl::chkActivLoop)) = activate;
    // Only the user's click reaches the handler; the logic setting the box
    // calls the handler itself.
    connect(activate, &QCheckBox::clicked, this,
            [this] { run(&ThinWindowLogic::chkActivLoop_Click); });
    row->addWidget(activate);
    row->addSpacing(16);

    const auto place = [&](std::size_t index, const QString &caption, ThinControl control) {
        auto *label = new QLabel(caption, box);
        QLineEdit *field = addField(control, kLoopDigits);
        label->setBuddy(field);
        m_loopCaptions.at(index) = label;
        row->addWidget(label);
        row->addWidget(field);
        row->addSpacing(10);
    };
    place(0, text::labelThinFreq(), ThinControl::txtThinFreq);
    place(1, text::labelThinUntil(), ThinControl::txtThinUntil);
    row->addStretch(1);

    QPushButton *loop = addButton(ThinControl::cmdLoop, text::buttonLoop(), QString());
    connect(loop, &QPushButton::clicked, this, [this] { run(&ThinWindowLogic::cmdLoop_Click); });
    row->addWidget(loop);
    return box;
}

QLayout *ThinWindow::buildCommands() {
    auto *commands = new QVBoxLayout;
    commands->setSpacing(6);
    QPushButton *thin =
        addButton(ThinControl::cmdThin, text::buttonThinThin(), text::hintThinThin());
    // Enter in a field previews the thinning.
    thin->setDefault(true);
    QPushButton *clear =
        addButton(ThinControl::cmdClear, text::buttonThinClear(), text::hintThinClear());
    QPushButton *accept =
        addButton(ThinControl::cmdAccept, text::buttonThinAccept(), text::hintThinAccept());
    QPushButton *cancel =
        addButton(ThinControl::cmdCancel, text::buttonThinCancel(), text::hintThinCancel());
    // The group box title sits above its first row: start the commands level
    // with the first row of values.
    commands->addSpacing(fontMetrics().height() + 6);
    commands->addWidget(thin);
    commands->addWidget(clear);
    commands->addStretch(1);
    commands->addWidget(accept);
    commands->addWidget(cancel);

    connect(thin, &QPushButton::clicked, this, [this] { run(&ThinWindowLogic::cmdThin_Click); });
    connect(clear, &QPushButton::clicked, this, [this] { run(&ThinWindowLogic::cmdClear_Click); });
    connect(accept, &QPushButton::clicked, this,
            [this] { run(&ThinWindowLogic::cmdAccept_Click); });
    connect(cancel, &QPushButton::clicked, this,
            [this] { run(&ThinWindowLogic::cmdCancel_Click); });
    return commands;
}

// ---- IThinView ------------------------------------------------------------------------------

QWidget *ThinWindow::control(ThinControl c) const {
    return m_controls.at(slot(c));
}

QString ThinWindow::text(ThinControl c) const {
    return controlText(control(c));
}

void ThinWindow::setText(ThinControl c, const QString &value) {
    setControlText(control(c), value);
}

void ThinWindow::setEnabled(ThinControl c, bool enabled) {
    if (c == ThinControl::fraLoop) {
        // The frame holds the switch that enables it: grey its captions, keep
        // the switch live.
        for (QLabel *caption : m_loopCaptions) {
            caption->setEnabled(enabled);
        }
        return;
    }
    if (QWidget *w = control(c)) {
        w->setEnabled(enabled);
    }
}

bool ThinWindow::isChecked(ThinControl c) const {
    auto *box = qobject_cast<QCheckBox *>(control(c));
    return box != nullptr && box->isChecked();
}

void ThinWindow::setChecked(ThinControl c, bool checked) {
    if (auto *box = qobject_cast<QCheckBox *>(control(c))) {
        box->setChecked(checked);
    }
}

void ThinWindow::focus(ThinControl c) {
    focusControl(control(c));
}

bool ThinWindow::refusesKey(int /*field*/, const QKeyEvent &key) {
    return refusedByKeyFilter(key);
}

} // namespace arbolex::ui
