#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace ax::reader {

// One field as a definition lays it out.
struct FitField {
  std::uint8_t number = 0;
  std::uint8_t type = 0;
  std::size_t offset = 0;  // from the start of the message's fields
  std::size_t size = 0;
};

struct FitDefinition {
  std::uint16_t kind = 0;  // 18 session, 19 lap, 20 record ...
  bool isBigEndian = false;
  std::vector<FitField> fields;
  std::size_t size = 0;  // of a data message, developer fields included
};

// A data message. It refers to the bytes and the definition, and is good for the call that hands it over.
class FitMessage {
 public:
  FitMessage(const FitDefinition& definition, const char* bytes, std::optional<double> time)
      : definition_(&definition), bytes_(bytes), time_(time) {}

  std::uint16_t kind() const { return definition_->kind; }
  // Its time stamp, in seconds since 1970; of a compressed header where it has one.
  std::optional<double> time() const { return time_; }
  // A number, of several the first. Empty when the field is not there, marked as not known, a text, or of a
  // size that does not fit its type.
  std::optional<double> number(int field) const;
  // The number times a scale, and an instant in seconds since 1970.
  std::optional<double> scaled(int field, double divisor) const;
  std::optional<double> instant(int field) const;
  std::string text(int field) const;
  // How many bytes each such message takes in the file.
  std::size_t size() const { return definition_->size + 1; }
  // From its fields on to the end of all bytes.
  std::size_t bytesLeft(std::string_view all) const {
    return static_cast<std::size_t>(all.data() + all.size() - bytes_);
  }

 private:
  const FitField* find(int field) const;

  const FitDefinition* definition_;
  const char* bytes_;
  std::optional<double> time_;
};

// Where and why the reading of messages ended early.
struct FitFault {
  std::size_t at = 0;  // the offset of a byte
  std::string what;
  std::string expected;
};

struct FitVisitor {
  std::function<void()> onFile;  // files may be chained: each begins anew
  std::function<void(const FitMessage&)> onMessage;
};

// Whether the bytes begin as a file of this format does.
bool isFit(std::string_view bytes);

// Hands over every data message in order, also those before a fault. What cannot be decoded ends the reading;
// a checksum that does not match is told after everything has been read.
std::optional<FitFault> readFitMessages(std::string_view bytes, const FitVisitor& visitor);

}  // namespace ax::reader
