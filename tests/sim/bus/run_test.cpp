// SPDX-License-Identifier: Apache-2.0
// The program itself: its two commands, their exit statuses and what they leave behind.
#include "tests/sim/bus/bus_client.hpp"
#include "tests/support/files.hpp"

#include <csignal>
#include <filesystem>
#include <fmt/format.h>
#include <poll.h>
#include <set>
#include <sys/syscall.h>
#include <unistd.h>

namespace sim::test {
namespace {

using testing::AllOf;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

struct Finished {
    int status;
    std::string errors;
};

Finished finish(const std::vector<std::string> &arguments,
                const Program::Environment &environment = {}) {
    Program program(arguments, environment);
    auto errors = program.read_errors();
    return {program.wait(), std::move(errors)};
}

Finished run_shell(const std::string &script) {
    return finish({"run", "--", "sh", "-c", script});
}

bool exists(pid_t pid) {
    return kill(pid, 0) == 0;
}

// Returns when the process has ended; at once when it has already.
void wait_for_end(pid_t pid) {
    const int fd = static_cast<int>(syscall(SYS_pidfd_open, pid, 0));
    if (fd < 0)
        return;
    pollfd ended{fd, POLLIN, 0};
    EXPECT_EQ(poll(&ended, 1, 20000), 1) << "process " << pid << " goes on";
    close(fd);
}

pid_t daemon_of(const std::string &address) {
    const Client client(address);
    const auto reply = Variant::adopt(g_dbus_connection_call_sync(
        client.connection(), "org.freedesktop.DBus", "/org/freedesktop/DBus",
        "org.freedesktop.DBus", "GetConnectionUnixProcessID",
        g_variant_new("(s)", "org.freedesktop.DBus"), G_VARIANT_TYPE("(u)"), G_DBUS_CALL_FLAGS_NONE,
        -1, nullptr, nullptr));
    guint32 pid = 0;
    if (reply)
        g_variant_get(reply.get(), "(u)", &pid);
    EXPECT_NE(pid, 0U);
    return static_cast<pid_t>(pid);
}

// A command that says where its bus is and stays until its input ends.
class Running : public testing::Test {
  protected:
    Running()
        : program_({"run", "--", "sh", "-c", "echo $$ $DBUS_SYSTEM_BUS_ADDRESS; read x; exit 5"}) {
        const auto line = program_.read_line();
        command_ = std::stoi(line);
        address_ = line.substr(line.find(' ') + 1);
        daemon_ = daemon_of(address_);
    }

