// Flare shapes built from angles, petals and crossed Gaussians: starbursts,
// petals, a diamond, a cross, corner glows, a finger of light, a chain of
// lens ghosts and a hazy sunburst. Each gives a transmission at shape
// coordinates and is drawn by VorFlare's frame inside the type's work box.
#include <cmath>
#include <cstdint>

#include "core/core_internal.h"
#include "generate/generate_internal.h"

namespace vorlite::generate {
namespace {

// The direction of (X, Y) as the unit complex number z = e^(i angle),
// angle = atan2(Y, X), held as its square: z^2 = ((X^2 - Y^2) + 2XY i) / r.
// Powers of z give sin(4 angle), cos(4 angle) and sin(10 angle) with a few
// products instead of an arc tangent and a sine per pixel. The centre,
// where the angle is undefined, counts as angle 0.
struct Direction {
    float re2;
    float im2;

    Direction(float x, float y, float r) {
        if (r > 0.0f) {
            const float inv = 1.0f / r;
            re2 = (x * x - y * y) * inv;
            im2 = (2.0f * x * y) * inv;
        } else {
            re2 = 1.0f;
            im2 = 0.0f;
        }
    }

    // z^4 = (z^2)^2
    float cos4() const { return re2 * re2 - im2 * im2; }
    float sin4() const { return 2.0f * re2 * im2; }

