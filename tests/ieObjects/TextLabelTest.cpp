#include "ieObjects/IETextLabel.h"

#include <gtest/gtest.h>

#include "ObjectsTestHelpers.h"
#include "support/PrintString.h"

namespace {

using objects_test::stationAt;
using vyn::ie::DexPosition3D;
using vyn::ie::DexTextLabel;
using vyn::ie::kNoValue;

}  // namespace

static_assert(sizeof(DexTextLabel::ETLInsertionPoint) == 4);
static_assert(DexTextLabel::INSERT_TOP_LEFT == 1 && DexTextLabel::INSERT_MIDDLE_CENTER == 5 &&
              DexTextLabel::INSERT_BOTTOM_RIGHT == 9);

TEST(DexTextLabel, StartsEmptyCentredAndPlain) {
  const DexTextLabel label;
  EXPECT_TRUE(label.getText().IsEmpty());
  EXPECT_TRUE(label.getFontName().IsEmpty());
  EXPECT_EQ(0.0, label.getHeightInMeters());
  EXPECT_EQ(0.0, label.getRotationAngle());
  EXPECT_EQ(5, label.getInsertionPoint());
  EXPECT_FALSE(label.getBold());
  EXPECT_FALSE(label.getItalic());
  EXPECT_FALSE(label.getUnderline());
  EXPECT_FALSE(label.getDrawBox());
  EXPECT_FALSE(label.getOpaque());
  EXPECT_EQ(2u, label.getStation().getStationAttrs());
  EXPECT_EQ(5, label.getStation().getCSType());
}

TEST(DexTextLabel, KeepsEveryFieldItIsGiven) {
  DexTextLabel label;
  label.setText(L"Manhole 3");
  label.setFontName(L"Arial");
  label.setHeightInMeters(0.35);
  label.setRotationAngle(45.0);
  label.setInsertionPoint(DexTextLabel::INSERT_BOTTOM_LEFT);
  label.setBold(true);
  label.setItalic(true);
  label.setUnderline(true);
  label.setDrawBox(true);
  label.setOpaque(true);
  EXPECT_EQ(L"Manhole 3", label.getText());
  EXPECT_EQ(L"Arial", label.getFontName());
  EXPECT_EQ(0.35, label.getHeightInMeters());
  EXPECT_EQ(45.0, label.getRotationAngle());
  EXPECT_EQ(7, label.getInsertionPoint());
  EXPECT_TRUE(label.getBold() && label.getItalic() && label.getUnderline() && label.getDrawBox() &&
              label.getOpaque());
  label.setInsertionPoint(0);
  EXPECT_EQ(0, label.getInsertionPoint());
}

TEST(DexTextLabel, KeepsItsNameInItsStationAndTheNameOnUnnamedStations) {
  DexTextLabel label;
  label.setName(L"T1");
  EXPECT_EQ(L"T1", label.getStation().getName());
  label.setStation(stationAt(1.0, 2.0, 3.0));
  EXPECT_EQ(L"T1", label.getName());
  EXPECT_EQ(DexPosition3D(1.0, 2.0, 3.0), label.getStation());
}

TEST(DexTextLabel, SetCoordsMarksNoValueCoordinatesUndefined) {
  DexTextLabel label;
  label.setCoords(1.0, kNoValue, 3.0);
  EXPECT_FALSE(label.getStation().isHorizCoordsDefined());
  label.setCoords(1.0, 2.0, 3.0, 4.0);
  EXPECT_EQ(4.0, label.getStation().getHeight());
}

TEST(DexTextLabel, ShiftMovesTheStationButKeepsTheRotationAngle) {
  DexTextLabel label;
  label.setCoords(1.0, 0.0, 0.0);
  label.setRotationAngle(15.0);
  label.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, 90.0);
  EXPECT_NEAR(0.0, label.getStation().getX(), 1e-12);
  EXPECT_NEAR(1.0, label.getStation().getY(), 1e-12);
  EXPECT_EQ(15.0, label.getRotationAngle());
}
