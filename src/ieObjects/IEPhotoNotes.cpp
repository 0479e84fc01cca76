#include "ieObjects/IEPhotoNotes.h"

namespace vyn::ie {

DexPhotoNote::~DexPhotoNote() = default;

DexPhotoNotes::~DexPhotoNotes() = default;

}  // namespace vyn::ie
