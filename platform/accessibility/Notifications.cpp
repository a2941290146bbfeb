#include "platform/accessibility/Notifications.h"

namespace ax {

namespace {

std::vector<PostedNotification>& posted() {
  static auto* const notifications = new std::vector<PostedNotification>;
  return *notifications;
}

std::vector<FailedAssertion>& failed() {
  static auto* const assertions = new std::vector<FailedAssertion>;
  return *assertions;
}

}  // namespace

void postNotification(Notification notification, Ref<Object> argument) {
  posted().push_back({notification, std::move(argument)});
}

std::string_view notificationName(Notification) {
  return "LayoutChangedNotification";
}

void assertion(bool condition, std::string_view message, std::string_view source, int line,
               std::string_view function) {
  if (!condition)
    failed().push_back({std::string(message), std::string(source), line, std::string(function)});
}

const std::vector<PostedNotification>& postedNotifications() {
  return posted();
}
const std::vector<FailedAssertion>& failedAssertions() {
  return failed();
}

void forgetReports() {
  posted().clear();
  failed().clear();
}

}  // namespace ax
