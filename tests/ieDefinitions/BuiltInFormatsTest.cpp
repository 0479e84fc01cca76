// The built-in table of the registry: its aggregate counts, its order and its telling rows.

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "ieDefinitions/IEFormatWords.h"
#include "ieDefinitions/IEFormatsData.h"
#include "support/LogCapture.h"

using vyn::ie::DexCommonType;
using vyn::ie::DexDataType;
using vyn::ie::DexFlags;
using vyn::ie::DexFormat;
using vyn::ie::DexFormatsData;
using vyn::ie::EAngleUnits;
using vyn::ie::EDistUnits;

namespace {

using Configurations = DexFlags<DexCommonType::ESupportedConfigurations>;
using Modes = DexFlags<DexCommonType::EUsingModes>;

const Configurations kAll{DexCommonType::REGULAR, DexCommonType::ONBOARD, DexCommonType::JAPAN};
const Configurations kRegularOnboard{DexCommonType::REGULAR, DexCommonType::ONBOARD};

// Other vendors' and open formats, in table order.
const wchar_t* const kVendorRows[] = {
    L"Leica Road Runner Files (*.dbx)",
    L"3D Viewer Files (*.w3d)",
    L"AutoCAD DXF (*.dxf)",
    L"AutoCAD 2000 Drawing (*.dwg)",
    L"AutoCAD Drawing Files (*.dwg; *.dxf)",
    L"AutoCAD Drawing (*.dwg)",
    L"ESRI Shape (*.shp;*.zip)",
    L"MapInfo (*.mif)",
    L"MapInfo (*.tab)",
    L"TDS (*.cr5)",
    L"LandXML (*.xml)",
    L"MXMOSS Points(*.mgn)",
    L"Credo (*.top)",
    L"Cut Sheet Standard (*.txt)",
    L"Cut Sheet User Defined (*.txt)",
    L"Check Sheet (*.txt)",
    L"PTL Sheet(*.txt)",
    L"MAP Exchange",
    L"Civil 3D",
    L"SSS (*.hal)",
    L"SSS (*.val)",
    L"SSS (*.rd)",
    L"SSS (*.hal; *.val; *.rd)",
    L"TDS (*.rd5)",
    L"CLIP (*.PLT)",
    L"CLIP (*.ALZ)",
    L"CLIP (*.TRV)",
    L"CLIP (*.PLT; *.ALZ; *.TRV)",
    L"INROADS (*.ASC)",
    L"ISPOL (*.ALI)",
    L"ISPOL (*.RAS)",
    L"ISPOL (*.SC1)",
    L"ISPOL (*.ALI; *.RAS; *.SC1)",
    L"Tekla (*.vgp)",
    L"SurvCE (*.RW5)",
    L"TDS (*.RAW)",
    L"TDS (*.RAW)",
    L"MOSS Survey (*.txt)",
    L"Field Book (*.fbk)",
    L"Find Chainage/Station Report (*.txt)",
    L"SSS (*.xtl)",
    L"TDS (*.tp5)",
    L"Trimble DC (*.dc)",
    L"NEZ (*.csv)",
    L"NEZ w/strings (*.csv)",
    L"DBF (*.dbf)",
    L"CMM (*.cor)",
    L"CSV (Comma delimited) (.csv)",
    L"Text report (*.txt)",
    L"Autodesk (*.las)",
    L"MMH360 (*.360)",
    L"MML-ETRS (*.mml)",
    L"KOF (*.kof)",
    L"KOF (*.kof)",
    L"GNSS Raw Report (*.txt)",
    L"APA (*.ZK)",
    L"APA-SIMA (*.O2K)",
    L"CSV w/codes (*.csv)",
    L"CSV (*.csv)",
    L"SIMA (*.SIM)",
    L"SIMA Index (*.SIM)",
    L"Berlin GNSS-Mittelwerte (*.txt)",
    L"MMH360_Z000 (*.360)",
    L"D40 (*.D40)",
    L"Microstation 95/ISFF (*.dgn)",
    L"Bentley infrastructure model (*.icm.dgn)",
    L"Bentley mobile imodel (*.idgndb)",
    L"Bentley compressed mobile imodel (*.imodel)",
    L"MicroStation V8 (*.dgn)",
    L"MX GENIO (*.txt; *.gen)",
    L"Custom (*.cxs)",
    L"SBG (*.LIN)",
    L"SBG Pxy (*.PXY)",
    L"SBG Geo (*.Geo)",
    L"Carlson (*.loc)",
    L"GeoPAK (*.gen)",
    L"Carlson (*.FCL)",
    L"CSV Report (*.CSV)",
    L"Belgian Cadastre (*.txt)",
    L"GSI8 (*.gsi)",
    L"GSI16 (*.gsi)",
    L"Finland Profila (*.txt)",
    L"Neu (*.neu)",
    L"12d ASCII (*.12da)",
    L"12d ASCII (*.12da)",
    L"Grontmij (*.dat)",
    L"Star*Net (*.dat)",
    L"PDF (*.pdf)",
    L"PDF (*.pdf)",
    L"PDF (*.pdf)",
    L"CPIXML (*.cpixml)",
    L"Civilcad 5 ASCII Dump Files (*.as5)",
    L"Civilcad 4 Job Files (*.laz)",
    L"Civilcad 4 ASCII Dump Files (*.asc)",
    L"Geocomp Files (*.str)",
    L"Hayes Data Files (*.dat)",
    L"Reb Files (*.001; *.*45; *.*58; *.reb; *.040; *.d40; *.*21; *.*66)",
    L"Nikon AP800 Files (*.ap8; *.raw)",
    L"Wild GRE4 Files (*.gre)",
    L"GENIO Files (*.gen; *.crd; *.inp)",
    L"Leica GSI Files (*.gsi)",
    L"Customizable ASCII Point Files (*.pts; *.asc; *.xyz; *.csv; *.txt; *.ctf)",
};

const DexFormatsData& registry() {
  return vyn::ie::getIEFormatsData();
}

std::vector<const DexFormat*> formats() {
  std::vector<const DexFormat*> all;
  for (unsigned int i = 0; i < registry().getNumberOfFormats(); ++i)
    all.push_back(registry().getFormatByIndex(i));
  return all;
}

std::wstring text(const CVynStringT<wchar_t>& value) {
  return std::wstring(value.view());
}

bool isMakersOwn(const DexFormat* format) {
  const std::wstring name = text(format->getName());
  return name.rfind(L"Vyn ", 0) == 0 || name.rfind(L"Orvex ", 0) == 0;
}

const DexFormat* findByName(const wchar_t* name) {
  for (const DexFormat* format : formats()) {
    if (format->getName() == name) return format;
  }
  return nullptr;
}

template <class E>
DexFlags<E> range(int first, int last) {
  DexFlags<E> set;
  for (int value = first; value <= last; ++value)
    set.add(static_cast<E>(value));
  return set;
}

// One complete row as the table gives it.
struct ExpectedRow {
  const wchar_t* guid;
  const wchar_t* name;
  DexCommonType::EDataDirections direction;
  const wchar_t* importDLL;
  const wchar_t* exportDLL;
  const wchar_t* title;
  const wchar_t* extension;
  const wchar_t* filterExtension;
  Configurations configurations;
  Modes usingModes;
  DexFlags<vyn::ie::EDexDataType> dataTypes;
  DexFlags<EDistUnits> distanceUnits;
  DexFlags<EAngleUnits> angleUnits;
  DexFlags<DexFormat::EParameterName> parameters;
};

void expectRow(const ExpectedRow& expected) {
  SCOPED_TRACE(expected.guid);
  const DexFormat* format = registry().getFormatById(expected.guid);
  ASSERT_NE(nullptr, format);
  EXPECT_EQ(expected.name, text(format->getName()));
  EXPECT_EQ(expected.direction, format->getDataDirections());
  EXPECT_EQ(expected.importDLL, text(format->getDllName(false)));
  EXPECT_EQ(expected.exportDLL, text(format->getDllName(true)));
  EXPECT_EQ(expected.title, text(format->getTitle()));
  EXPECT_EQ(expected.extension, text(format->getExtension(false)));
  EXPECT_EQ(expected.filterExtension, text(format->getFilterExtension()));
  EXPECT_EQ(expected.configurations, format->getConfigurations());
  EXPECT_EQ(expected.usingModes, format->getUsingModes());
  EXPECT_EQ(expected.dataTypes, format->getDataTypes());
  EXPECT_EQ(expected.distanceUnits, format->getDistanceUnits());
  EXPECT_EQ(expected.angleUnits, format->getAngleUnits());
  EXPECT_EQ(expected.parameters, format->getParameters());
}

}  // namespace

