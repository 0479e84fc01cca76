#include "ieUtils/DrawingPropertiesHelpers.h"

#include <gtest/gtest.h>

#include <memory>

#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEObjects.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexArea;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexCodeValues;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexDrawAreaProperties;
using vyn::ie::DexDrawLineProperties;
using vyn::ie::DexDrawPointProperties;
using vyn::ie::DexLayer;
using vyn::ie::DexObject;
using vyn::ie::EStyleDefinitionObject;
using vyn::ie::getObjectStyle;
using vyn::ie::IDexDrawProperties;

constexpr const wchar_t* kLogSource = L"ieUtils\\DrawingPropertiesHelpers";
constexpr int kNoStyleInDefaultLayerLine = 101;
constexpr const wchar_t* kNoStyleMessage = L"couldn't read color even from default layer style";

constexpr unsigned long kRed = 0x0000FF;
constexpr unsigned long kGreen = 0x00FF00;
constexpr unsigned long kBlue = 0xFF0000;

// ---- Per value type: the form that holds it, how it is set and marked by layer --------------------

// The value type T of a form, set and marked by layer through the given members; source number s
// gives the value base + s % modulus. The colour is asked of line properties here; every form has one.
template <class T, class F, int Type, auto Set, auto ByLayer, int Base, int Modulus = 1000>
struct StyleCase {
  using Value = T;
  using Form = F;
  static constexpr int kType = Type;
  static void set(Form& properties, T value) { (properties.*Set)(value); }
  static void setByLayer(Form& properties) { (properties.*ByLayer)(); }
  static T valueOf(int source) { return static_cast<T>(Base + source % Modulus); }
};

using Line = DexDrawLineProperties;
using Point = DexDrawPointProperties;
using Area = DexDrawAreaProperties;
using ColorCase = StyleCase<unsigned long, Line, IDexDrawProperties::DRAW_LINE, &Line::setColor,
                            &Line::setColorByLayer, 0x010101>;
using MarkCase = StyleCase<Point::EMarkStyleType, Point, IDexDrawProperties::DRAW_POINT, &Point::setMarkStyle,
                           &Point::setMarkStyleByLayer, 1>;
using DashCase = StyleCase<Line::EDashStyleType, Line, IDexDrawProperties::DRAW_LINE, &Line::setDashStyle,
                           &Line::setDashStyleByLayer, 0, 5>;
using WidthCase = StyleCase<unsigned char, Line, IDexDrawProperties::DRAW_LINE, &Line::setWidth,
                            &Line::setWidthByLayer, 10>;
using FillCase = StyleCase<Area::EFillStyleType, Area, IDexDrawProperties::DRAW_AREA, &Area::setFillStyleType,
                           &Area::setFillStyleByLayer, 0>;
using TransparencyCase = StyleCase<short, Area, IDexDrawProperties::DRAW_AREA, &Area::setFillTransparency,
                                   &Area::setFillTransparencyByLayer, 20>;

// Builds one object with every place a value can come from, each place defining the value of its own
// source number (or only the by-layer mark, or nothing), so that a test reads which place answered.
template <class Case>
class StyleScene {
  using T = typename Case::Value;
  using Form = typename Case::Form;

 public:
  StyleScene() : codeDescription_(L"CODE") {
    codeDescription_.setLayer(&codeLayer_);
    // Areas hold their fill apart from their outline: drawn as an area, the area form is their own.
    if constexpr (Case::kType == IDexDrawProperties::DRAW_AREA) {
      object_ = std::make_unique<DexArea>();
    } else {
      object_ = std::make_unique<DexDesignPoint>();
    }
  }

  // The object's own properties: with the value of source 0, or only marked by layer.
  void ownDefines() { setOwn(newForm(vyn::ie::STYLE_FROM_OBJECT)); }
  void ownByLayer() {
    Form* const own = newForm(-1);
    Case::setByLayer(*own);
    setOwn(own);
  }
  void ownWithoutValue() { setOwn(newForm(-1)); }
  void objectLayerDefines() {
    layer_.setDrawProperties(Case::kType, newForm(vyn::ie::STYLE_FROM_LAYER));
    object_->setLayer(&layer_, false);
  }
  void objectLayerWithoutValue() {
    layer_.setDrawProperties(Case::kType, newForm(-1));
    object_->setLayer(&layer_, false);
  }
  void codeDefines() { codeDescription_.setDrawProperties(Case::kType, newForm(vyn::ie::STYLE_FROM_CODE)); }
  void codeByLayer() {
    Form* const byCode = newForm(-1);
    Case::setByLayer(*byCode);
    codeDescription_.setDrawProperties(Case::kType, byCode);
  }
  void codeLayerDefines() {
    codeLayer_.setDrawProperties(Case::kType, newForm(vyn::ie::STYLE_FROM_CODE_LAYER));
  }
  void objectHasCode() { object_->addCode(new DexCodeValues(&codeDescription_)); }
  void defaultLayerDefines() {
    defaultLayer_.setDrawProperties(Case::kType, newForm(vyn::ie::STYLE_FROM_DEFAULT_LAYER));
  }

