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

TEST(CFile, WritesWhatReadsBackTruncatesAndAppends) {
  const dex_test::TempDir dir;
  const std::wstring path = dex_test::widen(dir.write("data.bin", "old content"));
  const std::string bytes(
      "\xFF\xFE"
      "a\0b\r\n",
      7);
  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(path.c_str()));
  EXPECT_TRUE(file.Opened());
  EXPECT_TRUE(writeText(file, bytes));
  EXPECT_TRUE(file.Close());
  EXPECT_FALSE(file.Opened());
  ASSERT_TRUE(file.OpenForAppending(path.c_str()));
  EXPECT_TRUE(writeText(file, "+more"));
  file.Close();
  ASSERT_TRUE(file.OpenForReading(path.c_str()));
  char buffer[16] = {};
  EXPECT_EQ(file.Read(buffer, sizeof buffer), bytes.size() + 5);
  EXPECT_EQ(std::string(buffer, bytes.size() + 5), bytes + "+more");
  EXPECT_EQ(file.Read(buffer, sizeof buffer), 0u);
}

TEST(CFile, CollectsManySmallWritesAndLargeOnesAndWritesTheRestWhenDestroyed) {
  const dex_test::TempDir dir;
  std::string expected;
  {
    base::CFile file;
    ASSERT_TRUE(file.OpenForWriting(dir.wfile("many.bin").c_str()));
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
  }
  EXPECT_EQ(dex_test::readFile(dir.file("many.bin")), expected);
}

TEST(CFile, RefusesPathsItCannotOpenAndUsesTheWrongWay) {
  const dex_test::TempDir dir;
  base::CFile file;
  char buffer[4];
  EXPECT_EQ(file.Read(buffer, sizeof buffer), 0u);
  EXPECT_FALSE(writeText(file, "x"));
  EXPECT_TRUE(file.Close());
  EXPECT_FALSE(file.OpenForWriting(dir.wfile("missing-folder/out.txt").c_str()));
  EXPECT_FALSE(file.OpenForAppending(dir.wfile("missing-folder/out.txt").c_str()));
  EXPECT_FALSE(file.OpenForReading(dir.wfile("missing.txt").c_str()));
  EXPECT_FALSE(file.OpenForReading(dir.wpath().c_str()));
  EXPECT_FALSE(file.OpenForWriting(dir.wpath().c_str()));
  EXPECT_FALSE(file.OpenForWriting(L"") || file.OpenForWriting(nullptr) || file.Opened());

  const std::string path = dir.write("in.txt", "abc");
  ASSERT_TRUE(file.OpenForReading(dex_test::widen(path).c_str()));
  EXPECT_FALSE(writeText(file, "x"));
  ASSERT_TRUE(file.OpenForWriting(dir.wfile("out.txt").c_str()));
  EXPECT_EQ(file.Read(buffer, sizeof buffer), 0u);
  EXPECT_EQ(dex_test::readFile(path), "abc");
  // A write the system refuses shows when the collected bytes go out.
  ASSERT_TRUE(file.OpenForWriting(L"/dev/full"));
  EXPECT_TRUE(writeText(file, "collected"));
  EXPECT_FALSE(file.Close());
}

TEST(CFile, HandsItsFileOverWhenMovedAndClosesItOnEveryPath) {
  const dex_test::TempDir dir;
  const int before = dex_test::openFileDescriptors();
  {
    base::CFile first;
    ASSERT_TRUE(first.OpenForWriting(dir.wpath().append(L"/Größe 東京.txt").c_str()));
    ASSERT_TRUE(writeText(first, "one"));
    base::CFile second(std::move(first));
    EXPECT_FALSE(first.Opened());  // NOLINT(bugprone-use-after-move): the moved-from state is defined
    base::CFile third;
    third = std::move(second);
    ASSERT_TRUE(writeText(third, "two"));
    EXPECT_TRUE(third.Close());
    third.OpenForWriting(dir.wfile("a.txt").c_str());
    third.OpenForAppending(dir.wfile("a.txt").c_str());
    third.OpenForReading(dir.wfile("missing.txt").c_str());
    EXPECT_EQ(dex_test::openFileDescriptors(), before);
    third.OpenForReading(dir.wfile("a.txt").c_str());
    EXPECT_EQ(dex_test::openFileDescriptors(), before + 1);
  }
  EXPECT_EQ(dex_test::openFileDescriptors(), before);
  EXPECT_EQ(dex_test::readFile(dir.file("Größe 東京.txt")), "onetwo");
}

}  // namespace