// ---- Data kinds ---------------------------------------------------------------------------------

TEST(BuiltInFormats, HoldsTheTwentyOneDataKindsInTableOrder) {
  struct Kind {
    vyn::ie::EDexDataType typeId;
    const wchar_t* name;
    DexCommonType::EDataDirections direction;
    Configurations configurations;
    Modes modes;
  };
  const Kind expected[] = {
      {vyn::ie::POINTS, L"Points", DexCommonType::IMPORT_AND_EXPORT, kAll, {}},
      {vyn::ie::LINES, L"Lines", DexCommonType::IMPORT_AND_EXPORT, kAll, DexCommonType::EXPORT_IN_JAPAN},
      {vyn::ie::AREAS, L"Areas", DexCommonType::IMPORT_AND_EXPORT, kAll, DexCommonType::EXPORT_IN_JAPAN},
      {vyn::ie::POINT_LISTS, L"Point Lists", DexCommonType::IMPORT_AND_EXPORT, kAll,
       DexCommonType::EXPORT_IN_JAPAN},
      {vyn::ie::CODES, L"Code Library", DexCommonType::IMPORT_AND_EXPORT, kAll, {}},
      {vyn::ie::RAW_DATA, L"Raw Data", DexCommonType::IMPORT_AND_EXPORT, kAll, {}},
      {vyn::ie::H_ALIGNMENTS,
       L"Horizontal Alignments",
       DexCommonType::IMPORT_AND_EXPORT,
       kRegularOnboard,
       {}},
      {vyn::ie::V_ALIGNMENTS, L"Vertical Alignments", DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard, {}},
      {vyn::ie::X_SECTIONS, L"X-Section Sets", DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard, {}},
      {vyn::ie::ROADS, L"Roads", DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard, {}},
      {vyn::ie::PARCELS, L"Parcels", DexCommonType::IMPORT_ONLY, kRegularOnboard, {}},
      {vyn::ie::X_SECTION_TEMPLATES,
       L"X-Section Templates",
       DexCommonType::IMPORT_AND_EXPORT,
       kRegularOnboard,
       {}},
      {vyn::ie::LOCALIZATION, L"Localization", DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard, {}},
      {vyn::ie::SCANNING_DATA, L"Scanning Data", DexCommonType::IMPORT_AND_EXPORT, kAll,
       DexCommonType::ONBOARD_WITH_SCANNING},
      {vyn::ie::ROAD_SURVEY, L"Roads Survey", DexCommonType::EXPORT_ONLY, kRegularOnboard, {}},
      {vyn::ie::JOB_HISTORY, L"Job History", DexCommonType::EXPORT_ONLY, kRegularOnboard, {}},
      {vyn::ie::SURFACES, L"Surfaces", DexCommonType::IMPORT_AND_EXPORT, kAll, {}},
      {vyn::ie::LAYER_STATES, L"Layers Library", DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard, {}},
      {vyn::ie::STAKE_REPORTS, L"Stakeout Reports", DexCommonType::EXPORT_ONLY, kRegularOnboard, {}},
      {vyn::ie::FIELD_REPORTS, L"Field Reports", DexCommonType::EXPORT_ONLY, kRegularOnboard, {}},
      {vyn::ie::MULTIPLE, L"Multiple", DexCommonType::IMPORT_AND_EXPORT, kRegularOnboard, {}},
  };
  ASSERT_EQ(21u, registry().getNumberOfDataTypes());
  // A query of no known direction passes every kind's direction (leaving a log record for each), so
  // it lists the whole table in order.
  vyn_vector<const DexDataType*> all;
  {
    const dex_test::LogCapture log;
    registry().getDataTypes(all, static_cast<DexCommonType::EDataDirections>(3), {},
                            Modes{DexCommonType::EXPORT_IN_JAPAN, DexCommonType::ONBOARD_WITH_SCANNING});
    EXPECT_EQ(21, log.count(L"ieDefinitions\\IEFormats", 62));
  }
  ASSERT_EQ(21u, all.size());
  for (std::size_t i = 0; i < all.size(); ++i)
    EXPECT_EQ(expected[i].typeId, all[i]->getTypeId()) << i;
  for (const Kind& kind : expected) {
    SCOPED_TRACE(kind.name);
    const DexDataType* type = registry().getDataTypeById(kind.typeId);
    ASSERT_NE(nullptr, type);
    EXPECT_EQ(kind.name, text(type->getName()));
    EXPECT_EQ(kind.direction, type->getDataDirections());
    EXPECT_EQ(kind.configurations, type->getConfigurations());
    EXPECT_EQ(kind.modes, type->getUsingModes());
  }
}