    Program program_;
    pid_t command_ = 0;
    std::string address_;
    pid_t daemon_ = 0;
};

TEST(Run, ExitsWithTheStatusOfItsCommand) {
    EXPECT_EQ(run_shell("exit 0").status, 0);
    EXPECT_EQ(run_shell("exit 7").status, 7);
    EXPECT_EQ(run_shell("kill -KILL $$").status, 128 + SIGKILL);
    EXPECT_EQ(run_shell("kill -TERM $$").status, 128 + SIGTERM);
}

TEST(Run, SaysWhenThereIsNoSuchCommand) {
    const auto missing = finish({"run", "--", "no-such-command-here"});
    EXPECT_EQ(missing.status, 127);
    EXPECT_THAT(missing.errors, HasSubstr("no-such-command-here"));
    const auto directory = finish({"run", "--", "/etc/passwd"});
    EXPECT_EQ(directory.status, 126);
    EXPECT_THAT(directory.errors, HasSubstr("/etc/passwd"));
}

TEST(Run, SaysWhenThereIsNoBusToStart) {
    const auto result = finish({"run", "--", "true"}, {{"PATH", "/nowhere"}});
    EXPECT_EQ(result.status, 125);
    EXPECT_THAT(result.errors, HasSubstr("dbus-daemon"));
}

TEST(Run, IsSilentWhenNothingIsWrong) {
    EXPECT_THAT(run_shell("exit 0").errors, IsEmpty());
}

TEST(Run, PassesInputOutputAndTheRestOfTheEnvironment) {
    Program program({"run", "--", "sh", "-c", "echo \"$DBUS_SESSION_BUS_ADDRESS\"; cat"},
                    {{"DBUS_SESSION_BUS_ADDRESS", "unix:path=/session"},
                     {"DBUS_SYSTEM_BUS_ADDRESS", "unix:path=/system"}});
    EXPECT_EQ(program.read_line(), "unix:path=/session");
    program.close_input();
    EXPECT_EQ(program.wait(), 0);
}

TEST_F(Running, TheServiceIsOnTheBusOfTheCommand) {
    Client client(address_);
    EXPECT_EQ(client.register_application(0), 1);
    // Refusals are told without being asked for.
    EXPECT_EQ(client.call(0, kCall, "EndCall", "(1, 9, 0, 0)").body, "(12,)");
    const auto errors = program_.read_errors("refused");
    EXPECT_THAT(errors, AllOf(HasSubstr("sub0 EndCall (1, 9, 0, 0) from :"),
                              HasSubstr("(test) refused with 12: there is no call 9"),
                              Not(HasSubstr("RegisterApplication"))));
    program_.close_input();
    EXPECT_EQ(program_.wait(), 5);
}

TEST_F(Running, LeavesNothingBehind) {
    program_.close_input();
    EXPECT_EQ(program_.wait(), 5);
    EXPECT_FALSE(exists(daemon_));
    EXPECT_FALSE(exists(command_));
}

TEST_F(Running, PassesSignalsOn) {
    program_.send_signal(SIGTERM);
    EXPECT_EQ(program_.wait(), 128 + SIGTERM);
    EXPECT_FALSE(exists(daemon_));
    EXPECT_FALSE(exists(command_));
}

TEST_F(Running, LeavesNothingBehindWhenItIsKilled) {
    program_.send_signal(SIGKILL);
    EXPECT_EQ(program_.wait(), 128 + SIGKILL);
    wait_for_end(daemon_);
    wait_for_end(command_);
}

TEST_F(Running, EndsTheCommandWhenItsBusIsGone) {
    kill(daemon_, SIGKILL);
    EXPECT_EQ(program_.wait(), 125);
    EXPECT_THAT(program_.read_errors(), HasSubstr("the bus is gone"));
    EXPECT_FALSE(exists(command_));
}

TEST(Run, TheCommandDecidesWhatASignalMeans) {
    for (const auto &[number, name] : {std::pair{SIGINT, "INT"}, {SIGTERM, "TERM"}}) {
        // The waiting sleep is left over for the program to end.
        Program program({"run", "--", "sh", "-c",
                         fmt::format("trap 'exit 42' {}; sleep 1000 & echo $!; wait", name)});
        const pid_t left_over = std::stoi(program.read_line());
        program.send_signal(number);
        EXPECT_EQ(program.wait(), 42) << name;
        EXPECT_FALSE(exists(left_over));
    }
}

TEST(Run, EndsWhatTheCommandLeftRunning) {
    Program program(
        {"run", "--", "sh", "-c",
         "sh -c 'trap \"\" TERM; echo $$; exec sleep 1000' & sleep 1000 & echo $!; wait %2"});
    const pid_t one = std::stoi(program.read_line());
    const pid_t other = std::stoi(program.read_line());
    program.send_signal(SIGTERM);
    EXPECT_EQ(program.wait(), 128 + SIGTERM);
    EXPECT_FALSE(exists(one));
    EXPECT_FALSE(exists(other));
}

TEST(Run, KeepsNothingInTheFileSystem) {
    const ::test::TemporaryDirectory directory;
    Program program({"run", "--", "sh", "-c", "echo here; read x"},
                    {{"TMPDIR", directory.path()}, {"XDG_RUNTIME_DIR", directory.path()}});
    program.read_line();
    EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
    program.close_input();
    program.wait();
    EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
}

TEST(Run, ManyAtOnceDoNotMeet) {
    std::vector<std::unique_ptr<Program>> programs;
    for (int i = 0; i < 4; ++i)
        programs.push_back(std::make_unique<Program>(std::vector<std::string>{
            "run", "--", "sh", "-c", "echo $DBUS_SYSTEM_BUS_ADDRESS; read x"}));
    std::set<std::string> addresses;
    for (const auto &program : programs)
        addresses.insert(program->read_line());
    EXPECT_EQ(addresses.size(), programs.size());
    for (const auto &address : addresses)
        EXPECT_EQ(Client(address).register_application(0), 1);
}

TEST(Run, VerboseTellsEveryRequestReplyAndSignal) {
    Program program({"run", "--verbose", "--speed", "0", "--slots", "1", "--", "sh", "-c",
                     "echo $DBUS_SYSTEM_BUS_ADDRESS; read x"});
    Client client(program.read_line());
    client.register_application(0);
    client.call(0, kCall, "MakeCall", "(1, '+15559999', 0, '', '', '', '')");
    client.wait_for(0, "CallEstablished");
    const auto errors = program.read_errors("CallEstablished");
    EXPECT_THAT(errors,
                AllOf(HasSubstr("sub0 RegisterApplication (0, 'test') from :"),
                      HasSubstr("MakeCall (1, '+15559999', 0, '', '', '', '') from"),
                      HasSubstr(" -> (0, 1)"), HasSubstr("sub0 signal CallInProgress (1,)")));
}

TEST(Usage, IsExplained) {
    for (const auto *argument : {"--help", "--version"})
        EXPECT_EQ(finish({argument}).status, 0) << argument;
    EXPECT_EQ(finish({"serve", "--help"}).status, 0);
    Program help({"run", "--help"});
    EXPECT_THAT(help.read_line(), Not(IsEmpty()));
    EXPECT_EQ(help.wait(), 0);
}

TEST(Usage, MistakesAreNamed) {
    const struct {
        std::vector<std::string> arguments;
        const char *text;
    } rows[] = {
        {{}, "ims-sim serve, or ims-sim run -- COMMAND"},
        {{"dance"}, "dance"},
        {{"serve", "--slots", "0"}, "--slots"},
        {{"serve", "--slots", "65"}, "--slots"},
        {{"serve", "--speed", "-1"}, "--speed"},
        {{"serve", "--speed", "fast"}, "--speed"},
        {{"serve", "--speed", "nan"}, "--speed"},
        {{"serve", "--speed", "inf"}, "--speed"},
        {{"serve", "--ring-time", "0"}, "--ring-time"},
        {{"serve", "--ring-time", "nan"}, "--ring-time"},
        {{"serve", "--colour"}, "--colour"},
        {{"serve", "--quiet", "--verbose"}, "excludes"},
        {{"serve", "--number", "5=+1555"}, "the slots are 0 to 1"},
        {{"serve", "--number", "+1555"}, "write SLOT=NUMBER"},
        {{"serve", "--number", "x=+1555"}, "the slots are 0 to 1"},
        {{"serve", "--number", "0=bob"}, "is no number"},
        {{"serve", "--number", "0=112"}, "emergency number"},
        {{"serve", "--number", "0=15550101"}, "belongs to two slots"},
        {{"run"}, "ims-sim run -- COMMAND"},
        {{"run", "ls", "--all"}, "Options of the command go after --"},
    };
    for (const auto &row : rows) {
        const auto result = finish(row.arguments);
        EXPECT_EQ(result.status, 2) << row.text;
        EXPECT_THAT(result.errors, HasSubstr(row.text));
    }
}

TEST(Serve, SaysWhenThereIsNoBus) {
    const auto given = finish({"serve", "--address", "unix:path=/nowhere/bus"});
    EXPECT_EQ(given.status, 1);
    EXPECT_THAT(given.errors, HasSubstr("cannot reach the bus"));
    const auto system = finish({"serve"}, {{"DBUS_SYSTEM_BUS_ADDRESS", "unix:path=/nowhere/bus"}});
    EXPECT_EQ(system.status, 1);
    EXPECT_THAT(system.errors,
                AllOf(HasSubstr("cannot reach the bus"), HasSubstr("--address ADDRESS")));
    EXPECT_EQ(finish({"serve", "--address", "nonsense"}).status, 1);
}

TEST(Serve, SaysWhenTheNameIsTaken) {
    PrivateBus bus;
    Client client(bus.address());
    Program first({"serve", "--address", bus.address()});
    client.wait_until_owned(kServiceName);
    const auto second = finish({"serve", "--address", bus.address()});
    EXPECT_EQ(second.status, 1);
    EXPECT_THAT(second.errors, HasSubstr("org.kelvo.ims is taken"));
}

TEST(Serve, EndsOnRequest) {
    PrivateBus bus;
    for (const int number : {SIGINT, SIGTERM, SIGHUP}) {
        Program program({"serve"}, {{"DBUS_SYSTEM_BUS_ADDRESS", bus.address()}});
        EXPECT_THAT(program.read_errors("is ready"),
                    HasSubstr("/org/kelvo/ims/sub1 has the number +15550101"));
        Client client(bus.address());
        client.wait_until_owned(kServiceName);
        program.send_signal(number);
        EXPECT_EQ(program.wait(), 0);
        client.wait_until_gone(kServiceName);
    }
}

TEST(Serve, EndsWithAFailureWhenItsBusGoes) {
    auto bus = std::make_unique<PrivateBus>();
    Program program({"serve", "--address", bus->address()});
    program.read_errors("is ready");
    bus.reset();
    EXPECT_EQ(program.wait(), 1);
    EXPECT_THAT(program.read_errors(), HasSubstr("the bus is gone"));
}

} // namespace
} // namespace sim::test
