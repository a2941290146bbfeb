#include "bench/Sides.h"

#include <algorithm>
#include <map>

namespace bench {

namespace {

std::vector<Side>& sides() {
  static std::vector<Side> all;
  return all;
}

std::map<std::string, std::vector<double>>& samples() {
  static std::map<std::string, std::vector<double>> all;
  return all;
}

std::string nameOf(const Side& side) {
  return side.operation + " | " + side.name;
}

class Collector final : public benchmark::BenchmarkReporter {
 public:
  bool ReportContext(const Context&) override { return true; }
  void ReportRuns(const std::vector<Run>& runs) override {
    for (const Run& run : runs) {
      if (run.run_type != Run::RT_Iteration || run.iterations == 0) continue;
      samples()[run.run_name.function_name].push_back(run.cpu_accumulated_time * 1e9 /
                                                      static_cast<double>(run.iterations));
    }
  }
};

double median(std::vector<double> values) {
  if (values.empty()) return 0;
  const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
  std::nth_element(values.begin(), middle, values.end());
  return *middle;
}

}  // namespace

void addSide(Side side) {
  sides().push_back(std::move(side));
}

const Side* sideOf(const std::string& operation, const std::string& name) {
  const auto found = std::find_if(sides().begin(), sides().end(), [&](const Side& side) {
    return side.operation == operation && side.name == name;
  });
  return found == sides().end() ? nullptr : &*found;
}

void runSides() {
  static std::size_t done = 0;
  benchmark::ClearRegisteredBenchmarks();
  for (; done < sides().size(); ++done)
    benchmark::RegisterBenchmark(nameOf(sides()[done]).c_str(), sides()[done].body);
  std::vector<std::string> options = {"axvelto-bench", "--benchmark_enable_random_interleaving=true",
                                      "--benchmark_repetitions=15", "--benchmark_min_time=0.02"};
  std::vector<char*> arguments;
  for (std::string& option : options) arguments.push_back(option.data());
  int count = static_cast<int>(arguments.size());
  benchmark::Initialize(&count, arguments.data());
  Collector collector;
  benchmark::RunSpecifiedBenchmarks(&collector);
}

std::vector<Timing> timingsOf(const std::string& operation) {
  std::vector<Timing> timings;
  for (const Side& side : sides()) {
    if (side.operation == operation)
      timings.push_back({side.name, median(samples()[nameOf(side)]) / side.items});
  }
  return timings;
}

}  // namespace bench
