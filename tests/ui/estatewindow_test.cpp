// The estate window on the screen: the run goes beside the window, the table
// sorts by the figures' values, a double-click opens the row under the mouse
// whatever the order, rows not grown are marked, and the chart stacks species.
#include "estate/resulttable.hpp"
#include "guifixture.hpp"

#include "document/documentcontroller.hpp"
#include "estatewindow/estatewindowlogic.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "ui/estatewindow.hpp"
#include "ui/thinwindow.hpp"

#include <QBarCategoryAxis>
#include <QChartView>
#include <QDeadlineTimer>
#include <QStackedBarSeries>
#include <QTableView>

namespace arbolex::testing {
namespace {

using estatewindow::EstateResultsModel;

class EstateWindowGuiTest : public MainWindowGuiTest {
protected:
    EstateWindowGuiTest() {
        QFile example(QDir(QStringLiteral(ARBOLEX_DATA_SOURCE))
                          .filePath(QStringLiteral("examples/estate.csv")));
        QFile marked(dir.filePath(QStringLiteral("marked.csv")));
        EXPECT_TRUE(example.open(QIODevice::ReadOnly) && marked.open(QIODevice::WriteOnly));
        marked.write(example.readAll() + "XX-01,X,0,15,lots,7.0,20.0,,3.0,,,,,\n");
    }
    ~EstateWindowGuiTest() override { estateWindow.waitForWork(); }

    void runAndWait() {
        estate.openEstate(dir.filePath(QStringLiteral("marked.csv")));
        const QDeadlineTimer deadline(60000);
        while (estate.running() && !deadline.hasExpired()) {
            QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
        }
        QCoreApplication::processEvents();
    }

    document::DocumentController &documents = session.documents();
    ui::EstateWindow &estateWindow = desktop.estateWindow();
    estatewindow::EstateWindowLogic &estate = session.estate();
};

TEST_F(EstateWindowGuiTest, SortedTableOpensTheRowDoubleClickedAndMarksTheRefused) {
    runAndWait();
    ASSERT_TRUE(estateWindow.isVisible());
    QTableView *table = estateWindow.table();
    QAbstractItemModel *shown = table->model();
    ASSERT_EQ(shown->rowCount(), 13);

    // Highest NPV first: a number sort, not a text sort, and the refused row last.
    table->sortByColumn(EstateResultsModel::kNpvColumn, Qt::DescendingOrder);
    double best = 0.0;
    QString bestId;
    const auto &columns = estate::figureColumns();
    const auto npvColumn = static_cast<std::size_t>(
        std::find_if(columns.begin(), columns.end(),
                     [](const estate::ResultColumn &c) { return c.name == "npv_ha"; }) -
        columns.begin());
    for (const auto &row : estate.model().rows()) {
        const double npv = QString::fromStdString(row.figures.at(npvColumn)).toDouble();
        if (row.grown && npv > best) {
            best = npv;
            bestId = row.id;
        }
    }
    EXPECT_EQ(shown->index(0, EstateResultsModel::kIdColumn).data().toString(), bestId);
    EXPECT_EQ(shown->index(12, 0).data().toString(), QStringLiteral("XX-01"));
    table->sortByColumn(EstateResultsModel::kNpvColumn, Qt::AscendingOrder);
    const QModelIndex refused = shown->index(12, EstateResultsModel::kIdColumn);
    EXPECT_EQ(refused.data().toString(), QStringLiteral("XX-01"));
    EXPECT_TRUE(refused.data(Qt::BackgroundRole).value<QColor>().isValid());
    EXPECT_FALSE(refused.data(Qt::ToolTipRole).toString().isEmpty());
    EXPECT_FALSE(shown->index(0, 0).data(Qt::BackgroundRole).isValid());

    table->sortByColumn(EstateResultsModel::kNpvColumn, Qt::DescendingOrder);
    emit table->doubleClicked(shown->index(0, EstateResultsModel::kNpvColumn));
    EXPECT_EQ(work.identification().subCompartment, bestId);
    EXPECT_EQ(documents.displayName(), bestId);
    // The chart: one stacked set per species over every year of the forecast.
    const auto *view = estateWindow.findChild<QChartView *>();
    ASSERT_NE(view, nullptr);
    const auto *series = qobject_cast<QStackedBarSeries *>(view->chart()->series().value(0));
    ASSERT_NE(series, nullptr);
    EXPECT_EQ(series->count(), estate.forecast().species.size());
    const auto *years =
        qobject_cast<QBarCategoryAxis *>(view->chart()->axes(Qt::Horizontal).value(0));
    ASSERT_NE(years, nullptr);
    EXPECT_EQ(static_cast<std::size_t>(years->count()), estate.forecast().years.size());
}

} // namespace
} // namespace arbolex::testing
