// The catalogue's frames built from the border styles: each fills a border
// record from its defaults, sets only its own fields, and draws. Edge
// profiles are working arrays of the larger side; a frame whose arrays
// cannot all be had draws nothing.
#include <array>
#include <cstdint>

#include "zentra_vorlite.h"

namespace {

constexpr VorColor k_white{255, 255, 255, 255};
constexpr VorColor k_black{0, 0, 0, 255};

// The edge profiles of one frame, released together on every path.
template <std::size_t N>
class Profiles {
public:
    explicit Profiles(const VorBitmap& bitmap) {
        const std::uint32_t larger = bitmap.width > bitmap.height ? bitmap.width : bitmap.height;
        for (void*& slot : slots_) {
            if (VorArrayBuild(&slot, larger, sizeof(float)) == 0) {
                release();
                return;
            }
        }
        built_ = true;
    }
    Profiles(const Profiles&) = delete;
    Profiles& operator=(const Profiles&) = delete;
    ~Profiles() { release(); }

    bool built() const { return built_; }
    float* operator[](std::size_t i) const { return static_cast<float*>(slots_[i]); }

private:
    void release() {
        for (void*& slot : slots_) VorArrayFree(&slot);
        built_ = false;
    }
    std::array<void*, N> slots_{};
    bool built_ = false;
};

VorBorderParams fresh() {
    VorBorderParams p;
    VorBorderInitParams(&p);
    return p;
}

// One round pass of a single profile in the colour, at the width.
void round_pass(VorBitmap* bitmap, float* profile, VorColor colour, double width) {
    VorBorderParams p = fresh();
    p.color = colour;
    p.style = VOR_BORDER_ROUND;
    p.width = width;
    p.bottomProfile = profile;
    VorBorders(bitmap, &p);
}

// How the six torn passes after the round one differ between the frames
// that share this scaffold.
struct TornPasses {
    VorColor round_colour;
    VorColor torn_colour;
    double tune_step;  // sideTune1 = strength x step x (7 - k), or x step alone
    bool decreasing;
    double tune2;
};

// A round pass, then six double-sided torn passes of widening width, each
// seeded by the next draw of a generator seeded with the run's seed.
void round_and_torn(VorBitmap* bitmap, const VLPLRunOptions* options, const Profiles<3>& profiles, VorRNG* rng,
                    const TornPasses& passes) {
    static constexpr std::array<double, 6> k_widths = {0.03, 0.035, 0.04, 0.045, 0.05, 0.055};
    round_pass(bitmap, profiles[0], passes.round_colour, 0.025);
    for (std::uint32_t k = 1; k <= 6; ++k) {
        VorBorderParams p = fresh();
        p.color = passes.torn_colour;
        p.style = VOR_BORDER_TORN_2;
        p.sideTune1 = passes.decreasing ? options->strength * passes.tune_step * static_cast<double>(7 - k)
                                        : options->strength * passes.tune_step;
        p.width = k_widths[k - 1];
        p.sideTune2 = passes.tune2;
        p.leftProfile = profiles[1];
        p.rightProfile = profiles[2];
        p.seed = VorRNGNextInt(rng);
        VorBorders(bitmap, &p);
    }
}

void seeded_round_and_torn(VorBitmap* bitmap, const VLPLRunOptions* options, const TornPasses& passes) {
    const Profiles<3> profiles(*bitmap);
    if (!profiles.built()) return;
    VorRNG rng;
    VorRNGSeed(&rng, options->seed);
    round_and_torn(bitmap, options, profiles, &rng, passes);
}

VorColor with_alpha(VorColor c, std::uint8_t alpha) {
    c.a = alpha;
    return c;
}

// One round pass of a single profile: the white and black round frames.
void single_round(VorBitmap* bitmap, VorColor colour) {
    const Profiles<1> profiles(*bitmap);
    if (!profiles.built()) return;
    round_pass(bitmap, profiles[0], colour, 0.025);
}

}  // namespace

extern "C" {

VOR_API void VorEffectMarTessaBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    constexpr VorColor cream{225, 225, 200, 255};
    seeded_round_and_torn(bitmap, options, TornPasses{cream, with_alpha(cream, 51), 0.006, true, 0.4});
}

VOR_API void VorEffectHolmvaleBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    seeded_round_and_torn(bitmap, options, TornPasses{k_white, k_white, 0.003, true, 0.4});
}

