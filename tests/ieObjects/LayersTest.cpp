#include "ieObjects/IELayers.h"

#include <gtest/gtest.h>

#include <climits>
#include <memory>

#include "ObjectsTestHelpers.h"

namespace {

using namespace vyn::ie;
using objects_test::Counted;

constexpr auto kLine = IDexDrawProperties::DRAW_LINE;
constexpr auto kPoint = IDexDrawProperties::DRAW_POINT;
constexpr auto kArea = IDexDrawProperties::DRAW_AREA;

DexLayer* namedLayer(const wchar_t* name) {
  return objects_test::named<DexLayer>(name);
}

// A layer with something in every field, for the copy tests.
std::unique_ptr<DexLayer> fullLayer() {
  auto layer = std::make_unique<DexLayer>();
  layer->setName(L"Fences");
  layer->setId(L"L7");
  layer->setNotes(L"surveyed 2015");
  layer->setActiveStatus(false);
  layer->setPlotStatus(false);
  layer->setAvoidance(AVOIDANCE_ZONE, SURFACE_AVOIDANCE_BY_DEPTH, 1.5);
  auto* const line = new DexDrawLineProperties(0xFF0000ul, 2, DexDrawLineProperties::DASH_DASH);
  line->setWidthByLayer();
  layer->setDrawProperties(kLine, line);
  auto* const point = new DexDrawPointProperties();
  point->setMarkStyle(DexDrawPointProperties::MARK_TREE);
  layer->setDrawProperties(kPoint, point);
  return layer;
}

void expectFullLayer(const DexLayer& layer) {
  EXPECT_TRUE(layer.getName() == L"Fences" && layer.getId() == L"L7" &&
              layer.getNotes() == L"surveyed 2015" && !layer.isActive() && !layer.isPlot() &&
              !layer.areAllParamsByDefault());
  double value = 0.0;
  auto surfaceMode = SURFACE_AVOIDANCE_NONE;
  EXPECT_EQ(AVOIDANCE_ZONE, layer.getAvoidance(value, surfaceMode));
  EXPECT_TRUE(value == 1.5 && surfaceMode == SURFACE_AVOIDANCE_BY_DEPTH);
  const DexDrawLineProperties* const line = layer.getDrawLineProperties();
  const DexDrawPointProperties* const point = layer.getDrawPointProperties();
  ASSERT_TRUE(line != nullptr && point != nullptr);
  unsigned char width = 0;
  auto mark = DexDrawPointProperties::MARK_DOT;
  EXPECT_TRUE(objects_test::colorOf(line) == 0xFF0000ul && line->getWidth(width) && width == 2 &&
              line->isWidthByLayer() && point->getMarkStyle(mark) &&
              mark == DexDrawPointProperties::MARK_TREE && layer.getDrawAreaProperties() == nullptr);
}

TEST(DexLayer, NewLayerIsAtItsDefaultsUntilAnyStatusNoteModeOrDefinedProperty) {
  DexLayer layer;
  EXPECT_TRUE(layer.isActive() && layer.isPlot() && layer.areAllParamsByDefault() &&
              layer.getNotes().IsEmpty());
  double value = -1.0;
  auto surfaceMode = static_cast<EDexSurfaceAvoidanceMode>(9);
  EXPECT_EQ(AVOIDANCE_NONE, layer.getAvoidance(value, surfaceMode));
  EXPECT_TRUE(value == 0.0 && surfaceMode == SURFACE_AVOIDANCE_NONE &&
              layer.getDrawProperties(kPoint) == nullptr);
  static_cast<IDexNameInterface&>(layer).setName(L" Trees ");  // name and id do not count
  static_cast<IDexIdInterface&>(layer).setId(L"7");
  layer.setAvoidance(AVOIDANCE_NONE, SURFACE_AVOIDANCE_BY_ELEVATION, 3.0);  // nor the surface mode
  auto* const area = new DexDrawAreaProperties();
  area->setFillStyleByLayer();
  layer.setDrawProperties(kArea, area);  // nor undefined properties
  EXPECT_TRUE(layer.areAllParamsByDefault() && layer.getName() == L" Trees " && layer.getId() == L"7");
  area->setFillTransparency(20);
  EXPECT_FALSE(layer.areAllParamsByDefault());
  using Setting = void (*)(DexLayer&);
  for (const Setting setting :
       {+[](DexLayer& l) { l.setActiveStatus(true); }, +[](DexLayer& l) { l.setPlotStatus(true); },
        +[](DexLayer& l) { l.setNotes(L""); }}) {
    DexLayer changed;
    setting(changed);  // even to the current value
    EXPECT_TRUE(changed.isActive() && !changed.areAllParamsByDefault());
  }
  DexLayer mode;
  mode.setAvoidance(static_cast<EDexAvoidanceMode>(7), static_cast<EDexSurfaceAvoidanceMode>(42), -2.5);
  EXPECT_FALSE(mode.areAllParamsByDefault());
  EXPECT_EQ(7, mode.getAvoidance(value, surfaceMode));
  EXPECT_TRUE(surfaceMode == 42 && value == -2.5);
  EXPECT_TRUE(DexLayer(DexLayer()).areAllParamsByDefault());
}

TEST(DexLayer, OwnsItsPropertyObjectsPerKind) {
  int deletions = 0;
  {
    DexLayer layer;
    const auto four = static_cast<IDexDrawProperties::EDexDrawType>(3);
    auto* const declined = new Counted<DexDrawLineProperties>(deletions);
    layer.setDrawProperties(four, declined);
    EXPECT_TRUE(layer.getDrawProperties(four) == nullptr && layer.getDrawLineProperties() == nullptr &&
                std::as_const(layer).getDrawProperties(static_cast<IDexDrawProperties::EDexDrawType>(-1)) ==
                    nullptr);
    delete declined;  // a declined object stays with the caller
    auto* const line = new Counted<DexDrawLineProperties>(deletions);
    layer.setDrawProperties(kLine, line);
    layer.setDrawProperties(kLine, line);
    EXPECT_TRUE(deletions == 1 && layer.getDrawLineProperties() == line);
    layer.setDrawProperties(kLine, new Counted<DexDrawLineProperties>(deletions));
    EXPECT_EQ(2, deletions);
    layer.setColor(0x00FF00ul);  // to each existing property object only
    EXPECT_EQ(nullptr, layer.getDrawPointProperties());
    layer.setDrawProperties(kPoint, new DexDrawLineProperties());  // the typed shortcut wants its class
    EXPECT_TRUE(layer.getDrawProperties(kPoint) != nullptr && layer.getDrawPointProperties() == nullptr);
    layer.setDrawProperties(kPoint, new DexDrawPointProperties());
    layer.setDrawProperties(kArea, new DexDrawAreaProperties());
    layer.setColor(0x00FF00ul);
    EXPECT_TRUE(objects_test::colorOf(layer.getDrawPointProperties()) == 0x00FF00ul &&
                objects_test::colorOf(layer.getDrawAreaProperties()) == 0x00FF00ul &&
                !layer.areAllParamsByDefault());
  }
  EXPECT_EQ(3, deletions);
  const std::unique_ptr<IDexDrawProperties> area(DexLayer::createDrawPropertiesFromString(L"Area"));
  EXPECT_TRUE(area != nullptr && area->getType() == kArea);
  EXPECT_TRUE(DexLayer::createDrawPropertiesFromString(L"area") == nullptr &&
              DexLayer::createDrawPropertiesFromString(L"Text") == nullptr);
}

TEST(DexLayer, CopiesOwnTheirPropertyObjects) {
  auto original = fullLayer();
  const DexLayer copy(*original);
  EXPECT_NE(original->getDrawLineProperties(), copy.getDrawLineProperties());
  int deletions = 0;
  DexLayer target;
  target.setDrawProperties(kLine, new Counted<DexDrawLineProperties>(deletions));
  target.setDrawProperties(kArea, new DexDrawAreaProperties());
  target = *original;
  EXPECT_EQ(1, deletions);
  original.reset();
  expectFullLayer(copy);
  expectFullLayer(target);
  const DexDrawLineProperties* const line = target.getDrawLineProperties();
  target = std::as_const(target);
  EXPECT_EQ(line, target.getDrawLineProperties());
  expectFullLayer(target);
}

TEST(DexDrawDictionary, KeepsLayersInOrderFindsExactNamesAndADefaultOfTheList) {
  DexDrawDictionary dictionary;
  EXPECT_TRUE(dictionary.getNumberOfLayers() == 0 && dictionary.getLayerAt(0) == nullptr &&
              dictionary.getDefaultLayer() == nullptr && !dictionary.setDefaultLayer(0));
  for (DexLayer* layer : {namedLayer(L"Road"), namedLayer(L"B"), namedLayer(L"Road"), namedLayer(L"road"),
                          static_cast<DexLayer*>(nullptr)})
    dictionary.addLayer(layer);  // names are not checked
  const DexDrawDictionary& constant = dictionary;
  EXPECT_TRUE(dictionary.getNumberOfLayers() == 4 && constant.getLayerAt(1)->getName() == L"B");
  for (const int index : {-1, 4, INT_MAX})
    EXPECT_TRUE(dictionary.getLayerAt(index) == nullptr && constant.getLayerAt(index) == nullptr) << index;
  EXPECT_TRUE(dictionary.findLayer(L"Road") == dictionary.getLayerAt(0) &&
              constant.findLayer(L"road") == dictionary.getLayerAt(3) &&
              dictionary.findLayer(L"ROAD") == nullptr && dictionary.findLayer(L"Road ") == nullptr &&
              constant.findLayer(L"") == nullptr);
  EXPECT_TRUE(dictionary.setDefaultLayer(1));
  EXPECT_FALSE(dictionary.setDefaultLayer(4) || dictionary.setDefaultLayer(-1));
  EXPECT_EQ(L"B", constant.getDefaultLayer()->getName());
}

TEST(DexDrawDictionary, OwnsItsLayersAndCopiesThem) {
  int deletions = 0;
  {
    DexDrawDictionary dictionary;
    dictionary.addLayer(new Counted<DexLayer>(deletions));
    dictionary.addLayer(new Counted<DexLayer>(deletions));
  }
  EXPECT_EQ(2, deletions);
  auto* const original = new DexDrawDictionary();
  original->addLayer(namedLayer(L"0"));
  original->addLayer(fullLayer().release());
  original->setDefaultLayer(1);
  const DexDrawDictionary copy(*original);
  EXPECT_NE(original->getLayerAt(1), copy.getLayerAt(1));
  DexDrawDictionary target;
  target.addLayer(new Counted<DexLayer>(deletions));
  target.setDefaultLayer(0);
  {
    DexDrawDictionary source;
    source.addLayer(fullLayer().release());
    target = source;
    EXPECT_EQ(3, deletions);
  }
  delete original;
  ASSERT_TRUE(copy.getNumberOfLayers() == 2 && copy.getDefaultLayer() != nullptr);
  EXPECT_TRUE(copy.getLayerAt(0)->getName() == L"0" && copy.getLayerAt(1) == copy.findLayer(L"Fences"));
  expectFullLayer(*copy.getDefaultLayer());
  ASSERT_EQ(1, target.getNumberOfLayers());
  expectFullLayer(*target.getLayerAt(0));
  EXPECT_EQ(nullptr, target.getDefaultLayer());  // the source had none
  target.setDefaultLayer(0);
  const DexLayer* const layer = target.getLayerAt(0);
  target = std::as_const(target);
  EXPECT_EQ(layer, target.getDefaultLayer());
}

}  // namespace
