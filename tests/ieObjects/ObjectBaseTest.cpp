// The common part of the survey objects, and the small kinds: text labels, parcels and regions.
#include "ieObjects/IEObjectBase.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <utility>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEObjects.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IERegion.h"
#include "ieObjects/detail/ObjectsLog.h"
#include "ieObjects/detail/ParcelLog.h"
#include "ieObjects/detail/RegionLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using namespace objects_test;
namespace detail = vyn::ie::detail;

// A design point whose protected copy of the common part the tests may call.
class ExposedPoint : public DexDesignPoint {
 public:
  using DexDesignPoint::copyCommonData;
  static auto copyCommonDataSlot() { return dex_test::vtableEntryOf(&ExposedPoint::copyCommonData); }
};

TEST(DexObject, EveryClassTellsItsKindAndGroupAndStartsActiveWithoutLayerNotesOrCodes) {
  DexDesignPoint designPoint;
  DexPtlPoint ptlPoint;
  DexSheetPoint sheetPoint;
  DexPolyLine polyLine(false);
  DexArea area(false);
  DexBreakline breakline(L"S");
  DexArc arc;
  DexCircle circle;
  DexTextLabel label;
  const std::pair<DexObject*, std::pair<int, int>> expected[] = {
      {&designPoint, {0, 0}}, {&ptlPoint, {1, 0}}, {&sheetPoint, {3, 1}},
      {&polyLine, {4, 2}},    {&area, {5, 2}},     {&breakline, {6, 2}},
      {&arc, {7, 2}},         {&circle, {12, 2}},  {&label, {11, 0}}};
  for (const auto& [object, kindAndGroup] : expected) {
    EXPECT_TRUE(object->getType() == kindAndGroup.first && object->getGroupType() == kindAndGroup.second);
    EXPECT_TRUE(object->getStateType() == 1 && object->getLayer() == nullptr && !object->isLayerByCode() &&
                object->getPhotoNotes() == nullptr && object->getNumberOfCodes() == 0 &&
                object->getDrawProperties() == nullptr);
  }
  circle.setStateType(static_cast<IDexStateInterface::ECurrentState>(2));  // any state is stored
  EXPECT_EQ(2, circle.getStateType());
  const DexLayer layer;
  label.setLayer(&layer, true);
  EXPECT_TRUE(label.getLayer() == &layer && label.isLayerByCode());
}

TEST(DexObject, OwnsItsDrawingPropertiesAndPhotoNotesAndDeletesWhatItReplaces) {
  int deletions = 0;
  {
    auto* const properties = new CountedLineProperties(deletions);
    auto* const notes = new CountedPhotoNotes(deletions);
    DexArc arc;
    for (int twice = 0; twice < 2; ++twice) {  // the same again changes nothing
      arc.setDrawProperties(properties);
      arc.setPhotoNotes(notes);
    }
    EXPECT_EQ(0, deletions);
    EXPECT_TRUE(arc.getDrawProperties() == properties && std::as_const(arc).getPhotoNotes() == notes);
    arc.setDrawProperties(new CountedLineProperties(deletions));
    arc.setPhotoNotes(new CountedPhotoNotes(deletions));
    EXPECT_EQ(2, deletions);
    arc.setDrawProperties(nullptr);
    EXPECT_EQ(3, deletions);
  }
  EXPECT_EQ(4, deletions);  // and with itself
}

TEST(DexObject, DrawingPropertiesByCodeComeFromTheFirstCodeOrItsLayerAndWithoutCodeAreLogged) {
  const dex_test::LogCapture log;
  const DexDesignPoint uncoded;
  EXPECT_EQ(nullptr, uncoded.getDrawPropertiesByCode(IDexDrawProperties::DRAW_POINT));
  EXPECT_EQ(nullptr, uncoded.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_LINE));
  EXPECT_EQ(1, log.count(detail::kObjectsLogSource, detail::kDrawPropertiesByCodeWithoutCodeLine));
  EXPECT_EQ(1, log.count(detail::kObjectsLogSource, detail::kDrawPropertiesByCodeLayerWithoutCodeLine));
  EXPECT_TRUE(log.records()[0].message.empty());
  DexLayer layer;
  layer.setDrawProperties(IDexDrawProperties::DRAW_LINE, linePropertiesOf(0xABCDEF));
  DexCodeDescription first(L"FENCE");
  first.setDrawProperties(IDexDrawProperties::DRAW_LINE, linePropertiesOf(0x0000FF));
  first.setLayer(&layer);
  DexCodeDescription second(L"WALL");
  second.setDrawProperties(IDexDrawProperties::DRAW_LINE, linePropertiesOf(0x00FF00));
  DexPolyLine line(false);
  line.addCode(codeOf(&first));
  line.addCode(codeOf(&second));
  EXPECT_EQ(first.getDrawProperties(IDexDrawProperties::DRAW_LINE),
            line.getDrawPropertiesByCode(IDexDrawProperties::DRAW_LINE));
  EXPECT_TRUE(line.getDrawPropertiesByCode(IDexDrawProperties::DRAW_AREA) == nullptr &&
              line.getDrawPropertiesByCode(3) == nullptr);
  EXPECT_EQ(layer.getDrawProperties(IDexDrawProperties::DRAW_LINE),
            line.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_LINE));
  EXPECT_EQ(nullptr, line.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_POINT));
  DexPolyLine other(false);  // the first code has no layer
  other.addCode(codeOf(&second));
  other.addCode(codeOf(&first));
  DexDesignPoint undescribed;
  undescribed.addCode(codeOf(nullptr));
  EXPECT_TRUE(other.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_LINE) == nullptr &&
              undescribed.getDrawPropertiesByCode(IDexDrawProperties::DRAW_POINT) == nullptr &&
              undescribed.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_POINT) == nullptr);
  EXPECT_EQ(2u, log.size());
}

