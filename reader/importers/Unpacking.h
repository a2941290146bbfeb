#pragma once

#include <functional>
#include <string>
#include <string_view>

namespace ax::reader {

// Called with the name and the bytes of each file in an archive, which are good for the call.
using UnpackedFile = std::function<void(const std::string& name, std::string_view bytes)>;

struct UnpackOptions {
  bool readsDamaged = false;  // hands over what can be unpacked of a damaged archive
  // Called for each fault that does not end the whole: a file of a zip archive that cannot be unpacked, and
  // the damage of what was handed over all the same. Takes the fault's text parts as Fault has them.
  std::function<void(const std::string& file, const std::string& what, const std::string& expected)> onFault;
};

// Hands over the file of a gzip archive, or the files of a zip archive one after the other, those that are
// gzip archives in their turn unpacked. Nothing is unpacked to more than 200 times its size, or 16 MB where
// that is more, and nothing to more than 1 GB. Any other bytes are handed over as they are. Throws a Fault.
void unpack(std::string_view bytes, const std::string& name, const UnpackOptions& options,
            const UnpackedFile& onFile);

}  // namespace ax::reader
