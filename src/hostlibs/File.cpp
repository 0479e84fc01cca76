#include "hostlibs/File.h"

#include <fcntl.h>
#include <utility>

#include "hostlibs/detail/PosixFile.h"

namespace base {
namespace {

// Writes larger than this go to the system at once; smaller ones are collected up to it.
constexpr std::size_t kCollectLimit = std::size_t{64} << 10;

}  // namespace

CFile::CFile() noexcept = default;

CFile::~CFile() {
  Close();
}

CFile::CFile(CFile&& other) noexcept
    : fd_(std::exchange(other.fd_, -1)),
      writing_(std::exchange(other.writing_, false)),
      pending_(std::move(other.pending_)) {
  other.pending_.clear();
}

CFile& CFile::operator=(CFile&& other) noexcept {
  if (this != &other) {
    Close();
    fd_ = std::exchange(other.fd_, -1);
    writing_ = std::exchange(other.writing_, false);
    pending_ = std::move(other.pending_);
    other.pending_.clear();
  }
  return *this;
}

bool CFile::OpenForReading(const wchar_t* path) {
  return open(path, O_RDONLY);
}
bool CFile::OpenForWriting(const wchar_t* path) {
  return open(path, O_WRONLY | O_CREAT | O_TRUNC);
}
bool CFile::OpenForAppending(const wchar_t* path) {
  return open(path, O_WRONLY | O_CREAT | O_APPEND);
}

bool CFile::open(const wchar_t* path, int flags) {
  Close();
  fd_ = vyn_text::detail::openFile(path, flags).release();
  writing_ = (flags & O_WRONLY) != 0;
  return Opened();
}

bool CFile::Opened() const noexcept {
  return fd_ >= 0;
}

std::size_t CFile::Read(void* buffer, std::size_t size) {
  if (!Opened() || writing_ || buffer == nullptr) return 0;
  return vyn_text::detail::readFully(fd_, buffer, size);
}

bool CFile::Write(const void* data, std::size_t size) {
  if (!Opened() || !writing_) return false;
  if (size == 0) return true;
  if (data == nullptr) return false;
  if (pending_.size() + size > kCollectLimit && !Flush()) return false;
  if (size >= kCollectLimit) return vyn_text::detail::writeFully(fd_, data, size);
  pending_.append(static_cast<const char*>(data), size);
  return true;
}

bool CFile::Flush() {
  if (!Opened()) return false;
  const bool written = vyn_text::detail::writeFully(fd_, pending_.data(), pending_.size());
  pending_.clear();
  return written;
}

bool CFile::Close() {
  if (!Opened()) return true;
  const bool written = Flush();
  vyn_text::detail::UniqueFd closing(std::exchange(fd_, -1));
  writing_ = false;
  return written;
}

}  // namespace base
