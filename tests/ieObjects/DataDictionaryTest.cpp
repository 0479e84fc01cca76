#include "ieObjects/IEDataDictionary.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/detail/DataDictionaryLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/Rows.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using objects_test::Counted;
namespace detail = vyn::ie::detail;

using AttrType = DexAttrDescription::EAttributeType;
constexpr auto kLine = IDexDrawProperties::DRAW_LINE;
constexpr auto kPoint = IDexDrawProperties::DRAW_POINT;
constexpr auto kArea = IDexDrawProperties::DRAW_AREA;

// The names of the descriptions a dictionary reads from its cursor to the end, "|"-separated.
std::wstring readNames(const DexDataDictionary& dictionary) {
  std::wstring names;
  while (const DexCodeDescription* const description = dictionary.getNextCodeDescription())
    names += std::wstring(description->getName().view()) + L"|";
  return names;
}

// A description with something in every field, for the copy tests.
std::unique_ptr<DexCodeDescription> fullDescription(const DexLayer& layer) {
  auto description = std::make_unique<DexCodeDescription>(L"FENCE");
  auto* const height = new DexAttrDescription(L"Height", DexAttrDescription::ATTR_FLOAT);
  height->extraStrings.Add(L"low");
  height->extraInt = 7;
  height->extraText1 = L"m";
  description->addAttrDescription(height);
  description->addAttrDescription(new DexAttrDescription(L"Owner", DexAttrDescription::ATTR_STRING));
  description->setDrawProperties(kLine,
                                 new DexDrawLineProperties(0x00FF00ul, 3, DexDrawLineProperties::DASH_DOT));
  description->setLayer(&layer);
  description->setDescCodeName(L"Fence line");
  description->setCodeType(CODE_TYPE_LINE);
  description->setAttribPromptType(ATTRIB_PROMPT_ALWAYS);
  description->setDtmFlag(DTM_CODE_EXCLUDED);
  return description;
}

void expectFullDescription(const DexCodeDescription& description, const DexLayer& layer) {
  ASSERT_EQ(2, description.getSize());
  const DexAttrDescription* const height = description.getAttrDescriptionAt(0);
  EXPECT_TRUE(description.getName() == L"FENCE" && height->getName() == L"Height" &&
              height->getType() == DexAttrDescription::ATTR_FLOAT && height->extraStrings.GetSize() == 1 &&
              height->extraStrings.GetAt(0) == L"low" && height->extraInt == 7 &&
              height->extraText1 == L"m" && description.getAttrDescriptionAt(1)->getName() == L"Owner");
  EXPECT_EQ(0x00FF00ul, objects_test::colorOf(description.getDrawProperties(kLine)));
  EXPECT_TRUE(description.getLayer() == &layer && description.getDescCodeName() == L"Fence line" &&
              description.getCodeType() == CODE_TYPE_LINE &&
              description.getAttribPromptType() == ATTRIB_PROMPT_ALWAYS &&
              description.getDtmFlag() == DTM_CODE_EXCLUDED);
}

