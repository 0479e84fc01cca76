#pragma once

#include <cstddef>
#include <string_view>

#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEUtilsUnits.h"

// The words, unit digits and limits of Leica GSI that the GSI importer and exporter share.
//
// A GSI line is a block of words separated by one blank. Every word has the same layout:
//
//   WW A B C U S DDDDDDDD      (GSI-8: 16 characters with its blank)
//   WW A B C U S DDDDDDDDDDDDDDDD   (GSI-16: 24 characters; the line starts with '*')
//
// WW is the word index (11 point number, 21 horizontal angle, ...), A to C further information the
// reader passes over (the block number in word 11), U the unit digit, S the sign and D the data,
// right-aligned and zero-padded: digits in units of the unit digit's last place for values, text for
// point numbers and codes. The word of a GSI-8 line is therefore 7 + 8 characters, that of GSI-16
// 7 + 16. GSI coordinates are easting (81, 84) before northing (82, 85); the model keeps the northing
// first.
namespace vyn::ie::gsi {

// "GSI8 (*.gsi)", "GSI16 (*.gsi)" and "Leica GSI Files (*.gsi)" (import only) of the registry.
inline constexpr const wchar_t* kGsi8FormatId = L"{D29B971C-8C74-4CF0-9429-6B77225084DA}";
inline constexpr const wchar_t* kGsi16FormatId = L"{A3D1B6CC-AAC9-4DE1-8AF3-91D1B5583B3B}";
inline constexpr const wchar_t* kLeicaGsiFormatId = L"{E88BDDCD-3B0F-4463-9FCF-A189E84A71DC}";

// True for the three GSI formats of the registry; every one of them reads both variants.
inline bool isGsiFormat(const DexFormat* format) {
  return format != nullptr && (format->isIdEqual(kGsi8FormatId) || format->isIdEqual(kGsi16FormatId) ||
                               format->isIdEqual(kLeicaGsiFormatId));
}

// The remark of an import that read the file but left something out (bad words, lines without a
// good word); each is traced, the first kTracedProblems with their line number.
inline constexpr EDexResult kResultWordsSkipped = static_cast<EDexResult>(23);
inline constexpr int kTracedProblems = 10;

// ---- Word indexes ---------------------------------------------------------------------------------
namespace word {
inline constexpr int kPointNumber = 11;
inline constexpr int kHorizontalAngle = 21;
inline constexpr int kVerticalAngle = 22;
inline constexpr int kSlopeDistance = 31;
inline constexpr int kHorizontalDistance = 32;
inline constexpr int kHeightDifference = 33;
inline constexpr int kCode = 41;  // the code block; 42 to 49 its information
inline constexpr int kFirstInfo = 42;
inline constexpr int kLastInfo = 49;
inline constexpr int kPrismConstant = 58;  // in the unit of the last place of a distance, as mm
inline constexpr int kPpm = 59;            // atmospheric correction, in tenths of ppm
inline constexpr int kPointCode = 71;      // the point code (remark 1); 72 to 79 its attributes
inline constexpr int kFirstAttribute = 72;
inline constexpr int kLastAttribute = 79;
inline constexpr int kEasting = 81;
inline constexpr int kNorthing = 82;
inline constexpr int kHeight = 83;
inline constexpr int kStationEasting = 84;
inline constexpr int kStationNorthing = 85;
inline constexpr int kStationHeight = 86;
inline constexpr int kReflectorHeight = 87;
inline constexpr int kInstrumentHeight = 88;
}  // namespace word

// ---- Unit digits (the sixth character of a word) ---------------------------------------------------
enum class EUnit {
  METERS_MM = 0,             // last place 1 mm
  FEET_THOUSANDTHS = 1,      // last place 1/1000 ft
  GON = 2,                   // 400 gon, last place 0.00001 gon
  DEGREES = 3,               // 360 decimal degrees, last place 0.00001 degree
  DEGREES_DMS = 4,           // 360 degrees sexagesimal DDDMMSSs, last place 0.1"
  MIL = 5,                   // 6400 mil, last place 0.0001 mil
  METERS_TENTH_MM = 6,       // last place 0.1 mm
  FEET_TEN_THOUSANDTHS = 7,  // last place 1/10000 ft
  METERS_HUNDREDTH_MM = 8,   // last place 0.01 mm
};
inline constexpr char kFirstUnitDigit = '0';
inline constexpr char kLastUnitDigit = '8';

// Feet of the unit digits 1 and 7: US survey feet for the settings' US units, international feet
// otherwise.
inline constexpr double kInternationalFoot = 0.3048;
inline constexpr double kUsSurveyFoot = 1200.0 / 3937.0;

constexpr double metersPerFoot(EDistUnits units) {
  return units == USFEET || units == USFEETINCHES ? kUsSurveyFoot : kInternationalFoot;
}

// ---- Layout -----------------------------------------------------------------------------------------
inline constexpr char kGsi16Mark = '*';
inline constexpr std::size_t kIndexWidth = 2;
inline constexpr std::size_t kUnitPlace = 5;  // zero-based
inline constexpr std::size_t kSignPlace = 6;
inline constexpr std::size_t kHeadWidth = 7;  // index, information, unit digit and sign
inline constexpr std::size_t kGsi8DataWidth = 8;
inline constexpr std::size_t kGsi16DataWidth = 16;

enum class EVariant { GSI8, GSI16 };

constexpr std::size_t dataWidth(EVariant variant) {
  return variant == EVariant::GSI16 ? kGsi16DataWidth : kGsi8DataWidth;
}

}  // namespace vyn::ie::gsi
