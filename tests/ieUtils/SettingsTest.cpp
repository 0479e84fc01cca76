#include "ieUtils/IESettings.h"

#include <gtest/gtest.h>

#include <cstring>
#include <type_traits>
#include <utility>

#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
namespace fields = vyn::ie::ascii_fields;

// How many host objects of a test were made (clones included), cloned and deleted.
struct Lifetimes {
  int made = 0;
  int clones = 0;
  int deleted = 0;
  int alive() const { return made - deleted; }
};

// A host object that answers its tag (a message box) or the last result it was told (a notifier) and
// counts its lifetime; failClone makes clone() answer null, as a failed allocation does.
template <class Interface>
class Counting : public Interface {
 public:
  Counting(Lifetimes& lifetimes, int tag, bool failClone = false)
      : lifetimes_(&lifetimes), tag_(tag), failClone_(failClone) {
    ++lifetimes_->made;
  }
  Counting(const Counting& other)
      : Interface(other), lifetimes_(other.lifetimes_), tag_(other.tag_), failClone_(other.failClone_) {
    ++lifetimes_->made;
  }
  Counting& operator=(const Counting&) = delete;
  ~Counting() override { ++lifetimes_->deleted; }
  Interface* clone() const override {
    ++lifetimes_->clones;
    return failClone_ ? nullptr : new Counting(*this);
  }
  int confirmOverwrite(HWND, const wchar_t*) const { return tag_; }
  void onFinished(EDexResult result) { tag_ = result; }
  int tag() const { return tag_; }

 private:
  Lifetimes* lifetimes_;
  int tag_;
  bool failClone_;
};
using Box = Counting<IDexMessageBox>;
using Notifier = Counting<IDexFinishNotifier>;

template <class Interface>
int tagOf(const Interface* object) {
  return object == nullptr ? -1 : static_cast<const Counting<Interface>*>(object)->tag();
}

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
  for (const fields::EType type : types)
    layout->fields.push_back({type, 10, 1});
  return layout;
}

TEST(DexSettings, StartsWithThePluginDefaultsAndWithoutRecordsOrHostObjects) {
  const DexSettings settings;
  EXPECT_TRUE(settings.dataTypes.isEmpty() && settings.distUnits == 27 && settings.angleUnits == 5 &&
              settings.coordsStyle == 1 && settings.maxNumericPointName == -1 && settings.pluginValue == 2);
  EXPECT_EQ(settings.coordDecimals, (decltype(settings.coordDecimals){3, 3, 3}));
  EXPECT_TRUE(settings.messageBox == nullptr && settings.exportNotifier == nullptr &&
              settings.importNotifier == nullptr && settings.userAsciiSettings == nullptr &&
              settings.textLayout == nullptr && settings.optionBlock == nullptr &&
              settings.toleranceFilter == nullptr && settings.pluginText == nullptr &&
              settings.parentWindow == nullptr);
  EXPECT_TRUE(settings.pluginFlags[0] && settings.pluginFlags[1] && !settings.pluginOption);
  for (int index = 0; index < 16; ++index)
    EXPECT_EQ(index == 7 || index == 15, settings.pluginOptions[index]) << "option " << index;
  EXPECT_EQ(2.2250738585072014e-308, kToleranceNotSet);
  const DexToleranceFilter filter;
  EXPECT_TRUE(filter.north == kToleranceNotSet && filter.east == kToleranceNotSet &&
              filter.elevation == kToleranceNotSet);
  const DexOptionBlock block;
  EXPECT_EQ(32u, sizeof(block));
  for (const std::uint8_t byte : block.bytes)
    EXPECT_EQ(0, byte);
}

