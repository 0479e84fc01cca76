// The rendering of an object's codes as one text by a code style, and the user forms of the built-in
// control codes.
#include "ieObjects/IECodesDataInterface.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/detail/CodesDataInterfaceLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using vyn::ie::DexAttrDescription;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexCodesDataInterface;
using vyn::ie::DexCodeStyle;
using vyn::ie::DexCodeValues;
namespace ascii_fields = vyn::ie::ascii_fields;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kCodesDataInterfaceLogSource;

// A style with the given field types and a distinct text in every separator and user form.
DexCodeStyle styleOf(std::initializer_list<int> types) {
  DexCodeStyle style;
  for (const int type : types)
    style.fields.push_back({static_cast<ascii_fields::EType>(type), 0, 0});
  style.codeSeparator = L";";
  style.stringSeparator = L"/";
  style.controlCodeSeparator = L"+";
  style.noteSeparator = L"|";
  style.generalPrefix = L"#";
  style.attrNameSeparator = L"<";
  style.attrValueSeparator = L"=";
  style.userAS = L"[as]";
  style.userAE = L"[ae]";
  style.userR = L"[r]";
  style.userC = L"[c]";
  style.userBegLine = L"[beg]";
  style.userEndLine = L"[end]";
  return style;
}

// An object's codes over descriptions that the fixture owns, as the code library would.
class CodeText : public ::testing::Test {
 protected:
  DexCodeDescription& describe(const wchar_t* name, std::initializer_list<const wchar_t*> attrs = {}) {
    auto& description = descriptions_.emplace_back(std::make_unique<DexCodeDescription>(name));
    for (const wchar_t* attr : attrs) {
      description->addAttrDescription(new DexAttrDescription(attr, DexAttrDescription::ATTR_STRING));
    }
    return *description;
  }

  DexCodeValues& addCode(const DexCodeDescription* description) {
    auto* const code = new DexCodeValues(description);
    codes_.addCode(code);
    return *code;
  }

  DexCodeValues& addCode(const wchar_t* name) { return addCode(&describe(name)); }

  DexCodeValues& addCodeWithControlCodes(const wchar_t* name, const wchar_t* first, const wchar_t* second) {
    DexCodeValues& code = addCode(name);
    code.setControlCode(DexCodeValues::FIRST_CONTROL_CODE, first);
    code.setControlCode(DexCodeValues::SECOND_CONTROL_CODE, second);
    return code;
  }

  CVynStringT<wchar_t> render(std::initializer_list<int> types, const wchar_t* note = L"") const {
    const DexCodeStyle style = styleOf(types);
    return codes_.getCodesAsCodeStyle(&style, note);
  }

  DexCodesDataInterface codes_;

 private:
  std::vector<std::unique_ptr<DexCodeDescription>> descriptions_;
};

}  // namespace

// User control codes

TEST(DexCodeStyle, StartsEmpty) {
  const DexCodeStyle style;
  EXPECT_TRUE(style.fields.empty());
  EXPECT_TRUE(style.codeSeparator.IsEmpty());
  EXPECT_TRUE(style.userEndLine.IsEmpty());
}

TEST(DexCodesDataInterfaceUserControlCode, ReplacesTheSixBuiltInControlCodes) {
  const DexCodesDataInterface codes;
  const DexCodeStyle style = styleOf({});
  EXPECT_EQ(L"[as]", codes.getUserControlCode(&style, L"AS"));
  EXPECT_EQ(L"[ae]", codes.getUserControlCode(&style, L"AE"));
  EXPECT_EQ(L"[r]", codes.getUserControlCode(&style, L"R"));
  EXPECT_EQ(L"[c]", codes.getUserControlCode(&style, L"C"));
  EXPECT_EQ(L"[beg]", codes.getUserControlCode(&style, L"BEG_LINE"));
  EXPECT_EQ(L"[end]", codes.getUserControlCode(&style, L"END_LINE"));
}

TEST(DexCodesDataInterfaceUserControlCode, LeavesOtherTextsUnchanged) {
  const DexCodesDataInterface codes;
  const DexCodeStyle style = styleOf({});
  EXPECT_EQ(L"as", codes.getUserControlCode(&style, L"as"));
  EXPECT_EQ(L"ASX", codes.getUserControlCode(&style, L"ASX"));
  EXPECT_EQ(L"PC", codes.getUserControlCode(&style, L"PC"));
  EXPECT_EQ(L"", codes.getUserControlCode(&style, L""));
}

TEST(DexCodesDataInterfaceUserControlCode, NullStyleLeavesTheControlCode) {
  const DexCodesDataInterface codes;
  EXPECT_EQ(L"AS", codes.getUserControlCode(nullptr, L"AS"));
}

TEST(DexCodesDataInterfaceUserControlCode, AnEmptyUserFormReplacesToo) {
  const DexCodesDataInterface codes;
  const DexCodeStyle style;
  EXPECT_EQ(L"", codes.getUserControlCode(&style, L"AE"));
}

// Code text

TEST_F(CodeText, NullStyleGivesAnEmptyText) {
  addCode(L"A");
  EXPECT_EQ(L"", codes_.getCodesAsCodeStyle(nullptr, L"note"));
}

TEST_F(CodeText, CodesAreSeparatedButNotFollowedBySeparators) {
  addCode(L"A");
  addCode(L"B");
  EXPECT_EQ(L"A;B", render({62, 63}));
  addCode(L"C");
  EXPECT_EQ(L"A;B;C", render({62, 63}));
  EXPECT_EQ(L";A;BC", render({63, 62})) << "the separator belongs to every code but the last";
}

