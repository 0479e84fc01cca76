#include "ieUtils/IEUtilsUnitWords.h"

#include <gtest/gtest.h>

#include <string>

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::EAngleUnits;
using vyn::ie::EDistUnits;
using vyn::ie::EPressureUnits;
using vyn::ie::ETemperatureUnits;
namespace utils = vyn::ie::utils;

std::wstring text(const String& value) {
  return std::wstring(value.view());
}

// ---- Keywords of the formats data file ----------------------------------------------------------

TEST(UnitKeywords, EveryDistanceUnitHasItsKeywordBothWays) {
  const wchar_t* const keywords[] = {
      L"METERS",      L"USFEET",      L"IFEET",      L"USFEETINCHES", L"IFEETINCHES",
      L"USCHAINS",    L"ICHAINS",     L"MILE",       L"INCHES",       L"USINCHES",
      L"MILLIMETERS", L"CENTIMETERS", L"KILOMETERS", L"MICROINCHES",  L"MILS",
      L"IYARDS",      L"USYARDS",     L"ANGSTROMS",  L"NANOMETERS",   L"MICRONS",
      L"DECIMETERS",  L"DECAMETERS",  L"HECTOMETER", L"GIGAMETERS",   L"ASTRONOMICAL_UNITS",
      L"LIGHT_YEARS", L"PARSECS",     L"ANY_UNITS",
  };
  for (int value = 0; value <= 27; ++value) {
    const EDistUnits units = static_cast<EDistUnits>(value);
    EXPECT_EQ(text(utils::keywordFromDistUnits(units)), keywords[value]);
    EDistUnits read = EDistUnits::METERS;
    EXPECT_TRUE(utils::distUnitsFromKeyword(String(keywords[value]), read));
    EXPECT_EQ(read, units);
  }
}

TEST(UnitKeywords, EveryAngleUnitHasItsKeywordBothWays) {
  const wchar_t* const keywords[] = {L"RADIANS", L"GRADS_GONS", L"MILS",
                                     L"DECDEG",  L"DDDMMSSS",   L"ANY_UNITS"};
  for (int value = 0; value <= 5; ++value) {
    const EAngleUnits units = static_cast<EAngleUnits>(value);
    EXPECT_EQ(text(utils::keywordFromAngleUnits(units)), keywords[value]);
    EAngleUnits read = EAngleUnits::RADIANS;
    EXPECT_TRUE(utils::angleUnitsFromKeyword(String(keywords[value]), read));
    EXPECT_EQ(read, units);
  }
}

TEST(UnitKeywords, UnknownKeywordsAreRejectedAndLeaveTheUnitAlone) {
  for (const wchar_t* unknown :
       {L"", L"meters", L"Meters", L"METERS ", L" METERS", L"FEET", L"HECTOMETERS"}) {
    EDistUnits dist = EDistUnits::PARSECS;
    EXPECT_FALSE(utils::distUnitsFromKeyword(String(unknown), dist)) << unknown;
    EXPECT_EQ(dist, EDistUnits::PARSECS);
    EAngleUnits angle = EAngleUnits::MILS;
    EXPECT_FALSE(utils::angleUnitsFromKeyword(String(unknown), angle)) << unknown;
    EXPECT_EQ(angle, EAngleUnits::MILS);
  }
  EAngleUnits angle = EAngleUnits::MILS;
  EXPECT_FALSE(utils::angleUnitsFromKeyword(String(L"USFEET"), angle));
}

TEST(UnitKeywords, ValuesOutsideTheEnumerationsHaveNoKeyword) {
  for (const int value : {-1, 28, 99}) {
    EXPECT_EQ(text(utils::keywordFromDistUnits(static_cast<EDistUnits>(value))), L"") << value;
  }
  for (const int value : {-1, 6, 99}) {
    EXPECT_EQ(text(utils::keywordFromAngleUnits(static_cast<EAngleUnits>(value))), L"") << value;
  }
}

// ---- Words of the job-history file --------------------------------------------------------------

