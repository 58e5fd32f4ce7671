// arbolex-cli assort, run as a user runs it: the fixed classes, a category
// file, and the refusals.
#include "cli/clirun.hpp"
#include "mocks/qtprinters.hpp"
#include "shell/testfiles.hpp"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <ostream>

namespace {

using arbolex::cli::testing::Outcome;

class AssortCliTest : public ::testing::Test {
protected:
    Outcome run(const QString &commandLine) {
        return arbolex::cli::testing::runCli(
            commandLine.split(QLatin1Char(' '), Qt::SkipEmptyParts), m_data.path());
    }

    /// Writes a category file into the data folder and returns its path.
    QString categoryFile(const char *lines) {
        const QString path = m_data.filePath(QStringLiteral("cats.qdm"));
        EXPECT_TRUE(arbolex::testing::writeBytes(path, lines));
        return path;
    }

    QTemporaryDir m_data;
};

constexpr const char *kStand =
    "assort --model 0 --age 40 --stocking 900 --height 20 --basal-area 40";

/// The cells of a table line: name, then numbers.
QStringList cells(const QString &line) {
    return line.split(QLatin1Char('\t'));
}

// That the classes add up to the stand's volume is the engine's
// (engine/assortment_test.cpp); the table's layout is checked with every
// command's (outputs_test.py).
TEST_F(AssortCliTest, CategoryFileGivesItsDefinedCategoriesInFileOrder) {
    const QString path = categoryFile("\"Stakes\"\r\n8\r\n12\r\n\"Unused\"\r\n0\r\n0\r\n"
                                      "\"Pulp, long\"\r\n7\r\n14\r\n\"Pallet\"\r\n15\r\n20\r\n"
                                      "\"Saw\"\r\n21\r\n0\r\n");
    const Outcome r = run(QLatin1String(kStand) + QStringLiteral(" --categories ") + path);
    ASSERT_EQ(r.exitCode, 0) << r.err.toStdString();
    ASSERT_EQ(r.out.size(), 2 + 4);
    const QStringList expected{QStringLiteral("Stakes"), QStringLiteral("Pulp, long"),
                               QStringLiteral("Pallet"), QStringLiteral("Saw")};
    for (int i = 0; i < 4; ++i) {
        EXPECT_EQ(cells(r.out[2 + i])[0], expected[i]);
    }
    // The last three are the fixed classes: the same numbers to the last digit.
    const Outcome fixed = run(QLatin1String(kStand));
    ASSERT_EQ(fixed.exitCode, 0);
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(cells(r.out[3 + i]).mid(1), cells(fixed.out[2 + i]).mid(1));
    }
}

struct Refusal {
    const char *name;
    const char *extra; ///< appended to the stand ("@" stands for the category file)
    const char *file;  ///< category file contents, or nullptr
    int exitCode;
    const char *complaint; ///< part of stderr
};

void PrintTo(const Refusal &r, std::ostream *os) {
    *os << r.name;
}

class AssortCliRefusalTest : public AssortCliTest, public ::testing::WithParamInterface<Refusal> {};

TEST_P(AssortCliRefusalTest, PrintsNoTable) {
    const Refusal &c = GetParam();
    QString extra = QLatin1String(c.extra);
    if (c.file != nullptr) {
        extra.replace(QLatin1Char('@'), categoryFile(c.file));
    }
    const Outcome r = run(QLatin1String(kStand) + extra);
    EXPECT_EQ(r.exitCode, c.exitCode);
    EXPECT_TRUE(r.out.isEmpty());
    EXPECT_TRUE(r.err.contains(QLatin1String(c.complaint))) << r.err.toStdString();
}

INSTANTIATE_TEST_SUITE_P(
    Cli, AssortCliRefusalTest,
    ::testing::Values(
        Refusal{"MissingFile", " --categories /nonexistent/cats.qdm", nullptr, 2, "File not found"},
        Refusal{"ShortFile", " --categories @", "\"Stakes\"\r\n8\r\n", 2, "category 1"},
        Refusal{"SmallEndUnder7", " --categories @",
                "\"a\"\r\n5\r\n9\r\n\"b\"\r\n0\r\n0\r\n\"c\"\r\n0\r\n0\r\n\"d\"\r\n0\r\n0\r\n"
                "\"e\"\r\n0\r\n0\r\n",
                1, "ERROR - Non-recoverable AsmtG calculation error"}),
    [](const auto &test) { return std::string(test.param.name); });

} // namespace
