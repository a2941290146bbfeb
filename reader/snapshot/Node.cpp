#include "reader/snapshot/Node.h"

namespace ax::reader {

bool Actions::has(Action action) const {
  switch (action) {
    case Action::activate:
      return activate;
    case Action::increment:
      return increment;
    case Action::decrement:
      return decrement;
  }
  return false;
}

std::string_view roleName(Role role) {
  static constexpr std::string_view names[] = {"container", "chart",  "element",    "staticText", "image",
                                               "link",      "button", "adjustable", "header"};
  return names[static_cast<std::size_t>(role)];
}

std::string_view actionName(Action action) {
  static constexpr std::string_view names[] = {"activate", "increment", "decrement"};
  return names[static_cast<std::size_t>(action)];
}

}  // namespace ax::reader
