/*
 * SPDX-License-Identifier: Apache-2.0
 *
 * place_call SLOT NUMBER: places a call, follows it until it is established, lists it, puts it on
 * hold, resumes it, ends it, and says what happens. Exits with 0 when all of this happened.
 */
#include "timeline.h"

#include <ims.h>

#include <stdlib.h>
#include <string.h>

#define WHO "caller"

/* Longer than any answer takes: what has not happened by then will not. */
#define PATIENCE_SECONDS 60

typedef struct {
    GMainLoop *loop;
    ims_h handle;
    int32_t session_id;
    int status;
    /* Requests whose callback is still to come: the handle must outlive them. */
    int pending;
    bool is_over;
} app_s;

static void leave_when_done(app_s *app) {
    if (app->is_over && app->pending == 0)
        g_main_loop_quit(app->loop);
}

static void give_up(app_s *app, const char *what, int code) {
    timeline(WHO, "--", "%s failed: %d", what, code);
    app->status = EXIT_FAILURE;
    app->is_over = true;
}

static gboolean on_patience_lost(gpointer user_data) {
    app_s *app = user_data;
    give_up(app, "waiting", PATIENCE_SECONDS);
    g_main_loop_quit(app->loop);
    return G_SOURCE_REMOVE;
}

/* Every asynchronous request ends here or in on_call_made(), once. */
static void on_done(ims_h handle, int result, void *data, void *user_data) {
    app_s *app = user_data;
    (void)handle;
    (void)data;
    --app->pending;
    timeline(WHO, "<-", "answer: result %d", result);
    if (result != 0)
        give_up(app, "the request", result);
    leave_when_done(app);
}

static void on_call_made(ims_h handle, int result, void *data, void *user_data) {
    app_s *app = user_data;
    /* The pointer is good until this function returns: copy what is behind it. */
    if (result == 0)
        app->session_id = *(int32_t *)data;
    timeline(WHO, "<-", "MakeCall answered: result %d, session %d", result, (int)app->session_id);
    --app->pending;
    (void)handle;
    if (result != 0)
        give_up(app, "MakeCall", result);
    leave_when_done(app);
}

/* What a request returns at once: whether it was sent. */
static void check_sent(app_s *app, const char *what, int code) {
    timeline(WHO, "->", "%s", what);
    if (code == IMS_ERROR_NONE)
        ++app->pending;
    else
        give_up(app, what, code);
    leave_when_done(app);
}

static void list_calls(app_s *app) {
    ims_call_list_info_s *list = calloc(1, sizeof *list);
    timeline(WHO, "->", "CallListInfo");
    int code = ims_call_get_call_list_info(app->handle, list);
    if (code != IMS_ERROR_NONE)
        give_up(app, "CallListInfo", code);
    for (uint32_t at = 0; code == IMS_ERROR_NONE && at < list->count; ++at) {
        const ims_call_info_s *call = &list->entries[at];
        timeline(WHO, "<-", "call: session %d with %s, type %d, state %d, %s",
                 (int)call->session_id, call->peer_uri, (int)call->call_type, (int)call->call_state,
                 call->bmocall ? "outgoing" : "incoming");
    }
    ims_call_list_info_clear(list);
    free(list);
}

static void on_progress(ims_h handle, int noti_id, void *event, void *user_data) {
    const ims_call_session_s *call = event;
    (void)handle;
    (void)user_data;
    timeline(WHO, "<-", "%s: session %d",
             noti_id == IMS_NOTI_CALL_ALERTING ? "CallAlerting" : "CallInProgress",
             (int)call->session_id);
}

static void on_established(ims_h handle, int noti_id, void *event, void *user_data) {
    app_s *app = user_data;
    ims_call_established_s *call = event;
    (void)noti_id;
    timeline(WHO, "<-", "CallEstablished: session %d", (int)call->session_id);
    free(call->text_1); /* ours to free, used or not */
    list_calls(app);
    check_sent(app, "HoldCall", ims_call_hold_call(handle, app->session_id, on_done, app));
}

static void on_held(ims_h handle, int noti_id, void *event, void *user_data) {
    app_s *app = user_data;
    const ims_call_held_s *call = event;
    (void)noti_id;
    timeline(WHO, "<-", "CallHeld: session %d", (int)call->session_id);
    check_sent(app, "ResumeCall", ims_call_resume_call(handle, app->session_id, on_done, app));
}

static void on_resumed(ims_h handle, int noti_id, void *event, void *user_data) {
    app_s *app = user_data;
    const ims_call_resumed_s *call = event;
    const ims_call_id_info_s end = {.session_id = app->session_id};
    (void)noti_id;
    timeline(WHO, "<-", "CallResumed: session %d", (int)call->session_id);
    check_sent(app, "EndCall", ims_call_end_call(handle, &end, on_done, app));
}

static void on_ended(ims_h handle, int noti_id, void *event, void *user_data) {
    app_s *app = user_data;
    const ims_call_ended_s *call = event;
    (void)handle;
    (void)noti_id;
    timeline(WHO, "<-", "CallEnded: session %d, reason %d", (int)call->session_id,
             (int)call->reason);
    app->is_over = true;
    leave_when_done(app);
}

static bool follow(app_s *app) {
    static const struct {
        int noti_id;
        ims_notification_cb callback;
    } events[] = {
        {IMS_NOTI_CALL_IN_PROGRESS, on_progress},    {IMS_NOTI_CALL_ALERTING, on_progress},
        {IMS_NOTI_CALL_ESTABLISHED, on_established}, {IMS_NOTI_CALL_HELD, on_held},
        {IMS_NOTI_CALL_RESUMED, on_resumed},         {IMS_NOTI_CALL_ENDED, on_ended},
    };
    for (size_t at = 0; at < G_N_ELEMENTS(events); ++at) {
        if (ims_set_notification_cb(app->handle, events[at].noti_id, events[at].callback, app) !=
            IMS_ERROR_NONE)
            return false;
    }
    return true;
}

int main(int argc, char **argv) {
    if (argc != 3) {
        fprintf(stderr, "usage: %s SLOT NUMBER\n", argv[0]);
        return 2;
    }
    app_s app = {.loop = g_main_loop_new(NULL, FALSE), .status = EXIT_SUCCESS};
    int code = ims_init(atoi(argv[1]), &app.handle);
    timeline(WHO, "->", "RegisterApplication: %s", code == IMS_ERROR_NONE ? "done" : "failed");
    if (code != IMS_ERROR_NONE) {
        g_main_loop_unref(app.loop);
        return EXIT_FAILURE;
    }

    if (follow(&app)) {
        const ims_call_make_info_s call = {.number = argv[2]};
        guint patience = g_timeout_add_seconds(PATIENCE_SECONDS, on_patience_lost, &app);
        check_sent(&app, "MakeCall", ims_call_make_call(app.handle, &call, on_call_made, &app));
        if (!app.is_over)
            g_main_loop_run(app.loop);
        if (app.status == EXIT_SUCCESS)
            g_source_remove(patience);
    } else {
        app.status = EXIT_FAILURE;
    }
    ims_deinit(app.handle);
    g_main_loop_unref(app.loop);
    return app.status;
}
