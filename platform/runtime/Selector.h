#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace ax {

class Class;
struct Method;

// The one record of an interned name. Records stand in an arena, 64 bytes apart, and live as long as the
// process; their addresses serve as hashes.
struct alignas(64) SelectorRecord {
  std::string_view name = {};
  std::uint64_t textHash = 0;
  const Method* missing = nullptr;  // what a class answers that lacks this message
  // The class that is found by this name: null until there is one, and once it is hidden.
  mutable std::atomic<Class*> namedClass = nullptr;
};
static_assert(sizeof(SelectorRecord) == 64, "Selector::hash() counts the records");

// An interned name: of a method ("layoutSubviews"), a member ("_titleLabel"), a stored value or a class. Two
// selectors are equal exactly when their names are; comparing them compares pointers. Interning and finding
// may be done on any thread.
class Selector {
 public:
  Selector() = default;
  constexpr explicit Selector(const SelectorRecord* record) : record_(record) {}
  static Selector intern(std::string_view name);
  // The selector of a name that somebody has interned before, or a nil one; makes nothing.
  static Selector find(std::string_view name);

  std::string_view name() const { return record_ == nullptr ? std::string_view() : record_->name; }
  explicit operator bool() const { return record_ != nullptr; }
  bool operator==(const Selector&) const = default;

  std::size_t hash() const { return reinterpret_cast<std::uintptr_t>(record_) >> 6; }
  const SelectorRecord* record() const { return record_; }

 private:
  const SelectorRecord* record_ = nullptr;
};

// A selector in the role of a member's or a stored value's name.
using Key = Selector;

std::uint64_t hashText(std::string_view text);

inline Selector selectorFromString(std::string_view name) {
  return Selector::intern(name);
}

template <std::size_t N>
struct LiteralText {
  char characters[N];
  consteval LiteralText(const char (&text)[N]) {
    for (std::size_t i = 0; i < N; ++i) characters[i] = text[i];
  }
  constexpr std::string_view view() const { return {characters, N - 1}; }
};

// The selector of a name that is written in the code: constant data until its first use, on whichever thread.
class LiteralSelector {
 public:
  constexpr explicit LiteralSelector(std::string_view name) : name_(name) {}

  Selector get() const {
    const SelectorRecord* record = record_.load(std::memory_order_acquire);
    return record != nullptr ? Selector(record) : find();
  }

 private:
  Selector find() const;

  std::string_view name_;
  mutable std::atomic<const SelectorRecord*> record_ = nullptr;
};

template <LiteralText Text>
inline constinit const LiteralSelector literalSelector{Text.view()};

inline namespace literals {

// "_titleLabel"_key: interned at the first use of that literal, a load from then on.
template <LiteralText Text>
Selector operator""_key() {
  return literalSelector<Text>.get();
}

}  // namespace literals

}  // namespace ax
