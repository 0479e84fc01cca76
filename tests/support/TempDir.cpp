#include "support/TempDir.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>

#include "hostlibs/VynString.h"

namespace dex_test {

TempDir::TempDir() {
  std::string pattern = (std::filesystem::temp_directory_path() / "dexchange-test-XXXXXX").string();
  if (mkdtemp(pattern.data()) == nullptr) throw std::runtime_error("cannot create a temporary folder");
  path_ = pattern;
}

TempDir::~TempDir() {
  std::error_code ignored;
  std::filesystem::remove_all(path_, ignored);
}

std::wstring TempDir::wpath() const {
  return widen(path_);
}
std::string TempDir::file(std::string_view name) const {
  return path_ + "/" + std::string(name);
}
std::wstring TempDir::wfile(std::string_view name) const {
  return widen(file(name));
}

std::string TempDir::write(std::string_view name, std::string_view bytes) const {
  const std::string target = file(name);
  std::ofstream out(target, std::ios::binary);
  out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
  return target;
}

std::string TempDir::writeRepeated(std::string_view name, std::string_view head, std::string_view block,
                                   std::size_t count, std::string_view tail) const {
  const std::string target = file(name);
  std::ofstream out(target, std::ios::binary);
  out << head;
  for (std::size_t i = 0; i < count; ++i)
    out << block;
  out << tail;
  return target;
}

std::string readFile(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

std::wstring widen(std::string_view utf8) {
  return std::wstring(CVynStringT<wchar_t>(std::string(utf8).c_str(), vyn_text::CP_UTF8).view());
}

std::string narrow(std::wstring_view wide) {
  return vyn_text::toUtf8(wide);
}

std::string dataFile(std::string_view relative) {
  return std::string(DEXCHANGE_TEST_DATA_DIR) + "/" + std::string(relative);
}

}  // namespace dex_test
