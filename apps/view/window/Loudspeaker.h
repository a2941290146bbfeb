#pragma once

#include <QAudioDevice>
#include <QAudioSink>
#include <QBuffer>
#include <memory>

#include "reader/sound/Sound.h"

namespace ax::view {

// Plays one sound at a time on the desktop's audio device, which it looks for when it first plays. Main
// thread only.
class Loudspeaker {
 public:
  ~Loudspeaker();

  // In place of what still sounds; an empty sound is silence. False where no device takes it.
  bool play(const reader::Sound& sound);

 private:
  bool open();
  void stop();

  bool isOpened_ = false;  // or tried to
  QAudioDevice device_;
  std::unique_ptr<QAudioSink> sink_;  // while something sounds
  QBuffer buffer_;
};

}  // namespace ax::view
