#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"

// Reads a text file line by line as wide text. The encoding is taken from the byte-order mark: UTF-8,
// UTF-16 little- or big-endian; a file without a mark is read as UTF-8 in which every byte that does
// not start a well-formed sequence is taken as the Latin-1 character of the same value, so no byte is
// lost. Lines end with CR LF, LF or a lone CR; the last line needs no line end. The file is read in
// blocks, so files of millions of lines are cheap. The object owns the open file and closes it in its
// destructor; it cannot be copied.
class DEX_API CTextFile {
 public:
  VYN_CLASS_ALLOCATOR

  enum class ETextEncoding {
    Utf8,     // no byte-order mark: UTF-8 with the Latin-1 fallback
    Utf8Bom,  // UTF-8 after the mark EF BB BF
    Utf16LE,  // after FF FE
    Utf16BE,  // after FE FF
  };

  // bufferSize is the size of one block read from the disk; values below 64 count as 64 and values
  // above 16 MiB as 16 MiB. A line longer than a block is still read whole.
  explicit CTextFile(int bufferSize = 4096);
  virtual ~CTextFile();
  CTextFile(const CTextFile&) = delete;
  CTextFile& operator=(const CTextFile&) = delete;

  // Opening. Open closes any file opened before and answers non-zero when the new one is open; a
  // missing file, a folder, a null or empty path answer 0 and leave the object closed.
  int Open(const wchar_t* path);
  bool IsOpen() const noexcept;
  void Close() noexcept;

  // Reading. ReadString gives the next line without its line end; NUL characters are kept. In a UTF-16
  // file a lone surrogate, and a last byte left over from an odd byte count, each become U+FFFD. At the
  // end of the file (or when no file is open) the answer is false and line is emptied.
  bool ReadString(CVynStringT<wchar_t>& line);

  // What was found: the encoding of the open file (Utf8 when none is open) and the number of lines
  // ReadString has given since Open.
  ETextEncoding GetEncoding() const noexcept { return encoding_; }
  int GetLineNumber() const noexcept { return lineNumber_; }

 private:
  struct LineEnd {
    std::size_t contentEnd;  // offset of the first line-end byte, or of the end of the data
    std::size_t next;        // offset where the following line starts
  };

  bool refill();
  bool findLineEnd(LineEnd& found);
  void decode(std::size_t begin, std::size_t end, CVynStringT<wchar_t>& line);

  std::size_t blockSize_;
  int fd_ = -1;  // owned
  ETextEncoding encoding_ = ETextEncoding::Utf8;
  int lineNumber_ = 0;
  std::vector<char> buffer_;  // raw bytes; [begin_, end_) not yet given out
  std::size_t begin_ = 0;
  std::size_t end_ = 0;
  std::size_t scanned_ = 0;  // bytes after begin_ already searched for a line end
  bool atEnd_ = false;       // the file has no more bytes to read
  std::wstring decoded_;     // the line being decoded, reused between lines
  std::u16string units_;     // UTF-16 code units of that line
};