// ---- Aggregate counts ---------------------------------------------------------------------------

TEST(BuiltInFormats, HoldsOneHundredFiftyFourFormatsByDirection) {
  ASSERT_EQ(154u, registry().getNumberOfFormats());
  std::map<DexCommonType::EDataDirections, int> byDirection;
  for (const DexFormat* format : formats())
    ++byDirection[format->getDataDirections()];
  EXPECT_EQ(98, byDirection[DexCommonType::IMPORT_AND_EXPORT]);
  EXPECT_EQ(33, byDirection[DexCommonType::EXPORT_ONLY]);
  EXPECT_EQ(23, byDirection[DexCommonType::IMPORT_ONLY]);
}

TEST(BuiltInFormats, CountsRowsByPlugInLibrary) {
  std::map<std::pair<std::wstring, std::wstring>, int> byLibraries;  // (import, export)
  for (const DexFormat* format : formats())
    ++byLibraries[{text(format->getDllName(false)), text(format->getDllName(true))}];
  const auto count = [&byLibraries](const wchar_t* importDLL, const wchar_t* exportDLL) {
    const auto found = byLibraries.find({importDLL, exportDLL});
    const int rows = found == byLibraries.end() ? 0 : found->second;
    if (found != byLibraries.end()) byLibraries.erase(found);
    return rows;
  };
  EXPECT_EQ(85, count(L"ImportParsers", L"ExportParsers"));
  EXPECT_EQ(29, count(L"", L"ExportParsers"));
  EXPECT_EQ(17, count(L"ImportParsers", L""));
  EXPECT_EQ(3, count(L"", L"TeighaDGNParser"));
  EXPECT_EQ(1, count(L"TeighaDGNParser", L"TeighaDGNParser"));
  EXPECT_EQ(2, count(L"SHPParser", L"SHPParser"));
  EXPECT_EQ(1, count(L"12DAParser", L""));
  EXPECT_EQ(1, count(L"", L"12DAParser"));
  EXPECT_EQ(1, count(L"", L"DWG_2000Parser") + count(L"DWG_2000Parser", L"") +
                   count(L"DWG_2000Parser", L"DWG_2000Parser"));
  EXPECT_EQ(1, count(L"DWG_2007Parser", L"DWG_2007Parser"));
  EXPECT_EQ(1, count(L"DWG_2007Parser", L"Civil3DConnect"));
  EXPECT_EQ(1, count(L"Civil3DConnect", L"") + count(L"", L"Civil3DConnect") +
                   count(L"Civil3DConnect", L"Civil3DConnect"));
  EXPECT_EQ(1, count(L"DGN_ISFFParser", L"") + count(L"", L"DGN_ISFFParser") +
                   count(L"DGN_ISFFParser", L"DGN_ISFFParser"));
  EXPECT_EQ(1, count(L"CPIXMLParser", L""));
  // One library serves the seven machine-control formats, and every other library one row.
  int machineControl = 0;
  for (const auto& [libraries, rows] : byLibraries) {
    if (rows == 7) {
      ++machineControl;
      EXPECT_EQ(libraries.first, libraries.second);
    } else {
      EXPECT_EQ(1, rows);
    }
  }
  EXPECT_EQ(1, machineControl);
}

