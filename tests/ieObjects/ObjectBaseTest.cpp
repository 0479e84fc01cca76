#include "ieObjects/IEObjectBase.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <utility>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEObjects.h"
#include "ieObjects/detail/ObjectsLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/VtableSlot.h"

namespace {

using objects_test::codeOf;
using objects_test::colorOf;
using objects_test::CountedLineProperties;
using objects_test::CountedPhotoNotes;
using objects_test::firstPhotoFileOf;
using objects_test::linePropertiesOf;
using objects_test::photoNotesOf;
using vyn::ie::DexArc;
using vyn::ie::DexArea;
using vyn::ie::DexBreakline;
using vyn::ie::DexCircle;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexDrawLineProperties;
using vyn::ie::DexDrawPointProperties;
using vyn::ie::DexLayer;
using vyn::ie::DexObject;
using vyn::ie::DexPolyLine;
using vyn::ie::DexPtlPoint;
using vyn::ie::DexSheetPoint;
using vyn::ie::DexTextLabel;
using vyn::ie::IDexDrawProperties;
using vyn::ie::IDexStateInterface;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kObjectsLogSource;

// A design point whose protected copy of the common part the tests may call.
class ExposedPoint : public DexDesignPoint {
 public:
  using DexDesignPoint::copyCommonData;
};

// A layer with line properties of the given colour.
std::unique_ptr<DexLayer> layerWithLineColor(unsigned long color) {
  auto layer = std::make_unique<DexLayer>();
  layer->setDrawProperties(IDexDrawProperties::DRAW_LINE, linePropertiesOf(color));
  return layer;
}

}  // namespace

static_assert(sizeof(DexObject::EGroupType) == 4);
static_assert(DexObject::GROUP_POINTS == 0 && DexObject::GROUP_SHEET_POINTS == 1 &&
              DexObject::GROUP_LINES == 2);

// ---- Common state -------------------------------------------------------------------------------

TEST(DexObject, StartsActiveWithoutLayerPhotoNotesOrCodes) {
  DexDesignPoint point;
  EXPECT_EQ(1, point.getStateType());
  EXPECT_EQ(nullptr, point.getLayer());
  EXPECT_FALSE(point.isLayerByCode());
  EXPECT_EQ(nullptr, point.getPhotoNotes());
  EXPECT_EQ(0, point.getNumberOfCodes());
  EXPECT_EQ(nullptr, point.getDrawProperties());
}

TEST(DexObject, StoresAnyStateItIsGiven) {
  DexCircle circle;
  circle.setStateType(IDexStateInterface::INACTIVE_STATE);
  EXPECT_EQ(0, circle.getStateType());
  circle.setStateType(static_cast<IDexStateInterface::ECurrentState>(2));
  EXPECT_EQ(2, circle.getStateType());
}

TEST(DexObject, KeepsTheLayerAndWhetherItCameFromTheCode) {
  const DexLayer layer;
  DexTextLabel label;
  label.setLayer(&layer, true);
  EXPECT_EQ(&layer, label.getLayer());
  EXPECT_TRUE(label.isLayerByCode());
  label.setLayer(nullptr, false);
  EXPECT_EQ(nullptr, label.getLayer());
  EXPECT_FALSE(label.isLayerByCode());
}

TEST(DexObject, EveryClassTellsItsKindAndGroup) {
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
      {&arc, {7, 2}},         {&circle, {12, 2}},  {&label, {11, 0}},
  };
  for (const auto& [object, kindAndGroup] : expected) {
    EXPECT_EQ(kindAndGroup.first, object->getType());
    EXPECT_EQ(kindAndGroup.second, object->getGroupType());
    EXPECT_EQ(1, object->getStateType());
  }
}

// ---- Drawing properties -------------------------------------------------------------------------

TEST(DexObject, ReplacingDrawingPropertiesDeletesTheOldOnesButNotTheSameOnes) {
  int deletions = 0;
  auto* const first = new CountedLineProperties(deletions);
  DexPolyLine line(false);
  line.setDrawProperties(first);
  line.setDrawProperties(first);
  EXPECT_EQ(0, deletions);
  EXPECT_EQ(first, line.getDrawProperties());
  line.setDrawProperties(new CountedLineProperties(deletions));
  EXPECT_EQ(1, deletions);
  line.setDrawProperties(nullptr);
  EXPECT_EQ(2, deletions);
  EXPECT_EQ(nullptr, line.getDrawProperties());
}

