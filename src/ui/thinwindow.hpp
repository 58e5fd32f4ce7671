#pragma once

#include "thinning/ithinview.hpp"
#include "ui/toolwindow.hpp"

#include <array>

class QGridLayout;
class QLabel;
class QLineEdit;
class QPushButton;

namespace arbolex::thinning {
class ThinWindowLogic;
}

namespace arbolex::ui {

using ThinToolWindow = ToolWindow<thinning::IThinView, thinning::ThinWindowLogic>;

/// The thinning window `frmThin`: the stand before the thinning, the removal
/// and the stand after it side by side, the commands and the loop frame
/// `fraLoop`. It is not modal, so the projection table stays in view while a
/// thinning is prescribed. Everything it shows is set by its logic through
/// IThinView; everything the user does goes straight to the logic's handlers.
/// Escape and the title bar's close button are Cancel; typed characters of
/// the fields go through the numeric key filter.
class ThinWindow : public ThinToolWindow {
    Q_OBJECT
public:
    /// `main` is the window it opens over.
    explicit ThinWindow(QWidget *main = nullptr);

    /// Assort button `index` (0 pre-thin, 1 thinning, 2 post-thin).
    QPushButton *assortButton(int index) const {
        return m_assortButtons.at(static_cast<std::size_t>(index));
    }

    /// The widget of a control (the group box for `fraLoop`).
    QWidget *control(thinning::ThinControl control) const;

    // IThinView
    QString text(thinning::ThinControl control) const override;
    void setText(thinning::ThinControl control, const QString &text) override;
    using QDialog::setEnabled;
    void setEnabled(thinning::ThinControl control, bool enabled) override;
    bool isChecked(thinning::ThinControl control) const override;
    void setChecked(thinning::ThinControl control, bool checked) override;
    void focus(thinning::ThinControl control) override;

protected:
    bool refusesKey(int field, const QKeyEvent &key) override;

private:
    QWidget *buildDetails();
    QWidget *buildLoop();
    QLayout *buildCommands();
    QLineEdit *addField(thinning::ThinControl control, int digits);
    QLabel *addResult(thinning::ThinControl control);
    QPushButton *addButton(thinning::ThinControl control, const QString &caption,
                           const QString &hint);

    std::array<QWidget *, thinning::kThinControlCount> m_controls{};
    /// Captions inside the loop frame, greyed with the frame (the switch
    /// itself stays live, or the loop could never be switched on again).
    std::array<QLabel *, 2> m_loopCaptions{};
    std::array<QPushButton *, 3> m_assortButtons{};
};

} // namespace arbolex::ui
