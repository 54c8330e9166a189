// Affine transforms in double precision. Every Post operation multiplies on
// the left, so the newest operation is applied to a point last.
#include "core_internal.h"

extern "C" {

const VorTransform VorTransformIdentity = {1.0, 0.0, 0.0, 0.0, 1.0, 0.0};

VOR_API void VorTransformCopy(VorTransform* dst, const VorTransform* src) { *dst = *src; }

VOR_API void VorTransformSetIdentity(VorTransform* transform) { *transform = VorTransformIdentity; }

VOR_API void VorTransformConcat(const VorTransform* A, VorTransform* B) {
    // Built in a temporary so that A and B may be the same record; the
    // product order of each sum is part of the result's exact bits.
    VorTransform r;
    r.a = B->c * A->b + B->a * A->a;
    r.b = B->d * A->b + B->b * A->a;
    r.tx = (B->tx * A->a + B->ty * A->b) + A->tx;
    r.c = B->c * A->d + B->a * A->c;
    r.d = B->d * A->d + B->b * A->c;
    r.ty = (B->tx * A->c + B->ty * A->d) + A->ty;
    *B = r;
}

VOR_API void VorTransformPostRotate(VorTransform* transform, double angle) {
    const double c = vorlite::core::cos(angle);
    const double s = vorlite::core::sin(angle);
    const VorTransform rotation = {c, -s, 0.0, s, c, 0.0};
    VorTransformConcat(&rotation, transform);
}

VOR_API void VorTransformPostTranslate(VorTransform* transform, double dx, double dy) {
    const VorTransform translation = {1.0, 0.0, dx, 0.0, 1.0, dy};
    VorTransformConcat(&translation, transform);
}

VOR_API void VorTransformPostScale(VorTransform* transform, double sx, double sy) {
    const VorTransform scaling = {sx, 0.0, 0.0, 0.0, sy, 0.0};
    VorTransformConcat(&scaling, transform);
}

VOR_API void VorTransformGetInverse(const VorTransform* transform, VorTransform* out) {
    const VorTransform t = *transform;
    const double det = t.d * t.a - t.b * t.c;
    // A singular transform is not an error the caller can see: out starts
    // as the identity and the division below then fills it with inf/NaN.
    if (det == 0.0) *out = VorTransformIdentity;
    const double r = 1.0 / det;
    out->a = t.d * r;
    out->b = r * -t.b;
    out->c = r * -t.c;
    out->d = r * t.a;
    out->tx = -(out->a * t.tx + out->b * t.ty);
    out->ty = -(out->d * t.ty + out->c * t.tx);
}

}  // extern "C"
