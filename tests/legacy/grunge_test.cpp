#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <limits>
#include <string>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::rgba;
using vorlite::test::TestBitmap;

struct Frame {
    const char* name;
    void (*draw)(VorBitmap*, uint32_t seed, double strength);
};

constexpr VorColor k_ink{0, 15, 0, 255};

const Frame k_frames[] = {
    {"ink", [](VorBitmap* b, uint32_t s, double k) { VorGrungeBorder1Legacy(b, &k_ink, s, 0, k); }},
    {"thin ink", [](VorBitmap* b, uint32_t s, double k) { VorGrungeBorder1Legacy(b, &k_ink, s, 1, k); }},
    {"paper", VorGrungeBorder4Legacy},
    {"burnt", VorGrungeBorder5Legacy},
    {"film", VorGrungeBorder6Legacy},
};

TEST(GrungeFrames, StayInsideAnySizeAndKeepAlpha) {
    // Odd and prime sizes, thin strips and a strength far past the cap.
    const uint32_t sides[] = {1, 2, 3, 5, 13, 31, 257};
    for (const Frame& f : k_frames) {
        for (uint32_t w : sides) {
            for (uint32_t h : sides) {
                TestBitmap b(w, h, 3);
                f.draw(b.get(), w * 31 + h, w == h ? 1e9 : 2.0);
                EXPECT_TRUE(b.alpha_kept()) << f.name << " " << w << "x" << h;
            }
        }
        VorBitmap empty{nullptr, 0, 0};
        f.draw(&empty, 1, 1.0);
        f.draw(nullptr, 1, 1.0);
    }
}

TEST(GrungeFrames, SeededAndReproducible) {
    for (const Frame& f : k_frames) {
        TestBitmap a(96, 64), b(96, 64), c(96, 64);
        f.draw(a.get(), 5, 1.0);
        f.draw(b.get(), 5, 1.0);
        f.draw(c.get(), 6, 1.0);
        EXPECT_TRUE(a == b) << f.name;
        EXPECT_FALSE(a == c) << f.name;
        EXPECT_FALSE(a.unchanged()) << f.name;
    }
}

TEST(GrungeFrames, NoStrengthDrawsNothing) {
    for (const Frame& f : k_frames) {
        for (double k : {0.0, -1.0, std::numeric_limits<double>::quiet_NaN()}) {
            TestBitmap b(40, 30);
            f.draw(b.get(), 5, k);
            EXPECT_TRUE(b.unchanged()) << f.name << " " << k;
        }
    }
}

// The frame lives in a band along the edges: the middle of the photo is
// left almost entirely as it was, however much grunge is asked for, and
// more strength changes more of the edge.
TEST(GrungeFrames, WorkStaysInTheBand) {
    for (const Frame& f : k_frames) {
        std::size_t changed_edge[2] = {0, 0};
        for (int i = 0; i < 2; ++i) {
            TestBitmap b(400, 300, VorColor{120, 130, 140, 42});
            f.draw(b.get(), 9, i == 0 ? 0.5 : 2.0);
            std::size_t centre = 0, changed_centre = 0;
            for (uint32_t y = 0; y < 300; ++y) {
                for (uint32_t x = 0; x < 400; ++x) {
                    const std::size_t o = (std::size_t{y} * 400 + x) * 4;
                    const bool changed = b.bytes[o] != b.before[o] || b.bytes[o + 1] != b.before[o + 1] ||
                                         b.bytes[o + 2] != b.before[o + 2];
                    if (x >= 120 && x < 280 && y >= 90 && y < 210) {
                        ++centre;
                        changed_centre += changed;
                    }
                    if (x < 4 || y < 4 || x >= 396 || y >= 296) changed_edge[i] += changed;
                }
            }
            EXPECT_LT(changed_centre * 20, centre) << f.name << " at strength " << (i == 0 ? 0.5 : 2.0);
        }
        EXPECT_GT(changed_edge[0], 0u) << f.name;
        EXPECT_GE(changed_edge[1], changed_edge[0]) << f.name;
    }
}

