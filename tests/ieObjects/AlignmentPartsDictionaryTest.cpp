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

using vyn::ie::DexAlignmentPartsDictionary;
using vyn::ie::DexDesignPoint;
using vyn::ie::IDexAlignmentPart;

constexpr const wchar_t* kLogSource = vyn::ie::detail::kAlignmentPartsLogSource;
constexpr int kNullPartLine = vyn::ie::detail::kPartsNullPartLine;
constexpr int kUnknownKindLine = vyn::ie::detail::kPartsUnknownKindLine;

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

TEST(AlignmentPart, StartsActiveWithoutStartPointStationOrLength) {
  const TestPart part(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"H1");
  EXPECT_EQ(1, part.getStateType());
  EXPECT_EQ(nullptr, part.getStartPoint());
  EXPECT_EQ(0.0, part.getStaStart());
  EXPECT_EQ(0.0, part.getLength());
  EXPECT_EQ(CVynStringT<wchar_t>(L"H1"), part.getName());
}

TEST(AlignmentPartsDictionary, KeepsEachKindInOrderOfAdditionWithoutCheckingNames) {
  DexAlignmentPartsDictionary dictionary;
  auto* const first = new TestPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"V");
  auto* const second = new TestPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"V");
  EXPECT_TRUE(dictionary.addAlignmentPart(first));
  EXPECT_TRUE(dictionary.addAlignmentPart(second));
  EXPECT_TRUE(dictionary.addAlignmentPart(new TestPart(IDexAlignmentPart::ROAD_STRING_SET, L"V")));
  EXPECT_EQ(0, dictionary.getNumberOfElements(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
  EXPECT_EQ(2, dictionary.getNumberOfElements(IDexAlignmentPart::VERTICAL_ALIGNMENT));
  EXPECT_EQ(1, dictionary.getNumberOfElements(IDexAlignmentPart::ROAD_STRING_SET));
  EXPECT_EQ(first, dictionary.getAlignmentPartAt(1, 0));
  EXPECT_EQ(second, dictionary.getAlignmentPartAt(1, 1));
  EXPECT_EQ(nullptr, dictionary.getAlignmentPartAt(1, 2));
  EXPECT_EQ(first, dictionary.findAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"V"));
  EXPECT_EQ(nullptr, dictionary.findAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"v"));
  EXPECT_EQ(nullptr, dictionary.findAlignmentPart(IDexAlignmentPart::CROSS_SECTION_SET, L"V"));
}

TEST(AlignmentPartsDictionary, KindOutsideTheTableCountsMinusOneWithLogRecord) {
  dex_test::LogCapture log;
  const DexAlignmentPartsDictionary dictionary;
  EXPECT_EQ(-1, dictionary.getNumberOfElements(4));
  EXPECT_EQ(-1, dictionary.getNumberOfElements(-1));
  EXPECT_EQ(nullptr, dictionary.getAlignmentPartAt(4, 0));
  EXPECT_EQ(nullptr, dictionary.findAlignmentPart(4, L""));
  EXPECT_EQ(4, log.count(kLogSource, kUnknownKindLine));
}

TEST(AlignmentPartsDictionary, DeclinesNullAndPartsOfAnUnknownKindWithLogRecords) {
  dex_test::LogCapture log;
  DexAlignmentPartsDictionary dictionary;
  EXPECT_FALSE(dictionary.addAlignmentPart(nullptr));
  EXPECT_EQ(1, log.count(kLogSource, kNullPartLine));
  int deletions = 0;
  {
    TestPart unknown(7, L"X", &deletions);
    EXPECT_FALSE(dictionary.addAlignmentPart(&unknown));
    EXPECT_EQ(1, log.count(kLogSource, kUnknownKindLine));
  }
  EXPECT_EQ(1, deletions);  // once, by its owner: the dictionary did not take it
}

TEST(AlignmentPartsDictionary, PartHeldAlreadyIsNotTakenTwice) {
  int deletions = 0;
  {
    DexAlignmentPartsDictionary dictionary;
    auto* const part = new TestPart(IDexAlignmentPart::CROSS_SECTION_SET, L"C", &deletions);
    EXPECT_TRUE(dictionary.addAlignmentPart(part));
    part->setName(L"renamed");
    EXPECT_TRUE(dictionary.addAlignmentPart(part));
    EXPECT_EQ(1, dictionary.getNumberOfElements(IDexAlignmentPart::CROSS_SECTION_SET));
  }
  EXPECT_EQ(1, deletions);
}

TEST(AlignmentPartsDictionary, DeletesEveryPartWithItself) {
  int deletions = 0;
  {
    DexAlignmentPartsDictionary dictionary;
    for (int kind = 0; kind < IDexAlignmentPart::kNumberOfPartTypes; ++kind)
      dictionary.addAlignmentPart(new TestPart(kind, L"P", &deletions));
  }
  EXPECT_EQ(4, deletions);
}

TEST(AlignmentPartsDictionary, StartPointsOfHorizontalAndVerticalAlignmentsOnlyCount) {
  DexDesignPoint horizontalStart;
  horizontalStart.setName(L"100");
  DexDesignPoint verticalStart;
  verticalStart.setName(L"200");
  DexDesignPoint crossSectionStart;
  crossSectionStart.setName(L"300");
  DexAlignmentPartsDictionary dictionary;
  auto* const horizontal = new TestPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"H");
  horizontal->setStartPoint(&horizontalStart);
  auto* const vertical = new TestPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"V");
  vertical->setStartPoint(&verticalStart);
  auto* const crossSections = new TestPart(IDexAlignmentPart::CROSS_SECTION_SET, L"C");
  crossSections->setStartPoint(&crossSectionStart);
  dictionary.addAlignmentPart(new TestPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"no start"));
  dictionary.addAlignmentPart(horizontal);
  dictionary.addAlignmentPart(vertical);
  dictionary.addAlignmentPart(crossSections);
  EXPECT_TRUE(dictionary.isPointUsedAsStartPoint(L"100"));
  EXPECT_TRUE(dictionary.isPointUsedAsStartPoint(L"200"));
  EXPECT_FALSE(dictionary.isPointUsedAsStartPoint(L"300"));
  EXPECT_FALSE(dictionary.isPointUsedAsStartPoint(L""));
}

TEST(AlignmentPartsDictionary, ContainerKeepsNamesUniqueWithinEachKind) {
  vyn::ie::DexData data{vyn::ie::DexSettings()};
  auto* const horizontal = new vyn::ie::DexHorizontalAlignment();
  horizontal->setName(L"MAIN");
  auto* const vertical = new vyn::ie::DexVerticalAlignment();
  vertical->setName(L"MAIN");
  const auto second = std::make_unique<vyn::ie::DexHorizontalAlignment>();
  second->setName(L"MAIN");
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(horizontal));
  EXPECT_TRUE(data.addIEAlignmentPartToDictionary(vertical));
  EXPECT_FALSE(data.addIEAlignmentPartToDictionary(second.get()));  // stays with the caller
  const DexAlignmentPartsDictionary* const dictionary = data.getIEAlignmentPartsDictionary();
  EXPECT_EQ(horizontal, dictionary->findAlignmentPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, L"MAIN"));
  EXPECT_EQ(vertical, dictionary->findAlignmentPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, L"MAIN"));
  EXPECT_EQ(1, dictionary->getNumberOfElements(IDexAlignmentPart::HORIZONTAL_ALIGNMENT));
}

}  // namespace
