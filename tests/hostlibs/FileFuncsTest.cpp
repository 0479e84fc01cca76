#include "hostlibs/FileFuncs.h"

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <filesystem>
#include <string>
#include <utility>

#include "support/PrintString.h"
#include "support/Rows.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::file_names;
using TextRow = std::pair<CVynStringT<wchar_t>, CVynStringT<wchar_t>>;

TEST(FileFuncsDelFile, DeletesFilesAndReadOnlyOnesOnlyWhenForced) {
  const dex_test::TempDir dir;
  const std::wstring path = dex_test::widen(dir.write("old.txt", "x"));
  const std::wstring locked = dex_test::widen(dir.write("locked.txt", "x"));
  ASSERT_EQ(::chmod(dir.file("locked.txt").c_str(), 0444), 0);
  EXPECT_TRUE(FileFuncs::DelFile(path.c_str(), false));
  EXPECT_FALSE(FileFuncs::DelFile(locked.c_str(), false));
  EXPECT_TRUE(std::filesystem::exists(dir.file("locked.txt")));
  EXPECT_TRUE(FileFuncs::DelFile(locked.c_str(), true));
  EXPECT_FALSE(std::filesystem::exists(dir.file("locked.txt")) ||
               std::filesystem::exists(dir.file("old.txt")));
  EXPECT_FALSE(FileFuncs::DelFile(dir.wfile("missing.txt").c_str(), true));
  EXPECT_FALSE(FileFuncs::DelFile(dir.wpath().c_str(), true));
  EXPECT_FALSE(FileFuncs::DelFile(L"", true) || FileFuncs::DelFile(nullptr, true));
  EXPECT_TRUE(std::filesystem::exists(dir.path()));
}

TEST(FileFuncs, MakeFileNameValidReplacesCharactersNoFileNameMayHold) {
  const TextRow rows[] = {
      {FileFuncs::MakeFileNameValid(L"a\\b/c:d*e?f\"g<h>i|j"), L"a_b_c_d_e_f_g_h_i_j"},
      {FileFuncs::MakeFileNameValid(L"tab\there\nnew\x01"), L"tab_here_new_"},
      {FileFuncs::MakeFileNameValid(L"Road 1 (east) - Größe.v2"), L"Road 1 (east) - Größe.v2"},
      {FileFuncs::MakeFileNameValid(L""), L""},
      {FileFuncs::MakeFileNameValid(nullptr), L""}};
  dex_test::expectRows(rows);
}

TEST(FileFuncs, CompactPathKeepsTheFileNameAndWholeFolderNamesWhereItCan) {
  const std::wstring atLimit(FileFuncs::kCompactPathLength, L'a');
  const std::wstring name(70, L'n');
  const std::wstring longFolder = L"C:\\" + std::wstring(80, L'f') + L"\\job.xml";
  const CVynStringT<wchar_t> cut = FileFuncs::CompactPath(nullptr, longFolder.c_str(), true);
  const TextRow rows[] = {
      {FileFuncs::CompactPath(nullptr, L"/home/surveyor/jobs/job.xml", true), L"/home/surveyor/jobs/job.xml"},
      {FileFuncs::CompactPath(nullptr, atLimit.c_str(), false), atLimit.c_str()},
      {FileFuncs::CompactPath(
           nullptr, L"/home/surveyor/projects/2024/motorway-extension/section-b/exports/road-design.xml",
           true),
       L"/home/surveyor/projects/2024/.../road-design.xml"},
      // no separator helps: the cut goes inside a folder name, never into the file name
      {cut.Right(11), L"...\\job.xml"},
      {cut.Left(3), L"C:\\"},
      {FileFuncs::CompactPath(nullptr, (L"/data/" + name).c_str(), true), (L".../" + name).c_str()},
      {FileFuncs::CompactPath(nullptr, name.c_str(), true), name.c_str()},
      {FileFuncs::CompactPath(nullptr, (L"/data/" + name).c_str(), false),
       ((L"/data/" + name).substr(0, FileFuncs::kCompactPathLength - 3) + L"...").c_str()},
      {FileFuncs::CompactPath(nullptr, nullptr, true), L""}};
  dex_test::expectRows(rows);
  EXPECT_EQ(cut.GetLength(), FileFuncs::kCompactPathLength);
}

TEST(FileNames, TakesPathsApartAtEitherSeparator) {
  const TextRow rows[] = {{extractFileNameFromPathName(L"C:\\jobs\\road.hal"), L"road.hal"},
                          {extractFileNameFromPathName(L"/jobs/sub\\road.hal"), L"road.hal"},
                          {extractFileNameWithoutExtFromPathName(L"C:\\jobs\\road.hal"), L"road"},
                          {extractFileNameWithoutExtFromPathName(L"/jobs/road.v2.hal"), L"road.v2"},
                          {extractFileNameWithoutExtFromPathName(L"/jobs.d/road"), L"road"},
                          {extractExtFromPathName(L"/jobs/road.v2.HAL"), L"HAL"},
                          {extractExtFromPathName(L"/jobs.d/road"), L""},
                          {extractDirNameWithSlashFromPathName(L"C:\\jobs\\road.hal"), L"C:\\jobs\\"},
                          {extractDirNameWithSlashFromPathName(L"/jobs\\sub/road.hal"), L"/jobs\\sub/"},
                          {extractDirNameWithSlashFromPathName(L"road.hal"), L""},
                          {extractFileNameFromPathName(L"/jobs/"), L""},
                          {extractFileNameWithoutExtFromPathName(L"/home/.profile"), L".profile"},
                          {extractExtFromPathName(L"/home/.profile"), L""},
                          {extractExtFromPathName(L"road."), L""},
                          {extractFileNameWithoutExtFromPathName(L"road."), L"road"},
                          {extractFileNameFromPathName(nullptr), L""},
                          {extractDirNameWithSlashFromPathName(nullptr), L""}};
  dex_test::expectRows(rows);
}

TEST(Folders, GivesTheFolderOfTheRunningProgramAndTellsWhatExists) {
  const std::filesystem::path exe = std::filesystem::canonical("/proc/self/exe");
  EXPECT_EQ(vyn::folders::getExeDir(), dex_test::widen(exe.parent_path().string()).c_str());
  const dex_test::TempDir dir;
  EXPECT_TRUE(PathFileExistsW(dex_test::widen(dir.write("here.txt", "")).c_str()));
  EXPECT_TRUE(PathFileExistsW(dir.wpath().c_str()));
  EXPECT_FALSE(PathFileExistsW(dir.wfile("missing.txt").c_str()));
  EXPECT_FALSE(PathFileExistsW(L""));
  EXPECT_FALSE(PathFileExistsW(nullptr));
}

}  // namespace
