// Colour matrices: 3 x 4 affine transforms of (red, green, blue), their
// builders, their application to a bitmap and the "colorMatrixTransform"
// processor.
#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "core/simd.h"
#include "proclist/proclist_internal.h"

namespace vorlite::color {
namespace {

// Both transforms round half up in double precision: a float channel value
// is widened, then +0.5 and truncated, clamped to 0..255.
inline std::uint8_t round_channel(float v) { return core::store_rounded(static_cast<double>(v)); }

// No cross-channel term: each output channel depends on its own input
// channel alone, so the matrix reduces to three 256-entry tone tables.
bool is_diagonal(const float* m) {
    return m[1] == 0.0f && m[2] == 0.0f && m[4] == 0.0f && m[6] == 0.0f && m[8] == 0.0f &&
           m[9] == 0.0f;
}

// Applies a diagonal matrix through its tables; true when it was one.
bool transform_diagonal(VorBitmap* bitmap, const VorColorMatrix& matrix) {
    VorHistMap map;
    if (!diagonal_matrix_map(matrix, &map)) return false;
    VorBitmapHistogramTransform(bitmap, &map);
    return true;
}

// One "operations" entry folded into the matrix; false when it is malformed.
bool hard_set(yajl_val operation, double strength, VorColorMatrix* matrix) {
    const yajl_val entries = proclist::member(operation, "entries", yajl_t_array);
    if (entries == nullptr || YAJL_GET_ARRAY(entries)->len != 12) return false;
    double gain = 1.0;
    proclist::member_double(operation, "gain", &gain);
    VorColorMatrix set;
    for (std::size_t k = 0; k < 12; ++k) {
        const yajl_val entry = YAJL_GET_ARRAY(entries)->values[k];
        // Only numbers carry a double value; anything else rejects the matrix.
        if (entry == nullptr || !YAJL_IS_NUMBER(entry)) return false;
        double v = strength * YAJL_GET_DOUBLE(entry) * gain;
        // Strength fades the whole matrix toward the identity.
        if (k == 0 || k == 5 || k == 10) v += 1.0 - strength;
        set.m[k] = static_cast<float>(v);
    }
    *matrix = set;
    return true;
}

bool fold_operation(yajl_val operation, double strength, VorColorMatrix* matrix) {
    const yajl_val name_value = proclist::member(operation, "operation", yajl_t_string);
    if (name_value == nullptr) return false;
    const std::string_view name = YAJL_GET_STRING(name_value);
    if (name == "hardSet") return hard_set(operation, strength, matrix);
    double value = 0.0;
    if (!proclist::member_double(operation, "value", &value)) return false;
    const float amount =
        VLPLBlendAroundIdentity(static_cast<float>(value), 1.0f, static_cast<float>(strength));
    if (name == "brightness") {
        VorColorMatrixBrightness(matrix, amount);
    } else if (name == "contrast") {
        // The processor's value is a factor (1 = unchanged); the builder
        // takes the offset from 1.
        VorColorMatrixContrast(matrix, static_cast<float>(static_cast<double>(amount) - 1.0));
    } else if (name == "saturation") {
        VorColorMatrixAdjSaturation(matrix, amount);
    } else {
        return false;
    }
    return true;
}

}  // namespace

#if VORLITE_EXACT_FLOAT_LANES
// Four pixels at a time, one pixel per lane and one vector per channel.
// Every lane performs the scalar steps of color_matrix_per_pixel: the same
// float products and sums in the same order, then store_rounded's rule with
// the half added in double precision.
namespace {
namespace lanes {

using core::simd::f32x4;
using core::simd::i32x4;
using core::simd::f64x4;
using core::simd::max_or_bound;
using core::simd::min_or_bound;
using core::simd::splat;
using core::simd::u32x4;

// Little-endian RGBA: red is the low byte of each 32-bit pixel.
static_assert(std::endian::native == std::endian::little);

// Through signed lanes: a byte fits, and SSE2 converts only signed integers.
inline f32x4 channel(u32x4 pixels, int shift) {
    return __builtin_convertvector(__builtin_convertvector((pixels >> shift) & 0xFFu, i32x4), f32x4);
}

// store_rounded for four lanes. Clamping to -0.5..254.5 first is exact
// (both bounds are floats and widening is exact) and maps every value the
// rule sends to 0 or 255 onto a bound that rounds to the same byte:
// below -0.5 and NaN to -0.5, above 254.5 and
// +infinity to 254.5. The in-range lanes then take trunc(v + 0.5) in double.
inline i32x4 round_to_bytes(f32x4 v) {
    const f32x4 low = splat(-0.5f);
    const f32x4 high = splat(254.5f);
    const f32x4 clamped = min_or_bound(max_or_bound(v, low), high);
    const f64x4 widened = __builtin_convertvector(clamped, f64x4);
    return __builtin_convertvector(widened + 0.5, i32x4);
}

inline u32x4 round_to_bytes_at(f32x4 v, int shift) {
    return __builtin_convertvector(round_to_bytes(v), u32x4) << shift;
}

// Each of the twelve matrix entries in all four lanes.
struct MatrixLanes {
    f32x4 m[12];
};

inline void transform_four(std::uint8_t* p, const MatrixLanes& k) {
    u32x4 pixels;
    std::memcpy(&pixels, p, 16);
    const f32x4 r = channel(pixels, 0), g = channel(pixels, 8), b = channel(pixels, 16);
    const f32x4 red = ((g * k.m[1] + k.m[3]) + r * k.m[0]) + b * k.m[2];
    const f32x4 green = ((r * k.m[4] + k.m[7]) + g * k.m[5]) + b * k.m[6];
    const f32x4 blue = ((r * k.m[8] + k.m[11]) + g * k.m[9]) + b * k.m[10];
    const u32x4 alpha = pixels & 0xFF000000u;
    const u32x4 out = alpha | round_to_bytes_at(red, 0) | round_to_bytes_at(green, 8) |
                      round_to_bytes_at(blue, 16);
    std::memcpy(p, &out, 16);
}

void transform(VorBitmap* bitmap, const VorColorMatrix& matrix) {
    MatrixLanes k;
    for (int i = 0; i < 12; ++i) k.m[i] = splat(matrix.m[i]);
    const std::size_t n = core::pixel_count(*bitmap);
    std::uint8_t* p = bitmap->data;
    std::size_t i = 0;
    for (; i + 4 <= n; i += 4, p += 16) {
        if (i % 16 == 0) core::prefetch_ahead<true>(p);
        transform_four(p, k);
    }
    // The last one to three pixels go through the same lanes from a padded
    // copy, so no byte past the bitmap is read or written.
    const std::size_t rest = (n - i) * 4;
    if (rest == 0) return;
    std::uint8_t block[16] = {};
    std::memcpy(block, p, rest);
    transform_four(block, k);
    std::memcpy(p, block, rest);
}

}  // namespace lanes
}  // namespace
#endif

bool diagonal_matrix_map(const VorColorMatrix& matrix, VorHistMap* map) {
    const float* m = matrix.m;
    if (!is_diagonal(m)) return false;
    for (int v = 0; v < 256; ++v) {
        const float level = static_cast<float>(v);
        map->map[0][v] = round_channel(level * m[0] + m[3]);
        map->map[1][v] = round_channel(level * m[5] + m[7]);
        map->map[2][v] = round_channel(level * m[10] + m[11]);
    }
    return true;
}

void color_matrix_per_pixel(VorBitmap* bitmap, const VorColorMatrix& matrix) {
    const float* m = matrix.m;
    const float m0 = m[0], m1 = m[1], m2 = m[2], m3 = m[3];
    const float m4 = m[4], m5 = m[5], m6 = m[6], m7 = m[7];
    const float m8 = m[8], m9 = m[9], m10 = m[10], m11 = m[11];
    const std::size_t n = core::pixel_count(*bitmap);
    std::uint8_t* p = bitmap->data;
    for (std::size_t i = 0; i < n; ++i, p += 4) {
        const float r = p[0], g = p[1], b = p[2];
        p[0] = round_channel(((g * m1 + m3) + r * m0) + b * m2);
        p[1] = round_channel(((r * m4 + m7) + g * m5) + b * m6);
        p[2] = round_channel(((r * m8 + m11) + g * m9) + b * m10);
    }
}

}  // namespace vorlite::color

