#include "ieObjects/IEVerticalAlignment.h"

#include <gtest/gtest.h>

#include <string>

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
  DexVerticalElement vertex(DexVerticalElement::VERTEX);
  DexVerticalElement parabola(DexVerticalElement::PARABOLA);
  for (DexVerticalElement* element : {&vertex, &parabola}) {
    element->setData(DexVerticalElement::CURVE_LENGTH, 80.0);
    element->setData(11, 1.0);
    element->setData(12, 2.0);
    EXPECT_EQ(80.0, element->getData(DexVerticalElement::CURVE_LENGTH));
    EXPECT_EQ(1.0, element->getData(11));
    EXPECT_EQ(0.0, element->getData(12));
    EXPECT_EQ(0.0, element->getData(-1));
  }
  EXPECT_EQ(1, log.count(detail::kAlignmentPartsLogSource, detail::kVerticalElementDatumLine));
  EXPECT_EQ(1u, log.size());
}

TEST(DexLongSection, KeepsFiveValuesAndAParabolaItDoesNotOwn) {
  const DexVerticalElement parabola(DexVerticalElement::PARABOLA);
  DexLongSection section(DexLongSection::PARABOLA_POINT);
  section.setData(4, 3.0);
  section.setData(5, 9.0);
  section.setParabola(&parabola);
  EXPECT_EQ(3.0, section.getData(4));
  EXPECT_EQ(0.0, section.getData(5));
  EXPECT_EQ(&parabola, section.getParabola());
  EXPECT_EQ(DexLongSection::PARABOLA_POINT, section.getLSType());
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
  EXPECT_EQ(vyn::ie::IDexAlignmentPart::VERTICAL_ALIGNMENT, alignment.getType());
}

TEST(DexVerticalAlignment, RefusesANullElement) {
  DexVerticalAlignment alignment;
  EXPECT_FALSE(alignment.addVerticalElement(nullptr));
  EXPECT_EQ(0, alignment.getNumberOfVerticalElements());
  EXPECT_TRUE(alignment.addVerticalElement(new DexVerticalElement(DexVerticalElement::VERTEX)));
  EXPECT_NE(nullptr, alignment.getVerticalElementAt(0));
  EXPECT_EQ(nullptr, alignment.getVerticalElementAt(1));
}

TEST(DexVerticalAlignment, DeletesItsSectionsAndElementsWithItself) {
  int deletions = 0;
  {
    DexVerticalAlignment alignment;
    alignment.addVerticalElement(new Counted<DexVerticalElement>(deletions, DexVerticalElement::PARABOLA));
    alignment.addLongSection(new Counted<DexLongSection>(deletions, DexLongSection::LEVEL_POINT));
    alignment.addLongSection(nullptr);
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexVerticalAlignment, CopyTiesItsSectionsToItsOwnElements) {
  DexVerticalAlignment alignment;
  alignment.setName(L"V1");
  auto* const element = new DexVerticalElement(DexVerticalElement::PARABOLA);
  element->setData(DexVerticalElement::CURVE_LENGTH, 60.0);
  alignment.addVerticalElement(element);
  const DexVerticalElement outside(DexVerticalElement::PARABOLA);
  DexLongSection* const tied = sectionAt(10.0);
  tied->setParabola(element);
  alignment.addLongSection(tied);
  DexLongSection* const tiedOutside = sectionAt(20.0);
  tiedOutside->setParabola(&outside);
  alignment.addLongSection(tiedOutside);
  alignment.addLongSection(nullptr);

  DexVerticalAlignment copy;
  copy.addLongSection(sectionAt(5.0));
  copy = alignment;
  EXPECT_EQ(L"V1", copy.getName());
  ASSERT_EQ(3, copy.getNumberOfLongSections());
  ASSERT_EQ(1, copy.getNumberOfVerticalElements());
  EXPECT_NE(element, copy.getVerticalElementAt(0));
  EXPECT_EQ(60.0, copy.getVerticalElementAt(0)->getData(DexVerticalElement::CURVE_LENGTH));
  EXPECT_EQ(copy.getVerticalElementAt(0), copy.findLongSection(10.0)->getParabola());
  EXPECT_EQ(&outside, copy.findLongSection(20.0)->getParabola());
  EXPECT_EQ(nullptr, copy.getLongSectionAt(2));
  EXPECT_EQ(nullptr, copy.findLongSection(5.0));
}

}  // namespace
