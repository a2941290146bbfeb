#pragma once

#include <exception>
#include <optional>
#include <string>

#include "reader/text/Fault.h"

namespace ax::reader {

// Runs a block and answers why it raised; nothing when it did not. Faults of the scene pass through.
template <class Block>
std::optional<std::string> raisedBy(Block&& block) {
  try {
    block();
    return std::nullopt;
  } catch (const Fault&) {
    throw;
  } catch (const std::exception& raised) {
    return raised.what();
  } catch (...) {
    return "something without a reason";
  }
}

}  // namespace ax::reader
