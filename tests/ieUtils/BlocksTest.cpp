#include "ieUtils/IEUtilsBlocks.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "support/TempDir.h"

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;

namespace {

constexpr std::size_t kRecordDataLength = 128;

// The checksum computed here from its definition: XOR of the UTF-16 units of the data and the digit.
unsigned expectedChecksum(std::wstring_view data, wchar_t digit) {
  unsigned sum = digit;
  for (const wchar_t ch : data) {
    if (ch > 0xFFFF) {
      const unsigned offset = static_cast<unsigned>(ch) - 0x10000;
      sum ^= 0xD800 + (offset >> 10);
      sum ^= 0xDC00 + (offset & 0x3FF);
    } else {
      sum ^= static_cast<unsigned>(ch);
    }
  }
  return sum;
}

std::wstring expectedRecord(std::wstring_view data, wchar_t digit) {
  std::wstring sum = std::to_wstring(expectedChecksum(data, digit));
  while (sum.size() < 3)
    sum.insert(0, 1, L'0');
  std::wstring record(1, L'\x02');
  record += data;
  record += digit;
  record += sum;
  record += L"\x03\r\n";
  return record;
}

struct Record {
  std::wstring data;
  wchar_t digit;
  std::wstring checksum;
};

// Takes out apart into records, checking the frame of each.
std::vector<Record> splitRecords(std::wstring_view out) {
  std::vector<Record> records;
  while (!out.empty()) {
    EXPECT_EQ(out.front(), L'\x02');
    const std::size_t etx = out.find(L'\x03');
    EXPECT_NE(etx, std::wstring_view::npos);
    if (etx == std::wstring_view::npos) break;
    EXPECT_EQ(out.substr(etx + 1, 2), L"\r\n");
    const std::wstring_view body = out.substr(1, etx - 1);
    EXPECT_GE(body.size(), kRecordDataLength + 4);
    records.push_back({std::wstring(body.substr(0, kRecordDataLength)), body[kRecordDataLength],
                       std::wstring(body.substr(kRecordDataLength + 1))});
    out.remove_prefix(etx + 3);
  }
  return records;
}

String textOf(std::wstring_view text) {
  return String(text);
}

}  // namespace

TEST(CreateBlockString, FinalCallOfThreeHundredCharactersEmitsThreeRecords) {
  std::wstring text;
  for (int i = 0; i < 300; ++i)
    text += static_cast<wchar_t>(L'A' + i % 26);
  String line;
  String out;
  EXPECT_TRUE(utils::createBlockString(textOf(text), line, out, true));

  const std::vector<Record> records = splitRecords(out.view());
  ASSERT_EQ(records.size(), 3u);
  EXPECT_EQ(records[0].digit, L'0');
  EXPECT_EQ(records[1].digit, L'1');
  EXPECT_EQ(records[2].digit, L'2');
  EXPECT_EQ(records[0].data, text.substr(0, 128));
  EXPECT_EQ(records[1].data, text.substr(128, 128));
  EXPECT_EQ(records[2].data, text.substr(256) + std::wstring(84, L' '));
  EXPECT_EQ(out.view(), expectedRecord(text.substr(0, 128), L'0') +
                            expectedRecord(text.substr(128, 128), L'1') +
                            expectedRecord(text.substr(256) + std::wstring(84, L' '), L'2'));
  EXPECT_EQ(line, L"3");
}

TEST(CreateBlockString, RecordBytesAreStxDataDigitChecksumEtxCrLf) {
  const std::wstring data(128, L'A');  // the data cancel out; the checksum is the digit's code, 48
  String line;
  String out;
  utils::createBlockString(textOf(data), line, out, false);
  EXPECT_EQ(out.view(), L"\x02" + data + L"0048\x03\r\n");
  EXPECT_EQ(out.GetLength(), 1 + 128 + 1 + 3 + 1 + 2);
}

TEST(CreateBlockString, ChecksumHasFourDigitsWhenCharactersPassU03FF) {
  std::wstring data(127, L' ');
  data += L'\x07FF';
  String line;
  String out;
  utils::createBlockString(textOf(data), line, out, false);
  ASSERT_EQ(expectedChecksum(data, L'0'), 0x7EFu);
  EXPECT_EQ(out.view(), L"\x02" + data + L"02031\x03\r\n");
}

TEST(CreateBlockString, ChecksumHasFiveDigitsForHighCharacters) {
  std::wstring data(127, L' ');
  data += L'\xABCD';
  String line;
  String out;
  utils::createBlockString(textOf(data), line, out, false);
  ASSERT_EQ(expectedChecksum(data, L'0'), 43997u);
  EXPECT_EQ(out.view(), L"\x02" + data + L"043997\x03\r\n");
}

TEST(CreateBlockString, CharactersBeyondTheBasicPlaneCountAsTheirTwoUnits) {
  std::wstring data(127, L'x');
  data += static_cast<wchar_t>(0x1F600);
  String line;
  String out;
  utils::createBlockString(textOf(data), line, out, false);
  EXPECT_EQ(out.view(), expectedRecord(data, L'0'));
}

