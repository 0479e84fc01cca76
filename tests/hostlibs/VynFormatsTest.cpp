#include "hostlibs/VynFormats.h"

#include <gtest/gtest.h>

#include <charconv>
#include <climits>
#include <cmath>
#include <cstdio>
#include <cwchar>
#include <limits>
#include <string>

#include "support/CommaLocale.h"
#include "support/TempDir.h"

namespace {

using vyn::math::round_prec;
using vyn_formats::DoubleToString;
using vyn_formats::StringToDegree;

constexpr double kNoValue = std::numeric_limits<double>::max();
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();

std::wstring text(const CVynStringT<wchar_t>& value) {
  return std::wstring(value.view());
}

// The number a text holds, read the same way under every process locale.
double readBack(const CVynStringT<wchar_t>& value) {
  const std::string narrow = dex_test::narrow(value.view());
  double number = 0.0;
  std::from_chars(narrow.data(), narrow.data() + narrow.size(), number);
  return number;
}

// ---- DoubleToString, general form ---------------------------------------------------------------

TEST(DoubleToStringGeneral, WritesTheShortestTextThatReadsBack) {
  EXPECT_EQ(text(DoubleToString(0.1)), L"0.1");
  EXPECT_EQ(text(DoubleToString(12.5)), L"12.5");
  EXPECT_EQ(text(DoubleToString(100.0)), L"100");
  EXPECT_EQ(text(DoubleToString(-2.675)), L"-2.675");
  EXPECT_EQ(text(DoubleToString(0.1 + 0.2)), L"0.30000000000000004");
  EXPECT_EQ(text(DoubleToString(1e-7)), L"1e-07");
  EXPECT_EQ(text(DoubleToString(1e21)), L"1e+21");
  EXPECT_EQ(text(DoubleToString(kNoValue)), L"1.7976931348623157e+308");
}

TEST(DoubleToStringGeneral, ValuesReadBackUnchanged) {
  for (const double value : {1.0 / 3.0, -123456.789e-20, 2.2250738585072014e-308, kNoValue, 5e-324}) {
    EXPECT_EQ(readBack(DoubleToString(value)), value) << value;
  }
}

TEST(DoubleToStringGeneral, WritesZeroWithoutSignAndNamesNonFiniteValues) {
  EXPECT_EQ(text(DoubleToString(0.0)), L"0");
  EXPECT_EQ(text(DoubleToString(-0.0)), L"0");
  EXPECT_EQ(text(DoubleToString(kNaN)), L"nan");
  EXPECT_EQ(text(DoubleToString(-kNaN)), L"nan");
  EXPECT_EQ(text(DoubleToString(kInfinity)), L"inf");
  EXPECT_EQ(text(DoubleToString(-kInfinity)), L"-inf");
}

// ---- DoubleToString, fixed form -----------------------------------------------------------------

TEST(DoubleToStringFixed, WritesExactlyTheGivenDecimals) {
  EXPECT_EQ(text(DoubleToString(12.5, 3)), L"12.500");
  EXPECT_EQ(text(DoubleToString(12.5, 0)), L"12");
  EXPECT_EQ(text(DoubleToString(1e-7, 3)), L"0.000");
  EXPECT_EQ(text(DoubleToString(1e-7, 10)), L"0.0000001000");
  EXPECT_EQ(text(DoubleToString(1e21, 2)), L"1000000000000000000000.00");
  EXPECT_EQ(text(DoubleToString(-3.14159, 2)), L"-3.14");
}

TEST(DoubleToStringFixed, RoundsTheBinaryValueAsPrintfDoes) {
  EXPECT_EQ(text(DoubleToString(0.125, 2)), L"0.12");  // an exact tie: to even
  EXPECT_EQ(text(DoubleToString(0.375, 2)), L"0.38");
  EXPECT_EQ(text(DoubleToString(2.675, 2)), L"2.67");  // the double lies below 2.675
  EXPECT_EQ(text(DoubleToString(0.5, 0)), L"0");
  EXPECT_EQ(text(DoubleToString(1.5, 0)), L"2");
  EXPECT_EQ(text(DoubleToString(-0.0005, 3)), L"-0.001");  // the double lies beyond the tie
}

TEST(DoubleToStringFixed, DropsTheMinusSignOfAZeroResult) {
  EXPECT_EQ(text(DoubleToString(-0.0, 3)), L"0.000");
  EXPECT_EQ(text(DoubleToString(-0.0004, 3)), L"0.000");
  EXPECT_EQ(text(DoubleToString(-0.4, 0)), L"0");
  EXPECT_EQ(text(DoubleToString(0.0, 2)), L"0.00");
}

TEST(DoubleToStringFixed, WritesTheNoValueMarkerInFull) {
  const std::wstring marker = text(DoubleToString(kNoValue, 3));
  EXPECT_EQ(marker.size(), 313u);
  EXPECT_EQ(marker.substr(0, 17), L"17976931348623157");
  EXPECT_EQ(marker.substr(309), L".000");
  EXPECT_EQ(text(DoubleToString(-kNoValue, 100)).size(), 1u + 309u + 1u + 100u);
}

TEST(DoubleToStringFixed, TakesDecimalsIntoZeroToOneHundred) {
  EXPECT_EQ(text(DoubleToString(2.5, -4)), L"2");
  EXPECT_EQ(text(DoubleToString(1.0, 1000)), L"1." + std::wstring(100, L'0'));
}

TEST(DoubleToStringFixed, NamesNonFiniteValues) {
  EXPECT_EQ(text(DoubleToString(kNaN, 3)), L"nan");
  EXPECT_EQ(text(DoubleToString(kInfinity, 3)), L"inf");
  EXPECT_EQ(text(DoubleToString(-kInfinity, 3)), L"-inf");
}

// ---- Integers and files -------------------------------------------------------------------------

TEST(IntToString, WritesTheWholeRange) {
  EXPECT_EQ(text(vyn_formats::IntToString(0)), L"0");
  EXPECT_EQ(text(vyn_formats::IntToString(-42)), L"-42");
  EXPECT_EQ(text(vyn_formats::IntToString(INT_MIN)), L"-2147483648");
  EXPECT_EQ(text(vyn_formats::UIntToString(UINT_MAX)), L"4294967295");
}

TEST(WriteString, WritesUtf8) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("out.txt");
  FILE* file = std::fopen(path.c_str(), "wb");
  ASSERT_NE(file, nullptr);
  EXPECT_TRUE(vyn_formats::WriteString(file, L"Gr\u00FC\u00DFe 12\u00B0"));
  EXPECT_TRUE(vyn_formats::WriteString(file, nullptr));
  EXPECT_TRUE(vyn_formats::WriteString(file, L""));
  std::fclose(file);
  EXPECT_EQ(dex_test::readFile(path),
            "Gr\xC3\xBC\xC3\x9F"
            "e 12\xC2\xB0");
}

