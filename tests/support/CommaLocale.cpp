#include "support/CommaLocale.h"

#include <unistd.h>

#include <clocale>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <system_error>

namespace dex_test {

namespace {

namespace fs = std::filesystem;

constexpr const char* kInstalledCandidates[] = {
    "de_DE.UTF-8", "de_DE.utf8",  "fr_FR.UTF-8", "fr_FR.utf8", "es_ES.UTF-8", "it_IT.UTF-8",
    "nl_NL.UTF-8", "ru_RU.UTF-8", "pt_BR.UTF-8", "de_DE",      "fr_FR",
};
constexpr const char* kCompiledName = "de_DE.UTF-8";

bool usesDecimalComma() {
  const std::lconv* conventions = std::localeconv();
  return conventions != nullptr && conventions->decimal_point != nullptr &&
         std::string(conventions->decimal_point) == ",";
}

bool activate(const char* name) {
  return std::setlocale(LC_ALL, name) != nullptr && usesDecimalComma();
}

bool isCompiledLocale(const fs::path& folder) {
  std::error_code ignored;
  return fs::exists(folder / "LC_NUMERIC", ignored);
}

// Compiles the German locale into cache/de_DE.UTF-8. localedef writes into a folder of this process
// that is then renamed into place, so test processes running side by side never see half a locale.
bool compileInto(const fs::path& cache) {
  std::error_code error;
  const fs::path scratch = cache / ("compiling-" + std::to_string(getpid()));
  fs::create_directories(scratch, error);
  if (error) return false;
  // -c writes the locale despite the warnings some locale sources give.
  const std::string command =
      "localedef -c -i de_DE -f UTF-8 '" + (scratch / kCompiledName).string() + "' >/dev/null 2>&1";
  [[maybe_unused]] const int status = std::system(command.c_str());  // judged by the files written
  if (isCompiledLocale(scratch / kCompiledName))
    fs::rename(scratch / kCompiledName, cache / kCompiledName, error);
  fs::remove_all(scratch, error);
  return isCompiledLocale(cache / kCompiledName);
}

// The folder holding a compiled German locale, or nothing when localedef is missing or fails. It is
// kept in the build tree, so only the first test process pays for localedef.
const std::optional<std::string>& compiledLocaleFolder() {
  static const std::optional<std::string> folder = []() -> std::optional<std::string> {
    const fs::path cache = DEXCHANGE_TEST_LOCALE_CACHE;
    if (isCompiledLocale(cache / kCompiledName) || compileInto(cache)) return cache.string();
    return std::nullopt;
  }();
  return folder;
}

// setlocale finds the compiled locale through LOCPATH, which is restored at once (the locale data
// stays loaded).
bool activateCompiled() {
  const std::optional<std::string>& folder = compiledLocaleFolder();
  if (!folder) return false;
  const char* current = std::getenv("LOCPATH");
  const std::optional<std::string> previous =
      current != nullptr ? std::optional<std::string>(current) : std::nullopt;
  setenv("LOCPATH", folder->c_str(), 1);
  const bool activated = activate(kCompiledName);
  if (previous) {
    setenv("LOCPATH", previous->c_str(), 1);
  } else {
    unsetenv("LOCPATH");
  }
  return activated;
}

}  // namespace

CommaLocale::CommaLocale() {
  const char* current = std::setlocale(LC_ALL, nullptr);
  previous_ = current != nullptr ? current : "C";
  for (const char* candidate : kInstalledCandidates) {
    if (activate(candidate)) {
      name_ = candidate;
      locale_ = candidate;
      active_ = true;
      return;
    }
  }
  if (activateCompiled()) {
    name_ = std::string(kCompiledName) + " (compiled)";
    locale_ = kCompiledName;
    folder_ = *compiledLocaleFolder();
    active_ = true;
    return;
  }
  std::setlocale(LC_ALL, previous_.c_str());
  reason_ = "no locale with a decimal comma is installed and localedef could not compile de_DE.UTF-8";
}

std::string CommaLocale::environment() const {
  if (!active_) return {};
  const std::string locale = "LC_ALL='" + locale_ + "'";
  return folder_.empty() ? locale : "LOCPATH='" + folder_ + "' " + locale;
}

CommaLocale::~CommaLocale() {
  std::setlocale(LC_ALL, previous_.c_str());
}

}  // namespace dex_test
