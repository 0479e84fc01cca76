#include "ieUtils/IESettings.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstring>
#include <type_traits>
#include <utility>

#include "support/VtableSlot.h"

namespace {

using vyn::ie::DexDisplaySettings;
using vyn::ie::DexOptionBlock;
using vyn::ie::DexSettings;
using vyn::ie::DexTextLayout;
using vyn::ie::DexToleranceFilter;
using vyn::ie::DexUserAsciiSettingsData;
using vyn::ie::EDexDataType;
using vyn::ie::EDexResult;
using vyn::ie::IDexFinishNotifier;
using vyn::ie::IDexMessageBox;
using vyn::ie::kToleranceNotSet;
namespace fields = vyn::ie::ascii_fields;

// What happened to the host objects of one test: how many were made (clones included), cloned and
// deleted. A test ends with made == deleted, and the sanitizer run catches a second delete.
struct Lifetimes {
  int made = 0;
  int clones = 0;
  int deleted = 0;
  int alive() const { return made - deleted; }
};

// A message box that answers its tag and counts its lifetime. failClone makes clone() answer null, as a
// failed allocation does.
class CountingMessageBox : public IDexMessageBox {
 public:
  CountingMessageBox(Lifetimes& lifetimes, int tag, bool failClone = false)
      : lifetimes_(&lifetimes), tag_(tag), failClone_(failClone) {
    ++lifetimes_->made;
  }
  CountingMessageBox(const CountingMessageBox& other)
      : IDexMessageBox(other), lifetimes_(other.lifetimes_), tag_(other.tag_), failClone_(other.failClone_) {
    ++lifetimes_->made;
  }
  CountingMessageBox& operator=(const CountingMessageBox&) = delete;
  ~CountingMessageBox() override { ++lifetimes_->deleted; }

  IDexMessageBox* clone() const override {
    ++lifetimes_->clones;
    return failClone_ ? nullptr : new CountingMessageBox(*this);
  }
  int confirmOverwrite(HWND /*parentWindow*/, const wchar_t* /*shortPath*/) const override { return tag_; }

 private:
  Lifetimes* lifetimes_;
  int tag_;
  bool failClone_;
};

// A notifier that remembers the last result it was told, starting from its tag.
class CountingNotifier : public IDexFinishNotifier {
 public:
  CountingNotifier(Lifetimes& lifetimes, int tag, bool failClone = false)
      : lifetimes_(&lifetimes), last_(static_cast<EDexResult>(tag)), failClone_(failClone) {
    ++lifetimes_->made;
  }
  CountingNotifier(const CountingNotifier& other)
      : IDexFinishNotifier(other),
        lifetimes_(other.lifetimes_),
        last_(other.last_),
        failClone_(other.failClone_) {
    ++lifetimes_->made;
  }
  CountingNotifier& operator=(const CountingNotifier&) = delete;
  ~CountingNotifier() override { ++lifetimes_->deleted; }

  IDexFinishNotifier* clone() const override {
    ++lifetimes_->clones;
    return failClone_ ? nullptr : new CountingNotifier(*this);
  }
  void onFinished(EDexResult result) override { last_ = result; }

  int last() const { return last_; }

 private:
  Lifetimes* lifetimes_;
  EDexResult last_;
  bool failClone_;
};

int tagOf(const IDexMessageBox* box) {
  return box->confirmOverwrite(nullptr, L"a.txt");
}
int tagOf(const IDexFinishNotifier* notifier) {
  return static_cast<const CountingNotifier*>(notifier)->last();
}

// Whether T has class-level operator new and delete of its own, so that either side of the plug-in
// boundary may delete what the other made.
template <class T>
constexpr bool hasClassAllocator = requires(std::size_t size, void* block) {
  T::operator new(size);
  T::operator delete(block);
};

DexSettings settingsWith(std::initializer_list<EDexDataType> types) {
  DexSettings settings;
  for (const EDexDataType type : types)
    settings.addDataType(type);
  return settings;
}

DexToleranceFilter* filterOf(double north, double east, double elevation) {
  auto* const filter = new DexToleranceFilter;
  filter->north = north;
  filter->east = east;
  filter->elevation = elevation;
  return filter;
}

DexUserAsciiSettingsData* asciiLayoutOf(std::initializer_list<fields::EType> types) {
  auto* const layout = new DexUserAsciiSettingsData;
  layout->delimiter = L';';
  layout->headerLine = true;
  for (const fields::EType type : types)
    layout->fields.push_back({type, 10, 1});
  return layout;
}

}  // namespace

