#include "DxfTestModel.h"

#include <tuple>

#include "dxf/DxfWords.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEArcs.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/IESurface.h"
#include "ieObjects/IETextLabel.h"
#include "ieUtils/DrawingPropertiesHelpers.h"
#include "pointfiles/CodeText.h"
#include "support/FixedText.h"
#include "support/TempDir.h"

namespace dxf_test {

using namespace vyn::ie;

namespace {

constexpr unsigned long kRed = 0x0000FF;
constexpr unsigned long kGreen = 0x00FF00;
constexpr unsigned long kBlue = 0xFF0000;
constexpr unsigned long kOrange = 0x0080FF;  // no palette entry: written as a true colour

std::string number(double value) {
  return dex_test::fixedText(value == 0.0 ? 0.0 : value, 3);
}

std::string utf8(const CVynStringT<wchar_t>& text) {
  return vyn_text::toUtf8(text.view());
}

DexLayer* addLayer(DexData& data, const wchar_t* name, unsigned long color, int dash, int width) {
  auto* layer = new DexLayer();
  layer->setName(name);
  auto* line = new DexDrawLineProperties(color, static_cast<unsigned char>(width),
                                         static_cast<DexDrawLineProperties::EDashStyleType>(dash));
  layer->setDrawProperties(IDexDrawProperties::DRAW_LINE, line);
  layer->setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawPointProperties());
  layer->setDrawProperties(IDexDrawProperties::DRAW_AREA, new DexDrawAreaProperties());
  layer->setColor(color);
  data.getIEDrawDictionary()->addLayer(layer);
  return layer;
}

// An object on layer with the codes of codeText; a coded object says that its values come from its
// layer (otherwise its codes would be asked for them).
template <class T>
T* placed(T* object, const DexLayer* layer, point_files::CodeReader& codes, const wchar_t* codeText = L"") {
  object->setLayer(layer, false);
  std::wstring rejected;
  codes.read(codeText, *object, rejected);
  if (object->getNumberOfCodes() == 0) return object;
  IDexDrawProperties* properties = nullptr;
  if (dynamic_cast<DexDesignPoint*>(object) != nullptr || dynamic_cast<DexTextLabel*>(object) != nullptr) {
    properties = new DexDrawPointProperties();
  } else {
    auto* line = new DexDrawLineProperties();
    line->setDashStyleByLayer();
    line->setWidthByLayer();
    properties = line;
  }
  properties->setColorByLayer();
  object->setDrawProperties(properties);
  return object;
}

DexStation station(double north, double east, double height, double bulge = 0.0) {
  DexStation at;
  at.setPosition(north, east, height);
  at.setBulge(bulge);
  return at;
}

template <class T>
std::string style(const DexObject& object, int type) {
  T value{};
  return getObjectStyle(type, &object, value, nullptr) == STYLE_NOT_FOUND
             ? "-"
             : std::to_string(static_cast<long>(value));
}

std::string common(const DexObject& object, const char* kind, int colorType) {
  std::wstring codes;
  point_files::appendCodesText(object, true, true, codes);
  const DexLayer* layer = object.getLayer();
  return std::string(kind) + " '" + utf8(object.getName()) +
         "' layer=" + (layer ? utf8(layer->getName()) : "-") + " codes=" + vyn_text::toUtf8(codes) +
         " color=" + style<unsigned long>(object, colorType);
}

std::string lineStyle(const DexObject& object) {
  return " dash=" + style<DexDrawLineProperties::EDashStyleType>(object, IDexDrawProperties::DRAW_LINE) +
         " width=" + style<unsigned char>(object, IDexDrawProperties::DRAW_LINE);
}

std::string where(const DexStation& at) {
  return " (" + number(at.getX()) + " " + number(at.getY()) + " " +
         (at.isHeightDefined() ? number(at.getZ()) : "-") + ")";
}

std::string describeObject(DexObject& object) {
  if (auto* point = dynamic_cast<DexDesignPoint*>(&object))
    return common(object, "point", IDexDrawProperties::DRAW_POINT) + where(point->getStation());
  if (auto* line = dynamic_cast<DexPolyLine*>(&object)) {
    const bool area = object.getType() == OBJECT_TYPE_AREA;
    std::string text = common(object, area ? "area" : "line",
                              area ? IDexDrawProperties::DRAW_AREA : IDexDrawProperties::DRAW_LINE) +
                       lineStyle(object) + (line->isClosed() ? " closed" : " open");
    if (auto* breakline = dynamic_cast<DexBreakline*>(line))
      text += " breakline of " + utf8(breakline->getSurfaceName());
    for (int n = 0; n < line->getNumberOfNodes(); ++n)
      text += where(line->getNodeStation(n)) + "b" + number(line->getNodeBulge(n));
    return text;
  }
  if (auto* arc = dynamic_cast<DexArc*>(&object)) {
    return common(object, "arc", IDexDrawProperties::DRAW_LINE) + lineStyle(object) +
           where(arc->getStation()) + " r=" + number(arc->getData(DexArc::ARC_RADIUS)) + " from " +
           number(arc->getData(DexArc::ARC_START_ANGLE)) + " to " +
           number(arc->getData(DexArc::ARC_END_ANGLE)) + (arc->isClockwise() ? " clockwise" : "");
  }
  if (auto* circle = dynamic_cast<DexCircle*>(&object))
    return common(object, "circle", IDexDrawProperties::DRAW_LINE) + where(circle->getStation()) +
           " r=" + number(circle->getData(DexCircle::CIRCLE_RADIUS));
  if (auto* label = dynamic_cast<DexTextLabel*>(&object)) {
    return common(object, "text", IDexDrawProperties::DRAW_POINT) + where(label->getStation()) + " '" +
           utf8(label->getText()) + "' h=" + number(label->getHeightInMeters()) +
           " rot=" + number(label->getRotationAngle()) + " at=" + std::to_string(label->getInsertionPoint());
  }
  return "other";
}

}  // namespace

