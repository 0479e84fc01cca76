#include "ieUtils/IEUtilsUnits.h"

#include <gtest/gtest.h>

#include <charconv>
#include <cmath>
#include <map>
#include <numbers>
#include <string>

#include "hostlibs/vynmath.h"
#include "ieUtils/IEUtilsUnitWords.h"
#include "support/Cases.h"
#include "support/CommaLocale.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
using String = CVynStringT<wchar_t>;
using dex_test::Case;

int number(const std::string& text) {
  int value = 0;
  std::from_chars(text.data(), text.data() + text.size(), value);
  return value;
}

// A unit of a case: its keyword or its number.
EDistUnits dist(const Case& c, std::size_t i) {
  EDistUnits units = EDistUnits::METERS;
  return utils::distUnitsFromKeyword(c.text(i).c_str(), units) ? units
                                                               : static_cast<EDistUnits>(number(c[i]));
}
EAngleUnits angle(const Case& c, std::size_t i) {
  EAngleUnits units = EAngleUnits::DECDEG;
  return utils::angleUnitsFromKeyword(c.text(i).c_str(), units) ? units
                                                                : static_cast<EAngleUnits>(number(c[i]));
}
template <class E>
E other(const Case& c, std::size_t i) {
  static const std::map<std::string, int> kNames = {
      {"FAHRENHEIT", static_cast<int>(ETemperatureUnits::FAHRENHEIT)},
      {"CELSIUS", static_cast<int>(ETemperatureUnits::CELSIUS)},
      {"MMHG", static_cast<int>(EPressureUnits::MMHG)},
      {"INHG", static_cast<int>(EPressureUnits::INHG)},
      {"HPA", static_cast<int>(EPressureUnits::HPA)},
      {"MBAR", static_cast<int>(EPressureUnits::MBAR)}};
  const auto found = kNames.find(c[i]);
  return static_cast<E>(found != kNames.end() ? found->second : number(c[i]));
}

String text(const Case& c, std::size_t i) {
  return c.text(i).c_str();
}

// Checks one case of tests/data/cases/units.txt.
void check(const Case& c) {
  const std::string& op = c[0];
  const auto near = [&c](double actual, std::size_t expected) {
    dex_test::expectNumber(actual, c, expected, 9);
  };
  if (op == "toMeters") return near(utils::toMetersFactor(c.number(2), dist(c, 1)), 3);
  if (op == "fromMeters") return near(utils::fromMetersFactor(c.number(2), dist(c, 1)), 3);
  if (op == "toDecDeg") return near(utils::angleToDecDeg(c.number(2), angle(c, 1)), 3);
  if (op == "fromDecDeg") return near(utils::decDegToAngle(angle(c, 1), c.number(2), c.integer(3)), 4);
  if (op == "fromCelsius") return near(utils::fromCelsius(c.number(2), other<ETemperatureUnits>(c, 1)), 3);
  if (op == "fromHpa") return near(utils::fromHpa(c.number(2), other<EPressureUnits>(c, 1)), 3);
  if (op == "checkZero") return near(utils::checkZeroVal(c.number(1)), 2);
  if (op == "textToDist") return near(utils::stringByStyleToDist(dist(c, 1), text(c, 2)), 3);
  if (op == "textToAngle") return near(utils::stringByStyleToAngle(angle(c, 1), text(c, 2)), 3);
  String out(L"refused");
  if (op == "distText") out = utils::distByStyleToString(dist(c, 1), c.number(2), c.integer(3));
  if (op == "angleText") out = utils::angleByStyleToString(angle(c, 1), c.number(2), c.integer(3));
  if (op == "doubleToString") out = utils::doubleToString(c.number(1), c.integer(2));
  if (op == "withExp") {
    EXPECT_EQ(c[2] != "refused", utils::doubleToStringWithExp(c.number(1), out));
  }
  if (out != L"refused" || op == "withExp") {
    EXPECT_EQ(text(c, op == "withExp" ? 2 : op == "doubleToString" ? 3 : 4), out);
  } else if (op == "stringToDouble") {
    double value = 7.0;
    EXPECT_EQ(c[2] == "1", utils::stringToDouble(text(c, 1), value));
    near(value, 3);
  } else if (op == "textToDistOk") {
    bool ok = c[4] != "1";
    near(utils::stringByStyleToDist(dist(c, 1), text(c, 2), ok), 3);
    EXPECT_EQ(c[4] == "1", ok);
  } else {
    ASSERT_EQ("textToDistEx", op);
    utils::EFlagFltValues flag = utils::EFlagFltValues::VALID_NUMBER;
    near(utils::stringByStyleToDistEx(dist(c, 1), text(c, 2), flag), 3);
    EXPECT_EQ(c.integer(4), static_cast<int>(flag));
  }
}

