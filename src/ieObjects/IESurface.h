#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "hostlibs/vynmath.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEOwningList.h"

// Triangulated surfaces of a dataset.
//
// Error-log records (source ieObjects\IESurface, empty message):
// - line 701: addPosition() stored a position equal in x, y and z to one already indexed;
// - line 702: addPosition() stored a position with a NaN or infinite coordinate (not indexed);
// - line 703: addPosition() stored a position with a coordinate of magnitude 2^1023 or more (not
//   indexed);
// - line 704: getPositionAt() was asked for an index outside the positions.
namespace vyn::ie {

class DexBreakline;
class DexLayer;

namespace detail {
class PositionOctree;
}

// A triangle of a surface: the indexes of its three corners in the surface's position list, -1
// (DexSurface::getEmptyIndex()) while a corner is not set. A plain value record.
class DEX_API DexTriangle {
 public:
  VYN_CLASS_ALLOCATOR

  enum EPositionNumber : std::int32_t {
    FIRST_POSITION = 0,
    SECOND_POSITION = 1,
    THIRD_POSITION = 2,
  };
  static constexpr int kNumberOfPositions = 3;

  // All three corners -1.
  DexTriangle() noexcept { corners_.fill(-1); }

  // The index of corner (an EPositionNumber value or its number); -1 for a corner outside 0 to 2,
  // which setPosition ignores.
  int getPosition(int corner) const noexcept { return isCorner(corner) ? corners_[toIndex(corner)] : -1; }
  void setPosition(int corner, int positionIndex) noexcept {
    if (isCorner(corner)) corners_[toIndex(corner)] = positionIndex;
  }
  // Copies the three indexes positionIndexes[0] to [2]; a null pointer changes nothing.
  void setPositions(const int* positionIndexes) noexcept;

  friend bool operator==(const DexTriangle&, const DexTriangle&) = default;

 private:
  static constexpr bool isCorner(int corner) noexcept { return corner >= 0 && corner < kNumberOfPositions; }
  static constexpr std::size_t toIndex(int corner) noexcept { return static_cast<std::size_t>(corner); }

  std::array<std::int32_t, kNumberOfPositions> corners_{};
};

// A triangulated surface: a name, a list of positions with an exact-lookup index over them, triangles
// made of position indexes, the breaklines that shape it, a layer and line drawing properties.
//
// Ownership: the surface owns its triangles and its drawing properties; it refers to its breaklines
// (survey objects owned by the dataset) and its layer without owning them, so deleting a surface leaves
// them alive. Copy construction and assignment duplicate the positions, the index, the triangles and
// the drawing properties, and share the breaklines and the layer.
//
// The position index (an octree of capacity 16 whose root grows to hold new positions) files every
// position that addPosition() stores, under its coordinates at that moment. It refuses, with an
// error-log record, a position equal in x, y and z to one already indexed, a NaN or infinite coordinate
// and a coordinate of magnitude 2^1023 or more; the position is stored all the same, it is only not
// found by getPositionIndex().
class DEX_API DexSurface : public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // Capacity of the leaves of the position index.
  static constexpr int kPositionIndexCapacity = 16;

  // The index that stands for "no position".
  static int getEmptyIndex() noexcept { return -1; }

  // ---- Construction ---------------------------------------------------------------------------
  // No name, positions, triangles, breaklines, layer or drawing properties.
  DexSurface();
  DexSurface(const DexSurface& other);
  DexSurface& operator=(const DexSurface& other);
  ~DexSurface() override;

  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }

  // ---- Positions ------------------------------------------------------------------------------
  // Appends position, files it in the position index and answers its index (the count before). A
  // position the index refuses is logged (lines 701 to 703) and stored and answered all the same.
  int addPosition(const DexPosition3D& position);
  int getNumberOfPositions() const noexcept { return static_cast<int>(positions_.size()); }
  // The position at index. For an index outside the list an error-log record is written (line 704)
  // and a scratch position (0, 0, 0), shared and reset on every such call, is answered; the caller
  // must not take it for a position of the surface.
  DexPosition3D& getPositionAt(int index);
  const DexPosition3D& getPositionAt(int index) const;
  // Copies x, y, z of the position at index into point; false (point unchanged) for an invalid index.
  bool getCoords(int index, vyn_math::TAbstractPoint3<double>& point) const;
  // True when the position at index has exactly point's x, y and z; false for an invalid index.
  bool isEqual(int index, const vyn_math::TAbstractPoint3<double>& point) const;
  // The index of the indexed position exactly equal to position in x, y and z (the first one added
  // when it was added more than once), or -1 when there is none or position lies outside the index's
  // box. An index is answered only while the position stored there still has those coordinates, so a
  // position changed through getPositionAt() or cut off by setNumberOfPositions() is not found.
  int getPositionIndex(const DexPosition3D& position) const;
  // Resizes the position list; new positions are (0, 0, 0). The position index is not changed. A
  // count below 0 counts as 0.
  void setNumberOfPositions(int count);
  // Makes room for count positions or triangles (a count of 0 or below changes nothing).
  void reservePositions(int count);
  void reserveTriangles(int count) { triangles_.reserve(count); }

  // ---- Triangles (owned) ----------------------------------------------------------------------
  // Appends triangle and takes ownership; a null triangle is ignored.
  void addTriangle(DexTriangle* triangle) { triangles_.add(triangle); }
  int getNumberOfTriangles() const noexcept { return triangles_.count(); }
  // The triangle at index, or null when index is outside the list. The surface keeps ownership.
  DexTriangle* getTriangleAt(int index) noexcept { return triangles_.at(index); }
  const DexTriangle* getTriangleAt(int index) const noexcept { return triangles_.at(index); }

  // ---- Breaklines (not owned) -----------------------------------------------------------------
  // Appends a reference to breakline, which must outlive the surface's use of it; null is ignored.
  void addBreakline(DexBreakline* breakline);
  int getNumberOfBreaklines() const noexcept { return static_cast<int>(breaklines_.size()); }
  // The breakline at index, or null when index is outside the list.
  DexBreakline* getBreaklineAt(int index) noexcept;
  const DexBreakline* getBreaklineAt(int index) const noexcept;

  // ---- Layer (not owned) and drawing properties (owned) ---------------------------------------
  const DexLayer* getLayer() const noexcept { return layer_; }
  void setLayer(const DexLayer* layer) noexcept { layer_ = layer; }
  DexDrawLineProperties* getDrawProperties() noexcept { return drawProperties_.get(); }
  const DexDrawLineProperties* getDrawProperties() const noexcept { return drawProperties_.get(); }
  // Takes ownership of properties (null allowed) and deletes the object held before, unless it is the
  // same pointer.
  void setDrawProperties(DexDrawLineProperties* properties) noexcept { drawProperties_.reset(properties); }

 private:
  bool isPositionIndex(int index) const noexcept { return index >= 0 && index < getNumberOfPositions(); }

  DexOwningList<DexTriangle> triangles_;
  vyn_vector<DexPosition3D> positions_;
  vyn_vector<DexBreakline*> breaklines_;
  CVynStringT<wchar_t> name_;
  const DexLayer* layer_ = nullptr;
  DexOwnedPointer<DexDrawLineProperties, DexCopyByCloneAs> drawProperties_;
  DexOwnedPointer<detail::PositionOctree> positionIndex_;
};

}  // namespace vyn::ie
