// Faded warm vintage: one colour matrix that desaturates, lifts the blacks
// (as an aged print never reaches full black), warms the highlights and
// pulls the blues down, applied in a single pass.
#include <cstdint>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::legacy {
namespace {

// Blacks lifted to a warm dark brown (26, 18, 12) and white dimmed to a
// cream (245, 232, 200): the tonal range of an aged print, red kept
// longest and blue lost first.
constexpr VorColorMatrix k_warm_fade{{
    0.800f, 0.075f, 0.000f, 26.0f,  //
    0.030f, 0.790f, 0.027f, 18.0f,  //
    0.000f, 0.060f, 0.677f, 12.0f,  //
}};
constexpr float k_vintage_saturation = 0.7f;

}  // namespace
}  // namespace vorlite::legacy

using namespace vorlite;

extern "C" {

VOR_API void VorLegacyGlimmoVintageColorMatrixTransform(VorBitmap* bitmap, const VLPLRunOptions* options) {
    if (bitmap == nullptr || bitmap->data == nullptr || options == nullptr || !(options->strength > 0.0)) return;
    const float strength = options->strength > 1.0 ? 1.0f : static_cast<float>(options->strength);
    VorColorMatrix look = legacy::k_warm_fade;
    // The saturation acts first (builders multiply on the right), so the
    // fade tints an already muted photo.
    VorColorMatrixAdjSaturation(&look, legacy::k_vintage_saturation);
    // A lighter strength moves each entry back toward the identity.
    VorColorMatrix matrix;
    for (int i = 0; i < 12; ++i) {
        const float identity = VorColorMatrixIdentity.m[i];
        matrix.m[i] = identity + (look.m[i] - identity) * strength;
    }
    VorBitmapColorMatrixTransform(bitmap, &matrix);
}

}  // extern "C"
