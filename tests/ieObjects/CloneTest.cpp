// Copy construction, assignment and clone() of every survey object: what each copies, and that every
// copy owns its own code values, drawing properties, photo notes and sheet-point stations, so that
// deleting the original leaves it intact (the sanitizer run checks the reads after the deletion).

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <utility>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEObjects.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
using objects_test::codeOf;
using objects_test::colorOf;
using objects_test::Counted;
using objects_test::firstPhotoFileOf;
using objects_test::stationAt;

constexpr unsigned long kObjectColor = 0x123456;

// Gives object one code (with code string "7") of description, line properties, two photo notes, the
// layer (by code), state 0 and the name "N1".
void fillCommonParts(DexObject& object, const DexCodeDescription& description, const DexLayer& layer) {
  object.addCode(codeOf(&description, {L"7"}));
  object.setDrawProperties(objects_test::linePropertiesOf(kObjectColor));
  object.setPhotoNotes(objects_test::photoNotesOf({L"a.jpg", L"b.jpg"}));
  object.setLayer(&layer, true);
  object.setStateType(IDexStateInterface::INACTIVE_STATE);
  object.setName(L"N1");
}

// The parts fillCommonParts gave, read from copy; none of the owned ones may be original's.
void expectOwnCommonParts(const DexObject& copy, const DexObject* original,
                          const DexCodeDescription& description, const DexLayer& layer) {
  if (original != nullptr) {
    EXPECT_TRUE(original->getCode(0) != copy.getCode(0) &&
                original->getDrawProperties() != copy.getDrawProperties() &&
                original->getPhotoNotes() != copy.getPhotoNotes());
  }
  delete original;
  ASSERT_TRUE(copy.getNumberOfCodes() == 1 && copy.getPhotoNotes() != nullptr);
  EXPECT_TRUE(copy.getCode(0)->getDescription() == &description &&
              copy.getCode(0)->getCodeStringAt(0) == L"7");
  EXPECT_EQ(kObjectColor, colorOf(copy.getDrawProperties()));
  EXPECT_TRUE(copy.getPhotoNotes()->getNumberOfPhotoNotes() == 2 && firstPhotoFileOf(copy) == L"a.jpg");
  EXPECT_TRUE(copy.getLayer() == &layer && copy.getStateType() == 0 && copy.getName() == L"N1");
}

template <class T>
class EveryObject : public ::testing::Test {
 protected:
  const DexCodeDescription description_{L"TREE"};
  const DexLayer layer_;

  T* filled() {
    auto* const object = new T();
    fillCommonParts(*object, description_, layer_);
    return object;
  }
};

using ObjectClasses = ::testing::Types<DexDesignPoint, DexPtlPoint, DexSheetPoint, DexPolyLine, DexArea,
                                       DexBreakline, DexArc, DexCircle, DexTextLabel>;
TYPED_TEST_SUITE(EveryObject, ObjectClasses);

template <class T>
std::unique_ptr<T> cloneOf(const T& object) {
  return std::unique_ptr<T>(dynamic_cast<T*>(object.clone()));
}

}  // namespace

TYPED_TEST(EveryObject, CopiesAndClonesOwnWhatTheObjectOwns) {
  TypeParam* const original = this->filled();
  const TypeParam copied(*original);
  expectOwnCommonParts(copied, original, this->description_, this->layer_);
  EXPECT_TRUE(copied.isLayerByCode());
  TypeParam* const source = this->filled();
  const std::unique_ptr<DexObject> clone(source->clone());
  ASSERT_NE(nullptr, dynamic_cast<TypeParam*>(clone.get()));
  EXPECT_EQ(source->getType(), clone->getType());
  expectOwnCommonParts(*clone, source, this->description_, this->layer_);
  EXPECT_FALSE(clone->isLayerByCode());
  const std::unique_ptr<DexObject> bare(TypeParam().clone());  // nothing owned, nothing cloned
  EXPECT_TRUE(bare->getDrawProperties() == nullptr && bare->getPhotoNotes() == nullptr &&
              bare->getNumberOfCodes() == 0 && bare->getStateType() == 1);
}

TYPED_TEST(EveryObject, AssignmentDeletesWhatTheTargetOwnedAndOwnsItsCopies) {
  int deletions = 0;
  TypeParam target;
  target.addCode(codeOf(nullptr));
  target.setDrawProperties(new Counted<DexDrawLineProperties>(deletions));
  target.setPhotoNotes(new Counted<DexPhotoNotes>(deletions));
  TypeParam* const original = this->filled();
  target = *original;
  EXPECT_EQ(2, deletions);
  expectOwnCommonParts(target, original, this->description_, this->layer_);
  const auto* const properties = target.getDrawProperties();
  target = std::as_const(target);
  EXPECT_EQ(properties, target.getDrawProperties());
  expectOwnCommonParts(target, nullptr, this->description_, this->layer_);
  target.setDrawProperties(new Counted<DexDrawLineProperties>(deletions));
  target.setPhotoNotes(new Counted<DexPhotoNotes>(deletions));
  target = TypeParam();  // nothing owned clears the target
  EXPECT_TRUE(deletions == 4 && target.getDrawProperties() == nullptr && target.getPhotoNotes() == nullptr);
}

