#include "ieObjects/IECodesDataInterface.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <string>
#include <utility>

#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/detail/CodesDataInterfaceLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using vyn::ie::DexAttrDescription;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexCodesDataInterface;
using vyn::ie::DexCodeValues;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kCodesDataInterfaceLogSource;

// Counts deletions so that ownership rules become visible.
class CountedCodeValues : public DexCodeValues {
 public:
  CountedCodeValues(const DexCodeDescription* description, int& deletions)
      : DexCodeValues(description), deletions_(deletions) {}
  ~CountedCodeValues() override { ++deletions_; }

 private:
  int& deletions_;
};

// A description with attributes of the given names, all of type String.
std::unique_ptr<DexCodeDescription> describe(const wchar_t* name,
                                             std::initializer_list<const wchar_t*> attrs = {}) {
  auto description = std::make_unique<DexCodeDescription>(name);
  for (const wchar_t* attr : attrs) {
    description->addAttrDescription(new DexAttrDescription(attr, DexAttrDescription::ATTR_STRING));
  }
  return description;
}

// A new code value of description with the given code strings; the caller owns it.
DexCodeValues* codeOf(const DexCodeDescription& description,
                      std::initializer_list<const wchar_t*> codeStrings = {}) {
  auto* const code = new DexCodeValues(&description);
  for (const wchar_t* codeString : codeStrings)
    code->addCodeString(codeString);
  return code;
}

// A code value with something in every field, for the copy tests.
DexCodeValues* fullCode(const DexCodeDescription& description) {
  auto* const code = codeOf(description, {L"7", L"8"});
  code->addAttr(L"2.5");
  code->addAttr(L"oak");
  code->setControlCode(DexCodeValues::FIRST_CONTROL_CODE, L"AS");
  code->setControlCode(DexCodeValues::THIRD_CONTROL_CODE, L"C");
  return code;
}

void expectFullCode(const DexCodeValues& code, const DexCodeDescription& description) {
  EXPECT_EQ(&description, code.getDescription());
  ASSERT_EQ(2, code.getNumberOfAttrs());
  EXPECT_EQ(L"2.5", code.getAttrAt(0));
  EXPECT_EQ(L"oak", code.getAttrAt(1));
  ASSERT_EQ(2, code.getNumberOfTheCodeStrings());
  EXPECT_EQ(L"7", code.getCodeStringAt(0));
  EXPECT_EQ(L"8", code.getCodeStringAt(1));
  EXPECT_EQ(L"AS", code.getControlCode(DexCodeValues::FIRST_CONTROL_CODE));
  EXPECT_EQ(L"", code.getControlCode(DexCodeValues::SECOND_CONTROL_CODE));
  EXPECT_EQ(L"C", code.getControlCode(DexCodeValues::THIRD_CONTROL_CODE));
}

}  // namespace

// DexCodeValues

TEST(DexCodeValues, NewValueHoldsOnlyItsDescription) {
  const auto description = describe(L"A", {L"h"});
  const DexCodeValues code(description.get());
  EXPECT_EQ(description.get(), code.getDescription());
  EXPECT_EQ(0, code.getNumberOfAttrs());
  EXPECT_EQ(0, code.getNumberOfTheCodeStrings());
  for (int place = 0; place < 3; ++place) {
    EXPECT_TRUE(code.getControlCode(static_cast<DexCodeValues::ECodeControlCode>(place)).IsEmpty());
  }
}

TEST(DexCodeValues, AttributeValuesAreReadByPosition) {
  DexCodeValues code(nullptr);
  code.addAttr(L"1");
  code.addAttr(L"");
  code.addAttr(L"3");
  EXPECT_EQ(3, code.getNumberOfAttrs());
  EXPECT_EQ(L"1", code.getAttrAt(0));
  EXPECT_EQ(L"3", code.getAttrAt(2));
  EXPECT_EQ(L"", code.getAttrAt(3));
  EXPECT_EQ(L"", code.getAttrAt(-1));
}

