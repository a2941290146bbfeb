#include "platform/formatting/MessagePattern.h"

#include <unicode/msgfmt.h>

#include <memory>
#include <vector>

#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/Numbers.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

// A literal piece, followed by an argument unless that is -1.
struct Piece {
  std::string literal;
  int argument = -1;
};

// A pattern with nothing but places such as {0} is filled in directly; `format` serves all others.
struct CompiledMessage final : CachedFormatter {
  std::vector<Piece> pieces;
  std::unique_ptr<icu::MessageFormat> format;
};

// The number of a place whose opening brace stands before `rest`, as "0}..."; -1 when it is more.
int plainPlace(std::string_view rest) {
  if (rest.size() < 2 || rest[1] != '}' || rest[0] < '0' || rest[0] > '9') return -1;
  return rest[0] - '0';
}

bool splitPlain(std::string_view pattern, std::vector<Piece>& pieces) {
  if (pattern.find('\'') != std::string_view::npos) return false;
  while (!pattern.empty()) {
    const std::size_t brace = pattern.find_first_of("{}");
    pieces.push_back({std::string(pattern.substr(0, brace)), -1});
    if (brace == std::string_view::npos) return true;
    if (pattern[brace] == '}') return false;
    const int place = plainPlace(pattern.substr(brace + 1));
    if (place < 0) return false;
    pieces.back().argument = place;
    pattern.remove_prefix(brace + 3);
  }
  return true;
}

std::unique_ptr<CompiledMessage> compile(std::string_view pattern) {
  auto message = std::make_unique<CompiledMessage>();
  if (splitPlain(pattern, message->pieces)) return message;
  const std::u16string wide = utf16From(pattern);
  const icu::UnicodeString text(wide.data(), static_cast<int32_t>(wide.size()));
  UErrorCode status = U_ZERO_ERROR;
  UParseError where;
  message->format =
      std::make_unique<icu::MessageFormat>(text, icu::Locale(gregorianLocaleName().c_str()), where, status);
  if (U_FAILURE(status) || message->format->usesNamedArguments()) return nullptr;
  return message;
}

void append(std::string& result, const MessageArgument& argument) {
  if (const auto* text = std::get_if<std::string>(&argument)) {
    result += *text;
  } else if (const auto* whole = std::get_if<std::int64_t>(&argument)) {
    result += integerString(*whole);
  } else {
    result += decimalString(std::get<double>(argument), 3);
  }
}

std::string filled(const std::vector<Piece>& pieces, std::span<const MessageArgument> arguments) {
  std::string result;
  for (const Piece& piece : pieces) {
    result += piece.literal;
    if (piece.argument < 0) continue;
    if (static_cast<std::size_t>(piece.argument) < arguments.size()) {
      append(result, arguments[piece.argument]);
    } else {
      result += {'{', static_cast<char>('0' + piece.argument), '}'};
    }
  }
  return result;
}

icu::Formattable formattable(const MessageArgument& argument) {
  if (const auto* text = std::get_if<std::string>(&argument)) {
    const std::u16string wide = utf16From(*text);
    return icu::UnicodeString(wide.data(), static_cast<int32_t>(wide.size()));
  }
  if (const auto* whole = std::get_if<std::int64_t>(&argument)) return icu::Formattable(int64_t{*whole});
  return icu::Formattable(std::get<double>(argument));
}

std::string formatted(const icu::MessageFormat& format, std::span<const MessageArgument> arguments) {
  std::vector<icu::Formattable> values;
  values.reserve(arguments.size());
  for (const MessageArgument& argument : arguments) values.push_back(formattable(argument));
  icu::UnicodeString text;
  icu::FieldPosition ignored(icu::FieldPosition::DONT_CARE);
  UErrorCode status = U_ZERO_ERROR;
  format.format(values.data(), static_cast<int32_t>(values.size()), text, ignored, status);
  if (U_FAILURE(status)) return {};
  return utf8From({text.getBuffer(), static_cast<std::size_t>(text.length())});
}

}  // namespace

std::string formatMessage(std::string_view pattern, std::span<const MessageArgument> arguments) {
  const CompiledMessage* message = formatterCache().get<CompiledMessage>(FormatterKind::message, 0, pattern,
                                                                         [&] { return compile(pattern); });
  if (message == nullptr) return {};
  return message->format ? formatted(*message->format, arguments) : filled(message->pieces, arguments);
}

std::string formatMessage(std::string_view pattern, std::initializer_list<MessageArgument> arguments) {
  return formatMessage(pattern, std::span<const MessageArgument>(arguments.begin(), arguments.size()));
}

}  // namespace ax::formatting
