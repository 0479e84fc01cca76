#include "hostlibs/TextFile.h"

#include <fcntl.h>
#include <algorithm>
#include <type_traits>

#include "hostlibs/detail/ByteOrderMark.h"
#include "hostlibs/detail/PosixFile.h"
#include "hostlibs/detail/Utf.h"

namespace {

constexpr std::size_t kSmallestBlock = 64;
constexpr std::size_t kLargestBlock = std::size_t{16} << 20;

std::size_t clampBlockSize(int requested) {
  if (requested <= 0) return kSmallestBlock;
  return std::clamp(static_cast<std::size_t>(requested), kSmallestBlock, kLargestBlock);
}

CTextFile::ETextEncoding encodingOf(vyn_text::detail::ByteOrderMark mark) {
  using vyn_text::detail::ByteOrderMark;
  switch (mark) {
    case ByteOrderMark::Utf8:
      return CTextFile::ETextEncoding::Utf8Bom;
    case ByteOrderMark::Utf16LE:
      return CTextFile::ETextEncoding::Utf16LE;
    case ByteOrderMark::Utf16BE:
      return CTextFile::ETextEncoding::Utf16BE;
    case ByteOrderMark::None:
      break;
  }
  return CTextFile::ETextEncoding::Utf8;
}

// The code units of the buffer in the file's encoding: bytes, or UTF-16 units of two bytes.
class Units {
 public:
  Units(const char* bytes, CTextFile::ETextEncoding encoding) noexcept
      : bytes_(bytes),
        little_(encoding == CTextFile::ETextEncoding::Utf16LE),
        wide_(little_ || encoding == CTextFile::ETextEncoding::Utf16BE) {}

  std::size_t size() const noexcept { return wide_ ? 2 : 1; }

  char16_t at(std::size_t offset) const noexcept {
    if (!wide_) return byte(offset);
    return little_ ? static_cast<char16_t>(byte(offset) | (byte(offset + 1) << 8))
                   : static_cast<char16_t>((byte(offset) << 8) | byte(offset + 1));
  }

  // Offset of the first CR or LF unit in [from, end), or of the first offset without a whole unit.
  std::size_t findBreak(std::size_t from, std::size_t end) const noexcept {
    if (!wide_) {
      const char* const found =
          std::find_if(bytes_ + from, bytes_ + end, [](char c) { return c == '\n' || c == '\r'; });
      return static_cast<std::size_t>(found - bytes_);
    }
    for (; from + 2 <= end; from += 2) {
      const char16_t unit = at(from);
      if (unit == u'\n' || unit == u'\r') return from;
    }
    return from;
  }

 private:
  char16_t byte(std::size_t offset) const noexcept {
    return static_cast<char16_t>(static_cast<unsigned char>(bytes_[offset]));
  }

  const char* bytes_;
  bool little_;
  bool wide_;
};

// Replaces the text of line with the characters in [first, last), reusing its storage.
template <typename Char>
void assignTo(CVynStringT<wchar_t>& line, const Char* first, const Char* last) {
  const auto length = static_cast<int>(last - first);
  wchar_t* const target = line.GetBuffer(length);
  for (int i = 0; i < length; ++i) {
    target[i] = static_cast<wchar_t>(static_cast<std::make_unsigned_t<Char>>(first[i]));
  }
  line.ReleaseBuffer(length);
}

}  // namespace

CTextFile::CTextFile(int bufferSize) : blockSize_(clampBlockSize(bufferSize)) {}

CTextFile::~CTextFile() {
  Close();
}

int CTextFile::Open(const wchar_t* path) {
  Close();
  vyn_text::detail::UniqueFd file = vyn_text::detail::openFile(path, O_RDONLY);
  if (!file.valid()) return 0;
  fd_ = file.release();
  buffer_.resize(blockSize_);
  // A mark takes at most three bytes; a short first read must not hide it.
  while (end_ < 3 && refill()) {
  }
  const auto mark = vyn_text::detail::detectByteOrderMark(std::string_view(buffer_.data(), end_));
  encoding_ = encodingOf(mark.mark);
  begin_ = mark.length;
  return 1;
}

