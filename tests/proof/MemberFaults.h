#pragma once

#include <functional>
#include <set>
#include <stdexcept>
#include <string_view>
#include <vector>

#include "tests/proof/HostMembers.h"

// Members of the host that answer something else than they should.
namespace ax::proof {

// What a faulty member raises.
struct MemberRaised : std::runtime_error {
  explicit MemberRaised(Selector raising) : std::runtime_error("a faulty member raised"), selector(raising) {}
  Selector selector;
};

using OwnAnswer = std::function<Ref<Object>()>;

struct MemberFault {
  std::string_view name;
  bool (*isFor)(MemberKind);
  // None where the member itself changes: it is missing, or of another type.
  std::function<Ref<Object>(Object& receiver, const HostMember& member, const OwnAnswer& own)> answer;
};

const std::vector<MemberFault>& memberFaults();

// Puts a fault in place before the module starts.
void breakMember(const HostMember& member, const MemberFault& fault);
// Writes down from now on that members are read or called.
void watchMembers(const std::vector<HostMember>& members);
// The numbers of those that were, since the last call.
std::set<std::size_t> takeTouched();

// While one stands, members answer as they should, and nothing is written down.
class WithoutFaults {
 public:
  WithoutFaults();
  ~WithoutFaults();
};

}  // namespace ax::proof
