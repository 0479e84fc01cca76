#include "ieUtils/IEUtilsParsers.h"

#include <gtest/gtest.h>

#include "support/Cases.h"
#include "support/PrintString.h"

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::utils::StringArray;
namespace utils = vyn::ie::utils;

String text(const dex_test::Case& c, std::size_t i) {
  return c.text(i).c_str();
}

TEST(Parsers, SplitLinesIntoValuesAsTheCasesGive) {
  dex_test::forEachCase("parsers.txt", [](const dex_test::Case& c) {
    if (c[0] == "unquote" || c[0] == "collapse") {
      const bool unquote = c[0] == "unquote";
      String edited = text(c, unquote ? 1 : 2);
      unquote ? utils::removeBorderQuotes(edited) : utils::removeUnnecessaryDelimiters(edited, c.text(1)[0]);
      EXPECT_EQ(edited, text(c, unquote ? 2 : 3));
      return;
    }
    const bool appends = c[0] == "values" || c[0] == "quoted";
    StringArray values;
    if (appends) values.Add(L"kept");
    const wchar_t delimiter = c.text(1).empty() ? L',' : c.text(1)[0];
    bool answer = true;
    if (c[0] == "values") answer = utils::parseValues(text(c, 4), values, delimiter, text(c, 2));
    if (c[0] == "quoted") utils::parseValuesInQuotes(text(c, 4), values, delimiter);
    if (c[0] == "spaced") utils::parseSpacedValuesInQuotes(text(c, 4), values);
    if (c[0] == "apa") answer = utils::parseValuesForApaFormat(text(c, 4), values, delimiter, text(c, 2));
    if (c[0] == "sima") answer = utils::parseValuesForSimaFormat(text(c, 4), values, delimiter, text(c, 2));
    EXPECT_EQ(answer, c[3] == "1");
    StringArray expected;
    if (appends) expected.Add(L"kept");
    for (std::size_t i = 5; i < c.size(); ++i)
      expected.Add(text(c, i));
    EXPECT_EQ(values, expected);
  });
}

}  // namespace
