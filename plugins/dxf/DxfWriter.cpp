#include "DxfWriter.h"

#include <sys/types.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

#include "DxfText.h"

namespace vyn::ie::dxf {

namespace {

constexpr std::size_t kFlushBytes = 1 << 20;
constexpr int kMaxDecimals = 15;

// Drops the trailing zeros of a fixed-point text, keeping one after the point.
std::size_t trimZeros(const char* text, std::size_t length) {
  const std::string_view view(text, length);
  const std::size_t point = view.find('.');
  if (point == std::string_view::npos) return length;
  std::size_t end = length;
  while (end > point + 2 && text[end - 1] == '0')
    --end;
  return end;
}

using Digits = std::array<char, 400>;

// value with at most decimals decimals, trailing zeros dropped; the shortest exact form when the
// fixed form does not fit.
std::string_view formatReal(Digits& digits, double value, int decimals) {
  const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), value,
                                    std::chars_format::fixed, std::clamp(decimals, 1, kMaxDecimals));
  if (result.ec != std::errc()) {
    const auto shortest = std::to_chars(digits.data(), digits.data() + digits.size(), value);
    return std::string_view(digits.data(), static_cast<std::size_t>(shortest.ptr - digits.data()));
  }
  const std::string_view text(digits.data(),
                              trimZeros(digits.data(), static_cast<std::size_t>(result.ptr - digits.data())));
  // A value that rounds to zero keeps no sign.
  return text == "-0.0" ? std::string_view("0.0") : text;
}

}  // namespace

std::string handleText(unsigned long long handle) {
  std::array<char, 20> digits{};
  const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), handle, 16);
  std::string text(digits.data(), result.ptr);
  std::transform(text.begin(), text.end(), text.begin(),
                 [](char ch) { return ch >= 'a' ? static_cast<char>(ch - 32) : ch; });
  return text;
}

DxfWriter::~DxfWriter() {
  if (file_ != nullptr) std::fclose(file_);
}

bool DxfWriter::open(const std::string& path) {
  file_ = std::fopen(path.c_str(), "wb");
  return file_ != nullptr;
}

bool DxfWriter::flush() {
  if (file_ == nullptr) return false;
  if (!buffer_.empty() && !failed_) {
    failed_ = std::fwrite(buffer_.data(), 1, buffer_.size(), file_) != buffer_.size();
    written_ += buffer_.size();
  }
  buffer_.clear();
  return !failed_;
}

bool DxfWriter::close() {
  const bool flushed = flush();
  const bool closed = file_ != nullptr && std::fclose(file_) == 0;
  file_ = nullptr;
  return flushed && closed;
}

void DxfWriter::maybeFlush() {
  if (buffer_.size() >= kFlushBytes) flush();
}

void DxfWriter::code(int code) {
  std::array<char, 8> digits{};
  const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), code);
  const auto length = static_cast<std::size_t>(result.ptr - digits.data());
  if (length < 3) buffer_.append(3 - length, ' ');
  buffer_.append(digits.data(), length);
  buffer_ += '\n';
}

void DxfWriter::group(int code, std::string_view value) {
  this->code(code);
  buffer_ += value;
  buffer_ += '\n';
  maybeFlush();
}

void DxfWriter::group(int code, long long value) {
  std::array<char, 24> digits{};
  const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), value);
  group(code, std::string_view(digits.data(), static_cast<std::size_t>(result.ptr - digits.data())));
}

std::string DxfWriter::realText(double value, int decimals) {
  Digits digits{};
  return std::string(formatReal(digits, value, decimals));
}

void DxfWriter::real(int code, double value, int decimals) {
  Digits digits{};
  group(code, formatReal(digits, value, decimals));
}

void DxfWriter::exact(int code, double value) {
  std::array<char, 32> digits{};
  const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), value);
  group(code, std::string_view(digits.data(), static_cast<std::size_t>(result.ptr - digits.data())));
}

void DxfWriter::text(int code, std::wstring_view value, std::size_t maxBytes) {
  scratch_.clear();
  appendEncoded(scratch_, value);
  if (scratch_.size() > maxBytes) {
    std::size_t cut = maxBytes;
    // An escape is seven characters: never leave a part of one.
    const std::size_t escape = scratch_.rfind("\\U+", cut);
    if (escape != std::string::npos && escape + 7 > cut) cut = escape;
    scratch_.resize(cut);
  }
  group(code, scratch_);
}

void DxfWriter::mtext(int code, std::wstring_view value) {
  scratch_.clear();
  appendMTextEncoded(scratch_, value);
  group(code, scratch_);
}

void DxfWriter::point(int code, double x, double y, double z, int decimals) {
  real(code, x, decimals);
  real(code + 10, y, decimals);
  real(code + 20, z, decimals);
}

unsigned long long DxfWriter::handle(int code) {
  const unsigned long long handle = nextHandle_++;
  reference(code, handle);
  return handle;
}

void DxfWriter::reference(int code, unsigned long long handle) {
  group(code, handleText(handle));
}

void DxfWriter::placeholder(int code, std::size_t width) {
  this->code(code);
  placeholderAt_ = written_ + buffer_.size();
  placeholderWidth_ = width;
  buffer_.append(width, '0');
  buffer_ += '\n';
}

bool DxfWriter::patch(std::string_view value) {
  if (file_ == nullptr || failed_ || value.size() > placeholderWidth_ || !flush()) return false;
  std::string padded(placeholderWidth_ - value.size(), '0');
  padded += value;
  const off_t end = ::ftello(file_);
  const bool done = ::fseeko(file_, static_cast<off_t>(placeholderAt_), SEEK_SET) == 0 &&
                    std::fwrite(padded.data(), 1, padded.size(), file_) == padded.size();
  return ::fseeko(file_, end, SEEK_SET) == 0 && done;
}

}  // namespace vyn::ie::dxf
