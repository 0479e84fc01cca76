#include "ieUtils/IEUtilsNames.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "support/Cases.h"
#include "support/PrintString.h"

namespace {

using String = CVynStringT<wchar_t>;
namespace utils = vyn::ie::utils;

TEST(NameRules, AcceptAndCorrectNamesAsTheCasesGive) {
  dex_test::forEachCase("names.txt", [](const dex_test::Case& c) {
    const String text = c.text(1).c_str();
    if (c[0] == "correct") {
      String out = L"kept";
      EXPECT_EQ(utils::correctCodeName(text, out), c[2] != "fails");
      EXPECT_EQ(out, c[2] == "fails" ? String(L"kept") : String(c.text(2).c_str()));
      return;
    }
    const bool accepted = c[0] == "name"      ? utils::isValidName(text)
                          : c[0] == "code"    ? utils::isValidCodeName(text)
                          : c[0] == "check"   ? utils::checkName(text)
                          : c[0] == "integer" ? utils::isValidInteger(text)
                                              : utils::isValidDecimalNumber(text);
    EXPECT_EQ(accepted, c[2] == "1");
  });
}

TEST(NameRules, EachRuleRejectsItsForbiddenCharactersAndAdmitsAllOthers) {
  EXPECT_EQ(std::wstring_view(utils::kCodeNameForbiddenCharacters), L",|{}\t\r\n");
  EXPECT_EQ(std::wstring_view(utils::kCodeNameReplaceableCharacters), L",|{}");
  EXPECT_EQ(std::wstring_view(utils::kObjectNameForbiddenCharacters),
            L"!,?%*@#$%^&'\"\\/|~;[]{}()<>`\t\r\n+=");
  EXPECT_EQ(std::wstring_view(utils::kPointNameForbiddenCharacters),
            std::wstring(utils::kObjectNameForbiddenCharacters) + L" ");
  for (const wchar_t ch : std::wstring_view(utils::kCodeNameForbiddenCharacters))
    EXPECT_FALSE(utils::isAdmissibleCodeNameCharacter(ch)) << static_cast<int>(ch);
  for (const wchar_t ch : std::wstring_view(utils::kPointNameForbiddenCharacters)) {
    EXPECT_EQ(utils::isAdmissibleObjectNameCharacter(ch), ch == L' ') << static_cast<int>(ch);
    EXPECT_FALSE(utils::isAdmissiblePointNameCharacter(ch)) << static_cast<int>(ch);
  }
  for (const wchar_t ch : std::wstring_view(L"aZ09-_.:ÄΩ測 %"))
    EXPECT_TRUE(utils::isAdmissibleCodeNameCharacter(ch) &&
                (ch == L' ' || ch == L'%' || utils::isAdmissiblePointNameCharacter(ch)));
}

}  // namespace
