#include "reader/importers/FitMessages.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cmath>

namespace ax::reader {
namespace {

constexpr double epoch = 631065600;           // 1989-12-31 00:00 UTC, from which the format counts
constexpr double clockOfDevice = 0x10000000;  // below it a time counts from when the device was started
constexpr double most = 1e12;  // no figure of a workout is larger, and none has use for an infinity
constexpr int timeField = 253;
constexpr std::size_t shortestHeader = 12;
constexpr std::size_t headerWithChecksum = 14;

enum class Reads : std::uint8_t { signedWhole, unsignedWhole, real, nothing };

// What the low bits of a type mean. A number with this pattern is not known.
struct BaseType {
  std::size_t size;
  Reads reads;
  std::uint64_t unknown;
};

constexpr std::array<BaseType, 17> baseTypes = {{
    {1, Reads::unsignedWhole, 0xFF},  // an enumeration
    {1, Reads::signedWhole, 0x7F},
    {1, Reads::unsignedWhole, 0xFF},
    {2, Reads::signedWhole, 0x7FFF},
    {2, Reads::unsignedWhole, 0xFFFF},
    {4, Reads::signedWhole, 0x7FFFFFFF},
    {4, Reads::unsignedWhole, 0xFFFFFFFF},
    {1, Reads::nothing, 0},  // a text
    {4, Reads::real, 0xFFFFFFFF},
    {8, Reads::real, 0xFFFFFFFFFFFFFFFF},
    {1, Reads::unsignedWhole, 0},
    {2, Reads::unsignedWhole, 0},
    {4, Reads::unsignedWhole, 0},
    {1, Reads::nothing, 0},  // plain bytes
    {8, Reads::signedWhole, 0x7FFFFFFFFFFFFFFF},
    {8, Reads::unsignedWhole, 0xFFFFFFFFFFFFFFFF},
    {8, Reads::unsignedWhole, 0},
}};

std::uint64_t wholeAt(const char* bytes, std::size_t size, bool isBigEndian) {
  std::uint64_t value = 0;
  for (std::size_t i = 0; i < size; ++i) {
    const std::size_t from = isBigEndian ? i : size - 1 - i;
    value = value << 8 | static_cast<unsigned char>(bytes[from]);
  }
  return value;
}

double withSign(std::uint64_t value, std::size_t size) {
  const unsigned shift = 64 - 8 * static_cast<unsigned>(size);
  return static_cast<double>(static_cast<std::int64_t>(value << shift) >> shift);
}

std::optional<double> realOf(std::uint64_t value, std::size_t size) {
  const double real =
      size == 4 ? std::bit_cast<float>(static_cast<std::uint32_t>(value)) : std::bit_cast<double>(value);
  return std::abs(real) <= most ? std::optional(real) : std::nullopt;
}

std::array<std::uint16_t, 256> checksumTable() {
  std::array<std::uint16_t, 256> table{};
  for (unsigned byte = 0; byte < 256; ++byte) {
    unsigned value = byte;
    for (int bit = 0; bit < 8; ++bit) value = value & 1 ? value >> 1 ^ 0xA001 : value >> 1;
    table[byte] = static_cast<std::uint16_t>(value);
  }
  return table;
}

std::uint16_t checksum(std::string_view bytes) {
  static const std::array<std::uint16_t, 256> table = checksumTable();
  unsigned value = 0;
  for (const char byte : bytes) value = value >> 8 ^ table[(value ^ static_cast<unsigned char>(byte)) & 0xFF];
  return static_cast<std::uint16_t>(value);
}

// Reads the chained files one after the other. Faults are thrown inside and handed out at the end.
class FitReading {
 public:
  FitReading(std::string_view bytes, const FitVisitor& visitor) : bytes_(bytes), visitor_(visitor) {}

  void run() {
    while (at_ < bytes_.size()) readFile();
  }

 private:
  [[noreturn]] static void fail(std::size_t at, std::string what, std::string expected) {
    throw FitFault{at, std::move(what), std::move(expected)};
  }
  unsigned byteAt(std::size_t index) const { return static_cast<unsigned char>(bytes_[index]); }
  unsigned takeByte() {
    need(1);
    return byteAt(at_++);
  }
  void need(std::size_t count) const {
    if (dataEnd_ - at_ >= count) return;
    if (isCut_) fail(bytes_.size(), "the file is cut off", std::to_string(wanted_) + " bytes");
    fail(at_, "a message reaches beyond the end of the data", "messages that end with it");
  }

  void readFile();
  void readHeader();
  void readMessage();
  void readDefinition(unsigned header);
  void readData(unsigned local, std::optional<unsigned> timeOffset);
  void checkSum(std::size_t start);
  std::optional<double> timeOf(const FitMessage& message, std::optional<unsigned> timeOffset);

