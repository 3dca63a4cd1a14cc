// SPDX-License-Identifier: Apache-2.0
//
// answer_call SLOT: waits for one call, answers it, and says what happens until it is over. Prints
// a line with "ready" once it is reachable.
#include "timeline.h"

#include <ims.h>

#include <array>
#include <cstdlib>
#include <memory>

namespace {

constexpr const char *kWho = "callee";

struct Deinit {
    void operator()(ims_h handle) const { ims_deinit(handle); }
};
using Handle = std::unique_ptr<ims_client_s, Deinit>;
using Text = std::unique_ptr<char, decltype(&std::free)>;

struct App {
    GMainLoop *loop;
    int status = EXIT_SUCCESS;
};

void on_answered(ims_h, int result, void *, void *user_data) {
    auto &app = *static_cast<App *>(user_data);
    timeline(kWho, "<-", "answer: result %d", result);
    if (result != 0) {
        app.status = EXIT_FAILURE;
        g_main_loop_quit(app.loop);
    }
}

void on_incoming(ims_h handle, int, void *event, void *user_data) {
    const auto &call = *static_cast<ims_call_incoming_s *>(event);
    // The texts are ours to free, used or not.
    const Text number{call.number, std::free};
    const std::array<Text, 5> others{Text{call.text_1, std::free}, Text{call.text_2, std::free},
                                     Text{call.text_3, std::free}, Text{call.text_4, std::free},
                                     Text{call.text_5, std::free}};
    timeline(kWho, "<-", "CallIncomingInd: session %d from %s", call.session_id, number.get());
    timeline(kWho, "->", "AnswerCall");
    const ims_call_id_info_s answer{call.session_id, call.call_type, 0};
    ims_call_answer_call(handle, &answer, on_answered, user_data);
}

void on_established(ims_h, int, void *event, void *) {
    const auto &call = *static_cast<ims_call_established_s *>(event);
    const Text text{call.text_1, std::free};
    timeline(kWho, "<-", "CallEstablished: session %d", call.session_id);
}

void on_held(ims_h, int, void *event, void *) {
    timeline(kWho, "<-", "CallHeld: session %d", static_cast<ims_call_held_s *>(event)->session_id);
}

void on_resumed(ims_h, int, void *event, void *) {
    timeline(kWho, "<-", "CallResumed: session %d",
             static_cast<ims_call_resumed_s *>(event)->session_id);
}

void on_ended(ims_h, int, void *event, void *user_data) {
    const auto &call = *static_cast<ims_call_ended_s *>(event);
    timeline(kWho, "<-", "CallEnded: session %d, reason %d", call.session_id, call.reason);
    g_main_loop_quit(static_cast<App *>(user_data)->loop);
}

struct Row {
    int noti_id;
    ims_notification_cb callback;
};

constexpr Row kEvents[] = {
    {IMS_NOTI_CALL_INCOMING_IND, on_incoming},
    {IMS_NOTI_CALL_ESTABLISHED, on_established},
    {IMS_NOTI_CALL_HELD, on_held},
    {IMS_NOTI_CALL_RESUMED, on_resumed},
    {IMS_NOTI_CALL_ENDED, on_ended},
};

} // namespace

int main(int argc, char **argv) {
    if (argc != 2) {
        std::fprintf(stderr, "usage: %s SLOT\n", argv[0]);
        return 2;
    }
    ims_h opened = nullptr;
    const int code = ims_init(std::atoi(argv[1]), &opened);
    timeline(kWho, "->", "RegisterApplication: %s", code == IMS_ERROR_NONE ? "done" : "failed");
    if (code != IMS_ERROR_NONE)
        return EXIT_FAILURE;
    const Handle handle{opened};

    const std::unique_ptr<GMainLoop, decltype(&g_main_loop_unref)> loop{
        g_main_loop_new(nullptr, FALSE), g_main_loop_unref};
    App app{loop.get()};
    for (const Row &row : kEvents) {
        if (ims_set_notification_cb(handle.get(), row.noti_id, row.callback, &app) !=
            IMS_ERROR_NONE)
            return EXIT_FAILURE;
    }
    timeline(kWho, "--", "ready");
    g_main_loop_run(loop.get());
    return app.status;
}
