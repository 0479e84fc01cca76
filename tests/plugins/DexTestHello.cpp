// A minimal plug-in: the two entry points answer fixed numbers, and a logging export shows that the
// plug-in reaches the same error log as the host that loaded it.

#include "hostlibs/DexApi.h"
#include "hostlibs/VynLogging.h"

extern "C" {

DEX_API unsigned MakeImporter() {
  return 0x1A2B0001u;
}

DEX_API unsigned MakeExporter() {
  return 0x1A2B0002u;
}

DEX_API void DexTestHelloLog(int line) {
  vyn_logging::vyn_err_log(L"tests\\DexTestHello", line, L"hello");
}

}  // extern "C"
