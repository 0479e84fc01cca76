#include "ieObjects/IERoadStrings.h"

#include <gtest/gtest.h>

#include <memory>

#include "ieObjects/IEAlignment.h"
#include "ieObjects/IECrossSections.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieObjects/detail/AlignmentPartsLog.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexAlignment;
using vyn::ie::DexCrossSectionSet;
using vyn::ie::DexHorizontalAlignment;
using vyn::ie::DexRoadString;
using vyn::ie::DexRoadStringPair;
using vyn::ie::DexRoadStringSet;
using vyn::ie::DexVerticalAlignment;
using vyn::ie::IDexAlignmentPart;
namespace detail = vyn::ie::detail;

template <class Part>
Part named(const wchar_t* name) {
  Part part;
  part.setName(name);
  return part;
}

// A set of one string whose one pair is (horizontal, vertical).
std::unique_ptr<DexRoadStringSet> setOfPair(const DexHorizontalAlignment* horizontal,
                                            const DexVerticalAlignment* vertical) {
  auto set = std::make_unique<DexRoadStringSet>();
  auto* const roadString = new DexRoadString;
  roadString->addRoadStringPair(new DexRoadStringPair(horizontal, vertical));
  set->addRoadString(roadString);
  return set;
}

TEST(RoadStringSet, ReportsPartsUsedByKindAndNameOfItsPairs) {
  const auto h1 = named<DexHorizontalAlignment>(L"P1");
  const auto v1 = named<DexVerticalAlignment>(L"P1");
  const auto h2 = named<DexHorizontalAlignment>(L"P2");
  const auto otherV1 = named<DexVerticalAlignment>(L"P1");
  const auto lowerV1 = named<DexVerticalAlignment>(L"p1");
  auto sections = DexCrossSectionSet(false);
  sections.setName(L"P1");
  const auto onlyVertical = setOfPair(nullptr, &v1);
  const auto onlyHorizontal = setOfPair(&h2, nullptr);
  const struct {
    const DexRoadStringSet* set;
    const IDexAlignmentPart* part;
    bool used;
  } cases[] = {
      {onlyVertical.get(), &v1, true},        {onlyVertical.get(), &otherV1, true},
      {onlyVertical.get(), &lowerV1, false},  {onlyVertical.get(), &h1, false},
      {onlyVertical.get(), &sections, false}, {onlyVertical.get(), nullptr, false},
      {onlyHorizontal.get(), &h2, true},      {onlyHorizontal.get(), &v1, false},
  };
  for (const auto& c : cases)
    EXPECT_EQ(c.used, c.set->isAlignmentPartUsed(c.part));
  const DexRoadStringSet empty;
  EXPECT_FALSE(empty.isAlignmentPartUsed(&v1));
  EXPECT_EQ(IDexAlignmentPart::ROAD_STRING_SET, empty.getType());
}

TEST(RoadStringSet, LetsAnAlignmentFindPartsItsRoadStringsName) {
  auto v1 = named<DexVerticalAlignment>(L"V1");
  const auto set = setOfPair(nullptr, &v1);
  DexAlignment alignment;
  alignment.setAlignmentPart(set.get());
  const auto namesake = named<DexVerticalAlignment>(L"V1");
  EXPECT_TRUE(alignment.isAlignPartIncluded(&namesake, true));
  EXPECT_FALSE(alignment.isAlignPartIncluded(&namesake, false));
}

TEST(RoadStrings, RefuseNullEntriesWithAnErrorLogRecord) {
  dex_test::LogCapture log;
  DexRoadString roadString;
  roadString.addRoadStringPair(nullptr);
  DexRoadStringSet set;
  set.addRoadString(nullptr);
  EXPECT_EQ(0, roadString.getNumberOfRoadStringPairs());
  EXPECT_EQ(0, set.getNumberOfRoadStrings());
  EXPECT_EQ(1, log.count(detail::kAlignmentPartsLogSource, 831));
  EXPECT_EQ(1, log.count(detail::kAlignmentPartsLogSource, 832));
  EXPECT_EQ(nullptr, roadString.getRoadStringPairAt(0));
  EXPECT_EQ(nullptr, set.getRoadStringAt(0));
}

TEST(RoadStrings, CopiesDuplicateStringsAndPairsButShareTheAlignments) {
  const auto v1 = named<DexVerticalAlignment>(L"V1");
  const auto set = setOfPair(nullptr, &v1);
  set->getRoadStringAt(0)->setStaStart(12.5);
  const DexRoadStringSet copy = *set;
  ASSERT_EQ(1, copy.getNumberOfRoadStrings());
  const DexRoadStringPair* const pair = copy.getRoadStringAt(0)->getRoadStringPairAt(0);
  EXPECT_NE(set->getRoadStringAt(0)->getRoadStringPairAt(0), pair);
  EXPECT_EQ(&v1, pair->vertical);
  EXPECT_EQ(12.5, copy.getRoadStringAt(0)->getStaStart());
}

}  // namespace
