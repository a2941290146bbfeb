// Localized texts: a folder of compiled resource bundles, one per language, such as "de.res".
#pragma once

#include <map>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "platform/formatting/PerRegion.h"

namespace ax::formatting {

// Texts are looked up in the file of the locale ("pt_BR"), then of its language ("pt"), then in
// "root", the English one. Files are read at first need; one that is missing counts as empty.
// Main thread only.
class StringTable {
 public:
  explicit StringTable(std::string folder);
  StringTable(const StringTable&) = delete;
  StringTable& operator=(const StringTable&) = delete;

  // The text in the current region's language; null for a key that the table lacks. The text lives
  // as long as the table, and is the same one for the same key and language.
  const std::string* find(std::string_view key) const;

  // The same in a named language or locale.
  const std::string* find(std::string_view key, std::string_view language) const;

  // Every key of "root", in order.
  std::vector<std::string> keys() const;

  // The keys that this one language's own file holds, in order, without fallback.
  std::vector<std::string> keys(std::string_view language) const;

 private:
  struct KeyHash {
    using is_transparent = void;
    std::size_t operator()(std::string_view key) const { return std::hash<std::string_view>{}(key); }
  };
  using Texts = std::unordered_map<std::string, std::string, KeyHash, std::equal_to<>>;
  using Chain = std::vector<const Texts*>;  // the most particular first

  const Texts& textsOf(const std::string& file) const;
  Chain chainOf(std::string_view locale) const;
  static const std::string* findIn(const Chain& chain, std::string_view key);

  std::string folder_;
  mutable std::map<std::string, Texts> files_;
  mutable PerRegion<Chain> current_;
};

// The languages that a folder has tables of, "root" included, in order.
std::vector<std::string> tableLanguages(const std::string& folder);

// The folder at `relative` ("../share/x") from the one that holds the program or shared library in
// which `addressInModule` lies; "" when the address is in none.
std::string resourceFolderBeside(const void* addressInModule, std::string_view relative);

}  // namespace ax::formatting
