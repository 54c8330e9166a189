/* Loads an effect document, runs it on a generated bitmap and reports. */
#include <stdio.h>

#include "zentra_vorlite.h"

static const char* const kEffect =
    "{\n"
    "  \"identifier\": \"example.identity\",\n"
    "  \"processors\": [\n"
    "    {\"name\": \"original\", \"parameters\": {}}\n"
    "  ]\n"
    "}\n";

int main(void) {
    VorBitmap bitmap;
    VLPLRunOptions options;
    VLPLEffectDocument* effect;
    uint32_t version[3], format[3], x, y;
    unsigned long checksum = 0;
    int ok;

    if (!VorBitmapBuild(&bitmap, 64, 48)) return 1;
    for (y = 0; y < bitmap.height; ++y) {
        for (x = 0; x < bitmap.width; ++x) {
            uint8_t* p = bitmap.data + 4 * (y * bitmap.width + x);
            VorColorSetARGB((VorColor*)p, 255, (uint8_t)(x * 4), (uint8_t)(y * 5), 128);
        }
    }

    effect = VLPLLoadEffect(kEffect);
    if (effect == NULL) {
        fprintf(stderr, "run_effect: the effect document did not load\n");
        VorBitmapFree(&bitmap);
        return 1;
    }
    VorEffectInitParams(&options);
    options.seed = 42;
    options.strength = 0.8;
    ok = VLPLRunEffect(effect, &bitmap, &options);
    VLPLUnloadEffect(&effect);

    for (x = 0; x < bitmap.width * bitmap.height * 4; ++x) checksum = checksum * 31 + bitmap.data[x];
    VorLiteVersion(version);
    VorLiteProclistVersion(format);
    printf("libzentra_vorlite %u.%u.%u, effect format %u.%u.%u\n", version[0], version[1], version[2],
           format[0], format[1], format[2]);
    printf("ran \"example.identity\" on a %ux%u bitmap: %s, checksum %08lx\n", bitmap.width, bitmap.height,
           ok ? "ok" : "failed", checksum & 0xFFFFFFFFul);
    VorBitmapFree(&bitmap);
    return ok ? 0 : 1;
}
