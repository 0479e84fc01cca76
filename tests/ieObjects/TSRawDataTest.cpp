#include "ieObjects/IETSRawData.h"

#include <gtest/gtest.h>

#include <memory>

#include "RawDataTestHelpers.h"

namespace {

using raw_test::TestTSRecord;
using vyn::ie::DexTSRawData;
using vyn::ie::IDexTSRawDataInterface;

TEST(DexTSRawData, PlacesOutsideTheFourValuesReadMinusOneAndAreIgnored) {
  DexTSRawData data(DexTSRawData::CONTENTS_HV);
  data.setTSRawData(0, 12.5);
  data.setTSRawData(4, 99.0);
  data.setTSRawData(-1, 99.0);
  EXPECT_EQ(12.5, data.getTSRawData(0));
  EXPECT_EQ(0.0, data.getTSRawData(3));
  EXPECT_EQ(-1.0, data.getTSRawData(4));
  EXPECT_EQ(-1.0, data.getTSRawData(-1));
  EXPECT_EQ(DexTSRawData::CONTENTS_HV, data.getContentsType());
}

TEST(DexTSRawData, NewRecordHasNeutralSettings) {
  const DexTSRawData data;
  EXPECT_EQ(0, data.getContentsType());
  EXPECT_EQ(0, data.getMethodType());
  EXPECT_EQ(0, data.getOffsetType());
  EXPECT_EQ(0, data.getSetNum());
  EXPECT_FALSE(data.getRemeasured());
  EXPECT_EQ(0.0, data.getPrismConst());
}

TEST(IDexTSRawDataInterface, IsATotalStationRecord) {
  const TestTSRecord record(vyn::ie::TS_RAW_FORESIGHT, L"F1");
  EXPECT_EQ(0, record.getRawDataType());
  EXPECT_EQ(2, record.getType());
  EXPECT_EQ(0, record.getNameSource());
  EXPECT_EQ(nullptr, record.getTSRawData());
}

TEST(IDexTSRawDataInterface, ValueSettersCopyTheArgumentAndNullRemovesTheValues) {
  TestTSRecord record(vyn::ie::TS_RAW_SIDESHOT);
  DexTSRawData values;
  values.setTSRawData(1, 90.0);
  record.setTSRawData(&values);
  ASSERT_NE(nullptr, record.getTSRawData());
  EXPECT_NE(&values, record.getTSRawData());
  values.setTSRawData(1, 45.0);
  EXPECT_EQ(90.0, record.getTSRawData()->getTSRawData(1));

  record.setTSRawData(&values);
  EXPECT_EQ(45.0, record.getTSRawData()->getTSRawData(1));
  record.setTSRawData(record.getTSRawData());
  EXPECT_EQ(45.0, record.getTSRawData()->getTSRawData(1));
  record.setTSRawData(nullptr);
  EXPECT_EQ(nullptr, record.getTSRawData());
}

TEST(IDexTSRawDataInterface, CloneCopiesNameTimeHeightAndValuesButNotDepth) {
  TestTSRecord record(vyn::ie::TS_RAW_FORESIGHT, L"F7", 3);
  record.setTime(base::CTime(5000));
  record.setTargetHeight(1.65);
  record.setDepth(2.0);
  DexTSRawData values;
  values.setTSRawData(2, 123.4);
  record.setTSRawData(&values);
  record.setAveragedTSRawData(&values);

  const std::unique_ptr<IDexTSRawDataInterface> copy(record.clone());
  EXPECT_EQ(L"F7", copy->getName());
  EXPECT_EQ(base::CTime(5000), copy->getTime());
  EXPECT_EQ(1.65, copy->getTargetHeight());
  EXPECT_EQ(0.0, copy->getDepth());
  EXPECT_EQ(3, copy->getNameSource());
  ASSERT_NE(nullptr, copy->getTSRawData());
  EXPECT_NE(record.getTSRawData(), copy->getTSRawData());
  EXPECT_EQ(123.4, copy->getTSRawData()->getTSRawData(2));
  ASSERT_NE(nullptr, copy->getAveragedTSRawData());
}

TEST(IDexTSRawDataInterface, CopyConstructionDuplicatesTheValues) {
  TestTSRecord record(vyn::ie::TS_RAW_FORESIGHT, L"F7");
  const DexTSRawData values;
  record.setTSRawData(&values);
  const TestTSRecord copy(record);
  ASSERT_NE(nullptr, copy.getTSRawData());
  EXPECT_NE(record.getTSRawData(), copy.getTSRawData());
}

}  // namespace
