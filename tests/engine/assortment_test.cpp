// The assortment calculation: properties over a grid of stands for every
// catalogue model, the user categories and the three failure messages.
#include "recordingreport.hpp"

#include <cmath>
#include <string>
#include <vector>

namespace arbolex::engine::testing {
namespace {

struct GridStand {
    float g, n, h;
    double dq() const { return 200.0 * std::sqrt(double{g} / (double{n} * 3.14159265358979)); }
};

/// Basal areas 10–90 m²/ha, stocking 200–5000 stems/ha, top heights 6–30 m.
std::vector<GridStand> standGrid() {
    std::vector<GridStand> grid;
    for (const float n : {200.0f, 450.0f, 900.0f, 1600.0f, 2500.0f, 5000.0f}) {
        for (const float h : {6.0f, 11.0f, 17.0f, 24.0f, 30.0f}) {
            for (float g = 10.0f; g <= 90.0f; g += 5.0f) {
                grid.push_back({g, n, h});
            }
        }
    }
    return grid;
}

double share(const Assortment &a, std::size_t i) {
    return a.volume > 0.0f ? double{a.classVolume[i]} / double{a.volume} : 0.0;
}

class AssortmentModelTest : public EngineTest, public ::testing::WithParamInterface<int> {
protected:
    void SetUp() override {
        ASSERT_TRUE(grow.GetModel(static_cast<std::int16_t>(GetParam())));
        grow.setSiteIndex(18.0f);
        ASSERT_TRUE(grow.GetVCF());
    }

