#include "bench/StartUp.h"

#include <dlfcn.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <filesystem>
#include <vector>

#include "bench/GeneratedCategories.h"
#include "platform/accessibility/BundleLoader.h"
#include "platform/accessibility/ValidationManager.h"

namespace bench {

namespace {

using Clock = std::chrono::steady_clock;

double microsecondsSince(Clock::time_point start) {
  return std::chrono::duration<double, std::micro>(Clock::now() - start).count();
}

std::string builtFile(const std::string& program, const std::string& relative) {
  return (std::filesystem::canonical(program).parent_path().parent_path() / relative).string();
}

int openClasses(const std::string& program) {
  const std::string path = builtFile(program, "lib/axvelto-bench-classes.so");
  const auto start = Clock::now();
  void* handle = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
  const double taken = microsecondsSince(start);
  if (handle == nullptr) return 1;
  std::printf("%f 65 0\n", taken);
  return 0;
}

int installGenerated() {
  registerGeneratedCategories();
  const auto start = Clock::now();
  const int installed = installGeneratedCategories();
  std::printf("%f %d 0\n", microsecondsSince(start), installed);
  return 0;
}

int openHost(const std::string& program) {
  const std::string host = builtFile(program, "lib/libaxvelto-host.so");
  return dlopen(host.c_str(), RTLD_NOW | RTLD_GLOBAL) == nullptr ? 1 : 0;
}

int openBundle(const std::string& program) {
  std::string error;
  const bool isOpen =
      openHost(program) == 0 &&
      ax::LoadedBundle::open(builtFile(program, "lib/AXVelto/AXVelto.so"), "AXVeltoGlue", error);
  return isOpen ? 0 : 1;
}

int startBundle(const std::string& program) {
  if (openHost(program) != 0) return 1;
  std::string error;
  const auto start = Clock::now();
  const auto bundle =
      ax::LoadedBundle::open(builtFile(program, "lib/AXVelto/AXVelto.so"), "AXVeltoGlue", error);
  const double opening = microsecondsSince(start);
  if (!bundle) return 1;
  const auto opened = Clock::now();
  bundle->start();
  const double taken = microsecondsSince(opened);
  const auto& requests = ax::ValidationManager::sharedInstance()->installationRequests();
  const auto installed =
      std::count_if(requests.begin(), requests.end(), [](const auto& request) { return request.installed; });
  std::printf("%f %d %f\n", taken, static_cast<int>(installed), opening);
  return 0;
}

struct Run {
  double taken = 0;
  int classes = 0;
  double opening = 0;
};

bool runChild(const std::string& program, const std::string& kind, Run& run) {
  std::FILE* child = popen(("'" + program + "' --start-up " + kind + " 2>/dev/null").c_str(), "r");
  if (child == nullptr) return false;
  const int fields = std::fscanf(child, "%lf %d %lf", &run.taken, &run.classes, &run.opening);
  return pclose(child) == 0 && fields == 3;
}

double median(std::vector<double> values) {
  if (values.empty()) return 0;
  std::sort(values.begin(), values.end());
  return values[values.size() / 2];
}

}  // namespace

int runStartUpChild(const std::string& kind, const std::string& program) {
  if (kind == "nothing") return 0;
  if (kind == "host") return openHost(program);
  if (kind == "opened") return openBundle(program);
  if (kind == "classes") return openClasses(program);
  return kind == "bundle" ? startBundle(program) : installGenerated();
}

StartUp measureStartUp(const std::string& program) {
  constexpr int rounds = 25;
  StartUp result;
  std::vector<double> generated, classes, bundle, opening;
  for (int i = 0; i < rounds; ++i) {
    Run run;
    if (runChild(program, "generated", run)) generated.push_back(run.taken);
    if (runChild(program, "classes", run)) classes.push_back(run.taken);
    if (!runChild(program, "bundle", run)) continue;
    bundle.push_back(run.taken);
    opening.push_back(run.opening);
    result.bundleCategories = run.classes;
  }
  result.generated = median(generated);
  result.classes = median(classes);
  result.bundle = median(bundle);
  result.opening = median(opening);
  return result;
}

}  // namespace bench