TEST(DexAttrDescription, LimitsAndTextFollowTheType) {
  const struct {
    int type;
    const wchar_t* text;
    int maxLength, attrSize, fraction;
  } rows[] = {{0, L"String", 255, -1, 0},       {1, L"Bool", 10, 4, 0},
              {2, L"Integer", 10, 4, 0},        {3, L"Float", 18, 8, 18},
              {4, L"List", 255, -1, 0},         {5, L"Date-Time", 19, -1, 0},
              {6, L"NotSupported", 255, -1, 0}, {-1, L"NotSupported", 255, -1, 0}};
  DexAttrDescription attr;
  EXPECT_TRUE(attr.getType() == DexAttrDescription::ATTR_STRING && attr.getName().IsEmpty() &&
              attr.extraInt == 1);
  for (const auto& row : rows) {
    attr.setType(static_cast<AttrType>(row.type));
    const dex_test::LogCapture log;
    EXPECT_EQ(row.text, attr.getTypeAsString()) << row.type;
    EXPECT_EQ(row.attrSize, attr.getAttrSize()) << row.type;
    EXPECT_EQ(row.fraction, attr.getMaxFracLength()) << row.type;
    EXPECT_EQ(0u, log.size()) << "only the length reports the type";
    EXPECT_EQ(row.maxLength, attr.getMaxLength()) << row.type;
    // The unsupported type is reported, without a message.
    const bool unsupported = row.text[0] == L'N';
    EXPECT_EQ(unsupported ? 1 : 0,
              log.count(detail::kDataDictionaryLogSource, detail::kUnsupportedAttrTypeLine));
    if (unsupported) {
      EXPECT_TRUE(log.records().front().message.empty());
    }
    attr.setTypeFromString(row.text);
    EXPECT_EQ(unsupported ? 0 : row.type, attr.getType()) << row.text;
  }
  const dex_test::LogCapture log;
  EXPECT_EQ(9, DexAttrDescription(L"a", static_cast<AttrType>(9)).getType());
  EXPECT_EQ(1, log.count(detail::kDataDictionaryLogSource, detail::kUnsupportedAttrTypeLine));
  attr.setMaxFracLength(3);
  attr.setType(DexAttrDescription::ATTR_FLOAT);
  EXPECT_EQ(3, attr.getMaxFracLength());
  // Types from texts ignore case; an unknown text gives a string.
  const std::pair<const wchar_t*, int> texts[] = {
      {L"float", 3}, {L"DATE-TIME", 5}, {L"bOoL", 1}, {L"list", 4}, {L"Real", 0}, {L"", 0}, {L" Float", 0}};
  for (const auto& [text, type] : texts) {
    attr.setType(DexAttrDescription::ATTR_LIST);
    attr.setTypeFromString(text);
    EXPECT_EQ(type, attr.getType()) << text;
  }
}

TEST(DexAttrDescription, ResetRestoresTheExtrasAndCopiesTakeEveryMember) {
  auto original = std::make_unique<DexAttrDescription>(L"Kind", DexAttrDescription::ATTR_FLOAT);
  original->extraStrings.Add(L"oak");
  original->extraInt = 0;
  original->extraText1 = L"x";
  original->extraText2 = L"y";
  original->extraText3 = L"z";
  original->setMaxFracLength(2);
  const DexAttrDescription copy(*original);
  DexAttrDescription assigned;
  assigned = *original;
  original->resetAll();  // keeps the name, the type and the list
  EXPECT_TRUE(original->getName() == L"Kind" && original->getType() == DexAttrDescription::ATTR_FLOAT &&
              original->extraStrings.GetSize() == 1 && original->extraInt == 1 &&
              original->extraText1.IsEmpty() && original->extraText2.IsEmpty() &&
              original->extraText3.IsEmpty() && original->getMaxFracLength() == 18);
  original.reset();
  for (const DexAttrDescription* attr : {&copy, static_cast<const DexAttrDescription*>(&assigned)})
    EXPECT_TRUE(attr->getName() == L"Kind" && attr->getMaxFracLength() == 2 &&
                attr->extraStrings.GetSize() == 1 && attr->extraStrings.GetAt(0) == L"oak" &&
                attr->extraInt == 0 && attr->extraText3 == L"z");
}

