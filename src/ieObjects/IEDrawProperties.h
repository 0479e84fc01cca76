#pragma once

#include <array>
#include <memory>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"

// Drawing properties: how a point, line or area is drawn (colour, point mark, dash style and width,
// fill style and transparency). They may be set on a survey object, a code description, a layer or
// the default layer of the draw dictionary, and every single value may say that it comes from the
// layer instead.
namespace vyn::ie {

// One drawing attribute: a value with a defined flag and a by-layer flag, all three independent.
// - set() stores the value, marks it defined and clears by-layer;
// - setByLayer() marks it by-layer only (value and defined flag stay);
// - get() answers the defined flag and writes its output only when the value is defined.
// Copying copies all three.
template <class T>
class DexDrawAttribute {
 public:
  constexpr DexDrawAttribute() = default;
  // A value that getters still do not report until set() is called.
  constexpr explicit DexDrawAttribute(const T& initial) : value_(initial) {}

  void set(const T& value) {
    value_ = value;
    defined_ = true;
    byLayer_ = false;
  }
  void setByLayer() noexcept { byLayer_ = true; }
  // Clears the defined flag; value and by-layer flag stay.
  void undefine() noexcept { defined_ = false; }

  bool get(T& value) const {
    if (defined_) value = value_;
    return defined_;
  }
  bool isDefined() const noexcept { return defined_; }
  bool isByLayer() const noexcept { return byLayer_; }

  // Hands the defined value and the by-layer flag to target as its setters would; an undefined value
  // is not handed over. This is how clone() copies a property object.
  void transferTo(DexDrawAttribute& target) const {
    if (defined_) target.set(value_);
    if (byLayer_) target.setByLayer();
  }

 private:
  T value_{};
  bool defined_ = false;
  bool byLayer_ = false;
};

// The drawing properties of one geometry kind. Abstract: the point, line and area forms below are the
// concrete classes. The colour, which all three forms have, is kept here.
//
// The virtual operations below are in their fixed order (the plug-in ABI). clone() returns a new
// object owned by the caller.
class DEX_API IDexDrawProperties {
 public:
  VYN_CLASS_ALLOCATOR

  enum EDexDrawType : int {
    DRAW_POINT = 0,
    DRAW_LINE = 1,
    DRAW_AREA = 2,
  };
  static constexpr int kNumberOfDrawTypes = 3;

  virtual ~IDexDrawProperties();
  virtual IDexDrawProperties* clone() const = 0;
  virtual EDexDrawType getType() const = 0;
  // "Point", "Line" or "Area".
  virtual CVynStringT<wchar_t> getObjTypeAsString() const = 0;
  // Colours are 32-bit colour values passed through unchanged.
  virtual bool getColor(unsigned long& color) const;
  virtual void setColor(unsigned long color);
  // True when any attribute of the object is defined.
  virtual bool isDefined() const = 0;
  virtual bool isColorByLayer() const;
  virtual void setColorByLayer();

 protected:
  IDexDrawProperties() = default;
  IDexDrawProperties(const IDexDrawProperties&) = default;
  IDexDrawProperties& operator=(const IDexDrawProperties&) = default;

  // The colour is part of every form's isDefined() and clone().
  bool isColorDefined() const noexcept { return color_.isDefined(); }
  void transferColorTo(IDexDrawProperties& target) const { color_.transferTo(target.color_); }

 private:
  DexDrawAttribute<unsigned long> color_;
};

// Drawing properties of a point: colour and mark style. Nothing is defined after construction.
//
// Style texts are read case-insensitively. The static text form logs a value outside the table
// (source ieObjects\IEDrawProperties, line 101, empty message) and answers an empty text.
class DEX_API DexDrawPointProperties : public IDexDrawProperties {
 public:
  VYN_CLASS_ALLOCATOR

  enum EMarkStyleType : int {
    MARK_DOT = 0,                      // "Dot"
    MARK_FILLED_RECT = 1,              // "Filled Rect"
    MARK_FILLED_DIAMOND = 2,           // "Filled Diamond"
    MARK_FILLED_CIRCLE = 3,            // "Filled Circle"
    MARK_FILLED_TRIANGLE = 4,          // "Filled Triangle"
    MARK_RECT = 5,                     // "Rect"
    MARK_DIAMOND = 6,                  // "Diamond"
    MARK_CIRCLE = 7,                   // "Circle"
    MARK_TRIANGLE = 8,                 // "Triangle"
    MARK_CROSS = 9,                    // "Cross"
    MARK_TREE = 10,                    // "Tree"
    MARK_SMALL_CROSS = 11,             // "SmallCross"
    MARK_UPSIDE_TRIANGLE = 12,         // "Upside Triangle"
    MARK_FILLED_UPSIDE_TRIANGLE = 13,  // "Filled Upside Triangle"
    MARK_X_CROSS = 14,                 // "XCross"
    MARK_NONE = 15,                    // "None"
  };