// ---- Defaults ---------------------------------------------------------------------------------------

TEST(DexSettings, StartsWithoutDataTypesInAnyUnitsAndWithoutHostObjects) {
  const DexSettings settings;
  EXPECT_TRUE(settings.dataTypes.isEmpty());
  EXPECT_EQ(27, settings.distUnits);
  EXPECT_EQ(5, settings.angleUnits);
  EXPECT_EQ(1, settings.coordsStyle);
  EXPECT_EQ(3, settings.coordDecimals[0]);
  EXPECT_EQ(3, settings.coordDecimals[1]);
  EXPECT_EQ(3, settings.coordDecimals[2]);
  EXPECT_EQ(-1, settings.maxNumericPointName);
  EXPECT_EQ(nullptr, settings.messageBox);
  EXPECT_EQ(nullptr, settings.exportNotifier);
  EXPECT_EQ(nullptr, settings.importNotifier);
  EXPECT_EQ(nullptr, settings.parentWindow);
}

TEST(DexSettings, StartsWithoutRecordsAndWithThePluginDefaults) {
  const DexSettings settings;
  EXPECT_EQ(nullptr, settings.userAsciiSettings);
  EXPECT_EQ(nullptr, settings.textLayout);
  EXPECT_EQ(nullptr, settings.optionBlock);
  EXPECT_EQ(nullptr, settings.toleranceFilter);
  EXPECT_EQ(nullptr, settings.pluginText);
  EXPECT_TRUE(settings.pluginFlags[0]);
  EXPECT_TRUE(settings.pluginFlags[1]);
  for (int index = 0; index < 16; ++index)
    EXPECT_EQ(index == 7 || index == 15, settings.pluginOptions[index]) << "option " << index;
  EXPECT_FALSE(settings.pluginOption);
  EXPECT_EQ(2, settings.pluginValue);
}

// ---- Data types -------------------------------------------------------------------------------------

TEST(DexSettings, FindsTheDataTypesItWasGiven) {
  DexSettings settings;
  settings.addDataType(vyn::ie::LINES);
  settings.addDataType(vyn::ie::MULTIPLE);
  settings.addDataType(vyn::ie::LINES);
  EXPECT_TRUE(settings.hasDataType(vyn::ie::LINES));
  EXPECT_TRUE(settings.hasDataType(vyn::ie::MULTIPLE));
  EXPECT_FALSE(settings.hasDataType(vyn::ie::POINTS));
  EXPECT_EQ(2, settings.dataTypes.count());
}

TEST(DexSettings, RemovingAnAbsentDataTypeChangesNothing) {
  DexSettings settings = settingsWith({vyn::ie::POINTS, vyn::ie::CODES});
  settings.removeDataType(vyn::ie::SURFACES);
  settings.removeDataType(static_cast<EDexDataType>(-1));
  settings.removeDataType(static_cast<EDexDataType>(64));
  EXPECT_EQ((vyn::ie::DexFlags<EDexDataType>{vyn::ie::POINTS, vyn::ie::CODES}), settings.dataTypes);
  settings.removeDataType(vyn::ie::CODES);
  EXPECT_EQ(vyn::ie::DexFlags<EDexDataType>(vyn::ie::POINTS), settings.dataTypes);
}

TEST(DexSettings, RemoveAllDataTypesLeavesNone) {
  DexSettings settings = settingsWith({vyn::ie::POINTS, vyn::ie::ROADS, vyn::ie::MULTIPLE});
  settings.removeAllDataTypes();
  EXPECT_TRUE(settings.dataTypes.isEmpty());
  EXPECT_FALSE(settings.hasDataType(vyn::ie::ROADS));
}

TEST(DexSettings, HasOnlyThisDataTypeWhenItIsTheOneKindRequested) {
  EXPECT_TRUE(settingsWith({vyn::ie::POINTS}).hasOnlyThisDataType(vyn::ie::POINTS));
  EXPECT_FALSE(settingsWith({vyn::ie::POINTS, vyn::ie::LINES}).hasOnlyThisDataType(vyn::ie::POINTS));
  EXPECT_FALSE(settingsWith({vyn::ie::LINES}).hasOnlyThisDataType(vyn::ie::POINTS));
  EXPECT_FALSE(settingsWith({}).hasOnlyThisDataType(vyn::ie::POINTS));
}

