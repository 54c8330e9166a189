// Automatic enhancement: a brightness gain per luminance level, derived
// from the luminance-weighted cumulative histogram and smoothed, applied to
// green directly and to red and blue partly multiplicatively and partly
// through green's change.
#include <array>

#include "core/core_internal.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::core::store_truncated;

constexpr int k_levels = 256;
using Gains = std::array<float, k_levels>;

// Per-channel levels: the black point a_c is subtracted and the result
// multiplied by scale_c. The percentiles are held at 0 and 1, which makes
// the stage neutral (a_c = 0, scale_c = 1) but keeps the arithmetic a
// different pair of percentiles would use.
struct Levels {
    double offset[3];
    double scale[3];
};

Levels neutral_levels(const VorCDF& cdf) {
    Levels levels;
    for (int c = 0; c < 3; ++c) {
        const double lo = VorCDFINV(cdf.cdf[c], 0.0);
        const double hi = VorCDFINV(cdf.cdf[c], 1.0);
        const double a = vorlite::core::pow(lo, 0.7);
        const double b = vorlite::core::pow(255.0 - hi, 0.7);
        levels.offset[c] = a;
        levels.scale[c] = 255.0 / (255.0 - b - a);
    }
    return levels;
}

// The gain of one level from its ratio r: how much more of the image lies
// at or below the level than an even spread of levels would put there.
float gain_of_ratio(double ratio, int level, int mode) {
    const float r = static_cast<float>(ratio);
    if (mode == 0) return vorlite::core::powf(r, 0.8f);
    if (mode == 2) return ratio > 1.0 ? vorlite::core::powf(r, 0.65f) : 1.0f;
    // The exponent shrinks toward white, so highlights are lifted least.
    const float shade = 1.0f - static_cast<float>(level) * vorlite::core::k_inv255;
    return vorlite::core::powf(r, 0.5f * vorlite::core::powf(shade, 2.2f));
}

// Gains from the luminance-weighted running total of the three channel
// histograms. Level 0 has no even-spread share to compare against and gets
// ratio 0.
Gains gain_table(const VorHistogram& histogram, std::size_t pixels, int mode) {
    const float q = 1.0f / static_cast<float>(pixels);
    const std::uint32_t(&count)[3][256] = histogram.count;
    Gains gains;
    double running = 0.0;
    for (int i = 0; i < k_levels; ++i) {
        running += count[0][i] * 0.213 + count[1][i] * 0.715 + count[2][i] * 0.072;
        const double ratio = i > 0 ? running * static_cast<double>(q) / i * 255.0 : 0.0;
        gains[i] = gain_of_ratio(ratio, i, mode);
    }
    return gains;
}

// 1 - 0.8 in double: the share of green's change that red and blue take
// over additively.
constexpr double k_green_share = 0x1.9999999999998p-3;

void apply_gains(VorBitmap* bitmap, const Gains& gains, const Levels& levels) {
    vorlite::core::for_each_pixel(bitmap->data, vorlite::core::pixel_count(*bitmap), [&](std::uint8_t* p) {
        const double r = p[0];
        const double g = p[1];
        const double b = p[2];
        // The weights sum to 1, so y stays below 256 and indexes the table.
        const double y = (g * 0.715 + r * 0.213) + b * 0.072;
        const double gain = gains[static_cast<int>(y)];
        // Green carries two half-level offsets, one here and one when it
        // is stored below.
        const double t = gain * g + 0.5;
        const double k = gain - 1.0;
        const double w = (t - g) * k_green_share;
        const double r_out = levels.scale[0] * ((r * 0.8 * k + r + w) - levels.offset[0]) + 0.5;
        const double g_out = levels.scale[1] * (t - levels.offset[1]) + 0.5;
        const double b_out = levels.scale[2] * ((b * 0.8 * k + b + w) - levels.offset[2]) + 0.5;
        p[0] = store_truncated(r_out);
        p[1] = store_truncated(g_out);
        p[2] = store_truncated(b_out);
    });
}

}  // namespace

extern "C" {

VOR_API void VorAutoEnhance(VorBitmap* bitmap, int mode) {
    // Only the begin hook is called: the hooks leave the pixels alone, and
    // the enhancement has always been bracketed on one side only.
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    if (mode == 3) VorBitmapContrastCurve(bitmap, 0.5f);

    Gains gains;
    Levels levels;
    {
        vorlite::tone::ChannelStatistics statistics;
        if (!vorlite::tone::gather_channel_statistics(bitmap, &statistics)) return;
        levels = neutral_levels(*statistics.cdf.get());
        gains = gain_table(*statistics.histogram.get(), vorlite::core::pixel_count(*bitmap), mode);
    }
    VorLineSmooth1D(gains.data(), k_levels, 4);
    apply_gains(bitmap, gains, levels);
}

}  // extern "C"
