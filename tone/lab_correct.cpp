// Colour-cast correction in L*a*b*: half of the cast of each chroma
// channel, measured as the middle of its 10th..90th percentile range, is
// taken out by scaling the packed chroma bytes.
#include "tone/tone_internal.h"

extern "C" {

VOR_API void VorLabCorrect(VorBitmap* bitmap) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    VorBitmapConvertRGBToLAB(bitmap);

    float centre_a = 0.0f;
    float centre_b = 0.0f;
    {
        // A failed allocation leaves the pixels in their packed L*a*b* form.
        vorlite::tone::ChannelStatistics statistics;
        if (!vorlite::tone::gather_channel_statistics(bitmap, &statistics)) return;
        // The middle of the 10th..90th percentile range of a chroma channel
        // is its cast; 127 is neutral.
        const auto centre = [&](int channel) {
            const double* cdf = statistics.cdf.get()->cdf[channel];
            const float p10 = static_cast<float>(VorCDFINV(cdf, static_cast<double>(0.1f)));
            const float p90 = static_cast<float>(VorCDFINV(cdf, static_cast<double>(0.9f)));
            return (p90 + p10) * 0.5f - 127.0f;
        };
        centre_a = centre(1);
        centre_b = centre(2);
    }
    // Half of each cast is taken out: the packed chroma byte is scaled so
    // that a byte of 127 + cast/2 would land on 127.
    const float half_a = centre_a * 0.5f;
    const float half_b = centre_b * 0.5f;
    const float factor_a = 127.0f / (half_a + 127.0f);
    const float factor_b = 127.0f / (half_b + 127.0f);
    VorBitmapConvertLABToRBG(bitmap, factor_a, factor_b);
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

}  // extern "C"
