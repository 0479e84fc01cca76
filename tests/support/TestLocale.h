#pragma once

#include <clocale>
#include <cstdlib>
#include <exception>
#include <locale>
#include <string>

// The locale a test program runs under. When DEXCHANGE_TEST_LOCALE names a locale, the whole process
// switches to it before any test: the C locale (setlocale LC_ALL) and the C++ global locale, so that
// printf-family calls and streams alike would show a decimal comma if the library let one through.
// A locale that cannot be set fails the run instead of quietly testing the C locale a second time.
namespace dex_test {

// True when no locale is asked for or the one asked for is now active; otherwise false, with a line
// for the user in problem.
inline bool applyTestLocale(std::string& problem) {
  const char* name = std::getenv("DEXCHANGE_TEST_LOCALE");
  if (name == nullptr || *name == '\0') return true;
  const char* folder = std::getenv("LOCPATH");
  const std::string where = folder != nullptr ? std::string(" (LOCPATH=") + folder + ")" : std::string();
  if (std::setlocale(LC_ALL, name) == nullptr) {
    problem = std::string("DEXCHANGE_TEST_LOCALE: the locale ") + name + " cannot be set" + where +
              "; install or generate it (make locale-test does) or unset the variable";
    return false;
  }
  try {
    std::locale::global(std::locale(name));
  } catch (const std::exception& error) {
    problem = std::string("DEXCHANGE_TEST_LOCALE: the C++ locale ") + name + " cannot be made" + where +
              ": " + error.what();
    return false;
  }
  return true;
}

}  // namespace dex_test