DexSettings drawingSettings() {
  DexSettings settings;
  for (const EDexDataType type : {POINTS, LINES, AREAS, SURFACES})
    settings.addDataType(type);
  return settings;
}

std::unique_ptr<DexParsersLoader> loaderWith(const DexSettings& settings) {
  auto loader = std::make_unique<DexParsersLoader>();
  loader->initIEData(settings);
  return loader;
}

EDexResult importDxf(DexParsersLoader& loader, const std::string& path) {
  const DexFormat* format = getIEFormatsData().getFormatById(dxf::kDxfFormatId);
  return loader.importInTheSameThread(dex_test::widen(path).c_str(), format, nullptr);
}

EDexResult exportDxf(DexParsersLoader& loader, const std::string& path) {
  const DexFormat* format = getIEFormatsData().getFormatById(dxf::kDxfFormatId);
  return loader.exportInTheSameThread(dex_test::widen(path).c_str(), format, nullptr);
}

void fillDrawing(DexData& data) {
  addLayer(data, L"0", 0, 0, 1);
  const DexLayer* points = addLayer(data, L"PTS", kRed, 0, 1);
  const DexLayer* road = addLayer(data, L"ROAD", kGreen, DexDrawLineProperties::DASH_DASH, 3);
  DexLayer* lots = addLayer(data, L"LOTS", kOrange, 0, 2);
  DexLayer* ground = addLayer(data, L"GROUND", kBlue, 0, 1);
  lots->setActiveStatus(false);
  ground->setPlotStatus(false);
  point_files::CodeReader codes(&data);
  DexDataset& dataset = *data.getCurDataset();
  auto* p1 = placed(new DexDesignPoint(), points, codes, L"EP:1");
  p1->setName(L"P1");
  p1->setCoords(5000.125, 2000.5, 101.25);
  auto* p2 = placed(new DexDesignPoint(), points, codes, L"TREE;Species=Oak");
  p2->setName(L"P%%2");
  p2->setCoords(5010.0, 2003.0, kNoValue);
  auto* blue = new DexDrawPointProperties();
  blue->setColor(kBlue);
  p2->setDrawProperties(blue);
  auto* p3 = placed(new DexDesignPoint(), road, codes, L"EP:1 KERB:L");
  p3->setName(L"\u00DC-7");
  p3->setCoords(5020.0, 2007.0, 99.875);
  for (DexObject* point :
       {static_cast<DexObject*>(p1), static_cast<DexObject*>(p2), static_cast<DexObject*>(p3)})
    dataset.add(point);

  auto* edge = placed(new DexPolyLine(false), road, codes, L"EP:1");
  edge->setName(L"EDGE");
  for (const DexStation& at :
       {station(5000, 2000, 100, 0.0), station(5010, 2010, 100, 0.5), station(5000, 2020, 100)})
    edge->addStation(at);
  dataset.add(edge);
  auto* profile = placed(new DexPolyLine(false), road, codes);
  profile->setName(L"PROFILE");
  profile->setDrawProperties(new DexDrawLineProperties(kRed, 4, DexDrawLineProperties::DASH_DOT));
  for (const DexStation& at : {station(5100, 2100, 90), station(5110, 2105, 91.5), station(5120, 2115, 93)})
    profile->addStation(at);
  dataset.add(profile);
  auto* lot = placed(new DexArea(false), lots, codes);
  lot->setName(L"LOT1");
  for (const DexStation& at :
       {station(4900, 1900, kNoValue), station(4900, 1950, kNoValue), station(4950, 1950, kNoValue, -0.25)})
    lot->addStation(at);
  auto* fill = new DexDrawAreaProperties();
  fill->setColor(kGreen);
  lot->setAreaDrawProperties(fill);
  dataset.add(lot);
  auto* breakline = placed(new DexBreakline(L"TIN"), ground, codes);
  for (const DexStation& at : {station(5200, 2200, 80), station(5210, 2200, 81)})
    breakline->addStation(at);
  dataset.add(breakline);

  auto* arc = placed(new DexArc(), road, codes);
  arc->setCenter(5050.0, 2050.0, 0.0);
  arc->setData(DexArc::ARC_RADIUS, 12.5);
  arc->setData(DexArc::ARC_START_ANGLE, 30.0);
  arc->setData(DexArc::ARC_END_ANGLE, 120.0);
  dataset.add(arc);
  auto* clockwise = placed(new DexArc(), road, codes, L"CL:2");
  clockwise->setName(L"CW");
  clockwise->setCenter(5060.0, 2060.0, 5.0);
  clockwise->setData(DexArc::ARC_RADIUS, 3.0);
  clockwise->setData(DexArc::ARC_START_ANGLE, 200.0);
  clockwise->setData(DexArc::ARC_END_ANGLE, 10.0);
  clockwise->setDirection(true);
  dataset.add(clockwise);
  auto* circle = placed(new DexCircle(), points, codes, L"MH");
  circle->setCenter(5070.0, 2070.0, 1.0);
  circle->setData(DexCircle::CIRCLE_RADIUS, 0.6);
  dataset.add(circle);
  auto* label = placed(new DexTextLabel(), road, codes);
  label->setCoords(5080.0, 2080.0, 0.0);
  label->setText(L"Station 1+00 \u00B1 {x} 5%%");
  label->setHeightInMeters(2.5);
  label->setRotationAngle(30.0);
  label->setInsertionPoint(DexTextLabel::INSERT_MIDDLE_CENTER);
  dataset.add(label);
  auto* note = placed(new DexTextLabel(), points, codes);
  note->setName(L"NOTE");
  note->setCoords(5090.0, 2090.0, 0.0);
  note->setText(L"Line one\nLine \\two");
  note->setHeightInMeters(1.5);
  note->setInsertionPoint(DexTextLabel::INSERT_TOP_LEFT);
  dataset.add(note);

  auto* region = new DexRegion();
  region->setName(L"ZONE");
  region->setLayer(lots);
  for (const auto& [north, east] : {std::pair{4800.0, 1800.0}, {4800.0, 1810.0}, {4810.0, 1805.0}})
    region->addVertex(DexPositionWithBulge(north, east, 0.0, 0.0));
  dataset.addRegion(region);
  auto* surface = new DexSurface();
  surface->setName(L"TIN");
  surface->setLayer(ground);
  for (const auto& [north, east, height] : {std::tuple{5300.0, 2300.0, 70.0},
                                            {5300.0, 2310.0, 71.0},
                                            {5310.0, 2310.0, 72.5},
                                            {5310.0, 2300.0, 71.5}})
    surface->addPosition(DexPosition3D(north, east, height));
  const int corners[2][3] = {{0, 1, 2}, {0, 2, 3}};
  for (const int* triangleCorners : corners) {
    auto* triangle = new DexTriangle();
    triangle->setPositions(triangleCorners);
    surface->addTriangle(triangle);
  }
  surface->addBreakline(breakline);
  dataset.add(surface);
}

