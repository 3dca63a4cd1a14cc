// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/bus/kill_rounds.hpp"

#include "tests/support/pump.hpp"

#include <csignal>
#include <poll.h>
#include <sys/inotify.h>
#include <unistd.h>

namespace sim::test {
namespace {

constexpr int kUpdatesARound = 12;
constexpr int kPollMilliseconds = 20000;

// What the program does in its directory, as it does it.
class DirectoryWatch {
  public:
    explicit DirectoryWatch(const std::string &path) : descriptor_(inotify_init1(IN_CLOEXEC)) {
        EXPECT_GE(descriptor_, 0);
        EXPECT_GE(inotify_add_watch(descriptor_, path.c_str(),
                                    IN_CREATE | IN_MODIFY | IN_CLOSE_WRITE | IN_MOVED_TO),
                  0);
    }
    DirectoryWatch(const DirectoryWatch &) = delete;
    DirectoryWatch &operator=(const DirectoryWatch &) = delete;
    ~DirectoryWatch() { close(descriptor_); }

    // Until this has happened so many times.
    void wait_for(std::uint32_t event, int times) {
        while (times > 0) {
            pollfd waiting{descriptor_, POLLIN, 0};
            ASSERT_EQ(poll(&waiting, 1, kPollMilliseconds), 1) << "nothing is written";
            alignas(inotify_event) char events[4096];
            const auto length = read(descriptor_, events, sizeof events);
            ASSERT_GT(length, 0);
            for (ssize_t at = 0; at < length;) {
                const auto *happened = reinterpret_cast<const inotify_event *>(events + at);
                times -= (happened->mask & event) != 0 ? 1 : 0;
                at += static_cast<ssize_t>(sizeof(inotify_event) + happened->len);
            }
        }
    }

  private:
    int descriptor_;
};

// Requests under way.
struct Stream {
    const KeptNumber &kept;
    int last_sent = 0;
    int last_acknowledged = 0;
    int open = 0;

    void send(Client &client) {
        struct Context {
            Stream *stream;
            int number;
        };
        const int number = ++last_sent;
        const auto arguments = Variant::adopt(
            g_variant_parse(nullptr, kept.arguments(number).c_str(), nullptr, nullptr, nullptr));
        ++open;
        g_dbus_connection_call(
            client.connection(), kServiceName, slot_path(0).c_str(), kept.interface, kept.method,
            arguments.get(), nullptr, G_DBUS_CALL_FLAGS_NO_AUTO_START, kPollMilliseconds, nullptr,
            [](GObject *connection, GAsyncResult *result, gpointer data) {
                const std::unique_ptr<Context> context(static_cast<Context *>(data));
                const auto reply = Variant::adopt(
                    g_dbus_connection_call_finish(G_DBUS_CONNECTION(connection), result, nullptr));
                --context->stream->open;
                if (!reply)
                    return;
                EXPECT_EQ(reply.print(), "(0,)");
                context->stream->last_acknowledged = context->number;
            },
            new Context{this, number});
    }

    // Until every one is answered, by the program or by the bus.
    void settle() const {
        ::test::pump_until([this] { return open == 0; }, "the answers to all changes");
    }
};

} // namespace

std::unique_ptr<Program> KillTest::start() {
    auto program = std::make_unique<Program>(std::vector<std::string>{
        "serve", "--quiet", "--address", bus_.address(), "--state", directory_.path()});
    client_->wait_until_owned(kServiceName);
    client_->register_application(0);
    return program;
}

int KillTest::stored(const KeptNumber &kept) {
    const auto reply = client_->call(0, kept.interface, kept.query, kept.query_arguments);
    return kept.read(Variant::adopt(g_variant_get_child_value(reply.value.get(), 1)).get());
}

void KillTest::kill_while_keeping(const KeptNumber &kept, int rounds) {
    constexpr std::uint32_t kMoments[] = {IN_CREATE, IN_MODIFY, IN_CLOSE_WRITE, IN_MOVED_TO};
    Stream stream{kept};
    {
        const auto program = start();
        stream.send(*client_);
        stream.settle();
        ASSERT_EQ(stream.last_acknowledged, 1);
        program->send_signal(SIGKILL);
        program->wait();
        client_->wait_until_gone(kServiceName);
    }
    int acknowledged_rounds = 0;
    for (int round = 0; round < rounds && !HasFailure(); ++round) {
        const auto program = start();
        const int number = stored(kept);
        EXPECT_GE(number, stream.last_acknowledged) << "in round " << round;
        EXPECT_LE(number, stream.last_sent) << "in round " << round;
        const int acknowledged_before = stream.last_acknowledged;
        DirectoryWatch watch(directory_.path());
        for (int i = 0; i < kUpdatesARound; ++i)
            stream.send(*client_);
        watch.wait_for(kMoments[round % std::size(kMoments)], 1 + round % 5);
        program->send_signal(SIGKILL);
        EXPECT_EQ(program->wait(), 128 + SIGKILL);
        stream.settle();
        client_->wait_until_gone(kServiceName);
        acknowledged_rounds += stream.last_acknowledged > acknowledged_before ? 1 : 0;
        EXPECT_EQ(kept.problem(content_of(directory_.file(kept.file))), "");
    }
    // Otherwise the rounds have shown nothing.
    EXPECT_GT(acknowledged_rounds, rounds / 4);
    const auto program = start();
    EXPECT_GE(stored(kept), stream.last_acknowledged);
    EXPECT_LE(stored(kept), stream.last_sent);
}

} // namespace sim::test
