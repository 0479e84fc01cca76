#include "DxfEntityWriter.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <numbers>

#include "DxfText.h"
#include "ieObjects/IEArcs.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/IESurface.h"
#include "ieObjects/IETextLabel.h"
#include "ieUtils/DrawingPropertiesHelpers.h"
#include "ieUtils/IEUtilsUnits.h"
#include "pointfiles/CodeText.h"

namespace vyn::ie::dxf {

namespace {

using EDashStyle = DexDrawLineProperties::EDashStyleType;

constexpr double kNoHeightHere = std::numeric_limits<double>::quiet_NaN();
constexpr double kAttributeHeightMeters = 0.25;
constexpr double kDefaultTextHeightMeters = 1.0;
constexpr int kMaxDecimals = 12;
constexpr int kPolyline3d = 8;
constexpr int kVertex3d = 32;

bool isImperial(EDistUnits units) {
  switch (units) {
    case USFEET:
    case IFEET:
    case MILE:
    case INCHES:
    case USINCHES:
    case MICROINCHES:
    case EDistUnits::MILS:
    case IYARDS:
    case USYARDS:
      return true;
    default:
      return false;
  }
}

// The layer's properties of type when they define the value, for getObjectStyle's default layer
// (which logs when it is asked for a value it does not define).
const DexLayer* definingColor(const DexLayer* layer, int type) {
  unsigned long color = 0;
  const IDexDrawProperties* properties = layer == nullptr ? nullptr : layer->getDrawProperties(type);
  return properties != nullptr && properties->getColor(color) ? layer : nullptr;
}

const DexLayer* definingLine(const DexLayer* layer, bool dash) {
  const DexDrawLineProperties* line = layer == nullptr ? nullptr : layer->getDrawLineProperties();
  EDashStyle style = DexDrawLineProperties::DASH_SOLID;
  unsigned char width = 0;
  if (line == nullptr) return nullptr;
  return (dash ? line->getDashStyle(style) : line->getWidth(width)) ? layer : nullptr;
}

bool isExplicit(EStyleDefinitionObject source) {
  return source != STYLE_FROM_LAYER && source != STYLE_NOT_FOUND;
}

// The TEXT justification (72, 73) of a label's insertion point.
std::pair<int, int> justificationOf(int insertion) {
  if (insertion < DexTextLabel::INSERT_TOP_LEFT || insertion > DexTextLabel::INSERT_BOTTOM_RIGHT)
    insertion = DexTextLabel::INSERT_BOTTOM_LEFT;
  const int row = (insertion - 1) / 3;
  const int column = (insertion - 1) % 3;
  const int vertical = row == 0 ? 3 : row == 1 ? 2 : column == 0 ? 0 : 1;
  return {column, vertical};
}

}  // namespace

DxfEntityWriter::DxfEntityWriter(DexData& data)
    : data_(data),
      dataset_(data.getNumberOfDatasets() > 0 ? data.getCurDataset() : nullptr),
      minX_(1.0),
      minY_(1.0),
      minZ_(0.0),
      maxX_(0.0),
      maxY_(0.0),
      maxZ_(0.0) {
  const DexSettings& settings = data.getSettings();
  DexAutoCadUtils& cad = styles_.cad();
  cad.setDistUnits(settings.distUnits);
  if (cad.getDistUnits() == USCHAINS || cad.getDistUnits() == ICHAINS) cad.setDistUnits(METERS);
  unitsCode_ = cad.getAutoCadDistUnits();
  toUnits_ = utils::fromMetersFactor(1.0, cad.getDistUnits());
  decimals_ = {std::clamp(settings.coordDecimals[1], 0, kMaxDecimals),
               std::clamp(settings.coordDecimals[0], 0, kMaxDecimals),
               std::clamp(settings.coordDecimals[2], 0, kMaxDecimals)};
  lengthDecimals_ = std::max(decimals_[0], decimals_[1]);
  points_ = settings.hasDataType(POINTS) || settings.hasDataType(POINT_LISTS);
  lines_ = settings.hasDataType(LINES);
  areas_ = settings.hasDataType(AREAS);
  surfaces_ = settings.hasDataType(SURFACES);
  labels_ = points_ || lines_;
  if (const DexDrawDictionary* dictionary = data.getIEDrawDictionary(); dictionary != nullptr)
    defaultLayer_ = dictionary->getDefaultLayer();
}

// ---- The frame --------------------------------------------------------------------------------------

void DxfEntityWriter::notePosition(double north, double east, double height) {
  const double px = units(east);
  const double py = units(north);
  const double pz = std::isfinite(height) && height != kNoValue && height != kNoHeight ? units(height) : 0.0;
  if (minX_ > maxX_) {
    minX_ = maxX_ = px;
    minY_ = maxY_ = py;
    minZ_ = maxZ_ = pz;
    return;
  }
  minX_ = std::min(minX_, px);
  maxX_ = std::max(maxX_, px);
  minY_ = std::min(minY_, py);
  maxY_ = std::max(maxY_, py);
  minZ_ = std::min(minZ_, pz);
  maxZ_ = std::max(maxZ_, pz);
}

void DxfEntityWriter::noteLayer(const DexLayer* layer) {
  if (layer == nullptr || layerNames_.count(layer) > 0) return;
  const CVynStringT<wchar_t> legal =
      styles_.cad().createCorrectCadName(DexAutoCadUtils::CAD_NAME_SYMBOL_TABLE, layer->getName(), true);
  std::string name;
  appendEncoded(name, legal.view());
  layerNames_.emplace(layer, name);
  layers_.push_back(layer);
}

// Every layer of the dictionary, then those objects refer to that it does not hold, and the extent.
void DxfEntityWriter::scan() {
  if (const DexDrawDictionary* dictionary = data_.getIEDrawDictionary(); dictionary != nullptr) {
    for (int i = 0; i < dictionary->getNumberOfLayers(); ++i)
      noteLayer(dictionary->getLayerAt(i));
  }
  if (dataset_ == nullptr) return;
  const int count = dataset_->getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
  for (int i = 0; i < count; ++i) {
    const DexObject* object = dataset_->getObjectAt(i);
    if (object == nullptr) continue;
    noteLayer(object->getLayer());
    if (const auto* point = dynamic_cast<const DexDesignPoint*>(object); point != nullptr) {
      const DexStation& station = point->getStation();
      if (station.isHorizCoordsDefined())
        notePosition(station.getX(), station.getY(), station.isHeightDefined() ? station.getZ() : kNoValue);
    } else if (const auto* line = dynamic_cast<const DexPolyLine*>(object); line != nullptr) {
      for (int n = 0; n < line->getNumberOfNodes(); ++n) {
        const DexStation& station = line->getNodeStation(n);
        notePosition(station.getX(), station.getY(), station.isHeightDefined() ? station.getZ() : kNoValue);
      }
    } else if (const auto* arc = dynamic_cast<const DexArc*>(object); arc != nullptr) {
      notePosition(arc->getStation().getX(), arc->getStation().getY(), arc->getStation().getZ());
    } else if (const auto* circle = dynamic_cast<const DexCircle*>(object); circle != nullptr) {
      notePosition(circle->getStation().getX(), circle->getStation().getY(), circle->getStation().getZ());
    } else if (const auto* label = dynamic_cast<const DexTextLabel*>(object); label != nullptr) {
      notePosition(label->getStation().getX(), label->getStation().getY(), label->getStation().getZ());
    }
  }
  for (int i = 0; i < dataset_->getNumberOfRegions(); ++i) {
    const DexRegion* region = dataset_->getRegionAt(i);
    noteLayer(region->getLayer());
    for (std::size_t v = 0; v < region->getVerticesCount(); ++v)
      notePosition(region->getVertexAt(v).getX(), region->getVertexAt(v).getY(),
                   region->getVertexAt(v).getZ());
  }
  for (int i = 0; i < dataset_->getNumberOfSurfaces(); ++i) {
    const DexSurface* surface = dataset_->getSurfaceAt(i);
    noteLayer(surface->getLayer());
    for (int p = 0; p < surface->getNumberOfPositions(); ++p)
      notePosition(surface->getPositionAt(p).getX(), surface->getPositionAt(p).getY(),
                   surface->getPositionAt(p).getZ());
  }
}

DxfLayerRow DxfEntityWriter::layerRow(const DexLayer* layer, const std::string& name) const {
  DxfLayerRow row;
  row.name = name;
  if (layer == nullptr) return row;
  unsigned long color = 0;
  bool hasColor = false;
  for (const int type :
       {IDexDrawProperties::DRAW_LINE, IDexDrawProperties::DRAW_POINT, IDexDrawProperties::DRAW_AREA}) {
    const IDexDrawProperties* properties = layer->getDrawProperties(type);
    if (!hasColor && properties != nullptr) hasColor = properties->getColor(color);
  }
  if (hasColor) {
    bool exact = false;
    row.color = styles_.indexOf(color, exact);
    if (!exact) row.trueColor = DxfStyles::trueColorOf(color);
  }
  if (const DexDrawLineProperties* line = layer->getDrawLineProperties(); line != nullptr) {
    EDashStyle dash = DexDrawLineProperties::DASH_SOLID;
    if (line->getDashStyle(dash)) {
      std::string lineType;
      appendEncoded(lineType, styles_.lineTypeOf(dash));
      row.lineType = lineType;
    }
    unsigned char width = 0;
    if (line->getWidth(width)) row.lineWeight = styles_.lineWeightOf(width);
  }
  row.on = layer->isActive();
  row.plot = layer->isPlot();
  return row;
}

DxfFrame DxfEntityWriter::frame() {
  DxfFrame frame;
  frame.unitsCode = unitsCode_;
  frame.metric = !isImperial(styles_.cad().getDistUnits());
  frame.toUnits = toUnits_;
  frame.attributeHeight = units(kAttributeHeightMeters);
  frame.decimals = lengthDecimals_;
  frame.minX = minX_;
  frame.minY = minY_;
  frame.minZ = minZ_;
  frame.maxX = maxX_;
  frame.maxY = maxY_;
  frame.maxZ = maxZ_;
  // Layer "0" first, each legal name once.
  std::vector<std::string> written;
  const auto add = [&](const DexLayer* layer, const std::string& name) {
    if (std::find(written.begin(), written.end(), name) != written.end()) return;
    written.push_back(name);
    frame.layers.push_back(layerRow(layer, name));
  };
  const auto zero = std::find_if(layers_.begin(), layers_.end(), [this](const DexLayer* layer) {
    return layerNames_.at(layer) == zeroLayer_;
  });
  add(zero == layers_.end() ? nullptr : *zero, zeroLayer_);
  for (const DexLayer* layer : layers_)
    add(layer, layerNames_.at(layer));
  return frame;
}

bool DxfEntityWriter::begin(const std::string& path) {
  if (!writer_.open(path)) return false;
  scan();
  writeFrameStart(writer_, frame());
  return true;
}

bool DxfEntityWriter::end() {
  const bool written = writeFrameEnd(writer_);
  return writer_.close() && written;
}

// ---- Common parts ------------------------------------------------------------------------------------

double DxfEntityWriter::x(const DexStation& station) const {
  return units(station.getY());
}

double DxfEntityWriter::y(const DexStation& station) const {
  return units(station.getX());
}

double DxfEntityWriter::z(const DexStation& station) const {
  return station.isHeightDefined() && station.getZ() != kNoValue ? units(station.getZ()) : 0.0;
}

void DxfEntityWriter::position(int code, double px, double py, double pz) {
  writer_.real(code, px, decimals_[0]);
  writer_.real(code + 10, py, decimals_[1]);
  writer_.real(code + 20, pz, decimals_[2]);
}

const std::string& DxfEntityWriter::layerName(const DexLayer* layer) const {
  if (layer == nullptr) return zeroLayer_;
  const auto found = layerNames_.find(layer);
  return found == layerNames_.end() ? zeroLayer_ : found->second;
}

DxfEntityWriter::Style DxfEntityWriter::colorStyle(bool defined, unsigned long color) const {
  Style style;
  if (!defined) return style;
  bool exact = false;
  style.color = styles_.indexOf(color, exact);
  if (!exact) style.trueColor = DxfStyles::trueColorOf(color);
  return style;
}

DxfEntityWriter::Style DxfEntityWriter::styleOf(const DexObject& object, int colorType, bool withLine) const {
  unsigned long color = 0;
  const EStyleDefinitionObject colorSource =
      getObjectStyle(colorType, &object, color, definingColor(defaultLayer_, colorType));
  Style style = colorStyle(isExplicit(colorSource), color);
  if (!withLine) return style;
  EDashStyle dash = DexDrawLineProperties::DASH_SOLID;
  if (isExplicit(
          getObjectStyle(IDexDrawProperties::DRAW_LINE, &object, dash, definingLine(defaultLayer_, true))))
    style.lineType = styles_.lineTypeOf(dash);
  unsigned char width = 1;
  if (isExplicit(
          getObjectStyle(IDexDrawProperties::DRAW_LINE, &object, width, definingLine(defaultLayer_, false))))
    style.lineWeight = styles_.lineWeightOf(width);
  return style;
}

void DxfEntityWriter::beginEntity(std::string_view type, std::string_view layer, const Style& style) {
  writer_.group(0, type);
  writer_.handle();
  writer_.reference(330, handle::kModelSpace);
  writer_.group(100, "AcDbEntity");
  writer_.group(8, layer);
  if (!style.lineType.empty()) writer_.text(6, style.lineType);
  if (style.color != kColorByLayer) writer_.group(62, style.color);
  if (style.trueColor >= 0) writer_.group(420, style.trueColor);
  if (style.lineWeight != kLineWeightByLayer) writer_.group(370, style.lineWeight);
}

DxfEntityWriter::Extras DxfEntityWriter::extrasOf(const DexObject& object, std::string_view kind) {
  Extras extras;
  extras.name = object.getName().view();
  point_files::appendCodesText(object, true, true, extras.codes);
  extras.kind = kind;
  return extras;
}

void DxfEntityWriter::writeExtras(const Extras& extras) {
  if (extras.kind.empty()) return;
  writer_.group(1001, kApplication);
  writer_.group(1000, extras.kind);
  writer_.text(1000, extras.name, kMaxXdataTextBytes);
  writer_.text(1000, extras.codes, kMaxXdataTextBytes);
  if (!extras.surface.empty()) writer_.text(1000, extras.surface, kMaxXdataTextBytes);
}

// ---- Objects -----------------------------------------------------------------------------------------

void DxfEntityWriter::writeObject(DexObject* object) {
  if (object == nullptr) return;
  if (const auto* point = dynamic_cast<const DexDesignPoint*>(object); point != nullptr) {
    if (points_) writePoint(*point);
  } else if (const auto* area = dynamic_cast<const DexArea*>(object); area != nullptr) {
    if (areas_) writeLine(*area, kind::kArea, styleOf(*area, IDexDrawProperties::DRAW_AREA, true));
  } else if (const auto* breakline = dynamic_cast<const DexBreakline*>(object); breakline != nullptr) {
    if (lines_)
      writeLine(*breakline, kind::kBreakline, styleOf(*breakline, IDexDrawProperties::DRAW_LINE, true));
  } else if (const auto* line = dynamic_cast<const DexPolyLine*>(object); line != nullptr) {
    if (lines_) writeLine(*line, kind::kPolyline, styleOf(*line, IDexDrawProperties::DRAW_LINE, true));
  } else if (const auto* arc = dynamic_cast<const DexArc*>(object); arc != nullptr) {
    if (lines_) writeArc(*arc);
  } else if (const auto* circle = dynamic_cast<const DexCircle*>(object); circle != nullptr) {
    if (lines_) writeCircle(*circle);
  } else if (const auto* label = dynamic_cast<const DexTextLabel*>(object); label != nullptr) {
    if (labels_) writeLabel(*label);
  }
}

void DxfEntityWriter::writePoint(const DexDesignPoint& point) {
  const DexStation& station = point.getStation();
  if (!station.isHorizCoordsDefined()) return;
  const std::string& layer = layerName(point.getLayer());
  const Style style = styleOf(point, IDexDrawProperties::DRAW_POINT, false);
  const double px = x(station);
  const double py = y(station);
  const double pz = z(station);
  beginEntity("POINT", layer, style);
  writer_.group(100, "AcDbPoint");
  position(10, px, py, pz);

  beginEntity(word::kInsert, layer, style);
  writer_.group(100, "AcDbBlockReference");
  writer_.group(66, 1);
  writer_.group(2, kPointBlock);
  position(10, px, py, pz);
  const std::string height =
      station.isHeightDefined() ? DxfWriter::realText(pz, decimals_[2]) : std::string();
  std::wstring codes;
  point_files::appendCodesText(point, true, true, codes);
  Style byBlock;
  byBlock.color = kColorByBlock;
  const double textHeight = units(kAttributeHeightMeters);
  for (const DxfPointTag& tag : kPointTags) {
    beginEntity(word::kAttribute, layer, byBlock);
    writer_.group(100, "AcDbText");
    position(10, px + tag.dx * textHeight, py + tag.dy * textHeight, pz);
    writer_.real(40, textHeight, lengthDecimals_);
    if (tag.tag == kNameTag) {
      writer_.text(1, withControlCodesEscaped(point.getName().view()));
    } else if (tag.tag == kHeightTag) {
      writer_.group(1, height);
    } else {
      writer_.text(1, withControlCodesEscaped(codes));
    }
    writer_.group(100, "AcDbAttribute");
    writer_.group(2, tag.tag);
    writer_.group(70, 0);
  }
  beginEntity(word::kSequenceEnd, layer, Style{});
}

void DxfEntityWriter::writeLine(const DexPolyLine& line, std::string_view kind, const Style& style) {
  vertices_.clear();
  for (int n = 0; n < line.getNumberOfNodes(); ++n) {
    const DexStation& station = line.getNodeStation(n);
    vertices_.push_back({x(station), y(station), station.isHeightDefined() ? z(station) : kNoHeightHere,
                         line.getNodeBulge(n)});
  }
  Extras extras = extrasOf(line, kind);
  if (kind == kind::kPolyline && extras.name.empty() && extras.codes.empty()) extras.kind = {};
  if (const auto* breakline = dynamic_cast<const DexBreakline*>(&line); breakline != nullptr)
    extras.surface = breakline->getSurfaceName().view();
  writeVertices(layerName(line.getLayer()), style, vertices_, line.isClosed() || kind == kind::kArea, true,
                extras);
}

void DxfEntityWriter::writeVertices(std::string_view layer, const Style& style,
                                    const std::vector<Vertex>& vertices, bool closed, bool heights,
                                    const Extras& extras) {
  if (vertices.empty()) return;
  const auto defined = [](const Vertex& vertex) { return !std::isnan(vertex.z); };
  const bool anyHeight = heights && std::any_of(vertices.begin(), vertices.end(), defined);
  const bool flat = std::all_of(vertices.begin(), vertices.end(), [&](const Vertex& vertex) {
    return defined(vertex) && vertex.z == vertices.front().z;
  });
  const auto height = [](const Vertex& vertex) { return std::isnan(vertex.z) ? 0.0 : vertex.z; };
  if (!anyHeight || flat) {
    beginEntity(word::kLwPolyline, layer, style);
    writer_.group(100, "AcDbPolyline");
    writer_.group(90, static_cast<long long>(vertices.size()));
    writer_.group(70, closed ? 1 : 0);
    if (anyHeight) writer_.real(38, vertices.front().z, decimals_[2]);
    for (const Vertex& vertex : vertices) {
      writer_.real(10, vertex.x, decimals_[0]);
      writer_.real(20, vertex.y, decimals_[1]);
      if (vertex.bulge != 0.0) writer_.exact(42, vertex.bulge);
    }
    writeExtras(extras);
    return;
  }
  beginEntity(word::kPolyline, layer, style);
  writer_.group(100, "AcDb3dPolyline");
  writer_.group(66, 1);
  position(10, 0.0, 0.0, 0.0);
  writer_.group(70, kPolyline3d | (closed ? 1 : 0));
  writeExtras(extras);
  for (const Vertex& vertex : vertices) {
    beginEntity(word::kVertex, layer, Style{});
    writer_.group(100, "AcDbVertex");
    writer_.group(100, "AcDb3dPolylineVertex");
    position(10, vertex.x, vertex.y, height(vertex));
    if (vertex.bulge != 0.0) writer_.exact(42, vertex.bulge);
    writer_.group(70, kVertex3d);
  }
  beginEntity(word::kSequenceEnd, layer, Style{});
}

void DxfEntityWriter::writeRegion(const DexRegion& region) {
  if (!areas_) return;
  vertices_.clear();
  for (std::size_t v = 0; v < region.getVerticesCount(); ++v) {
    const DexPositionWithBulge& vertex = region.getVertexAt(v);
    const bool hasHeight = vertex.getZ() != kNoValue && vertex.getZ() != kNoHeight;
    vertices_.push_back({units(vertex.getY()), units(vertex.getX()),
                         hasHeight ? units(vertex.getZ()) : kNoHeightHere, vertex.getBulge()});
  }
  unsigned long color = 0;
  const DexDrawAreaProperties* fill = region.getAreaDrawProperties();
  const Style style = colorStyle(fill != nullptr && fill->getColor(color), color);
  Extras extras;
  extras.kind = kind::kRegion;
  extras.name = region.getName().view();
  writeVertices(layerName(region.getLayer()), style, vertices_, true, true, extras);
}

void DxfEntityWriter::writeArc(const DexArc& arc) {
  const DexStation& centre = arc.getStation();
  const bool clockwise = arc.isClockwise();
  Extras extras = extrasOf(arc, clockwise ? kind::kClockwiseArc : kind::kArc);
  if (!clockwise && extras.name.empty() && extras.codes.empty()) extras.kind = {};
  beginEntity(word::kArc, layerName(arc.getLayer()), styleOf(arc, IDexDrawProperties::DRAW_LINE, true));
  writer_.group(100, "AcDbCircle");
  position(10, x(centre), y(centre), units(centre.getZ()));
  writer_.exact(40, units(arc.getData(DexArc::ARC_RADIUS)));
  writer_.group(100, "AcDbArc");
  // An arc of the drawing runs counter-clockwise from its start to its end.
  const double start = arc.getData(DexArc::ARC_START_ANGLE);
  const double end = arc.getData(DexArc::ARC_END_ANGLE);
  writer_.exact(50, clockwise ? end : start);
  writer_.exact(51, clockwise ? start : end);
  writeExtras(extras);
}

void DxfEntityWriter::writeCircle(const DexCircle& circle) {
  const DexStation& centre = circle.getStation();
  Extras extras = extrasOf(circle, kind::kCircle);
  if (extras.name.empty() && extras.codes.empty()) extras.kind = {};
  beginEntity(word::kCircle, layerName(circle.getLayer()),
              styleOf(circle, IDexDrawProperties::DRAW_LINE, true));
  writer_.group(100, "AcDbCircle");
  position(10, x(centre), y(centre), units(centre.getZ()));
  writer_.exact(40, units(circle.getData(DexCircle::CIRCLE_RADIUS)));
  writeExtras(extras);
}

void DxfEntityWriter::writeLabel(const DexTextLabel& label) {
  const DexStation& station = label.getStation();
  const std::wstring_view text = label.getText().view();
  const double height =
      units(label.getHeightInMeters() > 0.0 ? label.getHeightInMeters() : kDefaultTextHeightMeters);
  const double rotation = label.getRotationAngle();
  const double px = x(station);
  const double py = y(station);
  const double pz = z(station);
  Extras extras = extrasOf(label, kind::kLabel);
  if (extras.name.empty() && extras.codes.empty()) extras.kind = {};
  const std::string& layer = layerName(label.getLayer());
  const Style style = styleOf(label, IDexDrawProperties::DRAW_POINT, false);
  if (text.find(L'\n') != std::wstring_view::npos) {
    beginEntity(word::kMText, layer, style);
    writer_.group(100, "AcDbMText");
    position(10, px, py, pz);
    writer_.real(40, height, lengthDecimals_);
    const int insertion = label.getInsertionPoint();
    writer_.group(71, insertion >= 1 && insertion <= 9 ? insertion : DexTextLabel::INSERT_BOTTOM_LEFT);
    writer_.group(72, 1);
    std::string encoded;
    appendMTextEncoded(encoded, text);
    std::string_view rest = encoded;
    while (rest.size() > kMTextChunkBytes) {
      writer_.group(3, rest.substr(0, kMTextChunkBytes));
      rest.remove_prefix(kMTextChunkBytes);
    }
    writer_.group(1, rest);
    const double radians = rotation * std::numbers::pi / 180.0;
    writer_.exact(11, std::cos(radians));
    writer_.exact(21, std::sin(radians));
    writer_.exact(31, 0.0);
    writeExtras(extras);
    return;
  }
  const auto [horizontal, vertical] = justificationOf(label.getInsertionPoint());
  beginEntity(word::kText, layer, style);
  writer_.group(100, "AcDbText");
  position(10, px, py, pz);
  writer_.real(40, height, lengthDecimals_);
  writer_.text(1, withControlCodesEscaped(text));
  if (rotation != 0.0) writer_.exact(50, rotation);
  if (horizontal != 0) writer_.group(72, horizontal);
  if (horizontal != 0 || vertical != 0) position(11, px, py, pz);
  writer_.group(100, "AcDbText");
  if (vertical != 0) writer_.group(73, vertical);
  writeExtras(extras);
}

void DxfEntityWriter::writeSurface(const DexSurface& surface) {
  if (!surfaces_) return;
  const std::string& layer = layerName(surface.getLayer());
  unsigned long color = 0;
  const DexDrawLineProperties* properties = surface.getDrawProperties();
  const Style style = colorStyle(properties != nullptr && properties->getColor(color), color);
  // The importer names a surface after its layer; any other name goes with the faces.
  const CVynStringT<wchar_t> layerOwnName =
      surface.getLayer() == nullptr
          ? CVynStringT<wchar_t>(L"0")
          : styles_.cad().createCorrectCadName(DexAutoCadUtils::CAD_NAME_SYMBOL_TABLE,
                                               surface.getLayer()->getName(), true);
  Extras extras;
  if (surface.getName() != layerOwnName) {
    extras.kind = kind::kSurface;
    extras.name = surface.getName().view();
  }
  const int positions = surface.getNumberOfPositions();
  for (int t = 0; t < surface.getNumberOfTriangles(); ++t) {
    const DexTriangle* triangle = surface.getTriangleAt(t);
    int corners[3];
    bool valid = true;
    for (int k = 0; k < 3; ++k) {
      corners[k] = triangle->getPosition(k);
      valid = valid && corners[k] >= 0 && corners[k] < positions;
    }
    if (!valid) continue;
    beginEntity(word::kFace, layer, style);
    writer_.group(100, "AcDbFace");
    for (int k = 0; k < 4; ++k) {
      const DexPosition3D& corner = surface.getPositionAt(corners[std::min(k, 2)]);
      position(10 + k, units(corner.getY()), units(corner.getX()), units(corner.getZ()));
    }
    writeExtras(extras);
  }
}

}  // namespace vyn::ie::dxf