std::vector<std::string> describe(DexData& data) {
  std::vector<std::string> lines;
  if (data.getNumberOfDatasets() == 0) return lines;
  const DexDrawDictionary& layers = *data.getIEDrawDictionary();
  for (int i = 0; i < layers.getNumberOfLayers(); ++i) {
    const DexLayer& layer = *layers.getLayerAt(i);
    const DexDrawLineProperties* line = layer.getDrawLineProperties();
    unsigned long color = 0;
    DexDrawLineProperties::EDashStyleType dash{};
    unsigned char width = 0;
    lines.push_back("layer '" + utf8(layer.getName()) +
                    "' color=" + (line != nullptr && line->getColor(color) ? std::to_string(color) : "-") +
                    " dash=" + (line != nullptr && line->getDashStyle(dash) ? std::to_string(dash) : "-") +
                    " width=" + (line != nullptr && line->getWidth(width) ? std::to_string(width) : "-") +
                    (layer.isActive() ? "" : " off") + (layer.isPlot() ? "" : " not plotted"));
  }
  DexDataset& dataset = *data.getCurDataset();
  for (int i = 0; i < dataset.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE); ++i)
    lines.push_back(describeObject(*dataset.getObjectAt(i)));
  for (int i = 0; i < dataset.getNumberOfRegions(); ++i) {
    const DexRegion& region = *dataset.getRegionAt(i);
    std::string text = "region '" + utf8(region.getName()) + "' layer=" + utf8(region.getLayer()->getName());
    for (std::size_t v = 0; v < region.getVerticesCount(); ++v)
      text += " (" + number(region.getVertexAt(v).getX()) + " " + number(region.getVertexAt(v).getY()) + ")";
    lines.push_back(text);
  }
  for (int i = 0; i < dataset.getNumberOfSurfaces(); ++i) {
    const DexSurface& surface = *dataset.getSurfaceAt(i);
    std::string text = "surface '" + utf8(surface.getName()) +
                       "' layer=" + utf8(surface.getLayer()->getName()) +
                       " breaklines=" + std::to_string(surface.getNumberOfBreaklines());
    for (int t = 0; t < surface.getNumberOfTriangles(); ++t) {
      for (int k = 0; k < 3; ++k) {
        const DexPosition3D& corner = surface.getPositionAt(surface.getTriangleAt(t)->getPosition(k));
        text += (k == 0 ? " [" : " ") + number(corner.getX()) + "," + number(corner.getY()) + "," +
                number(corner.getZ());
      }
      text += "]";
    }
    lines.push_back(text);
  }
  return lines;
}

