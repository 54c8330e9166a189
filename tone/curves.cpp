// Fixed-shape tone curves: the contrast S-curve and the gamma power curve,
// each built once as a 256-level map and applied through the histogram
// transform; and the "contrast" and "gamma" processors.
#include "core/core_internal.h"
#include "proclist/proclist_internal.h"

namespace {

// Curve levels are clamped with NaN counted as above the range, so a
// curve whose power is undefined saturates to white rather than black.
std::uint8_t curve_level(float y) {
    if (!(y <= 255.0f)) return 255;
    if (y < 0.0f) return 0;
    return static_cast<std::uint8_t>(y);
}

// Each half of the S-curve spans 127 levels: the lower half 0..127, the
// upper half 127..254 (offset by 127, not 128). The upper half therefore
// sits one level low and 255 maps to 254, even at contrast 1; this drop is
// part of the curve's established look and is kept.
vorlite::core::Curve contrast_curve(float contrast) {
    const float c = contrast == 0.0f ? 1e-8f : contrast;
    const float k = 1.0f / c;
    const float s = 1.0f / 127.0f;
    vorlite::core::Curve curve;
    for (int i = 0; i < 256; ++i) {
        float y;
        if (i <= 127) {
            y = vorlite::core::powf(static_cast<float>(i) * s, c) * 127.0f + 0.5f;
        } else {
            y = (vorlite::core::powf(static_cast<float>(i - 128) * s, k) + 1.0f) * 127.0f + 0.5f;
        }
        curve[i] = curve_level(y);
    }
    return curve;
}

vorlite::core::Curve gamma_curve(float gamma) {
    const float s = 1.0f / 255.0f;
    vorlite::core::Curve curve;
    for (int i = 0; i < 256; ++i) {
        curve[i] = curve_level(vorlite::core::powf(static_cast<float>(i) * s, gamma) * 255.0f + 0.5f);
    }
    return curve;
}

// The "value" of a curve processor pulled toward the identity exponent 1
// by the run's strength; false when it is missing or not a number.
bool curve_exponent(yajl_val parameters, const VLPLRunOptions* options, float* out) {
    double value = 0.0;
    if (!vorlite::proclist::member_double(parameters, "value", &value)) return false;
    *out = VLPLBlendAroundIdentity(static_cast<float>(value), 1.0f,
                                   static_cast<float>(options->strength));
    return true;
}

}  // namespace

extern "C" {

VOR_API void VorBitmapContrastCurve(VorBitmap* bitmap, float contrast) {
    vorlite::core::apply_curve(bitmap, contrast_curve(contrast));
}

VOR_API void VorBitmapGamma(VorBitmap* bitmap, float gamma) {
    vorlite::core::apply_curve(bitmap, gamma_curve(gamma));
}

VOR_API int VLPLRunContrastProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options) {
    float contrast = 1.0f;
    if (!curve_exponent(parameters, options, &contrast)) return 0;
    VorBitmapContrastCurve(bitmap, contrast);
    return 1;
}

VOR_API int VLPLRunGammaProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options) {
    float gamma = 1.0f;
    if (!curve_exponent(parameters, options, &gamma)) return 0;
    VorBitmapGamma(bitmap, gamma);
    return 1;
}

}  // extern "C"
