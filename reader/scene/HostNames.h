#pragma once

#include <string>
#include <string_view>
#include <utility>

#include "platform/runtime/Class.h"

// What the runtime knows by name, members that were taken away included. Names that a scene uses are looked
// up here.
namespace ax::reader {

// Whether instances of the class answer a method, or would if it had not been taken away.
bool answersMethod(const Class& declaring, Selector selector);

// A member that `set` may name: an instance variable of this very name, or a setter "set<Key>:".
bool hasSettableMember(const Class& declaring, const std::string& key);
std::string setterName(const std::string& key);

// Whether an object answers a method by its class, or would if nothing of the host were taken away: a
// category's method counts for its target's instances also when the category was not installed.
bool mayAnswer(const Object& object, std::string_view method);

// Splits "Class.member" at the longest prefix that is a registered class; a class alone has no member. Null
// when no prefix is one. Blanks do not count.
std::pair<Class*, std::string> classAndMember(std::string_view given);

// The trailing numbers of a target: "bars.0.1" is "bars", {0, 1}.
std::pair<std::string, std::vector<std::size_t>> splitTarget(std::string_view text);

}  // namespace ax::reader
