#include "hostlibs/VynString.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cwchar>
#include <cwctype>
#include <new>
#include <utility>
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

// Trimming deletes in place; an empty set of targets trims nothing.
String& trimLeftOf(String& text, std::wstring_view targets) {
  if (targets.empty()) return text;
  const std::size_t first = firstNotOf(text.view(), targets);
  if (first > 0) text.Delete(0, toInt(first));
  return text;
}
String& trimRightOf(String& text, std::wstring_view targets) {
  if (targets.empty()) return text;
  const std::size_t end = endAfterLastNotOf(text.view(), targets);
  const std::size_t size = text.view().size();
  if (end < size) text.Delete(toInt(end), toInt(size - end));
  return text;
}

}  // namespace

// A block: the header, then capacity + 1 characters (the last one always a terminator). A capacity of
// 0 marks a shared read-only block of the one-character table.
struct String::Header {
  std::uint32_t length;
  std::uint32_t capacity;
};

namespace {

// The one-character ASCII texts: every occurrence shares its block, so that single-letter codes and
// code strings cost no allocation. Laid out as a Header followed by the characters.
struct SharedCharacter {
  std::uint32_t length;
  std::uint32_t capacity;
  wchar_t chars[2];  // NOLINT(modernize-avoid-c-arrays): the characters of a block
};
static_assert(offsetof(SharedCharacter, chars) == 2 * sizeof(std::uint32_t));

constexpr std::size_t kSharedCharacters = 128;

constexpr std::array<SharedCharacter, kSharedCharacters> makeSharedCharacters() {
  std::array<SharedCharacter, kSharedCharacters> table{};
  for (std::size_t ch = 1; ch < kSharedCharacters; ++ch)
    table[ch] = {1, 0, {static_cast<wchar_t>(ch), L'\0'}};
  return table;
}

// Never written (a capacity of 0 forbids it), but not const: the string's character pointer is not.
// NOLINTNEXTLINE(cppcoreguidelines-avoid-non-const-global-variables,cert-err58-cpp): constant-initialised
constinit std::array<SharedCharacter, kSharedCharacters> sharedCharacters = makeSharedCharacters();

wchar_t* sharedBlockFor(std::wstring_view text) noexcept {
  if (text.size() != 1) return nullptr;
  const wchar_t ch = text[0];
  if (ch <= L'\0' || ch >= static_cast<wchar_t>(kSharedCharacters)) return nullptr;
  return sharedCharacters[static_cast<unsigned char>(ch)].chars;
}

// A block of the host allocator for capacity characters; throws std::bad_alloc like the standard
// strings. The block is released from its characters (String::release).
wchar_t* allocateBlock(std::size_t capacity) {
  if (capacity > 0x7fffffffU) throw std::bad_alloc();
  const std::size_t bytes = 2 * sizeof(std::uint32_t) + (capacity + 1) * sizeof(wchar_t);
  auto* block = static_cast<std::uint32_t*>(vyn_block_new(bytes));
  if (block == nullptr) throw std::bad_alloc();
  block[0] = 0;
  block[1] = static_cast<std::uint32_t>(capacity);
  auto* chars = reinterpret_cast<wchar_t*>(block + 2);
  chars[0] = L'\0';
  chars[capacity] = L'\0';
  return chars;
}

}  // namespace

String::Header* String::header() const noexcept {
  return reinterpret_cast<Header*>(reinterpret_cast<char*>(chars_) - sizeof(Header));
}
std::size_t String::length() const noexcept {
  return chars_ == nullptr ? 0 : header()->length;
}
void String::release() noexcept {
  if (chars_ != nullptr && header()->capacity > 0) vyn_block_delete(header());
  chars_ = nullptr;
}
void String::setLength(std::size_t newLength) noexcept {
  if (chars_ == nullptr) return;
  header()->length = static_cast<std::uint32_t>(newLength);
  chars_[newLength] = L'\0';
}

