#include "ieObjects/IEDrawProperties.h"

#include <gtest/gtest.h>

#include <memory>

#include "ieObjects/detail/DrawPropertiesLog.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexDrawAreaProperties;
using vyn::ie::DexDrawAttribute;
using vyn::ie::DexDrawLineProperties;
using vyn::ie::DexDrawPointProperties;
using vyn::ie::DexDrawPropertiesByType;
using vyn::ie::IDexDrawProperties;
namespace detail = vyn::ie::detail;

using MarkStyle = DexDrawPointProperties::EMarkStyleType;
using DashStyle = DexDrawLineProperties::EDashStyleType;
using FillStyle = DexDrawAreaProperties::EFillStyleType;

const std::wstring kSource = detail::kDrawPropertiesLogSource;

// Counts deletions so that ownership rules become visible.
class CountedPointProperties : public DexDrawPointProperties {
 public:
  explicit CountedPointProperties(int& deletions) : deletions_(deletions) {}
  ~CountedPointProperties() override { ++deletions_; }

 private:
  int& deletions_;
};

std::unique_ptr<IDexDrawProperties> cloneOf(const IDexDrawProperties& properties) {
  return std::unique_ptr<IDexDrawProperties>(properties.clone());
}

}  // namespace

// The value / defined / by-layer triple.

TEST(DexDrawAttribute, SetterDefinesTheValueAndClearsByLayer) {
  DexDrawAttribute<int> attribute;
  attribute.setByLayer();
  attribute.set(4);
  int value = 0;
  EXPECT_TRUE(attribute.get(value));
  EXPECT_EQ(4, value);
  EXPECT_TRUE(attribute.isDefined());
  EXPECT_FALSE(attribute.isByLayer());
}

TEST(DexDrawAttribute, ByLayerSetterLeavesValueAndDefinedFlag) {
  DexDrawAttribute<int> attribute;
  attribute.set(4);
  attribute.setByLayer();
  int value = 0;
  EXPECT_TRUE(attribute.get(value));
  EXPECT_EQ(4, value);
  EXPECT_TRUE(attribute.isByLayer());

  DexDrawAttribute<int> onlyByLayer;
  onlyByLayer.setByLayer();
  EXPECT_FALSE(onlyByLayer.isDefined());
}

TEST(DexDrawAttribute, GetterWritesItsOutputOnlyWhenDefined) {
  const DexDrawAttribute<int> attribute(8);
  int value = -1;
  EXPECT_FALSE(attribute.get(value));
  EXPECT_EQ(-1, value);
}

TEST(DexDrawAttribute, TransferHandsOverDefinedValuesAndByLayerFlagsOnly) {
  DexDrawAttribute<int> undefinedByLayer(8);
  undefinedByLayer.setByLayer();
  DexDrawAttribute<int> target(1);
  undefinedByLayer.transferTo(target);
  int value = -1;
  EXPECT_FALSE(target.get(value));
  EXPECT_TRUE(target.isByLayer());

  DexDrawAttribute<int> definedByLayer;
  definedByLayer.set(3);
  definedByLayer.setByLayer();
  DexDrawAttribute<int> second;
  definedByLayer.transferTo(second);
  EXPECT_TRUE(second.get(value));
  EXPECT_EQ(3, value);
  EXPECT_TRUE(second.isByLayer());
}

// Colour, common to all forms.

TEST(IDexDrawProperties, ColourFollowsTheTripleThroughTheBaseInterface) {
  std::unique_ptr<IDexDrawProperties> properties = std::make_unique<DexDrawAreaProperties>();
  unsigned long color = 77;
  EXPECT_FALSE(properties->getColor(color));
  EXPECT_EQ(77u, color);
  EXPECT_FALSE(properties->isDefined());

  properties->setColorByLayer();
  EXPECT_TRUE(properties->isColorByLayer());
  EXPECT_FALSE(properties->isDefined());

  properties->setColor(0x00FF00FFul);
  EXPECT_FALSE(properties->isColorByLayer());
  EXPECT_TRUE(properties->getColor(color));
  EXPECT_EQ(0x00FF00FFul, color);
  EXPECT_TRUE(properties->isDefined());
}