TEST_F(CodeText, ASingleCodeHasNoCodeSeparator) {
  addCode(L"A");
  EXPECT_EQ(L"A", render({62, 63}));
  EXPECT_EQ(L"AA", render({62, 62}));
}

TEST_F(CodeText, PrefixCodeAndControlCodesInTheirUserForms) {
  addCodeWithControlCodes(L"FENCE", L"AS", L"END_LINE");
  EXPECT_EQ(L"#FENCE+[as]+[end]", render({61, 62, 65, 64}));
}

TEST_F(CodeText, EveryBuiltInControlCodeTakesItsUserForm) {
  addCodeWithControlCodes(L"A", L"AE", L"R");
  addCodeWithControlCodes(L"B", L"C", L"BEG_LINE");
  addCodeWithControlCodes(L"C", L"PC", L"");
  EXPECT_EQ(L"A[ae]+[r];B[c]+[beg];CPC", render({62, 64, 63}));
}

TEST_F(CodeText, SecondControlCodeNeedsNoFirst) {
  addCodeWithControlCodes(L"A", L"", L"R");
  EXPECT_EQ(L"A+[r]", render({62, 65, 64}));
}

TEST_F(CodeText, ControlCodeSeparatorItemNeedsAFirstControlCode) {
  addCodeWithControlCodes(L"A", L"", L"");
  addCodeWithControlCodes(L"B", L"C", L"");
  EXPECT_EQ(L"A;B+[c]", render({62, 65, 64, 63}));
}

TEST_F(CodeText, CodeStringsWithStringSeparator) {
  DexCodeValues& cp = addCode(L"CP");
  cp.addCodeString(L"12");
  cp.addCodeString(L"13");
  addCode(L"TREE");
  EXPECT_EQ(L"CP/12;TREE", render({62, 67, 66, 63}));
}

TEST_F(CodeText, AttributeBlockIsWrittenOncePerCodeInItsOwnOrder) {
  DexCodeValues& tree = addCode(&describe(L"TREE", {L"H", L"S"}));
  tree.addAttr(L"12");
  tree.addAttr(L"oak");
  addCode(L"A");
  // Field order scrambled: the block stands where its first field stands.
  EXPECT_EQ(L"TREE<H=12<S=oak;A", render({62, 72, 63, 70, 73, 71}));
  EXPECT_EQ(L"<H=12<S=oakTREE;A", render({73, 62, 71, 63, 72, 70}));
}

TEST_F(CodeText, AttributeBlockWritesOnlyTheListedItems) {
  DexCodeValues& tree = addCode(&describe(L"TREE", {L"H", L"S"}));
  tree.addAttr(L"12");
  EXPECT_EQ(L"TREEH12S", render({62, 72, 70}));
  EXPECT_EQ(L"TREE<=<=", render({62, 73, 71}));
  EXPECT_EQ(L"TREE12", render({62, 72}));
}

TEST_F(CodeText, NoteFollowsTheLastCodeOnly) {
  addCode(L"A");
  addCode(L"B");
  EXPECT_EQ(L"A;B|north corner", render({62, 69, 68, 63}, L"north corner"));
  EXPECT_EQ(L"A;B", render({62, 69, 68, 63}, L""));
}

TEST_F(CodeText, ObjectWithoutCodesAndWithoutNoteSeparatorIsItsNote) {
  EXPECT_EQ(L"north corner", render({62, 63}, L"north corner"));
  EXPECT_EQ(L"north corner", render({}, L"north corner"));
  EXPECT_EQ(L"north corner", render({68}, L"north corner"));
  EXPECT_EQ(L"", render({62, 68}, L""));
}

TEST_F(CodeText, ObjectWithoutCodesWritesNoteAndSeparatorInFieldOrder) {
  EXPECT_EQ(L"note|", render({62, 68, 69}, L"note"));
  EXPECT_EQ(L"|note", render({69, 62, 68}, L"note"));
  EXPECT_EQ(L"", render({68, 69}, L""));
}

TEST_F(CodeText, ObjectWithoutCodesNeedsANoteFieldBesideItsSeparator) {
  EXPECT_EQ(L"", render({62, 69}, L"note"));
}

TEST_F(CodeText, ObjectWithoutCodesLogsNothingForUnknownFields) {
  const dex_test::LogCapture log;
  EXPECT_EQ(L"note", render({0, 74}, L"note"));
  EXPECT_EQ(0u, log.size());
}

TEST_F(CodeText, UnknownFieldTypeWritesNothingAndLogsOncePerCode) {
  addCode(L"A");
  addCode(L"B");
  const dex_test::LogCapture log;
  EXPECT_EQ(L"A;B", render({62, 0, 63, 74}));
  EXPECT_EQ(4, log.count(kSource, detail::kUnknownCodeStyleFieldLine));
  ASSERT_EQ(4u, log.size());
  EXPECT_TRUE(log.records().front().message.empty());
}

TEST_F(CodeText, CodesWithoutDescriptionWriteNothing) {
  addCode(static_cast<const DexCodeDescription*>(nullptr))
      .setControlCode(DexCodeValues::FIRST_CONTROL_CODE, L"AS");
  addCode(L"A");
  const dex_test::LogCapture log;
  EXPECT_EQ(L"A", render({62, 64, 1000}));
  EXPECT_EQ(1u, log.size()) << "only the code with a description reads the fields";
}
