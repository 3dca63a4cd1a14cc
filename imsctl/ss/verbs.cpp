// SPDX-License-Identifier: Apache-2.0
// Supplementary services: call waiting, forwarding and barring.
#include "imsctl/line/requests.hpp"
#include "imsctl/ss/list.hpp"
#include "imsctl/ss/module.hpp"
#include "imsctl/ss/values.hpp"

namespace imsctl {
namespace {

constexpr std::int32_t kNumberTarget = 0;
constexpr std::int32_t kSipTarget = 1;

Argument<std::int32_t> service_class(Arguments &arguments) {
    return arguments.choice("--class", "which kind of calls", kServiceClasses, kAllClasses);
}

// How the service tells numbers and URIs apart.
std::int32_t target_type(std::string_view target) {
    return target.starts_with("sip:") || target.starts_with("sips:") ? kSipTarget : kNumberTarget;
}

Action prepare_get_waiting(Arguments &arguments) {
    const auto ss_class = service_class(arguments);
    return [=](Invocation &run) {
        const auto start = [&](ims_h handle, ims_response_cb callback, void *user_data) {
            return ims_ss_get_call_waiting(handle, *ss_class, callback, user_data);
        };
        show_list(run, start, kWaitingList);
    };
}

Action prepare_set_waiting(Arguments &arguments) {
    const auto status = arguments.choice("STATUS", "whether calls wait", kSwitch);
    const auto ss_class = service_class(arguments);
    return [=](Invocation &run) {
        const ims_ss_cw_info_s info{*ss_class, *status};
        run.request({}, with_record(ims_ss_set_call_waiting, info));
    };
}

using Query = int (*)(ims_h, const ims_ss_query_s *, ims_response_cb, void *);

Action get_list(const Argument<std::int32_t> &ss_class, const Argument<std::int32_t> &type,
                Query query, const StatusList &list) {
    return [=, &list](Invocation &run) {
        const ims_ss_query_s asked{*ss_class, *type};
        show_list(run, with_record(query, asked), list);
    };
}

Action prepare_get_forwarding(Arguments &arguments) {
    const auto condition = arguments.choice("CONDITION", "which calls are forwarded (default all)",
                                            kForwardingConditions, kAllConditions);
    return get_list(service_class(arguments), condition, ims_ss_get_call_forwarding,
                    kForwardingList);
}

Action prepare_set_forwarding(Arguments &arguments) {
    const auto condition =
        arguments.choice("CONDITION", "which calls are forwarded", kForwardingConditions);
    const auto status = arguments.choice("STATUS", "whether they are", kSwitch);
    const auto target = arguments.text_or("--to", "where to: +15550101, tel:..., sip:...", "");
    const auto no_reply_time =
        arguments.number("--after", "seconds before no-reply forwards (default: the service's)", 0);
    const auto ss_class = service_class(arguments);
    return [=](Invocation &run) {
        const ims_ss_cf_info_s info{*ss_class,
                                    *status,
                                    *condition,
                                    *no_reply_time,
                                    static_cast<std::int32_t>(target->size()),
                                    target_type(*target),
                                    target->c_str()};
        run.request({}, with_record(ims_ss_set_call_forwarding, info));
    };
}

Action prepare_get_barring(Arguments &arguments) {
    const auto type = arguments.choice("CALLS", "which calls are barred (default all)",
                                       kBarringTypes, kAllBarring);
    return get_list(service_class(arguments), type, ims_ss_get_call_barring, kBarringList);
}

Action prepare_set_barring(Arguments &arguments) {
    const auto type = arguments.choice("CALLS", "which calls are barred", kBarringTypes);
    const auto status = arguments.choice("STATUS", "whether they are", kSwitch);
    const auto password = arguments.text("--password", "the barring password");
    const auto ss_class = service_class(arguments);
    return [=](Invocation &run) {
        const ims_ss_cb_set_s info{*ss_class, *status, *type, password->c_str()};
        run.request({}, with_record(ims_ss_set_call_barring, info));
    };
}

constexpr Verb kSsVerbs[] = {
    {"ss waiting get", "show whether a second call waits", "ss waiting get", prepare_get_waiting},
    {"ss waiting set", "let a second call wait, or refuse it as busy", "ss waiting set off",
     prepare_set_waiting},
    {"ss forwarding get", "show where calls are forwarded to", "ss forwarding get no-reply",
     prepare_get_forwarding},
    {"ss forwarding set", "forward calls, or no longer",
     "ss forwarding set no-reply on --to +15550101 --after 20", prepare_set_forwarding},
    {"ss barring get", "show which calls are barred", "ss barring get outgoing",
     prepare_get_barring},
    {"ss barring set", "bar calls, or no longer", "ss barring set outgoing on --password 0000",
     prepare_set_barring},
};

} // namespace

std::span<const Verb> ss_verbs() {
    return kSsVerbs;
}

} // namespace imsctl
