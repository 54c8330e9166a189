/*
 * libzentra_vorlite: image effects on 32-bit RGBA bitmaps held in caller memory.
 *
 * Every function works in place on the records it is given, on the caller's
 * thread, and keeps no state between calls. Functions that can fail return
 * an int (1 success, 0 failure) or a null pointer; the others cannot fail.
 * Pixels are 4 bytes in memory order red, green, blue, alpha, rows top to
 * bottom with a stride of exactly the width; they are not premultiplied
 * unless a function says so. Every record is passed by pointer.
 *
 * Threads: the library creates none and holds no lock. Calls on distinct
 * bitmaps and records may run on different threads at once; calls that
 * share a bitmap, a tool record or a blend memo table must not overlap.
 * A loaded effect document may be run from many threads at once, since
 * running only reads it. The one process-wide state the library touches
 * is the C library's lrand48 generator, in VorRNGInit.
 *
 * Angles are in radians; a positive angle turns the x axis toward the y
 * axis, which on a bitmap (y pointing down) is clockwise on screen.
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
/* Frees pixels that VorBitmapBuild allocated and nulls data; the size
 * stays. Safe to call twice. Never pass a bitmap over the caller's own
 * memory: only VorBitmapBuild's pixels may be released here. */
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
/* Rotation by angle radians, positive from the x axis toward the y axis
 * (clockwise on a bitmap, whose y axis points down), about the origin. */
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
 * lacks the "identifier" string or the "processors" array. A document that
 * parses but lacks that envelope is not released: its parsed tree stays
 * allocated for the life of the process, so a host that loads untrusted
 * text many times should check it first. Processor names and parameters
 * are judged only when the document runs. */
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

/* Processor adapters: (parameters object, bitmap, run options) -> 1 or 0.
 * Each is named after the "name" that dispatches to it; its parameter keys
 * are listed beside it. A required key missing or of the wrong JSON type
 * gives 0 before any pixel changes. "alpha" is always a number and
 * "blendMode" an optional blend-mode string (absent means normal). */
/* "original": no keys; the pixels stay as they are. */
VOR_API int VLPLRunOriginalProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);
/* "vignette": "color" (colour), "shape" (object), "blendMode"; the
 * strength divides the radius. */
VOR_API int VLPLRunVignetteProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);
/* "legacyProcessor": "legacyName", one of the 38 names of the legacy
 * catalogue; 0 for another name or a non-string. Borders other than the two
 * glimmo ones draw only while bordersEnabled is set, yet return 1. */
VOR_API int VLPLRunLegacyProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                   const VLPLRunOptions* options);
/* "histogramMapping": "histMap" {"r", "g", "b": 256 levels each}, faded
 * toward the identity by the strength. */
VOR_API int VLPLRunHistogramMappingProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                             const VLPLRunOptions* options);
/* "gamma": "value" (number), the exponent, pulled toward 1 by the strength. */
VOR_API int VLPLRunGammaProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options);
/* "colorMatrixTransform": "operations", an array of {"operation":
 * "brightness" | "contrast" | "saturation", "value": number} or
 * {"operation": "hardSet", "entries": 12 numbers, "gain": number (optional,
 * 1)}, folded in order into a matrix that starts as the identity; the
 * strength pulls each amount toward its identity. */
VOR_API int VLPLRunColorMatrixTransformProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                                 const VLPLRunOptions* options);
/* "intensityMap": "histMap" (as "histogramMapping"), "alpha", "blendMode";
 * the strength fades the map and scales alpha. */
VOR_API int VLPLRunIntensityMapProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                         const VLPLRunOptions* options);
/* "flare": "color", "blendMode", "type" (a flare keyword), "dx", "dy", "dsx",
 * "dsy", "fScale", all required; the strength scales the colour's alpha. */
VOR_API int VLPLRunFlareProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options);
/* "contrast": "value" (number), the S-curve exponent, pulled toward 1 by
 * the strength. */
VOR_API int VLPLRunContrastProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);
/* "blendWithColor": "color" (colour), "alpha", "blendMode"; opacity alpha x
 * strength. */
VOR_API int VLPLRunBlendWithColorProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                           const VLPLRunOptions* options);
/* "noise": "intensity" (number) x strength, monochrome grain seeded with
 * the run's seed. */
VOR_API int VLPLRunNoiseProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options);
/* "sharpness": "amount" (number, the box-hybrid amount), "alpha",
 * "blendMode"; the sharpened copy is laid over at alpha x strength. */
VOR_API int VLPLRunSharpnessProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                      const VLPLRunOptions* options);
/* "gradient": "colors" and "opacities" (stop arrays), "gradientShape"
 * ("linear", "radial", "linearVignette"), "scale", "xCenter", "yCenter",
 * "angle" (degrees), "alpha", "vignetteShape", "blendMode"; the strength
 * scales the opacity. */
VOR_API int VLPLRunGradientProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options);

/* ====================================================================== */
/* Blend modes                                                            */
/* ====================================================================== */

/* Blend modes: how a source colour is laid over a destination pixel. */
#define VOR_BLEND_NORMAL 0u
#define VOR_BLEND_OVERLAY 1u
#define VOR_BLEND_COLOR 2u /* hue and saturation of the source, luminance of the destination */
#define VOR_BLEND_SCREEN 3u
#define VOR_BLEND_DARKEN 4u
#define VOR_BLEND_MULTIPLY 5u
#define VOR_BLEND_SOFT_LIGHT 6u

/* Memo of one source colour blended over every grey at each opacity level:
 * 196868 bytes. Level L's maps (computed[L] != 0) give the red, green and
 * blue result for each destination channel value at opacity L/255. */
typedef struct VorColorBlendMemoTable {
    uint32_t mode;
    uint8_t computed[256];
    uint8_t maps[256][3][256];
} VorColorBlendMemoTable;

/* Blends src over dst in place at opacity (not clamped; 1.0 replaces,
 * 0.0 keeps); red, green, blue written, dst alpha never. src alpha is used
 * only by the colour mode, as a saturation factor. Modes 7 and above give
 * black colour channels. */
VOR_API void VorColorBlend(VorColor* dst, const VorColor* src, uint32_t mode, float opacity);
/* The colour mode with the source given as VorColorRGB2HSL's hue,
 * saturation, lightness and its alpha; dst alpha kept. */
VOR_API void VorColorBlendColorMode(VorColor* dst, const float srcHSL[3], int32_t srcAlpha,
                                    float opacity);
/* Sets the table's mode and marks every level not computed; no pixels. */
VOR_API void VorColorBlendInitMemozied(VorColorBlendMemoTable* table, uint32_t mode);
/* Blends src over dst at opacity level/255 (level 0..255, larger levels
 * act as 255) through the grey maps of the table, filling the level on
 * first use; dst alpha kept. One table serves one source colour. */
VOR_API void VorColorBlendMemoized(VorColor* dst, const VorColor* src, uint32_t level,
                                   VorColorBlendMemoTable* table);

/* ====================================================================== */
/* Bitmap compositing                                                     */
/* ====================================================================== */

/* Every compositing function writes red, green and blue of the destination
 * in place and keeps its alpha bytes, except where the transformed blend
 * fills with opaque white. Modes and opacities are those of VorColorBlend. */

/* Blends src over dst pixel by pixel on the common top-left area; dst
 * pixels outside it are untouched; dst alpha kept. */
VOR_API void VorBitmapBlendBitmap(VorBitmap* dst, const VorBitmap* src, uint32_t mode,
                                  float opacity);
/* Each channel of the common area becomes srcWeight * src + dstWeight * dst,
 * truncated and clamped (weights not normalised); dst alpha kept. */
VOR_API void VorBitmapBlendBitmapSeparate(VorBitmap* dst, const VorBitmap* src, float dstWeight,
                                          float srcWeight);
/* Samples src bilinearly through the inverse of transform (source to
 * destination coordinates) and blends it over every dst pixel; pixels that
 * map outside the source become opaque white (alpha 255 too), others keep
 * their alpha. */
