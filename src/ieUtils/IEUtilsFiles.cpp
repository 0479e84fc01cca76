#include "ieUtils/IEUtilsFiles.h"

#include <dirent.h>
#include <fcntl.h>
#include <fnmatch.h>
#include <sys/stat.h>

#include <algorithm>
#include <cstdint>
#include <cwchar>
#include <memory>
#include <string>
#include <string_view>
#include <utility>

#include "hostlibs/FileFuncs.h"
#include "hostlibs/detail/CLocale.h"
#include "hostlibs/detail/Utf.h"

namespace vyn::ie::utils {

namespace {

using String = CVynStringT<wchar_t>;

constexpr wchar_t kFolderSeparator = L'/';
constexpr std::wstring_view kAssistDataSubfolder = L"/vyndata/ie_assist";

bool isSeparator(wchar_t ch) {
  return ch == L'/' || ch == L'\\';
}

// ---- Colours

constexpr int kGreenShift = 8;
constexpr int kBlueShift = 16;
constexpr unsigned long kColourByte = 0xFFu;

// Like the host system's colour macro, each part keeps only its low byte.
constexpr unsigned long packColour(unsigned long red, unsigned long green, unsigned long blue) {
  return (red & kColourByte) | ((green & kColourByte) << kGreenShift) | ((blue & kColourByte) << kBlueShift);
}

constexpr unsigned colourPart(unsigned long rgb, int shift) {
  return static_cast<unsigned>((rgb >> shift) & kColourByte);
}

// ---- Folder listings

struct DirCloser {
  void operator()(DIR* dir) const { closedir(dir); }
};
using DirHandle = std::unique_ptr<DIR, DirCloser>;

// 100-nanosecond intervals between 1601-01-01 and 1970-01-01.
constexpr std::int64_t kFileTimeEpochOffset = 116444736000000000LL;
constexpr std::int64_t kFileTimeTicksPerSecond = 10000000LL;
constexpr std::int64_t kNanosecondsPerFileTimeTick = 100;

FILETIME toFileTime(const timespec& time) {
  const std::int64_t ticks = kFileTimeEpochOffset + time.tv_sec * kFileTimeTicksPerSecond +
                             time.tv_nsec / kNanosecondsPerFileTimeTick;
  const auto value = static_cast<std::uint64_t>(std::max<std::int64_t>(ticks, 0));
  FILETIME fileTime;
  fileTime.dwLowDateTime = static_cast<DWORD>(value & 0xFFFFFFFFu);
  fileTime.dwHighDateTime = static_cast<DWORD>(value >> 32);
  return fileTime;
}

DWORD attributesOf(const struct stat& status) {
  DWORD attributes = 0;
  if (S_ISDIR(status.st_mode)) attributes |= FILE_ATTRIBUTE_DIRECTORY;
  if ((status.st_mode & S_IWUSR) == 0) attributes |= FILE_ATTRIBUTE_READONLY;
  return attributes == 0 ? FILE_ATTRIBUTE_NORMAL : attributes;
}

WIN32_FIND_DATAW makeFindData(std::string_view name, const struct stat& status) {
  WIN32_FIND_DATAW entry;
  const std::wstring wideName = vyn_text::detail::fromUtf8(name);
  const std::size_t length = std::min<std::size_t>(wideName.size(), MAX_PATH - 1);
  std::wmemcpy(entry.cFileName, wideName.data(), length);
  entry.cFileName[length] = L'\0';
  entry.dwFileAttributes = attributesOf(status);
  if (!S_ISDIR(status.st_mode)) {
    const auto size = static_cast<std::uint64_t>(std::max<off_t>(status.st_size, 0));
    entry.nFileSizeHigh = static_cast<DWORD>(size >> 32);
    entry.nFileSizeLow = static_cast<DWORD>(size & 0xFFFFFFFFu);
  }
  entry.ftCreationTime = toFileTime(status.st_ctim);
  entry.ftLastAccessTime = toFileTime(status.st_atim);
  entry.ftLastWriteTime = toFileTime(status.st_mtim);
  return entry;
}

// The status of an entry, following a link; a link that leads nowhere is described as itself.
bool statusOf(int folder, const char* name, struct stat& status) {
  return fstatat(folder, name, &status, 0) == 0 || fstatat(folder, name, &status, AT_SYMLINK_NOFOLLOW) == 0;
}

// The pattern an entry name must match. The host system matches "*.*" against every name, dotted or
// not, and ignores case.
class NameMatcher {
 public:
  explicit NameMatcher(const wchar_t* mask) {
    pattern_.push_back('*');
    if (mask != nullptr) pattern_.append(vyn_text::toUtf8(mask));
    if (pattern_ == "*.*") pattern_.resize(1);
  }
  bool matches(const char* name) const {
    const vyn_text::detail::CLocaleScope utf8Locale;  // multibyte names compare as characters
    return fnmatch(pattern_.c_str(), name, FNM_CASEFOLD) == 0;
  }

