#include "ieObjects/detail/PositionOctree.h"

#include <algorithm>
#include <cmath>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/SurfaceLog.h"

namespace vyn::ie::detail {

namespace {

// Boxes are not split below this half size: their octants would come near the smallest normal doubles.
constexpr double kSmallestHalf = 0x1p-1000;
// A box is split only while a quarter of it is at least this fraction of its centre's magnitude: the
// octants' centres then need fewer than 53 bits counted in that quarter, so they are exact.
constexpr double kSplitPrecision = 0x1p-48;

bool isFinite(double x, double y, double z) noexcept {
  return std::isfinite(x) && std::isfinite(y) && std::isfinite(z);
}

}  // namespace

PositionOctree::PositionOctree(int capacity) : capacity_(capacity) {
  if (capacity_ <= 0) {
    vyn_logging::vyn_err_log(kSurfaceLogSource, kSurfaceIndexCapacityLine);
    capacity_ = kDefaultCapacity;
  }
}

PositionOctree::InsertResult PositionOctree::insert(double x, double y, double z, int value) {
  if (!isFinite(x, y, z)) return InsertResult::kNotFinite;
  const Point point{x, y, z};
  if (root_ < 0 && !makeRoot(point)) return InsertResult::kOutOfReach;
  // Each growth doubles the root, so the loop ends after at most about a thousand rounds.
  while (!isInside(nodes_[static_cast<std::size_t>(root_)], point)) {
    if (!growRoot()) return InsertResult::kOutOfReach;
  }

  const std::int32_t leaf = leafOf(point);
  std::vector<Entry>& entries = nodes_[static_cast<std::size_t>(leaf)].entries;
  const bool stored = std::any_of(entries.begin(), entries.end(), [&point](const Entry& entry) {
    return entry.point.x == point.x && entry.point.y == point.y && entry.point.z == point.z;
  });
  if (stored) return InsertResult::kDuplicate;
  entries.push_back(Entry{point, value});
  ++size_;
  splitWhileFull(leaf, point);
  return InsertResult::kInserted;
}

int PositionOctree::find(double x, double y, double z) const {
  if (root_ < 0) return -1;
  const Point point{x, y, z};
  // A NaN or infinite coordinate is never inside a box.
  if (!isInside(nodes_[static_cast<std::size_t>(root_)], point)) return -1;
  for (const Entry& entry : nodes_[static_cast<std::size_t>(leafOf(point))].entries) {
    if (entry.point.x == x && entry.point.y == y && entry.point.z == z) return entry.value;
  }
  return -1;
}

int PositionOctree::depth() const {
  if (root_ < 0) return 0;
  int deepest = 0;
  std::vector<std::pair<std::int32_t, int>> pending{{root_, 1}};
  while (!pending.empty()) {
    const auto [node, level] = pending.back();
    pending.pop_back();
    deepest = std::max(deepest, level);
    const std::int32_t first = nodes_[static_cast<std::size_t>(node)].firstChild;
    if (first < 0) continue;
    for (std::int32_t octant = 0; octant < 8; ++octant)
      pending.emplace_back(first + octant, level + 1);
  }
  return deepest;
}

bool PositionOctree::isInside(const Node& node, const Point& point) noexcept {
  const auto within = [&node](double centre, double value) {
    return centre - node.half <= value && value < centre + node.half;
  };
  return within(node.centre.x, point.x) && within(node.centre.y, point.y) && within(node.centre.z, point.z);
}

int PositionOctree::octantOf(const Node& node, const Point& point) noexcept {
  return (point.x >= node.centre.x ? 1 : 0) | (point.y >= node.centre.y ? 2 : 0) |
         (point.z >= node.centre.z ? 4 : 0);
}

bool PositionOctree::canSplit(const Node& node) noexcept {
  const double quarter = node.half / 2.0;
  const double magnitude =
      std::max({std::fabs(node.centre.x), std::fabs(node.centre.y), std::fabs(node.centre.z)});
  return quarter >= kSmallestHalf && quarter >= magnitude * kSplitPrecision;
}

// The root is centred on the origin with the smallest power-of-two half size (1 at least) that holds
// the point.
bool PositionOctree::makeRoot(const Point& point) {
  const double magnitude = std::max({std::fabs(point.x), std::fabs(point.y), std::fabs(point.z)});
  int exponent = 0;
  if (magnitude >= 1.0) static_cast<void>(std::frexp(magnitude, &exponent));  // magnitude < 2^exponent
  const double half = std::ldexp(1.0, exponent);
  if (!std::isfinite(half)) return false;
  nodes_.emplace_back(Point{0.0, 0.0, 0.0}, half);
  root_ = static_cast<std::int32_t>(nodes_.size() - 1);
  return true;
}

// Doubles the root about the origin. The new root's octant i gets octants of its own when old octant i
// holds points, and old octant i becomes the one of them nearest the origin (octant 7 - i), which covers
// the same box. An old root without octants hands its few points down the new tree. The root keeps its
// node number. False, with nothing changed, when the doubled box would leave the finite doubles.
bool PositionOctree::growRoot() {
  const double grownHalf = 2.0 * nodes_[static_cast<std::size_t>(root_)].half;
  if (!std::isfinite(grownHalf)) return false;

  Node oldRoot = std::move(nodes_[static_cast<std::size_t>(root_)]);
  nodes_[static_cast<std::size_t>(root_)] = Node(Point{0.0, 0.0, 0.0}, grownHalf);
  const std::int32_t first = addOctantsOf(root_);
  if (oldRoot.firstChild < 0) {
    // The root splits as soon as it is full, so these points fit the new leaves without a split.
    for (const Entry& entry : oldRoot.entries)
      nodes_[static_cast<std::size_t>(leafOf(entry.point))].entries.push_back(entry);
    return true;
  }
  for (int octant = 0; octant < 8; ++octant) {
    const std::int32_t oldOctantIndex = oldRoot.firstChild + octant;
    const auto oldOctant = static_cast<std::size_t>(oldOctantIndex);
    if (nodes_[oldOctant].firstChild < 0 && nodes_[oldOctant].entries.empty()) continue;
    const std::int32_t grandchildren = addOctantsOf(first + octant);
    const std::int32_t newPlace = grandchildren + (7 - octant);
    nodes_[static_cast<std::size_t>(newPlace)] = std::move(nodes_[oldOctant]);
  }
  return true;
}

std::int32_t PositionOctree::leafOf(const Point& point) const noexcept {
  std::int32_t node = root_;
  while (nodes_[static_cast<std::size_t>(node)].firstChild >= 0) {
    const Node& inner = nodes_[static_cast<std::size_t>(node)];
    node = inner.firstChild + octantOf(inner, point);
  }
  return node;
}

// Appends the eight empty octants of parent and makes it an inner node; answers the first octant.
std::int32_t PositionOctree::addOctantsOf(std::int32_t parent) {
  const Point parentCentre = nodes_[static_cast<std::size_t>(parent)].centre;
  const double quarter = nodes_[static_cast<std::size_t>(parent)].half / 2.0;
  const auto first = static_cast<std::int32_t>(nodes_.size());
  for (int octant = 0; octant < 8; ++octant) {
    const Point centre{parentCentre.x + ((octant & 1) != 0 ? quarter : -quarter),
                       parentCentre.y + ((octant & 2) != 0 ? quarter : -quarter),
                       parentCentre.z + ((octant & 4) != 0 ? quarter : -quarter)};
    nodes_.emplace_back(centre, quarter);
  }
  nodes_[static_cast<std::size_t>(parent)].firstChild = first;
  return first;
}

// A full leaf holds capacity + 1 points, so after a split at most one octant is full again: the one
// that received every point, the new one included. Splitting stops where boxes cannot split exactly.
void PositionOctree::splitWhileFull(std::int32_t leaf, const Point& point) {
  const auto capacity = static_cast<std::size_t>(capacity_);
  while (nodes_[static_cast<std::size_t>(leaf)].entries.size() > capacity &&
         canSplit(nodes_[static_cast<std::size_t>(leaf)])) {
    std::vector<Entry> entries;
    entries.swap(nodes_[static_cast<std::size_t>(leaf)].entries);
    const std::int32_t first = addOctantsOf(leaf);
    const Node& parent = nodes_[static_cast<std::size_t>(leaf)];
    for (const Entry& entry : entries) {
      const std::int32_t child = first + octantOf(parent, entry.point);
      nodes_[static_cast<std::size_t>(child)].entries.push_back(entry);
    }
    leaf = first + octantOf(nodes_[static_cast<std::size_t>(leaf)], point);
  }
}

}  // namespace vyn::ie::detail