bool CTextFile::IsOpen() const noexcept {
  return fd_ >= 0;
}

void CTextFile::Close() noexcept {
  vyn_text::detail::UniqueFd closing(fd_);
  fd_ = -1;
  encoding_ = ETextEncoding::Utf8;
  lineNumber_ = 0;
  begin_ = end_ = scanned_ = 0;
  atEnd_ = false;
  std::vector<char>().swap(buffer_);
}

bool CTextFile::ReadString(CVynStringT<wchar_t>& line) {
  line.Empty();
  if (!IsOpen()) return false;
  LineEnd found{};
  while (!findLineEnd(found))
    refill();
  if (begin_ == end_ && atEnd_) return false;
  if (found.next == 0) found = {end_, end_};  // the last line, without a line end
  decode(begin_, found.contentEnd, line);
  begin_ = found.next;
  scanned_ = 0;
  ++lineNumber_;
  return true;
}

// Moves the unread bytes to the front of the buffer (growing it when they fill it) and reads one more
// block; false when the file has nothing more.
bool CTextFile::refill() {
  if (atEnd_) return false;
  if (begin_ > 0) {
    std::copy(buffer_.begin() + static_cast<std::ptrdiff_t>(begin_),
              buffer_.begin() + static_cast<std::ptrdiff_t>(end_), buffer_.begin());
    end_ -= begin_;
    begin_ = 0;
  }
  if (buffer_.size() - end_ < blockSize_) buffer_.resize(std::max(buffer_.size() * 2, end_ + blockSize_));
  const std::size_t got = vyn_text::detail::readFully(fd_, buffer_.data() + end_, blockSize_);
  end_ += got;
  if (got < blockSize_) atEnd_ = true;
  return got > 0;
}

// Searches the buffered bytes for the end of the current line. False when more bytes are needed to
// decide: no line end yet, or a CR as the last buffered unit (an LF may follow in the next block).
// At the end of the file a missing line end is reported as found.next == 0.
bool CTextFile::findLineEnd(LineEnd& found) {
  const Units units{buffer_.data(), encoding_};
  const std::size_t unit = units.size();
  std::size_t at = units.findBreak(begin_ + scanned_, end_);
  if (at + unit <= end_) {
    if (units.at(at) == u'\n') {
      found = {at, at + unit};
      return true;
    }
    if (at + 2 * unit <= end_) {
      found = {at, units.at(at + unit) == u'\n' ? at + 2 * unit : at + unit};
      return true;
    }
    if (atEnd_) {
      found = {at, at + unit};
      return true;
    }
    // Keep the CR unscanned until the next block shows what follows it.
  }
  scanned_ = at - begin_;
  found = {};
  return atEnd_;
}

void CTextFile::decode(std::size_t begin, std::size_t end, CVynStringT<wchar_t>& line) {
  const Units units{buffer_.data(), encoding_};
  const char* const bytes = buffer_.data();
  decoded_.clear();
  if (units.size() == 1) {
    if (std::all_of(bytes + begin, bytes + end,
                    [](char c) { return static_cast<unsigned char>(c) < 0x80; })) {
      assignTo(line, bytes + begin, bytes + end);  // plain ASCII, the common case, needs no decoder
      return;
    }
    vyn_text::detail::appendUtf8(decoded_, std::string_view(bytes + begin, end - begin));
  } else {
    units_.clear();
    std::size_t at = begin;
    for (; at + 2 <= end; at += 2)
      units_.push_back(units.at(at));
    decoded_ = vyn_text::detail::fromUtf16(units_);
    if (at < end) decoded_.push_back(vyn_text::detail::kReplacementCharacter);  // odd byte count
  }
  assignTo(line, decoded_.data(), decoded_.data() + decoded_.size());
}