  EStyleDefinitionObject resolve(T& value, bool withDefaultLayer = true) const {
    return getObjectStyle<T>(Case::kType, object_.get(), value, withDefaultLayer ? &defaultLayer_ : nullptr);
  }

  static T valueOf(int source) { return Case::valueOf(source); }

 private:
  // A new property object of the value's form; with the value of source when source is 0 or above.
  static Form* newForm(int source) {
    auto* const properties = new Form();
    if (source >= 0) Case::set(*properties, Case::valueOf(source));
    return properties;
  }
  void setOwn(Form* own) {
    if constexpr (Case::kType == IDexDrawProperties::DRAW_AREA) {
      static_cast<DexArea&>(*object_).setAreaDrawProperties(own);
    } else {
      object_->setDrawProperties(own);
    }
  }

  DexLayer layer_;
  DexLayer codeLayer_;
  DexLayer defaultLayer_;
  DexCodeDescription codeDescription_;
  std::unique_ptr<DexObject> object_;
};

// ---- Sources 0 to 5 for each value type -----------------------------------------------------------

enum Step {
  kOwn = 1,
  kOwnByLayer = 2,
  kOwnEmpty = 4,
  kLayer = 8,
  kLayerEmpty = 16,
  kCode = 32,
  kCodeByLayer = 64,
  kCodeLayer = 128,
  kHasCode = 256,
  kDefault = 512
};

template <class T>
class StyleResolution : public ::testing::Test {};

using StyleValueTypes =
    ::testing::Types<ColorCase, MarkCase, DashCase, WidthCase, FillCase, TransparencyCase>;
TYPED_TEST_SUITE(StyleResolution, StyleValueTypes);

// Own properties win; their by-layer mark reads the object's layer before the code; an object with a
// code skips its layer; a code's by-layer mark reads the code's layer; the default layer comes last.
TYPED_TEST(StyleResolution, SourcesAnswerInTheirOrder) {
  const std::pair<int, int> rows[] = {
      {kOwn | kLayer | kCode | kHasCode | kDefault, vyn::ie::STYLE_FROM_OBJECT},
      {kOwnByLayer | kLayer | kCode | kHasCode, vyn::ie::STYLE_FROM_LAYER},
      {kLayer | kDefault, vyn::ie::STYLE_FROM_LAYER},
      {kOwnEmpty | kLayer | kDefault, vyn::ie::STYLE_FROM_DEFAULT_LAYER},
      {kLayerEmpty | kDefault, vyn::ie::STYLE_FROM_DEFAULT_LAYER},
      {kLayer | kCode | kHasCode, vyn::ie::STYLE_FROM_CODE},
      {kCodeByLayer | kCodeLayer | kHasCode | kDefault, vyn::ie::STYLE_FROM_CODE_LAYER},
      {kCodeLayer | kHasCode | kDefault, vyn::ie::STYLE_FROM_DEFAULT_LAYER},
      {kLayer | kHasCode | kDefault, vyn::ie::STYLE_FROM_DEFAULT_LAYER}};
  for (const auto& [steps, source] : rows) {
    StyleScene<TypeParam> scene;
    if (steps & kOwn) scene.ownDefines();
    if (steps & kOwnByLayer) scene.ownByLayer();
    if (steps & kOwnEmpty) scene.ownWithoutValue();
    if (steps & kLayer) scene.objectLayerDefines();
    if (steps & kLayerEmpty) scene.objectLayerWithoutValue();
    if (steps & kCode) scene.codeDefines();
    if (steps & kCodeByLayer) scene.codeByLayer();
    if (steps & kCodeLayer) scene.codeLayerDefines();
    if (steps & kHasCode) scene.objectHasCode();
    if (steps & kDefault) scene.defaultLayerDefines();
    typename TypeParam::Value value{};
    EXPECT_EQ(source, scene.resolve(value)) << steps;
    EXPECT_EQ(scene.valueOf(source), value) << steps;
  }
}

// Nothing defined: without a default layer silently, with one lacking the value with a log record.
TYPED_TEST(StyleResolution, NothingDefinedIsNotFound) {
  dex_test::LogCapture log;
  StyleScene<TypeParam> scene;
  const auto untouched = scene.valueOf(7);
  auto value = untouched;
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, scene.resolve(value, false));
  EXPECT_EQ(0u, log.size());
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, scene.resolve(value));
  EXPECT_EQ(untouched, value);
  EXPECT_EQ(1, log.count(kLogSource, kNoStyleInDefaultLayerLine));
  EXPECT_EQ(1, log.countMessage(kNoStyleMessage));
  ASSERT_EQ(2u, log.size());
  EXPECT_EQ(4, log.records()[1].level);
  scene.objectHasCode();
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, scene.resolve(value, false));
  EXPECT_EQ(2u, log.size());
}

