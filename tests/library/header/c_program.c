/*
 * SPDX-License-Identifier: Apache-2.0
 *
 * Uses a bit of everything from C and needs no bus: bad arguments are refused before one is looked
 * for.
 */
#include "ims.h"

#include <stdio.h>
#include <string.h>

static void on_response(ims_h handle, int result, void *data, void *user_data) {
    (void)handle;
    (void)result;
    (void)data;
    (void)user_data;
}

static void on_notification(ims_h handle, int noti_id, void *event, void *user_data) {
    (void)handle;
    (void)noti_id;
    (void)event;
    (void)user_data;
}

static int check(const char *what, int result, int expected) {
    if (result == expected)
        return 0;
    fprintf(stderr, "%s returns %d instead of %d\n", what, result, expected);
    return 1;
}

int main(void) {
    static ims_call_list_info_s calls;
    ims_call_make_info_s call;
    int wrong = 0;

    memset(&call, 0, sizeof call);
    call.number = "+4912345";

    wrong |= check("ims_init", ims_init(0, NULL), IMS_ERROR_INVALID_PARAMETER);
    wrong |= check("ims_deinit", ims_deinit(NULL), IMS_ERROR_INVALID_PARAMETER);
    wrong |= check("ims_set_notification_cb",
                   ims_set_notification_cb(NULL, IMS_NOTI_CALL_ENDED, on_notification, NULL),
                   IMS_ERROR_INVALID_PARAMETER);
    wrong |=
        check("ims_unset_notification_cb", ims_unset_notification_cb(NULL, IMS_NOTI_CALL_ENDED),
              IMS_ERROR_INVALID_PARAMETER);
    wrong |= check("ims_call_make_call", ims_call_make_call(NULL, &call, on_response, NULL),
                   IMS_ERROR_INVALID_PARAMETER);
    wrong |= check("ims_xdm_modify_group_subject",
                   ims_xdm_modify_group_subject(NULL, "sip:g", "", on_response, NULL),
                   IMS_ERROR_INVALID_PARAMETER);
    wrong |= check("ims_call_get_call_list_info", ims_call_get_call_list_info(NULL, &calls),
                   IMS_ERROR_INVALID_PARAMETER);
    ims_call_list_info_clear(&calls);
    return wrong;
}
