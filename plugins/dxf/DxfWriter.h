#pragma once

#include <cstdint>
#include <cstdio>
#include <string>
#include <string_view>

// Writing the groups of an ASCII DXF file through one buffer, with the handles of a drawing.
namespace vyn::ie::dxf {

// Writes groups as two lines each, the code right-aligned in three characters as AutoCAD writes it
// and LF line ends; texts go through appendEncoded (ASCII, "\U+XXXX" beyond it). The buffer is
// written out whenever it grows past a block and by flush(); a failed write is remembered and makes
// every later flush() and close() answer false.
class DxfWriter {
 public:
  DxfWriter() = default;
  ~DxfWriter();
  DxfWriter(const DxfWriter&) = delete;
  DxfWriter& operator=(const DxfWriter&) = delete;

  // Creates (or empties) the file at that UTF-8 path; false when it cannot be created.
  bool open(const std::string& path);
  // Writes what is left and closes; false when any write failed.
  bool close();
  bool flush();

  // ---- Groups ---------------------------------------------------------------------------------
  void group(int code, std::string_view value);
  void group(int code, long long value);
  void group(int code, int value) { group(code, static_cast<long long>(value)); }
  // A number with at most that many decimals (trailing zeros dropped, one kept).
  void real(int code, double value, int decimals);
  // A number in the shortest form that reads back exactly.
  void exact(int code, double value);
  // The text real() writes.
  static std::string realText(double value, int decimals);
  // A text, encoded; at most maxBytes bytes of its encoded form (never cutting an escape).
  void text(int code, std::wstring_view value, std::size_t maxBytes = std::string::npos);
  void mtext(int code, std::wstring_view value);
  // The point (x, y, z) as the groups code, code + 10 and code + 20.
  void point(int code, double x, double y, double z, int decimals);

  // ---- Handles --------------------------------------------------------------------------------
  // Writes a new handle as group 5 (or the code given) and answers it.
  unsigned long long handle(int code = 5);
  // A handle as its hexadecimal text, as group code.
  void reference(int code, unsigned long long handle);
  void setNextHandle(unsigned long long next) noexcept { nextHandle_ = next; }
  unsigned long long nextHandle() const noexcept { return nextHandle_; }

  // ---- Patching -------------------------------------------------------------------------------
  // Writes a value of width characters now and remembers where, for patch().
  void placeholder(int code, std::size_t width);
  // Overwrites the placeholder with value, right-aligned in its width (the file must be flushed).
  bool patch(std::string_view value);

 private:
  void code(int code);
  void maybeFlush();

  std::FILE* file_ = nullptr;
  std::string buffer_;
  std::uint64_t written_ = 0;  // bytes already in the file
  std::uint64_t placeholderAt_ = 0;
  std::size_t placeholderWidth_ = 0;
  unsigned long long nextHandle_ = 1;
  bool failed_ = false;
  std::string scratch_;
};

// A handle's text: upper-case hexadecimal without leading zeros.
std::string handleText(unsigned long long handle);

}  // namespace vyn::ie::dxf
