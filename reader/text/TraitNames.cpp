#include "reader/text/TraitNames.h"

#include <array>

namespace ax::reader {

namespace {

constexpr std::array traitsByBit = {"button", "header",     "selected",   "link",
                                    "image",  "adjustable", "staticText", "notEnabled"};

}  // namespace

std::vector<std::string> traitNames(Traits traits) {
  std::vector<std::string> names;
  for (unsigned bit = 0; bit < 64; ++bit) {
    if ((traits >> bit & 1) == 0) continue;
    names.push_back(bit < traitsByBit.size() ? traitsByBit[bit] : "bit " + std::to_string(bit));
  }
  return names;
}

}  // namespace ax::reader
