// The main window wired to its logic: typing in the fields, leaving them, the
// grow and clear commands through their buttons, the other commands of the
// panel, the grid and its selection, the model menu and closing the window.
#include "guifixture.hpp"
#include "work/worktexts.hpp"

#include "engine/modeldescription.hpp"
#include "shell/testfiles.hpp"
#include "shell/vbformat.hpp"
#include "ui/projectionmodel.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainmessages.hpp"

#include <QAction>
#include <QActionGroup>
#include <QFocusEvent>
#include <QLabel>
#include <QPushButton>
#include <QTableView>

namespace arbolex::testing {
namespace {

using work::ProjectionTable;

void leave(QWidget *field, Qt::FocusReason reason) {
    QFocusEvent out(QEvent::FocusOut, reason);
    QApplication::sendEvent(field, &out);
}

TEST_F(MainWindowGuiTest, NumericFieldsKeepOnlyDigitsAndPointButStillEdit) {
    ASSERT_TRUE(dataCopied);
    for (int c = 0; c < workflow::kMainControlCount; ++c) {
        const auto control = static_cast<MainControl>(c);
        if (!workflow::isNumericField(control)) {
            continue;
        }
        QLineEdit *edit = field(control);
        ASSERT_NE(edit, nullptr) << workflow::controlName(control).toStdString();
        edit->clear();
        typeKeys(edit, QStringLiteral("1a2.b"));
        EXPECT_EQ(edit->text(), QStringLiteral("12."))
            << workflow::controlName(control).toStdString();
        pressKey(edit, Qt::Key_Backspace);
        pressKey(edit, Qt::Key_Left);
        typeKeys(edit, QStringLiteral("x5"));
        EXPECT_EQ(edit->text(), QStringLiteral("152"))
            << workflow::controlName(control).toStdString();
    }
}

TEST_F(MainWindowGuiTest, LeavingAgeOrHeightRunsTheLostFocusHandlers) {
    QLineEdit *height = field(MainControl::txtFromH);
    height->setText(QStringLiteral("52"));
    // Switching to another window does not leave the field.
    leave(height, Qt::ActiveWindowFocusReason);
    EXPECT_TRUE(interactive.messages.isEmpty());
    leave(height, Qt::TabFocusReason);
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, workflow::text::maximumHeight());