TEST(CreateBlockString, SequenceDigitWrapsFromNineToZero) {
  String line = L"9";
  String out;
  utils::createBlockString(textOf(std::wstring(128, L'z')), line, out, false);
  ASSERT_EQ(splitRecords(out.view()).size(), 1u);
  EXPECT_EQ(splitRecords(out.view())[0].digit, L'9');
  EXPECT_EQ(line, L"0");

  String many;
  String all;
  utils::createBlockString(textOf(std::wstring(11 * 128, L'q')), many, all, false);
  const std::vector<Record> records = splitRecords(all.view());
  ASSERT_EQ(records.size(), 11u);
  for (std::size_t i = 0; i < records.size(); ++i)
    EXPECT_EQ(records[i].digit, L'0' + static_cast<wchar_t>(i % 10));
  EXPECT_EQ(many, L"1");
}

TEST(CreateBlockString, ShortTextStaysPendingUntilTheRecordIsFull) {
  String line;
  String out;
  utils::createBlockString(textOf(std::wstring(100, L'a')), line, out, false);
  EXPECT_EQ(out, L"");
  EXPECT_EQ(line, L"0" + String(L'a', 100));

  utils::createBlockString(textOf(std::wstring(100, L'b')), line, out, false);
  const std::vector<Record> records = splitRecords(out.view());
  ASSERT_EQ(records.size(), 1u);
  EXPECT_EQ(records[0].data, std::wstring(100, L'a') + std::wstring(28, L'b'));
  EXPECT_EQ(line, L"1" + String(L'b', 72));
}

TEST(CreateBlockString, FinalCallWithNothingPendingEmitsABlankRecord) {
  String line;
  String out;
  utils::createBlockString(textOf(std::wstring(128, L'a')), line, out, false);
  EXPECT_EQ(line, L"1");
  String last;
  utils::createBlockString(String(), line, last, true);
  EXPECT_EQ(last.view(), expectedRecord(std::wstring(128, L' '), L'1'));
  EXPECT_EQ(line, L"2");
}

TEST(CreateBlockString, AppendsToOut) {
  String line;
  String out = L"head";
  utils::createBlockString(L"x", line, out, true);
  EXPECT_EQ(out.view(), L"head" + expectedRecord(L"x" + std::wstring(127, L' '), L'0'));
}

TEST(CreateBlockString, PendingLineLongerThanARecordLosesNothing) {
  String line = L"5" + String(L'p', 200);
  String out;
  utils::createBlockString(L"tail", line, out, true);
  const std::vector<Record> records = splitRecords(out.view());
  ASSERT_EQ(records.size(), 2u);
  EXPECT_EQ(records[0].digit, L'5');
  EXPECT_EQ(records[0].data, std::wstring(128, L'p'));
  EXPECT_EQ(records[1].digit, L'6');
  EXPECT_EQ(records[1].data, std::wstring(72, L'p') + L"tail" + std::wstring(52, L' '));
}

TEST(CreateBlockString, LineWithoutADigitIsFollowedByZero) {
  String line = L"x";
  String out;
  utils::createBlockString(textOf(std::wstring(128, L'a')), line, out, false);
  EXPECT_EQ(splitRecords(out.view())[0].digit, L'x');
  EXPECT_EQ(line, L"0");
}

// ---- Writing

namespace {

struct FileCloser {
  void operator()(FILE* file) const { std::fclose(file); }
};
using FileHandle = std::unique_ptr<FILE, FileCloser>;

}  // namespace

TEST(WriteBlockString, WritesTheRecordsInUtf8) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("blocks.dat");
  String line;
  {
    const FileHandle file(std::fopen(path.c_str(), "wb"));
    ASSERT_NE(file, nullptr);
    EXPECT_TRUE(utils::writeBlockString(file.get(), L"\u00C4" + String(L'a', 150), line, false));
    EXPECT_TRUE(utils::writeBlockString(file.get(), L"end", line, true));
  }
  const std::wstring first = L"\u00C4" + std::wstring(127, L'a');
  const std::wstring second = std::wstring(23, L'a') + L"end" + std::wstring(102, L' ');
  EXPECT_EQ(dex_test::readFile(path),
            dex_test::narrow(expectedRecord(first, L'0') + expectedRecord(second, L'1')));
  EXPECT_EQ(dex_test::readFile(path).substr(0, 3), "\x02\xC3\x84");
  EXPECT_EQ(line, L"2");
}

TEST(WriteBlockString, PendingTextWritesNothingYet) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("pending.dat");
  String line;
  {
    const FileHandle file(std::fopen(path.c_str(), "wb"));
    ASSERT_NE(file, nullptr);
    EXPECT_TRUE(utils::writeBlockString(file.get(), L"short", line, false));
  }
  EXPECT_EQ(dex_test::readFile(path), "");
  EXPECT_EQ(line, L"0short");
}

TEST(WriteBlockString, NullFileAnswersFalse) {
  String line;
  EXPECT_FALSE(utils::writeBlockString(nullptr, L"x", line, true));
}
