// The Alignments handler: horizontal geometry, station equations and profiles of roads.

#include <cmath>
#include <memory>
#include <numbers>
#include <vector>

#include "LandXmlHandlers.h"
#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEStationEquations.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieUtils/IEUtilsUnits.h"

namespace vyn::ie::landxml {

namespace {

constexpr double kDegreesPerRadian = 180.0 / std::numbers::pi;

// The azimuth from a to b: decimal degrees clockwise from north, in [0, 360).
double azimuth(const Vertex& a, const Vertex& b) {
  const double degrees = std::atan2(b.east - a.east, b.north - a.north) * kDegreesPerRadian;
  return degrees < 0.0 ? degrees + 360.0 : degrees;
}

double wrapAzimuth(double degrees) {
  const double wrapped = std::fmod(degrees, 360.0);
  return wrapped < 0.0 ? wrapped + 360.0 : wrapped;
}

// The value the file gave, else the one computed.
double given(double value, double computed) {
  return value != kNoValue ? value : computed;
}

double planDistance(const Vertex& a, const Vertex& b) {
  return std::hypot(b.north - a.north, b.east - a.east);
}

// The spiral type of a spiType word; false for a word that names none.
bool spiralTypeFromWord(std::wstring_view word, int& type) {
  DexSpiral probe;
  for (int candidate = 0; candidate < DexSpiral::kNumberOfSpiralTypes; ++candidate) {
    probe.setSpiralType(candidate);
    if (probe.getSpiralTypeAsString().view() == word) {
      type = candidate;
      return true;
    }
  }
  return false;
}

// The kinds of profile vertex, by element name.
struct VertexKind {
  std::wstring_view element;
  DexVerticalElement::EElementType elementType;
  DexLongSection::ELSType sectionType;
};
constexpr VertexKind kVertexKinds[] = {
    {element::kPvi, DexVerticalElement::VERTEX, DexLongSection::LEVEL_POINT},
    {element::kParaCurve, DexVerticalElement::PARABOLA, DexLongSection::PARABOLA_POINT},
    {element::kUnsymParaCurve, DexVerticalElement::ASYMMETRIC_PARABOLA, DexLongSection::PARABOLA_POINT},
    {element::kCircCurve, DexVerticalElement::CIRCULAR_CURVE, DexLongSection::CIRCULAR_POINT},
};

const VertexKind* vertexKindOf(std::wstring_view name) {
  for (const VertexKind& kind : kVertexKinds) {
    if (kind.element == name) return &kind;
  }
  return nullptr;
}

}  // namespace

// What is being read of one Alignment.
struct AlignmentsHandler::Road {
  DexAlignment* alignment = nullptr;             // the dataset's
  DexHorizontalAlignment* horizontal = nullptr;  // the parts dictionary's
  std::unique_ptr<DexStaEquationSet> equations;  // null until a StaEquation
  std::wstring name;

  // The CoordGeom element being read (an empty element name outside one).
  std::wstring_view geometry;
  int geometryBase = 0;  // the depth of the CoordGeom
  PointReader point;
  Vertex start, end, center, pi;
  bool hasStart = false, hasEnd = false, hasCenter = false, hasPi = false, broken = false;
  int rotation = 0;  // 1 ccw, -1 cw, 0 not given
  double length = kNoValue, radius = kNoValue, radiusStart = 0.0, radiusEnd = 0.0, constant = kNoValue;
  double dirStart = kNoValue, dirEnd = kNoValue;  // decimal degrees, as given
  int spiralType = DexSpiral::CLOTHOID;

