// Colour records.
#include <cstring>

#include "core_internal.h"

extern "C" {

VOR_API void VorColorSetARGB(VorColor* color, uint8_t a, uint8_t r, uint8_t g, uint8_t b) {
    color->r = r;
    color->g = g;
    color->b = b;
    color->a = a;
}

VOR_API void VorColorCopy(VorColor* dst, const VorColor* src) { std::memcpy(dst, src, sizeof *dst); }

}  // extern "C"
