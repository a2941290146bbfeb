#include "platform/formatting/YearlyRule.h"

#include <algorithm>
#include <charconv>
#include <chrono>
#include <cmath>
#include <cstdint>

namespace ax::formatting {

// Takes the parts off the front; the first that does not fit turns `good` off.
class RuleReader {
 public:
  explicit RuleReader(std::string_view line) : rest_(line) {}

  std::optional<YearlyRule> read() {
    YearlyRule rule;
    skipName();
    rule.standard_ = -time();
    skipName();
    rule.marked_ = !rest_.empty() && rest_.front() != ',' ? -time() : rule.standard_ + kHour;
    rule.begin_ = change();
    rule.end_ = change();
    return good_ && rest_.empty() ? std::optional(rule) : std::nullopt;
  }

 private:
  static constexpr double kHour = 3600;

  bool skip(char c) {
    if (rest_.empty() || rest_.front() != c) return false;
    rest_.remove_prefix(1);
    return true;
  }
  void expect(char c) { good_ = skip(c) && good_; }

  void skipName() {
    const auto ends = [](char c) {
      return c == '<' || c == ',' || c == '-' || c == '+' || (c >= '0' && c <= '9');
    };
    if (skip('<')) {
      rest_.remove_prefix(std::min(rest_.find('>'), rest_.size()));
      return expect('>');
    }
    rest_.remove_prefix(
        static_cast<std::size_t>(std::find_if(rest_.begin(), rest_.end(), ends) - rest_.begin()));
  }

  unsigned number() {
    unsigned value = 0;
    const auto read = std::from_chars(rest_.data(), rest_.data() + rest_.size(), value);
    good_ = good_ && read.ec == std::errc() && value < 1000;
    rest_.remove_prefix(static_cast<std::size_t>(read.ptr - rest_.data()));
    return value;
  }

  double time() {
    const bool negative = skip('-');
    if (!negative) skip('+');
    double seconds = number() * kHour;
    if (skip(':')) seconds += number() * 60;
    if (skip(':')) seconds += number();
    return negative ? -seconds : seconds;
  }

  YearlyRule::Change change() {
    YearlyRule::Change change;
    expect(',');
    expect('M');
    change.month = number();
    expect('.');
    change.week = number();
    expect('.');
    change.weekday = number();
    change.inDay = skip('/') ? time() : 2 * kHour;
    good_ = good_ && change.month >= 1 && change.month <= 12 && change.week >= 1 && change.week <= 5 &&
            change.weekday <= 6;
    return change;
  }

  std::string_view rest_;
  bool good_ = true;
};

std::optional<YearlyRule> YearlyRule::read(std::string_view line) {
  return RuleReader(line).read();
}

double YearlyRule::instantOf(const Change& change, int year, double formerOffset) const {
  using namespace std::chrono;
  const auto month = std::chrono::year(year) / std::chrono::month(change.month);
  const std::chrono::weekday weekday(change.weekday);
  const sys_days day =
      change.week == 5 ? sys_days(month / weekday[last]) : sys_days(month / weekday[change.week]);
  return static_cast<double>(day.time_since_epoch().count()) * 86400 + change.inDay - formerOffset;
}

std::array<YearlyRule::Instant, 6> YearlyRule::changesAround(double time) const {
  using namespace std::chrono;
  const sys_days day{days(static_cast<std::int64_t>(std::floor(time / 86400)))};
  const int year = static_cast<int>(year_month_day(day).year());
  std::array<Instant, 6> changes{};
  for (std::size_t i = 0; i < 3; ++i) {
    const int near = year - 1 + static_cast<int>(i);
    changes[2 * i] = {instantOf(begin_, near, standard_), true};
    changes[2 * i + 1] = {instantOf(end_, near, marked_), false};
  }
  std::sort(changes.begin(), changes.end(),
            [](const Instant& a, const Instant& b) { return a.time < b.time; });
  return changes;
}

MarkedStretch YearlyRule::at(double time) const {
  const auto changes = changesAround(time);
  const auto next =
      std::upper_bound(changes.begin() + 1, changes.end() - 1, time,
                       [](double instant, const Instant& change) { return instant < change.time; });
  const Instant& last = *(next - 1);
  return {last.time, next->time, last.marked ? marked_ : standard_, last.marked};
}

}  // namespace ax::formatting
