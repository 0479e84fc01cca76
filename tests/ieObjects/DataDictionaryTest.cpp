#include "ieObjects/IEDataDictionary.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ieObjects/IELayers.h"
#include "ieObjects/detail/DataDictionaryLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/VtableSlot.h"

namespace {

using vyn::ie::DexAttrDescription;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexDataDictionary;
using vyn::ie::DexDrawAreaProperties;
using vyn::ie::DexDrawLineProperties;
using vyn::ie::DexDrawPointProperties;
using vyn::ie::DexLayer;
using vyn::ie::IDexDrawProperties;
namespace detail = vyn::ie::detail;

using AttrType = DexAttrDescription::EAttributeType;

const std::wstring kSource = detail::kDataDictionaryLogSource;

// Counts deletions so that ownership rules become visible.
class CountedAttrDescription : public DexAttrDescription {
 public:
  explicit CountedAttrDescription(int& deletions) : deletions_(deletions) {}
  ~CountedAttrDescription() override { ++deletions_; }

 private:
  int& deletions_;
};

class CountedLineProperties : public DexDrawLineProperties {
 public:
  explicit CountedLineProperties(int& deletions) : deletions_(deletions) {}
  ~CountedLineProperties() override { ++deletions_; }

 private:
  int& deletions_;
};

class CountedCodeDescription : public DexCodeDescription {
 public:
  CountedCodeDescription(const wchar_t* name, int& deletions)
      : DexCodeDescription(name), deletions_(deletions) {}
  ~CountedCodeDescription() override { ++deletions_; }

 private:
  int& deletions_;
};

// Names of the descriptions a dictionary reads from its cursor, to the end.
std::vector<std::wstring> readNames(const DexDataDictionary& dictionary) {
  std::vector<std::wstring> names;
  while (const DexCodeDescription* const description = dictionary.getNextCodeDescription()) {
    names.emplace_back(description->getName().view());
  }
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
  description->setDrawProperties(IDexDrawProperties::DRAW_LINE,
                                 new DexDrawLineProperties(0x00FF00ul, 3, DexDrawLineProperties::DASH_DOT));
  description->setLayer(&layer);
  description->setDescCodeName(L"Fence line");
  description->setCodeType(vyn::ie::CODE_TYPE_LINE);
  description->setAttribPromptType(vyn::ie::ATTRIB_PROMPT_ALWAYS);
  description->setDtmFlag(vyn::ie::DTM_CODE_EXCLUDED);
  return description;
}

void expectFullDescription(const DexCodeDescription& description, const DexLayer& layer) {
  EXPECT_EQ(L"FENCE", description.getName());
  ASSERT_EQ(2, description.getSize());
  const DexAttrDescription* const height = description.getAttrDescriptionAt(0);
  EXPECT_EQ(L"Height", height->getName());
  EXPECT_EQ(DexAttrDescription::ATTR_FLOAT, height->getType());
  ASSERT_EQ(1, height->extraStrings.GetSize());
  EXPECT_EQ(L"low", height->extraStrings.GetAt(0));
  EXPECT_EQ(7, height->extraInt);
  EXPECT_EQ(L"m", height->extraText1);
  EXPECT_EQ(L"Owner", description.getAttrDescriptionAt(1)->getName());
  const auto* const line = dynamic_cast<const DexDrawLineProperties*>(
      description.getDrawProperties(IDexDrawProperties::DRAW_LINE));
  ASSERT_NE(nullptr, line);
  unsigned char width = 0;
  EXPECT_TRUE(line->getWidth(width));
  EXPECT_EQ(3, width);
  EXPECT_EQ(&layer, description.getLayer());
  EXPECT_EQ(L"Fence line", description.getDescCodeName());
  EXPECT_EQ(vyn::ie::CODE_TYPE_LINE, description.getCodeType());
  EXPECT_EQ(vyn::ie::ATTRIB_PROMPT_ALWAYS, description.getAttribPromptType());
  EXPECT_EQ(vyn::ie::DTM_CODE_EXCLUDED, description.getDtmFlag());
}

}  // namespace

// DexAttrDescription

