#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningMap.h"
#include "ieObjects/IETypedValues.h"

// Road templates (the shape of a road across its centre line) and the dictionary of an exchange that
// owns them. Cross sections refer to templates without owning them.
namespace vyn::ie {

// A named road template with two values that the plug-ins give their meaning. The virtual operations
// keep their order: destructor, setName, getName, setData, getData.
class DEX_API DexRoadTemplate : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The two values of a template; the library reads neither.
  enum ECSDataType : int {
    TEMPLATE_VALUE_1 = 0,
    TEMPLATE_VALUE_2 = 1,
  };

  // No name, both values 0.0.
  DexRoadTemplate() = default;
  explicit DexRoadTemplate(const CVynStringT<wchar_t>& name) : name_(name) {}
  DexRoadTemplate(const DexRoadTemplate&) = default;
  DexRoadTemplate& operator=(const DexRoadTemplate&) = default;
  ~DexRoadTemplate() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  // A kind outside 0 to 1 is ignored by setData and reads as 0.0.
  virtual void setData(int kind, double value) { data_.set(kind, value); }
  virtual double getData(int kind) const { return data_.get(kind); }

 private:
  DexTypedValues<ECSDataType, 2> data_;
  CVynStringT<wchar_t> name_;
};

// The road templates of one exchange by name, read in name order (exact code-unit order,
// case-sensitive), with the two conventions every template of the dictionary follows: offsets from
// the centre line (or from the previous point) and absolute heights (or heights relative to the
// previous point). The dictionary owns its templates and deletes them with itself; it is not copied.
class DEX_API DexRoadTemplatesDictionary {
 public:
  VYN_CLASS_ALLOCATOR

  using const_iterator = DexOwningMap<CVynStringT<wchar_t>, DexRoadTemplate>::const_iterator;

  DexRoadTemplatesDictionary(bool centralOffsets, bool absHeights)
      : centralOffsetsUsed_(centralOffsets), absHeightsUsed_(absHeights) {}
  DexRoadTemplatesDictionary(const DexRoadTemplatesDictionary&) = delete;
  DexRoadTemplatesDictionary& operator=(const DexRoadTemplatesDictionary&) = delete;
  virtual ~DexRoadTemplatesDictionary();

  // Files roadTemplate under its current name and takes ownership: true. Declined (false; the caller
  // keeps it) for null and when a template of that name is present (the present one stays). A
  // template the dictionary holds already changes nothing and answers true.
  bool addRoadTemplate(DexRoadTemplate* roadTemplate) {
    return roadTemplate != nullptr && templates_.add(roadTemplate->getName(), roadTemplate);
  }
  // The template filed under name, or null.
  DexRoadTemplate* findRoadTemplate(const CVynStringT<wchar_t>& name) { return templates_.find(name); }
  const DexRoadTemplate* findRoadTemplate(const CVynStringT<wchar_t>& name) const {
    return templates_.find(name);
  }
  // Deletes the template filed under name; an absent name changes nothing.
  void removeRoadTemplate(const CVynStringT<wchar_t>& name) { templates_.remove(name); }

  int getNumberOfRoadTemplates() const noexcept { return templates_.count(); }
  // The pairs (name, template) in name order.
  const_iterator begin() const noexcept { return templates_.begin(); }
  const_iterator end() const noexcept { return templates_.end(); }

  bool areCentralOffsetsUsed() const noexcept { return centralOffsetsUsed_; }
  bool areAbsHeightsUsed() const noexcept { return absHeightsUsed_; }

 private:
  DexOwningMap<CVynStringT<wchar_t>, DexRoadTemplate> templates_;
  bool centralOffsetsUsed_;
  bool absHeightsUsed_;
};

}  // namespace vyn::ie
