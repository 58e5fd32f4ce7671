// The estate window: its rows are the command line's for the same estate and
// money, a cancelled run shows nothing of itself, a row not grown says why and
// cannot be opened, and an opened row is the regime a user would type.
#include "thinning/thinningfixture.hpp"

#include "cli/clirun.hpp"
#include "document/documentcontroller.hpp"
#include "estateio/gdallayer.hpp"
#include "estatewindow/estatewindowlogic.hpp"
#include "shell/testfiles.hpp"
#include "shell/vbformat.hpp"

#include <QCryptographicHash>

#include <map>

namespace arbolex::testing {
namespace {

using estatewindow::EstateResultsModel;

QString exampleEstate() {
    return QDir(QStringLiteral(ARBOLEX_DATA_SOURCE))
        .filePath(QStringLiteral("examples/estate.csv"));
}

QByteArray digestOf(const QString &path) {
    return QCryptographicHash::hash(readBytes(path), QCryptographicHash::Sha256);
}

class EstateWindowTest : public ThinningTest {
protected:
    EstateWindowTest() {
        documents.start();
        estate::RunSettings settings;
        settings.threads = 2;
        settings.chunkRows = 4;
        estateLogic.setRunSettings(settings);
    }

    int rowOf(const QString &id) {
        const auto &rows = estateLogic.model().rows();
        for (std::size_t i = 0; i < rows.size(); ++i) {
            if (rows[i].id == id) {
                return static_cast<int>(i);
            }
        }
        return -1;
    }

    /// The table's rows, each as one line (a failure shows which row differs).
    std::vector<std::string> tableCells() const {
        std::vector<std::string> all;
        for (int r = 1; r <= logic.table().lastRow(); ++r) {
            all.push_back(logic.table().row(r).cells.join(u'|').toStdString());
        }
        return all;
    }

    QString writeEstate(const char *name, const char *text) {
        const QString path = dir.filePath(QLatin1String(name));
        EXPECT_TRUE(writeBytes(path, text));
        return path;
    }

