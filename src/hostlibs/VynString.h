#pragma once

#include <cstdarg>
#include <cstddef>
#include <functional>
#include <string>
#include <string_view>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

namespace vyn_text {

// Code pages accepted by the narrow-text constructor. The ANSI page is UTF-8 on this platform.
enum ECodePage : unsigned {
  CP_ACP = 0,
  CP_UTF8 = 65001,
  CP_WINDOWS_1252 = 1252,
};

template <typename CharT>
class CVynStringT;

// The wide string of every interface: value semantics and the operations of an MFC string. One
// wchar_t holds one character (wchar_t is 32-bit here). Indexes are ints; an index outside the text
// never crashes: readers answer 0 or clamp, writers do nothing. Like the MFC string it is one pointer
// wide: the empty text holds no memory, one ASCII character is shared from a read-only table, and any
// other text owns one heap block (length, capacity and characters), so that the model's many mostly
// empty texts cost little.
template <>
class DEX_API CVynStringT<wchar_t> {
 public:
  VYN_CLASS_ALLOCATOR

  using XCHAR = wchar_t;
  using PCXSTR = const wchar_t*;

  // Construction. A null pointer gives the empty text.
  CVynStringT() noexcept;
  CVynStringT(const wchar_t* text);  // NOLINT(google-explicit-constructor): MFC-style conversion
  CVynStringT(const wchar_t* text, int length);
  CVynStringT(wchar_t ch, int count = 1);
  // Narrow text in a code page: 0 (ANSI) and 65001 are UTF-8, 1252 is Windows-1252; any other page is
  // read as UTF-8. Bytes that are not valid UTF-8 are taken as Latin-1 characters.
  CVynStringT(const char* text, unsigned codePage);
  explicit CVynStringT(std::wstring_view text);
  CVynStringT(const CVynStringT& other);
  CVynStringT(CVynStringT&& other) noexcept;
  ~CVynStringT();

  // Assignment and concatenation.
  CVynStringT& operator=(const CVynStringT& other);
  CVynStringT& operator=(CVynStringT&& other) noexcept;
  CVynStringT& operator=(const wchar_t* text);
  CVynStringT& operator=(wchar_t ch);
  CVynStringT& operator+=(const CVynStringT& text);
  CVynStringT& operator+=(const wchar_t* text);
  CVynStringT& operator+=(wchar_t ch);

  // Size and access.
  int GetLength() const noexcept;
  bool IsEmpty() const noexcept;
  void Empty() noexcept;                         // keeps the memory for the next text
  wchar_t GetAt(int index) const noexcept;       // 0 outside the text
  wchar_t operator[](int index) const noexcept;  // as GetAt
  void SetAt(int index, wchar_t ch) noexcept;    // ignored outside the text
  const wchar_t* GetString() const noexcept;     // never null
  operator const wchar_t*() const noexcept;      // NOLINT(google-explicit-constructor)
  std::wstring_view view() const noexcept;
  // Direct access for C-style writers: at least minLength characters (plus a terminator) are
  // writable; ReleaseBuffer(-1) then takes the length up to the first zero.
  wchar_t* GetBuffer(int minLength = 0);
  void ReleaseBuffer(int newLength = -1);

  // Comparison: negative, 0 or positive. CompareNoCase folds case by Unicode simple lower case.
  int Compare(const wchar_t* text) const noexcept;
  int CompareNoCase(const wchar_t* text) const noexcept;

  // Editing. Each returns the new length (Insert, Delete) or the number of changes (Remove, Replace).
  // An index before the text counts as 0, one past its end as its end.
  int Insert(int index, wchar_t ch);
  int Insert(int index, const wchar_t* text);
  int Delete(int index, int count = 1);
  int Remove(wchar_t ch);
  int Replace(wchar_t oldChar, wchar_t newChar);
  int Replace(const wchar_t* oldText, const wchar_t* newText);  // an empty oldText changes nothing

  // Searching: the index found, or -1. A start outside the text finds nothing.
  int Find(wchar_t ch, int start = 0) const noexcept;
  int Find(const wchar_t* text, int start = 0) const noexcept;
  int FindOneOf(const wchar_t* characters) const noexcept;
  int ReverseFind(wchar_t ch) const noexcept;

  // Extraction; counts and indexes are clamped to the text.
  CVynStringT Mid(int first) const;
  CVynStringT Mid(int first, int count) const;
  CVynStringT Left(int count) const;
  CVynStringT Right(int count) const;
  // The next token after skipping delimiters, starting at start; start moves past the token. At the
  // end, start becomes -1 and the result is empty.
  CVynStringT Tokenize(const wchar_t* delimiters, int& start) const;

  // Trimming (white space by default) and case; each returns *this.
  CVynStringT& Trim();
  CVynStringT& Trim(wchar_t target);
  CVynStringT& Trim(const wchar_t* targets);
  CVynStringT& TrimLeft();
  CVynStringT& TrimLeft(wchar_t target);
  CVynStringT& TrimLeft(const wchar_t* targets);
  CVynStringT& TrimRight();
  CVynStringT& TrimRight(wchar_t target);
  CVynStringT& TrimRight(const wchar_t* targets);
  CVynStringT& MakeUpper();
  CVynStringT& MakeLower();
  CVynStringT& MakeReverse();

