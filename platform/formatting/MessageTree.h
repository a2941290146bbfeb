// Internal to this folder: a message pattern taken apart.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "platform/formatting/Numbers.h"

namespace ax::formatting {

struct MessageForm;

struct MessagePiece {
  enum class Kind : std::uint8_t { literal, argument, percent, inUnit, plural, countedNumber };
  Kind kind = Kind::literal;
  std::string text;                // of a literal
  int argument = -1;               // of all but literals and the number that a plural counts
  int unit = -1;                   // the argument that names the unit
  std::vector<MessageForm> forms;  // of a plural; `other` is always there
};

using Message = std::vector<MessagePiece>;

struct MessageForm {
  PluralForm form = PluralForm::other;
  Message body = {};
  bool writesNumber = false;  // "two days" may do without
};

// Null for a pattern that is malformed or asks for what no argument can do.
std::shared_ptr<const Message> parsedMessage(std::string_view pattern);

}  // namespace ax::formatting
