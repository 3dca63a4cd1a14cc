// SPDX-License-Identifier: Apache-2.0
#include "tests/support/private_bus.hpp"

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <fstream>
#include <stdexcept>
#include <system_error>

#include <fcntl.h>
#include <unistd.h>

namespace test {
namespace {

constexpr const char *kAddressVariable = "DBUS_SYSTEM_BUS_ADDRESS";

[[noreturn]] void fail_to_make(const char *what) {
    throw std::system_error(errno, std::generic_category(), what);
}

} // namespace

PrivateBus::PrivateBus(std::string_view policy_rules, std::string_view elements) {
    write_configuration(policy_rules, elements);
    start();
    if (const char *before = std::getenv(kAddressVariable); before != nullptr)
        system_bus_before_ = before;
    setenv(kAddressVariable, address_.c_str(), 1);
}

PrivateBus::~PrivateBus() {
    if (system_bus_before_)
        setenv(kAddressVariable, system_bus_before_->c_str(), 1);
    else
        unsetenv(kAddressVariable);
    stop();
}

void PrivateBus::stop() {
    daemon_.reset();
}

void PrivateBus::write_configuration(std::string_view policy_rules,
                                     std::string_view elements) const {
    std::ofstream file{directory_.file("bus.conf")};
    file << "<!DOCTYPE busconfig PUBLIC \"-//freedesktop//DTD D-BUS Bus Configuration 1.0//EN\"\n"
            " \"http://www.freedesktop.org/standards/dbus/1.0/busconfig.dtd\">\n"
            "<busconfig>\n"
            "  <type>session</type>\n"
            "  <listen>unix:path="
         << directory_.file("bus")
         << "</listen>\n"
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
        fail_to_make("bus.conf");
}

// What it says goes to a file, for nobody reads a pipe of it.
void PrivateBus::start() {
    const std::string log = directory_.file("log");
    const int errors = open(log.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600);
    if (errors < 0)
        fail_to_make("the log of the bus");
    daemon_.emplace(std::vector<std::string>{"dbus-daemon",
                                             "--config-file=" + directory_.file("bus.conf"),
                                             "--print-address=1", "--nofork", "--nopidfile"},
                    Process::Environment{}, ProcessStreams{.errors = errors});
    close(errors);
    try {
        address_ = daemon_->read_line();
    } catch (const std::runtime_error &why) {
        throw std::runtime_error(std::string{"dbus-daemon does not listen: "} + why.what() + "; " +
                                 content_of(log));
    }
}

} // namespace test
