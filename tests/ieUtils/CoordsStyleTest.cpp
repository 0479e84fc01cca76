#include "ieUtils/IEUtilsCoords.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <string>

#include "hostlibs/vynmath.h"
#include "support/CommaLocale.h"

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::ECoordsSign;
using vyn::ie::ECoordsStyle;
using vyn::ie::kNoValue;
using vyn::ie::utils::coordsByStyleToString;
using vyn::ie::utils::EFlagFltValues;
using vyn::ie::utils::stringByStyleToCoords;
using vyn::ie::utils::stringByStyleToCoordsEx;

constexpr double kInfinity = std::numeric_limits<double>::infinity();

static_assert(sizeof(ECoordsStyle) == 4 && sizeof(ECoordsSign) == 4);
static_assert(static_cast<int>(ECoordsStyle::DMS_WITH_MARKS) == 6 &&
              static_cast<int>(ECoordsSign::LONGITUDE_LETTER) == 2);

constexpr ECoordsStyle kAllStyles[] = {
    ECoordsStyle::DECIMAL_DEGREES,     ECoordsStyle::PACKED_DMS,        ECoordsStyle::DMS_DIGITS,
    ECoordsStyle::DMS_BLANK_SEPARATED, ECoordsStyle::DMS_WHOLE_SECONDS, ECoordsStyle::PLAIN_NUMBER,
    ECoordsStyle::DMS_WITH_MARKS,
};

ECoordsStyle style(int value) {
  return static_cast<ECoordsStyle>(value);
}

std::wstring write(ECoordsStyle coordsStyle, double decDeg, int precision = -1,
                   ECoordsSign sign = ECoordsSign::SIGNED_NUMBER) {
  return std::wstring(coordsByStyleToString(coordsStyle, decDeg, precision, sign).view());
}

// The value read back and ok; NaN when the reader failed (its result is then checked to be 0.0).
double read(ECoordsStyle coordsStyle, const std::wstring& text) {
  bool ok = false;
  const double value = stringByStyleToCoords(coordsStyle, String(text.c_str()), ok);
  if (!ok) {
    EXPECT_EQ(value, 0.0) << "a failed read answers 0.0";
    return std::nan("");
  }
  return value;
}

bool readFails(ECoordsStyle coordsStyle, const std::wstring& text) {
  bool ok = true;
  const double value = stringByStyleToCoords(coordsStyle, String(text.c_str()), ok);
  return !ok && value == 0.0;
}

// ---- Writing: the styles and their defaults -----------------------------------------------------

TEST(CoordsByStyleToString, WritesEveryStyleWithItsDefaultPrecision) {
  EXPECT_EQ(write(ECoordsStyle::DECIMAL_DEGREES, 12.5), L"12.500000000000");
  EXPECT_EQ(write(ECoordsStyle::PACKED_DMS, 12.5), L"12.300000000000");
  EXPECT_EQ(write(ECoordsStyle::DMS_DIGITS, 12.5), L"123000.00000");
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, 12.5), L"12 30 00.00000");
  EXPECT_EQ(write(ECoordsStyle::DMS_WHOLE_SECONDS, 12.5), L"123000");
  EXPECT_EQ(write(ECoordsStyle::PLAIN_NUMBER, 12.5), L"12.500");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, 12.5, -1, ECoordsSign::LATITUDE_LETTER),
            L"12\u00B030'00.00000\"N");
}

TEST(CoordsByStyleToString, MinusOneSelectsTheDefaultPrecision) {
  const int defaults[] = {12, 12, 9, 9, 4, 3, 9};
  for (const ECoordsStyle coordsStyle : kAllStyles) {
    const int precision = defaults[static_cast<int>(coordsStyle)];
    EXPECT_EQ(write(coordsStyle, 47.123456789), write(coordsStyle, 47.123456789, precision))
        << static_cast<int>(coordsStyle);
  }
}