TEST(DexSettings, HasOnlyThisDataTypeForEachSingleKind) {
  for (int kind = 0; kind <= vyn::ie::FIELD_REPORTS; ++kind) {
    const DexSettings settings = settingsWith({static_cast<EDexDataType>(kind)});
    for (int asked = 0; asked < vyn::ie::kDexDataTypeCount; ++asked)
      EXPECT_EQ(asked == kind, settings.hasOnlyThisDataType(static_cast<EDexDataType>(asked)))
          << "kind " << kind << ", asked " << asked;
  }
}

TEST(DexSettings, MultipleIsNeverCountedAsAKind) {
  const DexSettings withMultiple = settingsWith({vyn::ie::POINTS, vyn::ie::MULTIPLE});
  EXPECT_TRUE(withMultiple.hasOnlyThisDataType(vyn::ie::POINTS));
  EXPECT_FALSE(withMultiple.hasOnlyThisDataType(vyn::ie::MULTIPLE));
  const DexSettings onlyMultiple = settingsWith({vyn::ie::MULTIPLE});
  EXPECT_FALSE(onlyMultiple.hasOnlyThisDataType(vyn::ie::MULTIPLE));
  EXPECT_FALSE(onlyMultiple.hasOnlyThisDataType(vyn::ie::POINTS));
}

TEST(DexSettings, ValuesOutsideTheKindsAreNeitherCountedNorTheOnlyKind) {
  DexSettings settings = settingsWith({vyn::ie::FIELD_REPORTS});
  settings.addDataType(static_cast<EDexDataType>(30));
  EXPECT_TRUE(settings.hasOnlyThisDataType(vyn::ie::FIELD_REPORTS));
  EXPECT_FALSE(settings.hasOnlyThisDataType(static_cast<EDexDataType>(30)));
  EXPECT_FALSE(settings.hasOnlyThisDataType(static_cast<EDexDataType>(-1)));
}

// ---- Tolerance filter -------------------------------------------------------------------------------

TEST(DexSettings, ToleranceNotSetIsTheSmallestNormalDouble) {
  EXPECT_EQ(2.2250738585072014e-308, kToleranceNotSet);
  EXPECT_EQ(vyn::ie::kNoHeight, kToleranceNotSet);
  const DexToleranceFilter filter;
  EXPECT_EQ(kToleranceNotSet, filter.north);
  EXPECT_EQ(kToleranceNotSet, filter.east);
  EXPECT_EQ(kToleranceNotSet, filter.elevation);
}

TEST(DexSettings, HasNoToleranceFilterWithoutARecordOrWithNothingSet) {
  DexSettings settings;
  EXPECT_FALSE(settings.hasToleranceFilter());
  settings.toleranceFilter = filterOf(kToleranceNotSet, kToleranceNotSet, kToleranceNotSet);
  EXPECT_FALSE(settings.hasToleranceFilter());
}

TEST(DexSettings, HasAToleranceFilterWhenAnyValueIsSetEvenToZero) {
  const double notSet = kToleranceNotSet;
  for (DexToleranceFilter* const filter :
       {filterOf(0.0, notSet, notSet), filterOf(notSet, 0.0, notSet), filterOf(notSet, notSet, 0.0),
        filterOf(0.02, 0.02, 0.05), filterOf(notSet, notSet, -0.0)}) {
    DexSettings settings;
    settings.toleranceFilter = filter;
    EXPECT_TRUE(settings.hasToleranceFilter())
        << filter->north << ", " << filter->east << ", " << filter->elevation;
  }
}

// ---- Assignment: plain values -----------------------------------------------------------------------

