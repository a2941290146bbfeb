#include "host/charts/CHNoHeartRateDataViewController.h"

#include "host/core/HostStrings.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

constexpr double width = 320;

void show(View& parent, Ref<Label>& label, const char* key, double y) {
  if (!label) {
    label = make<Label>();
    label->setText(hostText(key));
  }
  if (label->frame() == Rect()) label->setFrame({0, y, width, 30});
  parent.addSubview(label);
}

}  // namespace

Class& CHNoHeartRateDataViewController::staticClass() {
  using T = CHNoHeartRateDataViewController;
  static Class& result = ClassBuilder<T>("CHNoHeartRateDataViewController", ViewController::staticClass())
                             .property<&T::titleLabel, &T::setTitleLabel>("titleLabel")
                             .property<&T::messageLabel, &T::setMessageLabel>("messageLabel")
                             .property<&T::linkLabel, &T::setLinkLabel>("linkLabel")
                             .property<&T::linkButton, &T::setLinkButton>("linkButton")
                             .instanceVariable<&T::opensLink_>("_opensLink")
                             .method<&T::linkTapped>("linkTapped:")
                             .build();
  return result;
}

void CHNoHeartRateDataViewController::loadView() {
  ViewController::loadView();
  View& content = *view();
  if (content.frame() == Rect()) content.setFrame({0, 0, width, 480});
  show(content, titleLabel_, "no.heart.rate.title", 40);
  show(content, messageLabel_, "no.heart.rate.message", 80);
  show(content, linkLabel_, "no.heart.rate.link", 120);
  if (!linkButton_) {
    linkButton_ = make<Button>();
    linkButton_->setTargetAction(*this, Selector::intern("linkTapped:"));
  }
  if (linkButton_->frame() == Rect()) linkButton_->setFrame(linkLabel_->frame());
  content.addSubview(linkButton_);
}

static const RegisteredClass<CHNoHeartRateDataViewController> registered;

}  // namespace ax::host
