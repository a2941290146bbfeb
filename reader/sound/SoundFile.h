#pragma once

#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "reader/sound/Sound.h"

namespace ax::reader {

enum class SoundFormat { wav, flac, vorbis, opus };

// What the ending of a file's name stands for: .wav, .flac, .ogg (Vorbis) or .opus, in any case. Nothing for
// another.
std::optional<SoundFormat> soundFormatOf(std::string_view fileName);

// A sound file that is made in memory, piece by piece; the same pieces always give the same bytes. Throws
// std::runtime_error when the format cannot hold what it is given.
class SoundFile {
 public:
  explicit SoundFile(SoundFormat format);
  ~SoundFile();

  void add(const Sound& sound);
  // All bytes of the file, which is complete with this.
  std::string finish();

 private:
  struct Encoder;
  std::unique_ptr<Encoder> encoder_;
};

// The file that holds one sound.
std::string soundFileOf(const Sound& sound, SoundFormat format);

}  // namespace ax::reader