TEST(DexSettings, DataTypesAreASetInWhichMultipleIsNeverTheOnlyKind) {
  DexSettings settings = settingsWith({LINES, MULTIPLE, LINES});
  EXPECT_TRUE(settings.hasDataType(LINES) && settings.hasDataType(MULTIPLE) && !settings.hasDataType(POINTS));
  EXPECT_TRUE(settings.hasOnlyThisDataType(LINES));
  EXPECT_FALSE(settings.hasOnlyThisDataType(MULTIPLE));
  settings.removeDataType(SURFACES);
  settings.removeDataType(static_cast<EDexDataType>(-1));
  settings.removeDataType(static_cast<EDexDataType>(64));
  settings.removeDataType(MULTIPLE);
  EXPECT_EQ(DexFlags<EDexDataType>(LINES), settings.dataTypes);
  settings.addDataType(POINTS);
  EXPECT_FALSE(settings.hasOnlyThisDataType(LINES) || settings.hasOnlyThisDataType(POINTS));
  settings.removeAllDataTypes();
  EXPECT_TRUE(settings.dataTypes.isEmpty());
  EXPECT_FALSE(settings.hasOnlyThisDataType(POINTS) || settingsWith({MULTIPLE}).hasOnlyThisDataType(POINTS));
  for (int kind = 0; kind <= FIELD_REPORTS; ++kind) {
    const DexSettings single = settingsWith({static_cast<EDexDataType>(kind)});
    for (int asked = 0; asked < kDexDataTypeCount; ++asked)
      EXPECT_EQ(asked == kind, single.hasOnlyThisDataType(static_cast<EDexDataType>(asked)))
          << kind << " " << asked;
  }
  DexSettings outside = settingsWith({FIELD_REPORTS});  // values outside the kinds are not counted
  outside.addDataType(static_cast<EDexDataType>(30));
  EXPECT_TRUE(outside.hasOnlyThisDataType(FIELD_REPORTS));
  EXPECT_FALSE(outside.hasOnlyThisDataType(static_cast<EDexDataType>(30)) ||
               outside.hasOnlyThisDataType(static_cast<EDexDataType>(-1)));
}

TEST(DexSettings, HasAToleranceFilterWhenAnyValueIsSetEvenToZero) {
  DexSettings settings;
  EXPECT_FALSE(settings.hasToleranceFilter());
  const double notSet = kToleranceNotSet;
  settings.toleranceFilter = filterOf(notSet, notSet, notSet);
  EXPECT_FALSE(settings.hasToleranceFilter());
  for (DexToleranceFilter* const filter : {filterOf(0.0, notSet, notSet), filterOf(notSet, 0.0, notSet),
                                           filterOf(notSet, notSet, 0.0), filterOf(notSet, notSet, -0.0)}) {
    DexSettings set;
    set.toleranceFilter = filter;
    EXPECT_TRUE(set.hasToleranceFilter())
        << filter->north << ", " << filter->east << ", " << filter->elevation;
  }
}

