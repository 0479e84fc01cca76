#include "ieObjects/IEOwningList.h"

#include <gtest/gtest.h>

#include <climits>
#include <iterator>
#include <type_traits>
#include <utility>
#include <vector>

#include "hostlibs/VynAlloc.h"

namespace {

using vyn::ie::DexCopyByClone;
using vyn::ie::DexOwningList;

// Counts the live instances so that a test sees every delete (and LeakSanitizer any leak).
class Counted {
 public:
  VYN_CLASS_ALLOCATOR

  explicit Counted(int value) : value_(value) { ++live_; }
  Counted(const Counted& other) : value_(other.value_) { ++live_; }
  Counted& operator=(const Counted&) = default;
  virtual ~Counted() { --live_; }

  int value() const { return value_; }
  void setValue(int value) { value_ = value; }
  static int live() { return live_; }

 private:
  int value_;
  static inline int live_ = 0;
};

// A polymorphic family copied through clone().
class Shape {
 public:
  VYN_CLASS_ALLOCATOR
  virtual ~Shape() = default;
  virtual Shape* clone() const = 0;
  virtual int corners() const = 0;
};

class Triangle : public Shape {
 public:
  Shape* clone() const override { return new Triangle(*this); }
  int corners() const override { return 3; }
};

class Square : public Shape {
 public:
  Shape* clone() const override { return new Square(*this); }
  int corners() const override { return 4; }
};

std::vector<int> valuesOf(const DexOwningList<Counted>& list) {
  std::vector<int> values;
  for (const Counted* item : list)
    values.push_back(item->value());
  return values;
}

class DexOwningListTest : public ::testing::Test {
 protected:
  void SetUp() override { liveBefore_ = Counted::live(); }
  void TearDown() override {
    EXPECT_EQ(liveBefore_, Counted::live()) << "an item leaked or was deleted twice";
  }

 private:
  int liveBefore_ = 0;
};

}  // namespace

TEST_F(DexOwningListTest, DestructorDeletesEveryItem) {
  {
    DexOwningList<Counted> list;
    EXPECT_TRUE(list.add(new Counted(1)));
    EXPECT_TRUE(list.add(new Counted(2)));
    EXPECT_EQ(2, list.count());
    EXPECT_EQ(2, Counted::live());
  }
  EXPECT_EQ(0, Counted::live());
}

TEST_F(DexOwningListTest, DeclinesNullItems) {
  DexOwningList<Counted> list;
  EXPECT_FALSE(list.add(nullptr));
  EXPECT_FALSE(list.insert(0, nullptr));
  EXPECT_EQ(0, list.count());
  EXPECT_TRUE(list.isEmpty());
}

TEST_F(DexOwningListTest, AtAnswersNullOutsideTheList) {
  DexOwningList<Counted> list;
  EXPECT_EQ(nullptr, list.at(0));
  list.add(new Counted(7));
  const auto& constList = list;
  EXPECT_EQ(7, list.at(0)->value());
  EXPECT_EQ(7, constList.at(0)->value());
  for (const int index : {-1, 1, INT_MAX, INT_MIN}) {
    EXPECT_EQ(nullptr, list.at(index)) << index;
    EXPECT_EQ(nullptr, constList.at(index)) << index;
  }
  static_assert(std::is_same_v<const Counted*, decltype(constList.at(0))>);
}

TEST_F(DexOwningListTest, RemoveDeletesTheItemAndClosesTheGap) {
  DexOwningList<Counted> list;
  for (int value = 1; value <= 3; ++value)
    list.add(new Counted(value));
  EXPECT_TRUE(list.remove(1));
  EXPECT_EQ(2, Counted::live());
  EXPECT_EQ((std::vector<int>{1, 3}), valuesOf(list));
  EXPECT_FALSE(list.remove(2));
  EXPECT_FALSE(list.remove(-1));
  EXPECT_EQ(2, list.count());
}

TEST_F(DexOwningListTest, DetachHandsTheItemBackToTheCaller) {
  DexOwningList<Counted> list;
  list.add(new Counted(1));
  list.add(new Counted(2));
  Counted* const detached = list.detach(0);
  ASSERT_NE(nullptr, detached);
  EXPECT_EQ(1, detached->value());
  EXPECT_EQ(1, list.count());
  EXPECT_EQ(2, list.at(0)->value());
  EXPECT_EQ(nullptr, list.detach(1));
  EXPECT_EQ(nullptr, list.detach(-1));
  list.clear();
  EXPECT_EQ(1, Counted::live());  // the detached item is alive until its new owner deletes it
  delete detached;
}

TEST_F(DexOwningListTest, InsertPlacesBeforeTheIndexAndAppendsAtTheEnd) {
  DexOwningList<Counted> list;
  list.add(new Counted(2));
  EXPECT_TRUE(list.insert(0, new Counted(1)));
  EXPECT_TRUE(list.insert(2, new Counted(4)));
  EXPECT_TRUE(list.insert(2, new Counted(3)));
  EXPECT_EQ((std::vector<int>{1, 2, 3, 4}), valuesOf(list));

  auto* const declined = new Counted(9);
  EXPECT_FALSE(list.insert(5, declined));
  EXPECT_FALSE(list.insert(-1, declined));
  EXPECT_EQ(4, list.count());
  delete declined;  // a declined item stays with the caller
}

