#include "ieUtils/IEUtilsFiles.h"

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <algorithm>
#include <chrono>
#include <cstdint>
#include <filesystem>
#include <set>
#include <string>
#include <utility>

#include "hostlibs/FileFuncs.h"
#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;
using Names = std::set<std::wstring>;
using Row = std::pair<String, const wchar_t*>;

TEST(UtilsFiles, HtmlColoursReadRedIntoTheLowestByteAndWriteUpperCase) {
  unsigned long rgb = 12345;
  for (const wchar_t* refused : {L"FF8000", L"#FF800", L"#FF80001", L"", L"FF8000#"})
    EXPECT_FALSE(utils::html2Rgb(refused, rgb)) << refused;
  EXPECT_EQ(rgb, 12345ul);
  const std::pair<const wchar_t*, unsigned long> read[] = {
      {L"#FF8000", 0x0080FF},
      {L"#0a0B0c", 0x0C0B0A},
      {L"#GG8000", 0},  // the reading stops at a bad number
      {L"#FFZZ00", 0x0000FF}};
  for (const auto& [html, value] : read) {
    EXPECT_TRUE(utils::html2Rgb(html, rgb));
    EXPECT_EQ(rgb, value) << html;
  }
  EXPECT_EQ(utils::rgb2Html(0x0080FFul), L"#FF8000");
  EXPECT_EQ(utils::rgb2Html(0xFF0A0B0Cul), L"#0C0B0A");
}

TEST(UtilsFiles, FileNamesListsAndReportColumns) {
  const Row rows[] = {{utils::createFileName(L"/jobs", L"a.txt", true), L"/jobs/a.txt"},
                      {utils::createFileName(L"/jobs/", L"a.txt", true), L"/jobs/a.txt"},
                      {utils::createFileName(L"C:\\jobs\\", L"a.txt", true), L"C:\\jobs\\a.txt"},
                      {utils::createFileName(L"C:\\jobs\\old.txt", L"a.txt", false), L"C:\\jobs\\a.txt"},
                      {utils::createFileName(L"old.txt", L"a.txt", false), L"a.txt"},
                      {utils::getNameFromFileName(L"C:\\jobs\\road.v1.hal"), L"road.v1"},
                      {utils::getNameFromFileName(L"/jobs/"), L""},
                      {utils::createNameFromFile(L"/jobs/Straße.csv"), L"Straße"},
                      {utils::createNameFromFile(L"/home/.profile"), L".profile"},
                      {utils::getStringOfSpaces(3), L"   "},
                      {utils::getStringOfSpaces(-2), L""},
                      // a report column cuts a long text, keeps a gap when asked and pads on the chosen side
                      {utils::getReportString(L' ', 5, false, L"ABCDEFG", false), L"ABCDE"},
                      {utils::getReportString(L' ', 5, false, L"ABCDEFG", true), L"ABCD "},
                      {utils::getReportString(L'.', 5, true, L"ABCDEFG", true), L".ABCD"},
                      {utils::getReportString(L' ', 5, false, L"ABCDE", false), L"ABCDE"},
                      {utils::getReportString(L'_', 1, false, L"A", true), L"_"},
                      {utils::getReportString(L'.', 5, true, L"AB", true), L"...AB"},
                      {utils::getReportString(L'.', 5, false, L"AB", false), L"AB..."},
                      {utils::getReportString(L' ', -3, true, L"AB", true), L""}};
  for (const auto& [actual, expected] : rows)
    EXPECT_EQ(actual, expected);
  EXPECT_TRUE(utils::isDots(L".") && utils::isDots(L".."));
  EXPECT_FALSE(utils::isDots(L"...") || utils::isDots(L".hidden") || utils::isDots(L"") ||
               utils::isDots(nullptr));
  utils::StringArray values;
  EXPECT_EQ(utils::stringArrayToString(values), L"");
  EXPECT_FALSE(utils::isStringInStringArray(values, L""));
  for (const wchar_t* text : {L"Tree", L" b", L"", L"Pole"})
    values.Add(text);
  EXPECT_EQ(utils::stringArrayToString(values), L"Tree, b,,Pole");
  EXPECT_TRUE(utils::isStringInStringArray(values, L"Pole"));
  EXPECT_FALSE(utils::isStringInStringArray(values, L"pole") ||
               utils::isStringInStringArray(values, L"Pole "));
}

// The names found in folder for what and mask.
Names found(const std::wstring& folder, utils::EFindFolder what, const wchar_t* mask) {
  vyn_vector<WIN32_FIND_DATAW> entries;
  utils::findAllFilesInFolder(entries, what, folder.c_str(), mask);
  Names names;
  for (const WIN32_FIND_DATAW& entry : entries)
    names.insert(entry.cFileName);
  EXPECT_EQ(names.size(), entries.size());
  return names;
}

