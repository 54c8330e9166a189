// Arbitrary bytes as an effect document: load, run on a small bitmap with
// a distinctive alpha, unload. Nothing may crash, read out of bounds or
// leak (beyond the loader's one deliberate leak, suppressed by name).
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>

#include "zentra_vorlite.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    const std::string text(reinterpret_cast<const char*>(data), size);
    VLPLEffectDocument* document = VLPLLoadEffect(text.c_str());
    if (document == nullptr) return 0;

    VorBitmap bitmap{};
    if (VorBitmapBuild(&bitmap, 13, 7) == 1) {
        for (uint32_t i = 0; i < 13 * 7 * 4; ++i) {
            bitmap.data[i] = static_cast<uint8_t>((i % 4 == 3) ? 42 : i * 29 + 3);
        }
        VLPLRunOptions options;
        VorEffectInitParams(&options);
        options.seed = size > 0 ? data[0] : 0;
        options.strength = size > 1 ? data[1] / 128.0 : 0.75;
        options.bordersEnabled = size > 2 ? (data[2] & 1) : 1;
        VLPLRunEffect(document, &bitmap, &options);
        VorBitmapFree(&bitmap);
    }
    VLPLUnloadEffect(&document);
    return 0;
}
