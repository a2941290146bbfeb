#pragma once

#include <string>
#include <vector>

#include "platform/toolkit/View.h"

namespace ax::reader {

// Presents a screen as the system does: a controller is told to load its view and that it did, the views are
// laid out, parents first, and then everything, children first, is told once to load its accessibility. What
// the host raises meanwhile is noted and stops nothing.
class ScreenPresenter {
 public:
  void present(const Ref<Object>& screen);
  // "CHCell layoutSubviews: why"
  const std::vector<std::string>& hostFaults() const { return hostFaults_; }

 private:
  template <class M>
  void send(const M& message, const Ref<Object>& receiver);
  void layOut(const Ref<View>& view, std::size_t level);
  void loadAccessibility(const Ref<View>& view, std::size_t level);

  std::vector<std::string> hostFaults_;
};

}  // namespace ax::reader
