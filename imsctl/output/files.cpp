// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/files.hpp"

#include "imsctl/output/failure.hpp"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <fcntl.h>
#include <filesystem>
#include <fmt/format.h>
#include <memory>
#include <sys/stat.h>
#include <unistd.h>

namespace imsctl {
namespace {

struct Close {
    void operator()(std::FILE *file) const { std::fclose(file); }
};
using File = std::unique_ptr<std::FILE, Close>;

Failure file_failure(FailureKind kind, const char *what, const std::string &name, int error) {
    return {kind,
            fmt::format("cannot {} {}: {}", what, quote(name), std::strerror(error)),
            "",
            {{"file", name}}};
}

std::string read_all(std::FILE *file, const std::string &name) {
    std::string content;
    char block[4096];
    while (const std::size_t length = std::fread(block, 1, sizeof block, file))
        content.append(block, length);
    if (std::ferror(file))
        throw file_failure(FailureKind::kInput, "read", name, errno);
    return content;
}

Failure not_written(const std::string &name) {
    return file_failure(FailureKind::kOutput, "write", name, errno);
}

File open_to_write(const std::string &name, int flags) {
    const int descriptor = open(name.c_str(), O_WRONLY | O_CLOEXEC | flags, S_IRUSR | S_IWUSR);
    if (descriptor < 0)
        throw not_written(name);
    File file(fdopen(descriptor, "w"));
    if (!file) {
        const int error = errno;
        close(descriptor);
        errno = error;
        throw not_written(name);
    }
    return file;
}

void write_all(File file, const std::string &name, const std::string &content) {
    const bool written =
        std::fwrite(content.data(), 1, content.size(), file.get()) == content.size();
    // Only closing tells of the last block.
    if (!written || std::fclose(file.release()) != 0)
        throw not_written(name);
}

// A new file on the way to its place.
class Replacement {
  public:
    explicit Replacement(std::string place)
        : place_(std::move(place)), name_(place_ + ".new"),
          file_(open_to_write(name_, O_CREAT | O_EXCL)) {}
    ~Replacement() {
        if (!done_)
            unlink(name_.c_str());
    }
    Replacement(const Replacement &) = delete;
    Replacement &operator=(const Replacement &) = delete;

    void put(const std::string &content) {
        write_all(std::move(file_), name_, content);
        if (rename(name_.c_str(), place_.c_str()) != 0)
            throw not_written(place_);
        done_ = true;
    }

  private:
    std::string place_;
    std::string name_;
    File file_;
    bool done_ = false;
};

// Where a link leads: the link itself is to stay.
std::string place_of(const std::string &name) {
    std::error_code no_such_file;
    const auto place = std::filesystem::canonical(name, no_such_file);
    return no_such_file ? name : place.string();
}

} // namespace

std::string read_file(const std::string &name) {
    if (name == kStandardStream)
        return read_all(stdin, "standard input");
    const File file(std::fopen(name.c_str(), "re"));
    if (!file)
        throw file_failure(FailureKind::kInput, "read", name, errno);
    return read_all(file.get(), name);
}

void write_file(const std::string &name, const std::string &content) {
    std::error_code unknown;
    const auto status = std::filesystem::status(name, unknown);
    // Devices and pipes take bytes, and stay.
    if (std::filesystem::exists(status) && !std::filesystem::is_regular_file(status))
        return write_all(open_to_write(name, 0), name, content);
    Replacement(place_of(name)).put(content);
}

} // namespace imsctl