void String::reserveOwned(std::size_t capacity) {
  const std::size_t current = length();
  if (chars_ != nullptr && header()->capacity >= std::max<std::size_t>(capacity, 1)) return;
  wchar_t* const grown = allocateBlock(std::max({capacity, current, std::size_t{1}}));
  std::wmemcpy(grown, GetString(), current);
  release();
  chars_ = grown;
  setLength(current);
}
wchar_t* String::writableChars() {
  if (chars_ != nullptr && header()->capacity == 0) reserveOwned(length());
  return chars_;
}

void String::assign(std::wstring_view text) {
  if (text.empty()) {
    Empty();
    return;
  }
  // An owned block large enough is reused (text may lie inside it, hence the move).
  if (chars_ != nullptr && header()->capacity >= text.size()) {
    std::wmemmove(chars_, text.data(), text.size());
    setLength(text.size());
    return;
  }
  if (wchar_t* const shared = sharedBlockFor(text)) {
    release();
    chars_ = shared;
    return;
  }
  wchar_t* const fresh = allocateBlock(text.size());
  std::wmemcpy(fresh, text.data(), text.size());
  release();
  chars_ = fresh;
  setLength(text.size());
}
void String::append(std::wstring_view text) {
  if (text.empty()) return;
  const std::size_t current = length();
  const std::size_t needed = current + text.size();
  if (chars_ == nullptr) {
    assign(text);
    return;
  }
  if (header()->capacity < needed) {
    // The old block stays alive until text, which may lie in it, has been copied.
    wchar_t* const grown = allocateBlock(std::max(needed, std::size_t{2} * header()->capacity));
    std::wmemcpy(grown, chars_, current);
    std::wmemcpy(grown + current, text.data(), text.size());
    release();
    chars_ = grown;
  } else {
    std::wmemcpy(chars_ + current, text.data(), text.size());
  }
  setLength(needed);
}

String::CVynStringT() noexcept = default;
String::CVynStringT(const wchar_t* text) {
  assign(viewOf(text));
}
String::CVynStringT(const wchar_t* text, int length) {
  if (text != nullptr && length > 0) assign(std::wstring_view(text, static_cast<std::size_t>(length)));
}
String::CVynStringT(wchar_t ch, int count) {
  if (count <= 0) return;
  reserveOwned(static_cast<std::size_t>(count));
  std::wmemset(chars_, ch, static_cast<std::size_t>(count));
  setLength(static_cast<std::size_t>(count));
}
String::CVynStringT(const char* text, unsigned codePage) {
  if (text == nullptr) return;
  const std::string_view bytes(text);
  assign(codePage == CP_WINDOWS_1252 ? detail::fromCp1252(bytes) : detail::fromUtf8(bytes));
}
String::CVynStringT(std::wstring_view text) {
  assign(text);
}
String::CVynStringT(const CVynStringT& other) {
  assign(other.view());
}
String::CVynStringT(CVynStringT&& other) noexcept : chars_(std::exchange(other.chars_, nullptr)) {}
String::~CVynStringT() {
  release();
}

String& String::operator=(const CVynStringT& other) {
  if (this != &other) assign(other.view());
  return *this;
}
String& String::operator=(CVynStringT&& other) noexcept {
  if (this != &other) {
    release();
    chars_ = std::exchange(other.chars_, nullptr);
  }
  return *this;
}
String& String::operator=(const wchar_t* text) {
  assign(viewOf(text));
  return *this;
}
String& String::operator=(wchar_t ch) {
  assign(std::wstring_view(&ch, 1));
  return *this;
}
String& String::operator+=(const CVynStringT& text) {
  append(text.view());
  return *this;
}
String& String::operator+=(const wchar_t* text) {
  append(viewOf(text));
  return *this;
}
String& String::operator+=(wchar_t ch) {
  append(std::wstring_view(&ch, 1));
  return *this;
}

int String::GetLength() const noexcept {
  return toInt(length());
}
bool String::IsEmpty() const noexcept {
  return length() == 0;
}
// Keeps an owned block for the next text, as a reused line buffer wants.
void String::Empty() noexcept {
  if (chars_ != nullptr && header()->capacity > 0) {
    setLength(0);
  } else {
    chars_ = nullptr;
  }
}

