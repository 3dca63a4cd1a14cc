// SPDX-License-Identifier: Apache-2.0
#include "sim/base/private_bus.hpp"

#include "sim/base/child.hpp"
#include "sim/base/descriptor.hpp"
#include "sim/base/glib_ref.hpp"

#include <array>
#include <csignal>
#include <cstring>
#include <fcntl.h>
#include <fmt/format.h>
#include <poll.h>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unistd.h>

namespace sim {

namespace {

constexpr int kStartMilliseconds = 10000;
constexpr int kConfigFd = 3;
constexpr int kAddressFd = 4;

// Everybody of the same user may do everything; without a type the bus reads no other files.
std::string configuration() {
    const GText unique(g_uuid_string_random());
    return fmt::format(
        "<!DOCTYPE busconfig PUBLIC \"-//freedesktop//DTD D-Bus Bus Configuration "
        "1.0//EN\" \"http://www.freedesktop.org/standards/dbus/1.0/busconfig.dtd\">"
        "<busconfig><listen>unix:abstract=ims-sim-{}</listen>"
        "<auth>EXTERNAL</auth><policy context=\"default\">"
        "<allow send_destination=\"*\" eavesdrop=\"true\"/><allow eavesdrop=\"true\"/>"
        "<allow own=\"*\"/></policy></busconfig>",
        unique.get());
}

std::string read_line(int fd) {
    std::string line;
    pollfd ready{fd, POLLIN, 0};
    std::array<char, 512> buffer{};
    while (line.find('\n') == std::string::npos) {
        if (poll(&ready, 1, kStartMilliseconds) <= 0)
            return {};
        const auto length = read(fd, buffer.data(), buffer.size());
        if (length <= 0)
            return {};
        line.append(buffer.data(), static_cast<std::size_t>(length));
    }
    return line.substr(0, line.find('\n'));
}

std::string content(int fd) {
    std::array<char, 2048> buffer{};
    const auto length = pread(fd, buffer.data(), buffer.size(), 0);
    const std::string_view text(buffer.data(), length > 0 ? static_cast<std::size_t>(length) : 0);
    return std::string(text.substr(0, text.find_last_not_of('\n') + 1));
}

} // namespace

PrivateBus::~PrivateBus() {
    if (pid_ <= 0)
        return;
    kill(pid_, SIGTERM);
    waitpid(pid_, nullptr, 0);
}

std::optional<std::string> PrivateBus::start() {
    const Descriptor config(memfd_create("ims-sim-bus", MFD_CLOEXEC));
    const auto text = configuration();
    if (!config ||
        write(config.number(), text.data(), text.size()) != static_cast<ssize_t>(text.size()))
        return fmt::format("no memory for the configuration of the bus: {}", strerror(errno));

    std::array<int, 2> ends{};
    if (pipe2(ends.data(), O_CLOEXEC) != 0)
        return fmt::format("no pipe to the bus: {}", strerror(errno));
    const Descriptor reading(ends[0]);
    Descriptor writing(ends[1]);

    // What the bus says matters when it does not start; otherwise it would only stand between
    // the lines of the command.
    const Descriptor complaints(memfd_create("ims-sim-bus-errors", MFD_CLOEXEC));
    const auto started = spawn(
        {.command = {"dbus-daemon", "--nofork", fmt::format("--config-file=/dev/fd/{}", kConfigFd),
                     fmt::format("--print-address={}", kAddressFd)},
         .environment = {},
         .descriptors = {{config.number(), kConfigFd}, {writing.number(), kAddressFd}},
         .error_output = complaints.number(),
         .death_signal = SIGTERM,
         .own_session = true});
    if (const auto *error = std::get_if<SpawnError>(&started))
        return fmt::format("cannot start dbus-daemon ({}); on Debian it comes with the package "
                           "dbus-daemon",
                           error->text);
    pid_ = std::get<pid_t>(started);
    writing = Descriptor();
    address_ = read_line(reading.number());
    if (address_.empty())
        return fmt::format("dbus-daemon did not start: {}", content(complaints.number()));
    return std::nullopt;
}

} // namespace sim
