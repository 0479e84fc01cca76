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

template <class T>
struct StyleCase;

// The colour is asked of line properties here; every form has one.
template <>
struct StyleCase<unsigned long> {
  static constexpr int kType = IDexDrawProperties::DRAW_LINE;
  using Form = DexDrawLineProperties;
  static void set(Form& properties, unsigned long value) { properties.setColor(value); }
  static void setByLayer(Form& properties) { properties.setColorByLayer(); }
  static unsigned long valueOf(int source) { return 0x010101UL * static_cast<unsigned long>(source + 1); }
};

template <>
struct StyleCase<DexDrawPointProperties::EMarkStyleType> {
  static constexpr int kType = IDexDrawProperties::DRAW_POINT;
  using Form = DexDrawPointProperties;
  static void set(Form& properties, DexDrawPointProperties::EMarkStyleType value) {
    properties.setMarkStyle(value);
  }
  static void setByLayer(Form& properties) { properties.setMarkStyleByLayer(); }
  static DexDrawPointProperties::EMarkStyleType valueOf(int source) {
    return static_cast<DexDrawPointProperties::EMarkStyleType>(source + 1);
  }
};

template <>
struct StyleCase<DexDrawLineProperties::EDashStyleType> {
  static constexpr int kType = IDexDrawProperties::DRAW_LINE;
  using Form = DexDrawLineProperties;
  static void set(Form& properties, DexDrawLineProperties::EDashStyleType value) {
    properties.setDashStyle(value);
  }
  static void setByLayer(Form& properties) { properties.setDashStyleByLayer(); }
  static DexDrawLineProperties::EDashStyleType valueOf(int source) {
    return static_cast<DexDrawLineProperties::EDashStyleType>(source % 5);
  }
};

template <>
struct StyleCase<unsigned char> {
  static constexpr int kType = IDexDrawProperties::DRAW_LINE;
  using Form = DexDrawLineProperties;
  static void set(Form& properties, unsigned char value) { properties.setWidth(value); }
  static void setByLayer(Form& properties) { properties.setWidthByLayer(); }
  static unsigned char valueOf(int source) { return static_cast<unsigned char>(10 + source); }
};

template <>
struct StyleCase<DexDrawAreaProperties::EFillStyleType> {
  static constexpr int kType = IDexDrawProperties::DRAW_AREA;
  using Form = DexDrawAreaProperties;
  static void set(Form& properties, DexDrawAreaProperties::EFillStyleType value) {
    properties.setFillStyleType(value);
  }
  static void setByLayer(Form& properties) { properties.setFillStyleByLayer(); }
  static DexDrawAreaProperties::EFillStyleType valueOf(int source) {
    return static_cast<DexDrawAreaProperties::EFillStyleType>(source);
  }
};

template <>
struct StyleCase<short> {
  static constexpr int kType = IDexDrawProperties::DRAW_AREA;
  using Form = DexDrawAreaProperties;
  static void set(Form& properties, short value) { properties.setFillTransparency(value); }
  static void setByLayer(Form& properties) { properties.setFillTransparencyByLayer(); }
  static short valueOf(int source) { return static_cast<short>(20 + source); }
};

// Builds one object with every place a value can come from, each place defining the value of its own
// source number (or only the by-layer mark, or nothing), so that a test reads which place answered.
template <class T>
class StyleScene {
  using Case = StyleCase<T>;
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

template <class T>
class StyleResolution : public ::testing::Test {};

using StyleValueTypes = ::testing::Types<unsigned long, DexDrawPointProperties::EMarkStyleType,
                                         DexDrawLineProperties::EDashStyleType, unsigned char,
                                         DexDrawAreaProperties::EFillStyleType, short>;
TYPED_TEST_SUITE(StyleResolution, StyleValueTypes);

TYPED_TEST(StyleResolution, OwnPropertiesWinOverEveryOtherSource) {
  StyleScene<TypeParam> scene;
  scene.ownDefines();
  scene.objectLayerDefines();
  scene.codeDefines();
  scene.objectHasCode();
  scene.defaultLayerDefines();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_OBJECT, scene.resolve(value));
  EXPECT_EQ(scene.valueOf(vyn::ie::STYLE_FROM_OBJECT), value);
}

TYPED_TEST(StyleResolution, OwnByLayerMarkReadsTheObjectLayerBeforeTheCode) {
  StyleScene<TypeParam> scene;
  scene.ownByLayer();
  scene.objectLayerDefines();
  scene.codeDefines();
  scene.objectHasCode();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_LAYER, scene.resolve(value));
  EXPECT_EQ(scene.valueOf(vyn::ie::STYLE_FROM_LAYER), value);
}

TYPED_TEST(StyleResolution, ObjectWithoutPropertiesOrCodesReadsItsLayer) {
  StyleScene<TypeParam> scene;
  scene.objectLayerDefines();
  scene.defaultLayerDefines();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_LAYER, scene.resolve(value));
  EXPECT_EQ(scene.valueOf(vyn::ie::STYLE_FROM_LAYER), value);
}

