// StringNatural and FreeNumericNames fed names from the input. The input is a list of names separated
// by LF; a name starting with "#" adds the number after it (which may be negative) instead of a
// name. Each name also goes through StringNatural, whose text and order are checked; then the
// collected names are renamed as an importer renames them, a bounded number of times.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "ieUtils/IENaturalNames.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/FuzzText.h"

namespace {

using vyn::ie::utils::FreeNumericNames;
using vyn::ie::utils::StringNatural;
using String = CVynStringT<wchar_t>;

constexpr std::size_t kMostNamesHandedOut = 2000;

bool isDigitText(const String& text) {
  if (text.IsEmpty()) return false;
  for (int i = 0; i < text.GetLength(); ++i) {
    if (text[i] < L'0' || text[i] > L'9') return false;
  }
  return true;
}

// A natural is never empty, all digits, without leading zeros, and counts up by one.
void checkNatural(const String& name) {
  StringNatural natural(name);
  const String digits = natural.get();
  DEX_FUZZ_CHECK(isDigitText(digits));
  DEX_FUZZ_CHECK(digits.GetLength() == 1 || digits[0] != L'0');
  DEX_FUZZ_CHECK(natural.toInt() >= 0);
  StringNatural next = natural;
  ++next;
  DEX_FUZZ_CHECK(natural < next && !(next < natural));
  DEX_FUZZ_CHECK(!(natural < natural));
  DEX_FUZZ_CHECK(natural.toInt() == 2147483647 || next.toInt() == natural.toInt() + 1);
  // A name that is all digits reads as itself, leading zeros aside.
  if (isDigitText(name)) {
    String trimmed = name;
    trimmed.TrimLeft(L'0');
    DEX_FUZZ_CHECK(digits == (trimmed.IsEmpty() ? String(L"0") : trimmed));
  }
}

int numberOf(std::string_view text) {
  long long value = 0;
  bool negative = false;
  std::size_t at = 0;
  if (at < text.size() && text[at] == '-') {
    negative = true;
    ++at;
  }
  for (; at < text.size() && text[at] >= '0' && text[at] <= '9'; ++at)
    value = std::min(value * 10 + (text[at] - '0'), 4294967296LL);
  return static_cast<int>(negative ? -std::min(value, 2147483648LL) : std::min(value, 2147483647LL));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::FuzzInput input(data, size);
  FreeNumericNames names;
  std::vector<String> toRename;
  while (!input.empty()) {
    const std::string_view line = input.takeUntil('\n');
    if (!line.empty() && line.front() == '#') {
      names.addObject(numberOf(line.substr(1)));
      continue;
    }
    const String name(dex_fuzz::decodeLenientUtf8(line));
    checkNatural(name);
    names.addObject(name);
    toRename.push_back(name);
  }
  // Before init() nothing may be handed out.
  if (!toRename.empty()) {
    DEX_FUZZ_CHECK(names.getFirstAvailableName().IsEmpty());
    DEX_FUZZ_CHECK(names.getFirstAvailableNumber() == 0);
  }
  names.init();
  [[maybe_unused]] const int last = names.getLastObject();
  DEX_FUZZ_CHECK(names.getObjectsToRename() >= 0);

  // A copy hands out the same names as its original.
  FreeNumericNames copy = names;
  std::size_t handedOut = 0;
  for (const String& name : toRename) {
    if (handedOut++ == kMostNamesHandedOut) break;
    const String given = names.getNameFor(name);
    DEX_FUZZ_CHECK(isDigitText(given));
    DEX_FUZZ_CHECK(given.GetLength() == 1 || given[0] != L'0');
    DEX_FUZZ_CHECK(copy.getNameFor(name) == given);
    DEX_FUZZ_CHECK(copy.getFirstAvailableNumber() == names.getFirstAvailableNumber());
  }
  [[maybe_unused]] const int lastAfterRenaming = names.getLastObject();
  return 0;
}