TEST(IDexDrawProperties, EachFormNamesItsType) {
  const DexDrawPointProperties point;
  const DexDrawLineProperties line;
  const DexDrawAreaProperties area;
  EXPECT_EQ(IDexDrawProperties::DRAW_POINT, point.getType());
  EXPECT_EQ(IDexDrawProperties::DRAW_LINE, line.getType());
  EXPECT_EQ(IDexDrawProperties::DRAW_AREA, area.getType());
  EXPECT_EQ(L"Point", point.getObjTypeAsString());
  EXPECT_EQ(L"Line", line.getObjTypeAsString());
  EXPECT_EQ(L"Area", area.getObjTypeAsString());
  static_assert(sizeof(IDexDrawProperties::EDexDrawType) == 4);
  static_assert(sizeof(MarkStyle) == 4 && sizeof(DashStyle) == 4 && sizeof(FillStyle) == 4);
}

// Point properties.

TEST(DexDrawPointProperties, NothingIsDefinedAfterConstruction) {
  const DexDrawPointProperties point;
  MarkStyle style = DexDrawPointProperties::MARK_TREE;
  EXPECT_FALSE(point.getMarkStyle(style));
  EXPECT_EQ(DexDrawPointProperties::MARK_TREE, style);
  EXPECT_FALSE(point.isMarkStyleByLayer());
  EXPECT_FALSE(point.isColorByLayer());
  EXPECT_FALSE(point.isDefined());
}

TEST(DexDrawPointProperties, MarkStyleAloneMakesTheObjectDefined) {
  DexDrawPointProperties point;
  point.setMarkStyleByLayer();
  EXPECT_FALSE(point.isDefined());
  point.setMarkStyle(DexDrawPointProperties::MARK_DOT);
  EXPECT_TRUE(point.isDefined());
  EXPECT_FALSE(point.isMarkStyleByLayer());
}

TEST(DexDrawPointProperties, EveryMarkStyleTextRoundTrips) {
  const wchar_t* const texts[] = {L"Dot",
                                  L"Filled Rect",
                                  L"Filled Diamond",
                                  L"Filled Circle",
                                  L"Filled Triangle",
                                  L"Rect",
                                  L"Diamond",
                                  L"Circle",
                                  L"Triangle",
                                  L"Cross",
                                  L"Tree",
                                  L"SmallCross",
                                  L"Upside Triangle",
                                  L"Filled Upside Triangle",
                                  L"XCross",
                                  L"None"};
  for (int value = 0; value < 16; ++value) {
    const auto style = static_cast<MarkStyle>(value);
    EXPECT_EQ(texts[value], DexDrawPointProperties::getMarkStyleAsString(style)) << value;
    DexDrawPointProperties point;
    EXPECT_TRUE(point.setMarkStyleFromString(texts[value])) << value;
    MarkStyle read = DexDrawPointProperties::MARK_DOT;
    EXPECT_TRUE(point.getMarkStyle(read));
    EXPECT_EQ(style, read);
    CVynStringT<wchar_t> text;
    EXPECT_TRUE(point.getMarkStyleAsString(text));
    EXPECT_EQ(texts[value], text);
  }
}

TEST(DexDrawPointProperties, MarkStyleTextsAreReadIgnoringCase) {
  DexDrawPointProperties point;
  EXPECT_TRUE(point.setMarkStyleFromString(L"filled UPSIDE triangle"));
  MarkStyle style = DexDrawPointProperties::MARK_DOT;
  EXPECT_TRUE(point.getMarkStyle(style));
  EXPECT_EQ(DexDrawPointProperties::MARK_FILLED_UPSIDE_TRIANGLE, style);
  EXPECT_TRUE(point.setMarkStyleFromString(L"xcross"));
  EXPECT_TRUE(point.getMarkStyle(style));
  EXPECT_EQ(DexDrawPointProperties::MARK_X_CROSS, style);
}

