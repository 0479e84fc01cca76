#include "ieUtils/IEUtilsParsers.h"

#include <gtest/gtest.h>

#include <initializer_list>

using String = CVynStringT<wchar_t>;
using vyn::ie::utils::StringArray;

namespace {

StringArray listOf(std::initializer_list<const wchar_t*> texts) {
  StringArray values;
  for (const wchar_t* text : texts)
    values.Add(text);
  return values;
}

StringArray splitValues(const String& line, wchar_t delimiter = L',', const String& forbidden = String()) {
  StringArray values;
  EXPECT_TRUE(vyn::ie::utils::parseValues(line, values, delimiter, forbidden));
  return values;
}

StringArray splitQuoted(const String& line, wchar_t delimiter = L',') {
  StringArray values;
  vyn::ie::utils::parseValuesInQuotes(line, values, delimiter);
  return values;
}

StringArray splitSpaced(const String& line) {
  StringArray values;
  vyn::ie::utils::parseSpacedValuesInQuotes(line, values);
  return values;
}

}  // namespace

// ---- parseValues

TEST(ParseValues, TrailingDelimiterGivesAnEmptyLastValue) {
  EXPECT_EQ(splitValues(L"a,b,"), listOf({L"a", L"b", L""}));
}

TEST(ParseValues, EmptyLineGivesOneEmptyValue) {
  EXPECT_EQ(splitValues(L""), listOf({L""}));
}

TEST(ParseValues, LineOfOnlyDelimitersGivesOneMoreEmptyValueThanDelimiters) {
  EXPECT_EQ(splitValues(L",,,"), listOf({L"", L"", L"", L""}));
}

TEST(ParseValues, ForbiddenCharacterStopsWithFalseAndKeepsTheValuesBefore) {
  StringArray values;
  EXPECT_FALSE(vyn::ie::utils::parseValues(L"a,x;y,b", values, L',', L";"));
  EXPECT_EQ(values, listOf({L"a"}));
}

TEST(ParseValues, ForbiddenCharactersAreLookedForAfterTrimming) {
  StringArray values;
  EXPECT_TRUE(vyn::ie::utils::parseValues(L" a ,\tb\t", values, L',', L" \t"));
  EXPECT_EQ(values, listOf({L"a", L"b"}));
  EXPECT_FALSE(vyn::ie::utils::parseValues(L"a b", values, L',', L" "));
}

TEST(ParseValues, TrimsBlanksTabsAndLineEndsAndRemovesInnerLineEnds) {
  EXPECT_EQ(splitValues(L"  a \t,\tb\r\nc ,d\r\n"), listOf({L"a", L"bc", L"d"}));
}

TEST(ParseValues, CrLfLineEndingsDoNotReachTheLastValue) {
  EXPECT_EQ(splitValues(L"P1,100.5,200.25\r\n"), listOf({L"P1", L"100.5", L"200.25"}));
}

TEST(ParseValues, KeepsNonAsciiText) {
  EXPECT_EQ(splitValues(L"Müller;Ωmega;測量 点", L';'), listOf({L"Müller", L"Ωmega", L"測量 点"}));
}

TEST(ParseValues, AppendsWithoutClearingTheList) {
  StringArray values = listOf({L"old"});
  EXPECT_TRUE(vyn::ie::utils::parseValues(L"x|y", values, L'|', String()));
  EXPECT_EQ(values, listOf({L"old", L"x", L"y"}));
}

TEST(ParseValues, QuotesAreOrdinaryCharacters) {
  EXPECT_EQ(splitValues(L"\"a,b\""), listOf({L"\"a", L"b\""}));
  EXPECT_EQ(splitValues(L"1,\"a,b"), listOf({L"1", L"\"a", L"b"}));
}

// ---- parseValuesInQuotes

TEST(ParseValuesInQuotes, QuotedValueMayHoldTheDelimiter) {
  EXPECT_EQ(splitQuoted(L"1,\"a,b\",2"), listOf({L"1", L"a,b", L"2"}));
}

TEST(ParseValuesInQuotes, QuoteNeverClosedDropsTheRestOfTheLine) {
  EXPECT_EQ(splitQuoted(L"1,\"a"), listOf({L"1"}));
  EXPECT_EQ(splitQuoted(L"1,\"a,b,2"), listOf({L"1"}));
  EXPECT_EQ(splitQuoted(L"\""), listOf({}));
}

TEST(ParseValuesInQuotes, DoubledQuotesInsideAValueStay) {
  EXPECT_EQ(splitQuoted(L"\"x\"\"y\""), listOf({L"x\"\"y"}));
}

