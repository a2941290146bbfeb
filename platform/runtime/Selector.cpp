#include "platform/runtime/Selector.h"

#include <array>
#include <atomic>
#include <cstring>
#include <deque>
#include <memory>
#include <mutex>
#include <string>
#include <tuple>
#include <vector>

#include "platform/runtime/Method.h"
#include "platform/runtime/PointerSlots.h"

namespace ax {

namespace {

std::uint64_t word(const char* bytes) {
  std::uint64_t value;
  std::memcpy(&value, bytes, sizeof value);
  return value;
}

std::uint64_t halfWord(const char* bytes) {
  std::uint32_t value;
  std::memcpy(&value, bytes, sizeof value);
  return value;
}

struct Ends {
  std::uint64_t head;
  std::uint64_t tail;
};

// All bytes of a text of at most 16, some of them perhaps twice.
Ends ends(const char* bytes, std::size_t size) {
  if (size >= 8) return {word(bytes), word(bytes + size - 8)};
  if (size >= 4) return {halfWord(bytes), halfWord(bytes + size - 4)};
  if (size == 0) return {0, 0};
  const auto byte = [&](std::size_t i) { return std::uint64_t(std::uint8_t(bytes[i])); };
  return {byte(0) | byte(size / 2) << 8, byte(size - 1)};
}

std::uint64_t folded(std::uint64_t a, std::uint64_t b) {
  __extension__ using Wide = unsigned __int128;
  const Wide product = Wide(a) * b;
  return std::uint64_t(product) ^ std::uint64_t(product >> 64);
}

bool isSameText(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) return false;
  if (a.size() > 32) return std::memcmp(a.data(), b.data(), a.size()) == 0;
  std::size_t done = 0;
  for (; done + 16 < a.size(); done += 8) {
    if (word(a.data() + done) != word(b.data() + done)) return false;
  }
  const Ends left = ends(a.data() + done, a.size() - done);
  const Ends right = ends(b.data() + done, b.size() - done);
  return left.head == right.head && left.tail == right.tail;
}

// All names of the process. Finding takes no lock: slots are single pointers, published when complete.
class NameTable {
 public:
  const SelectorRecord* find(std::string_view name, std::uint64_t hash) const {
    const Slots& slots = *slots_.load(std::memory_order_acquire);
    for (std::size_t i = hash & slots.mask;; i = (i + 1) & slots.mask) {
      const SelectorRecord* record = slots.at(i).load(std::memory_order_acquire);
      if (record == nullptr) return nullptr;
      if (record->textHash == hash && isSameText(record->name, name)) return record;
    }
  }

  const SelectorRecord* intern(std::string_view name, std::uint64_t hash) {
    const std::lock_guard lock(mutex_);
    if (const SelectorRecord* known = find(name, hash)) return known;
    if ((missing_.size() + 1) * 2 > generations_.back()->mask) grow();
    SelectorRecord& record = nextRecord();
    record.name = names_.emplace_back(name);
    record.textHash = hash;
    missing_.push_back({.selector = Selector(&record)});
    record.missing = &missing_.back();
    place(*generations_.back(), &record);
    return &record;
  }

 private:
  using Slots = PointerSlots<const SelectorRecord>;

  // Records that are made one after the other stand so, and take different places in small caches.
  using Block = std::array<SelectorRecord, 512>;

  SelectorRecord& nextRecord() {
    const std::size_t index = missing_.size() % std::tuple_size_v<Block>;
    if (index == 0) blocks_.push_back(std::make_unique<Block>());
    return (*blocks_.back())[index];
  }

  static void place(Slots& slots, const SelectorRecord* record) {
    std::size_t i = record->textHash & slots.mask;
    while (slots.at(i).load(std::memory_order_relaxed) != nullptr) i = (i + 1) & slots.mask;
    slots.at(i).store(record, std::memory_order_release);
  }

  void grow() {
    auto larger = Slots::make((generations_.back()->mask + 1) * 2);
    for (const Method& missing : missing_) place(*larger, missing.selector.record());
    slots_.store(larger.get(), std::memory_order_release);
    generations_.push_back(std::move(larger));
  }

  std::mutex mutex_;
  std::vector<std::unique_ptr<Block>> blocks_;
  std::deque<std::string> names_;
  std::deque<Method> missing_;
  std::vector<Slots::Owner> generations_ = initialGenerations();
  std::atomic<const Slots*> slots_ = generations_.back().get();

  static std::vector<Slots::Owner> initialGenerations() {
    std::vector<Slots::Owner> generations;
    generations.push_back(Slots::make(4096));
    return generations;
  }
};

NameTable& names() {
  static NameTable* const table = new NameTable;
  return *table;
}

}  // namespace

std::uint64_t hashText(std::string_view text) {
  constexpr std::uint64_t first = 0x9E3779B97F4A7C15u;
  constexpr std::uint64_t second = 0xD1B54A32D192ED03u;
  const char* bytes = text.data();
  const std::size_t size = text.size();
  std::uint64_t hash = size * first;
  std::size_t done = 0;
  for (; done + 16 < size; done += 16) {
    hash = folded(word(bytes + done) ^ first, word(bytes + done + 8) ^ hash);
  }
  if (size >= 16) {
    return folded(word(bytes + size - 16) ^ second, word(bytes + size - 8) ^ hash);
  }
  const auto [head, tail] = ends(bytes, size);
  return folded(head ^ second, tail ^ hash);
}

Selector Selector::intern(std::string_view name) {
  const std::uint64_t hash = hashText(name);
  const SelectorRecord* record = names().find(name, hash);
  return Selector(record != nullptr ? record : names().intern(name, hash));
}

Selector Selector::find(std::string_view name) {
  return Selector(names().find(name, hashText(name)));
}

Selector LiteralSelector::find() const {
  const Selector found = Selector::intern(name_);
  record_.store(found.record(), std::memory_order_release);
  return found;
}

}  // namespace ax
