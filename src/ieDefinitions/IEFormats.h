#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEDataType.h"
#include "ieDefinitions/IEFlags.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEUtilsUnits.h"

// The descriptors of exchange formats and data kinds. The formats registry (ieDefinitions/
// IEFormatsData.h) holds one DexFormat per format and one DexDataType per data kind; the host filters
// both by direction, configuration and using mode, and the loader takes the plug-in library names and
// the parameters from the format.

namespace vyn::ie {

// What a format descriptor and a data-kind descriptor share: a display name, a direction, the
// installations that offer it and the using modes that restrict it. Filtering of every registry query
// goes through compareCommonData. Only the two subclasses are created.
class DEX_API DexCommonType {
 public:
  VYN_CLASS_ALLOCATOR

  enum EDataDirections : std::int32_t {
    IMPORT_ONLY = 0,
    EXPORT_ONLY = 1,
    IMPORT_AND_EXPORT = 2,
  };

  // The kind of installation the host runs as. Every loop over configurations runs over these three.
  enum ESupportedConfigurations : std::int32_t {
    REGULAR = 0,
    ONBOARD = 1,
    JAPAN = 2,
  };

  // A using mode applied to a descriptor restricts it to callers that name that mode.
  enum EUsingModes : std::int32_t {
    EXPORT_IN_JAPAN = 0,
    ONBOARD_WITH_SCANNING = 1,
  };

  DexCommonType(const CVynStringT<wchar_t>& name, EDataDirections directionType,
                DexFlags<ESupportedConfigurations> configurations, DexFlags<EUsingModes> usingModes);
  DexCommonType(const DexCommonType& other);
  DexCommonType& operator=(const DexCommonType& other);

  // Virtual operations, in this order.
  // The display name ("AutoCAD Drawing (*.dwg)", "Points").
  virtual const CVynStringT<wchar_t>& getName() const;
  virtual EDataDirections getDataDirections() const;
  // True when c is one of the configurations the descriptor is offered in.
  virtual bool isConfigurationSupported(ESupportedConfigurations c) const;
  // True when the descriptor applies the using mode m.
  virtual bool isUsingModeApplied(EUsingModes m) const;

  // The filter of every registry query; true when all three steps pass:
  // - direction: an import query (0) accepts descriptors of direction 0 or 2, an export query (1)
  //   accepts 1 or 2, an import-and-export query (2) accepts only 2. Any other query value leaves an
  //   error-log record (ieDefinitions\IEFormats, line 62) and passes;
  // - configurations: every configuration of the query's set must be supported (an empty set passes);
  // - using modes: every mode the descriptor applies must be in the query's set (a descriptor without
  //   modes passes any query).
  bool compareCommonData(EDataDirections direction, DexFlags<ESupportedConfigurations> configurations,
                         DexFlags<EUsingModes> modes) const;

  // The sets as stored.
  DexFlags<ESupportedConfigurations> getConfigurations() const { return configurations_; }
  DexFlags<EUsingModes> getUsingModes() const { return usingModes_; }

 protected:
  virtual ~DexCommonType();

 private:
  CVynStringT<wchar_t> name_;
  EDataDirections directionType_;
  DexFlags<ESupportedConfigurations> configurations_;
  DexFlags<EUsingModes> usingModes_;
};

// A kind of exchanged data as the host offers it in its dialogs ("Points", "Raw Data").
class DEX_API DexDataType : public DexCommonType {
 public:
  VYN_CLASS_ALLOCATOR

  DexDataType(EDexDataType typeId, const CVynStringT<wchar_t>& name, EDataDirections directionType,
              DexFlags<ESupportedConfigurations> configurations, DexFlags<EUsingModes> usingModes);
  DexDataType(const DexDataType& other);
  DexDataType& operator=(const DexDataType& other);
  ~DexDataType() override;

  EDexDataType getTypeId() const { return typeId_; }
  // POINTS, POINT_LISTS or MULTIPLE.
  bool isPointDataType() const;
  // LINES or MULTIPLE.
  bool isLineDataType() const;
  // PARCELS, H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS or MULTIPLE (not ROAD_STRINGS, not
  // X_SECTION_TEMPLATES).
  bool isRoadDataType() const;

