// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"

#include <memory>
#include <optional>
#include <string>

namespace sim {

// A directory of small files that this process alone writes. A file is replaced whole or not at
// all, whenever the process or the machine dies.
class Store {
  public:
    // Makes the directory when it does not exist, and keeps other stores out of it.
    static Answer<std::shared_ptr<Store>> open(const std::string &path);

    Store(const Store &) = delete;
    Store &operator=(const Store &) = delete;
    ~Store();

    std::string path_of(const std::string &name) const { return path_ + "/" + name; }
    // Nothing when there is no such file.
    Answer<std::optional<std::string>> read(const std::string &name) const;
    // Durable when it returns success.
    Status write(const std::string &name, const std::string &content) const;

  private:
    Store(std::string path, int directory) : path_(std::move(path)), directory_(directory) {}

    std::string path_;
    int directory_;
};

} // namespace sim