TEST(DexObject, CommonCopySharesTheLayerAppendsCodesAndDuplicatesPropertiesStateAndPhotoNotes) {
  int deletions = 0;
  const DexLayer layer;
  const DexCodeDescription tree(L"TREE");
  const DexCodeDescription pole(L"POLE");
  ExposedPoint source;
  source.setLayer(&layer, true);
  source.addCode(codeOf(&tree, {L"1"}));
  auto* const properties = new DexDrawPointProperties();
  properties->setColor(0x112233);
  source.setDrawProperties(properties);
  source.setStateType(IDexStateInterface::INACTIVE_STATE);
  source.setPhotoNotes(photoNotesOf({L"a.jpg", L"b.jpg"}));
  DexDesignPoint target;
  target.addCode(codeOf(&pole));
  target.setDrawProperties(new CountedLineProperties(deletions));
  source.copyCommonData(&target);
  EXPECT_TRUE(target.getLayer() == &layer && !target.isLayerByCode() && target.getStateType() == 0);
  ASSERT_EQ(2, target.getNumberOfCodes());
  EXPECT_TRUE(target.getCode(0)->getDescription() == &pole && target.getCode(1)->getDescription() == &tree &&
              target.getCode(1) != source.getCode(0) && target.getCode(1)->getCodeStringAt(0) == L"1");
  EXPECT_EQ(1, deletions);
  EXPECT_TRUE(target.getDrawProperties() != properties &&
              target.getDrawProperties()->getType() == IDexDrawProperties::DRAW_POINT);
  EXPECT_EQ(0x112233u, colorOf(target.getDrawProperties()));
  EXPECT_TRUE(target.getPhotoNotes() != source.getPhotoNotes() &&
              target.getPhotoNotes()->getNumberOfPhotoNotes() == 2);
  // Notes are assigned into the target's own; a source without properties or notes clears them.
  auto* const targetNotes = new CountedPhotoNotes(deletions);
  targetNotes->addPhotoNote(new DexPhotoNote());
  DexDesignPoint withNotes;
  withNotes.setPhotoNotes(targetNotes);
  source.copyCommonData(&withNotes);
  EXPECT_TRUE(withNotes.getPhotoNotes() == targetNotes && targetNotes->getNumberOfPhotoNotes() == 2);
  EXPECT_EQ(L"a.jpg", firstPhotoFileOf(withNotes));
  const ExposedPoint bare;
  bare.copyCommonData(&withNotes);
  EXPECT_TRUE(withNotes.getPhotoNotes() == nullptr && withNotes.getDrawProperties() == nullptr);
  EXPECT_EQ(2, deletions);
  source.copyCommonData(nullptr);  // into null or itself: no change
  source.copyCommonData(&source);
  EXPECT_TRUE(source.getNumberOfCodes() == 1 && firstPhotoFileOf(source) == L"a.jpg");
}

TEST(DexObject, VirtualOperationsKeepTheirSlotOrder) {
  // A destructor takes two entries, so slot n of the plug-in interface is entry n + 1.
  if (!dex_test::vtableEntryOf(&DexObject::setStateType))
    GTEST_SKIP() << "virtual table layout not observable";
  EXPECT_EQ(2, dex_test::vtableEntryOf(&DexObject::setStateType));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexObject::getStateType));
  EXPECT_EQ(4, dex_test::vtableEntryOf(&DexObject::clone));
  EXPECT_EQ(5, dex_test::vtableEntryOf(&DexObject::shiftCoords));
  EXPECT_EQ(6, dex_test::vtableEntryOf(&DexObject::getGroupType));
  EXPECT_EQ(7, ExposedPoint::copyCommonDataSlot());
  EXPECT_EQ(8, dex_test::vtableEntryOf(&DexObject::getDrawProperties));
  EXPECT_EQ(9, dex_test::vtableEntryOf(&DexObject::setDrawProperties));
  EXPECT_GT(dex_test::vtableEntryOf(&DexDesignPoint::getType).value_or(0), 9);  // the other interfaces follow
  EXPECT_EQ(4, dex_test::vtableEntryOf(&DexTextLabel::clone));
  EXPECT_EQ(2, dex_test::vtableEntryOf(&DexParcel::getType));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexParcel::setCentralPoint));
  EXPECT_EQ(4, dex_test::vtableEntryOf(&DexParcel::getCentralPoint));
}