  // The Profile and ProfAlign being read.
  std::wstring profileName;
  DexVerticalAlignment* profile = nullptr;  // the parts dictionary's
  struct ProfileVertex {
    const VertexKind* kind;
    double station;
    double level;
    double length;
    double lengthIn;
    double lengthOut;
    double radius;
  };
  std::vector<ProfileVertex> vertices;
  ProfileVertex vertex{};
  std::wstring vertexText;
};

AlignmentsHandler::AlignmentsHandler(ReadContext& context) : context_(context) {}

AlignmentsHandler::~AlignmentsHandler() = default;

bool AlignmentsHandler::start(const ElementPath& path, std::wstring_view attributes) {
  const std::wstring_view name = path.name();
  if (road_ != nullptr) return startInAlignment(path, attributes);
  if (name == element::kAlignments) {
    context_.notHeldAttributes(name, attributes);
    return true;
  }
  if (name != element::kAlignment || path.name(1) != element::kAlignments) return false;
  startAlignment(attributes);
  return true;
}

bool AlignmentsHandler::startInAlignment(const ElementPath& path, std::wstring_view attributes) {
  Road& road = *road_;
  const std::wstring_view name = path.name();
  const std::wstring_view parent = path.name(1);
  if (!road.geometry.empty()) {
    if (path.depth() != road.geometryBase + 2) return false;
    if (name != element::kStart && name != element::kEnd && name != element::kCenter && name != element::kPi)
      return false;
    road.point.start(context_, name, attributes);
    return true;
  }
  if (parent == element::kAlignment) {
    if (name == element::kCoordGeom) {
      context_.notHeldAttributes(name, attributes);
      road.geometryBase = path.depth();
      return true;
    }
    if (name == element::kStaEquation) {
      addStaEquation(attributes);
      return true;
    }
    if (name == element::kProfile) {
      startProfile(attributes);
      return true;
    }
    return false;
  }
  if (parent == element::kCoordGeom && path.depth() == road.geometryBase + 1) {
    if (name != element::kLine && name != element::kCurve && name != element::kSpiral) return false;
    startGeometry(name, attributes);
    return true;
  }
  if (parent == element::kProfile && name == element::kProfAlign) {
    startProfAlign(attributes);
    return true;
  }
  if (parent == element::kProfAlign && road.profile != nullptr && vertexKindOf(name) != nullptr) {
    startVertex(name, attributes);
    return true;
  }
  return false;
}

void AlignmentsHandler::text(const ElementPath& path, std::wstring_view text) {
  if (road_ == nullptr) return;
  if (!road_->geometry.empty() && path.depth() == road_->geometryBase + 2) {
    road_->point.text(text);
  } else if (road_->vertex.kind != nullptr && path.name() == road_->vertex.kind->element) {
    road_->vertexText.assign(text);
  }
}

void AlignmentsHandler::end(const ElementPath& path) {
  if (road_ == nullptr) return;
  Road& road = *road_;
  const std::wstring_view name = path.name();
  if (!road.geometry.empty()) {
    if (path.depth() == road.geometryBase + 1) {
      endGeometry();
      return;
    }
    Vertex vertex;
    if (!road.point.end(context_, name, vertex)) {
      road.broken = true;
      return;
    }
    const bool isStart = name == element::kStart;
    const bool isEnd = name == element::kEnd;
    const bool isCenter = name == element::kCenter;
    (isStart ? road.start : isEnd ? road.end : isCenter ? road.center : road.pi) = vertex;
    (isStart ? road.hasStart : isEnd ? road.hasEnd : isCenter ? road.hasCenter : road.hasPi) = true;
    return;
  }
  if (road.vertex.kind != nullptr && name == road.vertex.kind->element) {
    endVertex();
  } else if (name == element::kProfAlign) {
    endProfAlign();
  } else if (name == element::kAlignment) {
    endAlignment();
  }
}

// A document that broke off keeps the alignment, profile and equations read so far.
void AlignmentsHandler::finish() {
  if (road_ == nullptr) return;
  road_->geometry = {};
  road_->vertex.kind = nullptr;
  endProfAlign();
  endAlignment();
}

// ---- Alignment ---------------------------------------------------------------------------------

void AlignmentsHandler::startAlignment(std::wstring_view attributes) {
  road_ = std::make_unique<Road>();
  Road& road = *road_;
  double staStart = 0.0;
  double length = 0.0;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (attribute == attribute::kName) {
      road.name.assign(value);
    } else if (attribute == attribute::kStaStart || attribute == attribute::kLength) {
      double meters = 0.0;
      if (context_.readCoordinates(value, &meters, 1) != 1) {
        context_.malformed(L"Alignment attribute not a number, 0 assumed", value);
        meters = 0.0;
      }
      (attribute == attribute::kStaStart ? staStart : length) = meters;
    } else {
      context_.notHeld(element::kAlignment, attribute);
    }
  });
  CVynStringT<wchar_t>& name = context_.scratch();
  point_files::assignText(name, road.name);
  auto alignment = std::make_unique<DexAlignment>();
  alignment->setName(name);
  alignment->setStaStart(staStart);
  alignment->setLength(length);
  auto horizontal = std::make_unique<DexHorizontalAlignment>();
  horizontal->setName(name);
  horizontal->setStaStart(staStart);
  horizontal->setLength(length);
  if (context_.data().getIEAlignmentPartsDictionary()->addAlignmentPart(horizontal.get())) {
    road.horizontal = horizontal.release();  // the dictionary owns it now
    alignment->setAlignmentPart(road.horizontal);
  }
  road.alignment = alignment.get();
  context_.dataset().add(alignment.release());
}

