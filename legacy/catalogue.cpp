// The legacy catalogue: named ready-made effects a document asks for by
// name alone through "legacyProcessor", and the entries that hand the run's
// options on to the camera displays, the grunge frames and the tone tools.
#include <cstring>

#include "proclist/proclist_internal.h"
#include "zentra_vorlite.h"

namespace {

using Entry = void (*)(VorBitmap*, const VLPLRunOptions*);

struct Named {
    const char* name;
    Entry run;
    bool gated;  // a border, drawn only while borders are enabled
};

void clarity(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) { VorEnhanceClarity(bitmap, nullptr); }

// In the order names are looked up. The two glimmo borders are not gated,
// unlike every other border: looks built on them always show them.
constexpr Named k_catalogue[] = {
    {"mar_tessaBorder", VorEffectMarTessaBorder, true},
    {"kip_coolBorder", VorEffectKipCoolBorder, true},
    {"veskBorder", VorEffectVeskBorder, true},
    {"skarnBorder", VorEffectSkarnBorder, true},
    {"nerioBorder", VorEffectNerioBorder, true},
    {"kvantBorder", VorEffectKvantBorder, true},
    {"holmvaleBorder", VorEffectHolmvaleBorder, true},
    {"duskoBorder", VorEffectDuskoBorder, true},
    {"rubraBorder", VorEffectRubraBorder, true},
    {"bi_chromeBorder", VorEffectBichromeBorder, true},
    {"pallorBorder", VorEffectPallorBorder, true},
    {"corvaleBorder", VorEffectCorvaleBorder, true},
    {"emberlyBorder", VorEffectEmberlyBorder, true},
    {"terrowBorder", VorEffectTerrowBorder, true},
    {"zenitBorder", VorEffectZenitBorder, true},
    {"old_kvantBorder", VorEffectOldKvantBorder, true},
    {"lira_griffinBorder", VorEffectLiragriffinBorder, true},
    {"tawnetBorder", VorEffectTawnetBorder, true},
    {"narwBorder", VorEffectNarwBorder, true},
    {"kairoBorder", VorEffectKairoBorder, true},
    {"colosBorder", VorEffectColosBorder, true},
    {"lanaiBorder", VorEffectLanaiBorder, true},
    {"claretBorder", VoeEffectClaretBorder, true},
    {"umbraBorder", VorEffectUmbraBorder, true},
    {"corvaleFlare", VorFlareLegacyCorvale, false},
    {"emberlyFlare", VorFlareLegacyEmberly, false},
    {"soft_focus", VorLegacySoftFocus, false},
    {"mar_tessaAutoColors", VorLegacyMarTessaAutoColors, false},
    {"glimmoBWBorder", VorEffectGlimmoBWBorder, false},
    {"glimmoTintypeBorder", VorEffectGlimmoTintypeBorder, false},
    {"glimmoTintypeColorMatrixTransform", VorLegacyGlimmoTintypeColorMatrixTransform, false},
    {"glimmoTintypeDiamondSquare", VorLegacyGlimmoTintypeDiamondSquare, false},
    {"glimmoVintageColorMatrixTransform", VorLegacyGlimmoVintageColorMatrixTransform, false},
    {"murmelGrittyPSSat", VorLegacyMurmelGrittyPSSat, false},
    {"murmelGrittyDots", VorLegacyMurmelGrittyDots, false},
    {"murmelBWPSSat", VorLegacyMurmelBWPSSat, false},
    {"murmelCinematicPSSat", VorLegacyMurmelCinematicPSSat, false},
    {"clarityEnhance", clarity, false},
};

static_assert(sizeof k_catalogue / sizeof k_catalogue[0] == 38);

}  // namespace

extern "C" {

VOR_API void VorLegacySoftFocus(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    VorConvolutionEffectSoftFocus(bitmap);
}

VOR_API void VorLegacyMarTessaAutoColors(VorBitmap* bitmap, const VLPLRunOptions* options) {
    // A warm cream ceiling: the brightest tones fade toward it, not white.
    const VorColor ceiling{251, 233, 194, 255};
    VorAutoColorsFadeMaxColor(bitmap, options->strength, &ceiling);
}

VOR_API void VorEffectNarwBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorCameraDisplay2Legacy(bitmap, options->seed);
}

VOR_API void VorEffectKairoBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorCameraDisplay4Legacy(bitmap, options->seed, options->strength);
}

VOR_API void VorEffectColosBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorCameraDisplay5Legacy(bitmap, options->seed);
}

VOR_API void VorEffectLanaiBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    VorCameraDisplay6Legacy(bitmap);
}

VOR_API void VoeEffectClaretBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorCameraDisplay7Legacy(bitmap, options->seed);
}

VOR_API void VorEffectUmbraBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    // The display takes the generator's second draw, not its first.
    VorRNG rng;
    VorRNGSeed(&rng, options->seed);
    VorRNGNextInt(&rng);
    VorCameraDisplay3Legacy(bitmap, VorRNGNextInt(&rng));
}

VOR_API void VorEffectTerrowBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    const VorColor ink{0, 15, 0, 255};
    VorGrungeBorder1Legacy(bitmap, &ink, options->seed, 0, options->strength);
}

VOR_API void VorEffectZenitBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorGrungeBorder6Legacy(bitmap, options->seed, options->strength);
}

VOR_API void VorEffectTawnetBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorGrungeBorder4Legacy(bitmap, options->seed, options->strength);
}

VOR_API void VorEffectLiragriffinBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorGrungeBorder5Legacy(bitmap, options->seed, options->strength);
}

// "legacyProcessor": "legacyName" picks the effect. Every known name
// succeeds, drawn or not; borders wait for bordersEnabled.
VOR_API int VLPLRunLegacyProcessor(const yajl_val parameters, VorBitmap* bitmap, const VLPLRunOptions* options) {
    if (parameters == nullptr || !YAJL_IS_OBJECT(parameters)) return 0;
    const yajl_val name = vorlite::proclist::member(parameters, "legacyName", yajl_t_string);
    if (name == nullptr) return 0;
    const char* text = YAJL_GET_STRING(name);
    for (const Named& entry : k_catalogue) {
        if (std::strcmp(text, entry.name) != 0) continue;
        VLPLRunOptions defaults;
        if (options == nullptr) {
            VorEffectInitParams(&defaults);
            options = &defaults;
        }
        if (bitmap == nullptr || bitmap->data == nullptr) return 1;
        if (!entry.gated || options->bordersEnabled != 0) entry.run(bitmap, options);
        return 1;
    }
    return 0;
}

}  // extern "C"
