#pragma once

#include <string>
#include <string_view>

#include "platform/foundation/AttributedString.h"
#include "platform/toolkit/View.h"
#include "reader/scene/SceneRun.h"
#include "reader/text/Fault.h"

namespace ax::reader {

// A view of the tests' own with a member of each kind, which notes what is done to it.
class SceneProbe : public View {
 public:
  static Class& staticClass();

  void layoutSubviews() override { log_ += "layout "; }
  void loadAccessibility() { log_ += "load "; }
  Ref<String> log() const { return string(log_); }
  void setNote(Ref<String> note);
  Ref<String> note() const { return note_; }
  std::int64_t valueAt(std::int64_t index, Ref<String>) { return -index; }
  bool isReady() { return false; }
  void fail() { throw std::runtime_error("out of order"); }

 private:
  bool flag_ = false;
  std::int32_t small_ = 0;
  std::uint64_t large_ = 0;
  float fraction_ = 0;
  Point place_;
  Ref<View> partner_;
  Ref<AttributedString> styled_;
  Ref<Object> anything_;
  Weak<View> weakly_;
  Ref<String> note_;
  std::string log_;
};

// A scene with these top-level members beside its format.
std::string sceneText(std::string_view members);

// The run of a scene that is whole, kept together with it.
struct StandingScene {
  explicit StandingScene(std::string_view members, const SceneRunOptions& options = {})
      : scene(readScene(sceneText(members), "test.json")), run(scene, options) {}
  Scene scene;
  SceneRun run;
};

// The fault of reading and running a scene; an empty one when there is none.
Fault faultOf(const std::string& text);

}  // namespace ax::reader