TEST(BuiltInFormats, CountsRowsByConfigurationsAndUsingModes) {
  std::map<std::uint64_t, int> byConfigurations;
  int exportInJapan = 0;
  for (const DexFormat* format : formats()) {
    ++byConfigurations[format->getConfigurations().getMask()];
    if (format->isUsingModeApplied(DexCommonType::EXPORT_IN_JAPAN)) ++exportInJapan;
    EXPECT_FALSE(format->isUsingModeApplied(DexCommonType::ONBOARD_WITH_SCANNING));
  }
  EXPECT_EQ(96, byConfigurations[kRegularOnboard.getMask()]);
  EXPECT_EQ(48, byConfigurations[kAll.getMask()]);
  const Configurations onboardJapan{DexCommonType::ONBOARD, DexCommonType::JAPAN};
  EXPECT_EQ(5, byConfigurations[onboardJapan.getMask()]);
  EXPECT_EQ(4, byConfigurations[Configurations(DexCommonType::REGULAR).getMask()]);
  EXPECT_EQ(1, byConfigurations[0]);
  EXPECT_EQ(5u, byConfigurations.size());
  EXPECT_EQ(15, exportInJapan);
}

TEST(BuiltInFormats, OffersAnyDistanceUnitMostOftenAndMostlyNoAngleUnit) {
  std::map<std::uint64_t, int> byDistanceUnits;
  int withoutAngleUnit = 0;
  for (const DexFormat* format : formats()) {
    ++byDistanceUnits[format->getDistanceUnits().getMask()];
    if (!format->areAngleUnitsUsed()) ++withoutAngleUnit;
  }
  const auto commonest = std::max_element(byDistanceUnits.begin(), byDistanceUnits.end(),
                                          [](const auto& a, const auto& b) { return a.second < b.second; });
  EXPECT_EQ(DexFlags<EDistUnits>(EDistUnits::ANY_UNITS).getMask(), commonest->first);
  EXPECT_GT(withoutAngleUnit, 154 / 2);
}

