#pragma once

// The tests' own view of the vector state, independent of the engine's guard:
// a test that removed the guard must still be able to tell a clean state from
// a dirty one.

#include "engine/vectorstate.hpp"

namespace arbolex::engine::testing {

/// Clears the upper halves with the test's own VZEROUPPER (the engine's
/// clearUpperVectorState is what the tests check, so it is not used here).
inline void clearForTest() {
#if defined(__x86_64__)
    if (hasUpperVectorState()) {
        __asm__ volatile("vzeroupper");
    }
#endif
}

/// Why the state cannot be seen changing on this processor, or nullptr when it
/// can: left in use by a 256-bit instruction and cleared by VZEROUPPER.
inline const char *whyStateCannotBeSeen() {
    if (!upperVectorStateInUse()) {
        return "this processor has no AVX state or cannot report it (XGETBV with ECX = 1): "
               "the vector-state penalty cannot happen or cannot be seen";
    }
    dirtyUpperVectorState();
    const bool shown = *upperVectorStateInUse();
    clearForTest();
    if (!shown || *upperVectorStateInUse()) {
        return "this processor does not report the AVX state as it changes";
    }
    return nullptr;
}

} // namespace arbolex::engine::testing
