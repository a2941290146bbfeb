#include "platform/runtime/Object.h"

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Weak.h"

namespace ax {

namespace {

const char weakLinkKey = 0;

}  // namespace

Class& Object::staticClass() {
  static Class& result = ClassBuilder<Object>("Object").build();
  return result;
}

Object::~Object() {
  if (attachments_ != nullptr) {
    // Destructors attached these; whoever asks the object now finds no more of it than this.
    isa_ = &classOf<Object>();
    endAttachments();
  }
  precondition(count_ == ending || count_ <= 1,
               "an object ended before a handle to it: its destructor must leave none behind");
}

// Each is gone from the list before it ends, since its destructor may look here.
void Object::endAttachments() {
  while (attachments_ != nullptr) {
    Attachment* const first = std::exchange(attachments_, attachments_->next);
    const Ref<Object> released = Ref<Object>::adopt(first->value);
    delete first;
  }
}

bool Object::isKindOf(const Class& other) const {
  return isa().isSubclassOf(other);
}

std::string Object::description() const {
  return "<" + isa().name() + ">";
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

void Object::end() {
  count_ = ending;
  if (attachments_ != nullptr) {
    if (Object* link = attached(&weakLinkKey)) static_cast<WeakLink*>(link)->target = nullptr;
    endAttachments();
  }
  delete this;
}

Class& WeakLink::staticClass() {
  static Class& result = ClassBuilder<WeakLink>("WeakLink", Object::staticClass()).build();
  return result;
}

Ref<WeakLink> WeakLink::to(Object& target) {
  if (target.isEnding()) return nullptr;
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