TEST(DexDesignPoint, CloneCopiesStationAndUserStringsButNotTheSurfaceFlag) {
  DexDesignPoint point;
  DexStation station = stationAt(1.0, 2.0, 3.0, L"P7", 0.1);
  station.setNotes(L"kerb");
  point.setStation(station);
  point.getUserStrings().Add(L"extra");
  point.setUsedInSurface(false);
  const auto copy = cloneOf(point);
  EXPECT_TRUE(copy->getStation() == station && copy->getName() == L"P7" &&
              copy->getUserStrings().GetSize() == 1 && copy->getUserStrings().GetAt(0) == L"extra" &&
              copy->isUsedInSurface());
  EXPECT_FALSE(DexDesignPoint(point).isUsedInSurface());  // copy construction takes it
  DexPtlPoint ptl(L"R1", L"R2", 0);
  ptl.setCoords(4.0, 5.0, 6.0);
  ptl.setName(L"PTL");
  const auto ptlCopy = cloneOf(ptl);
  EXPECT_TRUE(ptlCopy->getFirstReferencePointIds() == L"R1" &&
              ptlCopy->getSecondReferencePointIds() == L"R2" && ptlCopy->getCoordType() == 0 &&
              ptlCopy->getStation() == DexPosition3D(4.0, 5.0, 6.0) && ptlCopy->getName() == L"PTL");
}

TEST(DexTextLabel, CloneCopiesEveryField) {
  DexTextLabel label;
  label.setStation(stationAt(1.0, 2.0, 3.0, L"T1"));
  label.setText(L"Gate");
  label.setFontName(L"Courier");
  label.setHeightInMeters(1.25);
  label.setRotationAngle(33.0);
  label.setInsertionPoint(DexTextLabel::INSERT_TOP_RIGHT);
  label.setBold(true);
  label.setItalic(true);
  label.setUnderline(true);
  label.setDrawBox(true);
  label.setOpaque(true);
  const auto copy = cloneOf(label);
  EXPECT_TRUE(copy->getStation() == label.getStation() && copy->getName() == L"T1" &&
              copy->getText() == L"Gate" && copy->getFontName() == L"Courier" &&
              copy->getHeightInMeters() == 1.25 && copy->getRotationAngle() == 33.0 &&
              copy->getInsertionPoint() == 3);
  EXPECT_TRUE(copy->getBold() && copy->getItalic() && copy->getUnderline() && copy->getDrawBox() &&
              copy->getOpaque());
}

TEST(DexSheetPoint, CloneAndCopiesOwnTheirStations) {
  int deletions = 0;
  auto* const original = new DexSheetPoint();
  original->setName(L"SH");
  auto* const station = new Counted<DexOffsetStation>(deletions);
  station->setPosition(1.0, 2.0, 3.0);
  station->setSecondText(L"left");
  station->setExtraValue(9, 0.5);
  original->addStation(station);
  const auto clone = cloneOf(*original);
  const DexSheetPoint copy(*original);
  DexSheetPoint assigned;
  assigned.addStation(new Counted<DexOffsetStation>(deletions));
  assigned = *original;
  EXPECT_EQ(1, deletions);
  delete original;
  EXPECT_EQ(2, deletions);
  for (const DexSheetPoint* sheet :
       {static_cast<const DexSheetPoint*>(clone.get()), &copy, &std::as_const(assigned)}) {
    ASSERT_EQ(1, sheet->getNumberOfStations());
    const DexOffsetStation* const held = sheet->getStation(0);
    EXPECT_TRUE(sheet->getName() == L"SH" && *held == DexPosition3D(1.0, 2.0, 3.0) &&
                held->getSecondText() == L"left" && held->getExtraValue(9) == 0.5);
  }
}

