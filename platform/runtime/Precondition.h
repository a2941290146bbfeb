#pragma once

#include "platform/runtime/SourcePlace.h"

namespace ax {

// Whether this build checks what headers ask of their callers. Debug builds do: those without NDEBUG.
#ifdef NDEBUG
inline constexpr bool checksPreconditions = false;
#else
inline constexpr bool checksPreconditions = true;
#endif

// Writes the advice and the place to standard error and ends the process.
[[noreturn]] void preconditionFailed(const char* advice, SourcePlace place);

// States what must hold where it is called, with advice for the developer whose code breaks it. It speaks of
// this code's own mistakes alone: whatever a host may do wrong has an answer. Any thread; optimized builds
// check nothing, so that `holds` must have no effect of its own.
inline void precondition([[maybe_unused]] bool holds, [[maybe_unused]] const char* advice,
                         [[maybe_unused]] SourcePlace place = SourcePlace::current()) {
  if constexpr (checksPreconditions) {
    if (!holds) [[unlikely]]
      preconditionFailed(advice, place);
  }
}

}  // namespace ax
