// Red-eye: strongly red pixels (red at least green plus blue) take the
// mean of green and blue as their red.
#include <cmath>
#include <cstdint>

#include "zentra_vorlite.h"

extern "C" {

VOR_API void VorRedEye(VorBitmap* destination, const VorBitmap* source) {
    if (destination == nullptr || source == nullptr) return;
    if (destination->width != source->width || destination->height != source->height) return;
    if (source->height < 1 || source->data == nullptr || destination->data == nullptr) return;
    const std::size_t count = std::size_t{source->width} * source->height;
    const std::uint8_t* in = source->data;
    std::uint8_t* out = destination->data;
    for (std::size_t i = 0; i < count; ++i, in += 4, out += 4) {
        const std::uint32_t sum = std::uint32_t{in[1]} + in[2];
        if (in[0] < sum) continue;
        // The mean rounded half up; at most 255 since sum <= red <= 255.
        out[0] = static_cast<std::uint8_t>(std::floor(static_cast<double>(sum + 1) * 0.5));
    }
}

}  // extern "C"
