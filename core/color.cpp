// Colour, point and size records.
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

VOR_API void VorPointMake(VorPoint* point, float x, float y) {
    point->x = x;
    point->y = y;
}

VOR_API void VorSizeMake(VorSize* size, float width, float height) {
    size->width = width;
    size->height = height;
}

VOR_API VorPoint VorPointScale(VorPoint p, float sx, float sy) {
    VorPoint scaled;
    scaled.x = p.x * sx;
    scaled.y = p.y * sy;
    return scaled;
}

}  // extern "C"
