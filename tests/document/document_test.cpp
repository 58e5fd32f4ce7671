#include "document/documentfixture.hpp"

#include "document/documentreader.hpp"
#include "document/documentwriter.hpp"
#include "document/opendocument.hpp"

namespace arbolex::testing {
namespace {

/// A stand grown to 30, thinned by 60 m³/ha with the removal's assortment
/// kept as a row, and grown on to 40: growth, thinning and assortment rows.
constexpr const char *kGrownAndThinned = "model 0\n"
                                         "set txtFromA 15\n"
                                         "set txtFromN 2500\n"
                                         "set txtFromH 7\n"
                                         "set txtFromB 20\n"
                                         "set txtNetArea 10\n"
                                         "set txtToA 30\n"
                                         "set txtByA 5\n"
                                         "press cmdGrow\n"
                                         "press cmdThin\n"
                                         "set frmThin.txtRemV 60\n"
                                         "press frmThin.cmdThin\n"
                                         "press frmThin.cmdAssort(1)\n"
                                         "press frmAssort.cmdAccept\n"
                                         "press frmThin.cmdAccept\n"
                                         "set txtToA 40\n"
                                         "press cmdGrow";

/// From age 40: a second thinning, growing to 55, the final cut with its
/// cash flow, costs typed in and computed at 4 %.
constexpr const char *kToTheFinalCut = "answer no\n"
                                       "press cmdThin\n"
                                       "set frmThin.txtRemV 40\n"
                                       "press frmThin.cmdThin\n"
                                       "press frmThin.cmdAccept\n"
                                       "set txtToA 55\n"
                                       "press cmdGrow\n"
                                       "answer yes\n"
                                       "press cmdFinalCut\n"
                                       "press cmdNPV\n"
                                       "set frmNPV.txtInterestRate 4\n"
                                       "set frmNPV.NPV_Grid(1,1) Planting\n"
                                       "set frmNPV.NPV_Grid(1,2) 2500\n"
                                       "set frmNPV.NPV_Grid(3,4) 120.5\n"
                                       "press frmNPV.cmdNPV";

TEST_F(DocumentTest, OpeningContinuesExactlyAsWithoutTheSave) {
    auto first = newSession();
    first->run(QLatin1String(kGrownAndThinned));
    const document::Document saved = first->work();
    bool kinds[3] = {false, false, false};
    for (const work::TableRow &row : saved.rows) {
        kinds[static_cast<int>(row.kind)] = true;
    }
    ASSERT_TRUE(kinds[0] && kinds[1] && kinds[2]) << "growth, thinning and assortment rows";
    first->run(QStringLiteral("save ") + file(QStringLiteral("stand.arbolex")));

    auto second = newSession();
    second->run(QStringLiteral("open ") + file(QStringLiteral("stand.arbolex")));
    expectSameDocument(second->work(), saved);

    // Thinning, growing, the final cut and the cash flow go on identically.
    first->run(QLatin1String(kToTheFinalCut));
    second->run(QLatin1String(kToTheFinalCut));
    const document::Document felled = first->work();
    ASSERT_TRUE(felled.felled);
    ASSERT_FALSE(felled.cashFlow.empty());
    expectSameDocument(second->work(), felled);

    // The felled rotation and its cash flow come back as they were.
    first->run(QStringLiteral("save ") + file(QStringLiteral("felled.arbolex")));
    auto third = newSession();
    third->run(QStringLiteral("open ") + file(QStringLiteral("felled.arbolex")));
    expectSameDocument(third->work(), felled);
    EXPECT_FALSE(third->session.mainView().isEnabled(workflow::MainControl::cmdGrow));
    EXPECT_TRUE(third->session.mainView().isEnabled(workflow::MainControl::cmdNPV));
    // The window opened again shows the same grid in either session.
    first->run(QStringLiteral("press cmdNPV"));
    third->run(QStringLiteral("press cmdNPV"));
    EXPECT_EQ(third->session.npv().grid(), first->session.npv().grid());
}

TEST_F(DocumentTest, FileOpensWithItsFormatAndVersion) {
    auto session = newSession();
    session->run(QLatin1String(kGrownAndThinned));
    const QByteArray json = document::documentToJson(session->work());
    EXPECT_TRUE(json.startsWith("{\n    \"format\": \"ARBOLEX sub-compartment\",\n"
                                "    \"version\": 2,\n"));
    QString reason;
    const auto read = document::documentFromJson(json, reason);
    ASSERT_TRUE(read) << reason.toStdString();
    expectSameDocument(*read, session->work());
}

TEST_F(DocumentTest, CostsAreSavedAndAnOlderFileOpensWithTheDefaults) {
    auto first = newSession();
    first->run(QLatin1String(kGrownAndThinned));
    first->session.work().setCosts(2750.0, 12.5);
    first->run(QStringLiteral("save ") + file(QStringLiteral("costs.arbolex")));
    auto second = newSession();
    second->run(QStringLiteral("open ") + file(QStringLiteral("costs.arbolex")));
    EXPECT_EQ(second->session.work().establishmentCost(), 2750.0);
    EXPECT_EQ(second->session.work().annualCost(), 12.5);

    // A file written before the work had its costs: felled at 45, a cost of
    // 2500 typed into the first year of its cash flow.
    const QString old = file(QStringLiteral("version1.arbolex"));
    ASSERT_TRUE(
        QFile::copy(QStringLiteral(ARBOLEX_TEST_SOURCE "/document/version1-felled.arbolex"), old));
    QString reason;
    const auto read = document::readDocumentFile(old, reason);
    ASSERT_TRUE(read) << reason.toStdString();
    EXPECT_FALSE(read->establishmentCost.has_value());
    auto third = newSession();
    third->run(QStringLiteral("open ") + old);
    const document::Document opened = third->work();
    EXPECT_EQ(opened.rows, read->rows);
    EXPECT_EQ(opened.cashFlow, read->cashFlow);
    EXPECT_EQ(opened.interestRate, read->interestRate);
    // The shipped costs, and nothing to save for it.
    EXPECT_EQ(opened.establishmentCost, 3045.0);
    EXPECT_EQ(opened.annualCost, 0.0);
    EXPECT_FALSE(third->session.session().documents().isModified());
    // Its figures: the stand today is worth what its cash flow says.
    third->run(QStringLiteral("press cmdNPV\npress frmNPV.cmdNPV\npress cmdEconomics"));
    ASSERT_TRUE(third->session.economics().valued());
    EXPECT_EQ(*third->session.economics().value()->npv, third->session.work().cashFlow().SumNPV());
}

TEST_F(DocumentTest, ANumberJsonCannotHoldComesBack) {
    // A failed projection's row may hold what no JSON number can.
    document::Document d;
    work::TableRow row;
    row.kind = work::RowKind::Failed;
    row.cells = QStringList(work::kColumnCount, QString());
    row.record.volume = std::numeric_limits<float>::infinity();
    row.numbers[work::kNumCai] = std::numeric_limits<double>::quiet_NaN();
    d.rows.push_back(row);
    QString reason;
    const auto read = document::documentFromJson(document::documentToJson(d), reason);
    ASSERT_TRUE(read) << reason.toStdString();
    EXPECT_TRUE(std::isinf(read->rows.at(0).record.volume));
    EXPECT_TRUE(std::isnan(read->rows.at(0).numbers[work::kNumCai]));
}

TEST_F(DocumentTest, DocumentForAStandGrowsLikeTypedFields) {
    auto typed = newSession();
    typed->run(QStringLiteral("model 0\nset txtFromA 15\nset txtFromN 2500\nset txtFromH 7\n"
                              "set txtFromB 20\nset txtToA 40\nset txtByA 5\nset txtNetArea 10\n"
                              "press cmdGrow"));
    auto built = newSession();
    const rotation::Stand stand{0, 15.0f, 2500.0f, 7.0f, 20.0f};
    built->session.main().restore(document::documentForStand(
        built->session.work(), stand, {QStringLiteral("Kilbrack"), {}, {}, {}}, 40, 5, 10.0));
    built->run(QStringLiteral("press cmdGrow"));
    const auto builtRows = built->work().rows;
    const auto typedRows = typed->work().rows;
    ASSERT_EQ(builtRows.size(), typedRows.size());
    for (std::size_t r = 0; r < builtRows.size(); ++r) {
        EXPECT_EQ(builtRows[r].cells, typedRows[r].cells) << "row " << r + 1;
        EXPECT_EQ(builtRows[r].record, typedRows[r].record) << "row " << r + 1;
    }
    EXPECT_EQ(built->session.work().identification().forest, QStringLiteral("Kilbrack"));
}

} // namespace
} // namespace arbolex::testing
