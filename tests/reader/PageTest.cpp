#include <gtest/gtest.h>

#include <pugixml.hpp>

#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "reader/page/Page.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

namespace {

std::string pageOf(const Ref<View>& screen, const std::string& title = "Screen") {
  Page page;
  page.add(takeSnapshot(screen), title);
  return page.html();
}

bool has(const std::string& html, const std::string& part) {
  return html.find(part) != std::string::npos;
}

// A chart that stands for a series and says nothing of it.
class PageChart : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<PageChart>("PageTestChart", View::staticClass())
                               .method<&PageChart::containerType>("accessibilityContainerType")
                               .build();
    return result;
  }
  std::int64_t containerType() { return messages::dataSeriesContainerType; }
};

}  // namespace

TEST(PageTest, LetsNoTextOfTheHostBecomeMarkup) {
  const Ref<Button> odd = button("<script>alert('1')</script>");
  messages::setAccessibilityValue(odd, string("\"><img src=x>"));
  messages::setAccessibilityHint(odd, string("</style>&amp;"));
  const std::string html = pageOf(view({odd}), "</title><b>");
  EXPECT_FALSE(has(html, "<script") || has(html, "<img") || has(html, "<b>"));
  EXPECT_TRUE(has(html, "&lt;script&gt;alert(&#39;1&#39;)&lt;/script&gt;"));
  EXPECT_TRUE(has(html, "&lt;/style&gt;&amp;amp;"));
  pugi::xml_document document;
  EXPECT_TRUE(document.load_string(html.substr(html.find("<html")).c_str())) << "every element is closed";
}

TEST(PageTest, GivesEachRoleItsElement) {
  const Ref<Button> off = button("Off", {0, 60, 100, 20});
  messages::setAccessibilityTraits(off, TraitButton | TraitNotEnabled | TraitSelected);
  const Ref<Label> heading = label("Head");
  messages::setAccessibilityTraits(heading, TraitHeader | TraitButton);
  messages::setAccessibilityHint(heading, string("Opens"));
  const Ref<Label> pages = label("Pages", {0, 30, 100, 20});
  messages::setAccessibilityTraits(pages, TraitAdjustable);
  messages::setAccessibilityValue(pages, string("1 of 3"));
  const std::string html = pageOf(view({heading, pages, off}));
  EXPECT_TRUE(
      has(html,
          "<h3 class=\"name\"><button class=\"name\" type=\"button\" aria-describedby=\"screen-1-1-hint\">"
          "Head</button></h3>"));
  EXPECT_TRUE(has(html, "aria-valuetext=\"1 of 3\""));
  EXPECT_TRUE(has(html, "disabled=\"\" aria-current=\"true\">Off</button>"));
}

TEST(PageTest, KeepsTheOrderOfAChartInListsAndTables) {
  const Ref<View> chart = view<PageChart>({}, {0, 0, 100, 100});
  const Ref<AccessibilityElement> first = element("Monday", chart), head = element("Then", chart),
                                  last = element("Sunday", chart);
  messages::setAccessibilityValue(first, string("3 km"));
  messages::setAccessibilityTraits(head, TraitHeader);
  messages::setAccessibilityElements(chart, array({first, head, last}));
  const std::string html = pageOf(chart);
  const std::size_t row = html.find("<td class=\"number\">1</td><th scope=\"row\">Monday</th><td>3 km</td>");
  const std::size_t heading = html.find(">Then</h3>");
  const std::size_t lastRow = html.find("<td class=\"number\">3</td><th scope=\"row\">Sunday</th></tr>");
  EXPECT_LT(row, heading);
  EXPECT_LT(heading, lastRow);
  EXPECT_LT(lastRow, html.size());
}

TEST(PageTest, GivesEachScreenItsLanguage) {
  Page page;
  setEnvironment({.locale = "de_DE"});
  page.add(takeSnapshot(view({label("Eins")})), "");
  setEnvironment({.locale = "ar_EG"});
  page.add(takeSnapshot(view({label("Two")})), "Second");
  setEnvironment({});
  const std::string html = page.html();
  EXPECT_TRUE(has(html, "<html lang=\"de\" dir=\"ltr\">"));
  EXPECT_TRUE(has(html, "<h1>Bildschirme</h1>"));
  EXPECT_TRUE(has(html, "<article id=\"screen-1\" lang=\"de\" dir=\"ltr\""));
  EXPECT_TRUE(has(html, "<article id=\"screen-2\" lang=\"ar\" dir=\"rtl\""));
  EXPECT_TRUE(has(html, "<a href=\"#screen-2\">Second</a>"));
  EXPECT_TRUE(has(html, ">Bildschirm ohne Titel</h2>"));
}

}  // namespace ax::reader::testing
