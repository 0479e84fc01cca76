#pragma once

#include <string_view>

#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"
#include "ieObjects/IEObjectsType.h"
#include "ieUtils/IEUtilsUnits.h"

// The words, numbers and limits of LandXML that the reader and the writer share: element and attribute
// names, the unit words and what they mean, state and breakline words, and the plug-in's remarks.
// Names are compared as written in the file after any namespace prefix ("lx:CgPoint" is CgPoint).
namespace vyn::ie::landxml {

// "LandXML (*.xml)" of the registry.
inline constexpr const wchar_t* kFormatId = L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}";
bool isLandXmlFormat(const DexFormat* format);

// ---- Results -----------------------------------------------------------------------------------
// Remarks of an import, each a success (above 0) a host must not take for a plain DEX_RESULT_OK; when
// several apply, the highest (the most serious) is answered. Every cause is traced, counted by kind.
//  - kResultNotHeld: elements or attributes the model cannot hold were counted and read over;
//  - kResultMalformedSkipped: malformed parts were skipped or read with a stated assumption (a number
//    text with too few, too many or non-numeric values, a face naming a missing point, a curve of zero
//    radius read as its chord, a reference to a missing point, an unknown unit word);
//  - kResultTruncated: the document broke off (malformed XML or no closing root tag); what was read
//    before the break is kept.
inline constexpr EDexResult kResultNotHeld = static_cast<EDexResult>(23);
inline constexpr EDexResult kResultMalformedSkipped = static_cast<EDexResult>(24);
inline constexpr EDexResult kResultTruncated = static_cast<EDexResult>(25);

// ---- Elements --------------------------------------------------------------------------------
namespace element {
inline constexpr std::wstring_view kLandXml = L"LandXML";
inline constexpr std::wstring_view kUnits = L"Units";
inline constexpr std::wstring_view kMetric = L"Metric";
inline constexpr std::wstring_view kImperial = L"Imperial";
inline constexpr std::wstring_view kApplication = L"Application";
inline constexpr std::wstring_view kCgPoints = L"CgPoints";
inline constexpr std::wstring_view kCgPoint = L"CgPoint";
inline constexpr std::wstring_view kPlanFeatures = L"PlanFeatures";
inline constexpr std::wstring_view kPlanFeature = L"PlanFeature";
inline constexpr std::wstring_view kCoordGeom = L"CoordGeom";
inline constexpr std::wstring_view kLine = L"Line";
inline constexpr std::wstring_view kCurve = L"Curve";
inline constexpr std::wstring_view kSpiral = L"Spiral";
inline constexpr std::wstring_view kIrregularLine = L"IrregularLine";
inline constexpr std::wstring_view kChain = L"Chain";
inline constexpr std::wstring_view kStart = L"Start";
inline constexpr std::wstring_view kEnd = L"End";
inline constexpr std::wstring_view kCenter = L"Center";
inline constexpr std::wstring_view kPi = L"PI";
inline constexpr std::wstring_view kPntList2D = L"PntList2D";
inline constexpr std::wstring_view kPntList3D = L"PntList3D";
inline constexpr std::wstring_view kSurfaces = L"Surfaces";
inline constexpr std::wstring_view kSurface = L"Surface";
inline constexpr std::wstring_view kSourceData = L"SourceData";
inline constexpr std::wstring_view kBreaklines = L"Breaklines";
inline constexpr std::wstring_view kBreakline = L"Breakline";
inline constexpr std::wstring_view kDefinition = L"Definition";
inline constexpr std::wstring_view kPnts = L"Pnts";
inline constexpr std::wstring_view kP = L"P";
inline constexpr std::wstring_view kFaces = L"Faces";
inline constexpr std::wstring_view kF = L"F";
inline constexpr std::wstring_view kParcels = L"Parcels";
inline constexpr std::wstring_view kParcel = L"Parcel";
// Road collections.
inline constexpr std::wstring_view kAlignments = L"Alignments";
inline constexpr std::wstring_view kAlignment = L"Alignment";
inline constexpr std::wstring_view kProfile = L"Profile";
inline constexpr std::wstring_view kCrossSects = L"CrossSects";
inline constexpr std::wstring_view kStaEquation = L"StaEquation";
inline constexpr std::wstring_view kProfAlign = L"ProfAlign";
inline constexpr std::wstring_view kPvi = L"PVI";
inline constexpr std::wstring_view kParaCurve = L"ParaCurve";
inline constexpr std::wstring_view kUnsymParaCurve = L"UnsymParaCurve";
inline constexpr std::wstring_view kCircCurve = L"CircCurve";
}  // namespace element

