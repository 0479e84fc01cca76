// The small value types of the model: typed value records, photo notes, times with milliseconds and
// the base interfaces.
#include "ieObjects/IETypedValues.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <climits>
#include <cmath>
#include <limits>
#include <memory>
#include <type_traits>
#include <utility>

#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEPhotoNotes.h"
#include "ieObjects/IETimeMS.h"
#include "support/PrintString.h"
#include "support/SystemTime.h"
#include "support/TimeZoneScope.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using base::CTime;
using dex_test::systemTime;

enum ESampleKind : int { FIRST = 0, SECOND = 1, THIRD = 2, FOURTH = 3 };

ESampleKind kindFromNumber(int number) {
  return static_cast<ESampleKind>(number);
}

// Positions of the model are polymorphic records; the variant must work with them.
struct SamplePosition {
  SamplePosition() = default;
  SamplePosition(double x, double y) : x(x), y(y) {}
  SamplePosition(const SamplePosition&) = default;
  SamplePosition& operator=(const SamplePosition&) = default;
  virtual ~SamplePosition() = default;
  bool operator==(const SamplePosition& other) const { return x == other.x && y == other.y; }
  double x = 0.0;
  double y = 0.0;
};

static_assert(std::is_trivially_copyable_v<DexTypedValues<ESampleKind, 4>>, "a value record copies by value");
static_assert(sizeof(DexTypedValues<ESampleKind, 4>) == 4 * sizeof(double), "a value record holds no heap");

TEST(DexTypedValues, StoresEachKindAndReadsZeroForKindsOutsideTheArray) {
  DexTypedValues<ESampleKind, 3> values;
  EXPECT_EQ(3, values.size());
  EXPECT_TRUE(values.set(SECOND, 2.5) && values.set(THIRD, -7.25));
  for (const int outside : {3, -1, INT_MAX, INT_MIN})
    EXPECT_FALSE(values.set(kindFromNumber(outside), 99.0) || values.contains(kindFromNumber(outside)))
        << outside;
  EXPECT_TRUE(values.contains(THIRD));
  EXPECT_TRUE(values.get(FIRST) == 0.0 && values.get(SECOND) == 2.5 && values.get(THIRD) == -7.25 &&
              values.get(FOURTH) == 0.0 && values.get(kindFromNumber(INT_MIN)) == 0.0);
  EXPECT_TRUE(values.data()[0] == 0.0 && values.data()[2] == -7.25);
  DexTypedValues<unsigned, 2> wrapping;  // unsigned kinds wrap to outside the array
  EXPECT_FALSE(wrapping.set(static_cast<unsigned>(-1), 4.0));
  const DexTypedValues<ESampleKind, 2> markers(DBL_MAX);  // fills every kind but not the outside answer
  EXPECT_TRUE(markers.get(SECOND) == DBL_MAX && markers.get(THIRD) == 0.0);
  EXPECT_TRUE(std::isnan(DexTypedValues<ESampleKind, 2>(std::nan("")).get(FIRST)));
  DexTypedValues<ESampleKind, 3> copy = values;
  copy.set(SECOND, 2.0);
  EXPECT_TRUE(values.get(SECOND) == 2.5 && !(copy == values));
  copy = values;
  EXPECT_TRUE(copy == values);
  DexTypedArray<ESampleKind, 3, bool> marks;
  marks.set(SECOND, true);
  marks.set(FOURTH, true);
  EXPECT_TRUE(!marks.get(FIRST) && marks.get(SECOND) && !marks.get(FOURTH));
  DexTypedPositions<ESampleKind, 2, SamplePosition> positions;
  EXPECT_TRUE(positions.set(SECOND, SamplePosition(10.0, 20.0)));
  EXPECT_FALSE(positions.set(THIRD, SamplePosition(5.0, 5.0)));
  auto copied = positions;
  copied.set(SECOND, SamplePosition(3.0, 4.0));
  EXPECT_TRUE(positions.get(SECOND) == SamplePosition(10.0, 20.0) &&
              positions.get(FIRST) == SamplePosition() && positions.get(THIRD) == SamplePosition() &&
              positions.get(kindFromNumber(-3)) == SamplePosition());
  EXPECT_EQ(SamplePosition(3.0, 4.0), copied.get(SECOND));
}

DexPhotoNote* noteOf(const wchar_t* fileName, double angle) {
  auto* const note = new DexPhotoNote();
  note->setFileName(fileName);
  note->setData(PHOTO_HORIZONTAL_ANGLE, angle);
  return note;
}

