/* A C99 host: the header compiles as C and the interface links and runs. */
#include <stdio.h>
#include <string.h>

#include "zentra_vorlite.h"

static int check(int ok, const char* what) {
    if (!ok) fprintf(stderr, "c_interface: %s\n", what);
    return ok ? 0 : 1;
}

int main(void) {
    int failures = 0;
    uint32_t version[3];
    VorBitmap bitmap;
    VorColor color;
    VLPLRunOptions options;
    VLPLEffectDocument* document;

    VorLiteVersion(version);
    failures += check(version[0] == 2 && version[1] == 0 && version[2] == 0, "library version");

    failures += check(VorBitmapBuild(&bitmap, 3, 2) == 1, "bitmap build");
    VorColorSetARGB(&color, 255, 1, 2, 3);
    memcpy(bitmap.data + 4, &color, 4);

    VorEffectInitParams(&options);
    failures += check(options.seed == 0 && options.strength == 1.0 && options.bordersEnabled == 1 &&
                          options.scale == 1.0,
                      "default run options");
    options.seed = 7;
    document = VLPLLoadEffect(
        "{\"identifier\": \"c\", \"processors\": [{\"name\": \"original\", \"parameters\": {}}]}");
    failures += check(document != NULL, "load");
    failures += check(VLPLRunEffect(document, &bitmap, &options) == 1, "run");
    VLPLUnloadEffect(&document);
    failures += check(document == NULL, "unload nulls the handle");
    failures += check(memcmp(bitmap.data + 4, &color, 4) == 0, "original keeps pixels");
    failures += check(VLPLBlendAroundIdentity(2.0f, 1.0f, 0.5f) == 1.5f, "strength blend");
    failures += check(kVorToolMaxTolerance == 99999999 && kRadiusMultiplier == 2.0f, "constants");
    failures += check(VorTransformIdentity.a == 1.0 && VorTransformIdentity.d == 1.0, "identity");

    VorBitmapFree(&bitmap);
    return failures == 0 ? 0 : 1;
}
