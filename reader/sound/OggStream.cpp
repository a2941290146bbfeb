#include "reader/sound/OggStream.h"

#include <ogg/ogg.h>

#include <numeric>

namespace ax::reader {

namespace {

// Of a page's header: the stream's number in four bytes, how many lengths follow, and these.
constexpr std::size_t numberAt = 14, countAt = 26, lengthsAt = 27;

}  // namespace

void numberOggStream(std::string& file) {
  for (std::size_t at = 0; at + lengthsAt <= file.size();) {
    auto* bytes = reinterpret_cast<unsigned char*>(file.data() + at);
    const long header = long(lengthsAt) + bytes[countAt];
    if (at + std::size_t(header) > file.size()) return;
    const long body = std::accumulate(bytes + lengthsAt, bytes + header, 0L);
    if (at + std::size_t(header + body) > file.size()) return;
    for (std::size_t i = 0; i < 4; ++i) bytes[numberAt + i] = i == 0 ? 1 : 0;
    ogg_page page = {bytes, header, bytes + header, body};
    ogg_page_checksum_set(&page);
    at += std::size_t(header + body);
  }
}

}  // namespace ax::reader