TEST(DexSettings, AssignmentCopiesEveryPlainValue) {
  int window = 0;
  DexSettings source = settingsWith({vyn::ie::LINES, vyn::ie::MULTIPLE});
  source.distUnits = vyn::ie::USFEET;
  source.angleUnits = vyn::ie::GRADS_GONS;
  source.coordsStyle = vyn::ie::DMS_WITH_MARKS;
  source.coordDecimals = {4, 5, 2};
  source.pluginFlags = {false, true};
  source.pluginOptions = {};
  source.pluginOptions[0] = true;
  source.maxNumericPointName = 1200;
  source.pluginOption = true;
  source.pluginValue = -7;
  source.parentWindow = &window;

  DexSettings target;
  target = source;
  EXPECT_EQ(source.dataTypes, target.dataTypes);
  EXPECT_EQ(vyn::ie::USFEET, target.distUnits);
  EXPECT_EQ(vyn::ie::GRADS_GONS, target.angleUnits);
  EXPECT_EQ(vyn::ie::DMS_WITH_MARKS, target.coordsStyle);
  EXPECT_EQ(source.coordDecimals, target.coordDecimals);
  EXPECT_EQ(source.pluginFlags, target.pluginFlags);
  EXPECT_EQ(source.pluginOptions, target.pluginOptions);
  EXPECT_EQ(1200, target.maxNumericPointName);
  EXPECT_TRUE(target.pluginOption);
  EXPECT_EQ(-7, target.pluginValue);
  EXPECT_EQ(&window, target.parentWindow);
}

TEST(DexSettings, AssignedDataTypesAreACopy) {
  const DexSettings source = settingsWith({vyn::ie::POINTS});
  DexSettings target = settingsWith({vyn::ie::ROADS, vyn::ie::SURFACES});
  target = source;
  EXPECT_TRUE(target.hasOnlyThisDataType(vyn::ie::POINTS));
  target.addDataType(vyn::ie::CODES);
  EXPECT_FALSE(source.hasDataType(vyn::ie::CODES));
}

// ---- Assignment: host objects -----------------------------------------------------------------------

TEST(DexSettings, AssignmentReplacesTheMessageBoxWithACloneOfTheSources) {
  Lifetimes lifetimes;
  {
    DexSettings source;
    source.messageBox = new CountingMessageBox(lifetimes, 6);
    DexSettings target;
    target.messageBox = new CountingMessageBox(lifetimes, 7);
    target = source;
    ASSERT_NE(nullptr, target.messageBox);
    EXPECT_NE(source.messageBox, target.messageBox);
    EXPECT_EQ(6, tagOf(target.messageBox));
    EXPECT_EQ(1, lifetimes.clones);
    EXPECT_EQ(1, lifetimes.deleted);
  }
  EXPECT_EQ(0, lifetimes.alive());
}

TEST(DexSettings, AssignmentRemovesTheMessageBoxWhenTheSourceHasNone) {
  Lifetimes lifetimes;
  DexSettings target;
  target.messageBox = new CountingMessageBox(lifetimes, 6);
  target = DexSettings();
  EXPECT_EQ(nullptr, target.messageBox);
  EXPECT_EQ(0, lifetimes.alive());
}

TEST(DexSettings, AssignmentReplacesTheTargetsNotifiersWithClonesOfTheSources) {
  Lifetimes lifetimes;
  {
    DexSettings source;
    source.importNotifier = new CountingNotifier(lifetimes, 1);
    source.exportNotifier = new CountingNotifier(lifetimes, 2);
    DexSettings target;
    target.importNotifier = new CountingNotifier(lifetimes, 3);
    target.exportNotifier = new CountingNotifier(lifetimes, 4);
    target = source;
    EXPECT_EQ(1, tagOf(target.importNotifier));
    EXPECT_EQ(2, tagOf(target.exportNotifier));
    EXPECT_NE(source.importNotifier, target.importNotifier);
    EXPECT_NE(source.exportNotifier, target.exportNotifier);
    EXPECT_EQ(2, lifetimes.clones);
    EXPECT_EQ(2, lifetimes.deleted);
  }
  EXPECT_EQ(0, lifetimes.alive());
}

TEST(DexSettings, AssignmentWithoutNotifiersKeepsTheTargetsButRemovesItsMessageBox) {
  Lifetimes lifetimes;
  {
    DexSettings target;
    auto* const importNotifier = new CountingNotifier(lifetimes, 3);
    auto* const exportNotifier = new CountingNotifier(lifetimes, 4);
    target.importNotifier = importNotifier;
    target.exportNotifier = exportNotifier;
    target.messageBox = new CountingMessageBox(lifetimes, 6);
    target = settingsWith({vyn::ie::POINTS});
    EXPECT_EQ(importNotifier, target.importNotifier);
    EXPECT_EQ(exportNotifier, target.exportNotifier);
    EXPECT_EQ(nullptr, target.messageBox);
    EXPECT_EQ(0, lifetimes.clones);
    EXPECT_EQ(1, lifetimes.deleted);
  }
  EXPECT_EQ(0, lifetimes.alive());
}