TEST(UtilsFiles, FolderListingsMatchMasksIgnoringCaseAndLeaveOutTheDotEntries) {
  const dex_test::TempDir dir;
  for (const char* file : {"a.txt", "b.TXT", "Straße.txt"})
    dir.write(file, "");
  dir.write("c.csv", "x");
  std::filesystem::create_directory(dir.file("sub1"));
  std::filesystem::create_directory(dir.file("sub2.txt"));
  dir.write("sub1/inner.txt", "");
  std::filesystem::create_directory_symlink(dir.file("sub1"), dir.file("link"));
  std::filesystem::create_symlink(dir.file("missing"), dir.file("dangling.txt"));  // a file
  const std::wstring path = dir.wpath();
  EXPECT_EQ(found(path, utils::FIND_FILES, L".txt"),
            (Names{L"a.txt", L"b.TXT", L"Straße.txt", L"dangling.txt"}));
  EXPECT_EQ(found(path, utils::FIND_FILES, L"*.csv"), (Names{L"c.csv"}));
  EXPECT_EQ(found(path, utils::FIND_FILES, nullptr), found(path, utils::FIND_FILES, L".*"));
  EXPECT_EQ(found(path, utils::FIND_FOLDERS, nullptr), (Names{L"sub1", L"sub2.txt", L"link"}));
  EXPECT_EQ(found(path + L"/", utils::FIND_FILES_AND_FOLDERS, L".csv"), (Names{L"c.csv"}));
  EXPECT_EQ(found(path, utils::FIND_FILES_AND_FOLDERS, L".txt").size(), 5u);
  EXPECT_EQ(found(path, static_cast<utils::EFindFolder>(0), nullptr), Names{});
  EXPECT_EQ(found(path, utils::FIND_FILES, L"e.txt"),
            (Names{L"Straße.txt"}));  // the mask follows a leading *
  EXPECT_EQ(found(path, utils::FIND_FILES, L"?.TXT"),
            (Names{L"a.txt", L"b.TXT", L"Straße.txt", L"dangling.txt"}));
  EXPECT_EQ(found(path, utils::FIND_FILES, L"ß?.txt"), (Names{L"Straße.txt"}));
  EXPECT_EQ(found(path, utils::FIND_FILES, L"nothing"), Names{});
  vyn_vector<WIN32_FIND_DATAW> entries(3);
  utils::findAllFilesInFolder(entries, utils::FIND_FILES_AND_FOLDERS, L"/no/such/folder/dexchange", nullptr);
  EXPECT_TRUE(entries.empty());
  entries.resize(2);
  utils::findAllFilesInFolder(entries, utils::FIND_FILES, nullptr, L".txt");
  EXPECT_TRUE(entries.empty());
}

TEST(UtilsFiles, ListedEntriesCarryAttributesSizesTimesAndTheLongestNames) {
  const dex_test::TempDir dir;
  dir.write("a.txt", "12345");
  dir.write("c.csv", "x");
  dir.write(std::string(255, 'n'), "");
  ASSERT_EQ(chmod(dir.file("c.csv").c_str(), 0444), 0);
  std::filesystem::create_directory(dir.file("sub1"));
  std::filesystem::create_directory_symlink(dir.file("sub1"), dir.file("link"));
  vyn_vector<WIN32_FIND_DATAW> entries;
  utils::findAllFilesInFolder(entries, utils::FIND_FILES_AND_FOLDERS, dir.wpath().c_str(), nullptr);
  const auto entry = [&entries](const std::wstring& name) {
    const auto at =
        std::find_if(entries.begin(), entries.end(), [&name](const auto& e) { return e.cFileName == name; });
    return at == entries.end() ? WIN32_FIND_DATAW{} : *at;
  };
  const WIN32_FIND_DATAW file = entry(L"a.txt");
  EXPECT_TRUE(file.dwFileAttributes == FILE_ATTRIBUTE_NORMAL && file.nFileSizeLow == 5u &&
              file.nFileSizeHigh == 0u);
  const std::uint64_t written =
      (std::uint64_t{file.ftLastWriteTime.dwHighDateTime} << 32) | file.ftLastWriteTime.dwLowDateTime;
  const auto now =
      std::chrono::duration_cast<std::chrono::seconds>(std::chrono::system_clock::now().time_since_epoch())
          .count();
  const std::uint64_t nowTicks = (static_cast<std::uint64_t>(now) + 11644473600ull) * 10000000ull;
  EXPECT_TRUE(written <= nowTicks + 10000000ull * 60 && written >= nowTicks - 10000000ull * 600);
  EXPECT_TRUE(file.ftCreationTime.dwHighDateTime != 0u && file.ftLastAccessTime.dwHighDateTime != 0u);
  EXPECT_EQ(entry(L"c.csv").dwFileAttributes, FILE_ATTRIBUTE_READONLY);
  EXPECT_EQ(entry(L"sub1").dwFileAttributes, FILE_ATTRIBUTE_DIRECTORY);
  EXPECT_EQ(entry(L"link").dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY, FILE_ATTRIBUTE_DIRECTORY);
  EXPECT_EQ(entry(std::wstring(255, L'n')).nFileSizeLow, 0u);
  EXPECT_EQ(entries.size(), 5u);
}

TEST(UtilsFiles, AssistDataFolderDefaultsToTheProgramFolderUntilOneIsSet) {
  const String folder = vyn::folders::getExeDir();
  EXPECT_EQ(utils::getIEAssistDataPath(), folder + L"/vyndata/ie_assist");
  utils::setIEAssistDataPath(L"/srv/assist");
  EXPECT_EQ(utils::getIEAssistDataPath(), L"/srv/assist");
  utils::setIEAssistDataPath(String());
  EXPECT_EQ(utils::getIEAssistDataPath(), folder + L"/vyndata/ie_assist");
}

}  // namespace
