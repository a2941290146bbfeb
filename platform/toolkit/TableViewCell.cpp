#include "platform/toolkit/TableViewCell.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& TableViewCell::staticClass() {
  using T = TableViewCell;
  static Class& result = ClassBuilder<T>("TableViewCell", View::staticClass())
                             .method<&T::contentView>("contentView")
                             .property<&T::textLabel, &T::setTextLabel>("textLabel")
                             .property<&T::detailTextLabel, &T::setDetailTextLabel>("detailTextLabel")
                             .property<&T::imageView, &T::setImageView>("imageView")
                             .build();
  return result;
}

const Ref<View>& TableViewCell::contentView() {
  if (!contentView_) {
    contentView_ = make<View>();
    contentView_->setFrame({0, 0, frame().width, frame().height});
    addSubview(contentView_);
  }
  return contentView_;
}

void TableViewCell::addToContent(const Ref<View>& view) {
  if (view && view->superview() == nullptr) contentView()->addSubview(view);
}

void TableViewCell::setTextLabel(Ref<Label> label) {
  addToContent(label);
  textLabel_ = std::move(label);
}

void TableViewCell::setDetailTextLabel(Ref<Label> label) {
  addToContent(label);
  detailTextLabel_ = std::move(label);
}

void TableViewCell::setImageView(Ref<ImageView> view) {
  addToContent(view);
  imageView_ = std::move(view);
}

Class& CollectionViewCell::staticClass() {
  static Class& result = ClassBuilder<CollectionViewCell>("CollectionViewCell", View::staticClass()).build();
  return result;
}

static const RegisteredClass<TableViewCell> registered;
static const RegisteredClass<CollectionViewCell> registeredItem;

}  // namespace ax
