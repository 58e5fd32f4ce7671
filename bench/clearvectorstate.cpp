// A library to preload into a program (LD_PRELOAD) when measuring it: clears
// the upper halves of the vector registers (VZEROUPPER) before every pow,
// exp and log the program calls, then calls libm's own. A run with it shows
// how fast the program would be if no library ever left that state in use;
// the program's own guard should leave it nothing to gain
// (docs/performance.md).
#include <dlfcn.h>

#include <immintrin.h>

namespace {

template <typename F> F next(const char *name) {
    return reinterpret_cast<F>(dlsym(RTLD_NEXT, name));
}

__attribute__((target("avx"))) void zeroUpper() {
    _mm256_zeroupper();
}

/// The program runs on a processor with AVX, or there is nothing to clear.
bool hasAvx() {
    static const bool avx = __builtin_cpu_supports("avx");
    return avx;
}

void clear() {
    if (hasAvx()) {
        zeroUpper();
    }
}

} // namespace

/// `name` of libm, called after the state is cleared.
#define ARBOLEX_CLEARED(name, Parameters, Arguments)                                               \
    double name Parameters {                                                                       \
        using Function = double(*) Parameters;                                                     \
        static const Function libm = next<Function>(#name);                                        \
        clear();                                                                                   \
        return libm Arguments;                                                                     \
    }

extern "C" {

ARBOLEX_CLEARED(pow, (double x, double y), (x, y))
ARBOLEX_CLEARED(exp, (double x), (x))
ARBOLEX_CLEARED(log, (double x), (x))
ARBOLEX_CLEARED(expm1, (double x), (x))
ARBOLEX_CLEARED(log1p, (double x), (x))

} // extern "C"
