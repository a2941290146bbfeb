#include "apps/view/window/Loudspeaker.h"

#include <QAudioDevice>
#include <QMediaDevices>
#include <algorithm>
#include <cmath>
#include <cstdint>

namespace ax::view {

namespace {

constexpr double loudest = 32767;

QAudioFormat soundFormat() {
  QAudioFormat format;
  format.setSampleRate(reader::Sound::rate);
  format.setChannelCount(2);
  format.setSampleFormat(QAudioFormat::Int16);
  return format;
}

QByteArray bytesOf(const reader::Sound& sound) {
  QByteArray bytes;
  bytes.reserve(static_cast<qsizetype>(sound.samples().size()) * qsizetype{sizeof(std::int16_t)});
  for (const float sample : sound.samples()) {
    const auto level = std::int16_t(std::lround(std::clamp(double(sample), -1.0, 1.0) * loudest));
    bytes.append(reinterpret_cast<const char*>(&level), sizeof level);
  }
  return bytes;
}

}  // namespace

Loudspeaker::~Loudspeaker() {
  stop();
}

bool Loudspeaker::open() {
  if (isOpened_) return sink_ != nullptr;
  isOpened_ = true;
  const QAudioDevice device = QMediaDevices::defaultAudioOutput();
  if (!device.isNull() && device.isFormatSupported(soundFormat())) {
    sink_ = std::make_unique<QAudioSink>(device, soundFormat());
  }
  return sink_ != nullptr;
}

void Loudspeaker::stop() {
  if (sink_) sink_->reset();
  buffer_.close();
}

bool Loudspeaker::play(const reader::Sound& sound) {
  if (!open()) return false;
  stop();
  if (sound.pairs() == 0) return true;
  buffer_.setData(bytesOf(sound));
  buffer_.open(QIODevice::ReadOnly);
  sink_->start(&buffer_);
  return sink_->error() == QAudio::NoError;
}

}  // namespace ax::view
