#include "reader/scene/SceneRun.h"

#include "platform/accessibility/Notifications.h"
#include "platform/health/ActivitySummary.h"
#include "platform/runtime/Message.h"
#include "reader/contract/ContractReport.h"
#include "reader/scene/HostNames.h"
#include "reader/scene/Mirroring.h"
#include "reader/scene/ObjectBuilder.h"
#include "reader/scene/Omissions.h"
#include "reader/scene/Raised.h"
#include "reader/scene/ScreenPresenter.h"
#include "reader/scene/StepRunner.h"

namespace ax::reader {

namespace {

using Json = nlohmann::ordered_json;

constexpr const char* principalClass = "AXVeltoGlue";

// Nothing is kept by a host that lost its cache, or a member of it. Nil forgets the day. Answers what the
// host raised, if it did.
std::optional<std::string> keepSummary(const Ref<ActivitySummary>& summary, const SceneDay& day) {
  static const Message<Ref<Object>()> sharedInstance{"sharedInstance"};
  static const Message<void(Ref<Object>, std::int64_t)> setSummaryForCacheIndex{"setSummary:forCacheIndex:"};
  return raisedBy([&] {
    setSummaryForCacheIndex(sharedInstance(Class::named("ActivitySummaryCache")), summary, day.index);
  });
}

void keepDay(const SceneDay& day, std::vector<std::string>& hostFaults) {
  const Ref<ActivitySummary> summary = make<ActivitySummary>();
  summary->setFractions(day.move, day.exercise, day.stand);
  const auto raised = keepSummary(summary, day);
  if (raised) hostFaults.push_back("ActivitySummaryCache, keeping a day: " + *raised);
}

// All classes stand once the module is open.
void checkKnown(const SceneTarget& target, const std::string& file) {
  if (Class::namedEvenIfHidden(splitTarget(target.text).first) != nullptr) return;
  throw unknownTarget(target, file);
}

Json postedJson(const StepRunner& runner) {
  Json list = Json::array();
  for (const PostedNotification& posted : postedNotifications()) {
    list.push_back(
        {{"name", notificationName(posted.notification)}, {"argument", runner.asJson(posted.argument)}});
  }
  return list;
}

Json assertionsJson() {
  Json list = Json::array();
  for (const FailedAssertion& failed : failedAssertions()) {
    list.push_back({{"message", failed.message},
                    {"source", failed.source},
                    {"line", failed.line},
                    {"function", failed.function}});
  }
  return list;
}

}  // namespace

SceneRun::SceneRun(const Scene& scene, const SceneRunOptions& options)
    : scene_(scene), builder_(std::make_unique<ObjectBuilder>(scene.file)) {
  forgetReports();
  scene.environment.apply(Environment());
  for (const std::string& name : options.without) checkOmission({"", name}, "--without");
  for (const HostOmission& omission : scene.without) takeAway(omission.name);
  for (const std::string& name : options.without) takeAway(name);
  if (!options.modulePath.empty()) openBundle(options.modulePath);
  for (const SceneTarget& target : scene.moduleNames) checkKnown(target, scene.file);
  for (const SceneDay& day : scene.days) keepDay(day, hostFaults_);
  makeObjects();
  if (!screen_) return;
  if (scene.isMirrored) {
    mirror(screen_, [this](const Object& object) { return builder_->isPlaced(object); });
  }
  ScreenPresenter presenter;
  presenter.present(screen_);
  hostFaults_.insert(hostFaults_.end(), presenter.hostFaults().begin(), presenter.hostFaults().end());
}

SceneRun::~SceneRun() {
  for (const SceneDay& day : scene_.days) keepSummary(nullptr, day);
}

void SceneRun::openBundle(const std::string& modulePath) {
  std::string error;
  bundle_ = LoadedBundle::open(modulePath, principalClass, error);
  if (!bundle_) throw Fault{modulePath, "", error, "an accessibility bundle"};
  bundle_->start();
}

void SceneRun::makeObjects() {
  if (const Ref<Object> title = builder_->value(scene_.title)) title_ = title->description();
  for (const SceneObject& object : scene_.objects) builder_->allocate(object);
  if (scene_.screen) builder_->allocate(*scene_.screen);
  for (const SceneObject& object : scene_.objects) objects_.push_back(builder_->build(object));
  if (scene_.screen) screen_ = builder_->build(*scene_.screen);
}

Ref<Object> SceneRun::objectWithId(const std::string& id) const {
  return builder_->table().withId(id);
}

const std::string& SceneRun::idOf(const Object& object) const {
  return builder_->table().idOf(object);
}

Json SceneRun::runSteps() {
  StepRunner runner(*builder_, bundle_.get());
  Json results = Json::array();
  replies_.clear();
  for (std::size_t i = 0; i < scene_.steps.size(); ++i) {
    Json result = runner.run(scene_.steps[i], i);
    replies_.push_back(result.is_null() ? std::nullopt : std::optional(result["reply"]));
    if (!result.is_null()) results.push_back(std::move(result));
  }
  return {{"results", std::move(results)},
          {"notifications", postedJson(runner)},
          {"assertions", assertionsJson()},
          {"contractFailures", ContractReport::ofProcess().failuresJson()}};
}

}  // namespace ax::reader