TEST(DexCodeValues, InsertAttrFillsTheGapUpToTheAttributeIndex) {
  const auto description = describe(L"A", {L"a0", L"a1", L"a2", L"a3"});
  DexCodeValues code(description.get());
  code.addAttr(L"first");
  code.insertAttr(L"a3", L"fourth");
  ASSERT_EQ(4, code.getNumberOfAttrs());
  EXPECT_EQ(L"first", code.getAttrAt(0));
  EXPECT_EQ(L"", code.getAttrAt(1));
  EXPECT_EQ(L"", code.getAttrAt(2));
  EXPECT_EQ(L"fourth", code.getAttrAt(3));
  EXPECT_EQ(4, description->getSize());
}

TEST(DexCodeValues, InsertAttrReplacesTheValueOfAKnownAttribute) {
  const auto description = describe(L"A", {L"a0", L"a1"});
  DexCodeValues code(description.get());
  code.addAttr(L"x");
  code.addAttr(L"y");
  code.addAttr(L"z");
  code.insertAttr(L"a1", L"new");
  EXPECT_EQ(3, code.getNumberOfAttrs());
  EXPECT_EQ(L"x", code.getAttrAt(0));
  EXPECT_EQ(L"new", code.getAttrAt(1));
  EXPECT_EQ(L"z", code.getAttrAt(2));
}

TEST(DexCodeValues, InsertAttrOfANewNameAddsAStringAttributeToTheSharedDescription) {
  const auto description = describe(L"TREE", {L"Height"});
  DexCodeValues first(description.get());
  DexCodeValues second(description.get());
  second.addAttr(L"12");
  first.insertAttr(L"Species", L"oak");

  ASSERT_EQ(2, description->getSize());
  const DexAttrDescription* const added = description->getAttrDescriptionAt(1);
  EXPECT_EQ(L"Species", added->getName());
  EXPECT_EQ(DexAttrDescription::ATTR_STRING, added->getType());
  EXPECT_EQ(2, first.getNumberOfAttrs());
  EXPECT_EQ(L"oak", first.getAttrAt(1));

  CVynStringT<wchar_t> value(L"untouched");
  EXPECT_TRUE(second.getAttrByName(L"Species", value));
  EXPECT_TRUE(value.IsEmpty());
  EXPECT_EQ(L"12", second.getAttrByName(L"Height"));
}

TEST(DexCodeValues, InsertAttrMatchesNamesExactly) {
  const auto description = describe(L"A", {L"Height"});
  DexCodeValues code(description.get());
  code.insertAttr(L"height", L"1");
  EXPECT_EQ(2, description->getSize());
  EXPECT_EQ(L"1", code.getAttrAt(1));
}

TEST(DexCodeValues, InsertAttrWithoutDescriptionDoesNothing) {
  DexCodeValues code(nullptr);
  code.addAttr(L"kept");
  code.insertAttr(L"Height", L"1");
  EXPECT_EQ(1, code.getNumberOfAttrs());
  EXPECT_EQ(L"kept", code.getAttrAt(0));
}

TEST(DexCodeValues, GetAttrByNameAnswersWhetherTheAttributeIsDescribed) {
  const auto description = describe(L"A", {L"a0", L"a1", L"a2"});
  DexCodeValues code(description.get());
  code.addAttr(L"v0");
  code.addAttr(L"v1");

  CVynStringT<wchar_t> value(L"untouched");
  EXPECT_FALSE(code.getAttrByName(L"A1", value));
  EXPECT_EQ(L"untouched", value);
  EXPECT_TRUE(code.getAttrByName(L"a1", value));
  EXPECT_EQ(L"v1", value);
  EXPECT_TRUE(code.getAttrByName(L"a2", value));
  EXPECT_EQ(L"", value);

  EXPECT_EQ(L"v0", code.getAttrByName(L"a0"));
  EXPECT_EQ(L"", code.getAttrByName(L"missing"));
}

TEST(DexCodeValues, GetAttrByNameWithoutDescriptionFindsNothing) {
  DexCodeValues code(nullptr);
  code.addAttr(L"v0");
  CVynStringT<wchar_t> value(L"untouched");
  EXPECT_FALSE(code.getAttrByName(L"a0", value));
  EXPECT_EQ(L"untouched", value);
  EXPECT_EQ(L"", code.getAttrByName(L"a0"));
}

