// Entry points built on the box-hybrid filter: two-pass sharpening and
// blurring, a sharpened copy blended back over the original, soft focus,
// the light anti-aliasing blur and the "sharpness" processor.
#include <cstring>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "proclist/proclist_internal.h"
#include "tone/tone_internal.h"

namespace {

// Amount -100 scales to a blur of deviation (width + height) / 400 pixels.
constexpr float k_soft_focus_amount = -100.0f;
// The blurred image at half weight plus the original at 0.6: the weights
// add up to 1.1, so the glow also lifts the whole picture slightly.
constexpr float k_soft_focus_blur_weight = 0.5f;
constexpr float k_soft_focus_original_weight = 0.6f;
// A blur of deviation (width + height) / 8000 pixels: just enough to soften
// jagged edges.
constexpr float k_antialias_amount = -5.0f;

// The soft-focus mix of one row, the blurred pixels weighted first: row
// holds the original pixels and receives the result.
void mix_soft_focus_row(std::uint8_t* row, std::uint8_t* blurred, std::uint32_t width) {
    VorBitmap mixed{blurred, width, 1};
    const VorBitmap original{row, width, 1};
    VorBitmapBlendBitmapSeparate(&mixed, &original, k_soft_focus_blur_weight, k_soft_focus_original_weight);
    std::memcpy(row, blurred, std::size_t{4} * width);
}

}  // namespace

extern "C" {

VOR_API void VorSharpness(VorBitmap* bitmap, float amount) {
    if (amount == 0.0f) return;
    VorConvolutionEffectBoxHybridSharpen(bitmap, amount);
}

VOR_API void VorConvolutionEffectKipSharpen(VorBitmap* bitmap, float amount) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    VorConvolutionEffectBoxHybridSharpen(bitmap, amount);
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

VOR_API void VorConvolutionProcessorKipSharpen(VorBitmap* bitmap, float amount) {
    VorConvolutionEffectBoxHybridSharpen(bitmap, amount);
}

VOR_API void VorConvolutionProcessorSharpenAndBlendWithOriginal(VorBitmap* bitmap, float amount,
                                                                float alpha, uint32_t mode) {
    if (amount == 0.0f || alpha == 0.0f) return;
    // Streamed, each row is blended over its original while that is still
    // at hand, so no sharpened copy of the whole picture is ever made.
    const vorlite::color::RowBlender blender(mode, alpha, vorlite::core::pixel_count(*bitmap));
    const auto blend_row = [&blender](std::uint8_t* row, std::uint8_t* sharpened_row, std::uint32_t width) {
        blender.blend(row, sharpened_row, width);
    };
    switch (vorlite::tone::box_hybrid_two_passes(bitmap, amount, blend_row)) {
        case vorlite::tone::TwoPasses::done:
        case vorlite::tone::TwoPasses::out_of_memory:
            return;
        case vorlite::tone::TwoPasses::unavailable:
            break;
    }
    vorlite::core::WorkingBitmap sharpened;
    if (!sharpened.build_copy(*bitmap)) return;
    VorConvolutionEffectBoxHybridSharpen(sharpened.get(), amount);
    VorBitmapBlendBitmap(bitmap, sharpened.get(), mode, alpha);
}

VOR_API int VorConvolutionEffectSoftFocus(VorBitmap* bitmap) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    // Streamed, the mix needs only the row being finished, not a whole copy.
    switch (vorlite::tone::box_hybrid_two_passes(bitmap, k_soft_focus_amount, mix_soft_focus_row)) {
        case vorlite::tone::TwoPasses::done:
            VorBitmapEndGLEffectIfEnabled(bitmap);
            return 1;
        case vorlite::tone::TwoPasses::out_of_memory:
            return 0;
        case vorlite::tone::TwoPasses::unavailable:
            break;
    }
    vorlite::core::WorkingBitmap original;
    if (!original.build_copy(*bitmap)) return 0;
    VorConvolutionEffectBoxHybridSharpen(bitmap, k_soft_focus_amount);
    VorBitmapBlendBitmapSeparate(bitmap, original.get(), k_soft_focus_blur_weight,
                                 k_soft_focus_original_weight);
    VorBitmapEndGLEffectIfEnabled(bitmap);
    return 1;
}

VOR_API void VorConvolutionAntialiasGL(VorBitmap* bitmap) {
    VorConvolutionEffectBoxHybridSharpen(bitmap, k_antialias_amount);
}

VOR_API int VLPLRunSharpnessProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                      const VLPLRunOptions* options) {
    double amount = 0.0;
    vorlite::proclist::Layering layering;
    if (!vorlite::proclist::member_double(parameters, "amount", &amount)) return 0;
    if (!vorlite::proclist::member_layering(parameters, &layering)) return 0;
    // The run's strength fades the sharpened copy in; the filter itself
    // always runs at the document's amount.
    const float opacity = static_cast<float>(layering.alpha * options->strength);
    VorConvolutionProcessorSharpenAndBlendWithOriginal(bitmap, static_cast<float>(amount), opacity,
                                                       layering.mode);
    return 1;
}

}  // extern "C"
