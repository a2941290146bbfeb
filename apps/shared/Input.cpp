#include "apps/shared/Input.h"

#include <cerrno>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>

#include "apps/shared/Workouts.h"
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

Fault unreadable(const std::string& file, const std::string& what, const std::string& expected) {
  return {file.empty() ? "\"\"" : file, "", what, expected};
}

std::string allOfFile(std::ifstream& in, std::uintmax_t size) {
  std::string bytes(static_cast<std::size_t>(size), '\0');
  in.read(bytes.data(), static_cast<std::streamsize>(size));
  bytes.resize(static_cast<std::size_t>(in.gcount()));
  in.clear();
  return bytes + allOf(in);  // a file may grow, and a pipe has no size
}

}  // namespace

std::string readInput(const std::string& file) {
  if (file == "-") {
    static const std::string input = allOf(std::cin);  // it comes once, and may be asked for again
    return input;
  }
  std::error_code error;
  const std::filesystem::file_status status = std::filesystem::status(file, error);
  if (status.type() == std::filesystem::file_type::not_found) {
    throw unreadable(file, "there is no such file", "a scene or a workout file");
  }
  if (std::filesystem::is_directory(status)) {
    throw unreadable(file, "is a folder", "a file; axvelto import makes a list of a folder");
  }
  errno = 0;
  std::ifstream in(file, std::ios::binary);
  if (!in) {
    const bool isForbidden = errno == EACCES || errno == EPERM;
    throw unreadable(file, isForbidden ? "may not be read" : "cannot be read",
                     isForbidden ? "permission to read it" : "a scene or a workout file");
  }
  const bool hasSize = std::filesystem::is_regular_file(status);
  return allOfFile(in, hasSize ? std::filesystem::file_size(file, error) : 0);
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

reader::Scene sceneFor(const Opening& opening) {
  checkLocale(opening.locale);
  checkTimeZone(opening.timeZone);
  reader::Scene scene = readInputScene(opening);
  if (!opening.locale.empty()) speakFor(scene, opening.locale);
  if (!opening.timeZone.empty()) scene.environment.timeZone = opening.timeZone;
  checkOmissions(opening.without);
  return scene;
}

}  // namespace ax::app
