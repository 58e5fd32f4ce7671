#pragma once

// How a public procedure of the engine traps its run-time failures: its
// unchecked form runs, from a clean vector state (engine/vectorstate.hpp), and
// a failure is reported once and gives back 0.

#include "engine/checkedmath.hpp"
#include "engine/grow.hpp"
#include "engine/vectorstate.hpp"

namespace arbolex::engine {

template <typename Result, typename Body>
Result Grow::trapped(std::string_view lead, std::string_view mark, Body &&body) {
    clearUpperVectorState();
    try {
        return body();
    } catch (const RuntimeFault &fault) {
        reportFault(fault, titles::kArbolex, lead, mark);
        return Result{};
    }
}

} // namespace arbolex::engine
