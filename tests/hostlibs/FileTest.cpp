#include "hostlibs/File.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>

#include "support/OpenFiles.h"
#include "support/TempDir.h"

namespace {

bool writeText(base::CFile& file, std::string_view text) {
  return file.Write(text.data(), text.size());
}

TEST(CFile, WritesWhatReadsBack) {
  const dex_test::TempDir dir;
  const std::wstring path = dir.wfile("data.bin");
  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(path.c_str()));
  EXPECT_TRUE(file.Opened());
  const std::string bytes(
      "\xFF\xFE"
      "a\0b\r\n",
      7);
  EXPECT_TRUE(writeText(file, bytes));
  EXPECT_TRUE(file.Close());
  EXPECT_FALSE(file.Opened());
  EXPECT_EQ(dex_test::readFile(dir.file("data.bin")), bytes);

  ASSERT_TRUE(file.OpenForReading(path.c_str()));
  char buffer[16] = {};
  EXPECT_EQ(file.Read(buffer, sizeof buffer), bytes.size());
  EXPECT_EQ(std::string(buffer, bytes.size()), bytes);
  EXPECT_EQ(file.Read(buffer, sizeof buffer), 0u);
}

TEST(CFile, TruncatesOnWritingAndExtendsOnAppending) {
  const dex_test::TempDir dir;
  const std::string path = dir.write("log.txt", "old content");
  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(dex_test::widen(path).c_str()));
  EXPECT_TRUE(writeText(file, "new"));
  file.Close();
  EXPECT_EQ(dex_test::readFile(path), "new");
  ASSERT_TRUE(file.OpenForAppending(dex_test::widen(path).c_str()));
  EXPECT_TRUE(writeText(file, "+more"));
  file.Close();
  EXPECT_EQ(dex_test::readFile(path), "new+more");
}

TEST(CFile, CollectsManySmallWritesAndLargeOnes) {
  const dex_test::TempDir dir;
  const std::wstring path = dir.wfile("many.bin");
  std::string expected;
  {
    base::CFile file;
    ASSERT_TRUE(file.OpenForWriting(path.c_str()));
    for (int i = 0; i < 20000; ++i) {
      const std::string piece = std::to_string(i) + ';';
      ASSERT_TRUE(writeText(file, piece));
      expected += piece;
    }
    const std::string block(200000, 'z');
    ASSERT_TRUE(writeText(file, block));
    expected += block;
    ASSERT_TRUE(file.Flush());
    EXPECT_EQ(dex_test::readFile(dir.file("many.bin")), expected);
    ASSERT_TRUE(writeText(file, "tail"));
    expected += "tail";
  }  // the destructor writes what is left
  EXPECT_EQ(dex_test::readFile(dir.file("many.bin")), expected);
}

TEST(CFile, RefusesPathsItCannotOpen) {
  const dex_test::TempDir dir;
  base::CFile file;
  EXPECT_FALSE(file.OpenForWriting(dir.wfile("missing-folder/out.txt").c_str()));
  EXPECT_FALSE(file.OpenForAppending(dir.wfile("missing-folder/out.txt").c_str()));
  EXPECT_FALSE(file.OpenForReading(dir.wfile("missing.txt").c_str()));
  EXPECT_FALSE(file.OpenForReading(dir.wpath().c_str()));
  EXPECT_FALSE(file.OpenForWriting(dir.wpath().c_str()));
  EXPECT_FALSE(file.OpenForWriting(L""));
  EXPECT_FALSE(file.OpenForWriting(nullptr));
  EXPECT_FALSE(file.Opened());
}

TEST(CFile, AnswersFailureWhenClosedOrUsedTheWrongWay) {
  const dex_test::TempDir dir;
  base::CFile file;
  char buffer[4];
  EXPECT_EQ(file.Read(buffer, sizeof buffer), 0u);
  EXPECT_FALSE(writeText(file, "x"));
  EXPECT_TRUE(file.Close());

  const std::string path = dir.write("in.txt", "abc");
  ASSERT_TRUE(file.OpenForReading(dex_test::widen(path).c_str()));
  EXPECT_FALSE(writeText(file, "x"));
  ASSERT_TRUE(file.OpenForWriting(dir.wfile("out.txt").c_str()));
  EXPECT_EQ(file.Read(buffer, sizeof buffer), 0u);
  EXPECT_EQ(dex_test::readFile(path), "abc");
}

TEST(CFile, ReportsAWriteTheSystemRefuses) {
  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(L"/dev/full"));
  EXPECT_TRUE(writeText(file, "collected"));
  EXPECT_FALSE(file.Close());
}

TEST(CFile, HandsItsFileOverWhenMoved) {
  const dex_test::TempDir dir;
  base::CFile first;
  ASSERT_TRUE(first.OpenForWriting(dir.wfile("moved.txt").c_str()));
  ASSERT_TRUE(writeText(first, "one"));
  base::CFile second(std::move(first));
  EXPECT_FALSE(first.Opened());  // NOLINT(bugprone-use-after-move): the moved-from state is defined
  EXPECT_TRUE(second.Opened());
  base::CFile third;
  third = std::move(second);
  ASSERT_TRUE(writeText(third, "two"));
  EXPECT_TRUE(third.Close());
  EXPECT_EQ(dex_test::readFile(dir.file("moved.txt")), "onetwo");
}

TEST(CFile, ClosesItsFileWhenReopenedClosedOrDestroyed) {
  const dex_test::TempDir dir;
  const int before = dex_test::openFileDescriptors();
  {
    base::CFile file;
    file.OpenForWriting(dir.wfile("a.txt").c_str());
    file.OpenForAppending(dir.wfile("a.txt").c_str());
    file.OpenForReading(dir.wfile("missing.txt").c_str());
    EXPECT_EQ(dex_test::openFileDescriptors(), before);
    file.OpenForReading(dir.wfile("a.txt").c_str());
    EXPECT_EQ(dex_test::openFileDescriptors(), before + 1);
  }
  EXPECT_EQ(dex_test::openFileDescriptors(), before);
}

TEST(CFile, OpensNamesWithNonAsciiCharacters) {
  const dex_test::TempDir dir;
  const std::wstring path = dir.wpath() + L"/Größe 東京.txt";
  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(path.c_str()));
  EXPECT_TRUE(writeText(file, "x"));
  file.Close();
  EXPECT_EQ(dex_test::readFile(dir.file("Größe 東京.txt")), "x");
}

}  // namespace
