#pragma once

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace ax::reader::testing {

// Seconds since 1970 as the format counts them.
inline std::uint32_t fitTime(double seconds) {
  return static_cast<std::uint32_t>(seconds - 631065600);
}

// Base types of fields.
enum FitType : std::uint8_t {
  fitEnum = 0,
  fitU8 = 2,
  fitText = 7,
  fitU16 = 0x84,
  fitS32 = 0x85,
  fitU32 = 0x86
};

struct FitColumn {
  int number;
  FitType type;
  int size;
};

// Writes small files: definitions, data messages, and the frame around them.
class FitWriter {
 public:
  explicit FitWriter(bool isBigEndian = false) : isBigEndian_(isBigEndian) {}

  // Defines a kind of message under a local number; developer fields take `developerBytes` behind the others.
  FitWriter& define(int local, int kind, std::vector<FitColumn> columns, int developerBytes = 0) {
    data_ += static_cast<char>(0x40 | local | (developerBytes > 0 ? 0x20 : 0));
    data_ += '\0';
    data_ += static_cast<char>(isBigEndian_);
    put(static_cast<std::uint64_t>(kind), 2);
    data_ += static_cast<char>(columns.size());
    for (const FitColumn& each : columns) {
      data_ += {static_cast<char>(each.number), static_cast<char>(each.size), static_cast<char>(each.type)};
    }
    if (developerBytes > 0) data_ += {1, 0, static_cast<char>(developerBytes), 0};
    developerBytes_ = developerBytes;
    columns_ = std::move(columns);
    return *this;
  }

  // A message of the kind that was defined last under its number, one value for each column.
  FitWriter& add(int local, const std::vector<std::int64_t>& values) {
    data_ += static_cast<char>(local);
    return fields(values);
  }
  // The same with the low five bits of the time in the header.
  FitWriter& addAt(int local, unsigned time, const std::vector<std::int64_t>& values) {
    data_ += static_cast<char>(0x80 | local << 5 | (time & 31));
    return fields(values);
  }
  FitWriter& raw(const std::string& bytes) {
    data_ += bytes;
    return *this;
  }

  std::string file(int headerSize = 14) const {
    std::string header = {static_cast<char>(headerSize), 32, 0, 0};
    for (int i = 0; i < 4; ++i) header += static_cast<char>(data_.size() >> 8 * i);
    header += ".FIT";
    if (headerSize == 14) header += little(checksum(header));
    return header + data_ + little(checksum(header + data_));
  }

 private:
  FitWriter& fields(const std::vector<std::int64_t>& values) {
    for (std::size_t i = 0; i < columns_.size(); ++i) {
      put(static_cast<std::uint64_t>(values.at(i)), columns_[i].size);
    }
    data_.append(static_cast<std::size_t>(developerBytes_), '\x55');
    return *this;
  }
  void put(std::uint64_t value, int size) {
    for (int i = 0; i < size; ++i) {
      const int place = isBigEndian_ ? size - 1 - i : i;
      data_ += static_cast<char>(place < 8 ? value >> 8 * place : 0);
    }
  }
  static std::string little(unsigned value) {
    return {static_cast<char>(value), static_cast<char>(value >> 8)};
  }
  // Bit by bit, unlike the reader's table.
  static unsigned checksum(const std::string& bytes) {
    unsigned value = 0;
    for (const char byte : bytes) {
      value ^= static_cast<unsigned char>(byte);
      for (int bit = 0; bit < 8; ++bit) value = (value & 1) != 0 ? value >> 1 ^ 0xA001 : value >> 1;
    }
    return value;
  }

  bool isBigEndian_;
  int developerBytes_ = 0;
  std::vector<FitColumn> columns_;
  std::string data_;
};

}  // namespace ax::reader::testing