TEST(DexCodeValues, CodeStringsAreReadByPosition) {
  const dex_test::LogCapture log;
  DexCodeValues code(nullptr);
  code.addCodeString(L"1");
  code.addCodeString(L"2");
  EXPECT_EQ(2, code.getNumberOfTheCodeStrings());
  EXPECT_EQ(L"1", code.getCodeStringAt(0));
  EXPECT_EQ(L"2", code.getCodeStringAt(1));
  EXPECT_EQ(0u, log.size());
}

TEST(DexCodeValues, CodeStringOutsideTheListIsEmptyAndLogged) {
  DexCodeValues code(nullptr);
  code.addCodeString(L"1");
  const dex_test::LogCapture log;
  EXPECT_EQ(L"", code.getCodeStringAt(1));
  EXPECT_EQ(L"", code.getCodeStringAt(-1));
  EXPECT_EQ(2, log.count(kSource, detail::kCodeStringIndexLine));
  ASSERT_EQ(2u, log.size());
  EXPECT_TRUE(log.records().front().message.empty());
}

TEST(DexCodeValues, ControlCodesAreKeptInThreePlaces) {
  DexCodeValues code(nullptr);
  code.setControlCode(DexCodeValues::FIRST_CONTROL_CODE, L"AS");
  code.setControlCode(DexCodeValues::SECOND_CONTROL_CODE, L"R");
  code.setControlCode(DexCodeValues::THIRD_CONTROL_CODE, L"END_LINE");
  EXPECT_EQ(L"AS", code.getControlCode(static_cast<DexCodeValues::ECodeControlCode>(0)));
  EXPECT_EQ(L"R", code.getControlCode(static_cast<DexCodeValues::ECodeControlCode>(1)));
  EXPECT_EQ(L"END_LINE", code.getControlCode(static_cast<DexCodeValues::ECodeControlCode>(2)));
}

TEST(DexCodeValues, ControlCodePlacesOutsideTheThreeAreIgnored) {
  DexCodeValues code(nullptr);
  code.setControlCode(DexCodeValues::FIRST_CONTROL_CODE, L"AS");
  for (const int place : {-1, 3}) {
    const auto outside = static_cast<DexCodeValues::ECodeControlCode>(place);
    code.setControlCode(outside, L"X");
    EXPECT_EQ(L"", code.getControlCode(outside));
  }
  EXPECT_FALSE(code.doesCodeHasControlCode(L"X"));
  EXPECT_EQ(L"AS", code.getControlCode(DexCodeValues::FIRST_CONTROL_CODE));
}

TEST(DexCodeValues, HasAControlCodeThatEqualsOneOfTheThree) {
  DexCodeValues code(nullptr);
  code.setControlCode(DexCodeValues::FIRST_CONTROL_CODE, L"AS");
  code.setControlCode(DexCodeValues::SECOND_CONTROL_CODE, L"R");
  code.setControlCode(DexCodeValues::THIRD_CONTROL_CODE, L"C");
  EXPECT_TRUE(code.doesCodeHasControlCode(L"AS"));
  EXPECT_TRUE(code.doesCodeHasControlCode(L"R"));
  EXPECT_TRUE(code.doesCodeHasControlCode(L"C"));
  EXPECT_FALSE(code.doesCodeHasControlCode(L"as"));
  EXPECT_FALSE(code.doesCodeHasControlCode(L"A"));
  EXPECT_FALSE(code.doesCodeHasControlCode(L""));
}

