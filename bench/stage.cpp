// SPDX-License-Identifier: Apache-2.0
#include "bench/stage.hpp"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <system_error>

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace bench {
namespace {

[[noreturn]] void fail(const char *what) {
    throw std::system_error(errno, std::generic_category(), what);
}

std::string read_first_line(int descriptor) {
    std::string line;
    for (char c = 0; read(descriptor, &c, 1) == 1;) {
        if (c == '\n')
            return line;
        line += c;
    }
    throw std::runtime_error("a process ended before it was ready");
}

// A bus that is not told otherwise lets a connection wait for 128 replies only.
std::string write_configuration(const std::string &directory) {
    const std::string path = directory + "/bus.conf";
    std::ofstream file{path};
    file << "<!DOCTYPE busconfig PUBLIC \"-//freedesktop//DTD D-BUS Bus Configuration 1.0//EN\"\n"
            " \"http://www.freedesktop.org/standards/dbus/1.0/busconfig.dtd\">\n"
            "<busconfig>\n"
            "  <listen>unix:path="
         << directory
         << "/bus</listen>\n"
            "  <auth>EXTERNAL</auth>\n"
            "  <policy context=\"default\">\n"
            "    <allow own=\"*\"/>\n"
            "    <allow send_destination=\"*\"/>\n"
            "    <allow receive_sender=\"*\"/>\n"
            "  </policy>\n"
            "  <limit name=\"max_replies_per_connection\">50000</limit>\n"
            "</busconfig>\n";
    file.close();
    if (!file)
        fail("bus.conf");
    return path;
}

std::string start_of_bus(const Child &bus) {
    setenv("DBUS_SYSTEM_BUS_ADDRESS", bus.first_line().c_str(), 1);
    return std::filesystem::read_symlink("/proc/self/exe").parent_path() / "bench_peer";
}

} // namespace

Child::Child(const std::vector<std::string> &command) {
    std::array<int, 2> output{};
    if (pipe2(output.data(), O_CLOEXEC) != 0)
        fail("pipe2");
    std::vector<char *> arguments;
    for (const std::string &argument : command)
        arguments.push_back(const_cast<char *>(argument.c_str()));
    arguments.push_back(nullptr);
    const pid_t parent = getpid();
    process_ = fork();
    if (process_ < 0)
        fail("fork");
    if (process_ == 0) {
        prctl(PR_SET_PDEATHSIG, SIGKILL);
        dup2(output[1], STDOUT_FILENO);
        if (getppid() == parent)
            execvp(arguments[0], arguments.data());
        _exit(127);
    }
    close(output[1]);
    first_line_ = read_first_line(output[0]);
    close(output[0]);
}

Child::~Child() {
    kill(process_, SIGTERM);
    while (waitpid(process_, nullptr, 0) < 0 && errno == EINTR) {
    }
}

TemporaryDirectory::TemporaryDirectory()
    : path_{std::filesystem::temp_directory_path() / "kelvo-bench-XXXXXX"} {
    if (!mkdtemp(path_.data()))
        fail("mkdtemp");
}

TemporaryDirectory::~TemporaryDirectory() {
    std::error_code ignored;
    std::filesystem::remove_all(path_, ignored);
}

Stage::Stage()
    : bus_{{"dbus-daemon", "--config-file=" + write_configuration(directory_.path()),
            "--print-address=1", "--nofork", "--nopidfile"}},
      peer_{{start_of_bus(bus_)}} {}

} // namespace bench