VOR_API void VorBitmapBlendBitmapTransform(VorBitmap* dst, const VorBitmap* src, uint32_t mode,
                                           float opacity, const VorTransform* transform);
/* dst = over blended onto base with the opacity of the mask's alpha,
 * stretched bilinearly over the destination; base, over and dst share the
 * destination's size; dst alpha kept. */
VOR_API void VorBitmapBlendBitmapMask(VorBitmap* dst, const VorBitmap* base, const VorBitmap* over,
                                      const VorBitmap* mask, uint32_t mode);
/* dst = premultiplied over, un-premultiplied, blended onto base at the
 * opacity of over's alpha; all three share the destination's size; dst
 * alpha kept. */
VOR_API void VorBitmapCompositePremultiplied(VorBitmap* dst, const VorBitmap* base,
                                             const VorBitmap* over, uint32_t mode);
/* Blends one colour over every pixel (through grey maps except in the
 * colour mode, where the colour's alpha scales its saturation); alpha kept. */
VOR_API void VorBitmapBlendWithColor(VorBitmap* bitmap, const VorColor* color, uint32_t mode,
                                     float opacity);
/* The same operation as VorBitmapBlendWithColor; alpha kept. */
VOR_API void VorBitmapBlend(VorBitmap* bitmap, const VorColor* color, uint32_t mode,
                            float opacity);

/* ====================================================================== */
/* Colour spaces                                                          */
/* ====================================================================== */

/* Packed L*a*b* pixel: r = L* x 2.55, g = a* + 127, b = b* + 127, each
 * clamped to 0..255 and truncated; alpha untouched. HSV: hue degrees
 * 0..360, saturation 0..1, value 0..255. HSL: hue, saturation, lightness
 * all 0..1. */

/* Fills the 256-entry table of linear light x 100 per sRGB level. */
VOR_API void VorColorRGB2LABInitMapping(float table[256]);
/* Fills the 1024-entry cube-root table: entry i = (i/1023)^(1/3). */
VOR_API void VorColorRGB2LABInitMappingCbrt(float table[1024]);
/* L*a*b* of the colour on the packed byte scale, unclamped, as doubles,
 * linearised through the caller's table with exact cube roots. */
VOR_API void VorColorRGB2LABDoublesWithMapping(const VorColor* color, double* L, double* a,
                                               double* b, const float linear[256]);
/* Packs the previous result into red, green, blue; alpha kept. */
VOR_API void VorColorRGB2LABWithMapping(VorColor* color, const float linear[256]);
/* L*a*b* on the packed byte scale as doubles, entirely table-driven. */
VOR_API void VorColorRGB2LABDoublesWithCbrtMapping(const VorColor* color, double* L, double* a,
                                                   double* b);
/* Packs the table-driven L*a*b* into red, green, blue; alpha kept. */
VOR_API void VorColorRGB2LAB(VorColor* color);
/* Packed L*a*b* back to sRGB with lightness and chroma stretched by the
 * scales; alpha kept. */
VOR_API void VorColorLAB2RGBScaled(VorColor* color, double scaleL, double scaleA, double scaleB);
/* Packed L*a*b* back to sRGB; alpha kept. */
VOR_API void VorColorLAB2RGB(VorColor* color);
/* HSV triple of the colour; the colour is only read. */
VOR_API void VorColorRGB2HSV(const VorColor* color, float hsv[3]);
/* HSL triple of the colour; the colour is only read. */
VOR_API void VorColorRGB2HSL(const VorColor* color, float hsl[3]);
/* Writes the RGB of an HSL triple into out with alpha 255. A hue above 1
 * prints an error on standard output and gives the grey of the lightness
 * offset alone. */
VOR_API void VorColorHSL2RGB(const float hsl[3], VorColor* out);
/* Every pixel to packed L*a*b* (table-driven); alpha kept. */
VOR_API void VorBitmapConvertRGBToLAB(VorBitmap* bitmap);
/* Every packed L*a*b* pixel back to sRGB with a* and b* scaled; alpha kept. */
VOR_API void VorBitmapConvertLABToRBG(VorBitmap* bitmap, float scaleA, float scaleB);

/* ====================================================================== */
/* Colour matrices                                                        */
/* ====================================================================== */

/* Affine colour transform, 3 rows x 4 columns in memory order: output
 * channel i (0 red, 1 green, 2 blue) = m[4i] R + m[4i+1] G + m[4i+2] B +
 * m[4i+3], the offsets in 0..255 units. Diagonal: 0, 5, 10; offsets: 3, 7,
 * 11. Every builder multiplies on the right, so the newest adjustment acts
 * on the colour first. */
typedef struct VorColorMatrix {
    float m[12];
} VorColorMatrix;

VOR_API extern const VorColorMatrix VorColorMatrixIdentity; /* identity, zero offsets */

/* Copies the 12 entries. */
VOR_API void VorColorMatrixCopy(VorColorMatrix* dst, const VorColorMatrix* src);
/* Copies VorColorMatrixIdentity into the matrix. */
VOR_API void VorColorMatrixSetIdentity(VorColorMatrix* matrix);
/* M = M x N; M and N may be the same record. */
VOR_API void VorColorMatrixMultiply(VorColorMatrix* M, const VorColorMatrix* N);
/* M = M x saturation(s): 1 keeps colours, 0 is grey by weights 0.213,
 * 0.715, 0.072. */
VOR_API void VorColorMatrixAdjSaturation(VorColorMatrix* matrix, float s);
/* M = M x brightness b and contrast factor c (1, 1 = unchanged; contrast
 * pivots about 128 b). */
VOR_API void VorColorMatrixBrightnessContrast(VorColorMatrix* matrix, float brightness,
                                              float contrast);
/* VorColorMatrixBrightnessContrast with contrast 1. */
VOR_API void VorColorMatrixBrightness(VorColorMatrix* matrix, float brightness);
/* M = M x contrast about 128 with factor 1 + c (0 = unchanged). */
VOR_API void VorColorMatrixContrast(VorColorMatrix* matrix, float c);
/* Applies the matrix to red, green, blue of every pixel, rounded and
 * clamped to 0..255; alpha kept. */
VOR_API void VorBitmapColorMatrixTransform(VorBitmap* bitmap, const VorColorMatrix* matrix);
/* Applies the matrix and blends the result over each pixel with the mode
 * and opacity; a matrix without cross-channel terms takes full effect and
 * ignores both. Alpha kept. */
VOR_API void VorBitmapColorMatrixTransformAndBlendWithOriginal(VorBitmap* bitmap,
                                                               const VorColorMatrix* matrix,
                                                               uint32_t mode, float opacity);

/* ====================================================================== */
/* Histograms and histogram maps                                          */
/* ====================================================================== */

/* Per-channel tone map: map[c][i] is the output level of channel c (0 red,
 * 1 green, 2 blue) for input level i. 768 bytes, no header; alpha has no
 * table and is never mapped. */
typedef struct VorHistMap {
    uint8_t map[3][256];
} VorHistMap;

/* Per-channel pixel counts, red, green, blue; counts wrap modulo 2^32. */
typedef struct VorHistogram {
    uint32_t count[3][256];
} VorHistogram;

/* Per-channel cumulative distributions: cdf[c][i] is the fraction of pixels
 * whose channel c is at most i. */
typedef struct VorCDF {
    double cdf[3][256];
} VorCDF;

/* map[c][i] = i for every channel. */
VOR_API void VorHistMapSetIdentity(VorHistMap* map);
/* Copies the three 256-byte arrays into the red, green and blue tables. */
VOR_API void VorHistMapSet(VorHistMap* map, const uint8_t red[256], const uint8_t green[256],
                           const uint8_t blue[256]);
/* Composition in place: map[c][i] = second[c][map[c][i]] (map, then second). */
VOR_API void VorHistMapMap(VorHistMap* map, const VorHistMap* second);
/* map = map * amount + identity * (1 - amount), rounded half up and clamped;
 * 1.0 leaves the map as it is, 0.0 gives the identity. */