void AlignmentsHandler::endAlignment() {
  Road& road = *road_;
  if (road.equations != nullptr) {
    point_files::assignText(context_.scratch(), road.name);
    road.equations->setName(context_.scratch());
    if (context_.data().getIEStaEquationSetDictionary()->addStaEquationSet(road.equations.get())) {
      const DexStaEquationSet* const set = road.equations.release();  // the dictionary owns it now
      road.alignment->setStaEquationSet(set);
      if (road.horizontal != nullptr) road.horizontal->setStaEquationSet(set);
    } else {
      context_.malformed(L"StaEquations of an alignment skipped, they do not form a valid set", road.name);
    }
  }
  road_.reset();
}

// ---- CoordGeom ---------------------------------------------------------------------------------

void AlignmentsHandler::startGeometry(std::wstring_view name, std::wstring_view attributes) {
  Road& road = *road_;
  road.geometry = name == element::kLine    ? element::kLine
                  : name == element::kCurve ? element::kCurve
                                            : element::kSpiral;
  road.hasStart = road.hasEnd = road.hasCenter = road.hasPi = road.broken = false;
  road.rotation = 0;
  road.length = road.radius = road.constant = kNoValue;
  road.radiusStart = road.radiusEnd = 0.0;
  road.dirStart = road.dirEnd = kNoValue;
  road.spiralType = DexSpiral::CLOTHOID;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    const bool spiral = road.geometry == element::kSpiral;
    double number = 0.0;
    const bool isLength = context_.readCoordinates(value, &number, 1) == 1;
    double angle = 0.0;
    if (attribute == attribute::kDir || attribute == attribute::kDirStart ||
        attribute == attribute::kDirEnd) {
      if (point_files::parseNumber(value, angle) && std::isfinite(angle)) {
        (attribute == attribute::kDirEnd ? road.dirEnd : road.dirStart) =
            wrapAzimuth(utils::angleToDecDeg(angle, context_.units().direction));
      }
    } else if (attribute == attribute::kRot && road.geometry != element::kLine) {
      road.rotation = value == kCounterClockwise ? 1 : value == kClockwise ? -1 : 0;
    } else if (attribute == attribute::kLength && isLength) {
      road.length = number;
    } else if (attribute == attribute::kRadius && road.geometry == element::kCurve && isLength) {
      road.radius = number;
    } else if (spiral && (attribute == attribute::kRadiusStart || attribute == attribute::kRadiusEnd)) {
      // "INF" (a straight end) is held as 0, the model's radius of a straight end.
      (attribute == attribute::kRadiusStart ? road.radiusStart : road.radiusEnd) = isLength ? number : 0.0;
      if (!isLength && value != kInfinite)
        context_.malformed(L"Spiral radius not a number, INF assumed", value);
    } else if (spiral && attribute == attribute::kConstant && isLength) {
      road.constant = number;
    } else if (spiral && attribute == attribute::kSpiType) {
      if (!spiralTypeFromWord(value, road.spiralType))
        context_.malformed(L"Spiral of an unknown spiType read as a clothoid", value);
    } else if (!isDerivedAttribute(attribute)) {
      context_.notHeld(road.geometry, attribute);
    }
  });
}

