#include "ieObjects/IEJobInfo.h"

#include <gtest/gtest.h>

#include "support/TimeZoneScope.h"

namespace {

using vyn::ie::DexDisplaySettings;
using vyn::ie::DexJobInfo;

// 100-nanosecond ticks of 2015-12-31 23:30:05 UTC.
FILETIME newYearsEveUtc() {
  SYSTEMTIME fields;
  fields.wYear = 2015;
  fields.wMonth = 12;
  fields.wDay = 31;
  fields.wHour = 23;
  fields.wMinute = 30;
  fields.wSecond = 5;
  FILETIME time;
  EXPECT_TRUE(SystemTimeToFileTime(&fields, &time));
  return time;
}

TEST(JobInfo, NewInformationHasNothingSetAndAnswersTheDefaultUnits) {
  const DexJobInfo info;
  EXPECT_EQ(3, info.getAngleUnits());
  EXPECT_EQ(27, info.getDistUnits());
  vyn::ie::EDistUnits dist = vyn::ie::USFEETINCHES;
  EXPECT_FALSE(info.getDistUnits(dist));
  EXPECT_EQ(vyn::ie::USFEETINCHES, dist);
  vyn::ie::EAngleUnits angle = vyn::ie::RADIANS;
  EXPECT_FALSE(info.getAngleUnits(angle));
  CVynStringT<wchar_t> date(L"unchanged");
  CVynStringT<wchar_t> time(L"unchanged");
  EXPECT_FALSE(info.getCreateTimeString(date, time));
  EXPECT_EQ(CVynStringT<wchar_t>(L"unchanged"), date);
  FILETIME created;
  EXPECT_FALSE(info.getCreateTime(created));
  DexDisplaySettings display(vyn::ie::CS_LOCAL);
  EXPECT_FALSE(info.getDisplaySettings(display));
  EXPECT_EQ(vyn::ie::CS_LOCAL, display.csType);
}

TEST(JobInfo, UnitsCountAsSetOnceGiven) {
  DexJobInfo info;
  info.setDistUnits(vyn::ie::USFEET);
  info.setAngleUnits(vyn::ie::angle_units::ANY_UNITS);
  vyn::ie::EDistUnits dist = vyn::ie::METERS;
  EXPECT_TRUE(info.getDistUnits(dist));
  EXPECT_EQ(vyn::ie::USFEET, dist);
  EXPECT_EQ(vyn::ie::USFEET, info.getDistUnits());
  EXPECT_EQ(5, info.getAngleUnits());
}

TEST(JobInfo, CreationTimeIsWrittenInLocalTime) {
  const dex_test::TimeZoneScope zone("UTC-2");  // two hours east of UTC
  DexJobInfo info;
  info.setCreateTime(newYearsEveUtc());
  CVynStringT<wchar_t> date;
  CVynStringT<wchar_t> time;
  ASSERT_TRUE(info.getCreateTimeString(date, time));
  EXPECT_EQ(CVynStringT<wchar_t>(L"01/01/16"), date);
  EXPECT_EQ(CVynStringT<wchar_t>(L"01:30:05"), time);
}

TEST(JobInfo, CreationTimeOutsideTheLocalRangeGivesNoText) {
  DexJobInfo info;
  FILETIME beyond;
  beyond.dwHighDateTime = 0xFFFFFFFF;
  beyond.dwLowDateTime = 0xFFFFFFFF;
  info.setCreateTime(beyond);
  CVynStringT<wchar_t> date;
  CVynStringT<wchar_t> time;
  EXPECT_FALSE(info.getCreateTimeString(date, time));
  FILETIME stored;
  EXPECT_TRUE(info.getCreateTime(stored));
  EXPECT_EQ(0xFFFFFFFFu, stored.dwHighDateTime);
}

TEST(JobInfo, CopiesKeepTextsDisplaySettingsAndFlags) {
  DexJobInfo info;
  info.setText(0, L"job");
  info.setText(6, L"last");
  info.setText(7, L"ignored");
  info.setText(-1, L"ignored");
  info.setDisplaySettings(DexDisplaySettings(vyn::ie::CS_GEOGRAPHIC, L"WGS 84", L"zone"));
  const DexJobInfo copy(info);
  EXPECT_EQ(CVynStringT<wchar_t>(L"job"), copy.getText(0));
  EXPECT_EQ(CVynStringT<wchar_t>(L"last"), copy.getText(6));
  EXPECT_TRUE(copy.getText(7).IsEmpty());
  DexDisplaySettings display;
  ASSERT_TRUE(copy.getDisplaySettings(display));
  EXPECT_EQ(vyn::ie::CS_GEOGRAPHIC, display.csType);
  EXPECT_EQ(CVynStringT<wchar_t>(L"zone"), display.coordSystemZone);
}

}  // namespace