TEST(DexAttrDescription, DefaultConstructionGivesAnUnnamedStringAttribute) {
  const DexAttrDescription attr;
  EXPECT_EQ(DexAttrDescription::ATTR_STRING, attr.getType());
  EXPECT_EQ(0, attr.getType());
  EXPECT_TRUE(attr.getName().IsEmpty());
  EXPECT_EQ(255, attr.getMaxLength());
  EXPECT_EQ(0, attr.getMaxFracLength());
  EXPECT_EQ(0, attr.extraStrings.GetSize());
  EXPECT_EQ(1, attr.extraInt);
  EXPECT_TRUE(attr.extraText1.IsEmpty());
  EXPECT_TRUE(attr.extraText2.IsEmpty());
  EXPECT_TRUE(attr.extraText3.IsEmpty());
}

TEST(DexAttrDescription, ConstructionTakesNameAndType) {
  const DexAttrDescription attr(L"Diameter", DexAttrDescription::ATTR_FLOAT);
  EXPECT_EQ(L"Diameter", attr.getName());
  EXPECT_EQ(3, attr.getType());
  EXPECT_EQ(1, attr.extraInt);
}

TEST(DexAttrDescription, LimitsAndTextFollowTheType) {
  struct Row {
    int type;
    const wchar_t* text;
    int maxLength;
    int attrSize;
  };
  const Row rows[] = {
      {0, L"String", 255, -1}, {1, L"Bool", 10, 4},   {2, L"Integer", 10, 4},
      {3, L"Float", 18, 8},    {4, L"List", 255, -1}, {5, L"Date-Time", 19, -1},
  };
  const dex_test::LogCapture log;
  for (const Row& row : rows) {
    const DexAttrDescription attr(L"a", static_cast<AttrType>(row.type));
    EXPECT_EQ(row.text, attr.getTypeAsString()) << row.type;
    EXPECT_EQ(row.maxLength, attr.getMaxLength()) << row.type;
    EXPECT_EQ(row.attrSize, attr.getAttrSize()) << row.type;
  }
  EXPECT_EQ(0u, log.size());
}

TEST(DexAttrDescription, DateTimeIsNineteenLongAndFloatEightBytes) {
  EXPECT_EQ(19, DexAttrDescription(L"When", DexAttrDescription::ATTR_DATE_TIME).getMaxLength());
  EXPECT_EQ(8, DexAttrDescription(L"Depth", DexAttrDescription::ATTR_FLOAT).getAttrSize());
}

TEST(DexAttrDescription, FractionLengthCountsOnlyForFloats) {
  DexAttrDescription attr(L"Depth", DexAttrDescription::ATTR_FLOAT);
  EXPECT_EQ(18, attr.getMaxFracLength());
  attr.setMaxFracLength(3);
  EXPECT_EQ(3, attr.getMaxFracLength());
  attr.setType(DexAttrDescription::ATTR_INTEGER);
  EXPECT_EQ(0, attr.getMaxFracLength());
}

TEST(DexAttrDescription, MaxLengthFollowsTheTypeAfterSetType) {
  DexAttrDescription attr(L"a", DexAttrDescription::ATTR_STRING);
  attr.setType(DexAttrDescription::ATTR_BOOL);
  EXPECT_EQ(10, attr.getMaxLength());
  EXPECT_EQ(4, attr.getAttrSize());
}

TEST(DexAttrDescription, UnsupportedTypeReadsAsNotSupportedAndLogsItsLength) {
  DexAttrDescription attr;
  for (const int type : {6, -1, 1000}) {
    attr.setType(static_cast<AttrType>(type));
    const dex_test::LogCapture log;
    EXPECT_EQ(L"NotSupported", attr.getTypeAsString());
    EXPECT_EQ(-1, attr.getAttrSize());
    EXPECT_EQ(0, attr.getMaxFracLength());
    EXPECT_EQ(0u, log.size()) << "only the length reports the type";
    EXPECT_EQ(255, attr.getMaxLength());
    ASSERT_EQ(1u, log.size());
    EXPECT_EQ(1, log.count(kSource, detail::kUnsupportedAttrTypeLine));
    EXPECT_TRUE(log.records().front().message.empty());
  }
}

TEST(DexAttrDescription, ConstructionWithUnsupportedTypeReportsOnce) {
  const dex_test::LogCapture log;
  const DexAttrDescription attr(L"a", static_cast<AttrType>(9));
  EXPECT_EQ(9, attr.getType());
  EXPECT_EQ(1, log.count(kSource, detail::kUnsupportedAttrTypeLine));
}

