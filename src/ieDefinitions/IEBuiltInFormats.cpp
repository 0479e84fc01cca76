// The built-in tables of the formats registry: the data kinds and the formats the library offers
// without a formats data file, in registry order.

#include "ieDefinitions/detail/BuiltInFormats.h"

namespace vyn::ie::detail {

namespace {

using enum DexCommonType::EDataDirections;
using enum DexCommonType::ESupportedConfigurations;
using enum DexCommonType::EUsingModes;
using enum DexFormat::EParameterName;
using Configurations = DexFlags<DexCommonType::ESupportedConfigurations>;
using UsingModes = DexFlags<DexCommonType::EUsingModes>;
using DistUnits = DexFlags<EDistUnits>;
using AngleUnits = DexFlags<EAngleUnits>;

constexpr DexCommonType::EDataDirections kImport = IMPORT_ONLY;
constexpr DexCommonType::EDataDirections kExport = EXPORT_ONLY;
constexpr DexCommonType::EDataDirections kBoth = IMPORT_AND_EXPORT;

constexpr Configurations kAllConfigurations{REGULAR, ONBOARD, JAPAN};
constexpr Configurations kRegularOnboard{REGULAR, ONBOARD};
constexpr Configurations kOnboardJapan{ONBOARD, JAPAN};
constexpr Configurations kRegularOnly{REGULAR};
constexpr Configurations kNoConfiguration{};

constexpr UsingModes kNoModes{};
constexpr UsingModes kExportInJapan{EXPORT_IN_JAPAN};

// Distance-unit sets.
constexpr DistUnits kDistNone{};
constexpr DistUnits kDistAny{EDistUnits::ANY_UNITS};
constexpr DistUnits kDistMeters{EDistUnits::METERS};
constexpr DistUnits kDistMetersFeet{EDistUnits::METERS, EDistUnits::USFEET, EDistUnits::IFEET};
// Meters, both feet, miles, both inches, millimeters, centimeters and kilometers.
constexpr DistUnits kDistLandXml{EDistUnits::METERS,      EDistUnits::USFEET,      EDistUnits::IFEET,
                                 EDistUnits::MILE,        EDistUnits::INCHES,      EDistUnits::USINCHES,
                                 EDistUnits::MILLIMETERS, EDistUnits::CENTIMETERS, EDistUnits::KILOMETERS};
// Every drawing unit 0 to 26 except feet-and-inches and chains (3 to 6).
constexpr DistUnits kDistDwg{EDistUnits::METERS,      EDistUnits::USFEET,      EDistUnits::IFEET,
                             EDistUnits::MILE,        EDistUnits::INCHES,      EDistUnits::USINCHES,
                             EDistUnits::MILLIMETERS, EDistUnits::CENTIMETERS, EDistUnits::KILOMETERS,
                             EDistUnits::MICROINCHES, EDistUnits::MILS,        EDistUnits::IYARDS,
                             EDistUnits::USYARDS,     EDistUnits::ANGSTROMS,   EDistUnits::NANOMETERS,
                             EDistUnits::MICRONS,     EDistUnits::DECIMETERS,  EDistUnits::DECAMETERS,
                             EDistUnits::HECTOMETER,  EDistUnits::GIGAMETERS,  EDistUnits::ASTRONOMICAL_UNITS,
                             EDistUnits::LIGHT_YEARS, EDistUnits::PARSECS};

// Angle-unit sets.
constexpr AngleUnits kAngleNone{};
constexpr AngleUnits kAngleDecDeg{EAngleUnits::DECDEG};
constexpr AngleUnits kAngleDms{EAngleUnits::DDDMMSSS};
constexpr AngleUnits kAngleGons{EAngleUnits::GRADS_GONS};
constexpr AngleUnits kAngleLandXml{EAngleUnits::RADIANS, EAngleUnits::GRADS_GONS, EAngleUnits::DECDEG,
                                   EAngleUnits::DDDMMSSS};

constexpr BuiltInDataTypeRow kDataTypeRows[] = {
    {POINTS, L"Points", kBoth, kAllConfigurations, kNoModes},
    {LINES, L"Lines", kBoth, kAllConfigurations, kExportInJapan},
    {AREAS, L"Areas", kBoth, kAllConfigurations, kExportInJapan},
    {POINT_LISTS, L"Point Lists", kBoth, kAllConfigurations, kExportInJapan},
    {CODES, L"Code Library", kBoth, kAllConfigurations, kNoModes},
    {RAW_DATA, L"Raw Data", kBoth, kAllConfigurations, kNoModes},
    {H_ALIGNMENTS, L"Horizontal Alignments", kBoth, kRegularOnboard, kNoModes},
    {V_ALIGNMENTS, L"Vertical Alignments", kBoth, kRegularOnboard, kNoModes},
    {X_SECTIONS, L"X-Section Sets", kBoth, kRegularOnboard, kNoModes},
    {ROADS, L"Roads", kBoth, kRegularOnboard, kNoModes},
    {PARCELS, L"Parcels", kImport, kRegularOnboard, kNoModes},
    {X_SECTION_TEMPLATES, L"X-Section Templates", kBoth, kRegularOnboard, kNoModes},
    {LOCALIZATION, L"Localization", kBoth, kRegularOnboard, kNoModes},
    {SCANNING_DATA, L"Scanning Data", kBoth, kAllConfigurations, UsingModes{ONBOARD_WITH_SCANNING}},
    {ROAD_SURVEY, L"Roads Survey", kExport, kRegularOnboard, kNoModes},
    {JOB_HISTORY, L"Job History", kExport, kRegularOnboard, kNoModes},
    {SURFACES, L"Surfaces", kBoth, kAllConfigurations, kNoModes},
    {LAYER_STATES, L"Layers Library", kBoth, kRegularOnboard, kNoModes},
    {STAKE_REPORTS, L"Stakeout Reports", kExport, kRegularOnboard, kNoModes},
    {FIELD_REPORTS, L"Field Reports", kExport, kRegularOnboard, kNoModes},
    {MULTIPLE, L"Multiple", kBoth, kRegularOnboard, kNoModes},
};

// One format a line: guid, name, direction, exportDLL, importDLL, title, extension, filter,
// configurations, using modes, data kinds, distance units, angle units, parameters.
// clang-format off
constexpr BuiltInFormatRow kFormatRows[] = {
    {L"{E653FE2B-C46A-400E-BA60-864A221BE19F}", L"Vyn XML (*.vxml)", kBoth, L"ExportParsers", L"ImportParsers", L"Vyn XML", L"vxml", L"Vyn XML Files (*.vxml)|", kAllConfigurations, kNoModes, {POINTS, CODES, LINES, AREAS, PARCELS, H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROAD_STRINGS, ROADS, SURFACES, POINT_LISTS, X_SECTION_TEMPLATES, LOCALIZATION, RAW_DATA, STA_EQUATION_SETS, MULTIPLE}, kDistAny, kAngleNone, {PHOTO_NOTES, DRAW_DATA_EXP, PREDEFINED_CODE_WITH_ATTRS_EXP, GPS_RAWDATA_EXP, TS_RAWDATA_EXP, DL_RAWDATA_EXP, ARCS_IN_LINEWORK, BUILT_IN_PARAMETER_52}},
    {L"{B98F63BD-B492-4928-B3D1-DE7D535875BA}", L"Vyn Custom ASCII (*.txt)", kBoth, L"ExportParsers", L"ImportParsers", L"Custom ASCII", L"txt", L"Text Files (*.txt)|CSV Files (*.csv)|All Files (*.*)|", kAllConfigurations, kNoModes, {POINTS, CODES, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_HAVE_ATTR_VALUES_IN_QUOTES_EXP, CUSTOM_FIELDS}},
    {L"{B6DD723B-AB01-4119-8884-A6F38BEB0934}", L"Vyn Custom Lines (*.vln)", kBoth, L"ExportParsers", L"ImportParsers", L"Custom Lines", L"vln", L"Vyn Line Files (*.vln)|", kAllConfigurations, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {CUSTOM_FIELDS, CODE_STRING_POINTS_ARRAY_EXP}},
    {L"{81008BC5-16A6-4058-9339-04D24EA8FA68}", L"Vyn Coordinate Text (*.vct)", kBoth, L"ExportParsers", L"ImportParsers", L"Coord Text", L"vct", L"Vyn Coordinate Files (*.vct)|", kAllConfigurations, kNoModes, {POINTS, POINT_LISTS}, kDistMetersFeet, kAngleNone, {ABILITY_TO_USE_NUMERIC_POINT_NAMES_EXP}},
    {L"{9660CD8D-2321-49E1-BE3A-7551656D069A}", L"Leica Road Runner Files (*.dbx)", kImport, L"", L"DBXParser", L"DBX", L"dbx", L"Road Runner Files (*.dbx)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS, ROAD_STRINGS}, kDistNone, kAngleNone, {}},
    {L"{4C8FE8CC-2762-4B9B-BDB0-713F05995EFB}", L"3D Viewer Files (*.w3d)", kBoth, L"W3DParser", L"W3DParser", L"W3D", L"w3d", L"3D Viewer Files (*.w3d)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, MULTIPLE}, kDistAny, kAngleNone, {DRAW_DATA_EXP}},
    {L"{5373CF88-2FB9-458D-B233-3F539F08C588}", L"AutoCAD DXF (*.dxf)", kBoth, L"ExportParsers", L"ImportParsers", L"DXF", L"dxf", L"AutoCAD DXF (*.dxf)|", kAllConfigurations, kNoModes, {POINTS, LINES, AREAS, SURFACES, POINT_LISTS, MULTIPLE}, kDistDwg, kAngleDecDeg, {CUSTOM_CODE_STYLE_EXP, AUTODESK_SETTINGS_EXP, DRAW_DATA_EXP, ARCS_IN_LINEWORK}},
    {L"{72439747-9C65-4EE8-9419-FA6548E8E12D}", L"AutoCAD 2000 Drawing (*.dwg)", kImport, L"", L"DWG_2000Parser", L"DWG 2000", L"dwg", L"AutoCAD 2000 Drawing (*.dwg)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, POINT_LISTS, MULTIPLE}, kDistNone, kAngleNone, {}},
    {L"{EE73146C-1601-4B74-8D34-C1128D6C87EB}", L"AutoCAD Drawing Files (*.dwg; *.dxf)", kBoth, L"Civil3DConnect", L"DWG_2007Parser", L"DWG/DXF", L"dwg", L"AutoCAD Drawing Files (*.dwg)|AutoCAD DXF (*.dxf)|", kRegularOnly, kNoModes, {POINTS, LINES, AREAS, SURFACES, POINT_LISTS, MULTIPLE}, kDistDwg, kAngleDecDeg, {AUTODESK_SETTINGS_EXP, DRAW_DATA_EXP}},
    {L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}", L"AutoCAD Drawing (*.dwg)", kBoth, L"DWG_2007Parser", L"DWG_2007Parser", L"DWG", L"dwg", L"AutoCAD Drawing (*.dwg)|", kAllConfigurations, kNoModes, {POINTS, LINES, SURFACES, POINT_LISTS, MULTIPLE}, kDistDwg, kAngleDecDeg, {CUSTOM_CODE_STYLE_EXP, AUTODESK_SETTINGS_EXP, DRAW_DATA_EXP}},
    {L"{79241EB7-2DDB-4fbf-A677-8E0DB4DF8204}", L"ESRI Shape (*.shp;*.zip)", kBoth, L"SHPParser", L"SHPParser", L"SHP", L"shp", L"SHP Files (*.shp)|Zip Files (*.zip)|", kRegularOnboard, kNoModes, {POINTS, LINES, AREAS, POINT_LISTS, MULTIPLE}, kDistMetersFeet, kAngleNone, {ABILITY_TO_USE_DESCRIPTION_AS_ATTR_EXP, CS_IS_STORED_IN_THE_FILE, PHOTO_NOTES, MULTIPLE_FILES_EXP, DRAW_DATA_EXP, PREDEFINED_CODE_WITH_ATTRS_EXP}},
    {L"{C144E2ED-E0F1-4b21-ACEC-9D5FB675621A}", L"MapInfo (*.mif)", kBoth, L"ExportParsers", L"ImportParsers", L"MIF", L"mif", L"MIF Files (*.mif)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {}},
    {L"{C03C6099-8ED6-402A-9565-CBEBC783B5A1}", L"MapInfo (*.tab)", kBoth, L"ExportParsers", L"ImportParsers", L"TAB", L"tab", L"TAB Files (*.tab)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {}},
    {L"{CBA93812-9527-4E8B-8E80-7E0537CA26D4}", L"TDS (*.cr5)", kBoth, L"ExportParsers", L"ImportParsers", L"CR5", L"cr5", L"CR5 Files (*.cr5)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_USE_NUMERIC_POINT_NAMES_EXP}},
    {L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}", L"LandXML (*.xml)", kBoth, L"ExportParsers", L"ImportParsers", L"LandXML", L"xml", L"XML Files (*.xml)|", kAllConfigurations, kExportInJapan, {POINTS, LINES, PARCELS, ROAD_STRINGS, ROADS, SURFACES, POINT_LISTS, RAW_DATA, STA_EQUATION_SETS, MULTIPLE}, kDistLandXml, kAngleLandXml, {ABILITY_TO_USE_ZONES_FOR_XSECTIONS_EXP, PHOTO_NOTES, PREDEFINED_CODE_WITH_ATTRS_EXP, GPS_RAWDATA_EXP, TS_RAWDATA_EXP, XSECT_ROADS, PLANE_COORDS_FOR_GPS_POINTS_EXP, V_ALIGNMENT_SUPPORT_ARCS, V_ALIGNMENT_SUPPORT_LONG_SECTIONS, H_ALIGNMENT_SUPPORT_COMPOUND_SPIRALS, BULGES_IN_LINEWORK, BUILT_IN_PARAMETER_51}},
    {L"{987EEE7D-E16B-4239-8D8B-94CBCD6DBFB6}", L"MXMOSS Points(*.mgn)", kBoth, L"ExportParsers", L"ImportParsers", L"MGN", L"mgn", L"MGN Files (*.mgn)|", kAllConfigurations, kExportInJapan, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {}},
    {L"{6E17F756-14FC-445B-B20C-A806D2AA2FAB}", L"Credo (*.top)", kBoth, L"ExportParsers", L"ImportParsers", L"Credo", L"top", L"Credo Files (*.top)|", kAllConfigurations, kExportInJapan, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {}},
    {L"{C8AF27B4-65D9-46D6-AC53-44460992B49C}", L"Cut Sheet Standard (*.txt)", kExport, L"ExportParsers", L"", L"Cut Sheet", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {STAKE_REPORTS}, kDistMetersFeet, kAngleNone, {STAKEOUT_POINTS_FOR_REPORTS_EXP, STAKEOUT_TOLERANCE_FILTER}},
    {L"{EFD2C2AD-3A41-4FFC-AF4C-D8424B5C60FB}", L"Cut Sheet User Defined (*.txt)", kExport, L"ExportParsers", L"", L"Cut Sheet UD", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {STAKE_REPORTS}, kDistMetersFeet, kAngleNone, {CUSTOM_FIELDS, STAKEOUT_POINTS_FOR_REPORTS_EXP, STAKEOUT_TOLERANCE_FILTER}},
    {L"{E438FCFD-379E-4153-A55A-A7A3DEDC4E03}", L"Check Sheet (*.txt)", kExport, L"ExportParsers", L"", L"Check Sheet", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {STAKE_REPORTS}, kDistMetersFeet, kAngleNone, {STAKEOUT_POINTS_FOR_REPORTS_EXP}},
    {L"{AFE03E40-84C1-452A-9652-20A9C3D657E6}", L"PTL Sheet(*.txt)", kExport, L"ExportParsers", L"", L"PTL Sheet", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {POINTS, STAKE_REPORTS}, kDistMetersFeet, kAngleNone, {PTL_POINTS_EXP, PTL_SIGN_IN_POINT_NAME_EXP}},
    {L"{67BBDAF4-0BB4-48F6-B10A-27F44D1C8952}", L"Vyn Total Station Job (*.vtj)", kBoth, L"ExportParsers", L"ImportParsers", L"TS Job", L"vtj", L"Vyn TS Job Files (*.vtj)|", kAllConfigurations, kNoModes, {POINTS, CODES, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_USE_NUMERIC_POINT_NAMES_EXP}},
    {L"{89E9519C-C90A-4EE3-9DD3-99A517704895}", L"Vyn Total Station Raw (*.vtr)", kImport, L"", L"ImportParsers", L"TS Raw", L"vtr", L"Vyn TS Raw Files (*.vtr)|", kAllConfigurations, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{F7C8CDED-BC1A-429E-A173-4885F859C1DB}", L"Vyn Data Collector Coordinates (*.vdc)", kBoth, L"ExportParsers", L"ImportParsers", L"DC Coords", L"vdc", L"Vyn DC Files (*.vdc)|", kAllConfigurations, kNoModes, {POINTS, POINT_LISTS}, kDistMetersFeet, kAngleNone, {NUMERIC_POINTS_ARE_GENERATED_EXP}},
    {L"{C252C56B-5201-4036-8D75-9807B52D227C}", L"Vyn Data Collector Raw (*.vdr)", kImport, L"", L"ImportParsers", L"DC Raw", L"vdr", L"Vyn DC Raw Files (*.vdr)|", kAllConfigurations, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{4BCAC3FB-8DF9-4801-9FAA-135B536F2FF6}", L"Vyn Level Run (*.vlr)", kImport, L"", L"ImportParsers", L"Level Run", L"vlr", L"Vyn Level Files (*.vlr)|", kAllConfigurations, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{239C3E93-5F39-4A34-9BBA-C7E093F82384}", L"MAP Exchange", kBoth, L"ExportParsers", L"ImportParsers", L"MAP", L"map", L"MAP Exchange Files (*.map)|", kRegularOnly, kNoModes, {POINTS, LINES, AREAS, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {}},
    {L"{5D43A32C-AB0E-406C-BE2C-2ABAA25D8F6E}", L"Civil 3D", kImport, L"", L"Civil3DConnect", L"Civil 3D", L"", L"", kRegularOnly, kNoModes, {POINTS, LINES, SURFACES, POINT_LISTS, ROADS, MULTIPLE}, kDistNone, kAngleNone, {}},
    {L"{55032797-3B03-4B1B-95AE-1CB3BB5D4387}", L"SSS (*.hal)", kBoth, L"ExportParsers", L"ImportParsers", L"HAL", L"hal", L"HAL Files (*.hal)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS}, kDistAny, kAngleNone, {}},
    {L"{CFB62B09-C1E6-4760-BE3A-35525F1C35A4}", L"SSS (*.val)", kBoth, L"ExportParsers", L"ImportParsers", L"VAL", L"val", L"VAL Files (*.val)|", kRegularOnboard, kNoModes, {V_ALIGNMENTS}, kDistAny, kAngleNone, {V_ALIGNMENT_SUPPORT_ARCS}},
    {L"{2CEA3C53-6C7B-473E-804D-1ADCFDECC4C7}", L"SSS (*.rd)", kBoth, L"ExportParsers", L"ImportParsers", L"RD", L"rd", L"RD Files (*.rd)|", kRegularOnboard, kNoModes, {X_SECTIONS}, kDistAny, kAngleNone, {}},
    {L"{11E6AD7F-0F4D-4725-8034-16B16F8E2564}", L"SSS (*.hal; *.val; *.rd)", kBoth, L"ExportParsers", L"ImportParsers", L"SSS", L"hal", L"HAL Files (*.hal)|VAL Files (*.val)|RD Files (*.rd)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS}, kDistAny, kAngleNone, {V_ALIGNMENT_SUPPORT_ARCS}},
    {L"{47237487-43B6-421F-9BEA-2028B845DBEC}", L"TDS (*.rd5)", kBoth, L"ExportParsers", L"ImportParsers", L"RD5", L"rd5", L"RD5 Files (*.rd5)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS}, kDistAny, kAngleNone, {H_ALIGNMENT_DOESNT_SUPPORT_FIXED_AZ_FOR_ARCS}},
    {L"{D1140CBF-83D1-4015-BF5D-B5B16F13D416}", L"CLIP (*.PLT)", kBoth, L"ExportParsers", L"ImportParsers", L"PLT", L"PLT", L"PLT Files (*.PLT)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS}, kDistMeters, kAngleNone, {}},
    {L"{A0E74AB6-3961-4173-BA28-E539399EC4CC}", L"CLIP (*.ALZ)", kBoth, L"ExportParsers", L"ImportParsers", L"ALZ", L"ALZ", L"ALZ Files (*.ALZ)|", kRegularOnboard, kNoModes, {V_ALIGNMENTS}, kDistMeters, kAngleNone, {V_ALIGNMENT_SUPPORT_ARCS}},
    {L"{9266C996-F87D-46F5-A154-3FFE9C467DDF}", L"CLIP (*.TRV)", kBoth, L"ExportParsers", L"ImportParsers", L"TRV", L"TRV", L"TRV Files (*.TRV)|", kRegularOnboard, kNoModes, {X_SECTIONS}, kDistMeters, kAngleNone, {}},
    {L"{1C6B51CA-FC4D-4BC2-83C3-58FF64C2DAE0}", L"CLIP (*.PLT; *.ALZ; *.TRV)", kBoth, L"ExportParsers", L"ImportParsers", L"CLIP", L"PLT", L"PLT Files (*.PLT)|ALZ Files (*.ALZ)|TRV Files (*.TRV)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS}, kDistMeters, kAngleNone, {V_ALIGNMENT_SUPPORT_ARCS}},
    {L"{89708ADD-4125-4176-B142-DAA87EE44038}", L"INROADS (*.ASC)", kBoth, L"ExportParsers", L"ImportParsers", L"INROADS", L"ASC", L"ASC Files (*.ASC)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, ROADS}, kDistAny, kAngleNone, {H_ALIGNMENT_SUPPORT_COMPOUND_SPIRALS}},
    {L"{57FB4A34-15B1-4984-8077-BC1F59CAD739}", L"ISPOL (*.ALI)", kBoth, L"ExportParsers", L"ImportParsers", L"ALI", L"ALI", L"ALI Files (*.ALI)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS}, kDistMeters, kAngleNone, {}},
    {L"{13FAC885-9AA9-470D-9866-17E6D2D21684}", L"ISPOL (*.RAS)", kBoth, L"ExportParsers", L"ImportParsers", L"RAS", L"RAS", L"RAS Files (*.RAS)|", kRegularOnboard, kNoModes, {V_ALIGNMENTS}, kDistMeters, kAngleNone, {V_ALIGNMENT_SUPPORTS_ONLY_ARCS}},
    {L"{324F075A-A31E-41BC-BBF7-821E127AC99A}", L"ISPOL (*.SC1)", kBoth, L"ExportParsers", L"ImportParsers", L"SC1", L"SC1", L"SC1 Files (*.SC1)|", kRegularOnboard, kNoModes, {X_SECTIONS}, kDistMeters, kAngleNone, {XSECTIONS_SLOPES_ARE_STORED_SEPARATELY_IMP}},
    {L"{6BDB4CE4-58F0-4A74-84E5-37F241678E9D}", L"ISPOL (*.ALI; *.RAS; *.SC1)", kBoth, L"ExportParsers", L"ImportParsers", L"ISPOL", L"ALI", L"ALI Files (*.ALI)|RAS Files (*.RAS)|SC1 Files (*.SC1)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS}, kDistMeters, kAngleNone, {V_ALIGNMENT_SUPPORTS_ONLY_ARCS, XSECTIONS_SLOPES_ARE_STORED_SEPARATELY_IMP}},
    {L"{FF529444-68F3-40E1-A435-84BBA9823256}", L"Tekla (*.vgp)", kBoth, L"ExportParsers", L"ImportParsers", L"Tekla", L"vgp", L"VGP Files (*.vgp)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {}},
    {L"{D0D585FE-2D9C-43E5-8CA2-BE6A4AD6615C}", L"SurvCE (*.RW5)", kBoth, L"ExportParsers", L"ImportParsers", L"RW5", L"RW5", L"RW5 Files (*.RW5)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMetersFeet, kAngleNone, {TS_RAWDATA_EXP, GPS_RAWDATA_EXP, BS_POINT_MUST_EXIST}},
    {L"{268B466E-40F4-47CA-A46B-6E15E9A546D7}", L"TDS (*.RAW)", kImport, L"", L"ImportParsers", L"TDS RAW", L"RAW", L"RAW Files (*.RAW)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{C3D08200-B33A-4898-B890-4FC60701F174}", L"TDS (*.RAW)", kExport, L"ExportParsers", L"", L"TDS RAW", L"RAW", L"RAW Files (*.RAW)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMetersFeet, kAngleNone, {TS_RAWDATA_EXP, REDUCED_TS_RAW_DATA_IS_USED_EXP}},
    {L"{D5A4189C-177D-46EE-9D6A-C6C81F6FC31E}", L"Orvex Job (*.ojb)", kBoth, L"ExportParsers", L"ImportParsers", L"Orvex Job", L"ojb", L"Orvex Job Files (*.ojb)|", kAllConfigurations, kNoModes, {POINTS, CODES, LINES, AREAS, SURFACES, POINT_LISTS, LOCALIZATION, RAW_DATA, LAYER_STATES, MULTIPLE}, kDistAny, kAngleNone, {PHOTO_NOTES, DRAW_DATA_EXP, PREDEFINED_CODE_WITH_ATTRS_EXP, STORE_CONTROL_POINTS_IN_LOCALIZATION}},
    {L"{E94DD71D-593D-4D64-B0B8-F4CF0AFC54A7}", L"Orvex Project (*.oprj)", kBoth, L"ExportParsers", L"ImportParsers", L"Orvex Project", L"oprj", L"Orvex Project Files (*.oprj)|", kAllConfigurations, kNoModes, {POINTS, CODES, LINES, AREAS, POINT_LISTS, LAYER_STATES, MULTIPLE}, kDistAny, kAngleNone, {PHOTO_NOTES, DRAW_DATA_EXP}},
    {L"{4F91020D-09FA-44A4-B17E-FB8C979969F2}", L"Orvex Road (*.ord)", kBoth, L"ExportParsers", L"ImportParsers", L"Orvex Road", L"ord", L"Orvex Road Files (*.ord)|", kAllConfigurations, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROAD_STRINGS, ROADS, X_SECTION_TEMPLATES, STA_EQUATION_SETS}, kDistAny, kAngleNone, {XSECT_ROADS, V_ALIGNMENT_SUPPORT_ARCS, V_ALIGNMENT_SUPPORT_VERTICAL_ELEMENTS, H_ALIGNMENT_SUPPORT_COMPOUND_SPIRALS}},
    {L"{98D97139-900F-4090-9B9A-C3F1A5B64536}", L"Orvex Alignment (*.oal)", kBoth, L"ExportParsers", L"ImportParsers", L"Orvex Align", L"oal", L"Orvex Alignment Files (*.oal)|", kAllConfigurations, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, STA_EQUATION_SETS}, kDistAny, kAngleNone, {V_ALIGNMENT_SUPPORT_ARCS}},
    {L"{A974094D-561B-4F1C-AB9C-118FF7D17687}", L"Orvex Templates (*.otp)", kBoth, L"ExportParsers", L"ImportParsers", L"Orvex Templ", L"otp", L"Orvex Template Files (*.otp)|", kAllConfigurations, kNoModes, {X_SECTION_TEMPLATES}, kDistAny, kAngleNone, {}},
    {L"{7F234FF4-03BD-4512-8A1E-75FA15425FC4}", L"Orvex Code Library (*.ocl)", kBoth, L"ExportParsers", L"ImportParsers", L"Code Library", L"ocl", L"Orvex Code Library Files (*.ocl)|", kAllConfigurations, kNoModes, {CODES}, kDistNone, kAngleNone, {PREDEFINED_CODE_WITH_ATTRS_EXP}},
    {L"{190DD685-3424-4437-B1D2-A775447058F5}", L"Orvex Layers (*.oly)", kBoth, L"ExportParsers", L"ImportParsers", L"Layers", L"oly", L"Orvex Layer Files (*.oly)|", kAllConfigurations, kNoModes, {LAYER_STATES}, kDistNone, kAngleNone, {}},
    {L"{CAFBBC87-2D96-4C05-A2C1-C7F2F6BD5107}", L"Orvex Localization (*.olc)", kBoth, L"ExportParsers", L"ImportParsers", L"Localization", L"olc", L"Orvex Localization Files (*.olc)|", kAllConfigurations, kNoModes, {LOCALIZATION}, kDistNone, kAngleNone, {STORE_CONTROL_POINTS_IN_LOCALIZATION}},
    {L"{962FEB00-D3DB-40D0-A76A-E974E6D726F8}", L"MOSS Survey (*.txt)", kExport, L"ExportParsers", L"", L"MOSS", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {POINTS, ROAD_SURVEY}, kDistMetersFeet, kAngleNone, {SURVEY_FIND_STA_ROADS_EXP}},
    {L"{F41A9CD9-CAE3-4C37-B16E-934A5DDC5EBE}", L"Field Book (*.fbk)", kBoth, L"ExportParsers", L"ImportParsers", L"FBK", L"fbk", L"FBK Files (*.fbk)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMetersFeet, kAngleDms, {TS_RAWDATA_EXP, MANUAL_POINTS_WITH_RAW_DATA_EXP}},
    {L"{9ACD542C-9A68-4DB9-8CF7-5735ADBE8D4D}", L"Find Chainage/Station Report (*.txt)", kExport, L"ExportParsers", L"", L"Chainage", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {ROAD_SURVEY}, kDistMetersFeet, kAngleNone, {SURVEY_FIND_STA_ROADS_EXP}},
    {L"{D203A140-1926-450C-9B39-D231FC3AE86E}", L"SSS (*.xtl)", kBoth, L"ExportParsers", L"ImportParsers", L"XTL", L"xtl", L"XTL Files (*.xtl)|", kRegularOnboard, kNoModes, {X_SECTIONS}, kDistAny, kAngleNone, {}},
    {L"{AAFDB8C0-4CEA-4ADB-9CA3-71C474DCEEC5}", L"TDS (*.tp5)", kBoth, L"ExportParsers", L"ImportParsers", L"TP5", L"tp5", L"TP5 Files (*.tp5)|", kRegularOnboard, kNoModes, {X_SECTION_TEMPLATES}, kDistAny, kAngleNone, {}},
    {L"{C8C71830-5DD4-46C6-BF47-30E54D36EBB4}", L"Trimble DC (*.dc)", kImport, L"", L"ImportParsers", L"DC", L"dc", L"DC Files (*.dc)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{C28340E5-29DB-4F31-A9EE-0885BD1C377D}", L"NEZ (*.csv)", kBoth, L"ExportParsers", L"ImportParsers", L"NEZ", L"csv", L"CSV Files (*.csv)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {}},
    {L"{D5869690-A38F-4817-B1E0-D56A324C4913}", L"NEZ w/strings (*.csv)", kBoth, L"ExportParsers", L"ImportParsers", L"NEZ Strings", L"csv", L"CSV Files (*.csv)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS}, kDistAny, kAngleNone, {CODE_STRING_POINTS_ARRAY_EXP}},
    {L"{8AB2AD31-D5BF-4F40-8C1A-2BD0BDB2557D}", L"DBF (*.dbf)", kBoth, L"SHPParser", L"SHPParser", L"DBF", L"dbf", L"DBF Files (*.dbf)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_USE_DESCRIPTION_AS_ATTR_EXP}},
    {L"{5159352C-71F1-488E-9284-DEC130A7F93A}", L"CMM (*.cor)", kBoth, L"ExportParsers", L"ImportParsers", L"CMM", L"cor", L"COR Files (*.cor)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {}},
    {L"{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}", L"CSV (Comma delimited) (.csv)", kExport, L"ExportParsers", L"", L"CSV", L"csv", L"CSV Files (*.csv)|", kAllConfigurations, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_HAVE_ATTR_VALUES_IN_QUOTES_EXP}},
    {L"{21C0DB70-1373-44C2-80C4-28F83891A881}", L"Text report (*.txt)", kExport, L"ExportParsers", L"", L"Report", L"txt", L"Text Files (*.txt)|", kAllConfigurations, kNoModes, {POINTS, RAW_DATA, FIELD_REPORTS}, kDistAny, kAngleDecDeg, {}},
    {L"{9C0D054C-D426-466F-ABBE-D2A5B1DC23FA}", L"Autodesk (*.las)", kExport, L"ExportParsers", L"", L"LAS", L"las", L"LAS Files (*.las)|", kRegularOnboard, kNoModes, {POINTS, SCANNING_DATA}, kDistAny, kAngleNone, {}},
    {L"{DCFE6972-D3AE-4060-ABAF-2CAB78C341BB}", L"MMH360 (*.360)", kBoth, L"ExportParsers", L"ImportParsers", L"MMH360", L"360", L"360 Files (*.360)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistMeters, kAngleNone, {}},
    {L"{2F2044E6-9F05-4CB0-9BBD-FB1068E6FE5B}", L"MML-ETRS (*.mml)", kBoth, L"ExportParsers", L"ImportParsers", L"MML", L"mml", L"MML Files (*.mml)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistMeters, kAngleNone, {CS_IS_STORED_IN_THE_FILE}},
    {L"{F67D9674-BCDB-4C97-9923-2667818B781F}", L"KOF (*.kof)", kExport, L"ExportParsers", L"", L"KOF", L"kof", L"KOF Files (*.kof)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMeters, kAngleLandXml, {TS_RAWDATA_EXP}},
    {L"{D2D888B5-8014-45AE-8732-B637A2EA39A3}", L"KOF (*.kof)", kBoth, L"ExportParsers", L"ImportParsers", L"KOF", L"kof", L"KOF Files (*.kof)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistMeters, kAngleNone, {}},
    {L"{62CC1D3E-3BCD-4D3B-8BE3-478BE898D60A}", L"GNSS Raw Report (*.txt)", kExport, L"ExportParsers", L"", L"GNSS Raw", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {RAW_DATA}, kDistMetersFeet, kAngleNone, {GPS_RAWDATA_EXP, XYZ_COORDS_IN_GPS_RAW_DATA_EXP, NEZ_COV_MATRIX_IN_GPS_RAW_DATA_EXP, ARP_HEIGHT_IS_USED_IN_GPS_RAW_DATA_EXP}},
    {L"{0C9E9EB7-921C-4B9C-A7DB-DEEFC3BAEC69}", L"APA (*.ZK)", kBoth, L"ExportParsers", L"ImportParsers", L"APA", L"ZK", L"ZK Files (*.ZK)|", kAllConfigurations, kExportInJapan, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{721C5F47-E17C-4DAC-8D71-BEEA6E4A3208}", L"APA-SIMA (*.O2K)", kBoth, L"ExportParsers", L"ImportParsers", L"APA-SIMA", L"O2K", L"O2K Files (*.O2K)|", kAllConfigurations, kExportInJapan, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{D89E8B16-B6BC-4EAD-86A6-742DD336E02B}", L"CSV w/codes (*.csv)", kExport, L"ExportParsers", L"", L"CSV Codes", L"csv", L"CSV Files (*.csv)|", kAllConfigurations, kNoModes, {POINTS, CODES, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_ADD_ATTR_TYPE_TO_ATTR_EXP, ABILITY_TO_HAVE_ATTR_VALUES_IN_QUOTES_EXP}},
    {L"{C75FB268-FB39-4C95-822A-5F444FCA6715}", L"CSV (*.csv)", kBoth, L"ExportParsers", L"ImportParsers", L"CSV", L"csv", L"CSV Files (*.csv)|", kAllConfigurations, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {}},
    {L"{166BBC13-368F-4A88-B4E2-A0E290C71EB6}", L"SIMA (*.SIM)", kBoth, L"ExportParsers", L"ImportParsers", L"SIMA", L"SIM", L"SIM Files (*.SIM)|", kAllConfigurations, kExportInJapan, {POINTS, LINES, AREAS, POINT_LISTS, MULTIPLE}, kDistMeters, kAngleNone, {}},
    {L"{4178BF11-7D04-4309-937A-BFDEDAF5399B}", L"SIMA Index (*.SIM)", kExport, L"ExportParsers", L"", L"SIMA Index", L"SIM", L"SIM Files (*.SIM)|", kAllConfigurations, kExportInJapan, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{2A0E89E3-86D6-4666-91F3-99C75E9B0D0F}", L"Berlin GNSS-Mittelwerte (*.txt)", kExport, L"ExportParsers", L"", L"Berlin GNSS", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMeters, kAngleNone, {GPS_RAWDATA_EXP}},
    {L"{F3453D8C-8B7C-433A-A1B5-EFFBD97DF192}", L"MMH360_Z000 (*.360)", kExport, L"ExportParsers", L"", L"Z000", L"360", L"360 Files (*.360)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{067A719D-83A4-4FC3-BA45-38BD6773CA65}", L"D40 (*.D40)", kBoth, L"ExportParsers", L"ImportParsers", L"D40", L"D40", L"D40 Files (*.D40)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMeters, kAngleNone, {}},
    {L"{0F28748B-8FC9-40B3-BD53-E2E8A97FFDCB}", L"Vyn Machine Surface (*.vms)", kBoth, L"VynMachineParsers", L"VynMachineParsers", L"MC Surface", L"vms", L"Vyn Machine Surface Files (*.vms)|", kRegularOnboard, kNoModes, {SURFACES}, kDistAny, kAngleNone, {}},
    {L"{B37EE0D9-6166-450C-80D1-B144FE3AA37E}", L"Vyn Machine Linework (*.vml)", kBoth, L"VynMachineParsers", L"VynMachineParsers", L"MC Lines", L"vml", L"Vyn Machine Linework Files (*.vml)|", kRegularOnboard, kNoModes, {LINES, AREAS}, kDistAny, kAngleNone, {ARCS_IN_LINEWORK}},
    {L"{EF0FD643-22F9-4ABB-8C73-1000AED2C277}", L"Vyn Machine Points (*.vmp)", kBoth, L"VynMachineParsers", L"VynMachineParsers", L"MC Points", L"vmp", L"Vyn Machine Point Files (*.vmp)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {}},
    {L"{DD8A4124-AE3E-462C-98A3-64F301B1FCD1}", L"Vyn Machine Alignment (*.vma)", kBoth, L"VynMachineParsers", L"VynMachineParsers", L"MC Align", L"vma", L"Vyn Machine Alignment Files (*.vma)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS}, kDistAny, kAngleNone, {}},
    {L"{D12D2F91-3EA1-4446-AF76-58F977CF417E}", L"Vyn Machine Road (*.vmr)", kBoth, L"VynMachineParsers", L"VynMachineParsers", L"MC Road", L"vmr", L"Vyn Machine Road Files (*.vmr)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS}, kDistAny, kAngleNone, {XSECT_ROADS}},
    {L"{1F012F64-C389-4ECD-9AE8-0618EAADD1A9}", L"Vyn Machine Project (*.vmj)", kBoth, L"VynMachineParsers", L"VynMachineParsers", L"MC Project", L"vmj", L"Vyn Machine Project Files (*.vmj)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, ROADS, MULTIPLE}, kDistAny, kAngleNone, {MULTIPLE_FILES_EXP}},
    {L"{E6CE29B4-755B-4666-8B70-FB8B5E110C16}", L"Vyn Machine Zones (*.vmz)", kBoth, L"VynMachineParsers", L"VynMachineParsers", L"MC Zones", L"vmz", L"Vyn Machine Zone Files (*.vmz)|", kRegularOnboard, kNoModes, {AREAS, LAYER_STATES}, kDistAny, kAngleNone, {}},
    {L"{CB717EAE-DEC6-4AC9-B4DC-F2D5775B4078}", L"Microstation 95/ISFF (*.dgn)", kImport, L"", L"DGN_ISFFParser", L"DGN 95", L"dgn", L"Microstation 95/ISFF (*.dgn)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistNone, kAngleNone, {}},
    {L"{0E8F90BD-02F9-4354-872F-3ABBB667C1D6}", L"Bentley infrastructure model (*.icm.dgn)", kExport, L"TeighaDGNParser", L"", L"ICM", L"icm.dgn", L"Bentley Infrastructure Model (*.icm.dgn)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, ROADS, MULTIPLE}, kDistAny, kAngleNone, {DRAW_DATA_EXP}},
    {L"{E36F6CFB-810B-41E0-B382-0C5FD68D3892}", L"Bentley mobile imodel (*.idgndb)", kExport, L"TeighaDGNParser", L"", L"iModel", L"idgndb", L"Bentley Mobile iModel (*.idgndb)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, MULTIPLE}, kDistAny, kAngleNone, {DRAW_DATA_EXP}},
    {L"{9176346E-E993-4B26-B66F-46810BD253C7}", L"Bentley compressed mobile imodel (*.imodel)", kExport, L"TeighaDGNParser", L"", L"iModel Z", L"imodel", L"Bentley Compressed iModel (*.imodel)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, MULTIPLE}, kDistAny, kAngleNone, {DRAW_DATA_EXP}},
    {L"{BA73BA62-6C0D-47D1-9C34-DE82AC950D79}", L"MicroStation V8 (*.dgn)", kBoth, L"TeighaDGNParser", L"TeighaDGNParser", L"DGN V8", L"dgn", L"MicroStation V8 (*.dgn)|", kAllConfigurations, kNoModes, {POINTS, LINES, AREAS, SURFACES, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {DRAW_DATA_EXP, ARCS_IN_LINEWORK}},
    {L"{E7523D29-10FA-41A0-86FF-9AFF01C70BA4}", L"MX GENIO (*.txt; *.gen)", kBoth, L"ExportParsers", L"ImportParsers", L"MX GENIO", L"txt", L"Text Files (*.txt)|GEN Files (*.gen)|", kRegularOnboard, kNoModes, {POINTS, LINES, ROAD_STRINGS, ROADS}, kDistMeters, kAngleNone, {}},
    {L"{3DF09E3F-F637-4A57-9F05-ADBD66E28081}", L"Custom (*.cxs)", kBoth, L"ExportParsers", L"ImportParsers", L"Custom XS", L"cxs", L"CXS Files (*.cxs)|", kRegularOnboard, kNoModes, {X_SECTIONS}, kDistAny, kAngleNone, {CUSTOM_FIELDS}},
    {L"{DCB81F6B-9178-4200-8623-9A700ED47491}", L"SBG (*.LIN)", kBoth, L"ExportParsers", L"ImportParsers", L"SBG", L"LIN", L"LIN Files (*.LIN)|", kRegularOnboard, kNoModes, {LINES}, kDistMeters, kAngleNone, {}},
    {L"{5FF33F00-98C1-4835-B9D4-5F3B0549FBE2}", L"SBG Pxy (*.PXY)", kBoth, L"ExportParsers", L"ImportParsers", L"SBG Pxy", L"PXY", L"PXY Files (*.PXY)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{61E213BA-BB35-4599-88A7-21942FFC12C9}", L"SBG Geo (*.Geo)", kBoth, L"ExportParsers", L"ImportParsers", L"SBG Geo", L"Geo", L"GEO Files (*.Geo)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{10E9A151-B93E-4967-86D7-F16CD3155849}", L"Carlson (*.loc)", kBoth, L"ExportParsers", L"ImportParsers", L"Carlson LOC", L"loc", L"LOC Files (*.loc)|", kRegularOnboard, kNoModes, {LOCALIZATION}, kDistNone, kAngleNone, {}},
    {L"{04CE577C-3E66-4F7F-9577-7B1A5B40194F}", L"GeoPAK (*.gen)", kBoth, L"ExportParsers", L"ImportParsers", L"GeoPAK", L"gen", L"GEN Files (*.gen)|", kRegularOnboard, kNoModes, {H_ALIGNMENTS, V_ALIGNMENTS}, kDistMetersFeet, kAngleNone, {}},
    {L"{EE977565-1B0F-45AF-9948-779FF7D6DF53}", L"Carlson (*.FCL)", kBoth, L"ExportParsers", L"ImportParsers", L"Carlson FCL", L"FCL", L"FCL Files (*.FCL)|", kRegularOnboard, kNoModes, {CODES}, kDistNone, kAngleNone, {}},
    {L"{6C6745EC-E20D-4CEA-A8A6-38113C5F60BF}", L"Orvex Stakeout Report (*.html)", kExport, L"ExportParsers", L"", L"Stake Report", L"html", L"HTML Files (*.html)|", kAllConfigurations, kNoModes, {STAKE_REPORTS}, kDistAny, kAngleNone, {STAKEOUT_POINTS_FOR_REPORTS_EXP, STAKEOUT_TOLERANCE_FILTER}},
    {L"{0B407DCF-E3D5-4CF2-9591-3E81D6326B2D}", L"Orvex Field Report (*.html)", kExport, L"ExportParsers", L"", L"Field Report", L"html", L"HTML Files (*.html)|", kAllConfigurations, kNoModes, {FIELD_REPORTS}, kDistAny, kAngleNone, {}},
    {L"{DB68F797-2A09-4323-8CBE-628AA6E0D1BE}", L"Orvex Job History (*.ojh)", kExport, L"ExportParsers", L"", L"Job History", L"ojh", L"Orvex Job History Files (*.ojh)|", kRegularOnboard, kNoModes, {JOB_HISTORY}, kDistNone, kAngleNone, {}},
    {L"{4E7147F2-5515-42BB-8DD5-DD9105C6CA71}", L"Orvex Road Survey (*.ors)", kExport, L"ExportParsers", L"", L"Road Survey", L"ors", L"Orvex Road Survey Files (*.ors)|", kRegularOnboard, kNoModes, {ROAD_SURVEY}, kDistAny, kAngleNone, {SURVEY_FIND_STA_ROADS_EXP}},
    {L"{DC60F3DB-CFDB-4EBE-BADA-45D1DA1780E3}", L"Orvex Scan Session (*.oss)", kBoth, L"ExportParsers", L"ImportParsers", L"Scan Session", L"oss", L"Orvex Scan Files (*.oss)|", kRegularOnboard, kNoModes, {SCANNING_DATA}, kDistNone, kAngleNone, {}},
    {L"{2EF095B0-6695-483A-B51D-46A17CC5F4B0}", L"Orvex Surface (*.osf)", kBoth, L"ExportParsers", L"ImportParsers", L"Orvex Surface", L"osf", L"Orvex Surface Files (*.osf)|", kAllConfigurations, kNoModes, {SURFACES}, kDistAny, kAngleNone, {}},
    {L"{7C452130-C82B-4FB6-9C90-DA22CDF26914}", L"Orvex Station Equations (*.oeq)", kBoth, L"ExportParsers", L"ImportParsers", L"Sta Equations", L"oeq", L"Orvex Equation Files (*.oeq)|", kRegularOnboard, kNoModes, {STA_EQUATION_SETS}, kDistAny, kAngleNone, {}},
    {L"{A43377F3-2047-4A39-A4F0-7C1AD8AA957C}", L"Orvex Raw Data (*.orw)", kBoth, L"ExportParsers", L"ImportParsers", L"Orvex Raw", L"orw", L"Orvex Raw Files (*.orw)|", kAllConfigurations, kNoModes, {POINTS, RAW_DATA}, kDistAny, kAngleNone, {TS_RAWDATA_EXP, GPS_RAWDATA_EXP, DL_RAWDATA_EXP, RAW_POINTS_ARE_USED_EXP}},
    {L"{342C4438-7A19-43AD-96BD-6177FAF441B0}", L"CSV Report (*.CSV)", kExport, L"ExportParsers", L"", L"CSV Report", L"CSV", L"CSV Files (*.CSV)|", kRegularOnboard, kNoModes, {POINTS, FIELD_REPORTS}, kDistAny, kAngleNone, {}},
    {L"{EB55FCE1-4E12-4CBB-BF79-99758F1B7701}", L"Belgian Cadastre (*.txt)", kExport, L"ExportParsers", L"", L"BE Cadastre", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMeters, kAngleGons, {TS_RAWDATA_EXP}},
    {L"{D29B971C-8C74-4CF0-9429-6B77225084DA}", L"GSI8 (*.gsi)", kBoth, L"ExportParsers", L"ImportParsers", L"GSI8", L"gsi", L"GSI Files (*.gsi)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMetersFeet, kAngleNone, {}},
    {L"{A3D1B6CC-AAC9-4DE1-8AF3-91D1B5583B3B}", L"GSI16 (*.gsi)", kBoth, L"ExportParsers", L"ImportParsers", L"GSI16", L"gsi", L"GSI Files (*.gsi)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMetersFeet, kAngleNone, {}},
    {L"{417AFC8F-091D-4EDC-AFBB-D43D9A28DB9E}", L"Finland Profila (*.txt)", kExport, L"ExportParsers", L"", L"Profila", L"txt", L"Text Files (*.txt)|", kRegularOnboard, kNoModes, {X_SECTIONS}, kDistMeters, kAngleNone, {}},
    {L"{911E1E2F-E9F2-4A24-BD1F-51C10DC31DA5}", L"Neu (*.neu)", kBoth, L"ExportParsers", L"ImportParsers", L"NEU", L"neu", L"NEU Files (*.neu)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {}},
    {L"{475DE52E-6D40-40D7-8FAB-F41676AA6E7A}", L"12d ASCII (*.12da)", kImport, L"", L"12DAParser", L"12da", L"12da", L"12d ASCII Files (*.12da)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, ROAD_STRINGS, POINT_LISTS, MULTIPLE}, kDistNone, kAngleNone, {}},
    {L"{475DE52E-6D40-40D7-8FAB-F41676AA6E7A}", L"12d ASCII (*.12da)", kExport, L"12DAParser", L"", L"12da", L"12da", L"12d ASCII Files (*.12da)|", kRegularOnboard, kNoModes, {POINTS, LINES, SURFACES, ROAD_STRINGS, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {ARCS_IN_LINEWORK}},
    {L"{502D1DDB-59DC-489E-85D7-C36785C5F1AA}", L"Grontmij (*.dat)", kBoth, L"ExportParsers", L"ImportParsers", L"Grontmij", L"dat", L"DAT Files (*.dat)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMeters, kAngleGons, {}},
    {L"{C07CBCA8-316E-41C3-9839-91B976161F9F}", L"Star*Net (*.dat)", kBoth, L"ExportParsers", L"ImportParsers", L"Star*Net", L"dat", L"DAT Files (*.dat)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistMetersFeet, kAngleNone, {TS_RAWDATA_EXP, GPS_RAWDATA_EXP}},
    {L"{452578D4-E534-4FA1-80E0-0504850C4F5A}", L"PDF (*.pdf)", kExport, L"ExportParsers", L"", L"PDF", L"pdf", L"PDF Files (*.pdf)|", kAllConfigurations, kNoModes, {STAKE_REPORTS}, kDistAny, kAngleNone, {STAKEOUT_POINTS_FOR_REPORTS_EXP}},
    {L"{90BD9327-1663-452F-8AA0-EC5EB72672D1}", L"PDF (*.pdf)", kExport, L"ExportParsers", L"", L"PDF", L"pdf", L"PDF Files (*.pdf)|", kAllConfigurations, kNoModes, {FIELD_REPORTS}, kDistAny, kAngleNone, {}},
    {L"{9C18082E-8883-4C8A-984D-31C325C09030}", L"PDF (*.pdf)", kExport, L"ExportParsers", L"", L"PDF", L"pdf", L"PDF Files (*.pdf)|", kAllConfigurations, kNoModes, {JOB_HISTORY}, kDistNone, kAngleNone, {}},
    {L"{A370D71D-915D-47C5-801C-E251BE6A75BC}", L"CPIXML (*.cpixml)", kImport, L"", L"CPIXMLParser", L"CPIXML", L"cpixml", L"CPIXML Files (*.cpixml)|", kRegularOnboard, kNoModes, {POINTS, SCANNING_DATA}, kDistNone, kAngleNone, {}},
    {L"{5E0668F2-4AEA-4489-83F8-FF17A2A2D7FC}", L"Vyn Custom CSV (*.csv)", kBoth, L"ExportParsers", L"ImportParsers", L"Custom CSV", L"csv", L"CSV Files (*.csv)|", kAllConfigurations, kNoModes, {POINTS, CODES, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_HAVE_ATTR_VALUES_IN_QUOTES_EXP, CUSTOM_FIELDS}},
    {L"{DFC67FED-4B6C-400D-9EED-20855E6C611F}", L"Vyn Code List (*.vcd)", kBoth, L"ExportParsers", L"ImportParsers", L"Code List", L"vcd", L"Vyn Code List Files (*.vcd)|", kAllConfigurations, kNoModes, {CODES}, kDistNone, kAngleNone, {PREDEFINED_CODE_WITH_ATTRS_EXP}},
    {L"{CDAF2D9F-F515-4B61-B574-F846EEEFFA37}", L"Vyn Binary Exchange (*.vbx)", kBoth, L"ExportParsers", L"ImportParsers", L"Binary", L"vbx", L"Vyn Binary Exchange Files (*.vbx)|", kAllConfigurations, kNoModes, {POINTS, LINES, AREAS, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {}},
    {L"{1269DF91-869B-4CA8-9DC3-3BCF2602128B}", L"Vyn Instrument Codes (*.vic)", kBoth, L"ExportParsers", L"ImportParsers", L"Instr Codes", L"vic", L"Vyn Instrument Code Files (*.vic)|", kRegularOnboard, kNoModes, {CODES}, kDistNone, kAngleNone, {ABILITY_TO_USE_CONTROL_CODES_AS_NOTES_EXP}},
    {L"{92246150-9B6C-4F15-B6A3-FD2A8C937DBD}", L"Vyn Total Station Coordinates (*.vtc)", kBoth, L"ExportParsers", L"ImportParsers", L"TS Coords", L"vtc", L"Vyn TS Coordinate Files (*.vtc)|", kAllConfigurations, kNoModes, {POINTS, POINT_LISTS}, kDistMetersFeet, kAngleNone, {}},
    {L"{B924926E-73F9-466E-93AD-7289B73784EC}", L"Vyn GNSS Receiver Points (*.vgn)", kBoth, L"ExportParsers", L"ImportParsers", L"GNSS Points", L"vgn", L"Vyn GNSS Point Files (*.vgn)|", kAllConfigurations, kNoModes, {POINTS, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_STORE_GPS_POINTS_AS_MANUAL_EXP, COORDS_IN_DISPLAY_CS_IN_GPS_POSITIONS_EXP}},
    {L"{85FBF63B-59FD-40D3-8192-7AFC8160DE91}", L"Vyn GNSS Raw (*.vgw)", kImport, L"", L"ImportParsers", L"GNSS Raw", L"vgw", L"Vyn GNSS Raw Files (*.vgw)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{7D9C1D73-3D7B-40BD-8E99-999530952319}", L"Vyn Level Points (*.vlp)", kBoth, L"ExportParsers", L"ImportParsers", L"Level Points", L"vlp", L"Vyn Level Point Files (*.vlp)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistMetersFeet, kAngleNone, {DL_RAWDATA_EXP}},
    {L"{9CA6203B-A6BE-400F-AD1E-67B1728EB3B8}", L"Orvex Point List (*.opl)", kBoth, L"ExportParsers", L"ImportParsers", L"Point List", L"opl", L"Orvex Point List Files (*.opl)|", kAllConfigurations, kNoModes, {POINT_LISTS}, kDistNone, kAngleNone, {POINTS_IN_ALPHABETICAL_ORDER_EXP}},
    {L"{9ABFDAAC-6419-491A-9927-88DD309597DD}", L"Orvex Design Points (*.odp)", kBoth, L"ExportParsers", L"ImportParsers", L"Design Points", L"odp", L"Orvex Design Point Files (*.odp)|", kAllConfigurations, kNoModes, {POINTS, CODES, POINT_LISTS}, kDistAny, kAngleNone, {ABILITY_TO_DEFINE_ATTRIBUTES_USING_EXP, ABILITY_TO_APPEND_TO_EXISTED_FILE_EXP}},
    {L"{8D5D889D-5015-4DE4-8025-55B8C24FD79B}", L"Vyn Grid Text (*.vgt)", kBoth, L"ExportParsers", L"ImportParsers", L"Grid Text", L"vgt", L"Vyn Grid Text Files (*.vgt)|", kAllConfigurations, kExportInJapan, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{3F4938CB-5A21-424F-8C5C-42F5EA6FC2B7}", L"Vyn Grid Areas (*.vga)", kBoth, L"ExportParsers", L"ImportParsers", L"Grid Areas", L"vga", L"Vyn Grid Area Files (*.vga)|", kAllConfigurations, kExportInJapan, {POINTS, AREAS}, kDistMeters, kAngleNone, {MULTIPLE_STAION_POINTS}},
    {L"{3BE045D8-B83A-4485-8995-E31199114FAD}", L"Vyn Grid Points (*.vgq)", kBoth, L"ExportParsers", L"ImportParsers", L"Grid Points", L"vgq", L"Vyn Grid Point Files (*.vgq)|", kOnboardJapan, kExportInJapan, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{A43DE9FB-EAD4-4B48-8ED6-EEFB143D7337}", L"Vyn Grid Lines (*.vgl)", kBoth, L"ExportParsers", L"ImportParsers", L"Grid Lines", L"vgl", L"Vyn Grid Line Files (*.vgl)|", kOnboardJapan, kExportInJapan, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistMeters, kAngleNone, {}},
    {L"{E0741189-3E5C-4E6E-BB76-D4663310C8B6}", L"Vyn Grid Stakeout (*.vgs)", kExport, L"ExportParsers", L"", L"Grid Stake", L"vgs", L"Vyn Grid Stakeout Files (*.vgs)|", kOnboardJapan, kExportInJapan, {STAKE_REPORTS}, kDistMeters, kAngleNone, {STAKEOUT_POINTS_FOR_REPORTS_EXP}},
    {L"{5778087A-0F51-4D8E-8ADC-453989C9DF6F}", L"Vyn Grid Raw (*.vgr)", kExport, L"ExportParsers", L"", L"Grid Raw", L"vgr", L"Vyn Grid Raw Files (*.vgr)|", kOnboardJapan, kExportInJapan, {RAW_DATA}, kDistMeters, kAngleDms, {TS_RAWDATA_EXP}},
    {L"{8C454702-786E-4FAD-B2C9-2BF4DF141593}", L"Vyn Grid Road (*.vgd)", kBoth, L"ExportParsers", L"ImportParsers", L"Grid Road", L"vgd", L"Vyn Grid Road Files (*.vgd)|", kOnboardJapan, kExportInJapan, {H_ALIGNMENTS, V_ALIGNMENTS, X_SECTIONS, ROADS}, kDistMeters, kAngleNone, {}},
    {L"{D66071B7-225E-4FCD-A75A-586F48137A69}", L"Vyn Plot Text (*.vpt)", kExport, L"ExportParsers", L"", L"Plot Text", L"vpt", L"Vyn Plot Files (*.vpt)|", kAllConfigurations, kExportInJapan, {POINTS, POINT_LISTS}, kDistMeters, kAngleNone, {}},
    {L"{C0A7A4ED-0134-43B0-8681-ECBBB08D2536}", L"Vyn Office Exchange (*.vox)", kBoth, L"ExportParsers", L"ImportParsers", L"Office", L"vox", L"Vyn Office Exchange Files (*.vox)|", kRegularOnly, kNoModes, {POINTS, CODES, LINES, AREAS, SURFACES, POINT_LISTS, RAW_DATA, MULTIPLE}, kDistAny, kAngleNone, {PHOTO_NOTES, DRAW_DATA_EXP, CAST_COORDS_TO_WGS_AND_EXPORT_ORIGINAL_POINT}},
    {L"{6528BF9B-2781-4C9A-B49E-09A9C54C68B8}", L"Vyn Archive Exchange (*.vae)", kBoth, L"ExportParsers", L"ImportParsers", L"Archive", L"vae", L"Vyn Archive Files (*.vae)|", kNoConfiguration, kNoModes, {POINTS, LINES, AREAS, POINT_LISTS, MULTIPLE}, kDistAny, kAngleNone, {}},
    {L"{89B8E8DB-3E57-4AAC-A552-B6539A2E6E07}", L"Civilcad 5 ASCII Dump Files (*.as5)", kImport, L"", L"ImportParsers", L"AS5", L"as5", L"Civilcad 5 ASCII Dump Files (*.as5)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistNone, kAngleNone, {}},
    {L"{3F12EC8A-7526-4F0D-AF33-C5C65ACC4F16}", L"Civilcad 4 Job Files (*.laz)", kImport, L"", L"ImportParsers", L"LAZ", L"laz", L"Civilcad 4 Job Files (*.laz)|", kRegularOnboard, kNoModes, {POINTS, POINT_LISTS}, kDistNone, kAngleNone, {}},
    {L"{B91FEF1F-8EBB-4C45-821F-80DED21CC638}", L"Civilcad 4 ASCII Dump Files (*.asc)", kImport, L"", L"ImportParsers", L"ASC", L"asc", L"Civilcad 4 ASCII Dump Files (*.asc)|", kRegularOnboard, kNoModes, {POINTS, LINES, POINT_LISTS, MULTIPLE}, kDistNone, kAngleNone, {}},
    {L"{44B85AD7-DF9A-422D-B9C0-BDC2DE9D6171}", L"Geocomp Files (*.str)", kImport, L"", L"ImportParsers", L"STR", L"str", L"Geocomp Files (*.str)|", kRegularOnboard, kNoModes, {POINTS, LINES}, kDistNone, kAngleNone, {}},
    {L"{049275B4-48C1-4DF5-8E30-A983234CD5FF}", L"Hayes Data Files (*.dat)", kImport, L"", L"ImportParsers", L"Hayes", L"dat", L"Hayes Data Files (*.dat)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{FA53CFFB-23D7-4FEA-8F1A-BD593A52661D}", L"Reb Files (*.001; *.*45; *.*58; *.reb; *.040; *.d40; *.*21; *.*66)", kImport, L"", L"ImportParsers", L"Reb", L"reb", L"Reb Files (*.001;*.*45;*.*58;*.reb;*.040;*.d40;*.*21;*.*66)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{65FF3923-865D-4CC0-BC7E-8699E31BE4DC}", L"Nikon AP800 Files (*.ap8; *.raw)", kImport, L"", L"ImportParsers", L"AP800", L"ap8", L"Nikon AP800 Files (*.ap8;*.raw)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{69E26F6E-F20D-40A4-AF96-7F5970F529A1}", L"Wild GRE4 Files (*.gre)", kImport, L"", L"ImportParsers", L"GRE4", L"gre", L"Wild GRE4 Files (*.gre)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{A88981DF-38CE-42EB-AFB2-AC245636DBB6}", L"GENIO Files (*.gen; *.crd; *.inp)", kImport, L"", L"ImportParsers", L"GENIO", L"gen", L"GENIO Files (*.gen;*.crd;*.inp)|", kRegularOnboard, kNoModes, {POINTS, LINES, ROAD_STRINGS}, kDistNone, kAngleNone, {}},
    {L"{E88BDDCD-3B0F-4463-9FCF-A189E84A71DC}", L"Leica GSI Files (*.gsi)", kImport, L"", L"ImportParsers", L"Leica GSI", L"gsi", L"Leica GSI Files (*.gsi)|", kRegularOnboard, kNoModes, {POINTS, RAW_DATA}, kDistNone, kAngleNone, {}},
    {L"{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}", L"Customizable ASCII Point Files (*.pts; *.asc; *.xyz; *.csv; *.txt; *.ctf)", kImport, L"", L"ImportParsers", L"ASCII Points", L"pts", L"Customizable ASCII Point Files (*.pts;*.asc;*.xyz;*.csv;*.txt;*.ctf)|", kRegularOnboard, kNoModes, {POINTS, CODES, POINT_LISTS}, kDistNone, kAngleNone, {CUSTOM_FIELDS}},
};
// clang-format on

}  // namespace

std::span<const BuiltInDataTypeRow> builtInDataTypeRows() {
  return kDataTypeRows;
}

std::span<const BuiltInFormatRow> builtInFormatRows() {
  return kFormatRows;
}

}  // namespace vyn::ie::detail
