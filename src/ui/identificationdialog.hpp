#pragma once

#include "work/subcompartment.hpp"

#include <QDialog>

class QLineEdit;
class QPlainTextEdit;

namespace arbolex::ui {

/// The "Sub-compartment" dialog: forest, compartment, sub-compartment and a
/// free note, the identification that heads every report.
class IdentificationDialog : public QDialog {
    Q_OBJECT
public:
    explicit IdentificationDialog(const work::SubCompartment &id, QWidget *parent = nullptr);

    work::SubCompartment identification() const;

private:
    QLineEdit *m_forest = nullptr;
    QLineEdit *m_compartment = nullptr;
    QLineEdit *m_subCompartment = nullptr;
    QPlainTextEdit *m_notes = nullptr;
};

} // namespace arbolex::ui
