// Masks: the coverage a tool paints. Alpha 255 shows the processed image,
// 0 the untouched photograph. Two fills, the colour-aware brush, the plain
// soft brush that also paints colour, and two quantised Gaussian shapes.
#include <array>
#include <cmath>
#include <cstdint>
#include <cstring>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace {

// 1 - 1/sqrt(51): at radius + h times this the soft edge's weight has
// fallen to exactly 1/51, below which a dab no longer shows.
constexpr double k_edge_fraction = 0.8599719915971991;
// The same edge at a fixed four pixels for the plain brush.
constexpr double k_draw_edge = 3.4398879663887962;
// About 2 ln 1.02 and 2 ln 51: colour distances (over twice the squared
// tolerance) at which the colour Gaussian passes 1/1.02 and 1/51.
constexpr double k_colour_full = 0.03960525459235951;
constexpr double k_colour_none = 7.8636512654486515;
constexpr double k_inv255_double = 0.00392156862745098;
// ln(254/255), ln(1/255) and ln(63/64): where 1 - exp(-d^2 / 2r^2) crosses
// 1/255, 254/255 and the first half-step of 32 levels.
constexpr double k_ln_254_255 = -0.00392927813988955;
constexpr double k_ln_1_255 = -5.541263545158429;
constexpr double k_ln_63_64 = -0.015748356968139168;

void fill(VorBitmap* mask, std::uint8_t value) {
    if (mask == nullptr || mask->data == nullptr) return;
    std::memset(mask->data, value, std::size_t{mask->width} * mask->height * 4);
}

// The pixels a dab of outer radius R may reach: rounded centre +- R,
// clamped to the bitmap.
struct Box {
    std::int32_t x0, x1, y0, y1;
};

std::int32_t clamp_to(std::int32_t v, std::uint32_t size) {
    if (v < 0) return 0;
    const std::int64_t last = size < 1 ? 0 : static_cast<std::int64_t>(size) - 1;
    return v > last ? static_cast<std::int32_t>(last) : v;
}

Box dab_box(double cx, double cy, double outer, std::uint32_t width, std::uint32_t height) {
    using vorlite::core::truncate_clamped;
    return Box{clamp_to(truncate_clamped<std::int32_t>(cx + 0.5 - outer), width),
               clamp_to(truncate_clamped<std::int32_t>(outer + cx + 0.5), width),
               clamp_to(truncate_clamped<std::int32_t>(cy + 0.5 - outer), height),
               clamp_to(truncate_clamped<std::int32_t>(outer + cy + 0.5), height)};
}

// Calls visit(pixel, d2) for each pixel of the box strictly inside the
// outer radius (a NaN distance is outside).
template <typename Visit>
void for_each_in_dab(VorBitmap* mask, std::uint32_t width, std::uint32_t height, double cx, double cy,
                     double outer, Visit&& visit) {
    if (width == 0 || height == 0 || mask->data == nullptr) return;
    const Box box = dab_box(cx, cy, outer, width, height);
    if (box.y0 > box.y1) return;
    const double outer2 = outer * outer;
    for (std::int32_t y = box.y0; y <= box.y1; ++y) {
        const double dy = static_cast<double>(y) - cy;
        std::uint8_t* row = mask->data + (std::size_t{static_cast<std::uint32_t>(y)} * width) * 4;
        for (std::int32_t x = box.x0; x <= box.x1; ++x) {
            const double dx = static_cast<double>(x) - cx;
            const double d2 = dx * dx + dy * dy;
            if (!(outer2 > d2)) continue;
            visit(row + std::size_t{static_cast<std::uint32_t>(x)} * 4, static_cast<std::uint32_t>(x),
                  static_cast<std::uint32_t>(y), d2);
        }
    }
}

// The weight of the soft edge: 1 inside the radius, then a squared ramp
// falling by 1 per `edge` pixels.
double spatial_weight(double d2, double radius, double inv_edge) {
    if (d2 < radius * radius) return 1.0;
    const double s = (radius - std::sqrt(d2)) * inv_edge + 1.0;
    return s * s;
}