TEST(CoordsByStyleToString, NeverPadsTheDegrees) {
  EXPECT_EQ(write(ECoordsStyle::DMS_DIGITS, 5.5), L"53000.00000");
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, 5.5), L"5 30 00.00000");
  EXPECT_EQ(write(ECoordsStyle::DMS_WHOLE_SECONDS, 5.5), L"53000");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, 5.5), L"5\u00B030'00.00000\"");
  EXPECT_EQ(write(ECoordsStyle::DMS_DIGITS, 0.5), L"03000.00000");
}

TEST(CoordsByStyleToString, RoundingCarriesSecondsIntoMinutesAndDegrees) {
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, 10.99999999), L"10 59 59.99996");
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, 10.99999999, 8), L"11 00 00.0000");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, 10.99999999, 6), L"11\u00B000'00.00\"");
  EXPECT_EQ(write(ECoordsStyle::DMS_WHOLE_SECONDS, 10.9999), L"110000");
  EXPECT_EQ(write(ECoordsStyle::DMS_DIGITS, 359.9999, 4), L"3600000.");
  EXPECT_EQ(write(ECoordsStyle::DMS_DIGITS, 359.9999, 6), L"3595959.64");
}

TEST(CoordsByStyleToString, NegativeValuesKeepTheirSignInFront) {
  EXPECT_EQ(write(ECoordsStyle::DECIMAL_DEGREES, -12.5, 2), L"-12.50");
  EXPECT_EQ(write(ECoordsStyle::PACKED_DMS, -12.5, 4), L"-12.3000");
  EXPECT_EQ(write(ECoordsStyle::DMS_DIGITS, -12.5), L"-123000.00000");
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, -12.5), L"-12 30 00.00000");
  EXPECT_EQ(write(ECoordsStyle::DMS_WHOLE_SECONDS, -12.5), L"-123000");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, -12.5), L"-12\u00B030'00.00000\"");
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, -0.00001), L"-0 00 00.03600");
}

TEST(CoordsByStyleToString, PlainNumberWritesTinyMagnitudesAsZero) {
  EXPECT_EQ(write(ECoordsStyle::PLAIN_NUMBER, 0.00009, 6), L"0.000000");
  EXPECT_EQ(write(ECoordsStyle::PLAIN_NUMBER, -0.00009, 6), L"0.000000");
  EXPECT_EQ(write(ECoordsStyle::PLAIN_NUMBER, 0.0001, 6), L"0.000100");
  EXPECT_EQ(write(ECoordsStyle::DECIMAL_DEGREES, 0.00009, 6), L"0.000090");
}

TEST(CoordsByStyleToString, WholeSecondsIgnoreThePrecision) {
  for (const int precision : {-1, 0, 2, 9, 15}) {
    EXPECT_EQ(write(ECoordsStyle::DMS_WHOLE_SECONDS, 12.504166666, precision), L"123015") << precision;
  }
}

TEST(CoordsByStyleToString, HemisphereLettersReplaceTheSign) {
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, -75.25, -1, ECoordsSign::LONGITUDE_LETTER),
            L"75\u00B015'00.00000\"W");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, 75.25, -1, ECoordsSign::LONGITUDE_LETTER),
            L"75\u00B015'00.00000\"E");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, -33.5, 4, ECoordsSign::LATITUDE_LETTER),
            L"33\u00B030'00.\"S");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, 0.0, 5, ECoordsSign::LATITUDE_LETTER), L"0\u00B000'00.0\"N");
  // Any sign value but 0 writes the magnitude; only 1 and 2 have a letter.
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, -33.5, 5, static_cast<ECoordsSign>(9)), L"33\u00B030'00.0\"");
  // The letter belongs to the marks form only.
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, -33.5, 5, ECoordsSign::LATITUDE_LETTER), L"-33 30 00.0");
}

