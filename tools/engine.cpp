// The tool engine: a photograph, a "full" copy with the tool's effect
// applied everywhere, and a mask whose alpha says where the full copy
// shows. Touches edit the mask only; previews and the final render mix the
// two images through it. The host owns every record and bitmap; nothing is
// kept between calls.
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <utility>

#include "core/core_internal.h"
#include "core/simd.h"
#include "zentra_vorlite.h"

namespace {

enum Kind : std::int32_t {
    k_desaturate_except = 1,
    k_blur = 2,
    k_blur_brush = 3,
    k_red_eye = 4,
    k_whiten = 5,
    k_darken = 6,
    k_tint_warm = 7,
    k_tint_amber = 8,
    k_tint_rose = 9,
    k_sharpen = 10,
    k_soften = 11,
    k_paint = 12,
};

enum Mode : std::int32_t { k_apply = 1, k_erase = 2, k_colour_aware = 3 };

constexpr double k_no_tolerance = 99999999.0;

VorColor argb(std::uint8_t a, std::uint8_t r, std::uint8_t g, std::uint8_t b) { return VorColor{r, g, b, a}; }

void tint(VorBitmap* image, VorToolDrawParams* params, VorColor colour, std::uint32_t mode, float opacity) {
    // The tint is written into the parameters first: the darken brush then
    // measures colour distance against it.
    params->color = colour;
    VorBitmapBlendWithColor(image, &params->color, mode, opacity);
}

void red_overlay(VorBitmap* image) {
    VorColorMatrix red{};
    red.m[3] = 255.0f;
    VorBitmapColorMatrixTransform(image, &red);
}

void desaturate(VorBitmap* image) {
    VorColorMatrix matrix;
    VorColorMatrixSetIdentity(&matrix);
    VorColorMatrixAdjSaturation(&matrix, 0.0f);
    VorBitmapColorMatrixTransform(image, &matrix);
}

void similar(const VorBitmap* image, VorBitmap* mask, const VorColor& reference, const VorToolPoint& point,
             double tolerance, double strength, bool erase, bool ignore_colour) {
    VorMaskSimilarColors(image, mask, &reference, static_cast<double>(point.position.x),
                         static_cast<double>(point.position.y), point.radius, tolerance, 1.0, strength,
                         erase ? 1 : 0, 0, ignore_colour ? 1 : 0);
}

// Kind 1 starts opaque on a grey full image: "apply" erases the mask to
// bring the photograph's colour back and "erase" adds it again, the
// reverse of every other kind.
void desaturate_dab(const VorBitmap* image, VorBitmap* mask, const VorToolPoint& point,
                    const VorToolDrawState& state) {
    switch (point.mode) {
        case k_erase:
            similar(image, mask, state.color, point, k_no_tolerance, 1.0, false, true);
            return;
        case k_colour_aware:
            similar(image, mask, state.color, point, 10.0, 1.0, true, false);
            return;
        case k_apply:
            similar(image, mask, state.color, point, k_no_tolerance, 1.0, true, true);
            return;
        default:
            return;
    }
}

void dab(const VorBitmap* image, VorBitmap* mask, const VorToolPoint& point, const VorToolDrawParams& params,
         const VorToolDrawState& state) {
    const bool erase = point.mode == k_erase;
    switch (params.kind) {
        case k_desaturate_except:
            desaturate_dab(image, mask, point, state);
            return;
        case k_blur_brush:
        case k_red_eye:
        case k_whiten:
            similar(image, mask, params.color, point, k_no_tolerance, params.strength, erase, true);
            return;
        case k_darken:
            similar(image, mask, params.color, point, 10.0, 0.1, erase, false);
            return;
        case k_paint:
            VorMaskDraw(mask, &state.color, static_cast<double>(point.position.x),
                        static_cast<double>(point.position.y), point.radius, params.strength, erase ? 1 : 0);
            return;
        default:
            return;
    }
}

VorToolPoint brush_point(VorPoint position, const VorToolStroke& stroke) {
    VorToolPoint point;
    VorToolPointInit(&point);
    point.position = position;
    point.radius = stroke.radius;
    point.mode = stroke.mode;
    return point;
}

// The positions of the segment that ends at touch i: the start leg, a
// curve, or on the finger's lift the last curve with its finishing leg.
void segment(const VorToolStroke& stroke, std::uint32_t i, float radius, std::int32_t paint, VorPoint** generated,
             std::uint32_t* n) {
    const VorPoint* p = stroke.points;
    if (i == 1) {
        VorInterpolateFirstPointToMidpoint(p[0], p[1], radius, generated, n, paint);
        return;
    }
    const std::uint32_t count = stroke.count;
    if (stroke.finished == 0 || i != count - 1) {
        VorInterpolateBetweenPointsWithBezierQuadCurve(p[i - 2], p[i - 1], p[i], radius, generated, n, paint);
        return;
    }
    if (count > 2) {
        VorInterpolateBetweenPointsWithBezierQuadCurveAndFinishToPoint(p[count - 3], p[i - 1], p[i], radius,
                                                                      generated, n, paint);
    } else {
        VorInterpolateMidpointToSecondPoint(p[count - 2], p[i], radius, generated, n, paint);
    }
}

// The preview mix of one row: ((255 - m) image + m full + 127) >> 8. The
// shift divides by 256, not 255: full coverage shows the full image one
// level low from 128 up, a trade for a mix without division.
void mix_row(std::uint8_t* out, const std::uint8_t* image, const std::uint8_t* full, const std::uint8_t* mask,
             std::uint32_t columns) {
    std::uint32_t x = 0;
#if VORLITE_NATIVE_INTEGER_LANES
    // Four pixels at a time in 16-bit lanes: keep x image + m x full + 127
    // is at most 255 x 255 + 127, so no lane overflows.
    using namespace vorlite::core::simd;
    const u8x16 alpha = {0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255};
    for (; x + 4 <= columns; x += 4, out += 16, image += 16, full += 16, mask += 16) {
        const u8x16 coverage = load<u8x16>(mask);
        const u8x16 m = __builtin_shufflevector(coverage, coverage, 3, 3, 3, 3, 7, 7, 7, 7, 11, 11, 11, 11, 15, 15,
                                                15, 15);
        const u8x16 from_image = load<u8x16>(image);
        const u8x16 from_full = load<u8x16>(full);
        const u16x8 m_low = widen_low(m);
        const u16x8 m_high = widen_high(m);
        const u16x8 low = ((255 - m_low) * widen_low(from_image) + m_low * widen_low(from_full) + 127) >> 8;
        const u16x8 high = ((255 - m_high) * widen_high(from_image) + m_high * widen_high(from_full) + 127) >> 8;
        const u8x16 mixed = narrow_clamped(reinterpret_cast<i16x8>(low), reinterpret_cast<i16x8>(high));
        store(out, (mixed & ~alpha) | (load<u8x16>(out) & alpha));
    }
#endif
    for (; x < columns; ++x, out += 4, image += 4, full += 4, mask += 4) {
        const std::uint32_t m = mask[3];
        const std::uint32_t keep = 255 - m;
        out[0] = static_cast<std::uint8_t>((keep * image[0] + m * full[0] + 127) >> 8);
        out[1] = static_cast<std::uint8_t>((keep * image[1] + m * full[1] + 127) >> 8);
        out[2] = static_cast<std::uint8_t>((keep * image[2] + m * full[2] + 127) >> 8);
    }
}

}  // namespace

