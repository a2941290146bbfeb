#include "reader/importers/Unpacking.h"

#include <zip.h>
#include <zlib.h>

#include <algorithm>
#include <array>
#include <memory>
#include <optional>

#include "reader/importers/FileKind.h"
#include "reader/text/Fault.h"

namespace ax::reader {
namespace {

constexpr std::size_t largest = std::size_t{1} << 30;
constexpr const char* undamaged = "an undamaged archive";

std::size_t mostOf(std::size_t packed) {
  constexpr std::size_t times = 200;
  constexpr std::size_t always = std::size_t{16} << 20;
  return std::min(largest, std::max(always, packed * times));
}

Fault tooLarge(const std::string& name, std::size_t most) {
  return {name, "", "the archive unpacks to more than " + std::to_string(most >> 20) + " MB", "a workout"};
}

// What was unpacked, and why it ends early.
struct Unpacked {
  std::string bytes;
  std::optional<Fault> fault;
};

class Inflating {
 public:
  explicit Inflating(std::string_view packed, const std::string& name) : packed_(packed), name_(name) {
    constexpr int gzipOnly = 16 + MAX_WBITS;
    isOpen_ = inflateInit2(&stream_, gzipOnly) == Z_OK;
    stream_.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(packed.data()));
  }
  ~Inflating() {
    if (isOpen_) inflateEnd(&stream_);
  }
  Inflating(const Inflating&) = delete;
  Inflating& operator=(const Inflating&) = delete;

  // The members of an archive are one text; what stands behind the last is left alone.
  Unpacked run() {
    Unpacked result;
    bool isWhole = false;
    while (!result.fault) {
      if (isWhole && !startsMember()) break;
      const int status = step(result.bytes);
      isWhole = status == Z_STREAM_END;
      if (isWhole && inflateReset(&stream_) != Z_OK) break;
      if (status == Z_BUF_ERROR && left() == 0) result.fault = faultAt("the archive is cut off");
      if (status != Z_OK && status != Z_STREAM_END && !result.fault) {
        result.fault = faultAt("the archive is damaged");
      }
      if (result.bytes.size() > mostOf(packed_.size())) throw tooLarge(name_, mostOf(packed_.size()));
    }
    return result;
  }

 private:
  std::size_t taken() const { return reinterpret_cast<const char*>(stream_.next_in) - packed_.data(); }
  std::size_t left() const { return packed_.size() - taken(); }
  bool startsMember() const { return packed_.substr(taken()).starts_with("\x1F\x8B"); }
  Fault faultAt(const std::string& what) const {
    return {name_, "byte " + std::to_string(taken()), what, undamaged};
  }

  int step(std::string& bytes) {
    constexpr std::size_t most = std::size_t{1} << 30;
    stream_.avail_in = static_cast<uInt>(std::min(left(), most));
    stream_.next_out = reinterpret_cast<Bytef*>(part_.data());
    stream_.avail_out = static_cast<uInt>(part_.size());
    const int status = isOpen_ ? inflate(&stream_, Z_NO_FLUSH) : Z_MEM_ERROR;
    bytes.append(part_.data(), part_.size() - stream_.avail_out);
    return status;
  }

