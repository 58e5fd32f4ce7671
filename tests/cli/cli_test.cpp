// The command-line program, run as a user runs it: its tables, its exit
// statuses and what it writes to stderr and to the error log.
#include "cli/clirun.hpp"
#include "mocks/qtprinters.hpp"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <cmath>
#include <ostream>

namespace {

using arbolex::cli::testing::Outcome;

class CliTest : public ::testing::Test {
protected:
    Outcome run(const QStringList &arguments) {
        return arbolex::cli::testing::runCli(arguments, m_data.path());
    }

    QString errorLog() const {
        QFile file(m_data.filePath(QStringLiteral("ErrorLog.txt")));
        return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
    }

    QTemporaryDir m_data;
};

QStringList words(const char *commandLine) {
    return QString::fromLatin1(commandLine).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

/// The numbers of a table line.
std::vector<double> numbers(const QString &line) {
    std::vector<double> values;
    for (const QString &cell : line.split(QLatin1Char('\t'))) {
        bool ok = false;
        values.push_back(cell.toDouble(&ok));
        EXPECT_TRUE(ok) << cell.toStdString();
    }
    return values;
}

bool nearRel(double expected, double actual, double rel) {
    return std::fabs(expected - actual) <= rel * std::fabs(expected);
}

constexpr const char *kStand = "--model 0 --age 15 --stocking 2500 --height 7";
constexpr const char *kFullStand = "--model 0 --basal-area 20 --age 15 --stocking 2500 --height 7";

TEST_F(CliTest, ProjectionPrintsOneRowPerStep) {
    const Outcome r = run(words("project --basal-area 20 --to 45 --by 7") + words(kStand));
    ASSERT_EQ(r.exitCode, 0) << r.err.toStdString();
    EXPECT_TRUE(r.err.isEmpty()) << r.err.toStdString();
    ASSERT_EQ(r.out.size(), 3 + 6);
    EXPECT_TRUE(r.out[0].startsWith(QStringLiteral("# site_index\t16.01")));
    EXPECT_EQ(r.out[1], QStringLiteral("# model\tSS - (Thinned)"));
    EXPECT_EQ(r.out[2], QStringLiteral("age\ttop_height\tstocking\tbasal_area\tvolume\tdbh"));
    const double expectedAges[] = {15, 22, 29, 36, 43, 45};
    double previousHeight = 0.0;
    for (std::size_t i = 0; i < 6; ++i) {
        const std::vector<double> row = numbers(r.out[static_cast<qsizetype>(i) + 3]);
        ASSERT_EQ(row.size(), 6u);
        EXPECT_EQ(row[0], expectedAges[i]);
        EXPECT_GT(row[1], previousHeight);
        previousHeight = row[1];
        // dbh = 200·√(G / (N·π))
        EXPECT_TRUE(nearRel(200.0 * std::sqrt(row[3] / (row[2] * 3.14159265358979)), row[5], 1e-6));
    }
    EXPECT_EQ(numbers(r.out[3])[3], 20.0);
}

TEST_F(CliTest, DiameterGivesTheSameProjectionAsItsBasalArea) {
    const Outcome byBasalArea =
        run(words("project --basal-area 20 --to 30 --by 5") + words(kStand));
    ASSERT_EQ(byBasalArea.exitCode, 0);
    // The diameter column of the start row is the --dbh equivalent of 20 m²/ha.
    const QString diameter = byBasalArea.out[3].split(QLatin1Char('\t')).at(5);
    const Outcome byDiameter =
        run(words("project --to 30 --by 5") + words(kStand) << QStringLiteral("--dbh") << diameter);
    ASSERT_EQ(byDiameter.exitCode, 0) << byDiameter.err.toStdString();
    ASSERT_EQ(byDiameter.out.size(), byBasalArea.out.size());
    EXPECT_EQ(byDiameter.out[0], byBasalArea.out[0]);
    for (qsizetype i = 3; i < byBasalArea.out.size(); ++i) {
        const std::vector<double> a = numbers(byBasalArea.out[i]);
        const std::vector<double> b = numbers(byDiameter.out[i]);
        for (std::size_t k = 0; k < a.size(); ++k) {
            EXPECT_TRUE(nearRel(a[k], b[k], 1e-5)) << i << ' ' << k << ": " << a[k] << " " << b[k];
        }
    }
}

// Thinning to 30 m²/ha of basal area, then to the stocking and to the volume
// that this leaves: each kind of prescription must land on the same stand.
class CliThinTest : public CliTest, public ::testing::WithParamInterface<const char *> {};

TEST_P(CliThinTest, EveryResidualKindLandsOnTheSameStand) {
    const QStringList stand =
        words("--model 0 --age 30 --stocking 2000 --height 13 --basal-area 40");
    const Outcome byBasalArea = run(words("thin --residual-ba 30") + stand);
    ASSERT_EQ(byBasalArea.exitCode, 0) << byBasalArea.err.toStdString();
    ASSERT_EQ(byBasalArea.out.size(), 4);
    EXPECT_EQ(byBasalArea.out[2], QStringLiteral("basal_area\tstocking\tvolume"));
    const std::vector<double> thinned = numbers(byBasalArea.out[3]);
    EXPECT_EQ(thinned[0], 30.0);
    EXPECT_LT(thinned[1], 2000.0);

    const QString option = QString::fromLatin1(GetParam());
    const QStringList given = byBasalArea.out[3].split(QLatin1Char('\t'));
    const QString value = option == QLatin1String("--residual-ba")         ? given[0]
                          : option == QLatin1String("--residual-stocking") ? given[1]
                                                                           : given[2];
    const Outcome r = run(QStringList{QStringLiteral("thin"), option, value} + stand);
    ASSERT_EQ(r.exitCode, 0) << r.err.toStdString();
    ASSERT_EQ(r.out.size(), 4);
    const std::vector<double> again = numbers(r.out[3]);
    for (std::size_t k = 0; k < 3; ++k) {
        // The Newton solve stops within a thousandth of a m²/ha.
        EXPECT_TRUE(nearRel(thinned[k], again[k], 1e-4)) << k << ": " << again[k];
    }
}

INSTANTIATE_TEST_SUITE_P(Cli, CliThinTest,
                         ::testing::Values("--residual-ba", "--residual-stocking",
                                           "--residual-volume"));

struct BadCommandLine {
    const char *arguments;
    const char *complaint; ///< part of what stderr must say
};

void PrintTo(const BadCommandLine &c, std::ostream *os) {
    *os << c.arguments;
}

class CliBadArgumentsTest : public CliTest, public ::testing::WithParamInterface<BadCommandLine> {};

TEST_P(CliBadArgumentsTest, ExitsWithTwoAndSaysWhy) {
    // "%S" stands for a whole stand.
    const QString line = QString::fromLatin1(GetParam().arguments)
                             .replace(QStringLiteral("%S"), QLatin1String(kFullStand));
    const Outcome r = run(line.split(QLatin1Char(' '), Qt::SkipEmptyParts));
    EXPECT_EQ(r.exitCode, 2);
    EXPECT_TRUE(r.out.isEmpty());
    EXPECT_TRUE(r.err.contains(QLatin1String(GetParam().complaint))) << r.err.toStdString();
    EXPECT_TRUE(errorLog().isEmpty());
}

INSTANTIATE_TEST_SUITE_P(
    Cli, CliBadArgumentsTest,
    ::testing::Values(
        BadCommandLine{"grow-all --model 0", "unknown command"},
        BadCommandLine{"project --model 0 --basal-area 20 --colour red --age 15",
                       "unknown option --colour"},
        BadCommandLine{"project %S --to 45 --by", "missing value for --by"},
        BadCommandLine{"project --model 0 --basal-area 20 --age 15 --stocking many --height 7 "
                       "--to 45 --by 5",
                       "--stocking: \"many\" is not a number"},
        BadCommandLine{"project --model 22 --basal-area 20 --age 15 --stocking 2500 --height 7 "
                       "--to 45 --by 5",
                       "--model must be a whole number from 0 to 21"},
        BadCommandLine{"project --model 1.5 --basal-area 20 --age 15 --stocking 2500 --height 7 "
                       "--to 45 --by 5",
                       "--model must be a whole number"},
        BadCommandLine{"project %S --dbh 10 --to 45 --by 5",
                       "give only one of --basal-area, --dbh"},
        BadCommandLine{"project --model 0 --age 15 --stocking 2500 --height 7 --to 45 --by 5",
                       "give one of --basal-area, --dbh"},
        BadCommandLine{"project %S --to 45 --by 0", "--by must be above 0"},
        BadCommandLine{"project %S --by 5", "--to is required"},
        BadCommandLine{"thin %S",
                       "give one of --residual-ba, --residual-stocking, --residual-volume"},
        BadCommandLine{"thin %S --residual-ba 15 --residual-volume 20", "give only one of"},
        BadCommandLine{"thin %S 15", "unexpected argument \"15\""}));

TEST_F(CliTest, FailedProjectionKeepsItsRowsAndExitsWithOne) {
    // Backwards past the stand's origin the state transform cannot be inverted.
    const Outcome r =
        run(words("project --model 0 --age 5 --stocking 100 --height 7 --basal-area 20 "
                  "--to 1 --by 1"));
    EXPECT_EQ(r.exitCode, 1);
    ASSERT_EQ(r.out.size(), 3 + 4);
    EXPECT_TRUE(r.out.last().startsWith(QStringLiteral("2\t")));
    EXPECT_EQ(r.err, QStringLiteral("MSG\tOSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT\t"
                                    "ERROR - Unable to Invert State transform\t48\n"));
}

TEST_F(CliTest, FailureReportedByTheEngineGoesToStderrAndTheErrorLog) {
    // A model without a thinning response divides by its a = 0.
    const Outcome r =
        run(words("thin --model 1 --age 30 --stocking 2000 --height 13 --basal-area 40 "
                  "--residual-ba 30"));
    EXPECT_EQ(r.exitCode, 1);
    EXPECT_TRUE(r.err.startsWith(
        QStringLiteral("MSG\tARBOLEX --- OSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT\t"
                       "ERROR - in residual stocking calculation. Reason: Division by zero\t16\n"
                       "LOG\tError # :11  Division by zero in line ")));
    const QString log = errorLog();
    EXPECT_TRUE(log.startsWith(QStringLiteral("Error # :11  Division by zero in line ")));
    EXPECT_TRUE(log.contains(QStringLiteral(" in Grow.NRES ")));
    EXPECT_TRUE(log.endsWith(QStringLiteral("\r\n")));
}

TEST_F(CliTest, HelpNamesEveryCommandAndEachCommandHasItsOwn) {
    const Outcome overview = run({QStringLiteral("--help")});
    EXPECT_EQ(overview.exitCode, 0);
    const QString text = overview.out.join(QLatin1Char('\n'));
    for (const char *command : {"project", "thin", "rotation", "optimise", "uncertainty"}) {
        EXPECT_TRUE(text.contains(QLatin1String(command))) << command;
    }
    const Outcome thinHelp = run(words("thin --help"));
    EXPECT_EQ(thinHelp.exitCode, 0);
    EXPECT_TRUE(
        thinHelp.out.join(QLatin1Char('\n')).contains(QLatin1String("--residual-stocking")));
}

} // namespace
