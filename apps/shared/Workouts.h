#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <string_view>
#include <vector>

#include "apps/shared/Opening.h"
#include "reader/importers/WorkoutFile.h"
#include "reader/scene/Scene.h"

namespace ax::app {

// The workouts of the files of one command, read one after the other. Of several only what a list needs is
// kept, unless one of them is asked for by its number. The same workout in two files counts once; that, and
// damage that was read around, is told on standard error.
class Workouts {
 public:
  explicit Workouts(const Opening& opening) : opening_(opening) {}

  // A workout file. Throws a Fault and adds nothing when it cannot be read.
  void add(const std::string& name, std::string_view bytes);
  bool isEmpty() const { return kept_.empty(); }
  // One workout in detail, several as a list, for the locale and the time zone of the command. Throws a Fault
  // when there is none of the number that is asked for.
  nlohmann::ordered_json scene() const;

 private:
  struct Kept {
    std::string file;
    std::size_t number;  // of the file: two may have one name, and workouts of one file are never the same
    reader::WorkoutActivity activity;
  };
  void keep(const std::string& file, reader::WorkoutActivity activity);
  bool isKnown(const std::string& file, const reader::WorkoutActivity& activity);

  const Opening& opening_;
  std::size_t files_ = 0;
  std::vector<Kept> kept_;
};

// What an archive holds, or the file itself: each is handed to `onFile`. A fault of one is told on standard
// error and answers false in the end, and the others go on; a fault of the whole is thrown.
bool forEachUnpacked(const std::string& name, const Opening& opening,
                     const std::function<void(const std::string&, std::string_view)>& onFile);

// The scene of the one input of a command: as it is, unpacked or made of workouts. Throws a Fault.
reader::Scene readInputScene(const Opening& opening);

}  // namespace ax::app