  std::string_view packed_;
  const std::string& name_;
  z_stream stream_ = {};
  std::array<char, 1 << 16> part_ = {};
  bool isOpen_ = false;
};

void tell(const UnpackOptions& options, const Fault& fault) {
  const std::string what = fault.place.empty() ? fault.what : fault.what + ", at " + fault.place;
  if (options.onFault) options.onFault(fault.file, what, fault.expected);
}

void unpackGzip(std::string_view bytes, const std::string& name, const UnpackOptions& options,
                const UnpackedFile& onFile) {
  const Unpacked result = Inflating(bytes, name).run();
  if (result.fault && (!options.readsDamaged || result.bytes.empty())) throw *result.fault;
  if (result.fault) tell(options, *result.fault);
  onFile(name, result.bytes);
}

using Archive = std::unique_ptr<zip_t, decltype(&zip_discard)>;
using Entry = std::unique_ptr<zip_file_t, decltype(&zip_fclose)>;

Archive openArchive(std::string_view bytes, const std::string& name) {
  zip_error_t error;
  zip_error_init(&error);
  zip_source_t* source = zip_source_buffer_create(bytes.data(), bytes.size(), 0, &error);
  zip_t* archive = source != nullptr ? zip_open_from_source(source, ZIP_RDONLY, &error) : nullptr;
  const std::string why = zip_error_strerror(&error);
  zip_error_fini(&error);
  if (archive == nullptr) {
    zip_source_free(source);
    throw Fault{name, "", "the archive cannot be opened: " + why, undamaged};
  }
  return {archive, zip_discard};
}

// Counts what a whole archive unpacks to.
class Unzipping {
 public:
  Unzipping(std::string_view bytes, const std::string& name)
      : archive_(openArchive(bytes, name)), name_(name), most_(mostOf(bytes.size())) {}

  void run(const UnpackOptions& options, const UnpackedFile& onFile) {
    const zip_int64_t count = zip_get_num_entries(archive_.get(), 0);
    for (zip_int64_t i = 0; i < count; ++i) {
      const std::string entry = nameOf(static_cast<zip_uint64_t>(i));
      if (isWanted(entry)) handOver(static_cast<zip_uint64_t>(i), name_ + "/" + entry, options, onFile);
    }
  }

 private:
  std::string nameOf(zip_uint64_t index) const {
    const char* name = zip_get_name(archive_.get(), index, ZIP_FL_ENC_GUESS);
    return name == nullptr ? "" : name;
  }

  // No folders, and nothing of what some systems put beside the files.
  static bool isWanted(const std::string& entry) {
    const std::string_view last = std::string_view(entry).substr(entry.rfind('/') + 1);
    return !last.empty() && !last.starts_with('.') && !entry.starts_with("__MACOSX/");
  }

  void handOver(zip_uint64_t index, const std::string& path, const UnpackOptions& options,
                const UnpackedFile& onFile) {
    const Unpacked unpacked = read(index, path);
    if (unpacked.fault) tell(options, *unpacked.fault);
    if (unpacked.fault && (!options.readsDamaged || unpacked.bytes.empty())) return;
    if (kindOfFile(unpacked.bytes) != FileKind::gzip) return onFile(path, unpacked.bytes);
    unpackGzip(unpacked.bytes, path, options, onFile);
  }

  Unpacked read(zip_uint64_t index, const std::string& path) {
    Unpacked result;
    const Entry entry(zip_fopen_index(archive_.get(), index, 0), zip_fclose);
    if (!entry) {
      const std::string why = zip_error_strerror(zip_get_error(archive_.get()));
      result.fault = Fault{path, "", "cannot be unpacked: " + why, "a file without a password"};
      return result;
    }
    std::array<char, 1 << 16> part;
    zip_int64_t count = 0;
    while ((count = zip_fread(entry.get(), part.data(), part.size())) > 0) {
      result.bytes.append(part.data(), static_cast<std::size_t>(count));
      unpacked_ += static_cast<std::size_t>(count);
      if (unpacked_ > most_) throw tooLarge(name_, most_);
    }
    if (count < 0) result.fault = Fault{path, "", "is damaged in the archive", undamaged};
    return result;
  }

  Archive archive_;
  const std::string& name_;
  std::size_t most_;
  std::size_t unpacked_ = 0;
};

}  // namespace

void unpack(std::string_view bytes, const std::string& name, const UnpackOptions& options,
            const UnpackedFile& onFile) {
  switch (kindOfFile(bytes)) {
    case FileKind::gzip:
      return unpackGzip(bytes, name, options, onFile);
    case FileKind::zip:
      return Unzipping(bytes, name).run(options, onFile);
    default:
      return onFile(name, bytes);
  }
}

}  // namespace ax::reader
