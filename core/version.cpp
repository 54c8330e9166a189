// Versions of the library and of the effect-document format, and the
// shared constants of the interactive tools.
#include "core_internal.h"

extern "C" {

const float kRadiusMultiplier = 2.0f;
const int32_t kVorToolMaxTolerance = 99999999;

VOR_API void VorLiteVersion(uint32_t out[3]) {
    out[0] = 2;
    out[1] = 0;
    out[2] = 0;
}

VOR_API void VorLiteProclistVersion(uint32_t out[3]) {
    out[0] = 1;
    out[1] = 0;
    out[2] = 1;
}

}  // extern "C"