// Alpha from the brush's value: 255 above 254.5, 0 below -0.5 (and for
// NaN, which fails both tests the same way as the store rule says).
std::uint8_t store_alpha(double v) {
    if (!(v <= 254.5)) return 255;
    if (v < -0.5) return 0;
    return static_cast<std::uint8_t>(static_cast<std::uint32_t>(v + 0.5));
}

// The 31 half-step cut-offs after the innermost, sorted ascending; the
// level is 4 + 8 k for k cut-offs at or below the value.
using Steps = std::array<float, 31>;

std::uint8_t step_level(float q, const Steps& t) {
    std::uint32_t k = 0;
    for (std::uint32_t half = 16; half > 0; half >>= 1) {
        if (k + half <= 31 && t[k + half - 1] <= q) k += half;
    }
    return static_cast<std::uint8_t>(4 + 8 * k);
}

double level_log(std::uint32_t i) {
    return vorlite::core::log(1.0 - (static_cast<double>(i) + 0.5) / 32.0);
}

// -2 r^2 in float, widened: the factor turning ln(level) into a squared
// distance.
double gaussian_scale(double r) {
    return static_cast<double>(static_cast<float>(r * r) * -2.0f);
}

void write_alpha(std::uint8_t* pixel, std::uint8_t alpha) { pixel[3] = alpha; }

}  // namespace

