// The catalogue: the structure its coefficient tables promise, and model
// selection with its fault. Which sets an alternative calibration changes is
// checked through its description (modeldescription_test.cpp); the figures
// themselves through the golden projections.
#include "recordingreport.hpp"

#include "engine/catalogue.hpp"

namespace arbolex::engine::testing {
namespace {

TEST(CatalogueTest, StructuralCoefficients) {
    for (int id = 0; id < kModelCount; ++id) {
        const auto &e = catalogue()[static_cast<std::size_t>(id)];
        SCOPED_TRACE(id);
        EXPECT_EQ(e.s[22], 1.0f); // S23
        EXPECT_EQ(e.s[25], 1.0f); // S26
        EXPECT_EQ(e.s[7], 0.0f);  // S8, the work slot
        // The modal form is a true eigen-decomposition: w(z'(w)) = w.
        const double s23 = e.s[22], s25 = e.s[24], s29 = e.s[28], s30 = e.s[29];
        EXPECT_NEAR(s23 * s29 + s25 * s30, 1.0, 2e-3);
        const bool noResponse = e.t == std::array<double, 4>{};
        // Un-thinned calibrations have no thinning response, and neither have
        // the alternative calibrations 15 and 20 although labelled Thinned.
        const bool unthinnedLabel = std::string(e.label).find("(Un") != std::string::npos;
        EXPECT_EQ(noResponse, unthinnedLabel || id == 15 || id == 20) << e.label;
    }
}

// A coefficient table shifted or cut short by one place moves its corners.
TEST(CatalogueTest, CornersOfEachTable) {
    EXPECT_EQ(catalogue()[0].s[0], 0.6241574f);
    EXPECT_EQ(catalogue()[21].s[33], 1.4862974f);
    EXPECT_EQ(catalogue()[8].s[27], -9.090624e-06f);
    EXPECT_EQ(catalogue()[19].t[3], -0.10039201);
    EXPECT_EQ(catalogue()[17].v[9], 0.12541);
    EXPECT_EQ(catalogue()[0].a[37], -0.523796f);
    EXPECT_EQ(catalogue()[16].a[36], 0.0887397f);
}

TEST(CatalogueTest, ThinnedTestIsASubstringSearch) {
    for (int id : {1, 3, 5, 7, 9}) {
        EXPECT_FALSE(IsThinnedModel(id)) << id;
    }
    for (int id : {0, 2, 4, 6, 8, 10, 11, 13, 15, 17, 18, 21}) {
        EXPECT_TRUE(IsThinnedModel(id)) << id;
    }
}

using GetModelTest = EngineTest;

TEST_F(GetModelTest, LoadsTheWholeEntry) {
    ASSERT_TRUE(grow.GetModel(21));
    EXPECT_EQ(grow.modelId(), 21);
    EXPECT_EQ(grow.label(), "LPC - (Thinned)");
    const auto &six = catalogue()[6];
    for (int i = 1; i <= 34; ++i) {
        EXPECT_EQ(grow.S(i), six.s[static_cast<std::size_t>(i - 1)]) << i;
    }
    for (int i = 1; i <= 38; ++i) {
        EXPECT_EQ(grow.A(i), six.a[static_cast<std::size_t>(i - 1)]) << i;
    }
    for (int i = 0; i <= 9; ++i) {
        EXPECT_EQ(grow.V(i), six.v[static_cast<std::size_t>(i)]) << i;
    }
    EXPECT_EQ(grow.T(1), 0.3013);
}

TEST_F(GetModelTest, APartLoadsOnlyItsSet) {
    ASSERT_TRUE(grow.GetModel(0));
    ASSERT_TRUE(grow.GetModel(8, kPartThinningResponse));
    EXPECT_EQ(grow.modelId(), 8);
    EXPECT_EQ(grow.label(), "SP - (Thinned)");
    EXPECT_EQ(grow.T(1), 0.3059);
    EXPECT_EQ(grow.S(2), catalogue()[0].s[1]);
    EXPECT_EQ(grow.V(0), catalogue()[0].v[0]);
    EXPECT_EQ(grow.A(1), catalogue()[0].a[0]);
}

TEST_F(GetModelTest, UnknownIdentifierChangesNothing) {
    ASSERT_TRUE(grow.GetModel(3));
    grow.TM(12.0f);
    const float s8 = grow.S(8);
    for (std::int16_t bad : {std::int16_t{22}, std::int16_t{-1}}) {
        EXPECT_FALSE(grow.GetModel(bad));
        report.take("MODEL SELECTION", "FAULT - Unknown model selection", 48);
        EXPECT_EQ(grow.modelId(), 3);
        EXPECT_EQ(grow.label(), "NS - (UnThinned)");
        EXPECT_EQ(grow.S(8), s8);
        EXPECT_EQ(grow.V(0), 0.13742);
    }
}

} // namespace
} // namespace arbolex::engine::testing
