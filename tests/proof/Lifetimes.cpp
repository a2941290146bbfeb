#include <malloc.h>

#include <cstdio>

#include "host/core/HostApp.h"
#include "platform/foundation/BackgroundQueue.h"
#include "platform/runtime/Weak.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/View.h"
#include "reader/snapshot/Snapshot.h"
#include "tests/proof/Interview.h"
#include "tests/proof/Proofs.h"
#include "tests/tour/Samples.h"

#ifdef __SANITIZE_ADDRESS__
// The address sanitizer has an allocator of its own; g++ has no header for it.
extern "C" std::size_t __sanitizer_get_current_allocated_bytes();
#endif

namespace ax::proof {

namespace {

struct Watched {
  std::string what;
  Weak<Object> object;
};

struct ScreenLife {
  std::size_t objects = 0;
  std::vector<std::string> left;
};

void watchElements(const PlacedObject& at, std::vector<Watched>& watched) {
  const Ref<Array> elements = messages::accessibilityElements(at.object);
  if (!elements) return;
  for (const Ref<Object>& element : *elements)
    watched.push_back({at.place + "# " + element->isa().name(), element});
}

// Presents a screen, reads it, asks all of its objects everything, sends them every hook, and drops it.
ScreenLife live(const reader::Scene& scene, const std::string& module) {
  std::vector<Watched> watched;
  {
    reader::SceneRun run(scene, {.modulePath = module});
    Interview answers;
    reader::takeSnapshot(run.screen());
    for (const PlacedObject& at : objectsHeldBy(run)) {
      if (cast<Class>(at.object.get()) != nullptr) continue;
      watched.push_back({at.place + " " + at.object->isa().name(), at.object});
      watchElements(at, watched);
      askEverything(*at.object, answers);
      sendHooks(*at.object, answers, 1);  // or it would hold itself
      watchElements(at, watched);
    }
  }
  waitForBackgroundTasks();
  ScreenLife life{watched.size(), {}};
  for (const Watched& each : watched) {
    if (each.object.lock()) life.left.push_back(each.what);
  }
  return life;
}

bool proveScreens(const std::string& module) {
  std::size_t screens = 0;
  std::size_t objects = 0;
  std::size_t left = 0;
  for (const auto& file : tour::sampleScenes()) {
    const std::string name = file.filename().string();
    const reader::Scene scene = reader::readScene(tour::fileText(file), name);
    // What the module makes once in a process is made the first time.
    for (const int time : {1, 2}) {
      const ScreenLife life = live(scene, module);
      for (const std::string& what : life.left)
        std::printf("%s, time %d: left over: %s\n", name.c_str(), time, what.c_str());
      objects += life.objects;
      left += life.left.size();
      ++screens;
    }
  }
  std::printf("%zu screens, %zu objects, %zu left over\n", screens, objects, left);
  return left == 0 && objects != 0;
}

std::size_t bytesInUse() {
#ifdef __SANITIZE_ADDRESS__
  return __sanitizer_get_current_allocated_bytes();
#else
  return mallinfo2().uordblks;
#endif
}

// A list of cells, each with its parts: made, laid out, loaded, read, and dropped.
void liveAsCells(const Class& cellClass, std::size_t count) {
  std::vector<Ref<Object>> cells;
  for (std::size_t i = 0; i < count; ++i) {
    const Ref<Object> cell = cellClass.instantiate();
    messages::layoutSubviews(cell);
    messages::_accessibilityLoadAccessibilityInformation(cell);
    messages::accessibilityLabel(cell);
    messages::accessibilityElements(cell);
    cells.push_back(cell);
  }
}

constexpr std::size_t cellsAtOnce = 10'000;
constexpr std::size_t rounds = 100;

// The allocator's own figure of bytes in use is exact. Nothing may be added after the second round but what
// the library's pools may round: a hundredth of a byte for every cell that was made.
constexpr std::size_t mostGrowth = cellsAtOnce * rounds / 100;

bool proveCells() {
  bool holds = true;
  for (const char* name :
       {"CHWorkoutsListTableViewCell", "CHFriendListTableViewCell", "ActivityThreeRingCell"}) {
    std::size_t afterSecond = 0;
    for (std::size_t round = 1; round <= rounds; ++round) {
      liveAsCells(*Class::named(name), cellsAtOnce);
      waitForBackgroundTasks();
      if (round == 2) afterSecond = bytesInUse();
    }
    const std::size_t afterLast = bytesInUse();
    std::printf("%s: %zu cells %zu times: %zu bytes in use after the second, %zu after the last\n", name,
                cellsAtOnce, rounds, afterSecond, afterLast);
    holds = holds && afterLast <= afterSecond + mostGrowth;
  }
  return holds;
}

}  // namespace

bool proveLifetimes() {
  host::linkHost();
  const bool screensEnd = proveScreens(tour::modulePath());
  return proveCells() && screensEnd;
}

}  // namespace ax::proof