TEST(DexDrawPointProperties, UnknownMarkTextLeavesTheStyleUndefined) {
  DexDrawPointProperties point;
  point.setMarkStyle(DexDrawPointProperties::MARK_CROSS);
  EXPECT_FALSE(point.setMarkStyleFromString(L"Small Cross"));
  MarkStyle style = DexDrawPointProperties::MARK_NONE;
  EXPECT_FALSE(point.getMarkStyle(style));
  EXPECT_EQ(DexDrawPointProperties::MARK_NONE, style);
  EXPECT_FALSE(point.setMarkStyleFromString(L""));
  EXPECT_FALSE(point.isDefined());
}

TEST(DexDrawPointProperties, MarkStyleTextIsFalseWhileUndefined) {
  const DexDrawPointProperties point;
  CVynStringT<wchar_t> text(L"untouched");
  EXPECT_FALSE(point.getMarkStyleAsString(text));
  EXPECT_EQ(L"untouched", text);
}

TEST(DexDrawPointProperties, MarkStyleOutsideTheTableGivesAnEmptyTextAndALogRecord) {
  const dex_test::LogCapture log;
  EXPECT_EQ(L"", DexDrawPointProperties::getMarkStyleAsString(static_cast<MarkStyle>(16)));
  EXPECT_EQ(L"", DexDrawPointProperties::getMarkStyleAsString(static_cast<MarkStyle>(-1)));
  EXPECT_EQ(2, log.count(kSource, detail::kUnknownMarkStyleLine));
  const auto records = log.records();
  ASSERT_EQ(2u, records.size());
  EXPECT_TRUE(records[0].message.empty());
  EXPECT_EQ(vyn_logging::kErrorLevel, records[0].level);
}

TEST(DexDrawPointProperties, StoredMarkStyleOutsideTheTableReadsAsAnEmptyText) {
  DexDrawPointProperties point;
  point.setMarkStyle(static_cast<MarkStyle>(40));
  const dex_test::LogCapture log;
  CVynStringT<wchar_t> text(L"untouched");
  EXPECT_TRUE(point.getMarkStyleAsString(text));
  EXPECT_TRUE(text.IsEmpty());
  EXPECT_EQ(1, log.count(kSource, detail::kUnknownMarkStyleLine));
}

// Line properties.

TEST(DexDrawLineProperties, WidthIsReportedOnlyAfterSetWidth) {
  DexDrawLineProperties line;
  unsigned char width = 0;
  EXPECT_FALSE(line.getWidth(width));
  EXPECT_EQ(0, width);
  line.setWidth(1);
  EXPECT_TRUE(line.getWidth(width));
  EXPECT_EQ(1, width);
}

TEST(DexDrawLineProperties, ConstructorWithValuesDefinesAllThree) {
  const DexDrawLineProperties line(0x0000FFul, 3, DexDrawLineProperties::DASH_DASH_DOT);
  unsigned long color = 0;
  unsigned char width = 0;
  DashStyle style = DexDrawLineProperties::DASH_SOLID;
  EXPECT_TRUE(line.getColor(color));
  EXPECT_TRUE(line.getWidth(width));
  EXPECT_TRUE(line.getDashStyle(style));
  EXPECT_EQ(0x0000FFul, color);
  EXPECT_EQ(3, width);
  EXPECT_EQ(DexDrawLineProperties::DASH_DASH_DOT, style);
  EXPECT_FALSE(line.isColorByLayer() || line.isWidthByLayer() || line.isDashStyleByLayer());
}

