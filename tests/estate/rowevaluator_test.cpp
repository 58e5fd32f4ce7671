// One row of an estate: refused with the main window's message, or grown and
// valued exactly as the rotation library values the same stand and regime.
#include "estate/rowevaluator.hpp"

#include "estatefixture.hpp"
#include "rotation/standchecks.hpp"
#include "rotation/standmath.hpp"

#include <gtest/gtest.h>

#include <algorithm>

#include <cctype>
#include <cmath>

namespace arbolex::estate {
namespace {

using testing::sitkaRow;
using testing::with;

struct BadRow {
    const char *what;
    std::vector<std::pair<std::string, std::string>> changes; ///< to the Sitka row
    std::string message;
};

void PrintTo(const BadRow &r, std::ostream *os) {
    *os << r.what;
}

std::string text(std::string_view s) {
    return std::string(s);
}

class EstateBadRowTest : public ::testing::TestWithParam<BadRow> {};

TEST_P(EstateBadRowTest, IsRefusedWithItsMessage) {
    const Layout layout = testing::testLayout();
    const EstateDefaults defaults = testing::testDefaults();
    RowEvaluator evaluator(layout, defaults);
    RowValues row = sitkaRow();
    for (const auto &[name, value] : GetParam().changes) {
        row = with(row, name, value);
    }
    const RowResult r = evaluator.evaluate(row);
    EXPECT_EQ(r.status, RowStatus::kRefused);
    EXPECT_EQ(r.message.substr(0, GetParam().message.size()), GetParam().message);
    EXPECT_TRUE(r.harvests.empty());
    // A readable model is named even on a refused row.
    EXPECT_EQ(r.modelLabel.empty(), row[2] == "SS" || row[2] == "22" || row[2] == "2.5");
}

using namespace rotation::standtext;

INSTANTIATE_TEST_SUITE_P(
    Rows, EstateBadRowTest,
    ::testing::Values(
        BadRow{"model not a number",
               {{"model", "SS"}},
               "the model \"SS\" is not a model from 0 to 21"},
        BadRow{"model outside", {{"model", "22"}}, "the model \"22\" is not a model from 0 to 21"},
        BadRow{"model not whole", {{"model", "2.5"}}, "the model"},
        BadRow{"age missing", {{"age", ""}}, text(kFaultFromAge)},
        BadRow{"stocking unparsable", {{"stocking", "25OO"}}, text(kFaultFromStocking)},
        BadRow{"height missing", {{"top_height", " "}}, text(kFaultFromHeight)},
        BadRow{
            "neither basal area nor dbh", {{"basal_area", "n/a"}}, text(kFaultFromBasalAreaOrDbh)},
        BadRow{"age below range", {{"age", "9.9"}}, text(kRangeAge)},
        BadRow{"stocking above range", {{"stocking", "5001"}}, text(kRangeStocking)},
        BadRow{"height over the field's limit", {{"top_height", "49.5"}}, text(kMaximumHeight)},
        BadRow{"height below range", {{"top_height", "4.9"}}, text(kRangeHeightLead)},
        BadRow{"basal area above range", {{"basal_area", "100.5"}}, text(kRangeBasalArea)},
        BadRow{
            "area not positive", {{"area_ha", "0"}}, "the area_ha \"0\" is not an area above 0 ha"},
        BadRow{"area past any sub-compartment",
               {{"area_ha", "2.5e31"}},
               "the area_ha \"2.5e31\" is larger than a sub-compartment can be (100000 ha)"},
        BadRow{"area missing", {{"area_ha", ""}}, "the area_ha has no value"},
        BadRow{"interval not whole",
               {{"thin_every", "five"}},
               "the thin_every \"five\" is not a whole number from 1 to 200"},
        BadRow{"un-thinned model with a regime",
               {{"model", "1"}},
               "model 1 (SS - (Un-thinned)) has no thinning response"},
        BadRow{"thinning more than stands",
               {{"thin_volume", "900"}},
               "FAULT - Proposed thinning leads to negative or zero Volume."},
        BadRow{"first thinning before the present",
               {{"thin_from", "12"}},
               "the first thinning (age 12) is before the present age 15"},
        BadRow{"rotation past the age limit",
               {{"rotation", "61"}},
               "the rotation (age 61) is past the model's age limit 60"},
        BadRow{"rotation before the last thinning",
               {{"thin_until", "40"}, {"rotation", "35"}},
               "the regime thins at age 40, not before the final cut at age 35"}),
    [](const ::testing::TestParamInfo<BadRow> &param) {
        std::string name = param.param.what;
        for (char &c : name) {
            c = std::isalnum(static_cast<unsigned char>(c)) != 0 ? c : '_';
        }
        return name;
    });

class EstateRowTest : public ::testing::Test {
protected:
    Layout m_layout = testing::testLayout();
    EstateDefaults m_defaults = testing::testDefaults();
};

TEST_F(EstateRowTest, GrowsAndValuesTheStandAsTheRotationLibraryDoes) {
    RowEvaluator evaluator(m_layout, m_defaults);
    const RowResult r = evaluator.evaluate(with(sitkaRow(), "rotation", "48"));
    ASSERT_EQ(r.status, RowStatus::kOk) << r.message;

    engine::Grow grow;
    rotation::GrowthFailure failure;
    const rotation::Stand stand{0, 15.0f, 2500.0f, 7.0f, 20.0f};
    const auto path = rotation::growPath(grow, stand, m_defaults.regime, failure);
    ASSERT_TRUE(path.has_value());
    const rotation::RotationValue v = rotation::valueRotation(*path, 48, m_defaults.economics);
    EXPECT_EQ(r.modelLabel, "SS - (Thinned)");
    EXPECT_EQ(r.species, "SS");
    EXPECT_EQ(r.siteIndex, path->siteIndex);
    EXPECT_EQ(r.finalCutAge, 48);
    EXPECT_EQ(r.finalCutYear, 2026 + 48 - path->presentAge);
    EXPECT_EQ(r.finalCutVolume, v.finalCut.volume);
    EXPECT_EQ(r.thinningCount, 6); // ages 20, 25, ..., 45
    EXPECT_EQ(r.thinningCount, static_cast<int>(v.thinnings.size()));
    EXPECT_EQ(r.yieldClass, rotation::pathYieldClass(*path));
    EXPECT_EQ(r.finalCutMai, v.mai);
    EXPECT_EQ(r.npv, v.npv);
    EXPECT_EQ(r.lev, v.lev);
    EXPECT_EQ(r.forestValue, v.forestValue);
    // One harvest per thinning and the final cut, and the carbon of every
    // year from today, for the 2.5 ha.
    const auto harvests = std::count_if(r.harvests.begin(), r.harvests.end(), [](const auto &h) {
        return h.thinningLitres > 0 || h.finalCutLitres > 0;
    });
    EXPECT_EQ(harvests, 7);
    EXPECT_EQ(r.harvests[6].finalCutLitres, std::llround(double{v.finalCut.volume} * 2500.0));
    EXPECT_EQ(r.harvests.size(), 7U + static_cast<std::size_t>(48 - path->presentAge + 1));
    EXPECT_EQ(r.harvests.back().carbonRemovalKg,
              std::llround(v.carbon.years.back().netRemoval * 2500.0));
    EXPECT_EQ(r.carbonLongTermAverage, v.carbon.longTermAverage);
    EXPECT_LT(r.harvests.back().carbonRemovalKg, 0) << "the final cut releases carbon";
}

TEST_F(EstateRowTest, TheYieldClassIsTheStandsProductivityWhateverTheFinalCut) {
    RowEvaluator evaluator(m_layout, m_defaults);
    // A fertile site (11 m at 15 years): felled at 25 its increment has not
    // culminated; the yield class is read over the whole path all the same,
    // as it is for a final cut at 60.
    const RowValues fertile = with(sitkaRow(), "top_height", "11");
    const RowResult early = evaluator.evaluate(with(fertile, "rotation", "25"));
    const RowResult late = evaluator.evaluate(with(fertile, "rotation", "60"));
    ASSERT_EQ(early.status, RowStatus::kOk) << early.message;
    EXPECT_GT(early.yieldClass, 0);
    EXPECT_EQ(early.yieldClass, late.yieldClass);
    EXPECT_LT(early.finalCutMai, early.maxMai + 1e-12);
    EXPECT_NEAR(early.finalCutMai,
                (double{early.finalCutVolume} + early.thinningVolume) / early.finalCutAge, 1e-4);
}

TEST_F(EstateRowTest, DiameterStandsInForAMissingBasalAreaAndEmptyValuesTakeTheDefaults) {
    RowEvaluator evaluator(m_layout, m_defaults);
    const float dbh = 12.3f;
    const RowValues byDbh = with(with(sitkaRow(), "basal_area", ""), "dbh", "12.3");
    const RowValues byBasalArea =
        with(sitkaRow(), "basal_area", std::to_string(rotation::basalAreaFromDbh(2500.0f, dbh)));
    // The basal area wins over a diameter given beside it.
    const RowValues both = with(byBasalArea, "dbh", "99");
    const RowResult a = evaluator.evaluate(byDbh);
    const RowResult b = evaluator.evaluate(byBasalArea);
    const RowResult c = evaluator.evaluate(both);
    ASSERT_EQ(a.status, RowStatus::kOk) << a.message;
    EXPECT_NEAR(a.finalCutVolume, b.finalCutVolume, 1e-3f);
    EXPECT_EQ(b.npv, c.npv);

    // The regime written out in the row is the command line's.
    const RowResult own = evaluator.evaluate(with(
        sitkaRow(),
        {{"thin_from", "20"}, {"thin_every", "5"}, {"thin_volume", "40"}, {"rotation", "50"}}));
    m_defaults.rotation = 50;
    const RowResult defaulted = evaluator.evaluate(sitkaRow());
    EXPECT_EQ(own.npv, defaulted.npv);
    EXPECT_EQ(own.thinningCount, defaulted.thinningCount);
    // A first thinning at 0 leaves the stand unthinned.
    EXPECT_EQ(evaluator.evaluate(with(sitkaRow(), "thin_from", "0")).thinningCount, 0);
}

TEST_F(EstateRowTest, AThinningTheRegimeWouldMakeAfterTheFinalCutDoesNotStopTheRow) {
    RowEvaluator evaluator(m_layout, m_defaults);
    // Douglas fir thinned by 40 m3/ha every 5 years: the grow from the stand
    // a thinning after 50 leaves is refused (too few stems), but felled at 50
    // the row never meets it.
    const RowValues fir = with(sitkaRow(), {{"model", "4"},
                                            {"thin_from", "20"},
                                            {"thin_every", "5"},
                                            {"thin_volume", "40"},
                                            {"rotation", "50"}});
    const RowResult felled = evaluator.evaluate(fir);
    EXPECT_EQ(felled.status, RowStatus::kOk) << felled.message;
    EXPECT_EQ(felled.thinningCount, 6);
    const RowResult later = evaluator.evaluate(with(fir, "rotation", "56"));
    EXPECT_EQ(later.status, RowStatus::kRefused);
    EXPECT_EQ(later.message, "FAULT - Grow From STOCKING not in acceptable range [100, 5000]");
}

TEST_F(EstateRowTest, WithoutARotationAnywhereFellsAtTheEconomicRotation) {
    RowEvaluator evaluator(m_layout, m_defaults);
    const RowResult r = evaluator.evaluate(sitkaRow());
    ASSERT_EQ(r.status, RowStatus::kOk) << r.message;
    engine::Grow grow;
    rotation::GrowthFailure failure;
    const auto path =
        rotation::growPath(grow, {0, 15.0f, 2500.0f, 7.0f, 20.0f}, m_defaults.regime, failure);
    ASSERT_TRUE(path.has_value());
    EXPECT_EQ(r.finalCutAge,
              rotation::exploreRotations(*path, m_defaults.regime, m_defaults.economics)
                  .economicRotation);
}

/// `row` with a decimal comma in every number the estate reads.
RowValues withDecimalCommas(const RowValues &row) {
    return with(row, {{"top_height", "7,0"},
                      {"basal_area", "20,0"},
                      {"area_ha", "2,5"},
                      {"thin_from", "20,0"},
                      {"thin_every", "5"},
                      {"thin_volume", "40,0"},
                      {"rotation", "48,0"}});
}

TEST_F(EstateRowTest, DecimalCommasOfASemicolonTableReadAsTheirPointedTwins) {
    Layout semicolons = m_layout;
    semicolons.decimalComma = true;
    RowEvaluator european(semicolons, m_defaults);
    RowEvaluator plain(m_layout, m_defaults);
    const RowValues pointed =
        with(sitkaRow(),
             {{"thin_from", "20"}, {"thin_every", "5"}, {"thin_volume", "40"}, {"rotation", "48"}});
    const RowResult a = european.evaluate(withDecimalCommas(sitkaRow()));
    const RowResult b = plain.evaluate(pointed);
    ASSERT_EQ(a.status, RowStatus::kOk) << a.message;
    EXPECT_EQ(a.npv, b.npv);
    EXPECT_EQ(a.areaHa, 2.5);
    EXPECT_EQ(a.finalCutAge, 48);
    // A point still reads in a semicolon table.
    EXPECT_EQ(european.evaluate(pointed).npv, b.npv);

    // Where the comma separates fields it is no decimal point: the row's own message.
    const RowResult refused = plain.evaluate(withDecimalCommas(sitkaRow()));
    EXPECT_EQ(refused.status, RowStatus::kRefused);
    EXPECT_EQ(refused.message, std::string(rotation::standtext::kFaultFromHeight));
}

TEST(EstateNumberTest, ADecimalCommaIsOneCommaAndNoPoint) {
    EXPECT_EQ(decimalNumber(" 12,4 ", true), 12.4);
    EXPECT_EQ(decimalNumber("+7,", true), 7.0);
    EXPECT_EQ(decimalNumber("7.5", true), 7.5);
    EXPECT_EQ(decimalNumber("1e3", true), 1000.0);
    EXPECT_EQ(wholeNumber("50,0", true), 50);
    // Thousands and decimals, or two commas, say nothing certain: refused.
    EXPECT_FALSE(decimalNumber("2.500,5", true));
    EXPECT_FALSE(decimalNumber("1,2,3", true));
    EXPECT_FALSE(decimalNumber("12,4", false));
    EXPECT_FALSE(wholeNumber("50,5", true));
}

} // namespace
} // namespace arbolex::estate