extern "C" {

VOR_API void VorMaskSetOpaque(VorBitmap* mask) { fill(mask, 255); }

VOR_API void VorMaskSetTransparent(VorBitmap* mask) { fill(mask, 0); }

VOR_API void VorMaskSimilarColors(const VorBitmap* image, VorBitmap* mask, const VorColor* reference,
                                  double centerX, double centerY, double radius, double tolerance,
                                  double /*reserved*/, double strength, uint8_t erase,
                                  uint8_t useLightness, uint8_t ignoreColor) {
    const double h = radius * 0.5;
    const double outer = radius + h * k_edge_fraction;
    const double inv_h = 1.0 / h;
    const double t2 = tolerance * tolerance;
    double ref_l = 0.0, ref_a = 0.0, ref_b = 0.0;
    VorColorRGB2LABDoublesWithCbrtMapping(reference, &ref_l, &ref_a, &ref_b);
    const double full_below = t2 * k_colour_full;
    const double none_above = t2 * k_colour_none;
    const double gaussian = 1.0 / (2.0 * t2);
    const std::uint8_t* pixels = image->data;
    const std::uint32_t width = image->width;
    for_each_in_dab(mask, width, image->height, centerX, centerY, outer,
                    [&](std::uint8_t* m, std::uint32_t x, std::uint32_t y, double d2) {
                        const double s = spatial_weight(d2, radius, inv_h);
                        double c = 1.0;
                        if (ignoreColor == 0) {
                            const VorColor colour =
                                vorlite::core::load_pixel(pixels + (std::size_t{y} * width + x) * 4);
                            double l = 0.0, a = 0.0, b = 0.0;
                            VorColorRGB2LABDoublesWithCbrtMapping(&colour, &l, &a, &b);
                            const double da = ref_a - a;
                            const double db = ref_b - b;
                            const double dl = ref_l - l;
                            const double distance = useLightness != 0 ? (da * da + dl * dl) + db * db
                                                                      : db * db + da * da;
                            if (distance > none_above) return;
                            if (!(distance < full_below)) {
                                c = static_cast<double>(
                                    vorlite::core::expf(static_cast<float>(-distance * gaussian)));
                            }
                        }
                        const double w = s * strength * c;
                        const double alpha = static_cast<double>(m[3]);
                        const double v = erase != 0 ? (1.0 - w) * alpha
                                                    : ((alpha * k_inv255_double) * (1.0 - w) + w) * 255.0;
                        write_alpha(m, store_alpha(v));
                    });
}

VOR_API void VorMaskDraw(VorBitmap* mask, const VorColor* paint, double centerX, double centerY,
                         double radius, double strength, uint8_t erase) {
    if (mask == nullptr) return;
    const double outer = radius + k_draw_edge;
    const double colour[3] = {static_cast<double>(paint->r), static_cast<double>(paint->g),
                              static_cast<double>(paint->b)};
    for_each_in_dab(mask, mask->width, mask->height, centerX, centerY, outer,
                    [&](std::uint8_t* m, std::uint32_t, std::uint32_t, double d2) {
                        double w = spatial_weight(d2, radius, 0.25) * strength;
                        if (!(w >= 0.0)) w = 0.0;
                        if (!(w <= 1.0)) w = 1.0;
                        const double keep = 1.0 - w;
                        // Truncation, not rounding: the paint layer builds up
                        // a level lower than a rounded one would.
                        if (erase != 0) {
                            for (int i = 0; i < 4; ++i) {
                                m[i] = static_cast<std::uint8_t>(keep * static_cast<double>(m[i]));
                            }
                            return;
                        }
                        for (int i = 0; i < 3; ++i) {
                            m[i] = static_cast<std::uint8_t>(keep * static_cast<double>(m[i]) + w * colour[i]);
                        }
                        m[3] = static_cast<std::uint8_t>(keep * static_cast<double>(m[3]) + w * 255.0);
                    });
}

VOR_API void VorMaskRadial(const VorBitmap* image, VorBitmap* mask, double centerX, double centerY,
                           double radius) {
    const std::uint32_t width = image->width;
    const std::uint32_t height = image->height;
    if (height < 1 || mask->data == nullptr) return;
    const double s = gaussian_scale(radius);
    const float inner = static_cast<float>(s * k_ln_254_255);
    const float outer = static_cast<float>(s * k_ln_1_255);
    Steps t{};
    for (std::uint32_t i = 1; i <= 31; ++i) t[i - 1] = static_cast<float>(s * level_log(i));
    std::uint8_t* p = mask->data;
    for (std::uint32_t y = 0; y < height; ++y) {
        const double dy = static_cast<double>(y) - centerY;
        const double dy2 = dy * dy;
        for (std::uint32_t x = 0; x < width; ++x, p += 4) {
            const double dx = static_cast<double>(x) - centerX;
            const float q = static_cast<float>(dx * dx + dy2);
            std::uint8_t alpha;
            if (q < inner) {
                alpha = 0;
            } else if (q > outer) {
                alpha = 255;
            } else {
                alpha = step_level(q, t);
            }
            write_alpha(p, alpha);
        }
    }
}

VOR_API void VorMaskLinear(const VorBitmap* image, VorBitmap* mask, double centerX, double centerY,
                           double width, double angle) {
    const std::uint32_t columns = image->width;
    const std::uint32_t height = image->height;
    if (height < 1 || mask->data == nullptr) return;
    const double s = gaussian_scale(width);
    const float outer = static_cast<float>(std::sqrt(s * k_ln_1_255));
    // The band's innermost cut-off is the first half-step, not the 1/255
    // crossing the radial hole uses: the two shapes differ on purpose.
    const float inner = static_cast<float>(std::sqrt(s * k_ln_63_64));
    Steps t{};
    for (std::uint32_t i = 1; i <= 31; ++i) t[i - 1] = static_cast<float>(std::sqrt(s * level_log(i)));
    const double sn = static_cast<double>(static_cast<float>(vorlite::core::sin(angle)));
    const double cs = static_cast<double>(static_cast<float>(vorlite::core::cos(angle)));
    std::uint8_t* p = mask->data;
    for (std::uint32_t y = 0; y < height; ++y) {
        const double qy = (static_cast<double>(y) - centerY) * cs;
        for (std::uint32_t x = 0; x < columns; ++x, p += 4) {
            const double along = (centerX - static_cast<double>(x)) * -sn + qy;
            // Whole pixels of distance: the band is stepped, deliberately.
            const std::int32_t whole = vorlite::core::truncate_clamped<std::int32_t>(along);
            const float dist =
                static_cast<float>(whole < 0 ? -static_cast<std::int64_t>(whole) : static_cast<std::int64_t>(whole));
            std::uint8_t alpha;
            if (dist < inner) {
                alpha = 0;
            } else if (dist > outer) {
                alpha = 255;
            } else {
                alpha = step_level(dist, t);
            }
            write_alpha(p, alpha);
        }
    }
}

}  // extern "C"