TEST(DexDrawLineProperties, AnyOfItsAttributesMakesItDefined) {
  DexDrawLineProperties byWidth;
  byWidth.setWidth(2);
  EXPECT_TRUE(byWidth.isDefined());
  DexDrawLineProperties byDash;
  byDash.setDashStyle(DexDrawLineProperties::DASH_SOLID);
  EXPECT_TRUE(byDash.isDefined());
  DexDrawLineProperties byLayerOnly;
  byLayerOnly.setWidthByLayer();
  byLayerOnly.setDashStyleByLayer();
  byLayerOnly.setColorByLayer();
  EXPECT_FALSE(byLayerOnly.isDefined());
}

TEST(DexDrawLineProperties, DashStyleTextsAreReadIgnoringCase) {
  DexDrawLineProperties line;
  EXPECT_TRUE(line.setDashStyleFromString(L"dash dot"));
  DashStyle style = DexDrawLineProperties::DASH_SOLID;
  EXPECT_TRUE(line.getDashStyle(style));
  EXPECT_EQ(3, style);
  EXPECT_TRUE(line.setDashStyleFromString(L"DASH DOT DOT"));
  EXPECT_TRUE(line.getDashStyle(style));
  EXPECT_EQ(DexDrawLineProperties::DASH_DASH_DOT_DOT, style);
}

TEST(DexDrawLineProperties, UnknownDashTextClearsTheDefinedFlag) {
  DexDrawLineProperties line;
  line.setDashStyle(DexDrawLineProperties::DASH_DASH);
  line.setDashStyleByLayer();
  EXPECT_FALSE(line.setDashStyleFromString(L"Dotted"));
  DashStyle style = DexDrawLineProperties::DASH_SOLID;
  EXPECT_FALSE(line.getDashStyle(style));
  EXPECT_EQ(DexDrawLineProperties::DASH_SOLID, style);
  EXPECT_TRUE(line.isDashStyleByLayer());
  CVynStringT<wchar_t> text;
  EXPECT_FALSE(line.getDashStyleTypeAsString(text));
}

TEST(DexDrawLineProperties, EveryDashStyleHasItsText) {
  const wchar_t* const texts[] = {L"Solid", L"Dash", L"Dot", L"Dash Dot", L"Dash Dot Dot"};
  for (int value = 0; value < 5; ++value) {
    const auto style = static_cast<DashStyle>(value);
    EXPECT_EQ(texts[value], DexDrawLineProperties::getDashStyleTypeAsString(style));
    DexDrawLineProperties line;
    line.setDashStyle(style);
    CVynStringT<wchar_t> text;
    EXPECT_TRUE(line.getDashStyleTypeAsString(text));
    EXPECT_EQ(texts[value], text);
  }
}

TEST(DexDrawLineProperties, DashStyleOutsideTheTableGivesAnEmptyTextAndALogRecord) {
  const dex_test::LogCapture log;
  EXPECT_EQ(L"", DexDrawLineProperties::getDashStyleTypeAsString(static_cast<DashStyle>(5)));
  EXPECT_EQ(1, log.count(kSource, detail::kUnknownDashStyleLine));
  EXPECT_EQ(1u, log.size());
}

// Area properties.

TEST(DexDrawAreaProperties, NothingIsDefinedAfterConstruction) {
  const DexDrawAreaProperties area;
  FillStyle style = DexDrawAreaProperties::FILL_GRID;
  short transparency = 12;
  EXPECT_FALSE(area.getFillStyleType(style));
  EXPECT_FALSE(area.getFillTransparency(transparency));
  EXPECT_EQ(DexDrawAreaProperties::FILL_GRID, style);
  EXPECT_EQ(12, transparency);
  EXPECT_FALSE(area.isDefined());
}