TEST(DexAttrDescription, SetTypeFromStringIgnoresCase) {
  DexAttrDescription attr;
  attr.setTypeFromString(L"float");
  EXPECT_EQ(DexAttrDescription::ATTR_FLOAT, attr.getType());
  attr.setTypeFromString(L"DATE-TIME");
  EXPECT_EQ(DexAttrDescription::ATTR_DATE_TIME, attr.getType());
  attr.setTypeFromString(L"bOoL");
  EXPECT_EQ(DexAttrDescription::ATTR_BOOL, attr.getType());
  attr.setTypeFromString(L"Integer");
  EXPECT_EQ(DexAttrDescription::ATTR_INTEGER, attr.getType());
  attr.setTypeFromString(L"list");
  EXPECT_EQ(DexAttrDescription::ATTR_LIST, attr.getType());
}

TEST(DexAttrDescription, SetTypeFromUnknownTextGivesString) {
  DexAttrDescription attr(L"a", DexAttrDescription::ATTR_FLOAT);
  attr.setTypeFromString(L"Real");
  EXPECT_EQ(DexAttrDescription::ATTR_STRING, attr.getType());
  attr.setType(DexAttrDescription::ATTR_LIST);
  attr.setTypeFromString(L"");
  EXPECT_EQ(DexAttrDescription::ATTR_STRING, attr.getType());
  attr.setType(DexAttrDescription::ATTR_LIST);
  attr.setTypeFromString(L"NotSupported");
  EXPECT_EQ(DexAttrDescription::ATTR_STRING, attr.getType());
  attr.setType(DexAttrDescription::ATTR_LIST);
  attr.setTypeFromString(L" Float");
  EXPECT_EQ(DexAttrDescription::ATTR_STRING, attr.getType());
}

TEST(DexAttrDescription, ResetAllRestoresTheExtrasButKeepsNameTypeAndList) {
  DexAttrDescription attr(L"Kind", DexAttrDescription::ATTR_LIST);
  attr.extraStrings.Add(L"oak");
  attr.extraInt = 0;
  attr.extraText1 = L"x";
  attr.extraText2 = L"y";
  attr.extraText3 = L"z";
  attr.setMaxFracLength(2);
  attr.resetAll();
  EXPECT_EQ(L"Kind", attr.getName());
  EXPECT_EQ(DexAttrDescription::ATTR_LIST, attr.getType());
  EXPECT_EQ(1, attr.extraStrings.GetSize());
  EXPECT_EQ(1, attr.extraInt);
  EXPECT_TRUE(attr.extraText1.IsEmpty());
  EXPECT_TRUE(attr.extraText2.IsEmpty());
  EXPECT_TRUE(attr.extraText3.IsEmpty());
  attr.setType(DexAttrDescription::ATTR_FLOAT);
  EXPECT_EQ(18, attr.getMaxFracLength());
}

TEST(DexAttrDescription, CopiesTakeEveryMember) {
  auto original = std::make_unique<DexAttrDescription>(L"Depth", DexAttrDescription::ATTR_FLOAT);
  original->setMaxFracLength(4);
  original->extraStrings.Add(L"one");
  original->extraInt = 5;
  original->extraText2 = L"two";
  const DexAttrDescription copy(*original);
  DexAttrDescription assigned;
  assigned = *original;
  original.reset();
  for (const DexAttrDescription* attr : {&copy, static_cast<const DexAttrDescription*>(&assigned)}) {
    EXPECT_EQ(L"Depth", attr->getName());
    EXPECT_EQ(DexAttrDescription::ATTR_FLOAT, attr->getType());
    EXPECT_EQ(4, attr->getMaxFracLength());
    ASSERT_EQ(1, attr->extraStrings.GetSize());
    EXPECT_EQ(L"one", attr->extraStrings.GetAt(0));
    EXPECT_EQ(5, attr->extraInt);
    EXPECT_EQ(L"two", attr->extraText2);
  }
}

// DexCodeDescription