// A code without control codes answers as one whose three places are empty, also through copies.
TEST(DexCodeValues, ACodeWithoutControlCodesHasThreeEmptyPlaces) {
  DexCodeValues bare(nullptr);
  bare.setControlCode(DexCodeValues::SECOND_CONTROL_CODE, L"");
  EXPECT_TRUE(bare.doesCodeHasControlCode(L""));
  EXPECT_FALSE(bare.doesCodeHasControlCode(L"AS"));
  EXPECT_EQ(L"", bare.getControlCode(DexCodeValues::THIRD_CONTROL_CODE));

  DexCodeValues marked(nullptr);
  marked.setControlCode(DexCodeValues::THIRD_CONTROL_CODE, L"AE");
  DexCodeValues copy(marked);
  marked.setControlCode(DexCodeValues::THIRD_CONTROL_CODE, L"R");
  EXPECT_EQ(L"AE", copy.getControlCode(DexCodeValues::THIRD_CONTROL_CODE));
  EXPECT_TRUE(copy.doesCodeHasControlCode(L""));
  copy = bare;
  EXPECT_FALSE(copy.doesCodeHasControlCode(L"AE"));
  EXPECT_EQ(L"R", marked.getControlCode(DexCodeValues::THIRD_CONTROL_CODE));
}

TEST(DexCodeValues, AnEmptyControlCodeMatchesAnEmptyPlace) {
  DexCodeValues code(nullptr);
  code.setControlCode(DexCodeValues::FIRST_CONTROL_CODE, L"AS");
  EXPECT_TRUE(code.doesCodeHasControlCode(L""));
}

TEST(DexCodeValues, CopiesReferToTheSameDescriptionAndOwnTheirValues) {
  const auto description = describe(L"TREE", {L"Height", L"Species"});
  auto original = std::unique_ptr<DexCodeValues>(fullCode(*description));
  const DexCodeValues copy(*original);
  const auto other = describe(L"OTHER");
  DexCodeValues assigned(other.get());
  assigned.addAttr(L"gone");
  assigned.addCodeString(L"gone");
  assigned.setControlCode(DexCodeValues::SECOND_CONTROL_CODE, L"gone");
  assigned = *original;
  original->addAttr(L"later");
  original->setControlCode(DexCodeValues::FIRST_CONTROL_CODE, L"AE");
  original.reset();
  expectFullCode(copy, *description);
  expectFullCode(assigned, *description);
}

// DexCodesDataInterface

TEST(DexCodesDataInterface, CodesAreKeptInOrderAndMayRepeat) {
  const auto a = describe(L"A");
  DexCodesDataInterface codes;
  EXPECT_EQ(0, codes.getNumberOfCodes());
  auto* const first = codeOf(*a);
  auto* const second = codeOf(*a);
  codes.addCode(first);
  codes.addCode(second);
  codes.addCode(nullptr);
  EXPECT_EQ(2, codes.getNumberOfCodes());
  EXPECT_EQ(first, codes.getCode(0));
  EXPECT_EQ(second, std::as_const(codes).getCode(1));
}

TEST(DexCodesDataInterface, CodeOutsideTheListIsNull) {
  const auto a = describe(L"A");
  DexCodesDataInterface codes;
  codes.addCode(codeOf(*a));
  EXPECT_EQ(nullptr, codes.getCode(-1));
  EXPECT_EQ(nullptr, codes.getCode(1));
  EXPECT_EQ(nullptr, std::as_const(codes).getCode(1));
}

TEST(DexCodesDataInterface, FindCodeMatchesCodeStringsOnlyWhenAsked) {
  const auto other = describe(L"X");
  const auto cp = describe(L"CP");
  DexCodesDataInterface codes;
  codes.addCode(codeOf(*other, {L"CP2"}));
  auto* const code = codeOf(*cp, {L"1", L"2"});
  codes.addCode(code);

  EXPECT_EQ(code, codes.findCode(L"CP2", true));
  EXPECT_EQ(code, codes.findCode(L"CP1", true));
  EXPECT_EQ(nullptr, codes.findCode(L"CP2", false));
  EXPECT_EQ(nullptr, codes.findCode(L"CP2"));
  EXPECT_EQ(code, codes.findCode(L"CP", true));
  EXPECT_EQ(code, codes.findCode(L"CP", false));
  EXPECT_EQ(nullptr, codes.findCode(L"CP3", true));
  EXPECT_EQ(nullptr, codes.findCode(L"cp2", true));
  EXPECT_EQ(nullptr, codes.findCode(L"2", true)) << "a code string alone is not a name";
}