    height->setText(QStringLiteral("11"));
    leave(height, Qt::MouseFocusReason);
    const QString siteIndex = window.text(MainControl::lblSI);
    EXPECT_EQ(siteIndex, shell::formatNumber(grow.siteIndex(), u"#.0"));
    field(MainControl::txtFromA)->setText(QStringLiteral("30"));
    leave(field(MainControl::txtFromA), Qt::TabFocusReason);
    EXPECT_EQ(window.text(MainControl::lblSI), QStringLiteral("11.0")); // SI is the height at 30
    EXPECT_NE(siteIndex, window.text(MainControl::lblSI));
}

TEST_F(MainWindowGuiTest, GrowButtonFillsTheGridWithTheLogicsRows) {
    click(window.control(MainControl::cmdGrow));
    ASSERT_TRUE(interactive.messages.isEmpty()) << interactive.messages[0].text.toStdString();
    EXPECT_EQ(QApplication::overrideCursor(), nullptr); // the hourglass is gone again

    const ProjectionTable &table = logic.table();
    const ui::ProjectionModel &model = *window.gridModel();
    ASSERT_EQ(model.rowCount(), 8); // ages 15 to 50 by 5
    ASSERT_EQ(model.rowCount(), table.rowCount() - 1);
    const std::vector<int> columns = table.visibleColumns();
    ASSERT_EQ(model.columnCount(), static_cast<int>(columns.size()));
    for (int c = 0; c < model.columnCount(); ++c) {
        const int column = columns[static_cast<std::size_t>(c)];
        EXPECT_EQ(model.headerData(c, Qt::Horizontal).toString(), table.caption(column));
        EXPECT_EQ(model.headerData(c, Qt::Horizontal, ui::ProjectionModel::GroupRole).toString(),
                  ProjectionTable::groupCaption(column));
        for (int r = 0; r < model.rowCount(); ++r) {
            // Separators stay blank whatever marker their cell holds.
            EXPECT_EQ(model.data(model.index(r, c)).toString(),
                      model.isSeparator(c) ? QString() : table.row(r + 1).cells[column])
                << "row " << r + 1 << " column " << column;
        }
    }
    EXPECT_EQ(model.data(model.index(0, 0)).toString(), QStringLiteral("15"));
    EXPECT_EQ(model.headerData(0, Qt::Vertical).toString(), work::text::rowLabelGrowth());

    // The grid follows the logic's current row: the last one.
    EXPECT_EQ(table.currentRow(), 8);
    EXPECT_EQ(window.grid()->currentIndex().row(), 7);
}

TEST_F(MainWindowGuiTest, GridSelectionGoesToTheLogicAndUseRowContinuesFromIt) {
    click(window.control(MainControl::cmdGrow));
    ASSERT_EQ(window.gridModel()->rowCount(), 8);
    QItemSelectionModel *selection = window.grid()->selectionModel();
    const auto flags = QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows;
    // Rows 5 to 3 selected upwards: row 3 is current, row 5 the far end.
    selection->setCurrentIndex(window.gridModel()->index(4, 0), flags);
    selection->select(
        QItemSelection(window.gridModel()->index(2, 0), window.gridModel()->index(4, 0)), flags);
    selection->setCurrentIndex(window.gridModel()->index(2, 0), QItemSelectionModel::NoUpdate);
    EXPECT_EQ(logic.table().currentRow(), 3);
    EXPECT_EQ(logic.table().selectionEnd(), 5);

    click(window.control(MainControl::cmdUseRow));
    EXPECT_EQ(window.text(MainControl::txtFromA), logic.table().row(3).cells[0]);
    EXPECT_EQ(window.text(MainControl::txtFromA), QStringLiteral("25"));
    EXPECT_EQ(window.text(MainControl::txtFromN), logic.table().row(3).cells[2]);
}

TEST_F(MainWindowGuiTest, ClearAllAndClearSwitchTheHeaderLayout) {
    click(window.control(MainControl::cmdGrow));
    const ui::ProjectionModel &model = *window.gridModel();
    ASSERT_EQ(model.columnCount(), work::kColumnCount);

    click(window.control(MainControl::cmdClearAll));
    EXPECT_EQ(model.rowCount(), 0);
    EXPECT_EQ(model.columnCount(), work::kColumnCount - 1); // no money column

    click(window.control(MainControl::cmdClear));
    EXPECT_EQ(model.columnCount(), work::kColumnCount);
}

TEST_F(MainWindowGuiTest, EveryCommandButtonRunsItsOwnHandler) {
    window.show();
    field(MainControl::txtToA)->setText(QStringLiteral("60"));
    click(window.control(MainControl::cmdGrow));
    click(window.control(MainControl::cmdThin));
    EXPECT_TRUE(desktop.thinWindow().isVisible());
    desktop.thinWindow().reject();
    click(window.control(MainControl::cmdAssort));
    EXPECT_TRUE(desktop.assortWindow().isVisible());
    desktop.assortWindow().hide();
    click(window.control(MainControl::cmdShowTimberPrice));
    EXPECT_TRUE(desktop.pricesWindow().isVisible());
    desktop.pricesWindow().reject();

    // Final Cut, its net present value accepted: NPV… opens the cash flow.
    click(window.control(MainControl::cmdFinalCut));
    EXPECT_TRUE(logic.table().row(logic.table().lastRow()).finalCut);
    ASSERT_TRUE(window.control(MainControl::cmdNPV)->isEnabled());
    click(window.control(MainControl::cmdNPV));
    EXPECT_TRUE(desktop.npvWindow().isVisible());

    click(window.control(MainControl::cmdSummary));
    EXPECT_TRUE(logic.showingSummary());
    click(window.control(MainControl::cmdSummary));
    EXPECT_FALSE(logic.showingSummary());

    // Delete Rows asks first; No keeps the rows.
    const int rows = logic.table().lastRow();
    interactive.answers = {false};
    click(window.control(MainControl::cmdDeleteRows));
    EXPECT_EQ(interactive.questions.size(), 2) << "the NPV question, then this one";
    EXPECT_EQ(logic.table().lastRow(), rows);
}

TEST_F(MainWindowGuiTest, ModelMenuListsTheCatalogueAndSwitchesTheModel) {
    const QList<QAction *> entries = window.modelMenu()->actions();
    ASSERT_EQ(entries.size(), engine::kModelCount);
    for (int id = 0; id < engine::kModelCount; ++id) {
        EXPECT_TRUE(entries[id]->text().contains(
            QString::fromLatin1(engine::catalogue()[static_cast<std::size_t>(id)].label)));
        EXPECT_TRUE(entries[id]->text().contains(QString::number(id)));
    }
    // Calibrations that share a label are told apart by their notes
    // (modeldescription_test.cpp), which the menu shows.
    EXPECT_TRUE(entries[16]->text().contains(QString::fromStdString(engine::modelMenuNote(16))));

    entries[3]->trigger();
    EXPECT_EQ(grow.modelId(), 3);
    EXPECT_TRUE(window.windowTitle().contains(QStringLiteral("MODEL IN USE :  NS - (UnThinned)")));
    EXPECT_EQ(window.modelMenu()->checkedAction(), entries[3]);

    // A model chosen elsewhere is marked in the menu too.
    window.SetModelFromfrmModelChoice(16);
    EXPECT_EQ(grow.modelId(), 16);
    EXPECT_EQ(window.modelMenu()->checkedAction(), entries[16]);
}

TEST_F(MainWindowGuiTest, ClosingTheWindowSavesPlacementAndStartupFile) {
    window.show();
    window.setPlacement(QRect(40, 60, 1160, 720));
    field(MainControl::txtFromA)->setText(QStringLiteral("22"));
    QFile::remove(dir.filePath(QStringLiteral("IFPRM1.dat")));
    // The changed field is unsaved work: the window asks, and it is discarded.
    interactive.unsavedAnswers = {shell::UnsavedChoice::Discard};
    window.close();
    EXPECT_EQ(interactive.questions.size(), 1);
    settings.sync();
    EXPECT_EQ(settings.value(QStringLiteral("Settings/MainWidth")).toInt(), 1160);
    EXPECT_EQ(settings.value(QStringLiteral("Settings/MainHeight")).toInt(), 720);
    EXPECT_TRUE(readBytes(dir.filePath(QStringLiteral("IFPRM1.dat"))).contains("22"));
}

} // namespace
} // namespace arbolex::testing
