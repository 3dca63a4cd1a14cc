// SPDX-License-Identifier: Apache-2.0
#include "tests/support/process.hpp"

#include "tests/support/pump.hpp"

#include <array>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstring>
#include <stdexcept>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

namespace test {
namespace {

constexpr std::size_t kChunk = 4096;

[[noreturn]] void fail_to_run(const std::string &program, int error) {
    throw std::system_error(error, std::generic_category(), "cannot run " + program);
}

void close_once(int &descriptor) {
    if (descriptor >= 0)
        close(descriptor);
    descriptor = -1;
}

struct Pipe {
    Pipe() {
        if (pipe2(ends.data(), O_CLOEXEC) != 0)
            throw std::system_error(errno, std::generic_category(), "pipe2");
    }
    ~Pipe() {
        close_once(ends[0]);
        close_once(ends[1]);
    }
    Pipe(const Pipe &) = delete;
    Pipe &operator=(const Pipe &) = delete;

    int take(std::size_t which) { return std::exchange(ends[which], -1); }

    std::array<int, 2> ends{-1, -1};
};

std::vector<std::string> merged(const Process::Environment &more) {
    std::vector<std::string> all;
    for (char **each = environ; *each != nullptr; ++each) {
        const std::string_view entry = *each;
        if (!more.contains(std::string{entry.substr(0, entry.find('='))}))
            all.emplace_back(entry);
    }
    for (const auto &[name, value] : more)
        all.push_back(name + "=" + value);
    return all;
}

std::vector<char *> pointers_to(std::vector<std::string> &texts) {
    std::vector<char *> pointers;
    for (std::string &text : texts)
        pointers.push_back(text.data());
    pointers.push_back(nullptr);
    return pointers;
}

// What the child does between fork() and the program: nothing that takes a lock, for another
// thread of the test may have held it.
[[noreturn]] void become(char *const *command, char *const *environment,
                         const std::array<int, 3> &streams, pid_t parent, int failure) {
    prctl(PR_SET_PDEATHSIG, SIGKILL);
    signal(SIGPIPE, SIG_DFL); // the test's own is ignored as soon as it has a bus
    for (int i = 0; i < 3; ++i)
        dup2(streams[static_cast<std::size_t>(i)], i);
    if (getppid() == parent)
        execvpe(command[0], command, environment);
    const int error = errno;
    [[maybe_unused]] const ssize_t told = write(failure, &error, sizeof error);
    _exit(127);
}

} // namespace

Process::Stream::~Stream() {
    end();
}

void Process::Stream::end() {
    close_once(descriptor);
}

void Process::Stream::read_more() {
    std::array<char, kChunk> chunk{};
    const ssize_t length = read(descriptor, chunk.data(), chunk.size());
    if (length > 0)
        text.append(chunk.data(), static_cast<std::size_t>(length));
    else if (length == 0 || errno != EINTR)
        end();
}

Process::Process(const std::vector<std::string> &command, const Environment &environment,
                 const ProcessStreams &streams) {
    Pipe input;
    Pipe output;
    Pipe error;
    Pipe failure;
    if (!streams.has_input)
        close_once(input.ends[1]); // there is nothing to read
    std::vector<std::string> words = command;
    std::vector<std::string> variables = merged(environment);
    const std::vector<char *> arguments = pointers_to(words);
    const std::vector<char *> settings = pointers_to(variables);
    const int errors = streams.errors >= 0 ? streams.errors : error.ends[1];

    const pid_t parent = getpid();
    pid_ = fork();
    if (pid_ == 0)
        become(arguments.data(), settings.data(), {input.ends[0], output.ends[1], errors}, parent,
               failure.ends[1]);
    if (pid_ < 0)
        fail_to_run(words[0], errno);

    for (Pipe *const each : {&output, &error, &failure})
        close_once(each->ends[1]);
    int why = 0;
    if (read(failure.ends[0], &why, sizeof why) == sizeof why) {
        waitpid(pid_, nullptr, 0);
        fail_to_run(words[0], why);
    }
    end_ = static_cast<int>(syscall(SYS_pidfd_open, pid_, 0));
    if (end_ < 0) {
        const int no_descriptor = errno;
        kill(pid_, SIGKILL);
        waitpid(pid_, nullptr, 0);
        fail_to_run(words[0], no_descriptor);
    }
    input_ = input.take(1);
    output_.descriptor = output.take(0);
    error_.descriptor = error.take(0);
}

Process::~Process() {
    if (end_ >= 0) {
        kill(pid_, SIGKILL);
        waitpid(pid_, nullptr, 0);
        close_once(end_);
    }
    close_input();
}

// Once the child's end has been seen, its number may be another's.
void Process::send_signal(int number) const {
    if (end_ >= 0)
        kill(pid_, number);
}

void Process::close_input() {
    close_once(input_);
}

bool Process::look(int milliseconds) {
    // Negative descriptors are passed over.
    std::array<pollfd, 3> watched{
        {{output_.descriptor, POLLIN, 0}, {error_.descriptor, POLLIN, 0}, {end_, POLLIN, 0}}};
    if (poll(watched.data(), watched.size(), milliseconds) <= 0)
        return false;
    if (watched[0].revents != 0)
        output_.read_more();
    if (watched[1].revents != 0)
        error_.read_more();
    if (watched[2].revents != 0) {
        waitpid(pid_, &status_, 0);
        close_once(end_);
        while (look(0)) {
        } // what it wrote at last
    }
    return true;
}

void Process::wait_until(const std::function<bool()> &is_so, std::string_view what) {
    using Clock = std::chrono::steady_clock;
    const auto deadline = Clock::now() + kDeadline;
    while (!is_so()) {
        const auto left =
            std::chrono::ceil<std::chrono::milliseconds>(deadline - Clock::now()).count();
        if (left <= 0)
            throw DeadlineExceeded("waited in vain for " + std::string{what} + "; " + both());
        look(static_cast<int>(left));
    }
}

void Process::wait_for(Stream &stream, std::string_view text) {
    const auto has_come = [&] { return stream.text.find(text) != std::string::npos; };
    wait_until([&] { return has_come() || stream.has_ended(); }, text);
    if (!has_come())
        throw std::runtime_error("ended without \"" + std::string{text} + "\"; " + both());
}

void Process::wait_for_output(std::string_view text) {
    wait_for(output_, text);
}

void Process::wait_for_error(std::string_view text) {
    wait_for(error_, text);
}

std::string Process::read_line() {
    std::size_t end = std::string::npos;
    const auto is_whole = [&] {
        end = output_.text.find('\n', output_.taken);
        return end != std::string::npos;
    };
    wait_until([&] { return is_whole() || output_.has_ended(); }, "a line");
    if (end == std::string::npos)
        throw std::runtime_error("there is no further line; " + both());
    const std::string line = output_.text.substr(output_.taken, end - output_.taken);
    output_.taken = end + 1;
    return line;
}

std::string Process::read_errors(std::string_view until) {
    const std::string waiting_for =
        until.empty() ? "the end of its errors" : "\"" + std::string{until} + "\"";
    std::size_t end = std::string::npos;
    const auto is_whole = [&] {
        const auto found = until.empty() ? until.npos : error_.text.find(until, error_.taken);
        end = found == until.npos ? found : error_.text.find('\n', found);
        return end != std::string::npos;
    };
    wait_until([&] { return is_whole() || error_.has_ended(); }, waiting_for);
    if (end == std::string::npos && !until.empty())
        throw std::runtime_error("ended without " + waiting_for + "; " + both());
    const std::size_t from = error_.taken;
    error_.taken = end == std::string::npos ? error_.text.size() : end + 1;
    return error_.text.substr(from, error_.taken - from);
}

int Process::wait() {
    wait_until([this] { return end_ < 0; }, "the end of process " + std::to_string(pid_));
    return WIFEXITED(status_) ? WEXITSTATUS(status_) : 128 + WTERMSIG(status_);
}

} // namespace test
