#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEObjectsType.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEPhotoNotes.h"

// The common base of the survey objects of a dataset (points, polylines, areas, breaklines, arcs,
// circles, text labels).
//
// Error-log records of every survey object file (source ieObjects\IEObjects, empty message):
// - line 501: DexObject::getDrawPropertiesByCode() asked of an object without codes;
// - line 502: DexObject::getDrawPropertiesByCodeLayer() asked of an object without codes;
// - line 503: DexPolyLine::getStation() asked for an index outside the stations;
// - line 504: DexPolyLine::getNodeStation() asked for an index outside the nodes;
// - line 505: DexPolyLine::getNodeStation() met a point entry that refers to no point.
namespace vyn::ie {

class DexLayer;

// A survey object: an edit state, an object kind, codes with attributes, a layer, drawing properties,
// optional photo notes, cloning and a common coordinate shift. Subclasses give the kind (getType), the
// name (getName/setName) and the geometry.
//
// Ownership: the object owns its code values, its drawing properties (held by each subclass) and its
// photo notes; it refers to its layer and to the code descriptions of the code library without owning
// them. Copy construction and assignment of every subclass duplicate what the object owns (each copy
// has its own code values, drawing properties and photo notes) and share the layer; the layer-by-code
// flag is copied as it is. clone() answers a new object owned by the caller.
//
// The virtual operations are declared in their fixed order (the plug-in ABI): after the destructor,
// setStateType, getStateType, clone, shiftCoords, getGroupType, copyCommonData, getDrawProperties,
// setDrawProperties. The operations a subclass implements for the other interfaces (getType, getName,
// setName) follow them in its table.
class DEX_API DexObject : public IDexStateInterface,
                          public IDexObjInterface,
                          public DexCodesDataInterface,
                          public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // How the dataset groups objects: by one position, by a list of offset stations, or by a line.
  enum EGroupType : std::int32_t {
    GROUP_POINTS = 0,        // design points (with their subclasses) and text labels
    GROUP_SHEET_POINTS = 1,  // sheet points
    GROUP_LINES = 2,         // polylines, areas, breaklines, arcs and circles
  };

  // Deletes the photo notes (and, in the subclasses, the drawing properties).
  ~DexObject() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  void setStateType(ECurrentState state) override;
  ECurrentState getStateType() const override;
  // A new object of the same class with the parts that the class's clone copies; the caller owns it.
  virtual DexObject* clone() const = 0;
  // Shifts, scales and rotates the object's coordinates (origin, scale in x, y and z, rotation in
  // degrees) by the station rule of DexStation::shiftCoords.
  virtual void shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                           double rotation) = 0;
  // Not const, like getType(): that is its signature in the plug-in interface.
  virtual EGroupType getGroupType() = 0;

 protected:
  // Copies the common part into target, as every clone() does: appends copies of the codes to the
  // target's; gives it this object's layer with the layer-by-code flag false; a clone of the drawing
  // properties (or null); the state; and the photo notes (none when this object has none, a copy when
  // the target has none, otherwise the target's are assigned from these). A null target, or this
  // object itself, does nothing.
  virtual void copyCommonData(DexObject* target) const;

 public:
  // The object's own drawing properties, or null.
  virtual const IDexDrawProperties* getDrawProperties() const = 0;
  // Takes ownership of properties (null allowed) and deletes the object held before, unless it is the
  // same pointer.
  virtual void setDrawProperties(IDexDrawProperties* properties) = 0;

  // ---- Layer (not owned) ----------------------------------------------------------------------
  void setLayer(const DexLayer* layer, bool byCode) noexcept;
  const DexLayer* getLayer() const noexcept { return layer_; }
  // True when the layer was taken from the object's code rather than given for the object itself.
  bool isLayerByCode() const noexcept { return layerByCode_; }

  // ---- Drawing properties of the first code ---------------------------------------------------
  // The drawing properties of the given type (IDexDrawProperties::EDexDrawType) of the description
  // of code 0; null when that code has no description or the description none of that type. An
  // object without codes answers null after an error-log record (line 501).
  const IDexDrawProperties* getDrawPropertiesByCode(int type) const;
  // The drawing properties of the given type of the layer of the description of code 0; null when
  // that code has no description, the description no layer or the layer none of that type. An object
  // without codes answers null after an error-log record (line 502).
  const IDexDrawProperties* getDrawPropertiesByCodeLayer(int type) const;

  // ---- Photo notes (owned) --------------------------------------------------------------------
  DexPhotoNotes* getPhotoNotes() noexcept { return photoNotes_.get(); }
  const DexPhotoNotes* getPhotoNotes() const noexcept { return photoNotes_.get(); }
  // Takes ownership of photoNotes (null allowed) and deletes the notes held before, unless it is the
  // same pointer.
  void setPhotoNotes(DexPhotoNotes* photoNotes) noexcept { photoNotes_.reset(photoNotes); }

 protected:
  // State 1 (active), no layer, no photo notes, no codes.
  DexObject() = default;
  // Duplicate the code values and photo notes; share the layer.
  DexObject(const DexObject& other) = default;
  DexObject& operator=(const DexObject& other) = default;

 private:
  const DexLayer* layer_ = nullptr;
  bool layerByCode_ = false;
  ECurrentState state_ = ACTIVE_STATE;
  DexOwnedPointer<DexPhotoNotes> photoNotes_;
};

// The owned drawing properties of a survey object: duplicated with their clone() when the object is
// copied, so that each copy has its own.
using DexOwnedDrawProperties = DexOwnedPointer<IDexDrawProperties, DexCopyByClone>;

}  // namespace vyn::ie
