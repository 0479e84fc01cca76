#include "ieUtils/IEUtilsFiles.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <filesystem>
#include <set>
#include <string>

#include "hostlibs/FileFuncs.h"
#include "support/TempDir.h"

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;

// ---- Colours

TEST(Html2Rgb, ReadsRedIntoTheLowestByte) {
  unsigned long rgb = 0;
  EXPECT_TRUE(utils::html2Rgb(L"#FF8000", rgb));
  EXPECT_EQ(rgb, 0x0080FFul);
  EXPECT_TRUE(utils::html2Rgb(L"#0a0B0c", rgb));
  EXPECT_EQ(rgb, 0x0C0B0Aul);
}

TEST(Html2Rgb, NeedsSevenCharactersBeginningWithHash) {
  unsigned long rgb = 12345;
  EXPECT_FALSE(utils::html2Rgb(L"FF8000", rgb));
  EXPECT_FALSE(utils::html2Rgb(L"#FF800", rgb));
  EXPECT_FALSE(utils::html2Rgb(L"#FF80001", rgb));
  EXPECT_FALSE(utils::html2Rgb(L"", rgb));
  EXPECT_FALSE(utils::html2Rgb(L"FF8000#", rgb));
  EXPECT_EQ(rgb, 12345ul);
}

TEST(Html2Rgb, NumbersThatCannotBeReadCountAsZero) {
  unsigned long rgb = 1;
  EXPECT_TRUE(utils::html2Rgb(L"#GG8000", rgb));  // the reading stops at the first bad number
  EXPECT_EQ(rgb, 0ul);
  EXPECT_TRUE(utils::html2Rgb(L"#FFZZ00", rgb));
  EXPECT_EQ(rgb, 0x0000FFul);
}

TEST(Rgb2Html, WritesUpperCaseRedGreenBlue) {
  EXPECT_EQ(utils::rgb2Html(0x0080FFul), L"#FF8000");
  EXPECT_EQ(utils::rgb2Html(0ul), L"#000000");
  EXPECT_EQ(utils::rgb2Html(0xFF0A0B0Cul), L"#0C0B0A");
}

TEST(Rgb2Html, RoundTripsThroughHtml2Rgb) {
  unsigned long rgb = 0;
  ASSERT_TRUE(utils::html2Rgb(utils::rgb2Html(0x123456ul), rgb));
  EXPECT_EQ(rgb, 0x123456ul);
}

// ---- File names

TEST(CreateFileName, AddsASeparatorToAFolderWithoutOne) {
  EXPECT_EQ(utils::createFileName(L"/jobs", L"a.txt", true), L"/jobs/a.txt");
  EXPECT_EQ(utils::createFileName(L"/jobs/", L"a.txt", true), L"/jobs/a.txt");
  EXPECT_EQ(utils::createFileName(L"C:\\jobs\\", L"a.txt", true), L"C:\\jobs\\a.txt");
}

TEST(CreateFileName, PutsTheNameInTheFolderOfAPath) {
  EXPECT_EQ(utils::createFileName(L"/jobs/old.txt", L"a.txt", false), L"/jobs/a.txt");
  EXPECT_EQ(utils::createFileName(L"C:\\jobs\\old.txt", L"a.txt", false), L"C:\\jobs\\a.txt");
  EXPECT_EQ(utils::createFileName(L"old.txt", L"a.txt", false), L"a.txt");
  EXPECT_EQ(utils::createFileName(L"", L"a.txt", false), L"a.txt");
}

TEST(GetNameFromFileName, DropsFolderAndExtension) {
  EXPECT_EQ(utils::getNameFromFileName(L"/jobs/road.hal"), L"road");
  EXPECT_EQ(utils::getNameFromFileName(L"C:\\jobs\\road.v1.hal"), L"road.v1");
  EXPECT_EQ(utils::getNameFromFileName(L"road"), L"road");
  EXPECT_EQ(utils::getNameFromFileName(L"/jobs/"), L"");
  EXPECT_EQ(utils::createNameFromFile(L"/jobs/Straße.csv"), L"Straße");
  EXPECT_EQ(utils::createNameFromFile(L""), L"");
  EXPECT_EQ(utils::createNameFromFile(L"/home/.profile"), L".profile");
}