TEST(Units, ConvertWriteAndReadAsTheCasesGive) {
  dex_test::forEachCase("units.txt", check);
  EXPECT_EQ(kNoValue, 1.7976931348623157e308);
}

TEST(Units, FeetAndRadiansUseTheHostConversionsAndAppendingWritesWhatTheStringFormAnswers) {
  EXPECT_EQ(utils::toMetersFactor(100.0, EDistUnits::USFEET), USFeet2Meter(100.0));
  EXPECT_EQ(utils::fromMetersFactor(100.0, EDistUnits::USFEET), Meter2USFeet(100.0));
  EXPECT_EQ(utils::fromMetersFactor(30.48, EDistUnits::IFEET), Meter2IFeet(30.48));
  EXPECT_EQ(utils::toMetersFactor(5.065, EDistUnits::USFEETINCHES), FFFII2Meter(5.065, true));
  EXPECT_EQ(utils::fromMetersFactor(1.0, EDistUnits::USFEETINCHES), Meter2FFFII(1.0, true));
  EXPECT_EQ(utils::toMetersFactor(5.065, EDistUnits::IFEETINCHES), FFFII2Meter(5.065, false));
  EXPECT_DOUBLE_EQ(utils::toMetersFactor(5.06, EDistUnits::IFEETINCHES), 5.5 * 0.3048);
  EXPECT_EQ(utils::fromMetersFactor(1.0, EDistUnits::IFEETINCHES), Meter2FFFII(1.0, false));
  EXPECT_EQ(utils::angleToDecDeg(std::numbers::pi, EAngleUnits::RADIANS), Rad2Deg(std::numbers::pi, false));
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::RADIANS, 180.0, 3), Deg2Rad(180.0, false));
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::DDDMMSSS, 12.504166666, 4),
            Deg2DDDMMSS(12.504166666, 4, false));
  EXPECT_NEAR(utils::fromHpa(1013.25, EPressureUnits::MMHG), 760.0, 1e-3);
  EXPECT_EQ(utils::intToString(-2147483647 - 1), L"-2147483648");
  std::wstring out = L"kept:";
  std::wstring expected = out;
  for (const double value : {30.48, -0.0001, kNoValue, -kNoValue, std::nan(""), 0.125}) {
    for (const int places : {-1, 0, 3, 150}) {
      utils::appendDistByStyle(out, EDistUnits::IFEET, value, places);
      expected += std::wstring(utils::distByStyleToString(EDistUnits::IFEET, value, places).view()) + L";";
      out += L';';
    }
  }
  EXPECT_EQ(out, expected);
  double a = 0.0;
  double b = 0.0;
  EXPECT_EQ(utils::stringToDouble(L"4.5", a, true), utils::stringToDouble(L"4.5", b, false));
  EXPECT_EQ(a, b);
}

TEST(Units, NumberTextsIgnoreACommaDecimalLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  double value = 0.0;
  EXPECT_TRUE(utils::stringToDouble(L"12.5", value));
  EXPECT_EQ(value, 12.5);
  EXPECT_FALSE(utils::stringToDouble(L"12,5", value));
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::METERS, L"12.5xyz"), 12.5);
  EXPECT_EQ(utils::doubleToString(12.5, 2), L"12.50");
  String out;
  ASSERT_TRUE(utils::doubleToStringWithExp(123.456, out));
  EXPECT_EQ(out, L"0.12345600000000000E+03");
}

