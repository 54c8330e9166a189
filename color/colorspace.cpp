// Conversions between sRGB pixels and CIE L*a*b* (D65), HSV and HSL, and
// the in-place conversion of whole bitmaps to packed L*a*b* and back.
#include <stdio.h>

#include <cstddef>
#include <cstdint>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "core/simd.h"

namespace vorlite::color {
namespace {

using core::k_inv255;

void fill_linear_table(float table[256]) {
    for (int v = 0; v < 256; ++v) {
        const float c = static_cast<float>(v) * k_inv255;
        if (c > 0.04045f) {
            // The sRGB curve's (c + 0.055) / 1.055 is taken as a product in
            // double and only then narrowed for the single-precision power.
            const float base =
                static_cast<float>((static_cast<double>(c) + 0.055) * 0.9478672985781991);
            table[v] = vorlite::core::powf(base, 2.4f) * 100.0f;
        } else {
            table[v] = static_cast<float>(100 * v) * 0.000303527f;
        }
    }
}

void fill_cbrt_table(float table[1024]) {
    table[0] = 0.0f;
    for (int i = 1; i < 1024; ++i) {
        table[i] = static_cast<float>(vorlite::core::pow(i * (1.0 / 1023.0), 0.3333333333333333));
    }
}

// Computed in double and narrowed, so that the top entry is exactly 1.0.
void fill_encoding_table(float table[1024]) {
    for (int i = 0; i < 1024; ++i) {
        const double t = i / 1023.0;
        const double e = t <= 0.0031308 ? 12.92 * t : 1.055 * vorlite::core::pow(t, 1.0 / 2.4) - 0.055;
        table[i] = static_cast<float>(e);
    }
}

// The companding of XYZ ratios: cube root above the CIE threshold, the
// linear segment below it.
constexpr double k_lab_epsilon = 0.008856;

inline double lab_linear_segment(double t) { return 7.787 * t + 0.13793103448275862; }

inline double cbrt_exact(double t) {
    if (t > k_lab_epsilon) return static_cast<double>(vorlite::core::powf(static_cast<float>(t), 0.33333334f));
    return lab_linear_segment(t);
}

// The index scales by 1024 over a table spaced 1/1023 apart: the slight
// stretch is part of the library's L*a*b* and is kept.
inline double cbrt_tabled(double t, const float* cbrt) {
    if (t > k_lab_epsilon)
        return t >= 1.0 ? 1.0 : static_cast<double>(cbrt[static_cast<int>(t * 1024.0)]);
    return lab_linear_segment(t);
}

struct Lab {
    double L, a, b;
};

// sRGB-to-XYZ weights already divided by 100 and by the D65 white, by
// channel: red, green, blue, each giving its X, Y and Z weight.
constexpr double k_xyz_weights[3][3] = {{0.00433891, 0.002126, 0.000177255},
                                        {0.00376234915, 0.007152, 0.00109475308},
                                        {0.0018990604648, 0.000722, 0.0087295537}};
enum Channel { k_red, k_green, k_blue };
enum Axis { k_x, k_y, k_z };

// L* scaled to the byte range, before storing.
inline double packed_lightness(double fy) { return (116.0 * fy - 16.0) * 2.55; }

template <typename CubeRoot>
inline Lab rgb_to_lab(const VorColor& c, const float* linear, CubeRoot cube_root) {
    const double rl = linear[c.r];
    const double gl = linear[c.g];
    const double bl = linear[c.b];
    const auto& w = k_xyz_weights;
    const double x = (gl * w[k_green][k_x] + rl * w[k_red][k_x]) + bl * w[k_blue][k_x];
    const double y = (gl * w[k_green][k_y] + rl * w[k_red][k_y]) + bl * w[k_blue][k_y];
    const double z = (gl * w[k_green][k_z] + rl * w[k_red][k_z]) + bl * w[k_blue][k_z];
    const double fx = cube_root(x);
    const double fy = cube_root(y);
    const double fz = cube_root(z);
    return Lab{packed_lightness(fy), 500.0 * (fx - fy) + 127.0, 200.0 * (fy - fz) + 127.0};
}

inline Lab rgb_to_lab_tabled(const VorColor& c, const float* linear, const float* cbrt) {
    return rgb_to_lab(c, linear, [cbrt](double t) { return cbrt_tabled(t, cbrt); });
}

inline void pack_lab(VorColor& c, const Lab& lab) {
    c.r = core::store_truncated(lab.L);
    c.g = core::store_truncated(lab.a);
    c.b = core::store_truncated(lab.b);
}

// Fast path of the bitmap conversion. Each product in the XYZ sums depends
// on one channel level only, so the products are tabled per level; the sums
// are then added in the formula's order and precision. The tables hold the
// products times 1024: scaling by a power of two is exact and commutes with
// every rounding of the sum, so the scaled sum is the cube-root index before
// truncation, both thresholds scale with it exactly, and multiplying back by
// 1/1024 recovers the ratio itself for the linear segment.
constexpr double k_index_scale = 1024.0;
constexpr double k_scaled_epsilon = k_lab_epsilon * k_index_scale;
constexpr std::ptrdiff_t k_first_bright_index = static_cast<std::ptrdiff_t>(k_scaled_epsilon) + 1;

// Every product table rises with the level and rounding is monotonic, so no
// sum exceeds white's, which lies a fraction above 1024 (1024.16 for Z: the
// weights of each row add up to the white point's 1/100). Every ratio of 1
// or more therefore truncates to index 1024, whose entry is the cap 1.0;
// the spare entries only widen that margin.
constexpr int k_top_index = 1024;
constexpr int k_cbrt_entries = k_top_index + 8;

struct LabFastTables {
    double x[3][256];  // red, green, blue: scaled products of the level
    double y[3][256];
    double z[3][256];
    double cbrt[k_cbrt_entries];  // widened cube root, 1.0 from index 1024 on
    std::uint8_t lightness[k_cbrt_entries];  // the packed L* of each entry
};

LabFastTables build_lab_fast_tables() {
    LabFastTables t;
    const float* linear = linear_table().data();
    const float* cbrt = cbrt_table().data();
    for (int c = 0; c < 3; ++c) {
        for (int v = 0; v < 256; ++v) {
            const double level = linear[v];
            t.x[c][v] = level * k_xyz_weights[c][k_x] * k_index_scale;
            t.y[c][v] = level * k_xyz_weights[c][k_y] * k_index_scale;
            t.z[c][v] = level * k_xyz_weights[c][k_z] * k_index_scale;
        }
    }
    for (int i = 0; i < k_cbrt_entries; ++i) {
        t.cbrt[i] = i < k_top_index ? static_cast<double>(cbrt[i]) : 1.0;
        t.lightness[i] = core::store_truncated(packed_lightness(t.cbrt[i]));
    }
    return t;
}

const LabFastTables& lab_fast_tables() {
    static const LabFastTables tables = build_lab_fast_tables();
    return tables;
}

// a* and b*, stored by truncation. Every cube root lies in 0.137..1, so
// both sums stay within -310..565, inside the range the two-lane store
// admits.
inline void store_chroma(std::uint8_t* p, double fx, double fy, double fz) {
#if VORLITE_VECTOR_LANES
    using core::simd::f64x2;
    core::simd::store_truncated_pair(p, f64x2{500.0, 200.0} * (f64x2{fx, fy} - f64x2{fy, fz}) + 127.0);
#else
    p[0] = core::store_truncated(500.0 * (fx - fy) + 127.0);
    p[1] = core::store_truncated(200.0 * (fy - fz) + 127.0);
#endif
}

// Truncation toward zero of a positive scaled ratio, as a pointer-sized
// integer so that x86-64 needs no sign extension before the lookup.
inline std::ptrdiff_t cbrt_index(double t) { return static_cast<std::ptrdiff_t>(t); }

inline double lab_compand_scaled(double t, const double* cbrt) {
    if (t > k_scaled_epsilon) return cbrt[cbrt_index(t)];
    return lab_linear_segment(t * (1.0 / k_index_scale));
}

// One RGBA pixel to packed L*a*b*, alpha untouched.
inline void rgb_to_lab_fast(std::uint8_t* p, const LabFastTables& t) {
    const int r = p[0], g = p[1], b = p[2];
    // The formula's order: green's product first, then red's, then blue's.
    const double x = (t.x[k_green][g] + t.x[k_red][r]) + t.x[k_blue][b];
    const double y = (t.y[k_green][g] + t.y[k_red][r]) + t.y[k_blue][b];
    const double z = (t.z[k_green][g] + t.z[k_red][r]) + t.z[k_blue][b];
    const std::ptrdiff_t ix = cbrt_index(x), iy = cbrt_index(y), iz = cbrt_index(z);
    double fx, fy, fz;
    // Photos are mostly brighter than the linear segment. An index of at
    // least 10 puts its ratio above the threshold (9.07 scaled), so when all
    // three are, the cube roots come from the table, and so does L*; the
    // test runs on the integer indices, off the floating-point ports.
    const std::ptrdiff_t least = (ix - k_first_bright_index) | (iy - k_first_bright_index) |
                                 (iz - k_first_bright_index);  // negative if any index is below
    if (least >= 0) [[likely]] {
        fx = t.cbrt[ix];
        fy = t.cbrt[iy];
        fz = t.cbrt[iz];
        p[0] = t.lightness[iy];
    } else {
        fx = lab_compand_scaled(x, t.cbrt);
        fy = lab_compand_scaled(y, t.cbrt);
        fz = lab_compand_scaled(z, t.cbrt);
        p[0] = core::store_truncated(packed_lightness(fy));
    }
    store_chroma(p + 1, fx, fy, fz);
}

inline float lab_inverse_compand(float f) {
    const float cube = f * f * f;
    if (cube > 0.008856f) return cube;
    return (f - 0.13793103f) * 0.12841916f;
}

inline std::uint8_t encode_channel(float v, const float* encoding) {
    if (!(v > 0.0f)) return 0;
    if (v >= 1.0f) return 255;
    const float e = encoding[static_cast<int>(v * 1024.0f)];
    return static_cast<std::uint8_t>(static_cast<int>(e * 255.0f + 0.5f));
}

inline void lab_to_rgb(VorColor& c, double scale_l, double scale_a, double scale_b,
                       const float* encoding) {
    const double lb = c.r;
    const double ab = c.g;
    const double bb = c.b;
    // 100/255 turns the packed byte back into L*; 1/116 starts the inverse.
    const float fy =
        static_cast<float>(((lb * 0.392156870078234) * scale_l + 16.0) * 0.008620689655172414);
    const float fx = static_cast<float>(static_cast<double>(fy) + (scale_a * ab - 127.0) * 0.002);
    const float fz = static_cast<float>(static_cast<double>(fy) + (127.0 - scale_b * bb) * 0.005);
    const float x = lab_inverse_compand(fx) * 0.95047f;
    const float y = lab_inverse_compand(fy);
    const float z = lab_inverse_compand(fz) * 1.08883f;
    const float r_lin = (x * 3.2406f + y * -1.5372f) + z * -0.4986f;
    const float g_lin = (x * -0.9689f + y * 1.8758f) + z * 0.0415f;
    const float b_lin = (x * 0.0557f + y * -0.204f) + z * 1.057f;
    c.r = encode_channel(r_lin, encoding);
    c.g = encode_channel(g_lin, encoding);
    c.b = encode_channel(b_lin, encoding);
}

#if VORLITE_EXACT_FLOAT_LANES
// lab_to_rgb on four packed pixels: the same double and float operations
// lane by lane, the encoding table read lane by lane.
inline void lab_to_rgb_lanes(std::uint8_t* p, double scale_l, double scale_a, double scale_b,
                             const float* encoding) {
    namespace simd = core::simd;
    using simd::f32x4;
    using simd::f64x2;
    using simd::i32x4;
    f32x4 fx, fy, fz;
    for (int half = 0; half < 2; ++half) {
        const std::uint8_t* q = p + 8 * half;
        const f64x2 lb = {static_cast<double>(q[0]), static_cast<double>(q[4])};
        const f64x2 ab = {static_cast<double>(q[1]), static_cast<double>(q[5])};
        const f64x2 bb = {static_cast<double>(q[2]), static_cast<double>(q[6])};
        const f64x2 y = __builtin_convertvector(
            __builtin_convertvector(((lb * 0.392156870078234) * scale_l + 16.0) * 0.008620689655172414,
                                    simd::f32x2),
            f64x2);
        const auto x = __builtin_convertvector(y + (scale_a * ab - 127.0) * 0.002, simd::f32x2);
        const auto z = __builtin_convertvector(y + (127.0 - scale_b * bb) * 0.005, simd::f32x2);
        for (int i = 0; i < 2; ++i) {
            fx[2 * half + i] = x[i];
            fy[2 * half + i] = static_cast<float>(y[i]);
            fz[2 * half + i] = z[i];
        }
    }
    const auto compand = [](f32x4 f) {
        const f32x4 cube = f * f * f;
        const f32x4 linear = (f - simd::splat(0.13793103f)) * simd::splat(0.12841916f);
        return cube > simd::splat(0.008856f) ? cube : linear;
    };
    const f32x4 x = compand(fx) * simd::splat(0.95047f);
    const f32x4 y = compand(fy);
    const f32x4 z = compand(fz) * simd::splat(1.08883f);
    const f32x4 linear[3] = {
        (x * simd::splat(3.2406f) + y * simd::splat(-1.5372f)) + z * simd::splat(-0.4986f),
        (x * simd::splat(-0.9689f) + y * simd::splat(1.8758f)) + z * simd::splat(0.0415f),
        (x * simd::splat(0.0557f) + y * simd::splat(-0.204f)) + z * simd::splat(1.057f),
    };
    for (int channel = 0; channel < 3; ++channel) {
        const f32x4 v = linear[channel];
        const i32x4 inside = (v > simd::splat(0.0f)) & (v < simd::splat(1.0f));
        // Lanes outside (0, 1) read entry 0 and are replaced below.
        const i32x4 index = inside & __builtin_convertvector(v * simd::splat(1024.0f), i32x4);
        const f32x4 e = {encoding[index[0]], encoding[index[1]], encoding[index[2]], encoding[index[3]]};
        i32x4 level = __builtin_convertvector(e * simd::splat(255.0f) + simd::splat(0.5f), i32x4);
        level = inside ? level : (v >= simd::splat(1.0f) ? i32x4{255, 255, 255, 255} : i32x4{0, 0, 0, 0});
        for (int i = 0; i < 4; ++i) p[4 * i + channel] = static_cast<std::uint8_t>(level[i]);
    }
}
#endif

}  // namespace

const LinearTable& linear_table() {
    static const LinearTable table = [] {
        LinearTable t;
        fill_linear_table(t.data());
        return t;
    }();
    return table;
}

const CbrtTable& cbrt_table() {
    static const CbrtTable table = [] {
        CbrtTable t;
        fill_cbrt_table(t.data());
        return t;
    }();
    return table;
}

const EncodingTable& encoding_table() {
    static const EncodingTable table = [] {
        EncodingTable t;
        fill_encoding_table(t.data());
        return t;
    }();
    return table;
}

void lab_doubles_of_pixels(const std::uint8_t* p, std::size_t n, double* L, double* a, double* b) {
    const float* linear = linear_table().data();
    const float* cbrt = cbrt_table().data();
    for (std::size_t i = 0; i < n; ++i) {
        const Lab lab = rgb_to_lab_tabled(core::load_pixel(p + 4 * i), linear, cbrt);
        L[i] = lab.L;
        a[i] = lab.a;
        b[i] = lab.b;
    }
}

void lab_to_rgb_pixels(std::uint8_t* p, std::size_t n, double scale_l, double scale_a, double scale_b, bool lanes) {
    const float* encoding = encoding_table().data();
    std::size_t i = 0;
#if VORLITE_EXACT_FLOAT_LANES
    if (lanes) {
        for (; i + 4 <= n; i += 4) lab_to_rgb_lanes(p + 4 * i, scale_l, scale_a, scale_b, encoding);
    }
#else
    (void)lanes;
#endif
    for (; i < n; ++i) {
        VorColor c = core::load_pixel(p + 4 * i);
        lab_to_rgb(c, scale_l, scale_a, scale_b, encoding);
        core::store_pixel(p + 4 * i, c);
    }
}

}  // namespace vorlite::color

