#include "ieObjects/IELayers.h"

#include <gtest/gtest.h>

#include <climits>
#include <memory>

namespace {

using vyn::ie::DexDrawAreaProperties;
using vyn::ie::DexDrawDictionary;
using vyn::ie::DexDrawLineProperties;
using vyn::ie::DexDrawPointProperties;
using vyn::ie::DexLayer;
using vyn::ie::EDexAvoidanceMode;
using vyn::ie::EDexSurfaceAvoidanceMode;
using vyn::ie::IDexDrawProperties;
using vyn::ie::IDexIdInterface;
using vyn::ie::IDexNameInterface;

// Counts deletions so that ownership rules become visible.
class CountedLineProperties : public DexDrawLineProperties {
 public:
  explicit CountedLineProperties(int& deletions) : deletions_(deletions) {}
  ~CountedLineProperties() override { ++deletions_; }

 private:
  int& deletions_;
};

class CountedLayer : public DexLayer {
 public:
  explicit CountedLayer(int& deletions) : deletions_(deletions) {}
  ~CountedLayer() override { ++deletions_; }

 private:
  int& deletions_;
};

DexLayer* namedLayer(const wchar_t* name) {
  auto* const layer = new DexLayer();
  layer->setName(name);
  return layer;
}

// A layer with something in every field, for the copy tests.
std::unique_ptr<DexLayer> fullLayer() {
  auto layer = std::make_unique<DexLayer>();
  layer->setName(L"Fences");
  layer->setId(L"L7");
  layer->setNotes(L"surveyed 2015");
  layer->setActiveStatus(false);
  layer->setPlotStatus(false);
  layer->setAvoidance(vyn::ie::AVOIDANCE_ZONE, vyn::ie::SURFACE_AVOIDANCE_BY_DEPTH, 1.5);
  auto* const line = new DexDrawLineProperties(0xFF0000ul, 2, DexDrawLineProperties::DASH_DASH);
  line->setWidthByLayer();
  layer->setDrawProperties(IDexDrawProperties::DRAW_LINE, line);
  auto* const point = new DexDrawPointProperties();
  point->setMarkStyle(DexDrawPointProperties::MARK_TREE);
  layer->setDrawProperties(IDexDrawProperties::DRAW_POINT, point);
  return layer;
}

void expectFullLayer(const DexLayer& layer) {
  EXPECT_EQ(L"Fences", layer.getName());
  EXPECT_EQ(L"L7", layer.getId());
  EXPECT_EQ(L"surveyed 2015", layer.getNotes());
  EXPECT_FALSE(layer.isActive());
  EXPECT_FALSE(layer.isPlot());
  double value = 0.0;
  auto surfaceMode = vyn::ie::SURFACE_AVOIDANCE_NONE;
  EXPECT_EQ(vyn::ie::AVOIDANCE_ZONE, layer.getAvoidance(value, surfaceMode));
  EXPECT_EQ(1.5, value);
  EXPECT_EQ(vyn::ie::SURFACE_AVOIDANCE_BY_DEPTH, surfaceMode);
  const DexDrawLineProperties* const line = layer.getDrawLineProperties();
  ASSERT_NE(nullptr, line);
  unsigned long color = 0;
  unsigned char width = 0;
  EXPECT_TRUE(line->getColor(color));
  EXPECT_EQ(0xFF0000ul, color);
  EXPECT_TRUE(line->getWidth(width));
  EXPECT_EQ(2, width);
  EXPECT_TRUE(line->isWidthByLayer());
  const DexDrawPointProperties* const point = layer.getDrawPointProperties();
  ASSERT_NE(nullptr, point);
  auto mark = DexDrawPointProperties::MARK_DOT;
  EXPECT_TRUE(point->getMarkStyle(mark));
  EXPECT_EQ(DexDrawPointProperties::MARK_TREE, mark);
  EXPECT_EQ(nullptr, layer.getDrawAreaProperties());
}

}  // namespace

// Layers.

