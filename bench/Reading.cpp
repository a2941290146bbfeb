#include <array>
#include <functional>
#include <memory>
#include <string>

#include "bench/Sides.h"
#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"

// Reading an object by key, beside tables written for nothing else.
namespace {

using namespace ax;

class Host : public Object {
 public:
  static Class& staticClass();

  Ref<String> v0 = string("0"), v1 = string("1"), v2 = string("2"), v3 = string("3"), v4 = string("4"),
              v5 = string("5"), v6 = string("6"), v7 = string("7");
};

Class& Host::staticClass() {
  static Class& result = ClassBuilder<Host>("Bench.Host", Object::staticClass())
                             .instanceVariable<&Host::v0>("_titleLabel")
                             .instanceVariable<&Host::v1>("_valueLabel")
                             .instanceVariable<&Host::v2>("_distanceLabel")
                             .instanceVariable<&Host::v3>("_durationLabel")
                             .instanceVariable<&Host::v4>("_activeEnergyLabel")
                             .instanceVariable<&Host::v5>("_paceLabel")
                             .instanceVariable<&Host::v6>("_weatherConditionImageView")
                             .instanceVariable<&Host::v7>("_numberOfWorkoutsLabel")
                             .build();
  return result;
}

// The least that a table from interned keys to members can be: a power of two of slots, each an address and
// an offset.
class InternedTable {
 public:
  void add(const void* key, std::size_t offset) { slots_[slotOf(key)] = {key, offset}; }
  std::size_t find(const void* key) const { return slots_[slotOf(key)].offset; }

 private:
  struct Slot {
    const void* key = nullptr;
    std::size_t offset = 0;
  };
  std::size_t slotOf(const void* key) const {
    std::size_t i = (reinterpret_cast<std::uintptr_t>(key) >> 6) & (slots_.size() - 1);
    while (slots_[i].key != nullptr && slots_[i].key != key) i = (i + 1) & (slots_.size() - 1);
    return i;
  }
  std::array<Slot, 32> slots_;
};

// The same for texts: hashed by the standard library, compared once.
class TextTable {
 public:
  void add(std::string_view key, std::size_t offset) { slots_[slotOf(key)] = {key, offset}; }
  std::size_t find(std::string_view key) const { return slots_[slotOf(key)].offset; }

 private:
  struct Slot {
    std::string_view key = {};
    std::size_t offset = 0;
  };
  std::size_t slotOf(std::string_view key) const {
    std::size_t i = std::hash<std::string_view>()(key) & (slots_.size() - 1);
    while (!slots_[i].key.empty() && slots_[i].key != key) i = (i + 1) & (slots_.size() - 1);
    return i;
  }
  std::array<Slot, 32> slots_;
};

constexpr std::array<std::string_view, 8> names = {"_titleLabel",
                                                   "_valueLabel",
                                                   "_distanceLabel",
                                                   "_durationLabel",
                                                   "_activeEnergyLabel",
                                                   "_paceLabel",
                                                   "_weatherConditionImageView",
                                                   "_numberOfWorkoutsLabel"};

std::size_t offsetOf(const Host& host, int index) {
  const std::array<const Ref<String>*, 8> fields = {&host.v0, &host.v1, &host.v2, &host.v3,
                                                    &host.v4, &host.v5, &host.v6, &host.v7};
  return static_cast<std::size_t>(reinterpret_cast<const char*>(fields[index]) -
                                  reinterpret_cast<const char*>(&host));
}

Ref<Object> load(const Host& host, std::size_t offset) {
  return *reinterpret_cast<const Ref<String>*>(reinterpret_cast<const char*>(&host) + offset);
}

// Each of the eight members in turn.
template <class Read>
auto readAll(Read read) {
  return [host = make<Host>(), read] {
    const Host* receiver = host.get();
    for (int i = 0; i < bench::batch; i += 8) {
      benchmark::DoNotOptimize(receiver);
      read(*receiver);
    }
  };
}

template <class Value>
void keep(const Value& value) {
  benchmark::DoNotOptimize(value.get());
}

auto readByLiteral() {
  return readAll([](const Host& host) {
    keep(host.safeValueForKey("_titleLabel"_key));
    keep(host.safeValueForKey("_valueLabel"_key));
    keep(host.safeValueForKey("_distanceLabel"_key));
    keep(host.safeValueForKey("_durationLabel"_key));
    keep(host.safeValueForKey("_activeEnergyLabel"_key));
    keep(host.safeValueForKey("_paceLabel"_key));
    keep(host.safeValueForKey("_weatherConditionImageView"_key));
    keep(host.safeValueForKey("_numberOfWorkoutsLabel"_key));
  });
}

auto readByInternedTable() {
  InternedTable table;
  std::array<const void*, 8> keys = {};
  const Ref<Host> shape = make<Host>();
  for (int i = 0; i < 8; ++i) {
    keys[i] = Selector::intern(names[i]).record();
    table.add(keys[i], offsetOf(*shape, i));
  }
  return readAll([table = std::make_shared<InternedTable>(table), keys](const Host& host) {
    for (const void* key : keys) keep(load(host, table->find(key)));
  });
}

std::array<std::string, 8> arrivingNames() {
  std::array<std::string, 8> texts;
  std::copy(names.begin(), names.end(), texts.begin());
  return texts;
}

auto readByText() {
  return readAll([texts = arrivingNames()](const Host& host) {
    for (const std::string& text : texts) keep(host.safeValueForKey(text));
  });
}

auto readByTextTable() {
  TextTable table;
  const Ref<Host> shape = make<Host>();
  for (int i = 0; i < 8; ++i) table.add(names[i], offsetOf(*shape, i));
  return readAll([table = std::make_shared<TextTable>(table), texts = arrivingNames()](const Host& host) {
    for (const std::string& text : texts) keep(load(host, table->find(text)));
  });
}

const bench::RegisteredSide sides[] = {{"read literal", "ours", readByLiteral, bench::batch},
                                       {"read literal", "floor", readByInternedTable, bench::batch},
                                       {"read text", "ours", readByText, bench::batch},
                                       {"read text", "floor", readByTextTable, bench::batch}};

}  // namespace