  DexDrawPointProperties() = default;
  DexDrawPointProperties(const DexDrawPointProperties&) = default;
  DexDrawPointProperties& operator=(const DexDrawPointProperties&) = default;
  ~DexDrawPointProperties() override;

  // A new point object with every defined value and by-layer flag of this one.
  IDexDrawProperties* clone() const override;
  EDexDrawType getType() const override { return DRAW_POINT; }
  CVynStringT<wchar_t> getObjTypeAsString() const override;
  bool isDefined() const override;

  // Mark style.
  bool getMarkStyle(EMarkStyleType& style) const { return markStyle_.get(style); }
  void setMarkStyle(EMarkStyleType style) { markStyle_.set(style); }
  bool isMarkStyleByLayer() const noexcept { return markStyle_.isByLayer(); }
  void setMarkStyleByLayer() noexcept { markStyle_.setByLayer(); }
  // False when the mark style is not defined; otherwise its text (empty, and logged, for a value
  // outside the table) and true.
  bool getMarkStyleAsString(CVynStringT<wchar_t>& text) const;
  // On a text of the table (any case) sets the style and returns true; otherwise the style becomes
  // undefined and the result is false.
  bool setMarkStyleFromString(const CVynStringT<wchar_t>& text);
  // The text of a style; empty (and logged) outside the table.
  static CVynStringT<wchar_t> getMarkStyleAsString(EMarkStyleType style);

 private:
  DexDrawAttribute<EMarkStyleType> markStyle_{MARK_DOT};
};

// Drawing properties of a line: colour, dash style and width (1 until set, but not reported before
// setWidth). Nothing is defined after default construction.
//
// Style texts are read case-insensitively. The static text form logs a value outside the table
// (source ieObjects\IEDrawProperties, line 102, empty message) and answers an empty text.
class DEX_API DexDrawLineProperties : public IDexDrawProperties {
 public:
  VYN_CLASS_ALLOCATOR

  enum EDashStyleType : int {
    DASH_SOLID = 0,         // "Solid"
    DASH_DASH = 1,          // "Dash"
    DASH_DOT = 2,           // "Dot"
    DASH_DASH_DOT = 3,      // "Dash Dot"
    DASH_DASH_DOT_DOT = 4,  // "Dash Dot Dot"
  };

  DexDrawLineProperties() = default;
  // Colour, width and dash style, all three defined.
  DexDrawLineProperties(unsigned long color, unsigned char width, EDashStyleType dashStyle);
  DexDrawLineProperties(const DexDrawLineProperties&) = default;
  DexDrawLineProperties& operator=(const DexDrawLineProperties&) = default;
  ~DexDrawLineProperties() override;

  // A new line object with every defined value and by-layer flag of this one.
  IDexDrawProperties* clone() const override;
  EDexDrawType getType() const override { return DRAW_LINE; }
  CVynStringT<wchar_t> getObjTypeAsString() const override;
  bool isDefined() const override;

  // Dash style.
  bool getDashStyle(EDashStyleType& style) const { return dashStyle_.get(style); }
  void setDashStyle(EDashStyleType style) { dashStyle_.set(style); }
  bool isDashStyleByLayer() const noexcept { return dashStyle_.isByLayer(); }
  void setDashStyleByLayer() noexcept { dashStyle_.setByLayer(); }
  // False when the dash style is not defined; otherwise its text (empty, and logged, for a value
  // outside the table) and true.
  bool getDashStyleTypeAsString(CVynStringT<wchar_t>& text) const;
  // On a text of the table (any case) sets the style and returns true; otherwise the style becomes
  // undefined and the result is false.
  bool setDashStyleFromString(const CVynStringT<wchar_t>& text);
  // The text of a style; empty (and logged) outside the table.
  static CVynStringT<wchar_t> getDashStyleTypeAsString(EDashStyleType style);

  // Width.
  bool getWidth(unsigned char& width) const { return width_.get(width); }
  void setWidth(unsigned char width) { width_.set(width); }
  bool isWidthByLayer() const noexcept { return width_.isByLayer(); }
  void setWidthByLayer() noexcept { width_.setByLayer(); }

