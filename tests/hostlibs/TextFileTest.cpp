#include "hostlibs/TextFile.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "support/OpenFiles.h"
#include "support/TempDir.h"

namespace {

using Encoding = CTextFile::ETextEncoding;
using Lines = std::vector<std::wstring>;

// Every line of a file, read through a fresh CTextFile whose line numbers must follow the lines.
Lines readLines(const std::string& path, int bufferSize = 4096, Encoding* encoding = nullptr) {
  CTextFile file(bufferSize);
  EXPECT_NE(file.Open(dex_test::widen(path).c_str()), 0) << path;
  Lines lines;
  CVynStringT<wchar_t> line;
  while (file.ReadString(line)) {
    lines.emplace_back(line.view());
    EXPECT_EQ(file.GetLineNumber(), static_cast<int>(lines.size()));
  }
  EXPECT_TRUE(line.IsEmpty());
  if (encoding != nullptr) *encoding = file.GetEncoding();
  return lines;
}

std::string textFixture(const char* name) {
  return dex_test::dataFile(std::string("text/") + name);
}

TEST(CTextFile, ReadsTheSameLinesWhateverTheByteOrderMark) {
  const Lines expected = {L"P1,1000.000,2000.000,55.20", L"Größe 東京 \U0001D11E", L"", L"last line"};
  const struct {
    const char* file;
    Encoding encoding;
  } cases[] = {{"lines_utf8_without_bom.txt", Encoding::Utf8},
               {"lines_utf8_with_bom.txt", Encoding::Utf8Bom},
               {"lines_utf16le_with_bom.txt", Encoding::Utf16LE},
               {"lines_utf16be_with_bom.txt", Encoding::Utf16BE}};
  for (const auto& c : cases) {
    Encoding encoding = Encoding::Utf8;
    EXPECT_EQ(readLines(textFixture(c.file), 4096, &encoding), expected) << c.file;
    EXPECT_EQ(encoding, c.encoding) << c.file;
  }
}

TEST(CTextFile, SplitsLinesAtEveryLineEndAndMendsBadBytes) {
  const dex_test::TempDir dir;
  const struct {
    std::string path;
    Lines lines;
  } cases[] = {{textFixture("mixed_line_ends.txt"), {L"crlf", L"lf", L"cr", L"cr cr", L"", L"end"}},
               {textFixture("last_line_without_line_end.txt"), {L"first", L"second"}},
               {dir.write("lf.txt", "only\n"), {L"only"}},
               {dir.write("crlf.txt", "only\r\n"), {L"only"}},
               {dir.write("cr.txt", "only\r"), {L"only"}},
               {dir.write("newline.txt", "\n"), {L""}},
               {textFixture("empty.txt"), {}},
               // invalid UTF-8 bytes are taken as Latin-1, a left-over byte or a lone surrogate as U+FFFD
               {textFixture("invalid_utf8_bytes.txt"),
                {L"caf\u00e9 \u00e9t\u00e9", L"\u00ff\u00fe? no mark", L"\u00e2\u0082"}},
               {textFixture("odd_length_utf16le.txt"), {L"ab", L"cd\uFFFD"}},
               {textFixture("lone_surrogates_utf16le.txt"), {L"a\uFFFDb", L"\uFFFD"}},
               {textFixture("nul_characters.txt"), {std::wstring(L"a\0b", 3), std::wstring(1, L'\0')}}};
  for (const auto& c : cases)
    EXPECT_EQ(readLines(c.path), c.lines) << c.path;
}

TEST(CTextFile, KeepsLinesCrLfAndUtf16UnitsWholeAcrossBlockBoundaries) {
  const dex_test::TempDir dir;
  const std::string longLine(100000, 'x');
  EXPECT_EQ(readLines(dir.write("long.txt", "short\n" + longLine + "\r\nafter"), 64),
            (Lines{L"short", std::wstring(100000, L'x'), L"after"}));
  // 63 characters and a CR fill the first 64-byte block exactly; the LF starts the next one.
  EXPECT_EQ(readLines(dir.write("boundary.txt", std::string(63, 'a') + "\r\nb\r\n"), 64),
            (Lines{std::wstring(63, L'a'), L"b"}));
  std::u16string text = u"\uFEFF";
  for (int i = 0; i < 200; ++i)
    text += u"\u6771\U0001D11E\r\n";
  std::string bytes;
  for (const char16_t unit : text) {
    bytes += static_cast<char>(unit & 0xFF);
    bytes += static_cast<char>(unit >> 8);
  }
  EXPECT_EQ(readLines(dir.write("units.txt", bytes), 65), Lines(200, L"\u6771\U0001D11E"));
  // Nonsense buffer sizes are taken as the smallest block.
  EXPECT_EQ(readLines(textFixture("last_line_without_line_end.txt"), 0), (Lines{L"first", L"second"}));
  EXPECT_EQ(readLines(textFixture("last_line_without_line_end.txt"), -5), (Lines{L"first", L"second"}));
}

TEST(CTextFile, ReadsAMillionLines) {
  const dex_test::TempDir dir;
  std::string content;
  for (int i = 0; i < 1000000; ++i)
    content += "P" + std::to_string(i) + ",1000.000,2000.000\n";
  CTextFile file;
  ASSERT_NE(file.Open(dex_test::widen(dir.write("million.txt", content)).c_str()), 0);
  CVynStringT<wchar_t> line;
  CVynStringT<wchar_t> last;
  while (file.ReadString(line))
    last = line;
  EXPECT_EQ(file.GetLineNumber(), 1000000);
  EXPECT_EQ(last, L"P999999,1000.000,2000.000");
}

TEST(CTextFile, RefusesWhatItCannotOpenStartsAgainWhenReopenedAndClosesItsFile) {
  const dex_test::TempDir dir;
  const int before = dex_test::openFileDescriptors();
  CTextFile file;
  EXPECT_EQ(file.Open(dir.wfile("missing.txt").c_str()), 0);
  EXPECT_FALSE(file.IsOpen());
  EXPECT_EQ(file.Open(dir.wpath().c_str()) + file.Open(L"") + file.Open(nullptr), 0);
  CVynStringT<wchar_t> line = L"stale";
  EXPECT_FALSE(file.ReadString(line));
  EXPECT_TRUE(line.IsEmpty());

  const std::wstring path = dex_test::widen(textFixture("last_line_without_line_end.txt"));
  ASSERT_NE(file.Open(path.c_str()), 0);
  ASSERT_TRUE(file.ReadString(line));
  ASSERT_NE(file.Open(path.c_str()), 0);
  EXPECT_EQ(dex_test::openFileDescriptors(), before + 1);
  EXPECT_EQ(file.GetLineNumber(), 0);
  ASSERT_TRUE(file.ReadString(line));
  EXPECT_EQ(line, L"first");
  file.Close();
  EXPECT_EQ(dex_test::openFileDescriptors(), before);
  EXPECT_FALSE(file.IsOpen() || file.ReadString(line));
  EXPECT_EQ(file.GetEncoding(), Encoding::Utf8);
  {
    CTextFile destroyed;
    destroyed.Open(path.c_str());
  }
  EXPECT_EQ(dex_test::openFileDescriptors(), before);
}

}  // namespace
