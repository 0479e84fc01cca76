#include "ieObjects/IEInterfaces.h"

#include <gtest/gtest.h>

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