void AlignmentsHandler::endGeometry() {
  Road& road = *road_;
  const std::wstring_view kind = road.geometry;
  road.geometry = {};
  if (road.broken || !road.hasStart || !road.hasEnd || road.horizontal == nullptr) {
    if (!road.broken) context_.malformed(std::wstring(kind) + L" skipped, it lacks Start or End", road.name);
    return;
  }
  const Vertex& start = road.start;
  const Vertex& end = road.end;
  bool asChord = kind == element::kLine;
  if (kind == element::kCurve && !road.hasCenter) {
    const double chord = planDistance(start, end);
    if (road.radius == 0.0) {
      asChord = true;
    } else if (road.radius == kNoValue || std::fabs(road.radius) < chord / 2.0 || road.rotation == 0) {
      context_.malformed(L"Curve without Center, radius or rot read as its chord", road.name);
      asChord = true;
    } else {
      // The centre of the minor arc: off the chord's midpoint, to the left for a ccw arc.
      const double offset = std::sqrt(road.radius * road.radius - chord * chord / 4.0) / chord;
      const double side = road.rotation > 0 ? 1.0 : -1.0;
      road.center.north = (start.north + end.north) / 2.0 + side * offset * (end.east - start.east);
      road.center.east = (start.east + end.east) / 2.0 - side * offset * (end.north - start.north);
    }
  }
  if (kind == element::kCurve &&
      (road.radius == 0.0 || (!asChord && planDistance(road.center, start) < kSamePosition))) {
    context_.malformed(L"Curve of zero radius read as its chord", road.name);
    asChord = true;
  }
  if (asChord) {
    auto line = std::make_unique<DexLine2D>();
    line->setPosition(DexLine2D::START_POINT, start.north, start.east);
    line->setPosition(DexLine2D::END_POINT, end.north, end.east);
    line->setData(DexLine2D::START_AZIMUTH,
                  kind == element::kLine && road.dirStart != kNoValue ? road.dirStart : azimuth(start, end));
    line->setData(DexLine2D::LENGTH,
                  kind == element::kLine && road.length != kNoValue ? road.length : planDistance(start, end));
    road.horizontal->addSegment(line.release());
    return;
  }
  if (kind == element::kCurve) {
    // The radius as written (more decimals than the points), else from the centre.
    const double radius =
        road.radius != kNoValue && road.radius > 0.0 ? road.radius : planDistance(road.center, start);
    if (road.rotation == 0) {  // rot missing: the minor arc's turn
      const double cross = (start.east - road.center.east) * (end.north - road.center.north) -
                           (start.north - road.center.north) * (end.east - road.center.east);
      road.rotation = cross >= 0.0 ? 1 : -1;
    }
    const bool clockwise = road.rotation < 0;
    const double turn = clockwise ? 90.0 : -90.0;
    const double startAzimuth = given(road.dirStart, wrapAzimuth(azimuth(road.center, start) + turn));
    const double endAzimuth = given(road.dirEnd, wrapAzimuth(azimuth(road.center, end) + turn));
    double sweep = clockwise ? endAzimuth - startAzimuth : startAzimuth - endAzimuth;
    if (sweep <= 0.0) sweep += 360.0;
    auto curve = std::make_unique<DexCurve>();
    curve->setTurn(clockwise);
    curve->setPosition(DexCurve::START_POINT, start.north, start.east);
    curve->setPosition(DexCurve::CENTER_POINT, road.center.north, road.center.east);
    curve->setPosition(DexCurve::END_POINT, end.north, end.east);
    if (road.hasPi) curve->setPosition(DexCurve::PI_POINT, road.pi.north, road.pi.east);
    curve->setData(DexCurve::RADIUS, radius);
    curve->setData(DexCurve::LENGTH,
                   road.length != kNoValue ? road.length : radius * sweep / kDegreesPerRadian);
    curve->setData(DexCurve::START_AZIMUTH, startAzimuth);
    curve->setData(DexCurve::END_AZIMUTH, endAzimuth);
    curve->setData(DexCurve::DEFLECTION, clockwise ? sweep : -sweep);
    road.horizontal->addSegment(curve.release());
    return;
  }
  if (!road.hasPi || road.length == kNoValue) {
    context_.malformed(L"Spiral skipped, it lacks PI or length", road.name);
    return;
  }
  auto spiral = std::make_unique<DexSpiral>();
  spiral->setSpiralType(road.spiralType);
  spiral->setTurn(road.rotation < 0);
  spiral->setPosition(DexSpiral::START_POINT, start.north, start.east);
  spiral->setPosition(DexSpiral::END_POINT, end.north, end.east);
  spiral->setPosition(DexSpiral::PI_POINT, road.pi.north, road.pi.east);
  spiral->setData(DexSpiral::LENGTH, road.length);
  spiral->setData(DexSpiral::START_RADIUS, road.radiusStart);
  spiral->setData(DexSpiral::END_RADIUS, road.radiusEnd);
  spiral->setData(DexSpiral::START_AZIMUTH, given(road.dirStart, azimuth(start, road.pi)));
  spiral->setData(DexSpiral::END_AZIMUTH, given(road.dirEnd, azimuth(road.pi, end)));
  const double curvedRadius = road.radiusStart > 0.0 ? road.radiusStart : road.radiusEnd;
  if (road.constant != kNoValue) {
    spiral->setData(DexSpiral::SPIRAL_CONSTANT, road.constant);
  } else if (curvedRadius > 0.0) {
    spiral->setData(DexSpiral::SPIRAL_CONSTANT, std::sqrt(curvedRadius * road.length));
  }
  road.horizontal->addSegment(spiral.release());
}

