#include "apps/axvelto/Input.h"

#include <fstream>
#include <iostream>
#include <iterator>

#include "platform/formatting/Region.h"
#include "platform/foundation/Environment.h"

namespace ax::app {

using reader::Fault;

namespace {

std::string allOf(std::istream& in) {
  return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

// The app would lay its screen out from the other side for a language of the other direction.
void speakFor(reader::Scene& scene, const std::string& locale) {
  const std::string& own = scene.environment.locale.value_or(Environment().locale);
  scene.isMirrored = formatting::isRightToLeft(own) != formatting::isRightToLeft(locale);
  scene.environment.locale = locale;
}

constexpr std::string_view byteOrderMarks[] = {"\xEF\xBB\xBF", "\xFF\xFE", "\xFE\xFF"};

}  // namespace

std::string readInput(const std::string& file) {
  if (file == "-") return allOf(std::cin);
  std::ifstream in(file, std::ios::binary);
  in.peek();  // a folder opens, and fails only here
  if (in.fail()) throw Fault{file.empty() ? "\"\"" : file, "", "cannot be read", "a scene or a workout file"};
  in.clear();
  return allOf(in);
}

bool isWorkoutFile(std::string_view bytes) {
  for (const std::string_view mark : byteOrderMarks) {
    if (bytes.starts_with(mark)) bytes.remove_prefix(mark.size());
  }
  const std::size_t first = bytes.find_first_not_of(std::string_view(" \t\r\n\0", 5));
  return first != std::string_view::npos && bytes[first] == '<';
}

void checkLocale(const std::string& locale) {
  if (locale.empty() || formatting::isKnownLocale(locale)) return;
  throw Fault{"--locale", "", "\"" + locale + "\" is no known locale", "one such as en_US"};
}

void checkTimeZone(const std::string& timeZone) {
  if (timeZone.empty() || formatting::isKnownTimeZone(timeZone)) return;
  throw Fault{"--time-zone", "", "\"" + timeZone + "\" is no known time zone", "one such as Europe/Berlin"};
}

void checkOmissions(const std::vector<std::string>& names) {
  for (const std::string& name : names) reader::checkOmission({"", name}, "--without");
}

reader::Scene sceneFor(const Arguments& arguments) {
  const std::string& file = arguments.files.front();
  checkLocale(arguments.locale);
  std::string text = readInput(file);
  if (isWorkoutFile(text)) text = importWorkouts({{file, std::move(text)}}, arguments).dump();
  reader::Scene scene = reader::readScene(text, file);
  if (!arguments.locale.empty()) speakFor(scene, arguments.locale);
  checkOmissions(arguments.without);
  return scene;
}

}  // namespace ax::app
