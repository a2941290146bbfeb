#include "platform/formatting/Lists.h"

#include "platform/formatting/Region.h"

namespace ax::formatting {

std::string_view listSeparator() {
  static std::uint64_t generation = 0;
  static std::string_view separator;
  if (generation != regionGeneration()) {
    const std::string language = currentLanguage();
    separator = language == "ar" ? "، " : language == "ja" ? "、" : ", ";
    generation = regionGeneration();
  }
  return separator;
}

}  // namespace ax::formatting
