// SPDX-License-Identifier: Apache-2.0
// Files that last as long as a test. Who makes a TemporaryDirectory owns it: it is gone at the end,
// with all that is in it.
#pragma once

#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <system_error>

namespace test {

class TemporaryDirectory {
  public:
    TemporaryDirectory() {
        if (mkdtemp(path_.data()) == nullptr)
            throw std::system_error(errno, std::generic_category(), "a temporary directory");
    }
    ~TemporaryDirectory() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }
    TemporaryDirectory(const TemporaryDirectory &) = delete;
    TemporaryDirectory &operator=(const TemporaryDirectory &) = delete;

    const std::string &path() const { return path_; }
    std::string file(const std::string &name) const { return path_ + "/" + name; }

  private:
    std::string path_ = "/tmp/ims-test-XXXXXX"; // short enough for the path of a socket
};

inline std::string content_of(const std::string &path) {
    std::ifstream file{path, std::ios::binary};
    return {std::istreambuf_iterator<char>{file}, {}};
}

inline void put_content(const std::string &path, const std::string &content) {
    std::ofstream{path, std::ios::binary} << content;
}

} // namespace test
