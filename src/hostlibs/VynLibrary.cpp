#include "hostlibs/VynLibrary.h"

#include <dlfcn.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cstdlib>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace {

constexpr int kOpenMode = RTLD_NOW | RTLD_LOCAL;
constexpr std::string_view kLibraryPrefix = "lib";
constexpr std::string_view kLibrarySuffix = ".so";

std::atomic<unsigned> loadCalls{0};
std::atomic<unsigned> successfulLoads{0};

// Any object of this library tells dladdr which file the library was loaded from.
const char kLocationAnchor = 0;

struct LibraryCloser {
  void operator()(void* handle) const { dlclose(handle); }
};
using LibraryHandle = std::unique_ptr<void, LibraryCloser>;

CVynStringT<wchar_t> wide(const std::string& text) {
  return CVynStringT<wchar_t>(text.c_str(), vyn_text::CP_UTF8);
}

// The system's last loader error, or the fallback when it has none.
std::string lastLoaderError(const std::string& fallback) {
  const char* error = dlerror();
  return error != nullptr ? std::string(error) : fallback;
}

bool isPath(const std::string& name) {
  return name.find('/') != std::string::npos;
}

std::string libraryFileName(const std::string& name) {
  if (name.ends_with(kLibrarySuffix)) return name;
  return std::string(kLibraryPrefix) + name + std::string(kLibrarySuffix);
}

std::string folderOfThisLibrary() {
  Dl_info info{};
  if (dladdr(&kLocationAnchor, &info) == 0 || info.dli_fname == nullptr) return {};
  const std::string path = info.dli_fname;
  const std::size_t slash = path.rfind('/');
  return slash == std::string::npos ? std::string() : path.substr(0, slash);
}

void appendPluginPathFolders(std::vector<std::string>& folders) {
  const char* pluginPath = std::getenv("DEXCHANGE_PLUGIN_PATH");
  if (pluginPath == nullptr) return;
  const std::string_view list = pluginPath;
  std::size_t start = 0;
  while (start <= list.size()) {
    const std::size_t colon = std::min(list.find(':', start), list.size());
    if (colon > start) folders.emplace_back(list.substr(start, colon - start));
    start = colon + 1;
  }
}

// The folders a bare library name is looked for in, in order, before the system's own search.
std::vector<std::string> searchFolders() {
  std::vector<std::string> folders;
  appendPluginPathFolders(folders);
  folders.emplace_back(DEXCHANGE_INSTALLED_PLUGIN_DIR);
  const std::string ownFolder = folderOfThisLibrary();
  if (!ownFolder.empty()) {
    folders.push_back(ownFolder);
    folders.push_back(ownFolder + "/plugins");
    folders.push_back(ownFolder + "/dexchange/plugins");
  }
  return folders;
}

LibraryHandle openLibrary(const std::string& fileOrPath, std::string& error) {
  LibraryHandle handle(dlopen(fileOrPath.c_str(), kOpenMode));
  if (!handle) error = lastLoaderError("cannot load " + fileOrPath);
  return handle;
}

// Opens the library a name stands for. When a file was found in a search folder but would not load,
// its error is reported rather than the system search's plain "not found".
LibraryHandle findAndOpen(const std::string& name, std::string& error) {
  if (isPath(name)) return openLibrary(name, error);
  const std::string fileName = libraryFileName(name);
  std::string firstFoundError;
  for (const std::string& folder : searchFolders()) {
    std::string candidate = folder;
    candidate += '/';
    candidate += fileName;
    if (access(candidate.c_str(), F_OK) != 0) continue;
    std::string candidateError;
    if (LibraryHandle handle = openLibrary(candidate, candidateError)) return handle;
    if (firstFoundError.empty()) firstFoundError = candidateError;
  }
  LibraryHandle handle = openLibrary(fileName, error);
  if (!handle && !firstFoundError.empty()) error = firstFoundError;
  return handle;
}

void* findExport(void* handle, const char* functionName, std::string& error) {
  dlerror();  // a stale error must not be taken for this lookup's
  void* address = dlsym(handle, functionName);
  if (address == nullptr) error = lastLoaderError(std::string(functionName) + " is a null export");
  return address;
}

LibraryResult loadFunction(HINSTANCE& module, void*& address, const wchar_t* library,
                           const char* functionName) {
  const std::string name = vyn_text::toUtf8(library);
  if (name.empty()) return LibraryResult::failure(L"no library name given");
  if (functionName == nullptr || *functionName == '\0')
    return LibraryResult::failure(L"no function name given");

  std::string error;
  LibraryHandle handle = findAndOpen(name, error);
  if (!handle) return LibraryResult::failure(wide(error));
  void* const found = findExport(handle.get(), functionName, error);
  if (found == nullptr) return LibraryResult::failure(wide(error));

  module = handle.release();
  address = found;
  ++successfulLoads;
  return LibraryResult::success();
}

}  // namespace

LibraryResult GetLibraryFunctionAddress(HINSTANCE& module, void*& address, const wchar_t* library,
                                        const char* functionName) {
  ++loadCalls;
  FreeLibraryFunction(module);
  address = nullptr;
  try {
    return loadFunction(module, address, library, functionName);
  } catch (...) {
    return LibraryResult::failure(CVynStringT<wchar_t>());
  }
}

void FreeLibraryFunction(HINSTANCE& module) {
  if (module != nullptr) dlclose(module);
  module = nullptr;
}

namespace vyn::plugins {

unsigned loadCallCountForTesting() noexcept {
  return loadCalls.load();
}
unsigned successfulLoadCountForTesting() noexcept {
  return successfulLoads.load();
}

}  // namespace vyn::plugins