std::map<std::string, int> countByKindAndLayer(DexData& data) {
  std::map<std::string, int> counts;
  DexDataset& dataset = *data.getCurDataset();
  const auto layerOf = [](const DexLayer* layer) {
    return layer == nullptr ? std::string("0") : utf8(layer->getName());
  };
  for (int i = 0; i < dataset.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE); ++i) {
    DexObject& object = *dataset.getObjectAt(i);
    const int type = object.getType();
    const char* kind = type <= OBJECT_TYPE_PTL_POINT    ? "point"
                       : type == OBJECT_TYPE_ARC        ? "arc"
                       : type == OBJECT_TYPE_CIRCLE     ? "circle"
                       : type == OBJECT_TYPE_TEXT_LABEL ? "text"
                                                        : "line";
    ++counts[std::string(kind) + "|" + layerOf(object.getLayer())];
  }
  for (int i = 0; i < dataset.getNumberOfRegions(); ++i)
    ++counts["line|" + layerOf(dataset.getRegionAt(i)->getLayer())];
  for (int i = 0; i < dataset.getNumberOfSurfaces(); ++i)
    counts["face|" + layerOf(dataset.getSurfaceAt(i)->getLayer())] +=
        dataset.getSurfaceAt(i)->getNumberOfTriangles();
  return counts;
}

std::string groups(std::string_view compact) {
  std::string text;
  while (!compact.empty()) {
    const std::size_t bar = std::min(compact.find('|'), compact.size());
    const std::string_view group = compact.substr(0, bar);
    const std::size_t blank = std::min(group.find(' '), group.size());
    text.append(group.substr(0, blank)).append("\n");
    text.append(blank < group.size() ? group.substr(blank + 1) : std::string_view()).append("\n");
    compact.remove_prefix(std::min(bar + 1, compact.size()));
  }
  return text;
}

}  // namespace dxf_test
