// The inner loop of keyed drawing: one row, skipping the key colour.
#pragma once

#include <cstddef>
#include <cstdint>

#if defined(__SSE2__)
#include <emmintrin.h>
#elif defined(__ARM_NEON)
#include <arm_neon.h>
#endif

#if defined(__x86_64__) && defined(__GNUC__)
// Whether this processor runs 32-byte vectors; asked once.
bool CpuHasAvx2();
// The 32-pixel blocks of a keyed row; returns how many pixels it did (a multiple of 32).
std::size_t CopyRowKeyedAvx2(std::uint8_t* dst, const std::uint8_t* src, std::size_t n,
                             std::uint8_t key);
#endif

// dst[i] = src[i] for every i < n where src[i] != key; other bytes of dst keep their value.
// Sixteen pixels at a time: blocks wholly transparent are skipped, wholly opaque ones stored,
// mixed ones blended as a select (bytes under the key written back unchanged), so a sprite
// costs about a plain copy rather than a branch per pixel.
inline void CopyRowKeyed(std::uint8_t* dst, const std::uint8_t* src, std::size_t n,
                         std::uint8_t key) {
    std::size_t i = 0;
#if defined(__SSE2__)
    const __m128i k = _mm_set1_epi8(static_cast<char>(key));
    for (; i + 16 <= n; i += 16) {
        __m128i s = _mm_loadu_si128(reinterpret_cast<const __m128i*>(src + i));
        __m128i isKey = _mm_cmpeq_epi8(s, k);
        int keyBits = _mm_movemask_epi8(isKey);
        if (keyBits == 0xFFFF) {
            continue;  // all transparent: the edges of a sprite
        }
        if (keyBits == 0) {
            _mm_storeu_si128(reinterpret_cast<__m128i*>(dst + i), s);  // all opaque: its body
            continue;
        }
        __m128i d = _mm_loadu_si128(reinterpret_cast<const __m128i*>(dst + i));
        __m128i out = _mm_or_si128(_mm_and_si128(isKey, d), _mm_andnot_si128(isKey, s));
        _mm_storeu_si128(reinterpret_cast<__m128i*>(dst + i), out);
    }
#elif defined(__ARM_NEON)
    const uint8x16_t k = vdupq_n_u8(key);
    for (; i + 16 <= n; i += 16) {
        uint8x16_t s = vld1q_u8(src + i);
        uint8x16_t d = vld1q_u8(dst + i);
        vst1q_u8(dst + i, vbslq_u8(vceqq_u8(s, k), d, s));
    }
#endif
    for (; i < n; ++i) {
        if (src[i] != key) {
            dst[i] = src[i];
        }
    }
}
