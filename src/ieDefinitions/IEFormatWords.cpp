#include "ieDefinitions/IEFormatWords.h"

#include "ieDefinitions/detail/WordTable.h"

namespace vyn::ie {

namespace {

using detail::WordEntry;
using Configuration = DexCommonType::ESupportedConfigurations;
using UsingMode = DexCommonType::EUsingModes;
using Parameter = DexFormat::EParameterName;

constexpr WordEntry<Configuration> kConfigurationWords[] = {
    {DexCommonType::REGULAR, L"REGULAR"},
    {DexCommonType::ONBOARD, L"ONBOARD"},
    {DexCommonType::JAPAN, L"JAPAN"},
};

constexpr WordEntry<UsingMode> kUsingModeWords[] = {
    {DexCommonType::EXPORT_IN_JAPAN, L"EXPORT_IN_JAPAN"},
    {DexCommonType::ONBOARD_WITH_SCANNING, L"ONBOARD_WITH_SCANNING"},
};

constexpr WordEntry<EDexDataType> kDataTypeWords[] = {
    {POINTS, L"POINTS"},
    {CODES, L"CODES"},
    {LINES, L"LINES"},
    {AREAS, L"AREAS"},
    {PARCELS, L"PARCELS"},
    {H_ALIGNMENTS, L"H_ALIGNMENTS"},
    {V_ALIGNMENTS, L"V_ALIGNMENTS"},
    {X_SECTIONS, L"X_SECTIONS"},
    {ROAD_STRINGS, L"ROAD_STRINGS"},
    {ROADS, L"ROADS"},
    {SURFACES, L"SURFACES"},
    {POINT_LISTS, L"POINT_LISTS"},
    {X_SECTION_TEMPLATES, L"X_SECTION_TEMPLATES"},
    {ROAD_SURVEY, L"ROAD_SURVEY"},
    {LOCALIZATION, L"LOCALIZATION"},
    {SCANNING_DATA, L"SCANNING_DATA"},
    {JOB_HISTORY, L"JOB_HISTORY"},
    {LAYER_STATES, L"LAYER_STATES"},
    {RAW_DATA, L"RAW_DATA"},
    {STAKE_REPORTS, L"STAKE_REPORTS"},
    {STA_EQUATION_SETS, L"STA_EQUATION_SETS"},
    {FIELD_REPORTS, L"FIELD_REPORTS"},
    {MULTIPLE, L"MULTIPLE"},
};

// Parameters 51 and 52 have no word. The older word of parameter 18 follows its current one, so that
// writing finds the current word first.
constexpr WordEntry<Parameter> kParameterWords[] = {
    {DexFormat::ABILITY_TO_ADD_ATTR_TYPE_TO_ATTR_EXP, L"ABILITY_TO_ADD_ATTR_TYPE_TO_ATTR_EXP"},
    {DexFormat::ABILITY_TO_HAVE_ATTR_VALUES_IN_QUOTES_EXP, L"ABILITY_TO_HAVE_ATTR_VALUES_IN_QUOTES_EXP"},
    {DexFormat::ABILITY_TO_USE_NUMERIC_POINT_NAMES_EXP, L"ABILITY_TO_USE_NUMERIC_POINT_NAMES_EXP"},
    {DexFormat::ABILITY_TO_USE_ZONES_FOR_XSECTIONS_EXP, L"ABILITY_TO_USE_ZONES_FOR_XSECTIONS_EXP"},
    {DexFormat::ABILITY_TO_USE_CONTROL_CODES_AS_NOTES_EXP, L"ABILITY_TO_USE_CONTROL_CODES_AS_NOTES_EXP"},
    {DexFormat::ABILITY_TO_USE_DESCRIPTION_AS_ATTR_EXP, L"ABILITY_TO_USE_DESCRIPTION_AS_ATTR_EXP"},
    {DexFormat::ABILITY_TO_STORE_GPS_POINTS_AS_MANUAL_EXP, L"ABILITY_TO_STORE_GPS_POINTS_AS_MANUAL_EXP"},
    {DexFormat::ABILITY_TO_DEFINE_ATTRIBUTES_USING_EXP, L"ABILITY_TO_DEFINE_ATTRIBUTES_USING_EXP"},
    {DexFormat::ABILITY_TO_APPEND_TO_EXISTED_FILE_EXP, L"ABILITY_TO_APPEND_TO_EXISTED_FILE_EXP"},
    {DexFormat::NUMERIC_POINTS_ARE_GENERATED_EXP, L"NUMERIC_POINTS_ARE_GENERATED_EXP"},
    {DexFormat::CS_IS_STORED_IN_THE_FILE, L"CS_IS_STORED_IN_THE_FILE"},
    {DexFormat::CUSTOM_FIELDS, L"CUSTOM_FIELDS"},
    {DexFormat::CUSTOM_CODE_STYLE_EXP, L"CUSTOM_CODE_STYLE_EXP"},
    {DexFormat::AUTODESK_SETTINGS_EXP, L"AUTODESK_SETTINGS_EXP"},
    {DexFormat::CODE_STRING_POINTS_ARRAY_EXP, L"CODE_STRING_POINTS_ARRAY_EXP"},
    {DexFormat::PHOTO_NOTES, L"PHOTO_NOTES"},
    {DexFormat::MULTIPLE_FILES_EXP, L"MULTIPLE_FILES_EXP"},
    {DexFormat::DRAW_DATA_EXP, L"DRAW_DATA_EXP"},
    {DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP, L"PREDEFINED_CODE_WITH_ATTRS_EXP"},
    {DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP, L"PREDEFINED_CODE_STYLE_EXP"},
    {DexFormat::PTL_POINTS_EXP, L"PTL_POINTS_EXP"},
    {DexFormat::PTL_SIGN_IN_POINT_NAME_EXP, L"PTL_SIGN_IN_POINT_NAME_EXP"},
    {DexFormat::GPS_RAWDATA_EXP, L"GPS_RAWDATA_EXP"},
    {DexFormat::TS_RAWDATA_EXP, L"TS_RAWDATA_EXP"},
    {DexFormat::DL_RAWDATA_EXP, L"DL_RAWDATA_EXP"},
    {DexFormat::XSECT_ROADS, L"XSECT_ROADS"},
    {DexFormat::SURVEY_FIND_STA_ROADS_EXP, L"SURVEY_FIND_STA_ROADS_EXP"},
    {DexFormat::MULTIPLE_STAION_POINTS, L"MULTIPLE_STAION_POINTS"},
    {DexFormat::PLANE_COORDS_FOR_GPS_POINTS_EXP, L"PLANE_COORDS_FOR_GPS_POINTS_EXP"},
    {DexFormat::XYZ_COORDS_IN_GPS_RAW_DATA_EXP, L"XYZ_COORDS_IN_GPS_RAW_DATA_EXP"},
    {DexFormat::NEZ_COV_MATRIX_IN_GPS_RAW_DATA_EXP, L"NEZ_COV_MATRIX_IN_GPS_RAW_DATA_EXP"},
    {DexFormat::COORDS_IN_DISPLAY_CS_IN_GPS_POSITIONS_EXP, L"COORDS_IN_DISPLAY_CS_IN_GPS_POSITIONS_EXP"},
    {DexFormat::POINTS_IN_ALPHABETICAL_ORDER_EXP, L"POINTS_IN_ALPHABETICAL_ORDER_EXP"},
    {DexFormat::BS_POINT_MUST_EXIST, L"BS_POINT_MUST_EXIST"},
    {DexFormat::V_ALIGNMENT_SUPPORTS_ONLY_ARCS, L"V_ALIGNMENT_SUPPORTS_ONLY_ARCS"},
    {DexFormat::V_ALIGNMENT_SUPPORT_ARCS, L"V_ALIGNMENT_SUPPORT_ARCS"},
    {DexFormat::V_ALIGNMENT_SUPPORT_LONG_SECTIONS, L"V_ALIGNMENT_SUPPORT_LONG_SECTIONS"},
    {DexFormat::V_ALIGNMENT_SUPPORT_VERTICAL_ELEMENTS, L"V_ALIGNMENT_SUPPORT_VERTICAL_ELEMENTS"},
    {DexFormat::H_ALIGNMENT_SUPPORT_COMPOUND_SPIRALS, L"H_ALIGNMENT_SUPPORT_COMPOUND_SPIRALS"},
    {DexFormat::H_ALIGNMENT_DOESNT_SUPPORT_FIXED_AZ_FOR_ARCS,
     L"H_ALIGNMENT_DOESNT_SUPPORT_FIXED_AZ_FOR_ARCS"},
    {DexFormat::STAKEOUT_POINTS_FOR_REPORTS_EXP, L"STAKEOUT_POINTS_FOR_REPORTS_EXP"},
    {DexFormat::REDUCED_TS_RAW_DATA_IS_USED_EXP, L"REDUCED_TS_RAW_DATA_IS_USED_EXP"},
    {DexFormat::ARP_HEIGHT_IS_USED_IN_GPS_RAW_DATA_EXP, L"ARP_HEIGHT_IS_USED_IN_GPS_RAW_DATA_EXP"},
    {DexFormat::MANUAL_POINTS_WITH_RAW_DATA_EXP, L"MANUAL_POINTS_WITH_RAW_DATA_EXP"},
    {DexFormat::RAW_POINTS_ARE_USED_EXP, L"RAW_POINTS_ARE_USED_EXP"},
    {DexFormat::XSECTIONS_SLOPES_ARE_STORED_SEPARATELY_IMP, L"XSECTIONS_SLOPES_ARE_STORED_SEPARATELY_IMP"},
    {DexFormat::CAST_COORDS_TO_WGS_AND_EXPORT_ORIGINAL_POINT,
     L"CAST_COORDS_TO_WGS_AND_EXPORT_ORIGINAL_POINT"},
    {DexFormat::GPS_DLF_RAWDATA_EXP, L"GPS_DLF_RAWDATA_EXP"},
    {DexFormat::ARCS_IN_LINEWORK, L"ARCS_IN_LINEWORK"},
    {DexFormat::BULGES_IN_LINEWORK, L"BULGES_IN_LINEWORK"},
    {DexFormat::STAKEOUT_TOLERANCE_FILTER, L"STAKEOUT_TOLERANCE_FILTER"},
    {DexFormat::STORE_CONTROL_POINTS_IN_LOCALIZATION, L"STORE_CONTROL_POINTS_IN_LOCALIZATION"},
};

}  // namespace

CVynStringT<wchar_t> keywordFromDirection(DexCommonType::EDataDirections direction) {
  switch (direction) {
    case DexCommonType::IMPORT_ONLY:
      return L"Import";
    case DexCommonType::EXPORT_ONLY:
      return L"Export";
    default:
      return L"ImportExport";
  }
}

DexCommonType::EDataDirections directionFromKeyword(const CVynStringT<wchar_t>& word) {
  if (word.CompareNoCase(L"Import") == 0) return DexCommonType::IMPORT_ONLY;
  if (word.CompareNoCase(L"Export") == 0) return DexCommonType::EXPORT_ONLY;
  return DexCommonType::IMPORT_AND_EXPORT;
}

bool configurationFromKeyword(const CVynStringT<wchar_t>& word, Configuration& configuration) {
  return detail::valueOfWord<Configuration>(kConfigurationWords, word, configuration);
}

CVynStringT<wchar_t> keywordFromConfiguration(Configuration configuration) {
  return detail::wordOfValue<Configuration>(kConfigurationWords, configuration);
}

bool usingModeFromKeyword(const CVynStringT<wchar_t>& word, UsingMode& mode) {
  return detail::valueOfWord<UsingMode>(kUsingModeWords, word, mode);
}

CVynStringT<wchar_t> keywordFromUsingMode(UsingMode mode) {
  return detail::wordOfValue<UsingMode>(kUsingModeWords, mode);
}

bool dataTypeFromKeyword(const CVynStringT<wchar_t>& word, EDexDataType& type) {
  return detail::valueOfWord<EDexDataType>(kDataTypeWords, word, type);
}

CVynStringT<wchar_t> keywordFromDataType(EDexDataType type) {
  return detail::wordOfValue<EDexDataType>(kDataTypeWords, type);
}

bool parameterFromKeyword(const CVynStringT<wchar_t>& word, Parameter& parameter) {
  return detail::valueOfWord<Parameter>(kParameterWords, word, parameter);
}

CVynStringT<wchar_t> keywordFromParameter(Parameter parameter) {
  return detail::wordOfValue<Parameter>(kParameterWords, parameter);
}

}  // namespace vyn::ie
