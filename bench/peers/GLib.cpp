#include <glib-object.h>

#include <memory>

#include "bench/Sides.h"
#include "bench/peers/PropertyNames.h"

// Properties by name and object data of a GObject.
namespace {

struct Host {
  GObject parent;
  GObject* label;
};

void getProperty(GObject* object, guint, GValue* value, GParamSpec*) {
  g_value_set_object(value, reinterpret_cast<Host*>(object)->label);
}

void initializeClass(gpointer type, gpointer) {
  auto* objects = static_cast<GObjectClass*>(type);
  objects->get_property = getProperty;
  guint id = 0;
  for (const char* name : bench::propertyNames) {
    const auto flags = GParamFlags(G_PARAM_READABLE | G_PARAM_STATIC_STRINGS);
    g_object_class_install_property(objects, ++id,
                                    g_param_spec_object(name, name, name, G_TYPE_OBJECT, flags));
  }
}

GType hostType() {
  static const GType type =
      g_type_register_static_simple(G_TYPE_OBJECT, "AxveltoBenchHost", sizeof(GObjectClass), initializeClass,
                                    sizeof(Host), nullptr, GTypeFlags(0));
  return type;
}

std::shared_ptr<Host> host() {
  auto* made = static_cast<Host*>(g_object_new(hostType(), nullptr));
  made->label = static_cast<GObject*>(g_object_new(G_TYPE_OBJECT, nullptr));
  for (const char* key : {"benchFirst", "benchSecond", "benchThird", "benchFourth"}) {
    g_object_set_data_full(&made->parent, key, g_object_ref(made->label), g_object_unref);
  }
  return {made, [](Host* object) {
            g_object_unref(object->label);
            g_object_unref(object);
          }};
}

auto readByName() {
  return [object = host()] {
    for (int i = 0; i < bench::batch; ++i) {
      GObject* label = nullptr;
      g_object_get(object.get(), bench::propertyNames[i & 7], &label, nullptr);
      benchmark::DoNotOptimize(label);
      g_object_unref(label);
    }
  };
}

// Object data are not counted for the caller; one who keeps them counts them, as a Ref does.
auto getData() {
  return [object = host()] {
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(g_object_get_data(&object->parent, "benchThird"));
    }
  };
}

auto setData() {
  return [object = host()] {
    for (int i = 0; i < bench::batch; ++i) {
      g_object_set_data_full(&object->parent, "benchThird", g_object_ref(object->label), g_object_unref);
    }
  };
}

const bench::RegisteredSide sides[] = {{"read text", "GLib", readByName, bench::batch},
                                       {"get", "GLib", getData, bench::batch},
                                       {"set", "GLib", setData, bench::batch}};

}  // namespace