TEST(DexSettings, AssignmentTakesOneNotifierAndKeepsTheOther) {
  Lifetimes lifetimes;
  DexSettings source;
  source.exportNotifier = new CountingNotifier(lifetimes, 2);
  DexSettings target;
  auto* const importNotifier = new CountingNotifier(lifetimes, 3);
  target.importNotifier = importNotifier;
  target = source;
  EXPECT_EQ(importNotifier, target.importNotifier);
  EXPECT_EQ(2, tagOf(target.exportNotifier));
}

TEST(DexSettings, AFailedCloneLeavesTheFieldEmptyAndTheOldObjectDeleted) {
  Lifetimes lifetimes;
  {
    DexSettings source;
    source.messageBox = new CountingMessageBox(lifetimes, 6, true);
    source.importNotifier = new CountingNotifier(lifetimes, 1, true);
    DexSettings target;
    target.messageBox = new CountingMessageBox(lifetimes, 7);
    target.importNotifier = new CountingNotifier(lifetimes, 3);
    target = source;
    EXPECT_EQ(nullptr, target.messageBox);
    EXPECT_EQ(nullptr, target.importNotifier);
    EXPECT_EQ(2, lifetimes.deleted);
  }
  EXPECT_EQ(0, lifetimes.alive());
}

// ---- Assignment: records ----------------------------------------------------------------------------

TEST(DexSettings, AssignmentDeepCopiesTheUserAsciiLayout) {
  DexSettings source;
  source.userAsciiSettings =
      asciiLayoutOf({fields::FIELD_NAME, fields::FIELD_NORTHING, fields::FIELD_EASTING});
  DexSettings target;
  target.userAsciiSettings = asciiLayoutOf({fields::FIELD_CODES});
  target = source;
  ASSERT_NE(nullptr, target.userAsciiSettings);
  EXPECT_NE(source.userAsciiSettings, target.userAsciiSettings);
  EXPECT_EQ(L';', target.userAsciiSettings->delimiter);
  EXPECT_TRUE(target.userAsciiSettings->headerLine);
  ASSERT_EQ(3u, target.userAsciiSettings->fields.size());
  EXPECT_EQ(fields::FIELD_NORTHING, target.userAsciiSettings->fields[1].type);
  EXPECT_EQ(10, target.userAsciiSettings->fields[1].width);
  EXPECT_EQ(1, target.userAsciiSettings->fields[1].alignment);

  source.userAsciiSettings->fields.clear();
  EXPECT_EQ(3u, target.userAsciiSettings->fields.size());
}

TEST(DexSettings, AssignmentDeepCopiesTheTextLayout) {
  DexSettings source;
  source.textLayout = new DexTextLayout;
  source.textLayout->title = L"Stakeout";
  source.textLayout->fields.push_back({fields::FIELD_DESIGN_POINT, 12, 0});
  source.textLayout->headerTexts[6] = L"last header";
  source.textLayout->footerTexts[5] = L"last footer";
  DexSettings target;
  target = source;
  ASSERT_NE(nullptr, target.textLayout);
  EXPECT_NE(source.textLayout, target.textLayout);
  EXPECT_EQ(L"Stakeout", target.textLayout->title);
  ASSERT_EQ(1u, target.textLayout->fields.size());
  EXPECT_EQ(fields::FIELD_DESIGN_POINT, target.textLayout->fields[0].type);
  EXPECT_EQ(L"last header", target.textLayout->headerTexts[6]);
  EXPECT_EQ(L"last footer", target.textLayout->footerTexts[5]);

  source.textLayout->title = L"changed";
  EXPECT_EQ(L"Stakeout", target.textLayout->title);
}

TEST(DexSettings, AssignmentCopiesTheOptionBlockByteForByte) {
  DexSettings source;
  source.optionBlock = new DexOptionBlock;
  for (std::size_t index = 0; index < DexOptionBlock::kSize; ++index)
    source.optionBlock->bytes[index] = static_cast<std::uint8_t>(0xA0 + index);
  DexSettings target;
  target = source;
  ASSERT_NE(nullptr, target.optionBlock);
  EXPECT_NE(source.optionBlock, target.optionBlock);
  EXPECT_EQ(0, std::memcmp(source.optionBlock, target.optionBlock, DexOptionBlock::kSize));
}