TEST(DexCodeDescription, NewDescriptionHasOnlyItsName) {
  const DexCodeDescription description(L"TREE");
  EXPECT_EQ(L"TREE", description.getName());
  EXPECT_EQ(0, description.getSize());
  EXPECT_EQ(nullptr, description.getLayer());
  EXPECT_TRUE(description.getDescCodeName().IsEmpty());
  EXPECT_EQ(3, description.getCodeType());
  EXPECT_EQ(3, description.getAttribPromptType());
  EXPECT_EQ(2, description.getDtmFlag());
  for (int type = 0; type < 3; ++type) {
    EXPECT_EQ(nullptr, description.getDrawProperties(static_cast<IDexDrawProperties::EDexDrawType>(type)));
  }
  EXPECT_FALSE(description.isDrawPropertiesWasDefined());
  EXPECT_TRUE(description.isOnlyCodeNameDefined());
}

TEST(DexCodeDescription, NameIsSetThroughTheNameInterface) {
  DexCodeDescription description(L"A");
  vyn::ie::IDexNameInterface& named = description;
  named.setName(L"B");
  EXPECT_EQ(L"B", named.getName());
  EXPECT_EQ(2, dex_test::vtableEntryOf(&DexCodeDescription::setName).value_or(2));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexCodeDescription::getName).value_or(3));
}

TEST(DexCodeDescription, AnySettingButTheTerrainFlagEndsOnlyCodeNameDefined) {
  const DexLayer layer;
  const auto settings = std::vector<void (*)(DexCodeDescription&, const DexLayer&)>{
      [](DexCodeDescription& d, const DexLayer&) { d.addAttrDescription(new DexAttrDescription()); },
      [](DexCodeDescription& d, const DexLayer&) {
        d.setDrawProperties(IDexDrawProperties::DRAW_AREA, new DexDrawAreaProperties());
      },
      [](DexCodeDescription& d, const DexLayer& l) { d.setLayer(&l); },
      [](DexCodeDescription& d, const DexLayer&) { d.setDescCodeName(L"x"); },
      [](DexCodeDescription& d, const DexLayer&) { d.setCodeType(vyn::ie::CODE_TYPE_POINT); },
      [](DexCodeDescription& d, const DexLayer&) { d.setAttribPromptType(vyn::ie::ATTRIB_PROMPT_NEVER); },
  };
  for (std::size_t i = 0; i < settings.size(); ++i) {
    DexCodeDescription description(L"A");
    settings[i](description, layer);
    EXPECT_FALSE(description.isOnlyCodeNameDefined()) << "setting " << i;
  }
  DexCodeDescription description(L"A");
  description.setDtmFlag(vyn::ie::DTM_CODE_INCLUDED);
  EXPECT_TRUE(description.isOnlyCodeNameDefined());
}

TEST(DexCodeDescription, AnEmptyPropertyObjectCountsAsDefined) {
  DexCodeDescription description(L"A");
  description.setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawPointProperties());
  EXPECT_TRUE(description.isDrawPropertiesWasDefined());
  description.setDrawProperties(IDexDrawProperties::DRAW_POINT, nullptr);
  EXPECT_FALSE(description.isDrawPropertiesWasDefined());
}

TEST(DexCodeDescription, FindsAttrDescriptionsByExactName) {
  DexCodeDescription description(L"A");
  description.addAttrDescription(new DexAttrDescription(L"Height", DexAttrDescription::ATTR_FLOAT));
  description.addAttrDescription(new DexAttrDescription(L"Owner", DexAttrDescription::ATTR_STRING));
  description.addAttrDescription(new DexAttrDescription(L"Height", DexAttrDescription::ATTR_INTEGER));
  const DexCodeDescription& constDescription = description;

  EXPECT_EQ(3, description.getSize());
  EXPECT_EQ(1, description.findAttrDescriptionIndex(L"Owner"));
  EXPECT_EQ(0, description.findAttrDescriptionIndex(L"Height"));
  EXPECT_EQ(description.getAttrDescriptionAt(0), description.findAttrDescription(L"Height"));
  EXPECT_EQ(constDescription.getAttrDescriptionAt(1), constDescription.findAttrDescription(L"Owner"));
  EXPECT_EQ(-1, description.findAttrDescriptionIndex(L"owner"));
  EXPECT_EQ(nullptr, description.findAttrDescription(L"owner"));
  EXPECT_EQ(nullptr, constDescription.findAttrDescription(L""));
}

