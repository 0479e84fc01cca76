// The owning containers of the model: the owned pointer, the owning list and map, and the object list
// that owns nothing.
#include "ieObjects/IEOwningList.h"

#include <gtest/gtest.h>

#include <climits>
#include <iterator>
#include <string>
#include <type_traits>
#include <utility>

#include "hostlibs/VynAlloc.h"
#include "ieObjects/IEObjectList.h"
#include "ieObjects/IEObjects.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEOwningMap.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;

// Counts the live instances so that a test sees every delete (and LeakSanitizer any leak).
class Counted {
 public:
  VYN_CLASS_ALLOCATOR
  explicit Counted(int value) : value_(value) { ++live_; }
  Counted(const Counted& other) : value_(other.value_) { ++live_; }
  Counted& operator=(const Counted&) = default;
  virtual ~Counted() { --live_; }
  virtual Counted* clone() const { return new Counted(*this); }
  int value() const { return value_; }
  void setValue(int value) { value_ = value; }
  static int live() { return live_; }

 private:
  int value_;
  static inline int live_ = 0;
};

// A subclass whose clone() answers its base class, as some families' clone() does.
struct Narrowing : Counted {
  using Counted::Counted;
  Counted* clone() const override { return new Counted(*this); }
};

std::string valuesOf(const DexOwningList<Counted>& list) {
  std::string values;
  for (const Counted* item : list)
    values += std::to_string(item->value()) + " ";
  return values;
}

class Containers : public ::testing::Test {
 protected:
  void TearDown() override {
    EXPECT_EQ(liveBefore_, Counted::live()) << "an item leaked or was deleted twice";
  }

 private:
  int liveBefore_ = Counted::live();
};

TEST_F(Containers, OwnedPointerDeletesWhatItReplacesAndCopiesByCopyOrByClone) {
  auto* const first = new Counted(1);
  DexOwnedPointer<Counted> pointer(first);
  pointer.reset(first);
  EXPECT_EQ(first, pointer.get());
  pointer.reset(new Counted(2));
  EXPECT_EQ(2, pointer.get()->value());
  pointer.reset();
  EXPECT_FALSE(pointer);
  DexOwnedPointer<Counted, DexCopyByClone> original(new Counted(7));
  DexOwnedPointer<Counted, DexCopyByClone> copy(original);
  EXPECT_TRUE(copy && copy.get() != original.get() && copy.get()->value() == 7);
  Counted* const held = copy.get();
  copy = std::as_const(copy);
  EXPECT_EQ(held, copy.get());
  copy = DexOwnedPointer<Counted, DexCopyByClone>();
  EXPECT_FALSE(copy);
  // A typed clone of another class leaves the copy empty.
  DexOwnedPointer<Narrowing, DexCopyByCloneAs> narrowing(new Narrowing(3));
  EXPECT_FALSE((DexOwnedPointer<Narrowing, DexCopyByCloneAs>(narrowing)));
  DexOwnedPointer<Counted, DexCopyByCloneAs> typed(new Counted(4));
  EXPECT_EQ(4, (DexOwnedPointer<Counted, DexCopyByCloneAs>(typed).get()->value()));
}

TEST_F(Containers, OwningListDeclinesNullAnswersNullOutsideAndRemovesDetachesAndInsertsByIndex) {
  DexOwningList<Counted> list;
  EXPECT_FALSE(list.add(nullptr) || list.insert(0, nullptr));
  EXPECT_TRUE(list.isEmpty() && list.at(0) == nullptr);
  for (int value = 2; value <= 4; ++value)
    EXPECT_TRUE(list.add(new Counted(value)));
  EXPECT_TRUE(list.insert(0, new Counted(1)) && list.insert(4, new Counted(6)) &&
              list.insert(4, new Counted(5)));
  Counted declined(9);  // a declined item stays with the caller
  EXPECT_FALSE(list.insert(7, &declined) || list.insert(-1, &declined));
  EXPECT_EQ("1 2 3 4 5 6 ", valuesOf(list));
  const auto& constList = list;
  static_assert(std::is_same_v<const Counted*, decltype(constList.at(0))>);
  for (const int index : {-1, 6, INT_MAX, INT_MIN})
    EXPECT_TRUE(list.at(index) == nullptr && constList.at(index) == nullptr) << index;
  EXPECT_TRUE(list.remove(1));
  EXPECT_FALSE(list.remove(5) || list.remove(-1));
  Counted* const detached = list.detach(0);
  EXPECT_EQ(1, detached->value());
  EXPECT_TRUE(list.detach(4) == nullptr && list.detach(-1) == nullptr);
  EXPECT_EQ("3 4 5 6 ", valuesOf(list));
  list.clear();
  EXPECT_EQ(0, list.count());
  delete detached;  // alive until its new owner deletes it
  for (int value = 1; value <= 3; ++value)
    list.add(new Counted(value));
  list.add(new Counted(2));
  for (Counted* item : list)  // iterates in order, with const pointers through a const list
    item->setValue(item->value() * 10);
  static_assert(std::is_same_v<const Counted*, decltype(*constList.begin())>);
  static_assert(std::forward_iterator<DexOwningList<Counted>::const_iterator>);
  EXPECT_EQ(4, std::distance(list.begin(), list.end()));
  Counted* const found = list.findFirst([](const Counted& item) { return item.value() == 20; });
  EXPECT_TRUE(found == list.at(1) && list.indexOf(found) == 1);
  EXPECT_EQ(nullptr, list.findFirst([](const Counted& item) { return item.value() == 5; }));
  const Counted outsider(20);
  EXPECT_TRUE(list.indexOf(&outsider) == -1 && list.indexOf(nullptr) == -1);
}