TEST(DexCodeDescription, NewDescriptionHasOnlyItsNameUntilAnySettingButTheTerrainFlag) {
  const DexCodeDescription fresh(L"TREE");
  EXPECT_TRUE(fresh.getSize() == 0 && fresh.getLayer() == nullptr && fresh.getDescCodeName().IsEmpty() &&
              fresh.getCodeType() == 3 && fresh.getAttribPromptType() == 3 && fresh.getDtmFlag() == 2);
  EXPECT_TRUE(fresh.getDrawProperties(kPoint) == nullptr && fresh.getDrawProperties(kArea) == nullptr);
  EXPECT_TRUE(!fresh.isDrawPropertiesWasDefined() && fresh.isOnlyCodeNameDefined());
  const DexLayer layer;
  using Setting = void (*)(DexCodeDescription&, const DexLayer&);
  const Setting settings[] = {
      [](DexCodeDescription& d, const DexLayer&) { d.addAttrDescription(new DexAttrDescription()); },
      [](DexCodeDescription& d, const DexLayer&) { d.setDrawProperties(kArea, new DexDrawAreaProperties()); },
      [](DexCodeDescription& d, const DexLayer& l) { d.setLayer(&l); },
      [](DexCodeDescription& d, const DexLayer&) { d.setDescCodeName(L"x"); },
      [](DexCodeDescription& d, const DexLayer&) { d.setCodeType(CODE_TYPE_POINT); },
      [](DexCodeDescription& d, const DexLayer&) { d.setAttribPromptType(ATTRIB_PROMPT_NEVER); }};
  for (const Setting setting : settings) {
    DexCodeDescription description(L"A");
    setting(description, layer);
    EXPECT_FALSE(description.isOnlyCodeNameDefined());
  }
  DexCodeDescription description(L"A");
  description.setDtmFlag(DTM_CODE_INCLUDED);
  EXPECT_TRUE(description.isOnlyCodeNameDefined());
  IDexNameInterface& named = description;  // the name is set through the name interface
  named.setName(L"B");
  EXPECT_EQ(L"B", named.getName());
  EXPECT_EQ(2, dex_test::vtableEntryOf(&DexCodeDescription::setName).value_or(2));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexCodeDescription::getName).value_or(3));
}

TEST(DexCodeDescription, FindsAttrDescriptionsByExactNameAndKeepsPropertiesPerKind) {
  DexCodeDescription description(L"A");
  for (const wchar_t* name : {L"Height", L"Owner", L"Height"})
    description.addAttrDescription(new DexAttrDescription(name, DexAttrDescription::ATTR_FLOAT));
  description.addAttrDescription(nullptr);
  const DexCodeDescription& constant = description;
  const std::pair<int, int> rows[] = {{description.getSize(), 3},
                                      {description.findAttrDescriptionIndex(L"Owner"), 1},
                                      {description.findAttrDescriptionIndex(L"Height"), 0},
                                      {description.findAttrDescriptionIndex(L"owner"), -1}};
  dex_test::expectRows(rows);
  EXPECT_TRUE(description.findAttrDescription(L"Height") == description.getAttrDescriptionAt(0) &&
              constant.findAttrDescription(L"Owner") == constant.getAttrDescriptionAt(1) &&
              description.findAttrDescription(L"owner") == nullptr &&
              constant.findAttrDescription(L"") == nullptr);
  EXPECT_TRUE(description.getAttrDescriptionAt(-1) == nullptr && constant.getAttrDescriptionAt(3) == nullptr);
  int deletions = 0;
  auto* const point = new Counted<DexDrawPointProperties>(deletions);
  description.setDrawProperties(kPoint, point);
  description.setDrawProperties(kPoint, point);
  EXPECT_TRUE(description.getDrawProperties(kPoint) == point &&
              constant.getDrawProperties(kLine) == nullptr &&
              description.isDrawPropertiesWasDefined());  // an empty property object counts as defined
  description.setDrawProperties(kPoint, nullptr);
  EXPECT_EQ(1, deletions);
  EXPECT_FALSE(description.isDrawPropertiesWasDefined());
  const auto outside = static_cast<IDexDrawProperties::EDexDrawType>(3);
  const auto line = std::make_unique<DexDrawLineProperties>();  // declined: the caller keeps it
  description.setDrawProperties(outside, line.get());
  EXPECT_TRUE(description.getDrawProperties(outside) == nullptr &&
              description.getDrawProperties(static_cast<IDexDrawProperties::EDexDrawType>(-1)) == nullptr);
}

TEST(DexCodeDescription, CreatesDrawPropertiesFromExactTexts) {
  const std::pair<const wchar_t*, int> rows[] = {
      {L"Point", kPoint}, {L"Line", kLine}, {L"Area", kArea}, {L"point", -1}, {L"", -1}};
  for (const auto& [text, type] : rows) {
    const std::unique_ptr<IDexDrawProperties> made(DexCodeDescription::createDrawPropertiesFromString(text));
    EXPECT_EQ(type, made != nullptr ? made->getType() : -1) << text;
    if (made != nullptr) {
      EXPECT_FALSE(made->isDefined());
    }
  }
}