TEST(DexLayer, NewLayerIsActivePlottedAndAtItsDefaults) {
  const DexLayer layer;
  EXPECT_TRUE(layer.isActive());
  EXPECT_TRUE(layer.isPlot());
  EXPECT_TRUE(layer.areAllParamsByDefault());
  EXPECT_TRUE(layer.getName().IsEmpty());
  EXPECT_TRUE(layer.getId().IsEmpty());
  EXPECT_TRUE(layer.getNotes().IsEmpty());
  double value = -1.0;
  auto surfaceMode = static_cast<EDexSurfaceAvoidanceMode>(9);
  EXPECT_EQ(vyn::ie::AVOIDANCE_NONE, layer.getAvoidance(value, surfaceMode));
  EXPECT_EQ(0.0, value);
  EXPECT_EQ(vyn::ie::SURFACE_AVOIDANCE_NONE, surfaceMode);
  for (int type = 0; type < 3; ++type)
    EXPECT_EQ(nullptr, layer.getDrawProperties(static_cast<IDexDrawProperties::EDexDrawType>(type)));
}

TEST(DexLayer, SettingAStatusToItsCurrentValueStillLeavesTheDefaults) {
  DexLayer active;
  active.setActiveStatus(true);
  EXPECT_TRUE(active.isActive());
  EXPECT_FALSE(active.areAllParamsByDefault());

  DexLayer plotted;
  plotted.setPlotStatus(true);
  EXPECT_FALSE(plotted.areAllParamsByDefault());

  DexLayer noted;
  noted.setNotes(L"");
  EXPECT_FALSE(noted.areAllParamsByDefault());
}

TEST(DexLayer, NameAndIdDoNotLeaveTheDefaults) {
  DexLayer layer;
  IDexNameInterface& named = layer;
  IDexIdInterface& identified = layer;
  named.setName(L" Trees ");
  identified.setId(L"7");
  EXPECT_EQ(L" Trees ", named.getName());
  EXPECT_EQ(L"7", identified.getId());
  EXPECT_TRUE(layer.areAllParamsByDefault());
}

TEST(DexLayer, OnlyTheAvoidanceModeCountsAgainstTheDefaults) {
  DexLayer layer;
  layer.setAvoidance(vyn::ie::AVOIDANCE_NONE, vyn::ie::SURFACE_AVOIDANCE_BY_ELEVATION, 3.0);
  EXPECT_TRUE(layer.areAllParamsByDefault());
  layer.setAvoidance(static_cast<EDexAvoidanceMode>(7), static_cast<EDexSurfaceAvoidanceMode>(42), -2.5);
  EXPECT_FALSE(layer.areAllParamsByDefault());
  double value = 0.0;
  auto surfaceMode = vyn::ie::SURFACE_AVOIDANCE_NONE;
  EXPECT_EQ(7, layer.getAvoidance(value, surfaceMode));
  EXPECT_EQ(42, surfaceMode);
  EXPECT_EQ(-2.5, value);
}

TEST(DexLayer, OnlyDefinedPropertyObjectsCountAgainstTheDefaults) {
  DexLayer layer;
  auto* const area = new DexDrawAreaProperties();
  area->setFillStyleByLayer();
  layer.setDrawProperties(IDexDrawProperties::DRAW_AREA, area);
  EXPECT_TRUE(layer.areAllParamsByDefault());
  area->setFillTransparency(20);
  EXPECT_FALSE(layer.areAllParamsByDefault());
}

TEST(DexLayer, DrawPropertiesOutsideTheThreeTypesAreNullAndIgnored) {
  DexLayer layer;
  const auto four = static_cast<IDexDrawProperties::EDexDrawType>(3);
  EXPECT_EQ(nullptr, layer.getDrawProperties(four));
  EXPECT_EQ(nullptr,
            std::as_const(layer).getDrawProperties(static_cast<IDexDrawProperties::EDexDrawType>(-1)));
  int deletions = 0;
  auto* const line = new CountedLineProperties(deletions);
  layer.setDrawProperties(four, line);
  EXPECT_EQ(nullptr, layer.getDrawProperties(four));
  EXPECT_EQ(nullptr, layer.getDrawLineProperties());
  EXPECT_EQ(0, deletions);
  delete line;  // a declined object stays with the caller
}

TEST(DexLayer, SettingTheHeldPropertiesAgainDoesNotDeleteThem) {
  int deletions = 0;
  DexLayer layer;
  auto* const line = new CountedLineProperties(deletions);
  layer.setDrawProperties(IDexDrawProperties::DRAW_LINE, line);
  layer.setDrawProperties(IDexDrawProperties::DRAW_LINE, line);
  EXPECT_EQ(0, deletions);
  line->setWidth(4);  // still alive
  EXPECT_EQ(line, layer.getDrawLineProperties());
}

