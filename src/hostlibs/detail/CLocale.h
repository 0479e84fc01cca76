#pragma once

#include <locale.h>

// Numbers in survey files always use "." as the decimal separator, whatever locale the host process
// runs in. These helpers give the C conventions (with UTF-8 for multibyte text) to one thread for the
// length of a scope; uselocale is per thread, so other threads are not disturbed.
namespace vyn_text::detail {

// "C.UTF-8" when the system has it, else "C". Created once; never freed.
locale_t numericLocale();

class CLocaleScope {
 public:
  CLocaleScope() : previous_(uselocale(numericLocale())) {}
  ~CLocaleScope() { uselocale(previous_); }
  CLocaleScope(const CLocaleScope&) = delete;
  CLocaleScope& operator=(const CLocaleScope&) = delete;

 private:
  locale_t previous_;
};

}  // namespace vyn_text::detail
