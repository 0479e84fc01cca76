#include "ieObjects/IERawData.h"

#include <gtest/gtest.h>

#include "RawDataTestHelpers.h"

namespace {

using vyn::ie::DexRawData;
using vyn::ie::DexRawNote;
using vyn::ie::IDexRawDataInterface;

TEST(DexRawData, IgnoresNullRecordsAndAnswersNullPastTheEnd) {
  DexRawData rawData;
  rawData.addRawData(nullptr);
  EXPECT_EQ(0, rawData.getNumberOfRawData());
  rawData.addRawData(new DexRawNote());
  EXPECT_EQ(1, rawData.getNumberOfRawData());
  EXPECT_NE(nullptr, rawData.getRawDataAt(0));
  EXPECT_EQ(nullptr, rawData.getRawDataAt(1));
  EXPECT_EQ(nullptr, rawData.getRawDataAt(-1));
}

TEST(DexRawData, KeepsRecordsInRecordingOrder) {
  DexRawData rawData;
  rawData.addRawData(new raw_test::TestTSRecord(vyn::ie::TS_RAW_STATION, L"STN"));
  rawData.addRawData(new raw_test::TestLevelRecord(L"BM1"));
  EXPECT_EQ(L"STN", rawData.getRawDataAt(0)->getName());
  EXPECT_EQ(IDexRawDataInterface::RAW_DATA_DIGITAL_LEVEL, rawData.getRawDataAt(1)->getRawDataType());
}

TEST(DexRawNote, IsANoteWhoseNameIsItsText) {
  DexRawNote note;
  EXPECT_EQ(3, note.getRawDataType());
  EXPECT_EQ(base::CTime(), note.getTime());
  note.setName(L"cloudy");
  note.setTime(base::CTime(1000));
  EXPECT_EQ(L"cloudy", note.getName());
  EXPECT_EQ(base::CTime(1000), note.getTime());
}

}  // namespace