TEST(DexSettings, AssignmentCopiesValuesAndRecordsAndClonesHostObjects) {
  Lifetimes lifetimes;
  int window = 0;
  {
    DexSettings source = settingsWith({LINES, MULTIPLE});
    source.distUnits = USFEET;
    source.coordDecimals = {4, 5, 2};
    source.pluginFlags = {false, true};
    source.pluginOptions = {};
    source.maxNumericPointName = 1200;
    source.pluginOption = true;
    source.pluginValue = -7;
    source.parentWindow = &window;
    source.messageBox = new Box(lifetimes, 6);
    source.importNotifier = new Notifier(lifetimes, 1);
    source.exportNotifier = new Notifier(lifetimes, 2);
    source.userAsciiSettings = asciiLayoutOf({fields::FIELD_NAME, fields::FIELD_NORTHING});
    source.textLayout = new DexTextLayout;
    source.textLayout->title = L"Stakeout";
    source.textLayout->headerTexts[6] = L"last header";
    source.optionBlock = new DexOptionBlock;
    source.optionBlock->bytes[31] = 0xA5;
    source.toleranceFilter = filterOf(0.01, 0.02, 0.03);
    source.pluginText = new CVynStringT<wchar_t>(L"from the host");
    DexSettings target = settingsWith({ROADS});
    target.messageBox = new Box(lifetimes, 7);
    target.importNotifier = new Notifier(lifetimes, 3);
    target.userAsciiSettings = asciiLayoutOf({fields::FIELD_CODES});
    target.toleranceFilter = filterOf(1.0, 1.0, 1.0);
    target.pluginText = new CVynStringT<wchar_t>(L"old");
    target = source;
    EXPECT_EQ(3, lifetimes.clones);
    EXPECT_EQ(2, lifetimes.deleted);
    EXPECT_TRUE(target.dataTypes == source.dataTypes && target.distUnits == USFEET &&
                target.coordDecimals == source.coordDecimals && target.pluginFlags == source.pluginFlags &&
                target.pluginOptions == source.pluginOptions && target.maxNumericPointName == 1200 &&
                target.pluginOption && target.pluginValue == -7 && target.parentWindow == &window);
    EXPECT_TRUE(tagOf(target.messageBox) == 6 && tagOf(target.importNotifier) == 1 &&
                tagOf(target.exportNotifier) == 2);
    for (const auto& [original, duplicate] :
         {std::pair<const void*, const void*>{source.messageBox, target.messageBox},
          {source.importNotifier, target.importNotifier},
          {source.exportNotifier, target.exportNotifier},
          {source.userAsciiSettings, target.userAsciiSettings},
          {source.textLayout, target.textLayout},
          {source.optionBlock, target.optionBlock},
          {source.toleranceFilter, target.toleranceFilter},
          {source.pluginText, target.pluginText}}) {
      EXPECT_NE(nullptr, duplicate);
      EXPECT_NE(original, duplicate);
    }
    source.userAsciiSettings->fields.clear();
    source.textLayout->title = L"changed";
    EXPECT_EQ(2u, target.userAsciiSettings->fields.size());
    EXPECT_EQ(fields::FIELD_NORTHING, target.userAsciiSettings->fields[1].type);
    EXPECT_TRUE(target.textLayout->title == L"Stakeout" &&
                target.textLayout->headerTexts[6] == L"last header");
    EXPECT_EQ(0, std::memcmp(source.optionBlock, target.optionBlock, DexOptionBlock::kSize));
    EXPECT_TRUE(target.toleranceFilter->east == 0.02 && *target.pluginText == L"from the host");
    target.addDataType(CODES);
    EXPECT_FALSE(source.hasDataType(CODES));
    const DexSettings copy(source);  // copy construction clones likewise
    EXPECT_TRUE(tagOf(copy.messageBox) == 6 && copy.optionBlock != source.optionBlock &&
                copy.pluginText != source.pluginText);
    EXPECT_EQ(6, lifetimes.clones);
  }
  EXPECT_EQ(0, lifetimes.alive());
}

TEST(DexSettings, AssignmentFromSettingsWithoutThemKeepsNotifiersFilterAndTextButDropsTheRest) {
  Lifetimes lifetimes;
  {
    DexSettings target;
    auto* const importNotifier = new Notifier(lifetimes, 3);
    target.importNotifier = importNotifier;
    target.exportNotifier = new Notifier(lifetimes, 4);
    target.messageBox = new Box(lifetimes, 6);
    target.userAsciiSettings = asciiLayoutOf({fields::FIELD_NAME});
    target.textLayout = new DexTextLayout;
    target.optionBlock = new DexOptionBlock;
    auto* const filter = filterOf(1.0, 1.0, 1.0);
    target.toleranceFilter = filter;
    auto* const text = new CVynStringT<wchar_t>(L"kept");
    target.pluginText = text;
    target = settingsWith({POINTS});
    EXPECT_TRUE(target.importNotifier == importNotifier && tagOf(target.exportNotifier) == 4);
    EXPECT_TRUE(target.toleranceFilter == filter && target.pluginText == text && target.hasToleranceFilter());
    EXPECT_TRUE(target.messageBox == nullptr && target.userAsciiSettings == nullptr &&
                target.textLayout == nullptr && target.optionBlock == nullptr);
    EXPECT_EQ(1, lifetimes.deleted);
    DexSettings oneNotifier;  // one notifier is taken, the other kept
    oneNotifier.exportNotifier = new Notifier(lifetimes, 2);
    target = oneNotifier;
    EXPECT_TRUE(target.importNotifier == importNotifier && tagOf(target.exportNotifier) == 2);
    DexSettings failing;  // a failed clone leaves the field empty and the old object deleted
    failing.messageBox = new Box(lifetimes, 6, true);
    failing.importNotifier = new Notifier(lifetimes, 1, true);
    target.messageBox = new Box(lifetimes, 7);
    target = failing;
    EXPECT_TRUE(target.messageBox == nullptr && target.importNotifier == nullptr);
    DexSettings& alias = target;  // self-assignment changes nothing
    target.messageBox = new Box(lifetimes, 8);
    const int clones = lifetimes.clones;
    target = alias;
    EXPECT_EQ(8, tagOf(target.messageBox));
    EXPECT_EQ(clones, lifetimes.clones);
    DexSettings second(target);  // chained copies neither leak nor share
    DexSettings third;
    third = second;
    second = target;
    target = third;
    EXPECT_EQ(8, tagOf(target.messageBox));
  }
  EXPECT_EQ(0, lifetimes.alive());
  auto* const settings = new DexSettings;  // destruction deletes every owned host object
  settings->messageBox = new Box(lifetimes, 6);
  settings->importNotifier = new Notifier(lifetimes, 1);
  delete settings;
  EXPECT_EQ(0, lifetimes.alive());
}

