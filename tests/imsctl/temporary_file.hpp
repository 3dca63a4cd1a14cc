// SPDX-License-Identifier: Apache-2.0
// A file that lasts as long as a test.
#pragma once

#include <cstdlib>
#include <fstream>
#include <stdexcept>
#include <string>
#include <unistd.h>

namespace test {

class TemporaryFile {
  public:
    explicit TemporaryFile(const std::string &content) {
        const int descriptor = mkstemp(name_.data());
        if (descriptor < 0)
            throw std::runtime_error("cannot make a temporary file");
        close(descriptor);
        std::ofstream{name_} << content;
    }
    ~TemporaryFile() { unlink(name_.c_str()); }
    TemporaryFile(const TemporaryFile &) = delete;
    TemporaryFile &operator=(const TemporaryFile &) = delete;

    const std::string &name() const { return name_; }

  private:
    std::string name_ = "/tmp/imsctl-test-XXXXXX";
};

} // namespace test
