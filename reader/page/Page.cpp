#include "reader/page/Page.h"

#include "platform/formatting/Region.h"
#include "reader/page/ElementList.h"
#include "reader/page/PageStyle.h"
#include "reader/picture/Markup.h"
#include "reader/picture/ScreenPicture.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

std::string idOf(std::size_t screen) {
  return "screen-" + std::to_string(screen);
}

void addHead(Markup& html, const std::string& title) {
  static const std::string policy = std::string("default-src 'none'; style-src '") + pageStyleDigest +
                                    "'; media-src data:; base-uri 'none'; form-action 'none'";
  html.open("head");
  html.empty("meta", {{"charset", "utf-8"}});
  html.empty("meta", {{"http-equiv", "Content-Security-Policy"}, {"content", policy}});
  html.empty("meta", {{"name", "viewport"}, {"content", "width=device-width, initial-scale=1"}});
  html.element("title", {}, title);
  html.open("style").raw(pageStyle).close();
  html.close();
}

std::string sectionOf(const Snapshot& snapshot, const std::string& title, const PlaceOnPage& place) {
  const ReadingOrder order(snapshot);
  Markup html;
  html.open("div", {{"class", "columns"}});
  html.open("div", {{"class", "picture"}});
  html.raw(screenPicture(snapshot, order, readerText("page.picture", {title}))).close();
  addElementList(html, snapshot, order, place);
  return html.close().take();
}

}  // namespace

void Page::add(const Snapshot& snapshot, const std::string& title) {
  const bool isFirst = screens_.empty();
  if (isFirst) {
    heading_ = readerText("page.title");
    contents_ = readerText("page.contents");
  }
  Screen screen;
  screen.title = title.empty() ? readerText("screen.untitled") : title;
  screen.language = formatting::currentLanguage();
  screen.direction = formatting::currentLanguageIsRightToLeft() ? "rtl" : "ltr";
  screen.section = sectionOf(snapshot, screen.title, {idOf(screens_.size() + 1), 3, hasSound_});
  screens_.push_back(std::move(screen));
}

std::string Page::html() const {
  const Screen& first = screens_.front();
  const bool isOne = screens_.size() == 1;
  Markup html;
  html.raw("<!DOCTYPE html>\n");
  html.open("html", {{"lang", first.language}, {"dir", first.direction}});
  addHead(html, isOne ? first.title : heading_);
  html.open("body");
  if (!isOne) {
    html.open("header").element("h1", {}, heading_).close();
    html.open("nav", {{"aria-labelledby", "contents"}}).element("h2", {{"id", "contents"}}, contents_);
    html.open("ol");
    for (std::size_t i = 0; i < screens_.size(); ++i) {
      html.open("li", {{"lang", screens_[i].language}, {"dir", screens_[i].direction}});
      const std::string id = idOf(i + 1);
      html.element("a", {{"href", "#" + id}}, screens_[i].title).close();
    }
    html.close().close();
  }
  html.open("main");
  for (std::size_t i = 0; i < screens_.size(); ++i) {
    const Screen& screen = screens_[i];
    const std::string id = idOf(i + 1);
    html.open("article", {{"id", id},
                          {"lang", screen.language},
                          {"dir", screen.direction},
                          {"aria-labelledby", id + "-title"}});
    html.element(isOne ? "h1" : "h2", {{"id", id + "-title"}}, screen.title);
    html.raw(screen.section).close();
  }
  return html.close().close().close().take();
}

}  // namespace ax::reader
