#include "host/core/HostApp.h"

namespace ax::host {

void linkHost() {}

}  // namespace ax::host
