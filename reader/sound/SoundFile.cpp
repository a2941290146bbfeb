#include "reader/sound/SoundFile.h"

#include <sndfile.h>

#include <algorithm>
#include <cstring>
#include <stdexcept>

#include "reader/sound/OggStream.h"

namespace ax::reader {

namespace {

struct FormatRow {
  std::string_view ending;
  SoundFormat format;
  int code;
  bool isOgg;
};
constexpr FormatRow formatRows[] = {
    {".wav", SoundFormat::wav, SF_FORMAT_WAV | SF_FORMAT_PCM_16, false},
    {".flac", SoundFormat::flac, SF_FORMAT_FLAC | SF_FORMAT_PCM_16, false},
    {".ogg", SoundFormat::vorbis, SF_FORMAT_OGG | SF_FORMAT_VORBIS, true},
    {".opus", SoundFormat::opus, SF_FORMAT_OGG | SF_FORMAT_OPUS, true},
};

const FormatRow& rowOf(SoundFormat format) {
  return *std::ranges::find(formatRows, format, &FormatRow::format);
}

// A file of the library that stands in a string.
struct Memory {
  std::string bytes;
  std::size_t at = 0;

  static Memory& of(void* memory) { return *static_cast<Memory*>(memory); }
  static sf_count_t size(void* memory) { return sf_count_t(of(memory).bytes.size()); }
  static sf_count_t tell(void* memory) { return sf_count_t(of(memory).at); }
  static sf_count_t seek(sf_count_t offset, int whence, void* memory) {
    const sf_count_t from = whence == SEEK_CUR ? tell(memory) : whence == SEEK_END ? size(memory) : 0;
    of(memory).at = std::size_t(std::max<sf_count_t>(from + offset, 0));
    return tell(memory);
  }
  static sf_count_t read(void* data, sf_count_t count, void* memory) {
    Memory& file = of(memory);
    const std::size_t left = file.bytes.size() - std::min(file.at, file.bytes.size());
    const std::size_t taken = std::min(std::size_t(count), left);
    if (taken > 0) std::memcpy(data, file.bytes.data() + file.at, taken);
    file.at += taken;
    return sf_count_t(taken);
  }
  static sf_count_t write(const void* data, sf_count_t count, void* memory) {
    Memory& file = of(memory);
    const std::size_t end = file.at + std::size_t(count);
    if (end > file.bytes.size()) file.bytes.resize(end);
    if (count > 0) std::memcpy(file.bytes.data() + file.at, data, std::size_t(count));
    file.at = end;
    return count;
  }
};

std::runtime_error failure(SNDFILE* file) {
  return std::runtime_error(std::string("the sound cannot be encoded: ") + sf_strerror(file));
}

}  // namespace

struct SoundFile::Encoder {
  const FormatRow& row;
  Memory memory = {};
  SNDFILE* file = nullptr;

  explicit Encoder(SoundFormat format) : row(rowOf(format)) {
    SF_VIRTUAL_IO io = {&Memory::size, &Memory::seek, &Memory::read, &Memory::write, &Memory::tell};
    SF_INFO info = {};
    info.samplerate = Sound::rate;
    info.channels = 2;
    info.format = row.code;
    file = sf_open_virtual(&io, SFM_WRITE, &info, &memory);
    if (file == nullptr) throw failure(nullptr);
    sf_command(file, SFC_SET_CLIPPING, nullptr, SF_TRUE);
  }
  ~Encoder() { close(); }
  Encoder(const Encoder&) = delete;
  Encoder& operator=(const Encoder&) = delete;

  void close() {
    if (file != nullptr) sf_close(file);
    file = nullptr;
  }
};

std::optional<SoundFormat> soundFormatOf(std::string_view fileName) {
  std::string ending(fileName.substr(std::min(fileName.rfind('.'), fileName.size())));
  std::ranges::transform(ending, ending.begin(), [](char c) { return c >= 'A' && c <= 'Z' ? c + 32 : c; });
  const auto* row = std::ranges::find(formatRows, ending, &FormatRow::ending);
  return row == std::end(formatRows) ? std::nullopt : std::optional(row->format);
}

SoundFile::SoundFile(SoundFormat format) : encoder_(std::make_unique<Encoder>(format)) {}
SoundFile::~SoundFile() = default;

void SoundFile::add(const Sound& sound) {
  constexpr std::size_t most = 8192;  // the encoders keep what they are given at once on the stack
  for (auto rest = sound.samples(); !rest.empty();) {
    const auto part = rest.first(std::min(rest.size(), most));
    const auto pairs = sf_count_t(part.size() / 2);
    if (sf_writef_float(encoder_->file, part.data(), pairs) != pairs) throw failure(encoder_->file);
    rest = rest.subspan(part.size());
  }
}

std::string SoundFile::finish() {
  encoder_->close();
  if (encoder_->row.isOgg) numberOggStream(encoder_->memory.bytes);
  return std::move(encoder_->memory.bytes);
}

std::string soundFileOf(const Sound& sound, SoundFormat format) {
  SoundFile file(format);
  file.add(sound);
  return file.finish();
}

}  // namespace ax::reader
