#include "workload.h"

#include <cmath>

namespace vorlite::bench {

VorHistMap tone_map() {
    VorHistMap map;
    for (int i = 0; i < 256; ++i) {
        const double x = i / 255.0;
        const double lifted = std::sqrt(x) * 0.4 + x * 0.6;
        const double s_curve = x * x * (3.0 - 2.0 * x);
        const double darkened = std::pow(x, 1.3);
        map.map[0][i] = static_cast<std::uint8_t>(std::lround(lifted * 255.0));
        map.map[1][i] = static_cast<std::uint8_t>(std::lround(s_curve * 255.0));
        map.map[2][i] = static_cast<std::uint8_t>(std::lround(darkened * 255.0));
    }
    return map;
}

double sharpen_sigma(std::uint32_t width, std::uint32_t height, float amount) {
    return static_cast<double>(static_cast<float>(width + height) * amount * 2.5e-5f);
}

}  // namespace vorlite::bench