TEST(DexSettings, AssignmentRemovesTheRecordsThatAlwaysFollowTheSource) {
  DexSettings target;
  target.userAsciiSettings = asciiLayoutOf({fields::FIELD_NAME});
  target.textLayout = new DexTextLayout;
  target.optionBlock = new DexOptionBlock;
  target = DexSettings();
  EXPECT_EQ(nullptr, target.userAsciiSettings);
  EXPECT_EQ(nullptr, target.textLayout);
  EXPECT_EQ(nullptr, target.optionBlock);
}

TEST(DexSettings, AssignmentReplacesTheToleranceFilterAndTextOnlyWhenTheSourceHasThem) {
  DexSettings source;
  source.toleranceFilter = filterOf(0.01, 0.02, 0.03);
  source.pluginText = new CVynStringT<wchar_t>(L"from the host");
  DexSettings target;
  target.toleranceFilter = filterOf(1.0, 1.0, 1.0);
  target.pluginText = new CVynStringT<wchar_t>(L"old");
  target = source;
  ASSERT_NE(nullptr, target.toleranceFilter);
  EXPECT_NE(source.toleranceFilter, target.toleranceFilter);
  EXPECT_EQ(0.02, target.toleranceFilter->east);
  ASSERT_NE(nullptr, target.pluginText);
  EXPECT_NE(source.pluginText, target.pluginText);
  EXPECT_EQ(L"from the host", *target.pluginText);

  DexToleranceFilter* const kept = target.toleranceFilter;
  CVynStringT<wchar_t>* const keptText = target.pluginText;
  target = DexSettings();
  EXPECT_EQ(kept, target.toleranceFilter);
  EXPECT_EQ(keptText, target.pluginText);
  EXPECT_TRUE(target.hasToleranceFilter());
}

// ---- Self-assignment, copy construction, destruction ------------------------------------------------

TEST(DexSettings, SelfAssignmentChangesNothing) {
  Lifetimes lifetimes;
  DexSettings settings = settingsWith({vyn::ie::CODES});
  auto* const box = new CountingMessageBox(lifetimes, 6);
  auto* const notifier = new CountingNotifier(lifetimes, 1);
  auto* const layout = asciiLayoutOf({fields::FIELD_X});
  settings.messageBox = box;
  settings.importNotifier = notifier;
  settings.userAsciiSettings = layout;
  DexSettings& alias = settings;
  settings = alias;
  EXPECT_EQ(box, settings.messageBox);
  EXPECT_EQ(notifier, settings.importNotifier);
  EXPECT_EQ(layout, settings.userAsciiSettings);
  EXPECT_TRUE(settings.hasOnlyThisDataType(vyn::ie::CODES));
  EXPECT_EQ(0, lifetimes.clones);
  EXPECT_EQ(0, lifetimes.deleted);
}

TEST(DexSettings, CopyConstructionClonesEveryOwnedObject) {
  Lifetimes lifetimes;
  {
    DexSettings source = settingsWith({vyn::ie::ROADS});
    source.messageBox = new CountingMessageBox(lifetimes, 6);
    source.importNotifier = new CountingNotifier(lifetimes, 1);
    source.exportNotifier = new CountingNotifier(lifetimes, 2);
    source.userAsciiSettings = asciiLayoutOf({fields::FIELD_Z});
    source.textLayout = new DexTextLayout;
    source.optionBlock = new DexOptionBlock;
    source.toleranceFilter = filterOf(0.0, 0.0, 0.0);
    source.pluginText = new CVynStringT<wchar_t>(L"text");
    source.maxNumericPointName = 99;

    const DexSettings copy(source);
    EXPECT_EQ(3, lifetimes.clones);
    EXPECT_EQ(6, tagOf(copy.messageBox));
    EXPECT_EQ(1, tagOf(copy.importNotifier));
    EXPECT_EQ(2, tagOf(copy.exportNotifier));
    for (const auto& [original, duplicate] :
         {std::pair<const void*, const void*>{source.messageBox, copy.messageBox},
          {source.importNotifier, copy.importNotifier},
          {source.exportNotifier, copy.exportNotifier},
          {source.userAsciiSettings, copy.userAsciiSettings},
          {source.textLayout, copy.textLayout},
          {source.optionBlock, copy.optionBlock},
          {source.toleranceFilter, copy.toleranceFilter},
          {source.pluginText, copy.pluginText}}) {
      EXPECT_NE(nullptr, duplicate);
      EXPECT_NE(original, duplicate);
    }
    EXPECT_TRUE(copy.hasOnlyThisDataType(vyn::ie::ROADS));
    EXPECT_EQ(99, copy.maxNumericPointName);
  }
  EXPECT_EQ(0, lifetimes.alive());
}

