#include "platform/formatting/StringTable.h"

#include <dlfcn.h>
#include <link.h>
#include <unicode/ures.h>

#include <algorithm>
#include <cctype>
#include <filesystem>
#include <memory>
#include <system_error>
#include <utility>

#include "platform/formatting/Region.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

constexpr const char* kRoot = "root";

struct CloseBundle {
  void operator()(UResourceBundle* bundle) const { ures_close(bundle); }
};

// Only letters, digits and underscores can name a file of a table.
bool isFileName(const std::string& name) {
  return !name.empty() && std::ranges::all_of(name, [](unsigned char c) {
    return c == '_' || (c < 0x80 && std::isalnum(c) != 0);
  });
}

std::vector<std::string> sortedKeys(const auto& texts) {
  std::vector<std::string> keys;
  keys.reserve(texts.size());
  for (const auto& [key, text] : texts) keys.push_back(key);
  std::ranges::sort(keys);
  return keys;
}

}  // namespace

std::vector<std::string> tableLanguages(const std::string& folder) {
  std::vector<std::string> languages;
  std::error_code none;
  for (const auto& file : std::filesystem::directory_iterator(folder, none)) {
    if (file.path().extension() == ".res") languages.push_back(file.path().stem().string());
  }
  std::ranges::sort(languages);
  return languages;
}

StringTable::StringTable(std::string folder) : folder_(std::move(folder)) {}

const std::string* StringTable::find(std::string_view key) const {
  return findIn(current_.get([this] { return chainOf(currentRegion().locale); }), key);
}

const std::string* StringTable::find(std::string_view key, std::string_view language) const {
  return findIn(chainOf(language), key);
}

std::vector<std::string> StringTable::keys() const {
  return sortedKeys(textsOf(kRoot));
}

std::vector<std::string> StringTable::keys(std::string_view language) const {
  return sortedKeys(textsOf(std::string(language)));
}

const StringTable::Texts& StringTable::textsOf(const std::string& file) const {
  const auto [place, isNew] = files_.try_emplace(file);
  Texts& texts = place->second;
  if (!isNew || !isFileName(file)) return texts;
  UErrorCode status = U_ZERO_ERROR;
  const std::unique_ptr<UResourceBundle, CloseBundle> bundle(
      ures_openDirect(folder_.c_str(), file.c_str(), &status));
  while (U_SUCCESS(status) && ures_hasNext(bundle.get())) {
    const char* key = nullptr;
    int32_t length = 0;
    const char16_t* text = ures_getNextString(bundle.get(), &length, &key, &status);
    if (text == nullptr || key == nullptr) continue;  // a table within
    texts.emplace(key, utf8From({text, static_cast<std::size_t>(length)}));
  }
  return texts;
}

StringTable::Chain StringTable::chainOf(std::string_view locale) const {
  Chain chain;
  std::string name(locale.substr(0, locale.find('@')));
  std::ranges::replace(name, '-', '_');
  while (!name.empty()) {
    chain.push_back(&textsOf(name));
    const std::size_t cut = name.rfind('_');
    name.resize(cut == std::string::npos ? 0 : cut);
  }
  chain.push_back(&textsOf(kRoot));
  return chain;
}

const std::string* StringTable::findIn(const Chain& chain, std::string_view key) {
  for (const Texts* texts : chain) {
    if (const auto place = texts->find(key); place != texts->end()) return &place->second;
  }
  return nullptr;
}

std::string resourceFolderBeside(const void* addressInModule, std::string_view relative) {
  namespace fs = std::filesystem;
  Dl_info info;
  link_map* module = nullptr;
  if (dladdr1(addressInModule, &info, reinterpret_cast<void**>(&module), RTLD_DL_LINKMAP) == 0) return {};
  const bool isProgram = module == nullptr || module->l_name == nullptr || *module->l_name == '\0';
  std::error_code error;
  const fs::path file = fs::canonical(isProgram ? "/proc/self/exe" : module->l_name, error);
  if (error) return {};
  return (file.parent_path() / relative).lexically_normal().string();
}

}  // namespace ax::formatting