TEST(DexObject, DeletesItsDrawingPropertiesAndPhotoNotesWithItself) {
  int propertyDeletions = 0;
  int noteDeletions = 0;
  {
    DexArc arc;
    arc.setDrawProperties(new CountedLineProperties(propertyDeletions));
    arc.setPhotoNotes(new CountedPhotoNotes(noteDeletions));
  }
  EXPECT_EQ(1, propertyDeletions);
  EXPECT_EQ(1, noteDeletions);
}

// ---- Drawing properties by code -----------------------------------------------------------------

TEST(DexObject, DrawingPropertiesByCodeWithoutCodeAreLoggedAndNull) {
  const dex_test::LogCapture log;
  const DexDesignPoint point;
  EXPECT_EQ(nullptr, point.getDrawPropertiesByCode(IDexDrawProperties::DRAW_POINT));
  ASSERT_EQ(1u, log.size());
  EXPECT_EQ(kSource, log.records()[0].source);
  EXPECT_EQ(detail::kDrawPropertiesByCodeWithoutCodeLine, log.records()[0].line);
  EXPECT_TRUE(log.records()[0].message.empty());
}

TEST(DexObject, DrawingPropertiesByCodeLayerWithoutCodeAreLoggedAndNull) {
  const dex_test::LogCapture log;
  const DexPolyLine line(false);
  EXPECT_EQ(nullptr, line.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_LINE));
  ASSERT_EQ(1u, log.size());
  EXPECT_EQ(kSource, log.records()[0].source);
  EXPECT_EQ(detail::kDrawPropertiesByCodeLayerWithoutCodeLine, log.records()[0].line);
  EXPECT_TRUE(log.records()[0].message.empty());
}

TEST(DexObject, DrawingPropertiesByCodeComeFromTheFirstCodesDescription) {
  DexCodeDescription first(L"FENCE");
  first.setDrawProperties(IDexDrawProperties::DRAW_LINE, linePropertiesOf(0x0000FF));
  DexCodeDescription second(L"WALL");
  second.setDrawProperties(IDexDrawProperties::DRAW_LINE, linePropertiesOf(0x00FF00));
  DexPolyLine line(false);
  line.addCode(codeOf(&first));
  line.addCode(codeOf(&second));
  const dex_test::LogCapture log;
  EXPECT_EQ(first.getDrawProperties(IDexDrawProperties::DRAW_LINE),
            line.getDrawPropertiesByCode(IDexDrawProperties::DRAW_LINE));
  EXPECT_EQ(nullptr, line.getDrawPropertiesByCode(IDexDrawProperties::DRAW_AREA));
  EXPECT_EQ(nullptr, line.getDrawPropertiesByCode(3));
  EXPECT_EQ(0u, log.size());
}

TEST(DexObject, DrawingPropertiesByCodeOfACodeWithoutDescriptionAreNullWithoutLog) {
  DexDesignPoint point;
  point.addCode(codeOf(nullptr));
  const dex_test::LogCapture log;
  EXPECT_EQ(nullptr, point.getDrawPropertiesByCode(IDexDrawProperties::DRAW_POINT));
  EXPECT_EQ(nullptr, point.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_POINT));
  EXPECT_EQ(0u, log.size());
}

TEST(DexObject, DrawingPropertiesByCodeLayerComeFromTheLayerOfTheFirstCode) {
  const auto layer = layerWithLineColor(0xABCDEF);
  DexCodeDescription withLayer(L"EDGE");
  withLayer.setLayer(layer.get());
  const DexCodeDescription withoutLayer(L"BARE");
  DexPolyLine line(false);
  line.addCode(codeOf(&withLayer));
  EXPECT_EQ(layer->getDrawProperties(IDexDrawProperties::DRAW_LINE),
            line.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_LINE));
  EXPECT_EQ(nullptr, line.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_POINT));

  DexPolyLine other(false);
  other.addCode(codeOf(&withoutLayer));
  other.addCode(codeOf(&withLayer));
  EXPECT_EQ(nullptr, other.getDrawPropertiesByCodeLayer(IDexDrawProperties::DRAW_LINE));
}

