// Helpers shared by every processor adapter for reading its parameters.
#ifndef VORLITE_PROCLIST_INTERNAL_H
#define VORLITE_PROCLIST_INTERNAL_H

#include <yajl/yajl_tree.h>

#include <cstdint>

#include "zentra_vorlite.h"

namespace vorlite::proclist {

// The member `key` of `object` if it is present and of JSON type `type`
// (yajl_t_any accepts every type); null otherwise, also when `object`
// is null or not an object.
yajl_val member(yajl_val object, const char* key, yajl_type type);

// A member that is a JSON number, read as yajl provides it: the double
// value (which is infinite for numbers beyond double range), or the 64-bit
// integer value (which saturates for numbers with a fraction or exponent).
bool member_double(yajl_val object, const char* key, double* out);
bool member_integer(yajl_val object, const char* key, long long* out);

// How an adapter lays its result over the picture: "alpha", a required
// number read as a double (the opacity before the run's strength), and
// "blendMode", optional: absent, not a string or an unknown name all mean
// normal, as VLPLBlendModeFromBlendModeVal rules. False only when "alpha"
// is missing or not a number.
struct Layering {
    double alpha;
    std::uint32_t mode;
};
bool member_layering(yajl_val parameters, Layering* out);

}  // namespace vorlite::proclist

#endif
