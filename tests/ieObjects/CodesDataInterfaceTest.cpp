#include "ieObjects/IECodesDataInterface.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <string>
#include <utility>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/detail/CodesDataInterfaceLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/Rows.h"

namespace {

using namespace vyn::ie;
using objects_test::codeOf;
using objects_test::Counted;
namespace detail = vyn::ie::detail;

constexpr auto kFirst = DexCodeValues::FIRST_CONTROL_CODE;
constexpr auto kSecond = DexCodeValues::SECOND_CONTROL_CODE;
constexpr auto kThird = DexCodeValues::THIRD_CONTROL_CODE;

// A description with attributes of the given names, all of type String.
std::unique_ptr<DexCodeDescription> describe(const wchar_t* name,
                                             std::initializer_list<const wchar_t*> attrs = {}) {
  auto description = std::make_unique<DexCodeDescription>(name);
  for (const wchar_t* attr : attrs)
    description->addAttrDescription(new DexAttrDescription(attr, DexAttrDescription::ATTR_STRING));
  return description;
}

// A code value with something in every field, for the copy tests.
DexCodeValues* fullCode(const DexCodeDescription& description) {
  auto* const code = codeOf(&description, {L"7", L"8"});
  code->addAttr(L"2.5");
  code->addAttr(L"oak");
  code->setControlCode(kFirst, L"AS");
  code->setControlCode(kThird, L"C");
  return code;
}

void expectFullCode(const DexCodeValues& code, const DexCodeDescription& description) {
  ASSERT_TRUE(code.getNumberOfAttrs() == 2 && code.getNumberOfTheCodeStrings() == 2);
  EXPECT_TRUE(code.getDescription() == &description && code.getAttrAt(0) == L"2.5" &&
              code.getAttrAt(1) == L"oak" && code.getCodeStringAt(0) == L"7" &&
              code.getCodeStringAt(1) == L"8" && code.getControlCode(kFirst) == L"AS" &&
              code.getControlCode(kSecond) == L"" && code.getControlCode(kThird) == L"C");
}

TEST(DexCodeValues, AttributesAreReadByPositionOrByTheDescriptionsName) {
  const auto description = describe(L"A", {L"a0", L"a1", L"a2", L"a3"});
  DexCodeValues code(description.get());
  EXPECT_TRUE(code.getNumberOfAttrs() == 0 && code.getNumberOfTheCodeStrings() == 0 &&
              code.getControlCode(kFirst).IsEmpty() && code.getControlCode(kThird).IsEmpty());
  code.addAttr(L"v0");
  code.addAttr(L"v1");
  code.addAttr(L"");
  CVynStringT<wchar_t> value(L"untouched");
  EXPECT_FALSE(code.getAttrByName(L"A1", value));
  EXPECT_EQ(L"untouched", value);
  EXPECT_TRUE(code.getAttrByName(L"a1", value) && value == L"v1");
  EXPECT_TRUE(code.getAttrByName(L"a3", value) && value == L"");
  const std::pair<CVynStringT<wchar_t>, const wchar_t*> rows[] = {{code.getAttrAt(0), L"v0"},
                                                                  {code.getAttrAt(3), L""},
                                                                  {code.getAttrAt(-1), L""},
                                                                  {code.getAttrByName(L"a0"), L"v0"},
                                                                  {code.getAttrByName(L"x"), L""}};
  dex_test::expectRows(rows);
  DexCodeValues orphan(nullptr);  // without a description no name is known
  orphan.addAttr(L"kept");
  orphan.insertAttr(L"a0", L"1");
  EXPECT_TRUE(!orphan.getAttrByName(L"a0", value) && orphan.getAttrByName(L"a0") == L"" &&
              orphan.getNumberOfAttrs() == 1);
}

TEST(DexCodeValues, InsertAttrFillsTheGapReplacesAKnownValueOrAddsAStringAttribute) {
  const auto description = describe(L"TREE", {L"a0", L"a1", L"a2", L"a3"});
  DexCodeValues code(description.get());
  DexCodeValues other(description.get());
  other.addAttr(L"12");
  code.addAttr(L"first");
  code.insertAttr(L"a3", L"fourth");
  EXPECT_TRUE(code.getNumberOfAttrs() == 4 && code.getAttrAt(1) == L"" && code.getAttrAt(3) == L"fourth");
  code.insertAttr(L"a1", L"new");
  EXPECT_TRUE(code.getNumberOfAttrs() == 4 && code.getAttrAt(1) == L"new");
  code.insertAttr(L"A3", L"oak");  // names match exactly: a new attribute of the shared description
  ASSERT_EQ(5, description->getSize());
  EXPECT_TRUE(description->getAttrDescriptionAt(4)->getName() == L"A3" &&
              description->getAttrDescriptionAt(4)->getType() == DexAttrDescription::ATTR_STRING);
  EXPECT_EQ(L"oak", code.getAttrAt(4));
  CVynStringT<wchar_t> value(L"untouched");
  EXPECT_TRUE(other.getAttrByName(L"A3", value) && value.IsEmpty());
}

TEST(DexCodeValues, CodeStringsOutsideTheListAreEmptyAndLogged) {
  DexCodeValues code(nullptr);
  code.addCodeString(L"1");
  code.addCodeString(L"2");
  const dex_test::LogCapture log;
  EXPECT_TRUE(code.getNumberOfTheCodeStrings() == 2 && code.getCodeStringAt(1) == L"2");
  EXPECT_EQ(0u, log.size());
  EXPECT_TRUE(code.getCodeStringAt(2) == L"" && code.getCodeStringAt(-1) == L"");
  ASSERT_EQ(2, log.count(detail::kCodesDataInterfaceLogSource, detail::kCodeStringIndexLine));
  EXPECT_TRUE(log.size() == 2u && log.records().front().message.empty());
}

TEST(DexCodeValues, ControlCodesAreKeptInThreePlacesAndCopied) {
  DexCodeValues code(nullptr);
  EXPECT_TRUE(code.doesCodeHasControlCode(L""));  // three empty places
  code.setControlCode(kFirst, L"AS");
  code.setControlCode(kSecond, L"R");
  for (const int place : {-1, 3}) {  // places outside the three are ignored
    code.setControlCode(static_cast<DexCodeValues::ECodeControlCode>(place), L"X");
    EXPECT_EQ(L"", code.getControlCode(static_cast<DexCodeValues::ECodeControlCode>(place)));
  }
  EXPECT_TRUE(code.getControlCode(kFirst) == L"AS" && code.getControlCode(kSecond) == L"R");
  const std::pair<const wchar_t*, bool> rows[] = {{L"AS", true}, {L"R", true},  {L"", true},  {L"as", false},
                                                  {L"A", false}, {L"X", false}, {L"C", false}};
  for (const auto& [control, has] : rows)
    EXPECT_EQ(has, code.doesCodeHasControlCode(control)) << control;
  code.setControlCode(kThird, L"C");
  EXPECT_FALSE(code.doesCodeHasControlCode(L""));
  DexCodeValues copy(code);
  code.setControlCode(kThird, L"AE");
  EXPECT_EQ(L"C", copy.getControlCode(kThird));
  copy = DexCodeValues(nullptr);
  EXPECT_TRUE(copy.doesCodeHasControlCode(L"") && !copy.doesCodeHasControlCode(L"AS"));

  const auto description = describe(L"TREE", {L"Height", L"Species"});
  auto original = std::unique_ptr<DexCodeValues>(fullCode(*description));
  const DexCodeValues copied(*original);
  DexCodeValues assigned(nullptr);
  assigned.addAttr(L"gone");
  assigned.addCodeString(L"gone");
  assigned = *original;
  original->addAttr(L"later");
  original.reset();
  expectFullCode(copied, *description);
  expectFullCode(assigned, *description);
}

TEST(DexCodesDataInterface, FindsCodesByNameAndCodeStringInOrder) {
  const auto x = describe(L"X");
  const auto cp = describe(L"CP");
  const auto cp2 = describe(L"CP2");
  DexCodesDataInterface codes;
  auto* const orphan = new DexCodeValues(nullptr);  // a code without description matches no name
  orphan->addCodeString(L"CP");
  auto* const withStrings = codeOf(cp.get(), {L"1", L"2"});
  auto* const plain = codeOf(cp2.get());
  for (DexCodeValues* code : {orphan, codeOf(x.get(), {L"CP2"}), withStrings, plain, codeOf(cp2.get()),
                              static_cast<DexCodeValues*>(nullptr)})
    codes.addCode(code);
  EXPECT_TRUE(codes.getNumberOfCodes() == 5 && codes.getCode(2) == withStrings &&
              std::as_const(codes).getCode(3) == plain);
  EXPECT_TRUE(codes.getCode(-1) == nullptr && std::as_const(codes).getCode(5) == nullptr);
  // The first code whose name, or name and code string when asked, matches.
  const std::pair<const DexCodeValues*, const DexCodeValues*> found[] = {
      {codes.findCode(L"CP2", true), withStrings}, {codes.findCode(L"CP1", true), withStrings},
      {codes.findCode(L"CP2", false), plain},      {codes.findCode(L"CP2"), plain},
      {codes.findCode(L"CP", false), withStrings}, {codes.findCode(L"CP3", true), nullptr},
      {codes.findCode(L"cp2", true), nullptr},     {codes.findCode(L"2", true), nullptr},
      {codes.findCode(L"", true), nullptr}};
  dex_test::expectRows(found);
  const std::pair<int, int> positions[] = {{codes.getCodePos(L"CP"), 2},
                                           {codes.getCodePos(L"CP2"), 3},
                                           {codes.getCodePos(L"CP21"), -1},
                                           {codes.getCodePos(L"cp"), -1},
                                           {codes.getCodePos(L""), -1}};
  dex_test::expectRows(positions);
}

TEST(DexCodesDataInterface, ReadsAttributesAndRemovesTheFirstCodeOfAName) {
  const auto tree = describe(L"TREE", {L"Height", L"Species"});
  int deletions = 0;
  {
    DexCodesDataInterface codes;
    auto* const first = new Counted<DexCodeValues>(deletions, tree.get());
    first->addCodeString(L"1");
    first->addAttr(L"12");
    first->addAttr(L"oak");
    auto* const second = new Counted<DexCodeValues>(deletions, tree.get());
    second->addAttr(L"3");
    codes.addCode(new Counted<DexCodeValues>(deletions, nullptr));
    codes.addCode(first);
    codes.addCode(second);
    const std::pair<CVynStringT<wchar_t>, const wchar_t*> rows[] = {
        {codes.getCodeAttrValue(L"TREE", L"Species"), L"oak"},
        {codes.getCodeAttrValue(L"TREE", L"Height"), L"12"},
        {codes.getCodeAttrValue(L"TREE", L"Girth"), L""},
        {codes.getCodeAttrValue(L"TREE1", L"Height"), L""},  // code strings are not considered
        {codes.getCodeAttrValue(L"BUSH", L"Height"), L""}};
    dex_test::expectRows(rows);
    EXPECT_FALSE(codes.removeCode(L"") || codes.removeCode(L"tree"));
    EXPECT_TRUE(codes.removeCode(L"TREE"));
    EXPECT_EQ(1, deletions);
    EXPECT_TRUE(codes.getNumberOfCodes() == 2 && codes.getCode(1) == second);
    codes.removeAllCodes();
    EXPECT_TRUE(deletions == 3 && codes.getNumberOfCodes() == 0);
    codes.addCode(new Counted<DexCodeValues>(deletions, tree.get()));
  }
  EXPECT_EQ(4, deletions);  // but no description
  EXPECT_EQ(2, tree->getSize());
}

TEST(DexCodesDataInterface, CopiesAppendOrReplaceWithOwnCodes) {
  const auto tree = describe(L"TREE", {L"Height", L"Species"});
  const auto a = describe(L"A");
  auto source = std::make_unique<DexCodesDataInterface>();
  source->addCode(fullCode(*tree));
  source->addCode(codeOf(a.get()));
  DexCodesDataInterface target;
  auto* const own = codeOf(a.get());
  target.addCode(own);
  source->copyCodesData(&target);
  source->copyCodesData(nullptr);
  ASSERT_EQ(3, target.getNumberOfCodes());
  EXPECT_TRUE(target.getCode(0) == own && target.getCode(1) != source->getCode(0));
  const DexCodesDataInterface copy(*source);
  int deletions = 0;
  DexCodesDataInterface assigned;
  assigned.addCode(new Counted<DexCodeValues>(deletions, tree.get()));
  assigned = *source;
  EXPECT_EQ(1, deletions);
  source->copyCodesData(source.get());  // into itself: the codes twice
  ASSERT_EQ(4, source->getNumberOfCodes());
  EXPECT_TRUE(source->getCode(3)->getDescription() == a.get() && source->getCode(0) != source->getCode(2));
  source.reset();
  expectFullCode(*target.getCode(1), *tree);
  expectFullCode(*copy.getCode(0), *tree);
  expectFullCode(*assigned.getCode(0), *tree);
  EXPECT_EQ(a.get(), target.getCode(2)->getDescription());
  const DexCodesDataInterface& self = assigned;
  assigned = self;
  EXPECT_EQ(2, assigned.getNumberOfCodes());
}

}  // namespace
