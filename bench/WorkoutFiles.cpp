#include <array>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <memory>
#include <pugixml.hpp>
#include <string>
#include <vector>

#include "bench/HostObjects.h"
#include "bench/Sides.h"
#include "reader/importers/WorkoutFileReader.h"

// A megabyte of a workout file in each format, read whole, beside the parser alone or a plain read of the
// same records.
namespace {

using ax::reader::WorkoutFile;

constexpr std::size_t megabyte = 1'000'000;
constexpr int start = 1'000'000'000;  // as files count the seconds

#pragma pack(push, 1)
struct Record {
  std::uint8_t header = 0;
  std::uint32_t time = 0;
  std::int32_t latitude = 0;
  std::int32_t longitude = 0;
  std::uint16_t altitude = 0;
  std::uint8_t heartRate = 0;
  std::uint32_t distance = 0;
};
#pragma pack(pop)

constexpr std::array<std::uint8_t, 24> recordDefinition = {
    0x40, 0, 0, 20, 0, 6, 253, 4, 0x86, 0, 4, 0x85, 1, 4, 0x85, 2, 2, 0x84, 3, 1, 2, 5, 4, 0x86};

Record recordAt(int second) {
  Record record;
  record.time = static_cast<std::uint32_t>(start + second);
  record.latitude = 596523235 + second * 100;
  record.longitude = 119304647;
  record.altitude = static_cast<std::uint16_t>(3000 + second % 100);
  record.heartRate = static_cast<std::uint8_t>(100 + second % 60);
  record.distance = static_cast<std::uint32_t>(second * 300);
  return record;
}

// Without checksums, which a zero stands for.
std::string fitFile() {
  std::string data(reinterpret_cast<const char*>(recordDefinition.data()), recordDefinition.size());
  for (int second = 0; data.size() < megabyte; ++second) {
    const Record record = recordAt(second);
    data.append(reinterpret_cast<const char*>(&record), sizeof record);
  }
  const auto size = static_cast<std::uint32_t>(data.size());
  std::string header = {14, 32, 0, 0, 0, 0, 0, 0, '.', 'F', 'I', 'T', 0, 0};
  std::memcpy(header.data() + 4, &size, sizeof size);
  return header + data + std::string(2, '\0');
}

std::string pointsOf(const char* pattern, std::string text, const char* end) {
  char point[512];
  for (int second = 0; text.size() < megabyte; ++second) {
    std::snprintf(point, sizeof point, pattern, 50 + second * 1e-5, second / 3600 % 24, second / 60 % 60,
                  second % 60, 100 + second % 60);
    text += point;
  }
  return text + end;
}

std::string gpxFile() {
  return pointsOf(
      "<trkpt lat=\"%.6f\" lon=\"10\"><time>2026-03-08T%02d:%02d:%02dZ</time><extensions><t:x><t:hr>%d"
      "</t:hr></t:x></extensions></trkpt>\n",
      "<gpx><trk><trkseg>", "</trkseg></trk></gpx>");
}

std::string tcxFile() {
  return pointsOf(
      "<Trackpoint><Position><LatitudeDegrees>%.6f</LatitudeDegrees><LongitudeDegrees>10"
      "</LongitudeDegrees></Position><Time>2026-03-08T%02d:%02d:%02dZ</Time><HeartRateBpm><Value>%d"
      "</Value></HeartRateBpm></Trackpoint>\n",
      "<TrainingCenterDatabase><Activities><Activity><Lap StartTime=\"2026-03-08T00:00:00Z\"><Track>",
      "</Track></Lap></Activity></Activities></TrainingCenterDatabase>");
}

auto readByUs(std::string (*file)()) {
  return [file] {
    return [bytes = std::make_shared<std::string>(file())] {
      const auto result = ax::reader::readWorkoutFile(*bytes, "bench");
      bench::check(std::holds_alternative<WorkoutFile>(result), "a workout file cannot be read");
      benchmark::DoNotOptimize(&result);
    };
  };
}

auto readByParser(std::string (*file)()) {
  return [file] {
    return [bytes = std::make_shared<std::string>(file())] {
      pugi::xml_document document;
      bench::check(bool(document.load_buffer(bytes->data(), bytes->size())), "the parser refuses a file");
      benchmark::DoNotOptimize(&document);
    };
  };
}

// The records lie behind the header and their definition, one like the other.
auto readPlainly() {
  return [bytes = std::make_shared<std::string>(fitFile())] {
    constexpr std::size_t before = 14 + recordDefinition.size();
    std::vector<ax::reader::TrackPoint> points;
    for (std::size_t at = before; at + sizeof(Record) <= bytes->size(); at += sizeof(Record)) {
      Record record;
      std::memcpy(&record, bytes->data() + at, sizeof record);
      ax::reader::TrackPoint& point = points.emplace_back();
      point.time = record.time;
      point.latitude = record.latitude;
      point.longitude = record.longitude;
      point.distance = record.distance;
      point.heartRate = record.heartRate;
      point.altitude = record.altitude;
    }
    benchmark::DoNotOptimize(points.data());
  };
}

const bench::RegisteredSide sides[] = {
    {"fit", "ours", readByUs(fitFile)}, {"fit", "plain read", readPlainly},
    {"tcx", "ours", readByUs(tcxFile)}, {"tcx", "pugixml", readByParser(tcxFile)},
    {"gpx", "ours", readByUs(gpxFile)}, {"gpx", "pugixml", readByParser(gpxFile)}};

}  // namespace
