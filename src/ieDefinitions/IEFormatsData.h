#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/File.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEDataType.h"
#include "ieDefinitions/IEFlags.h"
#include "ieDefinitions/IEFormats.h"
#include "ieUtils/IEFileReaders.h"

namespace vyn::ie {

class DexFormatsData;

namespace detail {
struct FormatsDataAccess;
}

// ---- The process-wide registry ------------------------------------------------------------------
// The registry is created once, by the first of the two calls below, and lives until the library is
// unloaded. It is read-only from then on: the descriptors, pointers and indexes it hands out stay valid
// for the whole process, and it may be read from any thread. Creation is safe against concurrent first
// calls (one of them creates it; the others wait for it).

// The registry; the first call without a preceding intializeIEformatsDataFromFile creates it from the
// built-in table, without any file.
DEX_API const DexFormatsData& getIEFormatsData();

// Creates the registry from the formats data file fileName, when no registry exists yet; otherwise
// does nothing. The host calls it once at start-up, before any getIEFormatsData(). The file is used
// when it says useDataFromFile="true" and names at least one usable format; it is (re)written with
// the built-in table when it is missing, unreadable, older than version 1.9 or names no usable format;
// a file that says anything else for useDataFromFile is neither used nor touched. A bad file never
// stops the library: every failure ends in the built-in table.
DEX_API void intializeIEformatsDataFromFile(const CVynStringT<wchar_t>& fileName);

// The registry of every exchange format and data kind the library offers, filled at start-up from the
// built-in table or from a formats data file. The host filters it to fill its import and export
// dialogs and hands the chosen format to the loader. It owns its descriptors. GUIDs need not be
// unique (the built-in table has an import row and an export row under one GUID): every lookup
// answers the first match in list order.
//
// Formats data file ("IEFormatsData", XML in UTF-16 with byte-order mark and CR LF line ends), as
// written (one element a line, indented by two blanks a level):
//   <?xml version="1.0" encoding="utf-16"?>
//   <IEFormatsData version="1.9" useDataFromFile="false" numberOfFormats="154">
//     <IEFormats>
//       <IEFormat guid="{C144E2ED-E0F1-4B21-ACEC-9D5FB675621A}" name="MapInfo (*.mif)"
//                 directionType="ImportExport" importDLL="ImportParsers" exportDLL="ExportParsers"
//                 titleForVerticalScreen="MIF" extension="mif" filterExtension="MIF Files (*.mif)|">
//         <Configurations> <REGULAR/> <ONBOARD/> </Configurations>
//         <UsingModes/>
//         <DataTypes> <POINTS/> <LINES/> <POINT_LISTS/> <MULTIPLE/> </DataTypes>
//         <DistanceUnits used="true"> <ANY_UNITS/> </DistanceUnits>
//         <AngeUnits used="false"/>
//         <Parameters/>
//       </IEFormat>
//       ...
//     </IEFormats>
//   </IEFormatsData>
// The words are those of ieDefinitions/IEFormatWords.h and ieUtils/IEUtilsUnitWords.h. A file is read
// in UTF-16 or UTF-8, whatever its layout. Only version 1.9 and later files are read, and only when
// useDataFromFile is exactly "true"; a format element cut off by the end of a broken file is dropped.
// Reading is lenient: an unknown child of IEFormat (line 2486) or an unknown word in a set
// (configurations 2506, using modes 2519, data types 2552, distance units 2591, angle units 2607,
// parameters 2668; the configuration word "CONTRACTOR" is ignored silently) costs one error-log record
// and is skipped; a format without a parsable guid is skipped. Writing leaves one record for every
// value without a word (parameters 51 and 52: line 2360). The records name the source
// ieDefinitions\IEFormatsData and carry an empty message.
class DEX_API DexFormatsData {
 public:
  ~DexFormatsData();
  DexFormatsData(const DexFormatsData&) = delete;
  DexFormatsData& operator=(const DexFormatsData&) = delete;

  // ---- Formats ----
  unsigned int getNumberOfFormats() const;
  // The format at index i; null (and an error-log record, line 1988) when i is not below the count.
  const DexFormat* getFormatByIndex(unsigned int i) const;
  // The first format whose GUID equals g; null when none.
  const DexFormat* getFormatByGuid(const GUID& g) const;
  // The first format whose GUID equals the braced GUID text id; null when none or when id is null or
  // does not parse.
  const DexFormat* getFormatById(const wchar_t* id) const;
  // The index of the first format with the GUID text id; 0 when none matches or id does not parse,
  // which cannot be told from the first index: check the format at the index when it matters.
  unsigned int getIndexFormatById(const wchar_t* id) const;
  // The first format whose getExtension(withDot) equals extension ignoring case ("DXF" with false,
  // ".dxf" with true); null when none.
  const DexFormat* getFormatByExtension(const CVynStringT<wchar_t>& extension, bool withDot) const;

