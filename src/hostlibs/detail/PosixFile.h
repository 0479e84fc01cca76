#pragma once

#include <cstddef>

// File descriptors for the file stand-ins (text file, binary file, XML reader). Paths arrive as wide
// text and are handed to the system in UTF-8.
namespace vyn_text::detail {

// Owns one file descriptor and closes it at the end of its life.
class UniqueFd {
 public:
  UniqueFd() noexcept = default;
  explicit UniqueFd(int fd) noexcept : fd_(fd) {}
  ~UniqueFd() { reset(); }
  UniqueFd(UniqueFd&& other) noexcept : fd_(other.release()) {}
  UniqueFd& operator=(UniqueFd&& other) noexcept;
  UniqueFd(const UniqueFd&) = delete;
  UniqueFd& operator=(const UniqueFd&) = delete;

  bool valid() const noexcept { return fd_ >= 0; }
  int get() const noexcept { return fd_; }
  int release() noexcept;
  void reset(int fd = -1) noexcept;

 private:
  int fd_ = -1;
};

// Opens path with the open(2) flags given (close-on-exec is added; new files get mode 0666 less the
// umask). A null or empty path and a folder give an invalid descriptor.
UniqueFd openFile(const wchar_t* path, int flags);

// Reads until size bytes are in or the file ends; answers the bytes read (fewer at the end of the
// file or after a read error).
std::size_t readFully(int fd, void* buffer, std::size_t size);

// Writes all bytes; false when the system refuses part of them.
bool writeFully(int fd, const void* data, std::size_t size);

}  // namespace vyn_text::detail