TEST(DexCodeDescription, AttrDescriptionOutsideTheListIsNull) {
  DexCodeDescription description(L"A");
  description.addAttrDescription(new DexAttrDescription());
  description.addAttrDescription(nullptr);
  EXPECT_EQ(1, description.getSize());
  EXPECT_EQ(nullptr, description.getAttrDescriptionAt(-1));
  EXPECT_EQ(nullptr, description.getAttrDescriptionAt(1));
  EXPECT_EQ(nullptr, std::as_const(description).getAttrDescriptionAt(1));
}

TEST(DexCodeDescription, DrawPropertiesAreKeptPerGeometryKind) {
  DexCodeDescription description(L"A");
  auto* const point = new DexDrawPointProperties();
  auto* const area = new DexDrawAreaProperties();
  description.setDrawProperties(IDexDrawProperties::DRAW_POINT, point);
  description.setDrawProperties(IDexDrawProperties::DRAW_AREA, area);
  EXPECT_EQ(point, description.getDrawProperties(IDexDrawProperties::DRAW_POINT));
  EXPECT_EQ(nullptr, description.getDrawProperties(IDexDrawProperties::DRAW_LINE));
  EXPECT_EQ(area, std::as_const(description).getDrawProperties(IDexDrawProperties::DRAW_AREA));
}

TEST(DexCodeDescription, DrawPropertiesOfTypeOutsideTheTableAreIgnored) {
  DexCodeDescription description(L"A");
  const auto outside = static_cast<IDexDrawProperties::EDexDrawType>(3);
  const auto line = std::make_unique<DexDrawLineProperties>();  // declined: the caller keeps it
  description.setDrawProperties(outside, line.get());
  EXPECT_EQ(nullptr, description.getDrawProperties(outside));
  EXPECT_EQ(nullptr, description.getDrawProperties(static_cast<IDexDrawProperties::EDexDrawType>(-1)));
  EXPECT_FALSE(description.isDrawPropertiesWasDefined());
}

TEST(DexCodeDescription, SettingDrawPropertiesDeletesTheReplacedObject) {
  int deletions = 0;
  DexCodeDescription description(L"A");
  auto* const first = new CountedLineProperties(deletions);
  description.setDrawProperties(IDexDrawProperties::DRAW_LINE, first);
  description.setDrawProperties(IDexDrawProperties::DRAW_LINE, first);
  EXPECT_EQ(0, deletions);
  description.setDrawProperties(IDexDrawProperties::DRAW_LINE, new DexDrawLineProperties());
  EXPECT_EQ(1, deletions);
}

TEST(DexCodeDescription, DestructionDeletesAttrDescriptionsAndPropertiesButNotTheLayer) {
  int attrDeletions = 0;
  int propertyDeletions = 0;
  auto layer = std::make_unique<DexLayer>();
  layer->setName(L"Kept");
  {
    DexCodeDescription description(L"A");
    description.addAttrDescription(new CountedAttrDescription(attrDeletions));
    description.addAttrDescription(new CountedAttrDescription(attrDeletions));
    description.setDrawProperties(IDexDrawProperties::DRAW_LINE,
                                  new CountedLineProperties(propertyDeletions));
    description.setLayer(layer.get());
  }
  EXPECT_EQ(2, attrDeletions);
  EXPECT_EQ(1, propertyDeletions);
  EXPECT_EQ(L"Kept", layer->getName());
}

TEST(DexCodeDescription, CreatesDrawPropertiesFromExactTexts) {
  const std::unique_ptr<IDexDrawProperties> point(
      DexCodeDescription::createDrawPropertiesFromString(L"Point"));
  const std::unique_ptr<IDexDrawProperties> line(DexCodeDescription::createDrawPropertiesFromString(L"Line"));
  const std::unique_ptr<IDexDrawProperties> area(DexCodeDescription::createDrawPropertiesFromString(L"Area"));
  ASSERT_NE(nullptr, point);
  ASSERT_NE(nullptr, line);
  ASSERT_NE(nullptr, area);
  EXPECT_EQ(IDexDrawProperties::DRAW_POINT, point->getType());
  EXPECT_EQ(IDexDrawProperties::DRAW_LINE, line->getType());
  EXPECT_EQ(IDexDrawProperties::DRAW_AREA, area->getType());
  EXPECT_FALSE(point->isDefined());
  EXPECT_EQ(nullptr, DexCodeDescription::createDrawPropertiesFromString(L"point"));
  EXPECT_EQ(nullptr, DexCodeDescription::createDrawPropertiesFromString(L""));
}

