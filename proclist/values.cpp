// Typed lookups of document members, and the shared value decoders every
// adapter uses: colours, blend modes, and the pull of an amount towards its
// identity by the run's strength.
#include <cstring>

#include "proclist_internal.h"

namespace vorlite::proclist {

yajl_val member(yajl_val object, const char* key, yajl_type type) {
    if (object == nullptr || !YAJL_IS_OBJECT(object)) return nullptr;
    const char* path[] = {key, nullptr};
    return yajl_tree_get(object, path, type);
}

bool member_double(yajl_val object, const char* key, double* out) {
    const yajl_val value = member(object, key, yajl_t_number);
    if (value == nullptr) return false;
    *out = YAJL_GET_DOUBLE(value);
    return true;
}

bool member_integer(yajl_val object, const char* key, long long* out) {
    const yajl_val value = member(object, key, yajl_t_number);
    if (value == nullptr) return false;
    *out = YAJL_GET_INTEGER(value);
    return true;
}

bool member_layering(yajl_val parameters, Layering* out) {
    double alpha = 0.0;
    if (!member_double(parameters, "alpha", &alpha)) return false;
    int mode = 0;
    VLPLBlendModeFromBlendModeVal(member(parameters, "blendMode", yajl_t_any), &mode);
    *out = Layering{alpha, static_cast<std::uint32_t>(mode)};
    return true;
}

}  // namespace vorlite::proclist

using vorlite::proclist::member_integer;

extern "C" {

VOR_API int VLPLColorFromColorVal(const yajl_val value, VorColor* out) {
    if (value == nullptr || !YAJL_IS_OBJECT(value)) return 0;
    long long r = 0, g = 0, b = 0, a = 0;
    if (!member_integer(value, "r", &r) || !member_integer(value, "g", &g) ||
        !member_integer(value, "b", &b) || !member_integer(value, "a", &a)) {
        return 0;
    }
    // yajl reports a number with a fraction or an exponent as out of
    // integer range, so such channels are rejected here as too large.
    if (r > 255 || g > 255) return 0;
    if (b > 255 || a > 255) return 0;
    if (r < 0 || g < 0 || b < 0 || a < 0) return 0;
    out->r = static_cast<uint8_t>(r);
    out->g = static_cast<uint8_t>(g);
    out->b = static_cast<uint8_t>(b);
    out->a = static_cast<uint8_t>(a);
    return 1;
}

VOR_API int VLPLBlendModeFromBlendModeVal(const yajl_val value, int* mode) {
    struct Named {
        const char* name;
        int mode;
    };
    static constexpr Named k_modes[] = {{"normal", 0}, {"overlay", 1}, {"darken", 4},
                                       {"screen", 3}, {"color", 2},   {"multiply", 5}};
    *mode = 0;
    if (value == nullptr || !YAJL_IS_STRING(value)) return 1;
    const char* name = YAJL_GET_STRING(value);
    for (const Named& m : k_modes) {
        if (std::strcmp(name, m.name) == 0) {
            *mode = m.mode;
            break;
        }
    }
    return 1;
}

VOR_API float VLPLBlendAroundIdentity(float value, float identity, float strength) {
    const float d = 1.0f - strength;
    const float p = d * identity;
    const float q = strength * value;
    return p + q;
}

}  // extern "C"
