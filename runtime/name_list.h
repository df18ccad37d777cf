// NameList: the one sorted list of the runtime, instantiated for instances and variables.
//
// A circular list doubly linked through an end marker that the list owns. Invariants:
// - the elements run from end().next to end().prev in strictly ascending name order
//   (unsigned byte order of the stored, lower-cased names), no two with the same name;
// - the end marker is never an element: its name is "", and in an empty list its next and
//   prev point to itself; it stands for "none" wherever the runtime holds a record;
// - last() is end().prev, the last element, or the end marker when the list is empty;
// - lastHit is null or an element: the one most recently found or linked in;
// - the list owns its elements; a record handed to it becomes its own and lives until it
//   is removed, or the list is cleared or destroyed. Every record pointer the list hands
//   out stays valid exactly that long.
// Records must offer `name` (lower-cased), `next`, `prev` and `assign(const Record &)`.
#ifndef MORVEX_RUNTIME_NAME_LIST_H
#define MORVEX_RUNTIME_NAME_LIST_H

#include <cstdint>
#include <memory>
#include <string>

namespace morvex::runtime {

// strcmp order of `stored` against the lower-cased `name` (a missing name counts as ""),
// without making the lower-cased copy.
int compareLowered(const std::string &stored, const char *name);

template <class Record>
class NameList {
public:
  NameList() { end_.next = end_.prev = &end_; }
  ~NameList() { clear(); }
  NameList(const NameList &) = delete;
  NameList &operator=(const NameList &) = delete;

  Record *first() { return end_.next; }
  Record *end() { return &end_; }
  Record *last() { return end_.prev; }
  std::int32_t size() const { return count_; }
  Record *lastHit() const { return lastHit_; }

  // The element named `name` in any letter case, or end(). Sets lastHit when found.
  Record *find(const char *name) {
    if (lastHit_ && compareLowered(lastHit_->name, name) == 0) {
      return lastHit_;
    }
    Record *at = first();
    while (at != &end_ && compareLowered(at->name, name) < 0) {
      at = at->next;
    }
    if (at != &end_ && compareLowered(at->name, name) == 0) {
      lastHit_ = at;
      return at;
    }
    return &end_;
  }

  // Links `record` in at its sorted place, or, when an element has its name already, gives
  // that element the record's values and destroys the record. Returns the element that
  // now holds the name.
  Record *insertOrReplace(std::unique_ptr<Record> record) {
    Record *at = first();
    while (at != &end_ && at->name <= record->name) {
      if (at->name == record->name) {
        at->assign(*record);
        return at;
      }
      at = at->next;
    }
    return insertBefore(at, std::move(record));
  }

  // Links `record` in before `position` (an element or end()); null when either is missing.
  Record *insertBefore(Record *position, std::unique_ptr<Record> record) {
    if (!position || !record) {
      return nullptr;
    }
    Record *linked = record.release();
    linked->prev = position->prev;
    linked->next = position;
    position->prev->next = linked;
    position->prev = linked;
    lastHit_ = linked;
    ++count_;
    return linked;
  }

  // Unlinks `element` and hands it back to the caller; null for end() or null.
  std::unique_ptr<Record> unlink(Record *element) {
    if (!element || element == &end_) {
      return nullptr;
    }
    if (lastHit_ == element) {
      lastHit_ = nullptr;
    }
    element->prev->next = element->next;
    element->next->prev = element->prev;
    element->next = element->prev = nullptr;
    --count_;
    return std::unique_ptr<Record>(element);
  }

  // Unlinks and destroys `element`; returns the record that followed it, null for end().
  Record *remove(Record *element) {
    if (!element || element == &end_) {
      return nullptr;
    }
    Record *following = element->next;
    unlink(element);
    return following;
  }

  // Removes every element, from the last towards the first.
  void clear() {
    while (count_ > 0) {
      remove(last());
    }
  }

private:
  Record end_;
  std::int32_t count_ = 0;
  Record *lastHit_ = nullptr;
};

} // namespace morvex::runtime

#endif