// ---- StaEquation ---------------------------------------------------------------------------------

void AlignmentsHandler::addStaEquation(std::wstring_view attributes) {
  Road& road = *road_;
  DexStaEquation equation;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    const int kind = attribute == attribute::kStaInternal ? DexStaEquation::RUNNING_CHAINAGE
                     : attribute == attribute::kStaBack   ? DexStaEquation::STATION_BACK
                     : attribute == attribute::kStaAhead  ? DexStaEquation::STATION_AHEAD
                                                          : -1;
    if (kind < 0) {
      if (attribute == attribute::kDesc) {
        point_files::assignText(context_.scratch(), value);
        equation.setName(context_.scratch());
      } else {
        context_.notHeld(element::kStaEquation, attribute);
      }
      return;
    }
    double meters = 0.0;
    if (context_.readCoordinates(value, &meters, 1) == 1) equation.setData(kind, meters);
  });
  if (road.equations == nullptr) road.equations = std::make_unique<DexStaEquationSet>();
  if (!road.equations->addEquation(&equation))
    context_.malformed(L"StaEquation skipped, its staInternal or staAhead is missing or repeated", road.name);
}

// ---- Profile -------------------------------------------------------------------------------------

// A Profile's name names its ProfAligns that lack one.
void AlignmentsHandler::startProfile(std::wstring_view attributes) {
  Road& road = *road_;
  road.profileName = road.name;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (attribute == attribute::kName) {
      road.profileName.assign(value);
    } else if (!isDerivedAttribute(attribute)) {
      context_.notHeld(element::kProfile, attribute);
    }
  });
}

void AlignmentsHandler::startProfAlign(std::wstring_view attributes) {
  Road& road = *road_;
  std::wstring name = road.profileName;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (attribute == attribute::kName) {
      name.assign(value);
    } else {
      context_.notHeld(element::kProfAlign, attribute);
    }
  });
  auto profile = std::make_unique<DexVerticalAlignment>();
  point_files::assignText(context_.scratch(), name);
  profile->setName(context_.scratch());
  if (!context_.data().getIEAlignmentPartsDictionary()->addAlignmentPart(profile.get())) return;
  road.profile = profile.release();  // the dictionary owns it now
  road.alignment->setAlignmentPart(road.profile);
  road.vertices.clear();
}