// ---- Attributes ------------------------------------------------------------------------------
namespace attribute {
inline constexpr std::wstring_view kVersion = L"version";
inline constexpr std::wstring_view kDate = L"date";
inline constexpr std::wstring_view kTime = L"time";
inline constexpr std::wstring_view kLanguage = L"language";
inline constexpr std::wstring_view kReadOnly = L"readOnly";
inline constexpr std::wstring_view kName = L"name";
inline constexpr std::wstring_view kDesc = L"desc";
inline constexpr std::wstring_view kCode = L"code";
inline constexpr std::wstring_view kState = L"state";
inline constexpr std::wstring_view kPntRef = L"pntRef";
inline constexpr std::wstring_view kLinearUnit = L"linearUnit";
inline constexpr std::wstring_view kAngularUnit = L"angularUnit";
inline constexpr std::wstring_view kDirectionUnit = L"directionUnit";
inline constexpr std::wstring_view kAreaUnit = L"areaUnit";
inline constexpr std::wstring_view kVolumeUnit = L"volumeUnit";
inline constexpr std::wstring_view kTemperatureUnit = L"temperatureUnit";
inline constexpr std::wstring_view kPressureUnit = L"pressureUnit";
inline constexpr std::wstring_view kManufacturer = L"manufacturer";
inline constexpr std::wstring_view kTimeStamp = L"timeStamp";
inline constexpr std::wstring_view kRot = L"rot";
inline constexpr std::wstring_view kRadius = L"radius";
inline constexpr std::wstring_view kLength = L"length";
inline constexpr std::wstring_view kId = L"id";
inline constexpr std::wstring_view kSurfType = L"surfType";
inline constexpr std::wstring_view kBrkType = L"brkType";
inline constexpr std::wstring_view kStaStart = L"staStart";
inline constexpr std::wstring_view kDir = L"dir";
inline constexpr std::wstring_view kDirStart = L"dirStart";
inline constexpr std::wstring_view kDirEnd = L"dirEnd";
inline constexpr std::wstring_view kRadiusStart = L"radiusStart";
inline constexpr std::wstring_view kRadiusEnd = L"radiusEnd";
inline constexpr std::wstring_view kSpiType = L"spiType";
inline constexpr std::wstring_view kConstant = L"constant";
inline constexpr std::wstring_view kStaInternal = L"staInternal";
inline constexpr std::wstring_view kStaBack = L"staBack";
inline constexpr std::wstring_view kStaAhead = L"staAhead";
inline constexpr std::wstring_view kLengthIn = L"lengthIn";
inline constexpr std::wstring_view kLengthOut = L"lengthOut";
}  // namespace attribute

// Attributes that are derived from the geometry the plug-in reads (lengths, directions, angles and
// areas of the elements, a surface's extent): the model holds them through that geometry, so they
// are read over without a remark. Other attributes the reader does not take are counted.
bool isDerivedAttribute(std::wstring_view name);
// Attributes of the document's framing (namespaces, schema location, version, date, time, language,
// read-only flag) that describe the file rather than its data: read over without a remark.
bool isFramingAttribute(std::wstring_view name);

