// Worn frames: inked, torn, burnt and film-gate edges drawn into a band
// along the sides of the photo, with dirt specks, scratches, stains and
// light leaks. Every frame is seeded, sized with the photo's smaller side,
// and visits the band rather than the whole frame.
#include <cmath>
#include <cstddef>
#include <cstdint>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::legacy {
namespace {

using core::store_rounded;

// ---------------------------------------------------------------------------
// Pixel laying

// The colour laid over a pixel at coverage t (0 keeps, 1 replaces); alpha kept.
inline void lay_over(std::uint8_t* p, float r, float g, float b, float t) {
    p[0] = store_rounded(static_cast<float>(p[0]) + (r - static_cast<float>(p[0])) * t);
    p[1] = store_rounded(static_cast<float>(p[1]) + (g - static_cast<float>(p[1])) * t);
    p[2] = store_rounded(static_cast<float>(p[2]) + (b - static_cast<float>(p[2])) * t);
}

// The pixel multiplied by a colour (0..1 per channel) at coverage t: the way
// a stain or a scorch darkens paper without hiding what is printed on it.
inline void multiply_over(std::uint8_t* p, float r, float g, float b, float t) {
    const float c[3] = {r, g, b};
    for (int k = 0; k < 3; ++k) {
        const float v = static_cast<float>(p[k]);
        p[k] = store_rounded(v + (v * c[k] - v) * t);
    }
}

// Screen of a colour (0..255) at coverage t: light added, never darkening.
inline void screen_over(std::uint8_t* p, float r, float g, float b, float t) {
    const float c[3] = {r, g, b};
    for (int k = 0; k < 3; ++k) {
        const float v = static_cast<float>(p[k]);
        const float screened = 255.0f - (255.0f - v) * (255.0f - c[k]) * core::k_inv255;
        p[k] = store_rounded(v + (screened - v) * t);
    }
}

inline float clamp01(float v) { return v < 0.0f ? 0.0f : (v > 1.0f ? 1.0f : v); }

inline std::uint8_t* pixel_at(VorBitmap* bitmap, std::uint32_t x, std::uint32_t y) {
    return bitmap->data + (static_cast<std::size_t>(y) * bitmap->width + x) * 4;
}

bool drawable(const VorBitmap* bitmap) {
    return bitmap != nullptr && bitmap->data != nullptr && bitmap->width > 0 && bitmap->height > 0;
}

// Pixel range [lo, hi) covered by a span around centre c of half-size h,
// clipped to 0..limit; false when nothing is left (NaN included).
bool clip_span(float c, float h, std::uint32_t limit, std::uint32_t* lo, std::uint32_t* hi) {
    const float a = std::floor(c - h);
    const float b = std::floor(c + h) + 1.0f;
    if (!(a < static_cast<float>(limit)) || !(b > 0.0f)) return false;
    *lo = a <= 0.0f ? 0u : static_cast<std::uint32_t>(a);
    *hi = b >= static_cast<float>(limit) ? limit : static_cast<std::uint32_t>(b);
    return *lo < *hi;
}

// ---------------------------------------------------------------------------
// Noise: value noise on a hashed lattice, cheap enough to run per pixel of a
// band; it gives ink its mottling and edges their blotches.

inline std::uint32_t mix(std::uint32_t h) {
    h ^= h >> 16;
    h *= 0x7FEB352Du;
    h ^= h >> 15;
    h *= 0x846CA68Bu;
    h ^= h >> 16;
    return h;
}

inline float lattice(std::int32_t ix, std::int32_t iy, std::uint32_t seed) {
    const std::uint32_t h =
        mix(static_cast<std::uint32_t>(ix) * 0x9E3779B1u + static_cast<std::uint32_t>(iy) * 0x85EBCA77u + seed);
    return static_cast<float>(h >> 8) * 0x1p-24f;
}

inline float smooth(float t) { return t * t * (3.0f - 2.0f * t); }

// Floor of a noise coordinate, inline: std::floor is a library call on
// baseline x86-64, and the noise asks for two per pixel. Coordinates stay
// far inside the int range (pixel positions over a cell of at least one).
inline std::int32_t floor_to_int(float v) {
    const auto i = static_cast<std::int32_t>(v);
    return i - (v < static_cast<float>(i) ? 1 : 0);
}

// Smooth noise in 0..1 with features about cell pixels across, sampled a
// row at a time: the lattice is blended down to the row once, then each
// pixel blends two neighbouring cells with a weight from its column, formed
// once a frame. Per pixel that is a few loads and one blend.
class Noise {
public:
    // False when memory ran out; the noise may not be used then.
    bool build(float cell, std::uint32_t seed, std::uint32_t width) {
        inv_cell_ = 1.0f / (cell < 1.0f ? 1.0f : cell);
        seed_ = seed;
        const float cells = static_cast<float>(width) * inv_cell_;
        if (!columns_.build(width) || !cells_.build(static_cast<std::uint32_t>(cells) + 3u)) return false;
        for (std::uint32_t x = 0; x < width; ++x) {
            const float fx = static_cast<float>(x) * inv_cell_;
            const std::int32_t ix = floor_to_int(fx);
            columns_[x] = {ix, smooth(fx - static_cast<float>(ix))};
        }
        return true;
    }
    // Blends the lattice down to row y for the columns x0..x1 - 1.
    void row(std::uint32_t y, std::uint32_t x0, std::uint32_t x1) {
        if (x0 >= x1) return;
        const float fy = static_cast<float>(y) * inv_cell_;
        const std::int32_t iy = floor_to_int(fy);
        const float ty = smooth(fy - static_cast<float>(iy));
        for (std::int32_t c = columns_[x0].cell; c <= columns_[x1 - 1].cell + 1; ++c) {
            const float a = lattice(c, iy, seed_);
            cells_[static_cast<std::size_t>(c)] = a + (lattice(c, iy + 1, seed_) - a) * ty;
        }
    }
    // The noise at column x of the last row.
    float at(std::uint32_t x) const {
        const Column column = columns_[x];
        const float a = cells_[static_cast<std::size_t>(column.cell)];
        return a + (cells_[static_cast<std::size_t>(column.cell) + 1] - a) * column.weight;
    }

private:
    struct Column {
        std::int32_t cell;
        float weight;
    };
    float inv_cell_ = 1.0f;
    std::uint32_t seed_ = 0;
    core::WorkingArray<Column> columns_;
    core::WorkingArray<float> cells_;
};

// Two octaves, the finer at half weight: blotches with ragged rims.
class Grunge {
public:
    bool build(float cell, std::uint32_t seed, std::uint32_t width) {
        return coarse_.build(cell, seed, width) && fine_.build(cell * 0.25f, mix(seed + 1u), width);
    }
    void row(std::uint32_t y, std::uint32_t x0, std::uint32_t x1) {
        coarse_.row(y, x0, x1);
        fine_.row(y, x0, x1);
    }
    float at(std::uint32_t x) const { return (coarse_.at(x) * 2.0f + fine_.at(x)) * (1.0f / 3.0f); }

private:
    Noise coarse_;
    Noise fine_;
};

// ---------------------------------------------------------------------------
// Profiles: how deep the frame reaches into the photo at each position along
// a side, a fractal line so that the edge is torn rather than straight.

enum Side { k_top = 0, k_bottom = 1, k_left = 2, k_right = 3 };

struct Profiles {
    core::WorkingArray<float> side[4];
    float deepest[4] = {0.0f, 0.0f, 0.0f, 0.0f};
};

struct ProfileShape {
    float depth;      // mean depth in pixels
    float amplitude;  // fractal amplitude in pixels
    float roughness;  // 2^-roughness per level: low is jagged
    float corner;     // extra depth at the corners, in pixels
};

// Fills the four profiles from the generator; false if memory ran out.
bool build_profiles(const VorBitmap& bitmap, const ProfileShape& shape, VorRNG* rng, Profiles* out) {
    for (int s = 0; s < 4; ++s) {
        const std::uint32_t n = s < 2 ? bitmap.width : bitmap.height;
        if (!out->side[s].build(n)) return false;
        float* p = out->side[s].get();
        p[0] = shape.depth;
        p[n - 1] = shape.depth;
        if (n > 1) {
            VorMPDRNG(p, 0, static_cast<std::int32_t>(n - 1), shape.amplitude, shape.roughness, VOR_MPD_UNIFORM,
                      rng);
        }
        // The corners fray deeper: the extra depth falls off over a tenth of
        // the side from each end.
        const float falloff = static_cast<float>(n) * 0.1f + 1.0f;
        float deepest = 0.0f;
        for (std::uint32_t i = 0; i < n; ++i) {
            const float from_end = static_cast<float>(i < n - 1 - i ? i : n - 1 - i);
            const float near = 1.0f - clamp01(from_end / falloff);
            float v = p[i] + shape.corner * near * near;
            v = v < 0.0f ? 0.0f : v;
            p[i] = v;
            deepest = v > deepest ? v : deepest;
        }
        out->deepest[s] = deepest;
    }
    return true;
}

// Visits once each pixel lying within extra pixels of the frame's edge
// (the profiles' depth), as spans [x0, x1) of row y: the top rows down to the
// top profile's deepest point, the bottom rows likewise, and in the rows
// between only the columns the left and right profiles of that row reach.
// Work follows the band, not the frame.
template <typename Span>
void for_each_band_span(VorBitmap* bitmap, const Profiles& profiles, float extra, Span&& span) {
    const std::uint32_t w = bitmap->width;
    const std::uint32_t h = bitmap->height;
    const auto extent = [extra](float depth, std::uint32_t limit) {
        const float c = std::ceil(depth + extra);
        if (!(c > 0.0f)) return 0u;
        return c >= static_cast<float>(limit) ? limit : static_cast<std::uint32_t>(c);
    };
    const std::uint32_t top = extent(profiles.deepest[k_top], h);
    const std::uint32_t bottom = extent(profiles.deepest[k_bottom], h);
    const std::uint32_t bottom_start = h - bottom > top ? h - bottom : top;
    for (std::uint32_t y = 0; y < top; ++y) span(y, 0u, w);
    for (std::uint32_t y = top; y < bottom_start; ++y) {
        const std::uint32_t left = extent(profiles.side[k_left][y], w);
        const std::uint32_t right = extent(profiles.side[k_right][y], w);
        if (left > 0) span(y, 0u, left);
        const std::uint32_t right_start = w - right > left ? w - right : left;
        if (right_start < w) span(y, right_start, w);
    }
    for (std::uint32_t y = bottom_start; y < h; ++y) span(y, 0u, w);
}

// The same band pixel by pixel: prepare(y, x0, x1) readies the noise of a
// span's row before visit(p, x, y) is called for each of its pixels.
template <typename Prepare, typename Visit>
void for_each_band_pixel(VorBitmap* bitmap, const Profiles& profiles, float extra, Prepare&& prepare,
                         Visit&& visit) {
    for_each_band_span(bitmap, profiles, extra, [&](std::uint32_t y, std::uint32_t x0, std::uint32_t x1) {
        prepare(y, x0, x1);
        std::uint8_t* p = pixel_at(bitmap, x0, y);
        for (std::uint32_t x = x0; x < x1; ++x, p += 4) visit(p, x, y);
    });
}

// How far past the torn edge a pixel lies, the smallest over the sides
// (negative: inside the frame's band), with the edge roughened in two
// dimensions by the noise so it breaks into blotches and islands.
struct EdgeField {
    const Profiles* profiles;
    std::uint32_t w, h;
    float outside(std::uint32_t x, std::uint32_t y) const {
        const float dx_left = static_cast<float>(x);
        const float dx_right = static_cast<float>(w - 1 - x);
        const float dy_top = static_cast<float>(y);
        const float dy_bottom = static_cast<float>(h - 1 - y);
        float e = dy_top - profiles->side[k_top][x];
        e = e < dy_bottom - profiles->side[k_bottom][x] ? e : dy_bottom - profiles->side[k_bottom][x];
        e = e < dx_left - profiles->side[k_left][y] ? e : dx_left - profiles->side[k_left][y];
        e = e < dx_right - profiles->side[k_right][y] ? e : dx_right - profiles->side[k_right][y];
        return e;
    }
    // Distance from the bitmap's own edge.
    float rim(std::uint32_t x, std::uint32_t y) const {
        const std::uint32_t a = x < w - 1 - x ? x : w - 1 - x;
        const std::uint32_t b = y < h - 1 - y ? y : h - 1 - y;
        return static_cast<float>(a < b ? a : b);
    }
};

// ---------------------------------------------------------------------------
// Details: scratches and specks.

// An antialiased straight scratch of half-width hw from (x0, y0) to (x1, y1),
// visited along its major axis so that every pixel is laid once.
void draw_scratch(VorBitmap* bitmap, float x0, float y0, float x1, float y1, float hw, float r, float g, float b,
                  float opacity, bool lighten) {
    const float dx = x1 - x0;
    const float dy = y1 - y0;
    const bool steep = std::fabs(dy) > std::fabs(dx);
    const float major0 = steep ? y0 : x0;
    const float major1 = steep ? y1 : x1;
    const float minor0 = steep ? x0 : y0;
    const float span = major1 - major0;
    if (!(std::fabs(span) >= 1.0f)) return;
    const float slope = (steep ? dx : dy) / span;
    // Distance across the line measured along the minor axis is longer than
    // the perpendicular one by this factor.
    const float across = std::sqrt(1.0f + slope * slope);
    const float reach = hw * across + 1.0f;
    const std::uint32_t major_limit = steep ? bitmap->height : bitmap->width;
    const std::uint32_t minor_limit = steep ? bitmap->width : bitmap->height;
    std::uint32_t lo, hi;
    const float lo_m = major0 < major1 ? major0 : major1;
    const float hi_m = major0 < major1 ? major1 : major0;
    if (!clip_span((lo_m + hi_m) * 0.5f, (hi_m - lo_m) * 0.5f, major_limit, &lo, &hi)) return;
    for (std::uint32_t m = lo; m < hi; ++m) {
        const float t = (static_cast<float>(m) - major0) / span;
        // Scratches fade in and out at their ends.
        const float end_fade = clamp01(t * 8.0f) * clamp01((1.0f - t) * 8.0f);
        if (end_fade <= 0.0f) continue;
        const float c = minor0 + slope * (static_cast<float>(m) - major0);
        std::uint32_t a, z;
        if (!clip_span(c, reach, minor_limit, &a, &z)) continue;
        for (std::uint32_t n = a; n < z; ++n) {
            const float d = std::fabs(static_cast<float>(n) - c) / across;
            const float cover = clamp01(hw + 0.5f - d) * opacity * end_fade;
            if (cover <= 0.0f) continue;
            std::uint8_t* p = steep ? pixel_at(bitmap, n, m) : pixel_at(bitmap, m, n);
            if (lighten) {
                screen_over(p, r, g, b, cover);
            } else {
                lay_over(p, r, g, b, cover);
            }
        }
    }
}

// A point a distance into the photo from a random side, at most `band`
// pixels in, closer to the edge more often.
void point_near_edge(VorRNG* rng, float w, float h, float band, float* x, float* y) {
    const std::uint32_t side = VorRNGNextInt(rng) >> 30;
    const float along = VorRNGNextFloat(rng);
    const float u = VorRNGNextFloat(rng);
    const float in = u * u * band;
    switch (side) {
        case 0: *x = along * w; *y = in; break;
        case 1: *x = along * w; *y = h - 1.0f - in; break;
        case 2: *x = in; *y = along * h; break;
        default: *x = w - 1.0f - in; *y = along * h; break;
    }
}

void scatter_specks(VorBitmap* bitmap, VorRNG* rng, int count, float band, float size, const VorColor& colour) {
    const auto w = static_cast<float>(bitmap->width);
    const auto h = static_cast<float>(bitmap->height);
    for (int i = 0; i < count; ++i) {
        float x, y;
        point_near_edge(rng, w, h, band, &x, &y);
        const float u = VorRNGNextFloat(rng);
        VorDirtSpecLegacy(bitmap, x, y, size * (0.3f + u * u * 1.7f), &colour, VorRNGNextInt(rng));
    }
}

// Long scratches across the photo, mostly near-vertical like those a film
// gate or a sleeve leaves.
void scatter_scratches(VorBitmap* bitmap, VorRNG* rng, int count, float scale, const VorColor& colour,
                       float opacity, bool lighten, bool vertical) {
    const auto w = static_cast<float>(bitmap->width);
    const auto h = static_cast<float>(bitmap->height);
    for (int i = 0; i < count; ++i) {
        const float x = VorRNGNextFloat(rng) * w;
        const float y = VorRNGNextFloat(rng) * h;
        const float length = scale * (0.1f + 0.6f * VorRNGNextFloat(rng));
        const float lean = (VorRNGNextFloat(rng) - 0.5f) * 0.3f;
        float dx = lean * length;
        float dy = length;
        if (!vertical && (VorRNGNextInt(rng) & 0x80000000u) != 0) {
            dx = (VorRNGNextFloat(rng) - 0.5f) * 2.0f * length;
            dy = (VorRNGNextFloat(rng) - 0.5f) * 2.0f * length;
        }
        const float hw = scale * (0.0006f + 0.0012f * VorRNGNextFloat(rng));
        const float o = opacity * (0.4f + 0.6f * VorRNGNextFloat(rng));
        draw_scratch(bitmap, x, y, x + dx, y + dy, hw, colour.r, colour.g, colour.b, o, lighten);
    }
}

// ---------------------------------------------------------------------------
// The frames' common set-up.

struct Frame {
    VorBitmap* bitmap;
    float scale;     // smaller side in pixels
    float strength;  // 0..2
    VorRNG rng;
};

// False when nothing is to be drawn: no pixels, or no strength.
bool begin_frame(VorBitmap* bitmap, std::uint32_t seed, double strength, Frame* frame) {
    if (!drawable(bitmap) || !(strength > 0.0)) return false;
    frame->bitmap = bitmap;
    frame->scale = static_cast<float>(bitmap->width < bitmap->height ? bitmap->width : bitmap->height);
    frame->strength = strength > 2.0 ? 2.0f : static_cast<float>(strength);
    VorRNGSeed(&frame->rng, seed);
    return true;
}

inline constexpr int k_most_details = 4000;

// How many specks or scratches a frame scatters: per_side for each side of
// the size of the smaller side, scaled by the strength. The count follows
// the photo's proportions, not its resolution, since the details grow with
// the photo.
int count_for(const Frame& f, float per_side) {
    const float sides = (static_cast<float>(f.bitmap->width) + static_cast<float>(f.bitmap->height)) / f.scale;
    const float n = per_side * 0.5f * sides * f.strength + 0.5f;
    // A strip thousands of times longer than wide would ask for millions.
    return n > static_cast<float>(k_most_details) ? k_most_details : static_cast<int>(n);
}

}  // namespace
}  // namespace vorlite::legacy

