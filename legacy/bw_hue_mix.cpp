// Black and white weighted per hue, and the catalogue's three looks built on
// it. A pixel's grey is its darkest channel plus its chroma (brightest minus
// darkest) times the weight of its hue, the weight interpolated between the
// six sector weights: a grey pixel has no chroma and keeps its level, and a
// weight of 1 lifts a pure hue to its brightest channel.
#include <cstddef>
#include <cstdint>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::legacy {
namespace {

constexpr float k_weight_min = -200.0f;
constexpr float k_weight_max = 300.0f;

float clamp_percent(float v) {
    if (!(v > k_weight_min)) return v != v ? 0.0f : k_weight_min;
    return v > k_weight_max ? k_weight_max : v;
}

// The weight of a hue in degrees, linear between sector centres.
float hue_weight(const VorBWHueWeights& weights, float hue) {
    const float sector = hue * (1.0f / 60.0f);
    int i = static_cast<int>(sector);
    i = i < 0 ? 0 : (i > 5 ? 5 : i);
    const float t = sector - static_cast<float>(i);
    const float a = weights.weight[i];
    const float b = weights.weight[i == 5 ? 0 : i + 1];
    return a + (b - a) * t;
}

// The punch curve: a smoothstep S mixed 70 % with the straight line, so the
// mid-tones steepen while black and white stay put.
core::Curve punch_curve() {
    core::Curve curve{};
    for (int i = 0; i < 256; ++i) {
        const float t = static_cast<float>(i) * core::k_inv255;
        const float s = t * t * (3.0f - 2.0f * t);
        curve[i] = core::store_rounded((t + (s - t) * 0.7f) * 255.0f);
    }
    return curve;
}

struct Look {
    float reds, yellows, greens, cyans, blues, magentas;
    float amount;
    int32_t punch;
};

// Gritty: warm tones dark, so skin and brick turn rough, skies pale.
constexpr Look k_gritty{20.0f, 35.0f, 50.0f, 80.0f, 90.0f, 55.0f, 0.7f, 1};
// Plain black and white with the familiar balance: blues deep, reds middle.
constexpr Look k_bw{40.0f, 60.0f, 40.0f, 60.0f, 20.0f, 80.0f, 1.0f, 0};
// Cinematic: skin glowing, skies and shadows of foliage sunk.
constexpr Look k_cinematic{110.0f, 105.0f, 45.0f, 15.0f, 5.0f, 60.0f, 0.7f, 1};

void run_look(VorBitmap* bitmap, const VLPLRunOptions* options, const Look& look) {
    if (options == nullptr) return;
    VorBWHueWeights weights;
    VorLegacyPhotoshopBWSatWeightsSet(&weights, look.reds, look.yellows, look.greens, look.cyans, look.blues,
                                      look.magentas);
    const double strength = options->strength > 1.0 ? 1.0 : options->strength;
    VorLegacyPhotoshopBWSat(bitmap, &weights, look.amount * static_cast<float>(strength), look.punch);
}

}  // namespace
}  // namespace vorlite::legacy

using namespace vorlite;

extern "C" {

VOR_API void VorLegacyPhotoshopBWSatWeightsSet(VorBWHueWeights* weights, float reds, float yellows, float greens,
                                               float cyans, float blues, float magentas) {
    if (weights == nullptr) return;
    const float percent[6] = {reds, yellows, greens, cyans, blues, magentas};
    for (int i = 0; i < 6; ++i) weights->weight[i] = legacy::clamp_percent(percent[i]) * 0.01f;
}

VOR_API void VorLegacyPhotoshopBWSat(VorBitmap* bitmap, const VorBWHueWeights* weights, float amount,
                                     int32_t punch) {
    if (bitmap == nullptr || bitmap->data == nullptr || weights == nullptr || !(amount > 0.0f)) return;
    const float opacity = amount > 1.0f ? 1.0f : amount;
    // Laying a grey over a channel at one opacity depends on the two levels
    // alone: a table of those blends gives VorColorBlend's bytes per lookup.
    color::ChannelPairTable over(VOR_BLEND_NORMAL, opacity);
    if (!over.valid()) return;
    const std::uint8_t* table = over.entries();
    const core::Curve curve = punch != 0 ? legacy::punch_curve() : core::Curve{};
    core::for_each_pixel(bitmap->data, core::pixel_count(*bitmap), [&](std::uint8_t* p) {
        const VorColor c = core::load_pixel(p);
        float hsv[3];
        VorColorRGB2HSV(&c, hsv);
        const float chroma = hsv[1] * hsv[2];
        const float grey = (hsv[2] - chroma) + chroma * legacy::hue_weight(*weights, hsv[0]);
        std::uint8_t level = core::store_rounded(grey);
        if (punch != 0) level = curve[level];
        const std::uint8_t* row = table + (std::size_t{level} << 8);
        p[0] = row[p[0]];
        p[1] = row[p[1]];
        p[2] = row[p[2]];
    });
}

VOR_API void VorLegacyMurmelGrittyPSSat(VorBitmap* bitmap, const VLPLRunOptions* options) {
    legacy::run_look(bitmap, options, legacy::k_gritty);
}

VOR_API void VorLegacyMurmelBWPSSat(VorBitmap* bitmap, const VLPLRunOptions* options) {
    legacy::run_look(bitmap, options, legacy::k_bw);
}

VOR_API void VorLegacyMurmelCinematicPSSat(VorBitmap* bitmap, const VLPLRunOptions* options) {
    legacy::run_look(bitmap, options, legacy::k_cinematic);
}

}  // extern "C"