// ---- GUIDs and order ----------------------------------------------------------------------------

TEST(BuiltInFormats, EveryGuidParsesAndOnlyTheTwelveDRowsShareOne) {
  std::map<std::wstring, std::vector<const DexFormat*>> byGuid;
  for (const DexFormat* format : formats()) {
    const CVynStringT<wchar_t> guidText = format->getGuidAsString();
    GUID parsed;
    ASSERT_EQ(S_OK, CLSIDFromString(guidText, &parsed)) << text(format->getName());
    EXPECT_EQ(format->getGuid(), parsed);
    EXPECT_NE(GUID{}, format->getGuid()) << text(format->getName());
    EXPECT_TRUE(format->isIdEqual(guidText));
    byGuid[text(guidText)].push_back(format);
  }
  EXPECT_EQ(153u, byGuid.size());
  for (const auto& [guid, rows] : byGuid) {
    if (rows.size() == 1) continue;
    ASSERT_EQ(2u, rows.size());
    EXPECT_EQ(L"12d ASCII (*.12da)", text(rows[0]->getName()));
    EXPECT_EQ(DexCommonType::IMPORT_ONLY, rows[0]->getDataDirections());
    EXPECT_EQ(L"12DAParser", text(rows[0]->getDllName(false)));
    EXPECT_EQ(L"12d ASCII (*.12da)", text(rows[1]->getName()));
    EXPECT_EQ(DexCommonType::EXPORT_ONLY, rows[1]->getDataDirections());
    EXPECT_EQ(L"12DAParser", text(rows[1]->getDllName(true)));
    // Lookups answer the import row, the first in the table.
    EXPECT_EQ(rows[0], registry().getFormatById(guid.c_str()));
    EXPECT_EQ(rows[0], registry().getFormatByGuid(rows[1]->getGuid()));
    EXPECT_EQ(rows[0], registry().getFormatByIndex(registry().getIndexFormatById(guid.c_str())));
  }
}

