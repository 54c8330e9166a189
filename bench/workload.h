// The parameters both sides of a pair work with, defined once so that the
// library and its peer are always given the same job.
#ifndef VORLITE_BENCH_WORKLOAD_H
#define VORLITE_BENCH_WORKLOAD_H

#include <cstdint>

#include "zentra_vorlite.h"

namespace vorlite::bench {

// A colour-grading tone map, different per channel so that no channel is
// the identity: red lifted in the shadows, green an S-curve, blue darkened.
VorHistMap tone_map();

// A warm grading matrix with cross-channel terms (it cannot take the
// per-channel table path) and offsets, row-major 3 x 4 in 0..255 units.
inline constexpr float kMixMatrix[12] = {
    0.90f, 0.20f, 0.05f, 4.0f,   //
    0.10f, 0.80f, 0.10f, 2.0f,   //
    0.05f, 0.15f, 0.75f, -6.0f,  //
};

inline constexpr float kBlendOpacity = 0.5f;
inline constexpr float kNoiseIntensity = 0.1f;
inline constexpr std::uint32_t kNoiseSeed = 42;
inline constexpr float kSharpenAmount = 100.0f;
inline constexpr double kIntensityMapAlpha = 0.6;

// The Gaussian deviation in pixels that the box-hybrid filter approximates
// for an amount on a width x height bitmap: (width + height) x amount x
// 2.5e-5. An unsharp mask with this sigma does the same job.
double sharpen_sigma(std::uint32_t width, std::uint32_t height, float amount);

}  // namespace vorlite::bench

#endif
