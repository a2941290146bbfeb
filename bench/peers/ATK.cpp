#include <atk/atk.h>

#include <memory>
#include <vector>

#include "bench/Sides.h"
#include "bench/Walk.h"

// The same walk over a tree of ATK objects: name, role and extents of every node.
namespace {

struct Node {
  AtkObject parent;
  std::vector<Node*>* children;
  int x, y, width, height;
};

Node* nodeOf(gpointer object) {
  return static_cast<Node*>(object);
}

gint countChildren(AtkObject* object) {
  return static_cast<gint>(nodeOf(object)->children->size());
}

AtkObject* childAt(AtkObject* object, gint index) {
  return ATK_OBJECT(g_object_ref(&(*nodeOf(object)->children)[static_cast<std::size_t>(index)]->parent));
}

void finalize(GObject* object) {
  for (Node* child : *nodeOf(object)->children) g_object_unref(child);
  delete nodeOf(object)->children;
  auto* parentClass = static_cast<GObjectClass*>(g_type_class_peek(ATK_TYPE_OBJECT));
  parentClass->finalize(object);
}

void initializeClass(gpointer type, gpointer) {
  auto* objects = static_cast<AtkObjectClass*>(type);
  objects->get_n_children = countChildren;
  objects->ref_child = childAt;
  static_cast<GObjectClass*>(type)->finalize = finalize;
}

void initialize(GTypeInstance* instance, gpointer) {
  nodeOf(instance)->children = new std::vector<Node*>;
}

void extents(AtkComponent* component, gint* x, gint* y, gint* width, gint* height, AtkCoordType) {
  Node* node = nodeOf(component);
  *width = node->width;
  *height = node->height;
  *x = *y = 0;
  for (; node != nullptr; node = nodeOf(node->parent.accessible_parent)) {
    *x += node->x;
    *y += node->y;
  }
}

void initializeComponent(gpointer interface, gpointer) {
  static_cast<AtkComponentIface*>(interface)->get_extents = extents;
}

GType nodeType() {
  static const GType type = [] {
    const GType made =
        g_type_register_static_simple(ATK_TYPE_OBJECT, "AxveltoBenchNode", sizeof(AtkObjectClass),
                                      initializeClass, sizeof(Node), initialize, GTypeFlags(0));
    const GInterfaceInfo component = {initializeComponent, nullptr, nullptr};
    g_type_add_interface_static(made, ATK_TYPE_COMPONENT, &component);
    return made;
  }();
  return type;
}

Node* make(const char* name, AtkRole role, Node* parent, int x, int y, int width, int height) {
  Node* node = nodeOf(g_object_new(nodeType(), nullptr));
  if (name != nullptr) atk_object_set_name(&node->parent, name);
  atk_object_set_role(&node->parent, role);
  node->x = x;
  node->y = y;
  node->width = width;
  node->height = height;
  if (parent == nullptr) return node;
  atk_object_set_parent(&node->parent, &parent->parent);
  parent->children->push_back(node);
  return node;
}

void dropParents(Node* node) {
  for (Node* child : *node->children) {
    dropParents(child);
    atk_object_set_parent(&child->parent, nullptr);
  }
}

std::shared_ptr<Node> screen(int nodes) {
  Node* root = make(nullptr, ATK_ROLE_PANEL, nullptr, 0, 0, 400, 60 * nodes / bench::childrenPerRow);
  for (int made = 1; made < nodes;) {
    Node* row = make(nullptr, ATK_ROLE_PANEL, root, 0, 6 * made, 400, 60);
    ++made;
    for (int i = 0; i < bench::childrenPerRow && made < nodes; ++i, ++made) {
      make(("label " + std::to_string(made)).c_str(), ATK_ROLE_LABEL, row, 40 * i, 0, 40, 60);
    }
  }
  return {root, [](Node* all) {
            dropParents(all);
            g_object_unref(all);
          }};
}

void visit(AtkObject* object, bench::Sums& sums) {
  if (const char* name = atk_object_get_name(object)) sums.bytes += static_cast<unsigned char>(name[0]);
  sums.traits |= static_cast<std::uint64_t>(atk_object_get_role(object));
  gint x, y, width, height;
  atk_component_get_extents(ATK_COMPONENT(object), &x, &y, &width, &height, ATK_XY_SCREEN);
  sums.right += x + width;
  const gint count = atk_object_get_n_accessible_children(object);
  for (gint i = 0; i < count; ++i) {
    AtkObject* child = atk_object_ref_accessible_child(object, i);
    visit(child, sums);
    g_object_unref(child);
  }
}

struct WalkSides {
  WalkSides() {
    for (int nodes : bench::walkSizes) {
      bench::RegisteredSide(
          bench::walkName(nodes), "ATK",
          [nodes] {
            return [root = screen(nodes)] {
              bench::Sums sums;
              visit(&root->parent, sums);
              benchmark::DoNotOptimize(sums);
            };
          },
          nodes);
    }
  }
};
const WalkSides sides;

}  // namespace
