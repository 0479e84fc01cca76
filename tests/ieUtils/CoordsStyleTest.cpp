#include "ieUtils/IEUtilsCoords.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <iterator>
#include <string>

#include "hostlibs/vynmath.h"
#include "support/Cases.h"
#include "support/CommaLocale.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
using String = CVynStringT<wchar_t>;
using utils::coordsByStyleToString;
using utils::stringByStyleToCoords;

constexpr ECoordsStyle kStyles[] = {ECoordsStyle::DECIMAL_DEGREES,   ECoordsStyle::PACKED_DMS,
                                    ECoordsStyle::DMS_DIGITS,        ECoordsStyle::DMS_BLANK_SEPARATED,
                                    ECoordsStyle::DMS_WHOLE_SECONDS, ECoordsStyle::PLAIN_NUMBER,
                                    ECoordsStyle::DMS_WITH_MARKS};

// The value of a name of the list, or the number the field holds.
int valueOf(const std::string& field, std::initializer_list<const char*> names) {
  const auto found =
      std::find_if(names.begin(), names.end(), [&field](const char* name) { return field == name; });
  int value = static_cast<int>(found - names.begin());
  if (found == names.end()) std::from_chars(field.data(), field.data() + field.size(), value);
  return value;
}

ECoordsStyle style(const dex_test::Case& c) {
  return static_cast<ECoordsStyle>(
      valueOf(c[1], {"DECIMAL_DEGREES", "PACKED_DMS", "DMS_DIGITS", "DMS_BLANK_SEPARATED",
                     "DMS_WHOLE_SECONDS", "PLAIN_NUMBER", "DMS_WITH_MARKS"}));
}

TEST(CoordsStyles, WriteAndReadAsTheCasesGive) {
  dex_test::forEachCase("coords.txt", [](const dex_test::Case& c) {
    if (c[0] == "write") {
      const auto sign =
          static_cast<ECoordsSign>(valueOf(c[4], {"SIGNED_NUMBER", "LATITUDE_LETTER", "LONGITUDE_LETTER"}));
      EXPECT_EQ(coordsByStyleToString(style(c), c.number(2), c.integer(3), sign), String(c.text(5).c_str()));
      return;
    }
    bool ok = false;
    const double value = stringByStyleToCoords(style(c), String(c.text(2).c_str()), ok);
    EXPECT_EQ(ok, c[3] != "fails");
    if (ok) dex_test::expectNumber(value, c, 3, 4);
    if (!ok) {
      EXPECT_EQ(value, 0.0);
    }
  });
}

TEST(CoordsStyles, MinusOneSelectsTheDefaultPrecisionAndTheMarkerIsWrittenAsANumber) {
  const int defaults[] = {12, 12, 9, 9, 4, 3, 9};
  for (const ECoordsStyle coordsStyle : kStyles) {
    const int precision = defaults[static_cast<int>(coordsStyle)];
    EXPECT_EQ(coordsByStyleToString(coordsStyle, 47.123456789, -1, ECoordsSign::SIGNED_NUMBER),
              coordsByStyleToString(coordsStyle, 47.123456789, precision, ECoordsSign::SIGNED_NUMBER));
    EXPECT_FALSE(coordsByStyleToString(coordsStyle, kNoValue, -1, ECoordsSign::SIGNED_NUMBER).IsEmpty());
  }
  const String marker =
      coordsByStyleToString(ECoordsStyle::DECIMAL_DEGREES, kNoValue, 3, ECoordsSign::SIGNED_NUMBER);
  EXPECT_EQ(marker.GetLength(), 309 + 4);
  bool ok = false;
  EXPECT_EQ(stringByStyleToCoords(ECoordsStyle::DECIMAL_DEGREES, marker, ok), kNoValue);
  // The seconds styles divide before unpacking: the marker does not survive an empty text.
  EXPECT_EQ(stringByStyleToCoords(ECoordsStyle::DMS_DIGITS, L"", ok), DDDMMSS2Deg(kNoValue / 10000.0));
  EXPECT_NE(stringByStyleToCoords(ECoordsStyle::DMS_WHOLE_SECONDS, L"", ok), kNoValue);
}