 private:
  std::string pattern_;
};

bool isWanted(EFindFolder what, bool isFolder, std::string_view name) {
  if (!isFolder) return (what & FIND_FILES) != 0;
  return (what & FIND_FOLDERS) != 0 && name != "." && name != "..";
}

// ---- Assist-data folder

String& assistDataPath() {
  static String path;
  return path;
}

}  // namespace

bool html2Rgb(const String& html, unsigned long& rgb) {
  if (html.GetLength() != 7 || html[0] != L'#') return false;
  unsigned red = 0;
  unsigned green = 0;
  unsigned blue = 0;
  {
    const vyn_text::detail::CLocaleScope cLocale;
    static_cast<void>(std::swscanf(html.GetString() + 1, L"%2X%2X%2X", &red, &green, &blue));
  }
  rgb = packColour(red, green, blue);
  return true;
}

String rgb2Html(const unsigned long& rgb) {
  String html;
  html.Format(L"#%02X%02X%02X", colourPart(rgb, 0), colourPart(rgb, kGreenShift),
              colourPart(rgb, kBlueShift));
  return html;
}

String createFileName(const String& place, const String& name, bool placeIsFolder) {
  if (!placeIsFolder) return vyn::file_names::extractDirNameWithSlashFromPathName(place) + name;
  String fileName = place;
  if (!isSeparator(place.GetAt(place.GetLength() - 1))) fileName += kFolderSeparator;
  return fileName + name;
}

String createNameFromFile(const String& path) {
  return vyn::file_names::extractFileNameWithoutExtFromPathName(path);
}

String getNameFromFileName(const String& path) {
  return vyn::file_names::extractFileNameWithoutExtFromPathName(path);
}

int isDots(const wchar_t* name) {
  if (name == nullptr) return 0;
  const std::wstring_view text(name);
  return text == L"." || text == L".." ? 1 : 0;
}

void findAllFilesInFolder(vyn_vector<WIN32_FIND_DATAW>& found, EFindFolder what, const wchar_t* folder,
                          const wchar_t* mask) {
  found.clear();
  if (folder == nullptr) return;
  const DirHandle dir(opendir((vyn_text::toUtf8(folder) + "/").c_str()));
  if (!dir) return;
  const NameMatcher matcher(mask);
  while (const dirent* entry = readdir(dir.get())) {
    struct stat status {};
    if (!statusOf(dirfd(dir.get()), entry->d_name, status)) continue;
    if (!isWanted(what, S_ISDIR(status.st_mode), entry->d_name) || !matcher.matches(entry->d_name)) continue;
    found.push_back(makeFindData(entry->d_name, status));
  }
}

String getIEAssistDataPath() {
  const String& path = assistDataPath();
  if (!path.IsEmpty()) return path;
  return vyn::folders::getExeDir() + String(kAssistDataSubfolder);
}

void setIEAssistDataPath(String path) {
  assistDataPath() = std::move(path);
}

String stringArrayToString(const StringArray& values) {
  String joined;
  for (int i = 0; i < values.GetSize(); ++i) {
    if (i > 0) joined += L',';
    joined += values[i];
  }
  return joined;
}

bool isStringInStringArray(const StringArray& values, const String& text) {
  return std::any_of(values.begin(), values.end(), [&text](const String& value) { return value == text; });
}

String getStringOfSpaces(int n) {
  return n < 1 ? String() : String(L' ', n);
}

String getReportString(wchar_t fill, int width, bool alignRight, const String& text, bool keepGap) {
  if (width <= 0) return String();
  String shown = text;
  if (width <= text.GetLength()) shown = text.Left(keepGap ? width - 1 : width);
  const String pad = width > shown.GetLength() ? String(fill, width - shown.GetLength()) : String();
  return alignRight ? pad + shown : shown + pad;
}

}  // namespace vyn::ie::utils
