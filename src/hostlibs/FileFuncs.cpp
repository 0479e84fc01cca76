#include "hostlibs/FileFuncs.h"

#include <sys/stat.h>
#include <unistd.h>
#include <cerrno>
#include <string>
#include <string_view>
#include <vector>

#include "hostlibs/detail/Utf.h"

namespace {

using String = CVynStringT<wchar_t>;

constexpr std::wstring_view kSeparators = L"/\\";
constexpr std::wstring_view kEllipsis = L"...";

std::wstring_view viewOf(const wchar_t* text) noexcept {
  return text == nullptr ? std::wstring_view() : std::wstring_view(text);
}

// Offset just after the last separator (0 when there is none): where the file name starts.
std::size_t fileNameStart(std::wstring_view path) noexcept {
  const std::size_t separator = path.find_last_of(kSeparators);
  return separator == std::wstring_view::npos ? 0 : separator + 1;
}

std::wstring_view fileNameOf(std::wstring_view path) noexcept {
  return path.substr(fileNameStart(path));
}

// Offset of the dot that starts the extension in name, or npos.
std::size_t extensionDot(std::wstring_view name) noexcept {
  const std::size_t dot = name.find_last_of(L'.');
  return dot == 0 ? std::wstring_view::npos : dot;
}

bool isForbiddenInFileName(wchar_t ch) noexcept {
  return ch < 0x20 || std::wstring_view(L"\\/:*?\"<>|").find(ch) != std::wstring_view::npos;
}

bool isReadOnly(const struct stat& info) noexcept {
  return (info.st_mode & S_IWUSR) == 0;
}

String compactKeepingFileName(std::wstring_view path) {
  const std::size_t nameStart = fileNameStart(path);
  if (nameStart == 0) return String(path);  // all of it is the file name, which is never cut
  const std::wstring_view tail = path.substr(nameStart - 1);  // the last separator and the file name
  const auto limit = static_cast<std::size_t>(FileFuncs::kCompactPathLength);
  std::wstring result;
  if (tail.size() + kEllipsis.size() < limit) {
    std::wstring_view head = path.substr(0, limit - kEllipsis.size() - tail.size());
    // Whole folder names read better, unless cutting after one would waste most of the room.
    const std::size_t lastSeparator = head.find_last_of(kSeparators);
    if (lastSeparator != std::wstring_view::npos && 2 * (lastSeparator + 1) >= head.size()) {
      head = head.substr(0, lastSeparator + 1);
    }
    result = head;
  }
  result += kEllipsis;
  result += tail;
  return String(std::wstring_view(result));
}

}  // namespace

namespace FileFuncs {

bool DelFile(const wchar_t* path, bool force) {
  if (path == nullptr || *path == L'\0') return false;
  const std::string target = vyn_text::toUtf8(path);
  struct stat info {};
  if (::lstat(target.c_str(), &info) != 0 || S_ISDIR(info.st_mode)) return false;
  const bool madeWritable = isReadOnly(info) && !S_ISLNK(info.st_mode);
  if (madeWritable) {
    if (!force || ::chmod(target.c_str(), (info.st_mode & 07777) | S_IWUSR) != 0) return false;
  }
  if (::unlink(target.c_str()) == 0) return true;
  if (madeWritable) ::chmod(target.c_str(), info.st_mode & 07777);  // leave a file that stays as it was found
  return false;
}

String MakeFileNameValid(const wchar_t* name) {
  std::wstring valid(viewOf(name));
  for (wchar_t& ch : valid) {
    if (isForbiddenInFileName(ch)) ch = L'_';
  }
  return String(std::wstring_view(valid));
}

String CompactPath(HWND /*parent*/, const wchar_t* path, bool keepFileName) {
  const std::wstring_view text = viewOf(path);
  const auto limit = static_cast<std::size_t>(kCompactPathLength);
  if (text.size() <= limit) return String(text);
  if (keepFileName) return compactKeepingFileName(text);
  std::wstring result(text.substr(0, limit - kEllipsis.size()));
  result += kEllipsis;
  return String(std::wstring_view(result));
}

}  // namespace FileFuncs

namespace vyn::file_names {

String extractFileNameFromPathName(const wchar_t* path) {
  return String(fileNameOf(viewOf(path)));
}

String extractFileNameWithoutExtFromPathName(const wchar_t* path) {
  const std::wstring_view name = fileNameOf(viewOf(path));
  return String(name.substr(0, extensionDot(name)));
}

String extractExtFromPathName(const wchar_t* path) {
  const std::wstring_view name = fileNameOf(viewOf(path));
  const std::size_t dot = extensionDot(name);
  return dot == std::wstring_view::npos ? String() : String(name.substr(dot + 1));
}

String extractDirNameWithSlashFromPathName(const wchar_t* path) {
  const std::wstring_view text = viewOf(path);
  return String(text.substr(0, fileNameStart(text)));
}

}  // namespace vyn::file_names

namespace vyn::folders {

String getExeDir() {
  std::vector<char> buffer(256);
  while (true) {
    const ssize_t length = ::readlink("/proc/self/exe", buffer.data(), buffer.size());
    if (length < 0) return String();
    if (static_cast<std::size_t>(length) < buffer.size()) {
      std::string_view exe(buffer.data(), static_cast<std::size_t>(length));
      const std::size_t separator = exe.find_last_of('/');
      exe = exe.substr(0, separator == std::string_view::npos ? 0 : separator);
      if (exe.empty() && separator == 0) exe = "/";  // a program in the root folder
      return String(std::wstring_view(vyn_text::detail::fromUtf8(exe)));
    }
    buffer.resize(buffer.size() * 2);
  }
}

}  // namespace vyn::folders

BOOL PathFileExistsW(const wchar_t* path) {
  if (path == nullptr || *path == L'\0') return 0;
  struct stat info {};
  return ::stat(vyn_text::toUtf8(path).c_str(), &info) == 0 ? 1 : 0;
}
