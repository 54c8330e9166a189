// Flare shapes built from angles, lobes and crossed Gaussians: starbursts,
// petals, a diamond, a cross, corner glows, a finger of light, a lens
// ghost and a hazy sunburst. Each is a transmission at shape coordinates,
// drawn by VorFlare's frame inside the type's work box.
#include <cmath>

#include "core/core_internal.h"
#include "generate/generate_internal.h"

namespace vorlite::generate {
namespace {

// The shared rule of the Gaussian shapes: no light where it would stay
// below one level of the colour, full colour at or above the centre's.
float from_exponent(float e, float a, float limit) {
    if (e < limit) return 1.0f;
    if (e > 0.0f) return 1.0f - a;
    return 1.0f - core::expf(e) * a;
}

float angle_of(float x, float y) {
    return static_cast<float>(core::atan2(static_cast<double>(y), static_cast<double>(x)));
}

float square(float v) { return v * v; }

// Ten soft rays around a bright core: the falloff along a ray is five
// times slower than between rays.
float angle_gaussian(float x, float y, float r, float a, float limit) {
    // Between the rays the light falls fastest; if even along a ray it is
    // gone, the angle is not needed.
    if (-r * 1.0f < limit) return 1.0f;
    const float rays = 3.0f + 2.0f * core::sinf(10.0f * angle_of(x, y));
    return from_exponent(-r * rays, a, limit);
}

// A four-pointed star with long thin spikes along the axes over a small
// round core: sin^2(2 angle) = (1 - cos(4 angle)) / 2 closes the light
// between the spikes.
float stardom(float x, float y, float r, float a, float limit) {
    const float core_glow = -6.0f * r;
    if (-0.6f * r < limit) return 1.0f;
    const float between = 0.5f * (1.0f - core::cosf(4.0f * angle_of(x, y)));
    const float spikes = -r * (0.6f + 25.0f * between);
    return from_exponent(core_glow > spikes ? core_glow : spikes, a, limit);
}

// Four petals of light: a Gaussian whose square, exp(2e), is shaped by the
// angle directly into the transmission, as the sinc is.
float lobes(float x, float y, float r, float a) {
    const float e = -1.2f * r;
    const float petals = 0.5f + 0.5f * core::sinf(4.0f * angle_of(x, y));
    return 1.0f - core::expf(2.0f * e) * petals * a;
}

// A glow whose contour lines are diamonds: squared taxicab distance.
float diamond(float x, float y, float a, float limit) {
    return from_exponent(-4.0f * square(std::fabs(x) + std::fabs(y)), a, limit);
}

// Two long thin streaks crossing at the centre, the brighter of the two.
float cross(float x, float y, float a, float limit) {
    const float across = -0.02f * x * x - 60.0f * y * y;
    const float down = -0.02f * y * y - 60.0f * x * x;
    return from_exponent(across > down ? across : down, a, limit);
}

// Glows at the four corners of the flare's square, (+-1, +-1): light
// leaking in from the corners of a frame when the flare fills the picture.
float corner_flares(float x, float y, float a, float limit) {
    const float d = square(std::fabs(x) - 1.0f) + square(std::fabs(y) - 1.0f);
    return from_exponent(-3.0f * d, a, limit);
}

// A tapering finger of light from the left, rising gently to the right.
float finger(float x, float y, float a, float limit) {
    const float along = x + 0.5f;
    const float tilt = y + 0.3f * along;
    return from_exponent(-(0.25f * along * along + 12.0f * tilt * tilt), a, limit);
}

// A lens ghost: a large soft blob and a smaller, sharper one beside it.
float blob_flare(float x, float y, float a, float limit) {
    const float large = -6.0f * (square(x + 0.4f) + square(y + 0.4f));
    const float small = -10.0f * (square(x - 0.5f) + square(y - 0.5f));
    return from_exponent(large > small ? large : small, a, limit);
}

// A hazy sunburst over the whole picture: ten faint rays in a wide glow,
// mixed in at a fifth of the colour's opacity.
float blah(float x, float y, float r, float a, float limit) {
    // At a fifth of the opacity the glow is invisible ln 5 sooner.
    if (-0.5f * r < limit + 1.609438f) return 1.0f;
    const float glow = core::expf(-0.5f * r);
    const float rays = 0.6f + 0.4f * core::sinf(10.0f * angle_of(x, y));
    return 1.0f - glow * rays * (0.2f * a);
}

}  // namespace

float designed_flare_transmission(VorFlareType type, float x, const FlareRow& row, float r, float a, float limit) {
    const float y = row.y;
    switch (type) {
        case VOR_FLARE_ANGLE_GAUSSIAN: return angle_gaussian(x, y, r, a, limit);
        case VOR_FLARE_STARDOM: return stardom(x, y, r, a, limit);
        case VOR_FLARE_LOBES: return lobes(x, y, r, a);
        case VOR_FLARE_DIAMOND: return diamond(x, y, a, limit);
        case VOR_FLARE_CROSS: return cross(x, y, a, limit);
        case VOR_FLARE_CORNERS: return corner_flares(x, y, a, limit);
        case VOR_FLARE_FINGER: return finger(x, y, a, limit);
        case VOR_FLARE_BLOB_FLARE: return blob_flare(x, y, a, limit);
        case VOR_FLARE_BLAH: return blah(x, y, r, a, limit);
        default: return 1.0f;  // types without a shape give no light
    }
}

}  // namespace vorlite::generate
