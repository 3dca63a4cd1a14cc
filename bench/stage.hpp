// SPDX-License-Identifier: Apache-2.0
// What a measurement runs on: a bus of its own, with a peer in the service's place.
#pragma once

#include <string>
#include <vector>

#include <sys/types.h>

namespace bench {

// A process that ends with its owner. It has started when it has written its first line.
class Child {
  public:
    explicit Child(const std::vector<std::string> &command);
    ~Child();
    Child(const Child &) = delete;
    Child &operator=(const Child &) = delete;

    const std::string &first_line() const { return first_line_; }

  private:
    pid_t process_ = -1;
    std::string first_line_;
};

class TemporaryDirectory {
  public:
    TemporaryDirectory();
    ~TemporaryDirectory();
    TemporaryDirectory(const TemporaryDirectory &) = delete;
    TemporaryDirectory &operator=(const TemporaryDirectory &) = delete;

    const std::string &path() const { return path_; }

  private:
    std::string path_;
};

// While it lives, this process's system bus is a private one on which the peer answers.
class Stage {
  public:
    Stage();

  private:
    TemporaryDirectory directory_;
    Child bus_;
    Child peer_;
};

} // namespace bench
