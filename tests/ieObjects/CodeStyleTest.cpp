// The rendering of an object's codes as one text by a code style, and the user forms of the built-in
// control codes. Field types: 61 prefix, 62 code, 63 code separator, 64 control code, 65 control-code
// separator, 66 code string, 67 string separator, 68 note, 69 note separator, 70 attribute name, 71
// attribute-name separator, 72 attribute value, 73 attribute-value separator.
#include "ieObjects/IECodesDataInterface.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <string>
#include <tuple>
#include <vector>

#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/detail/CodesDataInterfaceLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
namespace detail = vyn::ie::detail;

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
  DexCodeValues& addCode(const wchar_t* name, const wchar_t* first = L"", const wchar_t* second = L"",
                         std::initializer_list<const wchar_t*> attrs = {}) {
    DexCodeDescription* description = nullptr;
    if (name != nullptr) {
      description = descriptions_.emplace_back(std::make_unique<DexCodeDescription>(name)).get();
      for (const wchar_t* attr : attrs)
        description->addAttrDescription(new DexAttrDescription(attr, DexAttrDescription::ATTR_STRING));
    }
    auto* const code = new DexCodeValues(description);
    code->setControlCode(DexCodeValues::FIRST_CONTROL_CODE, first);
    code->setControlCode(DexCodeValues::SECOND_CONTROL_CODE, second);
    codes_.addCode(code);
    return *code;
  }

  // Renders the codes with each row's field types and note and checks the text.
  void expectTexts(
      std::initializer_list<std::tuple<std::initializer_list<int>, const wchar_t*, const wchar_t*>> rows) {
    for (const auto& [types, note, text] : rows) {
      const DexCodeStyle style = styleOf(types);
      EXPECT_EQ(text, codes_.getCodesAsCodeStyle(&style, note)) << text;
    }
  }

  DexCodesDataInterface codes_;

 private:
  std::vector<std::unique_ptr<DexCodeDescription>> descriptions_;
};

TEST(DexCodeStyle, UserFormsReplaceTheSixBuiltInControlCodesOnly) {
  const DexCodeStyle fresh;
  EXPECT_TRUE(fresh.fields.empty() && fresh.codeSeparator.IsEmpty() && fresh.userEndLine.IsEmpty());
  const DexCodesDataInterface codes;
  const DexCodeStyle style = styleOf({});
  const std::pair<const wchar_t*, const wchar_t*> rows[] = {
      {L"AS", L"[as]"},        {L"AE", L"[ae]"}, {L"R", L"[r]"},   {L"C", L"[c]"}, {L"BEG_LINE", L"[beg]"},
      {L"END_LINE", L"[end]"}, {L"as", L"as"},   {L"ASX", L"ASX"}, {L"PC", L"PC"}, {L"", L""}};
  for (const auto& [control, user] : rows)
    EXPECT_EQ(user, codes.getUserControlCode(&style, control)) << control;
  EXPECT_EQ(L"AS", codes.getUserControlCode(nullptr, L"AS"));
  EXPECT_EQ(L"", codes.getUserControlCode(&fresh, L"AE"));  // an empty user form replaces too
}

TEST_F(CodeText, CodesControlCodesAndStringsInFieldOrderSeparatedButNotFollowed) {
  addCode(L"FENCE", L"AS", L"END_LINE");
  EXPECT_EQ(L"", codes_.getCodesAsCodeStyle(nullptr, L"note"));
  expectTexts({{{62, 63}, L"", L"FENCE"},
               {{62, 62}, L"", L"FENCEFENCE"},
               {{61, 62, 65, 64}, L"", L"#FENCE+[as]+[end]"}});
  addCode(L"A", L"AE", L"R");
  addCode(L"B", L"C", L"BEG_LINE");
  addCode(L"C", L"PC", L"");
  addCode(L"D", L"", L"R");  // a second control code needs no first
  addCode(L"E");             // but the separator item does
  DexCodeValues& cp = addCode(L"CP");
  cp.addCodeString(L"12");
  cp.addCodeString(L"13");
  expectTexts({{{62, 64, 63}, L"", L"FENCE[as]+[end];A[ae]+[r];B[c]+[beg];CPC;D+[r];E;CP"},
               {{62, 65, 64, 63}, L"", L"FENCE+[as]+[end];A+[ae]+[r];B+[c]+[beg];C+PC;D+[r];E;CP"},
               {{63, 62}, L"", L";FENCE;A;B;C;D;ECP"},  // the separator belongs to every code but the last
               {{62, 67, 66, 63}, L"", L"FENCE;A;B;C;D;E;CP/12"}});
}

TEST_F(CodeText, AttributeBlockIsWrittenOncePerCodeWhereItsFirstFieldStands) {
  DexCodeValues& tree = addCode(L"TREE", L"", L"", {L"H", L"S"});
  tree.addAttr(L"12");
  tree.addAttr(L"oak");
  addCode(L"A");
  expectTexts({{{62, 72, 63, 70, 73, 71}, L"", L"TREE<H=12<S=oak;A"},
               {{73, 62, 71, 63, 72, 70}, L"", L"<H=12<S=oakTREE;A"},
               {{62, 72, 70}, L"", L"TREEH12SoakA"},
               {{62, 73, 71}, L"", L"TREE<=<=A"},
               {{62, 72}, L"", L"TREE12oakA"},
               {{62, 69, 68, 63}, L"north corner", L"TREE;A|north corner"},  // the note follows the last code
               {{62, 69, 68, 63}, L"", L"TREE;A"}});
}

TEST_F(CodeText, ObjectWithoutCodesWritesItsNoteAndSeparatorInFieldOrder) {
  const dex_test::LogCapture log;
  expectTexts({{{62, 63}, L"north corner", L"north corner"},  // without a separator field: the note
               {{}, L"north corner", L"north corner"},
               {{68}, L"north corner", L"north corner"},
               {{62, 68}, L"", L""},
               {{62, 68, 69}, L"note", L"note|"},
               {{69, 62, 68}, L"note", L"|note"},
               {{68, 69}, L"", L""},
               {{62, 69}, L"note", L""},
               {{0, 74}, L"note", L"note"}});
  EXPECT_EQ(0u, log.size());  // unknown fields pass unseen
}

TEST_F(CodeText, UnknownFieldTypesWriteNothingAndLogOncePerCodeWithADescription) {
  addCode(nullptr, L"AS");  // a code without description writes nothing
  addCode(L"A");
  addCode(L"B");
  const dex_test::LogCapture log;
  expectTexts({{{62, 0, 63, 74}, L"", L"A;B"}});
  EXPECT_EQ(4, log.count(detail::kCodesDataInterfaceLogSource, detail::kUnknownCodeStyleFieldLine));
  ASSERT_EQ(4u, log.size());
  EXPECT_TRUE(log.records().front().message.empty());
}

}  // namespace