  // printf-style formatting with "." as the decimal separator whatever the process locale; use %ls
  // for wide texts and %s for UTF-8 ones. A format that cannot be rendered leaves the text empty.
  void Format(const wchar_t* format, ...);
  void AppendFormat(const wchar_t* format, ...);
  void FormatV(const wchar_t* format, va_list arguments);
  void AppendFormatV(const wchar_t* format, va_list arguments);

 private:
  struct Header;

  Header* header() const noexcept;
  std::size_t length() const noexcept;
  void assign(std::wstring_view text);
  void append(std::wstring_view text);
  // An owned block (never a shared one) of at least capacity characters, keeping the text.
  void reserveOwned(std::size_t capacity);
  // Characters that may be written in place; null for the empty text without block.
  wchar_t* writableChars();
  void setLength(std::size_t length) noexcept;
  void release() noexcept;

  // The characters of a block that starts with a Header; null for the empty text.
  wchar_t* chars_ = nullptr;
};

// Concatenation.
DEX_API CVynStringT<wchar_t> operator+(const CVynStringT<wchar_t>& left, const CVynStringT<wchar_t>& right);
DEX_API CVynStringT<wchar_t> operator+(const CVynStringT<wchar_t>& left, const wchar_t* right);
DEX_API CVynStringT<wchar_t> operator+(const wchar_t* left, const CVynStringT<wchar_t>& right);
DEX_API CVynStringT<wchar_t> operator+(const CVynStringT<wchar_t>& left, wchar_t right);
DEX_API CVynStringT<wchar_t> operator+(wchar_t left, const CVynStringT<wchar_t>& right);

// Exact, case-sensitive comparison.
inline bool operator==(const CVynStringT<wchar_t>& a, const CVynStringT<wchar_t>& b) noexcept {
  return a.view() == b.view();
}
inline bool operator==(const CVynStringT<wchar_t>& a, const wchar_t* b) noexcept {
  return a.Compare(b) == 0;
}
inline bool operator==(const wchar_t* a, const CVynStringT<wchar_t>& b) noexcept {
  return b.Compare(a) == 0;
}
inline bool operator!=(const CVynStringT<wchar_t>& a, const CVynStringT<wchar_t>& b) noexcept {
  return !(a == b);
}
inline bool operator!=(const CVynStringT<wchar_t>& a, const wchar_t* b) noexcept {
  return !(a == b);
}
inline bool operator!=(const wchar_t* a, const CVynStringT<wchar_t>& b) noexcept {
  return !(b == a);
}
inline bool operator<(const CVynStringT<wchar_t>& a, const CVynStringT<wchar_t>& b) noexcept {
  return a.view() < b.view();
}
inline bool operator<(const CVynStringT<wchar_t>& a, const wchar_t* b) noexcept {
  return a.Compare(b) < 0;
}
inline bool operator<(const wchar_t* a, const CVynStringT<wchar_t>& b) noexcept {
  return b.Compare(a) > 0;
}
inline bool operator>(const CVynStringT<wchar_t>& a, const CVynStringT<wchar_t>& b) noexcept {
  return b < a;
}
inline bool operator>(const CVynStringT<wchar_t>& a, const wchar_t* b) noexcept {
  return a.Compare(b) > 0;
}
inline bool operator>(const wchar_t* a, const CVynStringT<wchar_t>& b) noexcept {
  return b.Compare(a) < 0;
}
inline bool operator<=(const CVynStringT<wchar_t>& a, const CVynStringT<wchar_t>& b) noexcept {
  return !(b < a);
}
inline bool operator<=(const CVynStringT<wchar_t>& a, const wchar_t* b) noexcept {
  return a.Compare(b) <= 0;
}
inline bool operator<=(const wchar_t* a, const CVynStringT<wchar_t>& b) noexcept {
  return b.Compare(a) >= 0;
}
inline bool operator>=(const CVynStringT<wchar_t>& a, const CVynStringT<wchar_t>& b) noexcept {
  return !(a < b);
}
inline bool operator>=(const CVynStringT<wchar_t>& a, const wchar_t* b) noexcept {
  return a.Compare(b) >= 0;
}
inline bool operator>=(const wchar_t* a, const CVynStringT<wchar_t>& b) noexcept {
  return b.Compare(a) <= 0;
}

// UTF-8 form of a wide text (a null pointer gives ""); lone surrogates become U+FFFD.
DEX_API std::string toUtf8(const wchar_t* text);
DEX_API std::string toUtf8(std::wstring_view text);
// Appends the UTF-8 form of text to out, for writers that gather many texts in one buffer.
DEX_API void appendUtf8(std::string& out, std::wstring_view text);

}  // namespace vyn_text

using vyn_text::CVynStringT;

template <>
struct std::hash<CVynStringT<wchar_t>> {
  std::size_t operator()(const CVynStringT<wchar_t>& text) const noexcept {
    return std::hash<std::wstring_view>()(text.view());
  }
};
