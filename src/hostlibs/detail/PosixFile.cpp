#include "hostlibs/detail/PosixFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <cerrno>
#include <string>

#include "hostlibs/VynString.h"

namespace vyn_text::detail {

UniqueFd& UniqueFd::operator=(UniqueFd&& other) noexcept {
  if (this != &other) reset(other.release());
  return *this;
}

int UniqueFd::release() noexcept {
  const int fd = fd_;
  fd_ = -1;
  return fd;
}

void UniqueFd::reset(int fd) noexcept {
  if (fd_ >= 0) ::close(fd_);
  fd_ = fd;
}

UniqueFd openFile(const wchar_t* path, int flags) {
  if (path == nullptr || *path == L'\0') return UniqueFd();
  const std::string bytes = toUtf8(path);
  int fd = -1;
  do {
    fd = ::open(bytes.c_str(), flags | O_CLOEXEC, 0666);
  } while (fd < 0 && errno == EINTR);
  UniqueFd file(fd);
  // A folder opens read-only on this system, but it is not a file for any caller.
  struct stat info {};
  if (file.valid() && (::fstat(file.get(), &info) != 0 || S_ISDIR(info.st_mode))) file.reset();
  return file;
}

std::size_t readFully(int fd, void* buffer, std::size_t size) {
  auto* target = static_cast<char*>(buffer);
  std::size_t done = 0;
  while (done < size) {
    const ssize_t got = ::read(fd, target + done, size - done);
    if (got > 0) {
      done += static_cast<std::size_t>(got);
    } else if (got == 0 || errno != EINTR) {
      break;
    }
  }
  return done;
}

bool writeFully(int fd, const void* data, std::size_t size) {
  const auto* source = static_cast<const char*>(data);
  while (size > 0) {
    const ssize_t put = ::write(fd, source, size);
    if (put > 0) {
      source += put;
      size -= static_cast<std::size_t>(put);
    } else if (put == 0 || errno != EINTR) {
      return false;
    }
  }
  return true;
}

}  // namespace vyn_text::detail
