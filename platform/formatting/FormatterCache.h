// Internal to this folder: formatters for the current region, kept by kind and template.
// Making one costs 20 to 100 microseconds, finding it again a few dozen nanoseconds.
// Main thread only.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <list>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>

namespace ax::formatting {

enum class FormatterKind : std::uint8_t {
  decimal,
  integer,
  plainInteger,
  percent,
  pluralRules,
  numberParser,
  patternGenerator,
  date,
  dateParser,
  dateStyle,
  dateInterval,
  message,
  count
};

// Base of what the cache holds; each kind has one derived type.
class CachedFormatter {
 public:
  CachedFormatter() = default;
  CachedFormatter(const CachedFormatter&) = delete;
  CachedFormatter& operator=(const CachedFormatter&) = delete;
  virtual ~CachedFormatter() = default;
};

class FormatterCache {
 public:
  static constexpr std::size_t kCapacity = 256;

  // The formatter of `kind` for (number, text), made by `make()` when it is not held; null when
  // making it fails, which is not remembered. `Formatter` must be the one type used with `kind`.
  // The pointer holds until the next call of get() or clear().
  template <class Formatter, class Make>
  Formatter* get(FormatterKind kind, std::int32_t number, std::string_view text, Make make) {
    const Key key{kind, number, text};
    CachedFormatter* found = find(key);
    if (found == nullptr) found = insert(key, make());
    return static_cast<Formatter*>(found);
  }

  void clear();
  std::size_t size() const { return entries_.size(); }
  std::uint64_t made() const { return made_; }

 private:
  struct Key {
    FormatterKind kind;
    std::int32_t number;
    std::string_view text;
    bool operator==(const Key&) const = default;
  };
  struct KeyHash {
    std::size_t operator()(const Key& key) const;
  };
  struct Entry {
    Key key;  // its text is the `text` below
    std::string text;
    std::unique_ptr<CachedFormatter> formatter;
  };
  using Entries = std::list<Entry>;  // most recently found by look-up first

  CachedFormatter* find(const Key& key);
  CachedFormatter* insert(const Key& key, std::unique_ptr<CachedFormatter> formatter);
  void evictOldest();

  Entries entries_;
  std::unordered_map<Key, Entries::iterator, KeyHash> index_;
  std::array<Entry*, static_cast<std::size_t>(FormatterKind::count)> mostRecent_{};
  std::uint64_t made_ = 0;
};

FormatterCache& formatterCache();

}  // namespace ax::formatting
