#include "ieUtils/IEUtilsUnitWords.h"

#include <optional>
#include <span>
#include <string_view>

namespace vyn::ie::utils {

namespace {

template <typename E>
struct UnitWord {
  E units;
  std::wstring_view word;
};

template <typename E>
std::optional<E> unitsOfWord(std::span<const UnitWord<E>> words, const CVynStringT<wchar_t>& word) {
  for (const UnitWord<E>& entry : words) {
    if (entry.word == word.view()) return entry.units;
  }
  return std::nullopt;
}

template <typename E>
CVynStringT<wchar_t> wordOfUnits(std::span<const UnitWord<E>> words, E units) {
  for (const UnitWord<E>& entry : words) {
    if (entry.units == units) return CVynStringT<wchar_t>(entry.word);
  }
  return CVynStringT<wchar_t>();
}

// ---- Keywords of the formats data file ----------------------------------------------------------

constexpr UnitWord<EDistUnits> kDistKeywords[] = {
    {EDistUnits::METERS, L"METERS"},
    {EDistUnits::USFEET, L"USFEET"},
    {EDistUnits::IFEET, L"IFEET"},
    {EDistUnits::USFEETINCHES, L"USFEETINCHES"},
    {EDistUnits::IFEETINCHES, L"IFEETINCHES"},
    {EDistUnits::USCHAINS, L"USCHAINS"},
    {EDistUnits::ICHAINS, L"ICHAINS"},
    {EDistUnits::MILE, L"MILE"},
    {EDistUnits::INCHES, L"INCHES"},
    {EDistUnits::USINCHES, L"USINCHES"},
    {EDistUnits::MILLIMETERS, L"MILLIMETERS"},
    {EDistUnits::CENTIMETERS, L"CENTIMETERS"},
    {EDistUnits::KILOMETERS, L"KILOMETERS"},
    {EDistUnits::MICROINCHES, L"MICROINCHES"},
    {EDistUnits::MILS, L"MILS"},
    {EDistUnits::IYARDS, L"IYARDS"},
    {EDistUnits::USYARDS, L"USYARDS"},
    {EDistUnits::ANGSTROMS, L"ANGSTROMS"},
    {EDistUnits::NANOMETERS, L"NANOMETERS"},
    {EDistUnits::MICRONS, L"MICRONS"},
    {EDistUnits::DECIMETERS, L"DECIMETERS"},
    {EDistUnits::DECAMETERS, L"DECAMETERS"},
    {EDistUnits::HECTOMETER, L"HECTOMETER"},
    {EDistUnits::GIGAMETERS, L"GIGAMETERS"},
    {EDistUnits::ASTRONOMICAL_UNITS, L"ASTRONOMICAL_UNITS"},
    {EDistUnits::LIGHT_YEARS, L"LIGHT_YEARS"},
    {EDistUnits::PARSECS, L"PARSECS"},
    {EDistUnits::ANY_UNITS, L"ANY_UNITS"},
};

constexpr UnitWord<EAngleUnits> kAngleKeywords[] = {
    {EAngleUnits::RADIANS, L"RADIANS"},   {EAngleUnits::GRADS_GONS, L"GRADS_GONS"},
    {EAngleUnits::MILS, L"MILS"},         {EAngleUnits::DECDEG, L"DECDEG"},
    {EAngleUnits::DDDMMSSS, L"DDDMMSSS"}, {EAngleUnits::ANY_UNITS, L"ANY_UNITS"},
};

// ---- Words of the job-history file --------------------------------------------------------------

constexpr UnitWord<EDistUnits> kJobHistoryDistWords[] = {
    {EDistUnits::METERS, L"Meters"},
    {EDistUnits::USFEET, L"US Feet"},
    {EDistUnits::IFEET, L"IFeet"},
    {EDistUnits::USFEETINCHES, L"US Feet and Inches"},
    {EDistUnits::IFEETINCHES, L"IFeet and Inches"},
};

constexpr UnitWord<EAngleUnits> kJobHistoryAngleWords[] = {
    {EAngleUnits::RADIANS, L"Radians"},
    {EAngleUnits::GRADS_GONS, L"Grads"},
    {EAngleUnits::MILS, L"Mils"},
    {EAngleUnits::DDDMMSSS, L"Degrees"},
};

constexpr UnitWord<EPressureUnits> kJobHistoryPressureWords[] = {
    {EPressureUnits::MMHG, L"mmHg"},
    {EPressureUnits::HPA, L"hPa"},
    {EPressureUnits::INHG, L"inHg"},
    {EPressureUnits::MBAR, L"mbar"},
};

constexpr UnitWord<ETemperatureUnits> kJobHistoryTemperatureWords[] = {
    {ETemperatureUnits::FAHRENHEIT, L"Fahrenheit"},
    {ETemperatureUnits::CELSIUS, L"Celsius"},
};

// What a new job-history units record holds; an unknown word leaves a unit at that.
constexpr EDistUnits kJobHistoryDefaultDist = EDistUnits::METERS;
constexpr EAngleUnits kJobHistoryDefaultAngle = EAngleUnits::DECDEG;
constexpr EPressureUnits kJobHistoryDefaultPressure = EPressureUnits::MMHG;
constexpr ETemperatureUnits kJobHistoryDefaultTemperature = ETemperatureUnits::CELSIUS;

template <typename E>
bool assignFromWord(std::span<const UnitWord<E>> words, const CVynStringT<wchar_t>& word, E& units) {
  const std::optional<E> found = unitsOfWord(words, word);
  if (found) units = *found;
  return found.has_value();
}

}  // namespace

bool distUnitsFromKeyword(const CVynStringT<wchar_t>& keyword, EDistUnits& units) {
  return assignFromWord<EDistUnits>(kDistKeywords, keyword, units);
}

bool angleUnitsFromKeyword(const CVynStringT<wchar_t>& keyword, EAngleUnits& units) {
  return assignFromWord<EAngleUnits>(kAngleKeywords, keyword, units);
}

CVynStringT<wchar_t> keywordFromDistUnits(EDistUnits units) {
  return wordOfUnits<EDistUnits>(kDistKeywords, units);
}

CVynStringT<wchar_t> keywordFromAngleUnits(EAngleUnits units) {
  return wordOfUnits<EAngleUnits>(kAngleKeywords, units);
}

EDistUnits distUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word) {
  return unitsOfWord<EDistUnits>(kJobHistoryDistWords, word).value_or(kJobHistoryDefaultDist);
}

