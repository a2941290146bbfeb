#include <gtest/gtest.h>

#include <filesystem>

#include "tests/fuzz/Targets.h"
#include "tests/tour/Samples.h"

namespace ax::fuzz {
namespace {

struct Target {
  const char* name;
  void (*run)(Bytes);
};

constexpr Target targets[] = {{"dates", fuzzDates},   {"messages", fuzzMessages}, {"pace", fuzzPace},
                              {"scenes", fuzzScenes}, {"times", fuzzTimes},       {"workouts", fuzzWorkouts}};

TEST(FuzzTest, EveryInputOfAFaultIsTakenWithoutOne) {
  for (const Target& target : targets) {
    const auto folder = tour::samplesFolder() / "../tests/fuzz/found" / target.name;
    std::size_t inputs = 0;
    for (const auto& entry : std::filesystem::directory_iterator(folder)) {
      const std::string bytes = tour::fileText(entry.path());
      EXPECT_NO_THROW(target.run({reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size()}))
          << entry.path();
      ++inputs;
    }
    EXPECT_GT(inputs, 0u) << folder;
  }
}

}  // namespace
}  // namespace ax::fuzz