TEST(BuiltInFormats, ListsOtherVendorsFormatsByTheirNamesInTableOrder) {
  const std::vector<const DexFormat*> all = formats();
  std::vector<std::wstring> vendorRows;
  for (const DexFormat* format : all) {
    if (!isMakersOwn(format)) vendorRows.push_back(text(format->getName()));
  }
  const std::vector<std::wstring> expected(std::begin(kVendorRows), std::end(kVendorRows));
  EXPECT_EQ(expected, vendorRows);
  EXPECT_EQ(52, std::count_if(all.begin(), all.end(), isMakersOwn));
}

TEST(BuiltInFormats, TheFirstDxfRowIsAutoCadDxf) {
  const auto all = formats();
  const auto first = std::find_if(all.begin(), all.end(), [](const DexFormat* format) {
    return format->getExtension(false).CompareNoCase(L"dxf") == 0;
  });
  ASSERT_NE(all.end(), first);
  EXPECT_EQ(L"AutoCAD DXF (*.dxf)", text((*first)->getName()));
  EXPECT_EQ(*first, registry().getFormatByExtension(L"DXF", false));
  EXPECT_EQ(*first, registry().getFormatByExtension(L".dxf", true));
  EXPECT_EQ(*first, registry().getFormatByExtension(L".DxF", true));
  EXPECT_EQ(nullptr, registry().getFormatByExtension(L"dxf", true));
}

TEST(BuiltInFormats, NamesEveryRowAndEndsEveryFilterInABar) {
  for (const DexFormat* format : formats()) {
    SCOPED_TRACE(text(format->getName()));
    EXPECT_FALSE(format->getName().IsEmpty());
    const CVynStringT<wchar_t>& filter = format->getFilterExtension();
    if (!filter.IsEmpty()) {
      EXPECT_EQ(L'|', filter[filter.GetLength() - 1]);
    }
    // A direction's library is named exactly where the format has that direction.
    const DexCommonType::EDataDirections direction = format->getDataDirections();
    EXPECT_EQ(direction != DexCommonType::EXPORT_ONLY, !format->getDllName(false).IsEmpty());
    EXPECT_EQ(direction != DexCommonType::IMPORT_ONLY, !format->getDllName(true).IsEmpty());
  }
}

// ---- The four complete rows ---------------------------------------------------------------------

TEST(BuiltInFormats, TheAutoCadDrawingRowIsAsTabled) {
  DexFlags<EDistUnits> units = range<EDistUnits>(0, 26);
  for (int value = 3; value <= 6; ++value)
    units.remove(static_cast<EDistUnits>(value));
  expectRow({L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}",
             L"AutoCAD Drawing (*.dwg)",
             DexCommonType::IMPORT_AND_EXPORT,
             L"DWG_2007Parser",
             L"DWG_2007Parser",
             L"DWG",
             L"dwg",
             L"AutoCAD Drawing (*.dwg)|",
             kAll,
             {},
             {vyn::ie::POINTS, vyn::ie::LINES, vyn::ie::SURFACES, vyn::ie::POINT_LISTS, vyn::ie::MULTIPLE},
             units,
             EAngleUnits::DECDEG,
             {DexFormat::CUSTOM_CODE_STYLE_EXP, DexFormat::AUTODESK_SETTINGS_EXP, DexFormat::DRAW_DATA_EXP}});
  EXPECT_EQ(23, units.count());
}

