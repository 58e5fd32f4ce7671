// The writers of every output: TSV and CSV keep each block rectangular
// whatever a cell holds, JSON carries the figures the tables print, and the
// document names the unit of every figure and records what produced it.
#include "cli/resultdocument.hpp"
#include "shell/testfiles.hpp"

#include <QDateTime>
#include <QFile>
#include <QJsonArray>
#include <QJsonObject>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <stdexcept>

namespace arbolex::cli {
namespace {

Table awkwardTable() {
    Table table({QStringLiteral("name"), QStringLiteral("note"), QStringLiteral("npv")});
    table.add({Value::word(QStringLiteral("A1")),
               Value::word(QStringLiteral("fenced, \"deer\"\tsee\r\nmap")),
               Value::money(1234.567)});
    table.add({Value::word(QStringLiteral(" B2")), Value(), Value::money(std::nullopt)});
    return table;
}

TEST(TextOutputTest, NoCellBreaksItsLineOrShiftsItsFields) {
    for (const Format format : {Format::kTsv, Format::kCsv}) {
        TextOutput text(format);
        text.comment(QStringLiteral("model"), Value::word(QStringLiteral("SS - (Thinned)")));
        text.table(awkwardTable());
        text.title(QStringLiteral("figures"));
        text.fields({{QStringLiteral("rate"), Value::number(3.0)}});
        const QByteArray expected =
            format == Format::kTsv
                ? QByteArrayLiteral("# model\tSS - (Thinned)\n"
                                    "name\tnote\tnpv\n"
                                    "A1\tfenced, \"deer\" see  map\t1234.57\n"
                                    " B2\t\t\n"
                                    "\n# figures\n"
                                    "rate\t3\n")
                : QByteArrayLiteral("# model,SS - (Thinned)\n"
                                    "name,note,npv\n"
                                    "A1,\"fenced, \"\"deer\"\"\tsee\r\nmap\",1234.57\n"
                                    "\" B2\",,\n"
                                    "\n# figures\n"
                                    "rate,3\n");
        EXPECT_EQ(text.bytes(), expected) << formatWord(format).toStdString();
    }
}

TEST(TextOutputTest, ARowMustFillItsTable) {
    Table table({QStringLiteral("age"), QStringLiteral("volume")});
    EXPECT_THROW(table.add({Value::whole(15)}), std::logic_error);
    EXPECT_TRUE(table.rows().empty());
}

TEST(ValueTest, JsonCarriesTheFigureTheTablePrints) {
    const Value single = Value::number(16.0144348f);
    EXPECT_EQ(single.text(), QStringLiteral("16.0144348"));
    EXPECT_EQ(single.json().toDouble(), 16.0144348);
    EXPECT_EQ(Value::money(11837.594).text(), QStringLiteral("11837.59"));
    EXPECT_EQ(Value::money(11837.594).json().toDouble(), 11837.59);
    EXPECT_EQ(Value::whole(2056).json().toDouble(), 2056.0);
    // An input comes back exactly, however many digits it needs.
    const double third = 1.0 / 3.0;
    EXPECT_EQ(Value::exact(third).json().toDouble(), third);
    EXPECT_EQ(Value::exact(third).text().toDouble(), third);
    // What has no figure: nothing in a table or JSON, or the table's word
    // for it and null in JSON.
    EXPECT_TRUE(Value::money(std::nullopt).text().isEmpty());
    EXPECT_TRUE(Value::money(std::nullopt).json().isNull());
    EXPECT_EQ(Value::note(QStringLiteral("no root")).text(), QStringLiteral("no root"));
    EXPECT_TRUE(Value::note(QStringLiteral("no root")).json().isNull());
    // A grid's cell: a number when it reads as one, its text when it does not.
    EXPECT_EQ(Value::printed(QStringLiteral(" 7.0")).json().toDouble(), 7.0);
    EXPECT_EQ(Value::printed(QStringLiteral("***")).json().toString(), QStringLiteral("***"));
    EXPECT_TRUE(Value::printed(QStringLiteral("\t")).json().isNull());
    EXPECT_EQ(Value::word(QStringLiteral("12")).json().toString(), QStringLiteral("12"));
}

TEST(ResultDocumentTest, NamesTheUnitOfEveryFigureWhereverItStands) {
    RunRecord run(QStringLiteral("rotation"));
    run.input(QStringLiteral("rate"), Value::exact(3.0));
    run.input(QStringLiteral("rate_range"), QJsonArray{2.0, 4.0});
    run.input(QStringLiteral("prices"), Value::word(QStringLiteral("longterm")));
    ResultDocument document(run);
    document.insert({{QStringLiteral("npv"), Value::money(100.0)},
                     {QStringLiteral("irr"), Value::note(QStringLiteral("no root"))},
                     {QStringLiteral("valuation"), Value::word(QStringLiteral("stand"))}});
    document.insert(QStringLiteral("thinnings"), awkwardTable().json());
    document.insert(QStringLiteral("final_cut"),
                    QJsonObject{{QStringLiteral("assortments"),
                                 QJsonObject{{QStringLiteral(">20 cm"), 12.5}}}});
    document.insert(QStringLiteral("gain"), 3.5);
    document.setUnit(QStringLiteral("gain"), units::kCubicMetresPerHa);
    const QJsonObject o = document.json();
    const QJsonObject unitOf = o[QStringLiteral("units")].toObject();
    EXPECT_EQ(unitOf[QStringLiteral("npv")], QStringLiteral("EUR/ha"));
    EXPECT_EQ(unitOf[QStringLiteral("irr")], QStringLiteral("%/yr")) << "a null figure too";
    EXPECT_EQ(unitOf[QStringLiteral(">20 cm")], QStringLiteral("m3/ha"));
    EXPECT_EQ(unitOf[QStringLiteral("rate_range")], QStringLiteral("%/yr"));
    EXPECT_EQ(unitOf[QStringLiteral("gain")], QStringLiteral("m3/ha"));
    for (const char *word : {"valuation", "prices", "name", "note", "started"}) {
        EXPECT_FALSE(unitOf.contains(QLatin1String(word))) << word;
    }
    EXPECT_EQ(o[QStringLiteral("run")][QStringLiteral("inputs")][QStringLiteral("rate")], 3.0);

    // The estate counts money for the sub-compartment's area.
    ResultDocument estate(run, units::Table::kEstate);
    estate.addStreamedFigures({QStringLiteral("npv"), QStringLiteral("npv_ha")});
    const QJsonObject estateUnits = estate.json()[QStringLiteral("units")].toObject();
    EXPECT_EQ(estateUnits[QStringLiteral("npv")], QStringLiteral("EUR"));
    EXPECT_EQ(estateUnits[QStringLiteral("npv_ha")], QStringLiteral("EUR/ha"));
}

TEST(ResultDocumentTest, AFigureWithoutAUnitIsAFaultOfTheProgram) {
    ResultDocument document{RunRecord(QStringLiteral("project"))};
    document.insert(QStringLiteral("states"),
                    QJsonArray{QJsonObject{{QStringLiteral("girth"), 1.0}}});
    EXPECT_THROW((void)document.json(), std::logic_error);
    ResultDocument streamed{RunRecord(QStringLiteral("estate"))};
    streamed.addStreamedFigures({QStringLiteral("girth")});
    EXPECT_THROW((void)streamed.json(), std::logic_error);
}

TEST(RunRecordTest, RecordsTheProgramTheStartAndEachFileWithItsChecksum) {
    QTemporaryDir folder;
    const QString prices = folder.filePath(QStringLiteral("CURPRIC.qdm"));
    ASSERT_TRUE(arbolex::testing::writeBytes(prices, "abc"));
    RunRecord run(QStringLiteral("rotation"));
    run.fileRead(QStringLiteral("CURPRIC.qdm"), prices);
    run.fileRead(QStringLiteral("USRPRIC.qdm"), folder.filePath(QStringLiteral("USRPRIC.qdm")));
    run.setFormat(Format::kJson);
    const QJsonObject o = run.json();
    EXPECT_EQ(o[QStringLiteral("program")], QStringLiteral("arbolex-cli"));
    EXPECT_EQ(o[QStringLiteral("command")], QStringLiteral("rotation"));
    EXPECT_FALSE(o[QStringLiteral("version")].toString().isEmpty());
    EXPECT_EQ(o[QStringLiteral("inputs")][QStringLiteral("format")], QStringLiteral("json"));
    const QDateTime started =
        QDateTime::fromString(o[QStringLiteral("started")].toString(), Qt::ISODate);
    EXPECT_TRUE(started.isValid());
    EXPECT_EQ(started.timeSpec(), Qt::UTC);
    EXPECT_LE(started.secsTo(QDateTime::currentDateTimeUtc()), 60);
    const QJsonArray files = o[QStringLiteral("files")].toArray();
    ASSERT_EQ(files.size(), 2);
    // SHA-256 of "abc" (FIPS 180-2, appendix B.1).
    EXPECT_EQ(files[0][QStringLiteral("sha256")],
              QStringLiteral("ba7816bf8f01cfea414140de5dae2223b00361a396177a9cb410ff61f20015ad"));
    EXPECT_EQ(files[1][QStringLiteral("name")], QStringLiteral("USRPRIC.qdm"));
    EXPECT_TRUE(files[1][QStringLiteral("sha256")].isNull()) << "a file that is missing";
}

} // namespace
} // namespace arbolex::cli