// ---- Photo notes --------------------------------------------------------------------------------

TEST(DexObject, PhotoNotesAreOwnedAndReplacedNotesDeleted) {
  int deletions = 0;
  auto* const first = new CountedPhotoNotes(deletions);
  DexTextLabel label;
  label.setPhotoNotes(first);
  label.setPhotoNotes(first);
  EXPECT_EQ(0, deletions);
  EXPECT_EQ(first, label.getPhotoNotes());
  EXPECT_EQ(first, std::as_const(label).getPhotoNotes());
  label.setPhotoNotes(new CountedPhotoNotes(deletions));
  EXPECT_EQ(1, deletions);
  label.setPhotoNotes(nullptr);
  EXPECT_EQ(2, deletions);
}

// ---- Copying the common part --------------------------------------------------------------------

TEST(DexObject, CommonCopySharesTheLayerButNotTheLayerByCodeFlag) {
  const DexLayer layer;
  ExposedPoint source;
  source.setLayer(&layer, true);
  DexDesignPoint target;
  source.copyCommonData(&target);
  EXPECT_EQ(&layer, target.getLayer());
  EXPECT_FALSE(target.isLayerByCode());
}

TEST(DexObject, CommonCopyAppendsCodesThatTheTargetOwns) {
  const DexCodeDescription tree(L"TREE");
  const DexCodeDescription pole(L"POLE");
  ExposedPoint source;
  source.addCode(codeOf(&tree, {L"1"}));
  DexDesignPoint target;
  target.addCode(codeOf(&pole));
  source.copyCommonData(&target);
  ASSERT_EQ(2, target.getNumberOfCodes());
  EXPECT_EQ(&pole, target.getCode(0)->getDescription());
  EXPECT_EQ(&tree, target.getCode(1)->getDescription());
  EXPECT_NE(source.getCode(0), target.getCode(1));
  EXPECT_EQ(L"1", target.getCode(1)->getCodeStringAt(0));
}

TEST(DexObject, CommonCopyClonesTheDrawingPropertiesAndReplacesTheTargets) {
  int deletions = 0;
  ExposedPoint source;
  auto* const sourceProperties = new DexDrawPointProperties();
  sourceProperties->setColor(0x112233);
  source.setDrawProperties(sourceProperties);
  DexDesignPoint target;
  target.setDrawProperties(new CountedLineProperties(deletions));
  source.copyCommonData(&target);
  EXPECT_EQ(1, deletions);
  ASSERT_NE(nullptr, target.getDrawProperties());
  EXPECT_NE(source.getDrawProperties(), target.getDrawProperties());
  EXPECT_EQ(IDexDrawProperties::DRAW_POINT, target.getDrawProperties()->getType());
  EXPECT_EQ(0x112233u, colorOf(target.getDrawProperties()));
}

TEST(DexObject, CommonCopyWithoutDrawingPropertiesClearsTheTargets) {
  int deletions = 0;
  const ExposedPoint source;
  DexDesignPoint target;
  target.setDrawProperties(new CountedLineProperties(deletions));
  source.copyCommonData(&target);
  EXPECT_EQ(1, deletions);
  EXPECT_EQ(nullptr, target.getDrawProperties());
}

TEST(DexObject, CommonCopyTakesTheState) {
  ExposedPoint source;
  source.setStateType(IDexStateInterface::INACTIVE_STATE);
  DexDesignPoint target;
  source.copyCommonData(&target);
  EXPECT_EQ(0, target.getStateType());
}

TEST(DexObject, CommonCopyWithoutPhotoNotesDeletesTheTargets) {
  int deletions = 0;
  const ExposedPoint source;
  DexDesignPoint target;
  target.setPhotoNotes(new CountedPhotoNotes(deletions));
  source.copyCommonData(&target);
  EXPECT_EQ(1, deletions);
  EXPECT_EQ(nullptr, target.getPhotoNotes());
}

