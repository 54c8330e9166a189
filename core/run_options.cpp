// The run options of an effect: the defaults a host starts from before
// setting its own seed and strength.
#include "core_internal.h"

extern "C" {

VOR_API void VorEffectInitParams(VLPLRunOptions* options) {
    options->seed = 0;
    options->strength = 1.0;
    options->bordersEnabled = 1;
    options->scale = 1.0;
}

}  // extern "C"
