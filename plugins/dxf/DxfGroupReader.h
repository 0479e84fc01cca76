#pragma once

#include <cstdint>
#include <cstdio>
#include <memory>
#include <string>
#include <string_view>

// Reading a DXF file group by group, in blocks: the file is never held whole.
namespace vyn::ie::dxf {

// What the first bytes of a file say it is.
enum class EFileKind {
  ASCII,       // text groups (the only kind read)
  EMPTY,       // no byte, or blanks only
  BINARY_DXF,  // starts with "AutoCAD Binary DXF"
  DWG,         // starts with a DWG version word ("AC1015")
};

// Streams the groups of an ASCII DXF file: each group is a code line (an integer, blanks around it
// allowed) and a value line (its line end and one trailing CR removed). A UTF-8 byte-order mark is
// passed over. A line longer than kMaxLineBytes is cut there and the group marked cut.
//
// A code line that is not an integer stops next() with badCode(); resync() then moves on to the
// next line that reads as code 0, so that a reader can skip the damaged structure and go on.
class DxfGroupReader {
 public:
  DxfGroupReader();
  ~DxfGroupReader();
  DxfGroupReader(const DxfGroupReader&) = delete;
  DxfGroupReader& operator=(const DxfGroupReader&) = delete;

  // Opens the file (a UTF-8 path) and looks at its first bytes; false when it cannot be opened.
  bool open(const std::string& path);
  EFileKind kind() const noexcept { return kind_; }
  std::uint64_t fileSize() const noexcept { return fileSize_; }
  std::uint64_t bytesRead() const noexcept { return consumed_; }

  // Reads the next group. False at the end of the file, after a code line without its value line
  // (truncated() then tells), or at a code line that is not a number (badCode()).
  bool next();
  int code() const noexcept { return code_; }
  // Valid until the next call of next() or resync().
  std::string_view value() const noexcept { return value_; }
  // The line number of the current group's code line (1 for the first line).
  int line() const noexcept { return codeLine_; }
  bool valueCut() const noexcept { return valueCut_; }
  bool badCode() const noexcept { return badCode_; }
  bool truncated() const noexcept { return truncated_; }

  // After badCode(): skips lines up to one that reads as code 0 and makes it the current group with
  // the line after it as its value. False when the file ends first.
  bool resync();

 private:
  // The next line without its line end; false at the end of the file.
  bool readLine(std::string_view& line, bool& cut);
  bool fill();

  std::FILE* file_ = nullptr;
  std::unique_ptr<char[]> buffer_;
  std::size_t capacity_ = 0;
  std::size_t begin_ = 0;  // the first byte not yet read
  std::size_t end_ = 0;    // one past the last byte in the buffer
  bool atEnd_ = false;     // the file has no more bytes
  std::uint64_t fileSize_ = 0;
  std::uint64_t consumed_ = 0;
  std::string longLine_;  // a line that did not fit in the buffer
  EFileKind kind_ = EFileKind::EMPTY;
  int lineNumber_ = 0;
  int codeLine_ = 0;
  int code_ = 0;
  std::string_view value_;
  bool valueCut_ = false;
  bool badCode_ = false;
  bool truncated_ = false;
};

// Reads the whole text (blanks around it allowed) as a number, independently of the locale; false for
// anything else, for NaN and for infinities.
bool parseReal(std::string_view text, double& value);
bool parseInteger(std::string_view text, long long& value);

}  // namespace vyn::ie::dxf