TEST(IsDots, KnowsOnlyTheTwoDotEntries) {
  EXPECT_EQ(utils::isDots(L"."), 1);
  EXPECT_EQ(utils::isDots(L".."), 1);
  EXPECT_EQ(utils::isDots(L"..."), 0);
  EXPECT_EQ(utils::isDots(L".hidden"), 0);
  EXPECT_EQ(utils::isDots(L""), 0);
  EXPECT_EQ(utils::isDots(nullptr), 0);
}

// ---- Folder listings

namespace {

// A folder with files of several extensions, subfolders and a link to a folder.
class FolderListing : public ::testing::Test {
 protected:
  void SetUp() override {
    folder_.write("a.txt", "12345");
    folder_.write("b.TXT", "");
    folder_.write("c.csv", "x");
    folder_.write("Straße.txt", "");
    std::filesystem::create_directory(folder_.file("sub1"));
    std::filesystem::create_directory(folder_.file("sub2.txt"));
    folder_.write("sub1/inner.txt", "");
    std::filesystem::create_directory_symlink(folder_.file("sub1"), folder_.file("link"));
  }

  std::set<std::wstring> names(utils::EFindFolder what, const wchar_t* mask) const {
    vyn_vector<WIN32_FIND_DATAW> found;
    utils::findAllFilesInFolder(found, what, folder_.wpath().c_str(), mask);
    std::set<std::wstring> result;
    for (const WIN32_FIND_DATAW& entry : found)
      result.insert(entry.cFileName);
    EXPECT_EQ(result.size(), found.size());
    return result;
  }

  const WIN32_FIND_DATAW* entryNamed(const vyn_vector<WIN32_FIND_DATAW>& found, const wchar_t* name) const {
    const auto entry = std::find_if(found.begin(), found.end(), [name](const WIN32_FIND_DATAW& e) {
      return std::wstring(e.cFileName) == name;
    });
    return entry == found.end() ? nullptr : &*entry;
  }

  dex_test::TempDir folder_;
};

using Names = std::set<std::wstring>;

}  // namespace

TEST_F(FolderListing, FilesMatchingAnExtensionIgnoreCase) {
  EXPECT_EQ(names(utils::FIND_FILES, L".txt"), (Names{L"a.txt", L"b.TXT", L"Straße.txt"}));
  EXPECT_EQ(names(utils::FIND_FILES, L"*.csv"), (Names{L"c.csv"}));
}

TEST_F(FolderListing, NullMaskListsEveryFile) {
  EXPECT_EQ(names(utils::FIND_FILES, nullptr), (Names{L"a.txt", L"b.TXT", L"c.csv", L"Straße.txt"}));
  EXPECT_EQ(names(utils::FIND_FILES, L".*"), names(utils::FIND_FILES, nullptr));
}

TEST_F(FolderListing, FoldersLeaveOutTheDotEntries) {
  EXPECT_EQ(names(utils::FIND_FOLDERS, nullptr), (Names{L"sub1", L"sub2.txt", L"link"}));
  EXPECT_EQ(names(utils::FIND_FOLDERS, L".txt"), (Names{L"sub2.txt"}));
}

TEST_F(FolderListing, BothKindsAndNoSubfolderContents) {
  EXPECT_EQ(names(utils::FIND_FILES_AND_FOLDERS, L".txt"),
            (Names{L"a.txt", L"b.TXT", L"Straße.txt", L"sub2.txt"}));
  EXPECT_EQ(names(static_cast<utils::EFindFolder>(0), nullptr), Names{});
}

TEST_F(FolderListing, MaskFollowsTheLeadingAsterisk) {
  EXPECT_EQ(names(utils::FIND_FILES, L"e.txt"), (Names{L"Straße.txt"}));
  EXPECT_EQ(names(utils::FIND_FILES, L"?.TXT"), (Names{L"a.txt", L"b.TXT", L"Straße.txt"}));
  EXPECT_EQ(names(utils::FIND_FILES, L"ß?.txt"), (Names{L"Straße.txt"}));
  EXPECT_EQ(names(utils::FIND_FILES, L"nothing"), Names{});
}

