#pragma once

#include <cstddef>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwnedPointer.h"

// Regions of a dataset.
//
// Error-log record (source ieObjects\IERegion, empty message):
// - line 721: getVertexAt() was asked for an index at or past the end of the vertices.
namespace vyn::ie {

class DexLayer;

// A region: a named closed outline of vertices with bulges (each bulge describes the arc to the next
// vertex, the last one's the arc back to the first), a region type, a layer and area drawing properties.
//
// Ownership: the region owns its area drawing properties and refers to its layer without owning it.
// Copy construction and assignment copy the layer reference, the name, the region type and the vertices
// and duplicate the area drawing properties.
class DEX_API DexRegion : public IDexObjInterface, public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // What kind of area a region outlines. The model only stores the value: any number is kept.
  enum ERegionType : std::int32_t {
    REGION_TYPE_DEFAULT = 0,
  };

  // No layer, empty name, region type 0, no vertices, no drawing properties.
  DexRegion() = default;
  DexRegion(const DexRegion&) = default;
  DexRegion& operator=(const DexRegion&) = default;
  ~DexRegion() override;

  // OBJECT_TYPE_REGION.
  EDexObjectsType getType() override;
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // ---- Outline --------------------------------------------------------------------------------
  // Appends a copy of vertex.
  void addVertex(const DexPositionWithBulge& vertex) { vertices_.push_back(vertex); }
  std::size_t getVerticesCount() const noexcept { return vertices_.size(); }
  // The vertex at index. For an index at or past the end an error-log record is written (line 721) and
  // a shared read-only vertex (0, 0, 0) with bulge 0 is answered.
  const DexPositionWithBulge& getVertexAt(std::size_t index) const;

  // ---- Type, layer (not owned) and drawing properties (owned) ---------------------------------
  ERegionType getRegionType() const noexcept { return regionType_; }
  // An ERegionType value or its number.
  void setRegionType(int regionType) noexcept { regionType_ = static_cast<ERegionType>(regionType); }
  const DexLayer* getLayer() const noexcept { return layer_; }
  void setLayer(const DexLayer* layer) noexcept { layer_ = layer; }
  DexDrawAreaProperties* getAreaDrawProperties() noexcept { return areaDrawProperties_.get(); }
  const DexDrawAreaProperties* getAreaDrawProperties() const noexcept { return areaDrawProperties_.get(); }
  // Takes ownership of properties (null allowed) and deletes the object held before, unless it is the
  // same pointer.
  void setAreaDrawProperties(DexDrawAreaProperties* properties) noexcept {
    areaDrawProperties_.reset(properties);
  }

 private:
  const DexLayer* layer_ = nullptr;
  CVynStringT<wchar_t> name_;
  ERegionType regionType_ = REGION_TYPE_DEFAULT;
  vyn_vector<DexPositionWithBulge> vertices_;
  DexOwnedPointer<DexDrawAreaProperties, DexCopyByCloneAs> areaDrawProperties_;
};

}  // namespace vyn::ie
