#include "engine/vectorstate.hpp"

#if defined(__x86_64__)
#include <cpuid.h>
#include <immintrin.h>
#define ARBOLEX_X86 1
#endif

#include <cstdint>

namespace arbolex::engine {

namespace {

#ifdef ARBOLEX_X86

/// XGETBV: the extended control register `index` (0: the state components
/// the system saves, XCR0; 1: those in use now, XINUSE).
std::uint64_t xgetbv(unsigned index) {
    unsigned low = 0;
    unsigned high = 0;
    __asm__ volatile("xgetbv" : "=a"(low), "=d"(high) : "c"(index));
    return (std::uint64_t{high} << 32) | low;
}

/// The AVX state component: the upper halves of YMM0-15 (bit 2 of XCR0 and
/// of XINUSE).
constexpr std::uint64_t kAvxState = 1U << 2;
constexpr std::uint64_t kSseState = 1U << 1;

bool detectAvx() {
    unsigned eax = 0;
    unsigned ebx = 0;
    unsigned ecx = 0;
    unsigned edx = 0;
    if (__get_cpuid(1, &eax, &ebx, &ecx, &edx) == 0) {
        return false;
    }
    const bool osxsave = (ecx & bit_OSXSAVE) != 0;
    const bool avx = (ecx & bit_AVX) != 0;
    return osxsave && avx && (xgetbv(0) & (kAvxState | kSseState)) == (kAvxState | kSseState);
}

/// XGETBV with ECX = 1 (CPUID leaf 0xD, sub-leaf 1, EAX bit 2).
bool detectXinuse() {
    unsigned eax = 0;
    unsigned ebx = 0;
    unsigned ecx = 0;
    unsigned edx = 0;
    if (!detectAvx() || __get_cpuid_max(0, nullptr) < 0xD) {
        return false;
    }
    __cpuid_count(0xD, 1, eax, ebx, ecx, edx);
    return (eax & (1U << 2)) != 0;
}

// Detected once, before main: a call from another static initialiser that
// runs first finds false and clears nothing, which is only slower.
const bool kHasAvx = detectAvx();

__attribute__((target("avx"))) void zeroUpper() {
    _mm256_zeroupper();
}

#endif

} // namespace

bool hasUpperVectorState() {
#ifdef ARBOLEX_X86
    return kHasAvx;
#else
    return false;
#endif
}

void clearUpperVectorState() {
#ifdef ARBOLEX_X86
    if (kHasAvx) {
        zeroUpper();
    }
#endif
}

void dirtyUpperVectorState() {
#ifdef ARBOLEX_X86
    if (kHasAvx) {
        // Written as text, not as an intrinsic in an AVX function: the
        // compiler would end such a function with VZEROUPPER of its own.
        __asm__ volatile("vpcmpeqd %%ymm15, %%ymm15, %%ymm15" ::: "xmm15");
    }
#endif
}

std::optional<bool> upperVectorStateInUse() {
#ifdef ARBOLEX_X86
    static const bool canTell = detectXinuse();
    if (canTell) {
        return (xgetbv(1) & kAvxState) != 0;
    }
#endif
    return std::nullopt;
}

} // namespace arbolex::engine
