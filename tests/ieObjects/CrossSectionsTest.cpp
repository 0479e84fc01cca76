#include "ieObjects/IECrossSections.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

using vyn::ie::DexRoadTemplate;
using vyn::ie::DexRoadTemplatesDictionary;

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

}  // namespace