 private:
  EDexDataType typeId_;
};

// One exchange format: its identity, the plug-in libraries that read and write it, its file extension
// and dialog filter, and the sets of data kinds, units and optional abilities it has. Immutable once
// built; copyable.
class DEX_API DexFormat : public DexCommonType {
 public:
  VYN_CLASS_ALLOCATOR

  // Optional abilities of a format and its plug-in. Names ending in _EXP concern export, _IMP import.
  // The enumerator names are the words of the formats data file, except 51 and 52, which have no
  // word: they are known to the built-in table only and are never written to or read from the file.
  // The library itself acts on MULTIPLE_FILES_EXP only.
  enum EParameterName : std::int32_t {
    ABILITY_TO_ADD_ATTR_TYPE_TO_ATTR_EXP = 0,
    ABILITY_TO_HAVE_ATTR_VALUES_IN_QUOTES_EXP = 1,
    ABILITY_TO_USE_NUMERIC_POINT_NAMES_EXP = 2,
    ABILITY_TO_USE_ZONES_FOR_XSECTIONS_EXP = 3,
    ABILITY_TO_USE_CONTROL_CODES_AS_NOTES_EXP = 4,
    ABILITY_TO_USE_DESCRIPTION_AS_ATTR_EXP = 5,
    ABILITY_TO_STORE_GPS_POINTS_AS_MANUAL_EXP = 6,
    ABILITY_TO_DEFINE_ATTRIBUTES_USING_EXP = 7,
    ABILITY_TO_APPEND_TO_EXISTED_FILE_EXP = 8,
    NUMERIC_POINTS_ARE_GENERATED_EXP = 9,
    CS_IS_STORED_IN_THE_FILE = 10,
    CUSTOM_FIELDS = 11,
    CUSTOM_CODE_STYLE_EXP = 12,
    AUTODESK_SETTINGS_EXP = 13,
    CODE_STRING_POINTS_ARRAY_EXP = 14,
    PHOTO_NOTES = 15,
    MULTIPLE_FILES_EXP = 16,  // one file per dataset
    DRAW_DATA_EXP = 17,
    PREDEFINED_CODE_WITH_ATTRS_EXP = 18,
    PTL_POINTS_EXP = 19,
    PTL_SIGN_IN_POINT_NAME_EXP = 20,
    GPS_RAWDATA_EXP = 21,
    TS_RAWDATA_EXP = 22,
    DL_RAWDATA_EXP = 23,
    XSECT_ROADS = 24,
    SURVEY_FIND_STA_ROADS_EXP = 25,
    MULTIPLE_STAION_POINTS = 26,
    PLANE_COORDS_FOR_GPS_POINTS_EXP = 27,
    XYZ_COORDS_IN_GPS_RAW_DATA_EXP = 28,
    NEZ_COV_MATRIX_IN_GPS_RAW_DATA_EXP = 29,
    COORDS_IN_DISPLAY_CS_IN_GPS_POSITIONS_EXP = 30,
    POINTS_IN_ALPHABETICAL_ORDER_EXP = 31,
    BS_POINT_MUST_EXIST = 32,
    V_ALIGNMENT_SUPPORTS_ONLY_ARCS = 33,
    V_ALIGNMENT_SUPPORT_ARCS = 34,
    V_ALIGNMENT_SUPPORT_LONG_SECTIONS = 35,
    V_ALIGNMENT_SUPPORT_VERTICAL_ELEMENTS = 36,
    H_ALIGNMENT_SUPPORT_COMPOUND_SPIRALS = 37,
    H_ALIGNMENT_DOESNT_SUPPORT_FIXED_AZ_FOR_ARCS = 38,
    STAKEOUT_POINTS_FOR_REPORTS_EXP = 39,
    REDUCED_TS_RAW_DATA_IS_USED_EXP = 40,
    ARP_HEIGHT_IS_USED_IN_GPS_RAW_DATA_EXP = 41,
    MANUAL_POINTS_WITH_RAW_DATA_EXP = 42,
    RAW_POINTS_ARE_USED_EXP = 43,
    XSECTIONS_SLOPES_ARE_STORED_SEPARATELY_IMP = 44,
    CAST_COORDS_TO_WGS_AND_EXPORT_ORIGINAL_POINT = 45,
    GPS_DLF_RAWDATA_EXP = 46,
    ARCS_IN_LINEWORK = 47,
    BULGES_IN_LINEWORK = 48,
    STAKEOUT_TOLERANCE_FILTER = 49,
    STORE_CONTROL_POINTS_IN_LOCALIZATION = 50,
    BUILT_IN_PARAMETER_51 = 51,
    BUILT_IN_PARAMETER_52 = 52,
  };
  // The number of parameters: values 0 to kParameterCount - 1.
  static constexpr int kParameterCount = 53;

