#include <cmath>
#include <stdexcept>

#include "platform/formatting/IsoTime.h"
#include "reader/importers/IsoTime.h"
#include "tests/fuzz/Pieces.h"

void ax::fuzz::fuzzTimes(Bytes bytes) {
  const std::string text = textOf(bytes);
  for (const auto& time :
       {formatting::timeFromIso(text), reader::parseIsoTime(text), reader::offsetOfIsoTime(text)}) {
    if (!time) continue;
    if (!std::isfinite(*time)) throw std::logic_error("a time that is not finite");
    formatting::isoFromTime(*time);
    formatting::isoWithOffset(*time);
  }
}
