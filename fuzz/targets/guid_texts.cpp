// GUID texts. The input, in lenient UTF-8, holds two texts separated by the first LF. Each is read as
// a GUID text: whatever parses must print back as the same GUID in the braced upper-case form, and
// whatever does not must leave the GUID zeroed. Then the texts go through the format comparisons and
// the registry's lookups, whose answers must agree with the parse.

#include <cstddef>
#include <cstdint>
#include <string>

#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEFormatsData.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/FuzzText.h"

namespace {

using vyn::ie::DexFormat;

constexpr int kGuidTextLength = 38;

std::wstring upper(std::wstring text) {
  for (wchar_t& ch : text) {
    if (ch >= L'a' && ch <= L'f') ch = static_cast<wchar_t>(ch - L'a' + L'A');
  }
  return text;
}

// The GUID of text, or false with a zeroed GUID.
bool readGuidText(const std::wstring& text, GUID& guid) {
  guid = GUID{};
  guid.Data1 = 0xFFFFFFFFu;
  const HRESULT result = CLSIDFromString(text.c_str(), &guid);
  if (result != S_OK) {
    DEX_FUZZ_CHECK(result == CO_E_CLASSSTRING);
    DEX_FUZZ_CHECK(guid == GUID{});
    return false;
  }
  wchar_t printed[kGuidTextLength + 1] = {};
  DEX_FUZZ_CHECK(StringFromGUID2(guid, printed, kGuidTextLength + 1) == kGuidTextLength + 1);
  DEX_FUZZ_CHECK(std::wstring(printed) == upper(text.substr(0, text.find(L'\0'))));

  wchar_t* allocated = nullptr;
  DEX_FUZZ_CHECK(StringFromCLSID(guid, &allocated) == S_OK && allocated != nullptr);
  DEX_FUZZ_CHECK(std::wstring(allocated) == printed);
  CoTaskMemFree(allocated);
  return true;
}

void compareIds(const std::wstring& a, const std::wstring& b) {
  GUID guidA{};
  GUID guidB{};
  const bool parsedA = readGuidText(a, guidA);
  const bool parsedB = readGuidText(b, guidB);
  const wchar_t* textA = a.c_str();
  const wchar_t* textB = b.c_str();
  const wchar_t* none = nullptr;
  DEX_FUZZ_CHECK(vyn::ie::format_id::isFormatIdEqual(textA, textB) == (parsedA && parsedB && guidA == guidB));
  DEX_FUZZ_CHECK(vyn::ie::format_id::isFormatIdEqual(textA, textA) == parsedA);
  DEX_FUZZ_CHECK(!vyn::ie::format_id::isFormatIdEqual(textA, none));
  DEX_FUZZ_CHECK(!vyn::ie::format_id::isFormatIdEqual(none, textB));
}

// The built-in registry finds a format by the text exactly when the text parses to its GUID.
void lookUp(const std::wstring& text) {
  const vyn::ie::DexFormatsData& registry = vyn::ie::getIEFormatsData();
  GUID guid{};
  const bool parsed = readGuidText(text, guid);
  const DexFormat* found = registry.getFormatById(text.c_str());
  DEX_FUZZ_CHECK(found == (parsed ? registry.getFormatByGuid(guid) : nullptr));
  const unsigned index = registry.getIndexFormatById(text.c_str());
  if (found != nullptr) {
    DEX_FUZZ_CHECK(found->isIdEqual(text.c_str()));
    DEX_FUZZ_CHECK(registry.getFormatByIndex(index) == found);
  } else {
    DEX_FUZZ_CHECK(index == 0);
  }
  // Every format answers isIdEqual as the comparison of the parsed GUIDs.
  const DexFormat* first = registry.getFormatByIndex(0);
  DEX_FUZZ_CHECK(first->isIdEqual(text.c_str()) == (parsed && guid == first->getGuid()));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::FuzzInput input(data, size);
  const std::wstring a = dex_fuzz::decodeLenientUtf8(input.takeUntil('\n'));
  const std::wstring b = dex_fuzz::decodeLenientUtf8(input.takeRest());
  compareIds(a, b);
  lookUp(a);
  return 0;
}
