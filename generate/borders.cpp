// The border record: its defaults, the dispatch of a style to its renderer,
// and the JSON decoders of styles, shape modes and the vignette's "shape".
#include <cstring>

#include "core/core_internal.h"
#include "proclist/proclist_internal.h"

namespace {

struct Keyword {
    const char* name;
    std::int32_t value;
};

constexpr Keyword k_styles[] = {
    {"halftone", VOR_BORDER_HALFTONE}, {"lines", VOR_BORDER_LINES},
    {"smooth", VOR_BORDER_SMOOTH},     {"shadow", VOR_BORDER_SHADOW},
    {"fade", VOR_BORDER_FADE},         {"rough", VOR_BORDER_ROUGH},
    {"bulge", VOR_BORDER_BULGE},       {"torn", VOR_BORDER_TORN},
    {"torn_2", VOR_BORDER_TORN_2},     {"rect", VOR_BORDER_RECT},
    {"round", VOR_BORDER_ROUND},       {"glimmo", VOR_BORDER_GLIMMO},
    {"hard_rand", VOR_BORDER_HARD_RAND}, {"instant", VOR_BORDER_INSTANT},
    {"vignette", VOR_BORDER_VIGNETTE}, {"viewfinder", VOR_BORDER_VIEWFINDER},
};

constexpr Keyword k_shape_modes[] = {
    {"normal", VOR_SHAPE_NORMAL},
    {"sharp", VOR_SHAPE_SHARP},
    {"mediumSharp", VOR_SHAPE_MEDIUM_SHARP},
    {"ultraSharp", VOR_SHAPE_ULTRA_SHARP},
};

template <std::size_t N>
const Keyword* find_keyword(const Keyword (&table)[N], const char* name) {
    for (const Keyword& k : table) {
        if (std::strcmp(name, k.name) == 0) return &k;
    }
    return nullptr;
}

}  // namespace

extern "C" {

VOR_API void VorBorderInitParams(VorBorderParams* params) {
    params->inset = 0.0;
    params->halftoneScale = 1.0;
    params->lineSpacing = 1.0;
    params->shadowAngle = 0.0;
    params->sideTune1 = 0.0;
    params->width = 1.0;
    params->sideTune2 = 0.5;
    params->sideTune3 = 1.0;
    params->sideTune4 = 0.28;
    params->cornerFactor = 2.222;
    params->sideTune5 = 1.5;
    params->sideTune6 = 1.0;
    params->sideTune7 = 1.0;
    params->sideTune8 = 1.0;
    params->sideTune9 = 1.0;
    params->mpdMode = 0;
    params->sideFlags = 0;
    params->vignetteScale = 1.0;
    params->falloffPower = 1.0;
    params->cornerOffset = 0.0;
    params->roughAmplitude = 1.0;
    params->opacity = 1.0;
    params->insetLeft = 0.0;
    params->insetRight = 0.0;
    params->insetTop = 0.0;
    params->insetBottom = 0.0;
    params->seed = 0;
    params->color = VorColor{255, 255, 255, 255};
    params->blendMode = 0;
    params->style = VOR_BORDER_NONE;
    params->shapeMode = VOR_SHAPE_NORMAL;
    params->stretch = 0;
    params->dx = 0.0;
    params->dy = 0.0;
}

VOR_API void VorBorders(VorBitmap* bitmap, VorBorderParams* params) {
    switch (params->style) {
        case VOR_BORDER_HALFTONE:
        case VOR_BORDER_LINES:
        case VOR_BORDER_SMOOTH:
        case VOR_BORDER_SHADOW:
        case VOR_BORDER_FADE:
        case VOR_BORDER_ROUGH:
        case VOR_BORDER_VIEWFINDER:
            VorBordersTheta(bitmap, params);
            return;
        case VOR_BORDER_BULGE:
        case VOR_BORDER_TORN:
        case VOR_BORDER_RECT:
        case VOR_BORDER_ROUND:
        case VOR_BORDER_GLIMMO:
            VorBordersSide(bitmap, params);
            return;
        case VOR_BORDER_TORN_2:
            VorBordersDoubleSided(bitmap, params);
            return;
        case VOR_BORDER_HARD_RAND:
            VorBordersHardRand(bitmap, params);
            return;
        case VOR_BORDER_VIGNETTE:
            VorVignette(bitmap, params);
            return;
        default:
            // No style, "instant" (drawn only by VorBordersInstant) and
            // unknown values leave the picture as it is.
            return;
    }
}

VOR_API int VLPLBorderStyleFromBorderStyleTypeVal(const yajl_val value, VorBorderStyle* outStyle) {
    if (value == nullptr || !YAJL_IS_STRING(value)) return 0;
    const Keyword* k = find_keyword(k_styles, YAJL_GET_STRING(value));
    if (k == nullptr) return 0;
    *outStyle = k->value;
    return 1;
}

VOR_API int VLPLBorderShapeModeFromBorderShapeModeVal(const yajl_val value, VorBorderShapeMode* outMode) {
    *outMode = VOR_SHAPE_NORMAL;
    if (value == nullptr || !YAJL_IS_STRING(value)) return 1;
    const Keyword* k = find_keyword(k_shape_modes, YAJL_GET_STRING(value));
    if (k != nullptr) *outMode = k->value;
    return 1;
}

VOR_API int VLPLBorderPopoulateWithShapeTypeVal(const yajl_val shape, VorBorderParams* params,
                                                const VorBitmap* bitmap, float strength,
                                                uint8_t addEpsilon) {
    using vorlite::proclist::member;
    using vorlite::proclist::member_double;
    double scale = 0.0;
    const yajl_val scaling = member(shape, "scaling", yajl_t_string);
    if (!member_double(shape, "vignetteScale", &scale) || scaling == nullptr) return 0;
    VorBorderShapeMode mode = VOR_SHAPE_NORMAL;
    VLPLBorderShapeModeFromBorderShapeModeVal(member(shape, "shapeMode", yajl_t_any), &mode);
    double dx = 0.0;
    double dy = 0.0;
    member_double(shape, "dx", &dx);
    member_double(shape, "dy", &dy);
    params->shapeMode = mode;
    params->dx = dx;
    params->dy = dy;
    // A larger strength makes a smaller radius, so the darkening reaches
    // further in; the epsilon keeps a zero strength finite.
    const double divisor = static_cast<double>(strength) + (addEpsilon ? 1e-8 : 0.0);
    const char* how = YAJL_GET_STRING(scaling);
    if (std::strcmp(how, "average") == 0) {
        const double sum = static_cast<double>(static_cast<std::uint64_t>(bitmap->width) + bitmap->height);
        params->vignetteScale = scale * 0.5 * sum / divisor;
        params->stretch = 0;
    } else if (std::strcmp(how, "max") == 0) {
        const std::uint32_t larger = bitmap->width > bitmap->height ? bitmap->width : bitmap->height;
        params->vignetteScale = static_cast<double>(larger) * scale / divisor;
        params->stretch = 0;
    } else if (std::strcmp(how, "stretch") == 0) {
        params->vignetteScale = scale / divisor;
        params->stretch = 1;
    } else {
        return 0;
    }
    return 1;
}

}  // extern "C"
