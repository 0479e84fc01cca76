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

using objects_test::codeOf;
using objects_test::colorOf;
using objects_test::CountedLineProperties;
using objects_test::CountedOffsetStation;
using objects_test::CountedPhotoNotes;
using objects_test::firstPhotoFileOf;
using objects_test::linePropertiesOf;
using objects_test::photoNotesOf;
using objects_test::stationAt;
using vyn::ie::DexArc;
using vyn::ie::DexArea;
using vyn::ie::DexBreakline;
using vyn::ie::DexCircle;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexDrawAreaProperties;
using vyn::ie::DexLayer;
using vyn::ie::DexObject;
using vyn::ie::DexOffsetStation;
using vyn::ie::DexPolyLine;
using vyn::ie::DexPosition3D;
using vyn::ie::DexPtlPoint;
using vyn::ie::DexSheetPoint;
using vyn::ie::DexStation;
using vyn::ie::DexTextLabel;
using vyn::ie::IDexStateInterface;

constexpr unsigned long kObjectColor = 0x123456;

// Gives object one code (with code string "7") of description, line properties, two photo notes, the
// layer (by code), state 0 and the name "N1".
void fillCommonParts(DexObject& object, const DexCodeDescription& description, const DexLayer& layer) {
  object.addCode(codeOf(&description, {L"7"}));
  object.setDrawProperties(linePropertiesOf(kObjectColor));
  object.setPhotoNotes(photoNotesOf({L"a.jpg", L"b.jpg"}));
  object.setLayer(&layer, true);
  object.setStateType(IDexStateInterface::INACTIVE_STATE);
  object.setName(L"N1");
}

// The parts fillCommonParts gave, read from copy; none of the owned ones may be original's.
void expectOwnCommonParts(const DexObject& copy, const DexCodeDescription& description,
                          const DexLayer& layer) {
  ASSERT_EQ(1, copy.getNumberOfCodes());
  EXPECT_EQ(&description, copy.getCode(0)->getDescription());
  EXPECT_EQ(L"7", copy.getCode(0)->getCodeStringAt(0));
  EXPECT_EQ(kObjectColor, colorOf(copy.getDrawProperties()));
  ASSERT_NE(nullptr, copy.getPhotoNotes());
  EXPECT_EQ(2, copy.getPhotoNotes()->getNumberOfPhotoNotes());
  EXPECT_EQ(L"a.jpg", firstPhotoFileOf(copy));
  EXPECT_EQ(&layer, copy.getLayer());
  EXPECT_EQ(0, copy.getStateType());
  EXPECT_EQ(L"N1", copy.getName());
}

void expectNothingShared(const DexObject& copy, const DexObject& original) {
  EXPECT_NE(original.getCode(0), copy.getCode(0));
  EXPECT_NE(original.getDrawProperties(), copy.getDrawProperties());
  EXPECT_NE(original.getPhotoNotes(), copy.getPhotoNotes());
}

template <class T>
class EveryObject : public ::testing::Test {
 protected:
  const DexCodeDescription description_{L"TREE"};
  const DexLayer layer_;
};

using ObjectClasses = ::testing::Types<DexDesignPoint, DexPtlPoint, DexSheetPoint, DexPolyLine, DexArea,
                                       DexBreakline, DexArc, DexCircle, DexTextLabel>;
TYPED_TEST_SUITE(EveryObject, ObjectClasses);

}  // namespace

// ---- Every class --------------------------------------------------------------------------------

TYPED_TEST(EveryObject, CopyConstructionOwnsWhatTheObjectOwns) {
  auto* const original = new TypeParam();
  fillCommonParts(*original, this->description_, this->layer_);
  const TypeParam copy(*original);
  expectNothingShared(copy, *original);
  delete original;
  expectOwnCommonParts(copy, this->description_, this->layer_);
  EXPECT_TRUE(copy.isLayerByCode());
}

TYPED_TEST(EveryObject, AssignmentDeletesWhatTheTargetOwnedAndOwnsItsCopies) {
  int propertyDeletions = 0;
  int noteDeletions = 0;
  auto* const original = new TypeParam();
  fillCommonParts(*original, this->description_, this->layer_);
  TypeParam target;
  target.addCode(codeOf(nullptr));
  target.setDrawProperties(new CountedLineProperties(propertyDeletions));
  target.setPhotoNotes(new CountedPhotoNotes(noteDeletions));
  target = *original;
  EXPECT_EQ(1, propertyDeletions);
  EXPECT_EQ(1, noteDeletions);
  expectNothingShared(target, *original);
  delete original;
  expectOwnCommonParts(target, this->description_, this->layer_);
}