using namespace vorlite::color;

extern "C" {

const VorColorMatrix VorColorMatrixIdentity = {{1.0f, 0.0f, 0.0f, 0.0f,  //
                                                0.0f, 1.0f, 0.0f, 0.0f,  //
                                                0.0f, 0.0f, 1.0f, 0.0f}};

VOR_API void VorColorMatrixCopy(VorColorMatrix* dst, const VorColorMatrix* src) { *dst = *src; }

VOR_API void VorColorMatrixSetIdentity(VorColorMatrix* matrix) { *matrix = VorColorMatrixIdentity; }

VOR_API void VorColorMatrixMultiply(VorColorMatrix* M, const VorColorMatrix* N) {
    const float* m = M->m;
    const float* n = N->m;
    VorColorMatrix r;
    for (int i = 0; i < 3; ++i) {
        const float* row = m + 4 * i;
        for (int j = 0; j < 3; ++j) {
            r.m[4 * i + j] = (row[1] * n[4 + j] + row[0] * n[j]) + row[2] * n[8 + j];
        }
        // N's implied fourth row (0, 0, 0, 1) carries M's own offset through.
        r.m[4 * i + 3] = ((row[0] * n[3] + row[1] * n[7]) + row[3]) + row[2] * n[11];
    }
    *M = r;
}

VOR_API void VorColorMatrixAdjSaturation(VorColorMatrix* matrix, float s) {
    // Grey weights of the saturation matrix, deliberately not the luminance
    // weights of the colour blend mode.
    const float t = 1.0f - s;
    const float wr = t * 0.213f;
    const float wg = t * 0.715f;
    const float wb = t * 0.072f;
    const VorColorMatrix rows = {{wr + s, wg,     wb,     0.0f,  //
                            wr,     wg + s, wb,     0.0f,  //
                            wr,     wg,     wb + s, 0.0f}};
    VorColorMatrixMultiply(matrix, &rows);
}

VOR_API void VorColorMatrixBrightnessContrast(VorColorMatrix* matrix, float brightness,
                                              float contrast) {
    // Contrast pivots about the brightened mid-grey 128 b.
    const float d = contrast * brightness;
    const float o = (brightness * 128.0f) * (1.0f - contrast);
    const VorColorMatrix rows = {{d,    0.0f, 0.0f, o,  //
                            0.0f, d,    0.0f, o,  //
                            0.0f, 0.0f, d,    o}};
    VorColorMatrixMultiply(matrix, &rows);
}

VOR_API void VorColorMatrixBrightness(VorColorMatrix* matrix, float brightness) {
    VorColorMatrixBrightnessContrast(matrix, brightness, 1.0f);
}

VOR_API void VorColorMatrixContrast(VorColorMatrix* matrix, float c) {
    const float k = c + 1.0f;
    const float o = (1.0f - k) * 128.0f;
    const VorColorMatrix rows = {{k,    0.0f, 0.0f, o,  //
                            0.0f, k,    0.0f, o,  //
                            0.0f, 0.0f, k,    o}};
    VorColorMatrixMultiply(matrix, &rows);
}

VOR_API void VorBitmapColorMatrixTransform(VorBitmap* bitmap, const VorColorMatrix* matrix) {
    if (transform_diagonal(bitmap, *matrix)) return;
#if VORLITE_EXACT_FLOAT_LANES
    lanes::transform(bitmap, *matrix);
#else
    color_matrix_per_pixel(bitmap, *matrix);
#endif
}

VOR_API void VorBitmapColorMatrixTransformAndBlendWithOriginal(VorBitmap* bitmap,
                                                               const VorColorMatrix* matrix,
                                                               uint32_t mode, float opacity) {
    if (vorlite::core::pixel_count(*bitmap) == 0) return;
    const float* m = matrix->m;
    // A diagonal matrix takes full effect: mode and opacity are ignored.
    if (transform_diagonal(bitmap, *matrix)) return;
    const float m0 = m[0], m1 = m[1], m2 = m[2], m3 = m[3];
    const float m4 = m[4], m5 = m[5], m6 = m[6], m7 = m[7];
    const float m8 = m[8], m9 = m[9], m10 = m[10], m11 = m[11];
    const std::size_t n = vorlite::core::pixel_count(*bitmap);
    uint8_t* p = bitmap->data;
    for (std::size_t i = 0; i < n; ++i, p += 4) {
        const float r = p[0], g = p[1], b = p[2];
        // Green and blue add their offsets after both leading products here,
        // unlike the plain transform; the last bit can differ between them.
        const VorColor transformed{round_channel(((g * m1 + m3) + r * m0) + b * m2),
                                   round_channel(((r * m4 + g * m5) + m7) + b * m6),
                                   round_channel(((r * m8 + g * m9) + m11) + b * m10), 255};
        VorColor pixel = vorlite::core::load_pixel(p);
        VorColorBlend(&pixel, &transformed, mode, opacity);
        vorlite::core::store_pixel(p, pixel);
    }
}

VOR_API int VLPLRunColorMatrixTransformProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                                 const VLPLRunOptions* options) {
    const yajl_val operations = vorlite::proclist::member(parameters, "operations", yajl_t_array);
    if (operations == nullptr) return 0;
    // Every operation is folded before any pixel is touched, so a malformed
    // one leaves the bitmap as it was.
    VorColorMatrix matrix;
    VorColorMatrixSetIdentity(&matrix);
    const std::size_t count = YAJL_GET_ARRAY(operations)->len;
    for (std::size_t i = 0; i < count; ++i) {
        if (!fold_operation(YAJL_GET_ARRAY(operations)->values[i], options->strength, &matrix)) {
            return 0;
        }
    }
    VorBitmapColorMatrixTransform(bitmap, &matrix);
    return 1;
}

}  // extern "C"
