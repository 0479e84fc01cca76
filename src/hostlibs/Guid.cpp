#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <cwchar>

#include "hostlibs/winport.h"

namespace {

constexpr int kGuidTextLength = 38;
// Offsets of the hyphens in "{XXXXXXXX-XXXX-XXXX-XXXX-XXXXXXXXXXXX}".
constexpr int kHyphens[] = {9, 14, 19, 24};

int hexValue(wchar_t ch) {
  if (ch >= L'0' && ch <= L'9') return ch - L'0';
  if (ch >= L'a' && ch <= L'f') return ch - L'a' + 10;
  if (ch >= L'A' && ch <= L'F') return ch - L'A' + 10;
  return -1;
}

bool isHyphenPosition(int index) {
  for (const int hyphen : kHyphens) {
    if (index == hyphen) return true;
  }
  return false;
}

// Reads the 32 hexadecimal digits of a braced GUID text into 16 bytes, in text order.
bool readDigits(const wchar_t* text, std::uint8_t (&bytes)[16]) {
  if (std::wcslen(text) != kGuidTextLength || text[0] != L'{' || text[kGuidTextLength - 1] != L'}')
    return false;
  int nibble = 0;
  for (int i = 1; i < kGuidTextLength - 1; ++i) {
    if (isHyphenPosition(i)) {
      if (text[i] != L'-') return false;
      continue;
    }
    const int value = hexValue(text[i]);
    if (value < 0) return false;
    bytes[nibble / 2] = static_cast<std::uint8_t>((bytes[nibble / 2] << 4) | value);
    ++nibble;
  }
  return nibble == 32;
}

}  // namespace

bool operator==(const GUID& a, const GUID& b) noexcept {
  return a.Data1 == b.Data1 && a.Data2 == b.Data2 && a.Data3 == b.Data3 &&
         std::memcmp(a.Data4, b.Data4, sizeof a.Data4) == 0;
}

HRESULT CLSIDFromString(const wchar_t* text, CLSID* guid) {
  if (guid == nullptr) return E_INVALIDARG;
  *guid = GUID{};
  std::uint8_t bytes[16] = {};
  if (text == nullptr || !readDigits(text, bytes)) return CO_E_CLASSSTRING;
  guid->Data1 = (std::uint32_t{bytes[0]} << 24) | (std::uint32_t{bytes[1]} << 16) |
                (std::uint32_t{bytes[2]} << 8) | bytes[3];
  guid->Data2 = static_cast<std::uint16_t>((bytes[4] << 8) | bytes[5]);
  guid->Data3 = static_cast<std::uint16_t>((bytes[6] << 8) | bytes[7]);
  std::memcpy(guid->Data4, bytes + 8, sizeof guid->Data4);
  return S_OK;
}

int StringFromGUID2(const GUID& guid, wchar_t* buffer, int size) {
  if (buffer == nullptr || size < kGuidTextLength + 1) return 0;
  std::swprintf(buffer, static_cast<std::size_t>(size), L"{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}",
                static_cast<unsigned>(guid.Data1), unsigned{guid.Data2}, unsigned{guid.Data3},
                unsigned{guid.Data4[0]}, unsigned{guid.Data4[1]}, unsigned{guid.Data4[2]},
                unsigned{guid.Data4[3]}, unsigned{guid.Data4[4]}, unsigned{guid.Data4[5]},
                unsigned{guid.Data4[6]}, unsigned{guid.Data4[7]});
  return kGuidTextLength + 1;
}

HRESULT StringFromCLSID(const CLSID& guid, wchar_t** text) {
  if (text == nullptr) return E_INVALIDARG;
  *text = static_cast<wchar_t*>(std::malloc(sizeof(wchar_t) * (kGuidTextLength + 1)));
  if (*text == nullptr) return E_INVALIDARG;
  StringFromGUID2(guid, *text, kGuidTextLength + 1);
  return S_OK;
}

void CoTaskMemFree(void* block) {
  std::free(block);
}
