#include "platform/formatting/Region.h"

#include <unicode/locid.h>
#include <unicode/uloc.h>

#include <unordered_set>

#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/ZoneRules.h"

namespace ax::formatting {
namespace {

constexpr const char* kDefaultLocale = "en_US";
constexpr const char* kDefaultTimeZone = "UTC";

struct State {
  Region region{kDefaultLocale, kDefaultTimeZone};
  std::string language{"en"};
  bool rightToLeft = false;
  std::uint64_t generation = 1;
};

State& state() {
  static State* const theState = new State;
  return *theState;
}

const std::unordered_set<std::string>& knownLanguages() {
  static const auto* const languages = [] {
    auto* found = new std::unordered_set<std::string>;
    for (int32_t i = 0; i < uloc_countAvailable(); ++i) {
      found->insert(icu::Locale(uloc_getAvailable(i)).getLanguage());
    }
    return found;
  }();
  return *languages;
}

}  // namespace

const Region& currentRegion() {
  return state().region;
}

void setCurrentRegion(Region region) {
  if (!isKnownLocale(region.locale)) region.locale = kDefaultLocale;
  if (!isKnownTimeZone(region.timeZone)) region.timeZone = kDefaultTimeZone;
  const icu::Locale locale(region.locale.c_str());
  State& current = state();
  current.language = locale.getLanguage();
  current.rightToLeft = locale.isRightToLeft();
  current.region = std::move(region);
  ++current.generation;
  formatterCache().clear();
}

std::uint64_t regionGeneration() {
  return state().generation;
}

std::string currentLanguage() {
  return state().language;
}

bool currentLanguageIsRightToLeft() {
  return state().rightToLeft;
}

bool isRightToLeft(const std::string& locale) {
  return icu::Locale(locale.c_str()).isRightToLeft();
}

std::string likelyLocale(const std::string& language) {
  UErrorCode status = U_ZERO_ERROR;
  icu::Locale locale(language == "root" ? "en" : language.c_str());
  locale.addLikelySubtags(status);
  return U_FAILURE(status) ? language : std::string(locale.getLanguage()) + "_" + locale.getCountry();
}

bool isKnownLocale(std::string_view locale) {
  if (locale.empty() || locale.find('\0') != std::string_view::npos) return false;
  const icu::Locale parsed(std::string(locale).c_str());
  return !parsed.isBogus() && knownLanguages().contains(parsed.getLanguage());
}

bool isKnownTimeZone(std::string_view timeZone) {
  return timeZone == currentRegion().timeZone || zoneRules(std::string(timeZone)) != nullptr;
}

}  // namespace ax::formatting
