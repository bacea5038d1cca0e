// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/RowKernels.h"

#include <cstring>

#if defined(__SANITIZE_THREAD__)
// Pictures come out of FFmpeg's threads, whose agreement this sanitizer can't
// see: each byte read would be a report to suppress.
#define VECTOR_KERNEL __attribute__((no_sanitize("thread")))
#elif defined(__x86_64__) && defined(__ELF__) && defined(__GNUC__) && !defined(__clang__) && \
    !defined(__SANITIZE_ADDRESS__)
#define VECTOR_KERNEL __attribute__((target_clones("arch=x86-64-v4", "avx2", "default")))
#else
#define VECTOR_KERNEL
#endif

namespace host {
namespace {

// A float that may stand at any address.
using UnalignedFloat __attribute__((aligned(1), may_alias)) = float;

inline float Within(float value, float least, float most) {
    const float low = value > least ? value : least;
    return low < most ? low : most;
}

inline std::uint32_t Rounded(float value, float least, float most) {
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(Within(value, least, most) + 0.5f));
}

// A file may hold more than ten bits in a word of ten.
inline std::uint32_t ThreeOf10(std::uint32_t low, std::uint32_t middle, std::uint32_t high) {
    return (low & 0x3FF) | (middle & 0x3FF) << 10 | (high & 0x3FF) << 20;
}

inline std::uint32_t Swapped16(std::uint32_t value) {
    return (value >> 8 | value << 8) & 0xFFFFu;
}

}  // namespace

VECTOR_KERNEL
void WidenBytes(const std::uint8_t* __restrict from, int count, float* __restrict to) {
    for (int i = 0; i < count; ++i) {
        to[i] = static_cast<float>(from[i]);
    }
}

void WidenStridedBytes(const std::uint8_t* __restrict from, int step, int count,
                       float* __restrict to) {
    for (int i = 0; i < count; ++i) {
        to[i] = static_cast<float>(from[static_cast<std::ptrdiff_t>(i) * step]);
    }
}

VECTOR_KERNEL
void WidenWords(const std::uint8_t* __restrict from, int shift, int depth, int count,
                float* __restrict to) {
    const std::uint32_t mask = (1u << depth) - 1u;
    for (int i = 0; i < count; ++i) {
        std::uint16_t word;
        std::memcpy(&word, from + static_cast<std::ptrdiff_t>(i) * 2, sizeof word);
        to[i] = static_cast<float>(static_cast<std::int32_t>(word >> shift & mask));
    }
}

VECTOR_KERNEL
void BlendRows(const float* __restrict a, const float* __restrict b, float weight, int count,
               float* __restrict to) {
    for (int i = 0; i < count; ++i) {
        to[i] = a[i] + (b[i] - a[i]) * weight;
    }
}

VECTOR_KERNEL
void ApplyAffine(const Affine& affine, const float* __restrict x, const float* __restrict y,
                 const float* __restrict z, int count, float* __restrict r, float* __restrict g,
                 float* __restrict b) {
    const Affine k = affine;
    for (int i = 0; i < count; ++i) {
        r[i] = k.m[0][0] * x[i] + k.m[0][1] * y[i] + k.m[0][2] * z[i] + k.m[0][3];
        g[i] = k.m[1][0] * x[i] + k.m[1][1] * y[i] + k.m[1][2] * z[i] + k.m[1][3];
        b[i] = k.m[2][0] * x[i] + k.m[2][1] * y[i] + k.m[2][2] * z[i] + k.m[2][3];
    }
}

VECTOR_KERNEL
void ScaleRow(const float* from, float scale, float offset, int count, float* to) {
    for (int i = 0; i < count; ++i) {
        to[i] = from[i] * scale + offset;
    }
}