TEST(DexLayer, ReplacedAndRemainingPropertiesAreDeleted) {
  int deletions = 0;
  {
    DexLayer layer;
    layer.setDrawProperties(IDexDrawProperties::DRAW_LINE, new CountedLineProperties(deletions));
    layer.setDrawProperties(IDexDrawProperties::DRAW_LINE, new CountedLineProperties(deletions));
    EXPECT_EQ(1, deletions);
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexLayer, TypedShortcutsAnswerNullForAnObjectOfAnotherClass) {
  DexLayer layer;
  layer.setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawLineProperties());
  EXPECT_NE(nullptr, layer.getDrawProperties(IDexDrawProperties::DRAW_POINT));
  EXPECT_EQ(nullptr, layer.getDrawPointProperties());
  EXPECT_EQ(nullptr, layer.getDrawLineProperties());
}

TEST(DexLayer, ColourGoesToEachExistingPropertyObjectOnly) {
  DexLayer layer;
  layer.setColor(0x00FF00ul);
  EXPECT_EQ(nullptr, layer.getDrawPointProperties());
  layer.setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawPointProperties());
  layer.setDrawProperties(IDexDrawProperties::DRAW_AREA, new DexDrawAreaProperties());
  layer.setColor(0x00FF00ul);
  unsigned long color = 0;
  EXPECT_TRUE(layer.getDrawPointProperties()->getColor(color));
  EXPECT_EQ(0x00FF00ul, color);
  EXPECT_TRUE(layer.getDrawAreaProperties()->getColor(color));
  EXPECT_EQ(nullptr, layer.getDrawLineProperties());
  EXPECT_FALSE(layer.areAllParamsByDefault());
}

TEST(DexLayer, CreatesPropertyObjectsFromTheirExactTypeNames) {
  const std::unique_ptr<IDexDrawProperties> area(DexLayer::createDrawPropertiesFromString(L"Area"));
  ASSERT_NE(nullptr, area);
  EXPECT_EQ(IDexDrawProperties::DRAW_AREA, area->getType());
  EXPECT_EQ(nullptr, DexLayer::createDrawPropertiesFromString(L"area"));
  EXPECT_EQ(nullptr, DexLayer::createDrawPropertiesFromString(L"Text"));
}

TEST(DexLayer, CopyOwnsItsOwnPropertyObjects) {
  auto original = fullLayer();
  const DexLayer copy(*original);
  EXPECT_NE(original->getDrawLineProperties(), copy.getDrawLineProperties());
  original.reset();
  expectFullLayer(copy);
  EXPECT_FALSE(copy.areAllParamsByDefault());
}

TEST(DexLayer, AssignmentReplacesThePropertyObjectsWithCopies) {
  int deletions = 0;
  DexLayer target;
  target.setDrawProperties(IDexDrawProperties::DRAW_LINE, new CountedLineProperties(deletions));
  target.setDrawProperties(IDexDrawProperties::DRAW_AREA, new DexDrawAreaProperties());
  auto original = fullLayer();
  target = *original;
  EXPECT_EQ(1, deletions);
  original.reset();
  expectFullLayer(target);
}

TEST(DexLayer, SelfAssignmentKeepsThePropertyObjects) {
  auto layer = fullLayer();
  const DexDrawLineProperties* const line = layer->getDrawLineProperties();
  DexLayer& alias = *layer;
  *layer = alias;
  EXPECT_EQ(line, layer->getDrawLineProperties());
  expectFullLayer(*layer);
}

TEST(DexLayer, CopyOfAPristineLayerIsStillAtItsDefaults) {
  const DexLayer layer;
  const DexLayer copy(layer);
  EXPECT_TRUE(copy.areAllParamsByDefault());
}

// The draw dictionary.

TEST(DexDrawDictionary, KeepsLayersInInsertionOrderAndAnswersNullOutsideTheList) {
  DexDrawDictionary dictionary;
  EXPECT_EQ(0, dictionary.getNumberOfLayers());
  EXPECT_EQ(nullptr, dictionary.getLayerAt(0));
  dictionary.addLayer(namedLayer(L"A"));
  dictionary.addLayer(namedLayer(L"B"));
  dictionary.addLayer(nullptr);
  EXPECT_EQ(2, dictionary.getNumberOfLayers());
  EXPECT_EQ(L"A", dictionary.getLayerAt(0)->getName());
  EXPECT_EQ(L"B", std::as_const(dictionary).getLayerAt(1)->getName());
  for (const int index : {-1, 2, INT_MAX}) {
    EXPECT_EQ(nullptr, dictionary.getLayerAt(index));
    EXPECT_EQ(nullptr, std::as_const(dictionary).getLayerAt(index));
  }
}

