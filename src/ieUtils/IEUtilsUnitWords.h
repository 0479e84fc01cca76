#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IEUtilsUnits.h"

// The words by which files name the units. Words are compared exactly and case-sensitively.

namespace vyn::ie::utils {

// ---- Keywords of the formats data file ----------------------------------------------------------
// Each unit value has one keyword, the enumerator's own name: "METERS", "USFEET", ... "ANY_UNITS" for
// distances, "RADIANS", "GRADS_GONS", "MILS", "DECDEG", "DDDMMSSS", "ANY_UNITS" for angles.

// Sets units and answers true for a known keyword; answers false, leaving units unchanged, otherwise.
DEX_API bool distUnitsFromKeyword(const CVynStringT<wchar_t>& keyword, EDistUnits& units);
DEX_API bool angleUnitsFromKeyword(const CVynStringT<wchar_t>& keyword, EAngleUnits& units);

// The keyword of a value; an empty string for a value outside the enumeration.
DEX_API CVynStringT<wchar_t> keywordFromDistUnits(EDistUnits units);
DEX_API CVynStringT<wchar_t> keywordFromAngleUnits(EAngleUnits units);

// ---- Words of the job-history file --------------------------------------------------------------
// Distances "Meters", "US Feet", "IFeet", "US Feet and Inches", "IFeet and Inches"; angles "Radians",
// "Grads", "Mils", "Degrees" (the packed DDD.MMSS value, not decimal degrees); pressures "mmHg", "hPa",
// "inHg", "mbar"; temperatures "Fahrenheit", "Celsius".
// An unknown word reads as the unit a new job-history units record starts with, so that a field the
// reader cannot name leaves the units as they would be without it: meters, decimal degrees, mmHg,
// Celsius.

DEX_API EDistUnits distUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word);
DEX_API EAngleUnits angleUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word);
DEX_API EPressureUnits pressureUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word);
DEX_API ETemperatureUnits temperatureUnitsFromJobHistoryWord(const CVynStringT<wchar_t>& word);

// The job-history word of a value; an empty string for a value the file has no word for (distances
// other than meters, feet and feet-and-inches; decimal degrees and ANY_UNITS; numbers outside the
// enumerations).
DEX_API CVynStringT<wchar_t> jobHistoryWordFromDistUnits(EDistUnits units);
DEX_API CVynStringT<wchar_t> jobHistoryWordFromAngleUnits(EAngleUnits units);
DEX_API CVynStringT<wchar_t> jobHistoryWordFromPressureUnits(EPressureUnits units);
DEX_API CVynStringT<wchar_t> jobHistoryWordFromTemperatureUnits(ETemperatureUnits units);

}  // namespace vyn::ie::utils
