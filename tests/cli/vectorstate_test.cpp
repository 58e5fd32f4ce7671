// The command line's options are read into a QHash: on a processor with AVX,
// Qt's string hash leaves the upper halves of the vector registers in use,
// which makes every legacy-SSE instruction after it slow. The rotation that a
// command runs next must start by clearing them. Skipped where the processor
// cannot show the state, or where this Qt leaves it clean.
#include "cli/options.hpp"
#include "engine/vectorprobe.hpp"
#include "engine/vectorstate.hpp"
#include "rotation/rotation.hpp"

#include <gtest/gtest.h>

namespace arbolex::cli {
namespace {

TEST(OptionsVectorStateTest, TheRotationAfterTheOptionsRunsWithTheUpperStateClear) {
    if (const char *why = engine::testing::whyStateCannotBeSeen()) {
        GTEST_SKIP() << why;
    }
    const Options options({QStringLiteral("--rotation"), QStringLiteral("50")}, {"rotation"});
    if (!*engine::upperVectorStateInUse()) {
        GTEST_SKIP() << "Qt's string hash leaves the upper state clean on this processor";
    }
    engine::Grow grow;
    rotation::GrowthFailure failure;
    const auto path = rotation::growPath(grow, {0, 15.0f, 2500.0f, 7.0f, 20.0f}, {}, failure);
    const bool inUse = *engine::upperVectorStateInUse();
    EXPECT_FALSE(inUse) << "the rotation ran in the state Qt left";
    EXPECT_TRUE(path.has_value()) << failure.text;
    EXPECT_TRUE(options.has("rotation"));
}

} // namespace
} // namespace arbolex::cli
