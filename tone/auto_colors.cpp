// Automatic per-channel levels: red, green and blue are each stretched from
// their 0.5th percentile to their 99.5th percentile (or a ceiling colour's
// channel, if higher), faded toward no change, and applied as two colour
// matrices without cross-channel terms, that is as two lookup tables.
#include "color/color_internal.h"
#include "proclist/proclist_internal.h"
#include "tone/tone_internal.h"

namespace {

// Matrix elements of the diagonal (red, green, blue) and of the offsets.
constexpr int k_diagonal[3] = {0, 5, 10};
constexpr int k_offset[3] = {3, 7, 11};

}  // namespace

extern "C" {

VOR_API void VorAutoColorsFadeMaxColor(VorBitmap* bitmap, double fade, const VorColor* ceiling) {
    double lo[3];
    double hi[3];
    double top[3];
    {
        vorlite::tone::ChannelStatistics statistics;
        if (!vorlite::tone::gather_channel_statistics(bitmap, &statistics)) return;
        const double ceiling_level[3] = {static_cast<double>(ceiling->r),
                                         static_cast<double>(ceiling->g),
                                         static_cast<double>(ceiling->b)};
        for (int c = 0; c < 3; ++c) {
            const double* cdf = statistics.cdf.get()->cdf[c];
            lo[c] = VorCDFINV(cdf, 0.005) * fade;
            hi[c] = VorCDFINV(cdf, 0.995) * fade + 255.0 * (1.0 - fade);
            top[c] = hi[c] >= ceiling_level[c] ? hi[c] : ceiling_level[c];
        }
    }

    VorColorMatrix shift;
    VorColorMatrixSetIdentity(&shift);
    for (int c = 0; c < 3; ++c) shift.m[k_offset[c]] = static_cast<float>(-lo[c]);

    // hi already holds the unchanged share 255 (1 - fade) and is weighed by
    // (1 - fade) once more. Without a ceiling above hi this is just
    // hi - lo; with one, part fades and the span is deliberately this mix
    // rather than top - lo.
    VorColorMatrix stretch;
    VorColorMatrixSetIdentity(&stretch);
    for (int c = 0; c < 3; ++c) {
        const double span = hi[c] * (1.0 - fade) - lo[c] + top[c] * fade;
        stretch.m[k_diagonal[c]] = static_cast<float>(255.0 / span);
    }

    // Both matrices lack cross-channel terms, so each is a byte table per
    // channel and the two transforms make one pass of their composition.
    VorHistMap shift_map;
    VorHistMap stretch_map;
    vorlite::color::diagonal_matrix_map(shift, &shift_map);
    vorlite::color::diagonal_matrix_map(stretch, &stretch_map);
    VorHistMapMap(&shift_map, &stretch_map);
    VorBitmapHistogramTransform(bitmap, &shift_map);
}

VOR_API void VorAutoColorsFade(VorBitmap* bitmap, double fade) {
    const VorColor no_ceiling = {0, 0, 0, 255};
    VorAutoColorsFadeMaxColor(bitmap, fade, &no_ceiling);
}

VOR_API void VorAutoColors(VorBitmap* bitmap) { VorAutoColorsFade(bitmap, 1.0); }

VOR_API int VLPLRunAutoColorsFadeMaxProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                              const VLPLRunOptions* options) {
    VorColor ceiling;
    const yajl_val color = vorlite::proclist::member(parameters, "color", yajl_t_any);
    if (!VLPLColorFromColorVal(color, &ceiling)) return 0;
    VorAutoColorsFadeMaxColor(bitmap, options->strength, &ceiling);
    return 1;
}

}  // extern "C"
