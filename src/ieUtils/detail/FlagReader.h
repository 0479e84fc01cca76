#pragma once

#include "hostlibs/VynString.h"
#include "ieUtils/IEUtilsUnits.h"

namespace vyn::ie::utils::detail {

// The three-way verdict of the Ex readers around a reader of the form read(text, ok): an empty text
// is not read at all.
template <typename Reader>
double readWithVerdict(const CVynStringT<wchar_t>& text, EFlagFltValues& flag, Reader read) {
  if (text.IsEmpty()) {
    flag = EFlagFltValues::EMPTY_TEXT;
    return 0.0;
  }
  bool ok = false;
  const double value = read(text, ok);
  flag = ok ? EFlagFltValues::VALID_NUMBER : EFlagFltValues::NOT_A_NUMBER;
  return value;
}

}  // namespace vyn::ie::utils::detail