TEST(ParseValuesInQuotes, EmptyValuesBetweenDelimitersStay) {
  EXPECT_EQ(splitQuoted(L"a,,b"), listOf({L"a", L"", L"b"}));
}

TEST(ParseValuesInQuotes, TrailingDelimiterAddsNoEmptyValue) {
  EXPECT_EQ(splitQuoted(L"a,b,"), listOf({L"a", L"b"}));
  EXPECT_EQ(splitQuoted(L"a,b,   "), listOf({L"a", L"b"}));
}

TEST(ParseValuesInQuotes, EmptyLineGivesNothing) {
  EXPECT_EQ(splitQuoted(L""), listOf({}));
  EXPECT_EQ(splitQuoted(L"    "), listOf({}));
}

TEST(ParseValuesInQuotes, LineOfOnlyDelimitersGivesOneEmptyValuePerDelimiter) {
  EXPECT_EQ(splitQuoted(L",,,"), listOf({L"", L"", L""}));
}

TEST(ParseValuesInQuotes, EmptyQuotedValueIsAnEmptyValue) {
  EXPECT_EQ(splitQuoted(L"\"\",x"), listOf({L"", L"x"}));
}

TEST(ParseValuesInQuotes, BlanksAroundValuesAndQuotesAreDropped) {
  EXPECT_EQ(splitQuoted(L"  a  ,  \"b c\"  , d"), listOf({L"a", L"b c", L"d"}));
  EXPECT_EQ(splitQuoted(L"\" padded \""), listOf({L"padded"}));
}

TEST(ParseValuesInQuotes, TextAfterTheClosingQuoteKeepsTheValueOpen) {
  EXPECT_EQ(splitQuoted(L"\"a\"x,b"), listOf({}));
  EXPECT_EQ(splitQuoted(L"\"a\"x,b\""), listOf({}));
  EXPECT_EQ(splitQuoted(L"\"a\"x,b\"\""), listOf({L"a\"x,b\""}));
}

TEST(ParseValuesInQuotes, CrLfAfterTheLastQuotedValueKeepsIt) {
  EXPECT_EQ(splitQuoted(L"1,\"a,b\"\r\n"), listOf({L"1", L"a,b"}));
  EXPECT_EQ(splitQuoted(L"P1,\"CODE A\"\n"), listOf({L"P1", L"CODE A"}));
  EXPECT_EQ(splitQuoted(L"1,2\r\n"), listOf({L"1", L"2"}));
}

TEST(ParseValuesInQuotes, LineEndsInsideAValueAreRemoved) {
  EXPECT_EQ(splitQuoted(L"\"a\r\nb\",c\rd"), listOf({L"ab", L"cd"}));
}

TEST(ParseValuesInQuotes, KeepsNonAsciiText) {
  EXPECT_EQ(splitQuoted(L"Punkt 1;\"Straße; Ecke\";測量", L';'),
            listOf({L"Punkt 1", L"Straße; Ecke", L"測量"}));
}

TEST(ParseValuesInQuotes, AppendsWithoutClearingTheList) {
  StringArray values = listOf({L"old"});
  vyn::ie::utils::parseValuesInQuotes(L"x", values, L',');
  EXPECT_EQ(values, listOf({L"old", L"x"}));
}

// ---- parseSpacedValuesInQuotes

TEST(ParseSpacedValuesInQuotes, RunsOfBlanksSeparateValues) {
  EXPECT_EQ(splitSpaced(L"   P1    \"a b\"   3   "), listOf({L"P1", L"a b", L"3"}));
}

TEST(ParseSpacedValuesInQuotes, RunsOfBlanksInsideQuotesBecomeOneBlank) {
  EXPECT_EQ(splitSpaced(L"\"a    b\" c"), listOf({L"a b", L"c"}));
}

TEST(ParseSpacedValuesInQuotes, TabsAreNotSeparators) {
  EXPECT_EQ(splitSpaced(L"a\tb c"), listOf({L"a\tb", L"c"}));
}

TEST(ParseSpacedValuesInQuotes, EmptyAndBlankLinesGiveNothing) {
  EXPECT_EQ(splitSpaced(L""), listOf({}));
  EXPECT_EQ(splitSpaced(L"      "), listOf({}));
}

TEST(ParseSpacedValuesInQuotes, CrLfEndingAndUnbalancedQuote) {
  EXPECT_EQ(splitSpaced(L"P1  \"a b\"\r\n"), listOf({L"P1", L"a b"}));
  EXPECT_EQ(splitSpaced(L"P1 \"a b"), listOf({L"P1"}));
}

// ---- APA and SIMA

