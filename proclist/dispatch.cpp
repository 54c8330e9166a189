// Dispatch of one processor object to its adapter by name. The table is
// searched in order with exact, case-sensitive names.
#include <cstring>

#include "proclist_internal.h"

namespace {

using Adapter = int (*)(const yajl_val, VorBitmap*, const VLPLRunOptions*);

struct Processor {
    const char* name;
    Adapter run;
};

// VLPLRunAutoColorsFadeMaxProcessor is left out on purpose: hosts call it
// directly, documents cannot reach it.
constexpr Processor k_processors[] = {
    {"original", VLPLRunOriginalProcessor},
    {"vignette", VLPLRunVignetteProcessor},
    {"legacyProcessor", VLPLRunLegacyProcessor},
    {"histogramMapping", VLPLRunHistogramMappingProcessor},
    {"gamma", VLPLRunGammaProcessor},
    {"colorMatrixTransform", VLPLRunColorMatrixTransformProcessor},
    {"intensityMap", VLPLRunIntensityMapProcessor},
    {"flare", VLPLRunFlareProcessor},
    {"contrast", VLPLRunContrastProcessor},
    {"blendWithColor", VLPLRunBlendWithColorProcessor},
    {"noise", VLPLRunNoiseProcessor},
    {"sharpness", VLPLRunSharpnessProcessor},
    {"gradient", VLPLRunGradientProcessor},
};

}  // namespace

extern "C" {

VOR_API int VLPLRunProcessor(const yajl_val processor, VorBitmap* bitmap,
                             const VLPLRunOptions* options) {
    if (processor == nullptr || !YAJL_IS_OBJECT(processor)) return 0;
    using vorlite::proclist::member;
    const yajl_val name = member(processor, "name", yajl_t_string);
    const yajl_val parameters = member(processor, "parameters", yajl_t_object);
    if (name == nullptr || parameters == nullptr) return 0;
    const char* wanted = YAJL_GET_STRING(name);
    for (const Processor& p : k_processors) {
        if (std::strcmp(wanted, p.name) == 0) return p.run(parameters, bitmap, options);
    }
    return 0;
}

}  // extern "C"