TEST(DexDrawDictionary, FindsTheFirstLayerOfAnExactName) {
  DexDrawDictionary dictionary;
  dictionary.addLayer(namedLayer(L"Road"));
  DexLayer* const second = namedLayer(L"Road");
  dictionary.addLayer(second);  // names are not checked
  dictionary.addLayer(namedLayer(L"road"));
  EXPECT_EQ(3, dictionary.getNumberOfLayers());
  EXPECT_EQ(dictionary.getLayerAt(0), dictionary.findLayer(L"Road"));
  EXPECT_EQ(dictionary.getLayerAt(2), std::as_const(dictionary).findLayer(L"road"));
  EXPECT_EQ(nullptr, dictionary.findLayer(L"ROAD"));
  EXPECT_EQ(nullptr, dictionary.findLayer(L"Road "));
  EXPECT_EQ(nullptr, std::as_const(dictionary).findLayer(L""));
}

TEST(DexDrawDictionary, DefaultLayerMustBeAnIndexOfTheList) {
  DexDrawDictionary dictionary;
  EXPECT_EQ(nullptr, dictionary.getDefaultLayer());
  EXPECT_FALSE(dictionary.setDefaultLayer(0));
  dictionary.addLayer(namedLayer(L"0"));
  dictionary.addLayer(namedLayer(L"Default"));
  EXPECT_TRUE(dictionary.setDefaultLayer(1));
  EXPECT_EQ(L"Default", dictionary.getDefaultLayer()->getName());
  EXPECT_FALSE(dictionary.setDefaultLayer(2));
  EXPECT_FALSE(dictionary.setDefaultLayer(-1));
  EXPECT_EQ(L"Default", std::as_const(dictionary).getDefaultLayer()->getName());
}

TEST(DexDrawDictionary, DestructorDeletesEveryLayer) {
  int deletions = 0;
  {
    DexDrawDictionary dictionary;
    dictionary.addLayer(new CountedLayer(deletions));
    dictionary.addLayer(new CountedLayer(deletions));
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexDrawDictionary, CopyOwnsItsOwnLayers) {
  auto* const original = new DexDrawDictionary();
  original->addLayer(namedLayer(L"0"));
  original->addLayer(fullLayer().release());
  original->setDefaultLayer(1);
  const DexDrawDictionary copy(*original);
  EXPECT_NE(original->getLayerAt(1), copy.getLayerAt(1));
  delete original;
  ASSERT_EQ(2, copy.getNumberOfLayers());
  EXPECT_EQ(L"0", copy.getLayerAt(0)->getName());
  ASSERT_NE(nullptr, copy.getDefaultLayer());
  expectFullLayer(*copy.getDefaultLayer());
  EXPECT_EQ(copy.getLayerAt(1), copy.findLayer(L"Fences"));
}

TEST(DexDrawDictionary, AssignmentReplacesTheLayersWithCopies) {
  int deletions = 0;
  DexDrawDictionary target;
  target.addLayer(new CountedLayer(deletions));
  target.setDefaultLayer(0);
  {
    DexDrawDictionary source;
    source.addLayer(fullLayer().release());
    target = source;
    EXPECT_EQ(1, deletions);
  }
  ASSERT_EQ(1, target.getNumberOfLayers());
  expectFullLayer(*target.getLayerAt(0));
  EXPECT_EQ(nullptr, target.getDefaultLayer());  // the source had none
}

TEST(DexDrawDictionary, SelfAssignmentKeepsTheLayers) {
  DexDrawDictionary dictionary;
  dictionary.addLayer(fullLayer().release());
  dictionary.setDefaultLayer(0);
  const DexLayer* const layer = dictionary.getLayerAt(0);
  DexDrawDictionary& alias = dictionary;
  dictionary = alias;
  EXPECT_EQ(layer, dictionary.getDefaultLayer());
  expectFullLayer(*layer);
}