 private:
  DexDrawAttribute<EDashStyleType> dashStyle_{DASH_SOLID};
  DexDrawAttribute<unsigned char> width_{1};
};

// Drawing properties of an area: colour, fill style and fill transparency. Nothing is defined after
// construction.
//
// Style texts are read case-insensitively. The static text form logs a value outside the table
// (source ieObjects\IEDrawProperties, line 103, empty message) and answers an empty text.
class DEX_API DexDrawAreaProperties : public IDexDrawProperties {
 public:
  VYN_CLASS_ALLOCATOR

  enum EFillStyleType : int {
    FILL_NONE = 0,              // "None"
    FILL_SOLID = 1,             // "Solid"
    FILL_GRID = 2,              // "Grid"
    FILL_CHECKERED = 3,         // "Checkered"
    FILL_HORIZONTAL_LINES = 4,  // "Horz. Lines"
    FILL_VERTICAL_LINES = 5,    // "Vert. Lines"
  };

  DexDrawAreaProperties() = default;
  DexDrawAreaProperties(const DexDrawAreaProperties&) = default;
  DexDrawAreaProperties& operator=(const DexDrawAreaProperties&) = default;
  ~DexDrawAreaProperties() override;

  // A new area object with every defined value and by-layer flag of this one.
  IDexDrawProperties* clone() const override;
  EDexDrawType getType() const override { return DRAW_AREA; }
  CVynStringT<wchar_t> getObjTypeAsString() const override;
  bool isDefined() const override;

  // Fill style.
  bool getFillStyleType(EFillStyleType& style) const { return fillStyle_.get(style); }
  void setFillStyleType(EFillStyleType style) { fillStyle_.set(style); }
  bool isFillStyleByLayer() const noexcept { return fillStyle_.isByLayer(); }
  void setFillStyleByLayer() noexcept { fillStyle_.setByLayer(); }
  // False when the fill style is not defined; otherwise its text (empty, and logged, for a value
  // outside the table) and true.
  bool getFillStyleTypeAsString(CVynStringT<wchar_t>& text) const;
  // On a text of the table (any case) sets the style and returns true; otherwise the style becomes
  // undefined and the result is false.
  bool setFillStyleFromString(const CVynStringT<wchar_t>& text);
  // The text of a style; empty (and logged) outside the table.
  static CVynStringT<wchar_t> getFillStyleTypeAsString(EFillStyleType style);

  // Fill transparency.
  bool getFillTransparency(short& transparency) const { return fillTransparency_.get(transparency); }
  void setFillTransparency(short transparency) { fillTransparency_.set(transparency); }
  bool isFillTransparencyByLayer() const noexcept { return fillTransparency_.isByLayer(); }
  void setFillTransparencyByLayer() noexcept { fillTransparency_.setByLayer(); }

 private:
  DexDrawAttribute<EFillStyleType> fillStyle_{FILL_NONE};
  DexDrawAttribute<short> fillTransparency_{0};
};

// The three drawing-property objects of a layer or a code description, one per geometry kind, indexed
// by IDexDrawProperties::EDexDrawType. It owns what it holds: set() deletes the object it replaces
// (unless it is the same pointer) and the destructor deletes all three. Copy construction and
// assignment duplicate the objects with clone(), never sharing them.
class DEX_API DexDrawPropertiesByType {
 public:
  VYN_CLASS_ALLOCATOR

  DexDrawPropertiesByType() = default;
  DexDrawPropertiesByType(const DexDrawPropertiesByType& other);
  DexDrawPropertiesByType& operator=(const DexDrawPropertiesByType& other);
  virtual ~DexDrawPropertiesByType();

  // The object held for type, or null (always null for a type outside 0 to 2).
  IDexDrawProperties* get(int type) noexcept;
  const IDexDrawProperties* get(int type) const noexcept;
  // Takes ownership of properties (which may be null) for type, deleting the object held before
  // unless it is the same pointer, and returns true. Declined (false; the caller keeps properties)
  // for a type outside 0 to 2, and for an object already held under another type.
  bool set(int type, IDexDrawProperties* properties);

  // True when an object is held for any type.
  bool hasAny() const noexcept;
  // True when any held object isDefined().
  bool isAnyDefined() const;
  // Sets the colour on each object held; creates none.
  void setColor(unsigned long color);

  // A new default point, line or area object for the exact texts "Point", "Line" and "Area"
  // (case-sensitive), otherwise null. The caller owns the result.
  static IDexDrawProperties* createFromString(const CVynStringT<wchar_t>& text);

 private:
  std::array<std::unique_ptr<IDexDrawProperties>, IDexDrawProperties::kNumberOfDrawTypes> objects_;
};

}  // namespace vyn::ie
