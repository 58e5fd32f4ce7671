// Results of the engine recorded bit for bit. The build turns off contraction
// into fused multiply-adds, so these hold at every optimisation level; a change
// that moves any of them changes what users see in their tables.
#include "recordingreport.hpp"

#include <vector>

namespace arbolex::engine::testing {
namespace {

using GoldenTest = EngineTest;

/// Age, basal area, stocking, top height, volume.
struct Row {
    float age, g, n, h, v;
};

void expectRows(const std::vector<StandState> &states, const std::vector<Row> &rows) {
    ASSERT_EQ(states.size(), rows.size());
    for (std::size_t k = 0; k < rows.size(); ++k) {
        SCOPED_TRACE(rows[k].age);
        EXPECT_EQ(states[k].age, rows[k].age);
        EXPECT_EQ(states[k].basalArea, rows[k].g);
        EXPECT_EQ(states[k].stocking, rows[k].n);
        EXPECT_EQ(states[k].topHeight, rows[k].h);
        EXPECT_EQ(states[k].volume, rows[k].v);
    }
}

/// The reference stand (age 15, 20 m²/ha, 2500 stems/ha, 7 m) grown to 45 by 5.
std::vector<StandState> referenceProjection(Grow &grow, int model, float siteIndex) {
    EXPECT_TRUE(grow.GetModel(static_cast<std::int16_t>(model)));
    grow.GetVCF();
    EXPECT_TRUE(grow.SiteIndex(15.0f, 7.0f));
    EXPECT_EQ(grow.siteIndex(), siteIndex);
    grow.TM(grow.siteIndex());
    std::vector<StandState> states;
    EXPECT_TRUE(grow.PROJ(15.0f, 20.0f, 2500.0f, 7.0f, 45.0f, 5.0f, states));
    return states;
}

TEST_F(GoldenTest, SitkaSpruceProjection) {
    expectRows(referenceProjection(grow, 0, 0x1.003b2p+4f),
               {
                   {0x1.ep+3f, 0x1.4p+4f, 0x1.388p+11f, 0x1.cp+2f, 0x1.60e7bcp+5f},
                   {0x1.4p+4f, 0x1.11e66cp+5f, 0x1.2970f8p+11f, 0x1.40a1a6p+3f, 0x1.198feep+7f},
                   {0x1.9p+4f, 0x1.6d10b2p+5f, 0x1.16c0dep+11f, 0x1.a1b02ap+3f, 0x1.ff9daap+7f},
                   {0x1.ep+4f, 0x1.b64fcp+5f, 0x1.034d8p+11f, 0x1.003b2p+4f, 0x1.78f4ap+8f},
                   {0x1.18p+5f, 0x1.f17606p+5f, 0x1.e0783p+10f, 0x1.2da558p+4f, 0x1.f2294cp+8f},
                   {0x1.4p+5f, 0x1.10b0ap+6f, 0x1.bc2e1p+10f, 0x1.58991p+4f, 0x1.33eb7ep+9f},
                   {0x1.68p+5f, 0x1.241f5ap+6f, 0x1.9a3efcp+10f, 0x1.80d2cp+4f, 0x1.6be206p+9f},
               });
}

TEST_F(GoldenTest, LodgepolePineProjection) {
    expectRows(referenceProjection(grow, 6, 0x1.9c2c86p+3f),
               {
                   {0x1.ep+3f, 0x1.4p+4f, 0x1.388p+11f, 0x1.cp+2f, 0x1.856b7cp+5f},
                   {0x1.4p+4f, 0x1.004e9ep+5f, 0x1.2ef5a6p+11f, 0x1.24d43ap+3f, 0x1.e0d402p+6f},
                   {0x1.9p+4f, 0x1.4ab258p+5f, 0x1.20d48ap+11f, 0x1.63a2acp+3f, 0x1.8793bcp+7f},
                   {0x1.ep+4f, 0x1.827472p+5f, 0x1.1029f4p+11f, 0x1.9c2c86p+3f, 0x1.0c8ca4p+8f},
                   {0x1.18p+5f, 0x1.acb716p+5f, 0x1.fcadd2p+10f, 0x1.ce9dbp+3f, 0x1.504dc2p+8f},
                   {0x1.4p+5f, 0x1.cd9e24p+5f, 0x1.d882bcp+10f, 0x1.fb5606p+3f, 0x1.8eadf6p+8f},
                   {0x1.68p+5f, 0x1.e81feep+5f, 0x1.b4f94cp+10f, 0x1.11665cp+4f, 0x1.c8002ep+8f},
               });
}

TEST_F(GoldenTest, NewtonQuarterVolumeThinning) {
    ASSERT_TRUE(grow.GetModel(0));
    grow.GetVCF();
    ASSERT_TRUE(grow.SiteIndex(30.0f, 13.0f));
    const float v = grow.GetV7(40.0f, 2000.0f, 13.0f);
    EXPECT_EQ(v, 0x1.b91fb4p+7f);
    float nr = 0.0f, gr = 0.0f;
    ASSERT_TRUE(grow.NEWTON(2000.0f, 40.0f, 13.0f, 0.75f * v, nr, gr));
    EXPECT_EQ(gr, 0x1.e527a2p+4f);
    EXPECT_EQ(nr, 0x1.494056p+10f);
}

} // namespace
} // namespace arbolex::engine::testing