TEST(WriteString, FailsOnANullFileOrAFileThatCannotBeWritten) {
  EXPECT_FALSE(vyn_formats::WriteString(nullptr, L"text"));

  const dex_test::TempDir folder;
  const std::string path = folder.write("in.txt", "old");
  FILE* readOnly = std::fopen(path.c_str(), "rb");
  ASSERT_NE(readOnly, nullptr);
  EXPECT_FALSE(vyn_formats::WriteString(readOnly, L"text"));
  std::fclose(readOnly);
  EXPECT_EQ(dex_test::readFile(path), "old");
}

// ---- StringToDegree -----------------------------------------------------------------------------

double dms(double degrees, double minutes, double seconds) {
  return degrees + (minutes * 60.0 + seconds) / 3600.0;
}

TEST(StringToDegree, AcceptsDecimalDegreesAndDegreeMinuteSecondForms) {
  const struct {
    const wchar_t* text;
    double degrees;
  } cases[] = {
      {L"12.5", 12.5},
      {L"  -0.25\t", -0.25},
      {L"+7", 7.0},
      {L".5", 0.5},
      {L"1e-07", 1e-7},
      {L"12\u00B030'15.5\"", dms(12, 30, 15.5)},
      {L"12\u00B030'15.5", dms(12, 30, 15.5)},
      {L"12\u00B0 30' 15.5\"", dms(12, 30, 15.5)},
      {L"12\u00B030\u203215.5\u2033", dms(12, 30, 15.5)},
      {L"12\u00B030'15.5''", dms(12, 30, 15.5)},
      {L"12\u00B030'", 12.5},
      {L"12\u00B0", 12.0},
      {L"12\u00B030.5'", dms(12, 30.5, 0)},
      {L"12 30 15.5", dms(12, 30, 15.5)},
      {L"12  30\t15.5", dms(12, 30, 15.5)},
      {L"12 30.5", dms(12, 30.5, 0)},
      {L"12:30:15.5", dms(12, 30, 15.5)},
      {L"12:30", 12.5},
      {L"-0 30", -0.5},
      {L"-12:30:00", -12.5},
      {L"75\u00B015'00.00000\"W", -75.25},
      {L"75\u00B015'00\"w", -75.25},
      {L"S 33 52 04", -dms(33, 52, 4)},
      {L"12 30 00 N", 12.5},
      {L"12.5E", 12.5},
      {L"151:12:30 e", dms(151, 12, 30)},
  };
  for (const auto& c : cases) {
    double degrees = 999.0;
    EXPECT_TRUE(StringToDegree(c.text, degrees)) << c.text;
    EXPECT_NEAR(degrees, c.degrees, 1e-12) << c.text;
  }
}

