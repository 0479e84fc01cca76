#include "hostlibs/VynCompactVector.h"

#include <gtest/gtest.h>

#include <array>
#include <memory>
#include <string>

#include "hostlibs/VynString.h"

namespace {

using vyn_templ::CompactVector;
using Texts = CompactVector<CVynStringT<wchar_t>>;

std::wstring joined(const Texts& texts) {
  std::wstring all;
  for (const auto& text : texts)
    all += std::wstring(text.view()) + L"|";
  return all;
}

TEST(CompactVector, OneItemLivesInsideAndGrowthKeepsEveryItem) {
  static_assert(sizeof(Texts) == 16);
  Texts texts;
  texts.push_back(L"first text");
  EXPECT_EQ(texts.capacity(), 1U);
  // An item of the vector itself, added at the moment it must grow.
  texts.push_back(texts[0]);
  texts.emplace_back(texts[1]);
  EXPECT_EQ(joined(texts), L"first text|first text|first text|");

  texts.insert(texts.begin(), CVynStringT<wchar_t>(L"a"));
  texts.insert(texts.begin() + 1, 2, texts[0]);
  EXPECT_EQ(joined(texts), L"a|a|a|first text|first text|first text|");
  const std::array<CVynStringT<wchar_t>, 2> more{L"x", L"y"};
  texts.insert(texts.begin() + 3, more.begin(), more.end());
  EXPECT_EQ(joined(texts), L"a|a|a|x|y|first text|first text|first text|");

  texts.erase(texts.begin(), texts.begin() + 5);
  texts.erase(texts.begin());
  EXPECT_EQ(joined(texts), L"first text|first text|");
  texts.resize(1);
  texts.shrink_to_fit();
  EXPECT_EQ(texts.capacity(), 1U);
  EXPECT_EQ(joined(texts), L"first text|");
  texts.resize(3);
  EXPECT_EQ(joined(texts), L"first text|||");
}

TEST(CompactVector, CopiesMovesAndSwapsWorkInsideAndOnTheHeap) {
  Texts inside;
  inside.push_back(L"in");
  Texts heap;
  for (const wchar_t* text : {L"h1", L"h2", L"h3", L"h4", L"h5"})
    heap.push_back(text);

  Texts copy(heap);
  EXPECT_TRUE(copy == heap);
  copy = inside;
  EXPECT_EQ(joined(copy), L"in|");
  const Texts& alias = copy;
  copy = alias;  // self-assignment must change nothing
  EXPECT_EQ(joined(copy), L"in|");

  inside.swap(heap);
  EXPECT_EQ(joined(heap), L"in|");
  EXPECT_EQ(joined(inside), L"h1|h2|h3|h4|h5|");
  Texts moved(std::move(heap));
  EXPECT_EQ(joined(moved), L"in|");
  EXPECT_TRUE(heap.empty());  // NOLINT(bugprone-use-after-move): a moved-from vector is empty
  heap = std::move(inside);
  EXPECT_EQ(heap.size(), 5U);
  heap.clear();
  EXPECT_TRUE(heap.empty());

  // Owning items are destroyed exactly once whichever way they travel.
  auto counter = std::make_shared<int>(0);
  {
    CompactVector<std::shared_ptr<int>> owners;
    owners.push_back(counter);
    CompactVector<std::shared_ptr<int>> other(owners);
    other.push_back(counter);
    owners = std::move(other);
    EXPECT_EQ(counter.use_count(), 3);
  }
  EXPECT_EQ(counter.use_count(), 1);

  // Items larger than a pointer always live on the heap.
  CompactVector<std::array<double, 3>> triples;
  EXPECT_EQ(triples.capacity(), 0U);
  triples.push_back({1, 2, 3});
  triples.push_back(triples[0]);
  EXPECT_EQ(triples[1][2], 3.0);
}

}  // namespace
