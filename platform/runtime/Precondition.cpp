#include "platform/runtime/Precondition.h"

#include <cstdio>
#include <cstdlib>
#include <string_view>

namespace ax {

void preconditionFailed(const char* advice, SourcePlace place) {
  std::string_view file = place.file;
  file.remove_prefix(file.find_last_of('/') + 1);
  std::fprintf(stderr, "%.*s:%u: %s\n", int(file.size()), file.data(), place.line, advice);
  std::abort();
}

}  // namespace ax
