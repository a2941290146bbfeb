#include "apps/axvelto/SceneCharts.h"

#include "reader/snapshot/Charts.h"

namespace ax::app {

SceneCharts::SceneCharts(ShownScene& shown, const std::string& id) {
  if (!id.empty()) {
    const Ref<Object> object = shown.run().objectWithId(id);
    if (!object) {
      throw reader::Fault{shown.scene().file, "--of", "no object \"" + id + "\"", "an id of the scene"};
    }
    add(shown.snapshotOf(object));
    return;
  }
  if (shown.run().screen()) add(shown.snapshot());
  for (const Ref<Object>& object : shown.run().objects()) add(shown.snapshotOf(object));
}

void SceneCharts::add(reader::Snapshot snapshot) {
  const reader::Snapshot& kept = snapshots_.emplace_back(std::move(snapshot));
  for (const reader::Node* chart : reader::charts(kept)) {
    if (known_.insert(kept.object(chart->id).get()).second) found_.emplace_back(&kept, chart);
  }
}

}  // namespace ax::app
