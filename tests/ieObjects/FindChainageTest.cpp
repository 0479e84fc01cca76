#include "ieObjects/IEFindChainage.h"

#include <gtest/gtest.h>

#include "ieObjects/IEDataDictionary.h"

namespace {

using vyn::ie::DexFindChainage;
using vyn::ie::DexFindChainageReport;
using vyn::ie::DexSurveyXSection;

TEST(FindChainage, MarksTheCutUsedWhenKindFiveIsSetWhateverTheValue) {
  const struct {
    int kind;
    double value;
    bool cutUsed;
    double readBack;
  } cases[] = {
      {5, 0.0, true, 0.0},  {5, -1.5, true, -1.5}, {4, 2.0, false, 2.0},
      {6, 3.0, false, 3.0}, {7, 9.0, false, 0.0},  {-1, 9.0, false, 0.0},
  };
  for (const auto& c : cases) {
    DexFindChainage record;
    record.setData(c.kind, c.value);
    EXPECT_EQ(c.cutUsed, record.isCutUsed()) << c.kind;
    EXPECT_EQ(c.readBack, record.getData(c.kind)) << c.kind;
  }
}

TEST(FindChainageReport, KeepsNullEntriesAndCopiesItsRecords) {
  DexFindChainageReport report;
  report.setRoadName(L"Main");
  auto* const record = new DexFindChainage;
  record->setPtName(L"101");
  report.addFindChainage(record);
  report.addFindChainage(nullptr);
  EXPECT_EQ(2, report.getNumberOfFindChainages());
  EXPECT_EQ(record, report.getFindChainageAt(0));
  EXPECT_EQ(nullptr, report.getFindChainageAt(1));
  EXPECT_EQ(nullptr, report.getFindChainageAt(2));
  EXPECT_EQ(nullptr, report.getFindChainageAt(-1));

  DexFindChainageReport copy;
  copy = report;
  ASSERT_EQ(2, copy.getNumberOfFindChainages());
  EXPECT_NE(record, copy.getFindChainageAt(0));
  EXPECT_EQ(CVynStringT<wchar_t>(L"101"), copy.getFindChainageAt(0)->getPtName());
  EXPECT_EQ(CVynStringT<wchar_t>(L"Main"), copy.getRoadName());
}

TEST(SurveyXSection, KeepsThreeValuesAndRefersToItsCodeDescription) {
  vyn::ie::DexCodeDescription code(L"EP");
  DexSurveyXSection point;
  point.setData(2, 4.5);
  point.setData(3, 9.0);
  point.setCodeDescription(&code);
  const DexSurveyXSection copy = point;
  EXPECT_EQ(4.5, copy.getData(DexSurveyXSection::SXS_VALUE_2));
  EXPECT_EQ(0.0, copy.getData(3));
  EXPECT_EQ(&code, copy.getCodeDescription());
}

}  // namespace
