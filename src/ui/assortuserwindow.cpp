#include "ui/assortuserwindow.hpp"

#include "assortments/assortmessages.hpp"
#include "assortments/assortuserlogic.hpp"

#include <QCheckBox>
#include <QDoubleValidator>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace arbolex::ui {

using assortments::AssortUserControl;
namespace at = assortments::text;

namespace {

/// Which of a category's three fields a control is.
std::size_t fieldSlot(AssortUserControl c) {
    return static_cast<std::size_t>(c) - static_cast<std::size_t>(AssortUserControl::txtName);
}

QString indexedName(AssortUserControl c, int index) {
    static const char *const names[] = {"txtName", "txtSmall", "txtBig", "chkUse"};
    return QLatin1String(names[static_cast<std::size_t>(c)]) + QLatin1Char('(') +
           QString::number(index) + QLatin1Char(')');
}

} // namespace

AssortUserWindow::AssortUserWindow(QWidget *parent) : QDialog(parent) {
    setObjectName(QStringLiteral("frmAssortUser"));
    setWindowTitle(at::userWindowCaption());
    setModal(true);

    auto *grid = new QGridLayout;
    grid->setHorizontalSpacing(12);
    grid->setVerticalSpacing(6);
    const QString headings[] = {QStringLiteral("#"), at::userName(), at::userSmallEnd(),
                                at::userBigEnd(), at::userInUse()};
    for (int c = 0; c < 5; ++c) {
        auto *heading = new QLabel(headings[c], this);
        QFont bold = heading->font();
        bold.setBold(true);
        heading->setFont(bold);
        grid->addWidget(heading, 0, c, c == 1 ? Qt::AlignLeft : Qt::AlignHCenter);
    }
    const int digitWidth = fontMetrics().horizontalAdvance(QStringLiteral("0000.0")) + 16;
    for (int i = 1; i <= prices::kUserCategoryCount; ++i) {
        auto &fields = m_fields.at(static_cast<std::size_t>(i - 1));
        grid->addWidget(new QLabel(QString::number(i), this), i, 0, Qt::AlignHCenter);
        for (const AssortUserControl c :
             {AssortUserControl::txtName, AssortUserControl::txtSmall, AssortUserControl::txtBig}) {
            auto *edit = new QLineEdit(this);
            edit->setObjectName(indexedName(c, i));
            if (c == AssortUserControl::txtName) {
                edit->setMinimumWidth(fontMetrics().horizontalAdvance(QString(22, u'n')));
            } else {
                edit->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
                edit->setFixedWidth(digitWidth);
                auto *validator = new QDoubleValidator(0.0, 999.0, 1, edit);
                validator->setLocale(QLocale::c());
                validator->setNotation(QDoubleValidator::StandardNotation);
                edit->setValidator(validator);
            }
            fields.at(fieldSlot(c)) = edit;
            grid->addWidget(edit, i, static_cast<int>(fieldSlot(c)) + 1,
                            c == AssortUserControl::txtName ? Qt::Alignment{} : Qt::AlignHCenter);
        }
        auto *use = new QCheckBox(this);
        use->setObjectName(indexedName(AssortUserControl::chkUse, i));
        m_use.at(static_cast<std::size_t>(i - 1)) = use;
        grid->addWidget(use, i, 4, Qt::AlignHCenter);
    }

    m_flag = new QCheckBox(at::userFlag(), this);
    m_flag->setObjectName(QStringLiteral("chkUserCategories"));
    auto *notes = new QLabel(at::userNotes(), this);
    notes->setWordWrap(true);
    notes->setForegroundRole(QPalette::PlaceholderText);

    auto *ok = new QPushButton(at::okButton(), this);
    ok->setObjectName(QStringLiteral("cmdOK"));
    ok->setDefault(true);
    auto *cancel = new QPushButton(at::cancelButton(), this);
    cancel->setObjectName(QStringLiteral("cmdCancel"));
    for (QPushButton *b : {ok, cancel}) {
        b->setMinimumWidth(b->fontMetrics().horizontalAdvance(at::cancelButton()) + 48);
    }
    connect(ok, &QPushButton::clicked, this, [this] {
        if (m_logic != nullptr) {
            m_logic->cmdOK_Click();
        }
    });
    connect(cancel, &QPushButton::clicked, this, &AssortUserWindow::reject);
    auto *buttons = new QHBoxLayout;
    buttons->addStretch(1);
    buttons->addWidget(ok);
    buttons->addWidget(cancel);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(16, 14, 16, 14);
    layout->setSpacing(10);
    layout->addLayout(grid);
    layout->addWidget(notes);
    layout->addWidget(m_flag);
    layout->addLayout(buttons);
    layout->setSizeConstraint(QLayout::SetFixedSize);
    notes->setMaximumWidth(grid->sizeHint().width());
}

QLineEdit *AssortUserWindow::field(AssortUserControl c, int index) const {
    if (!assortments::isPerCategory(c) || c == AssortUserControl::chkUse || index < 1 ||
        index > prices::kUserCategoryCount) {
        return nullptr;
    }
    return m_fields.at(static_cast<std::size_t>(index - 1)).at(fieldSlot(c));
}

QWidget *AssortUserWindow::control(AssortUserControl c, int index) const {
    if (c == AssortUserControl::chkUse) {
        return m_use.at(static_cast<std::size_t>(index - 1));
    }
    if (c == AssortUserControl::chkUserCategories) {
        return m_flag;
    }
    if (QLineEdit *edit = field(c, index)) {
        return edit;
    }
    return findChild<QWidget *>(c == AssortUserControl::cmdOK ? QStringLiteral("cmdOK")
                                                              : QStringLiteral("cmdCancel"));
}

QString AssortUserWindow::text(AssortUserControl c, int index) const {
    const QLineEdit *edit = field(c, index);
    return edit != nullptr ? edit->text() : QString();
}

void AssortUserWindow::setText(AssortUserControl c, int index, const QString &text) {
    if (QLineEdit *edit = field(c, index)) {
        edit->setText(text);
    }
}

bool AssortUserWindow::isChecked(AssortUserControl c, int index) const {
    const auto *box = qobject_cast<const QCheckBox *>(control(c, index));
    return box != nullptr && box->isChecked();
}

void AssortUserWindow::setChecked(AssortUserControl c, int index, bool checked) {
    if (auto *box = qobject_cast<QCheckBox *>(control(c, index))) {
        box->setChecked(checked);
    }
}

void AssortUserWindow::focus(AssortUserControl c, int index) {
    if (QWidget *w = control(c, index)) {
        w->setFocus();
        if (auto *edit = qobject_cast<QLineEdit *>(w)) {
            edit->selectAll();
        }
    }
}

void AssortUserWindow::showEditor() {
    open();
    raise();
    activateWindow();
}

void AssortUserWindow::close() {
    hide();
}

bool AssortUserWindow::isShown() const {
    return isVisible();
}

void AssortUserWindow::reject() {
    if (m_logic != nullptr) {
        m_logic->cmdCancel_Click();
    } else {
        QDialog::reject();
    }
}

} // namespace arbolex::ui