// Locks the look of each frame once judged on photos.
TEST(GrungeFrames, GoldenChecksums) {
    const uint32_t expected[] = {3090195265u, 3420008369u, 4068063079u, 2459104002u, 1523048275u};
    for (std::size_t i = 0; i < std::size(k_frames); ++i) {
        TestBitmap b(96, 64, 2);
        k_frames[i].draw(b.get(), 1234, 1.0);
        EXPECT_EQ(checksum(b), expected[i]) << k_frames[i].name;
    }
}

TEST(BasicDot, AntialiasedRimAndClipping) {
    const VorColor black{0, 0, 0, 255};
    TestBitmap b(11, 11, VorColor{255, 255, 255, 42});
    VorDrawBasicDotLegacy(b.get(), 5.0f, 5.0f, 2.0f, &black, 1.0f);
    EXPECT_EQ(rgba(b.pixel(5 * 11 + 5)), (std::array<int, 4>{0, 0, 0, 42}));
    // Two pixels out lies on the rim: half covered, 255 x 0.5 rounds to 128.
    EXPECT_EQ(b.at(7, 5, 0), 128);
    EXPECT_EQ(b.at(8, 5, 0), 255);
    EXPECT_TRUE(b.alpha_kept());

    // Half the opacity, or the colour's alpha at half, lays half as much.
    TestBitmap half(11, 11, VorColor{255, 255, 255, 42});
    const VorColor half_black{0, 0, 0, 128};
    VorDrawBasicDotLegacy(half.get(), 5.0f, 5.0f, 2.0f, &half_black, 1.0f);
    EXPECT_EQ(half.at(5, 5, 0), 127);

    const float nan = std::numeric_limits<float>::quiet_NaN();
    const float cases[][4] = {{-20.0f, 5.0f, 3.0f, 1.0f}, {5.0f, 40.0f, 3.0f, 1.0f}, {nan, 5.0f, 3.0f, 1.0f},
                              {5.0f, 5.0f, nan, 1.0f},    {5.0f, 5.0f, 0.0f, 1.0f},  {5.0f, 5.0f, 3.0f, 0.0f},
                              {5.0f, 5.0f, 3.0f, nan}};
    for (const auto& c : cases) {
        TestBitmap u(11, 11, VorColor{255, 255, 255, 42});
        VorDrawBasicDotLegacy(u.get(), c[0], c[1], c[2], &black, c[3]);
        EXPECT_TRUE(u.unchanged()) << c[0] << " " << c[1] << " " << c[2] << " " << c[3];
    }
    // A dot mostly off the corner draws only the part inside.
    TestBitmap corner(11, 11, VorColor{255, 255, 255, 42});
    VorDrawBasicDotLegacy(corner.get(), -1.0f, -1.0f, 3.0f, &black, 1.0f);
    EXPECT_EQ(corner.at(0, 0, 0), 0);
    EXPECT_EQ(corner.at(10, 10, 0), 255);
}

TEST(DirtSpeck, SeededClumpAroundItsPoint) {
    const VorColor dirt{40, 30, 20, 255};
    TestBitmap a(64, 64, VorColor{200, 200, 200, 42}), b(a), c(a);
    VorDirtSpecLegacy(a.get(), 32.0f, 32.0f, 10.0f, &dirt, 3);
    VorDirtSpecLegacy(b.get(), 32.0f, 32.0f, 10.0f, &dirt, 3);
    VorDirtSpecLegacy(c.get(), 32.0f, 32.0f, 10.0f, &dirt, 4);
    EXPECT_TRUE(a == b);
    EXPECT_FALSE(a == c);
    EXPECT_TRUE(a.alpha_kept());
    EXPECT_LT(a.at(32, 32, 0), 200);
    // Even a fibre stays within a few sizes of the speck.
    EXPECT_EQ(a.at(0, 0, 0), 200);
    for (float size : {0.0f, -3.0f, std::numeric_limits<float>::quiet_NaN(), 1e30f}) {
        TestBitmap u(16, 16, VorColor{200, 200, 200, 42});
        VorDirtSpecLegacy(u.get(), 8.0f, 8.0f, size, &dirt, 3);
        EXPECT_TRUE(u.unchanged()) << size;
    }
}

}  // namespace
