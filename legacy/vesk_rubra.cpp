// Two frames that carry type: vesk, a white print border with today's
// date set in its lower band, and rubra, a red film-rebate edge with the
// frame numbers printed along it.
#include <algorithm>
#include <string>

#include "legacy/legacy_internal.h"

namespace {

// A profile of the larger side for the border styles, released on every
// path; a frame without its profiles draws nothing.
class Profile {
public:
    explicit Profile(const VorBitmap& b) {
        if (VorArrayBuild(&slot_, std::max(b.width, b.height), sizeof(float)) == 0) slot_ = nullptr;
    }
    Profile(const Profile&) = delete;
    Profile& operator=(const Profile&) = delete;
    ~Profile() { VorArrayFree(&slot_); }
    float* get() const { return static_cast<float*>(slot_); }

private:
    void* slot_ = nullptr;
};

// The depth of a side-style band of the given width, as the styles take
// it: a share of width + height, at most 0.45 of the smaller side.
float band_depth(const VorBitmap& b, double width) {
    const float sum = static_cast<float>(static_cast<std::uint64_t>(b.width) + b.height);
    return std::min(static_cast<float>(width) * sum, 0.45f * static_cast<float>(std::min(b.width, b.height)));
}

}  // namespace

extern "C" {

VOR_API void VorEffectVeskBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    if (bitmap == nullptr || bitmap->data == nullptr || bitmap->width == 0 || bitmap->height == 0) return;
    const Profile profile(*bitmap);
    if (profile.get() == nullptr) return;
    VorRNG rng;
    VorRNGSeed(&rng, options->seed);
    constexpr double k_width = 0.03;
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.bottomProfile = profile.get();
    p.style = VOR_BORDER_ROUND;
    p.color = VorColor{250, 248, 242, 255};
    p.width = k_width;
    p.seed = VorRNGNextInt(&rng);
    VorBorders(bitmap, &p);
    // A hairline just inside the mat, as a print's edge shadow.
    VorBorderInitParams(&p);
    p.bottomProfile = profile.get();
    p.style = VOR_BORDER_RECT;
    p.color = VorColor{60, 55, 50, 60};
    p.width = k_width * 1.04;
    p.seed = VorRNGNextInt(&rng);
    VorBorders(bitmap, &p);
    p.color = VorColor{250, 248, 242, 255};
    p.width = k_width;
    VorBorders(bitmap, &p);
    // Today's date in the lower band, right-aligned, in a soft grey.
    const std::string date = vorlite::legacy::date_text(vorlite::legacy::current_date());
    const float depth = band_depth(*bitmap, k_width);
    const float pitch = depth * 0.075f;
    const float x = static_cast<float>(bitmap->width) - depth - vorlite::legacy::text_width(date.size(), pitch);
    const float y = static_cast<float>(bitmap->height) - depth * 0.5f - 3.0f * pitch;
    const VorColor ink{96, 90, 84, 230};
    VorDotMatrix(bitmap, date.c_str(), x, y, pitch, &ink, VOR_BLEND_NORMAL);
}

VOR_API void VorEffectRubraBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    if (bitmap == nullptr || bitmap->data == nullptr || bitmap->width == 0 || bitmap->height == 0) return;
    const Profile left(*bitmap), right(*bitmap), bottom(*bitmap);
    if (left.get() == nullptr || right.get() == nullptr || bottom.get() == nullptr) return;
    VorRNG rng;
    VorRNGSeed(&rng, options->seed);
    constexpr double k_width = 0.028;
    // The rebate: a deep red edge, then a darker torn fringe inside it.
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.bottomProfile = bottom.get();
    p.style = VOR_BORDER_RECT;
    p.color = VorColor{118, 22, 24, 255};
    p.width = k_width;
    p.seed = VorRNGNextInt(&rng);
    VorBorders(bitmap, &p);
    VorBorderInitParams(&p);
    p.leftProfile = left.get();
    p.rightProfile = right.get();
    p.style = VOR_BORDER_TORN_2;
    p.color = VorColor{70, 8, 10, 150};
    p.width = k_width * 1.25;
    p.sideTune1 = 0.004;
    p.sideTune2 = 0.4;
    p.seed = VorRNGNextInt(&rng);
    VorBorders(bitmap, &p);
    // Frame numbers along the lower edge, as the film's edge prints them.
    const std::uint32_t frame = 1 + VorRNGNextInt(&rng) % 35;
    const std::string numbers = std::to_string(frame) + "   >" + std::to_string(frame) + "A        " +
                                std::to_string(frame + 1) + "   >" + std::to_string(frame + 1) + "A";
    const float depth = band_depth(*bitmap, k_width);
    const float pitch = depth * 0.07f;
    const VorColor ink{255, 178, 70, 220};
    const float x = depth * 1.5f;
    const float y = static_cast<float>(bitmap->height) - depth * 0.5f - 3.0f * pitch;
    VorDotMatrix(bitmap, numbers.c_str(), x, y, pitch, &ink, VOR_BLEND_NORMAL);
    const float top = depth * 0.5f - 3.0f * pitch;
    VorDotMatrix(bitmap, "SAFETY FILM", x, top, pitch, &ink, VOR_BLEND_NORMAL);
}

}  // extern "C"
