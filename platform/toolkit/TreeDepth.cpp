#include "platform/toolkit/TreeDepth.h"

#include <algorithm>
#include <atomic>
#include <utility>
#include <vector>

namespace ax {

namespace {

std::atomic<std::size_t> tooDeep = 0;

using Question = std::pair<Selector, const Object*>;

std::vector<Question>& questions() {
  thread_local std::vector<Question> asked;
  return asked;
}

// Put since the outermost of those that are being asked.
thread_local std::size_t putQuestions = 0;

}  // namespace

bool leaveOutTooDeep() {
  ++tooDeep;
  return false;
}

std::size_t timesTooDeep() {
  return tooDeep;
}

PartQuestion::PartQuestion(Selector message, Receiver asked) {
  const Question question{message, asked.get()};
  const bool isAsked = std::find(questions().begin(), questions().end(), question) != questions().end();
  if (questions().empty()) putQuestions = 0;
  mayBePut_ = !isAsked && isWithinDepth(questions().size()) && isWithinCount(putQuestions++);
  questions().push_back(question);
}

PartQuestion::~PartQuestion() {
  questions().pop_back();
}

}  // namespace ax
