// Whitening: pixels near a tooth-like hue (a* about 132 on the packed
// scale, not blue-shifted) are brightened by a gamma and their yellow
// pulled toward neutral, in proportion to a Gaussian of their distance from
// that hue.
#include <algorithm>
#include <cstdint>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace {

constexpr double k_inv255_double = 0.00392156862745098;
// -1/98: a Gaussian of width 7 on the packed L*a*b* scale.
constexpr double k_gaussian = 0.01020408163265306;

std::uint8_t truncated(double v) { return vorlite::core::truncate_clamped<std::uint8_t>(v); }

// One pixel's whitening is a long chain of dependent steps (the L*a*b*
// conversion, an exponential, a division, a power, the way back), each
// waiting on the one before. A block of pixels goes through the chain a
// step at a time instead, so that the steps of neighbouring pixels overlap;
// every pixel still takes exactly its own steps in their order.
constexpr std::size_t k_block = 64;

struct Block {
    double l[k_block];
    double a[k_block];
    double b[k_block];
    double k[k_block];
    float power[k_block];
};

void whiten_block(std::uint8_t* p, std::size_t n, Block& w) {
    vorlite::color::lab_doubles_of_pixels(p, n, w.l, w.a, w.b);
    for (std::size_t i = 0; i < n; ++i) {
        double d = (w.a[i] - 132.0) * (w.a[i] - 132.0);
        // Only a blue shift counts against a pixel: yellowed teeth are the
        // very pixels to treat.
        if (w.b[i] < 127.0) d += (w.b[i] - 127.0) * (w.b[i] - 127.0);
        const double g = static_cast<double>(vorlite::core::expf(static_cast<float>(-d * k_gaussian)));
        w.k[i] = g * 0.65;
    }
    for (std::size_t i = 0; i < n; ++i) {
        const float base = static_cast<float>(w.l[i] * k_inv255_double);
        const float exponent = static_cast<float>(1.0 / (w.k[i] * 0.5 + 1.0));
        w.power[i] = vorlite::core::powf(base, exponent);
    }
    // The new L*a*b* bytes go into the pixel, which is then converted back
    // in place (VorColorLAB2RGB, four pixels at a time).
    for (std::size_t i = 0; i < n; ++i) {
        std::uint8_t* pixel = p + 4 * i;
        pixel[0] = truncated(static_cast<double>(w.power[i] * 255.0f));
        pixel[1] = truncated(w.a[i]);
        pixel[2] = truncated((1.0 - w.k[i]) * (w.b[i] + -127.0) + 127.0);
    }
    vorlite::color::lab_to_rgb_pixels(p, n, 1.0, 1.0, 1.0, true);
}

}  // namespace

extern "C" {

VOR_API void VorWhiten(VorBitmap* image, const VorBitmap* /*second*/) {
    if (image == nullptr || image->height < 1 || image->data == nullptr) return;
    const std::size_t count = std::size_t{image->width} * image->height;
    Block work;
    for (std::size_t done = 0; done < count; done += k_block) {
        whiten_block(image->data + 4 * done, std::min(k_block, count - done), work);
    }
}

}  // extern "C"
