// The printed report and the exported charts, made without a screen: what
// the report carries, the pages of the PDF, the files of a chart, and the
// command-line report.
#include "workflow/mainwindowfixture.hpp"

#include "charts/reportcontent.hpp"
#include "document/documentwriter.hpp"
#include "economics/economicsmessages.hpp"
#include "economics/economicswindowlogic.hpp"
#include "prices/pricedata.hpp"
#include "report/chartexport.hpp"
#include "report/reportwriter.hpp"
#include "shell/testfiles.hpp"

#include <QDir>
#include <QImage>
#include <QProcess>
#include <QRegularExpression>
#include <QStandardPaths>

namespace arbolex::testing {
namespace {

/// Pages of a PDF file: its page objects.
int pdfPages(const QString &path) {
    const QString pdf = QString::fromLatin1(readBytes(path));
    if (!pdf.startsWith(QLatin1String("%PDF"))) {
        return -1;
    }
    return static_cast<int>(pdf.count(QRegularExpression(QStringLiteral("/Type\\s*/Page\\b"))));
}

/// A Sitka spruce stand grown from 15 to 60 on 10 ha and felled, its net
/// present value accepted.
class ReportTest : public MainWindowTest {
protected:
    ReportTest() {
        prices::GetPricesFromFiles(QStringLiteral(ARBOLEX_DATA_SOURCE), prices.data(), log);
    }

    void closeRotation() {
        typeStand(QStringLiteral("60"));
        type(MainControl::txtNetArea, QStringLiteral("10"));
        logic.cmdGrow_Click();
        logic.cmdFinalCut_Click(); // the fake answers Yes to the NPV question
    }

