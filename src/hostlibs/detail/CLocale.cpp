#include "hostlibs/detail/CLocale.h"

namespace vyn_text::detail {

locale_t numericLocale() {
  static const locale_t locale = [] {
    locale_t created = newlocale(LC_ALL_MASK, "C.UTF-8", static_cast<locale_t>(nullptr));
    if (created == static_cast<locale_t>(nullptr)) {
      created = newlocale(LC_ALL_MASK, "C", static_cast<locale_t>(nullptr));
    }
    return created;
  }();
  return locale;
}

}  // namespace vyn_text::detail