  // ---- Data kinds ----
  unsigned int getNumberOfDataTypes() const;
  // The first data kind with that typeId; null (and an error-log record, line 2039) when none is
  // registered (ROAD_STRINGS and STA_EQUATION_SETS never are).
  const DexDataType* getDataTypeById(EDexDataType id) const;

  // ---- Filters ----
  // Each appends to out, in list order, without clearing it first; the filter is
  // DexCommonType::compareCommonData(direction, configurations, modes).
  //
  // Every data kind that passes the filter.
  void getDataTypes(vyn_vector<const DexDataType*>& out, DexCommonType::EDataDirections direction,
                    DexFlags<DexCommonType::ESupportedConfigurations> configurations,
                    DexFlags<DexCommonType::EUsingModes> modes) const;
  // The index of every format that passes the filter.
  void getSupportedFormats(vyn_vector<int>& out, DexCommonType::EDataDirections direction,
                           DexFlags<DexCommonType::ESupportedConfigurations> configurations,
                           DexFlags<DexCommonType::EUsingModes> modes) const;
  // The index of every format that carries type and passes the filter. When no data kind with that
  // typeId is registered it appends nothing and leaves getDataTypeById's error-log record (so nothing
  // for ROAD_STRINGS, although formats carry it). The data kind's own direction and configurations
  // are not consulted.
  void getSupportedFormatsByDataType(vyn_vector<int>& out, EDexDataType type,
                                     DexCommonType::EDataDirections direction,
                                     DexFlags<DexCommonType::ESupportedConfigurations> configurations,
                                     DexFlags<DexCommonType::EUsingModes> modes) const;

 private:
  friend const DexFormatsData& getIEFormatsData();
  friend void intializeIEformatsDataFromFile(const CVynStringT<wchar_t>& fileName);
  friend struct detail::FormatsDataAccess;

  // The start-up sequence: the data kinds, then the formats from fileName when the file allows it,
  // otherwise the built-in formats (written to fileName when the file is to be replaced).
  explicit DexFormatsData(const CVynStringT<wchar_t>& fileName);

  // Built-in tables.
  void fillDataTypes();
  void fillFormatsDataByDefault();

  // Reading the formats data file. loadDataFromFile answers true only when formats were taken from
  // the file; storeFile then tells whether the file is to be replaced with the built-in table.
  bool loadDataFromFile(const CVynStringT<wchar_t>& fileName, bool& storeFile);
  bool loadIEFormatsData(DexXmlParser& parser);
  bool loadIEFormat(DexXmlParser& parser, const CVynStringT<wchar_t>& attributes,
                    const CVynStringT<wchar_t>& value, DexFormat*& out);
  void loadConfigurations(DexXmlParser& parser, CVynStringT<wchar_t>& tag, CVynStringT<wchar_t>& attributes,
                          CVynStringT<wchar_t>& value,
                          DexFlags<DexCommonType::ESupportedConfigurations>& configurations);
  void loadUsingModes(DexXmlParser& parser, CVynStringT<wchar_t>& tag, CVynStringT<wchar_t>& attributes,
                      CVynStringT<wchar_t>& value, DexFlags<DexCommonType::EUsingModes>& modes);
  void loadDataTypes(DexXmlParser& parser, CVynStringT<wchar_t>& tag, CVynStringT<wchar_t>& attributes,
                     CVynStringT<wchar_t>& value, DexFlags<EDexDataType>& types);
  void loadDistanceUnits(DexXmlParser& parser, CVynStringT<wchar_t>& tag, CVynStringT<wchar_t>& attributes,
                         CVynStringT<wchar_t>& value, DexFlags<EDistUnits>& units);
  void loadAngleUnits(DexXmlParser& parser, CVynStringT<wchar_t>& tag, CVynStringT<wchar_t>& attributes,
                      CVynStringT<wchar_t>& value, DexFlags<EAngleUnits>& units);
  void loadParameters(DexXmlParser& parser, CVynStringT<wchar_t>& tag, CVynStringT<wchar_t>& attributes,
                      CVynStringT<wchar_t>& value, DexFlags<DexFormat::EParameterName>& parameters);

  // Writing the formats data file. storeDataToTheFile answers false when the file cannot be opened
  // for writing or its bytes cannot be written.
  bool storeDataToTheFile(const CVynStringT<wchar_t>& fileName) const;
  bool writeIEFormat(base::CFile& file, const DexFormat* format) const;

  void deleteFormats();

  vyn_vector<DexFormat*> formats_;      // owned, in table or file order
  vyn_vector<DexDataType*> dataTypes_;  // owned, in table order
};

}  // namespace vyn::ie