TEST(DexSettings, CopyConstructionOfDefaultSettingsGivesTheDefaults) {
  DexSettings source;
  source.coordsStyle = vyn::ie::DECIMAL_DEGREES;
  const DexSettings copy(source);
  EXPECT_EQ(nullptr, copy.importNotifier);
  EXPECT_EQ(nullptr, copy.exportNotifier);
  EXPECT_EQ(nullptr, copy.toleranceFilter);
  EXPECT_EQ(nullptr, copy.pluginText);
  EXPECT_EQ(vyn::ie::DECIMAL_DEGREES, copy.coordsStyle);
  EXPECT_EQ(2, copy.pluginValue);
}

TEST(DexSettings, DestructionDeletesEveryOwnedHostObject) {
  Lifetimes lifetimes;
  auto* const settings = new DexSettings;
  settings->messageBox = new CountingMessageBox(lifetimes, 6);
  settings->importNotifier = new CountingNotifier(lifetimes, 1);
  settings->exportNotifier = new CountingNotifier(lifetimes, 2);
  delete settings;
  EXPECT_EQ(3, lifetimes.deleted);
  EXPECT_EQ(0, lifetimes.alive());
}

TEST(DexSettings, ChainedCopiesNeitherLeakNorShare) {
  Lifetimes lifetimes;
  {
    DexSettings first;
    first.messageBox = new CountingMessageBox(lifetimes, 6);
    first.importNotifier = new CountingNotifier(lifetimes, 1);
    DexSettings second(first);
    DexSettings third;
    third = second;
    second = first;
    first = third;
    EXPECT_EQ(6, tagOf(first.messageBox));
    EXPECT_EQ(1, tagOf(third.importNotifier));
    EXPECT_EQ(6, lifetimes.alive());
  }
  EXPECT_EQ(0, lifetimes.alive());
}

// ---- Host object interfaces -------------------------------------------------------------------------

TEST(IDexMessageBox, KeepsDestructorCloneAndConfirmOverwriteInThatOrder) {
  EXPECT_TRUE(std::has_virtual_destructor_v<IDexMessageBox>);
  using Clone = IDexMessageBox* (IDexMessageBox::*)();
  using Confirm = int (IDexMessageBox::*)(HWND, const wchar_t*);
  const auto clone = dex_test::vtableEntryOf(static_cast<Clone>(&IDexMessageBox::clone));
  const auto confirmOverwrite =
      dex_test::vtableEntryOf(static_cast<Confirm>(&IDexMessageBox::confirmOverwrite));
  if (!clone) GTEST_SKIP() << "virtual table layout not known on this platform";
  EXPECT_EQ(2, *clone);
  EXPECT_EQ(3, *confirmOverwrite);
}

TEST(IDexMessageBox, AnswersThroughTheHostsObject) {
  Lifetimes lifetimes;
  const CountingMessageBox box(lifetimes, IDYES);
  const IDexMessageBox& asked = box;
  EXPECT_EQ(IDYES, asked.confirmOverwrite(nullptr, L"/jobs/a.txt"));
}

namespace {

// Host objects written against either form of the operations: plain or const.
class PlainMessageBox : public IDexMessageBox {
 public:
  IDexMessageBox* clone() override { return new PlainMessageBox(*this); }
  int confirmOverwrite(HWND, const wchar_t*) override { return IDYES; }
};

class ConstMessageBox : public IDexMessageBox {
 public:
  IDexMessageBox* clone() const override { return new ConstMessageBox(*this); }
  int confirmOverwrite(HWND, const wchar_t*) const override { return IDYES; }
};

class PlainNotifier : public IDexFinishNotifier {
 public:
  IDexFinishNotifier* clone() override { return new PlainNotifier(*this); }
  void onFinished(EDexResult) override {}
};

template <class Box>
int askThroughCopiedSettings() {
  DexSettings settings;
  settings.messageBox = new Box();
  const DexSettings copy(settings);
  if (copy.messageBox == nullptr || copy.messageBox == settings.messageBox) return -1;
  return copy.messageBox->confirmOverwrite(nullptr, L"a.txt");
}

}  // namespace