TEST(DexCodeDescription, CopyOwnsItsOwnAttributesAndPropertiesAndSharesTheLayer) {
  DexLayer layer;
  auto original = fullDescription(layer);
  const DexAttrDescription* const originalAttr = original->getAttrDescriptionAt(0);
  const IDexDrawProperties* const originalLine = original->getDrawProperties(IDexDrawProperties::DRAW_LINE);
  const DexCodeDescription copy(*original);
  EXPECT_NE(originalAttr, copy.getAttrDescriptionAt(0));
  EXPECT_NE(originalLine, copy.getDrawProperties(IDexDrawProperties::DRAW_LINE));
  original.reset();
  expectFullDescription(copy, layer);
}

TEST(DexCodeDescription, AssignmentReplacesEverythingWithCopies) {
  DexLayer layer;
  int deletions = 0;
  DexCodeDescription target(L"OLD");
  target.addAttrDescription(new CountedAttrDescription(deletions));
  target.setDrawProperties(IDexDrawProperties::DRAW_POINT, new DexDrawPointProperties());
  auto original = fullDescription(layer);
  target = *original;
  EXPECT_EQ(1, deletions);
  EXPECT_EQ(nullptr, target.getDrawProperties(IDexDrawProperties::DRAW_POINT));
  original.reset();
  expectFullDescription(target, layer);
  const DexCodeDescription& self = target;
  target = self;
  expectFullDescription(target, layer);
}

// DexDataDictionary

TEST(DexDataDictionary, FindsDescriptionsByExactName) {
  DexDataDictionary dictionary;
  auto* const tree = new DexCodeDescription(L"TREE");
  EXPECT_TRUE(dictionary.addCodeDescription(tree));
  EXPECT_TRUE(dictionary.addCodeDescription(new DexCodeDescription(L"tree")));
  EXPECT_EQ(2, dictionary.getSize());
  EXPECT_EQ(tree, dictionary.findCodeDiscription(L"TREE"));
  EXPECT_EQ(tree, std::as_const(dictionary).findCodeDiscription(L"TREE"));
  EXPECT_EQ(L"tree", dictionary.findCodeDiscription(L"tree")->getName());
  EXPECT_EQ(nullptr, dictionary.findCodeDiscription(L"Tree"));
  EXPECT_EQ(nullptr, dictionary.findCodeDiscription(L"TREE "));
  EXPECT_EQ(nullptr, std::as_const(dictionary).findCodeDiscription(L""));
}

TEST(DexDataDictionary, AddingANameAlreadyPresentKeepsTheFirstDescription) {
  DexDataDictionary dictionary;
  auto* const first = new DexCodeDescription(L"CP");
  first->setDescCodeName(L"first");
  ASSERT_TRUE(dictionary.addCodeDescription(first));
  auto second = std::make_unique<DexCodeDescription>(L"CP");
  second->setDescCodeName(L"second");
  EXPECT_FALSE(dictionary.addCodeDescription(second.get()));  // declined: the caller keeps it
  EXPECT_EQ(1, dictionary.getSize());
  EXPECT_EQ(first, dictionary.findCodeDiscription(L"CP"));
  EXPECT_EQ(L"first", dictionary.findCodeDiscription(L"CP")->getDescCodeName());
}

TEST(DexDataDictionary, DeclinesNull) {
  DexDataDictionary dictionary;
  EXPECT_FALSE(dictionary.addCodeDescription(nullptr));
  EXPECT_EQ(0, dictionary.getSize());
}

TEST(DexDataDictionary, AddingAHeldDescriptionAgainChangesNothing) {
  int deletions = 0;
  {
    DexDataDictionary dictionary;
    auto* const description = new CountedCodeDescription(L"A", deletions);
    ASSERT_TRUE(dictionary.addCodeDescription(description));
    EXPECT_TRUE(dictionary.addCodeDescription(description));
    EXPECT_EQ(1, dictionary.getSize());
  }
  EXPECT_EQ(1, deletions);
}