TEST(StringToDegree, RejectsAnythingElseAndLeavesTheValueUnchanged) {
  const wchar_t* const cases[] = {
      L"",
      L"   ",
      L"abc",
      L"12.5m",
      L"12,5",
      L"nan",
      L"inf",
      L"-inf",
      L"1e999",
      L"--12",
      L"+-12",
      L"-12N",
      L"S-12",
      L"N",
      L"12 60",
      L"12 30 60",
      L"12:30:15:00",
      L"12 30 15 5",
      L"12.5 30",
      L"12 30.5 15",
      L"12:30 15",
      L"12::30",
      L"12:30:",
      L"12 -30",
      L"12\u00B030",
      L"12\u00B030'15\"x",
      L"12\u00B030'15\" 5",
      L"12 \u00B030'",
      L"30'15\"",
      L"12\u00B0\u00B0",
      L"1.2.3",
      L"12 30 15..5",
  };
  for (const wchar_t* c : cases) {
    double degrees = 999.0;
    EXPECT_FALSE(StringToDegree(c, degrees)) << c;
    EXPECT_EQ(degrees, 999.0) << c;
  }
  double degrees = 999.0;
  EXPECT_FALSE(StringToDegree(nullptr, degrees));
  EXPECT_EQ(degrees, 999.0);
}

// ---- round_prec ---------------------------------------------------------------------------------

TEST(RoundPrec, RoundsTheTypedDigitsHalfAwayFromZero) {
  EXPECT_EQ(round_prec(2.675, 2), 2.68);
  EXPECT_EQ(round_prec(-1.005, 2), -1.01);
  EXPECT_EQ(round_prec(1.23456, 3), 1.235);
  EXPECT_EQ(round_prec(1.2344, 3), 1.234);
  EXPECT_EQ(round_prec(0.5, 0), 1.0);
  EXPECT_EQ(round_prec(-0.5, 0), -1.0);
  EXPECT_EQ(round_prec(0.1 + 0.2, 2), 0.3);
  EXPECT_EQ(round_prec(1.0000000000000002, 15), 1.0);
}

TEST(RoundPrec, CarriesIntoHigherDigits) {
  EXPECT_EQ(round_prec(9.9999, 3), 10.0);
  EXPECT_EQ(round_prec(-99.95, 1), -100.0);
  EXPECT_EQ(round_prec(0.006, 2), 0.01);
}

TEST(RoundPrec, NegativeDecimalsRoundToTensAndHundreds) {
  EXPECT_EQ(round_prec(1234.5, -2), 1200.0);
  EXPECT_EQ(round_prec(1250.0, -2), 1300.0);
  EXPECT_EQ(round_prec(-15.0, -1), -20.0);
}

TEST(RoundPrec, AZeroResultIsPositiveZero) {
  EXPECT_EQ(round_prec(0.004, 2), 0.0);
  EXPECT_FALSE(std::signbit(round_prec(-0.004, 2)));
  EXPECT_FALSE(std::signbit(round_prec(-1e-200, 100)));
  EXPECT_FALSE(std::signbit(round_prec(-0.0, 3)));
}

TEST(RoundPrec, ReturnsValuesWithoutSuchADigitUnchanged) {
  EXPECT_EQ(round_prec(1e300, 2), 1e300);
  EXPECT_EQ(round_prec(9007199254740993.0, 0), 9007199254740993.0);
  EXPECT_EQ(round_prec(1.25, 2), 1.25);
  EXPECT_EQ(round_prec(kNoValue, 4), kNoValue);
  EXPECT_EQ(round_prec(1.0 / 3.0, 500), 1.0 / 3.0);
  EXPECT_EQ(round_prec(kInfinity, 2), kInfinity);
  EXPECT_TRUE(std::isnan(round_prec(kNaN, 2)));
}

// ---- Locale independence ------------------------------------------------------------------------

TEST(NumberTexts, UseAPointWhateverTheProcessLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  char probe[16];
  std::snprintf(probe, sizeof probe, "%.1f", 1.5);
  ASSERT_STREQ(probe, "1,5") << "the locale " << comma.name() << " was not really active";

  EXPECT_EQ(text(DoubleToString(1.5, 3)), L"1.500");
  EXPECT_EQ(text(DoubleToString(0.25)), L"0.25");
  CVynStringT<wchar_t> formatted;
  formatted.Format(L"%.3f", 1.5);
  EXPECT_EQ(text(formatted), L"1.500");

  double degrees = 0.0;
  EXPECT_TRUE(StringToDegree(L"12.5", degrees));
  EXPECT_EQ(degrees, 12.5);
  EXPECT_TRUE(StringToDegree(L"12 30 15.5", degrees));
  EXPECT_NEAR(degrees, dms(12, 30, 15.5), 1e-12);
  EXPECT_FALSE(StringToDegree(L"12,5", degrees));
  EXPECT_EQ(round_prec(2.675, 2), 2.68);
}

}  // namespace