TEST(DexCodeDescription, CopiesOwnTheirMembersAndShareTheLayer) {
  DexLayer layer;
  auto original = fullDescription(layer);
  const DexCodeDescription copy(*original);
  EXPECT_TRUE(copy.getAttrDescriptionAt(0) != original->getAttrDescriptionAt(0) &&
              copy.getDrawProperties(kLine) != original->getDrawProperties(kLine));
  int deletions = 0;
  DexCodeDescription target(L"OLD");
  target.addAttrDescription(new Counted<DexAttrDescription>(deletions));
  target.setDrawProperties(kPoint, new Counted<DexDrawPointProperties>(deletions));
  target = *original;
  EXPECT_EQ(2, deletions);
  original.reset();
  expectFullDescription(copy, layer);
  const DexCodeDescription& self = target;
  target = self;
  expectFullDescription(target, layer);
}

TEST(DexDataDictionary, FindsAndWalksDescriptionsByExactNameUnderTheNameAdded) {
  int deletions = 0;
  {
    DexDataDictionary dictionary;
    EXPECT_EQ(L"", readNames(dictionary));
    auto* const first = new Counted<DexCodeDescription>(deletions, L"B");
    EXPECT_TRUE(dictionary.addCodeDescription(first) && dictionary.addCodeDescription(first));
    dictionary.reset();
    for (const wchar_t* name : {L"a", L"A", L"10", L"2", L"Ab"})
      EXPECT_TRUE(dictionary.addCodeDescription(new DexCodeDescription(name)));
    auto same = std::make_unique<DexCodeDescription>(L"B");  // declined: the caller keeps it
    EXPECT_FALSE(dictionary.addCodeDescription(same.get()) || dictionary.addCodeDescription(nullptr));
    EXPECT_EQ(6, dictionary.getSize());
    const DexDataDictionary& constant = dictionary;
    EXPECT_TRUE(
        dictionary.findCodeDiscription(L"B") == first && constant.findCodeDiscription(L"B") == first &&
        dictionary.findCodeDiscription(L"b") == nullptr && dictionary.findCodeDiscription(L"B ") == nullptr &&
        constant.findCodeDiscription(L"") == nullptr);
    // The walk sees what was added before the first description; reset starts it again.
    EXPECT_EQ(L"10|2|A|Ab|B|a|", readNames(constant));
    EXPECT_EQ(nullptr, dictionary.getNextCodeDescription());
    constant.reset();
    EXPECT_EQ(L"10|2|A|Ab|B|a|", readNames(constant));
    first->setName(L"NEW");  // filed under the name it was added with
    EXPECT_TRUE(dictionary.findCodeDiscription(L"B") == first &&
                dictionary.findCodeDiscription(L"NEW") == nullptr);
  }
  EXPECT_EQ(1, deletions);
}

TEST(DexDataDictionary, CopiesAndAssignmentDuplicateEveryDescription) {
  DexLayer layer;
  auto original = std::make_unique<DexDataDictionary>();
  original->addCodeDescription(fullDescription(layer).release());
  original->addCodeDescription(new DexCodeDescription(L"A"));
  original->getNextCodeDescription();  // the copy's cursor does not follow the original's
  const DexCodeDescription* const originalFence = original->findCodeDiscription(L"FENCE");
  const DexDataDictionary copy(*original);
  int deletions = 0;
  DexDataDictionary target;
  target.addCodeDescription(new Counted<DexCodeDescription>(deletions, L"OLD"));
  target.getNextCodeDescription();
  target = *original;
  EXPECT_EQ(1, deletions);
  EXPECT_NE(originalFence, copy.findCodeDiscription(L"FENCE"));
  original.reset();
  expectFullDescription(*copy.findCodeDiscription(L"FENCE"), layer);
  EXPECT_EQ(L"A|FENCE|", readNames(copy));
  EXPECT_EQ(L"A|FENCE|", readNames(target));
  const DexDataDictionary& self = target;
  target = self;
  EXPECT_EQ(2, target.getSize());
}

}  // namespace
