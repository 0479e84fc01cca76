#include "ieUtils/IEUtilsNames.h"

#include <gtest/gtest.h>

#include <string_view>

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;

TEST(NameCharacterSets, HoldTheirCharactersInOrder) {
  EXPECT_EQ(std::wstring_view(utils::kCodeNameForbiddenCharacters), L",|{}\t\r\n");
  EXPECT_EQ(std::wstring_view(utils::kCodeNameReplaceableCharacters), L",|{}");
  EXPECT_EQ(std::wstring_view(utils::kObjectNameForbiddenCharacters).size(), 32u);
  EXPECT_EQ(std::wstring_view(utils::kObjectNameForbiddenCharacters),
            L"!,?%*@#$%^&'\"\\/|~;[]{}()<>`\t\r\n+=");
  EXPECT_EQ(std::wstring_view(utils::kPointNameForbiddenCharacters),
            std::wstring(utils::kObjectNameForbiddenCharacters) + L" ");
}

TEST(NameCharacters, EachForbiddenCharacterIsRejectedByItsRule) {
  for (const wchar_t ch : std::wstring_view(utils::kCodeNameForbiddenCharacters)) {
    EXPECT_FALSE(utils::isAdmissibleCodeNameCharacter(ch)) << static_cast<int>(ch);
  }
  for (const wchar_t ch : std::wstring_view(utils::kObjectNameForbiddenCharacters)) {
    EXPECT_FALSE(utils::isAdmissibleObjectNameCharacter(ch)) << static_cast<int>(ch);
    EXPECT_FALSE(utils::isAdmissiblePointNameCharacter(ch)) << static_cast<int>(ch);
  }
  EXPECT_FALSE(utils::isAdmissiblePointNameCharacter(L' '));
}

TEST(NameCharacters, OtherCharactersAreAdmissible) {
  for (const wchar_t ch : std::wstring_view(L"aZ09-_.:ÄΩ測")) {
    EXPECT_TRUE(utils::isAdmissibleCodeNameCharacter(ch));
    EXPECT_TRUE(utils::isAdmissibleObjectNameCharacter(ch));
    EXPECT_TRUE(utils::isAdmissiblePointNameCharacter(ch));
  }
  EXPECT_TRUE(utils::isAdmissibleObjectNameCharacter(L' '));
  EXPECT_TRUE(utils::isAdmissibleCodeNameCharacter(L' '));
  EXPECT_TRUE(utils::isAdmissibleCodeNameCharacter(L'%'));
}

TEST(IsValidName, RejectsBlankEmptyAndTooLongNames) {
  EXPECT_FALSE(utils::isValidName(L"P 1"));
  EXPECT_FALSE(utils::isValidName(L" "));
  EXPECT_FALSE(utils::isValidName(L""));
  EXPECT_FALSE(utils::isValidName(String(L'P', 51)));
  EXPECT_TRUE(utils::isValidName(String(L'P', 50)));
  EXPECT_TRUE(utils::isValidName(L"P-1.5_Ä"));
  EXPECT_FALSE(utils::isValidName(L"P%1"));
}

TEST(IsValidCodeName, AllowsBlanksAndRejectsStructureCharacters) {
  EXPECT_TRUE(utils::isValidCodeName(L"TREE OAK"));
  EXPECT_TRUE(utils::isValidCodeName(String(L'C', 50)));
  EXPECT_FALSE(utils::isValidCodeName(String(L'C', 51)));
  EXPECT_FALSE(utils::isValidCodeName(L""));
  EXPECT_FALSE(utils::isValidCodeName(L"A|B"));
  EXPECT_FALSE(utils::isValidCodeName(L"A\tB"));
}

TEST(CheckName, AcceptsEmptyAndLongNamesWithoutForbiddenCharacters) {
  EXPECT_TRUE(utils::checkName(L""));
  EXPECT_TRUE(utils::checkName(String(L'x', 200)));
  EXPECT_FALSE(utils::checkName(L"a|b"));
  EXPECT_FALSE(utils::checkName(L"a\nb"));
}

TEST(CorrectCodeName, ReplacesStructureCharacters) {
  String out;
  EXPECT_TRUE(utils::correctCodeName(L"A{1}|B", out));
  EXPECT_EQ(out, L"A_1__B");
  EXPECT_TRUE(utils::correctCodeName(L"a\tb\r\n,c", out));
  EXPECT_EQ(out, L"a b_c");
}

TEST(CorrectCodeName, FailureLeavesOutUnchanged) {
  String out = L"kept";
  EXPECT_FALSE(utils::correctCodeName(L"\r\n\r\n", out));
  EXPECT_EQ(out, L"kept");
  EXPECT_FALSE(utils::correctCodeName(String(L'x', 51), out));
  EXPECT_EQ(out, L"kept");
  EXPECT_FALSE(utils::correctCodeName(L"", out));
  EXPECT_EQ(out, L"kept");
}

TEST(CorrectCodeName, DroppedLineEndsMayBringALongTextWithinTheLimit) {
  String out;
  EXPECT_TRUE(utils::correctCodeName(String(L'x', 50) + L"\r\n", out));
  EXPECT_EQ(out, String(L'x', 50));
}

TEST(IsValidInteger, AllowsALeadingMinusOnly) {
  EXPECT_TRUE(utils::isValidInteger(L"-12"));
  EXPECT_TRUE(utils::isValidInteger(L"0"));
  EXPECT_FALSE(utils::isValidInteger(L"+5"));
  EXPECT_FALSE(utils::isValidInteger(L"1-2"));
  EXPECT_FALSE(utils::isValidInteger(L"1.5"));
  EXPECT_FALSE(utils::isValidInteger(L""));
  EXPECT_FALSE(utils::isValidInteger(L" 1"));
  EXPECT_FALSE(utils::isValidInteger(L"\u0663"));  // an Arabic-Indic digit is not a digit here
}

TEST(IsValidInteger, LengthIsLimitedToForty) {
  EXPECT_TRUE(utils::isValidInteger(String(L'9', 40)));
  EXPECT_FALSE(utils::isValidInteger(String(L'9', 41)));
}

TEST(IsValidDecimalNumber, AcceptsCommasPointsAndALeadingSign) {
  EXPECT_TRUE(utils::isValidDecimalNumber(L"-1,5"));
  EXPECT_TRUE(utils::isValidDecimalNumber(L"1.2.3"));
  EXPECT_TRUE(utils::isValidDecimalNumber(L"+.5"));
  EXPECT_FALSE(utils::isValidDecimalNumber(L"1-2"));
  EXPECT_FALSE(utils::isValidDecimalNumber(L"1e5"));
  EXPECT_FALSE(utils::isValidDecimalNumber(L"--1"));
  EXPECT_FALSE(utils::isValidDecimalNumber(L""));
  EXPECT_TRUE(utils::isValidDecimalNumber(String(L'1', 40)));
  EXPECT_FALSE(utils::isValidDecimalNumber(String(L'1', 41)));
}
