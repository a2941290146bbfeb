#pragma once

#include <string>
#include <vector>

#include "platform/foundation/String.h"
#include "platform/runtime/KeyReading.h"

// What the bundle tells the screen reader and its developers. Main thread only.
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

// What has been posted and reported since the last call of forgetReports(), oldest first.
const std::vector<PostedNotification>& postedNotifications();
const std::vector<FailedAssertion>& failedAssertions();
void forgetReports();

}  // namespace ax
