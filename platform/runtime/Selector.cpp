#include "platform/runtime/Selector.h"

#include <atomic>
#include <cstring>
#include <deque>
#include <memory>
#include <mutex>
#include <string>
#include <vector>

#include "platform/runtime/Method.h"

namespace ax {

namespace {

// All names of the process. Finding takes no lock: slots are single pointers, published when complete.
class NameTable {
 public:
  const SelectorRecord* find(std::string_view name, std::uint64_t hash) const {
    const Slots& slots = *slots_.load(std::memory_order_acquire);
    for (std::size_t i = hash & slots.mask;; i = (i + 1) & slots.mask) {
      const SelectorRecord* record = slots.records[i].load(std::memory_order_acquire);
      if (record == nullptr) return nullptr;
      if (record->textHash == hash && record->name == name) return record;
    }
  }

  const SelectorRecord* intern(std::string_view name, std::uint64_t hash) {
    const std::lock_guard lock(mutex_);
    if (const SelectorRecord* known = find(name, hash)) return known;
    if ((arena_.size() + 1) * 2 > generations_.back()->mask) grow();
    SelectorRecord& record = arena_.emplace_back();
    record.name = names_.emplace_back(name);
    record.textHash = hash;
    missing_.push_back({.selector = Selector(&record)});
    record.missing = &missing_.back();
    place(*generations_.back(), &record);
    return &record;
  }

 private:
  struct Slots {
    explicit Slots(std::size_t size)
        : mask(size - 1), records(std::make_unique<std::atomic<const SelectorRecord*>[]>(size)) {}
    std::size_t mask;
    std::unique_ptr<std::atomic<const SelectorRecord*>[]> records;
  };

  static void place(Slots& slots, const SelectorRecord* record) {
    std::size_t i = record->textHash & slots.mask;
    while (slots.records[i].load(std::memory_order_relaxed) != nullptr) i = (i + 1) & slots.mask;
    slots.records[i].store(record, std::memory_order_release);
  }

  void grow() {
    auto larger = std::make_unique<Slots>((generations_.back()->mask + 1) * 2);
    for (const SelectorRecord& record : arena_) place(*larger, &record);
    slots_.store(larger.get(), std::memory_order_release);
    generations_.push_back(std::move(larger));
  }

  std::mutex mutex_;
  std::deque<SelectorRecord> arena_;
  std::deque<std::string> names_;
  std::deque<Method> missing_;
  std::vector<std::unique_ptr<Slots>> generations_ = initialGenerations();
  std::atomic<const Slots*> slots_ = generations_.back().get();

  static std::vector<std::unique_ptr<Slots>> initialGenerations() {
    std::vector<std::unique_ptr<Slots>> generations;
    generations.push_back(std::make_unique<Slots>(4096));
    return generations;
  }
};

NameTable& names() {
  static NameTable* const table = new NameTable;
  return *table;
}

}  // namespace

std::uint64_t hashText(std::string_view text) {
  constexpr std::uint64_t multiplier = 0x9E3779B97F4A7C15u;
  std::uint64_t hash = text.size() * multiplier;
  const auto mix = [&](std::uint64_t word) {
    hash = (hash ^ word) * multiplier;
    hash ^= hash >> 32;
  };
  const char* bytes = text.data();
  std::size_t left = text.size();
  for (; left >= 8; bytes += 8, left -= 8) {
    std::uint64_t word;
    std::memcpy(&word, bytes, 8);
    mix(word);
  }
  std::uint64_t tail = 0;
  for (std::size_t i = 0; i < left; ++i) tail |= std::uint64_t(std::uint8_t(bytes[i])) << (8 * i);
  mix(tail);
  return hash;
}

Selector Selector::intern(std::string_view name) {
  const std::uint64_t hash = hashText(name);
  const SelectorRecord* record = names().find(name, hash);
  return Selector(record != nullptr ? record : names().intern(name, hash));
}

Selector Selector::find(std::string_view name) {
  return Selector(names().find(name, hashText(name)));
}

}  // namespace ax
