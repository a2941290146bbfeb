#include "platform/accessibility/Notifications.h"

#include "platform/runtime/MainThread.h"
#include "platform/runtime/Precondition.h"

namespace ax {

namespace {

template <class Report>
struct Reports {
  std::deque<Report> kept;
  std::size_t count = 0;

  void add(Report report) {
    if (kept.size() == keptReports) kept.pop_front();
    kept.push_back(std::move(report));
    ++count;
  }
};

template <class Report>
Reports<Report>& reports() {
  precondition(isMainThread(), "notifications and assertions belong to the main thread: report from there");
  static auto* const all = new Reports<Report>;
  return *all;
}

}  // namespace

void postNotification(Notification notification, Ref<Object> argument) {
  reports<PostedNotification>().add({notification, std::move(argument)});
}

std::string_view notificationName(Notification) {
  return "LayoutChangedNotification";
}

void assertion(bool condition, std::string_view message, std::string_view source, int line,
               std::string_view function) {
  if (condition) return;
  reports<FailedAssertion>().add({std::string(message), std::string(source), line, std::string(function)});
}

const std::deque<PostedNotification>& postedNotifications() {
  return reports<PostedNotification>().kept;
}
const std::deque<FailedAssertion>& failedAssertions() {
  return reports<FailedAssertion>().kept;
}
std::size_t postedNotificationCount() {
  return reports<PostedNotification>().count;
}
std::size_t failedAssertionCount() {
  return reports<FailedAssertion>().count;
}

void forgetReports() {
  reports<PostedNotification>() = {};
  reports<FailedAssertion>() = {};
}

}  // namespace ax
