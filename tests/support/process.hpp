// SPDX-License-Identifier: Apache-2.0
// Runs a program as a child of the test. Who makes a Process owns the child: it outlives neither
// the object nor the test. What it writes stays in its pipes until one of the functions below
// waits for something; none of them runs a main context. Each throws, and says what it waited for,
// when that does not come in time or cannot come any more.
#pragma once

#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include <sys/types.h>

namespace test {

struct ProcessStreams {
    bool has_input = false; // a pipe that close_input() closes; else there is nothing to read
    int errors = -1;        // a descriptor that gets its standard error; else error() does
};

class Process {
  public:
    // Beside, and before, that of the test.
    using Environment = std::map<std::string, std::string>;

    // The program is searched for in the test's own PATH. It runs when this returns.
    explicit Process(const std::vector<std::string> &command, const Environment &environment = {},
                     const ProcessStreams &streams = {});
    // Kills what still runs.
    ~Process();
    Process(const Process &) = delete;
    Process &operator=(const Process &) = delete;

    pid_t pid() const { return pid_; }
    void send_signal(int number) const;
    void close_input();

    // Until this text stands somewhere in all that has been written.
    void wait_for_output(std::string_view text);
    void wait_for_error(std::string_view text);

    // The next line of its output, without the line end.
    std::string read_line();
    // The next lines of its standard error, up to one with this text, that one included. Without
    // it, all up to the end.
    std::string read_errors(std::string_view until = {});

    // The exit status, or 128 + the signal that ended it. All that it wrote has been read then;
    // what it left running may still write.
    int wait();

    // What has been read so far, by whatever function.
    const std::string &output() const { return output_.text; }
    const std::string &error() const { return error_.text; }
    std::string both() const { return "output: " + output() + "error: " + error(); }

  private:
    struct Stream {
        ~Stream();

        bool has_ended() const { return descriptor < 0; }
        void end();
        void read_more();

        int descriptor = -1;
        std::string text;
        std::size_t taken = 0; // what read_line() or read_errors() has returned
    };

    void wait_until(const std::function<bool()> &is_so, std::string_view what);
    void wait_for(Stream &stream, std::string_view text);
    // Reads what comes first, or finds that the child has ended; false when nothing comes.
    bool look(int milliseconds);

    pid_t pid_ = -1;
    int end_ = -1; // readable when the child has ended
    int status_ = -1;
    int input_ = -1;
    Stream output_;
    Stream error_;
};

} // namespace test
