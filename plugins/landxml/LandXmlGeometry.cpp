#include "LandXmlGeometry.h"

#include <cmath>
#include <numbers>

#include "LandXmlText.h"
#include "ieObjects/IEPoints.h"

namespace vyn::ie::landxml {

namespace {

constexpr double kPi = std::numbers::pi;

// The plan angle of p seen from the centre, counter-clockwise from east.
double planAngle(const Vertex& centre, const Vertex& p) {
  return std::atan2(p.north - centre.north, p.east - centre.east);
}

// angle brought into (0, 2 pi].
double sweep(double angle) {
  double value = std::fmod(angle, 2 * kPi);
  if (value <= 0.0) value += 2 * kPi;
  return value;
}

Vertex vertexOf(const DexDesignPoint& point) {
  const DexStation& station = point.getStation();
  Vertex vertex;
  vertex.north = station.getX();
  vertex.east = station.getY();
  vertex.height = station.isHeightDefined() ? station.getZ() : kNoValue;
  vertex.point = const_cast<DexDesignPoint*>(&point);
  return vertex;
}

}  // namespace

bool isSamePosition(const Vertex& a, const Vertex& b) {
  return std::hypot(a.north - b.north, a.east - b.east) < kSamePosition;
}

bool Run::isClosed() const {
  return vertices.size() >= 3 && isSamePosition(vertices.front(), vertices.back());
}

// ---- PointReader -------------------------------------------------------------------------------

void PointReader::start(ReadContext& context, std::wstring_view element, std::wstring_view attributes) {
  text_.clear();
  reference_.clear();
  hasText_ = false;
  forEachAttribute(attributes, [&](std::wstring_view name, std::wstring_view value) {
    if (name == attribute::kPntRef) {
      reference_.assign(value);
    } else {
      context.notHeld(element, name);
    }
  });
}

void PointReader::text(std::wstring_view text) {
  text_.assign(text);
  hasText_ = true;
}

bool PointReader::end(ReadContext& context, std::wstring_view element, Vertex& vertex) {
  vertex = Vertex();
  if (hasText_) {
    double values[3] = {};
    const int count = context.readCoordinates(text_, values, 3);
    if (count < 2) {
      context.malformed(std::wstring(element) + L" skipped, its text is not 2 or 3 numbers", text_);
      return false;
    }
    vertex.north = values[0];
    vertex.east = values[1];
    if (count == 3) vertex.height = values[2];
    return true;
  }
  DexDesignPoint* const point = reference_.empty() ? nullptr : context.findPoint(reference_);
  if (point == nullptr || !point->isHorizCoordsDefined()) {
    context.malformed(std::wstring(element) + L" skipped, it names no point read before",
                      reference_.empty() ? std::wstring_view(L"(no text, no pntRef)") : reference_);
    return false;
  }
  vertex = vertexOf(*point);
  vertex.point = nullptr;  // a coordinate taken from a point, not the point itself
  return true;
}

// ---- CoordGeomReader ---------------------------------------------------------------------------

void CoordGeomReader::begin(const ElementPath& path, std::wstring_view attributes) {
  context_.notHeldAttributes(element::kCoordGeom, attributes);
  base_ = path.depth();
  runs_.clear();
  onlyChains_ = true;
  kind_ = Kind::NONE;
}

bool CoordGeomReader::start(const ElementPath& path, std::wstring_view attributes) {
  const std::wstring_view name = path.name();
  if (level(path) == 1) {
    startElement(name, attributes);
    return kind_ != Kind::NONE;
  }
  if (level(path) != 2 || kind_ == Kind::NONE) return false;
  if (name == element::kPntList2D || name == element::kPntList3D) {
    if (kind_ != Kind::IRREGULAR_LINE) return false;
    listDimension_ = name == element::kPntList2D ? 2 : 3;
    return true;
  }
  if (name != element::kStart && name != element::kEnd && name != element::kCenter && name != element::kPi)
    return false;
  point_.start(context_, name, attributes);
  return true;
}

void CoordGeomReader::startElement(std::wstring_view name, std::wstring_view attributes) {
  kind_ = name == element::kLine            ? Kind::LINE
          : name == element::kCurve         ? Kind::CURVE
          : name == element::kIrregularLine ? Kind::IRREGULAR_LINE
          : name == element::kChain         ? Kind::CHAIN
                                            : Kind::NONE;
  if (kind_ == Kind::NONE) return;
  broken_ = false;
  hasStart_ = hasEnd_ = hasCenter_ = hasPi_ = false;
  rotation_ = 0;
  radius_ = kNoValue;
  list_.clear();
  listDimension_ = 0;
  chainText_.clear();
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (kind_ == Kind::CURVE && attribute == attribute::kRot) {
      rotation_ = value == kCounterClockwise ? 1 : value == kClockwise ? -1 : 0;
    } else if (kind_ == Kind::CURVE && attribute == attribute::kRadius) {
      if (context_.readCoordinates(value, &radius_, 1) != 1) radius_ = kNoValue;  // in the points' unit
    } else {
      context_.notHeld(name, attribute);
    }
  });
}

