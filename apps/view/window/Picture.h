#pragma once

#include <QColor>
#include <QPalette>
#include <string>

#include "apps/view/model/ScreenModel.h"

namespace ax::view {

// The screen as an SVG document, in colours that go with the desktop's.
std::string pictureOf(const ScreenModel& model, const std::string& title, const QPalette& palette);

// Of what is drawn onto that picture.
struct PictureColours {
  QColor ink;
  QColor ground;
};
PictureColours pictureColours(const QPalette& palette);

}  // namespace ax::view