TEST_F(FolderListing, EntriesCarryAttributesSizesAndTimes) {
  ASSERT_EQ(chmod(folder_.file("c.csv").c_str(), 0444), 0);
  vyn_vector<WIN32_FIND_DATAW> found;
  utils::findAllFilesInFolder(found, utils::FIND_FILES_AND_FOLDERS, folder_.wpath().c_str(), nullptr);

  const WIN32_FIND_DATAW* file = entryNamed(found, L"a.txt");
  ASSERT_NE(file, nullptr);
  EXPECT_EQ(file->dwFileAttributes, FILE_ATTRIBUTE_NORMAL);
  EXPECT_EQ(file->nFileSizeLow, 5u);
  EXPECT_EQ(file->nFileSizeHigh, 0u);
  const std::uint64_t written =
      (std::uint64_t{file->ftLastWriteTime.dwHighDateTime} << 32) | file->ftLastWriteTime.dwLowDateTime;
  const auto now =
      std::chrono::duration_cast<std::chrono::seconds>(std::chrono::system_clock::now().time_since_epoch())
          .count();
  const std::uint64_t nowTicks = (static_cast<std::uint64_t>(now) + 11644473600ull) * 10000000ull;
  EXPECT_LE(written, nowTicks + 10000000ull * 60);
  EXPECT_GE(written, nowTicks - 10000000ull * 600);
  EXPECT_NE(file->ftCreationTime.dwHighDateTime, 0u);
  EXPECT_NE(file->ftLastAccessTime.dwHighDateTime, 0u);

  const WIN32_FIND_DATAW* readOnly = entryNamed(found, L"c.csv");
  ASSERT_NE(readOnly, nullptr);
  EXPECT_EQ(readOnly->dwFileAttributes, FILE_ATTRIBUTE_READONLY);

  const WIN32_FIND_DATAW* folder = entryNamed(found, L"sub1");
  ASSERT_NE(folder, nullptr);
  EXPECT_EQ(folder->dwFileAttributes, FILE_ATTRIBUTE_DIRECTORY);
  EXPECT_EQ(folder->nFileSizeLow, 0u);
  const WIN32_FIND_DATAW* link = entryNamed(found, L"link");
  ASSERT_NE(link, nullptr);
  EXPECT_EQ(link->dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY, FILE_ATTRIBUTE_DIRECTORY);
}

TEST_F(FolderListing, LinkThatLeadsNowhereIsAFile) {
  std::filesystem::create_symlink(folder_.file("missing"), folder_.file("dangling.txt"));
  EXPECT_EQ(names(utils::FIND_FILES, L".txt"), (Names{L"a.txt", L"b.TXT", L"Straße.txt", L"dangling.txt"}));
}

TEST(FindAllFilesInFolder, MissingOrNullFolderLeavesTheListEmpty) {
  vyn_vector<WIN32_FIND_DATAW> found(3);
  utils::findAllFilesInFolder(found, utils::FIND_FILES_AND_FOLDERS, L"/no/such/folder/dexchange", nullptr);
  EXPECT_TRUE(found.empty());
  found.resize(2);
  utils::findAllFilesInFolder(found, utils::FIND_FILES, nullptr, L".txt");
  EXPECT_TRUE(found.empty());
}

TEST(FindAllFilesInFolder, FolderWithTrailingSeparator) {
  const dex_test::TempDir folder;
  folder.write("x.dat", "");
  vyn_vector<WIN32_FIND_DATAW> found;
  utils::findAllFilesInFolder(found, utils::FIND_FILES, (folder.wpath() + L"/").c_str(), L".dat");
  ASSERT_EQ(found.size(), 1u);
  EXPECT_STREQ(found[0].cFileName, L"x.dat");
}

TEST(FindAllFilesInFolder, LongestNamesFitTheEntry) {
  const dex_test::TempDir folder;
  const std::string longName(255, 'n');
  folder.write(longName, "");
  vyn_vector<WIN32_FIND_DATAW> found;
  utils::findAllFilesInFolder(found, utils::FIND_FILES, folder.wpath().c_str(), nullptr);
  ASSERT_EQ(found.size(), 1u);
  EXPECT_EQ(std::wstring(found[0].cFileName), std::wstring(255, L'n'));
}

