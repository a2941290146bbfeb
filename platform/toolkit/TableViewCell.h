#pragma once

#include "platform/toolkit/ImageView.h"
#include "platform/toolkit/Label.h"

namespace ax {

// A row of a table. Its content view, made at first use, holds what the row shows; a text label, a detail
// label and an image view that are set without a superview are put into it.
class TableViewCell : public View {
 public:
  static Class& staticClass();

  const Ref<View>& contentView();
  // Nil until it is set.
  const Ref<Label>& textLabel() const { return textLabel_; }
  void setTextLabel(Ref<Label> label);
  const Ref<Label>& detailTextLabel() const { return detailTextLabel_; }
  void setDetailTextLabel(Ref<Label> label);
  const Ref<ImageView>& imageView() const { return imageView_; }
  void setImageView(Ref<ImageView> view);

 private:
  void addToContent(const Ref<View>& view);

  Ref<View> contentView_;
  Ref<Label> textLabel_;
  Ref<Label> detailTextLabel_;
  Ref<ImageView> imageView_;
};

// An item of a grid.
class CollectionViewCell : public View {
 public:
  static Class& staticClass();
};

}  // namespace ax
