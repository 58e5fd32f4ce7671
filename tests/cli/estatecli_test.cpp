// arbolex-cli estate, run as a user runs it: a spreadsheet with its columns in
// any order comes back with its carried columns untouched and every row once,
// bad rows listed; the files are the same for 1
// and 2 threads; shards merge into the whole; a GeoPackage comes back with its
// geometry; an input that cannot be read exits with 2.
#include "cli/clirun.hpp"
#include "estateio/gdallayer.hpp"
#include "mocks/programservices.hpp"
#include "shell/testfiles.hpp"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <cpl_conv.h>
#include <gdal.h>
#include <ogr_api.h>

#include <gtest/gtest.h>

#include <algorithm>

namespace {

using arbolex::cli::testing::Outcome;
using Table = std::vector<std::vector<std::string>>;

const char *const kRegime[] = {"--thin-from",   "20", "--thin-every", "5",
                               "--thin-volume", "40", "--rate",       "3"};

/// Columns shuffled, a carried column with a comma and quotes, an un-thinned
/// model with no regime, and three bad rows.
constexpr const char *kEstate =
    "model,stocking,id,note,age,top_height,basal_area,dbh,area_ha,thin_from,rotation\n"
    "0,2500,A1,\"fenced, \"\"deer\"\"\",15,7,20,,2.5,,50\n"
    "8,2200,A2,,18,9,,14.5,4,,\n"
    "1,2400,A3,plain,16,8,22,,1.5,0,45\n"
    "0,2500,B1,,9,7,20,,1,,50\n"
    "23,2500,B2,,15,7,20,,1,,50\n"
    "0,,B3,,15,7,20,,1,,50\n";

class EstateCliTest : public ::testing::Test {
protected:
    QString path(const char *name) const { return m_work.filePath(QLatin1String(name)); }

    void writeInput(const char *name, const char *text) {
        ASSERT_TRUE(arbolex::testing::writeBytes(path(name), text));
    }

    Outcome estate(const QString &input, const QString &out, QStringList more = {}) {
        QStringList arguments{QStringLiteral("estate"), input,
                              QStringLiteral("--out"),  out,
                              QStringLiteral("--year"), QStringLiteral("2030")};
        for (const char *word : kRegime) {
            arguments << QLatin1String(word);
        }
        return arbolex::cli::testing::runCli(arguments + more, m_data.path());
    }

    static Table read(const QString &file, std::vector<std::string> *columns = nullptr) {
        return arbolex::estateio::readTable(file.toStdString(), columns);
    }

    /// Two runs wrote the same files, and not empty ones.
    void expectSameFiles(const char *first, const char *second) const {
        for (const char *file : {"/subcompartments.csv", "/forecast.csv", "/errors.csv"}) {
            const QByteArray one = arbolex::testing::readBytes(path(first) + QLatin1String(file));
            EXPECT_FALSE(one.isEmpty()) << first << file;
            EXPECT_EQ(one, arbolex::testing::readBytes(path(second) + QLatin1String(file)))
                << first << " and " << second << file;
        }
    }

    static std::string column(const std::vector<std::string> &names,
                              const std::vector<std::string> &row, const char *name) {
        const auto at = std::find(names.begin(), names.end(), name);
        return at == names.end() ? "(missing)" : row[static_cast<std::size_t>(at - names.begin())];
    }

