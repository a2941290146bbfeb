#include "apps/axvelto/SoundOutput.h"

#include <fstream>
#include <utility>

#include "apps/shared/Complaint.h"
#include "platform/formatting/Region.h"
#include "reader/sound/Speech.h"
#include "reader/text/Fault.h"

namespace ax::app {

namespace {

reader::SoundFormat formatOf(const std::string& name) {
  const auto format = reader::soundFormatOf(name);
  if (format) return *format;
  throw reader::Fault{name.empty() ? "\"\"" : name, "", "no sound file by its ending",
                      ".wav, .flac, .ogg or .opus"};
}

}  // namespace

SoundOutput::SoundOutput(std::string name) : name_(std::move(name)), file_(formatOf(name_)) {}

void SoundOutput::write() {
  std::ofstream out(name_, std::ios::binary | std::ios::trunc);
  const std::string bytes = file_.finish();
  if (!out.write(bytes.data(), std::streamsize(bytes.size())).flush()) {
    throw reader::Fault{name_, "", "cannot be written", "a file to write to"};
  }
}

void tellOfMissingVoice(const std::string& file) {
  const std::string& locale = formatting::currentRegion().locale;
  if (reader::hasVoice(locale)) return;
  complain(file + ": no voice reads " + locale + ", so only the tones are heard");
}

}  // namespace ax::app