TEST(DexDrawAreaProperties, FillTransparencyFollowsTheTriple) {
  DexDrawAreaProperties area;
  area.setFillTransparency(40);
  area.setFillTransparencyByLayer();
  short transparency = 0;
  EXPECT_TRUE(area.getFillTransparency(transparency));
  EXPECT_EQ(40, transparency);
  EXPECT_TRUE(area.isFillTransparencyByLayer());
  EXPECT_TRUE(area.isDefined());
  area.setFillTransparency(-5);
  EXPECT_FALSE(area.isFillTransparencyByLayer());
  EXPECT_TRUE(area.getFillTransparency(transparency));
  EXPECT_EQ(-5, transparency);
}

TEST(DexDrawAreaProperties, EveryFillStyleTextRoundTripsIgnoringCase) {
  const wchar_t* const texts[] = {L"None", L"Solid", L"Grid", L"Checkered", L"Horz. Lines", L"Vert. Lines"};
  for (int value = 0; value < 6; ++value) {
    const auto style = static_cast<FillStyle>(value);
    EXPECT_EQ(texts[value], DexDrawAreaProperties::getFillStyleTypeAsString(style));
    CVynStringT<wchar_t> upper(texts[value]);
    upper.MakeUpper();
    DexDrawAreaProperties area;
    EXPECT_TRUE(area.setFillStyleFromString(upper)) << value;
    FillStyle read = DexDrawAreaProperties::FILL_NONE;
    EXPECT_TRUE(area.getFillStyleType(read));
    EXPECT_EQ(style, read);
  }
  DexDrawAreaProperties area;
  EXPECT_FALSE(area.setFillStyleFromString(L"Horz Lines"));
  EXPECT_FALSE(area.isDefined());
}

TEST(DexDrawAreaProperties, FillStyleOutsideTheTableGivesAnEmptyTextAndALogRecord) {
  const dex_test::LogCapture log;
  EXPECT_EQ(L"", DexDrawAreaProperties::getFillStyleTypeAsString(static_cast<FillStyle>(6)));
  EXPECT_EQ(1, log.count(kSource, detail::kUnknownFillStyleLine));
}

// Cloning and copying.

TEST(DexDrawPointProperties, CloneCopiesDefinedValuesAndByLayerFlagsOnly) {
  DexDrawPointProperties point;
  point.setColor(0x123456ul);
  point.setMarkStyleByLayer();
  const auto clone = cloneOf(point);
  auto* const copy = dynamic_cast<DexDrawPointProperties*>(clone.get());
  ASSERT_NE(nullptr, copy);
  unsigned long color = 0;
  EXPECT_TRUE(copy->getColor(color));
  EXPECT_EQ(0x123456ul, color);
  EXPECT_FALSE(copy->isColorByLayer());
  MarkStyle style = DexDrawPointProperties::MARK_NONE;
  EXPECT_FALSE(copy->getMarkStyle(style));
  EXPECT_TRUE(copy->isMarkStyleByLayer());
}

TEST(DexDrawLineProperties, CloneCopiesDefinedValuesAndByLayerFlagsOnly) {
  DexDrawLineProperties line;
  line.setWidth(5);
  line.setWidthByLayer();
  line.setColorByLayer();
  line.setDashStyle(DexDrawLineProperties::DASH_DOT);
  EXPECT_FALSE(line.setDashStyleFromString(L"Dotted"));  // value stays, no longer defined
  const auto clone = cloneOf(line);
  auto* const copy = dynamic_cast<DexDrawLineProperties*>(clone.get());
  ASSERT_NE(nullptr, copy);
  unsigned char width = 0;
  EXPECT_TRUE(copy->getWidth(width));
  EXPECT_EQ(5, width);
  EXPECT_TRUE(copy->isWidthByLayer());
  unsigned long color = 9;
  EXPECT_FALSE(copy->getColor(color));
  EXPECT_TRUE(copy->isColorByLayer());
  DashStyle style = DexDrawLineProperties::DASH_SOLID;
  EXPECT_FALSE(copy->getDashStyle(style));
  EXPECT_FALSE(copy->isDashStyleByLayer());
}

