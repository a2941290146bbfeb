#pragma once

#include <array>
#include <atomic>
#include <utility>

#include "platform/runtime/Selector.h"

namespace ax {

// A few records by selector, each in the one place that its selector has: what was asked for first, since two
// that take turns in one place would cost more than one that stays. It stands before a whole table and is
// right only as long as that table holds the same record; any thread may use it.
template <class Record, std::size_t Size>
class FirstTable {
 public:
  // A record of the selector, or one of another.
  const Record& find(Selector selector) const {
    return *places_[selector.hash() % Size].load(std::memory_order_acquire);
  }

  // Puts a record that was found in the table behind. One that the table has lost in the meantime is taken
  // away again: a thread that changes the table clears it first, and this one afterwards.
  template <class Table>
  void remember(const Record* record, const Table& behind) {
    std::atomic<const Record*>& place = places_[record->selector.hash() % Size];
    const Record* expected = &none;
    if (!place.compare_exchange_strong(expected, record, std::memory_order_acq_rel)) return;
    if (behind.find(record->selector) != record) place.store(&none, std::memory_order_release);
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

  static constexpr Record none = {};
  std::array<std::atomic<const Record*>, Size> places_ = empty();
};

}  // namespace ax
