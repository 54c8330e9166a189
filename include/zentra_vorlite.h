/*
 * libzentra_vorlite: image effects on 32-bit RGBA bitmaps held in caller memory.
 *
 * Every function works in place on the records it is given, on the caller's
 * thread, and keeps no state between calls. Functions that can fail return
 * an int (1 success, 0 failure) or a null pointer; the others cannot fail.
 * Pixels are 4 bytes in memory order red, green, blue, alpha, rows top to
 * bottom with a stride of exactly the width; they are not premultiplied
 * unless a function says so. Every record is passed by pointer.
 */
#ifndef ZENTRA_VORLITE_H
#define ZENTRA_VORLITE_H

#include <stdint.h>
#include <yajl/yajl_tree.h>

#if defined(VORLITE_BUILDING) && defined(__GNUC__)
#define VOR_API __attribute__((visibility("default")))
#else
#define VOR_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* ====================================================================== */
/* Records                                                                */
/* ====================================================================== */

/* A bitmap over caller memory: width x height pixels of 4 bytes, no row gap.
 * At most 0x3FFFFFFF pixels. data is null when the bitmap holds none. */
typedef struct VorBitmap {
    uint8_t* data;
    uint32_t width;
    uint32_t height;
} VorBitmap;

/* One pixel; read as a little-endian word it is 0xAABBGGRR. */
typedef struct VorColor {
    uint8_t r;
    uint8_t g;
    uint8_t b;
    uint8_t a;
} VorColor;

typedef struct VorPoint {
    float x;
    float y;
} VorPoint;

typedef struct VorSize {
    float width;
    float height;
} VorSize;

/* Options of an effect run, and the parameters of the named effects. */
typedef struct VLPLRunOptions {
    uint32_t seed;          /* seed of every random choice of the effect */
    double strength;        /* overall strength, 1.0 = full */
    uint8_t bordersEnabled; /* 0: border effects draw nothing */
    double scale;           /* 1.0 by default */
} VLPLRunOptions;

/* Affine transform: x' = a*x + b*y + tx, y' = c*x + d*y + ty. */
typedef struct VorTransform {
    double a, b, tx;
    double c, d, ty;
} VorTransform;

/* ====================================================================== */
/* Bitmaps, colours, points, arrays                                       */
/* ====================================================================== */

/* Stores the size, then allocates width*height zero-filled (transparent
 * black) pixels. Fails, with data null, when the size overflows or reaches
 * 0x40000000 pixels, or when memory runs out. */
VOR_API int VorBitmapBuild(VorBitmap* bitmap, uint32_t width, uint32_t height);
/* Frees the pixels and nulls data; the size stays. Safe to call twice. */
VOR_API void VorBitmapFree(VorBitmap* bitmap);
/* Copies every pixel of src into dst; both must be distinct and equal in size. */
VOR_API int VorBitmapCopy(VorBitmap* dst, const VorBitmap* src);
/* Reads the pixel at the truncated point; the point must lie inside. */
VOR_API void VorBitmapGetColorAtPoint(const VorBitmap* bitmap, VorPoint p, VorColor* out);

/* Sets the four bytes; note the argument order alpha, red, green, blue. */
VOR_API void VorColorSetARGB(VorColor* color, uint8_t a, uint8_t r, uint8_t g, uint8_t b);
VOR_API void VorColorCopy(VorColor* dst, const VorColor* src);

VOR_API void VorPointMake(VorPoint* point, float x, float y);
VOR_API void VorSizeMake(VorSize* size, float width, float height);
/* (p.x * sx, p.y * sy) in single precision. */
VOR_API VorPoint VorPointScale(VorPoint p, float sx, float sy);

/* Zero-filled blocks of count * elementSize bytes into a caller's pointer
 * slot; on overflow or exhausted memory the slot is nulled and 0 returned. */
VOR_API int VorArrayBuild(void** slot, uint32_t count, uint32_t elementSize);
VOR_API int VorArrayBuild2(void** slot, uint32_t countA, uint32_t countB, uint32_t elementSize);
/* Copies countA * countB * elementSize bytes; 0 without copying on overflow. */
VOR_API int VorArrayCopy2(void* dst, const void* src, uint32_t countA, uint32_t countB,
                          uint32_t elementSize);
VOR_API void VorArrayFree(void** slot);

/* ====================================================================== */
/* Effect parameters, versions, accelerated-path hooks                    */
/* ====================================================================== */

/* seed 0, strength 1.0, borders enabled, scale 1.0. */
VOR_API void VorEffectInitParams(VLPLRunOptions* options);
/* Library version: 2.0.0. */
VOR_API void VorLiteVersion(uint32_t out[3]);
/* Effect-document format version: 1.0.1. */
VOR_API void VorLiteProclistVersion(uint32_t out[3]);

/* Brackets around every effect for a hardware-accelerated build; in this
 * build they leave the pixels untouched. */
VOR_API void VorBitmapBeginGLEffectIfEnabled(VorBitmap* bitmap);
VOR_API void VorBitmapEndGLEffectIfEnabled(VorBitmap* bitmap);
VOR_API void VorBitmapEffectBitmapResize(VorBitmap* bitmap);
VOR_API void VorBitmapEffectBitmapComposite(VorBitmap* bitmap);
/* The identity effect. */
VOR_API void VorBitmapOriginal(VorBitmap* bitmap);
VOR_API void VorEffectOriginal(VorBitmap* bitmap);

