#include "platform/formatting/MessageTree.h"

#include <unicode/messagepattern.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <optional>
#include <utility>

#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

using Kind = MessagePiece::Kind;

constexpr std::array<std::pair<std::string_view, PluralForm>, 6> formNames = {{{"zero", PluralForm::zero},
                                                                               {"one", PluralForm::one},
                                                                               {"two", PluralForm::two},
                                                                               {"few", PluralForm::few},
                                                                               {"many", PluralForm::many},
                                                                               {"other", PluralForm::other}}};

struct Malformed {};

std::string trimmed(const std::string& text) {
  const std::size_t first = text.find_first_not_of(' ');
  return first == std::string::npos ? "" : text.substr(first, text.find_last_not_of(' ') - first + 1);
}

int argumentNumber(const std::string& text) {
  int number = -1;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  if (error != std::errc() || end != text.data() + text.size() || number < 0) throw Malformed();
  return number;
}

class Parser {
 public:
  explicit Parser(const icu::MessagePattern& pattern) : pattern_(pattern) {}

  // The message that starts at a part.
  Message message(int32_t start) const {
    Message pieces;
    int32_t textFrom = pattern_.getPart(start).getLimit();
    for (int32_t i = start + 1;; ++i) {
      addLiteral(pieces, textFrom, pattern_.getPart(i).getIndex());
      const UMessagePatternPartType type = pattern_.getPartType(i);
      if (type == UMSGPAT_PART_TYPE_MSG_LIMIT) return pieces;
      if (type == UMSGPAT_PART_TYPE_REPLACE_NUMBER) pieces.emplace_back().kind = Kind::countedNumber;
      if (type == UMSGPAT_PART_TYPE_ARG_START) {
        pieces.push_back(argument(i));
        i = pattern_.getLimitPartIndex(i);
      }
      textFrom = pattern_.getPart(i).getLimit();
    }
  }

 private:
  void addLiteral(Message& pieces, int32_t from, int32_t to) const {
    if (from == to) return;
    const icu::UnicodeString text = pattern_.getPatternString().tempSubStringBetween(from, to);
    const std::string literal = utf8From({text.getBuffer(), static_cast<std::size_t>(text.length())});
    if (!pieces.empty() && pieces.back().kind == Kind::literal) {
      pieces.back().text += literal;
    } else {
      pieces.emplace_back().text = literal;
    }
  }

  std::string textOf(int32_t part) const {
    std::string text;
    return pattern_.getSubstring(pattern_.getPart(part)).toUTF8String(text);
  }

  MessagePiece argument(int32_t start) const {
    if (pattern_.getPartType(start + 1) != UMSGPAT_PART_TYPE_ARG_NUMBER) throw Malformed();
    MessagePiece piece;
    piece.kind = Kind::argument;
    piece.argument = pattern_.getPart(start + 1).getValue();
    switch (pattern_.getPart(start).getArgType()) {
      case UMSGPAT_ARG_TYPE_NONE:
        break;
      case UMSGPAT_ARG_TYPE_SIMPLE:
        setManner(piece, start + 2);
        break;
      case UMSGPAT_ARG_TYPE_PLURAL:
        piece.kind = Kind::plural;
        piece.forms = forms(start);
        break;
      default:
        throw Malformed();
    }
    return piece;
  }

  // "number", "number, percent" or "unit, 1".
  void setManner(MessagePiece& piece, int32_t part) const {
    const std::string type = textOf(part);
    const bool hasStyle = pattern_.getPartType(part + 1) == UMSGPAT_PART_TYPE_ARG_STYLE;
    const std::string style = hasStyle ? trimmed(textOf(part + 1)) : "";
    if (type == "unit") {
      piece.kind = Kind::inUnit;
      piece.unit = argumentNumber(style);
    } else if (type == "number" && style == "percent") {
      piece.kind = Kind::percent;
    } else if (type != "number" || hasStyle) {
      throw Malformed();
    }
  }

  std::vector<MessageForm> forms(int32_t start) const {
    std::vector<MessageForm> forms;
    const int32_t limit = pattern_.getLimitPartIndex(start);
    for (int32_t i = start + 2; i < limit; ++i) {
      const std::string name = textOf(i++);
      const auto found = std::ranges::find(formNames, name, [](const auto& form) { return form.first; });
      const bool isForm = found != formNames.end() && pattern_.getPartType(i) == UMSGPAT_PART_TYPE_MSG_START;
      if (!isForm) throw Malformed();
      MessageForm form{found->second, message(i)};
      form.writesNumber = std::ranges::any_of(
          form.body, [](const MessagePiece& piece) { return piece.kind == Kind::countedNumber; });
      forms.push_back(std::move(form));
      i = pattern_.getLimitPartIndex(i);
    }
    return forms;
  }

  const icu::MessagePattern& pattern_;
};

}  // namespace

std::shared_ptr<const Message> parsedMessage(std::string_view pattern) {
  const std::u16string wide = utf16From(pattern);
  UErrorCode status = U_ZERO_ERROR;
  const icu::MessagePattern parts(icu::UnicodeString(wide.data(), static_cast<int32_t>(wide.size())), nullptr,
                                  status);
  if (U_FAILURE(status)) return nullptr;
  try {
    return std::make_shared<const Message>(Parser(parts).message(0));
  } catch (const Malformed&) {
    return nullptr;
  }
}

}  // namespace ax::formatting
