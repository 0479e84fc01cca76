#include "hostlibs/VynFormats.h"

#include <gtest/gtest.h>

#include <charconv>
#include <climits>
#include <cmath>
#include <cstdio>
#include <cwchar>
#include <limits>
#include <string>

#include "support/Cases.h"
#include "support/CommaLocale.h"
#include "support/TempDir.h"

namespace {

using vyn::math::round_prec;
using vyn_formats::DoubleToString;
using vyn_formats::StringToDegree;

constexpr double kNoValue = std::numeric_limits<double>::max();

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

TEST(VynFormats, WritesReadsAndRoundsNumberTextsAsTheCasesGive) {
  dex_test::forEachCase("vynformats.txt", [](const dex_test::Case& c) {
    if (c[0] == "DoubleToString") {
      const double value = c.number(1);
      EXPECT_EQ(text(c[2].empty() ? DoubleToString(value) : DoubleToString(value, c.integer(2))), c.text(3));
    } else if (c[0] == "StringToDegree") {
      double degrees = 999.0;
      const bool read = StringToDegree(c.text(1).c_str(), degrees);
      EXPECT_EQ(read, c[2] != "refused");
      if (read) {
        EXPECT_NEAR(degrees, c.number(2), 1e-12);
      }
      if (!read) {
        EXPECT_EQ(degrees, 999.0);
      }
    } else {
      dex_test::expectNumber(round_prec(c.number(1), c.integer(2)), c, 3, 4);
    }
  });
  EXPECT_EQ(text(DoubleToString(1.0, 1000)), L"1." + std::wstring(100, L'0'));
  for (const double value : {1.0 / 3.0, -123456.789e-20, 2.2250738585072014e-308, kNoValue, 5e-324})
    EXPECT_EQ(readBack(DoubleToString(value)), value) << value;
  const std::wstring marker = text(DoubleToString(kNoValue, 3));
  EXPECT_EQ(marker.size(), 313u);
  EXPECT_EQ(marker.substr(0, 17), L"17976931348623157");
  EXPECT_EQ(marker.substr(309), L".000");
  EXPECT_EQ(text(DoubleToString(-kNoValue, 100)).size(), 1u + 309u + 1u + 100u);
  for (const double negligible : {-0.004, -1e-200, -0.0})
    EXPECT_FALSE(std::signbit(round_prec(negligible, negligible == -1e-200 ? 100 : 2)));
  double degrees = 999.0;
  EXPECT_FALSE(StringToDegree(nullptr, degrees));
  EXPECT_EQ(degrees, 999.0);
}

TEST(VynFormats, IntegersAreWrittenInTheirWholeRange) {
  EXPECT_EQ(text(vyn_formats::IntToString(0)), L"0");
  EXPECT_EQ(text(vyn_formats::IntToString(-42)), L"-42");
  EXPECT_EQ(text(vyn_formats::IntToString(INT_MIN)), L"-2147483648");
  EXPECT_EQ(text(vyn_formats::UIntToString(UINT_MAX)), L"4294967295");
}

TEST(WriteString, WritesUtf8AndFailsOnANullFileOrAFileThatCannotBeWritten) {
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
  EXPECT_FALSE(vyn_formats::WriteString(nullptr, L"text"));
  FILE* readOnly = std::fopen(path.c_str(), "rb");
  ASSERT_NE(readOnly, nullptr);
  EXPECT_FALSE(vyn_formats::WriteString(readOnly, L"text"));
  std::fclose(readOnly);
}

double dms(double degrees, double minutes, double seconds) {
  return degrees + (minutes * 60.0 + seconds) / 3600.0;
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
