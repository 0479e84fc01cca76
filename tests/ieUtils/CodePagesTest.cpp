#include "ieUtils/IEUtilsCodePages.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "hostlibs/File.h"
#include "support/TempDir.h"

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;

namespace {

// A heap buffer of exactly the given size, so that the sanitizer run sees any write past its end.
std::vector<char> bufferOf(std::size_t size) {
  return std::vector<char>(size, '#');
}

const wchar_t kMixed[] = L"a\u00E4\u6E2Cb";  // a, a-umlaut (2 bytes), a CJK character (3 bytes), b

}  // namespace

TEST(GetMbcsLength, CountsTheUtf8BytesOfEachCharacter) {
  EXPECT_EQ(utils::getMbcsLength(L""), 0);
  EXPECT_EQ(utils::getMbcsLength(L"abc"), 3);
  EXPECT_EQ(utils::getMbcsLength(L"\u00E4"), 2);
  EXPECT_EQ(utils::getMbcsLength(L"\u6E2C"), 3);
  EXPECT_EQ(utils::getMbcsLength(String(static_cast<wchar_t>(0x1F600))), 4);
  EXPECT_EQ(utils::getMbcsLength(kMixed), 7);
}

TEST(GetMbcsLength, CharactersUtf8CannotCarryCountAsTheReplacementCharacter) {
  EXPECT_EQ(utils::getMbcsLength(String(static_cast<wchar_t>(0xD800))), 3);
  EXPECT_EQ(utils::getMbcsLength(String(static_cast<wchar_t>(0x110000))), 3);
}

TEST(StrExtractToFitMbcsBytes, TakesTheWholeCharactersThatFit) {
  String text = kMixed;
  int spare = -1;
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, 5, spare), L"a\u00E4");
  EXPECT_EQ(spare, 2);
  EXPECT_EQ(text, L"\u6E2Cb");
}

TEST(StrExtractToFitMbcsBytes, WholeTextFitsAndLeavesSpareBytes) {
  String text = kMixed;
  int spare = -1;
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, 10, spare), kMixed);
  EXPECT_EQ(spare, 3);
  EXPECT_EQ(text, L"");
}

TEST(StrExtractToFitMbcsBytes, NoRoomTakesNothing) {
  String text = L"\u6E2C";
  int spare = -1;
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, 2, spare), L"");
  EXPECT_EQ(spare, 2);
  EXPECT_EQ(text, L"\u6E2C");
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, 0, spare), L"");
  EXPECT_EQ(spare, 0);
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, -4, spare), L"");
  EXPECT_EQ(spare, -4);
  EXPECT_EQ(text, L"\u6E2C");
}

TEST(Tcs2Mbs, WithoutBufferAnswersTheBytesNeeded) {
  EXPECT_EQ(utils::tcs2Mbs(nullptr, kMixed, 0), 7u);
  EXPECT_EQ(utils::tcs2Mbs(nullptr, nullptr, 0), 0u);
}

TEST(Tcs2Mbs, WritesTheTextAndItsZeroWhenThereIsRoom) {
  std::vector<char> buffer = bufferOf(8);
  EXPECT_EQ(utils::tcs2Mbs(buffer.data(), kMixed, buffer.size()), 7u);
  EXPECT_STREQ(buffer.data(),
               "a\xC3\xA4\xE6\xB8\xAC"
               "b");
}

TEST(Tcs2Mbs, FullBufferGetsNoZeroAndNoPartOfACharacter) {
  std::vector<char> exact = bufferOf(7);
  EXPECT_EQ(utils::tcs2Mbs(exact.data(), kMixed, exact.size()), 7u);
  EXPECT_EQ(std::string(exact.data(), exact.size()),
            "a\xC3\xA4\xE6\xB8\xAC"
            "b");

  std::vector<char> small = bufferOf(5);
  EXPECT_EQ(utils::tcs2Mbs(small.data(), kMixed, small.size()), 3u);
  EXPECT_EQ(std::string(small.data(), 4), std::string("a\xC3\xA4\0", 4));
  EXPECT_EQ(small[4], '#');
}

TEST(Tcs2Mbs, NullSourceIsTheEmptyText) {
  std::vector<char> buffer = bufferOf(2);
  EXPECT_EQ(utils::tcs2Mbs(buffer.data(), nullptr, buffer.size()), 0u);
  EXPECT_EQ(buffer[0], '\0');
}

TEST(String2Ascii, CopiesTheLowBytesAndAZero) {
  std::vector<char> buffer = bufferOf(11);
  utils::string2Ascii(L"A\u00E4\u20AC", buffer.data(), 10);
  EXPECT_EQ(std::string(buffer.data(), 4), std::string("A\xE4\xAC\0", 4));
}

