// Whitening: pixels near a tooth-like hue (a* about 132 on the packed
// scale, not blue-shifted) are brightened by a gamma and their yellow
// pulled toward neutral, in proportion to a Gaussian of their distance from
// that hue.
#include <cstdint>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace {

constexpr double k_inv255_double = 0.00392156862745098;
// -1/98: a Gaussian of width 7 on the packed L*a*b* scale.
constexpr double k_gaussian = 0.01020408163265306;

std::uint8_t truncated(double v) { return vorlite::core::truncate_clamped<std::uint8_t>(v); }

VorColor whiten(VorColor colour) {
    double l = 0.0, a = 0.0, b = 0.0;
    VorColorRGB2LABDoublesWithCbrtMapping(&colour, &l, &a, &b);
    double d = (a - 132.0) * (a - 132.0);
    // Only a blue shift counts against a pixel: yellowed teeth are the
    // very pixels to treat.
    if (b < 127.0) d += (b - 127.0) * (b - 127.0);
    const double g = static_cast<double>(vorlite::core::expf(static_cast<float>(-d * k_gaussian)));
    const double k = g * 0.65;
    const float base = static_cast<float>(l * k_inv255_double);
    const float exponent = static_cast<float>(1.0 / (k * 0.5 + 1.0));
    VorColor lab = colour;
    lab.r = truncated(static_cast<double>(vorlite::core::powf(base, exponent) * 255.0f));
    lab.g = truncated(a);
    lab.b = truncated((1.0 - k) * (b + -127.0) + 127.0);
    VorColorLAB2RGB(&lab);
    return lab;
}

}  // namespace

extern "C" {

VOR_API void VorWhiten(VorBitmap* image, const VorBitmap* /*second*/) {
    if (image == nullptr || image->height < 1 || image->data == nullptr) return;
    const std::size_t count = std::size_t{image->width} * image->height;
    std::uint8_t* p = image->data;
    for (std::size_t i = 0; i < count; ++i, p += 4) {
        const VorColor out = whiten(vorlite::core::load_pixel(p));
        p[0] = out.r;
        p[1] = out.g;
        p[2] = out.b;
    }
}

}  // extern "C"
