#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEObjectBase.h"
#include "ieObjects/IEStation.h"

namespace vyn::ie {

// A text label of a drawing: its insertion station (which also holds the label's name), the text with
// its font, height in meters, rotation angle, insertion point and style flags, and its own drawing
// properties.
//
// The label owns its drawing properties (see DexObject for copy and clone). clone() copies the common
// part and every field of the label.
class DEX_API DexTextLabel : public DexObject {
 public:
  VYN_CLASS_ALLOCATOR

  // Which point of the text's box lies on the insertion station, row by row from the top left.
  enum ETLInsertionPoint : std::int32_t {
    INSERT_TOP_LEFT = 1,
    INSERT_TOP_CENTER = 2,
    INSERT_TOP_RIGHT = 3,
    INSERT_MIDDLE_LEFT = 4,
    INSERT_MIDDLE_CENTER = 5,  // the default
    INSERT_MIDDLE_RIGHT = 6,
    INSERT_BOTTOM_LEFT = 7,
    INSERT_BOTTOM_CENTER = 8,
    INSERT_BOTTOM_RIGHT = 9,
  };

  // ---- Construction ---------------------------------------------------------------------------
  // Insertion station (flags 2, kind 5) at the origin, empty text and font name, height and rotation
  // 0, insertion point INSERT_MIDDLE_CENTER, every style flag false, no drawing properties, state 1.
  DexTextLabel();
  DexTextLabel(const DexTextLabel& other) = default;
  DexTextLabel& operator=(const DexTextLabel& other) = default;
  ~DexTextLabel() override;

  // ---- DexObject ------------------------------------------------------------------------------
  DexObject* clone() const override;
  // The station's shiftCoords; the rotation angle of the label stays as it is.
  void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                   double rotation) override;
  // GROUP_POINTS.
  EGroupType getGroupType() override;

 protected:
  // The common part, then, when target is a text label, through its setters: the station, rotation
  // angle, height, text, insertion point, font name and the five style flags.
  void copyCommonData(DexObject* target) const override;

 public:
  const IDexDrawProperties* getDrawProperties() const override { return drawProperties_.get(); }
  void setDrawProperties(IDexDrawProperties* properties) override { drawProperties_.reset(properties); }

  // OBJECT_TYPE_TEXT_LABEL.
  EDexObjectsType getType() override;
  // The name is the station's.
  void setName(const CVynStringT<wchar_t>& name) override { station_.setName(name); }
  const CVynStringT<wchar_t>& getName() const override { return station_.getName(); }

  // ---- Insertion station ----------------------------------------------------------------------
  const DexStation& getStation() const noexcept { return station_; }
  // Takes the whole station, except that a label with a name keeps it when station has none.
  void setStation(const DexStation& station);
  // The station's setPosition: kNoValue marks the horizontal coordinates or the height undefined.
  void setCoords(double x, double y, double z) { station_.setPosition(x, y, z); }
  // As above, then the station's geoid height.
  void setCoords(double x, double y, double z, double geoidHeight) {
    station_.setPosition(x, y, z, geoidHeight);
  }

  // ---- Text and style -------------------------------------------------------------------------
  const CVynStringT<wchar_t>& getText() const noexcept { return text_; }
  void setText(const CVynStringT<wchar_t>& text) { text_ = text; }
  const CVynStringT<wchar_t>& getFontName() const noexcept { return fontName_; }
  void setFontName(const CVynStringT<wchar_t>& fontName) { fontName_ = fontName; }
  double getHeightInMeters() const noexcept { return heightInMeters_; }
  void setHeightInMeters(double height) noexcept { heightInMeters_ = height; }
  double getRotationAngle() const noexcept { return rotationAngle_; }
  void setRotationAngle(double angle) noexcept { rotationAngle_ = angle; }
  ETLInsertionPoint getInsertionPoint() const noexcept { return insertionPoint_; }
  // An ETLInsertionPoint value or its number; any value is stored.
  void setInsertionPoint(int insertionPoint) noexcept {
    insertionPoint_ = static_cast<ETLInsertionPoint>(insertionPoint);
  }
  bool getBold() const noexcept { return bold_; }
  void setBold(bool bold) noexcept { bold_ = bold; }
  bool getItalic() const noexcept { return italic_; }
  void setItalic(bool italic) noexcept { italic_ = italic; }
  bool getUnderline() const noexcept { return underline_; }
  void setUnderline(bool underline) noexcept { underline_ = underline; }
  bool getDrawBox() const noexcept { return drawBox_; }
  void setDrawBox(bool drawBox) noexcept { drawBox_ = drawBox; }
  bool getOpaque() const noexcept { return opaque_; }
  void setOpaque(bool opaque) noexcept { opaque_ = opaque; }

 private:
  DexStation station_{2, CS_LOCAL};
  DexOwnedDrawProperties drawProperties_;
  double rotationAngle_ = 0.0;
  double heightInMeters_ = 0.0;
  CVynStringT<wchar_t> text_;
  ETLInsertionPoint insertionPoint_ = INSERT_MIDDLE_CENTER;
  CVynStringT<wchar_t> fontName_;
  bool bold_ = false;
  bool italic_ = false;
  bool underline_ = false;
  bool drawBox_ = false;
  bool opaque_ = false;
};

}  // namespace vyn::ie
