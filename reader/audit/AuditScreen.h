#pragma once

#include <functional>
#include <set>
#include <string>
#include <vector>

#include "reader/audit/LanguageWords.h"
#include "reader/snapshot/ShownContent.h"

namespace ax::reader {

// What a listener stops at, as it is spoken.
struct AuditedElement {
  const Node* node;
  std::size_t place;  // in reading order, from 1
  std::string line;
};

// One screen in one language with everything that the rules look at: plain values, made while the screen
// stood and its language was in force. It owns the snapshot that its elements point into, so it is moved,
// never copied.
struct AuditScreen {
  std::string file;
  std::string locale;
  bool isRightToLeft = false;
  std::string separator;               // between spoken parts
  std::vector<std::string> roleWords;  // what the reader says for roles
  std::set<std::string> names;         // of people and places: the same in every language
  LanguageWords words;                 // of the language
  Snapshot snapshot;
  ShownContent shown;
  std::vector<AuditedElement> elements;

  AuditScreen() = default;
  AuditScreen(AuditScreen&&) = default;
  AuditScreen& operator=(AuditScreen&&) = default;
  AuditScreen(const AuditScreen&) = delete;
  AuditScreen& operator=(const AuditScreen&) = delete;
};

// Reads a screen that stands, in the language of the environment. Main thread only.
AuditScreen readAuditScreen(Snapshot snapshot, ShownContent shown, LanguageWords words);

// How many seconds a voice takes to say a text in a locale at a normal rate; below 0 where it has no voice.
using SpeakingTime = std::function<double(const std::string& text, const std::string& locale)>;

// The screens of one file, one in each language that it is audited in.
struct Audit {
  std::vector<AuditScreen> screens;
  SpeakingTime speakingTime;  // may be empty: then nothing is timed
};

}  // namespace ax::reader
