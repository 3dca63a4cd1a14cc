// SPDX-License-Identifier: Apache-2.0
// A child process whose output is collected as it comes.
#pragma once

#include <gio/gio.h>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace test {

using Environment = std::map<std::string, std::string>;

class Process {
  public:
    explicit Process(const std::vector<std::string> &command, const Environment &environment = {});
    // Kills what still runs.
    ~Process();
    Process(const Process &) = delete;
    Process &operator=(const Process &) = delete;

    void wait_for_output(std::string_view text);
    void wait_for_error(std::string_view text);
    void send_signal(int number);

    // Waits for the end. The exit status, or 128 + the signal that ended it.
    int wait();

    const std::string &output() const { return output_.text; }
    const std::string &error() const { return error_.text; }
    std::string both() const { return "output: " + output() + "error: " + error(); }

  private:
    struct Stream {
        GInputStream *stream = nullptr;
        std::string text;
        bool ended = false;
    };

    static void read_more(Stream &stream);
    static void on_read(GObject *source, GAsyncResult *result, gpointer stream);
    static void on_exit(GObject *source, GAsyncResult *result, gpointer ended);

    GSubprocess *process_ = nullptr;
    Stream output_;
    Stream error_;
    bool exited_ = false;
};

} // namespace test
