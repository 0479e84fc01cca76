// GUID texts. The input, in lenient UTF-8, is read as a GUID text; whatever parses must print back as
// the same GUID in the braced upper-case form, and whatever does not must leave the GUID zeroed.

#include <cstddef>
#include <cstdint>
#include <string>

#include "hostlibs/winport.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/FuzzText.h"

namespace {

constexpr int kGuidTextLength = 38;

std::wstring upper(std::wstring text) {
  for (wchar_t& ch : text) {
    if (ch >= L'a' && ch <= L'f') ch = static_cast<wchar_t>(ch - L'a' + L'A');
  }
  return text;
}

void readGuidText(const std::wstring& text) {
  CLSID guid{};
  guid.Data1 = 0xFFFFFFFFu;
  const HRESULT result = CLSIDFromString(text.c_str(), &guid);
  if (result != S_OK) {
    DEX_FUZZ_CHECK(result == CO_E_CLASSSTRING);
    DEX_FUZZ_CHECK(guid == GUID{});
    return;
  }
  wchar_t printed[kGuidTextLength + 1] = {};
  DEX_FUZZ_CHECK(StringFromGUID2(guid, printed, kGuidTextLength + 1) == kGuidTextLength + 1);
  DEX_FUZZ_CHECK(std::wstring(printed) == upper(text.substr(0, text.find(L'\0'))));

  wchar_t* allocated = nullptr;
  DEX_FUZZ_CHECK(StringFromCLSID(guid, &allocated) == S_OK && allocated != nullptr);
  DEX_FUZZ_CHECK(std::wstring(allocated) == printed);
  CoTaskMemFree(allocated);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::FuzzInput input(data, size);
  const std::wstring text = dex_fuzz::decodeLenientUtf8(input.takeRest());
  readGuidText(text);
  return 0;
}
