#pragma once

#include <cstddef>
#include <optional>

#include "platform/runtime/Message.h"
#include "reader/text/AttributedText.h"

namespace ax::reader {

// Asks live objects by message, so that overrides answer. What the host raises while it is asked counts as
// nil, NO or 0. Main thread only.
class HostQuestions {
 public:
  template <class R, class... A>
  R ask(const Message<R(A...)>& message, Receiver receiver, std::type_identity_t<A>... arguments) {
    try {
      return message(receiver, std::move(arguments)...);
    } catch (...) {
      ++raised_;
      return R();
    }
  }

  // Nil is no text; an empty text is one.
  template <class... A>
  std::optional<AttributedText> askText(const Message<Ref<String>(A...)>& message, Receiver receiver,
                                        std::type_identity_t<A>... arguments) {
    const Ref<String> text = ask(message, receiver, std::move(arguments)...);
    return text ? std::optional(attributedText(*text)) : std::nullopt;
  }

  // Any other work that runs the host's code; false when it raised.
  template <class Work>
  bool attempt(Work&& work) {
    try {
      std::forward<Work>(work)();
      return true;
    } catch (...) {
      ++raised_;
      return false;
    }
  }

  std::size_t raised() const { return raised_; }  // so far

 private:
  std::size_t raised_ = 0;
};

}  // namespace ax::reader
