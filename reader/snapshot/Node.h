#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "platform/runtime/Geometry.h"
#include "platform/toolkit/Traits.h"
#include "reader/snapshot/DataSeries.h"
#include "reader/text/AttributedText.h"

namespace ax::reader {

// Never used again in the process; 0 is no node.
using NodeId = std::uint64_t;

// What a node is above all; its traits tell the rest.
enum class Role { container, chart, element, staticText, image, link, button, adjustable, header };

struct States {
  bool selected = false;
  bool disabled = false;
  bool expanded = false;
  bool collapsed = false;
  bool modal = false;
};

enum class Action { activate, increment, decrement };

struct Actions {
  bool activate = false;
  bool increment = false;
  bool decrement = false;

  bool has(Action action) const;
  bool operator==(const Actions&) const = default;
};

// Everything that one object said of itself at the moment it was asked: plain values, no way back.
struct Node {
  NodeId id = 0;
  NodeId parent = 0;                  // 0 at the top
  std::vector<NodeId> children = {};  // in reading order
  bool isElement = false;             // the reader stops at it; containers only group others
  Role role = Role::element;
  std::optional<AttributedText> label = {};
  std::optional<AttributedText> value = {};
  std::optional<AttributedText> hint = {};
  Traits traits = 0;
  States states = {};
  Rect frame = {};  // in screen space
  Actions actions = {};
  std::string className = {};
  std::string objectId = {};  // the name by which its maker knows the object; may be empty
  std::optional<DataSeries> series = {};
};

std::string_view roleName(Role role);
std::string_view actionName(Action action);

}  // namespace ax::reader
