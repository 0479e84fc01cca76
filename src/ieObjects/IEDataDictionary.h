#pragma once

#include <map>
#include <memory>
#include <optional>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"

// The code library of a job: the code descriptions (a code with its attributes, drawing properties
// and layer) and the dictionary that holds them by name. Survey objects refer to these descriptions
// through their code values (see IECodesDataInterface.h).
//
// Error-log records (source ieObjects\IEDataDictionary, empty message):
// - line 401: DexAttrDescription::getMaxLength() met a type outside the attribute type table.
namespace vyn::ie {

class DexLayer;

// The kind of geometry a code is meant for. The data model only stores and copies the value; the names
// give the usual meaning and any other value may be passed cast from its number.
enum EDexCodeType : int {
  CODE_TYPE_POINT = 0,
  CODE_TYPE_LINE = 1,
  CODE_TYPE_AREA = 2,
  CODE_TYPE_UNDEFINED = 3,  // the default: the code says nothing about its geometry
};

// When field software asks for a code's attribute values. Stored and copied only, as above.
enum EDexAttribPromptType : int {
  ATTRIB_PROMPT_NEVER = 0,
  ATTRIB_PROMPT_ALWAYS = 1,
  ATTRIB_PROMPT_OPTIONAL = 2,
  ATTRIB_PROMPT_UNDEFINED = 3,  // the default: the job's own setting applies
};

// Whether the points of a code take part in a terrain model. Stored and copied only, as above.
enum EDexDTMCodeFlag : int {
  DTM_CODE_EXCLUDED = 0,
  DTM_CODE_INCLUDED = 1,
  DTM_CODE_UNDEFINED = 2,  // the default: the code says nothing about the terrain model
};

// The definition of one attribute of a code: its name, its value type and the limits that follow from
// the type. The extra members below are free for plug-ins and the host: the library initialises and
// copies them and gives them no meaning.
class DEX_API DexAttrDescription {
 public:
  VYN_CLASS_ALLOCATOR

  // Value types. Other values may be stored; they read as "NotSupported".
  enum EAttributeType : int {
    ATTR_STRING = 0,     // "String"
    ATTR_BOOL = 1,       // "Bool"
    ATTR_INTEGER = 2,    // "Integer"
    ATTR_FLOAT = 3,      // "Float"
    ATTR_LIST = 4,       // "List"
    ATTR_DATE_TIME = 5,  // "Date-Time"
  };

  // Both constructors call resetAll(). The default one gives an unnamed String attribute.
  DexAttrDescription();
  DexAttrDescription(const CVynStringT<wchar_t>& name, EAttributeType type);
  DexAttrDescription(const DexAttrDescription&) = default;
  DexAttrDescription& operator=(const DexAttrDescription&) = default;
  virtual ~DexAttrDescription();

  // Sets the stored maximal length from the type, the maximal fraction length to 18, extraInt to 1 and
  // the three extra texts to empty. The name, the type and extraStrings stay.
  void resetAll();

  const CVynStringT<wchar_t>& getName() const noexcept { return name_; }
  void setName(const CVynStringT<wchar_t>& name) { name_ = name; }

  // Type. setType() stores the type only; setTypeFromString() also calls update().
  EAttributeType getType() const noexcept { return type_; }
  void setType(EAttributeType type) noexcept { type_ = type; }
  // "String", "Bool", "Integer", "Float", "List", "Date-Time"; "NotSupported" for any other type.
  CVynStringT<wchar_t> getTypeAsString() const;
  // Accepts the texts of getTypeAsString() in any case; any other text sets ATTR_STRING.
  void setTypeFromString(const CVynStringT<wchar_t>& text);
  // Sets the stored maximal length from the type (as getMaxLength()).
  void update();

  // Limits from the type. getMaxLength(): 255 String, 10 Bool, 10 Integer, 18 Float, 255 List,
  // 19 Date-Time; 255 and an error-log record (line 401) for any other type. getMaxFracLength(): the
  // stored maximal fraction length (18 unless set) for Float, 0 for every other type. getAttrSize():
  // the size of a binary value, 4 Bool, 4 Integer, 8 Float, -1 for any other type.
  int getMaxLength() const;
  int getMaxFracLength() const noexcept;
  void setMaxFracLength(int maxFracLength) noexcept { maxFracLength_ = maxFracLength; }
  int getAttrSize() const noexcept;

 private:
  EAttributeType type_ = ATTR_STRING;
  CVynStringT<wchar_t> name_;

 public:
  CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&> extraStrings;  // empty

 private:
  int maxLength_ = 0;
  int maxFracLength_ = 0;

 public:
  int extraInt = 1;
  CVynStringT<wchar_t> extraText1;
  CVynStringT<wchar_t> extraText2;
  CVynStringT<wchar_t> extraText3;
};

// A code of the code library: its name, its attribute descriptions in order, one drawing-property
// object per geometry kind, its layer, a description text and three settings that the library only
// stores (code type, attribute prompt, terrain-model flag).
//
// The description owns its attribute descriptions and property objects; it refers to its layer
// without owning it (the draw dictionary owns layers). Copy construction and assignment duplicate the
// attribute descriptions and property objects and share the layer.
class DEX_API DexCodeDescription : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  explicit DexCodeDescription(const CVynStringT<wchar_t>& name);
  DexCodeDescription(const DexCodeDescription&) = default;
  DexCodeDescription& operator=(const DexCodeDescription&) = default;
  ~DexCodeDescription() override;