TEST(CoordsByStyleToString, FourPackedDecimalsLeaveAPointAfterTheSeconds) {
  EXPECT_EQ(write(ECoordsStyle::DMS_DIGITS, 12.5, 4), L"123000.");
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, 12.5, 4), L"12 30 00.");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, 12.5, 4), L"12\u00B030'00.\"");
}

TEST(CoordsByStyleToString, SecondsStylesWithoutMinutesAndSecondsGiveAnEmptyText) {
  for (const ECoordsStyle coordsStyle :
       {ECoordsStyle::DMS_DIGITS, ECoordsStyle::DMS_BLANK_SEPARATED, ECoordsStyle::DMS_WITH_MARKS}) {
    SCOPED_TRACE(static_cast<int>(coordsStyle));
    for (const int precision : {0, 1, 2, 3, -2, -100}) {
      EXPECT_EQ(write(coordsStyle, 12.5, precision), L"") << precision;
    }
    EXPECT_EQ(write(coordsStyle, std::nan("")), L"");
    EXPECT_EQ(write(coordsStyle, kInfinity), L"");
    EXPECT_EQ(write(coordsStyle, -kInfinity, -1, ECoordsSign::LATITUDE_LETTER), L"");
  }
}

TEST(CoordsByStyleToString, OtherStylesWriteNonFiniteValuesAsTheHostDoes) {
  EXPECT_EQ(write(ECoordsStyle::DECIMAL_DEGREES, std::nan("")), L"nan");
  EXPECT_EQ(write(ECoordsStyle::PACKED_DMS, -kInfinity), L"-inf");
  EXPECT_EQ(write(ECoordsStyle::DMS_WHOLE_SECONDS, std::nan("")), L"nan");
  EXPECT_EQ(write(ECoordsStyle::PLAIN_NUMBER, kInfinity), L"inf");
}

TEST(CoordsByStyleToString, NegativePrecisionsOtherThanMinusOneWriteTheShortestForm) {
  EXPECT_EQ(write(ECoordsStyle::DECIMAL_DEGREES, 12.25, -2), L"12.25");
  EXPECT_EQ(write(ECoordsStyle::PLAIN_NUMBER, 12.25, -5), L"12.25");
  EXPECT_EQ(write(ECoordsStyle::PACKED_DMS, 12.5, -2), L"13");  // the packed value rounded to 0 decimals
}

TEST(CoordsByStyleToString, UnknownStylesGiveAnEmptyText) {
  for (const int value : {7, 8, 99, -1}) {
    EXPECT_EQ(write(style(value), 12.5), L"") << value;
  }
}

TEST(CoordsByStyleToString, NoValueMarkerIsWrittenAsANumber) {
  const std::wstring marker = write(ECoordsStyle::DECIMAL_DEGREES, kNoValue, 3);
  EXPECT_EQ(marker.size(), 309u + 4u);
  EXPECT_EQ(marker.substr(0, 17), L"17976931348623157");
  EXPECT_EQ(read(ECoordsStyle::DECIMAL_DEGREES, marker), kNoValue);
  EXPECT_EQ(read(ECoordsStyle::PLAIN_NUMBER, write(ECoordsStyle::PLAIN_NUMBER, kNoValue)), kNoValue);
  for (const ECoordsStyle coordsStyle : kAllStyles) {
    EXPECT_FALSE(write(coordsStyle, kNoValue).empty()) << static_cast<int>(coordsStyle);
  }
}

// ---- Reading ------------------------------------------------------------------------------------

TEST(StringByStyleToCoords, ReadsTheExamplesOfEveryStyle) {
  EXPECT_EQ(read(ECoordsStyle::DECIMAL_DEGREES, L"12.500000000000"), 12.5);
  EXPECT_EQ(read(ECoordsStyle::PACKED_DMS, L"12.300000000000"), 12.5);
  EXPECT_EQ(read(ECoordsStyle::DMS_DIGITS, L"123000.00000"), 12.5);
  EXPECT_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 30 00.00000"), 12.5);
  EXPECT_EQ(read(ECoordsStyle::DMS_WHOLE_SECONDS, L"123000"), 12.5);
  EXPECT_EQ(read(ECoordsStyle::PLAIN_NUMBER, L"12.500"), 12.5);
  EXPECT_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"12\u00B030'00.00000\"N"), 12.5);
}

