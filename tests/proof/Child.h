#pragma once

#include <functional>
#include <string>

namespace ax::proof {

struct ChildEnd {
  std::string result;   // what the body answered
  std::string failure;  // how else the process ended, and the line that tells most of why; empty: well
};

// Runs `body` in a child, since what is started, hidden or grafted stays for the life of a process. What has
// leaked when the body is over counts as a failure where leaks are looked for, and so does taking too long.
ChildEnd runInChild(const std::function<std::string()>& body, unsigned seconds);

struct Tally {
  std::size_t questions = 0;
  std::size_t failed = 0;
};

// Runs `work` in as many processes at once, each told its number, and adds up what they answer. One that ends
// badly counts as failed.
Tally onWorkers(std::size_t workers, const std::function<Tally(std::size_t)>& work);

}  // namespace ax::proof
