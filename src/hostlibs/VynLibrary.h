#pragma once

#include <type_traits>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"

// Loading plug-in libraries and finding their entry points.
//
// A library name with a "/" is a path and is opened as it is. A bare name X stands for the file
// libX.so (a name that already ends in ".so" is taken as the file name), looked for in order in:
//   1. the folders listed in the environment variable DEXCHANGE_PLUGIN_PATH (colon-separated),
//   2. the plug-in folder of the installation the library was built for,
//   3. the folder of libdexchange.so itself, its plugins/ subfolder and its dexchange/plugins/
//      subfolder (so that a moved installation or a build tree still finds its plug-ins),
//   4. the system's own library search.
// Libraries are opened with every symbol bound at once and kept private to the caller
// (RTLD_NOW | RTLD_LOCAL).

// The answer of GetLibraryFunction: true when the library is loaded and the entry point found;
// otherwise false with the system's explanation, for messages.
class DEX_API LibraryResult {
 public:
  static LibraryResult success() { return LibraryResult(true, CVynStringT<wchar_t>()); }
  static LibraryResult failure(const CVynStringT<wchar_t>& errorText) {
    return LibraryResult(false, errorText);
  }

  explicit operator bool() const noexcept { return succeeded_; }
  // Why the load failed; empty on success.
  const CVynStringT<wchar_t>& errorText() const noexcept { return errorText_; }

 private:
  LibraryResult(bool succeeded, const CVynStringT<wchar_t>& errorText)
      : succeeded_(succeeded), errorText_(errorText) {}

  bool succeeded_;
  CVynStringT<wchar_t> errorText_;
};

// Loads the library into module and stores the address of the export functionName in address.
// A module already set on entry is released first (as FreeLibraryFunction does), so a handle never
// leaks; callers that hold entry points from it must drop them. On failure (no name, library not found
// or not loadable, no such export) both module and address are null, a library loaded on the way is
// released again, and the result is false with the reason.
DEX_API LibraryResult GetLibraryFunctionAddress(HINSTANCE& module, void*& address, const wchar_t* library,
                                                const char* functionName);

// The typed form: function is a pointer to a function of the export's type (the caller vouches for the
// type), set or cleared as GetLibraryFunctionAddress sets or clears the address.
template <class Function>
LibraryResult GetLibraryFunction(HINSTANCE& module, Function& function, const wchar_t* library,
                                 const char* functionName) {
  static_assert(std::is_pointer_v<Function> && std::is_function_v<std::remove_pointer_t<Function>>,
                "GetLibraryFunction stores into a function pointer");
  void* address = nullptr;
  LibraryResult result = GetLibraryFunctionAddress(module, address, library, functionName);
  function = reinterpret_cast<Function>(address);
  return result;
}

// Releases a library loaded by GetLibraryFunction and sets module to null; a null module is left as
// it is. Entry points taken from the library must not be called afterwards.
DEX_API void FreeLibraryFunction(HINSTANCE& module);

namespace vyn::plugins {

// Test seams: the number of GetLibraryFunction calls so far, and of those that loaded a library and
// found its export. A caller that reuses a held library shows no new call.
DEX_API unsigned loadCallCountForTesting() noexcept;
DEX_API unsigned successfulLoadCountForTesting() noexcept;

}  // namespace vyn::plugins