TEST(DexTextLabel, KeepsItsFieldsAndNameInItsStationAndShiftsWithoutTurningTheText) {
  DexTextLabel label;
  EXPECT_TRUE(label.getInsertionPoint() == DexTextLabel::INSERT_MIDDLE_CENTER && !label.getBold() &&
              !label.getOpaque() && label.getHeightInMeters() == 0.0 && label.getStation().getCSType() == 5);
  label.setText(L"Manhole 3");
  label.setFontName(L"Arial");
  label.setHeightInMeters(0.35);
  label.setInsertionPoint(DexTextLabel::INSERT_BOTTOM_LEFT);
  label.setBold(true);
  label.setItalic(true);
  label.setUnderline(true);
  label.setDrawBox(true);
  label.setOpaque(true);
  EXPECT_TRUE(label.getText() == L"Manhole 3" && label.getFontName() == L"Arial" &&
              label.getHeightInMeters() == 0.35 && label.getInsertionPoint() == 7 && label.getBold() &&
              label.getItalic() && label.getUnderline() && label.getDrawBox() && label.getOpaque());
  label.setName(L"T1");
  EXPECT_EQ(L"T1", label.getStation().getName());
  label.setStation(stationAt(1.0, 2.0, 3.0));  // the name goes on to an unnamed station
  EXPECT_EQ(L"T1", label.getName());
  label.setCoords(1.0, kNoValue, 3.0);
  EXPECT_FALSE(label.getStation().isHorizCoordsDefined());
  label.setCoords(1.0, 0.0, 0.0, 4.0);
  EXPECT_EQ(4.0, label.getStation().getHeight());
  label.setRotationAngle(15.0);
  label.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, 90.0);
  EXPECT_NEAR(0.0, label.getStation().getX(), 1e-12);
  EXPECT_NEAR(1.0, label.getStation().getY(), 1e-12);
  EXPECT_EQ(15.0, label.getRotationAngle());
}

TEST(DexParcel, KeepsItsLinksWhichCopiesShareAndLogsANullAlignment) {
  const dex_test::LogCapture log;
  DexHorizontalAlignment alignment;
  DexDesignPoint point;
  DexParcel parcel;
  EXPECT_TRUE(parcel.getType() == 10 && parcel.getHAlignment() == nullptr &&
              parcel.getCentralPoint() == nullptr);
  parcel.setName(L"LOT 7");
  parcel.setHAlignment(&alignment);
  parcel.setHAlignment(nullptr);  // keeps the one set before
  parcel.setCentralPoint(&point);
  EXPECT_EQ(1, log.count(detail::kParcelLogSource, detail::kParcelNullAlignmentLine));
  const DexParcel copy(parcel);
  DexParcel assigned;
  assigned = parcel;
  EXPECT_TRUE(copy.getHAlignment() == &alignment && copy.getCentralPoint() == &point &&
              copy.getName() == L"LOT 7");
  EXPECT_EQ(&point, assigned.getCentralPoint());
}

TEST(DexRegion, KeepsVerticesOwnsItsAreaPropertiesAndLogsAVertexPastTheEnd) {
  int deletions = 0;
  const dex_test::LogCapture log;
  const DexLayer layer;
  auto* const region = new DexRegion();
  EXPECT_TRUE(region->getType() == 13 && region->getVerticesCount() == 0 && region->getRegionType() == 0);
  region->setName(L"R");
  region->setLayer(&layer);
  region->setRegionType(42);
  region->addVertex(DexPositionWithBulge(1, 2, 3, 0.5));
  region->addVertex(DexPositionWithBulge(4, 5, 6, 0.25));
  EXPECT_TRUE(region->getVertexAt(0) == DexPosition3D(1, 2, 3) && region->getVertexAt(0).getBulge() == 0.5 &&
              region->getVertexAt(1).x == 4.0);
  EXPECT_TRUE(region->getVertexAt(5) == DexPosition3D(0, 0, 0) && region->getVertexAt(2).getBulge() == 0.0);
  EXPECT_EQ(2, log.count(detail::kRegionLogSource, detail::kRegionVertexIndexLine));
  auto* const properties = new CountedAreaProperties(deletions);
  properties->setColor(0x123);
  region->setAreaDrawProperties(properties);
  region->setAreaDrawProperties(properties);
  EXPECT_EQ(0, deletions);
  const DexRegion copy(*region);  // duplicates the properties, shares the layer
  DexRegion assigned;
  assigned = *region;
  region->setAreaDrawProperties(new DexDrawAreaProperties());
  EXPECT_EQ(1, deletions);
  delete region;
  EXPECT_TRUE(copy.getName() == L"R" && copy.getLayer() == &layer && copy.getRegionType() == 42 &&
              copy.getVerticesCount() == 2);
  EXPECT_EQ(0x123u, colorOf(copy.getAreaDrawProperties()));
  EXPECT_TRUE(assigned.getAreaDrawProperties() != nullptr && assigned.getVerticesCount() == 2);
}

}  // namespace
