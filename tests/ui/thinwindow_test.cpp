// The thinning window wired to its logic and to the main window: the main
// window's Thin button, the fields' key filter, preview, accept, the ways out
// without a thinning, and the loop frame.
#include "guifixture.hpp"
#include "work/worktexts.hpp"

#include "shell/vbtext.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "ui/projectionmodel.hpp"
#include "ui/thinwindow.hpp"
#include "workflow/mainmessages.hpp"

#include <QAction>
#include <QActionGroup>
#include <QCheckBox>
#include <QPushButton>
#include <QScreen>

namespace arbolex::testing {
namespace {

using thinning::ThinControl;

/// The main window (model 0 of the start-up file: 15 years, 2500 stems/ha,
/// 7 m, 20 m²/ha) with the thinning window attached as in the program.
class ThinWindowGuiTest : public MainWindowGuiTest {
protected:
    ThinWindowGuiTest() { window.show(); }

    /// Grows to `age` by 5 and presses the main window's Thin button.
    void openThinningAt(const QString &age) {
        field(MainControl::txtToA)->setText(age);
        click(window.control(MainControl::cmdGrow));
        click(window.control(MainControl::cmdThin));
    }

    QWidget *thinControl(ThinControl c) const { return thinWindow.control(c); }
    double number(ThinControl c) const { return shell::val(thinWindow.text(c)); }
    int gridRows() const { return window.gridModel()->rowCount(); }
    QString rowLabel(int row) const {
        return window.gridModel()->headerData(row - 1, Qt::Vertical).toString();
    }
    QString noMessage() const {
        return interactive.messages.isEmpty() ? QString() : interactive.messages.front().text;
    }

