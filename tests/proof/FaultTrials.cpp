#include <algorithm>
#include <chrono>
#include <cstdio>
#include <thread>

#include "host/core/HostApp.h"
#include "platform/accessibility/ValidationManager.h"
#include "tests/proof/Child.h"
#include "tests/proof/Interview.h"
#include "tests/proof/MemberFaults.h"
#include "tests/proof/Proofs.h"
#include "tests/tour/Samples.h"

namespace ax::proof {

namespace {

using Json = nlohmann::ordered_json;

constexpr unsigned longestTrial = 200;

struct Sample {
  std::string name;
  reader::Scene scene;
  Interview asItIs;  // without a fault
};

struct Trial {
  std::size_t member;
  const MemberFault* fault;
};

struct Outcome {
  std::size_t questions = 0;
  std::vector<std::string> faults;
};

// What stands before any trial: everything is loaded and read, and nothing started.
class Bench {
 public:
  Bench() : module_(tour::modulePath()) {
    host::linkHost();
    const std::vector<Class*> classesOfHost = Class::all();
    std::string error;
    bundle_ = LoadedBundle::open(module_, "AXVeltoGlue", error);
    members_ = membersNamedIn(module_, classesOfHost);
    for (const auto& file : tour::sampleScenes()) {
      const std::string name = file.filename().string();
      samples_.push_back({name, reader::readScene(tour::fileText(file), name), {}});
    }
  }

  const std::vector<HostMember>& members() const { return members_; }

  // Asks every sample without a fault, and answers what is wrong even then.
  std::vector<std::string> recordBaseline() {
    const ChildEnd end = runInChild(
        [this] { return recorded().dump(-1, ' ', false, Json::error_handler_t::replace); }, longestTrial);
    if (!end.failure.empty()) return {"without a fault: " + end.failure};
    const Json json = Json::parse(end.result);
    std::vector<std::string> faults = json["faults"];
    for (std::size_t i = 0; i < samples_.size(); ++i) {
      samples_[i].asItIs = interviewOf(json["samples"][i]);
      const auto& raised = samples_[i].asItIs.faults;
      faults.insert(faults.end(), raised.begin(), raised.end());
    }
    return faults;
  }

  // A member that no sample reads or calls is missing, or of another type: other faults of it show nowhere.
  bool isTried(const Trial& trial) const {
    return trial.fault->isFor(members_[trial.member].kind) &&
           (!trial.fault->answer || std::ranges::any_of(samples_, [&](const Sample& sample) {
             return sample.asItIs.touched().contains(trial.member);
           }));
  }

  std::string nameOf(const Trial& trial) const {
    return members_[trial.member].name() + " " + std::string(trial.fault->name);
  }

  Outcome run(const Trial& trial) const {
    const ChildEnd end =
        runInChild([&] { return faultsDuring(trial).dump(-1, ' ', false, Json::error_handler_t::replace); },
                   longestTrial);
    if (!end.failure.empty()) return {0, {end.failure}};
    const Json json = Json::parse(end.result);
    return {json["questions"], json["faults"]};
  }

 private:
  Json recorded() {
    watchMembers(members_);
    bundle_->start();
    Json samples = Json::array();
    for (const Sample& sample : samples_) samples.push_back(jsonOf(interview(sample.scene, module_)));
    Json faults = Json::array();
    for (const ContractCheck& check : ValidationManager::sharedInstance()->checks()) {
      const bool isMember = check.kind != CheckKind::classExists && check.kind != CheckKind::kindOfClass &&
                            check.kind != CheckKind::protocol;
      if (isMember && std::ranges::none_of(members_, [&](const HostMember& member) {
            return member.selector.name() == check.member;
          }))
        faults.push_back(check.description() + ", which the contract checks, is not among the members");
    }
    return {{"samples", samples}, {"faults", faults}};
  }

  // Those that the fault can reach; all of them for a few faults, which others stand for.
  bool isPresented(const Sample& sample, const Trial& trial) const {
    return !trial.fault->answer || trial.fault->name == "raising" ||
           sample.asItIs.touched().contains(trial.member);
  }

  Json faultsDuring(const Trial& trial) const {
    breakMember(members_[trial.member], *trial.fault);
    bundle_->start();
    std::size_t questions = 0;
    Json faults = Json::array();
    for (const Sample& sample : samples_) {
      if (!isPresented(sample, trial)) continue;
      const Interview now = interview(sample.scene, module_);
      questions += now.questions;
      const bool changesType = trial.fault->name == "of another type";
      if (!now.refusal.empty() && !changesType) faults.push_back(sample.name + ": " + now.refusal);
      for (const std::string& raised : now.faults) faults.push_back(sample.name + ": " + raised);
      for (const std::string& place :
           changedIn(sample.asItIs, now, trial.member, members_[trial.member], changesType))
        faults.push_back(sample.name + ": " + place);
    }
    return {{"questions", questions}, {"faults", faults}};
  }

