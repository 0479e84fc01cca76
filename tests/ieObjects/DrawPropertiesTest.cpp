#include "ieObjects/IEDrawProperties.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "ieObjects/ObjectsTestHelpers.h"
#include "ieObjects/detail/DrawPropertiesLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
namespace detail = vyn::ie::detail;

using Point = DexDrawPointProperties;
using Line = DexDrawLineProperties;
using Area = DexDrawAreaProperties;

const std::wstring kSource = detail::kDrawPropertiesLogSource;

// One attribute as "name=value", "name=value*" (also by layer), "name*" (by layer only) or nothing.
template <class T>
std::string attribute(const char* name, bool defined, T value, bool byLayer) {
  if (!defined && !byLayer) return "";
  return std::string(" ") + name + (defined ? "=" + std::to_string(value) : "") + (byLayer ? "*" : "");
}

// What a properties object defines, its type first and "defined" when it counts as such.
std::string describe(const IDexDrawProperties& properties) {
  unsigned long color = 0;
  const bool hasColor = properties.getColor(color);
  std::string text = std::to_string(properties.getType()) + (properties.isDefined() ? " defined" : "");
  text += attribute("color", hasColor, color, properties.isColorByLayer());
  if (const auto* point = dynamic_cast<const Point*>(&properties)) {
    Point::EMarkStyleType mark = Point::MARK_DOT;
    const bool hasMark = point->getMarkStyle(mark);
    text += attribute("mark", hasMark, static_cast<int>(mark), point->isMarkStyleByLayer());
  } else if (const auto* line = dynamic_cast<const Line*>(&properties)) {
    Line::EDashStyleType dash = Line::DASH_SOLID;
    unsigned char width = 0;
    const bool hasDash = line->getDashStyle(dash);
    const bool hasWidth = line->getWidth(width);
    text += attribute("dash", hasDash, static_cast<int>(dash), line->isDashStyleByLayer());
    text += attribute("width", hasWidth, static_cast<int>(width), line->isWidthByLayer());
  } else if (const auto* area = dynamic_cast<const Area*>(&properties)) {
    Area::EFillStyleType fill = Area::FILL_NONE;
    short transparency = 0;
    const bool hasFill = area->getFillStyleType(fill);
    const bool hasTransparency = area->getFillTransparency(transparency);
    text += attribute("fill", hasFill, static_cast<int>(fill), area->isFillStyleByLayer());
    text += attribute("transparency", hasTransparency, transparency, area->isFillTransparencyByLayer());
  }
  return text;
}

std::string describeClone(const IDexDrawProperties& properties) {
  return describe(*std::unique_ptr<IDexDrawProperties>(properties.clone()));
}

TEST(DexDrawAttribute, KeepsValueDefinedFlagAndByLayerFlagApartAndTransfersThem) {
  DexDrawAttribute<int> attribute(8);
  int value = -1;
  EXPECT_FALSE(attribute.get(value));
  EXPECT_EQ(-1, value);
  attribute.setByLayer();
  EXPECT_FALSE(attribute.isDefined());
  DexDrawAttribute<int> target(1);
  attribute.transferTo(target);  // an undefined value does not travel, the by-layer flag does
  EXPECT_FALSE(target.get(value) || !target.isByLayer());
  attribute.set(4);
  attribute.setByLayer();
  DexDrawAttribute<int> second;
  attribute.transferTo(second);
  EXPECT_TRUE(second.get(value) && second.isByLayer());
  EXPECT_EQ(4, value);
  second.set(5);
  EXPECT_FALSE(second.isByLayer());
}

TEST(IDexDrawProperties, AnyOwnAttributeButNoByLayerFlagMakesAFormDefined) {
  Point point;
  Line line(0x0000FFul, 3, Line::DASH_DASH_DOT);
  Area area;
  EXPECT_EQ("0", describe(point));
  EXPECT_EQ("1 defined color=255 dash=3 width=3", describe(line));
  point.setMarkStyleByLayer();
  point.setColorByLayer();
  EXPECT_EQ("0 color* mark*", describe(point));
  point.setMarkStyle(Point::MARK_DOT);
  EXPECT_EQ("0 defined color* mark=0", describe(point));
  area.setFillTransparency(40);
  area.setFillTransparencyByLayer();
  EXPECT_EQ("2 defined transparency=40*", describe(area));
  area.setFillTransparency(-5);
  area.setColor(0x00FF00FFul);
  EXPECT_EQ("2 defined color=16711935 transparency=-5", describe(area));
  Line byLayerOnly;
  byLayerOnly.setWidthByLayer();
  byLayerOnly.setDashStyleByLayer();
  EXPECT_EQ("1 dash* width*", describe(byLayerOnly));
  byLayerOnly.setWidth(2);
  EXPECT_EQ("1 defined dash* width=2", describe(byLayerOnly));
  EXPECT_EQ(L"Point", point.getObjTypeAsString());
  EXPECT_EQ(L"Line", line.getObjTypeAsString());
  EXPECT_EQ(L"Area", area.getObjTypeAsString());
}