TEST(DexPolyLine, ClonesCopyStationsOrShareThePoints) {
  DexPolyLine line(false);
  line.addStation(stationAt(1.0, 0.0, 0.0));
  line.addStation(stationAt(2.0, 0.0, 0.0, L"", 0.5));
  line.setName(L"L1");
  line.setId(L"ID1");
  line.setCloseStatus(true);
  const auto copy = cloneOf(line);
  EXPECT_TRUE(!copy->isUsingPoints() && copy->getNumberOfStations() == 2 &&
              copy->getStation(1).getBulge() == 0.5 && copy->getName() == L"L1" && copy->getId() == L"ID1" &&
              copy->isClosed());
  DexDesignPoint a;
  DexDesignPoint b;
  a.setName(L"A");
  auto* const points = new DexPolyLine(true);
  points->addPoint(&a, 0.0);
  points->addPoint(&b, 0.3);
  const auto pointsCopy = cloneOf(*points);
  const DexPolyLine copied(*points);
  DexPolyLine assigned(false);
  assigned = *points;
  delete points;
  EXPECT_TRUE(pointsCopy->isUsingPoints() && pointsCopy->getNumberOfPoints() == 2 &&
              pointsCopy->getPoint(0) == &a && pointsCopy->getPoint(1) == &b &&
              pointsCopy->getNodeBulge(1) == 0.3);
  EXPECT_TRUE(copied.getPoint(0) == &a && assigned.getPoint(0) == &a && assigned.isUsingPoints());
  EXPECT_EQ(L"A", a.getName());
}

TEST(DexArea, ClonesCopyAreaPropertiesVerticesNameAndCloseStatusButNotTheId) {
  auto* const area = new DexArea(false);
  auto* const properties = new DexDrawAreaProperties();
  properties->setFillStyleType(DexDrawAreaProperties::FILL_GRID);
  properties->setFillTransparency(40);
  area->setAreaDrawProperties(properties);
  area->addStation(stationAt(1.0, 0.0, 0.0));
  area->setName(L"A1");
  area->setId(L"ID1");
  area->setCloseStatus(false);
  const auto clone = cloneOf(*area);
  const DexArea copy(*area);
  DexArea assigned;
  assigned = *area;
  delete area;
  ASSERT_NE(nullptr, clone->getAreaDrawProperties());
  auto fill = DexDrawAreaProperties::FILL_NONE;
  EXPECT_TRUE(clone->getAreaDrawProperties()->getFillStyleType(fill) &&
              fill == DexDrawAreaProperties::FILL_GRID);
  EXPECT_TRUE(clone->getNumberOfStations() == 1 && clone->getName() == L"A1" && !clone->isClosed() &&
              clone->getId().IsEmpty());
  for (const DexArea* owner : {&copy, &std::as_const(assigned)}) {
    short transparency = 0;
    ASSERT_NE(nullptr, owner->getAreaDrawProperties());
    EXPECT_TRUE(owner->getAreaDrawProperties()->getFillTransparency(transparency) && transparency == 40);
  }
  DexDesignPoint a;
  DexArea points(true);
  points.addPoint(&a, 0.0);
  const auto pointsCopy = cloneOf(points);
  EXPECT_TRUE(pointsCopy->isUsingPoints() && pointsCopy->getPoint(0) == &a &&
              pointsCopy->getAreaDrawProperties() == nullptr);
}

TEST(DexBreakline, CloneCopiesOnlyStationsAndNameACopyEveryField) {
  DexBreakline breakline(L"Ground");
  breakline.addStation(stationAt(1.0, 0.0, 0.0));
  breakline.addStation(stationAt(2.0, 0.0, 0.0));
  breakline.setName(L"BL1");
  breakline.setId(L"ID1");
  breakline.setCloseStatus(true);
  breakline.setBreaklineType(DexBreakline::BREAKLINE_SOFT);
  const auto clone = cloneOf(breakline);
  EXPECT_TRUE(clone->getSurfaceName() == L"Ground" && clone->getNumberOfStations() == 2 &&
              clone->getName() == L"BL1" && clone->getId().IsEmpty() && !clone->isClosed() &&
              clone->getBreaklineType() == 0);
  const DexBreakline copy(breakline);
  EXPECT_TRUE(copy.getSurfaceName() == L"Ground" && copy.getId() == L"ID1" && copy.isClosed() &&
              copy.getBreaklineType() == 1);
}

TEST(DexArc, ClonesCopyStationDataAndDirection) {
  DexArc arc;
  arc.setStation(stationAt(1.0, 2.0, 3.0, L"ARC"));
  for (int kind = 0; kind < DexArc::kNumberOfDataValues; ++kind)
    arc.setData(kind, 10.0 + kind);
  arc.setDirection(true);
  const auto copy = cloneOf(arc);
  EXPECT_TRUE(copy->getStation() == arc.getStation() && copy->getName() == L"ARC" && copy->isClockwise());
  for (int kind = 0; kind < DexArc::kNumberOfDataValues; ++kind)
    EXPECT_EQ(10.0 + kind, copy->getData(kind));
  DexCircle circle;
  circle.setStation(stationAt(1.0, 2.0, 3.0, L"C"));
  circle.setData(DexCircle::CIRCLE_RADIUS, 2.5);
  const auto circleCopy = cloneOf(circle);
  EXPECT_TRUE(circleCopy->getStation() == circle.getStation() && circleCopy->getData(0) == 2.5);
}