TEST(DexObject, CommonCopyGivesATargetWithoutPhotoNotesItsOwnCopy) {
  ExposedPoint source;
  source.setPhotoNotes(photoNotesOf({L"a.jpg", L"b.jpg"}));
  DexDesignPoint target;
  source.copyCommonData(&target);
  ASSERT_NE(nullptr, target.getPhotoNotes());
  EXPECT_NE(source.getPhotoNotes(), target.getPhotoNotes());
  EXPECT_EQ(2, target.getPhotoNotes()->getNumberOfPhotoNotes());
  EXPECT_NE(source.getPhotoNotes()->getPhotoNote(0), target.getPhotoNotes()->getPhotoNote(0));
}

TEST(DexObject, CommonCopyAssignsPhotoNotesIntoTheTargetsOwn) {
  int deletions = 0;
  ExposedPoint source;
  source.setPhotoNotes(photoNotesOf({L"new.jpg"}));
  DexDesignPoint target;
  auto* const targetNotes = new CountedPhotoNotes(deletions);
  targetNotes->addPhotoNote(new vyn::ie::DexPhotoNote());
  targetNotes->addPhotoNote(new vyn::ie::DexPhotoNote());
  target.setPhotoNotes(targetNotes);
  source.copyCommonData(&target);
  EXPECT_EQ(0, deletions);
  EXPECT_EQ(targetNotes, target.getPhotoNotes());
  EXPECT_EQ(1, targetNotes->getNumberOfPhotoNotes());
  EXPECT_EQ(L"new.jpg", firstPhotoFileOf(target));
}

TEST(DexObject, CommonCopyIntoNullOrItselfChangesNothing) {
  const DexCodeDescription tree(L"TREE");
  ExposedPoint source;
  source.addCode(codeOf(&tree));
  source.setPhotoNotes(photoNotesOf({L"a.jpg"}));
  source.copyCommonData(nullptr);
  source.copyCommonData(&source);
  EXPECT_EQ(1, source.getNumberOfCodes());
  EXPECT_EQ(L"a.jpg", firstPhotoFileOf(source));
}

// ---- Virtual table ------------------------------------------------------------------------------

namespace {

// Names the protected copy of the common part for the slot test.
class SlotProbe : public DexDesignPoint {
 public:
  static auto copyCommonDataSlot() { return dex_test::vtableEntryOf(&SlotProbe::copyCommonData); }
};

}  // namespace

TEST(DexObject, VirtualOperationsKeepTheirSlotOrder) {
  // A destructor takes two entries, so slot n of the plug-in interface is entry n + 1.
  const auto setStateType = dex_test::vtableEntryOf(&DexObject::setStateType);
  if (!setStateType) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_EQ(2, *setStateType);
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexObject::getStateType).value_or(-1));
  EXPECT_EQ(4, dex_test::vtableEntryOf(&DexObject::clone).value_or(-1));
  EXPECT_EQ(5, dex_test::vtableEntryOf(&DexObject::shiftCoords).value_or(-1));
  EXPECT_EQ(6, dex_test::vtableEntryOf(&DexObject::getGroupType).value_or(-1));
  EXPECT_EQ(7, SlotProbe::copyCommonDataSlot().value_or(-1));
  EXPECT_EQ(8, dex_test::vtableEntryOf(&DexObject::getDrawProperties).value_or(-1));
  EXPECT_EQ(9, dex_test::vtableEntryOf(&DexObject::setDrawProperties).value_or(-1));
}

TEST(DexObject, SubclassesImplementTheOtherInterfacesAfterTheCommonSlots) {
  const auto getType = dex_test::vtableEntryOf(&DexDesignPoint::getType);
  if (!getType) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_GT(*getType, 9);
  EXPECT_EQ(9, dex_test::vtableEntryOf(&DexDesignPoint::setDrawProperties).value_or(-1));
  EXPECT_EQ(4, dex_test::vtableEntryOf(&DexTextLabel::clone).value_or(-1));
  EXPECT_EQ(5, dex_test::vtableEntryOf(&DexArc::shiftCoords).value_or(-1));
}
