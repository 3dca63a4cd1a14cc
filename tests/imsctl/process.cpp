// SPDX-License-Identifier: Apache-2.0
#include "tests/imsctl/process.hpp"

#include "tests/support/pump.hpp"

#include <csignal>
#include <stdexcept>

namespace test {

Process::Process(const std::vector<std::string> &command, const Environment &environment) {
    std::vector<const char *> arguments;
    for (const std::string &word : command)
        arguments.push_back(word.c_str());
    arguments.push_back(nullptr);

    GSubprocessLauncher *launcher = g_subprocess_launcher_new(static_cast<GSubprocessFlags>(
        G_SUBPROCESS_FLAGS_STDOUT_PIPE | G_SUBPROCESS_FLAGS_STDERR_PIPE));
    for (const auto &[name, value] : environment)
        g_subprocess_launcher_setenv(launcher, name.c_str(), value.c_str(), TRUE);
    GError *error = nullptr;
    process_ = g_subprocess_launcher_spawnv(launcher, arguments.data(), &error);
    g_object_unref(launcher);
    if (process_ == nullptr) {
        const std::string why = error->message;
        g_error_free(error);
        throw std::runtime_error(why);
    }
    output_.stream = g_subprocess_get_stdout_pipe(process_);
    error_.stream = g_subprocess_get_stderr_pipe(process_);
    read_more(output_);
    read_more(error_);
    g_subprocess_wait_async(process_, nullptr, on_exit, &exited_);
}

Process::~Process() {
    if (!exited_)
        send_signal(SIGKILL);
    // What is under way refers to this object.
    pump_until([this] { return exited_ && output_.ended && error_.ended; }, "a child's end");
    g_object_unref(process_);
}

void Process::read_more(Stream &stream) {
    g_input_stream_read_bytes_async(stream.stream, 4096, G_PRIORITY_DEFAULT, nullptr, on_read,
                                    &stream);
}

void Process::on_read(GObject *source, GAsyncResult *result, gpointer user_data) {
    auto &stream = *static_cast<Stream *>(user_data);
    GBytes *bytes = g_input_stream_read_bytes_finish(G_INPUT_STREAM(source), result, nullptr);
    gsize size = 0;
    if (bytes != nullptr) {
        const auto *data = static_cast<const char *>(g_bytes_get_data(bytes, &size));
        stream.text.append(data == nullptr ? "" : data, size);
        g_bytes_unref(bytes);
    }
    stream.ended = size == 0;
    if (!stream.ended)
        read_more(stream);
}

void Process::on_exit(GObject *source, GAsyncResult *result, gpointer ended) {
    g_subprocess_wait_finish(G_SUBPROCESS(source), result, nullptr);
    *static_cast<bool *>(ended) = true;
}

void Process::wait_for_output(std::string_view text) {
    pump_until([&] { return output_.text.find(text) != std::string::npos; }, text);
}

void Process::wait_for_error(std::string_view text) {
    pump_until([&] { return error_.text.find(text) != std::string::npos; }, text);
}

void Process::send_signal(int number) {
    g_subprocess_send_signal(process_, number);
}

int Process::wait() {
    pump_until([this] { return exited_ && output_.ended && error_.ended; }, "a child's end");
    return g_subprocess_get_if_exited(process_) ? g_subprocess_get_exit_status(process_)
                                                : 128 + g_subprocess_get_term_sig(process_);
}

} // namespace test