TEST(IDexMessageBox, EitherFormOfTheOperationsServes) {
  EXPECT_EQ(IDYES, askThroughCopiedSettings<PlainMessageBox>());
  EXPECT_EQ(IDYES, askThroughCopiedSettings<ConstMessageBox>());

  DexSettings settings;
  settings.importNotifier = new PlainNotifier();
  const DexSettings copy(settings);
  EXPECT_NE(nullptr, copy.importNotifier);
  EXPECT_NE(settings.importNotifier, copy.importNotifier);
}

TEST(IDexFinishNotifier, KeepsDestructorCloneAndOnFinishedInThatOrder) {
  EXPECT_TRUE(std::has_virtual_destructor_v<IDexFinishNotifier>);
  using Clone = IDexFinishNotifier* (IDexFinishNotifier::*)();
  const auto clone = dex_test::vtableEntryOf(static_cast<Clone>(&IDexFinishNotifier::clone));
  const auto onFinished = dex_test::vtableEntryOf(&IDexFinishNotifier::onFinished);
  if (!clone) GTEST_SKIP() << "virtual table layout not known on this platform";
  EXPECT_EQ(2, *clone);
  EXPECT_EQ(3, *onFinished);
}

TEST(IDexFinishNotifier, IsToldTheResultThroughTheSettings) {
  Lifetimes lifetimes;
  DexSettings settings;
  settings.importNotifier = new CountingNotifier(lifetimes, 0);
  const DexSettings& held = settings;
  held.importNotifier->onFinished(vyn::ie::DEX_RESULT_STOPPED);
  EXPECT_EQ(vyn::ie::DEX_RESULT_STOPPED, tagOf(settings.importNotifier));
}

// ---- Records ----------------------------------------------------------------------------------------

TEST(DexOptionBlock, IsThirtyTwoZeroBytes) {
  EXPECT_EQ(32u, sizeof(DexOptionBlock));
  const DexOptionBlock block;
  for (const std::uint8_t byte : block.bytes)
    EXPECT_EQ(0, byte);
}

TEST(DexSettings, EveryClassAllocatesThroughTheHostAllocator) {
  EXPECT_TRUE(hasClassAllocator<DexSettings>);
  EXPECT_TRUE(hasClassAllocator<IDexMessageBox>);
  EXPECT_TRUE(hasClassAllocator<IDexFinishNotifier>);
  EXPECT_TRUE(hasClassAllocator<DexTextLayout>);
  EXPECT_TRUE(hasClassAllocator<DexOptionBlock>);
  EXPECT_TRUE(hasClassAllocator<DexToleranceFilter>);
  EXPECT_TRUE(hasClassAllocator<DexDisplaySettings>);
}

// ---- Display settings -------------------------------------------------------------------------------

TEST(DexDisplaySettings, DefaultsToGridWithEmptyTexts) {
  const DexDisplaySettings settings;
  EXPECT_EQ(vyn::ie::CS_GRID, settings.csType);
  EXPECT_EQ(3, settings.csType);
  EXPECT_TRUE(settings.coordSystemName.IsEmpty());
  EXPECT_TRUE(settings.coordSystemZone.IsEmpty());
  EXPECT_FALSE(std::is_polymorphic_v<DexDisplaySettings>);
  const DexDisplaySettings braced = {};
  EXPECT_EQ(vyn::ie::CS_GRID, braced.csType);
}

TEST(DexDisplaySettings, TakesTheKindItIsBuiltWith) {
  const DexDisplaySettings settings(vyn::ie::CS_GEOGRAPHIC);
  EXPECT_EQ(vyn::ie::CS_GEOGRAPHIC, settings.csType);
  EXPECT_TRUE(settings.coordSystemName.IsEmpty());
}

TEST(DexDisplaySettings, CopiesTheKindAndBothTexts) {
  const DexDisplaySettings source(vyn::ie::CS_GROUND, L"UTM", L"33N");
  DexDisplaySettings target;
  target = source;
  const DexDisplaySettings copy(source);
  for (const DexDisplaySettings* const settings : {&std::as_const(target), &copy}) {
    EXPECT_EQ(vyn::ie::CS_GROUND, settings->csType);
    EXPECT_EQ(L"UTM", settings->coordSystemName);
    EXPECT_EQ(L"33N", settings->coordSystemZone);
  }
}
