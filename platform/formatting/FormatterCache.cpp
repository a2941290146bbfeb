#include "platform/formatting/FormatterCache.h"

#include <functional>

#include "platform/formatting/FormatterStatistics.h"

namespace ax::formatting {

std::size_t FormatterCache::KeyHash::operator()(const Key& key) const {
  const auto kindAndNumber =
      (static_cast<std::size_t>(key.kind) << 32) ^ static_cast<std::uint32_t>(key.number);
  return std::hash<std::string_view>{}(key.text) ^ (kindAndNumber * 0x9E3779B97F4A7C15u);
}

CachedFormatter* FormatterCache::find(const Key& key) {
  Entry*& recent = mostRecent_[static_cast<std::size_t>(key.kind)];
  if (recent != nullptr && recent->key == key) return recent->formatter.get();
  const auto place = index_.find(key);
  if (place == index_.end()) return nullptr;
  entries_.splice(entries_.begin(), entries_, place->second);
  recent = &*place->second;
  return recent->formatter.get();
}

CachedFormatter* FormatterCache::insert(const Key& key, std::unique_ptr<CachedFormatter> formatter) {
  if (!formatter) return nullptr;
  if (entries_.size() >= kCapacity) evictOldest();
  ++made_;
  Entry& entry = entries_.emplace_front(Entry{key, std::string(key.text), std::move(formatter)});
  entry.key.text = entry.text;
  index_.emplace(entry.key, entries_.begin());
  mostRecent_[static_cast<std::size_t>(key.kind)] = &entry;
  return entry.formatter.get();
}

void FormatterCache::evictOldest() {
  Entry& oldest = entries_.back();
  Entry*& recent = mostRecent_[static_cast<std::size_t>(oldest.key.kind)];
  if (recent == &oldest) recent = nullptr;
  index_.erase(oldest.key);
  entries_.pop_back();
}

void FormatterCache::clear() {
  mostRecent_.fill(nullptr);
  index_.clear();
  entries_.clear();
}

// Never destroyed: texts may still be formatted while static objects go.
FormatterCache& formatterCache() {
  static FormatterCache* const cache = new FormatterCache;
  return *cache;
}

std::uint64_t formattersMade() {
  return formatterCache().made();
}

std::size_t formattersHeld() {
  return formatterCache().size();
}

}  // namespace ax::formatting