    ui::ThinWindow &thinWindow = desktop.thinWindow();
    thinning::ThinWindowLogic &thin = session.thinning();
};

TEST_F(ThinWindowGuiTest, MainThinButtonIsOfferedByThinnedModelsOnly) {
    QWidget *button = window.control(MainControl::cmdThin);
    EXPECT_TRUE(button->isEnabled()); // model 0 is thinned

    const QList<QAction *> models = window.modelMenu()->actions();
    models[1]->trigger();
    EXPECT_FALSE(button->isEnabled());
    models[2]->trigger();
    EXPECT_TRUE(button->isEnabled());
}

TEST_F(ThinWindowGuiTest, FieldsKeepOnlyDigitsAndPointButStillEdit) {
    for (int c = 0; c < thinning::kThinControlCount; ++c) {
        const auto control = static_cast<ThinControl>(c);
        if (!thinning::isThinField(control)) {
            continue;
        }
        auto *edit = qobject_cast<QLineEdit *>(thinControl(control));
        ASSERT_NE(edit, nullptr) << thinning::controlName(control).toStdString();
        typeKeys(edit, QStringLiteral("1a2.b"));
        EXPECT_EQ(edit->text(), QStringLiteral("12."))
            << thinning::controlName(control).toStdString();
        pressKey(edit, Qt::Key_Backspace);
        pressKey(edit, Qt::Key_Left);
        typeKeys(edit, QStringLiteral("-5"));
        EXPECT_EQ(edit->text(), QStringLiteral("152"))
            << thinning::controlName(control).toStdString();
    }
}

TEST_F(ThinWindowGuiTest, OpensCentredOverTheMainWindowWithTheStandBeforeThinning) {
    // The offscreen screen is small: the main window hangs over its left edge
    // so that its centre leaves room for the thinning window around it.
    const QRect screen = window.screen()->availableGeometry();
    window.setPlacement(QRect(screen.center().x() - 600, screen.top() + 50, 1200, 600));
    openThinningAt(QStringLiteral("30"));
    ASSERT_EQ(noMessage(), QString());
    ASSERT_TRUE(thinWindow.isVisible());
    EXPECT_FALSE(thinWindow.isModal());
    EXPECT_TRUE(thinWindow.windowTitle().endsWith(QStringLiteral("Thinning at age 30")));
    const QPoint offset = thinWindow.frameGeometry().center() - window.frameGeometry().center();
    EXPECT_LE(offset.manhattanLength(), 2);

    const work::TableRow &last = logic.table().row(logic.table().lastRow());
    EXPECT_EQ(thinWindow.text(ThinControl::lblPreN), last.cells[work::kColStocking]);
    EXPECT_NEAR(number(ThinControl::lblPreV), last.record.volume, 0.01);
    EXPECT_TRUE(thinWindow.text(ThinControl::txtRemV).isEmpty());
    EXPECT_FALSE(thinControl(ThinControl::cmdAccept)->isEnabled()); // nothing previewed yet

    // Over a main window pushed to the screen's edge it stays whole on the screen.
    click(thinControl(ThinControl::cmdCancel));
    window.setPlacement(QRect(screen.right() - 300, screen.top() + 50, 1200, 600));
    click(window.control(MainControl::cmdThin));
    EXPECT_TRUE(screen.contains(thinWindow.frameGeometry()));
}

TEST_F(ThinWindowGuiTest, PreviewFillsThePostThinColumnAndAcceptWritesTheThinningRow) {
    openThinningAt(QStringLiteral("30"));
    const int rowsBefore = gridRows();
    typeKeys(thinControl(ThinControl::txtRemV), QStringLiteral("60"));
    click(thinControl(ThinControl::cmdThin));
    ASSERT_EQ(noMessage(), QString());

    EXPECT_NEAR(number(ThinControl::txtPostV), number(ThinControl::lblPreV) - 60.0, 0.005);
    EXPECT_NEAR(number(ThinControl::txtPostN) + number(ThinControl::txtRemN),
                number(ThinControl::lblPreN), 1.0); // each rounded to whole stems
    EXPECT_GT(number(ThinControl::lblPostD), number(ThinControl::lblPreD)); // small trees go
    EXPECT_FALSE(thinWindow.text(ThinControl::lblRemMV).isEmpty());
    EXPECT_EQ(gridRows(), rowsBefore); // a preview writes nothing
    ASSERT_TRUE(thinControl(ThinControl::cmdAccept)->isEnabled());

    const QString postN = thinWindow.text(ThinControl::txtPostN);
    click(thinControl(ThinControl::cmdAccept));
    EXPECT_FALSE(thinWindow.isVisible());
    ASSERT_EQ(gridRows(), rowsBefore + 1);
    EXPECT_EQ(rowLabel(gridRows()), work::text::rowLabelThinning());
    EXPECT_EQ(window.gridModel()->data(window.gridModel()->index(gridRows() - 1, 0)).toString(),
              QStringLiteral("30"));
    // The next grow continues from the thinned stand.
    EXPECT_EQ(window.text(MainControl::txtFromN), postN);
}

// Escape and the close button are the tool window base's (toolwindow_test.cpp).
TEST_F(ThinWindowGuiTest, ClearAndCancelLeaveTheTableAlone) {
    openThinningAt(QStringLiteral("30"));
    const int rows = gridRows();
    thinWindow.setText(ThinControl::txtRemB, QStringLiteral("10"));
    click(thinControl(ThinControl::cmdThin));
    ASSERT_FALSE(thinWindow.text(ThinControl::lblPostD).isEmpty());
    click(thinControl(ThinControl::cmdClear));
    for (ThinControl c : {ThinControl::txtRemB, ThinControl::txtPostB, ThinControl::lblPostD,
                          ThinControl::lblRemMV}) {
        EXPECT_TRUE(thinWindow.text(c).isEmpty()) << thinning::controlName(c).toStdString();
    }
    EXPECT_FALSE(thinWindow.text(ThinControl::lblPreD).isEmpty());
    EXPECT_FALSE(thinControl(ThinControl::cmdAccept)->isEnabled());

    click(thinControl(ThinControl::cmdCancel));
    EXPECT_FALSE(thinWindow.isVisible());
    EXPECT_EQ(gridRows(), rows);
    EXPECT_EQ(noMessage(), QString());
}

TEST_F(ThinWindowGuiTest, LoopControlsFollowActivateLoopAndLoopThinsEveryFewYears) {
    openThinningAt(QStringLiteral("20"));
    auto *activate = qobject_cast<QCheckBox *>(thinControl(ThinControl::chkActivLoop));
    const ThinControl loopControls[] = {ThinControl::txtThinFreq, ThinControl::txtThinUntil,
                                        ThinControl::cmdLoop};
    const auto loopEnabled = [&](bool on) {
        for (ThinControl c : loopControls) {
            EXPECT_EQ(thinControl(c)->isEnabled(), on) << thinning::controlName(c).toStdString();
        }
        EXPECT_TRUE(activate->isEnabled()); // the switch stays live
    };
    // The first thinning of a projection is never offered as a loop.
    EXPECT_TRUE(interactive.questions.isEmpty());
    EXPECT_FALSE(activate->isChecked());
    loopEnabled(false);
    click(activate);
    loopEnabled(true);
    click(activate);
    loopEnabled(false);
    click(activate);

    typeKeys(thinControl(ThinControl::txtRemV), QStringLiteral("30"));
    click(thinControl(ThinControl::cmdThin));
    typeKeys(thinControl(ThinControl::txtThinFreq), QStringLiteral("5"));
    typeKeys(thinControl(ThinControl::txtThinUntil), QStringLiteral("30"));
    click(thinControl(ThinControl::cmdLoop));
    ASSERT_EQ(noMessage(), QString());

    // Thinnings at 20, 25 and 30 (their rows: thinrows_test.cpp), and the
    // window open on the next one.
    int thinnings = 0;
    for (int r = 1; r <= gridRows(); ++r) {
        thinnings += rowLabel(r) == work::text::rowLabelThinning() ? 1 : 0;
    }
    EXPECT_EQ(thinnings, 3);
    EXPECT_TRUE(thinWindow.isVisible());

    // The next time the window opens after a thinning, the loop is offered.
    click(thinControl(ThinControl::cmdCancel));
    interactive.answers = {false};
    click(window.control(MainControl::cmdThin));
    EXPECT_EQ(interactive.questions.size(), 1);
    EXPECT_FALSE(activate->isChecked());
    loopEnabled(false);
}

} // namespace
} // namespace arbolex::testing
