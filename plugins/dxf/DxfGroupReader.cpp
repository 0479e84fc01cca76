#include "DxfGroupReader.h"

#include <sys/stat.h>

#include <algorithm>
#include <cctype>
#include <charconv>
#include <cmath>
#include <cstring>
#include <memory>

#include "DxfWords.h"

namespace vyn::ie::dxf {

namespace {

constexpr std::size_t kBlockSize = 1 << 20;
constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";
constexpr std::string_view kBinaryMark = "AutoCAD Binary DXF";
constexpr std::string_view kDwgMark = "AC1";

bool isBlank(char ch) {
  return ch == ' ' || ch == '\t' || ch == '\r' || ch == '\n' || ch == '\f' || ch == '\v';
}

std::string_view trimmed(std::string_view text) {
  while (!text.empty() && isBlank(text.front()))
    text.remove_prefix(1);
  while (!text.empty() && isBlank(text.back()))
    text.remove_suffix(1);
  return text;
}

EFileKind kindOf(std::string_view head) {
  if (head.substr(0, kBinaryMark.size()) == kBinaryMark) return EFileKind::BINARY_DXF;
  if (head.size() >= 6 && head.substr(0, kDwgMark.size()) == kDwgMark &&
      std::isdigit(static_cast<unsigned char>(head[3])) != 0)
    return EFileKind::DWG;
  return std::all_of(head.begin(), head.end(), isBlank) ? EFileKind::EMPTY : EFileKind::ASCII;
}

}  // namespace

bool parseReal(std::string_view text, double& value) {
  text = trimmed(text);
  if (!text.empty() && text.front() == '+') text.remove_prefix(1);
  if (text.empty()) return false;
  double parsed = 0.0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), parsed);
  if (error != std::errc() || end != text.data() + text.size() || !std::isfinite(parsed)) return false;
  value = parsed;
  return true;
}

bool parseInteger(std::string_view text, long long& value) {
  text = trimmed(text);
  if (!text.empty() && text.front() == '+') text.remove_prefix(1);
  long long parsed = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), parsed);
  if (error == std::errc() && end == text.data() + text.size() && !text.empty()) {
    value = parsed;
    return true;
  }
  // Some writers give integers as reals ("1.0").
  double real = 0.0;
  if (!parseReal(text, real) || real != std::floor(real) || std::fabs(real) > 9.0e18) return false;
  value = static_cast<long long>(real);
  return true;
}

DxfGroupReader::DxfGroupReader() = default;

DxfGroupReader::~DxfGroupReader() {
  if (file_ != nullptr) std::fclose(file_);
}

bool DxfGroupReader::open(const std::string& path) {
  file_ = std::fopen(path.c_str(), "rb");
  if (file_ == nullptr) return false;
  struct stat info {};
  if (::stat(path.c_str(), &info) == 0) fileSize_ = static_cast<std::uint64_t>(info.st_size);
  // Room for the whole of a small file, and always for a line at the limit and its line end.
  capacity_ =
      static_cast<std::size_t>(std::min<std::uint64_t>(kBlockSize, fileSize_ + 1)) + kMaxLineBytes + 2;
  buffer_ = std::make_unique_for_overwrite<char[]>(capacity_);
  fill();
  std::string_view head(buffer_.get() + begin_, end_ - begin_);
  if (head.substr(0, kUtf8Mark.size()) == kUtf8Mark) {
    begin_ += kUtf8Mark.size();
    consumed_ += kUtf8Mark.size();
    head.remove_prefix(kUtf8Mark.size());
  }
  kind_ = kindOf(head);
  return true;
}

bool DxfGroupReader::fill() {
  if (atEnd_ || file_ == nullptr) return false;
  if (begin_ > 0) {
    std::memmove(buffer_.get(), buffer_.get() + begin_, end_ - begin_);
    end_ -= begin_;
    begin_ = 0;
  }
  const std::size_t read = std::fread(buffer_.get() + end_, 1, capacity_ - end_, file_);
  end_ += read;
  if (read == 0) atEnd_ = true;
  return read > 0;
}

bool DxfGroupReader::readLine(std::string_view& line, bool& cut) {
  cut = false;
  for (;;) {
    const char* start = buffer_.get() + begin_;
    const auto* newline = static_cast<const char*>(std::memchr(start, '\n', end_ - begin_));
    if (newline != nullptr || (atEnd_ && begin_ < end_)) {
      const std::size_t length =
          newline != nullptr ? static_cast<std::size_t>(newline - start) : end_ - begin_;
      const std::size_t used = newline != nullptr ? length + 1 : length;
      begin_ += used;
      consumed_ += used;
      ++lineNumber_;
      line = std::string_view(start, length);
      if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
      if (line.size() > kMaxLineBytes) {
        line = line.substr(0, kMaxLineBytes);
        cut = true;
      }
      return true;
    }
    if (atEnd_) return false;
    if (end_ - begin_ > kMaxLineBytes) break;
    fill();
  }
  // A line longer than the limit: keep its head, pass over the rest up to its line end.
  longLine_.assign(buffer_.get() + begin_, kMaxLineBytes);
  for (;;) {
    const char* start = buffer_.get() + begin_;
    const auto* newline = static_cast<const char*>(std::memchr(start, '\n', end_ - begin_));
    const std::size_t used =
        newline != nullptr ? static_cast<std::size_t>(newline - start) + 1 : end_ - begin_;
    begin_ += used;
    consumed_ += used;
    if (newline != nullptr || !fill()) break;
  }
  ++lineNumber_;
  line = longLine_;
  cut = true;
  return true;
}

bool DxfGroupReader::next() {
  badCode_ = false;
  std::string_view codeText;
  bool cut = false;
  if (!readLine(codeText, cut)) return false;
  codeLine_ = lineNumber_;
  long long parsed = 0;
  if (cut || !parseInteger(codeText, parsed) || parsed < -32768 || parsed > 32767) {
    badCode_ = true;
    return false;
  }
  code_ = static_cast<int>(parsed);
  if (!readLine(value_, valueCut_)) {
    truncated_ = true;
    return false;
  }
  return true;
}

bool DxfGroupReader::resync() {
  badCode_ = false;
  std::string_view text;
  bool cut = false;
  while (readLine(text, cut)) {
    long long parsed = -1;
    if (cut || !parseInteger(text, parsed) || parsed != 0) continue;
    codeLine_ = lineNumber_;
    code_ = 0;
    if (!readLine(value_, valueCut_)) {
      truncated_ = true;
      return false;
    }
    return true;
  }
  return false;
}

}  // namespace vyn::ie::dxf
