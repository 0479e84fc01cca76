#include "ieObjects/IEInterfaces.h"

#include <gtest/gtest.h>

#include "support/VtableSlot.h"

namespace {

using vyn::ie::IDexIdInterface;
using vyn::ie::IDexNameInterface;
using vyn::ie::IDexStateInterface;

class Sample : public IDexNameInterface, public IDexIdInterface, public IDexStateInterface {
 public:
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  void setId(const CVynStringT<wchar_t>& id) override { id_ = id; }
  const CVynStringT<wchar_t>& getId() const override { return id_; }
  void setStateType(ECurrentState state) override { state_ = state; }
  ECurrentState getStateType() const override { return state_; }

 private:
  CVynStringT<wchar_t> name_;
  CVynStringT<wchar_t> id_;
  ECurrentState state_ = ACTIVE_STATE;
};

}  // namespace

static_assert(sizeof(IDexStateInterface::ECurrentState) == 4);
static_assert(IDexStateInterface::INACTIVE_STATE == 0 && IDexStateInterface::ACTIVE_STATE == 1 &&
              IDexStateInterface::ANY_STATE == 2);

TEST(IDexInterfaces, ObjectsAreReachedAndDeletedThroughEachInterface) {
  IDexNameInterface* const named = new Sample();
  named->setName(L"P1");
  auto* const identified = dynamic_cast<IDexIdInterface*>(named);
  ASSERT_NE(nullptr, identified);
  identified->setId(L"17");
  auto* const stated = dynamic_cast<IDexStateInterface*>(identified);
  ASSERT_NE(nullptr, stated);
  EXPECT_EQ(IDexStateInterface::ACTIVE_STATE, stated->getStateType());
  stated->setStateType(static_cast<IDexStateInterface::ECurrentState>(7));
  EXPECT_EQ(7, stated->getStateType());
  EXPECT_EQ(L"P1", named->getName());
  delete stated;  // the virtual destructor of any base releases the whole object
}

TEST(IDexInterfaces, CopyingAnObjectCopiesOnlyItsOwnData) {
  Sample original;
  original.setName(L"A");
  Sample copy(original);
  EXPECT_EQ(L"A", copy.getName());
  copy.setName(L"B");
  original = copy;
  EXPECT_EQ(L"B", original.getName());
}

// ---- Time and object-kind interfaces ------------------------------------------------------------

namespace {

using vyn::ie::EDexObjectsType;
using vyn::ie::IDexObjInterface;
using vyn::ie::IDexTimeInterface;

class StampedObject : public IDexTimeInterface, public IDexObjInterface {
 public:
  void setTime(const base::CTime& time) override { time_ = time; }
  const base::CTime& getTime() const override { return time_; }
  EDexObjectsType getType() override { return vyn::ie::OBJECT_TYPE_TEXT_LABEL; }

 private:
  base::CTime time_;
};

}  // namespace

static_assert(sizeof(EDexObjectsType) == 4);
static_assert(vyn::ie::OBJECT_TYPE_ALL == -1 && vyn::ie::OBJECT_TYPE_DESIGN_POINT == 0 &&
              vyn::ie::OBJECT_TYPE_SHEET_POINT == 3 && vyn::ie::OBJECT_TYPE_POLYLINE == 4 &&
              vyn::ie::OBJECT_TYPE_SURFACE == 8 && vyn::ie::OBJECT_TYPE_TEXT_LABEL == 11 &&
              vyn::ie::OBJECT_TYPE_REGION == 13);

TEST(IDexInterfaces, TimeAndKindAreReachedAndDeletedThroughTheirInterfaces) {
  IDexTimeInterface* const stamped = new StampedObject();
  EXPECT_EQ(stamped->getTime(), base::CTime());
  stamped->setTime(base::CTime(1700000000));
  EXPECT_EQ(stamped->getTime().GetTime(), 1700000000);
  auto* const typed = dynamic_cast<IDexObjInterface*>(stamped);
  ASSERT_NE(nullptr, typed);
  EXPECT_EQ(vyn::ie::OBJECT_TYPE_TEXT_LABEL, typed->getType());
  delete typed;
}

TEST(IDexInterfaces, OperationsFollowTheDestructorInTheTable) {
  const auto setTime = dex_test::vtableEntryOf(&IDexTimeInterface::setTime);
  const auto getTime = dex_test::vtableEntryOf(&IDexTimeInterface::getTime);
  const auto getType = dex_test::vtableEntryOf(&IDexObjInterface::getType);
  const auto setName = dex_test::vtableEntryOf(&IDexNameInterface::setName);
  const auto getStateType = dex_test::vtableEntryOf(&IDexStateInterface::getStateType);
  if (!setTime || !getTime || !getType || !setName || !getStateType) {
    GTEST_SKIP() << "virtual table layout not observable on this platform";
  }
  // Entries 0 and 1 are the destructor (complete and deleting).
  EXPECT_EQ(*setTime, 2);
  EXPECT_EQ(*getTime, 3);
  EXPECT_EQ(*getType, 2);
  EXPECT_EQ(*setName, 2);
  EXPECT_EQ(*getStateType, 3);
}
