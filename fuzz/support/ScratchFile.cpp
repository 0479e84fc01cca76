#include "support/ScratchFile.h"

#include <fcntl.h>
#include <unistd.h>

#include <filesystem>
#include <system_error>

#include "hostlibs/VynString.h"

namespace dex_fuzz {

namespace {

std::string scratchFolder() {
  std::error_code error;
  const std::filesystem::path folder = std::filesystem::temp_directory_path(error);
  return error ? std::string("/tmp") : folder.string();
}

}  // namespace

ScratchFile::ScratchFile(std::string_view tag)
    : path_(scratchFolder() + "/dexchange-fuzz-" + std::string(tag) + "-" + std::to_string(::getpid())),
      wpath_(CVynStringT<wchar_t>(path_.c_str(), vyn_text::CP_UTF8).view()) {}

ScratchFile::~ScratchFile() {
  ::unlink(path_.c_str());
}

// Each input goes into a new file: rewriting a file in place after truncating it makes ext4 flush it
// to the disk on close, which slows a fuzzer down a hundredfold.
bool ScratchFile::write(std::string_view bytes) const {
  ::unlink(path_.c_str());
  const int fd = ::open(path_.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0600);
  if (fd < 0) return false;
  std::size_t written = 0;
  while (written < bytes.size()) {
    const ssize_t got = ::write(fd, bytes.data() + written, bytes.size() - written);
    if (got <= 0) break;
    written += static_cast<std::size_t>(got);
  }
  ::close(fd);
  return written == bytes.size();
}

}  // namespace dex_fuzz
