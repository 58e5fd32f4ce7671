// The assortment windows wired to their logic: the main window's Assort
// button and menu entry, the thinning window's three Assort buttons, the
// report's buttons, the categories window, and the assortment rows in the grid.
#include "guifixture.hpp"

#include "assortments/assortmessages.hpp"
#include "assortments/assortuserlogic.hpp"
#include "assortments/assortwindowlogic.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "ui/assortuserwindow.hpp"
#include "ui/assortwindow.hpp"
#include "ui/projectionmodel.hpp"
#include "ui/thinwindow.hpp"

#include <QAction>
#include <QCheckBox>
#include <QPushButton>
#include <QTableView>
#include <QTableWidget>

namespace arbolex::testing {
namespace {

using assortments::AssortControl;
using assortments::AssortUserControl;
using thinning::ThinControl;

class AssortWindowGuiTest : public MainWindowGuiTest {
protected:
    AssortWindowGuiTest() { window.show(); }

    void growTo(const QString &age) {
        field(MainControl::txtToA)->setText(age);
        click(window.control(MainControl::cmdGrow));
    }

    QString shown(AssortControl c) const { return assortWindow.text(c); }

    ui::ThinWindow &thinWindow = desktop.thinWindow();
    thinning::ThinWindowLogic &thin = session.thinning();
    ui::AssortWindow &assortWindow = desktop.assortWindow();
    assortments::AssortWindowLogic &assort = session.assort();
    ui::AssortUserWindow &userWindow = desktop.assortUserWindow();
    assortments::AssortUserLogic &user = session.assortUser();
};

TEST_F(AssortWindowGuiTest, AssortButtonReportsTheSelectedGrowthRow) {
    growTo(QStringLiteral("40"));
    logic.select(3, 3);
    click(window.control(MainControl::cmdAssort));
    ASSERT_TRUE(interactive.messages.isEmpty());
    EXPECT_TRUE(assortWindow.isVisible());
    EXPECT_EQ(assortWindow.windowTitle(), QStringLiteral("Assortment at age 25"));
    EXPECT_FALSE(shown(AssortControl::lblVol714).isEmpty());
    click(assortWindow.control(AssortControl::cmdOK));
    EXPECT_FALSE(assortWindow.isVisible());
}

TEST_F(AssortWindowGuiTest, ThinningButtonsKeepReportsAsRowsSpanningTheGrid) {
    growTo(QStringLiteral("30"));
    click(window.control(MainControl::cmdThin));
    qobject_cast<QLineEdit *>(thinWindow.control(ThinControl::txtRemV))
        ->setText(QStringLiteral("60"));
    click(thinWindow.control(ThinControl::cmdThin));
    for (int kind : {2, 1}) {
        click(thinWindow.assortButton(kind));
        ASSERT_TRUE(assortWindow.isVisible()) << kind;
        click(assortWindow.control(AssortControl::cmdAccept));
    }
    click(thinWindow.control(ThinControl::cmdAccept));
    ASSERT_TRUE(interactive.messages.isEmpty());

    const ui::ProjectionModel *model = window.gridModel();
    const int rows = model->rowCount();
    EXPECT_EQ(model->headerData(rows - 2, Qt::Vertical).toString(), QStringLiteral("AT yr"));
    EXPECT_EQ(model->headerData(rows - 1, Qt::Vertical).toString(), QStringLiteral("AP yr"));
    // The report reads as one line from the second column.
    const QString line = model->index(rows - 1, 1).data().toString();
    EXPECT_TRUE(line.startsWith(QStringLiteral("7-14(%) "))) << line.toStdString();
    EXPECT_TRUE(line.contains(QStringLiteral(">20(m3/ha) ")));
    const QTableView *grid = window.grid();
    EXPECT_EQ(grid->columnSpan(rows - 1, 1), model->columnCount() - 1);
    EXPECT_EQ(grid->columnSpan(rows - 3, 1), 1); // the thinning row
}

TEST_F(AssortWindowGuiTest, CategoriesWindowFromTheMenuSwitchesReportsToCategories) {
    window.assortUserAction()->trigger();
    ASSERT_TRUE(userWindow.isVisible());
    auto *name = qobject_cast<QLineEdit *>(userWindow.control(AssortUserControl::txtName, 4));
    ASSERT_NE(name, nullptr);
    EXPECT_EQ(name->text(), QStringLiteral("Stakes"));
    click(userWindow.control(AssortUserControl::chkUse, 4));
    click(userWindow.control(AssortUserControl::chkUserCategories, 0));
    click(userWindow.control(AssortUserControl::cmdOK, 0));
    ASSERT_TRUE(interactive.messages.isEmpty());
    EXPECT_FALSE(userWindow.isVisible());

    growTo(QStringLiteral("40"));
    logic.select(4, 4);
    click(window.control(MainControl::cmdAssort));
    EXPECT_TRUE(assortWindow.userTable()->isVisible());
    ASSERT_EQ(assortWindow.userTable()->rowCount(), 1);
    EXPECT_EQ(assortWindow.userTable()->item(0, 0)->text(), QStringLiteral("Stakes"));
    EXPECT_FALSE(assortWindow.control(AssortControl::lblVol714)->isVisible());
}

} // namespace
} // namespace arbolex::testing