TYPED_TEST(EveryObject, AssignmentOfNothingOwnedClearsTheTarget) {
  int propertyDeletions = 0;
  int noteDeletions = 0;
  const TypeParam empty;
  TypeParam target;
  target.setDrawProperties(new CountedLineProperties(propertyDeletions));
  target.setPhotoNotes(new CountedPhotoNotes(noteDeletions));
  target = empty;
  EXPECT_EQ(1, propertyDeletions);
  EXPECT_EQ(1, noteDeletions);
  EXPECT_EQ(nullptr, target.getDrawProperties());
  EXPECT_EQ(nullptr, target.getPhotoNotes());
}

TYPED_TEST(EveryObject, SelfAssignmentKeepsEverything) {
  TypeParam object;
  fillCommonParts(object, this->description_, this->layer_);
  const auto* const properties = object.getDrawProperties();
  object = std::as_const(object);
  EXPECT_EQ(properties, object.getDrawProperties());
  expectOwnCommonParts(object, this->description_, this->layer_);
}

TYPED_TEST(EveryObject, CloneIsANewObjectOfTheSameClassWithItsOwnCommonParts) {
  auto* const original = new TypeParam();
  fillCommonParts(*original, this->description_, this->layer_);
  const std::unique_ptr<DexObject> clone(original->clone());
  ASSERT_NE(nullptr, dynamic_cast<TypeParam*>(clone.get()));
  EXPECT_EQ(original->getType(), clone->getType());
  expectNothingShared(*clone, *original);
  delete original;
  expectOwnCommonParts(*clone, this->description_, this->layer_);
  EXPECT_FALSE(clone->isLayerByCode());
}

TYPED_TEST(EveryObject, CloneOfAnObjectWithoutOwnedPartsHasNone) {
  const TypeParam original;
  const std::unique_ptr<DexObject> clone(original.clone());
  EXPECT_EQ(nullptr, clone->getDrawProperties());
  EXPECT_EQ(nullptr, clone->getPhotoNotes());
  EXPECT_EQ(0, clone->getNumberOfCodes());
  EXPECT_EQ(1, clone->getStateType());
}

// ---- What each clone copies ---------------------------------------------------------------------

TEST(DexDesignPoint, CloneCopiesStationAndUserStringsButNotTheSurfaceFlag) {
  DexDesignPoint point;
  DexStation station = stationAt(1.0, 2.0, 3.0, L"P7", 0.1);
  station.setNotes(L"kerb");
  point.setStation(station);
  point.getUserStrings().Add(L"extra");
  point.setUsedInSurface(false);
  const std::unique_ptr<DexObject> clone(point.clone());
  const auto& copy = dynamic_cast<const DexDesignPoint&>(*clone);
  EXPECT_EQ(station, copy.getStation());
  EXPECT_EQ(L"P7", copy.getName());
  ASSERT_EQ(1, copy.getUserStrings().GetSize());
  EXPECT_EQ(L"extra", copy.getUserStrings().GetAt(0));
  EXPECT_TRUE(copy.isUsedInSurface());
}

TEST(DexDesignPoint, CopyConstructionTakesTheSurfaceFlag) {
  DexDesignPoint point;
  point.setUsedInSurface(false);
  const DexDesignPoint copy(point);
  EXPECT_FALSE(copy.isUsedInSurface());
}

TEST(DexPtlPoint, CloneKeepsTheReferenceLineAndStation) {
  DexPtlPoint point(L"R1", L"R2", 0);
  point.setCoords(4.0, 5.0, 6.0);
  point.setName(L"PTL");
  const std::unique_ptr<DexObject> clone(point.clone());
  const auto* const copy = dynamic_cast<const DexPtlPoint*>(clone.get());
  ASSERT_NE(nullptr, copy);
  EXPECT_EQ(L"R1", copy->getFirstReferencePointIds());
  EXPECT_EQ(L"R2", copy->getSecondReferencePointIds());
  EXPECT_EQ(0, copy->getCoordType());
  EXPECT_EQ(DexPosition3D(4.0, 5.0, 6.0), copy->getStation());
  EXPECT_EQ(L"PTL", copy->getName());
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
  const std::unique_ptr<DexObject> clone(label.clone());
  const auto& copy = dynamic_cast<const DexTextLabel&>(*clone);
  EXPECT_EQ(label.getStation(), copy.getStation());
  EXPECT_EQ(L"T1", copy.getName());
  EXPECT_EQ(L"Gate", copy.getText());
  EXPECT_EQ(L"Courier", copy.getFontName());
  EXPECT_EQ(1.25, copy.getHeightInMeters());
  EXPECT_EQ(33.0, copy.getRotationAngle());
  EXPECT_EQ(3, copy.getInsertionPoint());
  EXPECT_TRUE(copy.getBold() && copy.getItalic() && copy.getUnderline() && copy.getDrawBox() &&
              copy.getOpaque());
}