TEST(StringByStyleToCoords, ReadsALongitudeWithItsWestLetterAsNegative) {
  const std::wstring west = write(ECoordsStyle::DMS_WITH_MARKS, -75.25, -1, ECoordsSign::LONGITUDE_LETTER);
  EXPECT_EQ(west, L"75\u00B015'00.00000\"W");
  EXPECT_EQ(read(ECoordsStyle::DMS_WITH_MARKS, west), -75.25);
  EXPECT_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"75\u00B015'00.00000\"w"), -75.25);
  EXPECT_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"33\u00B030'00.0\"S"), -33.5);
  EXPECT_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"33\u00B030'00.0\"E"), 33.5);
}

TEST(StringByStyleToCoords, PadsOneDigitMinutesAndSecondsOfTheBlankForm) {
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 3 5.5"), 12.0 + 3.0 / 60.0 + 5.5 / 3600.0);
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 3 5.5"), DDDMMSS2Deg(12.03055));
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 30 5.5"), DDDMMSS2Deg(12.30055));
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 3 15."), DDDMMSS2Deg(12.0315));
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 30 ."), 12.5);
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 30 15.5 S"), -DDDMMSS2Deg(12.30155));
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, L"12 30 15.5w\r\n"), -DDDMMSS2Deg(12.30155));
}

TEST(StringByStyleToCoords, PadsMinutesOfTheMarksFormByOneZero) {
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"12\u00B03'5.5\""), DDDMMSS2Deg(12.03055));
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"12\u00B030'5.5\"N"), DDDMMSS2Deg(12.30055));
  // No minute digits: one zero only, so the seconds slide into the minutes.
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"12\u00B0'30.5\""), DDDMMSS2Deg(12.0305));
  // The closing double quote is optional, and everything after it is dropped.
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"12\u00B030'15.5"), DDDMMSS2Deg(12.30155));
  EXPECT_DOUBLE_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"12\u00B030'15.5\" anything"), DDDMMSS2Deg(12.30155));
}

TEST(StringByStyleToCoords, NumberStylesReadWhatStringToDoubleReads) {
  EXPECT_EQ(read(ECoordsStyle::DECIMAL_DEGREES, L" -45.25 \r\n"), -45.25);
  EXPECT_EQ(read(ECoordsStyle::PACKED_DMS, L"-45.15"), -45.25);
  EXPECT_EQ(read(ECoordsStyle::DMS_DIGITS, L"451500"), 45.25);
  EXPECT_EQ(read(ECoordsStyle::DMS_WHOLE_SECONDS, L"-451500"), -45.25);
  EXPECT_TRUE(readFails(ECoordsStyle::DECIMAL_DEGREES, L"45.25N"));
  EXPECT_TRUE(readFails(ECoordsStyle::DMS_DIGITS, L"45 15 00"));
  EXPECT_TRUE(readFails(ECoordsStyle::PLAIN_NUMBER, L"12,5"));
}

TEST(StringByStyleToCoords, UnknownStylesReadThePlainNumber) {
  for (const int value : {7, 99, -1}) {
    EXPECT_EQ(read(style(value), L"12.3"), 12.3) << value;
    EXPECT_TRUE(readFails(style(value), L"12.3x")) << value;
  }
}