TEST(CoordsStyles, ExtendedReaderTellsEmptyInvalidAndValidTextsApart) {
  utils::EFlagFltValues flag = utils::EFlagFltValues::VALID_NUMBER;
  for (const ECoordsStyle coordsStyle : kStyles) {
    EXPECT_EQ(utils::stringByStyleToCoordsEx(coordsStyle, L"", flag), 0.0);
    EXPECT_EQ(flag, utils::EFlagFltValues::EMPTY_TEXT);
    EXPECT_EQ(utils::stringByStyleToCoordsEx(coordsStyle, L"abc", flag), 0.0);
    EXPECT_EQ(flag, utils::EFlagFltValues::NOT_A_NUMBER);
    const String text = coordsByStyleToString(coordsStyle, 12.5, -1, ECoordsSign::LATITUDE_LETTER);
    EXPECT_EQ(utils::stringByStyleToCoordsEx(coordsStyle, text, flag), 12.5);
    EXPECT_EQ(flag, utils::EFlagFltValues::VALID_NUMBER);
  }
}

TEST(CoordsStyles, EveryStyleReadsBackWhatItWritesToTheResolutionOfItsLastDigit) {
  const double values[] = {0.0,         0.00001,  -0.00001, 10.99999999, -10.99999999,
                           359.9999,    12.5,     -75.25,   -0.5,        1e-9,
                           179.0000001, 0.000277, -33.8688, 151.2093,    89.99999999};
  const int defaults[] = {12, 12, 9, 9, 4, 3, 9};
  for (const ECoordsStyle coordsStyle : kStyles) {
    for (const int precision : {-1, 4, 6, 11}) {
      const int decimals = precision == -1 ? defaults[static_cast<int>(coordsStyle)] : precision;
      double resolution =
          0.5 * std::pow(10.0, 4 - decimals) / 3600.0;  // packed decimals beyond minutes and seconds
      if (coordsStyle == ECoordsStyle::DECIMAL_DEGREES) resolution = 0.5 * std::pow(10.0, -decimals);
      if (coordsStyle == ECoordsStyle::PLAIN_NUMBER)
        resolution = std::max(0.5 * std::pow(10.0, -decimals), 0.0001);
      if (coordsStyle == ECoordsStyle::DMS_WHOLE_SECONDS) resolution = 0.5 / 3600.0;
      for (const ECoordsSign sign :
           {ECoordsSign::SIGNED_NUMBER, ECoordsSign::LATITUDE_LETTER, ECoordsSign::LONGITUDE_LETTER}) {
        for (const double value : values) {
          const String written = coordsByStyleToString(coordsStyle, value, precision, sign);
          bool ok = false;
          const double back = stringByStyleToCoords(coordsStyle, written, ok);
          ASSERT_TRUE(ok) << static_cast<int>(coordsStyle) << " " << precision << " "
                          << vyn_text::toUtf8(written.view());
          EXPECT_NEAR(back, value, resolution * (1.0 + 1e-9) + 1e-12) << vyn_text::toUtf8(written.view());
        }
      }
    }
  }
  bool ok = false;  // carried seconds read back as the next minute and degree
  EXPECT_EQ(stringByStyleToCoords(ECoordsStyle::DMS_WITH_MARKS,
                                  coordsByStyleToString(ECoordsStyle::DMS_WITH_MARKS, -10.99999999, 6,
                                                        ECoordsSign::LATITUDE_LETTER),
                                  ok),
            -11.0);
  EXPECT_EQ(stringByStyleToCoords(ECoordsStyle::DMS_WHOLE_SECONDS, L"600000", ok), 60.0);
}

TEST(CoordsStyles, WriteAndReadAPointUnderACommaLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  EXPECT_EQ(coordsByStyleToString(ECoordsStyle::DECIMAL_DEGREES, 12.5, -1, ECoordsSign::SIGNED_NUMBER),
            L"12.500000000000");
  EXPECT_EQ(coordsByStyleToString(ECoordsStyle::DMS_WITH_MARKS, -75.25, -1, ECoordsSign::LONGITUDE_LETTER),
            L"75\u00B015'00.00000\"W");
  bool ok = false;
  EXPECT_EQ(stringByStyleToCoords(ECoordsStyle::DMS_WITH_MARKS, L"75\u00B015'00.00000\"W", ok), -75.25);
  EXPECT_FALSE((stringByStyleToCoords(ECoordsStyle::DECIMAL_DEGREES, L"12,5", ok), ok));
}

}  // namespace