VOR_API void VorHistMapFade(VorHistMap* map, double amount);
/* Maps red, green and blue of every pixel through the map; alpha kept. */
VOR_API void VorBitmapHistogramTransform(VorBitmap* bitmap, const VorHistMap* map);
/* Adds one count per pixel per channel to the histogram (no clearing);
 * the pixels are only read. */
VOR_API void VorHistogramBuild(const VorBitmap* bitmap, VorHistogram* histogram);
/* One channel's normalised cumulative distribution; an empty histogram
 * gives the uniform i/255. */
VOR_API void VorHistogram2CDFChan(const uint32_t counts[256], double cdf[256]);
/* VorHistogram2CDFChan for red, green and blue. */
VOR_API void VorHistogram2CDF(const VorHistogram* histogram, VorCDF* cdf);
/* The fractional level (0..255) at which one channel's CDF reaches p,
 * interpolated linearly between entries. */
VOR_API double VorCDFINV(const double cdf[256], double p);
/* Gradient map: blends the opaque colour map[.][luminance] onto every pixel
 * with the blend mode at opacity alpha; alpha bytes kept. */
VOR_API void VorBitmapIntensityMap(VorBitmap* bitmap, const VorHistMap* map, uint32_t mode,
                                   double alpha);
/* Decodes {"r": [256 ints], "g": [...], "b": [...]}, each element 0..255,
 * into map; 0 on any missing or malformed part (map then partly written). */
VOR_API int VLPLHistMapfromHistMapVal(const yajl_val value, VorHistMap* map);

/* ====================================================================== */
/* Tone curves                                                            */
/* ====================================================================== */

/* S-curve with exponent contrast on each half of the range (0 stands for
 * 1e-8); the upper half ends at 254. Red, green, blue mapped; alpha kept. */
VOR_API void VorBitmapContrastCurve(VorBitmap* bitmap, float contrast);
/* Power curve level = 255 * (level / 255)^gamma on red, green, blue;
 * alpha kept. */
VOR_API void VorBitmapGamma(VorBitmap* bitmap, float gamma);

/* ====================================================================== */
/* Adjustment tools                                                       */
/* ====================================================================== */

/* Slider adjustments of the whole bitmap: value nominally -100..100, 0
 * meaning no change. The pointer argument is the tool's parameter record,
 * passed through and never read. */

/* Value clamped to -100..100: below 0 a gamma curve of -log2(0.5 + v/400)
 * darkens red, green, blue; from 0 up a brightness matrix of 1 + 0.006 v
 * scales them; alpha kept. */
VOR_API void VorToolBrightness(VorBitmap* bitmap, const void* params, double value);
/* Value clamped to -100..100: contrast curve of exponent 3.1^(v/100) on
 * red, green, blue; alpha kept. */
VOR_API void VorToolContrast(VorBitmap* bitmap, const void* params, double value);
/* Value clamped to -100..100: saturation matrix of factor 1 + v/100 (0 is
 * grey, 2 doubles); alpha kept. */
VOR_API void VorToolSaturation(VorBitmap* bitmap, const void* params, double value);
/* Value unclamped: per-channel gains, warmer (more red, less blue) above 0,
 * cooler below; alpha kept. */
VOR_API void VorToolWarmth(VorBitmap* bitmap, const void* params, double value);
/* Value unclamped: two-pass box-hybrid filter at that amount, sharpening
 * above 0 and blurring below; alpha kept. */
VOR_API void VorToolSharpness(VorBitmap* bitmap, const void* params, double value);
/* The four tone sliders of a host in one call, each -100..100 with 0 for
 * no change, applied in this order: VorToolBrightness, VorToolContrast,
 * VorToolWarmth, VorToolSaturation. All four at 0 give exactly what the
 * four tools at 0 give. Alpha kept. */
VOR_API void VorToolAdjustBrightnessContrastWarmthSaturation(VorBitmap* bitmap, double brightness,
                                                             double contrast, double warmth,
                                                             double saturation);

/* ====================================================================== */
/* Auto colours                                                           */
/* ====================================================================== */

/* Per-channel levels: stretches each of red, green and blue so that its
 * 0.5th percentile becomes 0 and its 99.5th percentile, or the ceiling's
 * channel if that is higher, becomes 255; fade 0 leaves the pixels as they
 * are, 1 applies the full stretch. Alpha kept. */
VOR_API void VorAutoColorsFadeMaxColor(VorBitmap* bitmap, double fade, const VorColor* ceiling);
/* VorAutoColorsFadeMaxColor with a black ceiling, which never applies;
 * alpha kept. */
VOR_API void VorAutoColorsFade(VorBitmap* bitmap, double fade);
/* The full per-channel stretch (fade 1, no ceiling); alpha kept. */
VOR_API void VorAutoColors(VorBitmap* bitmap);
/* Adapter for hosts only (no document name reaches it): {"color": colour}
 * is the ceiling and the run's strength the fade; 0, with the pixels
 * untouched, when the colour does not decode. */
VOR_API int VLPLRunAutoColorsFadeMaxProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                              const VLPLRunOptions* options);

/* ====================================================================== */
/* Integral images and local contrast                                     */
/* ====================================================================== */

/* Integral images are W x H arrays of unsigned 32-bit sums, row-major:
 * entry (x, y) sums every value at or above and left of (x, y), modulo
 * 2^32. */

/* Fills the red, green and blue sum tables (W x H each) from the pixels,
 * which are only read; returns the number of rows processed. */
VOR_API uint32_t VorBuildIntegralImage(const VorBitmap* bitmap, uint32_t* red, uint32_t* green,
                                       uint32_t* blue);
/* Fills one W x H sum table with the grey level of each pixel
 * (0.2 red + 0.7 green + 0.1 blue, rounded); the pixels are only read. */
VOR_API void VorBuildIntegralImageGray(const VorBitmap* bitmap, uint32_t* sums);
/* Sum over the inclusive rectangle x0..x1, y0..y1 of a W-wide sum table
 * (height is not read), modulo 2^32. */
VOR_API uint32_t VorSumBoxFromIntegralImage(const uint32_t* sums, uint32_t width, uint32_t height,
                                            uint32_t x0, uint32_t y0, uint32_t x1, uint32_t y1);
/* Gaussian smoothing in place of n floats over the whole line (no kernel
 * cut-off); values stay as they were if the working buffer cannot be had. */
VOR_API void VorLineSmooth1D(float* values, uint32_t n, int32_t sigma);
/* Applies the map to each pixel through its neighbourhood's mean grey level
 * and amplifies its detail; red, green, blue rewritten, alpha set to 255.
 * Left untouched if the working buffers cannot be had. */
VOR_API void VorBlurHistMap(VorBitmap* bitmap, const VorHistMap* map);
/* Local contrast ("clarity"): a lifting curve derived from the green
 * histogram, applied with VorBlurHistMap; alpha set to 255. */
VOR_API void VorLocalContrastEnhanceProcessor(VorBitmap* bitmap);
/* VorLocalContrastEnhanceProcessor between the accelerated-path hooks. */
VOR_API void VorLocalContrastEnhance(VorBitmap* bitmap);
/* VorLocalContrastEnhanceProcessor; the second pointer is not read. */
VOR_API void VorEnhanceClarity(VorBitmap* bitmap, const void* unused);

/* ====================================================================== */
/* Sharpening and soft focus                                              */
/* ====================================================================== */

/* Box-hybrid filter: each pass blurs along rows (X) or columns (Y) with
 * 2r + 1 boxes weighted like a Gaussian of deviation (width + height) *
 * |amount| * 2.5e-5 pixels; a positive amount sharpens with the blur, a
 * negative one returns the blur. An integral line is 4 words per pixel: running sums of
 * red, green and blue, the fourth word unused. */

/* Fills line (4 * width words) with the running sums along row y; pixels
 * only read. */
VOR_API void VorBuildIntegralLineX(const VorBitmap* bitmap, uint32_t y, uint32_t* line);
/* Fills line (4 * height words) with the running sums down column x;
 * pixels only read. */