VOR_API void VorEffectOldKvantBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    seeded_round_and_torn(bitmap, options, TornPasses{k_white, with_alpha(k_white, 51), 0.006, true, 0.4});
}

VOR_API void VorEffectPallorBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    // Seeded before the profiles are built, unlike its siblings.
    VorRNG rng;
    VorRNGSeed(&rng, options->seed);
    const Profiles<3> profiles(*bitmap);
    if (!profiles.built()) return;
    round_and_torn(bitmap, options, profiles, &rng, TornPasses{k_white, k_white, 0.03, false, 8.0});
}

VOR_API void VorEffectKipCoolBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    const Profiles<1> profiles(*bitmap);
    if (!profiles.built()) return;
    VorBorderParams p = fresh();
    p.bottomProfile = profiles[0];
    p.style = VOR_BORDER_BULGE;
    p.color = k_white;
    p.width = 0.05;
    p.inset = 0.5;
    p.sideTune3 = 0.0;
    VorBorders(bitmap, &p);
}

VOR_API void VorEffectSkarnBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    VorBorderParams p = fresh();
    p.style = VOR_BORDER_FADE;
    p.inset = 1.0;
    p.cornerFactor = 1.0;
    p.color = k_black;
    VorBorders(bitmap, &p);
}

VOR_API void VorEffectNerioBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    single_round(bitmap, k_white);
}

VOR_API void VorEffectKvantBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    single_round(bitmap, k_black);
}

VOR_API void VorEffectBichromeBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    const Profiles<1> profiles(*bitmap);
    if (!profiles.built()) return;
    VorBorderParams p = fresh();
    p.bottomProfile = profiles[0];
    p.seed = options->seed;
    p.style = VOR_BORDER_TORN;
    p.color = k_white;
    p.sideTune1 = options->strength * 0.015;
    p.width = 0.02;
    p.sideTune2 = 0.5;
    VorBorders(bitmap, &p);
}

VOR_API void VorEffectCorvaleBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    VorBorderParams p = fresh();
    p.style = VOR_BORDER_SMOOTH;
    p.color = k_white;
    VorBorders(bitmap, &p);
}

VOR_API void VorEffectEmberlyBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    VorBorderParams p = fresh();
    p.style = VOR_BORDER_FADE;
    p.inset = 0.0;
    p.cornerFactor = 2.222;
    p.color = k_black;
    VorBorders(bitmap, &p);
}

VOR_API void VorEffectDuskoBorder(VorBitmap* bitmap, const VLPLRunOptions* options) {
    // The profile is deliberately never released: every call leaves one
    // array of the larger side allocated, as this frame always has.
    void* profile = nullptr;
    const std::uint32_t larger = bitmap->width > bitmap->height ? bitmap->width : bitmap->height;
    if (VorArrayBuild(&profile, larger, sizeof(float)) == 0) return;
    VorBorderParams p = fresh();
    p.bottomProfile = static_cast<float*>(profile);
    p.color = k_black;
    p.vignetteScale = static_cast<double>(larger) * 0.85 / (options->strength + 1e-8);
    p.seed = options->seed;
    p.style = VOR_BORDER_TORN;
    p.sideTune1 = options->strength * 0.02;
    p.width = 0.02;
    p.sideTune2 = 0.5;
    VorBorders(bitmap, &p);
    p.style = VOR_BORDER_ROUND;
    p.width = 0.02;
    VorBorders(bitmap, &p);
}

VOR_API void VorEffectGlimmoBWBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    const Profiles<1> profiles(*bitmap);
    if (!profiles.built()) return;
    VorBorderParams p = fresh();
    p.bottomProfile = profiles[0];
    p.style = VOR_BORDER_RECT;
    p.color = VorColor{127, 127, 127, 255};
    p.width = 0.021;
    VorBorders(bitmap, &p);
    p.color = k_white;
    p.width = 0.02;
    VorBorders(bitmap, &p);
}

VOR_API void VorEffectGlimmoTintypeBorder(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    const Profiles<1> profiles(*bitmap);
    if (!profiles.built()) return;
    VorBorderParams p = fresh();
    p.bottomProfile = profiles[0];
    p.style = VOR_BORDER_GLIMMO;
    p.color = k_black;
    p.sideTune0 = 1.0;
    VorBorders(bitmap, &p);
}

}  // extern "C"
