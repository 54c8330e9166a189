// Accelerated-path hooks and the identity effect. This build has no
// accelerated path: the hooks keep their place in every effect so that one
// can be added without touching the effects.
#include "core_internal.h"

extern "C" {

VOR_API void VorBitmapBeginGLEffectIfEnabled(VorBitmap*) {}

VOR_API void VorBitmapEndGLEffectIfEnabled(VorBitmap*) {}

VOR_API void VorBitmapEffectBitmapResize(VorBitmap* bitmap) { VorBitmapBeginGLEffectIfEnabled(bitmap); }

VOR_API void VorBitmapEffectBitmapComposite(VorBitmap* bitmap) { VorBitmapBeginGLEffectIfEnabled(bitmap); }

VOR_API void VorBitmapOriginal(VorBitmap*) {}

VOR_API void VorEffectOriginal(VorBitmap* bitmap) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

// "original": no parameter keys; the dispatcher has already required the
// parameters object.
VOR_API int VLPLRunOriginalProcessor(const yajl_val, VorBitmap* bitmap, const VLPLRunOptions*) {
    VorBitmapOriginal(bitmap);
    return 1;
}

}  // extern "C"
