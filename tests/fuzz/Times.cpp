#include <cmath>
#include <stdexcept>

#include "platform/formatting/IsoTime.h"
#include "reader/importers/XmlFields.h"
#include "tests/fuzz/Pieces.h"

void ax::fuzz::fuzzTimes(Bytes bytes) {
  const std::string text = textOf(bytes);
  const auto inFile = reader::parseTime(text);
  for (const auto& time :
       {formatting::timeFromIso(text), inFile ? std::optional(inFile->time) : std::nullopt}) {
    if (!time) continue;
    if (!std::isfinite(*time)) throw std::logic_error("a time that is not finite");
    formatting::isoFromTime(*time);
    formatting::isoWithOffset(*time);
  }
}
