#include "tests/proof/HostMembers.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <set>

#include "platform/foundation/Array.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/Signature.h"

namespace ax::proof {

namespace {

// The texts of a file that end with a zero, and each part of them that could be a name in a key path.
class NamesIn {
 public:
  explicit NamesIn(const std::string& file) {
    std::ifstream in(file, std::ios::binary);
    const std::string bytes{std::istreambuf_iterator<char>(in), {}};
    std::string word;
    for (const char c : bytes) {
      const bool isInName = std::isalnum(static_cast<unsigned char>(c)) || c == '_' || c == ':';
      if (isInName) {
        word += c;
      } else {
        if (word.size() > 1 && (c == '\0' || c == '.')) keep(word);
        word.clear();
      }
    }
  }

  bool hold(std::string_view name) const {
    const auto found = names_.lower_bound(reversed(name));
    return found != names_.end() && found->starts_with(reversed(name));
  }

 private:
  static std::string reversed(std::string_view text) { return {text.rbegin(), text.rend()}; }
  // A linker lets a text be the end of another, so that names are looked up from their ends.
  void keep(std::string_view word) { names_.insert(reversed(word)); }

  std::set<std::string> names_;
};

MemberKind kindOfCode(std::string_view code) {
  if (code == "v") return MemberKind::nothing;
  if (code == "B") return MemberKind::flag;
  if (code.starts_with('{')) return MemberKind::geometry;
  return code.size() == 1 && std::string_view("qQiIdf").find(code[0]) != code.npos ? MemberKind::scalar
                                                                                   : MemberKind::object;
}

MemberKind kindOf(const InstanceVariable& variable) {
  const std::string type = variable.type();
  if (type == "Array" || type == "MutableArray") return MemberKind::array;
  if (type == "Number") return MemberKind::number;
  return Class::named(type) != nullptr ? MemberKind::object : kindOfCode(type);
}

MemberKind kindOf(const Method& method) {
  if (method.result == identityOf<Ref<Array>>()) return MemberKind::array;
  if (method.result == identityOf<Ref<Number>>()) return MemberKind::number;
  return kindOfCode(method.signature->encodings[0]);
}

}  // namespace

std::string HostMember::name() const {
  return (declaring->isMetaclass() ? "+" : "") + declaring->name() + "." + std::string(selector.name());
}

std::vector<HostMember> membersNamedIn(const std::string& module, const std::vector<Class*>& classes) {
  const NamesIn names(module);
  std::vector<HostMember> members;
  for (Class* named : classes) {
    named->forEachOwnInstanceVariable([&](const InstanceVariable& variable) {
      if (names.hold(variable.selector.name()))
        members.push_back({named, variable.selector, &variable, nullptr, kindOf(variable)});
    });
    for (Class* table : {named, &named->metaclass()}) {
      table->forEachOwnMethod([&](const Method& method) {
        if (names.hold(method.selector.name()))
          members.push_back({table, method.selector, nullptr, &method, kindOf(method)});
      });
    }
  }
  std::ranges::sort(members, {}, &HostMember::name);
  return members;
}

}  // namespace ax::proof