TEST(JobHistoryUnitWords, ReadTheirUnits) {
  EXPECT_EQ(utils::distUnitsFromJobHistoryWord(String(L"Meters")), EDistUnits::METERS);
  EXPECT_EQ(utils::distUnitsFromJobHistoryWord(String(L"US Feet")), EDistUnits::USFEET);
  EXPECT_EQ(utils::distUnitsFromJobHistoryWord(String(L"IFeet")), EDistUnits::IFEET);
  EXPECT_EQ(utils::distUnitsFromJobHistoryWord(String(L"US Feet and Inches")), EDistUnits::USFEETINCHES);
  EXPECT_EQ(utils::distUnitsFromJobHistoryWord(String(L"IFeet and Inches")), EDistUnits::IFEETINCHES);

  EXPECT_EQ(utils::angleUnitsFromJobHistoryWord(String(L"Radians")), EAngleUnits::RADIANS);
  EXPECT_EQ(utils::angleUnitsFromJobHistoryWord(String(L"Grads")), EAngleUnits::GRADS_GONS);
  EXPECT_EQ(utils::angleUnitsFromJobHistoryWord(String(L"Mils")), EAngleUnits::MILS);
  EXPECT_EQ(utils::angleUnitsFromJobHistoryWord(String(L"Degrees")), EAngleUnits::DDDMMSSS);

  EXPECT_EQ(utils::pressureUnitsFromJobHistoryWord(String(L"mmHg")), EPressureUnits::MMHG);
  EXPECT_EQ(utils::pressureUnitsFromJobHistoryWord(String(L"hPa")), EPressureUnits::HPA);
  EXPECT_EQ(utils::pressureUnitsFromJobHistoryWord(String(L"inHg")), EPressureUnits::INHG);
  EXPECT_EQ(utils::pressureUnitsFromJobHistoryWord(String(L"mbar")), EPressureUnits::MBAR);

  EXPECT_EQ(utils::temperatureUnitsFromJobHistoryWord(String(L"Fahrenheit")), ETemperatureUnits::FAHRENHEIT);
  EXPECT_EQ(utils::temperatureUnitsFromJobHistoryWord(String(L"Celsius")), ETemperatureUnits::CELSIUS);
}

TEST(JobHistoryUnitWords, UnknownWordsReadAsTheUnitsOfANewUnitsRecord) {
  for (const wchar_t* unknown : {L"", L"meters", L"US feet", L"Feet", L"Decimal Degrees", L"degrees", L"HPA",
                                 L"Kelvin", L"Celsius "}) {
    SCOPED_TRACE(std::wstring(unknown));
    EXPECT_EQ(utils::distUnitsFromJobHistoryWord(String(unknown)), EDistUnits::METERS);
    EXPECT_EQ(utils::angleUnitsFromJobHistoryWord(String(unknown)), EAngleUnits::DECDEG);
    EXPECT_EQ(utils::pressureUnitsFromJobHistoryWord(String(unknown)), EPressureUnits::MMHG);
    EXPECT_EQ(utils::temperatureUnitsFromJobHistoryWord(String(unknown)), ETemperatureUnits::CELSIUS);
  }
}

TEST(JobHistoryUnitWords, UnitsWriteBackToTheirWords) {
  for (const wchar_t* word : {L"Meters", L"US Feet", L"IFeet", L"US Feet and Inches", L"IFeet and Inches"}) {
    EXPECT_EQ(text(utils::jobHistoryWordFromDistUnits(utils::distUnitsFromJobHistoryWord(String(word)))),
              word);
  }
  for (const wchar_t* word : {L"Radians", L"Grads", L"Mils", L"Degrees"}) {
    EXPECT_EQ(text(utils::jobHistoryWordFromAngleUnits(utils::angleUnitsFromJobHistoryWord(String(word)))),
              word);
  }
  for (const wchar_t* word : {L"mmHg", L"hPa", L"inHg", L"mbar"}) {
    EXPECT_EQ(
        text(utils::jobHistoryWordFromPressureUnits(utils::pressureUnitsFromJobHistoryWord(String(word)))),
        word);
  }
  for (const wchar_t* word : {L"Fahrenheit", L"Celsius"}) {
    EXPECT_EQ(text(utils::jobHistoryWordFromTemperatureUnits(
                  utils::temperatureUnitsFromJobHistoryWord(String(word)))),
              word);
  }
}

TEST(JobHistoryUnitWords, UnitsWithoutAWordGiveAnEmptyText) {
  for (const int value : {5, 14, 27, 99, -1}) {
    EXPECT_EQ(text(utils::jobHistoryWordFromDistUnits(static_cast<EDistUnits>(value))), L"") << value;
  }
  for (const int value : {3, 5, 6, -1}) {
    EXPECT_EQ(text(utils::jobHistoryWordFromAngleUnits(static_cast<EAngleUnits>(value))), L"") << value;
  }
  EXPECT_EQ(text(utils::jobHistoryWordFromPressureUnits(static_cast<EPressureUnits>(4))), L"");
  EXPECT_EQ(text(utils::jobHistoryWordFromTemperatureUnits(static_cast<ETemperatureUnits>(2))), L"");
}

}  // namespace