EAngleUnits angleUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word) {
  return unitsOfWord<EAngleUnits>(kJobHistoryAngleWords, word).value_or(kJobHistoryDefaultAngle);
}

EPressureUnits pressureUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word) {
  return unitsOfWord<EPressureUnits>(kJobHistoryPressureWords, word).value_or(kJobHistoryDefaultPressure);
}

ETemperatureUnits temperatureUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word) {
  return unitsOfWord<ETemperatureUnits>(kJobHistoryTemperatureWords, word)
      .value_or(kJobHistoryDefaultTemperature);
}

CVynStringT<wchar_t> jobHistoryWordFromDistUnits(EDistUnits units) {
  return wordOfUnits<EDistUnits>(kJobHistoryDistWords, units);
}

CVynStringT<wchar_t> jobHistoryWordFromAngleUnits(EAngleUnits units) {
  return wordOfUnits<EAngleUnits>(kJobHistoryAngleWords, units);
}

CVynStringT<wchar_t> jobHistoryWordFromPressureUnits(EPressureUnits units) {
  return wordOfUnits<EPressureUnits>(kJobHistoryPressureWords, units);
}

CVynStringT<wchar_t> jobHistoryWordFromTemperatureUnits(ETemperatureUnits units) {
  return wordOfUnits<ETemperatureUnits>(kJobHistoryTemperatureWords, units);
}

}  // namespace vyn::ie::utils
