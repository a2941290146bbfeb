#pragma once

#include <deque>
#include <map>
#include <nlohmann/json.hpp>
#include <set>
#include <string>
#include <vector>

#include "reader/scene/SceneRun.h"

namespace ax::proof {

// What one object answered to everything, and what members of the host that took.
struct ObjectAnswers {
  std::string text;
  std::set<std::size_t> touched;
};

// What one screen answered: presented, asked object by object, sent every hook, and read as a listener meets
// it.
struct Interview {
  std::map<std::string, ObjectAnswers> objects;  // by their places: "/0/3", "/0/_titleLabel", "/0#2"
  std::vector<std::string> transcript;
  std::set<std::size_t> whilePresented, whileRead, byHooks;  // what members all of it took
  std::size_t questions = 0;
  std::vector<std::string> faults;  // what an override raised, and might not
  std::string refusal = {};         // why the scene could not be made: a member does not take what it sets

  std::set<std::size_t> touched() const;
};

nlohmann::ordered_json jsonOf(const Interview& interview);
Interview interviewOf(const nlohmann::ordered_json& json);

// The module must have been started by the scene's run, or is by this one.
Interview interview(const reader::Scene& scene, const std::string& module);

struct PlacedObject {
  std::string place;
  Ref<Object> object;
};

// Every object of a screen as the toolkit and the instance variables of the host hold it.
std::deque<PlacedObject> objectsHeldBy(const reader::SceneRun& run);
// Asks an object every question that any category of the module answers.
std::string askEverything(Object& object, Interview& into);
// Sends an object every life-cycle message and setter that any category of the module answers.
// Rounds after the first hand it to itself.
void sendHooks(Object& object, Interview& into, std::size_t rounds = 3);

}  // namespace ax::proof