TEST(StringByStyleToCoords, EmptyTextsFollowTheNumberReader) {
  EXPECT_EQ(read(ECoordsStyle::DECIMAL_DEGREES, L""), kNoValue);
  EXPECT_EQ(read(ECoordsStyle::PLAIN_NUMBER, L"  "), kNoValue);
  EXPECT_EQ(read(ECoordsStyle::PACKED_DMS, L""), kNoValue);
  // The seconds styles divide before unpacking: the marker does not survive.
  EXPECT_EQ(read(ECoordsStyle::DMS_DIGITS, L""), DDDMMSS2Deg(kNoValue / 10000.0));
  EXPECT_NE(read(ECoordsStyle::DMS_WHOLE_SECONDS, L""), kNoValue);
  EXPECT_TRUE(readFails(ECoordsStyle::DMS_BLANK_SEPARATED, L""));
  EXPECT_TRUE(readFails(ECoordsStyle::DMS_WITH_MARKS, L""));
}

TEST(StringByStyleToCoords, BlankFormWithoutItsSeparatorsOrPointFails) {
  for (const wchar_t* bad : {L"123000.0",             // no blank
                             L"12 3000.0", L"12 30",  // one blank
                             L"12 30 15", L"12 3 5",  // no point
                             L"1.2 3 4",              // the point in the degrees
                             L"12 3.5 15",            // the point in the minutes
                             L"1.2 3 ",               // the point before a field that cannot be padded
                             L"12 ", L" ", L"  ", L"12  30 00.0", L"12 30 00.0 N", L"12 30 00.0\u00B0"}) {
    EXPECT_TRUE(readFails(ECoordsStyle::DMS_BLANK_SEPARATED, bad)) << bad;
  }
}

TEST(StringByStyleToCoords, MarksFormWithoutItsSeparatorsOrPointFails) {
  for (const wchar_t* bad : {L"12 30 00.0",         // blanks instead of marks
                             L"12\u00B03000.0\"",   // no apostrophe
                             L"1230'00.0\"",        // no degree sign
                             L"12'30\u00B000.0\"",  // the apostrophe before the degree sign
                             L"12\u00B030'15\"",    // no point
                             L"1.5\u00B030'00\"",   // the point in the degrees
                             L"12\u00B03.5'00\"",   // the point in the minutes
                             L"12\u00B030'00.0N",   // a letter without the closing quote
                             L"\u00B0'", L"'\u00B0."}) {
    EXPECT_TRUE(readFails(ECoordsStyle::DMS_WITH_MARKS, bad)) << bad;
  }
}

TEST(StringByStyleToCoordsEx, TellsEmptyInvalidAndValidTextsApart) {
  EFlagFltValues flag = EFlagFltValues::VALID_NUMBER;
  for (const ECoordsStyle coordsStyle : kAllStyles) {
    SCOPED_TRACE(static_cast<int>(coordsStyle));
    EXPECT_EQ(stringByStyleToCoordsEx(coordsStyle, String(L""), flag), 0.0);
    EXPECT_EQ(flag, EFlagFltValues::EMPTY_TEXT);
    EXPECT_EQ(stringByStyleToCoordsEx(coordsStyle, String(L"abc"), flag), 0.0);
    EXPECT_EQ(flag, EFlagFltValues::NOT_A_NUMBER);
    const String text = coordsByStyleToString(coordsStyle, 12.5, -1, ECoordsSign::LATITUDE_LETTER);
    EXPECT_EQ(stringByStyleToCoordsEx(coordsStyle, text, flag), 12.5);
    EXPECT_EQ(flag, EFlagFltValues::VALID_NUMBER);
  }
}

// ---- Round trips --------------------------------------------------------------------------------

// Half a unit of the last written digit, in degrees.
double resolution(ECoordsStyle coordsStyle, int precision) {
  switch (coordsStyle) {
    case ECoordsStyle::DECIMAL_DEGREES:
      return 0.5 * std::pow(10.0, -precision);
    case ECoordsStyle::PLAIN_NUMBER:
      return std::max(0.5 * std::pow(10.0, -precision), 0.0001);  // tiny values are written as 0
    case ECoordsStyle::DMS_WHOLE_SECONDS:
      return 0.5 / 3600.0;
    default:  // packed decimals beyond the 4 of minutes and seconds are decimals of a second
      return 0.5 * std::pow(10.0, 4 - precision) / 3600.0;
  }
}