VOR_API void VorBuildIntegralLineY(const VorBitmap* bitmap, uint32_t x, uint32_t* line);
/* erfc(z) by a Chebyshev expansion for z >= 0; 0 for z < 0. */
VOR_API float VorMathErfccheb(float z);
/* erf(x) from VorMathErfccheb. */
VOR_API float VorMathErf(float x);
/* Cumulative distribution at x of a centred normal of deviation sigma. */
VOR_API float VorMathNormalCDF(float x, float sigma);
/* One horizontal pass on red, green, blue in place; alpha kept. */
VOR_API void VorBoxHybridSharpenX(VorBitmap* bitmap, float amount);
/* One vertical pass on red, green, blue in place; alpha kept. */
VOR_API void VorBoxHybridSharpenY(VorBitmap* bitmap, float amount);
/* The X pass, then the Y pass on its result; alpha kept. */
VOR_API void VorConvolutionEffectBoxHybridSharpen(VorBitmap* bitmap, float amount);
/* Both passes unless amount is 0; alpha kept. */
VOR_API void VorSharpness(VorBitmap* bitmap, float amount);
/* Both passes inside the accelerated-path hooks; alpha kept. */
VOR_API void VorConvolutionEffectKipSharpen(VorBitmap* bitmap, float amount);
/* Both passes, without the hooks; alpha kept. */
VOR_API void VorConvolutionProcessorKipSharpen(VorBitmap* bitmap, float amount);
/* Filters a copy with both passes and blends it back over the bitmap with
 * the blend mode at opacity alpha; nothing when amount or alpha is 0 or
 * the copy cannot be made; alpha bytes kept. */
VOR_API void VorConvolutionProcessorSharpenAndBlendWithOriginal(VorBitmap* bitmap, float amount,
                                                                float alpha, uint32_t mode);
/* Blurs by (width + height) / 400 and adds the original back: 0.5 x blur +
 * 0.6 x original per channel; alpha kept. 0, unchanged, when the working
 * copy cannot be made, else 1. */
VOR_API int VorConvolutionEffectSoftFocus(VorBitmap* bitmap);
/* Both passes at amount -5: a light blur of red, green, blue; alpha kept. */
VOR_API void VorConvolutionAntialiasGL(VorBitmap* bitmap);

/* ====================================================================== */
/* Random numbers and noise                                               */
/* ====================================================================== */

/* Linear congruential generator: each step is state = state * 69069 + 1
 * modulo 2^32. Every seeded effect depends on this exact sequence. */
typedef struct VorRNG {
    uint32_t seed;  /* the seed last given; never read by the draws */
    uint64_t state; /* current state; its upper 32 bits stay 0 */
} VorRNG;

/* seed = state = the given value. */
VOR_API void VorRNGSeed(VorRNG* rng, uint32_t seed);
/* Seeds from the C library's lrand48 (the one non-reproducible entry). It
 * advances lrand48's process-wide state, which other code of the process
 * may share; no effect of the library calls it. */
VOR_API void VorRNGInit(VorRNG* rng);
/* One step; returns the new state. */
VOR_API uint32_t VorRNGNextInt(VorRNG* rng);
/* The state reached from seed after n steps; n = 0 gives seed. */
VOR_API uint32_t VorRNGNextSeedN(uint32_t seed, uint32_t n);
/* One step; the state as a float times 2^-32, in [0, 1] (1 included). */
VOR_API float VorRNGNextFloat(VorRNG* rng);
/* Standard normal draw (Box-Muller, cosine half); two draws or more. */
VOR_API float VorRNGNextFloatNormal(VorRNG* rng);
/* Standard Laplace draw by the inverse distribution; one draw. */
VOR_API float VorRNGNextFloatLaplace(VorRNG* rng);
/* Monochrome grain: one uniform offset of up to +-intensity * 255 per pixel
 * added to red, green and blue alike (clamped); alpha set to 255. */
VOR_API void VorBitmapAddNoise(VorBitmap* bitmap, float intensity, uint32_t seed);
/* Colour grain: an offset drawn for red, green and blue separately
 * (clamped); alpha set to 255. */
VOR_API void VorBitmapAddChannelIndependentNoise(VorBitmap* bitmap, float intensity,
                                                 uint32_t seed);

/* ====================================================================== */
/* Auto enhance                                                           */
/* ====================================================================== */

/* Brightens levels that hold more of the image than an even spread would,
 * by a gain curve from the luminance histogram applied through each
 * pixel's luminance to green, with red and blue following. Mode 0: gain
 * exponent 0.8; 2: only lifts, exponent 0.65; 3: contrast curve 0.5 first,
 * then as 1; 1 and any other value: an exponent that falls toward white.
 * Alpha kept. */
VOR_API void VorAutoEnhance(VorBitmap* bitmap, int mode);
/* Colour-cast correction in packed L*a*b*: pulls the a* and b* channels
 * toward neutral by factors from their 10th and 90th percentiles, and
 * converts back to sRGB (levels may shift by the round trip). Alpha kept. */
VOR_API void VorLabCorrect(VorBitmap* bitmap);

/* ====================================================================== */
/* Fractal textures                                                       */
/* ====================================================================== */

/* Noise per midpoint of a fractal profile: uniform in -0.5..0.5, standard
 * normal or standard Laplace; any other mode draws nothing and the profile
 * is a plain interpolation of its ends. */
enum {
    VOR_MPD_UNIFORM = 0,
    VOR_MPD_NORMAL = 1,
    VOR_MPD_LAPLACE = 2
};

/* Midpoint displacement of profile[first..last] between the two end values
 * the caller set, amplitude shrinking by 2^-roughness per level, then
 * stretched over the whole range when last - first is not a power of two
 * (the stretch assumes first = 0). Random source: a generator seeded with
 * seed. */
VOR_API void VorMPDSeed(float* profile, int32_t first, int32_t last, float amplitude,
                        float roughness, int32_t mode, uint32_t seed);
/* The same, drawing from the caller's generator and advancing it. */
VOR_API void VorMPDRNG(float* profile, int32_t first, int32_t last, float amplitude,
                       float roughness, int32_t mode, VorRNG* rng);
/* The same, from a generator seeded by VorRNGInit (not reproducible). */
VOR_API void VorMPD(float* profile, int32_t first, int32_t last, float amplitude,
                    float roughness, int32_t mode);
/* Grey diamond-square texture in the top-left (P + 1) x (P + 1) square, P
 * the largest power of two below the smaller side, with edgeA as columns 0
 * and P and edgeB as rows 0 and P (each at least P + 1 floats, overwritten).
 * Seeded with 1234: the texture depends on size, amplitude and roughness
 * alone. Red, green, blue written; alpha kept; pixels beyond the square
 * untouched. */
VOR_API void VorBitmapDiamondSquare(VorBitmap* bitmap, float amplitude, float roughness,
                                    float* edgeA, float* edgeB);

/* ====================================================================== */
/* Borders and vignette                                                   */
/* ====================================================================== */

/* Border styles (VorBorderParams.style), with their document keywords. */
typedef int32_t VorBorderStyle;
enum {
    VOR_BORDER_NONE = 0,
    VOR_BORDER_HALFTONE = 1,   /* "halftone" */
    VOR_BORDER_LINES = 2,      /* "lines" */
    VOR_BORDER_SMOOTH = 3,     /* "smooth" */
    VOR_BORDER_SHADOW = 4,     /* "shadow" */
    VOR_BORDER_FADE = 5,       /* "fade" */
    VOR_BORDER_ROUGH = 6,      /* "rough" */
    VOR_BORDER_BULGE = 7,      /* "bulge" */
    VOR_BORDER_TORN = 8,       /* "torn" */
    VOR_BORDER_TORN_2 = 9,     /* "torn_2" */
    VOR_BORDER_RECT = 10,      /* "rect" */
    VOR_BORDER_ROUND = 11,     /* "round" */
    VOR_BORDER_GLIMMO = 12,    /* "glimmo" */
    VOR_BORDER_HARD_RAND = 13, /* "hard_rand" */
    VOR_BORDER_INSTANT = 14,   /* "instant": VorBorders draws nothing */
    VOR_BORDER_VIGNETTE = 15,  /* "vignette" */
    VOR_BORDER_VIEWFINDER = 16 /* "viewfinder" */
};

