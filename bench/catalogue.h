// What is measured and what counts as good enough: the bitmap sizes, the
// pairs of the library against its peers with their goals, and the growth
// limits. The benchmarks register from it and the report reads its goals
// from it, so a name cannot drift between the two.
//
// Every benchmark is named "operation/side/size": side "ours" is the
// library, any other side is a peer of the same operation.
#ifndef VORLITE_BENCH_CATALOGUE_H
#define VORLITE_BENCH_CATALOGUE_H

#include <cstdint>

namespace vorlite::bench {

struct BitmapSize {
    const char* label;
    std::uint32_t width;
    std::uint32_t height;
};

// A photo-sized bitmap and a small one of the same 4:3 shape: time per pixel
// should not grow between them.
inline constexpr BitmapSize kSmall{"1MP", 1152, 864};
inline constexpr BitmapSize kLarge{"12MP", 4000, 3000};
inline constexpr BitmapSize kSizes[] = {kSmall, kLarge};

inline constexpr const char* kOurs = "ours";

// One row of the comparison table: an operation of the library against one
// peer. goal is the largest acceptable ratio ours/peer of the medians; 0
// means the peer is shown for information only. large_only limits the goal
// to the 12-megapixel bitmap: the blur's cost grows with the photo there,
// and memcpy is a floor only there, where its 48 MB cannot sit in a cache
// (the 4 MB of the small bitmap still do after the untimed fresh copy).
struct Comparison {
    const char* operation;
    const char* ours_label;
    const char* peer;
    const char* peer_label;
    double goal;
    bool large_only = false;
};

inline constexpr Comparison kComparisons[] = {
    {"lut", "VorBitmapHistogramTransform", "opencv", "cv::LUT, CV_8UC4, identity alpha table", 0.5},
    {"lut", "VorBitmapHistogramTransform", "vips", "vips_maplut", 0.0},
    {"lut", "VorBitmapHistogramTransform", "memcpy", "memcpy of the same bytes (floor)", 2.0, true},
    {"matrix", "VorBitmapColorMatrixTransform, cross-channel", "opencv", "cv::transform, 4 x 5 matrix", 0.6},
    {"matrix", "VorBitmapColorMatrixTransform, cross-channel", "vips", "vips_recomb + vips_linear", 0.0},
    {"lab", "VorBitmapConvertRGBToLAB", "opencv", "cv::cvtColor RGB to Lab, 8-bit", 1.0},
    {"sharpen", "VorConvolutionEffectKipSharpen, amount 100", "opencv",
     "cv::GaussianBlur + cv::addWeighted (unsharp mask, same sigma)", 0.25, true},
    {"sharpen", "VorConvolutionEffectKipSharpen, amount 100", "vips", "vips_gaussblur (blur only, same sigma)",
     0.0},
    {"blend", "VorBitmapBlendBitmap, normal, opacity 0.5", "opencv", "cv::addWeighted 0.5 / 0.5", 1.5},
    {"noise", "VorBitmapAddNoise, intensity 0.1", "opencv", "cv::randu over [0, 64) + cv::add", 0.6},
    {"vignette", "VorVignette, multiply, stretched, scale 0.6", "memcpy", "memcpy of the same bytes", 5.0, true},
    {"gradient", "VorGradientApply, linear, overlay", "memcpy", "memcpy of the same bytes", 5.0, true},
    {"clarity", "VorEnhanceClarity", "memcpy", "memcpy of the same bytes", 30.0, true},
};

// Sharpening cost must hardly depend on the amount: the time at the large
// amount over the time at the small one, on the large bitmap.
inline constexpr const char* kSharpenSmallAmount = "sharpen_a50";
inline constexpr const char* kSharpenLargeAmount = "sharpen_a400";
inline constexpr double kSharpenGrowthGoal = 1.5;

// Every whole-image operation: time per pixel on the large bitmap over time
// per pixel on the small one.
inline constexpr double kSizeGrowthGoal = 1.3;

// The generated effects (vignette, gradients, frames, flares), named by
// these prefixes, have a table of their own: each row against memcpy of the
// same bytes, measured in the same run under the vignette's name.
inline constexpr const char* kGeneratedPrefixes[] = {"vignette", "gradient", "border_", "flare"};
inline constexpr const char* kGeneratedFloor = "vignette";

// A flare visits only its work box. Each flare type is drawn again at half
// its size on the large bitmap (operation name + kHalfSizeSuffix), where its
// box is about a quarter as large; its time per box pixel (the counter
// kBoxPixelsCounter holds the box's pixel count) should not grow by more
// than this factor.
inline constexpr const char* kHalfSizeSuffix = "_half";
inline constexpr const char* kBoxPixelsCounter = "box_pixels";
inline constexpr double kFlareBoxGoal = 1.3;

// Peak resident memory of the command-line tool over the decoded bitmap.
inline constexpr double kMemoryGoal = 3.0;

}  // namespace vorlite::bench

#endif
