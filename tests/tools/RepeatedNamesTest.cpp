// Which points of a CgPoints wait for a later one: the names that repeat an earlier name.
#include "landxml/RepeatedNames.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {

using vyn::ie::landxml::markRepeatedNames;

std::vector<bool> repeatsOf(const std::vector<std::wstring>& names) {
  return markRepeatedNames(static_cast<std::uint32_t>(names.size()),
                           [&](std::uint32_t at) { return std::wstring_view(names[at]); });
}

TEST(RepeatedNames, OnlyLaterOccurrencesOfANonEmptyNameRepeat) {
  const struct {
    std::vector<std::wstring> names;
    std::vector<bool> repeated;
  } cases[] = {
      {{}, {}},
      {{L"1", L"2", L"3"}, {false, false, false}},
      {{L"A", L"B", L"", L"A", L"B", L"A", L"", L"C"}, {false, false, false, true, true, true, false, false}},
      {{L"p", L"P", L"p "}, {false, false, false}},
  };
  for (const auto& c : cases)
    EXPECT_EQ(c.repeated, repeatsOf(c.names));
}

TEST(RepeatedNames, AMillionNamesOfOneTextKeepOnlyTheFirst) {
  const std::vector<std::wstring> names(1'000'000, L"same");
  const std::vector<bool> repeated = repeatsOf(names);
  EXPECT_FALSE(repeated.front());
  EXPECT_EQ(names.size() - 1, static_cast<std::size_t>(std::count(repeated.begin(), repeated.end(), true)));
}

}  // namespace