/* Vignette falloff sharpness (VorBorderParams.shapeMode). */
typedef int32_t VorBorderShapeMode;
enum {
    VOR_SHAPE_NORMAL = 0,        /* "normal" */
    VOR_SHAPE_SHARP = 1,         /* "sharp" */
    VOR_SHAPE_MEDIUM_SHARP = 2,  /* "mediumSharp" */
    VOR_SHAPE_ULTRA_SHARP = 3    /* "ultraSharp" */
};

/* One record describes every border and the vignette. VorBorderInitParams
 * sets the defaults noted; sideTune0 and the four profile pointers are left
 * as they were. Widths scale with width + height of the bitmap. */
typedef struct VorBorderParams {
    double inset;          /* 0.0: inset factor or pixels, by style */
    double halftoneScale;  /* 1.0: halftone frequency divisor (0 ignored) */
    double lineSpacing;    /* 1.0: line phase divisor */
    double shadowAngle;    /* 0.0: shadow direction, degrees */
    double sideTune0;      /* not set: side styles */
    double sideTune1;      /* 0.0: side styles */
    double width;          /* 1.0: border width multiplier */
    double sideTune2;      /* 0.5 */
    double sideTune3;      /* 1.0 */
    double sideTune4;      /* 0.28 */
    double cornerFactor;   /* 2.222: fade corner radius multiplier */
    double sideTune5;      /* 1.5 */
    double sideTune6;      /* 1.0 */
    double sideTune7;      /* 1.0 */
    double sideTune8;      /* 1.0 */
    double sideTune9;      /* 1.0 */
    int32_t mpdMode;       /* 0: noise mode of the edge profiles */
    int32_t sideFlags;     /* 0: side styles */
    double vignetteScale;  /* 1.0: vignette radius, pixels (or fraction with stretch) */
    double falloffPower;   /* 1.0: hard_rand falloff exponent / 4 */
    double cornerOffset;   /* 0.0: hard_rand pinned profile ends */
    double roughAmplitude; /* 1.0: hard_rand profile amplitude factor */
    double opacity;        /* 1.0: hard_rand opacity */
    double insetLeft;      /* 0.0 each: per-side insets in pixels; styles 1 to 6 */
    double insetRight;     /*   overwrite all four when they draw */
    double insetTop;
    double insetBottom;
    uint32_t seed;         /* 0: seed of the style's generator */
    VorColor color;        /* opaque white */
    int32_t blendMode;     /* 0: blend mode of the colour (styles 9 to 15) */
    VorBorderStyle style;  /* 0: nothing drawn */
    float* bottomProfile;  /* not set: caller-owned edge profiles, one float */
    float* leftProfile;    /*   per column (top, bottom) or row (left, right) */
    float* rightProfile;
    float* topProfile;
    VorBorderShapeMode shapeMode; /* 0: vignette falloff */
    uint8_t stretch;       /* 0: 1 normalises x and y by the bitmap's size */
    double dx;             /* 0.0 each: vignette centre offset, fraction of */
    double dy;             /*   half the width and half the height */
} VorBorderParams;

/* Writes the defaults above. */
VOR_API void VorBorderInitParams(VorBorderParams* params);
/* Draws params->style: 1 to 6 and 16 by VorBordersTheta (which writes the
 * per-side insets back), 7, 8, 10, 11, 12 by VorBordersSide, 9 by
 * VorBordersDoubleSided, 13 by VorBordersHardRand, 15 by VorVignette; any
 * other style leaves the bitmap untouched. */
VOR_API void VorBorders(VorBitmap* bitmap, VorBorderParams* params);
/* Band along the four edges with rounded corners, shaded per style; colour
 * channels mixed inside the band, all four bytes replaced by the colour
 * outside the frame. Styles 1 to 6 store the computed inset in the four
 * per-side insets. */
VOR_API void VorBordersTheta(VorBitmap* bitmap, VorBorderParams* params);
/* Edge treatments built on fractal edge profiles (the profiles the style
 * needs must hold one float per column or row): bulge, torn, rect, round
 * and glimmo. Colour laid over with blendMode; alpha kept. */
VOR_API void VorBordersSide(VorBitmap* bitmap, const VorBorderParams* params);
/* Torn edges on two opposite sides at once (torn_2); alpha kept. */
VOR_API void VorBordersDoubleSided(VorBitmap* bitmap, const VorBorderParams* params);
/* Theta-like band whose edges are displaced by four fractal profiles,
 * which it fills (all four must be set); alpha kept. */
VOR_API void VorBordersHardRand(VorBitmap* bitmap, const VorBorderParams* params);
/* The instant-print frame; VorBorders never calls it. */
VOR_API void VorBordersInstant(VorBitmap* bitmap, const VorBorderParams* params);
/* Darkens (or tints) toward the edges with the colour and blend mode: a
 * smooth ramp out from the centre (offset by dx, dy) and the full colour
 * beyond vignetteScale, the ramp's sharpness set by shapeMode; alpha kept. */
VOR_API void VorVignette(VorBitmap* bitmap, const VorBorderParams* params);
/* Decoders: a style keyword (0 for a null, non-string or unknown node, the
 * style then untouched), a shape-mode keyword (always 1; anything else is
 * "normal"), and the "shape" object of the vignette and gradient
 * processors: {"vignetteScale": number, "scaling": "average" | "max" |
 * "stretch", "shapeMode": keyword, "dx": number, "dy": number}, the radius
 * divided by strength (plus 1e-8 when addEpsilon is set). */
VOR_API int VLPLBorderStyleFromBorderStyleTypeVal(const yajl_val value, VorBorderStyle* outStyle);
VOR_API int VLPLBorderShapeModeFromBorderShapeModeVal(const yajl_val value,
                                                      VorBorderShapeMode* outMode);
VOR_API int VLPLBorderPopoulateWithShapeTypeVal(const yajl_val shape, VorBorderParams* params,
                                                const VorBitmap* bitmap, float strength,
                                                uint8_t addEpsilon);

/* ====================================================================== */
/* Gradients                                                              */
/* ====================================================================== */

/* Stops at locations in percent, 0 to 100, in ascending order. */
typedef struct VorGradientColorStop {
    VorColor color;
    double location;
} VorGradientColorStop;

typedef struct VorGradientOpacityStop {
    double opacity; /* 0 to 1 */
    double location;
} VorGradientOpacityStop;

/* A gradient owns its two stop arrays (VorGradientBuild, VorGradientFree).
 * Drawing needs at least two colour stops and as many colour stops as
 * opacity stops: the opacity ramp is measured on the colour stops'
 * locations. */
typedef struct VorGradient {
    VorGradientColorStop* colorStops;
    VorGradientOpacityStop* opacityStops;
    uint32_t colorStopCount;
    uint32_t opacityStopCount;
} VorGradient;

/* Gradient shapes. */
enum {
    VOR_GRADIENT_LINEAR = 0,         /* "linear" */
    VOR_GRADIENT_RADIAL = 1,         /* "radial" */
    VOR_GRADIENT_LINEAR_VIGNETTE = 2 /* "linearVignette" */
};

typedef struct VorGradientShapeParams {
    int32_t shape;                /* 0 */
    double scale;                 /* 1.0: length, fraction of the size; 0 draws nothing */
    double xCenter;               /* 0.5: origin, fraction of the width */
    double yCenter;               /* 0.5: origin, fraction of the height */
    double angle;                 /* 0.0: radians */
    VorBorderShapeMode shapeMode; /* 0: vignette falloff (shape 2) */
    double vignetteScale;         /* 1.0 */
    double dx;                    /* 0.0 each: vignette centre offset */
    double dy;
} VorGradientShapeParams;

/* Stores both counts and allocates zero-filled stops; 0, with both pointers
 * null, when a count reaches 2^28 or memory runs out. */
