// Point and size records: pairs of single-precision floats.
#include "core_internal.h"

extern "C" {

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