  // Asking an object may set something on what it holds.
  static bool dependsOn(const Interview& before, std::string place, std::size_t member) {
    while (true) {
      const auto found = before.objects.find(place);
      if (found != before.objects.end() && found->second.touched.contains(member)) return true;
      if (place.empty()) return false;
      place.resize(place.find_last_of("/#"));
    }
  }

  // What does not depend on the member, and answers otherwise all the same.
  static std::vector<std::string> changedIn(const Interview& before, const Interview& now, std::size_t member,
                                            const HostMember& faulty, bool changesType) {
    std::vector<std::string> changed;
    if (now.objects.empty()) return changed;  // the scene could not set what it sets
    const auto isOnTheWay = [name = "/" + std::string(faulty.selector.name())](const std::string& place) {
      return place.find(name) != std::string::npos;
    };
    // What stands in front of a method is left to the host once that is of another type.
    const auto hasMethod = [&](const ObjectAnswers& answers) {
      const Class* c = Class::named(answers.text.substr(0, answers.text.find('\n')));
      return faulty.method != nullptr && changesType && c != nullptr && c->isSubclassOf(*faulty.declaring);
    };
    for (const auto& [place, answers] : before.objects) {
      if (before.whilePresented.contains(member) || isOnTheWay(place) || hasMethod(answers) ||
          dependsOn(before, place, member))
        continue;
      const auto found = now.objects.find(place);
      if (found == now.objects.end()) {
        changed.push_back(place + " is gone: " + answers.text.substr(0, answers.text.find('\n')));
      } else if (found->second.text != answers.text) {
        changed.push_back(place + " answers otherwise: " + firstDifference(answers.text, found->second.text));
      }
    }
    if (!before.whileRead.contains(member) && before.transcript != now.transcript)
      changed.push_back("it is spoken otherwise: " +
                        firstDifference(joined(before.transcript), joined(now.transcript)));
    return changed;
  }

  static std::string joined(const std::vector<std::string>& lines) {
    std::string text;
    for (const std::string& line : lines) text.append(line).append("\n");
    return text;
  }

  static std::string firstDifference(const std::string& before, const std::string& now) {
    const auto [a, b] = std::ranges::mismatch(before, now);
    const auto lineAt = [](const std::string& text, auto at) {
      const std::size_t start = text.rfind('\n', std::size_t(at - text.begin())) + 1;
      return text.substr(start, std::min<std::size_t>(text.find('\n', start) - start, 120));
    };
    return lineAt(before, a) + " | " + lineAt(now, b);
  }

  std::string module_;
  std::unique_ptr<LoadedBundle> bundle_;
  std::vector<HostMember> members_;
  std::vector<Sample> samples_;
};

std::vector<Trial> trialsOf(const Bench& bench, const Selection& selection) {
  std::vector<Trial> trials;
  for (std::size_t member = 0; member < bench.members().size(); ++member) {
    for (const MemberFault& fault : memberFaults()) {
      if (bench.isTried({member, &fault})) trials.push_back({member, &fault});
    }
  }
  std::vector<Trial> selected;
  for (std::size_t i = 0; i < trials.size(); ++i) {
    const bool isInPart = i % selection.of == selection.part;
    if (isInPart && bench.nameOf(trials[i]).find(selection.words) != std::string::npos)
      selected.push_back(trials[i]);
  }
  return selected;
}

std::size_t printFaults(const std::vector<std::string>& faults, const std::string& where) {
  for (const std::string& fault : faults) std::printf("%s: %s\n", where.c_str(), fault.c_str());
  std::fflush(stdout);
  return faults.size();
}

// Every `step`th trial from `first` on.
Tally runEvery(const Bench& bench, const std::vector<Trial>& trials, std::size_t first, std::size_t step) {
  Tally tally;
  for (std::size_t i = first; i < trials.size(); i += step) {
    const Outcome outcome = bench.run(trials[i]);
    tally.questions += outcome.questions;
    if (outcome.faults.empty()) continue;
    ++tally.failed;
    printFaults(outcome.faults, "scripts/faults '" + bench.nameOf(trials[i]) + "'");
  }
  return tally;
}

}  // namespace

bool proveFaults(const Selection& selection) {
  const auto start = std::chrono::steady_clock::now();
  Bench bench;
  if (printFaults(bench.recordBaseline(), "without a fault") != 0) return false;
  const std::vector<Trial> trials = trialsOf(bench, selection);
  const std::size_t workers = std::max(1u, std::thread::hardware_concurrency());
  std::set<std::size_t> members;
  for (const Trial& trial : trials) members.insert(trial.member);
  const Tally tally =
      onWorkers(workers, [&](std::size_t worker) { return runEvery(bench, trials, worker, workers); });
  const std::chrono::duration<double> seconds = std::chrono::steady_clock::now() - start;
  std::printf("%zu members of the host, %zu kinds of faults, %zu runs, %zu questions, %.0f s: ",
              members.size(), memberFaults().size(), trials.size(), tally.questions, seconds.count());
  std::printf("%zu with a fault\n", tally.failed);
  return tally.failed == 0 && !trials.empty();
}

}  // namespace ax::proof