extern "C" {

VOR_API void VorToolDrawParamsInit(VorToolDrawParams* params) {
    params->kind = 0;
    params->color = argb(255, 255, 255, 255);
    params->strength = 1.0;
    params->skipFullTool = 0;
    params->redOverlay = 0;
}

VOR_API void VorToolDrawStateInit(VorToolDrawState* state) {
    // kind is the host's to set, from the parameters' kind.
    state->color = argb(255, 255, 255, 255);
    state->flag = 0;
}

VOR_API void VorToolDrawStateDestroy(VorToolDrawState* /*state*/) {}

VOR_API void VorToolPointInit(VorToolPoint* point) {
    VorPointMake(&point->position, 0.0f, 0.0f);
    point->radius = 0.0;
    point->mode = 0;
}

VOR_API void VorToolStrokeInit(VorToolStroke* stroke) {
    stroke->points = nullptr;
    stroke->count = 0;
    stroke->nextIndex = 0;
    stroke->finished = 0;
    stroke->radius = 0.0;
    stroke->mode = 0;
    stroke->useFixedColor = 0;
    stroke->fixedColor = argb(255, 255, 255, 255);
}

VOR_API void VorToolShapeInit(VorToolShape* shape) {
    shape->kind = 0;
    VorPointMake(&shape->center, 0.0f, 0.0f);
    shape->size = 0.0;
    shape->angle = 0.0;
}

VOR_API void VorToolConfigureMask(const VorBitmap* /*image*/, VorBitmap* mask, const VorToolDrawParams* params) {
    if (params->kind == k_desaturate_except) {
        VorMaskSetOpaque(mask);
    } else {
        VorMaskSetTransparent(mask);
    }
}

VOR_API void VorToolApplyFullTool(VorBitmap* image, VorToolDrawParams* params) {
    if (params->kind == k_paint) return;
    if (params->redOverlay != 0) {
        red_overlay(image);
        return;
    }
    switch (params->kind) {
        case k_desaturate_except:
            desaturate(image);
            return;
        case k_blur:
        case k_blur_brush:
            VorConvolutionEffectBoxHybridSharpen(image, -100.0f);
            return;
        case k_red_eye:
            VorRedEye(image, image);
            return;
        case k_whiten:
            VorWhiten(image, image);
            return;
        case k_darken:
            tint(image, params, argb(255, 30, 30, 30), VOR_BLEND_SOFT_LIGHT, 1.0f);
            return;
        case k_tint_warm:
            tint(image, params, argb(255, 190, 110, 62), VOR_BLEND_MULTIPLY, 0.26f);
            return;
        case k_tint_amber:
            tint(image, params, argb(255, 190, 30, 20), VOR_BLEND_MULTIPLY, 0.34f);
            return;
        case k_tint_rose:
            tint(image, params, argb(255, 192, 42, 45), VOR_BLEND_MULTIPLY, 0.6f);
            return;
        case k_sharpen:
            VorToolSharpness(image, params, 100.0);
            return;
        case k_soften:
            VorToolSharpness(image, params, -150.0);
            return;
        default:
            return;
    }
}

VOR_API void VorToolInit(const VorBitmap* image, VorBitmap* full, VorBitmap* mask, VorToolDrawParams* params,
                         VorToolDrawState* /*state*/) {
    if (VorBitmapCopy(full, image) == 0) return;
    VorToolConfigureMask(image, mask, params);
    if (params->skipFullTool != 0) return;
    VorToolApplyFullTool(full, params);
}

VOR_API void VorToolFirstDownProcessing(const VorBitmap* image, const VorToolStroke* stroke,
                                        const VorToolDrawParams* params, VorToolDrawState* state) {
    if (params->kind != k_desaturate_except || stroke->mode != k_colour_aware) return;
    if (stroke->useFixedColor != 0) {
        state->color = stroke->fixedColor;
    } else if (stroke->points != nullptr && stroke->count > 0) {
        VorBitmapGetColorAtPoint(image, stroke->points[0], &state->color);
    }
}

VOR_API void VorToolDrawPoint(const VorBitmap* image, VorBitmap* mask, const VorToolPoint* point,
                              const VorToolDrawParams* params, const VorToolDrawState* state) {
    dab(image, mask, *point, *params, *state);
}

VOR_API void VorToolDrawStrokeOutRect(const VorBitmap* image, VorBitmap* mask, const VorToolStroke* stroke,
                                      const VorToolDrawParams* params, VorToolDrawState* state, VorPoint* outMin,
                                      VorPoint* outMax) {
    if (stroke->points == nullptr) return;
    const std::int32_t paint = state->kind == k_paint ? 1 : 0;
    const auto radius = static_cast<float>(stroke->radius);
    for (std::uint32_t i = stroke->nextIndex; i < stroke->count; ++i) {
        if (i == 0) {
            VorToolFirstDownProcessing(image, stroke, params, state);
            const VorToolPoint point = brush_point(stroke->points[0], *stroke);
            dab(image, mask, point, *params, *state);
            continue;
        }
        VorPoint* generated = nullptr;
        std::uint32_t n = 0;
        segment(*stroke, i, radius, paint, &generated, &n);
        VorPoint low{0.0f, 0.0f};
        VorPoint high{0.0f, 0.0f};
        if (n > 0) {
            low = VorPoint{static_cast<float>(image->width - 1), static_cast<float>(image->height - 1)};
            for (std::uint32_t k = 0; k < n; ++k) {
                const VorPoint p = generated[k];
                if (p.x < low.x) low.x = p.x;
                if (p.y < low.y) low.y = p.y;
                if (p.x > high.x) high.x = p.x;
                if (p.y > high.y) high.y = p.y;
                const VorToolPoint point = brush_point(p, *stroke);
                dab(image, mask, point, *params, *state);
            }
        }
        // Padded by the brush's diameter rounded up: the dabs reach that
        // far beyond their centres.
        const auto pad = static_cast<float>(
            vorlite::core::truncate_clamped<std::int32_t>(std::ceil(static_cast<float>(stroke->radius + stroke->radius))));
        low.x -= pad;
        low.y -= pad;
        high.x += pad;
        high.y += pad;
        if (outMin != nullptr) *outMin = low;
        if (outMax != nullptr) *outMax = high;
        std::free(generated);
    }
}

VOR_API void VorToolDrawStroke(const VorBitmap* image, VorBitmap* mask, const VorToolStroke* stroke,
                               const VorToolDrawParams* params, VorToolDrawState* state) {
    VorPoint low{0.0f, 0.0f};
    VorPoint high{0.0f, 0.0f};
    VorToolDrawStrokeOutRect(image, mask, stroke, params, state, &low, &high);
}

VOR_API void VorToolDrawShapeInMask(const VorBitmap* image, VorBitmap* mask, const VorToolShape* shape) {
    const auto x = static_cast<double>(shape->center.x);
    const auto y = static_cast<double>(shape->center.y);
    if (shape->kind == 1) {
        VorMaskRadial(image, mask, x, y, shape->size);
    } else if (shape->kind == 2) {
        VorMaskLinear(image, mask, x, y, shape->size, shape->angle * 0.017453292519943295);
    }
}

VOR_API void VorToolRenderPreviewBox(VorBitmap* out, const VorBitmap* image, const VorBitmap* full,
                                     const VorBitmap* mask, int32_t x0, int32_t y0, int32_t x1, int32_t y1,
                                     const void* /*reserved*/) {
    const std::uint32_t width = out->width;
    const std::uint32_t height = out->height;
    if (width != image->width || height != image->height || width != mask->width || height != mask->height) return;
    if (x0 > x1) std::swap(x0, x1);
    if (y0 > y1) std::swap(y0, y1);
    const std::int64_t w = width;
    const std::int64_t h = height;
    std::int64_t left = x0 < 0 ? 0 : x0;
    std::int64_t top = y0 < 0 ? 0 : y0;
    std::int64_t right = x1 >= w ? w - 1 : x1;
    std::int64_t bottom = y1 >= h ? h - 1 : y1;
    if (right < 0 || bottom < 0 || left >= w || top >= h || bottom < top) return;
    if (right < left) return;
    const auto columns = static_cast<std::uint32_t>(right - left + 1);
    for (std::int64_t y = top; y <= bottom; ++y) {
        const std::size_t offset = (static_cast<std::size_t>(y) * width + static_cast<std::size_t>(left)) * 4;
        mix_row(out->data + offset, image->data + offset, full->data + offset, mask->data + offset, columns);
    }
}

VOR_API void VorToolRenderPreview(VorBitmap* out, const VorBitmap* image, const VorBitmap* full,
                                  const VorBitmap* mask, const void* reserved) {
    // The bottom bound is one past the last row; the box clamps it.
    const auto right = static_cast<std::int32_t>(out->width) - 1;
    const auto bottom = static_cast<std::int32_t>(out->height);
    VorToolRenderPreviewBox(out, image, full, mask, 0, 0, right, bottom, reserved);
}

VOR_API void VorToolRenderHiRes(VorBitmap* image, const VorBitmap* mask, VorToolDrawParams* params,
                                const VorToolDrawState* state) {
    if (state->kind == k_paint) {
        VorBitmapCompositePremultiplied(image, image, mask, 0);
        return;
    }
    vorlite::core::WorkingBitmap copy;
    if (!copy.build(image->width, image->height)) return;
    if (VorBitmapCopy(copy.get(), image) == 0) return;
    VorToolApplyFullTool(copy.get(), params);
    VorBitmapBlendBitmapMask(image, image, copy.get(), mask, 0);
}

}  // extern "C"
