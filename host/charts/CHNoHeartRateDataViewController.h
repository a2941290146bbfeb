#pragma once

#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ViewController.h"

namespace ax::host {

// The screen in place of a heart rate that was not recorded: a title, a message, and a link whose text is a
// label of its own under an untitled button.
class CHNoHeartRateDataViewController : public ViewController {
 public:
  static Class& staticClass();

  void loadView() override;

  const Ref<Label>& titleLabel() const { return titleLabel_; }
  void setTitleLabel(Ref<Label> label) { titleLabel_ = std::move(label); }
  const Ref<Label>& messageLabel() const { return messageLabel_; }
  void setMessageLabel(Ref<Label> label) { messageLabel_ = std::move(label); }
  const Ref<Label>& linkLabel() const { return linkLabel_; }
  void setLinkLabel(Ref<Label> label) { linkLabel_ = std::move(label); }
  const Ref<Button>& linkButton() const { return linkButton_; }
  void setLinkButton(Ref<Button> button) { linkButton_ = std::move(button); }

 private:
  void linkTapped(Ref<Object>) { opensLink_ = true; }

  Ref<Label> titleLabel_;
  Ref<Label> messageLabel_;
  Ref<Label> linkLabel_;
  Ref<Button> linkButton_;
  bool opensLink_ = false;
};

}  // namespace ax::host