TYPED_TEST(StyleResolution, OwnPropertiesWithoutTheValueKeepTheLayerOut) {
  StyleScene<TypeParam> scene;
  scene.ownWithoutValue();
  scene.objectLayerDefines();
  scene.defaultLayerDefines();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER, scene.resolve(value));
  EXPECT_EQ(scene.valueOf(vyn::ie::STYLE_FROM_DEFAULT_LAYER), value);
}

TYPED_TEST(StyleResolution, DefaultLayerAnswersWhenNothingElseDefinesTheValue) {
  StyleScene<TypeParam> scene;
  scene.objectLayerWithoutValue();
  scene.defaultLayerDefines();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER, scene.resolve(value));
  EXPECT_EQ(scene.valueOf(vyn::ie::STYLE_FROM_DEFAULT_LAYER), value);
}

TYPED_TEST(StyleResolution, FirstCodeAnswersAndTheObjectLayerIsNotConsulted) {
  StyleScene<TypeParam> scene;
  scene.objectLayerDefines();
  scene.codeDefines();
  scene.objectHasCode();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_CODE, scene.resolve(value));
  EXPECT_EQ(scene.valueOf(vyn::ie::STYLE_FROM_CODE), value);
}

TYPED_TEST(StyleResolution, CodeByLayerMarkReadsTheLayerOfTheCode) {
  StyleScene<TypeParam> scene;
  scene.codeByLayer();
  scene.codeLayerDefines();
  scene.objectHasCode();
  scene.defaultLayerDefines();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_CODE_LAYER, scene.resolve(value));
  EXPECT_EQ(scene.valueOf(vyn::ie::STYLE_FROM_CODE_LAYER), value);
}

TYPED_TEST(StyleResolution, CodeLayerIsNotReadWithoutTheByLayerMark) {
  StyleScene<TypeParam> scene;
  scene.codeLayerDefines();
  scene.objectHasCode();
  scene.defaultLayerDefines();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER, scene.resolve(value));
}

TYPED_TEST(StyleResolution, ObjectWithACodeSkipsItsLayerWhenTheCodeDefinesNothing) {
  StyleScene<TypeParam> scene;
  scene.objectLayerDefines();
  scene.objectHasCode();
  scene.defaultLayerDefines();
  TypeParam value{};
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER, scene.resolve(value));
}

TYPED_TEST(StyleResolution, NothingDefinedAndNoDefaultLayerIsNotFoundSilently) {
  dex_test::LogCapture log;
  StyleScene<TypeParam> scene;
  scene.objectHasCode();
  const TypeParam untouched = scene.valueOf(7);
  TypeParam value = untouched;
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, scene.resolve(value, false));
  EXPECT_EQ(untouched, value);
  EXPECT_EQ(0u, log.size());
}

TYPED_TEST(StyleResolution, DefaultLayerWithoutTheValueIsNotFoundWithLogRecordAndMessage) {
  dex_test::LogCapture log;
  StyleScene<TypeParam> scene;
  const TypeParam untouched = scene.valueOf(7);
  TypeParam value = untouched;
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, scene.resolve(value));
  EXPECT_EQ(untouched, value);
  EXPECT_EQ(1, log.count(kLogSource, kNoStyleInDefaultLayerLine));
  EXPECT_EQ(1, log.countMessage(kNoStyleMessage));
  ASSERT_EQ(2u, log.size());
  EXPECT_EQ(4, log.records()[1].level);
}

// ---- The cases of a drawing exporter ------------------------------------------------------------

// A point whose colour is defined by the given properties, on a layer whose point colour is blue.
struct PointOnBlueLayer {
  PointOnBlueLayer() {
    layer.setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawPointProperties());
    layer.setColor(kBlue);
    point.setLayer(&layer, false);
  }
  DexLayer layer;
  DexDesignPoint point;
};

TEST(ObjectStyle, PointWithOwnRedColourIsRedEvenOnABlueLayer) {
  PointOnBlueLayer scene;
  auto* const own = new DexDrawPointProperties();
  own->setColor(kRed);
  scene.point.setDrawProperties(own);
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_OBJECT,
            getObjectStyle(IDexDrawProperties::DRAW_POINT, &scene.point, color, nullptr));
  EXPECT_EQ(kRed, color);
}

TEST(ObjectStyle, PointWithColourByLayerTakesTheBlueOfItsLayer) {
  PointOnBlueLayer scene;
  auto* const own = new DexDrawPointProperties();
  own->setColorByLayer();
  scene.point.setDrawProperties(own);
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_LAYER,
            getObjectStyle(IDexDrawProperties::DRAW_POINT, &scene.point, color, nullptr));
  EXPECT_EQ(kBlue, color);
}

