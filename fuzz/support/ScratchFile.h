#pragma once

#include <string>
#include <string_view>

// The file a target hands to a reader that only takes paths. Its name carries the process id and the
// target's tag, so fuzzers, replays and tests running side by side never share one. Each input
// replaces it; it is removed when the object ends (keep one in a function-local static).
namespace dex_fuzz {

class ScratchFile {
 public:
  explicit ScratchFile(std::string_view tag);
  ~ScratchFile();
  ScratchFile(const ScratchFile&) = delete;
  ScratchFile& operator=(const ScratchFile&) = delete;

  // Replaces the content with bytes; false when the file cannot be written (the target then has
  // nothing to read and returns).
  bool write(std::string_view bytes) const;

  const std::string& path() const { return path_; }
  const std::wstring& wpath() const { return wpath_; }

 private:
  std::string path_;
  std::wstring wpath_;
};

}  // namespace dex_fuzz
