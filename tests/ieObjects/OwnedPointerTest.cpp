#include "ieObjects/IEOwnedPointer.h"

#include <gtest/gtest.h>

#include <utility>

namespace {

using vyn::ie::DexCopyByClone;
using vyn::ie::DexCopyByCloneAs;
using vyn::ie::DexOwnedPointer;

// An item that counts its deletions and copies.
struct Counted {
  Counted(int& deletionsRef, int valueInit) : deletions(&deletionsRef), value(valueInit) {}
  Counted(const Counted&) = default;
  Counted& operator=(const Counted&) = default;
  virtual ~Counted() { ++*deletions; }
  virtual Counted* clone() const { return new Counted(*this); }

  int* deletions;
  int value;
};

// A subclass whose clone() answers its base class, as some families' clone() does.
struct Narrowing : Counted {
  using Counted::Counted;
  Counted* clone() const override { return new Counted(*this); }
};

}  // namespace

TEST(DexOwnedPointer, ResetDeletesTheOldObjectButNotTheSameOne) {
  int deletions = 0;
  auto* const first = new Counted(deletions, 1);
  DexOwnedPointer<Counted> pointer(first);
  pointer.reset(first);
  EXPECT_EQ(0, deletions);
  EXPECT_EQ(first, pointer.get());
  pointer.reset(new Counted(deletions, 2));
  EXPECT_EQ(1, deletions);
  pointer.reset();
  EXPECT_EQ(2, deletions);
  EXPECT_FALSE(pointer);
}

TEST(DexOwnedPointer, CopiesDuplicateTheObjectAndSelfAssignmentKeepsIt) {
  int deletions = 0;
  DexOwnedPointer<Counted, DexCopyByClone> original(new Counted(deletions, 7));
  DexOwnedPointer<Counted, DexCopyByClone> copy(original);
  ASSERT_TRUE(copy);
  EXPECT_NE(original.get(), copy.get());
  EXPECT_EQ(7, copy.get()->value);
  Counted* const held = copy.get();
  copy = std::as_const(copy);
  EXPECT_EQ(held, copy.get());
  DexOwnedPointer<Counted, DexCopyByClone> empty;
  copy = empty;
  EXPECT_FALSE(copy);
  EXPECT_EQ(1, deletions);
}

TEST(DexOwnedPointer, ATypedCloneOfAnotherClassLeavesTheCopyEmpty) {
  int deletions = 0;
  DexOwnedPointer<Narrowing, DexCopyByCloneAs> original(new Narrowing(deletions, 3));
  const DexOwnedPointer<Narrowing, DexCopyByCloneAs> copy(original);
  EXPECT_FALSE(copy);
  EXPECT_EQ(1, deletions);
  DexOwnedPointer<Counted, DexCopyByCloneAs> typed(new Counted(deletions, 4));
  const DexOwnedPointer<Counted, DexCopyByCloneAs> typedCopy(typed);
  ASSERT_TRUE(typedCopy);
  EXPECT_EQ(4, typedCopy.get()->value);
}
