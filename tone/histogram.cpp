// Per-channel histograms, their cumulative distributions and the
// inverse-CDF lookup, the JSON form of a histogram map and the
// "histogramMapping" processor that applies one.
#include <cstring>

#include "core/core_internal.h"
#include "proclist/proclist_internal.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::core::pixel_count;

constexpr int k_levels = 256;

// One element of a map channel in JSON: an integer whose low 32 bits hold
// a level. yajl flags numbers written with a fraction or an exponent, and
// integers beyond 64 bits, as not integer-valid.
bool level_from_json(yajl_val element, std::uint8_t* out) {
    if (!YAJL_IS_INTEGER(element)) return false;
    const std::uint32_t low = static_cast<std::uint32_t>(YAJL_GET_INTEGER(element));
    if (low > 255) return false;
    *out = static_cast<std::uint8_t>(low);
    return true;
}

}  // namespace

namespace vorlite::tone {

bool gather_channel_statistics(const VorBitmap* bitmap, ChannelStatistics* statistics) {
    if (!statistics->histogram.build(1) || !statistics->cdf.build(1)) return false;
    VorHistogramBuild(bitmap, statistics->histogram.get());
    VorHistogram2CDF(statistics->histogram.get(), statistics->cdf.get());
    return true;
}

}  // namespace vorlite::tone

extern "C" {

VOR_API void VorHistogramBuild(const VorBitmap* bitmap, VorHistogram* histogram) {
    std::uint32_t* red = histogram->count[0];
    std::uint32_t* green = histogram->count[1];
    std::uint32_t* blue = histogram->count[2];
    const std::uint8_t* pixels = bitmap->data;
    vorlite::core::for_each_pixel(pixels, pixel_count(*bitmap), [&](const std::uint8_t* p) {
        ++red[p[0]];
        ++green[p[1]];
        ++blue[p[2]];
    });
}

VOR_API void VorHistogram2CDFChan(const uint32_t counts[256], double cdf[256]) {
    std::uint32_t running = 0;  // wraps like the counts themselves
    for (int i = 0; i < k_levels; ++i) {
        running += counts[i];
        cdf[i] = static_cast<double>(running);
    }
    if (running != 0) {
        const double scale = 1.0 / static_cast<double>(running);
        for (int i = 0; i < k_levels; ++i) cdf[i] *= scale;
    } else {
        // Nothing counted: the distribution of a uniform ramp.
        const double step = 1.0 / 255.0;
        for (int i = 0; i < k_levels; ++i) cdf[i] = i * step;
    }
}

VOR_API void VorHistogram2CDF(const VorHistogram* histogram, VorCDF* cdf) {
    for (int c = 0; c < 3; ++c) VorHistogram2CDFChan(histogram->count[c], cdf->cdf[c]);
}

VOR_API double VorCDFINV(const double cdf[256], double p) {
    if (p <= 0.0) return 0.0;
    if (p >= 1.0) return 255.0;
    if (p <= cdf[0]) return p / cdf[0];
    for (int j = 0; j < k_levels - 1; ++j) {
        if (cdf[j] < p && cdf[j + 1] >= p) return j + (p - cdf[j]) / (cdf[j + 1] - cdf[j]);
    }
    // A normalised total can land just under 1, leaving p above the last
    // entry: the level is then the top one.
    return 255.0;
}

VOR_API int VLPLHistMapfromHistMapVal(const yajl_val value, VorHistMap* map) {
    using vorlite::proclist::member;
    const yajl_val red = member(value, "r", yajl_t_array);
    const yajl_val green = member(value, "g", yajl_t_array);
    if (red == nullptr || green == nullptr) return 0;
    const yajl_val blue = member(value, "b", yajl_t_array);
    if (blue == nullptr) return 0;
    const yajl_val arrays[3] = {red, green, blue};
    for (const yajl_val array : arrays) {
        if (YAJL_GET_ARRAY(array)->len != k_levels) return 0;
    }
    for (int i = 0; i < k_levels; ++i) {
        std::uint8_t level[3];
        for (int c = 0; c < 3; ++c) {
            if (!level_from_json(YAJL_GET_ARRAY(arrays[c])->values[i], &level[c])) return 0;
        }
        for (int c = 0; c < 3; ++c) map->map[c][i] = level[c];
    }
    return 1;
}

VOR_API int VLPLRunHistogramMappingProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                             const VLPLRunOptions* options) {
    if (parameters == nullptr || !YAJL_IS_OBJECT(parameters)) return 0;
    const yajl_val json_map = vorlite::proclist::member(parameters, "histMap", yajl_t_object);
    if (json_map == nullptr) return 0;
    VorHistMap map;
    if (!VLPLHistMapfromHistMapVal(json_map, &map)) return 0;
    VorHistMapFade(&map, options->strength);
    VorBitmapHistogramTransform(bitmap, &map);
    return 1;
}

}  // extern "C"
