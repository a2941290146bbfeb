#pragma once

#include <cstddef>

#include "platform/runtime/SafeMessage.h"

// How far a host's objects are followed into one another. A host may answer with the object that it was asked
// for, or make a new one at each question, and then there would be no end.
namespace ax {

inline constexpr std::size_t deepestLevel = 256;
// Of one walk, or of one question and all that it takes. Two new objects at each level would be met too often
// to end.
inline constexpr std::size_t mostObjects = 100'000;

// Counts something that is left out because it lies too deep, or behind too many others; false. Any thread.
bool leaveOutTooDeep();
// Whether a level, counted from 0, is still followed; one that is not is counted.
inline bool isWithinDepth(std::size_t level) {
  return level < deepestLevel || leaveOutTooDeep();
}
// The same for an object that comes after so many others of a walk.
inline bool isWithinCount(std::size_t before) {
  return before < mostObjects || leaveOutTooDeep();
}
// How often something was left out, in this process so far.
std::size_t timesTooDeep();

// Stands while one object is asked for something that may be made of what others answer to the same message.
// A question that is being asked already, or in too many others, is not to be put once more. Main thread
// only.
class PartQuestion {
 public:
  PartQuestion(Selector message, Receiver asked);
  PartQuestion(const PartQuestion&) = delete;
  PartQuestion& operator=(const PartQuestion&) = delete;
  ~PartQuestion();

  bool mayBePut() const { return mayBePut_; }

 private:
  bool mayBePut_;
};

// What a part of `whole` answers, for an answer of the whole's own to the same message; nil, NO or 0 when the
// part is the whole itself, is being asked already, or raises.
template <class R>
R answerOfPart(const Message<R()>& message, Receiver whole, Receiver part) {
  const PartQuestion beingAsked(message.selector(), whole);
  const PartQuestion question(message.selector(), part);
  return question.mayBePut() ? safeAnswer(message, part) : R();
}

}  // namespace ax