TEST(DexSheetPoint, CloneAndCopiesOwnTheirStations) {
  int deletions = 0;
  auto* const original = new DexSheetPoint();
  original->setName(L"SH");
  auto* const station = new CountedOffsetStation(deletions);
  station->setPosition(1.0, 2.0, 3.0);
  station->setSecondText(L"left");
  station->setExtraValue(9, 0.5);
  original->addStation(station);
  const std::unique_ptr<DexObject> clone(original->clone());
  const DexSheetPoint copy(*original);
  DexSheetPoint assigned;
  assigned.addStation(new CountedOffsetStation(deletions));
  assigned = *original;
  EXPECT_EQ(1, deletions);
  delete original;
  EXPECT_EQ(2, deletions);
  const std::initializer_list<const DexSheetPoint*> sheets = {dynamic_cast<const DexSheetPoint*>(clone.get()),
                                                              &copy, &assigned};
  for (const DexSheetPoint* sheet : sheets) {
    ASSERT_NE(nullptr, sheet);
    EXPECT_EQ(L"SH", sheet->getName());
    ASSERT_EQ(1, sheet->getNumberOfStations());
    const DexOffsetStation* const held = sheet->getStation(0);
    EXPECT_EQ(DexPosition3D(1.0, 2.0, 3.0), *held);
    EXPECT_EQ(L"left", held->getSecondText());
    EXPECT_EQ(0.5, held->getExtraValue(9));
  }
}

TEST(DexPolyLine, CloneOfAStationModeLineCopiesStationsNameIdAndCloseStatus) {
  DexPolyLine line(false);
  line.addStation(stationAt(1.0, 0.0, 0.0));
  line.addStation(stationAt(2.0, 0.0, 0.0, L"", 0.5));
  line.setName(L"L1");
  line.setId(L"ID1");
  line.setCloseStatus(true);
  const std::unique_ptr<DexObject> clone(line.clone());
  const auto& copy = dynamic_cast<const DexPolyLine&>(*clone);
  EXPECT_FALSE(copy.isUsingPoints());
  ASSERT_EQ(2, copy.getNumberOfStations());
  EXPECT_EQ(0.5, copy.getStation(1).getBulge());
  EXPECT_EQ(L"L1", copy.getName());
  EXPECT_EQ(L"ID1", copy.getId());
  EXPECT_TRUE(copy.isClosed());
}

TEST(DexPolyLine, CloneOfAPointModeLineReferencesTheSamePoints) {
  DexDesignPoint a;
  DexDesignPoint b;
  a.setName(L"A");
  auto* const line = new DexPolyLine(true);
  line->addPoint(&a, 0.0);
  line->addPoint(&b, 0.3);
  DexObject* const clone = line->clone();
  const auto* const copy = dynamic_cast<const DexPolyLine*>(clone);
  ASSERT_NE(nullptr, copy);
  EXPECT_TRUE(copy->isUsingPoints());
  ASSERT_EQ(2, copy->getNumberOfPoints());
  EXPECT_EQ(&a, copy->getPoint(0));
  EXPECT_EQ(&b, copy->getPoint(1));
  EXPECT_EQ(0.3, copy->getNodeBulge(1));
  delete clone;
  delete line;
  EXPECT_EQ(L"A", a.getName());
}

TEST(DexPolyLine, CopiesOfAPointModeLineShareThePoints) {
  DexDesignPoint a;
  DexPolyLine line(true);
  line.addPoint(&a, 0.0);
  const DexPolyLine copy(line);
  DexPolyLine assigned(false);
  assigned = line;
  EXPECT_EQ(&a, copy.getPoint(0));
  EXPECT_EQ(&a, assigned.getPoint(0));
  EXPECT_TRUE(assigned.isUsingPoints());
}

TEST(DexArea, CloneCopiesAreaPropertiesVerticesNameAndCloseStatusButNotTheId) {
  DexArea area(false);
  auto* const properties = new DexDrawAreaProperties();
  properties->setFillStyleType(DexDrawAreaProperties::FILL_GRID);
  area.setAreaDrawProperties(properties);
  area.addStation(stationAt(1.0, 0.0, 0.0));
  area.setName(L"A1");
  area.setId(L"ID1");
  area.setCloseStatus(false);
  const std::unique_ptr<DexObject> clone(area.clone());
  const auto& copy = dynamic_cast<const DexArea&>(*clone);
  ASSERT_NE(nullptr, copy.getAreaDrawProperties());
  EXPECT_NE(properties, copy.getAreaDrawProperties());
  DexDrawAreaProperties::EFillStyleType fill = DexDrawAreaProperties::FILL_NONE;
  EXPECT_TRUE(copy.getAreaDrawProperties()->getFillStyleType(fill));
  EXPECT_EQ(DexDrawAreaProperties::FILL_GRID, fill);
  EXPECT_EQ(1, copy.getNumberOfStations());
  EXPECT_EQ(L"A1", copy.getName());
  EXPECT_FALSE(copy.isClosed());
  EXPECT_TRUE(copy.getId().IsEmpty());
}