TEST(String2Ascii, StopsAfterMaxCharactersWithinMaxPlusOneBytes) {
  std::vector<char> buffer = bufferOf(4);
  utils::string2Ascii(L"abcdef", buffer.data(), 3);
  EXPECT_EQ(std::string(buffer.data(), 4), std::string("abc\0", 4));
  std::vector<char> one = bufferOf(1);
  utils::string2Ascii(L"abc", one.data(), 0);
  EXPECT_EQ(one[0], '\0');
  utils::string2Ascii(L"abc", one.data(), -5);
  EXPECT_EQ(one[0], '\0');
  utils::string2Ascii(L"abc", nullptr, 3);
}

TEST(String2Char, WritesAWholeTextThatFitsWithItsZero) {
  std::vector<char> buffer = bufferOf(6);
  utils::string2Char(L"abc", buffer.data(), 5);
  EXPECT_STREQ(buffer.data(), "abc");
  utils::string2Char(kMixed, buffer.data(), 5);
  EXPECT_STREQ(buffer.data(), "a\xC3\xA4");
}

TEST(String2Char, NeverWritesPastMaxPlusOneBytes) {
  std::vector<char> ascii = bufferOf(4);
  utils::string2Char(L"abcdef", ascii.data(), 3);
  EXPECT_EQ(std::string(ascii.data(), 4), std::string("abc\0", 4));

  std::vector<char> umlauts = bufferOf(4);
  utils::string2Char(L"\u00E4\u00E4", umlauts.data(), 3);
  EXPECT_EQ(std::string(umlauts.data(), 3), std::string("\xC3\xA4\0", 3));

  std::vector<char> wide = bufferOf(5);
  utils::string2Char(L"\u6E2C\u91CF", wide.data(), 4);
  EXPECT_STREQ(wide.data(), "\xE6\xB8\xAC");

  std::vector<char> none = bufferOf(1);
  utils::string2Char(L"\u6E2C", none.data(), 0);
  EXPECT_EQ(none[0], '\0');
  utils::string2Char(L"abc", none.data(), -1);
  EXPECT_EQ(none[0], '\0');
  utils::string2Char(L"abc", nullptr, 3);
}

TEST(TsTChar2Char, WritesTheUtf8FormWithItsZero) {
  std::vector<char> buffer = bufferOf(static_cast<std::size_t>(utils::getMbcsLength(kMixed)) + 1);
  utils::tsTChar2Char(kMixed, buffer.data());
  EXPECT_EQ(std::string(buffer.data(), buffer.size()), std::string("a\xC3\xA4\xE6\xB8\xAC"
                                                                   "b\0",
                                                                   8));
  std::vector<char> empty = bufferOf(1);
  utils::tsTChar2Char(nullptr, empty.data());
  EXPECT_EQ(empty[0], '\0');
  utils::tsTChar2Char(kMixed, nullptr);
}

TEST(TsTChar2WChar, CopiesUpToAndIncludingTheZero) {
  std::vector<wchar_t> buffer(5, L'#');
  utils::tsTChar2WChar(L"a\u00E4\u6E2C", buffer.data());
  EXPECT_EQ(std::wstring(buffer.data(), 5), std::wstring(L"a\u00E4\u6E2C\0#", 5));
  utils::tsWChar2TChar(L"xy", buffer.data());
  EXPECT_STREQ(buffer.data(), L"xy");
  utils::tsWChar2TChar(nullptr, buffer.data());
  EXPECT_STREQ(buffer.data(), L"");
  utils::tsTChar2WChar(L"x", nullptr);
}

TEST(WriteUnicodeString, WritesLittleEndianUtf16UnitsWithoutTerminator) {
  const dex_test::TempDir folder;
  const std::wstring path = folder.wfile("units.bin");
  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(path.c_str()));
  utils::writeUnicodeString(file, String(L"A\u00E4\u6E2C") + static_cast<wchar_t>(0x1F600));
  utils::writeUnicodeString(file, String());
  ASSERT_TRUE(file.Close());
  EXPECT_EQ(dex_test::readFile(folder.file("units.bin")),
            std::string("A\0\xE4\0\x2C\x6E\x3D\xD8\x00\xDE", 10));
}

TEST(WriteUnicodeString, ClosedFileIsLeftAlone) {
  base::CFile closed;
  utils::writeUnicodeString(closed, L"text");
  EXPECT_FALSE(closed.Opened());

  const dex_test::TempDir folder;
  const std::string path = folder.write("existing.bin", "keep");
  base::CFile reading;
  ASSERT_TRUE(reading.OpenForReading(dex_test::widen(path).c_str()));
  utils::writeUnicodeString(reading, L"text");
  reading.Close();
  EXPECT_EQ(dex_test::readFile(path), "keep");
}