TEST(DexPhotoNotes, KeepNotesInOrderAndCopiesOrClonesOwnTheirOwnNotes) {
  DexPhotoNote note;
  note.setData(PHOTO_DISTANCE, 12.5);
  note.setData(static_cast<EPhotoPropertyDataType>(3), 99.0);  // kinds past the third are ignored
  note.setData(static_cast<EPhotoPropertyDataType>(-1), 99.0);
  EXPECT_TRUE(note.getData(static_cast<EPhotoPropertyDataType>(INT_MAX)) == 0.0 &&
              note.getData(PHOTO_VERTICAL_ANGLE) == 0.0 && note.getData(PHOTO_DISTANCE) == 12.5 &&
              note.getFileName().IsEmpty());
  auto* const notes = new DexPhotoNotes();
  notes->addPhotoNote(noteOf(L"a.jpg", 1.0));
  notes->addPhotoNote(noteOf(L"b.jpg", 2.0));
  notes->addPhotoNote(nullptr);
  EXPECT_EQ(2, notes->getNumberOfPhotoNotes());
  EXPECT_EQ(L"b.jpg", std::as_const(*notes).getPhotoNote(1)->getFileName());
  for (const int index : {2, -1, INT_MAX})
    EXPECT_TRUE(notes->getPhotoNote(index) == nullptr &&
                std::as_const(*notes).getPhotoNote(index) == nullptr);
  const DexPhotoNote* const first = notes->getPhotoNote(0);
  notes->clone(*notes);  // into itself: no change
  DexPhotoNotes& alias = *notes;
  *notes = alias;
  EXPECT_TRUE(notes->getNumberOfPhotoNotes() == 2 && notes->getPhotoNote(0) == first);
  DexPhotoNotes cloned;
  cloned.addPhotoNote(noteOf(L"kept.jpg", 0.0));
  cloned.clone(*notes);  // appends copies
  DexPhotoNotes copy(*notes);
  DexPhotoNotes assigned;
  assigned.addPhotoNote(noteOf(L"old.jpg", 0.0));
  assigned = *notes;
  delete notes;
  EXPECT_TRUE(cloned.getNumberOfPhotoNotes() == 3 && cloned.getPhotoNote(0)->getFileName() == L"kept.jpg");
  EXPECT_EQ(2.0, cloned.getPhotoNote(2)->getData(PHOTO_HORIZONTAL_ANGLE));
  for (const DexPhotoNotes* held : {&copy, &assigned})
    EXPECT_TRUE(held->getNumberOfPhotoNotes() == 2 && held->getPhotoNote(1)->getFileName() == L"b.jpg");
  DexPhotoNote target;
  target.setData(PHOTO_DISTANCE, 3.0);
  target = *copy.getPhotoNote(0);
  EXPECT_TRUE(target.getData(PHOTO_DISTANCE) == 0.0 && target.getFileName() == L"a.jpg" &&
              DexPhotoNote(target).getData(PHOTO_HORIZONTAL_ANGLE) == 1.0);
}

std::string timeOf(const DexTimeMS& time) {
  return std::to_string(time.GetTime()) + "." + std::to_string(time.getMS());
}

TEST(DexTimeMS, ReadsCalendarFieldsAsLocalTimeWithTheDaylightSavingFlagAndKeepsTheMilliseconds) {
  EXPECT_EQ("0.0", timeOf(DexTimeMS()));
  EXPECT_EQ("1234567890.250", timeOf(DexTimeMS(1234567890, 250)));
  EXPECT_EQ("42.999", timeOf(DexTimeMS(CTime(42), 999)));
  {
    const dex_test::TimeZoneScope utc("UTC0");
    EXPECT_EQ("1709296215.125", timeOf(DexTimeMS(2024, 3, 1, 12, 30, 15, 125, -1)));
    EXPECT_EQ("1709296215.7", timeOf(DexTimeMS(systemTime(2024, 3, 1, 12, 30, 15, 999), 7, 0)));
  }
  const dex_test::TimeZoneScope central(dex_test::kCentralEuropeanZone);
  EXPECT_EQ("1719828000.1", timeOf(DexTimeMS(2024, 7, 1, 12, 0, 0, 1, 1)));  // noon summer time
  EXPECT_EQ("1719828000.1", timeOf(DexTimeMS(2024, 7, 1, 12, 0, 0, 1, -1)));
  EXPECT_EQ("1719831600.1", timeOf(DexTimeMS(2024, 7, 1, 12, 0, 0, 1, 0)));
  EXPECT_EQ("1719828000.5", timeOf(DexTimeMS(systemTime(2024, 7, 1, 12, 0, 0, 999), 5, 1)));
  EXPECT_EQ("1719831600.5", timeOf(DexTimeMS(systemTime(2024, 7, 1, 12, 0, 0, 999), 5, 0)));
  for (const int dst : {-1, 0, 1})
    EXPECT_EQ(DexTimeMS(2024, 1, 15, 8, 5, 0, 0, dst).GetTime(), CTime(2024, 1, 15, 8, 5, 0, dst).GetTime());
  EXPECT_EQ("0.300", timeOf(DexTimeMS(2023, 2, 29, 0, 0, 0, 300, -1)));  // invalid fields: the empty time
  EXPECT_EQ("0.300", timeOf(DexTimeMS(systemTime(2023, 13, 1, 0, 0, 0, 999), 300, -1)));
}