TEST(DexDataDictionary, WalksDescriptionsInExactNameOrder) {
  DexDataDictionary dictionary;
  for (const wchar_t* name : {L"B", L"a", L"A", L"10", L"2", L"Ab"}) {
    dictionary.addCodeDescription(new DexCodeDescription(name));
  }
  dictionary.reset();
  EXPECT_EQ((std::vector<std::wstring>{L"10", L"2", L"A", L"Ab", L"B", L"a"}), readNames(dictionary));
  EXPECT_EQ(nullptr, dictionary.getNextCodeDescription());
  dictionary.reset();
  EXPECT_EQ(L"10", dictionary.getNextCodeDescription()->getName());
}

TEST(DexDataDictionary, ANewDictionaryReadsFromItsFirstDescription) {
  DexDataDictionary dictionary;
  EXPECT_EQ(nullptr, dictionary.getNextCodeDescription());
  DexDataDictionary filled;
  filled.addCodeDescription(new DexCodeDescription(L"Z"));
  filled.addCodeDescription(new DexCodeDescription(L"M"));
  EXPECT_EQ((std::vector<std::wstring>{L"M", L"Z"}), readNames(filled));
}

TEST(DexDataDictionary, AConstDictionaryCanBeWalkedAgain) {
  DexDataDictionary dictionary;
  dictionary.addCodeDescription(new DexCodeDescription(L"B"));
  dictionary.addCodeDescription(new DexCodeDescription(L"A"));
  const DexDataDictionary& constDictionary = dictionary;
  EXPECT_EQ((std::vector<std::wstring>{L"A", L"B"}), readNames(constDictionary));
  constDictionary.reset();
  EXPECT_EQ((std::vector<std::wstring>{L"A", L"B"}), readNames(constDictionary));
}

TEST(DexDataDictionary, ResetSeesDescriptionsAddedBeforeTheFirst) {
  DexDataDictionary dictionary;
  dictionary.addCodeDescription(new DexCodeDescription(L"M"));
  dictionary.reset();
  dictionary.addCodeDescription(new DexCodeDescription(L"A"));
  EXPECT_EQ((std::vector<std::wstring>{L"A", L"M"}), readNames(dictionary));
}

TEST(DexDataDictionary, FiledUnderTheNameItWasAddedWith) {
  DexDataDictionary dictionary;
  auto* const description = new DexCodeDescription(L"OLD");
  dictionary.addCodeDescription(description);
  description->setName(L"NEW");
  EXPECT_EQ(description, dictionary.findCodeDiscription(L"OLD"));
  EXPECT_EQ(nullptr, dictionary.findCodeDiscription(L"NEW"));
}

TEST(DexDataDictionary, DestructionDeletesEveryDescription) {
  int deletions = 0;
  {
    DexDataDictionary dictionary;
    dictionary.addCodeDescription(new CountedCodeDescription(L"A", deletions));
    dictionary.addCodeDescription(new CountedCodeDescription(L"B", deletions));
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexDataDictionary, CopyDuplicatesEveryDescription) {
  DexLayer layer;
  auto original = std::make_unique<DexDataDictionary>();
  original->addCodeDescription(fullDescription(layer).release());
  original->addCodeDescription(new DexCodeDescription(L"A"));
  original->getNextCodeDescription();  // the copy's cursor does not follow the original's
  const DexCodeDescription* const originalFence = original->findCodeDiscription(L"FENCE");
  const DexDataDictionary copy(*original);
  EXPECT_NE(originalFence, copy.findCodeDiscription(L"FENCE"));
  original.reset();
  EXPECT_EQ(2, copy.getSize());
  expectFullDescription(*copy.findCodeDiscription(L"FENCE"), layer);
  EXPECT_EQ((std::vector<std::wstring>{L"A", L"FENCE"}), readNames(copy));
}

TEST(DexDataDictionary, AssignmentReplacesTheDescriptionsWithCopies) {
  int deletions = 0;
  DexDataDictionary target;
  target.addCodeDescription(new CountedCodeDescription(L"OLD", deletions));
  target.getNextCodeDescription();
  auto source = std::make_unique<DexDataDictionary>();
  source->addCodeDescription(new DexCodeDescription(L"B"));
  source->addCodeDescription(new DexCodeDescription(L"C"));
  target = *source;
  EXPECT_EQ(1, deletions);
  source.reset();
  EXPECT_EQ(nullptr, target.findCodeDiscription(L"OLD"));
  EXPECT_EQ((std::vector<std::wstring>{L"B", L"C"}), readNames(target));
  const DexDataDictionary& self = target;
  target = self;
  EXPECT_EQ(2, target.getSize());
}
