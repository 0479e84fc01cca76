#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace dex_test {

// A fresh folder under the system's temporary folder, removed with its contents at the end.
class TempDir {
 public:
  TempDir();
  ~TempDir();
  TempDir(const TempDir&) = delete;
  TempDir& operator=(const TempDir&) = delete;

  const std::string& path() const { return path_; }
  std::wstring wpath() const;
  // Path of a file in the folder (UTF-8, and as a wide string).
  std::string file(std::string_view name) const;
  std::wstring wfile(std::string_view name) const;
  // Writes the bytes to a file in the folder and returns its path.
  std::string write(std::string_view name, std::string_view bytes) const;
  // Writes head, count copies of block, then tail, piece by piece (for files of hundreds of megabytes
  // without holding them in memory), and returns the path.
  std::string writeRepeated(std::string_view name, std::string_view head, std::string_view block,
                            std::size_t count, std::string_view tail) const;

 private:
  std::string path_;
};

// The whole content of a file, or an empty string when it cannot be read.
std::string readFile(const std::string& path);

// The UTF-8 form of a wide text and back, for building file names in tests.
std::wstring widen(std::string_view utf8);
std::string narrow(std::wstring_view wide);

// Path of a file under tests/data.
std::string dataFile(std::string_view relative);

}  // namespace dex_test
