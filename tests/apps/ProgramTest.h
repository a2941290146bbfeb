#pragma once

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

#include "tests/tour/Samples.h"

namespace ax::app {

struct Outcome {
  int code;
  std::string out, err;
};

// Runs the program itself, as its users do, in a folder of this process's own that goes with the test.
class ProgramTest : public testing::Test {
 protected:
  void SetUp() override { std::filesystem::create_directories(folder_); }
  void TearDown() override { std::filesystem::remove_all(folder_); }

  std::string file(const std::string& name, const std::string& text) const {
    const std::filesystem::path path = folder_ / name;
    std::ofstream(path, std::ios::binary) << text;
    return path.string();
  }

  Outcome run(const std::string& arguments, const std::string& input = "") const {
    const std::filesystem::path program =
        std::filesystem::read_symlink("/proc/self/exe").parent_path() / "axvelto";
    const std::string in = file("in", input), out = file("out", ""), err = file("err", "");
    const std::string line =
        "'" + program.string() + "' " + arguments + " <'" + in + "' >'" + out + "' 2>'" + err + "'";
    const int status = std::system(line.c_str());
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, textOf(out), textOf(err)};
  }

  static std::string sample(const std::string& name) { return (tour::samplesFolder() / name).string(); }

 private:
  static std::string textOf(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
  }

  const std::filesystem::path folder_ =
      std::filesystem::path(testing::TempDir()) / ("axvelto-commands-" + std::to_string(getpid()));
};

}  // namespace ax::app
