#include "platform/formatting/Lists.h"

#include <vector>

#include "platform/formatting/MessagePattern.h"
#include "platform/formatting/PlatformWords.h"
#include "platform/formatting/Region.h"

namespace ax::formatting {

std::string_view listSeparator() {
  static std::uint64_t generation = 0;
  static std::string& separator = *new std::string;
  if (generation != regionGeneration()) {
    separator = formatMessage(platformWord("list.pair"), std::vector<MessageArgument>(2, std::string()));
    generation = regionGeneration();
  }
  return separator;
}

}  // namespace ax::formatting
