// Fractal textures by midpoint displacement: jagged one-dimensional
// profiles between two fixed ends (the torn and rough edges of borders)
// and a grey diamond-square texture.
#include <cmath>
#include <cstddef>
#include <cstdint>

#include "core/core_internal.h"

namespace {

// The largest power of two p with p <= n (1 when n < 2), counted in 64 bits
// so that no int32 range can overflow the doubling.
std::int64_t largest_power_of_two_within(std::int64_t n) {
    std::int64_t p = 1;
    while (n >= 2 * p) p *= 2;
    return p;
}

// One midpoint's displacement before scaling; modes without a generator
// draw nothing, leaving a plain interpolation.
float displacement(std::int32_t mode, VorRNG* rng) {
    switch (mode) {
        case VOR_MPD_UNIFORM:
            return VorRNGNextFloat(rng) - 0.5f;
        case VOR_MPD_NORMAL:
            return VorRNGNextFloatNormal(rng);
        case VOR_MPD_LAPLACE:
            return VorRNGNextFloatLaplace(rng);
        default:
            return 0.0f;
    }
}

// Each level halves the segments and scales the displacement by
// 2^-roughness: roughness 1 halves it, 0 keeps every scale equally rough.
float level_factor(float roughness) { return vorlite::core::powf(2.0f, -roughness); }

// Level by level, coarse to fine, left to right within a level: one draw
// per midpoint, so a profile is a function of the generator's sequence.
void displace(float* profile, std::int64_t first, std::int64_t end, std::int64_t span, float amplitude,
              float roughness, std::int32_t mode, VorRNG* rng) {
    if (span <= 1) return;
    const float factor = level_factor(roughness);
    float a = amplitude;
    std::int64_t step = span;
    std::int64_t half = span / 2;
    for (;;) {
        for (std::int64_t i = first; i < end; i += step) {
            const float r = displacement(mode, rng);
            profile[i + half] = r * a + (profile[i + step] + profile[i]) * 0.5f;
        }
        a *= factor;
        if (half < 2) return;
        step = half;
        half /= 2;
    }
}

// Stretches profile[0..end] over profile[0..last] in place, downwards so
// that every source is read before it is overwritten (its index never
// exceeds the one written).
void stretch(float* profile, std::int64_t end, std::int64_t last) {
    const double q = 1.0 / (static_cast<double>(last) / static_cast<double>(end));
    for (std::int64_t j = last; j >= 0; --j) {
        const double x = static_cast<double>(j) * q;
        const double k = std::floor(x);
        const double t = x - k;
        const auto i = static_cast<std::int64_t>(k);
        profile[j] = t < 0.0001 ? profile[i]
                                : static_cast<float>(static_cast<double>(profile[i + 1]) * t +
                                                     static_cast<double>(profile[i]) * (1.0 - t));
    }
}

void midpoint_displacement(float* profile, std::int32_t first, std::int32_t last, float amplitude,
                           float roughness, std::int32_t mode, VorRNG* rng) {
    const std::int64_t span = largest_power_of_two_within(static_cast<std::int64_t>(last) - first);
    const std::int64_t end = first + span;
    profile[end] = profile[last];
    displace(profile, first, end, span, amplitude, roughness, mode, rng);
    if (last > end) stretch(profile, end, last);
}

// The texture's grey: above the range white, truncated within it, below it
// (and NaN) black.
std::uint8_t edge_grey(float v) {
    if (v > 255.0f) return 255;
    if (!(v > 0.0f)) return 0;
    return static_cast<std::uint8_t>(v);
}

// An interior point: a quarter of its four neighbours plus an upward
// displacement (the draw is not centred, so the texture brightens toward
// its fine detail), truncated, then held to a byte.
std::uint8_t interior_grey(int neighbour_sum, float a, VorRNG* rng) {
    const float n = VorRNGNextFloat(rng);
    const auto g = vorlite::core::truncate_clamped<std::int32_t>(0.25f * static_cast<float>(neighbour_sum) + n * a);
    if (g > 254) return 255;
    if (g < 0) return 0;
    return static_cast<std::uint8_t>(g);
}

class Square {
public:
    explicit Square(VorBitmap* bitmap) : data_(bitmap->data), width_(bitmap->width) {}

