// SPDX-License-Identifier: Apache-2.0
#include "tests/contract/library.hpp"

namespace test {
namespace {

std::string line_of(const Call &call, const std::string &reply_type) {
    return method_line(call.interface, call.member, "(" + call.signature + ")", reply_type);
}

} // namespace

std::string LibraryOnTheBus::last_call(const std::string &reply_type) {
    const std::vector<Call> calls = requests();
    if (calls.empty())
        throw std::runtime_error("nothing was sent");
    return line_of(calls.back(), reply_type);
}

std::string LibraryOnTheBus::made_by(const RequestRow &row) {
    peer().on(full_method(row), reply(row.reply_type, row.reply));
    ResponseRecorder recorder{[&](const Response &, void *data) {
        if (row.check_data)
            row.check_data(data); // also releases what the application takes over
    }};
    EXPECT_EQ(row.function.call(handle_, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
    pump_until([&] { return recorder.count() > 0; }, "the callback of " + row.function.name);
    EXPECT_EQ(recorder.last().result, 0)
        << row.function.name << " does not take " << row.reply_type;
    return last_call(row.reply_type);
}

std::string LibraryOnTheBus::made_by(const QueryRow &row) {
    peer().on(full_method(row), reply(row.reply_type, row.reply));
    EXPECT_EQ(row.function.call(handle_), IMS_ERROR_NONE)
        << row.function.name << " does not take " << row.reply_type;
    return last_call(row.reply_type);
}

// The fixture has made the handle; the peer answered as it does by itself.
std::string LibraryOnTheBus::made_by_init() {
    const std::vector<Call> calls = peer().calls_to(kRegisterApplication);
    if (calls.empty())
        throw std::runtime_error("ims_init() sent nothing");
    return line_of(calls.front(), "(ii)");
}

// No result fails it, so it has no row.
std::string LibraryOnTheBus::made_by_network_environment_query() {
    peer().on("org.kelvo.ims.Settings.GetNetworkEnvironment", reply("(ii)", "(0, 3)"));
    std::int32_t type = 0;
    EXPECT_EQ(ims_get_network_environment(handle_, &type), IMS_ERROR_NONE);
    EXPECT_EQ(type, 3);
    return last_call("(ii)");
}

std::map<std::string, std::string> LibraryOnTheBus::observe_calls() {
    std::map<std::string, std::string> lines{
        {"ims_init", made_by_init()},
        {"ims_get_network_environment", made_by_network_environment_query()}};
    // A function with several rows has the same method in each.
    const auto observe = [&](const auto &row) {
        const std::string line = made_by(row);
        EXPECT_EQ(lines.try_emplace(row.function.name, line).first->second, line)
            << row.function.name;
    };
    for (const ModuleRows &module : all_modules()) {
        for (const RequestRow &row : module.requests)
            observe(row);
        for (const QueryRow &row : module.queries)
            observe(row);
    }
    return lines;
}

std::set<std::string> LibraryOnTheBus::observe_events() {
    std::set<std::string> lines;
    for (const ModuleRows &module : all_modules()) {
        for (const ModuleEvent &each : module.events) {
            const EventRow &row = each.row;
            NotificationRecorder recorder{[&](const Notified &, void *event) { row.check(event); }};
            listen(row.id, recorder);
            emit(each.module.interface, row.member, parse(row.type, row.value));
            fence();
            EXPECT_EQ(ims_unset_notification_cb(handle_, row.id), IMS_ERROR_NONE);
            EXPECT_EQ(recorder.count(), 1U) << row.member << " of type " << row.type;
            lines.insert(signal_line(each.module.interface, row.member, row.type));
        }
    }
    return lines;
}

} // namespace test
