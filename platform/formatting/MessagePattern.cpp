#include "platform/formatting/MessagePattern.h"

#include <algorithm>
#include <vector>

#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/MessageTree.h"
#include "platform/formatting/PlatformWords.h"

namespace ax::formatting {
namespace {

struct CompiledMessage final : CachedFormatter {
  std::shared_ptr<const Message> message;
};

std::shared_ptr<const Message> compiled(std::string_view pattern) {
  const CompiledMessage* found = formatterCache().get<CompiledMessage>(
      FormatterKind::message, 0, pattern, [&]() -> std::unique_ptr<CompiledMessage> {
        auto made = std::make_unique<CompiledMessage>();
        made->message = parsedMessage(pattern);
        return made->message ? std::move(made) : nullptr;
      });
  return found == nullptr ? nullptr : found->message;
}

// A text has no number to agree with; it is not alone, lest a plural took it for one.
NumberText asNumber(const MessageArgument& argument) {
  struct Visitor {
    NumberText operator()(const std::string& text) const { return {text, nullptr, false}; }
    NumberText operator()(std::int64_t value) const { return integerNumber(value); }
    NumberText operator()(double value) const { return decimalNumber(value, 3); }
    NumberText operator()(const NumberText& number) const { return number; }
    NumberText operator()(const CountedNoun& noun) const { return {noun.name, nullptr, false}; }
  };
  return std::visit(Visitor(), argument);
}

bool isText(const NumberText& number) {
  return !number.operands && !number.isNoValue && !number.text.empty();
}

const MessageForm& formOf(const std::vector<MessageForm>& forms, PluralForm wanted) {
  const auto found = std::ranges::find(forms, wanted, &MessageForm::form);
  return found != forms.end() ? *found : *std::ranges::find(forms, PluralForm::other, &MessageForm::form);
}

class Filling {
 public:
  explicit Filling(std::span<const MessageArgument> arguments) : arguments_(arguments) {}

  void add(const Message& message, const NumberText* counted = nullptr) {
    for (const MessagePiece& piece : message) add(piece, counted);
  }

  NumberText result() && {
    if (noValue_.isNoValue && !hasText_) return std::move(noValue_);
    return std::move(filled_);
  }

 private:
  using Kind = MessagePiece::Kind;

  void add(const MessagePiece& piece, const NumberText* counted) {
    if (piece.kind == Kind::literal) return add(piece.text);
    if (piece.kind == Kind::countedNumber) return counted != nullptr ? add(*counted) : add("#");
    for (const int needed : {piece.argument, piece.unit}) {
      if (needed >= std::ssize(arguments_))
        return add(std::string("{").append(std::to_string(needed)).append("}"));
    }
    const MessageArgument& argument = arguments_[piece.argument];
    if (piece.kind == Kind::argument) return add(asNumber(argument));
    if (piece.kind == Kind::percent) return addPercent(argument);
    if (piece.kind == Kind::plural) return addAgreeing(piece.forms, argument);
    addInUnit(argument, arguments_[piece.unit]);
  }

  void add(std::string_view text) {
    if (text.empty()) return;
    filled_.text += text;
    filled_.operands = nullptr;
    filled_.isAlone = false;
  }

  void add(const NumberText& number) {
    if (number.text.empty()) return;
    note(number);
    filled_.isAlone = filled_.text.empty() && number.isAlone;
    filled_.text += number.text;
    filled_.operands = number.operands;
  }

  void note(const NumberText& number) {
    hasText_ = hasText_ || isText(number);
    if (number.isNoValue) noValue_ = number;
  }

  void addPercent(const MessageArgument& argument) {
    const auto* whole = std::get_if<std::int64_t>(&argument);
    const auto* fraction = std::get_if<double>(&argument);
    if (whole != nullptr) return add(percentNumber(static_cast<double>(*whole)));
    add(fraction != nullptr ? percentNumber(*fraction) : asNumber(argument));
  }

  void addAgreeing(const std::vector<MessageForm>& forms, const MessageArgument& argument) {
    const NumberText number = asNumber(argument);
    if (number.text.empty() || number.isNoValue) return add(number);
    const MessageForm& form = formOf(forms, pluralForm(number));
    if (form.writesNumber) return add(form.body, &number);
    // What comes before the number, "2 of " or a minus, must not be lost with it.
    if (!number.isAlone) return add(formOf(forms, PluralForm::other).body, &number);
    if (!isNegative(number)) return add(form.body, &number);
    Filling positive(arguments_);
    positive.add(form.body, &number);
    add(formatMessage(platformWord("number.negative"), {std::move(positive).result().text}));
  }

  void addInUnit(const MessageArgument& argument, const MessageArgument& unit) {
    const CountedNoun* noun = std::get_if<CountedNoun>(&unit);
    if (noun != nullptr && !noun->pattern.empty()) return add(filledMessage(noun->pattern, {&argument, 1}));
    const NumberText number = asNumber(argument);
    const std::string name = asNumber(unit).text;
    if (name.empty() || number.text.empty() || number.isNoValue) return add(number);
    note(number);
    add(formatMessage(platformWord("number.unit"), {number.text, name}));
  }

  std::span<const MessageArgument> arguments_;
  NumberText filled_;
  NumberText noValue_;
  bool hasText_ = false;
};

}  // namespace

NumberText filledMessage(std::string_view pattern, std::span<const MessageArgument> arguments) {
  const std::shared_ptr<const Message> message = compiled(pattern);
  if (!message) return {};
  Filling filling(arguments);
  filling.add(*message);
  return std::move(filling).result();
}

std::string formatMessage(std::string_view pattern, std::span<const MessageArgument> arguments) {
  return filledMessage(pattern, arguments).text;
}

std::string formatMessage(std::string_view pattern, std::initializer_list<MessageArgument> arguments) {
  return formatMessage(pattern, std::span<const MessageArgument>(arguments.begin(), arguments.size()));
}

}  // namespace ax::formatting
