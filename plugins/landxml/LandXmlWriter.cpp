#include "LandXmlWriter.h"

#include <algorithm>
#include <cmath>

#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/IEStationEquations.h"
#include "ieObjects/IESurface.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieUtils/IESettings.h"
#include "pointfiles/CodeText.h"

namespace vyn::ie::landxml {

namespace {

// Bulges below this are straight segments.
constexpr double kStraightBulge = 1e-12;
// Decimals of the radius and length of a curve beyond those of the coordinates.
constexpr int kExtraCurveDecimals = 3;
// Decimals of directions: a ten-thousandth of a second of arc in decimal degrees.
constexpr int kDirectionDecimals = 8;

std::string ascii(std::wstring_view word) {
  return std::string(word.begin(), word.end());
}

bool isSingleWord(std::wstring_view name) {
  return !name.empty() && std::none_of(name.begin(), name.end(), [](wchar_t ch) {
    return ch == L' ' || ch == L'\t' || ch == L'\r' || ch == L'\n';
  });
}

}  // namespace

LandXmlWriter::LandXmlWriter(const DexSettings& settings, XmlText& out) : out_(out) {
  if (!wordOfLinearUnit(settings.distUnits).empty()) units_ = settings.distUnits;
  if (!wordOfAngularUnit(settings.angleUnits).empty()) angleUnits_ = settings.angleUnits;
  for (std::size_t i = 0; i < decimals_.size(); ++i)
    decimals_[i] = std::clamp(settings.coordDecimals[i], 0, kMostDecimals);
}

void LandXmlWriter::header(std::string_view date, std::string_view time, std::string_view libraryVersion) {
  out_.bytes() += "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";
  out_.start("LandXML");
  out_.attribute("xmlns", kNamespace);
  out_.attribute("xmlns:xsi", kSchemaInstance);
  out_.attribute("xsi:schemaLocation", kSchemaLocation);
  out_.attribute("version", kWrittenVersion);
  out_.attribute("date", date);
  out_.attribute("time", time);
  out_.attribute("language", std::string_view("English"));
  out_.attribute("readOnly", std::string_view("false"));
  out_.endStart();
  out_.newLine(1);
  out_.start("Units");
  out_.endStart();
  out_.newLine(2);
  const bool imperial = isImperialUnit(units_);
  out_.start(imperial ? "Imperial" : "Metric");
  out_.attribute("areaUnit", std::string_view(imperial ? "squareFoot" : "squareMeter"));
  out_.attribute("linearUnit", ascii(wordOfLinearUnit(units_)));
  out_.attribute("volumeUnit", std::string_view(imperial ? "cubicFeet" : "cubicMeter"));
  out_.attribute("temperatureUnit", std::string_view(imperial ? "fahrenheit" : "celsius"));
  out_.attribute("pressureUnit", std::string_view(imperial ? "inHG" : "milliBars"));
  out_.attribute("angularUnit", ascii(wordOfAngularUnit(angleUnits_)));
  out_.attribute("directionUnit", ascii(wordOfAngularUnit(angleUnits_)));
  out_.endEmpty();
  out_.newLine(1);
  out_.end("Units");
  out_.newLine(1);
  out_.start("Application");
  out_.attribute("name", std::string_view("dexchange"));
  out_.attribute("desc", std::string_view("survey data exchange library"));
  out_.attribute("version", libraryVersion);
  std::string timeStamp(date);
  timeStamp += 'T';
  timeStamp += time;
  out_.attribute("timeStamp", timeStamp);
  out_.endEmpty();
}

void LandXmlWriter::footer() {
  out_.newLine(0);
  out_.end("LandXML");
  out_.newLine(0);
}

void LandXmlWriter::startCollection(std::string_view element, std::wstring_view groupName) {
  out_.newLine(1);
  out_.start(element);
  if (!groupName.empty()) out_.attribute("name", groupName);
  out_.endStart();
}

void LandXmlWriter::endCollection(std::string_view element) {
  out_.newLine(1);
  out_.end(element);
}

double LandXmlWriter::distance(double meters) const {
  return utils::fromMetersFactor(meters, units_);
}

void LandXmlWriter::coordinates(double north, double east, double height) {
  out_.number(distance(north), decimals_[0]);
  out_.blank();
  out_.number(distance(east), decimals_[1]);
  if (height != kNoValue) {
    out_.blank();
    out_.number(distance(height), decimals_[2]);
  }
}

// ---- Points --------------------------------------------------------------------------------------

void LandXmlWriter::point(const DexDesignPoint& point) {
  const DexStation& station = point.getStation();
  out_.newLine(2);
  out_.start("CgPoint");
  if (!point.getName().IsEmpty()) out_.attribute("name", point.getName().view());
  if (point.getNumberOfCodes() > 0) {
    codes_.clear();
    point_files::appendCodesText(point, true, true, codes_);
    if (!codes_.empty()) out_.attribute("code", codes_);
  }
  if (!station.getNotes().IsEmpty()) out_.attribute("desc", station.getNotes().view());
  const std::wstring_view state = wordOfStateFlags(station.getStationAttrs());
  if (!state.empty()) out_.attribute("state", ascii(state));
  if (!station.isHorizCoordsDefined()) {
    out_.endEmpty();
    return;
  }
  out_.endStart();
  coordinates(station.getX(), station.getY(), station.isHeightDefined() ? station.getZ() : kNoValue);
  out_.end("CgPoint");
}

void LandXmlWriter::pointReference(const DexDesignPoint& point) {
  out_.newLine(2);
  out_.start("CgPoint");
  out_.attribute("pntRef", point.getName().view());
  out_.endEmpty();
}

// ---- Linework ------------------------------------------------------------------------------------

bool LandXmlWriter::planFeature(const DexPolyLine& polyline, bool chainsAllowed) {
  nodes_.clear();
  bool chain = chainsAllowed && polyline.isUsingPoints();
  for (int i = 0; i < polyline.getNumberOfNodes(); ++i) {
    const DexStation& station = polyline.getNodeStation(i);
    if (!station.isHorizCoordsDefined()) continue;
    nodes_.push_back({station.getX(), station.getY(), station.isHeightDefined() ? station.getZ() : kNoValue,
                      polyline.getNodeBulge(i)});
    chain = chain && std::fabs(polyline.getNodeBulge(i)) < kStraightBulge &&
            isSingleWord(station.getName().view());
  }
  if (nodes_.size() < 2) return false;
  chain = chain && static_cast<int>(nodes_.size()) == polyline.getNumberOfNodes();
  out_.newLine(2);
  out_.start("PlanFeature");
  if (!polyline.getName().IsEmpty()) out_.attribute("name", polyline.getName().view());
  out_.endStart();
  if (chain) {
    out_.newLine(3);
    out_.start("CoordGeom");
    out_.endStart();
    out_.newLine(4);
    out_.start("Chain");
    out_.endStart();
    for (int i = 0; i < polyline.getNumberOfNodes(); ++i) {
      if (i > 0) out_.blank();
      out_.text(polyline.getNodeStation(i).getName().view());
    }
    if (polyline.isClosed()) {
      out_.blank();
      out_.text(polyline.getNodeStation(0).getName().view());
    }
    out_.end("Chain");
    out_.newLine(3);
    out_.end("CoordGeom");
  } else {
    coordGeom(nodes_, polyline.isClosed());
  }
  out_.newLine(2);
  out_.end("PlanFeature");
  return true;
}

void LandXmlWriter::coordGeom(const std::vector<Node>& nodes, bool closed) {
  out_.newLine(3);
  out_.start("CoordGeom");
  out_.endStart();
  for (std::size_t i = 0; i + 1 < nodes.size(); ++i)
    segment(nodes[i], nodes[i + 1]);
  if (closed) segment(nodes.back(), nodes.front());
  out_.newLine(3);
  out_.end("CoordGeom");
}

void LandXmlWriter::pointElement(std::string_view element, const Node& node) {
  out_.newLine(5);
  out_.start(element);
  out_.endStart();
  coordinates(node.north, node.east, node.height);
  out_.end(element);
}

// A Line, or a Curve for a bulge. In plan axes (east, north) the centre lies off the chord's midpoint,
// to the left of the chord for a counter-clockwise arc (bulge above 0), by (1 - b^2) / (4 b) chords.
void LandXmlWriter::segment(const Node& start, const Node& end) {
  const double bulge = start.bulge;
  out_.newLine(4);
  if (std::fabs(bulge) < kStraightBulge) {
    out_.start("Line");
    out_.endStart();
    pointElement("Start", start);
    pointElement("End", end);
    out_.newLine(4);
    out_.end("Line");
    return;
  }
  const double dEast = end.east - start.east;
  const double dNorth = end.north - start.north;
  const double chord = std::hypot(dEast, dNorth);
  const double offset = (1.0 - bulge * bulge) / (4.0 * bulge);
  Node centre{(start.north + end.north) / 2 + offset * dEast, (start.east + end.east) / 2 - offset * dNorth,
              kNoValue, 0.0};
  const double radius = chord * (1.0 + bulge * bulge) / (4.0 * std::fabs(bulge));
  const double length = radius * 4.0 * std::atan(std::fabs(bulge));
  out_.start("Curve");
  out_.attribute("rot", ascii(bulge > 0 ? kCounterClockwise : kClockwise));
  out_.attribute("radius", distance(radius), decimals_[0] + kExtraCurveDecimals);
  out_.attribute("length", distance(length), decimals_[0] + kExtraCurveDecimals);
  out_.endStart();
  pointElement("Start", start);
  pointElement("Center", centre);
  pointElement("End", end);
  out_.newLine(4);
  out_.end("Curve");
}

// ---- Surfaces ------------------------------------------------------------------------------------

void LandXmlWriter::startSurface(const DexSurface& surface, bool hasDefinition) {
  out_.newLine(2);
  out_.start("Surface");
  out_.attribute("name", surface.getName().view());
  out_.endStart();
  bool sourceData = false;
  for (int i = 0; i < surface.getNumberOfBreaklines(); ++i) {
    const DexBreakline* breakline = surface.getBreaklineAt(i);
    if (breakline == nullptr || breakline->getNumberOfStations() < 2) continue;
    if (!sourceData) {
      out_.newLine(3);
      out_.start("SourceData");
      out_.endStart();
      out_.newLine(4);
      out_.start("Breaklines");
      out_.endStart();
      sourceData = true;
    }
    out_.newLine(5);
    out_.start("Breakline");
    if (!breakline->getName().IsEmpty()) out_.attribute("name", breakline->getName().view());
    const std::wstring_view type = wordOfBreaklineType(breakline->getBreaklineType());
    if (!type.empty()) out_.attribute("brkType", ascii(type));
    out_.endStart();
    bool withHeights = true;
    for (int s = 0; s < breakline->getNumberOfStations(); ++s)
      withHeights = withHeights && breakline->getStation(s).isHeightDefined();
    const std::string_view list = withHeights ? "PntList3D" : "PntList2D";
    out_.start(list);
    out_.endStart();
    for (int s = 0; s < breakline->getNumberOfStations(); ++s) {
      const DexStation& station = breakline->getStation(s);
      if (s > 0) out_.blank();
      coordinates(station.getX(), station.getY(), withHeights ? station.getZ() : kNoValue);
    }
    out_.end(list);
    out_.end("Breakline");
  }
  if (sourceData) {
    out_.newLine(4);
    out_.end("Breaklines");
    out_.newLine(3);
    out_.end("SourceData");
  }
  if (!hasDefinition) return;
  out_.newLine(3);
  out_.start("Definition");
  out_.attribute("surfType", ascii(kTin));
  out_.endStart();
  out_.newLine(4);
  out_.start("Pnts");
  out_.endStart();
}

void LandXmlWriter::positions(const DexSurface& surface, int first, int last) {
  for (int i = first; i < last; ++i) {
    const DexPosition3D& position = surface.getPositionAt(i);
    out_.newLine(5);
    out_.start("P");
    out_.attribute("id", static_cast<std::int64_t>(i) + 1);
    out_.endStart();
    coordinates(position.getX(), position.getY(), position.getZ());
    out_.end("P");
  }
}

void LandXmlWriter::startFaces() {
  out_.newLine(4);
  out_.end("Pnts");
  out_.newLine(4);
  out_.start("Faces");
  out_.endStart();
}

int LandXmlWriter::faces(const DexSurface& surface, int first, int last) {
  const int count = surface.getNumberOfPositions();
  int leftOut = 0;
  for (int i = first; i < last; ++i) {
    const DexTriangle* triangle = surface.getTriangleAt(i);
    bool valid = triangle != nullptr;
    for (int corner = 0; valid && corner < DexTriangle::kNumberOfPositions; ++corner) {
      const int index = triangle->getPosition(corner);
      valid = index >= 0 && index < count;
    }
    if (!valid) {
      ++leftOut;
      continue;
    }
    out_.newLine(5);
    out_.start("F");
    out_.endStart();
    for (int corner = 0; corner < DexTriangle::kNumberOfPositions; ++corner) {
      if (corner > 0) out_.blank();
      out_.integer(static_cast<std::int64_t>(triangle->getPosition(corner)) + 1);
    }
    out_.end("F");
  }
  return leftOut;
}

void LandXmlWriter::endSurface(bool hasDefinition) {
  if (hasDefinition) {
    out_.newLine(4);
    out_.end("Faces");
    out_.newLine(3);
    out_.end("Definition");
  }
  out_.newLine(2);
  out_.end("Surface");
}

// ---- Parcels -------------------------------------------------------------------------------------

void LandXmlWriter::parcel(const DexParcel& parcel, const DexRegion* boundary, bool pointsWritten) {
  out_.newLine(2);
  out_.start("Parcel");
  out_.attribute("name", parcel.getName().view());
  out_.endStart();
  if (const DexDesignPoint* centre = parcel.getCentralPoint();
      centre != nullptr && centre->isHorizCoordsDefined()) {
    const DexStation& station = centre->getStation();
    out_.newLine(3);
    out_.start("Center");
    if (pointsWritten && !centre->getName().IsEmpty()) out_.attribute("pntRef", centre->getName().view());
    out_.endStart();
    coordinates(station.getX(), station.getY(), station.isHeightDefined() ? station.getZ() : kNoValue);
    out_.end("Center");
  }
  if (boundary != nullptr && boundary->getVerticesCount() >= 2) {
    nodes_.clear();
    for (std::size_t i = 0; i < boundary->getVerticesCount(); ++i) {
      const DexPositionWithBulge& vertex = boundary->getVertexAt(i);
      nodes_.push_back({vertex.getX(), vertex.getY(), kNoValue, vertex.getBulge()});
    }
    coordGeom(nodes_, true);
  }
  out_.newLine(2);
  out_.end("Parcel");
}

// ---- Alignments ----------------------------------------------------------------------------------

int LandXmlWriter::alignment(const DexAlignment& alignment) {
  const int lengthDecimals = decimals_[0] + kExtraCurveDecimals;
  out_.newLine(2);
  out_.start("Alignment");
  out_.attribute("name", alignment.getName().view());
  out_.attribute("length", distance(alignment.getLength()), lengthDecimals);
  out_.attribute("staStart", distance(alignment.getStaStart()), lengthDecimals);
  out_.endStart();
  int leftOut = 0;
  const auto* horizontal = dynamic_cast<const DexHorizontalAlignment*>(
      alignment.getAlignmentPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
  out_.newLine(3);
  out_.start("CoordGeom");
  out_.endStart();
  for (int i = 0; horizontal != nullptr && i < horizontal->getNumberOfSegments(); ++i) {
    const IDexAlignmentObjInterface* element = horizontal->getSegmentAt(i);
    if (const auto* asLine = dynamic_cast<const DexLine2D*>(element)) {
      line(*asLine);
    } else if (const auto* asCurve = dynamic_cast<const DexCurve*>(element)) {
      curve(*asCurve);
    } else if (const auto* asSpiral = dynamic_cast<const DexSpiral*>(element)) {
      spiral(*asSpiral);
    } else {
      ++leftOut;
    }
  }
  out_.newLine(3);
  out_.end("CoordGeom");
  const DexStaEquationSet* equations = alignment.getStaEquationSet();
  if (equations == nullptr && horizontal != nullptr) equations = horizontal->getStaEquationSet();
  if (equations != nullptr) staEquations(*equations);
  bool profileOpen = false;
  for (int i = 0; i < alignment.getNumberOfAlignmentParts(); ++i) {
    const auto* vertical = dynamic_cast<const DexVerticalAlignment*>(alignment.getAlignmentPartAt(i));
    if (vertical == nullptr) continue;
    if (!profileOpen) {
      out_.newLine(3);
      out_.start("Profile");
      out_.attribute("name", alignment.getName().view());
      out_.endStart();
      profileOpen = true;
    }
    profile(*vertical);
  }
  if (profileOpen) {
    out_.newLine(3);
    out_.end("Profile");
  }
  out_.newLine(2);
  out_.end("Alignment");
  return leftOut;
}

void LandXmlWriter::direction(std::string_view name, double azimuth) {
  out_.attribute(name, utils::decDegToAngle(angleUnits_, azimuth, kDirectionDecimals), kDirectionDecimals);
}

void LandXmlWriter::planPoint(std::string_view element, const DexPosition2D& position) {
  pointElement(element, Node{position.getX(), position.getY(), kNoValue, 0.0});
}

void LandXmlWriter::line(const DexLine2D& line) {
  out_.newLine(4);
  out_.start("Line");
  if (line.isStartAzimuthDefined()) direction("dir", line.getData(DexLine2D::START_AZIMUTH));
  out_.attribute("length", distance(line.getData(DexLine2D::LENGTH)), decimals_[0] + kExtraCurveDecimals);
  out_.endStart();
  planPoint("Start", line.getPosition(DexLine2D::START_POINT));
  planPoint("End", line.getPosition(DexLine2D::END_POINT));
  out_.newLine(4);
  out_.end("Line");
}

void LandXmlWriter::curve(const DexCurve& curve) {
  const int lengthDecimals = decimals_[0] + kExtraCurveDecimals;
  out_.newLine(4);
  out_.start("Curve");
  out_.attribute("rot", ascii(curve.isTurnClockwised() ? kClockwise : kCounterClockwise));
  out_.attribute("radius", distance(curve.getData(DexCurve::RADIUS)), lengthDecimals);
  out_.attribute("length", distance(curve.getData(DexCurve::LENGTH)), lengthDecimals);
  if (curve.hasData(DexCurve::START_AZIMUTH)) direction("dirStart", curve.getData(DexCurve::START_AZIMUTH));
  if (curve.hasData(DexCurve::END_AZIMUTH)) direction("dirEnd", curve.getData(DexCurve::END_AZIMUTH));
  out_.endStart();
  planPoint("Start", curve.getPosition(DexCurve::START_POINT));
  planPoint("Center", curve.getPosition(DexCurve::CENTER_POINT));
  planPoint("End", curve.getPosition(DexCurve::END_POINT));
  const DexPosition2D& pi = curve.getPosition(DexCurve::PI_POINT);
  if (pi.getX() != 0.0 || pi.getY() != 0.0) planPoint("PI", pi);
  out_.newLine(4);
  out_.end("Curve");
}

void LandXmlWriter::spiral(const DexSpiral& spiral) {
  const int lengthDecimals = decimals_[0] + kExtraCurveDecimals;
  const auto radius = [&](std::string_view name, double meters) {
    if (meters == 0.0) {
      out_.attribute(name, ascii(kInfinite));  // a straight end
    } else {
      out_.attribute(name, distance(meters), lengthDecimals);
    }
  };
  out_.newLine(4);
  out_.start("Spiral");
  out_.attribute("length", distance(spiral.getData(DexSpiral::LENGTH)), lengthDecimals);
  radius("radiusStart", spiral.getData(DexSpiral::START_RADIUS));
  radius("radiusEnd", spiral.getData(DexSpiral::END_RADIUS));
  out_.attribute("rot", ascii(spiral.isTurnClockwised() ? kClockwise : kCounterClockwise));
  out_.attribute("spiType", spiral.getSpiralTypeAsString().view());
  const double constant = spiral.getData(DexSpiral::SPIRAL_CONSTANT);
  if (constant != 0.0) out_.attribute("constant", distance(constant), lengthDecimals);
  direction("dirStart", spiral.getData(DexSpiral::START_AZIMUTH));
  direction("dirEnd", spiral.getData(DexSpiral::END_AZIMUTH));
  out_.endStart();
  planPoint("Start", spiral.getPosition(DexSpiral::START_POINT));
  planPoint("PI", spiral.getPosition(DexSpiral::PI_POINT));
  planPoint("End", spiral.getPosition(DexSpiral::END_POINT));
  out_.newLine(4);
  out_.end("Spiral");
}

void LandXmlWriter::staEquations(const DexStaEquationSet& set) {
  const int decimals = decimals_[0] + kExtraCurveDecimals;
  for (int i = 0; i < set.getNumberOfEquations(); ++i) {
    const DexStaEquation& equation = *set.getEquationAt(i);
    out_.newLine(3);
    out_.start("StaEquation");
    out_.attribute("staAhead", distance(equation.getData(DexStaEquation::STATION_AHEAD)), decimals);
    if (equation.isDataSet(DexStaEquation::STATION_BACK))
      out_.attribute("staBack", distance(equation.getData(DexStaEquation::STATION_BACK)), decimals);
    out_.attribute("staInternal", distance(equation.getData(DexStaEquation::RUNNING_CHAINAGE)), decimals);
    if (!equation.getName().IsEmpty()) out_.attribute("desc", equation.getName().view());
    out_.endEmpty();
  }
}

// The vertices of a profile, from its vertical elements or, when it has none, its long sections.
void LandXmlWriter::profile(const DexVerticalAlignment& profile) {
  const int lengthDecimals = decimals_[0] + kExtraCurveDecimals;
  out_.newLine(4);
  out_.start("ProfAlign");
  out_.attribute("name", profile.getName().view());
  out_.endStart();
  const auto vertex = [&](std::string_view element, double station, double level, double length,
                          double radius) {
    out_.newLine(5);
    out_.start(element);
    if (element == "ParaCurve" || element == "CircCurve")
      out_.attribute("length", distance(length), lengthDecimals);
    if (element == "CircCurve") out_.attribute("radius", distance(radius), lengthDecimals);
    profileVertex(element, station, level);
  };
  for (int i = 0; i < profile.getNumberOfVerticalElements(); ++i) {
    const DexVerticalElement& element = *profile.getVerticalElementAt(i);
    const double station = element.getData(DexVerticalElement::VERTEX_STATION);
    const double level = element.getData(DexVerticalElement::VERTEX_LEVEL);
    switch (element.getElementType()) {
      case DexVerticalElement::VERTEX:
        vertex("PVI", station, level, 0.0, 0.0);
        break;
      case DexVerticalElement::PARABOLA:
        vertex("ParaCurve", station, level, element.getData(DexVerticalElement::CURVE_LENGTH), 0.0);
        break;
      case DexVerticalElement::ASYMMETRIC_PARABOLA:
        out_.newLine(5);
        out_.start("UnsymParaCurve");
        out_.attribute("lengthIn", distance(element.getData(DexVerticalElement::LENGTH_IN)), lengthDecimals);
        out_.attribute("lengthOut", distance(element.getData(DexVerticalElement::LENGTH_OUT)),
                       lengthDecimals);
        profileVertex("UnsymParaCurve", station, level);
        break;
      case DexVerticalElement::CIRCULAR_CURVE:
        vertex("CircCurve", station, level, element.getData(DexVerticalElement::CURVE_LENGTH),
               element.getData(DexVerticalElement::RADIUS));
        break;
    }
  }
  for (int i = 0; profile.getNumberOfVerticalElements() == 0 && i < profile.getNumberOfLongSections(); ++i) {
    const DexLongSection* section = profile.getLongSectionAt(i);
    if (section == nullptr) continue;
    const double station = section->getData(DexLongSection::STATION);
    const double level = section->getData(DexLongSection::LEVEL);
    const double length = section->getData(DexLongSection::CURVE_LENGTH);
    switch (section->getLSType()) {
      case DexLongSection::LEVEL_POINT:
        vertex("PVI", station, level, 0.0, 0.0);
        break;
      case DexLongSection::PARABOLA_POINT:
        vertex("ParaCurve", station, level, length, 0.0);
        break;
      case DexLongSection::CIRCULAR_POINT:
        vertex("CircCurve", station, level, length, section->getData(DexLongSection::RADIUS));
        break;
    }
  }
  out_.newLine(4);
  out_.end("ProfAlign");
}

// Ends the start tag of a profile vertex begun by the caller, with its "station level" text.
void LandXmlWriter::profileVertex(std::string_view element, double station, double level) {
  out_.endStart();
  out_.number(distance(station), decimals_[0]);
  out_.blank();
  out_.number(distance(level), decimals_[2]);
  out_.end(element);
}

}  // namespace vyn::ie::landxml
