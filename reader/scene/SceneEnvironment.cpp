#include "reader/scene/SceneEnvironment.h"

#include "platform/formatting/IsoTime.h"

namespace ax::reader {

namespace {

template <class T, class U>
void change(T& member, const std::optional<U>& given) {
  if (given) member = *given;
}

}  // namespace

void SceneEnvironment::apply(Environment base) const {
  change(base.locale, locale);
  change(base.timeZone, timeZone);
  change(base.screenReader, screenReader);
  change(base.wheelchair, wheelchair);
  change(base.firstName, firstName);
  change(base.firstDayOfWeek, firstDayOfWeek);
  change(base.energyUnit, energyUnit);
  change(base.checks, checks);
  setEnvironment(base);
  if (!now) return;
  base.now = formatting::timeFromIso(*now);  // a local time, in the zone that is now in force
  setEnvironment(std::move(base));
}

}  // namespace ax::reader
