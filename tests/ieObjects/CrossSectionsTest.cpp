#include "ieObjects/IECrossSections.h"

#include <gtest/gtest.h>

#include <cmath>
#include <initializer_list>
#include <memory>
#include <vector>

#include "ieObjects/IEVerticalAlignment.h"

namespace {

using vyn::ie::DexCrossSection;
using vyn::ie::DexCrossSectionSet;
using vyn::ie::DexRoadTemplate;
using vyn::ie::DexRoadTemplatesDictionary;
using vyn::ie::DexTemplateSegment;

class CountedTemplate : public DexRoadTemplate {
 public:
  CountedTemplate(const wchar_t* name, int& deletions) : DexRoadTemplate(name), deletions_(deletions) {}
  ~CountedTemplate() override { ++deletions_; }

 private:
  int& deletions_;
};

TEST(RoadTemplate, KeepsTwoValuesAndIgnoresOtherKinds) {
  DexRoadTemplate roadTemplate(L"T1");
  roadTemplate.setData(DexRoadTemplate::TEMPLATE_VALUE_2, 2.5);
  roadTemplate.setData(2, 9.0);
  roadTemplate.setData(-1, 9.0);
  EXPECT_EQ(0.0, roadTemplate.getData(DexRoadTemplate::TEMPLATE_VALUE_1));
  EXPECT_EQ(2.5, roadTemplate.getData(1));
  EXPECT_EQ(0.0, roadTemplate.getData(2));
}

TEST(RoadTemplatesDictionary, KeepsTheFirstTemplateOfANameAndReadsInNameOrder) {
  int deletions = 0;
  {
    DexRoadTemplatesDictionary dictionary(false, true);
    EXPECT_FALSE(dictionary.areCentralOffsetsUsed());
    EXPECT_TRUE(dictionary.areAbsHeightsUsed());
    auto* const first = new CountedTemplate(L"B", deletions);
    EXPECT_TRUE(dictionary.addRoadTemplate(first));
    EXPECT_TRUE(dictionary.addRoadTemplate(new CountedTemplate(L"A", deletions)));
    CountedTemplate second(L"B", deletions);
    EXPECT_FALSE(dictionary.addRoadTemplate(&second));
    EXPECT_FALSE(dictionary.addRoadTemplate(nullptr));
    EXPECT_EQ(first, dictionary.findRoadTemplate(L"B"));
    EXPECT_EQ(nullptr, dictionary.findRoadTemplate(L"b"));
    std::vector<CVynStringT<wchar_t>> names;
    for (const auto& [name, roadTemplate] : dictionary)
      names.push_back(roadTemplate->getName());
    EXPECT_EQ((std::vector<CVynStringT<wchar_t>>{L"A", L"B"}), names);

    dictionary.removeRoadTemplate(L"A");
    dictionary.removeRoadTemplate(L"missing");
    EXPECT_EQ(1, dictionary.getNumberOfRoadTemplates());
    EXPECT_EQ(1, deletions);
  }
  EXPECT_EQ(3, deletions);  // the removed one, the one the dictionary held, the declined one by its owner
}

// ---- Templates -------------------------------------------------------------------------------------

struct Point {
  double offset;
  double height;
  const wchar_t* name = L"";
};

DexRoadTemplate makeTemplate(std::initializer_list<Point> points, const wchar_t* name = L"T") {
  DexRoadTemplate roadTemplate(name);
  for (const Point& p : points)
    roadTemplate.addSegment(new DexTemplateSegment(p.offset, p.height, p.name));
  return roadTemplate;
}

std::vector<double> offsetsOf(const DexRoadTemplate& roadTemplate) {
  std::vector<double> offsets;
  for (int i = 0; i < roadTemplate.getNumberOfSegments(); ++i)
    offsets.push_back(roadTemplate.getSegmentAt(i)->getData(DexTemplateSegment::OFFSET));
  return offsets;
}

std::vector<double> heightsOf(const DexRoadTemplate& roadTemplate) {
  std::vector<double> heights;
  for (int i = 0; i < roadTemplate.getNumberOfSegments(); ++i)
    heights.push_back(roadTemplate.getSegmentAt(i)->getData(DexTemplateSegment::HEIGHT));
  return heights;
}

TEST(TemplateSegment, KeepsOffsetHeightAndNameAndIgnoresOtherKinds) {
  DexTemplateSegment segment(-2.5, 1.25, L"EP");
  segment.setData(2, 9.0);
  const std::unique_ptr<DexTemplateSegment> copy(segment.clone());
  EXPECT_EQ(-2.5, copy->getData(DexTemplateSegment::OFFSET));
  EXPECT_EQ(1.25, copy->getData(DexTemplateSegment::HEIGHT));
  EXPECT_EQ(0.0, copy->getData(2));
  EXPECT_EQ(CVynStringT<wchar_t>(L"EP"), copy->getName());
}

TEST(RoadTemplate, InsertsOnlyAtIndexesFromZeroToCount) {
  DexRoadTemplate roadTemplate = makeTemplate({{1, 0}});
  roadTemplate.insertTemplateAt(0, new DexTemplateSegment(0, 0));
  roadTemplate.insertTemplateAt(2, new DexTemplateSegment(2, 0));
  DexTemplateSegment outside(9, 0);
  roadTemplate.insertTemplateAt(4, &outside);
  roadTemplate.insertTemplateAt(-1, &outside);
  roadTemplate.insertTemplateAt(1, nullptr);
  roadTemplate.addSegment(nullptr);
  EXPECT_EQ((std::vector<double>{0, 1, 2}), offsetsOf(roadTemplate));
  EXPECT_EQ(nullptr, roadTemplate.getSegmentAt(3));
}

TEST(RoadTemplate, FindsTheFirstSegmentEqualInOffsetHeightAndName) {
  const DexRoadTemplate roadTemplate = makeTemplate({{1, 2, L"A"}, {1, 2, L"a"}, {1, 2, L"A"}, {1, 2, L"A"}});
  const DexRoadTemplate probe = makeTemplate({{1, 2, L"a"}, {1, 2.0001, L"A"}, {NAN, 2, L"A"}});
  EXPECT_EQ(1, roadTemplate.findSegment(probe.getSegmentAt(0)));
  EXPECT_EQ(-1, roadTemplate.findSegment(probe.getSegmentAt(1)));
  EXPECT_EQ(-1, roadTemplate.findSegment(probe.getSegmentAt(2)));
  EXPECT_EQ(-1, roadTemplate.findSegment(nullptr));
  const DexRoadTemplate third = makeTemplate({{0, 0, L"X"}, {5, 1, L"B"}, {1, 2, L"B"}});
  const DexTemplateSegment wanted(1, 2, L"B");
  EXPECT_EQ(2, third.findSegment(&wanted));
}

TEST(RoadTemplate, CentreLineHeightIsThatOfTheFirstPointWithinATenthOfTheCentre) {
  const struct {
    std::initializer_list<Point> points;
    double height;
  } cases[] = {
      {{{-5, 1}, {0.04, 7}, {0.0, 8}}, 7},
      {{{-5, 1}, {0.2, 7}}, 0.0},
      {{{-0.0996, 3}}, 0.0},  // rounds to -0.1, which is not within reach
      {{{-0.0994, 3}}, 3},
      {{}, 0.0},
  };
  for (const auto& c : cases)
    EXPECT_EQ(c.height, makeTemplate(c.points).getCLHeight());
  DexRoadTemplate roadTemplate = makeTemplate({{-5, 1}, {0, 3}});
  roadTemplate.removeCLHeight(roadTemplate.getCLHeight());
  EXPECT_EQ((std::vector<double>{-2, 0}), heightsOf(roadTemplate));
  EXPECT_EQ((std::vector<double>{-5, 0}), offsetsOf(roadTemplate));
}

TEST(RoadTemplate, OrdersAndMirrorsOffsets) {
  const struct {
    std::initializer_list<Point> points;
    bool reorder;
    std::vector<double> offsets;
  } cases[] = {
      {{{-30, 0}, {-5, 0}, {6, 0}, {7, 0}}, true, {5, 6, 7, 30}},
      {{{-30, 0}, {-5, 0}, {6, 0}, {7, 0}}, false, {30, 5, 6, 7}},
      {{{-7, 0}, {-6, 0}, {0, 0}, {6, 0}, {8, 0}}, true, {0, 6, 6, 7, 8}},
      {{{-1, 0}, {2, 0}}, true, {1, 2}},
      {{}, true, {}},
  };
  for (const auto& c : cases) {
    DexRoadTemplate roadTemplate = makeTemplate(c.points);
    roadTemplate.makeOffsetsPositiveAndOrdered(c.reorder);
    EXPECT_EQ(c.offsets, offsetsOf(roadTemplate));
  }
  // A mirrored point goes before a right-side point of equal offset.
  DexRoadTemplate named = makeTemplate({{-6, 0, L"L"}, {0, 0}, {6, 0, L"R"}});
  named.makeOffsetsPositiveAndOrdered(true);
  EXPECT_EQ(CVynStringT<wchar_t>(L"L"), named.getSegmentAt(1)->getName());
  DexRoadTemplate unordered = makeTemplate({{3, 0}, {-9, 0}, {1, 0}});
  unordered.makeOffsetsOrdered();
  EXPECT_EQ((std::vector<double>{-9, 1, 3}), offsetsOf(unordered));
}

TEST(RoadTemplate, SeparatesTheLeftSideWithACopyOfTheCentrePoint) {
  const struct {
    std::initializer_list<Point> points;
    bool hasLeft;
    std::vector<double> left;
    std::vector<double> right;
  } cases[] = {
      {{{-5, 0}, {0, 1}, {5, 0}}, true, {-5, 0}, {0, 5}},
      {{{0, 1}, {5, 0}}, false, {}, {0, 5}},
      {{{-5, 0}, {0, 1}}, true, {-5, 0}, {}},
      {{{-5, 0}, {-2, 0}}, true, {-5, -2}, {}},
      {{{5, 0}}, false, {}, {5}},
      {{}, false, {}, {}},
  };
  for (const auto& c : cases) {
    DexRoadTemplate roadTemplate = makeTemplate(c.points, L"Main");
    const std::unique_ptr<DexRoadTemplate> left(roadTemplate.separateLeftPart());
    ASSERT_EQ(c.hasLeft, left != nullptr);
    if (left) {
      EXPECT_EQ(c.left, offsetsOf(*left));
      EXPECT_EQ(CVynStringT<wchar_t>(L"Main"), left->getName());
    }
    EXPECT_EQ(c.right, offsetsOf(roadTemplate));
  }
}

TEST(RoadTemplate, ComparesToTheMillimetreByNameAndSegments) {
  const struct {
    std::initializer_list<Point> mine;
    std::initializer_list<Point> other;
    const wchar_t* otherName;
    bool equal;
  } cases[] = {
      {{{-5, 1, L"EP"}, {0, 2}}, {{-5.0004, 1.0003, L"EP"}, {0, 2}}, L"T", true},
      {{{-5, 1}}, {{-5.002, 1}}, L"T", false},
      {{{-5, 1}}, {{-5, 1}}, L"t", false},
      {{{-5, 1, L"EP"}}, {{-5, 1}}, L"T", false},
      {{{-5, 1}}, {{-5, 1, L"EP"}}, L"T", false},
      {{{-5, 1, L"EP"}}, {{-5, 1, L"ep"}}, L"T", false},
      {{{-5, 1}, {0, 0}}, {{-5, 1}}, L"T", false},
      {{}, {}, L"T", true},
  };
  for (const auto& c : cases) {
    DexRoadTemplate mine = makeTemplate(c.mine);
    const DexRoadTemplate other = makeTemplate(c.other, c.otherName);
    EXPECT_EQ(c.equal, mine.isEqual(&other, false));
  }
  DexRoadTemplate roadTemplate = makeTemplate({});
  EXPECT_FALSE(roadTemplate.isEqual(nullptr, true));
}

TEST(RoadTemplate, AdjustedComparisonTakesOverACentrePointOnlyTheOtherHas) {
  const struct {
    std::initializer_list<Point> mine;
    std::initializer_list<Point> other;
    bool equal;
    std::vector<double> offsetsAfter;
  } cases[] = {
      {{{2, 1}, {5, 1}}, {{0, 0}, {2, 1}, {5, 1}}, true, {0, 2, 5}},
      {{{-5, 1}, {-2, 1}}, {{-5, 1}, {-2, 1}, {0.0004, 0}}, true, {-5, -2, 0.0004}},
      {{}, {{0, 0}}, true, {0}},
      {{{2, 1}}, {{0, 0}, {2, 1}, {5, 1}}, false, {2}},
      {{{0, 0}, {2, 1}, {9, 9}}, {{0, 0}, {2, 1}}, true, {0, 2, 9}},
      {{{2, 1}}, {{0, 0.5}, {2, 1}}, false, {2}},
  };
  for (const auto& c : cases) {
    DexRoadTemplate mine = makeTemplate(c.mine);
    const DexRoadTemplate other = makeTemplate(c.other);
    EXPECT_EQ(c.equal, mine.isEqual(&other, true));
    EXPECT_EQ(c.offsetsAfter, offsetsOf(mine));
  }
}

TEST(RoadTemplate, CopiesOwnTheirSegments) {
  const DexRoadTemplate original = makeTemplate({{-5, 1}, {0, 2}});
  DexRoadTemplate copy = original;
  copy.getSegmentAt(0)->setData(DexTemplateSegment::OFFSET, -9);
  EXPECT_EQ((std::vector<double>{-5, 0}), offsetsOf(original));
  EXPECT_NE(original.getSegmentAt(0), copy.getSegmentAt(0));
}

TEST(RoadTemplatesDictionary, ConvertsBetweenCentralAndSequentialValues) {
  const struct {
    bool offsets;
    bool heights;
    std::vector<double> seqOffsets;
    std::vector<double> seqHeights;
    bool centralAfter;
  } cases[] = {
      {true, false, {2, 3, 4}, {1, 3, 6}, false},
      {false, true, {2, 5, 9}, {1, 2, 3}, false},
      {true, true, {2, 3, 4}, {1, 2, 3}, false},
      {false, false, {2, 5, 9}, {1, 3, 6}, true},
  };
  for (const auto& c : cases) {
    DexRoadTemplatesDictionary dictionary(true, true);
    dictionary.addRoadTemplate(new DexRoadTemplate(makeTemplate({{2, 1}, {5, 3}, {9, 6}}, L"B")));
    dictionary.addRoadTemplate(new DexRoadTemplate(makeTemplate({{2, 1}, {5, 3}, {9, 6}}, L"A")));
    dictionary.convertOffsetsCentralToSeq(c.offsets, c.heights);
    EXPECT_EQ(c.centralAfter, dictionary.areCentralOffsetsUsed());
    EXPECT_TRUE(dictionary.areAbsHeightsUsed());
    for (const auto& [name, roadTemplate] : dictionary) {
      EXPECT_EQ(c.seqOffsets, offsetsOf(*roadTemplate));
      EXPECT_EQ(c.seqHeights, heightsOf(*roadTemplate));
    }
    dictionary.convertOffsetsSeqToCentral(c.offsets, c.heights);
    EXPECT_TRUE(dictionary.areCentralOffsetsUsed());
    EXPECT_EQ((std::vector<double>{2, 5, 9}), offsetsOf(*dictionary.findRoadTemplate(L"A")));
    EXPECT_EQ((std::vector<double>{1, 3, 6}), heightsOf(*dictionary.findRoadTemplate(L"B")));
  }
  DexRoadTemplatesDictionary sequential(false, false);
  sequential.convertOffsetsSeqToCentral(false, false);
  EXPECT_FALSE(sequential.areCentralOffsetsUsed());
}

// ---- Cross sections --------------------------------------------------------------------------------

TEST(CrossSection, StartsWithItsFirstTemplateEvenANullOne) {
  DexRoadTemplate a(L"A");
  DexRoadTemplate b(L"B");
  DexCrossSection section(nullptr);
  section.addRoadTemplate(&a);
  section.addRoadTemplate(nullptr);
  section.addRoadTemplate(&b);
  section.addRoadTemplate(&a);
  EXPECT_EQ(4, section.getNumberOfRoadTemplates());
  EXPECT_EQ(nullptr, section.getRoadTemplateAt(0));
  EXPECT_EQ(&b, section.findRoadTemplate(L"B"));
  EXPECT_EQ(nullptr, section.findRoadTemplate(L"b"));
  EXPECT_TRUE(section.removeRoadTemplate(L"A"));
  EXPECT_EQ(&b, section.getRoadTemplateAt(1));
  EXPECT_EQ(&a, section.getRoadTemplateAt(2));
  EXPECT_FALSE(section.removeRoadTemplate(L"C"));
  EXPECT_EQ(nullptr, section.getRoadTemplateAt(3));
  EXPECT_EQ(0.0, section.getSta());
  EXPECT_TRUE(section.getTurn());
}

TEST(CrossSection, KeepsTheFirstLevelOfEachVerticalAlignment) {
  const vyn::ie::DexVerticalAlignment first;
  const vyn::ie::DexVerticalAlignment second;
  const auto* const va1 = &first;
  const auto* const va2 = &second;
  DexCrossSection section(nullptr);
  section.setLevelAtCL(10.5, va1);
  section.setLevelAtCL(99.0, va1);
  section.setLevelAtCL(-1.0, nullptr);
  EXPECT_EQ(10.5, section.getLevelAtCL(va1));
  EXPECT_EQ(0.0, section.getLevelAtCL(va2));
  EXPECT_EQ(-1.0, section.getLevelAtCL(nullptr));
}

TEST(CrossSection, CopyDataTakesOverEverythingOfTheOther) {
  DexRoadTemplate a(L"A");
  DexRoadTemplate b(L"B");
  DexCrossSection source(&a);
  source.addRoadTemplate(&b);
  source.setSta(120.0);
  source.setTurn(false);
  source.setLevelAtCL(7.0, nullptr);
  DexCrossSection target(&b);
  target.setLevelAtCL(3.0, nullptr);
  target.copyData(nullptr);
  EXPECT_EQ(3.0, target.getLevelAtCL(nullptr));
  target.copyData(&source);
  EXPECT_EQ(7.0, target.getLevelAtCL(nullptr));
  EXPECT_EQ(120.0, target.getSta());
  EXPECT_FALSE(target.getTurn());
  ASSERT_EQ(2, target.getNumberOfRoadTemplates());
  EXPECT_EQ(&a, target.getRoadTemplateAt(0));
}

TEST(CrossSectionSet, OwnsItsSectionsInOrderAndNotesTemplateNamesOnlyWithTheMap) {
  DexRoadTemplate a(L"A");
  DexRoadTemplate b(L"B");
  for (const bool useMap : {true, false}) {
    DexCrossSectionSet set(useMap);
    EXPECT_EQ(vyn::ie::IDexAlignmentPart::CROSS_SECTION_SET, set.getType());
    EXPECT_EQ(useMap, set.isTemplateMapUsed());
    EXPECT_FALSE(set.addCrossSection(nullptr));
    auto* const first = new DexCrossSection(&a);
    first->setSta(50);
    EXPECT_TRUE(set.addCrossSection(first));
    auto* const second = new DexCrossSection(nullptr);
    second->addRoadTemplate(&b);
    EXPECT_TRUE(set.addCrossSection(second));
    EXPECT_EQ(first, set.getCrossSectionAt(0));
    EXPECT_EQ(nullptr, set.getCrossSectionAt(2));
    EXPECT_EQ(useMap, set.isTemplateUsed(L"A"));
    EXPECT_EQ(useMap, set.isTemplateUsed(L"B"));
    EXPECT_FALSE(set.isTemplateUsed(L"C"));
    const DexCrossSectionSet copy = set;
    EXPECT_NE(first, copy.getCrossSectionAt(0));
    EXPECT_EQ(50, copy.getCrossSectionAt(0)->getSta());
  }
}

}  // namespace