TEST_F(DexOwningListTest, ClearDeletesEveryItem) {
  DexOwningList<Counted> list;
  list.add(new Counted(1));
  list.add(new Counted(2));
  list.clear();
  EXPECT_EQ(0, list.count());
  EXPECT_EQ(0, Counted::live());
  list.clear();
}

TEST_F(DexOwningListTest, CopyOwnsItsOwnItems) {
  auto* original = new DexOwningList<Counted>();
  original->add(new Counted(1));
  original->add(new Counted(2));
  const DexOwningList<Counted> copy(*original);
  EXPECT_NE(original->at(0), copy.at(0));
  original->at(0)->setValue(10);
  delete original;
  EXPECT_EQ((std::vector<int>{1, 2}), valuesOf(copy));
  EXPECT_EQ(2, Counted::live());
}

TEST_F(DexOwningListTest, AssignmentReplacesTheItemsWithCopies) {
  DexOwningList<Counted> target;
  target.add(new Counted(5));
  {
    DexOwningList<Counted> source;
    source.add(new Counted(1));
    source.add(new Counted(2));
    target = source;
    EXPECT_EQ(4, Counted::live());  // the replaced item is deleted, the copies are new
  }
  EXPECT_EQ((std::vector<int>{1, 2}), valuesOf(target));
}

TEST_F(DexOwningListTest, SelfAssignmentChangesNothing) {
  DexOwningList<Counted> list;
  list.add(new Counted(1));
  const Counted* const item = list.at(0);
  auto& alias = list;
  list = alias;
  EXPECT_EQ(1, list.count());
  EXPECT_EQ(item, list.at(0));
  EXPECT_EQ(1, item->value());
}

TEST_F(DexOwningListTest, MovingTransfersTheItemsWithoutCopying) {
  DexOwningList<Counted> source;
  source.add(new Counted(1));
  const Counted* const item = source.at(0);
  DexOwningList<Counted> moved(std::move(source));
  EXPECT_EQ(item, moved.at(0));
  DexOwningList<Counted> target;
  target.add(new Counted(2));
  target = std::move(moved);
  EXPECT_EQ(item, target.at(0));
  EXPECT_EQ(1, Counted::live());
}

TEST_F(DexOwningListTest, AppendCopiesOfKeepsTheItemsAlreadyThere) {
  DexOwningList<Counted> list;
  list.add(new Counted(1));
  DexOwningList<Counted> other;
  other.add(new Counted(2));
  other.add(new Counted(3));
  list.appendCopiesOf(other);
  EXPECT_EQ((std::vector<int>{1, 2, 3}), valuesOf(list));
  EXPECT_NE(other.at(0), list.at(1));
  list.appendCopiesOf(list);
  EXPECT_EQ(3, list.count());
}

TEST_F(DexOwningListTest, CloneCopyKeepsEachItemsClass) {
  DexOwningList<Shape, DexCopyByClone> shapes;
  shapes.add(new Triangle());
  shapes.add(new Square());
  DexOwningList<Shape, DexCopyByClone> copy;
  copy = shapes;
  shapes.clear();
  ASSERT_EQ(2, copy.count());
  EXPECT_EQ(3, copy.at(0)->corners());
  EXPECT_EQ(4, copy.at(1)->corners());
  EXPECT_NE(nullptr, dynamic_cast<const Square*>(copy.at(1)));
}

TEST_F(DexOwningListTest, IteratesInListOrderWithConstPointersThroughAConstList) {
  DexOwningList<Counted> list;
  for (int value = 1; value <= 3; ++value)
    list.add(new Counted(value));
  for (Counted* item : list)
    item->setValue(item->value() * 10);
  const auto& constList = list;
  static_assert(std::is_same_v<const Counted*, decltype(*constList.begin())>);
  EXPECT_EQ((std::vector<int>{10, 20, 30}), valuesOf(constList));
  EXPECT_EQ(3, std::distance(list.begin(), list.end()));
  static_assert(std::forward_iterator<DexOwningList<Counted>::const_iterator>);
}

TEST_F(DexOwningListTest, FindFirstAndIndexOfAnswerTheFirstMatch) {
  DexOwningList<Counted> list;
  list.add(new Counted(1));
  list.add(new Counted(2));
  list.add(new Counted(2));
  Counted* const found = list.findFirst([](const Counted& item) { return item.value() == 2; });
  EXPECT_EQ(list.at(1), found);
  EXPECT_EQ(nullptr, list.findFirst([](const Counted& item) { return item.value() == 5; }));
  EXPECT_EQ(1, list.indexOf(found));
  const Counted outsider(2);
  EXPECT_EQ(-1, list.indexOf(&outsider));
  EXPECT_EQ(-1, list.indexOf(nullptr));
}