VECTOR_KERNEL
void DoubleChroma(const float* __restrict from, float before, float behind, int count,
                  float* __restrict to) {
    for (int i = 0; i < count / 2; ++i) {
        to[2 * i] = from[i] + (from[i - 1] - from[i]) * before;
        to[2 * i + 1] = from[i] + (from[i + 1] - from[i]) * behind;
    }
    if (count % 2 != 0) {
        const int last = count / 2;
        to[count - 1] = from[last] + (from[last - 1] - from[last]) * before;
    }
}

VECTOR_KERNEL
void HalveChroma(const float* __restrict from, int width, float* __restrict to) {
    const auto mean = [](float left, float middle, float right) {
        return (left + 2.0f * middle + right) * 0.25f;
    };
    const int pairs = width / 2;
    to[0] = mean(from[0], from[0], from[width > 1 ? 1 : 0]);
    for (int i = 1; i < pairs; ++i) {
        to[i] = mean(from[2 * i - 1], from[2 * i], from[2 * i + 1]);
    }
    if (width % 2 != 0 && width > 1) {
        to[pairs] = mean(from[width - 2], from[width - 1], from[width - 1]);
    }
}

VECTOR_KERNEL
void StoreBgra(const float* __restrict r, const float* __restrict g, const float* __restrict b,
               const float* __restrict alpha, int count, std::uint8_t* __restrict to) {
    for (int i = 0; i < count; ++i) {
        const std::uint32_t pixel = Rounded(b[i], 0.0f, 255.0f) | Rounded(g[i], 0.0f, 255.0f) << 8 |
                                    Rounded(r[i], 0.0f, 255.0f) << 16 |
                                    Rounded(alpha[i], 0.0f, 255.0f) << 24;
        std::memcpy(to + static_cast<std::ptrdiff_t>(i) * 4, &pixel, sizeof pixel);
    }
}

VECTOR_KERNEL
void StoreOpaqueBgra(const Affine& affine, const float* __restrict y, const float* __restrict cb,
                     const float* __restrict cr, int count, std::uint8_t* __restrict to) {
    const Affine k = affine;
    for (int i = 0; i < count; ++i) {
        const float luma = k.m[0][0] * y[i];
        const float r = luma + (k.m[0][2] * cr[i] + k.m[0][3]);
        const float g = luma + (k.m[1][1] * cb[i] + (k.m[1][2] * cr[i] + k.m[1][3]));
        const float b = luma + (k.m[2][1] * cb[i] + k.m[2][3]);
        const std::uint32_t pixel = Rounded(b, 0.0f, 255.0f) | Rounded(g, 0.0f, 255.0f) << 8 |
                                    Rounded(r, 0.0f, 255.0f) << 16 | 0xFF000000u;
        std::memcpy(to + static_cast<std::ptrdiff_t>(i) * 4, &pixel, sizeof pixel);
    }
}

VECTOR_KERNEL
void StoreArgb16(const float* __restrict r, const float* __restrict g, const float* __restrict b,
                 const float* __restrict alpha, int count, std::uint8_t* __restrict to) {
    for (int i = 0; i < count; ++i) {
        const std::uint32_t first = Swapped16(Rounded(alpha[i], 0.0f, 65535.0f)) |
                                    Swapped16(Rounded(r[i], 0.0f, 65535.0f)) << 16;
        const std::uint32_t second = Swapped16(Rounded(g[i], 0.0f, 65535.0f)) |
                                     Swapped16(Rounded(b[i], 0.0f, 65535.0f)) << 16;
        std::memcpy(to + static_cast<std::ptrdiff_t>(i) * 8, &first, sizeof first);
        std::memcpy(to + static_cast<std::ptrdiff_t>(i) * 8 + 4, &second, sizeof second);
    }
}

VECTOR_KERNEL
void StoreAyuvFloat(const float* __restrict y, const float* __restrict cb,
                    const float* __restrict cr, const float* __restrict alpha, int count,
                    std::uint8_t* __restrict to) {
    auto* const out = reinterpret_cast<UnalignedFloat*>(to);
    for (int i = 0; i < count; ++i) {
        out[4 * i] = alpha[i];
        out[4 * i + 1] = y[i];
        out[4 * i + 2] = cb[i];
        out[4 * i + 3] = cr[i];
    }
}

