#pragma once

#include <cstddef>
#include <deque>
#include <string>

#include "platform/foundation/String.h"
#include "platform/runtime/KeyReading.h"

// What the bundle tells the screen reader and its developers. Main thread only: debug builds end the process
// on another.
namespace ax {

enum class Notification { LayoutChangedNotification };

struct PostedNotification {
  Notification notification;
  Ref<Object> argument;
};

struct FailedAssertion {
  std::string message;
  std::string source;
  int line;
  std::string function;
};

using enum Notification;

void postNotification(Notification notification, Ref<Object> argument = nullptr);
std::string_view notificationName(Notification notification);

// Reports a broken expectation when the condition is false; it returns in any case.
void assertion(bool condition, std::string_view message, std::string_view source, int line,
               std::string_view function);

// What has been posted and reported since the last call of forgetReports(), oldest first. Of each no more is
// kept than the last `keptReports`; the counts are of all.
inline constexpr std::size_t keptReports = 256;
const std::deque<PostedNotification>& postedNotifications();
const std::deque<FailedAssertion>& failedAssertions();
std::size_t postedNotificationCount();
std::size_t failedAssertionCount();
void forgetReports();

}  // namespace ax