wchar_t String::GetAt(int index) const noexcept {
  return index >= 0 && static_cast<std::size_t>(index) < length() ? chars_[index] : L'\0';
}
wchar_t String::operator[](int index) const noexcept {
  return GetAt(index);
}
void String::SetAt(int index, wchar_t ch) noexcept {
  if (index < 0 || static_cast<std::size_t>(index) >= length()) return;
  if (header()->capacity == 0) {
    // A shared character becomes a text of its own, or the shared one for the new character.
    assign(std::wstring_view(&ch, 1));
    return;
  }
  chars_[index] = ch;
}
const wchar_t* String::GetString() const noexcept {
  return chars_ == nullptr ? L"" : chars_;
}
String::operator const wchar_t*() const noexcept {
  return GetString();
}
std::wstring_view String::view() const noexcept {
  return {GetString(), length()};
}

wchar_t* String::GetBuffer(int minLength) {
  const std::size_t current = length();
  const std::size_t wanted = minLength > 0 ? static_cast<std::size_t>(minLength) : 0;
  reserveOwned(std::max(current, wanted));
  if (wanted > current) {
    std::wmemset(chars_ + current, L'\0', wanted - current);
    setLength(wanted);
  }
  return chars_;
}
void String::ReleaseBuffer(int newLength) {
  if (writableChars() == nullptr) return;
  const std::size_t current = length();
  const std::size_t kept = newLength < 0 ? std::wcslen(chars_) : clampIndex(newLength, current);
  setLength(std::min(kept, current));
}

int String::Compare(const wchar_t* text) const noexcept {
  const int order = view().compare(viewOf(text));
  return order < 0 ? -1 : (order > 0 ? 1 : 0);
}
int String::CompareNoCase(const wchar_t* text) const noexcept {
  return compareFolded(view(), viewOf(text));
}

// The rarer edits rebuild the text; the frequent ones (trimming, case, Replace of a character) work in
// place.
int String::Insert(int index, wchar_t ch) {
  std::wstring edited(view());
  edited.insert(clampIndex(index, edited.size()), 1, ch);
  assign(edited);
  return GetLength();
}
int String::Insert(int index, const wchar_t* text) {
  std::wstring edited(view());
  edited.insert(clampIndex(index, edited.size()), viewOf(text));
  assign(edited);
  return GetLength();
}
int String::Delete(int index, int count) {
  const std::size_t size = length();
  if (index < 0 || count <= 0 || static_cast<std::size_t>(index) >= size) return GetLength();
  const auto first = static_cast<std::size_t>(index);
  const std::size_t removed = std::min(static_cast<std::size_t>(count), size - first);
  wchar_t* const chars = writableChars();
  std::wmemmove(chars + first, chars + first + removed, size - first - removed);
  setLength(size - removed);
  return GetLength();
}
int String::Remove(wchar_t ch) {
  const std::size_t size = length();
  if (view().find(ch) == std::wstring_view::npos) return 0;
  wchar_t* const chars = writableChars();
  const std::size_t kept = static_cast<std::size_t>(std::remove(chars, chars + size, ch) - chars);
  setLength(kept);
  return toInt(size - kept);
}
int String::Replace(wchar_t oldChar, wchar_t newChar) {
  const auto changes = static_cast<int>(std::count(view().begin(), view().end(), oldChar));
  if (changes == 0 || oldChar == newChar) return changes;
  wchar_t* const chars = writableChars();
  std::replace(chars, chars + length(), oldChar, newChar);
  return changes;
}
int String::Replace(const wchar_t* oldText, const wchar_t* newText) {
  const std::wstring from(viewOf(oldText));
  const std::wstring to(viewOf(newText));
  if (from.empty()) return 0;
  const std::wstring_view text = view();
  int changes = 0;
  std::wstring result;
  std::size_t position = 0;
  for (std::size_t found = text.find(from); found != std::wstring_view::npos;
       found = text.find(from, position)) {
    result.append(text.substr(position, found - position));
    result += to;
    position = found + from.size();
    ++changes;
  }
  if (changes > 0) {
    result.append(text.substr(position));
    assign(result);
  }
  return changes;
}