using namespace vorlite::legacy;

extern "C" {

VOR_API void VorDrawBasicDotLegacy(VorBitmap* bitmap, float x, float y, float radius, const VorColor* color,
                                   float opacity) {
    if (!drawable(bitmap) || color == nullptr || !(radius > 0.0f) || !(opacity > 0.0f)) return;
    const float o = (opacity > 1.0f ? 1.0f : opacity) * static_cast<float>(color->a) * vorlite::core::k_inv255;
    std::uint32_t x0, x1, y0, y1;
    if (!clip_span(x, radius + 1.0f, bitmap->width, &x0, &x1)) return;
    if (!clip_span(y, radius + 1.0f, bitmap->height, &y0, &y1)) return;
    for (std::uint32_t py = y0; py < y1; ++py) {
        const float dy = static_cast<float>(py) - y;
        std::uint8_t* p = pixel_at(bitmap, x0, py);
        for (std::uint32_t px = x0; px < x1; ++px, p += 4) {
            const float dx = static_cast<float>(px) - x;
            const float cover = clamp01(radius + 0.5f - std::sqrt(dx * dx + dy * dy));
            if (cover > 0.0f) lay_over(p, color->r, color->g, color->b, cover * o);
        }
    }
}

VOR_API void VorDirtSpecLegacy(VorBitmap* bitmap, float x, float y, float size, const VorColor* color,
                               uint32_t seed) {
    if (!drawable(bitmap) || color == nullptr || !(size > 0.0f) || !(size < 1e6f)) return;
    VorRNG rng;
    VorRNGSeed(&rng, seed);
    // A clump: a core dot and satellites that shrink as they stray.
    const float r = size * 0.5f;
    const int satellites = 2 + static_cast<int>(VorRNGNextInt(&rng) % 5u);
    VorDrawBasicDotLegacy(bitmap, x, y, r * 0.6f, color, 0.85f);
    for (int i = 0; i < satellites; ++i) {
        const float ox = (VorRNGNextFloat(&rng) - 0.5f) * size;
        const float oy = (VorRNGNextFloat(&rng) - 0.5f) * size;
        const float sr = r * (0.15f + 0.35f * VorRNGNextFloat(&rng));
        VorDrawBasicDotLegacy(bitmap, x + ox, y + oy, sr, color, 0.5f + 0.4f * VorRNGNextFloat(&rng));
    }
    // One speck in six trails a thin bent fibre.
    if (VorRNGNextInt(&rng) % 6u == 0u) {
        float fx = x;
        float fy = y;
        float angle_x = VorRNGNextFloat(&rng) - 0.5f;
        float angle_y = VorRNGNextFloat(&rng) - 0.5f;
        const float step = size * 0.5f;
        const float hw = size * 0.04f > 0.35f ? size * 0.04f : 0.35f;
        for (int k = 0; k < 6; ++k) {
            const float nx = fx + angle_x * step * 2.0f;
            const float ny = fy + angle_y * step * 2.0f;
            draw_scratch(bitmap, fx, fy, nx, ny, hw, color->r, color->g, color->b,
                         0.6f * static_cast<float>(color->a) * vorlite::core::k_inv255, false);
            fx = nx;
            fy = ny;
            angle_x += (VorRNGNextFloat(&rng) - 0.5f) * 0.5f;
            angle_y += (VorRNGNextFloat(&rng) - 0.5f) * 0.5f;
        }
    }
}

VOR_API void VorGrungeBorder1Legacy(VorBitmap* bitmap, const VorColor* color, uint32_t seed, int32_t variant,
                                    double strength) {
    Frame f;
    if (color == nullptr || !begin_frame(bitmap, seed, strength, &f)) return;
    const bool thin = (variant & 1) != 0;
    const float s = f.scale;
    const float k = 0.5f + 0.5f * f.strength;
    const ProfileShape shape{s * (thin ? 0.038f : 0.055f) * k, s * (thin ? 0.02f : 0.04f) * k, thin ? 0.45f : 0.6f,
                             s * 0.02f * k};
    Profiles profiles;
    if (!build_profiles(*bitmap, shape, &f.rng, &profiles)) return;
    const float jag = s * (thin ? 0.012f : 0.02f) * k;
    Grunge blotch;
    Noise streak;
    if (!blotch.build(s * 0.03f, VorRNGNextInt(&f.rng), bitmap->width) ||
        !streak.build(s * 0.004f, VorRNGNextInt(&f.rng), bitmap->width)) {
        return;
    }
    const float ink = static_cast<float>(color->a) * vorlite::core::k_inv255;
    const EdgeField field{&profiles, bitmap->width, bitmap->height};
    const auto r = static_cast<float>(color->r);
    const auto g = static_cast<float>(color->g);
    const auto b = static_cast<float>(color->b);
    const auto prepare = [&](std::uint32_t y, std::uint32_t x0, std::uint32_t x1) {
        blotch.row(y, x0, x1);
        streak.row(y, x0, x1);
    };
    for_each_band_pixel(bitmap, profiles, jag + 1.0f, prepare, [&](std::uint8_t* p, std::uint32_t x, std::uint32_t y) {
        const float e0 = field.outside(x, y);
        if (e0 >= jag + 0.5f) return;
        const float n = blotch.at(x);
        const float e = e0 + (n - 0.5f) * 2.0f * jag;
        const float cover = clamp01(0.5f - e);
        if (cover <= 0.0f) return;
        // Dry brush: the ink thins in streaks near its edge.
        const float dry = clamp01((e + jag) / (jag + 1.0f)) * streak.at(x);
        lay_over(p, r, g, b, cover * ink * (1.0f - 0.8f * dry));
    });
    scatter_specks(bitmap, &f.rng, count_for(f, thin ? 40.0f : 70.0f), shape.depth * 3.0f + jag, s * 0.01f,
                   *color);
    const VorColor ink_colour = *color;
    scatter_scratches(bitmap, &f.rng, count_for(f, 2.0f), s, ink_colour, 0.25f * ink, false, false);
}

VOR_API void VorGrungeBorder4Legacy(VorBitmap* bitmap, uint32_t seed, double strength) {
    Frame f;
    if (!begin_frame(bitmap, seed, strength, &f)) return;
    const float s = f.scale;
    const float k = 0.5f + 0.5f * f.strength;
    const ProfileShape shape{s * 0.06f * k, s * 0.02f * k, 0.55f, s * 0.03f * k};
    Profiles profiles;
    if (!build_profiles(*bitmap, shape, &f.rng, &profiles)) return;
    const float jag = s * 0.008f * k;
    const float stain_reach = s * 0.05f * k;
    const float grime_reach = s * 0.012f + 1.0f;
    Grunge fibres, stains;
    if (!fibres.build(s * 0.01f, VorRNGNextInt(&f.rng), bitmap->width) ||
        !stains.build(s * 0.08f, VorRNGNextInt(&f.rng), bitmap->width)) {
        return;
    }
    const EdgeField field{&profiles, bitmap->width, bitmap->height};
    const float stain = 0.55f * f.strength > 0.9f ? 0.9f : 0.55f * f.strength;
    const auto prepare = [&](std::uint32_t y, std::uint32_t x0, std::uint32_t x1) {
        fibres.row(y, x0, x1);
        stains.row(y, x0, x1);
    };
    for_each_band_pixel(bitmap, profiles, stain_reach + jag, prepare, [&](std::uint8_t* p, std::uint32_t x,
                                                                          std::uint32_t y) {
        const float e0 = field.outside(x, y);
        if (e0 >= stain_reach + jag) return;
        const float fibre = fibres.at(x);
        const float e = e0 + (fibre - 0.5f) * 2.0f * jag;
        // Yellowed paper creeping in from the edge, in blotches.
        const float age = 1.0f - clamp01(e / stain_reach);
        const float stain_level = stains.at(x);
        const float blot = clamp01((stain_level - 0.3f) * 2.5f);
        const float yellow = age * age * blot * stain;
        if (yellow > 0.0f) multiply_over(p, 0.93f, 0.80f, 0.58f, yellow);
        const float cover = clamp01(0.5f - e);
        if (cover > 0.0f) {
            // Off-white paper with its fibres, greyer where it is grubby and
            // darkest along the outer rim that fingers handled.
            const float rim = field.rim(x, y) / grime_reach;
            const float handled = rim < 1.0f ? (1.0f - rim) * (1.0f - rim) * 0.35f : 0.0f;
            const float grime = (1.0f - 0.1f * (1.0f - stain_level) - 0.06f * fibre) * (1.0f - handled);
            lay_over(p, 238.0f * grime, 232.0f * grime, 216.0f * grime, cover);
        }
    });
    const VorColor dust{48, 40, 30, 200};
    scatter_specks(bitmap, &f.rng, count_for(f, 25.0f), s * 0.2f, s * 0.005f, dust);
    const VorColor light{250, 248, 240, 255};
    scatter_scratches(bitmap, &f.rng, count_for(f, 4.0f), s, light, 0.35f, true, false);
}

VOR_API void VorGrungeBorder5Legacy(VorBitmap* bitmap, uint32_t seed, double strength) {
    Frame f;
    if (!begin_frame(bitmap, seed, strength, &f)) return;
    const float s = f.scale;
    const float k = 0.5f + 0.5f * f.strength;
    const ProfileShape shape{s * 0.07f * k, s * 0.035f * k, 0.5f, s * 0.06f * k};
    Profiles profiles;
    if (!build_profiles(*bitmap, shape, &f.rng, &profiles)) return;
    const float jag = s * 0.015f * k;
    const float halo = s * 0.06f * k;
    Grunge ember;
    if (!ember.build(s * 0.02f, VorRNGNextInt(&f.rng), bitmap->width)) return;
    const EdgeField field{&profiles, bitmap->width, bitmap->height};
    const auto prepare = [&](std::uint32_t y, std::uint32_t x0, std::uint32_t x1) { ember.row(y, x0, x1); };
    for_each_band_pixel(bitmap, profiles, halo + jag, prepare, [&](std::uint8_t* p, std::uint32_t x, std::uint32_t y) {
        const float e0 = field.outside(x, y);
        if (e0 >= halo + jag) return;
        const float n = ember.at(x);
        const float e = e0 + (n - 0.5f) * 2.0f * jag;
        if (e >= halo) return;
        // The scorch: the print browns, then darkens toward the char line.
        const float near = 1.0f - clamp01(e / halo);
        multiply_over(p, 0.78f, 0.47f, 0.22f, near * near * (0.7f + 0.3f * n));
        const float cover = clamp01(0.5f - e);
        if (cover > 0.0f) {
            // Char: near-black, with faint glowing brown where the noise peaks.
            const float glow = clamp01((n - 0.72f) * 4.0f) * clamp01(1.0f + e / jag);
            lay_over(p, 22.0f + 70.0f * glow, 15.0f + 25.0f * glow, 10.0f, cover);
        }
    });
    const VorColor ash{30, 22, 16, 230};
    scatter_specks(bitmap, &f.rng, count_for(f, 30.0f), s * 0.15f, s * 0.006f, ash);
}

VOR_API void VorGrungeBorder6Legacy(VorBitmap* bitmap, uint32_t seed, double strength) {
    Frame f;
    if (!begin_frame(bitmap, seed, strength, &f)) return;
    const float s = f.scale;
    const float k = 0.5f + 0.5f * f.strength;
    const bool landscape = bitmap->width >= bitmap->height;
    // The film-gate edge is much straighter than a torn one: small amplitude,
    // rounded corners of the gate.
    const ProfileShape shape{s * 0.03f * k, s * 0.004f * k, 0.8f, s * 0.012f * k};
    Profiles profiles;
    if (!build_profiles(*bitmap, shape, &f.rng, &profiles)) return;
    // The rebate carrying the sprocket holes runs along the long sides.
    const float rebate = s * 0.09f * k;
    float* long_a = profiles.side[landscape ? k_top : k_left].get();
    float* long_b = profiles.side[landscape ? k_bottom : k_right].get();
    const std::uint32_t long_n = landscape ? bitmap->width : bitmap->height;
    for (std::uint32_t i = 0; i < long_n; ++i) {
        long_a[i] += rebate;
        long_b[i] += rebate;
    }
    for (int side : {landscape ? k_top : k_left, landscape ? k_bottom : k_right}) profiles.deepest[side] += rebate;
    const float jag = s * 0.002f;
    Grunge fog;
    if (!fog.build(s * 0.01f, VorRNGNextInt(&f.rng), bitmap->width)) return;
    const EdgeField field{&profiles, bitmap->width, bitmap->height};
    // Sprocket holes: rounded rectangles centred in the rebate, one pitch
    // apart, lit from behind.
    const float pitch = rebate * 1.05f;
    const float hole_w = pitch * 0.48f;
    const float hole_h = rebate * 0.42f;
    const float hole_corner = hole_h * 0.3f;
    const float hole_centre = rebate * 0.45f;
    const float phase = VorRNGNextFloat(&f.rng) * pitch;
    const float across_long = landscape ? static_cast<float>(bitmap->height) : static_cast<float>(bitmap->width);
    const auto prepare = [&](std::uint32_t y, std::uint32_t x0, std::uint32_t x1) { fog.row(y, x0, x1); };
    for_each_band_pixel(bitmap, profiles, jag + 2.0f, prepare, [&](std::uint8_t* p, std::uint32_t x, std::uint32_t y) {
        const float e0 = field.outside(x, y);
        if (e0 >= jag + 0.5f) return;
        const float fx = static_cast<float>(x);
        const float fy = static_cast<float>(y);
        const float n = fog.at(x);
        const float e = e0 + (n - 0.5f) * 2.0f * jag;
        const float cover = clamp01(0.5f - e);
        if (cover <= 0.0f) return;
        // The base is not quite black: a faint fog in the film's rebate.
        const float base = 8.0f + 14.0f * n;
        lay_over(p, base, base * 0.9f, base * 0.8f, cover);
        const float along = landscape ? fx : fy;
        const float across = landscape ? fy : fx;
        const float from_edge = across < across_long * 0.5f ? across : across_long - 1.0f - across;
        const float u = std::fabs(std::fmod(along + phase, pitch) - pitch * 0.5f) - (hole_w * 0.5f - hole_corner);
        const float v = std::fabs(from_edge - hole_centre) - (hole_h * 0.5f - hole_corner);
        const float uu = u > 0.0f ? u : 0.0f;
        const float vv = v > 0.0f ? v : 0.0f;
        const float d = std::sqrt(uu * uu + vv * vv) - hole_corner;
        const float hole = clamp01(0.5f - d) * cover;
        if (hole > 0.0f) lay_over(p, 226.0f, 220.0f, 204.0f, hole * (0.85f + 0.15f * n));
    });
    // A light leak: warm light fogging the film from one corner.
    const std::uint32_t corner = VorRNGNextInt(&f.rng) >> 30;
    const float radius = s * 0.45f;
    const float cx = (corner & 1u) != 0 ? static_cast<float>(bitmap->width) - 1.0f : 0.0f;
    const float cy = (corner & 2u) != 0 ? static_cast<float>(bitmap->height) - 1.0f : 0.0f;
    std::uint32_t x0, x1, y0, y1;
    const float leak = 0.8f * f.strength > 1.0f ? 1.0f : 0.8f * f.strength;
    if (clip_span(cx, radius, bitmap->width, &x0, &x1) && clip_span(cy, radius, bitmap->height, &y0, &y1)) {
        const float inv_r = 1.0f / radius;
        for (std::uint32_t y = y0; y < y1; ++y) {
            const float dy = (static_cast<float>(y) - cy) * inv_r;
            std::uint8_t* p = pixel_at(bitmap, x0, y);
            for (std::uint32_t x = x0; x < x1; ++x, p += 4) {
                const float dx = (static_cast<float>(x) - cx) * inv_r;
                const float t = 1.0f - (dx * dx + dy * dy);
                if (t <= 0.0f) continue;
                const float t2 = t * t;
                screen_over(p, 255.0f, 110.0f + 90.0f * t2, 40.0f, t2 * leak);
            }
        }
    }
    const VorColor dust{235, 235, 230, 230};
    scatter_specks(bitmap, &f.rng, count_for(f, 12.0f), s * 0.5f, s * 0.004f, dust);
    const VorColor light{240, 240, 235, 255};
    scatter_scratches(bitmap, &f.rng, count_for(f, 3.0f), s * 1.5f, light, 0.3f, true, true);
}

}  // extern "C"
