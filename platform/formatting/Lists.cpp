#include "platform/formatting/Lists.h"

#include <vector>

#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/MessagePattern.h"
#include "platform/formatting/PerRegion.h"
#include "platform/formatting/PlatformWords.h"

namespace ax::formatting {

std::string_view listSeparator() {
  static NeverDestroyed<PerRegion<std::string>> separator;
  return separator->get([] {
    return formatMessage(platformWord("list.pair"), std::vector<MessageArgument>(2, std::string()));
  });
}

}  // namespace ax::formatting