  std::string_view bytes_;
  const FitVisitor& visitor_;
  std::size_t at_ = 0;
  std::size_t dataEnd_ = 0;
  std::uint64_t wanted_ = 0;  // how long the bytes must be for this file to be whole
  bool isCut_ = false;
  std::array<std::optional<FitDefinition>, 16> definitions_ = {};
  std::uint32_t clock_ = 0;  // the last time stamp, as the format counts
};

void FitReading::readFile() {
  const std::size_t start = at_;
  readHeader();
  definitions_ = {};
  clock_ = 0;
  visitor_.onFile();
  while (at_ < dataEnd_) readMessage();
  if (isCut_) need(1);
  checkSum(start);
}

void FitReading::readHeader() {
  const std::string_view rest = bytes_.substr(at_);
  if (!isFit(rest)) {
    fail(at_, at_ == 0 ? "no FIT header" : "something stands behind the FIT data",
         "a header with .FIT in it");
  }
  const std::size_t size = byteAt(at_);
  const std::uint64_t dataSize = wholeAt(rest.data() + 4, 4, false);
  const std::size_t sum = size >= headerWithChecksum ? wholeAt(rest.data() + shortestHeader, 2, false) : 0;
  if (sum != 0 && sum != checksum(rest.substr(0, shortestHeader))) {
    fail(at_ + shortestHeader, "the checksum of the header does not match", "an undamaged file");
  }
  wanted_ = at_ + size + dataSize + 2;
  isCut_ = wanted_ > bytes_.size();
  dataEnd_ = isCut_ ? bytes_.size() : at_ + size + static_cast<std::size_t>(dataSize);
  at_ += size;
}

void FitReading::checkSum(std::size_t start) {
  const std::uint64_t told = wholeAt(bytes_.data() + dataEnd_, 2, false);
  const bool matches = told == 0 || told == checksum(bytes_.substr(start, dataEnd_ - start));
  at_ = dataEnd_ + 2;
  if (!matches) fail(dataEnd_, "the checksum does not match", "an undamaged file");
}

void FitReading::readMessage() {
  const unsigned header = takeByte();
  if ((header & 0x80) != 0) return readData(header >> 5 & 3, header & 31);
  if ((header & 0x40) != 0) return readDefinition(header);
  readData(header & 15, std::nullopt);
}

void FitReading::readDefinition(unsigned header) {
  need(5);
  FitDefinition definition;
  definition.isBigEndian = byteAt(at_ + 1) != 0;
  definition.kind = static_cast<std::uint16_t>(wholeAt(bytes_.data() + at_ + 2, 2, definition.isBigEndian));
  const unsigned count = byteAt(at_ + 4);
  at_ += 5;
  need(std::size_t{3} * count);
  for (unsigned i = 0; i < count; ++i, at_ += 3) {
    const std::size_t size = byteAt(at_ + 1);
    definition.fields.push_back({static_cast<std::uint8_t>(byteAt(at_)),
                                 static_cast<std::uint8_t>(byteAt(at_ + 2)), definition.size, size});
    definition.size += size;
  }
  const unsigned developerFields = (header & 0x20) != 0 ? takeByte() : 0;
  need(std::size_t{3} * developerFields);
  for (unsigned i = 0; i < developerFields; ++i, at_ += 3) definition.size += byteAt(at_ + 1);
  definitions_[header & 15] = std::move(definition);
}

void FitReading::readData(unsigned local, std::optional<unsigned> timeOffset) {
  const std::optional<FitDefinition>& definition = definitions_[local];
  if (!definition) {
    fail(at_ - 1, "a message of a kind that has not been defined", "a definition before it");
  }
  need(definition->size);
  const char* fields = bytes_.data() + at_;
  const FitMessage untimed(*definition, fields, std::nullopt);
  visitor_.onMessage(FitMessage(*definition, fields, timeOf(untimed, timeOffset)));
  at_ += definition->size;
}

// A compressed header tells the low five bits of the time, which has moved on by less than they hold.
std::optional<double> FitReading::timeOf(const FitMessage& message, std::optional<unsigned> timeOffset) {
  if (timeOffset) {
    if (clock_ == 0) return std::nullopt;
    clock_ += (*timeOffset - clock_) & 31;
    return epoch + clock_;
  }
  const auto told = message.number(timeField);
  if (!told || *told < 0 || *told > 0xFFFFFFFF) return std::nullopt;
  clock_ = static_cast<std::uint32_t>(*told);
  return *told < clockOfDevice ? std::nullopt : std::optional(epoch + *told);
}

}  // namespace

const FitField* FitMessage::find(int field) const {
  const auto found = std::ranges::find(definition_->fields, field, &FitField::number);
  return found == definition_->fields.end() ? nullptr : &*found;
}

std::optional<double> FitMessage::number(int field) const {
  const FitField* found = find(field);
  const std::size_t index = found == nullptr ? baseTypes.size() : found->type & 0x1F;
  if (index >= baseTypes.size()) return std::nullopt;
  const BaseType& type = baseTypes[index];
  if (type.reads == Reads::nothing || found->size == 0 || found->size % type.size != 0) return std::nullopt;
  const std::uint64_t value = wholeAt(bytes_ + found->offset, type.size, definition_->isBigEndian);
  if (value == type.unknown) return std::nullopt;
  if (type.reads == Reads::real) return realOf(value, type.size);
  const double whole =
      type.reads == Reads::signedWhole ? withSign(value, type.size) : static_cast<double>(value);
  return std::abs(whole) <= most ? std::optional(whole) : std::nullopt;
}

std::optional<double> FitMessage::scaled(int field, double divisor) const {
  const auto value = number(field);
  return value ? std::optional(*value / divisor) : std::nullopt;
}

std::optional<double> FitMessage::instant(int field) const {
  const auto value = number(field);
  return value && *value >= clockOfDevice ? std::optional(epoch + *value) : std::nullopt;
}

std::string FitMessage::text(int field) const {
  const FitField* found = find(field);
  if (found == nullptr || (found->type & 0x1F) != 7) return {};
  const std::string_view all(bytes_ + found->offset, found->size);
  return std::string(all.substr(0, all.find('\0')));
}

bool isFit(std::string_view bytes) {
  return bytes.size() >= shortestHeader && static_cast<unsigned char>(bytes[0]) >= shortestHeader &&
         static_cast<unsigned char>(bytes[0]) <= bytes.size() && bytes.substr(8, 4) == ".FIT";
}

std::optional<FitFault> readFitMessages(std::string_view bytes, const FitVisitor& visitor) {
  try {
    FitReading(bytes, visitor).run();
  } catch (const FitFault& fault) {
    return fault;
  }
  return std::nullopt;
}

}  // namespace ax::reader