TEST(DexArea, CloneOfAPointModeAreaReferencesTheSamePoints) {
  DexDesignPoint a;
  DexArea area(true);
  area.addPoint(&a, 0.0);
  const std::unique_ptr<DexObject> clone(area.clone());
  const auto& copy = dynamic_cast<const DexArea&>(*clone);
  EXPECT_TRUE(copy.isUsingPoints());
  EXPECT_EQ(&a, copy.getPoint(0));
  EXPECT_EQ(nullptr, copy.getAreaDrawProperties());
}

TEST(DexArea, CopiesOwnTheirAreaProperties) {
  auto* const original = new DexArea(false);
  auto* const properties = new DexDrawAreaProperties();
  properties->setFillTransparency(40);
  original->setAreaDrawProperties(properties);
  const DexArea copy(*original);
  DexArea assigned;
  assigned = *original;
  EXPECT_NE(properties, copy.getAreaDrawProperties());
  EXPECT_NE(properties, assigned.getAreaDrawProperties());
  delete original;
  short transparency = 0;
  ASSERT_NE(nullptr, copy.getAreaDrawProperties());
  EXPECT_TRUE(copy.getAreaDrawProperties()->getFillTransparency(transparency));
  EXPECT_EQ(40, transparency);
  ASSERT_NE(nullptr, assigned.getAreaDrawProperties());
  EXPECT_TRUE(assigned.getAreaDrawProperties()->getFillTransparency(transparency));
}

TEST(DexBreakline, CloneCopiesOnlyStationsAndName) {
  DexBreakline breakline(L"Ground");
  breakline.addStation(stationAt(1.0, 0.0, 0.0));
  breakline.addStation(stationAt(2.0, 0.0, 0.0));
  breakline.setName(L"BL1");
  breakline.setId(L"ID1");
  breakline.setCloseStatus(true);
  breakline.setBreaklineType(DexBreakline::BREAKLINE_SOFT);
  const std::unique_ptr<DexObject> clone(breakline.clone());
  const auto& copy = dynamic_cast<const DexBreakline&>(*clone);
  EXPECT_EQ(L"Ground", copy.getSurfaceName());
  EXPECT_EQ(2, copy.getNumberOfStations());
  EXPECT_EQ(L"BL1", copy.getName());
  EXPECT_TRUE(copy.getId().IsEmpty());
  EXPECT_FALSE(copy.isClosed());
  EXPECT_EQ(0, copy.getBreaklineType());
}

TEST(DexBreakline, CopyConstructionTakesEveryField) {
  DexBreakline breakline(L"Ground");
  breakline.setId(L"ID1");
  breakline.setCloseStatus(true);
  breakline.setBreaklineType(DexBreakline::BREAKLINE_SOFT);
  const DexBreakline copy(breakline);
  EXPECT_EQ(L"Ground", copy.getSurfaceName());
  EXPECT_EQ(L"ID1", copy.getId());
  EXPECT_TRUE(copy.isClosed());
  EXPECT_EQ(1, copy.getBreaklineType());
}

TEST(DexArc, CloneCopiesStationDataAndDirection) {
  DexArc arc;
  arc.setStation(stationAt(1.0, 2.0, 3.0, L"ARC"));
  for (int kind = 0; kind < DexArc::kNumberOfDataValues; ++kind)
    arc.setData(kind, 10.0 + kind);
  arc.setDirection(true);
  const std::unique_ptr<DexObject> clone(arc.clone());
  const auto& copy = dynamic_cast<const DexArc&>(*clone);
  EXPECT_EQ(arc.getStation(), copy.getStation());
  EXPECT_EQ(L"ARC", copy.getName());
  for (int kind = 0; kind < DexArc::kNumberOfDataValues; ++kind)
    EXPECT_EQ(10.0 + kind, copy.getData(kind));
  EXPECT_TRUE(copy.isClockwise());
}

TEST(DexCircle, CloneCopiesStationAndRadius) {
  DexCircle circle;
  circle.setStation(stationAt(1.0, 2.0, 3.0, L"C"));
  circle.setData(DexCircle::CIRCLE_RADIUS, 2.5);
  const std::unique_ptr<DexObject> clone(circle.clone());
  const auto& copy = dynamic_cast<const DexCircle&>(*clone);
  EXPECT_EQ(circle.getStation(), copy.getStation());
  EXPECT_EQ(2.5, copy.getData(0));
}
