#include "ieObjects/IEObjectList.h"

#include <gtest/gtest.h>

#include <utility>

#include "ieObjects/IEObjects.h"
#include "support/PrintString.h"

namespace {

using vyn::ie::DexArc;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexObject;
using vyn::ie::DexObjectList;
using vyn::ie::DexPolyLine;

// A design point that counts its deletions.
class CountedPoint : public DexDesignPoint {
 public:
  CountedPoint(const wchar_t* name, int& deletions) : deletions_(deletions) { setName(name); }
  ~CountedPoint() override { ++deletions_; }

 private:
  int& deletions_;
};

// The names the list answers from its cursor, joined with commas.
CVynStringT<wchar_t> walk(const DexObjectList& list) {
  CVynStringT<wchar_t> names;
  for (const DexObject* object = list.getNextObjectInTheList(); object != nullptr;
       object = list.getNextObjectInTheList()) {
    if (!names.IsEmpty()) names += L",";
    names += object->getName();
  }
  return names;
}

}  // namespace

TEST(DexObjectList, KeepsItsName) {
  DexObjectList list;
  EXPECT_TRUE(list.getName().IsEmpty());
  list.setName(L"Selection 1");
  EXPECT_EQ(L"Selection 1", list.getName());
}

TEST(DexObjectList, DeclinesNullAndKeepsTheFirstObjectOfAName) {
  DexDesignPoint first;
  first.setName(L"P1");
  DexArc second;
  second.setName(L"P1");
  DexObjectList list;
  EXPECT_FALSE(list.addObject(nullptr));
  EXPECT_TRUE(list.addObject(&first));
  EXPECT_FALSE(list.addObject(&second));
  EXPECT_EQ(1, list.getNumberOfObjects());
  EXPECT_EQ(&first, list.findObjectInTheList(L"P1"));
}

TEST(DexObjectList, FindsObjectsByExactName) {
  DexPolyLine line(false);
  line.setName(L"Fence");
  DexObjectList list;
  list.addObject(&line);
  EXPECT_EQ(&line, list.findObjectInTheList(L"Fence"));
  EXPECT_EQ(nullptr, list.findObjectInTheList(L"fence"));
  EXPECT_EQ(nullptr, list.findObjectInTheList(L"Fence "));
  EXPECT_EQ(nullptr, DexObjectList().findObjectInTheList(L""));
}

TEST(DexObjectList, IsReadInNameOrderThroughItsCursor) {
  DexDesignPoint b;
  b.setName(L"B");
  DexDesignPoint a;
  a.setName(L"A");
  DexDesignPoint c;
  c.setName(L"C");
  DexObjectList list;
  list.addObject(&b);
  list.addObject(&c);
  list.addObject(&a);
  const DexObjectList& constList = list;
  EXPECT_EQ(L"A,B,C", walk(constList));
  EXPECT_EQ(nullptr, constList.getNextObjectInTheList());
  constList.reset();
  EXPECT_EQ(&a, constList.getNextObjectInTheList());
  constList.reset();
  EXPECT_EQ(L"A,B,C", walk(constList));
}

TEST(DexObjectList, AnEmptyListAnswersNullAtOnce) {
  const DexObjectList list;
  list.reset();
  EXPECT_EQ(nullptr, list.getNextObjectInTheList());
  EXPECT_EQ(0, list.getNumberOfObjects());
}

TEST(DexObjectList, NeverDeletesItsObjects) {
  int deletions = 0;
  CountedPoint point(L"P1", deletions);
  {
    auto* const list = new DexObjectList();
    list->addObject(&point);
    delete list;
  }
  EXPECT_EQ(0, deletions);
}

TEST(DexObjectList, CopiesShareTheObjectsAndReadFromTheStart) {
  DexDesignPoint a;
  a.setName(L"A");
  DexDesignPoint b;
  b.setName(L"B");
  auto* const original = new DexObjectList();
  original->setName(L"L");
  original->addObject(&a);
  original->addObject(&b);
  EXPECT_EQ(&a, original->getNextObjectInTheList());
  const DexObjectList copy(*original);
  DexObjectList assigned;
  assigned = *original;
  delete original;
  EXPECT_EQ(L"L", copy.getName());
  EXPECT_EQ(L"A,B", walk(copy));
  EXPECT_EQ(L"A,B", walk(assigned));
  EXPECT_EQ(&b, assigned.findObjectInTheList(L"B"));
  assigned = std::as_const(assigned);
  EXPECT_EQ(2, assigned.getNumberOfObjects());
}
