#include "WideVectors.h"

#if defined(__x86_64__) && defined(__GNUC__)
#include <immintrin.h>
#endif

namespace kareport
{

#if defined(__x86_64__) && defined(__GNUC__)

namespace
{

__attribute__((target("avx"))) void zeroUpperHalves()
{
    _mm256_zeroupper();
}

} // namespace

void endWideVectors()
{
    static const bool hasWideVectors = __builtin_cpu_supports("avx") != 0;
    if (hasWideVectors) {
        zeroUpperHalves();
    }
}

#else

void endWideVectors() {}

#endif

} // namespace kareport
