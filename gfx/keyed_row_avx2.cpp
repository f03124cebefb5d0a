// The 32-byte version of the keyed row copy, for processors that have it. Compiled for AVX2
// in this one function only; the caller asks CpuHasAvx2 first.
#include "gfx/keyed_row.h"

#if defined(__x86_64__) && defined(__GNUC__)
#include <immintrin.h>

bool CpuHasAvx2() {
    static const bool has = __builtin_cpu_supports("avx2");
    return has;
}

__attribute__((target("avx2"))) std::size_t CopyRowKeyedAvx2(std::uint8_t* dst,
                                                             const std::uint8_t* src, std::size_t n,
                                                             std::uint8_t key) {
    const __m256i k = _mm256_set1_epi8(static_cast<char>(key));
    std::size_t i = 0;
    for (; i + 32 <= n; i += 32) {
        __m256i s = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(src + i));
        __m256i isKey = _mm256_cmpeq_epi8(s, k);
        unsigned keyBits = static_cast<unsigned>(_mm256_movemask_epi8(isKey));
        if (keyBits == 0xFFFFFFFFu) {
            continue;
        }
        if (keyBits == 0) {
            _mm256_storeu_si256(reinterpret_cast<__m256i*>(dst + i), s);
            continue;
        }
        __m256i d = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(dst + i));
        _mm256_storeu_si256(reinterpret_cast<__m256i*>(dst + i), _mm256_blendv_epi8(s, d, isKey));
    }
    return i;
}
#endif