// ---- Assist-data folder

namespace {

// Leaves the process-wide folder empty again after each test.
class AssistDataPath : public ::testing::Test {
 protected:
  void TearDown() override { utils::setIEAssistDataPath(String()); }
};

}  // namespace

TEST_F(AssistDataPath, DefaultsToTheProgramFolder) {
  const String folder = vyn::folders::getExeDir();
  ASSERT_FALSE(folder.IsEmpty());
  EXPECT_EQ(utils::getIEAssistDataPath(), folder + L"/vyndata/ie_assist");
}

TEST_F(AssistDataPath, TheFolderSetWinsUntilItIsEmptiedAgain) {
  utils::setIEAssistDataPath(L"/srv/assist");
  EXPECT_EQ(utils::getIEAssistDataPath(), L"/srv/assist");
  utils::setIEAssistDataPath(String());
  EXPECT_EQ(utils::getIEAssistDataPath(), vyn::folders::getExeDir() + L"/vyndata/ie_assist");
}

// ---- Lists and columns

namespace {

utils::StringArray listOf(std::initializer_list<const wchar_t*> texts) {
  utils::StringArray values;
  for (const wchar_t* text : texts)
    values.Add(text);
  return values;
}

}  // namespace

TEST(StringArrayToString, JoinsWithCommasAndAddsNoBlanks) {
  EXPECT_EQ(utils::stringArrayToString(listOf({})), L"");
  EXPECT_EQ(utils::stringArrayToString(listOf({L"a"})), L"a");
  EXPECT_EQ(utils::stringArrayToString(listOf({L"a", L" b", L"", L"c"})), L"a, b,,c");
}

TEST(IsStringInStringArray, ComparesExactly) {
  const utils::StringArray values = listOf({L"Tree", L"Pole"});
  EXPECT_TRUE(utils::isStringInStringArray(values, L"Pole"));
  EXPECT_FALSE(utils::isStringInStringArray(values, L"pole"));
  EXPECT_FALSE(utils::isStringInStringArray(values, L"Pole "));
  EXPECT_FALSE(utils::isStringInStringArray(listOf({}), L""));
}

TEST(GetStringOfSpaces, GivesNothingBelowOne) {
  EXPECT_EQ(utils::getStringOfSpaces(3), L"   ");
  EXPECT_EQ(utils::getStringOfSpaces(0), L"");
  EXPECT_EQ(utils::getStringOfSpaces(-2), L"");
}

TEST(GetReportString, CutsALongTextToTheWidth) {
  EXPECT_EQ(utils::getReportString(L' ', 5, false, L"ABCDEFG", false), L"ABCDE");
  EXPECT_EQ(utils::getReportString(L' ', 5, false, L"ABCDEFG", true), L"ABCD ");
  EXPECT_EQ(utils::getReportString(L'.', 5, true, L"ABCDEFG", true), L".ABCD");
}

TEST(GetReportString, TextOfExactlyTheWidthLosesItsLastCharacterOnlyWithKeepGap) {
  EXPECT_EQ(utils::getReportString(L' ', 5, false, L"ABCDE", false), L"ABCDE");
  EXPECT_EQ(utils::getReportString(L' ', 5, false, L"ABCDE", true), L"ABCD ");
  EXPECT_EQ(utils::getReportString(L'_', 1, false, L"A", true), L"_");
}

TEST(GetReportString, PadsAShortTextOnTheChosenSide) {
  EXPECT_EQ(utils::getReportString(L'.', 5, true, L"AB", true), L"...AB");
  EXPECT_EQ(utils::getReportString(L'.', 5, false, L"AB", false), L"AB...");
  EXPECT_EQ(utils::getReportString(L' ', 3, false, L"", false), L"   ");
}

TEST(GetReportString, NoWidthGivesNothing) {
  EXPECT_EQ(utils::getReportString(L' ', 0, false, L"AB", false), L"");
  EXPECT_EQ(utils::getReportString(L' ', -3, true, L"AB", true), L"");
}