TEST(DexCodesDataInterface, FindCodeAnswersTheFirstMatchingCode) {
  const auto cp = describe(L"CP");
  const auto cp2 = describe(L"CP2");
  DexCodesDataInterface codes;
  auto* const plain = codeOf(*cp2);
  auto* const withString = codeOf(*cp, {L"2"});
  codes.addCode(plain);
  codes.addCode(withString);
  codes.addCode(codeOf(*cp2));
  EXPECT_EQ(plain, codes.findCode(L"CP2", true));
  EXPECT_EQ(plain, codes.findCode(L"CP2", false));

  DexCodesDataInterface reversed;
  auto* const first = codeOf(*cp, {L"2"});
  reversed.addCode(first);
  reversed.addCode(codeOf(*cp2));
  EXPECT_EQ(first, reversed.findCode(L"CP2", true));
  EXPECT_EQ(reversed.getCode(1), reversed.findCode(L"CP2", false));
}

TEST(DexCodesDataInterface, CodesWithoutDescriptionMatchNoName) {
  const auto a = describe(L"A");
  DexCodesDataInterface codes;
  auto* const orphan = new DexCodeValues(nullptr);
  orphan->addCodeString(L"A");
  codes.addCode(orphan);
  codes.addCode(codeOf(*a));
  EXPECT_EQ(codes.getCode(1), codes.findCode(L"A", true));
  EXPECT_EQ(nullptr, codes.findCode(L"", true));
  EXPECT_EQ(1, codes.getCodePos(L"A"));
  EXPECT_EQ(-1, codes.getCodePos(L""));
  EXPECT_FALSE(codes.removeCode(L""));
  EXPECT_EQ(2, codes.getNumberOfCodes());
}

TEST(DexCodesDataInterface, CodePosIsTheIndexOfTheFirstCodeOfThatName) {
  const auto a = describe(L"A");
  const auto b = describe(L"B");
  DexCodesDataInterface codes;
  codes.addCode(codeOf(*a));
  codes.addCode(codeOf(*b, {L"1"}));
  codes.addCode(codeOf(*b));
  EXPECT_EQ(0, codes.getCodePos(L"A"));
  EXPECT_EQ(1, codes.getCodePos(L"B"));
  EXPECT_EQ(-1, codes.getCodePos(L"B1"));
  EXPECT_EQ(-1, codes.getCodePos(L"b"));
}

TEST(DexCodesDataInterface, CodeAttrValueReadsTheFirstCodeOfThatName) {
  const auto tree = describe(L"TREE", {L"Height", L"Species"});
  DexCodesDataInterface codes;
  auto* const first = codeOf(*tree, {L"1"});
  first->addAttr(L"12");
  first->addAttr(L"oak");
  auto* const second = codeOf(*tree);
  second->addAttr(L"3");
  codes.addCode(first);
  codes.addCode(second);
  EXPECT_EQ(L"oak", codes.getCodeAttrValue(L"TREE", L"Species"));
  EXPECT_EQ(L"12", codes.getCodeAttrValue(L"TREE", L"Height"));
  EXPECT_EQ(L"", codes.getCodeAttrValue(L"TREE", L"Girth"));
  EXPECT_EQ(L"", codes.getCodeAttrValue(L"TREE1", L"Height")) << "code strings are not considered";
  EXPECT_EQ(L"", codes.getCodeAttrValue(L"BUSH", L"Height"));
}

TEST(DexCodesDataInterface, RemoveCodeDeletesTheFirstCodeOfThatName) {
  const auto a = describe(L"A");
  const auto b = describe(L"B");
  int deletions = 0;
  DexCodesDataInterface codes;
  codes.addCode(new CountedCodeValues(a.get(), deletions));
  auto* const firstB = new CountedCodeValues(b.get(), deletions);
  firstB->addCodeString(L"first");
  codes.addCode(firstB);
  auto* const secondB = new CountedCodeValues(b.get(), deletions);
  codes.addCode(secondB);

  EXPECT_TRUE(codes.removeCode(L"B"));
  EXPECT_EQ(1, deletions);
  ASSERT_EQ(2, codes.getNumberOfCodes());
  EXPECT_EQ(secondB, codes.getCode(1));
  EXPECT_FALSE(codes.removeCode(L"C"));
  EXPECT_FALSE(codes.removeCode(L"a"));
  EXPECT_EQ(1, deletions);
}

