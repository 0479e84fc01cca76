// The Units and CgPoints handlers.

#include <memory>

#include "LandXmlHandlers.h"
#include "LandXmlText.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEObjectList.h"
#include "ieObjects/IEPoints.h"

namespace vyn::ie::landxml {

// ---- Units ---------------------------------------------------------------------------------------

UnitsHandler::UnitsHandler(ReadContext& context, const FileUnits& fallback) : context_(context) {
  context_.units() = fallback;
}

bool UnitsHandler::start(const ElementPath& path, std::wstring_view attributes) {
  const std::wstring_view name = path.name();
  if (name == element::kUnits) return true;
  if (name != element::kMetric && name != element::kImperial) return false;
  FileUnits& units = context_.units();
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view word) {
    const auto readLinear = [&](EDistUnits& target) {
      if (!linearUnitFromWord(word, target))
        context_.malformed(L"unknown linear unit, the fallback unit is used", word);
    };
    const auto readAngular = [&](EAngleUnits& target) {
      if (!angularUnitFromWord(word, target))
        context_.malformed(L"unknown angular unit, the fallback unit is used", word);
    };
    if (attribute == attribute::kLinearUnit) {
      readLinear(units.linear);
    } else if (attribute == attribute::kAngularUnit) {
      readAngular(units.angular);
    } else if (attribute == attribute::kDirectionUnit) {
      readAngular(units.direction);
    } else if (!isUnitOfUnreadValues(attribute)) {
      context_.notHeld(name, attribute);
    }
  });
  return true;
}

// ---- CgPoints ------------------------------------------------------------------------------------

CgPointsHandler::CgPointsHandler(ReadContext& context, bool withLists)
    : context_(context), withLists_(withLists), codes_(&context.data()) {}

bool CgPointsHandler::start(const ElementPath& path, std::wstring_view attributes) {
  const std::wstring_view name = path.name();
  if (name == element::kCgPoints) {
    startGroup(attributes);
    return true;
  }
  if (name != element::kCgPoint || path.name(1) != element::kCgPoints) return false;
  startPoint(attributes);
  return true;
}

void CgPointsHandler::text(const ElementPath& path, std::wstring_view text) {
  if (path.name() != element::kCgPoint) return;
  text_.assign(text);
  hasText_ = true;
}

void CgPointsHandler::end(const ElementPath& path) {
  if (path.name() == element::kCgPoint) {
    endPoint();
  } else if (!groups_.empty()) {
    groups_.pop_back();
  }
}

void CgPointsHandler::startGroup(std::wstring_view attributes) {
  DexObjectList* list = nullptr;
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (attribute != attribute::kName || !withLists_) {
      context_.notHeld(element::kCgPoints, attribute);
      return;
    }
    CVynStringT<wchar_t>& listName = context_.scratch();
    point_files::assignText(listName, value);
    list = context_.dataset().findObjectListByName(listName);
    if (list == nullptr) {
      auto created = std::make_unique<DexObjectList>();
      created->setName(listName);
      list = created.get();
      context_.dataset().addObjectList(created.release());
    }
  });
  groups_.push_back(list);
}

void CgPointsHandler::startPoint(std::wstring_view attributes) {
  name_.clear();
  code_.clear();
  desc_.clear();
  reference_.clear();
  hasName_ = false;
  hasText_ = false;
  stateFlag_ = 0;
  forEachAttribute(attributes, [this](std::wstring_view attribute, std::wstring_view value) {
    if (attribute == attribute::kName) {
      name_.assign(value);
      hasName_ = true;
    } else if (attribute == attribute::kCode) {
      code_.assign(value);
    } else if (attribute == attribute::kDesc) {
      desc_.assign(value);
    } else if (attribute == attribute::kPntRef) {
      reference_.assign(value);
    } else if (attribute == attribute::kState) {
      if (!stateFlagFromWord(value, stateFlag_))
        context_.malformed(L"CgPoint state word unknown, the point is read without a state", value);
    } else {
      context_.notHeld(element::kCgPoint, attribute);
    }
  });
}

bool CgPointsHandler::readCoordinates(double& north, double& east, double& height) {
  north = east = height = kNoValue;
  if (hasText_) {
    double values[3] = {};
    const int count = context_.readCoordinates(text_, values, 3);
    if (count >= 2) {
      north = values[0];
      east = values[1];
      if (count == 3) height = values[2];
      return true;
    }
    context_.malformed(L"CgPoint skipped, its text is not 2 or 3 numbers", name_ + L": " + text_);
    return false;
  }
  if (reference_.empty()) return true;  // a point without coordinates
  const DexDesignPoint* referenced = context_.findPoint(reference_);
  if (referenced == nullptr) {
    context_.malformed(L"CgPoint skipped, its pntRef names no point read before", reference_);
    return false;
  }
  const DexStation& station = referenced->getStation();
  if (station.isHorizCoordsDefined()) {
    north = station.getX();
    east = station.getY();
  }
  if (station.isHeightDefined()) height = station.getZ();
  return true;
}

void CgPointsHandler::endPoint() {
  DexObjectList* const group = groups_.empty() ? nullptr : groups_.back();
  if (!hasName_ && !hasText_ && !reference_.empty() && group != nullptr) {
    // A member of a named group that names a point of the file.
    if (DexDesignPoint* member = context_.findPoint(reference_)) {
      group->addObject(member);
    } else {
      context_.malformed(L"CgPoint skipped, its pntRef names no point read before", reference_);
    }
    return;
  }
  double north = 0.0;
  double east = 0.0;
  double height = 0.0;
  if (!readCoordinates(north, east, height)) return;

  auto point = std::make_unique<DexDesignPoint>();
  CVynStringT<wchar_t>& text = context_.scratch();
  point_files::assignText(text, name_);
  point->setName(text);
  point->setCoords(north, east, height);
  if (!desc_.empty() || stateFlag_ != 0) {
    DexStation station = point->getStation();
    if (!desc_.empty()) {
      point_files::assignText(text, desc_);
      station.setNotes(text);
    }
    if (stateFlag_ != 0) station.setStationAttrs(station.getStationAttrs() | (1u << stateFlag_));
    point->setStation(station);
  }
  if (!code_.empty()) addCodes(*point);
  DexDesignPoint* const added = point.get();
  context_.dataset().add(point.release());
  context_.addPoint(added);
  if (group != nullptr) group->addObject(added);
}

void CgPointsHandler::addCodes(DexDesignPoint& point) {
  rejectedCodes_.clear();
  if (codes_.read(code_, point, rejectedCodes_)) return;
  // Not a code text of the point files' form: the whole text is one code.
  point.removeAllCodes();
  CVynStringT<wchar_t>& name = context_.scratch();
  point_files::assignText(name, code_);
  DexDataDictionary* dictionary = context_.data().getIEDataDictionary();
  const DexCodeDescription* description = dictionary->findCodeDiscription(name);
  if (description == nullptr) {
    auto* created = new DexCodeDescription(name);
    dictionary->addCodeDescription(created);
    description = created;
  }
  point.addCode(new DexCodeValues(description));
}

}  // namespace vyn::ie::landxml
