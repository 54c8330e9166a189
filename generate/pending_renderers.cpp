// Renderers whose designs are not part of this build yet: they draw
// nothing, so the styles and flare types that reach them leave the picture
// as it is. Each moves to a file of its own when its design lands.
#include "core/core_internal.h"

extern "C" {

VOR_API void VorFlareLegacyCorvale(VorBitmap*, const VLPLRunOptions*) {}
VOR_API void VorFlareLegacyEmberly(VorBitmap*, const VLPLRunOptions*) {}

}  // extern "C"
