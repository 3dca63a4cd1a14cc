// SPDX-License-Identifier: Apache-2.0
#include "sim/base/store.hpp"

#include "sim/base/descriptor.hpp"

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <filesystem>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace sim {

namespace {

// Settings hold passwords: the files are for their owner alone.
constexpr mode_t kFileMode = 0600;

Refusal failure(std::string_view what, const std::string &path) {
    return refuse(Result::kFailed, "cannot {} {}: {}", what, path, std::strerror(errno));
}

bool write_all(int file, std::string_view rest) {
    while (!rest.empty()) {
        const auto written = ::write(file, rest.data(), rest.size());
        if (written < 0 && errno != EINTR)
            return false;
        if (written > 0)
            rest.remove_prefix(static_cast<std::size_t>(written));
    }
    return true;
}

bool read_all(int file, std::string &content) {
    char block[4096];
    for (;;) {
        const auto count = ::read(file, block, sizeof block);
        if (count == 0)
            return true;
        if (count < 0 && errno != EINTR)
            return false;
        if (count > 0)
            content.append(block, static_cast<std::size_t>(count));
    }
}

} // namespace

Answer<std::shared_ptr<Store>> Store::open(const std::string &path) {
    std::error_code error;
    std::filesystem::create_directories(path, error);
    if (error)
        return refuse(Result::kFailed, "cannot make the directory {}: {}", path, error.message());
    const int directory = ::open(path.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (directory < 0)
        return failure("open the directory", path);
    const std::shared_ptr<Store> store(new Store(path, directory));
    // The lock goes with the process, however that ends.
    if (flock(directory, LOCK_EX | LOCK_NB) == 0)
        return store;
    if (errno == EWOULDBLOCK)
        return refuse(Result::kFailed, "another ims-sim keeps its state in {}", path);
    return failure("lock the directory", path);
}

Store::~Store() {
    close(directory_);
}

Answer<std::optional<std::string>> Store::read(const std::string &name) const {
    // Not to wait for a writer, should it be a pipe.
    const Descriptor file(openat(directory_, name.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    if (!file && errno == ENOENT)
        return std::optional<std::string>();
    if (!file)
        return failure("open", path_of(name));
    struct stat status {};
    if (fstat(file.number(), &status) != 0)
        return failure("read", path_of(name));
    if (!S_ISREG(status.st_mode))
        return refuse(Result::kFailed, "{} is no file", path_of(name));
    std::string content;
    if (!read_all(file.number(), content))
        return failure("read", path_of(name));
    return std::optional(std::move(content));
}

Status Store::write(const std::string &name, const std::string &content) const {
    // Only this process writes here: what stands under this name is left from one that was killed.
    const std::string fresh = name + ".new";
    unlinkat(directory_, fresh.c_str(), 0);
    {
        const Descriptor file(
            openat(directory_, fresh.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kFileMode));
        if (!file)
            return failure("make", path_of(fresh));
        if (!write_all(file.number(), content) || fsync(file.number()) != 0) {
            const auto refusal = failure("write", path_of(fresh));
            unlinkat(directory_, fresh.c_str(), 0);
            return refusal;
        }
    }
    if (renameat(directory_, fresh.c_str(), directory_, name.c_str()) != 0) {
        const auto refusal = failure("replace", path_of(name));
        unlinkat(directory_, fresh.c_str(), 0);
        return refusal;
    }
    if (fsync(directory_) != 0)
        return failure("write the directory", path_);
    return Done{};
}

} // namespace sim
