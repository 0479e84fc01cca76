#include "ieUtils/IEUtilsCodePages.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "hostlibs/File.h"
#include "support/PrintString.h"
#include "support/TempDir.h"

namespace {

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;

const wchar_t kMixed[] = L"a\u00E4\u6E2Cb";  // a, a-umlaut (2 bytes), a CJK character (3 bytes), b
const std::string kMixedUtf8 =
    "a\xC3\xA4\xE6\xB8\xAC"
    "b";

// What a writer left in a heap buffer of exactly the size, so that the sanitizer sees any write past its end.
template <class Write>
std::string written(std::size_t size, Write write) {
  std::vector<char> buffer(size, '#');
  write(buffer.data());
  return std::string(buffer.data(), size);
}

TEST(CodePages, CountsAndCutsUtf8BytesAtWholeCharacters) {
  EXPECT_EQ(utils::getMbcsLength(L""), 0);
  EXPECT_EQ(utils::getMbcsLength(kMixed), 7);
  EXPECT_EQ(utils::getMbcsLength(String(static_cast<wchar_t>(0x1F600))), 4);
  // Characters UTF-8 cannot carry count as the replacement character.
  EXPECT_EQ(utils::getMbcsLength(String(static_cast<wchar_t>(0xD800))), 3);
  EXPECT_EQ(utils::getMbcsLength(String(static_cast<wchar_t>(0x110000))), 3);
  String text = kMixed;
  int spare = -1;
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, 5, spare), L"a\u00E4");
  EXPECT_TRUE(spare == 2 && text == L"\u6E2Cb");
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, 2, spare), L"");  // no room: nothing
  EXPECT_TRUE(spare == 2 && text == L"\u6E2Cb");
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, 10, spare), L"\u6E2Cb");
  EXPECT_TRUE(spare == 6 && text.IsEmpty());
  EXPECT_EQ(utils::strExtractToFitMbcsBytes(text, -4, spare), L"");
  EXPECT_EQ(spare, -4);
}

TEST(CodePages, WritersNeverPassTheirBufferOrSplitACharacter) {
  EXPECT_EQ(utils::tcs2Mbs(nullptr, kMixed, 0), 7u);  // without a buffer: the bytes needed
  EXPECT_EQ(utils::tcs2Mbs(nullptr, nullptr, 0), 0u);
  std::size_t count = 0;
  EXPECT_EQ(written(8, [&](char* b) { count = utils::tcs2Mbs(b, kMixed, 8); }), kMixedUtf8 + '\0');
  EXPECT_EQ(written(7, [&](char* b) { count += utils::tcs2Mbs(b, kMixed, 7); }),
            kMixedUtf8);  // full: no zero
  EXPECT_EQ(written(5, [&](char* b) { count += utils::tcs2Mbs(b, kMixed, 5); }),
            std::string("a\xC3\xA4\0#", 5));
  EXPECT_EQ(written(2, [&](char* b) { count += utils::tcs2Mbs(b, nullptr, 2); }).front(), '\0');
  EXPECT_EQ(count, 7u + 7u + 3u);
  EXPECT_EQ(written(11, [](char* b) { utils::string2Ascii(L"A\u00E4\u20AC", b, 10); }).substr(0, 4),
            std::string("A\xE4\xAC\0", 4));  // the low bytes
  EXPECT_EQ(written(4, [](char* b) { utils::string2Ascii(L"abcdef", b, 3); }), std::string("abc\0", 4));
  EXPECT_EQ(written(1, [](char* b) { utils::string2Ascii(L"abc", b, 0); }), std::string(1, '\0'));
  EXPECT_EQ(written(1, [](char* b) { utils::string2Ascii(L"abc", b, -5); }), std::string(1, '\0'));
  EXPECT_EQ(written(6, [](char* b) { utils::string2Char(kMixed, b, 5); }).substr(0, 4),
            std::string("a\xC3\xA4\0", 4));
  EXPECT_EQ(written(4, [](char* b) { utils::string2Char(L"abcdef", b, 3); }), std::string("abc\0", 4));
  EXPECT_EQ(written(4, [](char* b) { utils::string2Char(L"\u00E4\u00E4", b, 3); }).substr(0, 3),
            std::string("\xC3\xA4\0", 3));
  EXPECT_EQ(written(5, [](char* b) { utils::string2Char(L"\u6E2C\u91CF", b, 4); }).substr(0, 4),
            std::string("\xE6\xB8\xAC\0", 4));
  EXPECT_EQ(written(1, [](char* b) { utils::string2Char(L"\u6E2C", b, 0); }), std::string(1, '\0'));
  EXPECT_EQ(written(1, [](char* b) { utils::string2Char(L"abc", b, -1); }), std::string(1, '\0'));
  EXPECT_EQ(written(8, [](char* b) { utils::tsTChar2Char(kMixed, b); }), kMixedUtf8 + '\0');
  EXPECT_EQ(written(1, [](char* b) { utils::tsTChar2Char(nullptr, b); }), std::string(1, '\0'));
  utils::string2Ascii(L"abc", nullptr, 3);
  utils::string2Char(L"abc", nullptr, 3);
  utils::tsTChar2Char(kMixed, nullptr);
  std::vector<wchar_t> wide(5, L'#');
  utils::tsTChar2WChar(L"a\u00E4\u6E2C", wide.data());
  EXPECT_EQ(std::wstring(wide.data(), 5), std::wstring(L"a\u00E4\u6E2C\0#", 5));
  utils::tsWChar2TChar(nullptr, wide.data());
  EXPECT_STREQ(wide.data(), L"");
  utils::tsWChar2TChar(L"xy", wide.data());
  EXPECT_STREQ(wide.data(), L"xy");
  utils::tsTChar2WChar(L"x", nullptr);
}

TEST(CodePages, WriteUnicodeStringWritesLittleEndianUtf16UnitsToAnOpenFileOnly) {
  const dex_test::TempDir folder;
  base::CFile file;
  ASSERT_TRUE(file.OpenForWriting(folder.wfile("units.bin").c_str()));
  utils::writeUnicodeString(file, String(L"A\u00E4\u6E2C") + static_cast<wchar_t>(0x1F600));
  utils::writeUnicodeString(file, String());
  ASSERT_TRUE(file.Close());
  EXPECT_EQ(dex_test::readFile(folder.file("units.bin")),
            std::string("A\0\xE4\0\x2C\x6E\x3D\xD8\x00\xDE", 10));
  utils::writeUnicodeString(file, L"text");
  EXPECT_FALSE(file.Opened());
  const std::string path = folder.write("existing.bin", "keep");
  ASSERT_TRUE(file.OpenForReading(dex_test::widen(path).c_str()));
  utils::writeUnicodeString(file, L"text");
  file.Close();
  EXPECT_EQ(dex_test::readFile(path), "keep");
}

}  // namespace
