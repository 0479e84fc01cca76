#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "hostlibs/DexApi.h"

namespace vyn::ie::detail {

// The position index of a surface: an octree over points in space that maps each stored point to an
// int (the point's index in the surface's position list). Lookups are exact: a point is found only
// under coordinates equal to the ones it was stored with.
//
// Boxes are half-open cubes [centre - half, centre + half) on each axis. The root box is centred on the
// origin and every half size is a power of two, so every centre is a sum of powers of two and boxes
// split and grow without rounding: a point always descends the same way. The first point sets the
// smallest root (half size 1 at least) that holds it; a point outside the root makes the root double
// until the point is inside, each old octant moving one level down into the new octant around it. A
// leaf holding more than the capacity splits into octants, unless its octants could no longer be
// described exactly (then it simply keeps more points).
//
// Refused points (insert() says why): a point equal to one stored; a NaN or infinite coordinate; a
// coordinate of magnitude 2^1023 (about 9e307) or more, which no finite box around the origin holds. Nothing
// is stored for a refused point, and no input makes an operation loop without end.
//
// The index keeps its own copy of every point, so it never reads the caller's list. Exported (though
// never installed) so that the tests can reach it directly.
class DEX_API PositionOctree {
 public:
  enum class InsertResult {
    kInserted,
    kDuplicate,   // a point with the same x, y and z is stored
    kNotFinite,   // a coordinate is NaN or infinite
    kOutOfReach,  // a coordinate lies beyond every box the index can describe
  };

  static constexpr int kDefaultCapacity = 16;

  // capacity is the number of points a leaf holds before it splits. A capacity of 0 or less is reported
  // through the error log (source ieObjects\IESurface, line 705) and kDefaultCapacity is used instead.
  explicit PositionOctree(int capacity = kDefaultCapacity);

  InsertResult insert(double x, double y, double z, int value);
  // The value stored with the point (x, y, z), or -1 when there is none: for an empty index, a point
  // outside the root box and a NaN coordinate alike.
  int find(double x, double y, double z) const;

  std::size_t size() const noexcept { return size_; }
  bool isEmpty() const noexcept { return size_ == 0; }
  int capacity() const noexcept { return capacity_; }
  // The levels from the root down to the deepest leaf (0 for an empty index); for tests and benchmarks.
  int depth() const;

 private:
  struct Point {
    double x;
    double y;
    double z;
  };
  struct Entry {
    Point point;
    int value;
  };
  struct Node {
    Node(const Point& boxCentre, double boxHalf) noexcept : centre(boxCentre), half(boxHalf) {}

    Point centre;
    double half;
    std::int32_t firstChild = -1;  // the eight octants are consecutive nodes; -1 for a leaf
    std::vector<Entry> entries;    // a leaf's points
  };

  static bool isInside(const Node& node, const Point& point) noexcept;
  static int octantOf(const Node& node, const Point& point) noexcept;
  static bool canSplit(const Node& node) noexcept;

  bool makeRoot(const Point& point);
  bool growRoot();
  std::int32_t leafOf(const Point& point) const noexcept;
  std::int32_t addOctantsOf(std::int32_t parent);
  void splitWhileFull(std::int32_t leaf, const Point& point);

  std::vector<Node> nodes_;
  std::int32_t root_ = -1;
  int capacity_;
  std::size_t size_ = 0;
};

}  // namespace vyn::ie::detail
