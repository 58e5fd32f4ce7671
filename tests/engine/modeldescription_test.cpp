#include "engine/modeldescription.hpp"

#include "engine/catalogue.hpp"
#include "engine/grow.hpp"

#include <gtest/gtest.h>

#include <map>
#include <vector>

namespace arbolex::engine {
namespace {

using Set = CoefficientSet;

// How each alternative calibration differs from the base entry of its label,
// as the catalogue documents it; the description reads it from the numbers.
TEST(ModelDescriptionTest, AlternativesDifferFromTheirBaseAsDocumented) {
    const std::map<int, std::pair<int, std::vector<Set>>> documented = {
        {10, {4, {Set::kVolume, Set::kAssortment}}},
        {11, {5, {Set::kVolume, Set::kAssortment}}},
        {12, {8, {Set::kAssortment}}},
        {13, {9, {Set::kAssortment}}},
        {14, {6, {Set::kStateModel, Set::kVolume, Set::kAssortment}}},
        {15, {6, {Set::kStateModel, Set::kThinningResponse, Set::kVolume, Set::kAssortment}}},
        {16, {0, {Set::kStateModel, Set::kThinningResponse, Set::kVolume, Set::kAssortment}}},
        {17, {1, {Set::kStateModel, Set::kVolume, Set::kAssortment}}},
        {18, {1, {Set::kStateModel, Set::kVolume, Set::kAssortment}}},
        {19, {0, {Set::kStateModel, Set::kThinningResponse, Set::kVolume, Set::kAssortment}}},
        {20, {6, {Set::kStateModel, Set::kThinningResponse, Set::kAssortment}}},
        {21, {6, {}}},
    };
    for (int id = 0; id < kModelCount; ++id) {
        const ModelDescription model = describeModel(id);
        if (id < 10) {
            EXPECT_FALSE(model.alternative(id)) << id;
            EXPECT_TRUE(model.differences.empty()) << id;
            continue;
        }
        const auto &[base, sets] = documented.at(id);
        EXPECT_EQ(model.baseModel, base) << id;
        EXPECT_EQ(model.differences, sets) << id;
    }
}

// The description's volume correction must name exactly the entries whose
// standing volume GetVCF corrects, at any site index.
TEST(ModelDescriptionTest, VolumeCorrectionNamesTheCorrectedEntries) {
    Grow grow;
    for (int id = 0; id < kModelCount; ++id) {
        bool corrected = false;
        for (const float si : {10.0f, 15.0f, 18.0f, 21.0f, 26.0f}) {
            ASSERT_TRUE(grow.GetModel(static_cast<std::int16_t>(id), 0));
            grow.setSiteIndex(si);
            grow.GetVCF();
            corrected = corrected || grow.volumeCorrectionFactor() != 1.0f;
        }
        EXPECT_EQ(corrected, HasVolumeCorrection(id)) << id;
    }
}

TEST(ModelDescriptionTest, NamesSpeciesRegimeAndWhatAnAlternativeChanges) {
    EXPECT_EQ(modelSummary(0), "Sitka spruce, thinned");
    EXPECT_EQ(modelSummary(13), "Scots pine, un-thinned; as 9 with its own assortments");
    EXPECT_EQ(modelSummary(7), "Lodgepole pine (coastal), un-thinned");
    EXPECT_EQ(modelSummary(21), "Lodgepole pine (coastal), thinned; as 6, value for value");
    // The thinning response of 20 is not changed but gone.
    EXPECT_EQ(modelSummary(20), "Lodgepole pine (coastal), thinned; as 6 with its own state model "
                                "and assortments; no thinning response");
    EXPECT_EQ(modelSummary(16), "Sitka spruce, thinned; as 0 with its own state model, thinning "
                                "response, volume and assortments; volume corrected by site index");
    EXPECT_EQ(modelMenuNote(16), "Sitka spruce, thinned; as 0, own state, thinning, volume, "
                                 "assortment sets; volume by site");
    EXPECT_EQ(modelMenuNote(15), "Lodgepole pine (coastal), thinned; as 6, own state, volume, "
                                 "assortment sets; no thinning response");
    // Entries 0, 16 and 19 share a label and must read differently.
    EXPECT_NE(modelMenuNote(16), modelMenuNote(19));
    EXPECT_NE(modelSummary(16), modelSummary(19));
    EXPECT_NE(modelDetails(0), modelDetails(16));
}

} // namespace
} // namespace arbolex::engine