    Assortment fixed(const GridStand &s) {
        Assortment a;
        EXPECT_TRUE(grow.AsmtB(s.g, s.n, s.h, {}, a)) << s.g << " " << s.n << " " << s.h;
        return a;
    }
};

TEST_P(AssortmentModelTest, ClassesAreNonNegativeAndAddUpToTheStandVolume) {
    for (const GridStand &s : standGrid()) {
        const Assortment a = fixed(s);
        ASSERT_EQ(a.count, 3u);
        EXPECT_EQ(a.volume, grow.GetV7(s.g, s.n, s.h));
        double sum = 0.0;
        double percent = 0.0;
        for (std::size_t i = 0; i < 3; ++i) {
            EXPECT_GE(a.classVolume[i], 0.0f);
            sum += a.classVolume[i];
            percent += a.percent(i);
        }
        if (a.volume > 0.0f) {
            EXPECT_TRUE(nearRel(a.volume, sum, 1e-5)) << s.g << " " << s.n << " " << s.h;
            EXPECT_TRUE(nearRel(100.0, percent, 1e-5));
        } else {
            EXPECT_EQ(sum, 0.0); // no volume to 7 cm top: nothing to divide
        }
    }
}

TEST_P(AssortmentModelTest, BiggerMeanTreesNeverLoseSawlogShare) {
    // Along the grid's basal areas at one stocking and height, the mean
    // diameter grows.
    const std::vector<GridStand> grid = standGrid();
    for (std::size_t i = 1; i < grid.size(); ++i) {
        const GridStand &a = grid[i - 1];
        const GridStand &b = grid[i];
        if (a.n != b.n || a.h != b.h) {
            continue;
        }
        const Assortment small = fixed(a);
        const Assortment big = fixed(b);
        if (small.volume <= 0.0f || big.volume <= 0.0f) {
            continue;
        }
        EXPECT_GE(share(big, 2), share(small, 2) - 1e-6) << b.g << " " << b.n << " " << b.h;
        EXPECT_LE(share(big, 0), share(small, 0) + 1e-6) << b.g << " " << b.n << " " << b.h;
    }
}

TEST_P(AssortmentModelTest, ThinStandsHaveAlmostNoSawlog) {
    for (const GridStand &s : standGrid()) {
        if (s.dq() < 10.0) {
            EXPECT_LT(share(fixed(s), 2), 0.005) << s.dq();
        }
    }
}

TEST_P(AssortmentModelTest, ASmallChangeOfBasalAreaMakesASmallChangeOfEveryClass) {
    for (const GridStand &s : standGrid()) {
        const Assortment a = fixed(s);
        const Assortment b = fixed({s.g * 1.001f, s.n, s.h});
        const double volumeChange = std::fabs(double{b.volume} - a.volume);
        for (std::size_t i = 0; i < 3; ++i) {
            // 0.1 % more basal area moves no class by more than the volume
            // moved plus 1 % of the volume, and no share by a point.
            EXPECT_LE(std::fabs(double{b.classVolume[i]} - a.classVolume[i]),
                      volumeChange + 0.01 * std::fabs(double{a.volume}) + 1e-3)
                << i << ": " << s.g << " " << s.n << " " << s.h;
            if (a.volume > 0.0f && b.volume > 0.0f) {
                EXPECT_LE(std::fabs(b.percent(i) - a.percent(i)), 1.0f)
                    << i << ": " << s.g << " " << s.n << " " << s.h;
            }
        }
    }
}

INSTANTIATE_TEST_SUITE_P(EveryModel, AssortmentModelTest, ::testing::Range(0, kModelCount));

using AssortmentTest = EngineTest;

TEST_F(AssortmentTest, EntriesWithIdenticalCoefficientsGiveIdenticalResults) {
    const auto &entries = catalogue();
    Grow other;
    const std::vector<GridStand> grid = standGrid();
    for (int i = 0; i < kModelCount; ++i) {
        for (int j = i + 1; j < kModelCount; ++j) {
            const CatalogueEntry &a = entries[static_cast<std::size_t>(i)];
            const CatalogueEntry &b = entries[static_cast<std::size_t>(j)];
            if (a.a != b.a) {
                continue;
            }
            grow.GetModel(static_cast<std::int16_t>(i));
            other.GetModel(static_cast<std::int16_t>(j));
            grow.setSiteIndex(18.0f);
            other.setSiteIndex(18.0f);
            for (const GridStand &s : grid) {
                Assortment x;
                Assortment y;
                ASSERT_TRUE(grow.AsmtB(s.g, s.n, s.h, {}, x));
                ASSERT_TRUE(other.AsmtB(s.g, s.n, s.h, {}, y));
                for (std::size_t k = 0; k < 3; ++k) {
                    // Same assortment set: same shares; same volume set too: same volumes.
                    if (x.volume > 0.0f && y.volume > 0.0f) {
                        EXPECT_NEAR(x.percent(k), y.percent(k), 1e-4) << i << " " << j;
                    }
                    if (a.v == b.v) {
                        EXPECT_EQ(x.classVolume[k], y.classVolume[k]) << i << " " << j;
                    }
                }
            }
        }
    }
}

TEST_F(AssortmentTest, UserCategoriesAreComputedEachOnItsOwn) {
    ASSERT_TRUE(grow.GetModel(0));
    grow.setSiteIndex(18.0f);
    const GridStand s{40.0f, 900.0f, 18.0f};
    Assortment classes;
    ASSERT_TRUE(grow.AsmtB(s.g, s.n, s.h, {}, classes));

    // The fixed classes as categories, plus an overlapping one and an open one.
    const std::vector<AssortmentCategory> categories{
        {7.0f, 14.0f}, {15.0f, 20.0f}, {21.0f, 0.0f}, {12.0f, 24.0f}, {7.0f, 0.0f}};
    Assortment user;
    ASSERT_TRUE(grow.AsmtB(s.g, s.n, s.h, categories, user));
    ASSERT_EQ(user.count, 5u);
    for (std::size_t i = 0; i < 3; ++i) {
        EXPECT_EQ(user.classVolume[i], classes.classVolume[i]) << i;
    }
    EXPECT_GT(user.classVolume[3], 0.0f);
    EXPECT_LT(user.classVolume[3], user.volume);
    EXPECT_TRUE(nearRel(user.volume, user.classVolume[4], 1e-6)); // everything to 7 cm top
}

TEST_F(AssortmentTest, TheStandRatioFallsWithTheTopDiameter) {
    for (const double dq : {8.0, 15.0, 25.0, 40.0}) {
        double previous = 1.0;
        for (double t = 1.0; t <= 60.0; t += 0.5) {
            const double r = StandVolumeRatio(dq, t, {-3.2, 4.7});
            EXPECT_LE(r, previous) << dq << " " << t;
            EXPECT_GE(r, 0.0);
            previous = r;
        }
        EXPECT_GT(StandVolumeRatio(dq, 0.5, {-3.2, 4.7}), 0.99);
        EXPECT_EQ(StandVolumeRatio(dq, INFINITY, {-3.2, 4.7}), 0.0);
    }
}

struct FailureCase {
    const char *name;
    std::vector<AssortmentCategory> categories;
    float g, n;
    std::vector<std::string> messages;
};

class AssortmentFailureTest : public EngineTest,
                              public ::testing::WithParamInterface<FailureCase> {};

TEST_P(AssortmentFailureTest, ReportsAndGivesNothing) {
    const FailureCase &c = GetParam();
    ASSERT_TRUE(grow.GetModel(6));
    Assortment a;
    a.count = 9;
    EXPECT_FALSE(grow.AsmtB(c.g, c.n, 12.0f, c.categories, a));
    EXPECT_EQ(a.count, 0u);
    EXPECT_EQ(a.volume, 0.0f);
    ASSERT_EQ(report.messages.size(), c.messages.size());
    for (std::size_t i = 0; i < c.messages.size(); ++i) {
        EXPECT_EQ(report.messages[i].text, c.messages[i]);
        EXPECT_EQ(report.messages[i].title, titles::kArbolex);
    }
    ASSERT_EQ(report.logLines.size(), c.messages.size());
    EXPECT_EQ(report.logLines.back(),
              "ERROR - Non-recoverable Assortment calculation error. in Grow.AsmtB()");
    report.clear();
}

const char *const kAsmtG = "ERROR - Non-recoverable AsmtG calculation error";
const char *const kAsmtH = "ERROR - Non-recoverable AsmtH calculation error";
const char *const kAsmtB = "ERROR - Non-recoverable Assortment calculation error.";

INSTANTIATE_TEST_SUITE_P(
    Cases, AssortmentFailureTest,
    ::testing::Values(
        FailureCase{"SmallEndUnder7", {{6.0f, 14.0f}}, 30.0f, 900.0f, {kAsmtG, kAsmtB}},
        FailureCase{"BigEndBelowSmallEnd", {{14.0f, 9.0f}}, 30.0f, 900.0f, {kAsmtG, kAsmtB}},
        FailureCase{"NoBasalArea", {}, 0.0f, 900.0f, {kAsmtH, kAsmtB}},
        FailureCase{"NoStocking", {}, 30.0f, 0.0f, {kAsmtH, kAsmtB}}),
    [](const auto &test) { return std::string(test.param.name); });

} // namespace
} // namespace arbolex::engine::testing
