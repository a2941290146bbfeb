#pragma once

#include <string>

#include "reader/sound/SoundFile.h"

namespace ax::app {

// The sound file that a command makes.
class SoundOutput {
 public:
  // Throws a Fault for a name whose ending is no format, before any work is done.
  explicit SoundOutput(std::string name);

  void add(const reader::Sound& sound) { file_.add(sound); }
  // Throws a Fault when the file cannot be written.
  void write();

 private:
  std::string name_;
  reader::SoundFile file_;
};

// Says on standard error when no voice reads the language of the environment; then only the tones are heard.
void tellOfMissingVoice(const std::string& file);

}  // namespace ax::app
