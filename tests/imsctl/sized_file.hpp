// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdlib>
#include <stdexcept>
#include <string>
#include <unistd.h>

namespace test {

// A file of this size, that is gone with the test.
class SizedFile {
  public:
    explicit SizedFile(std::size_t size) {
        const int descriptor = mkstemps(name_, sizeof ".png" - 1);
        if (descriptor < 0 || ftruncate(descriptor, static_cast<off_t>(size)) != 0)
            throw std::runtime_error("no file");
        close(descriptor);
    }
    ~SizedFile() { unlink(name_); }
    SizedFile(const SizedFile &) = delete;
    SizedFile &operator=(const SizedFile &) = delete;
    std::string name() const { return name_; }

  private:
    char name_[32] = "/tmp/sized-XXXXXX.png";
};

} // namespace test