    document::DocumentController &documents = session.documents();
    estatewindow::EstateWindowLogic &estateLogic = session.estate();
};

#ifdef ARBOLEX_CLI_PATH
TEST_F(EstateWindowTest, RowsAndForecastAreTheCommandLinesAndTheInputIsOnlyRead) {
    const QByteArray before = digestOf(exampleEstate());
    work.cashFlow().setInterestRate(3.5);
    estateView.fileToChoose = exampleEstate();
    estateLogic.mnuOpenEstate_Click();
    ASSERT_TRUE(interactive.messages.isEmpty()) << interactive.messages.first().text.toStdString();
    EXPECT_EQ(estateView.resultChanges, 1);
    EXPECT_TRUE(estateView.shown);
    EXPECT_EQ(estateView.lastProgress, 12);
    EXPECT_EQ(digestOf(exampleEstate()), before);

    QTemporaryDir cliData;
    ASSERT_TRUE(copyShippedData(cliData.path()));
    const QString out = cliData.filePath(QStringLiteral("out"));
    const estate::EstateDefaults d = estateLogic.defaults();
    const cli::testing::Outcome r = cli::testing::runCli(
        {QStringLiteral("estate"), exampleEstate(), QStringLiteral("--out"), out,
         QStringLiteral("--year"), QString::number(d.year), QStringLiteral("--rate"),
         QStringLiteral("3.5"), QStringLiteral("--prices"), QStringLiteral("longterm"),
         QStringLiteral("--threads"), QStringLiteral("1"),
         // The window keeps every row's carbon; the program when asked.
         QStringLiteral("--carbon-price"), QStringLiteral("0")},
        cliData.path());
    ASSERT_LE(r.exitCode, 1) << r.err.toStdString();

    std::vector<std::string> names;
    const auto results = estateio::readTable(
        QDir(out).filePath(QStringLiteral("subcompartments.csv")).toStdString(), &names);
    const auto &rows = estateLogic.model().rows();
    ASSERT_EQ(rows.size(), results.size());
    for (std::size_t i = 0; i < rows.size(); ++i) {
        const std::vector<std::string> &cli = results[i];
        EXPECT_EQ(std::to_string(rows[i].line), cli[0]);
        EXPECT_EQ(rows[i].id.toStdString(), cli[1]);
        const std::vector<std::string> figures(
            cli.end() - static_cast<long>(rows[i].figures.size()), cli.end());
        EXPECT_EQ(rows[i].figures, figures) << "row " << i;
    }

    // The chart's bars are the forecast's lines by species.
    const auto forecast =
        estateio::readTable(QDir(out).filePath(QStringLiteral("forecast.csv")).toStdString());
    const charts::HarvestForecast &chart = estateLogic.forecast();
    ASSERT_FALSE(chart.empty());
    std::map<std::pair<int, QString>, double> cliBars;
    for (const auto &line : forecast) {
        if (line[1] != "all") {
            cliBars[{std::stoi(line[0]), QString::fromStdString(line[1])}] =
                std::stod(line[2]) + std::stod(line[3]);
        }
    }
    std::size_t bars = 0;
    for (qsizetype s = 0; s < chart.species.size(); ++s) {
        for (std::size_t y = 0; y < chart.years.size(); ++y) {
            const double v = chart.volumes[static_cast<std::size_t>(s)][y];
            const auto found = cliBars.find({chart.years[y], chart.species[s]});
            if (found == cliBars.end()) {
                EXPECT_EQ(v, 0.0);
                continue;
            }
            EXPECT_NEAR(v, found->second, 1e-6);
            ++bars;
        }
    }
    EXPECT_EQ(bars, cliBars.size());
}
#endif

TEST_F(EstateWindowTest, ACancelledRunShowsNothingOfItself) {
    estateView.onProgress = [this](long long done) {
        if (done > 0) {
            estateLogic.cancel();
        }
    };
    estateLogic.openEstate(exampleEstate());
    EXPECT_FALSE(estateLogic.running());
    EXPECT_EQ(estateLogic.model().rowCount(), 0);
    EXPECT_TRUE(estateLogic.forecast().empty());
    EXPECT_EQ(estateView.resultChanges, 0);
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_TRUE(interactive.messages.first().text.contains(QStringLiteral("cancelled")));

    // The next run is whole.
    estateView.onProgress = nullptr;
    estateLogic.openEstate(exampleEstate());
    EXPECT_EQ(estateLogic.model().rowCount(), 12);
}

TEST_F(EstateWindowTest, ARowNotGrownIsMarkedWithItsMessageAndCannotBeOpened) {
    const QString path =
        writeEstate("bad.csv", "id,model,age,stocking,top_height,basal_area,area_ha\n"
                               "A,0,15,2500,7,20,3\n"
                               "B,0,15,lots,7,20,3\n");
    estateLogic.openEstate(path);
    ASSERT_EQ(estateLogic.model().rowCount(), 2);
    const EstateResultsModel &model = estateLogic.model();
    const QModelIndex good = model.index(0, EstateResultsModel::kIdColumn);
    const QModelIndex bad = model.index(1, EstateResultsModel::kNpvColumn);
    EXPECT_FALSE(model.data(good, EstateResultsModel::kNotGrownRole).toBool());
    EXPECT_TRUE(model.data(bad, EstateResultsModel::kNotGrownRole).toBool());
    const QString message = model.rows()[1].message;
    EXPECT_FALSE(message.isEmpty());
    EXPECT_EQ(model.data(bad, Qt::ToolTipRole).toString(), message);
    EXPECT_EQ(model.cellText(1, EstateResultsModel::kStatusColumn), QStringLiteral("refused"));
    EXPECT_EQ(model.cellText(1, EstateResultsModel::kNpvColumn), QString());
    // A figure sorts by its number; a row without one has nothing to sort by.
    EXPECT_FALSE(model.data(bad, EstateResultsModel::kSortRole).isValid());
    EXPECT_EQ(
        model.data(model.index(0, EstateResultsModel::kNpvColumn), EstateResultsModel::kSortRole)
            .typeId(),
        QMetaType::Double);

    growTo(QStringLiteral("30"));
    const auto before = tableCells();
    estateLogic.openSubCompartment(1);
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_TRUE(interactive.messages.first().text.startsWith(QStringLiteral("FAULT - ")));
    EXPECT_TRUE(interactive.messages.first().text.contains(message));
    EXPECT_TRUE(interactive.questions.isEmpty());
    EXPECT_EQ(tableCells(), before);

    // A table without the columns of an estate changes nothing shown.
    estateLogic.openEstate(writeEstate("notanestate.csv", "name,age\nA,15\n"));
    ASSERT_EQ(interactive.messages.size(), 2);
    EXPECT_TRUE(interactive.messages.last().text.startsWith(QStringLiteral("FAULT - ")));
    EXPECT_EQ(estateLogic.model().rowCount(), 2);
}

TEST_F(EstateWindowTest, AnOpenedRowIsItsRegimeTypedByHandAsANewUnsavedDocument) {
    estateLogic.openEstate(exampleEstate());
    const int row = rowOf(QStringLiteral("GL-01"));
    ASSERT_GE(row, 0);
    const int rotation = estateLogic.model().rows()[static_cast<std::size_t>(row)].finalCutAge;
    ASSERT_GT(rotation, 30);

    // GL-01 by hand: the fixture's stand on 12.4 ha, 40 m³/ha every 5 years from 20.
    std::vector<int> ages;
    for (int age = 20; age < rotation; age += 5) {
        ages.push_back(age);
    }
    typeRotation(ages, {QStringLiteral("40")}, rotation, QStringLiteral("12.4"));
    ASSERT_TRUE(work.felled());
    const auto byHand = tableCells();
    const QString siteIndexByHand = work.siteIndexText();
    ASSERT_FALSE(siteIndexByHand.isEmpty());

    // Unsaved work: the question, and Cancel keeps it.
    const auto asked = interactive.questions.size();
    estateLogic.openSubCompartment(row);
    EXPECT_EQ(interactive.questions.size(), asked + 1);
    EXPECT_TRUE(work.identification().subCompartment.isEmpty());

    interactive.unsavedAnswers.append(shell::UnsavedChoice::Discard);
    estateLogic.openSubCompartment(row);
    EXPECT_TRUE(interactive.messages.isEmpty());
    EXPECT_EQ(tableCells(), byHand);
    EXPECT_EQ(work.siteIndexText(), siteIndexByHand);
    EXPECT_TRUE(work.felled());
    EXPECT_EQ(work.identification().subCompartment, QStringLiteral("GL-01"));
    EXPECT_TRUE(documents.path().isEmpty());
    EXPECT_EQ(documents.displayName(), QStringLiteral("GL-01"));
    EXPECT_TRUE(documents.isModified());
    EXPECT_TRUE(view.caption().contains(QStringLiteral("GL-01")));
}

TEST_F(EstateWindowTest, EveryRowOfTheExampleOpensGrownAndFelled) {
    estateLogic.openEstate(exampleEstate());
    for (int row = estateLogic.model().rowCount() - 1; row >= 0; --row) {
        interactive.unsavedAnswers.append(shell::UnsavedChoice::Discard);
        estateLogic.openSubCompartment(row);
        const auto &r = estateLogic.model().rows()[static_cast<std::size_t>(row)];
        EXPECT_TRUE(work.felled()) << r.id.toStdString();
        EXPECT_EQ(work.identification().subCompartment, r.id);
    }
    EXPECT_TRUE(interactive.messages.isEmpty()) << interactive.messages.value(0).text.toStdString();
}

} // namespace
} // namespace arbolex::testing