    std::uint8_t level(std::int64_t x, std::int64_t y) const { return at(x, y)[0]; }
    void set(std::int64_t x, std::int64_t y, std::uint8_t grey) const {
        std::uint8_t* p = at(x, y);
        p[0] = grey;
        p[1] = grey;
        p[2] = grey;
    }

private:
    std::uint8_t* at(std::int64_t x, std::int64_t y) const {
        return data_ + (static_cast<std::size_t>(y) * width_ + static_cast<std::size_t>(x)) * 4;
    }
    std::uint8_t* data_;
    std::uint32_t width_;
};

// The centre of every square of the level, from its four corners.
void diamond_step(const Square& s, std::int64_t size, std::int64_t step, float a, VorRNG* rng) {
    const std::int64_t half = step / 2;
    for (std::int64_t y = 0; y < size; y += step) {
        for (std::int64_t x = 0; x < size; x += step) {
            const int sum = s.level(x, y) + s.level(x + step, y) + s.level(x, y + step) + s.level(x + step, y + step);
            s.set(x + half, y + half, interior_grey(sum, a, rng));
        }
    }
}

// The midpoints of the squares' inner edges, row by row, from their four
// neighbours at half the step; the outer edges keep the profiles. Rows on
// the squares' sides hold horizontal edge midpoints, rows through their
// centres the vertical ones.
void square_step(const Square& s, std::int64_t size, std::int64_t step, float a, VorRNG* rng) {
    const std::int64_t half = step / 2;
    for (std::int64_t y = half; y < size; y += half) {
        const std::int64_t first_x = (y % step == 0) ? half : step;
        for (std::int64_t x = first_x; x < size; x += step) {
            const int sum = s.level(x, y - half) + s.level(x - half, y) + s.level(x + half, y) + s.level(x, y + half);
            s.set(x, y, interior_grey(sum, a, rng));
        }
    }
}

}  // namespace

extern "C" {

VOR_API void VorMPDSeed(float* profile, int32_t first, int32_t last, float amplitude, float roughness,
                        int32_t mode, uint32_t seed) {
    VorRNG rng;
    VorRNGSeed(&rng, seed);
    midpoint_displacement(profile, first, last, amplitude, roughness, mode, &rng);
}

VOR_API void VorMPDRNG(float* profile, int32_t first, int32_t last, float amplitude, float roughness,
                       int32_t mode, VorRNG* rng) {
    midpoint_displacement(profile, first, last, amplitude, roughness, mode, rng);
}

VOR_API void VorMPD(float* profile, int32_t first, int32_t last, float amplitude, float roughness,
                    int32_t mode) {
    VorRNG rng;
    VorRNGInit(&rng);
    midpoint_displacement(profile, first, last, amplitude, roughness, mode, &rng);
}

VOR_API void VorBitmapDiamondSquare(VorBitmap* bitmap, float amplitude, float roughness, float* edgeA,
                                    float* edgeB) {
    const std::uint32_t smaller = bitmap->width < bitmap->height ? bitmap->width : bitmap->height;
    // A square needs two pixels a side.
    if (smaller < 2) return;
    const std::int64_t size = largest_power_of_two_within(static_cast<std::int64_t>(smaller) - 1);
    const auto last = static_cast<std::int32_t>(size);
    VorRNG rng;
    VorRNGSeed(&rng, 1234);
    edgeA[0] = edgeA[last] = 128.0f;
    edgeB[0] = edgeB[last] = 128.0f;
    VorMPDRNG(edgeA, 0, last, amplitude, roughness, VOR_MPD_UNIFORM, &rng);
    VorMPDRNG(edgeB, 0, last, amplitude, roughness, VOR_MPD_UNIFORM, &rng);

    const Square square(bitmap);
    for (std::int64_t i = 0; i <= size; ++i) {
        square.set(0, i, edge_grey(edgeA[i]));
        square.set(size, i, edge_grey(edgeA[i]));
        square.set(i, 0, edge_grey(edgeB[i]));
        square.set(i, size, edge_grey(edgeB[i]));
    }
    const float factor = level_factor(roughness);
    float a = amplitude;
    for (std::int64_t step = size; step > 1; step /= 2) {
        a *= factor;
        diamond_step(square, size, step, a, &rng);
        square_step(square, size, step, a, &rng);
    }
}

}  // extern "C"