    // z^10 = (z^4)^2 z^2
    float sin10() const {
        const float re4 = cos4();
        const float im4 = sin4();
        const float re8 = re4 * re4 - im4 * im4;
        const float im8 = 2.0f * re4 * im4;
        return re8 * im2 + im8 * re2;
    }
};

float max_of(float a, float b) { return a > b ? a : b; }

// Shapes whose row contributes only Y and Y^2.
struct RowY {
    float y;
    float y2;
};

// Ten soft rays around a bright core: along a ray the light falls as
// exp(-r), between rays five times faster.
struct AngleGaussian {
    FlareLight light;
    RowY row(float y) const { return {y, y * y}; }
    float operator()(float x, const RowY& t) const {
        const float r = x * x + t.y2;
        // Along a ray the light is brightest: past it, no angle is needed.
        if (-r < light.limit) return 1.0f;
        const float rays = 3.0f + 2.0f * Direction(x, t.y, r).sin10();
        return flare_from_exponent(-r * rays, light);
    }
};

// A four-pointed star: long thin spikes along the axes over a small round
// core. sin^2(2 angle) = (1 - cos(4 angle)) / 2 closes the light between
// the spikes.
struct Stardom {
    FlareLight light;
    RowY row(float y) const { return {y, y * y}; }
    float operator()(float x, const RowY& t) const {
        const float r = x * x + t.y2;
        if (-0.6f * r < light.limit) return 1.0f;
        const float between = 0.5f * (1.0f - Direction(x, t.y, r).cos4());
        const float spikes = -r * (0.6f + 25.0f * between);
        return flare_from_exponent(max_of(-6.0f * r, spikes), light);
    }
};

// Four broad petals on the diagonals, grown out of a round glow: the
// Gaussian's square exp(2e), e = -1.2 r, scaled by 1 + 1.6 r sin(4 angle
// - pi/2) directly into the transmission, as the sinc is. Towards the
// axes the factor turns negative; those dark sides get no light.
struct Lobes {
    FlareLight light;
    RowY row(float y) const { return {y, y * y}; }
    float operator()(float x, const RowY& t) const {
        const float r = x * x + t.y2;
        const float glow = -2.4f * r;
        // The petal factor is at most 1 + 1.6 r < exp(1.6 r).
        if (glow + 1.6f * r < light.limit) return 1.0f;
        const float petals = 1.0f - 1.6f * r * Direction(x, t.y, r).cos4();
        return 1.0f - core::expf(glow) * petals * light.a;
    }
};

// A diamond of light: flat inside, with a soft edge, whose contours are
// squares on their corners (taxicab distance d, e = -3 d^4).
struct Diamond {
    FlareLight light;
    float row(float y) const { return std::fabs(y); }
    float operator()(float x, float abs_y) const {
        const float d = std::fabs(x) + abs_y;
        const float d2 = d * d;
        return flare_from_exponent(-3.0f * (d2 * d2), light);
    }
};

// Two long thin streaks crossing at the centre; the brighter one wins.
struct Cross {
    FlareLight light;
    RowY row(float y) const { return {y, y * y}; }
    float operator()(float x, const RowY& t) const {
        const float x2 = x * x;
        const float across = -0.02f * x2 - 60.0f * t.y2;
        const float down = -0.02f * t.y2 - 60.0f * x2;
        return flare_from_exponent(max_of(across, down), light);
    }
};

// Glows at the four corners of the flare's square, (+-1, +-1): light
// leaking in at the corners of a frame when the flare fills the picture.
struct CornerFlares {
    FlareLight light;
    float row(float y) const {
        const float v = std::fabs(y) - 1.0f;
        return v * v;
    }
    float operator()(float x, float v2) const {
        const float u = std::fabs(x) - 1.0f;
        return flare_from_exponent(-3.0f * (u * u + v2), light);
    }
};

struct FingerRow {
    float along;        // the exponent along the finger
    float across_rate;  // 1 / width^2
};

// A finger of light rising from its base one unit below the centre
// (Y = 1) and tapering to a rounded tip about one unit above it: brightest
// at the base, its width shrinking linearly with the height.
struct Finger {
    FlareLight light;
    FingerRow row(float y) const {
        const float from_base = y - 1.0f;
        const float height = -from_base;
        // Below the base the light ends within about half a unit.
        const float along = from_base > 0.0f ? -14.0f * (from_base * from_base) : -0.8f * (from_base * from_base);
        const float width = max_of(0.3f - 0.1f * height, 0.05f);
        return {along, 1.0f / (width * width)};
    }
    float operator()(float x, const FingerRow& t) const {
        if (t.along < light.limit) return 1.0f;
        return flare_from_exponent(t.along - x * x * t.across_rate, light);
    }
};

struct GhostRow {
    float large;   // (Y + 0.5)^2
    float medium;  // (Y - 0.3)^2
    float small;   // (Y - 0.8)^2
};

// A ghost: a flat disc of the given radius with a short soft edge
// (e = -2 (d^2 / R^2)^2), its light scaled by exp(gain).
float ghost(float d2, float inv_r2, float gain) {
    const float q = d2 * inv_r2;
    return gain - 2.0f * (q * q);
}

// Lens ghosts in a chain down the diagonal, as a lens images its aperture
// away from a light: a large dim disc up and to the left, a middle one,
// and a small bright one down and to the right.
struct BlobFlare {
    FlareLight light;
    GhostRow row(float y) const {
        const float l = y + 0.5f;
        const float m = y - 0.3f;
        const float s = y - 0.8f;
        return {l * l, m * m, s * s};
    }
    float operator()(float x, const GhostRow& t) const {
        const float l = x + 0.5f;
        const float m = x - 0.3f;
        const float s = x - 0.8f;
        // Radii 0.5, 0.25 and 0.12; gains ln 0.45 and ln 0.7.
        const float large = ghost(l * l + t.large, 4.0f, -0.7985077f);
        const float medium = ghost(m * m + t.medium, 16.0f, -0.3566749f);
        const float small = ghost(s * s + t.small, 69.44444f, 0.0f);
        return flare_from_exponent(max_of(large, max_of(medium, small)), light);
    }
};

// A hazy sunburst over the whole picture: ten faint rays in a wide glow,
// laid directly into the transmission at a fifth of the colour's opacity.
struct Blah {
    FlareLight light;
    RowY row(float y) const { return {y, y * y}; }
    float operator()(float x, const RowY& t) const {
        const float r = x * x + t.y2;
        // At a fifth of the opacity the glow is gone ln 5 sooner.
        if (-0.5f * r < light.limit + 1.609438f) return 1.0f;
        const float rays = 0.6f + 0.4f * Direction(x, t.y, r).sin10();
        return 1.0f - core::expf(-0.5f * r) * rays * (0.2f * light.a);
    }
};

}  // namespace

bool paint_designed_flare(VorFlareType type, const FlareRaster& raster, const FlareLight& light) {
    switch (type) {
        case VOR_FLARE_ANGLE_GAUSSIAN: paint_flare(raster, AngleGaussian{light}); return true;
        case VOR_FLARE_STARDOM: paint_flare(raster, Stardom{light}); return true;
        case VOR_FLARE_LOBES: paint_flare(raster, Lobes{light}); return true;
        case VOR_FLARE_DIAMOND: paint_flare(raster, Diamond{light}); return true;
        case VOR_FLARE_CROSS: paint_flare(raster, Cross{light}); return true;
        case VOR_FLARE_CORNERS: paint_flare(raster, CornerFlares{light}); return true;
        case VOR_FLARE_FINGER: paint_flare(raster, Finger{light}); return true;
        case VOR_FLARE_BLOB_FLARE: paint_flare(raster, BlobFlare{light}); return true;
        case VOR_FLARE_BLAH: paint_flare(raster, Blah{light}); return true;
        default: return false;
    }
}

}  // namespace vorlite::generate