    QString path(const QString &name) const { return QDir(dir.path()).filePath(name); }
};

TEST_F(ReportTest, ContentCarriesTheRotationAndLeavesTheWindowAsItWas) {
    closeRotation();
    const charts::ReportContent content = charts::reportContent(work);
    EXPECT_EQ(content.projection.rows.size(), static_cast<std::size_t>(logic.table().lastRow()));
    EXPECT_EQ(content.projection.captions.size(), content.projection.groups.size());
    EXPECT_FALSE(content.summary.empty());
    EXPECT_FALSE(logic.showingSummary()) << "the report fills the summary behind the scenes";
    // The group row names the group: captions do not repeat it.
    EXPECT_EQ(content.projection.captions.count(QStringLiteral("N/ha")), 3);
    ASSERT_EQ(content.cashFlow.rows.size(), 1U) << "only the year of the final cut earns";
    EXPECT_EQ(content.cashFlow.rows[0].first(), QStringLiteral("60"));
    EXPECT_FALSE(content.netPresentValue.isEmpty());
    EXPECT_EQ(content.interestRate, QStringLiteral("5.00"));
    EXPECT_EQ(content.yieldClass, view.text(MainControl::lblYC));
    // The stand the projection started from, whatever the fields show now.
    EXPECT_EQ(content.inputs.front().second, QStringLiteral("15"));
    EXPECT_FALSE(content.standChart.empty());
    // A culmination is marked exactly when the window shows a yield class.
    EXPECT_EQ(content.incrementChart.marks.empty(), content.yieldClass == QStringLiteral("0"));
    EXPECT_FALSE(content.cashFlowChart.empty());
}

TEST_F(ReportTest, PdfHoldsTheTextPagesThenOnePagePerChart) {
    closeRotation();
    const QString pdf = path(QStringLiteral("report.pdf"));
    const int pages =
        report::writeReportPdf(charts::reportContent(work), pdf, QStringLiteral("today"));
    EXPECT_GE(pages, 4); // at least one page of text and the three charts
    EXPECT_EQ(pdfPages(pdf), pages);

    // Before the final cut there is no cash flow and no chart of it.
    logic.cmdClear_Click();
    typeStand(QStringLiteral("30"));
    logic.cmdGrow_Click();
    const charts::ReportContent young = charts::reportContent(work);
    EXPECT_TRUE(young.cashFlow.empty());
    EXPECT_TRUE(young.cashFlowChart.empty());
    EXPECT_EQ(pdfPages(pdf), pages) << "unchanged until written again";
    const int youngPages = report::writeReportPdf(young, pdf, QStringLiteral("today"));
    EXPECT_EQ(pdfPages(pdf), youngPages);
    EXPECT_EQ(youngPages, 3) << "one page of text, stand and increments";
}

TEST_F(ReportTest, EconomicsPageOnlyWhileTheEconomicsWindowShowsTheTablesFigures) {
    closeRotation();
    economics::EconomicsWindowLogic &economics = session.economics();
    const QString pdf = path(QStringLiteral("economics.pdf"));
    const int plainPages = report::writeReportPdf(charts::reportContent(work), pdf, QString());
    EXPECT_FALSE(charts::reportContent(work, economics).economics)
        << "the economics window never valued the rotation";

    economics.cmdEconomics_Click();
    charts::ReportContent content = charts::reportContent(work, economics);
    ASSERT_TRUE(content.economics.has_value());
    const charts::EconomicsPage &page = *content.economics;
    EXPECT_EQ(page.title, QStringLiteral("Economics of the rotation at 5.00 % a year"));
    // The figures as the window shows them, in its order, then timber and carbon.
    const std::size_t valueFigures = economics::valueFigures().size();
    ASSERT_EQ(page.figures.size(), valueFigures + 3);
    EXPECT_EQ(page.figures.front().first, economics::economicstext::figureNpv());
    EXPECT_EQ(page.figures.front().second, economicsView.text(economics::EconomicsControl::lblNPV));
    EXPECT_EQ(page.figures[valueFigures - 1].second,
              economicsView.text(economics::EconomicsControl::lblYieldClass));
    EXPECT_EQ(page.figures.back().second,
              economicsView.text(economics::EconomicsControl::lblCarbonRotation));
    EXPECT_FALSE(page.rotations.empty());
    EXPECT_TRUE(page.regimes.empty()) << "the optimiser has not run";

    // The optimiser's regimes, then the user's own; captions on one line.
    economics.cmdOptimise_Click();
    content = charts::reportContent(work, economics);
    ASSERT_TRUE(content.economics.has_value());
    const charts::ReportTable &regimes = content.economics->regimes;
    ASSERT_EQ(regimes.rows.size(), economics.regimes().size() + 1);
    EXPECT_EQ(regimes.rows.back().first(), economics::economicstext::regimeYours());
    for (const QString &caption : regimes.captions) {
        EXPECT_FALSE(caption.contains(u'\n')) << caption.toStdString();
    }
    EXPECT_EQ(report::writeReportPdf(content, pdf, QString()), plainPages + 1);
    EXPECT_EQ(pdfPages(pdf), plainPages + 1);

    // A table changed since is not the one valued: no page until Compute.
    work.removeRowsFrom(logic.table().lastRow());
    EXPECT_FALSE(charts::reportContent(work, economics).economics);
    economics.cmdCompute_Click();
    EXPECT_TRUE(charts::reportContent(work, economics).economics);
    logic.ClearAll();
    EXPECT_FALSE(charts::reportContent(work, economics).economics);
    EXPECT_TRUE(interactive.messages.isEmpty());
}

TEST_F(ReportTest, ChartsExportAsPngAndSvgAndUnwritableFilesAreRefused) {
    closeRotation();
    const charts::ReportContent content = charts::reportContent(work);
    const QString nowhere = path(QStringLiteral("no-such-folder/file"));
    EXPECT_EQ(report::writeReportPdf(content, nowhere + QStringLiteral(".pdf"), QString()), 0);
    EXPECT_FALSE(report::saveChartPng(content.standChart, nowhere + QStringLiteral(".png"),
                                      QSize(400, 300)));
    EXPECT_FALSE(report::saveChartSvg(content.standChart, nowhere + QStringLiteral(".svg"),
                                      QSize(400, 300)));

    const QString png = path(QStringLiteral("stand.png"));
    ASSERT_TRUE(report::saveChartPng(content.standChart, png, QSize(640, 420)));
    const QImage image(png);
    EXPECT_EQ(image.size(), QSize(1280, 840)) << "twice the size, sharp in print";
    const QString svg = path(QStringLiteral("cash.svg"));
    ASSERT_TRUE(report::saveChartSvg(content.cashFlowChart, svg, QSize(640, 420)));
    const QString drawing = QString::fromUtf8(readBytes(svg));
    EXPECT_TRUE(drawing.contains(QLatin1String("<svg")));
    EXPECT_TRUE(drawing.contains(QLatin1String("<path"))) << "lines stay vectors";
}

#ifdef ARBOLEX_CLI_PATH
/// The Sitka spruce rotation of closeRotation() as a script of the runner.
constexpr char kRotationScript[] =
    "model 0\nset txtFromA 15\nset txtFromN 2500\nset txtFromH 7\n"
    "set txtFromB 20\nset txtNetArea 10\nset txtToA 60\nset txtByA 5\n"
    "press cmdGrow\nanswer yes\npress cmdFinalCut\n";

class ReportCommandTest : public ReportTest {
protected:
    ReportCommandTest() { EXPECT_TRUE(copyShippedData(dir.path())); }

    QString writeScript(const QString &name, const QByteArray &lines) const {
        EXPECT_TRUE(writeBytes(path(name), lines));
        return path(name);
    }

