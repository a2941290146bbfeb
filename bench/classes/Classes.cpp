// 65 classes with virtual functions, as a plug-in of ordinary C++ would bring them.
#include <string>
#include <utility>

namespace plugin {

struct Widget {
  virtual ~Widget() = default;
  virtual std::string label() const { return {}; }
  virtual std::string value() const { return {}; }
  virtual unsigned long traits() const { return 0; }
  virtual bool isElement() const { return false; }
  virtual void layout() {}
};

template <int N>
struct Screen : Widget {
  ~Screen() override = default;
  std::string label() const override { return "label " + std::to_string(N); }
  std::string value() const override { return Widget::value() + std::to_string(N); }
  unsigned long traits() const override { return N; }
  bool isElement() const override { return true; }
  void layout() override { ++layouts; }
  int layouts = 0;
};

template <int... N>
Widget* makeOneOf(int wanted, std::integer_sequence<int, N...>) {
  Widget* made = nullptr;
  ((wanted == N ? void(made = new Screen<N>) : void()), ...);
  return made;
}

}  // namespace plugin

extern "C" plugin::Widget* makeWidget(int wanted) {
  return plugin::makeOneOf(wanted, std::make_integer_sequence<int, 65>());
}
