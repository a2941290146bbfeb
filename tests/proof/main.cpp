#include <charconv>
#include <cstdio>
#include <string_view>

#include "tests/proof/Proofs.h"

namespace {

using ax::proof::Selection;

bool readNumber(std::string_view text, std::size_t& number) {
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  return error == std::errc() && end == text.data() + text.size();
}

// "3/8" is a part, counted from 1; anything else is looked for in the names.
Selection selectionOf(std::string_view given) {
  Selection selection;
  const std::size_t slash = given.find('/');
  const bool isPart = slash != given.npos && readNumber(given.substr(0, slash), selection.part) &&
                      readNumber(given.substr(slash + 1), selection.of) && selection.part >= 1 &&
                      selection.part <= selection.of;
  if (!isPart) return {.words = std::string(given)};
  --selection.part;
  return selection;
}

}  // namespace

int main(int argc, char** argv) {
  const std::string_view proof = argc > 1 ? argv[1] : "";
  if (proof == "faults" && argc <= 3)
    return ax::proof::proveFaults(selectionOf(argc > 2 ? argv[2] : "")) ? 0 : 1;
  if (proof == "lifetimes" && argc == 2) return ax::proof::proveLifetimes() ? 0 : 1;
  std::fputs("axvelto-proof faults [PART/OF | WORDS]\naxvelto-proof lifetimes\n", stderr);
  return 2;
}
