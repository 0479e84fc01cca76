#include "ieObjects/IEAlignment.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

#include "ObjectsTestHelpers.h"
#include "ieObjects/detail/AlignmentLog.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexAlignment;
using vyn::ie::DexHorizontalAlignment;
using vyn::ie::DexVerticalAlignment;
using vyn::ie::IDexAlignmentPart;
namespace detail = vyn::ie::detail;

constexpr const wchar_t* kSource = detail::kAlignmentLogSource;

TEST(DexAlignment, FirstPartOfAKindIsThePrimaryOneAndEveryPartIsIncluded) {
  DexHorizontalAlignment first;
  DexHorizontalAlignment second;
  second.setName(L"H");
  DexHorizontalAlignment namesake;
  namesake.setName(L"H");
  DexVerticalAlignment vertical;
  DexAlignment alignment;
  EXPECT_FALSE(alignment.isAlignPartIncluded(&first, false));
  IDexAlignmentPart* const listed[] = {&first, &vertical, &second, &first};
  for (IDexAlignmentPart* part : listed)
    alignment.setAlignmentPart(part);
  EXPECT_EQ(&first, alignment.getAlignmentPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
  EXPECT_EQ(&vertical, alignment.getAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT));
  EXPECT_EQ(nullptr, alignment.getAlignmentPart(IDexAlignmentPart::CROSS_SECTION_SET));
  ASSERT_EQ(4, alignment.getNumberOfAlignmentParts());
  for (int i = 0; i < 4; ++i)
    EXPECT_EQ(listed[i], alignment.getAlignmentPartAt(i));
  EXPECT_EQ(nullptr, alignment.getAlignmentPartAt(4));
  for (const bool deep : {false, true}) {
    EXPECT_TRUE(alignment.isAlignPartIncluded(&second, deep));
    EXPECT_FALSE(alignment.isAlignPartIncluded(&namesake, deep));  // by identity, not by name
    EXPECT_FALSE(alignment.isAlignPartIncluded(nullptr, deep));
  }
}

TEST(DexAlignment, NullPartsAndUnknownKindsAreReported) {
  const dex_test::LogCapture log;
  DexAlignment alignment;
  alignment.setAlignmentPart(nullptr);
  EXPECT_EQ(nullptr, alignment.getAlignmentPart(4));
  EXPECT_EQ(nullptr, alignment.getAlignmentPart(-1));
  EXPECT_EQ(1, log.count(kSource, detail::kAlignmentNullPartLine));
  EXPECT_EQ(2, log.count(kSource, detail::kAlignmentPartTypeLine));
}

TEST(DexAlignment, StationIntervalMustBePositive) {
  DexAlignment alignment;
  double interval = -1.0;
  EXPECT_FALSE(alignment.getStnInterval(interval));
  EXPECT_EQ(-1.0, interval);
  EXPECT_FALSE(alignment.setStnInterval(0.0));
  EXPECT_TRUE(alignment.setStnInterval(20.0));
  EXPECT_FALSE(alignment.setStnInterval(-5.0));
  EXPECT_TRUE(alignment.getStnInterval(interval));
  EXPECT_EQ(20.0, interval);
}

TEST(DexAlignment, NaNClearsACorridorOffset) {
  DexAlignment alignment;
  alignment.setCorridorLeftOffset(3.5);
  EXPECT_TRUE(alignment.hasCorridorLeftOffset());
  EXPECT_EQ(3.5, alignment.getCorridorLeftOffset());
  alignment.setCorridorLeftOffset(std::numeric_limits<double>::quiet_NaN());
  EXPECT_FALSE(alignment.hasCorridorLeftOffset());
  EXPECT_EQ(0.0, alignment.getCorridorLeftOffset());
  alignment.setCorridorRightOffset(-2.0);
  EXPECT_TRUE(alignment.hasCorridorRightOffset());
  EXPECT_FALSE(alignment.hasCorridorLeftOffset());
}

TEST(DexAlignment, CopySharesPartsAndDuplicatesDrawProperties) {
  DexHorizontalAlignment part;
  DexAlignment alignment;
  alignment.setName(L"ROAD 1");
  alignment.setAlignmentPart(&part);
  alignment.setDrawProperties(objects_test::linePropertiesOf(0x00FF00));

  const DexAlignment copy(alignment);
  EXPECT_EQ(L"ROAD 1", copy.getName());
  EXPECT_EQ(&part, copy.getAlignmentPart(0));
  ASSERT_NE(nullptr, copy.getDrawProperties());
  EXPECT_NE(alignment.getDrawProperties(), copy.getDrawProperties());
  EXPECT_EQ(0x00FF00u, objects_test::colorOf(copy.getDrawProperties()));
}

}  // namespace
