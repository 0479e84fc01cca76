#include "ieObjects/IETextLabel.h"

#include "ieObjects/detail/ObjectStations.h"

namespace vyn::ie {

DexTextLabel::DexTextLabel() = default;

DexTextLabel::~DexTextLabel() = default;

DexObject* DexTextLabel::clone() const {
  auto* const copy = new DexTextLabel();
  copyCommonData(copy);
  return copy;
}

void DexTextLabel::shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                               double rotation) {
  station_.shiftCoords(origin, scaleX, scaleY, scaleZ, rotation);
}

DexObject::EGroupType DexTextLabel::getGroupType() {
  return GROUP_POINTS;
}

void DexTextLabel::copyCommonData(DexObject* target) const {
  DexObject::copyCommonData(target);
  auto* const label = dynamic_cast<DexTextLabel*>(target);
  if (label == nullptr || label == this) return;
  label->setStation(station_);
  label->setRotationAngle(rotationAngle_);
  label->setHeightInMeters(heightInMeters_);
  label->setText(text_);
  label->setInsertionPoint(insertionPoint_);
  label->setFontName(fontName_);
  label->setBold(bold_);
  label->setItalic(italic_);
  label->setUnderline(underline_);
  label->setDrawBox(drawBox_);
  label->setOpaque(opaque_);
}

EDexObjectsType DexTextLabel::getType() {
  return OBJECT_TYPE_TEXT_LABEL;
}

void DexTextLabel::setStation(const DexStation& station) {
  detail::assignStationKeepingName(station_, station);
}

}  // namespace vyn::ie