TEST(UnitWords, KeywordsAndJobHistoryWordsReadAndWriteTheirUnitsAndNothingElse) {
  for (int value = -1; value <= 28; ++value) {
    const auto units = static_cast<EDistUnits>(value);
    EDistUnits read = EDistUnits::PARSECS;
    EXPECT_EQ(utils::distUnitsFromKeyword(utils::keywordFromDistUnits(units), read),
              value >= 0 && value <= 27);
    if (value >= 0 && value <= 27) {
      EXPECT_EQ(read, units);
    }
  }
  for (int value = -1; value <= 6; ++value) {
    const auto units = static_cast<EAngleUnits>(value);
    EAngleUnits read = EAngleUnits::MILS;
    EXPECT_EQ(utils::angleUnitsFromKeyword(utils::keywordFromAngleUnits(units), read),
              value >= 0 && value <= 5);
  }
  EXPECT_EQ(utils::keywordFromDistUnits(EDistUnits::ASTRONOMICAL_UNITS), L"ASTRONOMICAL_UNITS");
  EXPECT_EQ(utils::keywordFromAngleUnits(EAngleUnits::GRADS_GONS), L"GRADS_GONS");
  EAngleUnits angle = EAngleUnits::MILS;
  EXPECT_FALSE(utils::angleUnitsFromKeyword(L"USFEET", angle));
  for (const wchar_t* unknown : {L"", L"meters", L"METERS ", L"FEET", L"HECTOMETERS"}) {
    EDistUnits dist = EDistUnits::PARSECS;
    EXPECT_FALSE(utils::distUnitsFromKeyword(unknown, dist) || utils::angleUnitsFromKeyword(unknown, angle))
        << unknown;
    EXPECT_TRUE(dist == EDistUnits::PARSECS && angle == EAngleUnits::MILS);
  }
  for (const wchar_t* word : {L"Meters", L"US Feet", L"IFeet", L"US Feet and Inches", L"IFeet and Inches"})
    EXPECT_EQ(utils::jobHistoryWordFromDistUnits(utils::distUnitsFromJobHistoryWord(word)), word);
  for (const wchar_t* word : {L"Radians", L"Grads", L"Mils", L"Degrees"})
    EXPECT_EQ(utils::jobHistoryWordFromAngleUnits(utils::angleUnitsFromJobHistoryWord(word)), word);
  for (const wchar_t* word : {L"mmHg", L"hPa", L"inHg", L"mbar"})
    EXPECT_EQ(utils::jobHistoryWordFromPressureUnits(utils::pressureUnitsFromJobHistoryWord(word)), word);
  for (const wchar_t* word : {L"Fahrenheit", L"Celsius"})
    EXPECT_EQ(utils::jobHistoryWordFromTemperatureUnits(utils::temperatureUnitsFromJobHistoryWord(word)),
              word);
  EXPECT_EQ(utils::angleUnitsFromJobHistoryWord(L"Degrees"), EAngleUnits::DDDMMSSS);
  // Unknown words read as the units of a new units record; units without a word write nothing.
  for (const wchar_t* unknown : {L"", L"meters", L"Decimal Degrees", L"HPA", L"Kelvin", L"Celsius "}) {
    EXPECT_EQ(utils::distUnitsFromJobHistoryWord(unknown), EDistUnits::METERS);
    EXPECT_EQ(utils::angleUnitsFromJobHistoryWord(unknown), EAngleUnits::DECDEG);
    EXPECT_EQ(utils::pressureUnitsFromJobHistoryWord(unknown), EPressureUnits::MMHG);
    EXPECT_EQ(utils::temperatureUnitsFromJobHistoryWord(unknown), ETemperatureUnits::CELSIUS);
  }
  for (const int value : {5, 14, 27, 99, -1})
    EXPECT_EQ(utils::jobHistoryWordFromDistUnits(static_cast<EDistUnits>(value)), L"") << value;
  for (const int value : {3, 5, 6, -1})
    EXPECT_EQ(utils::jobHistoryWordFromAngleUnits(static_cast<EAngleUnits>(value)), L"") << value;
  EXPECT_EQ(utils::jobHistoryWordFromPressureUnits(static_cast<EPressureUnits>(4)), L"");
  EXPECT_EQ(utils::jobHistoryWordFromTemperatureUnits(static_cast<ETemperatureUnits>(2)), L"");
}

}  // namespace
