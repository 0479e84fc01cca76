#include "ieObjects/IEVerticalAlignment.h"

#include <gtest/gtest.h>

#include "ieObjects/detail/AlignmentPartsLog.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexLongSection;
using vyn::ie::DexVerticalAlignment;
using vyn::ie::DexVerticalElement;
namespace detail = vyn::ie::detail;

DexLongSection* sectionAt(double station) {
  auto* const section = new DexLongSection(DexLongSection::LEVEL_POINT);
  section->setData(DexLongSection::STATION, station);
  return section;
}

// An element or section that counts its deletions.
template <class Base>
class Counted : public Base {
 public:
  template <class Type>
  Counted(int& deletions, Type type) : Base(type), deletions_(deletions) {}
  ~Counted() override { ++deletions_; }

 private:
  int& deletions_;
};

TEST(DexVerticalElement, CurveLengthOfAVertexIsLoggedButStillAnswered) {
  const dex_test::LogCapture log;
  for (const auto type : {DexVerticalElement::VERTEX, DexVerticalElement::PARABOLA}) {
    DexVerticalElement element(type);
    element.setData(DexVerticalElement::CURVE_LENGTH, 80.0);
    element.setData(12, 2.0);
    EXPECT_EQ(80.0, element.getData(DexVerticalElement::CURVE_LENGTH));
    EXPECT_EQ(0.0, element.getData(12));
  }
  EXPECT_EQ(1, log.count(detail::kAlignmentPartsLogSource, detail::kVerticalElementDatumLine));
  EXPECT_EQ(1u, log.size());
}

TEST(DexVerticalAlignment, FindsLongSectionsByExactStationSkippingEmptyEntries) {
  DexVerticalAlignment alignment;
  alignment.addLongSection(nullptr);
  alignment.addLongSection(sectionAt(100.0000001));
  DexLongSection* const exact = sectionAt(100.0);
  alignment.addLongSection(exact);
  alignment.addLongSection(sectionAt(100.0));
  EXPECT_EQ(4, alignment.getNumberOfLongSections());
  EXPECT_EQ(nullptr, alignment.getLongSectionAt(0));
  EXPECT_EQ(nullptr, alignment.getLongSectionAt(4));
  EXPECT_EQ(exact, alignment.findLongSection(100.0));
  EXPECT_EQ(nullptr, alignment.findLongSection(0.0));
  EXPECT_FALSE(alignment.addVerticalElement(nullptr));
  EXPECT_EQ(0, alignment.getNumberOfVerticalElements());
}

TEST(DexVerticalAlignment, DeletesItsSectionsAndElementsWithItself) {
  int deletions = 0;
  {
    DexVerticalAlignment alignment;
    EXPECT_TRUE(alignment.addVerticalElement(
        new Counted<DexVerticalElement>(deletions, DexVerticalElement::PARABOLA)));
    alignment.addLongSection(new Counted<DexLongSection>(deletions, DexLongSection::LEVEL_POINT));
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexVerticalAlignment, CopyTiesItsSectionsToItsOwnElements) {
  DexVerticalAlignment alignment;
  auto* const element = new DexVerticalElement(DexVerticalElement::PARABOLA);
  alignment.addVerticalElement(element);
  const DexVerticalElement outside(DexVerticalElement::PARABOLA);
  for (const DexVerticalElement* parabola : {static_cast<const DexVerticalElement*>(element), &outside}) {
    DexLongSection* const section = sectionAt(alignment.getNumberOfLongSections());
    section->setParabola(parabola);
    alignment.addLongSection(section);
  }
  alignment.addLongSection(nullptr);

  DexVerticalAlignment copy;
  copy.addLongSection(sectionAt(5.0));
  copy = alignment;
  ASSERT_EQ(3, copy.getNumberOfLongSections());
  ASSERT_EQ(1, copy.getNumberOfVerticalElements());
  EXPECT_NE(element, copy.getVerticalElementAt(0));
  EXPECT_EQ(copy.getVerticalElementAt(0), copy.findLongSection(0.0)->getParabola());
  EXPECT_EQ(&outside, copy.findLongSection(1.0)->getParabola());
  EXPECT_EQ(nullptr, copy.getLongSectionAt(2));
  EXPECT_EQ(nullptr, copy.findLongSection(5.0));
}

}  // namespace