TEST(DexDrawAreaProperties, CloneCopiesDefinedValuesAndByLayerFlagsOnly) {
  DexDrawAreaProperties area;
  area.setFillStyleType(DexDrawAreaProperties::FILL_CHECKERED);
  area.setFillTransparencyByLayer();
  const auto clone = cloneOf(area);
  auto* const copy = dynamic_cast<DexDrawAreaProperties*>(clone.get());
  ASSERT_NE(nullptr, copy);
  FillStyle style = DexDrawAreaProperties::FILL_NONE;
  EXPECT_TRUE(copy->getFillStyleType(style));
  EXPECT_EQ(DexDrawAreaProperties::FILL_CHECKERED, style);
  EXPECT_FALSE(copy->isFillStyleByLayer());
  short transparency = 0;
  EXPECT_FALSE(copy->getFillTransparency(transparency));
  EXPECT_TRUE(copy->isFillTransparencyByLayer());
  EXPECT_FALSE(copy->isColorByLayer());
  unsigned long color = 0;
  EXPECT_FALSE(copy->getColor(color));
}

TEST(DexDrawAreaProperties, CloneIsIndependentOfItsSource) {
  auto* const area = new DexDrawAreaProperties();
  area->setColor(1);
  const auto clone = cloneOf(*area);
  area->setColor(2);
  delete area;
  unsigned long color = 0;
  EXPECT_TRUE(clone->getColor(color));
  EXPECT_EQ(1u, color);
}

TEST(DexDrawLineProperties, CopyConstructionAndAssignmentCopyAllThreeFlags) {
  DexDrawLineProperties line;
  line.setWidth(4);
  line.setDashStyleByLayer();
  const DexDrawLineProperties copy(line);
  unsigned char width = 0;
  EXPECT_TRUE(copy.getWidth(width));
  EXPECT_EQ(4, width);
  EXPECT_TRUE(copy.isDashStyleByLayer());
  DexDrawLineProperties assigned(7, 7, DexDrawLineProperties::DASH_DASH);
  assigned = line;
  unsigned long color = 0;
  EXPECT_FALSE(assigned.getColor(color));
  EXPECT_TRUE(assigned.getWidth(width));
  EXPECT_TRUE(assigned.isDashStyleByLayer());
}

// The three objects of a layer or code description.

TEST(DexDrawPropertiesByType, CreatesFormsFromTheirExactNames) {
  const std::unique_ptr<IDexDrawProperties> point(DexDrawPropertiesByType::createFromString(L"Point"));
  const std::unique_ptr<IDexDrawProperties> line(DexDrawPropertiesByType::createFromString(L"Line"));
  const std::unique_ptr<IDexDrawProperties> area(DexDrawPropertiesByType::createFromString(L"Area"));
  ASSERT_NE(nullptr, point);
  ASSERT_NE(nullptr, line);
  ASSERT_NE(nullptr, area);
  EXPECT_NE(nullptr, dynamic_cast<DexDrawPointProperties*>(point.get()));
  EXPECT_NE(nullptr, dynamic_cast<DexDrawLineProperties*>(line.get()));
  EXPECT_NE(nullptr, dynamic_cast<DexDrawAreaProperties*>(area.get()));
  EXPECT_FALSE(point->isDefined());
  for (const wchar_t* text : {L"point", L"LINE", L"Area ", L"", L"Polygon"})
    EXPECT_EQ(nullptr, DexDrawPropertiesByType::createFromString(text)) << text;
}

TEST(DexDrawPropertiesByType, SettingTheHeldPointerAgainKeepsIt) {
  int deletions = 0;
  DexDrawPropertiesByType set;
  auto* const point = new CountedPointProperties(deletions);
  EXPECT_TRUE(set.set(IDexDrawProperties::DRAW_POINT, point));
  EXPECT_TRUE(set.set(IDexDrawProperties::DRAW_POINT, point));
  EXPECT_EQ(0, deletions);
  point->setColor(5);  // still alive
  EXPECT_EQ(point, set.get(IDexDrawProperties::DRAW_POINT));
}

