#include "ieUtils/IEUtilsNames.h"

#include <algorithm>
#include <string>
#include <string_view>

namespace vyn::ie::utils {

namespace {

using String = CVynStringT<wchar_t>;

bool holds(std::wstring_view characters, wchar_t ch) {
  return characters.find(ch) != std::wstring_view::npos;
}

bool isDigit(wchar_t ch) {
  return ch >= L'0' && ch <= L'9';
}

bool hasLengthWithin(const String& text, int maxLength) {
  return text.GetLength() >= 1 && text.GetLength() <= maxLength;
}

template <class Predicate>
bool allCharactersAre(const String& text, Predicate admissible) {
  const std::wstring_view characters = text.view();
  return std::all_of(characters.begin(), characters.end(), admissible);
}

// A number text: its first character may also be one of signs, every other one is accepted by body.
template <class Predicate>
bool isNumberText(const String& text, std::wstring_view signs, Predicate body) {
  if (!hasLengthWithin(text, kMaxNumberLength)) return false;
  const std::wstring_view characters = text.view();
  return (holds(signs, characters.front()) || body(characters.front())) &&
         std::all_of(characters.begin() + 1, characters.end(), body);
}

wchar_t codeNameReplacement(wchar_t ch) {
  return ch == L'\t' ? L' ' : L'_';
}

}  // namespace

bool isAdmissibleCodeNameCharacter(wchar_t ch) {
  return !holds(kCodeNameForbiddenCharacters, ch);
}

bool isAdmissibleObjectNameCharacter(wchar_t ch) {
  return !holds(kObjectNameForbiddenCharacters, ch);
}

bool isAdmissiblePointNameCharacter(wchar_t ch) {
  return ch != L' ' && isAdmissibleObjectNameCharacter(ch);
}

bool isValidName(const String& name) {
  return hasLengthWithin(name, kMaxNameLength) && allCharactersAre(name, isAdmissiblePointNameCharacter);
}

bool isValidCodeName(const String& name) {
  return hasLengthWithin(name, kMaxNameLength) && allCharactersAre(name, isAdmissibleCodeNameCharacter);
}

bool checkName(const String& name) {
  return allCharactersAre(name, isAdmissibleCodeNameCharacter);
}

bool correctCodeName(const String& in, String& out) {
  std::wstring corrected;
  corrected.reserve(static_cast<std::size_t>(in.GetLength()));
  for (const wchar_t ch : in.view()) {
    if (ch == L'\r' || ch == L'\n') continue;
    corrected.push_back(isAdmissibleCodeNameCharacter(ch) ? ch : codeNameReplacement(ch));
  }
  const String candidate{std::wstring_view(corrected)};
  if (!isValidCodeName(candidate)) return false;
  out = candidate;
  return true;
}

bool isValidInteger(const String& text) {
  return isNumberText(text, L"-", isDigit);
}

bool isValidDecimalNumber(const String& text) {
  return isNumberText(text, L"-+", [](wchar_t ch) { return isDigit(ch) || ch == L'.' || ch == L','; });
}

}  // namespace vyn::ie::utils