/* Constants of the interactive tools. */
VOR_API extern const float kRadiusMultiplier;      /* 2.0 */
VOR_API extern const int32_t kVorToolMaxTolerance; /* 99999999 */

/* ====================================================================== */
/* Affine transforms                                                      */
/* ====================================================================== */

VOR_API extern const VorTransform VorTransformIdentity; /* (1, 0, 0, 0, 1, 0) */

VOR_API void VorTransformCopy(VorTransform* dst, const VorTransform* src);
VOR_API void VorTransformSetIdentity(VorTransform* transform);
/* B = A x B; A and B may be the same record. */
VOR_API void VorTransformConcat(const VorTransform* A, VorTransform* B);
/* The Post operations multiply on the left: the newest applies last. */
VOR_API void VorTransformPostRotate(VorTransform* transform, double angle);
VOR_API void VorTransformPostTranslate(VorTransform* transform, double dx, double dy);
VOR_API void VorTransformPostScale(VorTransform* transform, double sx, double sy);
/* out = T^-1; a singular T leaves non-finite entries. */
VOR_API void VorTransformGetInverse(const VorTransform* transform, VorTransform* out);

/* ====================================================================== */
/* Effect documents                                                       */
/* ====================================================================== */

/* A loaded effect document: {"identifier": string, "processors": [
 * {"name": string, "parameters": object}, ...]}. Running only reads it, so
 * one document may run on several threads at once. */
typedef struct VLPLEffectDocument VLPLEffectDocument;

/* Parses an effect document; null when the text is null, not JSON, or
 * lacks the "identifier" string or the "processors" array. */
VOR_API VLPLEffectDocument* VLPLLoadEffect(const char* json);
/* Releases the document and nulls the caller's handle. */
VOR_API void VLPLUnloadEffect(VLPLEffectDocument** document);
/* Runs every processor in order on the bitmap. A failing processor ends
 * the run with 0 and leaves the changes of the ones before it. */
VOR_API int VLPLRunEffect(const VLPLEffectDocument* document, VorBitmap* bitmap,
                          const VLPLRunOptions* options);
/* Runs one {"name", "parameters"} processor object. */
VOR_API int VLPLRunProcessor(const yajl_val processor, VorBitmap* bitmap,
                             const VLPLRunOptions* options);

/* Shared decoders. A colour is {"r", "g", "b", "a"}, integers 0..255; out
 * is left unchanged on failure. A blend mode is a string; anything else,
 * or an unknown name, means "normal", and the decoder always returns 1. */
VOR_API int VLPLColorFromColorVal(const yajl_val value, VorColor* out);
VOR_API int VLPLBlendModeFromBlendModeVal(const yajl_val value, int* mode);
/* (1 - strength) * identity + strength * value, in single precision. */
VOR_API float VLPLBlendAroundIdentity(float value, float identity, float strength);

/* Processor adapters: (parameters object, bitmap, run options) -> 1 or 0. */
VOR_API int VLPLRunOriginalProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);
VOR_API int VLPLRunVignetteProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);
VOR_API int VLPLRunLegacyProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                   const VLPLRunOptions* options);
VOR_API int VLPLRunHistogramMappingProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                             const VLPLRunOptions* options);
VOR_API int VLPLRunGammaProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options);
VOR_API int VLPLRunColorMatrixTransformProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                                 const VLPLRunOptions* options);
VOR_API int VLPLRunIntensityMapProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                         const VLPLRunOptions* options);
VOR_API int VLPLRunFlareProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options);
VOR_API int VLPLRunContrastProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);
VOR_API int VLPLRunBlendWithColorProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                           const VLPLRunOptions* options);
VOR_API int VLPLRunNoiseProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options);
VOR_API int VLPLRunSharpnessProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                      const VLPLRunOptions* options);
VOR_API int VLPLRunGradientProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);

/* ====================================================================== */
/* Blend modes                                                            */
/* ====================================================================== */

/* ====================================================================== */
/* Bitmap compositing                                                     */
/* ====================================================================== */

/* ====================================================================== */
/* Colour spaces                                                          */
/* ====================================================================== */

/* ====================================================================== */
/* Colour matrices                                                        */
/* ====================================================================== */

/* ====================================================================== */
/* Histograms and histogram maps                                          */
/* ====================================================================== */

/* ====================================================================== */
/* Tone curves                                                            */
/* ====================================================================== */

/* ====================================================================== */
/* Adjustment tools                                                       */
/* ====================================================================== */

/* ====================================================================== */
/* Auto colours                                                           */
/* ====================================================================== */

/* ====================================================================== */
/* Integral images and local contrast                                     */
/* ====================================================================== */

/* ====================================================================== */
/* Sharpening and soft focus                                              */
/* ====================================================================== */

/* ====================================================================== */
/* Random numbers and noise                                               */
/* ====================================================================== */

/* ====================================================================== */
/* Auto enhance                                                           */
/* ====================================================================== */

#ifdef __cplusplus
}
#endif

#endif /* ZENTRA_VORLITE_H */
