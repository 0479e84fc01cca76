#include "hostlibs/TextFile.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "support/OpenFiles.h"
#include "support/TempDir.h"

namespace {

using Encoding = CTextFile::ETextEncoding;

// Every line of a file, read through a fresh CTextFile.
std::vector<std::wstring> readLines(const std::string& path, int bufferSize = 4096) {
  CTextFile file(bufferSize);
  EXPECT_NE(file.Open(dex_test::widen(path).c_str()), 0) << path;
  std::vector<std::wstring> lines;
  CVynStringT<wchar_t> line;
  while (file.ReadString(line))
    lines.emplace_back(line.view());
  EXPECT_TRUE(line.IsEmpty());
  return lines;
}

std::string textFixture(const char* name) {
  return dex_test::dataFile(std::string("text/") + name);
}

const std::vector<std::wstring> kSurveyLines = {L"P1,1000.000,2000.000,55.20", L"Größe 東京 \U0001D11E", L"",
                                                L"last line"};

struct EncodingCase {
  const char* file;
  Encoding encoding;
};

class CTextFileEncodings : public testing::TestWithParam<EncodingCase> {};

TEST_P(CTextFileEncodings, ReadsTheSameLinesWhateverTheByteOrderMark) {
  const EncodingCase& param = GetParam();
  CTextFile file;
  ASSERT_NE(file.Open(dex_test::widen(textFixture(param.file)).c_str()), 0);
  EXPECT_EQ(file.GetEncoding(), param.encoding);
  std::vector<std::wstring> lines;
  CVynStringT<wchar_t> line;
  while (file.ReadString(line)) {
    lines.emplace_back(line.view());
    EXPECT_EQ(file.GetLineNumber(), static_cast<int>(lines.size()));
  }
  EXPECT_EQ(lines, kSurveyLines);
}

INSTANTIATE_TEST_SUITE_P(ByteOrderMarks, CTextFileEncodings,
                         testing::Values(EncodingCase{"lines_utf8_without_bom.txt", Encoding::Utf8},
                                         EncodingCase{"lines_utf8_with_bom.txt", Encoding::Utf8Bom},
                                         EncodingCase{"lines_utf16le_with_bom.txt", Encoding::Utf16LE},
                                         EncodingCase{"lines_utf16be_with_bom.txt", Encoding::Utf16BE}));

TEST(CTextFile, SplitsLinesAtCrLfLfAndLoneCr) {
  const std::vector<std::wstring> expected = {L"crlf", L"lf", L"cr", L"cr cr", L"", L"end"};
  EXPECT_EQ(readLines(textFixture("mixed_line_ends.txt")), expected);
}

TEST(CTextFile, GivesTheLastLineWithoutLineEnd) {
  const std::vector<std::wstring> expected = {L"first", L"second"};
  EXPECT_EQ(readLines(textFixture("last_line_without_line_end.txt")), expected);
}

TEST(CTextFile, GivesNoExtraLineAfterAFinalLineEnd) {
  const dex_test::TempDir dir;
  const std::vector<std::wstring> one = {L"only"};
  EXPECT_EQ(readLines(dir.write("lf.txt", "only\n")), one);
  EXPECT_EQ(readLines(dir.write("crlf.txt", "only\r\n")), one);
  EXPECT_EQ(readLines(dir.write("cr.txt", "only\r")), one);
  const std::vector<std::wstring> emptyLine = {L""};
  EXPECT_EQ(readLines(dir.write("newline.txt", "\n")), emptyLine);
}

TEST(CTextFile, TakesInvalidUtf8BytesAsLatin1) {
  const std::vector<std::wstring> expected = {L"caf\u00e9 \u00e9t\u00e9", L"\u00ff\u00fe? no mark",
                                              L"\u00e2\u0082"};
  EXPECT_EQ(readLines(textFixture("invalid_utf8_bytes.txt")), expected);
}

TEST(CTextFile, MapsTheLeftOverByteOfOddLengthUtf16ToReplacementCharacter) {
  const std::vector<std::wstring> expected = {L"ab", L"cd\uFFFD"};
  EXPECT_EQ(readLines(textFixture("odd_length_utf16le.txt")), expected);
}

TEST(CTextFile, MapsLoneSurrogatesToReplacementCharacter) {
  const std::vector<std::wstring> expected = {L"a\uFFFDb", L"\uFFFD"};
  EXPECT_EQ(readLines(textFixture("lone_surrogates_utf16le.txt")), expected);
}

TEST(CTextFile, KeepsNulCharacters) {
  const std::vector<std::wstring> expected = {std::wstring(L"a\0b", 3), std::wstring(1, L'\0')};
  EXPECT_EQ(readLines(textFixture("nul_characters.txt")), expected);
}

TEST(CTextFile, ReadsLinesLongerThanItsBuffer) {
  const dex_test::TempDir dir;
  const std::string longLine(100000, 'x');
  const std::string path = dir.write("long.txt", "short\n" + longLine + "\r\nafter");
  const std::vector<std::wstring> expected = {L"short", std::wstring(100000, L'x'), L"after"};
  EXPECT_EQ(readLines(path, 64), expected);
}

TEST(CTextFile, KeepsCrLfTogetherAcrossBlockBoundaries) {
  const dex_test::TempDir dir;
  // 63 characters and a CR fill the first 64-byte block exactly; the LF starts the next one.
  const std::string first(63, 'a');
  const std::string path = dir.write("boundary.txt", first + "\r\n" + "b\r\n");
  const std::vector<std::wstring> expected = {std::wstring(63, L'a'), L"b"};
  EXPECT_EQ(readLines(path, 64), expected);
}

TEST(CTextFile, KeepsUtf16UnitsWholeAcrossBlockBoundaries) {
  const dex_test::TempDir dir;
  std::u16string text = u"\uFEFF";
  for (int i = 0; i < 200; ++i)
    text += u"\u6771\U0001D11E\r\n";
  std::string bytes;
  for (const char16_t unit : text) {
    bytes += static_cast<char>(unit & 0xFF);
    bytes += static_cast<char>(unit >> 8);
  }
  const std::vector<std::wstring> lines = readLines(dir.write("units.txt", bytes), 65);
  ASSERT_EQ(lines.size(), 200u);
  for (const std::wstring& line : lines)
    EXPECT_EQ(line, L"\u6771\U0001D11E");
}

TEST(CTextFile, ReadsAMillionLines) {
  const dex_test::TempDir dir;
  std::string content;
  for (int i = 0; i < 1000000; ++i)
    content += "P" + std::to_string(i) + ",1000.000,2000.000\n";
  const std::string path = dir.write("million.txt", content);
  CTextFile file;
  ASSERT_NE(file.Open(dex_test::widen(path).c_str()), 0);
  CVynStringT<wchar_t> line;
  CVynStringT<wchar_t> last;
  while (file.ReadString(line))
    last = line;
  EXPECT_EQ(file.GetLineNumber(), 1000000);
  EXPECT_EQ(last, L"P999999,1000.000,2000.000");
}

TEST(CTextFile, AnswersNothingForAnEmptyFile) {
  EXPECT_TRUE(readLines(textFixture("empty.txt")).empty());
}

TEST(CTextFile, RefusesMissingFilesFoldersAndEmptyPaths) {
  const dex_test::TempDir dir;
  CTextFile file;
  EXPECT_EQ(file.Open(dir.wfile("missing.txt").c_str()), 0);
  EXPECT_FALSE(file.IsOpen());
  EXPECT_EQ(file.Open(dir.wpath().c_str()), 0);
  EXPECT_EQ(file.Open(L""), 0);
  EXPECT_EQ(file.Open(nullptr), 0);
  CVynStringT<wchar_t> line = L"stale";
  EXPECT_FALSE(file.ReadString(line));
  EXPECT_TRUE(line.IsEmpty());
}

TEST(CTextFile, StartsAgainWhenOpenedAgainAndStopsWhenClosed) {
  const std::wstring path = dex_test::widen(textFixture("last_line_without_line_end.txt"));
  CTextFile file;
  ASSERT_NE(file.Open(path.c_str()), 0);
  CVynStringT<wchar_t> line;
  ASSERT_TRUE(file.ReadString(line));
  ASSERT_NE(file.Open(path.c_str()), 0);
  EXPECT_EQ(file.GetLineNumber(), 0);
  ASSERT_TRUE(file.ReadString(line));
  EXPECT_EQ(line, L"first");
  file.Close();
  EXPECT_FALSE(file.IsOpen());
  EXPECT_FALSE(file.ReadString(line));
  EXPECT_EQ(file.GetEncoding(), Encoding::Utf8);
}

TEST(CTextFile, ClosesItsFileWhenReopenedClosedOrDestroyed) {
  const std::wstring path = dex_test::widen(textFixture("mixed_line_ends.txt"));
  const int before = dex_test::openFileDescriptors();
  {
    CTextFile file;
    file.Open(path.c_str());
    file.Open(path.c_str());
    EXPECT_EQ(dex_test::openFileDescriptors(), before + 1);
    file.Close();
    EXPECT_EQ(dex_test::openFileDescriptors(), before);
    file.Open(path.c_str());
  }
  EXPECT_EQ(dex_test::openFileDescriptors(), before);
}

TEST(CTextFile, TakesNonsenseBufferSizesAsTheSmallestBlock) {
  const std::vector<std::wstring> expected = {L"first", L"second"};
  EXPECT_EQ(readLines(textFixture("last_line_without_line_end.txt"), 0), expected);
  EXPECT_EQ(readLines(textFixture("last_line_without_line_end.txt"), -5), expected);
}

}  // namespace
