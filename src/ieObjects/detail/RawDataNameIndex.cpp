#include "ieObjects/detail/RawDataNameIndex.h"

namespace vyn::ie::detail {
namespace {

void shift(int& position, int from, int delta) noexcept {
  if (position != RawDataNameIndex::kNone && position >= from) position += delta;
}

}  // namespace

void RawDataNameIndex::append(const CVynStringT<wchar_t>& name) {
  const int position = size();
  const auto [entry, isNew] = entries_.try_emplace(name, Ends{position, position});
  int previous = kNone;
  if (!isNew) {
    previous = entry->second.last;
    link(previous).next = position;
    entry->second.last = position;
  }
  links_.push_back(Link{&*entry, previous, kNone});
}

void RawDataNameIndex::insert(int position, const CVynStringT<wchar_t>& name) {
  if (position >= size()) {
    append(name);
    return;
  }
  renumber(position, 1);
  const auto [entry, isNew] = entries_.try_emplace(name, Ends{position, position});
  links_.insert(links_.begin() + position, Link{&*entry, kNone, kNone});
  if (isNew) return;

  // The neighbours of the same name: the last one before position, and the one after it.
  int previous = kNone;
  int next = entry->second.first;
  while (next != kNone && next < position) {
    previous = next;
    next = link(next).next;
  }
  link(position).previous = previous;
  link(position).next = next;
  (previous != kNone ? link(previous).next : entry->second.first) = position;
  (next != kNone ? link(next).previous : entry->second.last) = position;
}

void RawDataNameIndex::remove(int position) {
  const Link removed = link(position);
  Ends& ends = removed.entry->second;
  (removed.previous != kNone ? link(removed.previous).next : ends.first) = removed.next;
  (removed.next != kNone ? link(removed.next).previous : ends.last) = removed.previous;
  if (ends.first == kNone) entries_.erase(entries_.find(removed.entry->first));
  links_.erase(links_.begin() + position);
  renumber(position + 1, -1);
}

void RawDataNameIndex::clear() noexcept {
  links_.clear();
  entries_.clear();
}

void RawDataNameIndex::reserve(int capacity) {
  if (capacity <= 0) return;
  links_.reserve(static_cast<std::size_t>(capacity));
  entries_.reserve(static_cast<std::size_t>(capacity));
}

int RawDataNameIndex::first(const CVynStringT<wchar_t>& name) const {
  const auto found = entries_.find(name);
  return found != entries_.end() ? found->second.first : kNone;
}

int RawDataNameIndex::last(const CVynStringT<wchar_t>& name) const {
  const auto found = entries_.find(name);
  return found != entries_.end() ? found->second.last : kNone;
}

void RawDataNameIndex::renumber(int from, int delta) noexcept {
  for (Link& each : links_) {
    shift(each.previous, from, delta);
    shift(each.next, from, delta);
  }
  for (auto& [name, ends] : entries_) {
    shift(ends.first, from, delta);
    shift(ends.last, from, delta);
  }
}

}  // namespace vyn::ie::detail
