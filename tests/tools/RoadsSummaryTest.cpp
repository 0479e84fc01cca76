#include "RoadsSummary.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEData.h"

namespace {

using namespace vyn::ie;

std::string summaryOf(const DexData& data) {
  std::ostringstream out;
  dexchange_tool::printRoads(out, data);
  return out.str();
}

// A road as a LandXML import leaves it: a plan of three elements bound to a station-equation set,
// a profile, and an alignment made of both.
void fillRoad(DexData& data) {
  auto* const set = new DexStaEquationSet(L"SE");
  DexStaEquation equation;
  equation.setData(DexStaEquation::RUNNING_CHAINAGE, 100.0);
  equation.setData(DexStaEquation::STATION_AHEAD, 1000.0);
  set->addEquation(&equation);
  ASSERT_TRUE(data.addIEStaEquationSetToDictionary(set));

  auto* const horizontal = new DexHorizontalAlignment();
  horizontal->setName(L"H1");
  horizontal->setLength(450.0);
  horizontal->addSegment(new DexLine2D());
  horizontal->addSegment(new DexSpiral());
  horizontal->addSegment(new DexCurve());
  horizontal->addSegment(new DexSpiral());
  horizontal->setStaEquationSet(set);
  auto* const vertical = new DexVerticalAlignment();
  vertical->setName(L"V1");
  vertical->addVerticalElement(new DexVerticalElement(DexVerticalElement::PARABOLA));
  ASSERT_TRUE(data.addIEAlignmentPartToDictionary(horizontal));
  ASSERT_TRUE(data.addIEAlignmentPartToDictionary(vertical));

  auto* const alignment = new DexAlignment();
  alignment->setName(L"ROAD 1");
  alignment->setStaStart(10.0);
  alignment->setLength(450.0);
  alignment->setAlignmentPart(horizontal);
  alignment->setAlignmentPart(vertical);
  alignment->setStaEquationSet(set);
  data.addDataset(new DexDataset(L"D"));
  data.getDatasetAt(0)->add(alignment);
}

TEST(RoadsSummary, ListsAlignmentsTheirPartsAndStationEquations) {
  DexData data{DexSettings()};
  fillRoad(data);
  EXPECT_EQ(
      "alignments: 1\n"
      "  \"ROAD 1\": stations 10.000 .. 460.000, station equations \"SE\"\n"
      "    horizontal \"H1\": stations 0.000 .. 450.000, 4 elements (1 line, 1 curve, 2 spirals, 0 "
      "intersection points), station equations \"SE\"\n"
      "    vertical \"V1\": stations 0.000 .. 0.000, 1 vertical element, 0 long sections\n"
      "alignment parts: 1 horizontal, 1 vertical, 0 cross-section sets, 0 road-string sets\n"
      "station-equation sets: 1\n"
      "  \"SE\": 1 equation\n"
      "    \"1\": chainage 100.000, back 100.000, ahead 1000.000\n",
      summaryOf(data));
}

TEST(RoadsSummary, SaysNothingOfAContainerWithoutRoads) {
  DexData data{DexSettings()};
  data.getIEAlignmentPartsDictionary();
  data.getIEStaEquationSetDictionary();
  data.addDataset(new DexDataset(L"D"));
  EXPECT_EQ("", summaryOf(data));
}

}  // namespace