VOR_API int VorGradientBuild(VorGradient* gradient, uint32_t colorStopCount,
                             uint32_t opacityStopCount);
/* Frees both stop arrays and nulls the pointers; the counts stay. */
VOR_API void VorGradientFree(VorGradient* gradient);
/* Writes the defaults above. */
VOR_API void VorGradientShapeParamsInit(VorGradientShapeParams* params);
/* Samples the gradient into n entries (colour in bytes 0 to 2, opacity in
 * byte 3), eased between stops; n must be 0 or at least 2. */
VOR_API void VorGradientMemoize(const VorGradient* gradient, VorColor* table, uint32_t n);
/* Lays the gradient over the bitmap with the blend mode, each pixel at
 * opacity x its sampled opacity; alpha kept. */
VOR_API void VorGradientApply(VorBitmap* bitmap, const VorGradientShapeParams* params,
                              const VorGradient* gradient, uint32_t blendMode, double opacity);
/* Fills a built gradient from [{"color": colour, "location": number}, ...]
 * and [{"opacity": number, "location": number}, ...]; 0 at the first
 * malformed element, the stops before it written. */
VOR_API int VLPLGradientfromColorsValAndOpacitiesVal(const yajl_val colors,
                                                     const yajl_val opacities,
                                                     VorGradient* gradient);

/* ====================================================================== */
/* Flares                                                                 */
/* ====================================================================== */

/* Flare shapes, with their document keywords ("dimondFlare" is spelt so). */
typedef int32_t VorFlareType;
enum {
    VOR_FLARE_SINC = 0,             /* "sinc" */
    VOR_FLARE_GAUSSIAN_THING = 1,   /* "gaussianThing" */
    VOR_FLARE_GAUSSIAN_THING_2 = 2, /* "gaussianThing2" */
    VOR_FLARE_GAUSSIAN_THING_3 = 3, /* "gaussianThing3" */
    VOR_FLARE_GAUSSIAN_THING_4 = 4, /* "gaussianThing4" */
    VOR_FLARE_ANGLE_GAUSSIAN = 5,   /* "angleGaussian" */
    VOR_FLARE_STARDOM = 6,          /* "stardom" */
    VOR_FLARE_LOBES = 7,            /* "lobes" */
    VOR_FLARE_NONE = 8,             /* no keyword; draws nothing visible */
    VOR_FLARE_STRIPE = 9,           /* "stripe" */
    VOR_FLARE_STRIPE_2 = 10,        /* "stripe2" */
    VOR_FLARE_DIAMOND = 11,         /* "dimondFlare" */
    VOR_FLARE_CROSS = 12,           /* "crossFlare" */
    VOR_FLARE_CORNERS = 13,         /* "cornerFlares" */
    VOR_FLARE_FINGER = 14,          /* "fingerFlare" */
    VOR_FLARE_BLOB_FLARE = 15,      /* "blobFlare" */
    VOR_FLARE_BLAH = 16,            /* "blah" */
    VOR_FLARE_BLOB = 17,            /* "blob" */
    VOR_FLARE_BLOB_2 = 18           /* "blob2" */
};

/* Paints a flare of the colour through the blend mode, centred at (dx, dy)
 * in fractions of the half-size from the middle, sized dsx x dsy x fScale;
 * only the type's work box is visited. Nothing when the colour's alpha,
 * dsx, dsy or fScale is 0. Alpha kept. */
VOR_API void VorFlare(VorBitmap* bitmap, float fScale, const VorColor* color, VorFlareType type,
                      float dx, float dy, float dsx, float dsy, uint32_t blendMode);
/* A flare keyword to its type; 0 for a null, non-string or unknown node. */
VOR_API int VLPLFlareTypeFromFlareTypeVal(const yajl_val value, VorFlareType* outType);
/* A ring of light of the given radius around (cx, cy), in pixels, with a
 * soft glow filling it: a lens ghost or a display's lamp. Only the ring's
 * bounding box is visited; alpha kept. */
VOR_API void VorRingFlare(VorBitmap* bitmap, float cx, float cy, float radius, const VorColor* color,
                          uint32_t blendMode);
/* The preset flares of the legacy catalogue; the seed and strength of the
 * options place and weigh them. Alpha kept. */