// ---- Values --------------------------------------------------------------------------------------
inline constexpr std::wstring_view kClockwise = L"cw";
inline constexpr std::wstring_view kCounterClockwise = L"ccw";
inline constexpr std::wstring_view kTin = L"TIN";
// The radius of a spiral's straight end (an xs:double infinity).
inline constexpr std::wstring_view kInfinite = L"INF";
inline constexpr std::wstring_view kWrittenVersion = L"1.2";
inline constexpr std::wstring_view kNamespace = L"http://www.landxml.org/schema/LandXML-1.2";
inline constexpr std::wstring_view kSchemaInstance = L"http://www.w3.org/2001/XMLSchema-instance";
inline constexpr std::wstring_view kSchemaLocation =
    L"http://www.landxml.org/schema/LandXML-1.2 http://www.landxml.org/schema/LandXML-1.2/LandXML-1.2.xsd";

// ---- Units ----------------------------------------------------------------------------------------
// The linear unit words of Metric ("millimeter", "centimeter", "meter", "kilometer") and Imperial
// ("foot", "USSurveyFoot", "inch", "mile"), and the angular words ("radians", "grads",
// "decimal degrees", "decimal dd.mm.ss").
bool linearUnitFromWord(std::wstring_view word, EDistUnits& units);
bool angularUnitFromWord(std::wstring_view word, EAngleUnits& units);
// The word of a unit a file can name, or an empty view for one it cannot (feet and inches, chains,
// US inches and the others outside the tables above; MILS and ANY_UNITS for angles).
std::wstring_view wordOfLinearUnit(EDistUnits units);
std::wstring_view wordOfAngularUnit(EAngleUnits units);
// Whether a linear unit is one of Imperial's (then the Imperial element names the units).
bool isImperialUnit(EDistUnits units);
// The unit attributes of Metric and Imperial other than linearUnit, angularUnit and directionUnit:
// units of values the plug-in does not read.
bool isUnitOfUnreadValues(std::wstring_view attribute);

// The units of a file: of lengths and coordinates (heights included: elevationUnit names the unit of
// elevation attributes such as ellipsoidHeight, not of the coordinate texts), of angles and of
// directions. Files without Units are read in meters and radians (the schema's default for angles).
struct FileUnits {
  EDistUnits linear = METERS;
  EAngleUnits angular = RADIANS;
  EAngleUnits direction = RADIANS;
};

// ---- States ----------------------------------------------------------------------------------------
// A point's state ("abandoned", "destroyed", "existing", "proposed") is held as one of these point
// attribute flags of its station (bits the model leaves to plug-ins); a point carries at most one.
inline constexpr unsigned kFirstStateFlag = 5;
// The flag of a state word; false for another word.
bool stateFlagFromWord(std::wstring_view word, unsigned& flag);
// The word of the first state flag a station's attribute set holds, or an empty view.
std::wstring_view wordOfStateFlags(unsigned stationAttrs);
// The attribute set without any state flag.
unsigned withoutStateFlags(unsigned stationAttrs);

// ---- Breakline types --------------------------------------------------------------------------------
// "standard" is BREAKLINE_HARD (0); "wall", "proximity" and "nondestructive" are held as the numbers 2,
// 3 and 4 (the model stores any number). BREAKLINE_SOFT has no LandXML word and is written without one.
bool breaklineTypeFromWord(std::wstring_view word, int& type);
std::wstring_view wordOfBreaklineType(int type);

// ---- Parcels ----------------------------------------------------------------------------------------
// The region type of a parcel's boundary: each parcel's outline is a region of the dataset with the
// parcel's name and this type, and the parcel's horizontal alignment (of the same name) is its link to
// the road parts.
inline constexpr int kParcelBoundaryRegion = 1;

// ---- Limits ------------------------------------------------------------------------------------------
// Decimals of coordinates the writer accepts from the settings (more would only write noise).
inline constexpr int kMostDecimals = 12;
// Skipped parts traced one by one before only their count is traced.
inline constexpr int kTracedProblems = 10;

}  // namespace vyn::ie::landxml