  // The code. A description already in a DexDataDictionary stays filed under the name it was added
  // with.
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // Attribute descriptions.
  // Appends description and takes ownership; a null description is ignored.
  void addAttrDescription(DexAttrDescription* description) { attrDescriptions_.add(description); }
  // The number of attribute descriptions.
  int getSize() const noexcept { return attrDescriptions_.count(); }
  // The attribute description at index, or null when index is outside the list.
  DexAttrDescription* getAttrDescriptionAt(int index) noexcept { return attrDescriptions_.at(index); }
  const DexAttrDescription* getAttrDescriptionAt(int index) const noexcept {
    return attrDescriptions_.at(index);
  }
  // The first attribute description named name (exact, case-sensitive), or null.
  DexAttrDescription* findAttrDescription(const CVynStringT<wchar_t>& name);
  const DexAttrDescription* findAttrDescription(const CVynStringT<wchar_t>& name) const;
  // The index of that description, or -1.
  int findAttrDescriptionIndex(const CVynStringT<wchar_t>& name) const;

  // Drawing properties. The getters answer null for a type outside 0 to 2 or when none is held.
  IDexDrawProperties* getDrawProperties(int type) noexcept { return drawProperties_.get(type); }
  const IDexDrawProperties* getDrawProperties(int type) const noexcept { return drawProperties_.get(type); }
  // Takes ownership of properties (null allowed) and deletes the object held before, unless it is the
  // same pointer. Ignored for a type outside 0 to 2 and for an object already held under another type;
  // the caller then keeps properties.
  void setDrawProperties(int type, IDexDrawProperties* properties) { drawProperties_.set(type, properties); }
  // True when a property object is held for any geometry kind (defined values or not).
  bool isDrawPropertiesWasDefined() const noexcept { return drawProperties_.hasAny(); }

  // True when nothing but the name is set: no attribute descriptions, no property objects, no layer,
  // an empty description text, code type and attribute prompt at their defaults. The terrain-model
  // flag is not looked at.
  bool isOnlyCodeNameDefined() const noexcept;

  // The layer is not owned.
  const DexLayer* getLayer() const noexcept { return layer_; }
  void setLayer(const DexLayer* layer) noexcept { layer_ = layer; }
  const CVynStringT<wchar_t>& getDescCodeName() const noexcept { return descCodeName_; }
  void setDescCodeName(const CVynStringT<wchar_t>& descCodeName) { descCodeName_ = descCodeName; }
  EDexCodeType getCodeType() const noexcept { return codeType_; }
  void setCodeType(EDexCodeType codeType) noexcept { codeType_ = codeType; }
  EDexAttribPromptType getAttribPromptType() const noexcept { return attribPromptType_; }
  void setAttribPromptType(EDexAttribPromptType promptType) noexcept { attribPromptType_ = promptType; }
  EDexDTMCodeFlag getDtmFlag() const noexcept { return dtmFlag_; }
  void setDtmFlag(EDexDTMCodeFlag dtmFlag) noexcept { dtmFlag_ = dtmFlag; }

  // A new default point, line or area property object for the exact texts "Point", "Line" and
  // "Area" (case-sensitive), otherwise null. The caller owns the result.
  static IDexDrawProperties* createDrawPropertiesFromString(const CVynStringT<wchar_t>& text);

 private:
  DexOwningList<DexAttrDescription> attrDescriptions_;
  DexDrawPropertiesByType drawProperties_;
  const DexLayer* layer_ = nullptr;
  CVynStringT<wchar_t> descCodeName_;
  EDexCodeType codeType_ = CODE_TYPE_UNDEFINED;
  EDexAttribPromptType attribPromptType_ = ATTRIB_PROMPT_UNDEFINED;
  EDexDTMCodeFlag dtmFlag_ = DTM_CODE_UNDEFINED;
  CVynStringT<wchar_t> name_;
};

// The code library of a job: code descriptions by name, read in name order (exact code-unit order,
// case-sensitive) through a cursor. The dictionary owns its descriptions and deletes them with itself;
// copy construction and assignment duplicate every description. A name keeps the first description
// added under it.
//
// The cursor belongs to the dictionary, not to a reader: reset() and getNextCodeDescription() are
// const so that a const dictionary can be walked, and two walks at once disturb each other.
class DEX_API DexDataDictionary {
 public:
  VYN_CLASS_ALLOCATOR

  DexDataDictionary() = default;
  DexDataDictionary(const DexDataDictionary& other);
  DexDataDictionary& operator=(const DexDataDictionary& other);
  virtual ~DexDataDictionary();

  // Files description under its current name and takes ownership: true. Declined (false; the caller
  // keeps description and must delete it) for null and when another description of that name is
  // present (the present one stays). Adding a description the dictionary already holds changes
  // nothing and answers true.
  bool addCodeDescription(DexCodeDescription* description);

  // The description filed under name (exact, case-sensitive), or null.
  DexCodeDescription* findCodeDiscription(const CVynStringT<wchar_t>& name);
  const DexCodeDescription* findCodeDiscription(const CVynStringT<wchar_t>& name) const;

  // The number of descriptions.
  int getSize() const noexcept { return static_cast<int>(descriptions_.size()); }

  // Reading in name order. reset() puts the cursor on the first description (a dictionary never reset
  // reads from its first one, and so do a copy and an assigned dictionary);
  // getNextCodeDescription() answers the description under the cursor and moves on, null at the end.
  void reset() const noexcept { cursor_.reset(); }
  DexCodeDescription* getNextCodeDescription() noexcept { return takeNext(); }
  const DexCodeDescription* getNextCodeDescription() const noexcept { return takeNext(); }

 private:
  using Map = std::map<CVynStringT<wchar_t>, std::unique_ptr<DexCodeDescription>>;

  DexCodeDescription* takeNext() const noexcept;

  Map descriptions_;
  // Empty: at the first description.
  mutable std::optional<Map::const_iterator> cursor_;
};

}  // namespace vyn::ie