TEST(DexDrawPropertiesByType, ReplacingDeletesTheOldObject) {
  int deletions = 0;
  {
    DexDrawPropertiesByType set;
    set.set(IDexDrawProperties::DRAW_POINT, new CountedPointProperties(deletions));
    set.set(IDexDrawProperties::DRAW_POINT, new CountedPointProperties(deletions));
    EXPECT_EQ(1, deletions);
    set.set(IDexDrawProperties::DRAW_POINT, nullptr);
    EXPECT_EQ(2, deletions);
    EXPECT_FALSE(set.hasAny());
    set.set(IDexDrawProperties::DRAW_POINT, new CountedPointProperties(deletions));
  }
  EXPECT_EQ(3, deletions);
}

TEST(DexDrawPropertiesByType, DeclinesTypesOutsideTheThreeAndObjectsHeldElsewhere) {
  DexDrawPropertiesByType set;
  auto* const line = new DexDrawLineProperties();
  EXPECT_FALSE(set.set(static_cast<IDexDrawProperties::EDexDrawType>(3), line));
  EXPECT_FALSE(set.set(static_cast<IDexDrawProperties::EDexDrawType>(-1), line));
  EXPECT_EQ(nullptr, set.get(static_cast<IDexDrawProperties::EDexDrawType>(3)));
  EXPECT_FALSE(set.hasAny());
  EXPECT_TRUE(set.set(IDexDrawProperties::DRAW_LINE, line));
  EXPECT_FALSE(set.set(IDexDrawProperties::DRAW_AREA, line));  // would be deleted twice
  EXPECT_EQ(nullptr, set.get(IDexDrawProperties::DRAW_AREA));
}

TEST(DexDrawPropertiesByType, CopiesAreDeep) {
  auto* const original = new DexDrawPropertiesByType();
  auto* const line = new DexDrawLineProperties(3, 2, DexDrawLineProperties::DASH_DASH);
  line->setWidthByLayer();
  original->set(IDexDrawProperties::DRAW_LINE, line);
  DexDrawPropertiesByType copy(*original);
  DexDrawPropertiesByType assigned;
  assigned.set(IDexDrawProperties::DRAW_AREA, new DexDrawAreaProperties());
  assigned = *original;
  delete original;
  for (const DexDrawPropertiesByType* set : {&copy, &assigned}) {
    const auto* const copiedLine =
        dynamic_cast<const DexDrawLineProperties*>(set->get(IDexDrawProperties::DRAW_LINE));
    ASSERT_NE(nullptr, copiedLine);
    unsigned char width = 0;
    EXPECT_TRUE(copiedLine->getWidth(width));
    EXPECT_EQ(2, width);
    EXPECT_TRUE(copiedLine->isWidthByLayer());
    EXPECT_EQ(nullptr, set->get(IDexDrawProperties::DRAW_POINT));
    EXPECT_EQ(nullptr, set->get(IDexDrawProperties::DRAW_AREA));
  }
}

TEST(DexDrawPropertiesByType, ColourGoesToEveryHeldObjectAndCreatesNone) {
  DexDrawPropertiesByType set;
  set.setColor(9);
  EXPECT_FALSE(set.hasAny());
  set.set(IDexDrawProperties::DRAW_AREA, new DexDrawAreaProperties());
  EXPECT_FALSE(set.isAnyDefined());
  set.setColor(9);
  unsigned long color = 0;
  EXPECT_TRUE(set.get(IDexDrawProperties::DRAW_AREA)->getColor(color));
  EXPECT_EQ(9u, color);
  EXPECT_TRUE(set.isAnyDefined());
  EXPECT_EQ(nullptr, set.get(IDexDrawProperties::DRAW_POINT));
}