TEST(DexCodesDataInterface, RemoveAllCodesDeletesEveryCode) {
  const auto a = describe(L"A");
  int deletions = 0;
  DexCodesDataInterface codes;
  codes.addCode(new CountedCodeValues(a.get(), deletions));
  codes.addCode(new CountedCodeValues(a.get(), deletions));
  codes.removeAllCodes();
  EXPECT_EQ(2, deletions);
  EXPECT_EQ(0, codes.getNumberOfCodes());
}

TEST(DexCodesDataInterface, DestructionDeletesEveryCodeButNoDescription) {
  const auto a = describe(L"A", {L"h"});
  int deletions = 0;
  {
    DexCodesDataInterface codes;
    codes.addCode(new CountedCodeValues(a.get(), deletions));
    codes.addCode(new CountedCodeValues(a.get(), deletions));
  }
  EXPECT_EQ(2, deletions);
  EXPECT_EQ(1, a->getSize());
}

TEST(DexCodesDataInterface, CopyCodesDataAppendsCopiesToTheTarget) {
  const auto tree = describe(L"TREE", {L"Height", L"Species"});
  const auto a = describe(L"A");
  auto source = std::make_unique<DexCodesDataInterface>();
  source->addCode(fullCode(*tree));
  source->addCode(codeOf(*a));
  DexCodesDataInterface target;
  auto* const own = codeOf(*a);
  target.addCode(own);

  source->copyCodesData(&target);
  ASSERT_EQ(3, target.getNumberOfCodes());
  EXPECT_EQ(own, target.getCode(0));
  EXPECT_NE(source->getCode(0), target.getCode(1));
  source.reset();
  expectFullCode(*target.getCode(1), *tree);
  EXPECT_EQ(a.get(), target.getCode(2)->getDescription());
}

TEST(DexCodesDataInterface, CopyCodesDataToNullDoesNothing) {
  const auto a = describe(L"A");
  DexCodesDataInterface codes;
  codes.addCode(codeOf(*a));
  codes.copyCodesData(nullptr);
  EXPECT_EQ(1, codes.getNumberOfCodes());
}

TEST(DexCodesDataInterface, CopyCodesDataIntoItselfDoublesTheCodes) {
  const auto a = describe(L"A");
  const auto b = describe(L"B");
  DexCodesDataInterface codes;
  codes.addCode(codeOf(*a));
  codes.addCode(codeOf(*b));
  codes.copyCodesData(&codes);
  ASSERT_EQ(4, codes.getNumberOfCodes());
  EXPECT_EQ(a.get(), codes.getCode(2)->getDescription());
  EXPECT_EQ(b.get(), codes.getCode(3)->getDescription());
  EXPECT_NE(codes.getCode(0), codes.getCode(2));
}

TEST(DexCodesDataInterface, CopyOwnsItsOwnCodes) {
  const auto tree = describe(L"TREE", {L"Height", L"Species"});
  auto original = std::make_unique<DexCodesDataInterface>();
  original->addCode(fullCode(*tree));
  const DexCodesDataInterface copy(*original);
  ASSERT_EQ(1, copy.getNumberOfCodes());
  EXPECT_NE(original->getCode(0), copy.getCode(0));
  original.reset();
  expectFullCode(*copy.getCode(0), *tree);
}

TEST(DexCodesDataInterface, AssignmentReplacesTheCodesWithCopies) {
  const auto tree = describe(L"TREE", {L"Height", L"Species"});
  int deletions = 0;
  DexCodesDataInterface target;
  target.addCode(new CountedCodeValues(tree.get(), deletions));
  auto source = std::make_unique<DexCodesDataInterface>();
  source->addCode(fullCode(*tree));
  target = *source;
  EXPECT_EQ(1, deletions);
  source.reset();
  ASSERT_EQ(1, target.getNumberOfCodes());
  expectFullCode(*target.getCode(0), *tree);
  const DexCodesDataInterface& self = target;
  target = self;
  EXPECT_EQ(1, target.getNumberOfCodes());
}