  // The sets are taken as given; angleUnits containing EAngleUnits::ANY_UNITS (5) and distanceUnits
  // containing EDistUnits::ANY_UNITS (27) mean any unit.
  DexFormat(const GUID& guid, const CVynStringT<wchar_t>& name, EDataDirections directionType,
            const CVynStringT<wchar_t>& exportDLL, const CVynStringT<wchar_t>& importDLL,
            const CVynStringT<wchar_t>& titleForVerticalScreen, const CVynStringT<wchar_t>& extension,
            const CVynStringT<wchar_t>& filterExtension, DexFlags<ESupportedConfigurations> configurations,
            DexFlags<EUsingModes> usingModes, DexFlags<EDexDataType> dataTypes,
            DexFlags<EDistUnits> distanceUnits, DexFlags<EAngleUnits> angleUnits,
            DexFlags<EParameterName> parameters);
  DexFormat(const DexFormat& other);
  DexFormat& operator=(const DexFormat& other);
  ~DexFormat() override;

  // Identity. The GUID text is the registry form: braced, upper-case hexadecimal, 38 characters.
  const GUID& getGuid() const { return guid_; }
  const CVynStringT<wchar_t> getGuidAsString() const;
  // True when id is a braced GUID text (hexadecimal digits in either case) equal to this format's
  // GUID; false for a null or unparsable text.
  bool isIdEqual(const wchar_t* id) const;

  // Names and file naming.
  // The export library when forExport, else the import library (either may be empty).
  const CVynStringT<wchar_t> getDllName(bool forExport) const;
  // The short title for narrow screens ("DWG").
  const CVynStringT<wchar_t> getTitle() const;
  // The extension without the dot ("dwg"); with withDot a non-empty extension gets a leading dot
  // (".dwg"); an empty extension stays empty.
  const CVynStringT<wchar_t> getExtension(bool withDot) const;
  // The file-dialog filter, ending in a bar ("AutoCAD Drawing (*.dwg)|").
  const CVynStringT<wchar_t>& getFilterExtension() const { return filterExtension_; }

  // Membership in the sets.
  bool isDataTypeSupported(EDexDataType type) const { return dataTypes_.has(type); }
  bool isDistUnitsTypeSupported(EDistUnits units) const { return distanceUnits_.has(units); }
  bool isAngleUnitsTypeSupported(EAngleUnits units) const { return angleUnits_.has(units); }
  bool isParameterSupported(EParameterName parameter) const { return parameters_.has(parameter); }
  // The matching unit set is not empty.
  bool areDistUnitsUsed() const { return !distanceUnits_.isEmpty(); }
  bool areAngleUnitsUsed() const { return !angleUnits_.isEmpty(); }
  // Whether the export dialog needs a unit choice: false without any unit; true when either set
  // holds its "any unit" value or more than one value.
  bool hasUnitsToSelect() const;

  // The sets as stored.
  DexFlags<EDexDataType> getDataTypes() const { return dataTypes_; }
  DexFlags<EDistUnits> getDistanceUnits() const { return distanceUnits_; }
  DexFlags<EAngleUnits> getAngleUnits() const { return angleUnits_; }
  DexFlags<EParameterName> getParameters() const { return parameters_; }

 private:
  GUID guid_;
  CVynStringT<wchar_t> exportDLL_;
  CVynStringT<wchar_t> importDLL_;
  CVynStringT<wchar_t> titleForVerticalScreen_;
  CVynStringT<wchar_t> extension_;
  CVynStringT<wchar_t> filterExtension_;
  DexFlags<EDexDataType> dataTypes_;
  DexFlags<EDistUnits> distanceUnits_;
  DexFlags<EAngleUnits> angleUnits_;
  DexFlags<EParameterName> parameters_;
};

namespace format_id {

// True when both texts are braced GUID texts of the same GUID (hexadecimal digits in either case);
// false when either is null or does not parse. Plug-ins compare the format handed to them against
// their own GUID texts with it.
DEX_API bool isFormatIdEqual(const wchar_t* const& a, const wchar_t* const& b);

}  // namespace format_id

}  // namespace vyn::ie
