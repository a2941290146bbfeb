#pragma once

#include <string>

namespace ax::reader {

// Gives the one stream of an Ogg file the number 1, in place of the random one that it was written with, so
// that the same sound is the same bytes.
void numberOggStream(std::string& file);

}  // namespace ax::reader
