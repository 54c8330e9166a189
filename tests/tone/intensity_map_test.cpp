#include <gtest/gtest.h>

#include <cstdint>
#include <vector>

#include "tests/test_support.h"
#include "tone/tone_internal.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::sample_map;
using vorlite::test::TestBitmap;


TEST(IntensityMap, PicksTheMapColourAtTheRoundedLuminance) {
    const VorHistMap m = sample_map();
    const struct {
        VorColor pixel;
        int level;
    } cases[] = {{{255, 0, 0, 7}, 54}, {{0, 255, 0, 8}, 182}, {{255, 255, 255, 12}, 255},
                 {{0, 1, 0, 14}, 1}, {{2, 0, 0, 15}, 0}};  // 0.715 rounds up, 0.425 down
    for (const auto& c : cases) {
        VorColor px = c.pixel;
        VorBitmap b{reinterpret_cast<uint8_t*>(&px), 1, 1};
        VorBitmapIntensityMap(&b, &m, VOR_BLEND_NORMAL, 1.0);
        EXPECT_EQ((std::vector<int>{px.r, px.g, px.b, px.a}),
                  (std::vector<int>{m.map[0][c.level], m.map[1][c.level], m.map[2][c.level], c.pixel.a}));
    }
}

// The channel-pair table (every mode but the colour mode, the unknown
// mode 7 among them) and the colour mode's precomputed hue and saturation
// must store what blending each pixel's mapped colour on its own stores.
// Outside 0..1 the colour mode's unclamped store would wrap, so those
// opacities must take the per-pixel blend.
TEST(IntensityMap, EveryPathMatchesThePerPixelBlend) {
    const VorHistMap map = sample_map();
    const struct {
        uint32_t width, height;
    } sizes[] = {{1, 1}, {7, 3}, {1, 29}, {61, 47}};
    for (uint32_t mode = VOR_BLEND_NORMAL; mode <= VOR_BLEND_SOFT_LIGHT + 1; ++mode) {
        for (double alpha : {0.0, 0.3, 0.5, 0.77, 1.0, -0.5, 1.5}) {
            for (const auto& s : sizes) {
                TestBitmap fast(s.width, s.height, mode * 131 + s.width), reference = fast;
                VorBitmapIntensityMap(fast.get(), &map, mode, alpha);
                vorlite::tone::intensity_map_per_pixel(reference.get(), map, mode, static_cast<float>(alpha));
                ASSERT_TRUE(fast == reference) << "mode " << mode << ", alpha " << alpha << ", " << s.width << " x "
                                               << s.height;
            }
        }
    }
}

}  // namespace
