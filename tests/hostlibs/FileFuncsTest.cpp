#include "hostlibs/FileFuncs.h"

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <filesystem>
#include <string>

#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using vyn::file_names::extractDirNameWithSlashFromPathName;
using vyn::file_names::extractExtFromPathName;
using vyn::file_names::extractFileNameFromPathName;
using vyn::file_names::extractFileNameWithoutExtFromPathName;

TEST(FileFuncsDelFile, DeletesAFile) {
  const dex_test::TempDir dir;
  const std::string path = dir.write("old.txt", "x");
  EXPECT_TRUE(FileFuncs::DelFile(dex_test::widen(path).c_str(), false));
  EXPECT_FALSE(std::filesystem::exists(path));
}

TEST(FileFuncsDelFile, DeletesAReadOnlyFileOnlyWhenForced) {
  const dex_test::TempDir dir;
  const std::string path = dir.write("locked.txt", "x");
  ASSERT_EQ(::chmod(path.c_str(), 0444), 0);
  EXPECT_FALSE(FileFuncs::DelFile(dex_test::widen(path).c_str(), false));
  EXPECT_TRUE(std::filesystem::exists(path));
  EXPECT_TRUE(FileFuncs::DelFile(dex_test::widen(path).c_str(), true));
  EXPECT_FALSE(std::filesystem::exists(path));
}

TEST(FileFuncsDelFile, AnswersFalseForMissingFilesFoldersAndEmptyPaths) {
  const dex_test::TempDir dir;
  EXPECT_FALSE(FileFuncs::DelFile(dir.wfile("missing.txt").c_str(), true));
  EXPECT_FALSE(FileFuncs::DelFile(dir.wpath().c_str(), true));
  EXPECT_TRUE(std::filesystem::exists(dir.path()));
  EXPECT_FALSE(FileFuncs::DelFile(L"", true));
  EXPECT_FALSE(FileFuncs::DelFile(nullptr, true));
}

TEST(FileFuncsMakeFileNameValid, ReplacesCharactersNoFileNameMayHold) {
  EXPECT_EQ(FileFuncs::MakeFileNameValid(L"a\\b/c:d*e?f\"g<h>i|j"), L"a_b_c_d_e_f_g_h_i_j");
  EXPECT_EQ(FileFuncs::MakeFileNameValid(L"tab\there\nnew\x01"), L"tab_here_new_");
  EXPECT_EQ(FileFuncs::MakeFileNameValid(L"Road 1 (east) - Größe.v2"), L"Road 1 (east) - Größe.v2");
  EXPECT_EQ(FileFuncs::MakeFileNameValid(L""), L"");
  EXPECT_EQ(FileFuncs::MakeFileNameValid(nullptr), L"");
}

TEST(FileFuncsCompactPath, LeavesShortPathsAlone) {
  const wchar_t* path = L"/home/surveyor/jobs/job.xml";
  EXPECT_EQ(FileFuncs::CompactPath(nullptr, path, true), path);
  const std::wstring atLimit(FileFuncs::kCompactPathLength, L'a');
  EXPECT_EQ(FileFuncs::CompactPath(nullptr, atLimit.c_str(), false), atLimit.c_str());
}

TEST(FileFuncsCompactPath, KeepsTheFileNameAndWholeFolderNames) {
  const wchar_t* path = L"/home/surveyor/projects/2024/motorway-extension/section-b/exports/road-design.xml";
  const CVynStringT<wchar_t> shortened = FileFuncs::CompactPath(nullptr, path, true);
  EXPECT_EQ(shortened, L"/home/surveyor/projects/2024/.../road-design.xml");
  EXPECT_LE(shortened.GetLength(), FileFuncs::kCompactPathLength);
}

TEST(FileFuncsCompactPath, CutsInsideAFolderNameWhenNoSeparatorHelps) {
  const std::wstring path = L"C:\\" + std::wstring(80, L'f') + L"\\job.xml";
  const CVynStringT<wchar_t> shortened = FileFuncs::CompactPath(nullptr, path.c_str(), true);
  EXPECT_EQ(shortened.GetLength(), FileFuncs::kCompactPathLength);
  EXPECT_EQ(shortened.Right(11), L"...\\job.xml");
  EXPECT_EQ(shortened.Left(3), L"C:\\");
}