// ---- The cases of a drawing exporter ------------------------------------------------------------

template <class Properties>
Properties* coloured(unsigned long color, Properties* properties = new Properties()) {
  if (color != 0)
    properties->setColor(color);
  else
    properties->setColorByLayer();
  return properties;
}

TEST(ObjectStyle, PointsOnABlueLayerTakeTheirOwnTheLayersOrTheCodesColour) {
  constexpr auto kPoint = IDexDrawProperties::DRAW_POINT;
  DexLayer layer;
  layer.setDrawProperties(kPoint, new DexDrawPointProperties());
  layer.setColor(kBlue);
  DexDesignPoint point;
  point.setLayer(&layer, false);
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_LAYER, getObjectStyle(kPoint, &point, color, nullptr));
  EXPECT_EQ(kBlue, color);
  DexCodeDescription description(L"TREE");
  description.setDrawProperties(kPoint, coloured<DexDrawPointProperties>(kGreen));
  point.addCode(new DexCodeValues(&description));
  EXPECT_EQ(vyn::ie::STYLE_FROM_CODE, getObjectStyle(kPoint, &point, color, nullptr));
  EXPECT_EQ(kGreen, color);
  point.setDrawProperties(coloured<DexDrawPointProperties>(kRed));
  EXPECT_EQ(vyn::ie::STYLE_FROM_OBJECT, getObjectStyle(kPoint, &point, color, nullptr));
  EXPECT_EQ(kRed, color);
  dex_test::LogCapture log;  // a draw type outside the table finds nothing
  color = 0;
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, getObjectStyle(3, &point, color, &layer));
  EXPECT_EQ(0UL, color);
  EXPECT_EQ(1, log.count(kLogSource, kNoStyleInDefaultLayerLine));
  point.setDrawProperties(coloured<DexDrawPointProperties>(0));
  EXPECT_EQ(vyn::ie::STYLE_FROM_LAYER, getObjectStyle(kPoint, &point, color, nullptr));
  EXPECT_EQ(kBlue, color);
  // Point properties have no width: by layer or not, they give none, and the default layer neither.
  DexDesignPoint alone;
  alone.setDrawProperties(coloured<DexDrawPointProperties>(0));
  unsigned char width = 9;
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, getObjectStyle(kPoint, &alone, width, &layer));
  EXPECT_EQ(9, width);
  EXPECT_EQ(2, log.count(kLogSource, kNoStyleInDefaultLayerLine));
}

TEST(ObjectStyle, LinesAndAreasReadTheFormOfTheirDrawType) {
  constexpr auto kLine = IDexDrawProperties::DRAW_LINE;
  DexLayer codeLayer;
  codeLayer.setDrawProperties(kLine, new DexDrawLineProperties(kRed, 3, DexDrawLineProperties::DASH_DOT));
  DexCodeDescription description(L"FENCE");
  auto* const byCode = new DexDrawLineProperties();
  byCode->setWidthByLayer();
  description.setDrawProperties(kLine, byCode);
  description.setLayer(&codeLayer);
  vyn::ie::DexPolyLine line;
  line.addCode(new DexCodeValues(&description));
  unsigned char width = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_CODE_LAYER, getObjectStyle(kLine, &line, width, nullptr));
  EXPECT_EQ(3, width);
  DexDesignPoint point;  // own properties of another draw type are not read
  point.setDrawProperties(coloured<DexDrawPointProperties>(kRed));
  DexLayer defaultLayer;
  defaultLayer.setDrawProperties(kLine,
                                 new DexDrawLineProperties(kBlue, 4, DexDrawLineProperties::DASH_DASH));
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER, getObjectStyle(kLine, &point, color, &defaultLayer));
  EXPECT_EQ(kBlue, color);
  auto dash = DexDrawLineProperties::DASH_SOLID;  // a null object reads only the default layer
  const DexObject* const none = nullptr;
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER, getObjectStyle(kLine, none, dash, &defaultLayer));
  EXPECT_EQ(DexDrawLineProperties::DASH_DASH, dash);
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, getObjectStyle(kLine, none, dash, nullptr));
  DexArea area;  // drawn as an area its area properties, as a line its outline
  area.setAreaDrawProperties(coloured<DexDrawAreaProperties>(kGreen));
  area.setDrawProperties(new DexDrawLineProperties(kRed, 2, DexDrawLineProperties::DASH_SOLID));
  EXPECT_EQ(vyn::ie::STYLE_FROM_OBJECT, getObjectStyle(IDexDrawProperties::DRAW_AREA, &area, color, nullptr));
  EXPECT_EQ(kGreen, color);
  EXPECT_EQ(vyn::ie::STYLE_FROM_OBJECT, getObjectStyle(kLine, &area, color, nullptr));
  EXPECT_EQ(kRed, color);
}

}  // namespace
