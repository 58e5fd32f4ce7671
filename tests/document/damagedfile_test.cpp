// Files that must be refused: each gets one "FAULT - " message naming the
// file and what is wrong, and the work in the window does not change.
#include "document/documentfixture.hpp"

#include "document/documentwriter.hpp"
#include "shell/testfiles.hpp"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <functional>

namespace arbolex::testing {
namespace {

struct Damage {
    const char *name;
    /// Turns a good file's text into the damaged one.
    std::function<QByteArray(const QByteArray &)> damage;
    /// A part of the reason the message must give.
    const char *reason;
};

/// Edits the parsed file and writes it out again.
std::function<QByteArray(const QByteArray &)> edit(std::function<void(QJsonObject &)> change) {
    return [change](const QByteArray &good) {
        QJsonObject top = QJsonDocument::fromJson(good).object();
        change(top);
        return QJsonDocument(top).toJson();
    };
}

/// Edits the first row of the table.
std::function<QByteArray(const QByteArray &)> editRow(int index,
                                                      std::function<void(QJsonObject &)> change) {
    return edit([index, change](QJsonObject &top) {
        QJsonObject table = top[QStringLiteral("table")].toObject();
        QJsonArray rows = table[QStringLiteral("rows")].toArray();
        QJsonObject row = rows[index].toObject();
        change(row);
        rows[index] = row;
        table[QStringLiteral("rows")] = rows;
        top[QStringLiteral("table")] = table;
    });
}

class DamagedFileTest : public DocumentTest, public ::testing::WithParamInterface<Damage> {};

TEST_P(DamagedFileTest, IsRefusedAndChangesNothing) {
    auto session = newSession();
    session->run(QStringLiteral("model 0\nset txtFromA 15\nset txtFromN 2500\nset txtFromH 7\n"
                                "set txtFromB 20\nset txtToA 30\nset txtByA 5\npress cmdGrow"));
    const QByteArray good = document::documentToJson(session->work());
    const QString path = file(QStringLiteral("Kilbrack 12b.arbolex"));
    ASSERT_TRUE(writeBytes(path, GetParam().damage(good)));

    // Work of another stand is in the window when the file is opened.
    session->run(QStringLiteral("set txtToA 45\npress cmdGrow"));
    const document::Document before = session->work();
    session->output.clear();
    session->run(QStringLiteral("open ") + path);

    const QStringList lines = session->output.split(u'\n', Qt::SkipEmptyParts);
    ASSERT_EQ(lines.size(), 1) << session->output.toStdString();
    EXPECT_TRUE(lines.first().contains(
        QStringLiteral("FAULT - The file \"Kilbrack 12b.arbolex\" cannot be opened: ")));
    EXPECT_TRUE(lines.first().contains(QLatin1String(GetParam().reason)))
        << lines.first().toStdString();
    expectSameDocument(session->work(), before);
}

const Damage kDamages[] = {
    {"Truncated", [](const QByteArray &good) { return good.left(good.size() / 2); }, "cut short"},
    {"SyntaxErrorHasItsPlace",
     [](const QByteArray &good) {
         QByteArray bad = good;
         return bad.replace("\"version\": 2,", "\"version\": 2;");
     },
     "line 3, column 18"},
    {"Empty", [](const QByteArray &) { return QByteArray(); }, "the file is empty"},
    {"Binary", [](const QByteArray &) { return QByteArray("\x89PNG\r\n\x1a\n\0\0", 10); },
     "damaged"},
    {"Foreign", [](const QByteArray &) { return QByteArray(R"({"type": "FeatureCollection"})"); },
     "not an ARBOLEX sub-compartment"},
    {"NewerVersion", edit([](QJsonObject &top) { top[QStringLiteral("version")] = 3; }),
     "newer version of ARBOLEX (format version 3"},
    {"NegativeEstablishmentCost", edit([](QJsonObject &top) {
         QJsonObject cashFlow = top[QStringLiteral("cashFlow")].toObject();
         cashFlow[QStringLiteral("establishmentCost")] = -3045;
         top[QStringLiteral("cashFlow")] = cashFlow;
     }),
     "the cash flow: \"establishmentCost\" is -3045"},
    {"Model23", edit([](QJsonObject &top) { top[QStringLiteral("model")] = 23; }),
     "\"model\" is 23"},
    {"NegativeStocking",
     editRow(2,
             [](QJsonObject &row) {
                 QJsonObject record = row[QStringLiteral("record")].toObject();
                 record[QStringLiteral("stocking")] = -1200;
                 row[QStringLiteral("record")] = record;
             }),
     "row 3, its record: \"stocking\" is -1200"},
    {"NegativeStockingField", edit([](QJsonObject &top) {
         QJsonObject fields = top[QStringLiteral("fields")].toObject();
         fields[QStringLiteral("txtFromN")] = QStringLiteral("-2500");
         top[QStringLiteral("fields")] = fields;
     }),
     "\"txtFromN\" holds \"-2500\""},
    {"RowsOutOfAgeOrder",
     editRow(2,
             [](QJsonObject &row) {
                 QJsonObject record = row[QStringLiteral("record")].toObject();
                 record[QStringLiteral("age")] = 16;
                 row[QStringLiteral("record")] = record;
             }),
     "row 3 is younger than the row before it"},
    {"MissingCells", editRow(0, [](QJsonObject &row) { row.remove(QStringLiteral("cells")); }),
     "row 1 has no \"cells\""},
    {"FelledWithoutFinalCut", edit([](QJsonObject &top) {
         QJsonObject table = top[QStringLiteral("table")].toObject();
         table[QStringLiteral("felled")] = true;
         top[QStringLiteral("table")] = table;
     }),
     "does not agree with the final-cut rows"},
};

INSTANTIATE_TEST_SUITE_P(Files, DamagedFileTest, ::testing::ValuesIn(kDamages),
                         [](const auto &damage) { return std::string(damage.param.name); });

TEST_F(DocumentTest, MissingFileIsRefused) {
    auto session = newSession();
    session->run(QStringLiteral("open ") + file(QStringLiteral("nowhere.arbolex")));
    EXPECT_TRUE(session->output.contains(QStringLiteral(
        "FAULT - The file \"nowhere.arbolex\" cannot be opened: it cannot be read")));
}

} // namespace
} // namespace arbolex::testing