VOR_API void VorFlareLegacyCorvale(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorFlareLegacyEmberly(VorBitmap* bitmap, const VLPLRunOptions* options);

/* ====================================================================== */
/* Legacy catalogue                                                       */
/* ====================================================================== */

/* The named ready-made effects of the "legacyProcessor" catalogue. Each
 * takes the bitmap and the run options: the seed feeds its generator, the
 * strength scales it. Borders draw whatever bordersEnabled says; the
 * processor is what gates them. Alpha kept unless noted. */
VOR_API void VorLegacyGlimmoTintypeDiamondSquare(VorBitmap* bitmap,
                                                 const VLPLRunOptions* options);
VOR_API void VorLegacyGlimmoVintageColorMatrixTransform(VorBitmap* bitmap,
                                                        const VLPLRunOptions* options);
VOR_API void VorLegacyMurmelGrittyPSSat(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorLegacyMurmelGrittyDots(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorLegacyMurmelBWPSSat(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorLegacyMurmelCinematicPSSat(VorBitmap* bitmap, const VLPLRunOptions* options);

/* The frames built from the border styles (seeded by the run where torn). */
VOR_API void VorEffectMarTessaBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectKipCoolBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectSkarnBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectNerioBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectKvantBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectHolmvaleBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
/* Leaves one array of the larger side allocated on every call. */
VOR_API void VorEffectDuskoBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectBichromeBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectPallorBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectCorvaleBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectEmberlyBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectOldKvantBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectGlimmoBWBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectGlimmoTintypeBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
/* The grunge frames with the run's seed and strength. */
VOR_API void VorEffectTerrowBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectZenitBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectLiragriffinBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectTawnetBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
/* The camera displays with the run's seed (and strength for Kairo). */
VOR_API void VorEffectNarwBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectKairoBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectColosBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectLanaiBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VoeEffectClaretBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
VOR_API void VorEffectUmbraBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
/* VorConvolutionEffectSoftFocus. */
VOR_API void VorLegacySoftFocus(VorBitmap* bitmap, const VLPLRunOptions* options);
/* Levels faded by the run's strength toward a warm cream ceiling. */
VOR_API void VorLegacyMarTessaAutoColors(VorBitmap* bitmap, const VLPLRunOptions* options);
/* A fixed brown-toned monochrome colour matrix. */
VOR_API void VorLegacyGlimmoTintypeColorMatrixTransform(VorBitmap* bitmap,
                                                        const VLPLRunOptions* options);

/* ---------------------------------------------------------------------- */
/* Black and white, grit and film textures                                */
/* ---------------------------------------------------------------------- */

/* Hue weights of the black-and-white mix, one per hue sector: reds,
 * yellows, greens, cyans, blues, magentas (hues 0, 60, ... 300 degrees). */
typedef struct VorBWHueWeights {
    float weight[6];
} VorBWHueWeights;

/* Sets the six weights from percentages (100 keeps a fully saturated hue
 * as bright as its brightest channel, 0 makes it as dark as its darkest),
 * each clamped to -200..300. */
VOR_API void VorLegacyPhotoshopBWSatWeightsSet(VorBWHueWeights* weights, float reds, float yellows,
                                               float greens, float cyans, float blues,
                                               float magentas);
/* Black and white weighted per hue: each pixel's grey is its darkest
 * channel plus its chroma times the weight of its hue (a grey stays the
 * same grey); with punch non-zero the grey passes a hard S-curve for a
 * gritty contrast. The grey is laid over the photo with opacity amount
 * (0 keeps the photo, 1 is fully monochrome). Alpha kept. */
VOR_API void VorLegacyPhotoshopBWSat(VorBitmap* bitmap, const VorBWHueWeights* weights, float amount,
                                     int32_t punch);
/* Seeded grit: small dark and light specks, sized with the photo, covering
 * about density of its area (0.05 is a coarse grain); monochrome non-zero
 * shifts red, green and blue alike, else each speck is tinted. Alpha kept. */
VOR_API void VorLegacyGrittyDots(VorBitmap* bitmap, float density, int32_t monochrome, uint32_t seed);

/* ---------------------------------------------------------------------- */
/* Dot-matrix text and camera displays                                    */
/* ---------------------------------------------------------------------- */

/* One round dot of the colour centred at (x, y) with a one-pixel soft rim,
 * blended in the mode at the colour's alpha; clipped; alpha kept. */
VOR_API void VorDotMatrixDot(VorBitmap* bitmap, float x, float y, float radius, const VorColor* color,
                             uint32_t mode);
/* Text in a 5 x 7 dot-matrix font with its top-left dot at (x, y), dots
 * pitch pixels apart and a character every 6 dots. The font has the space,
 * the marks % & ~ { } ^ > < : - + . / * | @, the capitals, "f", "s" and the
 * digits; other small letters print as capitals, other characters as
 * blanks. Clipped; alpha kept. */
VOR_API void VorDotMatrix(VorBitmap* bitmap, const char* text, float x, float y, float pitch,
                          const VorColor* color, uint32_t mode);
/* An anti-aliased line of the given width with round ends; clipped;
 * alpha kept. */
VOR_API void VorDrawLine(VorBitmap* bitmap, float x0, float y0, float x1, float y1, float width,
                         const VorColor* color, uint32_t mode);
/* The displays, each sized by the smaller side; alpha kept. 2: a film
 * compact's orange date stamp of a seeded day. 3: a camcorder viewfinder
 * with REC lamp, battery, corners and a time code from the value. 4: an
 * autofocus finder's focus frame and exposure read-out, at strength 0..1.
 * 5: a travel stamp of a seeded place with coordinates. 6: today's date.
 * 7: a digital compact's grid, mode, battery, flash lamp and exposure. */
VOR_API void VorCameraDisplay2Legacy(VorBitmap* bitmap, uint32_t seed);
VOR_API void VorCameraDisplay3Legacy(VorBitmap* bitmap, uint32_t value);
VOR_API void VorCameraDisplay4Legacy(VorBitmap* bitmap, uint32_t seed, double strength);
VOR_API void VorCameraDisplay5Legacy(VorBitmap* bitmap, uint32_t seed);
VOR_API void VorCameraDisplay6Legacy(VorBitmap* bitmap);
VOR_API void VorCameraDisplay7Legacy(VorBitmap* bitmap, uint32_t seed);
/* A white print border with today's date in its lower band. */
VOR_API void VorEffectVeskBorder(VorBitmap* bitmap, const VLPLRunOptions* options);
/* A red film-rebate edge with frame numbers along it, seeded. */
VOR_API void VorEffectRubraBorder(VorBitmap* bitmap, const VLPLRunOptions* options);

/* ---------------------------------------------------------------------- */
/* Grunge frames                                                          */
/* ---------------------------------------------------------------------- */

/* The worn frames of the catalogue. Each is seeded (same seed, same
 * pixels), sized with the photo's smaller side, and touches mostly a band
 * along the edges; strength 1 is the designed look, 0 draws nothing, up to
 * 2 adds grunge. Alpha kept. */
/* Rough brushed ink edge in the colour (its alpha the ink's opacity) with
 * spatter and dry-brush wear; variant 0 a broad edge, 1 a thinner,
 * scratchier one (others as variant mod 2). */
VOR_API void VorGrungeBorder1Legacy(VorBitmap* bitmap, const VorColor* color, uint32_t seed,
                                    int32_t variant, double strength);
/* Worn paper print: a torn off-white edge, yellowed stains, frayed
 * corners, dust and fine scratches. */
VOR_API void VorGrungeBorder4Legacy(VorBitmap* bitmap, uint32_t seed, double strength);
/* Burnt print: a charred ragged edge with a brown scorch halo, burnt-in
 * corners and ash specks. */
VOR_API void VorGrungeBorder5Legacy(VorBitmap* bitmap, uint32_t seed, double strength);
/* Film rebate: a black film-gate edge with sprocket holes along the long
 * sides, a warm light leak at a corner, dust and long scratches. */
VOR_API void VorGrungeBorder6Legacy(VorBitmap* bitmap, uint32_t seed, double strength);
/* One round dot of the colour centred at (x, y), radius in pixels with a
 * one-pixel antialiased rim, laid over at opacity x colour alpha / 255;
 * clipped to the bitmap; alpha kept. */
VOR_API void VorDrawBasicDotLegacy(VorBitmap* bitmap, float x, float y, float radius,
                                   const VorColor* color, float opacity);
/* One speck of dirt about size pixels across at (x, y): a seeded clump of
 * basic dots, now and then trailing a thin fibre; clipped; alpha kept. */
VOR_API void VorDirtSpecLegacy(VorBitmap* bitmap, float x, float y, float size, const VorColor* color,
                               uint32_t seed);

/* ====================================================================== */
/* Masks                                                                  */
/* ====================================================================== */

/* A mask is a bitmap of the photograph's size whose alpha is the coverage of
 * a tool: 255 shows the processed image, 0 the untouched photograph. Mask
 * coordinates are pixels with centres on whole numbers. Sizes are trusted:
 * the functions taking an image index the mask with the image's size. */

/* Every pixel (255, 255, 255, 255). */
VOR_API void VorMaskSetOpaque(VorBitmap* mask);
/* Every pixel (0, 0, 0, 0). */
VOR_API void VorMaskSetTransparent(VorBitmap* mask);
/* Colour-aware soft brush: raises (or with erase lowers) the mask's alpha
 * inside radius * 1.43 of the centre, weighted by distance and, unless
 * ignoreColor, by a Gaussian of the L*a*b* distance (a*b* only without
 * useLightness) from the reference colour against tolerance. reserved is
 * not read. Only alpha is written. */
VOR_API void VorMaskSimilarColors(const VorBitmap* image, VorBitmap* mask,
                                  const VorColor* reference, double centerX, double centerY,
                                  double radius, double tolerance, double reserved,
                                  double strength, uint8_t erase, uint8_t useLightness,
                                  uint8_t ignoreColor);
/* Plain soft brush with a four-pixel soft edge, writing all four bytes:
 * paints the colour (its alpha unused) as a premultiplied layer, or with
 * erase fades all four bytes toward 0. Truncates rather than rounds. */
VOR_API void VorMaskDraw(VorBitmap* mask, const VorColor* paint, double centerX, double centerY,
                         double radius, double strength, uint8_t erase);
/* Quantised Gaussian hole: alpha 0 at the centre rising to 255 far away, in
 * the levels 0, 4, 12, ..., 252, 255. Only alpha is written. */
VOR_API void VorMaskRadial(const VorBitmap* image, VorBitmap* mask, double centerX,
                           double centerY, double radius);
/* Quantised Gaussian band: alpha 0 along the line through the centre at
 * the angle (radians), stepped in whole pixels of distance. Only alpha is
 * written. */
VOR_API void VorMaskLinear(const VorBitmap* image, VorBitmap* mask, double centerX,
                           double centerY, double width, double angle);

/* ====================================================================== */
/* Stroke interpolation                                                   */
/* ====================================================================== */

/* Evenly spaced brush positions along a stroke: half the radius apart, or
 * sqrt(2 * radius + 1) apart for the paint brush (paintFlag non-zero). Each
 * writes a malloc'ed array the caller releases with free, and its length.
 * The points run from next to the start toward the end, which comes last;
 * the start itself, emitted by the previous call, is not repeated. The
 * radius must be positive. */

/* The straight leg from a to the midpoint of a and b. */
VOR_API void VorInterpolateFirstPointToMidpoint(VorPoint a, VorPoint b, float radius,
                                                VorPoint** outPoints, uint32_t* outCount,
                                                int32_t paintFlag);
/* The quadratic curve from the midpoint of a and b to that of b and c, b
 * its control point. */
VOR_API void VorInterpolateBetweenPointsWithBezierQuadCurve(VorPoint a, VorPoint b, VorPoint c,
                                                            float radius, VorPoint** outPoints,
                                                            uint32_t* outCount, int32_t paintFlag);
/* The same curve, then the straight leg from the midpoint of b and c back
 * to b: a finished stroke ends at b, not at c. */
VOR_API void VorInterpolateBetweenPointsWithBezierQuadCurveAndFinishToPoint(
    VorPoint a, VorPoint b, VorPoint c, float radius, VorPoint** outPoints, uint32_t* outCount,
    int32_t paintFlag);
/* The straight leg from the midpoint of a and b to b. */
VOR_API void VorInterpolateMidpointToSecondPoint(VorPoint a, VorPoint b, float radius,
                                                 VorPoint** outPoints, uint32_t* outCount,
                                                 int32_t paintFlag);

/* ====================================================================== */
/* Red-eye and whitening                                                  */
/* ====================================================================== */

/* Where red is at least green + blue in the source, the destination's red
 * becomes the mean of green and blue rounded half up; nothing else is
 * written. Nothing unless both bitmaps have the same size. In place when
 * both are the same bitmap. */
VOR_API void VorRedEye(VorBitmap* destination, const VorBitmap* source);
/* Brightens and de-yellows pixels near a fixed tooth-like hue, in place;
 * second is not read. Alpha kept. */
VOR_API void VorWhiten(VorBitmap* image, const VorBitmap* second);

/* ====================================================================== */
/* Tool engine                                                            */
/* ====================================================================== */

/* A tool use keeps three bitmaps of one size: the photograph, a full copy
 * with the tool's effect applied everywhere, and a mask whose alpha says
 * where the full copy shows. Touches edit the mask only; previews mix the
 * two through it. The records belong to the host; the engine never
 * allocates or frees them and keeps no state between calls. */

/* Tool kinds: 1 desaturate except where brushed (mask starts opaque),
 * 2 and 3 blur, 4 red-eye, 5 whitening, 6 darken (colour-aware brush),
 * 7 to 9 tints, 10 sharpen, 11 soften, 12 colour paint (the mask is the
 * paint layer). Kinds 2 and 7 to 11 are edited with shapes. */
typedef struct VorToolDrawParams {
    int32_t kind;         /* 0: nothing */
    VorColor color;       /* opaque white; kinds 6 to 9 overwrite it with their tint */
    double strength;      /* 1.0: brush strength of kinds 3, 4, 5 and 12 */
    uint8_t skipFullTool; /* 0: when set the full image stays a plain copy */
    uint8_t redOverlay;   /* 0: when set the full image is solid red */
} VorToolDrawParams;

typedef struct VorToolDrawState {
    VorColor color; /* opaque white: paint colour of kind 12, sampled colour of kind 1 mode 3 */
    uint8_t flag;   /* 0: not read */
    int32_t kind;   /* not set by VorToolDrawStateInit: the host copies the parameters' kind */
} VorToolDrawState;

typedef struct VorToolPoint {
    VorPoint position; /* (0, 0) */
    double radius;     /* 0.0, pixels */
    int32_t mode;      /* 0: 1 apply, 2 erase, 3 colour-aware (kind 1) */
} VorToolPoint;

typedef struct VorToolStroke {
    VorPoint* points;      /* null: touch positions, owned by the host */
    uint32_t count;        /* 0: valid points */
    uint32_t nextIndex;    /* 0: first point not yet drawn, advanced by the host */
    uint8_t finished;      /* 0: set when the finger lifts */
    double radius;         /* 0.0: brush radius, pixels of the edited image */
    int32_t mode;          /* 0: 1 apply, 2 erase, 3 colour-aware (kind 1 only) */
    uint8_t useFixedColor; /* 0: kind 1 mode 3 takes fixedColor instead of sampling */
    VorColor fixedColor;   /* opaque white */
} VorToolStroke;

typedef struct VorToolShape {
    int32_t kind;     /* 0: 1 radial, 2 linear */
    VorPoint center;  /* (0, 0) */
    double size;      /* 0.0: radius of the radial shape, half-width of the band */
    double angle;     /* 0.0: degrees, linear shape only */
} VorToolShape;

/* Defaults of the records, as noted on their fields. */
VOR_API void VorToolDrawParamsInit(VorToolDrawParams* params);
VOR_API void VorToolDrawStateInit(VorToolDrawState* state);
VOR_API void VorToolDrawStateDestroy(VorToolDrawState* state); /* nothing to release */
VOR_API void VorToolPointInit(VorToolPoint* point);
VOR_API void VorToolStrokeInit(VorToolStroke* stroke);
VOR_API void VorToolShapeInit(VorToolShape* shape);

/* Copies the image into full (stops if that fails), sets the mask for the
 * kind, and unless skipFullTool applies the kind's effect to full. The
 * three bitmaps have one size. */
VOR_API void VorToolInit(const VorBitmap* image, VorBitmap* full, VorBitmap* mask,
                         VorToolDrawParams* params, VorToolDrawState* state);
/* Kind 1: an opaque mask; every other kind: a transparent one. */
VOR_API void VorToolConfigureMask(const VorBitmap* image, VorBitmap* mask,
                                  const VorToolDrawParams* params);
/* Applies the kind's effect to the bitmap in place, or solid red with
 * redOverlay; kind 12 and unknown kinds do nothing. Kinds 6 to 9 write
 * their tint into params->color. */
VOR_API void VorToolApplyFullTool(VorBitmap* image, VorToolDrawParams* params);
/* Kind 1 in mode 3: the state colour becomes the stroke's fixed colour or
 * the image's colour under its first point. */
VOR_API void VorToolFirstDownProcessing(const VorBitmap* image, const VorToolStroke* stroke,
                                        const VorToolDrawParams* params,
                                        VorToolDrawState* state);
/* One brush dab of the kind into the mask. */
VOR_API void VorToolDrawPoint(const VorBitmap* image, VorBitmap* mask, const VorToolPoint* point,
                              const VorToolDrawParams* params, const VorToolDrawState* state);
/* Draws the stroke's points from nextIndex on and reports the rectangle of
 * the last segment drawn, padded by the brush diameter (left untouched when
 * only the first point was drawn). */
VOR_API void VorToolDrawStrokeOutRect(const VorBitmap* image, VorBitmap* mask,
                                      const VorToolStroke* stroke, const VorToolDrawParams* params,
                                      VorToolDrawState* state, VorPoint* outMin,
                                      VorPoint* outMax);
/* The same without the rectangle. */
VOR_API void VorToolDrawStroke(const VorBitmap* image, VorBitmap* mask, const VorToolStroke* stroke,
                               const VorToolDrawParams* params, VorToolDrawState* state);
/* Fills the mask with the radial or linear shape. */
VOR_API void VorToolDrawShapeInMask(const VorBitmap* image, VorBitmap* mask,
                                    const VorToolShape* shape);
/* Mixes image and full through the mask's alpha m into out over the pixels
 * x0..x1, y0..y1 (corners in any order, clamped to the bitmap):
 * ((255 - m) * image + m * full + 127) >> 8 on red, green, blue; out's
 * alpha is not written. Nothing when out, image and mask differ in size.
 * reserved is not read. */
VOR_API void VorToolRenderPreviewBox(VorBitmap* out, const VorBitmap* image, const VorBitmap* full,
                                     const VorBitmap* mask, int32_t x0, int32_t y0, int32_t x1,
                                     int32_t y1, const void* reserved);
/* The same over the whole bitmap. */
VOR_API void VorToolRenderPreview(VorBitmap* out, const VorBitmap* image, const VorBitmap* full,
                                  const VorBitmap* mask, const void* reserved);
/* Applies the finished edit to the image in place through a mask of its
 * size: the paint layer laid over it for state kind 12, otherwise the
 * kind's effect recomputed on a copy and blended through the mask. */
VOR_API void VorToolRenderHiRes(VorBitmap* image, const VorBitmap* mask, VorToolDrawParams* params,
                                const VorToolDrawState* state);

#ifdef __cplusplus
}
#endif

#endif /* ZENTRA_VORLITE_H */
