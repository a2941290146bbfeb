#include "reader/importers/FileKind.h"

#include <algorithm>
#include <iterator>

#include "reader/importers/FitMessages.h"
#include "reader/importers/TextEncoding.h"

namespace ax::reader {
namespace {

using namespace std::string_view_literals;

struct Start {
  std::size_t at;
  std::string_view bytes;
  FileKind kind;
  const char* name;
};

constexpr Start starts[] = {
    {0, "\x1F\x8B"sv, FileKind::gzip, "a gzip archive"},
    {0, "PK\x03\x04"sv, FileKind::zip, "a zip archive"},
    {0, "PK\x05\x06"sv, FileKind::zip, "an empty zip archive"},
    {0, "\x89PNG"sv, FileKind::other, "a PNG picture"},
    {0, "\xFF\xD8\xFF"sv, FileKind::other, "a JPEG picture"},
    {0, "GIF8"sv, FileKind::other, "a GIF picture"},
    {8, "WEBP"sv, FileKind::other, "a WebP picture"},
    {4, "ftyp"sv, FileKind::other, "a film or a picture"},
    {0, "%PDF"sv, FileKind::other, "a PDF document"},
    {0,
     "\x7F"
     "ELF"sv,
     FileKind::other, "a program"},
    {0, "SQLite format 3"sv, FileKind::other, "a database"},
    {0, "BZh"sv, FileKind::other, "a bzip2 archive"},
    {0,
     "\xFD"
     "7zXZ"sv,
     FileKind::other, "an xz archive"},
    {0, "7z\xBC\xAF"sv, FileKind::other, "a 7z archive"},
};
constexpr std::string_view byteOrderMarks[] = {"\xEF\xBB\xBF"sv, "\xFF\xFE"sv, "\xFE\xFF"sv};

const Start* startOf(std::string_view bytes) {
  const auto found = std::ranges::find_if(starts, [=](const Start& each) {
    return bytes.size() >= each.at && bytes.substr(each.at).starts_with(each.bytes);
  });
  return found == std::end(starts) ? nullptr : found;
}

// The first byte that can be seen; 0 where there is none.
char firstVisible(std::string_view bytes) {
  for (const std::string_view mark : byteOrderMarks) {
    if (bytes.starts_with(mark)) bytes.remove_prefix(mark.size());
  }
  constexpr std::string_view blanks = " \t\r\n\xEF\xBB\xBF\0"sv;
  const std::size_t first = bytes.find_first_not_of(blanks);
  return first == std::string_view::npos ? '\0' : bytes[first];
}

bool isText(std::string_view bytes) {
  constexpr std::size_t looked = 1024;
  const std::string_view start = bytes.substr(0, looked);
  return start.find('\0') == std::string_view::npos && isUtf8(start.substr(0, start.find_last_of(" \n") + 1));
}

}  // namespace

FileKind kindOfFile(std::string_view bytes) {
  if (bytes.empty()) return FileKind::empty;
  if (isFit(bytes)) return FileKind::fit;
  if (const Start* start = startOf(bytes)) return start->kind;
  switch (firstVisible(bytes)) {
    case '<':
      return FileKind::xml;
    case '{':
    case '[':
      return FileKind::json;
    default:
      return FileKind::other;
  }
}

std::string nameOfKind(std::string_view bytes) {
  if (bytes.empty()) return "an empty file";
  if (const Start* start = startOf(bytes)) return start->name;
  switch (kindOfFile(bytes)) {
    case FileKind::fit:
      return "a FIT file";
    case FileKind::xml:
      return "an XML text";
    case FileKind::json:
      return "a JSON text";
    default:
      return isText(bytes) ? "a plain text" : "a file of an unknown kind";
  }
}

}  // namespace ax::reader