int effectivePrecision(ECoordsStyle coordsStyle, int precision) {
  const int defaults[] = {12, 12, 9, 9, 4, 3, 9};
  return precision == -1 ? defaults[static_cast<int>(coordsStyle)] : precision;
}

TEST(CoordsStyleRoundTrip, EveryStyleReadsBackWhatItWrites) {
  const double values[] = {0.0,       0.00001,     -0.00001, 10.99999999, -10.99999999, 359.9999,
                           -359.9999, 12.5,        -75.25,   45.1234567,  -0.5,         89.99999999,
                           1e-9,      179.0000001, 0.000277, -33.8688,    151.2093};
  const ECoordsSign signs[] = {ECoordsSign::SIGNED_NUMBER, ECoordsSign::LATITUDE_LETTER,
                               ECoordsSign::LONGITUDE_LETTER};
  for (const ECoordsStyle coordsStyle : kAllStyles) {
    for (const int precision : {-1, 4, 6, 11}) {
      const int decimals = effectivePrecision(coordsStyle, precision);
      for (const ECoordsSign sign : signs) {
        for (const double value : values) {
          const std::wstring written = write(coordsStyle, value, precision, sign);
          SCOPED_TRACE(testing::Message()
                       << "style " << static_cast<int>(coordsStyle) << " precision " << precision << " value "
                       << value << " text " << vyn_text::toUtf8(written));
          ASSERT_FALSE(written.empty());
          const double back = read(coordsStyle, written);
          ASSERT_FALSE(std::isnan(back));
          EXPECT_NEAR(back, value, resolution(coordsStyle, decimals) * (1.0 + 1e-9) + 1e-12);
        }
      }
    }
  }
}

TEST(CoordsStyleRoundTrip, CarriedSecondsReadBackAsTheNextMinuteAndDegree) {
  EXPECT_EQ(read(ECoordsStyle::DMS_BLANK_SEPARATED, write(ECoordsStyle::DMS_BLANK_SEPARATED, 10.99999999, 8)),
            11.0);
  EXPECT_EQ(read(ECoordsStyle::DMS_DIGITS, write(ECoordsStyle::DMS_DIGITS, 359.9999, 4)), 360.0);
  EXPECT_EQ(read(ECoordsStyle::DMS_WITH_MARKS,
                 write(ECoordsStyle::DMS_WITH_MARKS, -10.99999999, 6, ECoordsSign::LATITUDE_LETTER)),
            -11.0);
  EXPECT_EQ(read(ECoordsStyle::DMS_WHOLE_SECONDS, write(ECoordsStyle::DMS_WHOLE_SECONDS, 59.99999)), 60.0);
}

// ---- Locale -------------------------------------------------------------------------------------

TEST(CoordsByStyleToString, WritesAndReadsAPointUnderACommaLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  EXPECT_EQ(write(ECoordsStyle::DECIMAL_DEGREES, 12.5), L"12.500000000000");
  EXPECT_EQ(write(ECoordsStyle::PACKED_DMS, 12.5), L"12.300000000000");
  EXPECT_EQ(write(ECoordsStyle::DMS_BLANK_SEPARATED, 12.5), L"12 30 00.00000");
  EXPECT_EQ(write(ECoordsStyle::DMS_WITH_MARKS, -75.25, -1, ECoordsSign::LONGITUDE_LETTER),
            L"75\u00B015'00.00000\"W");
  EXPECT_EQ(read(ECoordsStyle::DMS_WITH_MARKS, L"75\u00B015'00.00000\"W"), -75.25);
  EXPECT_EQ(read(ECoordsStyle::DECIMAL_DEGREES, L"12.5"), 12.5);
  EXPECT_TRUE(readFails(ECoordsStyle::DECIMAL_DEGREES, L"12,5"));
}

}  // namespace
