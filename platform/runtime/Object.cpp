#include "platform/runtime/Object.h"

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Weak.h"

namespace ax {

namespace {

const char weakLinkKey = 0;
// Handles that a destructor makes of its own object come and go without ending it once more.
constexpr std::uint32_t ending = 1u << 31;

}  // namespace

Class& Object::staticClass() {
  static Class& result = ClassBuilder<Object>("Object").build();
  return result;
}

Object::~Object() {
  for (Attachment* a = attachments_; a != nullptr;) {
    Attachment* next = a->next;
    const Ref<Object> released = Ref<Object>::adopt(a->value);
    delete a;
    a = next;
  }
}

bool Object::isKindOf(const Class& other) const {
  return isa_->isSubclassOf(other);
}

std::string Object::description() const {
  return "<" + isa_->name() + ">";
}

void Object::attach(const void* key, Ref<Object> value) {
  Attachment** place = &attachments_;
  while (*place != nullptr && (*place)->key != key) place = &(*place)->next;
  Attachment* former = *place;
  if (former == nullptr) {
    if (value) *place = new Attachment{nullptr, key, value.leak()};
    return;
  }
  const Ref<Object> released = Ref<Object>::adopt(former->value);
  if (value) {
    former->value = value.leak();
    return;
  }
  *place = former->next;
  delete former;
}

void Object::end() const {
  if (const Object* link = attached(&weakLinkKey)) {
    const_cast<WeakLink*>(static_cast<const WeakLink*>(link))->target = nullptr;
  }
  count_ = ending;
  delete this;
}

Class& WeakLink::staticClass() {
  static Class& result = ClassBuilder<WeakLink>("WeakLink", Object::staticClass()).build();
  return result;
}

Ref<WeakLink> WeakLink::to(Object& target) {
  if (Object* link = target.attached(&weakLinkKey)) return Ref<WeakLink>(static_cast<WeakLink*>(link));
  Ref<WeakLink> link = make<WeakLink>();
  link->target = &target;
  target.attach(&weakLinkKey, link);
  return link;
}

Ref<Object> getAssociatedObject(const Object& object, const void* staticKey) {
  return object.attachedValue(staticKey);
}

void setAssociatedObject(Object& object, const void* staticKey, Ref<Object> value) {
  object.attach(staticKey, std::move(value));
}

void setAssociatedCopiedObject(Object& object, const void* staticKey, const Ref<Object>& value) {
  object.attach(staticKey, value ? value->copy() : nullptr);
}

static const RegisteredClass<Object> registered;

}  // namespace ax