void CoordGeomReader::text(const ElementPath& path, std::wstring_view text) {
  if (kind_ == Kind::NONE) return;
  if (level(path) == 1 && kind_ == Kind::CHAIN) {
    chainText_.assign(text);
  } else if (level(path) == 2 && listDimension_ > 0 &&
             (path.name() == element::kPntList2D || path.name() == element::kPntList3D)) {
    if (!readNumberList(text, list_)) {
      context_.malformed(L"IrregularLine skipped, its point list is not numbers", text.substr(0, 80));
      broken_ = true;
    }
  } else if (level(path) == 2) {
    point_.text(text);
  }
}

bool CoordGeomReader::end(const ElementPath& path) {
  if (level(path) == 0) {
    base_ = 0;
    return true;
  }
  if (kind_ == Kind::NONE) return false;
  if (level(path) == 1) {
    endElement();
    kind_ = Kind::NONE;
    return false;
  }
  if (level(path) != 2) return false;
  const std::wstring_view name = path.name();
  if (name == element::kPntList2D || name == element::kPntList3D) return false;
  Vertex vertex;
  if (!point_.end(context_, name, vertex)) {
    broken_ = true;
    return false;
  }
  if (name == element::kStart) {
    start_ = vertex;
    hasStart_ = true;
  } else if (name == element::kEnd) {
    end_ = vertex;
    hasEnd_ = true;
  } else if (name == element::kCenter) {
    center_ = vertex;
    hasCenter_ = true;
  } else {
    pi_ = vertex;
    hasPi_ = true;
  }
  return false;
}

void CoordGeomReader::endElement() {
  if (kind_ == Kind::CHAIN) {
    addChain();
    return;
  }
  onlyChains_ = false;
  if (broken_) return;  // its malformed part was recorded
  if (!hasStart_ || !hasEnd_) {
    context_.malformed(L"CoordGeom element skipped, it lacks its Start or End", L"");
    return;
  }
  switch (kind_) {
    case Kind::LINE:
      addSegment(start_, end_, 0.0);
      break;
    case Kind::CURVE:
      addCurve();
      break;
    case Kind::IRREGULAR_LINE:
      addIrregularLine();
      break;
    default:
      break;
  }
}

