#include "ieUtils/IEUtilsBlocks.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <memory>
#include <string>
#include <string_view>

#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;

// A record from its definition: STX, 128 data characters, the sequence digit, the XOR of the UTF-16
// units of data and digit (at least three decimal digits), ETX, CR LF.
std::wstring record(std::wstring_view data, wchar_t digit) {
  unsigned sum = digit;
  for (const wchar_t ch : data) {
    const unsigned offset = static_cast<unsigned>(ch) - 0x10000;
    sum ^= ch > 0xFFFF ? (0xD800 + (offset >> 10)) ^ (0xDC00 + (offset & 0x3FF)) : static_cast<unsigned>(ch);
  }
  std::wstring digits = std::to_wstring(sum);
  digits.insert(0, digits.size() < 3 ? 3 - digits.size() : 0, L'0');
  return L"\x02" + std::wstring(data) + digit + digits + L"\x03\r\n";
}

// What createBlockString appends to out (which starts as head) for text, the line state going on.
std::wstring blocks(const std::wstring& text, String& line, bool final, const wchar_t* head = L"") {
  String out = head;
  EXPECT_TRUE(utils::createBlockString(String(std::wstring_view(text)), line, out, final));
  return std::wstring(out.view());
}

TEST(CreateBlockString, CutsTextIntoFramedRecordsWithSequenceDigitsAndChecksums) {
  std::wstring text;
  for (int i = 0; i < 300; ++i)
    text += static_cast<wchar_t>(L'A' + i % 26);
  String line;
  EXPECT_EQ(blocks(text, line, true), record(text.substr(0, 128), L'0') +
                                          record(text.substr(128, 128), L'1') +
                                          record(text.substr(256) + std::wstring(84, L' '), L'2'));
  EXPECT_EQ(line, L"3");
  line = L"";  // 128 equal characters cancel out: the checksum is the digit's code, 48
  EXPECT_EQ(blocks(std::wstring(128, L'A'), line, false),
            L"\x02" + std::wstring(128, L'A') + L"0048\x03\r\n");
  const std::wstring wide = std::wstring(127, L' ') + L'\x07FF';  // four checksum digits
  line = L"";
  EXPECT_EQ(blocks(wide, line, false), L"\x02" + wide + L"02031\x03\r\n");
  const std::wstring high = std::wstring(127, L' ') + L'\xABCD';  // five
  line = L"";
  EXPECT_EQ(blocks(high, line, false), L"\x02" + high + L"043997\x03\r\n");
  const std::wstring astral = std::wstring(127, L'x') + static_cast<wchar_t>(0x1F600);  // its two units count
  line = L"";
  EXPECT_EQ(blocks(astral, line, false), record(astral, L'0'));
}

TEST(CreateBlockString, KeepsShortTextPendingAndWrapsTheSequenceDigit) {
  String line;
  EXPECT_EQ(blocks(std::wstring(100, L'a'), line, false), L"");
  EXPECT_EQ(line, L"0" + String(L'a', 100));
  EXPECT_EQ(blocks(std::wstring(100, L'b'), line, false),
            record(std::wstring(100, L'a') + std::wstring(28, L'b'), L'0'));
  EXPECT_EQ(line, L"1" + String(L'b', 72));
  line = L"9";
  EXPECT_EQ(blocks(std::wstring(128, L'z'), line, false), record(std::wstring(128, L'z'), L'9'));
  EXPECT_EQ(line, L"0");
  line = L"";
  std::wstring eleven;
  for (int i = 0; i < 11; ++i)
    eleven += record(std::wstring(128, L'q'), static_cast<wchar_t>(L'0' + i % 10));
  EXPECT_EQ(blocks(std::wstring(11 * 128, L'q'), line, false), eleven);
  EXPECT_EQ(line, L"1");
  // A final call with nothing pending emits a blank record; out is appended to.
  EXPECT_EQ(blocks(L"", line, true, L"head"), L"head" + record(std::wstring(128, L' '), L'1'));
  EXPECT_EQ(line, L"2");
  line = L"5" + String(L'p', 200);  // a pending line longer than a record loses nothing
  EXPECT_EQ(blocks(L"tail", line, true),
            record(std::wstring(128, L'p'), L'5') +
                record(std::wstring(72, L'p') + L"tail" + std::wstring(52, L' '), L'6'));
  line = L"x";  // a line without a digit is followed by 0
  EXPECT_EQ(blocks(std::wstring(128, L'a'), line, false), record(std::wstring(128, L'a'), L'x'));
  EXPECT_EQ(line, L"0");
}

TEST(WriteBlockString, WritesTheRecordsInUtf8AndNothingWhilePending) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("blocks.dat");
  String line;
  FILE* file = std::fopen(path.c_str(), "wb");
  ASSERT_NE(file, nullptr);
  EXPECT_TRUE(utils::writeBlockString(file, L"short", line, false));
  std::fflush(file);
  EXPECT_EQ(dex_test::readFile(path), "");
  EXPECT_EQ(line, L"0short");
  EXPECT_TRUE(utils::writeBlockString(file, L"\u00C4" + String(L'a', 150), line, false));
  EXPECT_TRUE(utils::writeBlockString(file, L"end", line, true));
  std::fclose(file);
  const std::wstring first = L"short\u00C4" + std::wstring(122, L'a');
  const std::wstring second = std::wstring(28, L'a') + L"end" + std::wstring(97, L' ');
  EXPECT_EQ(dex_test::readFile(path), dex_test::narrow(record(first, L'0') + record(second, L'1')));
  EXPECT_EQ(line, L"2");
  EXPECT_FALSE(utils::writeBlockString(nullptr, L"x", line, true));
}

}  // namespace