    /// `arbolex-cli report ARGUMENTS` on the test's data folder: its exit
    /// status and standard output.
    std::pair<int, QString> run(const QStringList &arguments) const {
        QProcess process;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.remove(QStringLiteral("QT_QPA_PLATFORM")); // it must not need a screen
        process.setProcessEnvironment(environment);
        process.start(QStringLiteral(ARBOLEX_CLI_PATH),
                      QStringList{QStringLiteral("report")} + arguments +
                          QStringList{QStringLiteral("--data-dir"), dir.path()});
        EXPECT_TRUE(process.waitForFinished(120000));
        return std::pair{process.exitCode(), QString::fromUtf8(process.readAllStandardOutput())};
    }
};

/// The text of pages `first` to `last` of a PDF, through poppler's pdftotext;
/// empty without it.
QString pdfText(const QString &pdf, int first, int last) {
    const QString tool = QStandardPaths::findExecutable(QStringLiteral("pdftotext"));
    if (tool.isEmpty()) {
        return {};
    }
    QProcess process;
    process.start(tool, {QStringLiteral("-f"), QString::number(first), QStringLiteral("-l"),
                         QString::number(last), pdf, QStringLiteral("-")});
    process.waitForFinished(60000);
    return QString::fromUtf8(process.readAllStandardOutput());
}

TEST_F(ReportCommandTest, CommandLineWritesTheSamePdfWithoutAScreen) {
    const QString script = writeScript(QStringLiteral("rotation.txt"), kRotationScript);
    const QString pdf = path(QStringLiteral("cli.pdf"));
    const auto [status, out] =
        run({QStringLiteral("--script"), script, QStringLiteral("--out"), pdf});
    ASSERT_EQ(status, 0) << out.toStdString();
    EXPECT_GE(pdfPages(pdf), 4);
    EXPECT_EQ(out, pdf + QStringLiteral("\t%1 pages\n").arg(pdfPages(pdf)));

    // A sub-compartment saved by the windows, with its identification.
    type(MainControl::txtNetArea, QStringLiteral("10"));
    typeStand(QStringLiteral("40"));
    logic.cmdGrow_Click();
    work.setIdentification(
        {QStringLiteral("Kilbrack"), QStringLiteral("12"), QStringLiteral("b"), QString()});
    const QString saved = path(QStringLiteral("kilbrack.arbolex"));
    QString reason;
    ASSERT_TRUE(document::writeDocumentFile(saved, work.snapshot(), reason))
        << reason.toStdString();
    EXPECT_EQ(charts::reportContent(work).forest, QStringLiteral("Kilbrack"));
    EXPECT_EQ(run({saved, QStringLiteral("--out"), pdf}).first, 0);
    EXPECT_EQ(pdfPages(pdf), 3) << "text, stand and increments: no cash flow yet";

    EXPECT_EQ(run({QStringLiteral("--script"), script}).first, 2) << "no --out";
    EXPECT_EQ(run({saved, QStringLiteral("--script"), script, QStringLiteral("--out"), pdf}).first,
              2)
        << "a document or a script, not both";
    EXPECT_EQ(run({path(QStringLiteral("none.arbolex")), QStringLiteral("--out"), pdf}).first, 2);
    EXPECT_EQ(run({QStringLiteral("--script"), path(QStringLiteral("none.txt")),
                   QStringLiteral("--out"), pdf})
                  .first,
              2);
}

TEST_F(ReportCommandTest, ScriptThatValuedTheRotationAddsTheEconomicsPage) {
    if (QStandardPaths::findExecutable(QStringLiteral("pdftotext")).isEmpty()) {
        GTEST_SKIP() << "no pdftotext (poppler-utils) to read the pages";
    }
    const QString plain = path(QStringLiteral("plain.pdf"));
    const QString valued = path(QStringLiteral("valued.pdf"));
    ASSERT_EQ(
        run({QStringLiteral("--script"), writeScript(QStringLiteral("plain.txt"), kRotationScript),
             QStringLiteral("--out"), plain})
            .first,
        0);
    const QByteArray economics = QByteArray(kRotationScript) +
                                 "press cmdEconomics\n"
                                 "set frmEconomics.txtInterestRate 3.00\n"
                                 "press frmEconomics.cmdCompute\n"
                                 "press frmEconomics.cmdOptimise\n";
    ASSERT_EQ(
        run({QStringLiteral("--script"), writeScript(QStringLiteral("economics.txt"), economics),
             QStringLiteral("--out"), valued})
            .first,
        0);
    const int pages = pdfPages(valued);
    ASSERT_EQ(pages, pdfPages(plain) + 1);
    EXPECT_FALSE(pdfText(plain, 1, pdfPages(plain)).contains(QStringLiteral("Economics of")));
    // The economics page follows the charts; the carbon account of the felled
    // rotation comes after it, in both reports.
    int economicsPage = 0;
    for (int p = 1; p <= pages && economicsPage == 0; ++p) {
        if (pdfText(valued, p, p)
                .contains(QStringLiteral("Economics of the rotation at 3.00 % a year"))) {
            economicsPage = p;
        }
    }
    ASSERT_GT(economicsPage, 0);
    // Its figures are the window's (ReportTest); the carbon account follows.
    EXPECT_TRUE(pdfText(valued, economicsPage + 1, pages)
                    .contains(QStringLiteral("Carbon account of the rotation")));
}
#endif

} // namespace
} // namespace arbolex::testing