TEST(FileFuncsCompactPath, NeverCutsTheFileName) {
  const std::wstring name(70, L'n');
  const std::wstring path = L"/data/" + name;
  EXPECT_EQ(FileFuncs::CompactPath(nullptr, path.c_str(), true), (L".../" + name).c_str());
  EXPECT_EQ(FileFuncs::CompactPath(nullptr, name.c_str(), true), name.c_str());
}

TEST(FileFuncsCompactPath, CutsTheEndWithoutKeepFileName) {
  const std::wstring path = L"/data/" + std::wstring(70, L'n');
  const CVynStringT<wchar_t> shortened = FileFuncs::CompactPath(nullptr, path.c_str(), false);
  EXPECT_EQ(shortened, (path.substr(0, FileFuncs::kCompactPathLength - 3) + L"...").c_str());
  EXPECT_EQ(FileFuncs::CompactPath(nullptr, nullptr, true), L"");
}

TEST(FileNames, TakesPathsApartAtEitherSeparator) {
  EXPECT_EQ(extractFileNameFromPathName(L"C:\\jobs\\road.hal"), L"road.hal");
  EXPECT_EQ(extractFileNameFromPathName(L"/jobs/sub\\road.hal"), L"road.hal");
  EXPECT_EQ(extractFileNameWithoutExtFromPathName(L"C:\\jobs\\road.hal"), L"road");
  EXPECT_EQ(extractFileNameWithoutExtFromPathName(L"/jobs/road.v2.hal"), L"road.v2");
  EXPECT_EQ(extractFileNameWithoutExtFromPathName(L"/jobs.d/road"), L"road");
  EXPECT_EQ(extractExtFromPathName(L"/jobs/road.v2.HAL"), L"HAL");
  EXPECT_EQ(extractExtFromPathName(L"/jobs.d/road"), L"");
  EXPECT_EQ(extractDirNameWithSlashFromPathName(L"C:\\jobs\\road.hal"), L"C:\\jobs\\");
  EXPECT_EQ(extractDirNameWithSlashFromPathName(L"/jobs\\sub/road.hal"), L"/jobs\\sub/");
}

TEST(FileNames, HandlesNamesWithoutFolderExtensionOrName) {
  EXPECT_EQ(extractDirNameWithSlashFromPathName(L"road.hal"), L"");
  EXPECT_EQ(extractFileNameFromPathName(L"/jobs/"), L"");
  EXPECT_EQ(extractFileNameWithoutExtFromPathName(L"/home/.profile"), L".profile");
  EXPECT_EQ(extractExtFromPathName(L"/home/.profile"), L"");
  EXPECT_EQ(extractExtFromPathName(L"road."), L"");
  EXPECT_EQ(extractFileNameWithoutExtFromPathName(L"road."), L"road");
  EXPECT_EQ(extractFileNameFromPathName(nullptr), L"");
  EXPECT_EQ(extractDirNameWithSlashFromPathName(nullptr), L"");
}

TEST(Folders, GivesTheFolderOfTheRunningProgram) {
  const std::filesystem::path exe = std::filesystem::canonical("/proc/self/exe");
  const CVynStringT<wchar_t> folder = vyn::folders::getExeDir();
  EXPECT_EQ(folder, dex_test::widen(exe.parent_path().string()).c_str());
  EXPECT_NE(folder.Right(1), L"/");
}

TEST(PathFileExistsW, AnswersForFilesFoldersAndMissingPaths) {
  const dex_test::TempDir dir;
  const std::string file = dir.write("here.txt", "");
  EXPECT_TRUE(PathFileExistsW(dex_test::widen(file).c_str()));
  EXPECT_TRUE(PathFileExistsW(dir.wpath().c_str()));
  EXPECT_FALSE(PathFileExistsW(dir.wfile("missing.txt").c_str()));
  EXPECT_FALSE(PathFileExistsW(L""));
  EXPECT_FALSE(PathFileExistsW(nullptr));
}

}  // namespace
