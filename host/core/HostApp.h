#pragma once

namespace ax::host {

// Does nothing: a program that calls it is linked with the host, whose classes are otherwise reached by name
// alone.
void linkHost();

}  // namespace ax::host