using namespace vorlite::color;

extern "C" {

VOR_API void VorColorRGB2LABInitMapping(float table[256]) { fill_linear_table(table); }

VOR_API void VorColorRGB2LABInitMappingCbrt(float table[1024]) { fill_cbrt_table(table); }

VOR_API void VorColorRGB2LABDoublesWithMapping(const VorColor* color, double* L, double* a,
                                               double* b, const float linear[256]) {
    const Lab lab = rgb_to_lab(*color, linear, cbrt_exact);
    *L = lab.L;
    *a = lab.a;
    *b = lab.b;
}

VOR_API void VorColorRGB2LABWithMapping(VorColor* color, const float linear[256]) {
    pack_lab(*color, rgb_to_lab(*color, linear, cbrt_exact));
}

VOR_API void VorColorRGB2LABDoublesWithCbrtMapping(const VorColor* color, double* L, double* a,
                                                   double* b) {
    const Lab lab = rgb_to_lab_tabled(*color, linear_table().data(), cbrt_table().data());
    *L = lab.L;
    *a = lab.a;
    *b = lab.b;
}

VOR_API void VorColorRGB2LAB(VorColor* color) {
    pack_lab(*color, rgb_to_lab_tabled(*color, linear_table().data(), cbrt_table().data()));
}

VOR_API void VorColorLAB2RGBScaled(VorColor* color, double scaleL, double scaleA, double scaleB) {
    lab_to_rgb(*color, scaleL, scaleA, scaleB, encoding_table().data());
}

VOR_API void VorColorLAB2RGB(VorColor* color) {
    lab_to_rgb(*color, 1.0, 1.0, 1.0, encoding_table().data());
}

VOR_API void VorColorRGB2HSV(const VorColor* color, float hsv[3]) {
    const int r = color->r;
    const int g = color->g;
    const int b = color->b;
    const int max = r > g ? (r > b ? r : b) : (g > b ? g : b);
    const int min = r < g ? (r < b ? r : b) : (g < b ? g : b);
    if (max == 0) {
        hsv[0] = hsv[1] = hsv[2] = 0.0f;
        return;
    }
    const float delta = static_cast<float>(max - min);
    if (delta == 0.0f) {
        hsv[0] = 0.0f;
        hsv[1] = 0.0f;
        hsv[2] = static_cast<float>(max);
        return;
    }
    float h;
    if (r == max) {
        h = static_cast<float>(g - b) / delta * 60.0f;
    } else if (g == max) {
        h = (static_cast<float>(b - r) / delta + 2.0f) * 60.0f;
    } else {
        h = (static_cast<float>(r - g) / delta + 4.0f) * 60.0f;
    }
    if (h < 0.0f) h += 360.0f;
    hsv[0] = h;
    hsv[1] = delta / static_cast<float>(max);
    hsv[2] = static_cast<float>(max);
}

VOR_API void VorColorRGB2HSL(const VorColor* color, float hsl[3]) {
    const float r = static_cast<float>(color->r) * k_inv255;
    const float g = static_cast<float>(color->g) * k_inv255;
    const float b = static_cast<float>(color->b) * k_inv255;
    const float max = r > g ? (r > b ? r : b) : (g > b ? g : b);
    const float min = r < g ? (r < b ? r : b) : (g < b ? g : b);
    const float l = (max + min) * 0.5f;
    if (max == min) {
        hsl[0] = 0.0f;
        hsl[1] = 0.0f;
        hsl[2] = l;
        return;
    }
    const float d = max - min;
    const float s = l > 0.5f ? d / (2.0f - (max + min)) : d / (max + min);
    float sector;
    if (max == r) {
        sector = (g - b) / d;
        if (g < b) sector += 6.0f;
    } else if (max == g) {
        sector = (b - r) / d + 2.0f;
    } else {
        sector = (r - g) / d + 4.0f;
    }
    hsl[0] = sector * 0.16666667f;
    hsl[1] = s;
    hsl[2] = l;
}

VOR_API void VorColorHSL2RGB(const float hsl[3], VorColor* out) {
    const float h = hsl[0];
    const float s = hsl[1];
    const float l = hsl[2];
    const float h6 = h * 6.0f;
    const float chroma = l > 0.5f ? (s + s) * (1.0f - l) : (l * s) + (l * s);
    const float m = static_cast<float>(static_cast<double>(l) - static_cast<double>(chroma) * 0.5);
    float rc = 0.0f;
    float gc = 0.0f;
    float bc = 0.0f;
    // Anything past the last sector (NaN included) is reported and drawn as
    // the grey m; the secondary component is only needed inside the wheel,
    // where folding h6 into 0..1 takes at most three subtractions.
    if (h6 <= 6.0f) {
        float m2 = h6;
        while (m2 >= 2.0f) m2 -= 2.0f;
        if (m2 >= 1.0f) m2 = 2.0f - m2;
        const float x = m2 * chroma;
        if (h6 < 1.0f) {
            rc = chroma, gc = x;
        } else if (h6 < 2.0f) {
            rc = x, gc = chroma;
        } else if (h6 < 3.0f) {
            gc = chroma, bc = x;
        } else if (h6 < 4.0f) {
            gc = x, bc = chroma;
        } else if (h6 < 5.0f) {
            rc = x, bc = chroma;
        } else {
            rc = chroma, bc = x;
        }
    } else {
        fputs("There was an error in VorColorHSL2RGB...The hPrime value was more than 6 somehow.",
              stdout);
    }
    out->r = vorlite::core::store_rounded(static_cast<double>((rc + m) * 255.0f));
    out->g = vorlite::core::store_rounded(static_cast<double>((gc + m) * 255.0f));
    out->b = vorlite::core::store_rounded(static_cast<double>((bc + m) * 255.0f));
    out->a = 255;
}

VOR_API void VorBitmapConvertRGBToLAB(VorBitmap* bitmap) {
    const LabFastTables& fast = lab_fast_tables();
    vorlite::core::for_each_pixel(bitmap->data, vorlite::core::pixel_count(*bitmap),
                                  [&fast](std::uint8_t* p) { rgb_to_lab_fast(p, fast); });
}

VOR_API void VorBitmapConvertLABToRBG(VorBitmap* bitmap, float scaleA, float scaleB) {
    lab_to_rgb_pixels(bitmap->data, vorlite::core::pixel_count(*bitmap), 1.0, static_cast<double>(scaleA),
                      static_cast<double>(scaleB), true);
}

}  // extern "C"