VECTOR_KERNEL
void StoreUyvy(const float* __restrict luma, const float* __restrict cb, const float* __restrict cr,
               int count, float least, float most, std::uint8_t* __restrict to) {
    for (int i = 0; i < count / 2; ++i) {
        const std::uint32_t pair =
            Rounded(cb[i], least, most) | Rounded(luma[2 * i], least, most) << 8 |
            Rounded(cr[i], least, most) << 16 | Rounded(luma[2 * i + 1], least, most) << 24;
        std::memcpy(to + static_cast<std::ptrdiff_t>(i) * 4, &pair, sizeof pair);
    }
    if (count % 2 != 0) {
        to[2 * (count - 1)] = static_cast<std::uint8_t>(Rounded(cb[count / 2], least, most));
        to[2 * (count - 1) + 1] = static_cast<std::uint8_t>(Rounded(luma[count - 1], least, most));
    }
}

VECTOR_KERNEL
void RoundRow(const float* __restrict from, float least, float most, int count,
              std::uint16_t* __restrict to) {
    for (int i = 0; i < count; ++i) {
        to[i] = static_cast<std::uint16_t>(Rounded(from[i], least, most));
    }
}

void StoreV210(const std::uint16_t* __restrict luma, const std::uint16_t* __restrict cb,
               const std::uint16_t* __restrict cr, int count, std::uint8_t* __restrict to) {
    const auto group = [&](const std::uint16_t* y, const std::uint16_t* u, const std::uint16_t* v) {
        const std::uint32_t words[4] = {ThreeOf10(u[0], y[0], v[0]), ThreeOf10(y[1], u[1], y[2]),
                                        ThreeOf10(v[1], y[3], u[2]), ThreeOf10(y[4], v[2], y[5])};
        std::memcpy(to, words, sizeof words);
        to += sizeof words;
    };
    int x = 0;
    for (; x + 6 <= count; x += 6) {
        group(luma + x, cb + x / 2, cr + x / 2);
    }
    const int left = count - x;
    if (left > 0) {  // the rest of the last group is zero
        std::uint16_t y[6] = {}, u[3] = {}, v[3] = {};
        std::memcpy(y, luma + x, static_cast<std::size_t>(left) * 2);
        std::memcpy(u, cb + x / 2, static_cast<std::size_t>((left + 1) / 2) * 2);
        std::memcpy(v, cr + x / 2, static_cast<std::size_t>((left + 1) / 2) * 2);
        group(y, u, v);
    }
    const int groups = (count + 5) / 6;
    const int whole = (count + 47) / 48 * 8;
    std::memset(to, 0, static_cast<std::size_t>(whole - groups) * 16);
}

VECTOR_KERNEL
void StoreUyvyFromBytes(const std::uint8_t* __restrict luma, const std::uint8_t* __restrict cb,
                        const std::uint8_t* __restrict cr, int count, std::uint8_t* __restrict to) {
    for (int i = 0; i < count / 2; ++i) {
        to[4 * i] = cb[i];
        to[4 * i + 1] = luma[2 * i];
        to[4 * i + 2] = cr[i];
        to[4 * i + 3] = luma[2 * i + 1];
    }
    if (count % 2 != 0) {
        to[2 * (count - 1)] = cb[count / 2];
        to[2 * (count - 1) + 1] = luma[count - 1];
    }
}

VECTOR_KERNEL
void BlendBytes(const std::uint8_t* __restrict a, const std::uint8_t* __restrict b, int weight,
                int count, std::uint8_t* __restrict to) {
    const unsigned wb = static_cast<unsigned>(weight);
    const unsigned wa = 8u - wb;
    for (int i = 0; i < count; ++i) {
        to[i] = static_cast<std::uint8_t>((a[i] * wa + b[i] * wb + 4u) >> 3);
    }
}

}  // namespace host
