// The headless runner's script language and the grow shortcut.
#include "cli/runnerfixture.hpp"
#include "mocks/programservices.hpp"
#include "mocks/qtprinters.hpp"
#include "shell/testfiles.hpp"

#include "cli/scriptrunner.hpp"

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <algorithm>

namespace arbolex::testing {
namespace {

TEST_F(RunnerTest, TypesPressesAndPrintsAsAUserWould) {
    ASSERT_TRUE(
        runScript(QStringLiteral("model 0  # Sitka spruce\n\n"
                                 "set txtFromA 1x5\nset txtFromN 2500\nset txtFromH 7\n"
                                 "set txtFromB 20\nset txtToA 25\nset txtByA 5\n"
                                 "press cmdGrow\nprint txtFromA\nprint lblSI\nprint flxMain"))
            .ok());
    const QStringList lines = printed();
    ASSERT_EQ(lines.size(), 2 + 4) << output.toStdString(); // two fields, header, three rows
    EXPECT_EQ(lines[0], QStringLiteral("25")) << "the key filter dropped the x";
    EXPECT_EQ(lines[1], QStringLiteral("16.0"));
    // Each row's label first, as a copied table has it; every line has the
    // header's fields, the first row's summary marker an empty cell.
    EXPECT_TRUE(lines[2].startsWith(QStringLiteral("Row\tAge\tTop Ht\tN/ha\tDBH\t BA")));
    for (qsizetype i = 2; i < lines.size(); ++i) {
        EXPECT_EQ(lines[i].count(QLatin1Char('\t')), 26) << lines[i].toStdString();
    }
    EXPECT_TRUE(lines[3].startsWith(QStringLiteral("G yr\t15\t7.0\t2500\t10.1\t20.0\t")));
}

TEST_F(RunnerTest, MessagesAndQuestionsArePrintedInOrder) {
    ASSERT_TRUE(run({QStringLiteral("set txtFromH 52"), QStringLiteral("press cmdGrow")}).ok());
    const QStringList lines = printed();
    ASSERT_EQ(lines.size(), 2);
    EXPECT_EQ(lines[0], QStringLiteral("MSG\tOSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT\t"
                                       "Maximum height alowed is 49\t48"));
    EXPECT_TRUE(lines[1].startsWith(QStringLiteral("MSG\t")));
    EXPECT_TRUE(lines[1].contains(QStringLiteral("Grow From AGE")));
}

TEST_F(RunnerTest, AWholeThinnedRotationCanBeScripted) {
    ASSERT_TRUE(runScript(QLatin1String(kYoungStand) +
                          QStringLiteral("set txtToA 30\nset txtByA 5\npress cmdGrow\n"
                                         "press cmdThin\nset frmThin.txtRemV 40\n"
                                         "press frmThin.cmdThin\nprint frmThin.txtRemV\n"
                                         "press frmThin.cmdAccept\n"
                                         // A second thinning window offers the loop: the
                                         // question needs an answer.
                                         "answer no\npress cmdThin\nprint frmThin.chkActivLoop\n"
                                         "press frmThin.cmdCancel\nprint flxMain"))
                    .ok())
        << outcome.error.toStdString();
    const QStringList lines = printed();
    EXPECT_EQ(lines[0], QStringLiteral("40.00"));
    EXPECT_TRUE(lines[1].startsWith(QStringLiteral("ASK\t")));
    EXPECT_TRUE(lines[1].endsWith(QStringLiteral("\tno")));
    EXPECT_TRUE(lines[1].contains(QStringLiteral("thinning only once\\r\\nOR ")));
    EXPECT_EQ(lines[2], QStringLiteral("0"));
    EXPECT_TRUE(lines.last().startsWith(QStringLiteral("T yr\t30\t16.0\t"))) << "the thinning row";
    EXPECT_TRUE(lines.last().contains(QStringLiteral("\t40\t")));
}

TEST_F(RunnerTest, ScriptErrorsNameTheirLine) {
    struct Case {
        QStringList lines;
        int line;
    };
    const Case cases[] = {
        {{QStringLiteral("model 0"), QStringLiteral("jump 3")}, 2},
        {{QStringLiteral("set txtNothing 5")}, 1},
        {{QStringLiteral("press frmThin.lblPreN")}, 1},
        {{QStringLiteral("select")}, 1},
        {{QStringLiteral("answer maybe")}, 1},
        {{QStringLiteral("print nowhere")}, 1},
        // The net present value window takes nothing until it is open.
        {{QStringLiteral("model 0"), QStringLiteral("set frmNPV.NPV_Grid(1,1) Planting")}, 2},
        {{QStringLiteral("press frmNPV.cmdNPV")}, 1},
    };
    for (const Case &c : cases) {
        EXPECT_EQ(run(c.lines).line, c.line) << c.lines.join(QLatin1Char('|')).toStdString();
        EXPECT_FALSE(outcome.error.isEmpty());
    }
}

TEST_F(RunnerTest, IncrementsOfAStandBeyondItsModelOverflow) {
    // Scots pine 43 m tall at 15: the volumes run away, and an increment's
    // terms no longer fit a whole number. That is the Overflow of the grid's
    // procedure, logged; the conversion it replaces was undefined, which the
    // sanitizer build (make test-asan) stops at.
    ASSERT_TRUE(runScript(QStringLiteral("model 8\nset txtFromA 15\nset txtFromN 2500\n"
                                         "set txtFromH 43\nset txtFromB 20\nset txtToA 50\n"
                                         "set txtByA 5\npress cmdGrow"))
                    .ok());
    const QStringList log = logMessages(dir.path());
    EXPECT_TRUE(std::any_of(log.begin(), log.end(), [](const QString &line) {
        return line.startsWith(QStringLiteral("Error 6 Overflow in line ")) &&
               line.endsWith(QStringLiteral(" in Misc.AppendGrid()"));
    })) << log.join(QLatin1Char('|')).toStdString();
}

TEST_F(RunnerTest, AQuestionWithoutAnAnswerStopsTheScript) {
    EXPECT_EQ(runScript(QLatin1String(kYoungStand) +
                        QStringLiteral("set txtToA 30\nset txtByA 5\npress cmdGrow\n"
                                       "press cmdThin\nset frmThin.txtRemV 40\n"
                                       "press frmThin.cmdThin\npress frmThin.cmdAccept\n"
                                       "press cmdThin"))
                  .line,
              13);
    EXPECT_TRUE(outcome.error.contains(QStringLiteral("no answer")));
}

QString cli() {
    return QStringLiteral(ARBOLEX_CLI_PATH);
}

TEST(RunnerProcessTest, ExitStatusAndTheSavedStartupFile) {
    QTemporaryDir dir;
    ASSERT_TRUE(copyShippedData(dir.path()));
    const QString script = dir.filePath(QStringLiteral("s.arb"));
    ASSERT_TRUE(writeBytes(script, "model 4\nset txtFromA 22\n"));
    QProcess p;
    p.start(cli(), {QStringLiteral("run"), script, QStringLiteral("--data-dir"), dir.path()});
    ASSERT_TRUE(p.waitForFinished());
    EXPECT_EQ(p.exitCode(), 0) << p.readAllStandardError().toStdString();
    const QList<QByteArray> values =
        readBytes(dir.filePath(QStringLiteral("IFPRM1.dat"))).split('\n');
    EXPECT_EQ(values.value(0).trimmed(), QByteArray("4")) << "the unload saved the model";
    EXPECT_EQ(values.value(1).trimmed(), QByteArray("22"));

    ASSERT_TRUE(writeBytes(script, "model 4\nfrobnicate\n"));
    p.start(cli(), {QStringLiteral("run"), script, QStringLiteral("--data-dir"), dir.path()});
    ASSERT_TRUE(p.waitForFinished());
    EXPECT_EQ(p.exitCode(), 2);
    EXPECT_TRUE(p.readAllStandardError().contains("s.arb:2:"));
}

// Its formats are checked with every command's (outputs_test.py).
TEST(GrowCommandTest, PrintsTheGridAndRefusesWhatTheWindowRefuses) {
    QTemporaryDir dir;
    const QStringList stand =
        QStringLiteral("grow --model 0 --age 15 --stocking 2500 --height 7 --dbh 10.09 --to 25 "
                       "--by 5 --data-dir")
            .split(QLatin1Char(' ')) +
        QStringList{dir.path()};
    QProcess p;
    p.start(cli(), stand);
    ASSERT_TRUE(p.waitForFinished());
    EXPECT_EQ(p.exitCode(), 0) << p.readAllStandardError().toStdString();
    const QStringList tsv =
        QString::fromUtf8(p.readAllStandardOutput()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    ASSERT_EQ(tsv.size(), 4);
    EXPECT_TRUE(tsv[1].startsWith(QStringLiteral("15\t7.0\t2500\t10.1\t20.0")))
        << "DBH completed BA";

    QStringList refused = stand;
    refused[refused.indexOf(QStringLiteral("7"))] = QStringLiteral("60");
    p.start(cli(), refused);
    ASSERT_TRUE(p.waitForFinished());
    EXPECT_EQ(p.exitCode(), 2);
    EXPECT_TRUE(p.readAllStandardError().contains("Maximum height alowed is 49"));
}

} // namespace
} // namespace arbolex::testing
