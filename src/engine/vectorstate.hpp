#pragma once

// The upper halves of the vector registers (docs/performance.md).
//
// A library that runs 256-bit instructions and returns without clearing the
// upper halves of the registers (Qt's string hash does) leaves the vector
// unit "dirty": from then on every legacy-SSE instruction of the process,
// libm's pow and exp among them, merges into the full register and runs
// several times slower, and a thread started from that state inherits it.
// Every batch of numeric work therefore starts by clearing the upper state:
// the engine's procedures, the rotation's and the valuation's functions, the
// estate's rows and each worker thread. Clearing changes no result: it only
// zeroes bits that no scalar instruction reads.

#include <optional>

namespace arbolex::engine {

/// True when the processor has AVX and the operating system saves its state:
/// only then can the upper halves be left in use, and only then are they
/// cleared.
bool hasUpperVectorState();

/// Clears the upper halves of the vector registers (VZEROUPPER) on a
/// processor that has them; does nothing elsewhere. Costs about a nanosecond:
/// call it where a batch of numeric work begins and after any call out of it
/// (a progress callback, a sink) that may run another library's code.
void clearUpperVectorState();

/// Leaves the upper halves in use, as a library that runs a 256-bit
/// instruction and returns without VZEROUPPER does; nothing on a processor
/// without them. For the tests and benchmarks that show the penalty and its
/// cure.
void dirtyUpperVectorState();

/// Whether the upper halves are in use right now (bit 2 of XINUSE, read by
/// XGETBV with ECX = 1); std::nullopt where the processor cannot tell.
std::optional<bool> upperVectorStateInUse();

} // namespace arbolex::engine