int String::Find(wchar_t ch, int start) const noexcept {
  if (start < 0 || static_cast<std::size_t>(start) >= length()) return -1;
  const std::size_t found = view().find(ch, static_cast<std::size_t>(start));
  return found == std::wstring_view::npos ? -1 : toInt(found);
}
int String::Find(const wchar_t* text, int start) const noexcept {
  if (text == nullptr || start < 0 || static_cast<std::size_t>(start) > length()) return -1;
  const std::size_t found = view().find(text, static_cast<std::size_t>(start));
  return found == std::wstring_view::npos ? -1 : toInt(found);
}
int String::FindOneOf(const wchar_t* characters) const noexcept {
  const std::wstring_view set = viewOf(characters);
  if (set.empty()) return -1;
  const std::size_t found = view().find_first_of(set);
  return found == std::wstring_view::npos ? -1 : toInt(found);
}
int String::ReverseFind(wchar_t ch) const noexcept {
  const std::size_t found = view().rfind(ch);
  return found == std::wstring_view::npos ? -1 : toInt(found);
}

String String::Mid(int first) const {
  return Mid(first, GetLength());
}
String String::Mid(int first, int count) const {
  const std::size_t begin = clampIndex(first, length());
  if (count <= 0) return {};
  return String(view().substr(begin, static_cast<std::size_t>(count)));
}
String String::Left(int count) const {
  return count <= 0 ? String() : String(view().substr(0, clampIndex(count, length())));
}
String String::Right(int count) const {
  const std::size_t kept = clampIndex(count, length());
  return String(view().substr(length() - kept));
}

String String::Tokenize(const wchar_t* delimiters, int& start) const {
  if (start < 0 || static_cast<std::size_t>(start) > length()) {
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
  return trimLeftOf(*this, kWhiteSpace);
}
String& String::TrimLeft(wchar_t target) {
  return trimLeftOf(*this, std::wstring_view(&target, 1));
}
String& String::TrimLeft(const wchar_t* targets) {
  return trimLeftOf(*this, viewOf(targets));
}
String& String::TrimRight() {
  return trimRightOf(*this, kWhiteSpace);
}
String& String::TrimRight(wchar_t target) {
  return trimRightOf(*this, std::wstring_view(&target, 1));
}
String& String::TrimRight(const wchar_t* targets) {
  return trimRightOf(*this, viewOf(targets));
}
String& String::MakeUpper() {
  wchar_t* const chars = writableChars();
  for (std::size_t i = 0; i < length(); ++i)
    chars[i] = static_cast<wchar_t>(towupper_l(chars[i], detail::numericLocale()));
  return *this;
}
String& String::MakeLower() {
  wchar_t* const chars = writableChars();
  for (std::size_t i = 0; i < length(); ++i)
    chars[i] = foldCase(chars[i]);
  return *this;
}
String& String::MakeReverse() {
  wchar_t* const chars = writableChars();
  if (chars != nullptr) std::reverse(chars, chars + length());
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
  assign(rendered);
}
void String::AppendFormatV(const wchar_t* format, va_list arguments) {
  std::wstring rendered;
  if (renderFormat(rendered, format, arguments)) append(rendered);
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
void appendUtf8(std::string& out, std::wstring_view text) {
  // The texts of survey files are mostly ASCII: its runs are copied, not encoded one by one.
  const auto isAscii = [](wchar_t ch) { return ch >= 0 && ch < 0x80; };
  auto next = text.begin();
  while (next != text.end()) {
    const auto asciiEnd = std::find_if_not(next, text.end(), isAscii);
    const std::size_t start = out.size();
    out.resize(start + static_cast<std::size_t>(asciiEnd - next));
    std::transform(next, asciiEnd, out.begin() + static_cast<std::ptrdiff_t>(start),
                   [](wchar_t ch) { return static_cast<char>(ch); });
    if (asciiEnd == text.end()) break;
    detail::appendUtf8(out, *asciiEnd);
    next = asciiEnd + 1;
  }
}

}  // namespace vyn_text
