#include "apps/view/window/Loudspeaker.h"

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
  if (!isOpened_) device_ = QMediaDevices::defaultAudioOutput();
  isOpened_ = true;
  return !device_.isNull() && device_.isFormatSupported(soundFormat());
}

void Loudspeaker::stop() {
  if (sink_) sink_->reset();
  sink_.reset();
  buffer_.close();
}

bool Loudspeaker::play(const reader::Sound& sound) {
  if (!open()) return false;
  stop();
  if (sound.pairs() == 0) return true;
  buffer_.setData(bytesOf(sound));
  buffer_.open(QIODevice::ReadOnly);
  // A sink that is started again and again falls silent on some desktops.
  sink_ = std::make_unique<QAudioSink>(device_, soundFormat());
  sink_->start(&buffer_);
  return sink_->error() == QAudio::NoError;
}

}  // namespace ax::view
