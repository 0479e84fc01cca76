// The XML reader's one-pass attribute visitor, and its tokens read through reused strings and slots.

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

#include "hostlibs/XmlParser.h"
#include "support/TempDir.h"

namespace {

using String = CVynStringT<wchar_t>;
using Pairs = std::vector<std::pair<std::wstring, std::wstring>>;

Pairs visitAll(const wchar_t* attributes, std::size_t stopAfter = 100) {
  Pairs seen;
  CXmlParserBase::ForEachAttrib(attributes, [&](std::wstring_view name, std::wstring_view value) {
    seen.emplace_back(name, value);
    return seen.size() < stopAfter;
  });
  return seen;
}

TEST(CXmlParserForEachAttrib, VisitsEveryAttributeInOrderWithItsValueUnescaped) {
  struct Case {
    const wchar_t* attributes;
    std::size_t stopAfter;
    Pairs expected;
  };
  const Case cases[] = {
      {L"", 100, {}},
      {L"name=\"P1\" code=\"EP:1\"", 100, {{L"name", L"P1"}, {L"code", L"EP:1"}}},
      {L"desc=\"a &amp; &lt;b&gt; &quot;c&quot;&#10;\" x='1'", 100, {{L"desc", L"a & <b> \"c\"\n"}, {L"x", L"1"}}},
      {L"a=\"1\" b=\"2\" c=\"3\"", 2, {{L"a", L"1"}, {L"b", L"2"}}},  // visit answered false
  };
  for (const Case& c : cases)
    EXPECT_EQ(c.expected, visitAll(c.attributes, c.stopAfter)) << c.attributes;
}

// Tokens of ever-changing lengths, more distinct names than the reader keeps at once, and more
// nodes than it reads at a time: each must come as if read into fresh strings.
TEST(CXmlParserReadToken, ReusedStringsGiveEveryTokenAsWritten) {
  std::wstring document = L"<?xml version=\"1.0\"?><Root>";
  std::vector<std::vector<std::wstring>> expected = {{L"", L"version=\"1.0\"", L""}, {L"Root", L"", L""}};
  for (int i = 0; i < 500; ++i) {
    const std::wstring name = L"E" + std::to_wstring(i % 173) + std::wstring(static_cast<std::size_t>(i % 7), L'x');
    const std::wstring text = std::wstring(static_cast<std::size_t>((i * 37) % 61 + 1), L'a' + i % 26);
    const std::wstring attributes = i % 3 == 0 ? L"" : L"k=\"" + std::to_wstring(i) + L"\"";
    document += L"<" + name + (attributes.empty() ? L"" : L" " + attributes) + L">" + text + L"</" + name + L">";
    expected.push_back({name, attributes, L""});
    expected.push_back({name, L"", text});
    expected.push_back({L"/" + name, L"", L""});
    if (i % 50 == 0) {
      document += L"<Empty/>";
      expected.push_back({L"Empty", L"", L""});
      expected.push_back({L"/Empty", L"", L""});
    }
  }
  document += L"</Root>";
  expected.push_back({L"/Root", L"", L""});

  const dex_test::TempDir dir;
  const std::string path = dir.write("reuse.xml", vyn_text::toUtf8(document));
  CXmlParser parser;
  ASSERT_EQ(CXmlParserBase::INIT_OK, CXmlParserBase::DoInitialize(dex_test::widen(path).c_str(), &parser));
  String tag, attributes, value;
  for (const auto& token : expected) {
    ASSERT_TRUE(parser.ReadToken(tag, attributes, value)) << token[0];
    ASSERT_EQ(token[0], tag.view());
    ASSERT_EQ(token[1], attributes.view()) << token[0];
    ASSERT_EQ(token[2], value.view()) << token[0];
  }
  EXPECT_FALSE(parser.ReadToken(tag, attributes, value));
  EXPECT_TRUE(tag.IsEmpty() && attributes.IsEmpty() && value.IsEmpty());
}

}  // namespace