void AlignmentsHandler::startVertex(std::wstring_view name, std::wstring_view attributes) {
  Road& road = *road_;
  road.vertex = {vertexKindOf(name), 0.0, 0.0, 0.0, 0.0, 0.0, 0.0};
  road.vertexText.clear();
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    double* const target = attribute == attribute::kLength      ? &road.vertex.length
                           : attribute == attribute::kLengthIn  ? &road.vertex.lengthIn
                           : attribute == attribute::kLengthOut ? &road.vertex.lengthOut
                           : attribute == attribute::kRadius    ? &road.vertex.radius
                                                                : nullptr;
    if (target == nullptr) {
      context_.notHeld(name, attribute);
    } else if (context_.readCoordinates(value, target, 1) != 1) {
      context_.malformed(std::wstring(name) + L" attribute not a number, 0 assumed", value);
      *target = 0.0;
    }
  });
  if (road.vertex.kind->elementType == DexVerticalElement::ASYMMETRIC_PARABOLA)
    road.vertex.length = road.vertex.lengthIn + road.vertex.lengthOut;
}

void AlignmentsHandler::endVertex() {
  Road& road = *road_;
  double values[2] = {};
  if (context_.readCoordinates(road.vertexText, values, 2) != 2) {
    context_.malformed(
        std::wstring(road.vertex.kind->element) + L" skipped, its text is not station and level",
        road.vertexText);
  } else {
    road.vertex.station = values[0];
    road.vertex.level = values[1];
    road.vertices.push_back(road.vertex);
  }
  road.vertex.kind = nullptr;
}

// The vertices become elements and long sections once their neighbours, and so their grades, are known.
void AlignmentsHandler::endProfAlign() {
  Road& road = *road_;
  if (road.profile == nullptr) return;
  const std::vector<Road::ProfileVertex>& vertices = road.vertices;
  const auto grade = [&vertices](std::size_t from) {  // percent, from vertex from to the next
    const double run = vertices[from + 1].station - vertices[from].station;
    return run == 0.0 ? 0.0 : 100.0 * (vertices[from + 1].level - vertices[from].level) / run;
  };
  for (std::size_t i = 0; i < vertices.size(); ++i) {
    const Road::ProfileVertex& vertex = vertices[i];
    const double gradeIn = i > 0 ? grade(i - 1) : 0.0;
    const double gradeOut = i + 1 < vertices.size() ? grade(i) : 0.0;
    const bool asymmetric = vertex.kind->elementType == DexVerticalElement::ASYMMETRIC_PARABOLA;
    const double before = asymmetric ? vertex.lengthIn : vertex.length / 2.0;
    const double after = asymmetric ? vertex.lengthOut : vertex.length / 2.0;
    auto element = std::make_unique<DexVerticalElement>(vertex.kind->elementType);
    element->setData(DexVerticalElement::VERTEX_STATION, vertex.station);
    element->setData(DexVerticalElement::VERTEX_LEVEL, vertex.level);
    element->setData(DexVerticalElement::GRADE_IN, gradeIn);
    element->setData(DexVerticalElement::GRADE_OUT, gradeOut);
    element->setData(DexVerticalElement::START_STATION, vertex.station - before);
    element->setData(DexVerticalElement::START_LEVEL, vertex.level - gradeIn * before / 100.0);
    element->setData(DexVerticalElement::END_STATION, vertex.station + after);
    element->setData(DexVerticalElement::END_LEVEL, vertex.level + gradeOut * after / 100.0);
    element->setData(DexVerticalElement::CURVE_LENGTH, vertex.length);
    element->setData(DexVerticalElement::LENGTH_IN, vertex.lengthIn);
    element->setData(DexVerticalElement::LENGTH_OUT, vertex.lengthOut);
    element->setData(DexVerticalElement::RADIUS, vertex.radius);
    auto section = std::make_unique<DexLongSection>(vertex.kind->sectionType);
    section->setData(DexLongSection::STATION, vertex.station);
    section->setData(DexLongSection::LEVEL, vertex.level);
    section->setData(DexLongSection::GRADE, gradeOut);
    section->setData(DexLongSection::CURVE_LENGTH, vertex.length);
    section->setData(DexLongSection::RADIUS, vertex.radius);
    if (vertex.kind->sectionType == DexLongSection::PARABOLA_POINT) section->setParabola(element.get());
    road.profile->addVerticalElement(element.release());
    road.profile->addLongSection(section.release());
  }
  if (!vertices.empty()) {
    road.profile->setStaStart(vertices.front().station);
    road.profile->setLength(vertices.back().station - vertices.front().station);
  }
  road.profile = nullptr;
  road.vertices.clear();
}

}  // namespace vyn::ie::landxml
