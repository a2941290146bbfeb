#include "reader/sound/Speech.h"

#include <espeak-ng/speak_lib.h>
#include <samplerate.h>

#include <algorithm>
#include <new>
#include <string_view>
#include <utility>
#include <vector>

namespace ax::reader {

namespace {

// Beside the loudest note; what is made of full samples stays below 1 when it is resampled.
constexpr float speechLevel = 0.6F / 32768;

// The library's Japanese voice reads kana alone and says "Chinese letter" for everything else.
constexpr std::string_view unreadLanguages[] = {"ja"};

// What the Arabic voice leaves out of a number or reads as its end, and marks that are not spoken.
constexpr std::pair<std::string_view, std::string_view> replacements[] = {
    {"\u066A", " في المئة"}, {"\u066B", "."}, {"\u066C", ""}, {"\u200E", ""}, {"\u200F", ""}, {"\u061C", ""}};

std::string readable(std::string line) {
  for (const auto& [from, to] : replacements) {
    for (std::size_t at; (at = line.find(from)) != std::string::npos;) line.replace(at, from.size(), to);
  }
  return line;
}

// The library, opened with its first line and closed with the process. It is one for the process.
class Voices {
 public:
  static Voices& shared() {
    static Voices voices;
    return voices;
  }

  // Takes the voice of a locale.
  bool take(const std::string& locale) {
    std::string name = locale.substr(0, locale.find_first_of(".@"));
    std::ranges::replace(name, '_', '-');
    std::ranges::transform(name, name.begin(), [](char c) { return c >= 'A' && c <= 'Z' ? c + 32 : c; });
    if (std::ranges::count(unreadLanguages, name.substr(0, name.find('-'))) != 0) return false;
    while (rate_ > 0 && !name.empty()) {
      if (espeak_SetVoiceByName(name.c_str()) == EE_OK) return true;
      const std::size_t end = name.rfind('-');
      name.resize(end == std::string::npos ? 0 : end);
    }
    return false;
  }

  // With the voice that was taken last, at rate().
  const std::vector<short>& say(const std::string& line) {
    const std::string text = readable(line);
    said_.clear();
    espeak_Synth(text.c_str(), text.size() + 1, 0, POS_CHARACTER, 0, espeakCHARS_UTF8, nullptr, nullptr);
    return said_;
  }

  int rate() const { return rate_; }

 private:
  Voices() {
    rate_ = espeak_Initialize(AUDIO_OUTPUT_SYNCHRONOUS, 0, nullptr, espeakINITIALIZE_DONT_EXIT);
    if (rate_ <= 0) return;
    espeak_SetSynthCallback(&Voices::keep);
    espeak_SetParameter(espeakRATE, espeakRATE_NORMAL, 0);
  }
  ~Voices() {
    if (rate_ > 0) espeak_Terminate();
  }

  static int keep(short* samples, int count, espeak_EVENT*) {
    std::vector<short>& said = shared().said_;
    if (samples != nullptr) said.insert(said.end(), samples, samples + std::max(count, 0));
    return 0;
  }

  int rate_ = 0;
  std::vector<short> said_;
};

std::vector<float> resampled(const std::vector<float>& samples, double ratio) {
  std::vector<float> result(std::size_t(double(samples.size()) * ratio) + 1);
  SRC_DATA data = {};
  data.data_in = samples.data();
  data.input_frames = long(samples.size());
  data.data_out = result.data();
  data.output_frames = long(result.size());
  data.src_ratio = ratio;
  if (src_simple(&data, SRC_SINC_MEDIUM_QUALITY, 1) != 0) throw std::bad_alloc();  // its one failure
  result.resize(std::size_t(data.output_frames_gen));
  return result;
}

}  // namespace

bool hasVoice(const std::string& locale) {
  return Voices::shared().take(locale);
}

std::optional<Sound> spokenSound(const std::string& line, const std::string& locale) {
  Voices& voices = Voices::shared();
  if (!voices.take(locale)) return std::nullopt;
  std::vector<float> samples;
  for (const short sample : voices.say(line)) samples.push_back(speechLevel * float(sample));
  Sound sound;
  for (const float sample : resampled(samples, double(Sound::rate) / voices.rate())) {
    sound.add(sample, sample);
  }
  return sound;
}

double speakingTime(const std::string& line, const std::string& locale) {
  Voices& voices = Voices::shared();
  return voices.take(locale) ? double(voices.say(line).size()) / voices.rate() : -1;
}

}  // namespace ax::reader
