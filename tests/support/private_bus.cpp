// SPDX-License-Identifier: Apache-2.0
#include "tests/support/private_bus.hpp"

#include "tests/support/pump.hpp"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <system_error>

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace test {
namespace {

constexpr const char *kAddressVariable = "DBUS_SYSTEM_BUS_ADDRESS";

[[noreturn]] void fail(const char *what) {
    throw std::system_error(errno, std::generic_category(), what);
}

struct Pipe {
    Pipe() {
        if (pipe2(ends.data(), O_CLOEXEC) != 0)
            fail("pipe2");
    }
    ~Pipe() {
        close_end(0);
        close_end(1);
    }
    Pipe(const Pipe &) = delete;
    Pipe &operator=(const Pipe &) = delete;

    void close_end(std::size_t which) {
        if (ends[which] >= 0)
            close(ends[which]);
        ends[which] = -1;
    }

    std::array<int, 2> ends{-1, -1};
};

std::string read_file(const std::string &path) {
    std::ifstream file{path};
    return {std::istreambuf_iterator<char>{file}, {}};
}

// Up to the end of the line; nothing when there is none.
std::string read_line(int descriptor) {
    std::string line;
    for (;;) {
        pollfd waiting{descriptor, POLLIN, 0};
        const auto limit = std::chrono::milliseconds{kDeadline}.count();
        if (poll(&waiting, 1, static_cast<int>(limit)) <= 0)
            throw DeadlineExceeded("waited in vain for dbus-daemon to listen");
        std::array<char, 256> chunk{};
        const ssize_t got = read(descriptor, chunk.data(), chunk.size());
        if (got <= 0)
            return {};
        line.append(chunk.data(), static_cast<std::size_t>(got));
        if (const auto end = line.find('\n'); end != std::string::npos)
            return line.substr(0, end);
    }
}

} // namespace

PrivateBus::PrivateBus(std::string_view policy_rules, std::string_view elements) {
    std::string pattern = "/tmp/ims-test-XXXXXX";
    if (!mkdtemp(pattern.data()))
        fail("mkdtemp");
    directory_ = pattern;
    write_configuration(policy_rules, elements);
    start();
    setenv(kAddressVariable, address_.c_str(), 1);
}

PrivateBus::~PrivateBus() {
    unsetenv(kAddressVariable);
    stop();
    std::error_code ignored;
    std::filesystem::remove_all(directory_, ignored);
}

void PrivateBus::stop() {
    if (daemon_ <= 0)
        return;
    kill(daemon_, SIGTERM);
    while (waitpid(daemon_, nullptr, 0) < 0 && errno == EINTR) {
    }
    daemon_ = -1;
}

void PrivateBus::write_configuration(std::string_view policy_rules,
                                     std::string_view elements) const {
    std::ofstream file{directory_ + "/bus.conf"};
    file << "<!DOCTYPE busconfig PUBLIC \"-//freedesktop//DTD D-BUS Bus Configuration 1.0//EN\"\n"
            " \"http://www.freedesktop.org/standards/dbus/1.0/busconfig.dtd\">\n"
            "<busconfig>\n"
            "  <type>session</type>\n"
            "  <listen>unix:path="
         << directory_
         << "/bus</listen>\n"
            "  <auth>EXTERNAL</auth>\n"
            "  <policy context=\"default\">\n"
            "    <allow user=\"*\"/>\n"
            "    <allow own=\"*\"/>\n"
            "    <allow send_destination=\"*\" eavesdrop=\"false\"/>\n"
            "    <allow send_type=\"signal\"/>\n"
            "    <allow receive_sender=\"*\"/>\n"
         << policy_rules
         << "  </policy>\n"
            "  <limit name=\"max_replies_per_connection\">100000</limit>\n"
         << elements << "</busconfig>\n";
    file.close();
    if (!file)
        fail("bus.conf");
}

void PrivateBus::start() {
    Pipe address;
    const std::string configuration = "--config-file=" + directory_ + "/bus.conf";
    const std::string print = "--print-address=" + std::to_string(address.ends[1]);
    const std::string log = directory_ + "/log";
    const std::array<const char *, 6> arguments{"dbus-daemon", configuration.c_str(), print.c_str(),
                                                "--nofork",    "--nopidfile",         nullptr};
    const pid_t parent = getpid();
    daemon_ = fork();
    if (daemon_ < 0)
        fail("fork");
    if (daemon_ == 0) {
        // Nothing that takes a lock: another thread of the parent may have held it.
        prctl(PR_SET_PDEATHSIG, SIGKILL);
        fcntl(address.ends[1], F_SETFD, 0);
        dup2(open(log.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600), STDERR_FILENO);
        if (getppid() == parent)
            execvp(arguments[0], const_cast<char *const *>(arguments.data()));
        _exit(127);
    }
    address.close_end(1);
    address_ = read_line(address.ends[0]);
    if (address_.empty())
        throw std::runtime_error("dbus-daemon ended before it listened: " + read_file(log));
}

} // namespace test