// Host objects written against either form of the operations: plain or const.
class PlainMessageBox : public IDexMessageBox {
 public:
  IDexMessageBox* clone() override { return new PlainMessageBox(*this); }
  int confirmOverwrite(HWND, const wchar_t*) override { return IDYES; }
};
class PlainNotifier : public IDexFinishNotifier {
 public:
  IDexFinishNotifier* clone() override { return new PlainNotifier(*this); }
  void onFinished(EDexResult) override {}
};

TEST(DexSettings, HostInterfacesKeepTheirSlotOrderAndServeInEitherForm) {
  using BoxClone = IDexMessageBox* (IDexMessageBox::*)();
  using Confirm = int (IDexMessageBox::*)(HWND, const wchar_t*);
  using NotifierClone = IDexFinishNotifier* (IDexFinishNotifier::*)();
  DexSettings settings;
  settings.messageBox = new PlainMessageBox();
  settings.importNotifier = new PlainNotifier();
  const DexSettings copy(settings);
  EXPECT_TRUE(copy.messageBox != nullptr && copy.messageBox != settings.messageBox &&
              copy.importNotifier != nullptr);
  EXPECT_EQ(IDYES, copy.messageBox->confirmOverwrite(nullptr, L"a.txt"));
  Lifetimes lifetimes;
  settings.exportNotifier = new Notifier(lifetimes, 0);
  settings.exportNotifier->onFinished(DEX_RESULT_STOPPED);
  EXPECT_EQ(DEX_RESULT_STOPPED, tagOf(settings.exportNotifier));
  static_assert(std::has_virtual_destructor_v<IDexMessageBox> &&
                std::has_virtual_destructor_v<IDexFinishNotifier>);
  const auto clone = dex_test::vtableEntryOf(static_cast<BoxClone>(&IDexMessageBox::clone));
  if (!clone) GTEST_SKIP() << "virtual table layout not known on this platform";
  EXPECT_EQ(2, *clone);
  EXPECT_EQ(3, dex_test::vtableEntryOf(static_cast<Confirm>(&IDexMessageBox::confirmOverwrite)));
  EXPECT_EQ(2, dex_test::vtableEntryOf(static_cast<NotifierClone>(&IDexFinishNotifier::clone)));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&IDexFinishNotifier::onFinished));
}

TEST(DexDisplaySettings, DefaultsToGridWithEmptyTextsAndCopiesKindAndTexts) {
  const DexDisplaySettings braced = {};
  EXPECT_TRUE(braced.csType == CS_GRID && braced.coordSystemName.IsEmpty() &&
              braced.coordSystemZone.IsEmpty());
  EXPECT_EQ(CS_GEOGRAPHIC, DexDisplaySettings(CS_GEOGRAPHIC).csType);
  static_assert(!std::is_polymorphic_v<DexDisplaySettings>);
  const DexDisplaySettings source(CS_GROUND, L"UTM", L"33N");
  DexDisplaySettings target;
  target = source;
  const DexDisplaySettings copy(source);
  for (const DexDisplaySettings* const settings : {&std::as_const(target), &copy})
    EXPECT_TRUE(settings->csType == CS_GROUND && settings->coordSystemName == L"UTM" &&
                settings->coordSystemZone == L"33N");
}

}  // namespace
