#include "hostlibs/VynString.h"

#include <algorithm>
#include <cwchar>
#include <cwctype>
#include <vector>

#include "hostlibs/detail/CLocale.h"
#include "hostlibs/detail/Utf.h"

namespace vyn_text {
namespace {

using String = CVynStringT<wchar_t>;

constexpr std::wstring_view kWhiteSpace = L" \t\n\v\f\r";

std::wstring_view viewOf(const wchar_t* text) noexcept {
  return text == nullptr ? std::wstring_view() : std::wstring_view(text);
}

int toInt(std::size_t value) noexcept {
  return static_cast<int>(value);
}

// Clamps an index into [0, size].
std::size_t clampIndex(int index, std::size_t size) noexcept {
  if (index <= 0) return 0;
  return std::min(static_cast<std::size_t>(index), size);
}

wchar_t foldCase(wchar_t ch) noexcept {
  return static_cast<wchar_t>(towlower_l(ch, detail::numericLocale()));
}

int compareFolded(std::wstring_view a, std::wstring_view b) noexcept {
  const std::size_t common = std::min(a.size(), b.size());
  for (std::size_t i = 0; i < common; ++i) {
    const wchar_t left = foldCase(a[i]);
    const wchar_t right = foldCase(b[i]);
    if (left != right) return left < right ? -1 : 1;
  }
  if (a.size() == b.size()) return 0;
  return a.size() < b.size() ? -1 : 1;
}

// Renders a printf-style format into out; false when the format cannot be rendered.
bool renderFormat(std::wstring& out, const wchar_t* format, va_list arguments) {
  if (format == nullptr) return false;
  constexpr std::size_t kLargestText = std::size_t{1} << 24;
  const detail::CLocaleScope cLocale;
  std::vector<wchar_t> buffer(256);
  while (true) {
    va_list copy;
    va_copy(copy, arguments);
    // NOLINTNEXTLINE(clang-analyzer-valist.Uninitialized): copy is initialised by va_copy above
    const int written = std::vswprintf(buffer.data(), buffer.size(), format, copy);
    va_end(copy);
    if (written >= 0) {
      out.append(buffer.data(), static_cast<std::size_t>(written));
      return true;
    }
    // vswprintf cannot tell a short buffer from a bad conversion: grow up to a bound, then give up.
    if (buffer.size() >= kLargestText) return false;
    buffer.resize(buffer.size() * 4);
  }
}

std::size_t firstNotOf(std::wstring_view text, std::wstring_view targets) {
  const std::size_t found = text.find_first_not_of(targets);
  return found == std::wstring_view::npos ? text.size() : found;
}

std::size_t endAfterLastNotOf(std::wstring_view text, std::wstring_view targets) {
  const std::size_t found = text.find_last_not_of(targets);
  return found == std::wstring_view::npos ? 0 : found + 1;
}

}  // namespace

String::CVynStringT() noexcept = default;
String::CVynStringT(const wchar_t* text) : text_(viewOf(text)) {}
String::CVynStringT(const wchar_t* text, int length) {
  if (text != nullptr && length > 0) text_.assign(text, static_cast<std::size_t>(length));
}
String::CVynStringT(wchar_t ch, int count) {
  if (count > 0) text_.assign(static_cast<std::size_t>(count), ch);
}
String::CVynStringT(const char* text, unsigned codePage) {
  if (text == nullptr) return;
  const std::string_view bytes(text);
  text_ = codePage == CP_WINDOWS_1252 ? detail::fromCp1252(bytes) : detail::fromUtf8(bytes);
}
String::CVynStringT(std::wstring_view text) : text_(text) {}
String::CVynStringT(const CVynStringT& other) = default;
String::CVynStringT(CVynStringT&& other) noexcept = default;
String::~CVynStringT() = default;

String& String::operator=(const CVynStringT& other) = default;
String& String::operator=(CVynStringT&& other) noexcept = default;
String& String::operator=(const wchar_t* text) {
  // The argument may point into this text.
  std::wstring copy(viewOf(text));
  text_.swap(copy);
  return *this;
}
String& String::operator=(wchar_t ch) {
  text_.assign(1, ch);
  return *this;
}
String& String::operator+=(const CVynStringT& text) {
  text_ += text.text_;
  return *this;
}
String& String::operator+=(const wchar_t* text) {
  const std::wstring copy(viewOf(text));
  text_ += copy;
  return *this;
}
String& String::operator+=(wchar_t ch) {
  text_.push_back(ch);
  return *this;
}

int String::GetLength() const noexcept {
  return toInt(text_.size());
}
bool String::IsEmpty() const noexcept {
  return text_.empty();
}
void String::Empty() noexcept {
  text_.clear();
}

wchar_t String::GetAt(int index) const noexcept {
  return index >= 0 && static_cast<std::size_t>(index) < text_.size() ? text_[static_cast<std::size_t>(index)]
                                                                      : L'\0';
}
wchar_t String::operator[](int index) const noexcept {
  return GetAt(index);
}
void String::SetAt(int index, wchar_t ch) noexcept {
  if (index >= 0 && static_cast<std::size_t>(index) < text_.size())
    text_[static_cast<std::size_t>(index)] = ch;
}
const wchar_t* String::GetString() const noexcept {
  return text_.c_str();
}
String::operator const wchar_t*() const noexcept {
  return text_.c_str();
}
std::wstring_view String::view() const noexcept {
  return text_;
}

wchar_t* String::GetBuffer(int minLength) {
  if (minLength > 0 && static_cast<std::size_t>(minLength) > text_.size()) {
    text_.resize(static_cast<std::size_t>(minLength));
  }
  return text_.data();
}
void String::ReleaseBuffer(int newLength) {
  const std::size_t length = newLength < 0 ? std::wcslen(text_.c_str()) : clampIndex(newLength, text_.size());
  text_.resize(length);
}

int String::Compare(const wchar_t* text) const noexcept {
  const int order = view().compare(viewOf(text));
  return order < 0 ? -1 : (order > 0 ? 1 : 0);
}
int String::CompareNoCase(const wchar_t* text) const noexcept {
  return compareFolded(view(), viewOf(text));
}

int String::Insert(int index, wchar_t ch) {
  text_.insert(clampIndex(index, text_.size()), 1, ch);
  return GetLength();
}
int String::Insert(int index, const wchar_t* text) {
  const std::wstring copy(viewOf(text));
  text_.insert(clampIndex(index, text_.size()), copy);
  return GetLength();
}
int String::Delete(int index, int count) {
  if (index >= 0 && count > 0 && static_cast<std::size_t>(index) < text_.size()) {
    text_.erase(static_cast<std::size_t>(index), static_cast<std::size_t>(count));
  }
  return GetLength();
}
int String::Remove(wchar_t ch) {
  const auto removed = std::erase(text_, ch);
  return toInt(removed);
}
int String::Replace(wchar_t oldChar, wchar_t newChar) {
  int changes = 0;
  for (wchar_t& ch : text_) {
    if (ch == oldChar) {
      ch = newChar;
      ++changes;
    }
  }
  return changes;
}
int String::Replace(const wchar_t* oldText, const wchar_t* newText) {
  const std::wstring from(viewOf(oldText));
  const std::wstring to(viewOf(newText));
  if (from.empty()) return 0;
  int changes = 0;
  std::wstring result;
  std::size_t position = 0;
  for (std::size_t found = text_.find(from); found != std::wstring::npos;
       found = text_.find(from, position)) {
    result.append(text_, position, found - position);
    result += to;
    position = found + from.size();
    ++changes;
  }
  if (changes > 0) {
    result.append(text_, position, std::wstring::npos);
    text_.swap(result);
  }
  return changes;
}

int String::Find(wchar_t ch, int start) const noexcept {
  if (start < 0 || static_cast<std::size_t>(start) >= text_.size()) return -1;
  const std::size_t found = text_.find(ch, static_cast<std::size_t>(start));
  return found == std::wstring::npos ? -1 : toInt(found);
}
int String::Find(const wchar_t* text, int start) const noexcept {
  if (text == nullptr || start < 0 || static_cast<std::size_t>(start) > text_.size()) return -1;
  const std::size_t found = text_.find(text, static_cast<std::size_t>(start));
  return found == std::wstring::npos ? -1 : toInt(found);
}
int String::FindOneOf(const wchar_t* characters) const noexcept {
  const std::wstring_view set = viewOf(characters);
  if (set.empty()) return -1;
  const std::size_t found = text_.find_first_of(set);
  return found == std::wstring::npos ? -1 : toInt(found);
}
int String::ReverseFind(wchar_t ch) const noexcept {
  const std::size_t found = text_.rfind(ch);
  return found == std::wstring::npos ? -1 : toInt(found);
}

String String::Mid(int first) const {
  return Mid(first, GetLength());
}
String String::Mid(int first, int count) const {
  const std::size_t begin = clampIndex(first, text_.size());
  if (count <= 0) return {};
  return String(view().substr(begin, static_cast<std::size_t>(count)));
}
String String::Left(int count) const {
  return count <= 0 ? String() : String(view().substr(0, clampIndex(count, text_.size())));
}
String String::Right(int count) const {
  const std::size_t length = clampIndex(count, text_.size());
  return String(view().substr(text_.size() - length));
}

String String::Tokenize(const wchar_t* delimiters, int& start) const {
  if (start < 0 || static_cast<std::size_t>(start) > text_.size()) {
    start = -1;
    return {};
  }
  const std::wstring_view set = viewOf(delimiters);
  const std::wstring_view text = view();
  if (set.empty()) {
    // MFC answers the rest of the text when no delimiter is given.
    if (static_cast<std::size_t>(start) < text.size()) {
      String rest(text.substr(static_cast<std::size_t>(start)));
      start = GetLength();
      return rest;
    }
    start = -1;
    return {};
  }
  const std::size_t begin = text.find_first_not_of(set, static_cast<std::size_t>(start));
  if (begin == std::wstring_view::npos) {
    start = -1;
    return {};
  }
  std::size_t end = text.find_first_of(set, begin);
  if (end == std::wstring_view::npos) end = text.size();
  start = toInt(end == text.size() ? end : end + 1);
  return String(text.substr(begin, end - begin));
}

String& String::Trim() {
  return TrimRight().TrimLeft();
}
String& String::Trim(wchar_t target) {
  return TrimRight(target).TrimLeft(target);
}
String& String::Trim(const wchar_t* targets) {
  return TrimRight(targets).TrimLeft(targets);
}
String& String::TrimLeft() {
  text_.erase(0, firstNotOf(text_, kWhiteSpace));
  return *this;
}
String& String::TrimLeft(wchar_t target) {
  text_.erase(0, firstNotOf(text_, std::wstring_view(&target, 1)));
  return *this;
}
String& String::TrimLeft(const wchar_t* targets) {
  const std::wstring copy(viewOf(targets));
  if (!copy.empty()) text_.erase(0, firstNotOf(text_, copy));
  return *this;
}
String& String::TrimRight() {
  text_.resize(endAfterLastNotOf(text_, kWhiteSpace));
  return *this;
}
String& String::TrimRight(wchar_t target) {
  text_.resize(endAfterLastNotOf(text_, std::wstring_view(&target, 1)));
  return *this;
}
String& String::TrimRight(const wchar_t* targets) {
  const std::wstring copy(viewOf(targets));
  if (!copy.empty()) text_.resize(endAfterLastNotOf(text_, copy));
  return *this;
}
String& String::MakeUpper() {
  for (wchar_t& ch : text_)
    ch = static_cast<wchar_t>(towupper_l(ch, detail::numericLocale()));
  return *this;
}
String& String::MakeLower() {
  for (wchar_t& ch : text_)
    ch = foldCase(ch);
  return *this;
}
String& String::MakeReverse() {
  std::reverse(text_.begin(), text_.end());
  return *this;
}

void String::Format(const wchar_t* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  FormatV(format, arguments);
  va_end(arguments);
}
void String::AppendFormat(const wchar_t* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  AppendFormatV(format, arguments);
  va_end(arguments);
}
void String::FormatV(const wchar_t* format, va_list arguments) {
  std::wstring rendered;
  if (!renderFormat(rendered, format, arguments)) rendered.clear();
  text_.swap(rendered);
}
void String::AppendFormatV(const wchar_t* format, va_list arguments) {
  std::wstring rendered;
  if (renderFormat(rendered, format, arguments)) text_ += rendered;
}

String operator+(const String& left, const String& right) {
  String result(left);
  result += right;
  return result;
}
String operator+(const String& left, const wchar_t* right) {
  String result(left);
  result += right;
  return result;
}
String operator+(const wchar_t* left, const String& right) {
  String result(left);
  result += right;
  return result;
}
String operator+(const String& left, wchar_t right) {
  String result(left);
  result += right;
  return result;
}
String operator+(wchar_t left, const String& right) {
  String result(left);
  result += right;
  return result;
}

std::string toUtf8(const wchar_t* text) {
  return detail::toUtf8(viewOf(text));
}
std::string toUtf8(std::wstring_view text) {
  return detail::toUtf8(text);
}

}  // namespace vyn_text
