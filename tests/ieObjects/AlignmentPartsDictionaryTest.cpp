#include "ieObjects/IEAlignmentPartsDictionary.h"

#include <gtest/gtest.h>

#include <memory>

#include "ieObjects/IEData.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieObjects/detail/AlignmentPartsLog.h"
#include "support/LogCapture.h"

namespace {

using namespace vyn::ie;
constexpr const wchar_t* kLogSource = detail::kAlignmentPartsLogSource;

// A part of any kind (also one outside the table) that counts its deletions.
class TestPart : public IDexAlignmentPart {
 public:
  TestPart(int kind, const wchar_t* name, int* deletions = nullptr) : kind_(kind), deletions_(deletions) {
    setName(name);
  }
  ~TestPart() override {
    if (deletions_ != nullptr) ++*deletions_;
  }
  EDexAlignmentPartType getType() const override { return static_cast<EDexAlignmentPartType>(kind_); }

 private:
  int kind_;
  int* deletions_;
};

TEST(AlignmentPartsDictionary, KeepsEachKindInOrderOfAdditionAndDeletesThemAll) {
  int deletions = 0;
  {
    DexAlignmentPartsDictionary dictionary;
    auto* const first = new TestPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"V", &deletions);
    auto* const second = new TestPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"V", &deletions);
    EXPECT_TRUE(dictionary.addAlignmentPart(first));
    EXPECT_TRUE(dictionary.addAlignmentPart(second));  // names are not checked here
    EXPECT_TRUE(dictionary.addAlignmentPart(second));  // held already: not taken twice
    EXPECT_TRUE(
        dictionary.addAlignmentPart(new TestPart(IDexAlignmentPart::ROAD_STRING_SET, L"V", &deletions)));
    EXPECT_EQ(0, dictionary.getNumberOfElements(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
    EXPECT_EQ(2, dictionary.getNumberOfElements(IDexAlignmentPart::VERTICAL_ALIGNMENT));
    EXPECT_EQ(second, dictionary.getAlignmentPartAt(1, 1));
    EXPECT_EQ(nullptr, dictionary.getAlignmentPartAt(1, 2));
    EXPECT_EQ(first, dictionary.findAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"V"));
    EXPECT_EQ(nullptr, dictionary.findAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"v"));
    EXPECT_EQ(nullptr, dictionary.findAlignmentPart(IDexAlignmentPart::CROSS_SECTION_SET, L"V"));
  }
  EXPECT_EQ(3, deletions);
}

TEST(AlignmentPartsDictionary, NullPartsAndUnknownKindsAreLogged) {
  const dex_test::LogCapture log;
  DexAlignmentPartsDictionary dictionary;
  EXPECT_FALSE(dictionary.addAlignmentPart(nullptr));
  TestPart unknown(7, L"X");
  EXPECT_FALSE(dictionary.addAlignmentPart(&unknown));  // left to its owner
  EXPECT_EQ(-1, dictionary.getNumberOfElements(4));
  EXPECT_EQ(-1, dictionary.getNumberOfElements(-1));
  EXPECT_EQ(nullptr, dictionary.getAlignmentPartAt(4, 0));
  EXPECT_EQ(nullptr, dictionary.findAlignmentPart(4, L""));
  EXPECT_EQ(1, log.count(kLogSource, detail::kPartsNullPartLine));
  EXPECT_EQ(5, log.count(kLogSource, detail::kPartsUnknownKindLine));
}

TEST(AlignmentPartsDictionary, StartPointsOfHorizontalAndVerticalAlignmentsOnlyCount) {
  DexDesignPoint points[3];
  DexAlignmentPartsDictionary dictionary;
  IDexAlignmentPart* const parts[] = {new DexHorizontalAlignment(), new DexVerticalAlignment(),
                                      new TestPart(IDexAlignmentPart::CROSS_SECTION_SET, L"C")};
  const wchar_t* const names[] = {L"100", L"200", L"300"};
  dictionary.addAlignmentPart(new DexHorizontalAlignment());  // without start point
  for (int i = 0; i < 3; ++i) {
    points[i].setName(names[i]);
    parts[i]->setStartPoint(&points[i]);
    dictionary.addAlignmentPart(parts[i]);
  }
  EXPECT_TRUE(dictionary.isPointUsedAsStartPoint(L"100"));
  EXPECT_TRUE(dictionary.isPointUsedAsStartPoint(L"200"));
  EXPECT_FALSE(dictionary.isPointUsedAsStartPoint(L"300"));
  EXPECT_FALSE(dictionary.isPointUsedAsStartPoint(L""));
}

TEST(AlignmentPartsDictionary, ContainerKeepsNamesUniqueWithinEachKind) {
  DexData data{DexSettings()};
  auto* const horizontal = new DexHorizontalAlignment();
  auto* const vertical = new DexVerticalAlignment();
  const auto second = std::make_unique<DexHorizontalAlignment>();
  for (IDexAlignmentPart* part :
       {static_cast<IDexAlignmentPart*>(horizontal), static_cast<IDexAlignmentPart*>(vertical),
        static_cast<IDexAlignmentPart*>(second.get())})
    part->setName(L"MAIN");
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(horizontal));
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(vertical));
  EXPECT_FALSE(data.addIEAlignmentPartToDictionary(second.get()));  // stays with the caller
  EXPECT_EQ(
      1, data.getIEAlignmentPartsDictionary()->getNumberOfElements(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
  EXPECT_EQ(vertical, data.getIEAlignmentPartsDictionary()->findAlignmentPart(1, L"MAIN"));
}

}  // namespace