void CoordGeomReader::addCurve() {
  const double chord = std::hypot(end_.north - start_.north, end_.east - start_.east);
  const bool closedCircle = chord < kSamePosition;
  double delta = 0.0;  // the central angle, counter-clockwise positive
  if (hasCenter_ && std::hypot(start_.north - center_.north, start_.east - center_.east) >= kSamePosition &&
      radius_ != 0.0) {
    const double turn = planAngle(center_, end_) - planAngle(center_, start_);
    const double ccw = closedCircle ? 2 * kPi : sweep(turn);
    const double cw = closedCircle ? 2 * kPi : sweep(-turn);
    const int rotation = rotation_ != 0 ? rotation_ : (ccw <= kPi ? 1 : -1);  // without rot: the minor arc
    delta = rotation > 0 ? ccw : -cw;
  } else if (!hasCenter_ && hasPi_ && !closedCircle) {
    const double inNorth = pi_.north - start_.north, inEast = pi_.east - start_.east;
    const double outNorth = end_.north - pi_.north, outEast = end_.east - pi_.east;
    const double cross = inEast * outNorth - inNorth * outEast;  // positive: a left (ccw) turn
    delta = std::atan2(cross, inEast * outEast + inNorth * outNorth);
  } else if (!hasCenter_ && radius_ != kNoValue && radius_ > 0.0 && !closedCircle && chord <= 2 * radius_ &&
             rotation_ != 0) {
    delta = rotation_ * 2 * std::asin(chord / (2 * radius_));
  } else {
    context_.malformed(L"Curve of zero radius read as its chord", L"");
    if (!closedCircle) addSegment(start_, end_, 0.0);
    return;
  }
  if (closedCircle) {
    // A full circle: two half arcs through the point opposite the start.
    Vertex opposite = start_;
    opposite.north = 2 * center_.north - start_.north;
    opposite.east = 2 * center_.east - start_.east;
    const double half = delta > 0 ? 1.0 : -1.0;
    addSegment(start_, opposite, half);
    addSegment(opposite, end_, half);
    return;
  }
  addSegment(start_, end_, std::tan(delta / 4));
}

void CoordGeomReader::addIrregularLine() {
  const std::size_t dimension = static_cast<std::size_t>(listDimension_);
  if (dimension == 0 || list_.size() % dimension != 0 || !context_.toMeters(list_)) {
    context_.malformed(L"IrregularLine skipped, its point list is not whole points", L"");
    return;
  }
  Vertex previous = start_;
  for (std::size_t i = 0; i < list_.size(); i += dimension) {
    Vertex vertex;
    vertex.north = list_[i];
    vertex.east = list_[i + 1];
    if (dimension == 3) vertex.height = list_[i + 2];
    if (!isSamePosition(previous, vertex)) addSegment(previous, vertex, 0.0);
    previous = vertex;
  }
  if (!isSamePosition(previous, end_)) addSegment(previous, end_, 0.0);
}

void CoordGeomReader::addChain() {
  Words words(chainText_);
  std::wstring_view name;
  bool first = true;
  while (words.next(name)) {
    const DexDesignPoint* point = context_.findPoint(name);
    if (point == nullptr || !point->isHorizCoordsDefined()) {
      context_.malformed(L"Chain point skipped, it names no point read before", name);
      first = true;  // the line breaks at the missing point
      continue;
    }
    const Vertex vertex = vertexOf(*point);
    if (first && (runs_.empty() || runs_.back().vertices.empty() ||
                  !isSamePosition(runs_.back().vertices.back(), vertex))) {
      runs_.emplace_back();
    }
    if (!first || runs_.back().vertices.empty()) {
      addVertex(vertex);
    } else {
      runs_.back().vertices.back() = vertex;  // the joint is the named point
    }
    first = false;
  }
}

void CoordGeomReader::addSegment(const Vertex& start, const Vertex& end, double bulge) {
  if (runs_.empty() || runs_.back().vertices.empty() ||
      !isSamePosition(runs_.back().vertices.back(), start)) {
    runs_.emplace_back();
    addVertex(start);
  }
  runs_.back().vertices.back().bulge = bulge;
  addVertex(end);
}

void CoordGeomReader::addVertex(const Vertex& vertex) {
  Vertex added = vertex;
  added.bulge = 0.0;
  runs_.back().vertices.push_back(added);
}

}  // namespace vyn::ie::landxml