    QTemporaryDir m_data;
    QTemporaryDir m_work;
    bool m_copied = arbolex::testing::copyShippedData(m_data.path());
};

TEST_F(EstateCliTest, CarriesColumnsKeepsEveryRowInOrderAndListsTheBadOnes) {
    writeInput("estate.csv", kEstate);
    const Outcome r = estate(path("estate.csv"), path("out"));
    EXPECT_EQ(r.exitCode, 1) << r.err.toStdString();
    EXPECT_TRUE(r.err.contains(QStringLiteral("3 of 6 rows not grown"))) << r.err.toStdString();

    std::vector<std::string> names;
    const Table results = read(path("out/subcompartments.csv"), &names);
    ASSERT_EQ(results.size(), 6U);
    EXPECT_EQ(std::vector<std::string>(names.begin(), names.begin() + 4),
              (std::vector<std::string>{"line", "id", "note", "model_label"}));
    const char *ids[] = {"A1", "A2", "A3", "B1", "B2", "B3"};
    const char *statuses[] = {"ok", "ok", "ok", "refused", "refused", "refused"};
    for (std::size_t i = 0; i < results.size(); ++i) {
        EXPECT_EQ(column(names, results[i], "line"), std::to_string(i + 2));
        EXPECT_EQ(column(names, results[i], "id"), ids[i]);
        EXPECT_EQ(column(names, results[i], "status"), statuses[i]);
    }
    EXPECT_EQ(column(names, results[0], "note"), "fenced, \"deer\"");
    EXPECT_EQ(column(names, results[0], "final_cut_year"), "2065"); // felled at 50, now 15
    EXPECT_EQ(column(names, results[2], "thinnings"), "0");
    EXPECT_EQ(column(names, results[2], "model_label"), "SS - (Un-thinned)");

    const Table errors = read(path("out/errors.csv"));
    ASSERT_EQ(errors.size(), 3U);
    EXPECT_EQ(errors[0], (std::vector<std::string>{
                             "5", "B1", "FAULT - Grow From AGE not in acceptable range [10, 60]"}));
    EXPECT_EQ(errors[1][0], "6");
    EXPECT_EQ(errors[1][2], "the model \"23\" is not a model from 0 to 21");
    EXPECT_EQ(errors[2][2], "FAULT - Grow From STOCKING has not been specified correctly.");

    const Table forecast = read(path("out/forecast.csv"));
    ASSERT_FALSE(forecast.empty());
    EXPECT_EQ(forecast[0][0], "2030");
    EXPECT_EQ(forecast[0][1], "all");
}

// A row's figures are the rotation library's (rowevaluator_test.cpp) and the
// rotation command's to the cent (oneforestry_test.cpp).

TEST_F(EstateCliTest, OneOrTwoThreadsWriteTheSameFilesAndShardsMergeIntoTheWhole) {
    QByteArray estateText("id,model,age,stocking,top_height,basal_area,area_ha,rotation\n");
    for (int i = 0; i < 120; ++i) {
        estateText += QByteArrayLiteral("R") + QByteArray::number(i) + ',' +
                      QByteArray::number(std::array{0, 2, 4, 8, 16, 19}[i % 6]) + ',' +
                      QByteArray::number(15 + i % 5) + ",2400," + QByteArray::number(7 + i % 4) +
                      ",21," + QByteArray::number(1 + i % 3) + ".25," +
                      QByteArray::number(40 + i % 12) + '\n';
    }
    writeInput("many.csv", estateText.constData());
    for (const char *threads : {"1", "2"}) {
        estate(path("many.csv"), path("t") + QLatin1String(threads),
               {QStringLiteral("--threads"), QLatin1String(threads)});
    }
    expectSameFiles("t1", "t2");

    // Two shards give the whole's rows; that their forecasts add up is the
    // estate run's (estaterun_test.cpp).
    Table merged;
    for (const char *shard : {"1/2", "2/2"}) {
        const QString out = path("shard") + QLatin1String(shard).left(1);
        estate(path("many.csv"), out, {QStringLiteral("--shard"), QLatin1String(shard)});
        const Table part = read(out + QStringLiteral("/subcompartments.csv"));
        merged.insert(merged.end(), part.begin(), part.end());
    }
    std::sort(merged.begin(), merged.end(),
              [](const auto &a, const auto &b) { return std::stoi(a[0]) < std::stoi(b[0]); });
    EXPECT_EQ(merged, read(path("t1/subcompartments.csv")));
}

TEST_F(EstateCliTest, AGeoPackageComesBackWithItsGeometryAndTypedResults) {
    GDALAllRegister();
    const std::string input = path("stands.gpkg").toStdString();
    GDALDatasetH ds =
        GDALCreate(GDALGetDriverByName("GPKG"), input.c_str(), 0, 0, 0, GDT_Unknown, nullptr);
    ASSERT_NE(ds, nullptr);
    OGRLayerH layer = GDALDatasetCreateLayer(ds, "stands", nullptr, wkbPolygon, nullptr);
    const std::pair<const char *, OGRFieldType> fields[] = {
        {"id", OFTString},     {"model", OFTInteger},   {"age", OFTReal},
        {"stocking", OFTReal}, {"top_height", OFTReal}, {"basal_area", OFTReal},
        {"area_ha", OFTReal},  {"owner", OFTString}};
    for (const auto &[name, type] : fields) {
        OGRFieldDefnH f = OGR_Fld_Create(name, type);
        OGR_L_CreateField(layer, f, TRUE);
        OGR_Fld_Destroy(f);
    }
    const char *polygons[] = {"POLYGON ((0 0,100 0,100 100,0 100,0 0))",
                              "POLYGON ((200 0,300 0,300 50,200 50,200 0))"};
    for (int i = 0; i < 2; ++i) {
        OGRFeatureH f = OGR_F_Create(OGR_L_GetLayerDefn(layer));
        OGR_F_SetFieldString(f, 0, i == 0 ? "P1" : "P2");
        OGR_F_SetFieldInteger(f, 1, 0);
        OGR_F_SetFieldDouble(f, 2, i == 0 ? 15.0 : 5.0); // the second is too young
        OGR_F_SetFieldDouble(f, 3, 2500.0);
        OGR_F_SetFieldDouble(f, 4, 7.0);
        OGR_F_SetFieldDouble(f, 5, 20.0);
        OGR_F_SetFieldDouble(f, 6, i == 0 ? 1.0 : 0.5);
        OGR_F_SetFieldString(f, 7, "state");
        OGRGeometryH g = nullptr;
        char *wkt = const_cast<char *>(polygons[i]);
        OGR_G_CreateFromWkt(&wkt, nullptr, &g);
        OGR_F_SetGeometryDirectly(f, g);
        ASSERT_EQ(OGR_L_CreateFeature(layer, f), OGRERR_NONE);
        OGR_F_Destroy(f);
    }
    GDALClose(ds);

    const Outcome r = estate(path("stands.gpkg"), path("gis"),
                             {QStringLiteral("--layer"), QStringLiteral("stands")});
    EXPECT_EQ(r.exitCode, 1) << r.err.toStdString();
    const std::string output = path("gis/subcompartments.gpkg").toStdString();
    GDALDatasetH back = GDALOpenEx(output.c_str(), GDAL_OF_VECTOR, nullptr, nullptr, nullptr);
    ASSERT_NE(back, nullptr);
    OGRLayerH results = GDALDatasetGetLayer(back, 0);
    ASSERT_EQ(OGR_L_GetFeatureCount(results, TRUE), 2);
    OGRFeatureDefnH definition = OGR_L_GetLayerDefn(results);
    const int npv = OGR_FD_GetFieldIndex(definition, "npv_ha");
    const int owner = OGR_FD_GetFieldIndex(definition, "owner");
    ASSERT_GE(npv, 0);
    ASSERT_GE(owner, 0);
    EXPECT_EQ(OGR_Fld_GetType(OGR_FD_GetFieldDefn(definition, npv)), OFTReal);
    for (int i = 0; i < 2; ++i) {
        OGRFeatureH f = OGR_L_GetNextFeature(results);
        ASSERT_NE(f, nullptr);
        char *wkt = nullptr;
        OGR_G_ExportToWkt(OGR_F_GetGeometryRef(f), &wkt);
        EXPECT_STREQ(wkt, polygons[i]);
        CPLFree(wkt);
        EXPECT_STREQ(OGR_F_GetFieldAsString(f, owner), "state");
        // The grown stand has an NPV; the refused one none.
        EXPECT_EQ(OGR_F_IsFieldSetAndNotNull(f, npv) != 0, i == 0);
        OGR_F_Destroy(f);
    }
    GDALClose(back);
    EXPECT_EQ(read(path("gis/subcompartments.csv")).size(), 2U);
}

TEST_F(EstateCliTest, ASemicolonSpreadsheetWithDecimalCommasGivesItsPlainTwinsFiles) {
    // As a spreadsheet with European settings saves it: a byte-order mark,
    // semicolons, decimal commas, and a carried text holding a semicolon.
    writeInput("european.csv",
               "\xEF\xBB\xBFid;model;age;stocking;top_height;basal_area;area_ha;note\n"
               "A1;0;15;2500;7,0;20,5;2,25;\"fenced; deer\"\n"
               "A2;8;18;2200;9;22,25;4;\n"
               "B1;0;15;2500;7,0,1;20;1;\n");
    writeInput("plain.csv", "id,model,age,stocking,top_height,basal_area,area_ha,note\n"
                            "A1,0,15,2500,7.0,20.5,2.25,fenced; deer\n"
                            "A2,8,18,2200,9,22.25,4,\n"
                            "B1,0,15,2500,\"7,0\",20,1,\n");
    EXPECT_EQ(estate(path("european.csv"), path("eu")).exitCode, 1);
    EXPECT_EQ(estate(path("plain.csv"), path("plain")).exitCode, 1);
    expectSameFiles("eu", "plain");
    // A value that is no number keeps its row's message and line in both; in
    // the comma-separated twin that is the quoted decimal comma.
    const Table errors = read(path("plain/errors.csv"));
    ASSERT_EQ(errors.size(), 1U);
    EXPECT_EQ(errors[0],
              (std::vector<std::string>{"4", "B1",
                                        "FAULT - Grow From TOP HEIGHT has not been specified "
                                        "correctly."}));
}

TEST_F(EstateCliTest, AnInputThatCannotBeReadExitsWithTwo) {
    EXPECT_EQ(estate(path("missing.csv"), path("out")).exitCode, 2);
    writeInput("short.csv", "id,model,age,stocking,top_height,basal_area\nS,0,15,2500,7,20\n");
    const Outcome noArea = estate(path("short.csv"), path("out"));
    EXPECT_EQ(noArea.exitCode, 2);
    EXPECT_TRUE(noArea.err.contains(QStringLiteral("no column \"area_ha\"")))
        << noArea.err.toStdString();
    EXPECT_FALSE(QFile::exists(path("out/subcompartments.csv")));
    const Outcome badShard =
        estate(path("short.csv"), path("out"), {QStringLiteral("--shard"), QStringLiteral("4/3")});
    EXPECT_EQ(badShard.exitCode, 2);
}

} // namespace
