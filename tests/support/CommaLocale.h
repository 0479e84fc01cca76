#pragma once

#include <string>

namespace dex_test {

// Switches the whole process (setlocale LC_ALL) to a locale whose decimal separator is "," for the
// life of the object, then restores the locale it found. Installed locales (German, French, ...) are
// tried first; when none is installed, a German one is compiled with localedef into the build tree
// (once: later test processes reuse it). When neither works, active() is false and reason() says why:
//
//   const dex_test::CommaLocale comma;
//   if (!comma.active()) GTEST_SKIP() << comma.reason();
class CommaLocale {
 public:
  CommaLocale();
  ~CommaLocale();
  CommaLocale(const CommaLocale&) = delete;
  CommaLocale& operator=(const CommaLocale&) = delete;

  bool active() const { return active_; }
  const std::string& name() const { return name_; }
  const std::string& reason() const { return reason_; }
  // What a child process needs to run under the same locale: "LC_ALL=<locale>", preceded by
  // "LOCPATH=<folder> " when the locale was compiled into the build tree. Empty when not active.
  std::string environment() const;

 private:
  std::string previous_;
  std::string name_;
  std::string locale_;  // the name setlocale took
  std::string folder_;  // LOCPATH of a compiled locale, else empty
  std::string reason_;
  bool active_ = false;
};

}  // namespace dex_test
