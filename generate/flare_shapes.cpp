// Flare shapes built from angles, lobes and crossed Gaussians.
#include "generate/generate_internal.h"

namespace vorlite::generate {

float designed_flare_transmission(VorFlareType, float, const FlareRow&, float, float, float) { return 1.0f; }

}  // namespace vorlite::generate
