#pragma once

#include <unordered_map>
#include <vector>

#include "hostlibs/VynString.h"

namespace vyn::ie::detail {

// The positions of a list's records by name, each name's positions chained in list order, so that the
// first and the last record of a name, and each one's neighbours of the same name, are found without
// walking the list. Appending is O(1); inserting and removing renumber every position after the
// place, O(n) like the list's own shift.
//
// The index keeps the name a record had when it was filed; the list checks the records' current
// names and refiles them (rebuild) after renames.
class RawDataNameIndex {
 public:
  static constexpr int kNone = -1;

  int size() const noexcept { return static_cast<int>(links_.size()); }
  // Files the record at position size() under name.
  void append(const CVynStringT<wchar_t>& name);
  // Files a record at position (0 to size()) under name; the records from position on move up one.
  void insert(int position, const CVynStringT<wchar_t>& name);
  // Drops the record at position; the records after it move down one.
  void remove(int position);
  void clear() noexcept;
  void reserve(int capacity);

  // The first or last position filed under name, or kNone.
  int first(const CVynStringT<wchar_t>& name) const;
  int last(const CVynStringT<wchar_t>& name) const;
  // The next or previous position filed under the same name as position, or kNone.
  int next(int position) const noexcept { return links_[static_cast<std::size_t>(position)].next; }
  int previous(int position) const noexcept { return links_[static_cast<std::size_t>(position)].previous; }

 private:
  struct Ends {
    int first;
    int last;
  };
  using Entries = std::unordered_map<CVynStringT<wchar_t>, Ends>;
  struct Link {
    Entries::value_type* entry;  // the name filed under; nodes of an unordered map stay put
    int previous;
    int next;
  };

  Link& link(int position) noexcept { return links_[static_cast<std::size_t>(position)]; }
  // Adds delta to every stored position at or after from.
  void renumber(int from, int delta) noexcept;

  Entries entries_;
  std::vector<Link> links_;
};

}  // namespace vyn::ie::detail