TEST(IDexDrawProperties, StyleTextsRoundTripIgnoringCase) {
  const wchar_t* const marks[] = {L"Dot",
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
  const wchar_t* const dashes[] = {L"Solid", L"Dash", L"Dot", L"Dash Dot", L"Dash Dot Dot"};
  const wchar_t* const fills[] = {L"None", L"Solid", L"Grid", L"Checkered", L"Horz. Lines", L"Vert. Lines"};
  CVynStringT<wchar_t> text;
  for (int value = 0; value < 16; ++value) {
    CVynStringT<wchar_t> upper(marks[value]);
    Point point;
    EXPECT_TRUE(point.setMarkStyleFromString(upper.MakeUpper())) << value;
    EXPECT_TRUE(point.getMarkStyleAsString(text));
    EXPECT_EQ(marks[value], text);
    EXPECT_EQ(marks[value], Point::getMarkStyleAsString(static_cast<Point::EMarkStyleType>(value)));
  }
  for (int value = 0; value < 5; ++value) {
    Line line;
    EXPECT_TRUE(line.setDashStyleFromString(CVynStringT<wchar_t>(dashes[value]).MakeLower())) << value;
    EXPECT_TRUE(line.getDashStyleTypeAsString(text));
    EXPECT_EQ(dashes[value], text);
  }
  for (int value = 0; value < 6; ++value) {
    Area area;
    EXPECT_TRUE(area.setFillStyleFromString(CVynStringT<wchar_t>(fills[value]).MakeUpper())) << value;
    EXPECT_TRUE(area.getFillStyleTypeAsString(text));
    EXPECT_EQ(fills[value], text);
  }
}

TEST(IDexDrawProperties, UnknownStyleTextsUndefineTheStyleAndStylesOutsideTheTablesAreLogged) {
  Point point;
  point.setMarkStyle(Point::MARK_CROSS);
  EXPECT_FALSE(point.setMarkStyleFromString(L"Small Cross") || point.setMarkStyleFromString(L""));
  CVynStringT<wchar_t> text(L"untouched");
  EXPECT_FALSE(point.getMarkStyleAsString(text));
  EXPECT_EQ(L"untouched", text);
  Line line;
  line.setDashStyle(Line::DASH_DASH);
  line.setDashStyleByLayer();
  EXPECT_FALSE(line.setDashStyleFromString(L"Dotted"));
  EXPECT_FALSE(line.getDashStyleTypeAsString(text));
  Area area;
  EXPECT_FALSE(area.setFillStyleFromString(L"Horz Lines") || area.getFillStyleTypeAsString(text));
  EXPECT_EQ("0", describe(point));
  EXPECT_EQ("1 dash*", describe(line));

  const dex_test::LogCapture log;
  EXPECT_EQ(L"", Point::getMarkStyleAsString(static_cast<Point::EMarkStyleType>(16)));
  EXPECT_EQ(L"", Point::getMarkStyleAsString(static_cast<Point::EMarkStyleType>(-1)));
  point.setMarkStyle(static_cast<Point::EMarkStyleType>(40));
  EXPECT_TRUE(point.getMarkStyleAsString(text));
  EXPECT_TRUE(text.IsEmpty());
  EXPECT_EQ(L"", Line::getDashStyleTypeAsString(static_cast<Line::EDashStyleType>(5)));
  EXPECT_EQ(L"", Area::getFillStyleTypeAsString(static_cast<Area::EFillStyleType>(6)));
  EXPECT_EQ(3, log.count(kSource, detail::kUnknownMarkStyleLine));
  EXPECT_EQ(1, log.count(kSource, detail::kUnknownDashStyleLine));
  EXPECT_EQ(1, log.count(kSource, detail::kUnknownFillStyleLine));
  EXPECT_TRUE(log.records()[0].message.empty());
  EXPECT_EQ(vyn_logging::kErrorLevel, log.records()[0].level);
}

TEST(IDexDrawProperties, ClonesAndCopiesTakeDefinedValuesAndByLayerFlagsOnly) {
  Point point;
  point.setColor(0x123456ul);
  point.setMarkStyleByLayer();
  EXPECT_EQ("0 defined color=1193046 mark*", describeClone(point));
  Line line;
  line.setWidth(5);
  line.setWidthByLayer();
  line.setColorByLayer();
  line.setDashStyle(Line::DASH_DOT);
  line.setDashStyleFromString(L"Dotted");  // the value stays, no longer defined
  EXPECT_EQ("1 defined color* width=5*", describeClone(line));
  Area area;
  area.setFillStyleType(Area::FILL_CHECKERED);
  area.setFillTransparencyByLayer();
  EXPECT_EQ("2 defined fill=3 transparency*", describeClone(area));
  Line assigned(7, 7, Line::DASH_DASH);
  assigned = line;
  EXPECT_EQ(describe(line), describe(assigned));
  EXPECT_EQ(describe(line), describe(Line(line)));
}

TEST(DexDrawPropertiesByType, CreatesFormsFromTheirExactNames) {
  for (const wchar_t* name : {L"Point", L"Line", L"Area"}) {
    const std::unique_ptr<IDexDrawProperties> made(DexDrawPropertiesByType::createFromString(name));
    ASSERT_NE(nullptr, made);
    EXPECT_EQ(name, made->getObjTypeAsString());
    EXPECT_FALSE(made->isDefined());
  }
  for (const wchar_t* text : {L"point", L"LINE", L"Area ", L"", L"Polygon"})
    EXPECT_EQ(nullptr, DexDrawPropertiesByType::createFromString(text)) << text;
}

TEST(DexDrawPropertiesByType, OwnsOneObjectPerFormAndCopiesDeeply) {
  int deletions = 0;
  {
    DexDrawPropertiesByType set;
    set.setColor(9);  // creates nothing
    EXPECT_FALSE(set.hasAny());
    auto* const held = new objects_test::CountedLineProperties(deletions);
    EXPECT_TRUE(set.set(IDexDrawProperties::DRAW_LINE, held) && set.set(IDexDrawProperties::DRAW_LINE, held));
    EXPECT_EQ(0, deletions);
    EXPECT_FALSE(set.set(IDexDrawProperties::DRAW_AREA, held));  // would be deleted twice
    Line stray;
    EXPECT_FALSE(set.set(3, &stray) || set.set(-1, &stray));
    EXPECT_EQ(nullptr, set.get(3));
    EXPECT_FALSE(set.isAnyDefined());
    set.setColor(9);
    EXPECT_TRUE(set.isAnyDefined());
    EXPECT_EQ("1 defined color=9", describe(*set.get(IDexDrawProperties::DRAW_LINE)));
    set.set(IDexDrawProperties::DRAW_LINE, new objects_test::CountedLineProperties(deletions));
    EXPECT_EQ(1, deletions);
    set.set(IDexDrawProperties::DRAW_LINE, nullptr);
    EXPECT_EQ(2, deletions);
    EXPECT_FALSE(set.hasAny());
    set.set(IDexDrawProperties::DRAW_LINE, new objects_test::CountedLineProperties(deletions));
  }
  EXPECT_EQ(3, deletions);

  auto* const original = new DexDrawPropertiesByType();
  auto* const line = new Line(3, 2, Line::DASH_DASH);
  line->setWidthByLayer();
  original->set(IDexDrawProperties::DRAW_LINE, line);
  DexDrawPropertiesByType copy(*original);
  DexDrawPropertiesByType assigned;
  assigned.set(IDexDrawProperties::DRAW_AREA, new Area());
  assigned = *original;
  delete original;
  for (const DexDrawPropertiesByType* set : {&copy, &assigned}) {
    EXPECT_EQ("1 defined color=3 dash=1 width=2*", describe(*set->get(IDexDrawProperties::DRAW_LINE)));
    EXPECT_TRUE(set->get(IDexDrawProperties::DRAW_POINT) == nullptr &&
                set->get(IDexDrawProperties::DRAW_AREA) == nullptr);
  }
}

}  // namespace
