// The editor's slider adjustments: one value, nominally -100..100 with 0
// meaning no change, turned into a tone curve, a colour matrix, per-channel
// gains or a sharpening amount and applied to the whole bitmap in place.
#include "core/core_internal.h"

namespace {

// Written as "not within" so that a NaN slider lands on the upper limit.
double clamp_slider(double value) {
    if (!(value <= 100.0)) value = 100.0;
    if (!(value >= -100.0)) value = -100.0;
    return value;
}

void apply_matrix(VorBitmap* bitmap, void (*adjust)(VorColorMatrix*, float), float factor) {
    VorColorMatrix matrix;
    VorColorMatrixSetIdentity(&matrix);
    adjust(&matrix, factor);
    VorBitmapColorMatrixTransform(bitmap, &matrix);
}

struct WarmthGains {
    double red, green, blue;
};

// Per-channel gains from white-point targets: warming lifts red, lowers
// green slightly and blue strongly; cooling moves each channel the other
// way with its own, larger, coefficients.
WarmthGains warmth_gains(double value) {
    double w = 0.0;
    if (value != 0.0) {
        // 1 - cos over a quarter turn: gentle around 0, reaching 100 at the
        // slider's ends; the sign follows the slider.
        w = (1.0 - vorlite::core::cos(value * 0.015707963267948967)) * (value > 0.0 ? 100.0 : -100.0);
    }
    const double inverse_white = 0.00392156862745098;
    if (w > 0.0) {
        return {(255.0 + 0.9078 * w) * inverse_white, (255.0 - 0.24 * w) * inverse_white,
                (255.0 - 1.4 * w) * inverse_white};
    }
    return {(255.0 + 1.55 * w) * inverse_white, (255.0 - 0.44625 * w) * inverse_white,
            (255.0 - 2.4531 * w) * inverse_white};
}

}  // namespace

extern "C" {

VOR_API void VorToolBrightness(VorBitmap* bitmap, const void* /*params*/, double value) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    const double v = clamp_slider(value);
    if (v < 0.0) {
        // Darkening bends the curve instead of scaling: gamma = -log2(0.5 +
        // v / 400), from 1 just below 0 to 2 at -100, so shadows go first
        // and white stays white.
        const double gamma = vorlite::core::log(v * 0.0025 + 0.5) * -1.4426950408889634;
        VorBitmapGamma(bitmap, static_cast<float>(gamma));
    } else {
        apply_matrix(bitmap, VorColorMatrixBrightness, static_cast<float>(1.0 + v * 0.006));
    }
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

VOR_API void VorToolContrast(VorBitmap* bitmap, const void* /*params*/, double value) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    // 3.1 raised to v / 100. Even 0 goes through the curve, which lowers
    // the upper half by one level.
    const double exponent = vorlite::core::exp(clamp_slider(value) * 0.011314021114911007);
    VorBitmapContrastCurve(bitmap, static_cast<float>(exponent));
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

VOR_API void VorToolSaturation(VorBitmap* bitmap, const void* /*params*/, double value) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    apply_matrix(bitmap, VorColorMatrixAdjSaturation,
                 static_cast<float>(1.0 + clamp_slider(value) * 0.01));
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

VOR_API void VorToolWarmth(VorBitmap* bitmap, const void* /*params*/, double value) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    const WarmthGains gains = warmth_gains(value);
    VorHistMap map;
    for (int i = 0; i < 256; ++i) {
        map.map[0][i] = vorlite::core::store_rounded(i * gains.red);
        map.map[1][i] = vorlite::core::store_rounded(i * gains.green);
        map.map[2][i] = vorlite::core::store_rounded(i * gains.blue);
    }
    VorBitmapHistogramTransform(bitmap, &map);
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

VOR_API void VorToolSharpness(VorBitmap* bitmap, const void* /*params*/, double value) {
    VorConvolutionEffectKipSharpen(bitmap, static_cast<float>(value));
}

// A host's four tone sliders in one call, in the order their effects
// stack on a phone: exposure first, then contrast on the new tones, then
// colour temperature, and saturation last so it works on the final hues.
VOR_API void VorToolAdjustBrightnessContrastWarmthSaturation(VorBitmap* bitmap, double brightness,
                                                             double contrast, double warmth,
                                                             double saturation) {
    VorToolBrightness(bitmap, nullptr, brightness);
    VorToolContrast(bitmap, nullptr, contrast);
    VorToolWarmth(bitmap, nullptr, warmth);
    VorToolSaturation(bitmap, nullptr, saturation);
}

}  // extern "C"