TEST(ObjectStyle, PointWithoutPropertiesTakesItsLayerUntilACodeDefinesGreen) {
  PointOnBlueLayer scene;
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_LAYER,
            getObjectStyle(IDexDrawProperties::DRAW_POINT, &scene.point, color, nullptr));
  EXPECT_EQ(kBlue, color);

  DexCodeDescription description(L"TREE");
  auto* const byCode = new DexDrawPointProperties();
  byCode->setColor(kGreen);
  description.setDrawProperties(IDexDrawProperties::DRAW_POINT, byCode);
  scene.point.addCode(new DexCodeValues(&description));
  EXPECT_EQ(vyn::ie::STYLE_FROM_CODE,
            getObjectStyle(IDexDrawProperties::DRAW_POINT, &scene.point, color, nullptr));
  EXPECT_EQ(kGreen, color);
}

TEST(ObjectStyle, CodeWidthByLayerTakesTheWidthOfTheCodeLayer) {
  DexLayer codeLayer;
  codeLayer.setDrawProperties(IDexDrawProperties::DRAW_LINE,
                              new DexDrawLineProperties(kRed, 3, DexDrawLineProperties::DASH_DOT));
  DexCodeDescription description(L"FENCE");
  auto* const byCode = new DexDrawLineProperties();
  byCode->setWidthByLayer();
  description.setDrawProperties(IDexDrawProperties::DRAW_LINE, byCode);
  description.setLayer(&codeLayer);
  vyn::ie::DexPolyLine line;
  line.addCode(new DexCodeValues(&description));
  unsigned char width = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_CODE_LAYER,
            getObjectStyle(IDexDrawProperties::DRAW_LINE, &line, width, nullptr));
  EXPECT_EQ(3, width);
}

TEST(ObjectStyle, OwnPropertiesOfAnotherDrawTypeAreNotRead) {
  DexDesignPoint point;
  auto* const own = new DexDrawPointProperties();
  own->setColor(kRed);
  point.setDrawProperties(own);
  DexLayer defaultLayer;
  defaultLayer.setDrawProperties(IDexDrawProperties::DRAW_LINE,
                                 new DexDrawLineProperties(kBlue, 1, DexDrawLineProperties::DASH_SOLID));
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER,
            getObjectStyle(IDexDrawProperties::DRAW_LINE, &point, color, &defaultLayer));
  EXPECT_EQ(kBlue, color);
}

TEST(ObjectStyle, AreaDrawnAsAreaReadsItsAreaPropertiesAndAsLineItsOutline) {
  DexArea area;
  auto* const fill = new DexDrawAreaProperties();
  fill->setColor(kGreen);
  area.setAreaDrawProperties(fill);
  area.setDrawProperties(new DexDrawLineProperties(kRed, 2, DexDrawLineProperties::DASH_SOLID));
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_FROM_OBJECT, getObjectStyle(IDexDrawProperties::DRAW_AREA, &area, color, nullptr));
  EXPECT_EQ(kGreen, color);
  EXPECT_EQ(vyn::ie::STYLE_FROM_OBJECT, getObjectStyle(IDexDrawProperties::DRAW_LINE, &area, color, nullptr));
  EXPECT_EQ(kRed, color);
}

TEST(ObjectStyle, WidthIsNotReadFromPropertiesOfAnotherForm) {
  // Point properties have no width: by layer or not, they give none, and the point has no layer.
  DexDesignPoint point;
  auto* const own = new DexDrawPointProperties();
  own->setColorByLayer();
  point.setDrawProperties(own);
  DexLayer defaultLayer;
  defaultLayer.setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawPointProperties());
  dex_test::LogCapture log;
  unsigned char width = 9;
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND,
            getObjectStyle(IDexDrawProperties::DRAW_POINT, &point, width, &defaultLayer));
  EXPECT_EQ(9, width);
  EXPECT_EQ(1, log.count(kLogSource, kNoStyleInDefaultLayerLine));
}

TEST(ObjectStyle, NullObjectReadsOnlyTheDefaultLayer) {
  DexLayer defaultLayer;
  defaultLayer.setDrawProperties(IDexDrawProperties::DRAW_LINE,
                                 new DexDrawLineProperties(kBlue, 4, DexDrawLineProperties::DASH_DASH));
  DexDrawLineProperties::EDashStyleType dash = DexDrawLineProperties::DASH_SOLID;
  EXPECT_EQ(vyn::ie::STYLE_FROM_DEFAULT_LAYER,
            getObjectStyle(IDexDrawProperties::DRAW_LINE, static_cast<const DexObject*>(nullptr), dash,
                           &defaultLayer));
  EXPECT_EQ(DexDrawLineProperties::DASH_DASH, dash);
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, getObjectStyle(IDexDrawProperties::DRAW_LINE,
                                                     static_cast<const DexObject*>(nullptr), dash, nullptr));
}

TEST(ObjectStyle, DrawTypeOutsideTheTableFindsNothing) {
  PointOnBlueLayer scene;
  auto* const own = new DexDrawPointProperties();
  own->setColor(kRed);
  scene.point.setDrawProperties(own);
  dex_test::LogCapture log;
  unsigned long color = 0;
  EXPECT_EQ(vyn::ie::STYLE_NOT_FOUND, getObjectStyle(3, &scene.point, color, &scene.layer));
  EXPECT_EQ(0UL, color);
  EXPECT_EQ(1, log.count(kLogSource, kNoStyleInDefaultLayerLine));
}

}  // namespace
