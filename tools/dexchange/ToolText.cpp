#include "ToolText.h"

#include <algorithm>
#include <cctype>
#include <charconv>

namespace dexchange_tool {

std::string utf8(const CVynStringT<wchar_t>& text) {
  return vyn_text::toUtf8(text.view());
}

std::string utf8(std::wstring_view text) {
  return vyn_text::toUtf8(text);
}

CVynStringT<wchar_t> wide(const std::string& text) {
  return CVynStringT<wchar_t>(text.c_str(), vyn_text::CP_UTF8);
}

std::string lowerCase(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(),
                 [](unsigned char ch) { return static_cast<char>(std::tolower(ch)); });
  return text;
}

std::vector<std::string> commaItems(const std::string& list) {
  std::vector<std::string> items;
  std::size_t start = 0;
  while (start <= list.size()) {
    const std::size_t comma = std::min(list.find(',', start), list.size());
    items.push_back(list.substr(start, comma - start));
    start = comma + 1;
  }
  return items;
}

std::string fixed3(double value) {
  char text[64];
  const auto end = std::to_chars(text, text + sizeof text, value, std::chars_format::fixed, 3).ptr;
  return std::string(text, end);
}

}  // namespace dexchange_tool
