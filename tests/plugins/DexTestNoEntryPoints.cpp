// A library that loads but offers neither "MakeImporter" nor "MakeExporter".

#include "hostlibs/DexApi.h"

extern "C" DEX_API int DexTestNoEntryPointsAnswer() {
  return 42;
}
