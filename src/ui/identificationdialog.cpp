#include "ui/identificationdialog.hpp"

#include "document/documentmessages.hpp"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QVBoxLayout>

namespace arbolex::ui {

namespace {

/// Longest name of a forest, compartment or sub-compartment, characters.
constexpr int kMaxNameLength = 200;

} // namespace

IdentificationDialog::IdentificationDialog(const work::SubCompartment &id, QWidget *parent)
    : QDialog(parent) {
    setObjectName(QStringLiteral("frmSubCompartment"));
    setWindowTitle(document::text::titleIdentification());
    const auto line = [this](const QString &value, const char *name) {
        auto *edit = new QLineEdit(value, this);
        edit->setObjectName(QLatin1String(name));
        edit->setMaxLength(kMaxNameLength);
        edit->setMinimumWidth(edit->fontMetrics().horizontalAdvance(QString(36, u'M')) / 2);
        return edit;
    };
    m_forest = line(id.forest, "txtForest");
    m_compartment = line(id.compartment, "txtCompartment");
    m_subCompartment = line(id.subCompartment, "txtSubCompartment");
    m_notes = new QPlainTextEdit(id.notes, this);
    m_notes->setObjectName(QStringLiteral("txtNotes"));
    m_notes->setTabChangesFocus(true);
    m_notes->setMinimumHeight(m_notes->fontMetrics().lineSpacing() * 5 + 12);

    auto *form = new QFormLayout;
    form->setHorizontalSpacing(12);
    form->setVerticalSpacing(8);
    form->addRow(document::text::captionForest() + u':', m_forest);
    form->addRow(document::text::captionCompartment() + u':', m_compartment);
    form->addRow(document::text::captionSubCompartment() + u':', m_subCompartment);
    form->addRow(document::text::captionNotes() + u':', m_notes);

    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(16, 16, 16, 12);
    layout->setSpacing(12);
    layout->addLayout(form);
    layout->addWidget(buttons);
}

work::SubCompartment IdentificationDialog::identification() const {
    return {m_forest->text().trimmed(), m_compartment->text().trimmed(),
            m_subCompartment->text().trimmed(), m_notes->toPlainText().trimmed()};
}

} // namespace arbolex::ui