TEST(ParseValuesForApaFormat, KeepsTheFirstFiveValues) {
  StringArray values;
  EXPECT_TRUE(vyn::ie::utils::parseValuesForApaFormat(L"1,2,3,4,5,6,7", values, ',', String()));
  EXPECT_EQ(values, listOf({L"1", L"2", L"3", L"4", L"5"}));
}

TEST(ParseValuesForSimaFormat, KeepsTheFirstSixValues) {
  StringArray values;
  EXPECT_TRUE(vyn::ie::utils::parseValuesForSimaFormat(L"1,2,3,4,5,6,7", values, ',', String()));
  EXPECT_EQ(values, listOf({L"1", L"2", L"3", L"4", L"5", L"6"}));
}

TEST(ParseValuesForApaFormat, SplitsAtCommasWhateverDelimiterAndForbiddenSay) {
  StringArray values;
  EXPECT_TRUE(vyn::ie::utils::parseValuesForApaFormat(L" a ;b, c\r\n", values, ';', L"a"));
  EXPECT_EQ(values, listOf({L"a ;b", L"c"}));
}

TEST(ParseValuesForSimaFormat, KeepsNonAsciiTextAndQuotesAsTheyAre) {
  StringArray values;
  EXPECT_TRUE(vyn::ie::utils::parseValuesForSimaFormat(L"Straße,\"測量,x\"\r\n", values, ',', String()));
  EXPECT_EQ(values, listOf({L"Straße", L"\"測量", L"x\""}));
}

TEST(ParseValuesForApaFormat, TrailingCommaAndEmptyLineAddNoEmptyValue) {
  StringArray values;
  EXPECT_TRUE(vyn::ie::utils::parseValuesForApaFormat(L"a,b,", values, ',', String()));
  EXPECT_EQ(values, listOf({L"a", L"b"}));
  values.RemoveAll();
  EXPECT_TRUE(vyn::ie::utils::parseValuesForSimaFormat(L"", values, ',', String()));
  EXPECT_EQ(values, listOf({}));
  EXPECT_TRUE(vyn::ie::utils::parseValuesForSimaFormat(L",,", values, ',', String()));
  EXPECT_EQ(values, listOf({L"", L""}));
}

// ---- removeBorderQuotes and removeUnnecessaryDelimiters

TEST(RemoveBorderQuotes, RemovesTheQuotesAroundAText) {
  String text = L"\"abc\"";
  vyn::ie::utils::removeBorderQuotes(text);
  EXPECT_EQ(text, L"abc");
}

TEST(RemoveBorderQuotes, NeedsTheLeadingQuote) {
  String text = L"abc\"";
  vyn::ie::utils::removeBorderQuotes(text);
  EXPECT_EQ(text, L"abc\"");
  String empty;
  vyn::ie::utils::removeBorderQuotes(empty);
  EXPECT_EQ(empty, L"");
}

TEST(RemoveBorderQuotes, RemovesTheClosingQuoteOnlyWhenItIsTheFirstOneLeft) {
  String unclosed = L"\"abc";
  vyn::ie::utils::removeBorderQuotes(unclosed);
  EXPECT_EQ(unclosed, L"abc");
  String inner = L"\"a\"b\"";
  vyn::ie::utils::removeBorderQuotes(inner);
  EXPECT_EQ(inner, L"a\"b\"");
  String lone = L"\"";
  vyn::ie::utils::removeBorderQuotes(lone);
  EXPECT_EQ(lone, L"");
  String pair = L"\"\"";
  vyn::ie::utils::removeBorderQuotes(pair);
  EXPECT_EQ(pair, L"");
}

TEST(RemoveUnnecessaryDelimiters, CollapsesRunsAndDropsOneAtEachEnd) {
  String text = L",,a,,,b,,";
  vyn::ie::utils::removeUnnecessaryDelimiters(text, L',');
  EXPECT_EQ(text, L"a,b");
  String spaced = L"  P1   10.5 ";
  vyn::ie::utils::removeUnnecessaryDelimiters(spaced, L' ');
  EXPECT_EQ(spaced, L"P1 10.5");
}

TEST(RemoveUnnecessaryDelimiters, TextOfOnlyDelimitersBecomesEmpty) {
  String single = L";";
  vyn::ie::utils::removeUnnecessaryDelimiters(single, L';');
  EXPECT_EQ(single, L"");
  String run = L";;;;";
  vyn::ie::utils::removeUnnecessaryDelimiters(run, L';');
  EXPECT_EQ(run, L"");
  String empty;
  vyn::ie::utils::removeUnnecessaryDelimiters(empty, L';');
  EXPECT_EQ(empty, L"");
}