TEST(BuiltInFormats, TheEsriShapeRowIsAsTabled) {
  expectRow({L"{79241EB7-2DDB-4fbf-A677-8E0DB4DF8204}",
             L"ESRI Shape (*.shp;*.zip)",
             DexCommonType::IMPORT_AND_EXPORT,
             L"SHPParser",
             L"SHPParser",
             L"SHP",
             L"shp",
             L"SHP Files (*.shp)|Zip Files (*.zip)|",
             kRegularOnboard,
             {},
             {vyn::ie::POINTS, vyn::ie::LINES, vyn::ie::AREAS, vyn::ie::POINT_LISTS, vyn::ie::MULTIPLE},
             range<EDistUnits>(0, 2),
             {},
             {DexFormat::ABILITY_TO_USE_DESCRIPTION_AS_ATTR_EXP, DexFormat::CS_IS_STORED_IN_THE_FILE,
              DexFormat::PHOTO_NOTES, DexFormat::MULTIPLE_FILES_EXP, DexFormat::DRAW_DATA_EXP,
              DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP}});
}

TEST(BuiltInFormats, TheLandXmlRowIsAsTabled) {
  expectRow({L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}",
             L"LandXML (*.xml)",
             DexCommonType::IMPORT_AND_EXPORT,
             L"ImportParsers",
             L"ExportParsers",
             L"LandXML",
             L"xml",
             L"XML Files (*.xml)|",
             kAll,
             DexCommonType::EXPORT_IN_JAPAN,
             {vyn::ie::POINTS, vyn::ie::LINES, vyn::ie::PARCELS, vyn::ie::ROAD_STRINGS, vyn::ie::ROADS,
              vyn::ie::SURFACES, vyn::ie::POINT_LISTS, vyn::ie::RAW_DATA, vyn::ie::STA_EQUATION_SETS,
              vyn::ie::MULTIPLE},
             range<EDistUnits>(0, 2) | range<EDistUnits>(7, 12),
             {EAngleUnits::RADIANS, EAngleUnits::GRADS_GONS, EAngleUnits::DECDEG, EAngleUnits::DDDMMSSS},
             {DexFormat::ABILITY_TO_USE_ZONES_FOR_XSECTIONS_EXP, DexFormat::PHOTO_NOTES,
              DexFormat::PREDEFINED_CODE_WITH_ATTRS_EXP, DexFormat::GPS_RAWDATA_EXP,
              DexFormat::TS_RAWDATA_EXP, DexFormat::XSECT_ROADS, DexFormat::PLANE_COORDS_FOR_GPS_POINTS_EXP,
              DexFormat::V_ALIGNMENT_SUPPORT_ARCS, DexFormat::V_ALIGNMENT_SUPPORT_LONG_SECTIONS,
              DexFormat::H_ALIGNMENT_SUPPORT_COMPOUND_SPIRALS, DexFormat::BULGES_IN_LINEWORK,
              static_cast<DexFormat::EParameterName>(51)}});
}

TEST(BuiltInFormats, TheMapInfoMifRowIsAsTabled) {
  expectRow({L"{C144E2ED-E0F1-4b21-ACEC-9D5FB675621A}",
             L"MapInfo (*.mif)",
             DexCommonType::IMPORT_AND_EXPORT,
             L"ImportParsers",
             L"ExportParsers",
             L"MIF",
             L"mif",
             L"MIF Files (*.mif)|",
             kRegularOnboard,
             {},
             {vyn::ie::POINTS, vyn::ie::LINES, vyn::ie::POINT_LISTS, vyn::ie::MULTIPLE},
             EDistUnits::ANY_UNITS,
             {},
             {}});
}

TEST(BuiltInFormats, TheTellingRowsAnswerTheirUnitChoice) {
  EXPECT_TRUE(registry().getFormatById(L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}")->hasUnitsToSelect());
  EXPECT_TRUE(registry().getFormatById(L"{79241EB7-2DDB-4fbf-A677-8E0DB4DF8204}")->hasUnitsToSelect());
  EXPECT_TRUE(registry().getFormatById(L"{C144E2ED-E0F1-4b21-ACEC-9D5FB675621A}")->hasUnitsToSelect());
  EXPECT_TRUE(registry()
                  .getFormatById(L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}")
                  ->isParameterSupported(DexFormat::DRAW_DATA_EXP));
  EXPECT_NE(nullptr, findByName(L"MapInfo (*.tab)"));
}
