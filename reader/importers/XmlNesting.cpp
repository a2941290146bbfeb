#include "reader/importers/XmlNesting.h"

#include <algorithm>
#include <iterator>

namespace ax::reader {
namespace {

constexpr std::size_t deepest = 100;
constexpr std::size_t largeText = 1 << 20;
constexpr std::size_t mostPerByte = 8;
constexpr std::size_t elementBytes = 64;    // what the parser takes for an element
constexpr std::size_t attributeBytes = 40;  // and an attribute

struct Skipped {
  std::string_view start, end;
};
// Marks that hold no elements.
constexpr Skipped skipped[] = {{"<!--", "-->"}, {"<![CDATA[", "]]>"}, {"<?", "?>"}, {"<!", ">"}};

class Marks {
 public:
  explicit Marks(std::string_view text) : text_(text) {}

  std::optional<XmlExcess> find() {
    while ((at_ = text_.find('<', at_)) != std::string_view::npos) {
      if (skip()) continue;
      takeTag();
      if (depth_ > deepest) {
        return XmlExcess{start_, "elements nested more than 100 deep", "at most 100"};
      }
      if (text_.size() > largeText && bytes_ > mostPerByte * text_.size()) {
        return XmlExcess{start_, "more elements than a workout of this size has", "points with values"};
      }
    }
    return std::nullopt;
  }

 private:
  bool skip() {
    const auto kind = std::ranges::find_if(
        skipped, [this](const Skipped& each) { return text_.substr(at_).starts_with(each.start); });
    if (kind == std::end(skipped)) return false;
    const std::size_t end = text_.find(kind->end, at_ + kind->start.size());
    at_ = end == std::string_view::npos ? text_.size() : end + kind->end.size();
    return true;
  }

  void takeTag() {
    start_ = at_;
    const bool closes = text_.substr(at_).starts_with("</");
    char former = ' ';
    for (++at_; at_ < text_.size() && text_[at_] != '>'; ++at_) {
      former = text_[at_];
      if (former != '"' && former != '\'') continue;
      bytes_ += attributeBytes;
      at_ = std::min(text_.find(former, at_ + 1), text_.size() - 1);
    }
    if (closes) {
      if (depth_ > 0) --depth_;
      return;
    }
    bytes_ += elementBytes;
    if (former != '/') ++depth_;
  }

  std::string_view text_;
  std::size_t at_ = 0;
  std::size_t start_ = 0;
  std::size_t depth_ = 0;
  std::size_t bytes_ = 0;
};

}  // namespace

std::optional<XmlExcess> findXmlExcess(std::string_view text) {
  return Marks(text).find();
}

}  // namespace ax::reader
