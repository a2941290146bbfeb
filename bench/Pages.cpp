#include "bench/Pages.h"

#include <iterator>
#include <memory>

#include "bench/Comparison.h"
#include "bench/Sides.h"
#include "platform/foundation/Array.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "platform/toolkit/View.h"
#include "reader/page/Page.h"
#include "reader/picture/ScreenPicture.h"

namespace bench {

namespace {

using namespace ax;

// A chart of as many bars as it has elements.
class Bars : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Bars>("Bench.Bars", View::staticClass())
                               .method<&Bars::containerType>("accessibilityContainerType")
                               .method<&Bars::type>("_accessibilityDataSeriesType")
                               .method<&Bars::values>("_accessibilityDataSeriesValuesForAxis:")
                               .build();
    return result;
  }
  std::int64_t containerType() { return messages::dataSeriesContainerType; }
  std::int64_t type() { return 2; }
  Ref<Array> values(std::int64_t axis) {
    Array::Items numbers;
    for (int i = 0; i < count; ++i) numbers.push_back(number(axis == horizontalAxis ? i : i * 7 % 23));
    return array(std::move(numbers));
  }

  int count = 0;
};

std::shared_ptr<reader::Snapshot> chart(int count) {
  const Ref<Bars> bars = make<Bars>();
  bars->count = count;
  bars->setFrame({0, 0, 16.0 * count, 200});
  Array::Items elements;
  for (int i = 0; i < count; ++i) {
    const auto element = AccessibilityElement::initWithAccessibilityContainer(bars);
    messages::setAccessibilityLabel(element, string("Bar " + std::to_string(i)));
    messages::setAccessibilityValue(element, string(std::to_string(i * 7 % 23) + " kilometers"));
    element->setAccessibilityFrameInContainerSpace({16.0 * i, 0, 16, 200});
    elements.push_back(element);
  }
  messages::setAccessibilityElements(bars, array(std::move(elements)));
  return std::make_shared<reader::Snapshot>(reader::takeSnapshot(bars));
}

using Written = std::string (*)(const reader::Snapshot&);

std::string picture(const reader::Snapshot& snapshot) {
  return reader::screenPicture(snapshot, reader::ReadingOrder(snapshot), "Bars");
}

std::string page(const reader::Snapshot& snapshot) {
  reader::Page made(reader::Page::Sound::without);
  made.add(snapshot, "Bars");
  return made.html();
}

struct Screen {
  const char* name;
  int elements;
};

// A day of hours, a month of days, and readings.
constexpr Screen screens[] = {{"a day", 24}, {"a month", 30}, {"readings", 10'000}};

struct Kind {
  const char* name;
  Written write;
};

constexpr Kind kinds[] = {{"picture", &picture}, {"page", &page}};

std::string nameOf(const Kind& kind, const Screen& screen) {
  return std::string(kind.name) + " of " + screen.name;
}

struct Sides {
  Sides() {
    for (const Kind& kind : kinds) {
      for (const Screen& screen : screens) add(kind, screen);
    }
  }

  static void add(const Kind& kind, const Screen& screen) {
    const Written write = kind.write;
    const int count = screen.elements;
    RegisteredSide(
        nameOf(kind, screen), "ours",
        [=] { return [=, made = chart(count)] { benchmark::DoNotOptimize(write(*made).data()); }; }, count);
    RegisteredSide(
        nameOf(kind, screen), "floor",
        [=] {
          const std::string line(write(*chart(count)).size() / std::size_t(count), 'x');
          return [=] {
            std::string text;
            for (int i = 0; i < count; ++i) text += line;
            benchmark::DoNotOptimize(text.data());
          };
        },
        count);
  }
};

const Sides sides;

}  // namespace

void comparePages(std::vector<Row>& rows) {
  for (const Kind& kind : kinds) {
    for (const Screen& screen : screens) {
      const std::string name = nameOf(kind, screen);
      compare({name, name + ", per element of " + std::to_string(screen.elements)}, rows);
    }
    const std::string small = nameOf(kind, screens[0]), large = nameOf(kind, screens[2]);
    compareGrowth({std::string(kind.name) + ", growth per element from 24 to 10000", small, large, 1.25},
                  rows);
  }
}

}  // namespace bench
