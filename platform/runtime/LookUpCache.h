#pragma once

#include <array>
#include <atomic>
#include <utility>

#include "platform/runtime/Selector.h"

namespace ax {

// A few records by selector, each in the one place that its selector has: what was asked for first, since two
// that take turns in one place would cost more than one that stays. It stands before a whole table and is
// right only as long as that table holds the same record. Any thread may find; who remembers or clears holds
// the lock under which the whole table changes.
template <class Record, std::size_t Size>
class LookUpCache {
 public:
  // A record of the selector, or one of another.
  const Record& find(Selector selector) const { return at(placeOf(selector)); }
  const Record& at(std::size_t place) const { return *places_[place].load(std::memory_order_acquire); }
  static std::size_t placeOf(Selector selector) { return selector.hash() % Size; }

  void remember(const Record& record) {
    std::atomic<const Record*>& place = places_[placeOf(record.selector)];
    if (place.load(std::memory_order_relaxed) == &none) place.store(&record, std::memory_order_release);
  }

  void clear() {
    for (auto& place : places_) place.store(&none, std::memory_order_release);
  }

 private:
  static std::array<std::atomic<const Record*>, Size> empty() {
    return []<std::size_t... I>(std::index_sequence<I...>) {
      return std::array<std::atomic<const Record*>, Size>{((void)I, &none)...};
    }
    (std::make_index_sequence<Size>());
  }

  // Of a name that nobody asks for, the nil selector included: messages that are not resolved have that one.
  static constexpr SelectorRecord nobody = {};
  static constexpr Record none = {.selector = Selector(&nobody)};
  std::array<std::atomic<const Record*>, Size> places_ = empty();
};

}  // namespace ax