TEST(DexTimeMS, ComparesAndCountsWithTheMillisecondsCarriedAndBorrowedIntoZeroTo999) {
  EXPECT_TRUE(DexTimeMS(10, 600) == DexTimeMS(10, 600) && DexTimeMS(10, 600) != DexTimeMS(10, 601));
  EXPECT_TRUE(DexTimeMS(10, 999) < DexTimeMS(11, 0) && DexTimeMS(10, 1) < DexTimeMS(10, 2));
  const auto added = [](DexTimeMS a, const DexTimeMS& b) { return timeOf(a += b); };
  const auto subtracted = [](DexTimeMS a, const DexTimeMS& b) { return timeOf(a -= b); };
  const std::pair<std::string, const char*> rows[] = {
      {added({10, 600}, {2, 500}), "13.100"},   {added({10, 500}, {0, 500}), "11.0"},
      {added({10, 100}, {2, 899}), "12.999"},   {subtracted({10, 200}, {2, 500}), "7.700"},
      {subtracted({10, 0}, {0, 1}), "9.999"},   {subtracted({10, 500}, {3, 500}), "7.0"},
      {added({10, -5}, {0, 0}), "9.995"},       {added({10, 2500}, {1, 600}), "14.100"},
      {subtracted({10, 0}, {0, 1500}), "8.500"}};
  for (const auto& [actual, expected] : rows)
    EXPECT_EQ(actual, expected);
  DexTimeMS time(10, 600);
  const DexTimeMS& same = time;
  time += same;  // itself
  EXPECT_EQ("21.200", timeOf(time));
  time -= same;
  EXPECT_EQ("0.0", timeOf(time));
  time = DexTimeMS(10, 600);
  time.setMS(-3);  // stored as given
  EXPECT_EQ("10.-3", timeOf(*std::make_unique<DexTimeMS>(time)));
}

class Sample : public IDexNameInterface,
               public IDexIdInterface,
               public IDexStateInterface,
               public IDexTimeInterface,
               public IDexObjInterface {
 public:
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  void setId(const CVynStringT<wchar_t>& id) override { id_ = id; }
  const CVynStringT<wchar_t>& getId() const override { return id_; }
  void setStateType(ECurrentState state) override { state_ = state; }
  ECurrentState getStateType() const override { return state_; }
  void setTime(const CTime& time) override { time_ = time; }
  const CTime& getTime() const override { return time_; }
  EDexObjectsType getType() override { return OBJECT_TYPE_TEXT_LABEL; }

 private:
  CVynStringT<wchar_t> name_;
  CVynStringT<wchar_t> id_;
  ECurrentState state_ = ACTIVE_STATE;
  CTime time_;
};

TEST(IDexInterfaces, ObjectsAreReachedAndDeletedThroughEachInterfaceInItsSlotOrder) {
  static_assert(IDexStateInterface::INACTIVE_STATE == 0 && IDexStateInterface::ACTIVE_STATE == 1 &&
                IDexStateInterface::ANY_STATE == 2 && OBJECT_TYPE_ALL == -1 && OBJECT_TYPE_REGION == 13);
  IDexNameInterface* const named = new Sample();
  named->setName(L"P1");
  dynamic_cast<IDexIdInterface*>(named)->setId(L"17");
  auto* const stated = dynamic_cast<IDexStateInterface*>(named);
  stated->setStateType(static_cast<IDexStateInterface::ECurrentState>(7));
  auto* const stamped = dynamic_cast<IDexTimeInterface*>(named);
  stamped->setTime(CTime(1700000000));
  EXPECT_TRUE(named->getName() == L"P1" && stated->getStateType() == 7 &&
              stamped->getTime().GetTime() == 1700000000);
  EXPECT_EQ(OBJECT_TYPE_TEXT_LABEL, dynamic_cast<IDexObjInterface*>(named)->getType());
  delete stamped;  // the virtual destructor of any base releases the whole object
  if (!dex_test::vtableEntryOf(&IDexTimeInterface::setTime))
    GTEST_SKIP() << "virtual table layout not observable";
  EXPECT_EQ(2, dex_test::vtableEntryOf(&IDexTimeInterface::setTime));  // entries 0 and 1: the destructor
  EXPECT_EQ(3, dex_test::vtableEntryOf(&IDexTimeInterface::getTime));
  EXPECT_EQ(2, dex_test::vtableEntryOf(&IDexObjInterface::getType));
  EXPECT_EQ(2, dex_test::vtableEntryOf(&IDexNameInterface::setName));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&IDexStateInterface::getStateType));
}

}  // namespace
