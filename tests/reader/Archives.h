#pragma once

#include <gtest/gtest.h>
#include <zip.h>
#include <zlib.h>

#include <string>
#include <utility>
#include <vector>

// Archives to be unpacked.
namespace ax::reader::testing {

inline std::string gzipped(const std::string& bytes) {
  z_stream stream = {};
  EXPECT_EQ(deflateInit2(&stream, Z_BEST_COMPRESSION, Z_DEFLATED, 16 + MAX_WBITS, 8, Z_DEFAULT_STRATEGY),
            Z_OK);
  std::string packed(deflateBound(&stream, bytes.size()), '\0');
  stream.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(bytes.data()));
  stream.avail_in = static_cast<uInt>(bytes.size());
  stream.next_out = reinterpret_cast<Bytef*>(packed.data());
  stream.avail_out = static_cast<uInt>(packed.size());
  EXPECT_EQ(deflate(&stream, Z_FINISH), Z_STREAM_END);
  packed.resize(stream.total_out);
  deflateEnd(&stream);
  return packed;
}

inline std::string zipped(const std::vector<std::pair<std::string, std::string>>& files) {
  zip_error_t error;
  zip_error_init(&error);
  zip_source_t* source = zip_source_buffer_create(nullptr, 0, 0, &error);
  zip_source_keep(source);
  zip_t* archive = zip_open_from_source(source, ZIP_TRUNCATE, &error);
  EXPECT_NE(archive, nullptr);
  for (const auto& [name, bytes] : files) {
    if (name.ends_with('/')) {
      zip_dir_add(archive, name.c_str(), ZIP_FL_ENC_UTF_8);
    } else {
      zip_file_add(archive, name.c_str(), zip_source_buffer(archive, bytes.data(), bytes.size(), 0),
                   ZIP_FL_ENC_UTF_8);
    }
  }
  EXPECT_EQ(zip_close(archive), 0);
  zip_source_open(source);
  zip_source_seek(source, 0, SEEK_END);
  std::string packed(static_cast<std::size_t>(zip_source_tell(source)), '\0');
  zip_source_seek(source, 0, SEEK_SET);
  zip_source_read(source, packed.data(), packed.size());
  zip_source_close(source);
  zip_source_free(source);
  return packed;
}

}  // namespace ax::reader::testing
