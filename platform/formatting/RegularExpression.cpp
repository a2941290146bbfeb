#include "platform/formatting/RegularExpression.h"

#include <unicode/regex.h>
#include <unicode/utext.h>

namespace ax::formatting {
namespace {

constexpr int32_t kMostSteps = 100;  // in ICU's unit, of 10,000 steps

TextRange rangeOf(const icu::RegexMatcher& matcher, int32_t group) {
  UErrorCode status = U_ZERO_ERROR;
  const int64_t from = matcher.start64(group, status);
  const int64_t to = matcher.end64(group, status);
  if (U_FAILURE(status) || from < 0) return {};
  return {static_cast<std::size_t>(from), static_cast<std::size_t>(to - from)};
}

}  // namespace

struct RegularExpression::Compiled {
  std::unique_ptr<icu::RegexPattern> pattern;
};

RegularExpression::RegularExpression(std::string_view pattern) : compiled_(std::make_unique<Compiled>()) {
  UErrorCode status = U_ZERO_ERROR;
  const auto text = icu::UnicodeString::fromUTF8({pattern.data(), static_cast<int32_t>(pattern.size())});
  compiled_->pattern.reset(icu::RegexPattern::compile(text, 0, status));
}

RegularExpression::~RegularExpression() = default;

std::vector<TextRange> RegularExpression::firstMatch(std::string_view text) const {
  if (!compiled_->pattern) return {};
  UErrorCode status = U_ZERO_ERROR;
  UText characters = UTEXT_INITIALIZER;
  utext_openUTF8(&characters, text.data(), static_cast<int64_t>(text.size()), &status);
  const std::unique_ptr<icu::RegexMatcher> matcher(compiled_->pattern->matcher(status));
  std::vector<TextRange> ranges;
  if (U_SUCCESS(status)) {
    matcher->setTimeLimit(kMostSteps, status);
    matcher->reset(&characters);
    if (matcher->find(status) && U_SUCCESS(status)) {
      for (int32_t group = 0; group <= matcher->groupCount(); ++group)
        ranges.push_back(rangeOf(*matcher, group));
    }
  }
  utext_close(&characters);
  return ranges;
}

}  // namespace ax::formatting
