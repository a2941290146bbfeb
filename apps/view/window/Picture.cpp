#include "apps/view/window/Picture.h"

#include "reader/picture/PictureStyle.h"
#include "reader/picture/ScreenPicture.h"

namespace ax::view {

namespace colours = reader::colours;

namespace {

struct DarkColour {
  std::string_view light;
  std::string_view dark;
};

constexpr const char *darkInk = "#eef2f7", *darkGround = "#14181f";
constexpr DarkColour darkColours[] = {{colours::ground, darkGround}, {colours::ink, darkInk},
                                      {colours::outline, "#8b97a7"}, {colours::fill, "#222933"},
                                      {colours::control, "#22375c"}, {colours::data, "#6fb1f5"}};

bool isDark(const QPalette& palette) {
  return palette.color(QPalette::Window).lightness() < palette.color(QPalette::WindowText).lightness();
}

// The picture's colours are attributes: quoted, and in no text of it.
std::string darkened(std::string svg) {
  for (const DarkColour& colour : darkColours) {
    const std::string light = '"' + std::string(colour.light) + '"';
    for (std::size_t at = svg.find(light); at != std::string::npos; at = svg.find(light, at + light.size())) {
      svg.replace(at + 1, colour.light.size(), colour.dark);
    }
  }
  return svg;
}

}  // namespace

std::string pictureOf(const ScreenModel& model, const std::string& title, const QPalette& palette) {
  const reader::Snapshot& snapshot = model.snapshot();
  std::string svg = reader::screenPicture(snapshot, reader::ReadingOrder(snapshot), title);
  return isDark(palette) ? darkened(std::move(svg)) : svg;
}

PictureColours pictureColours(const QPalette& palette) {
  if (isDark(palette)) return {QColor(darkInk), QColor(darkGround)};
  return {QColor(colours::ink), QColor(colours::ground)};
}

}  // namespace ax::view