TEST_F(Containers, OwningListCopiesOwnTheirItemsAndMovesTransferThem) {
  const int base = Counted::live();
  auto* original = new DexOwningList<Counted>();
  original->add(new Counted(1));
  original->add(new Counted(2));
  const DexOwningList<Counted> copy(*original);
  EXPECT_NE(original->at(0), copy.at(0));
  DexOwningList<Counted> target;
  target.add(new Counted(5));
  target = *original;  // the replaced item is deleted
  original->at(0)->setValue(10);
  delete original;
  EXPECT_TRUE(valuesOf(copy) == "1 2 " && valuesOf(target) == "1 2 ");
  const Counted* const item = target.at(0);
  auto& alias = target;
  target = alias;
  EXPECT_EQ(item, target.at(0));
  DexOwningList<Counted> moved(std::move(target));
  DexOwningList<Counted> movedAgain;
  movedAgain.add(new Counted(3));
  movedAgain = std::move(moved);
  EXPECT_EQ(item, movedAgain.at(0));
  movedAgain.appendCopiesOf(copy);  // keeps the items already there
  EXPECT_EQ("1 2 1 2 ", valuesOf(movedAgain));
  EXPECT_NE(copy.at(0), movedAgain.at(2));
  movedAgain.appendCopiesOf(movedAgain);
  EXPECT_EQ(4, movedAgain.count());
  EXPECT_EQ(base + 6, Counted::live());
  DexOwningList<Counted, DexCopyByClone> clones;  // a clone copy keeps each item's class
  clones.add(new Narrowing(7));
  DexOwningList<Counted, DexCopyByClone> cloned;
  cloned = clones;
  EXPECT_EQ(7, cloned.at(0)->value());
}

TEST_F(Containers, OwningMapKeepsTheFirstItemOfAKeyAndLeavesDeclinedItemsWithTheCaller) {
  {
    DexOwningMap<int, Counted> map;
    auto* const first = new Counted(1);
    Counted declined(2);
    EXPECT_TRUE(map.add(2, first) && map.add(2, first) && map.add(5, first));  // held already: no change
    EXPECT_FALSE(map.add(2, &declined) || map.add(3, nullptr));
    EXPECT_TRUE(map.add(1, new Counted(3)));
    EXPECT_TRUE(map.count() == 2 && map.find(2) == first && map.find(5) == nullptr && map.find(3) == nullptr);
    EXPECT_TRUE(map.holds(first) && !map.holds(&declined) && map.begin()->first == 1);
    EXPECT_TRUE(map.remove(1));
    EXPECT_FALSE(map.remove(1));
  }
  DexOwningMap<int, Counted> map;
  map.add(1, new Counted(1));
  map.clear();
  EXPECT_TRUE(map.count() == 0 && map.begin() == map.end());
}

// The names an object list answers from its cursor.
std::wstring walk(const DexObjectList& list) {
  std::wstring names;
  for (const DexObject* object = list.getNextObjectInTheList(); object != nullptr;
       object = list.getNextObjectInTheList())
    names += std::wstring(object->getName().view()) + L" ";
  return names;
}

TEST(DexObjectList, KeepsTheFirstObjectOfANameInNameOrderAndNeverDeletesThem) {
  DexDesignPoint b;
  b.setName(L"B");
  DexArc a;
  a.setName(L"A");
  DexPolyLine c(false);
  c.setName(L"C");
  DexDesignPoint sameName;
  sameName.setName(L"B");
  auto* const list = new DexObjectList();
  list->setName(L"Selection 1");
  EXPECT_FALSE(list->addObject(nullptr));
  EXPECT_TRUE(list->addObject(&b) && list->addObject(&c) && list->addObject(&a));
  EXPECT_FALSE(list->addObject(&sameName));
  EXPECT_TRUE(list->findObjectInTheList(L"B") == &b && list->findObjectInTheList(L"b") == nullptr &&
              list->findObjectInTheList(L"C ") == nullptr);
  EXPECT_EQ(L"A B C ", walk(*list));
  EXPECT_EQ(nullptr, list->getNextObjectInTheList());
  list->reset();
  EXPECT_EQ(&a, list->getNextObjectInTheList());
  const DexObjectList copy(*list);  // copies share the objects and read from the start
  DexObjectList assigned;
  assigned = *list;
  delete list;
  EXPECT_EQ(L"Selection 1", copy.getName());
  EXPECT_TRUE(walk(copy) == L"A B C " && walk(assigned) == L"A B C ");
  assigned = std::as_const(assigned);
  EXPECT_EQ(3, assigned.getNumberOfObjects());
  const DexObjectList empty;
  empty.reset();
  EXPECT_TRUE(empty.getNextObjectInTheList() == nullptr && empty.findObjectInTheList(L"") == nullptr);
}

}  // namespace
