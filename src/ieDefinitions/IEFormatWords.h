#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEDataType.h"
#include "ieDefinitions/IEFormats.h"

// The words by which the formats data file names directions, configurations, using modes, data kinds
// and parameters. The words of the sets are the enumerator names ("REGULAR", "EXPORT_IN_JAPAN",
// "POINTS", "MULTIPLE_FILES_EXP") and are compared exactly and case-sensitively. The unit keywords are
// in ieUtils/IEUtilsUnitWords.h.

namespace vyn::ie {

// ---- Directions ---------------------------------------------------------------------------------

// "Import", "Export" or "ImportExport"; any value other than 0 and 1 is written "ImportExport".
DEX_API CVynStringT<wchar_t> keywordFromDirection(DexCommonType::EDataDirections direction);
// Ignoring case, "Import" is IMPORT_ONLY and "Export" EXPORT_ONLY; any other text, the empty one
// included, is IMPORT_AND_EXPORT.
DEX_API DexCommonType::EDataDirections directionFromKeyword(const CVynStringT<wchar_t>& word);

// ---- Set members --------------------------------------------------------------------------------
// Each xFromKeyword sets its result and answers true for a known word, and answers false, leaving the
// result unchanged, otherwise. Each keywordFromX answers an empty string for a value without a word.

DEX_API bool configurationFromKeyword(const CVynStringT<wchar_t>& word,
                                      DexCommonType::ESupportedConfigurations& configuration);
DEX_API CVynStringT<wchar_t> keywordFromConfiguration(DexCommonType::ESupportedConfigurations configuration);

DEX_API bool usingModeFromKeyword(const CVynStringT<wchar_t>& word, DexCommonType::EUsingModes& mode);
DEX_API CVynStringT<wchar_t> keywordFromUsingMode(DexCommonType::EUsingModes mode);

DEX_API bool dataTypeFromKeyword(const CVynStringT<wchar_t>& word, EDexDataType& type);
DEX_API CVynStringT<wchar_t> keywordFromDataType(EDexDataType type);

// PREDEFINED_CODE_WITH_ATTRS_EXP is also read from its older word "PREDEFINED_CODE_STYLE_EXP" (and
// always written with the newer one). Parameters 51 and 52 have no word.
DEX_API bool parameterFromKeyword(const CVynStringT<wchar_t>& word, DexFormat::EParameterName& parameter);
DEX_API CVynStringT<wchar_t> keywordFromParameter(DexFormat::EParameterName parameter);

}  // namespace vyn::ie
