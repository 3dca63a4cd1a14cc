// SPDX-License-Identifier: Apache-2.0
// The library, the files and the stand-in say the same. A request or signal that is added to one of
// them alone makes this fail.
#include "tests/contract/library.hpp"
#include "tests/support/bus_observer.hpp"
#include "tests/support/declarations.hpp"

#include "sim/stand_in.hpp"

#include <filesystem>
#include <iostream>

namespace test {
namespace {

Contract contract_of_stand_in() {
    const sim::Log log{sim::LogLevel::kQuiet};
    sim::MainLoop loop;
    sim::Options options;
    options.numbers = {"+15550100", "+15550101"};
    const sim::StandIn stand_in{options, log, loop};
    Contract contract;
    for (const sim::Interface &interface : stand_in.interfaces()) {
        const std::string name{interface.name};
        for (const sim::Method &method : interface.methods)
            contract.methods.insert(method_line(name, std::string{method.member},
                                                std::string{method.in}, std::string{method.out}));
        for (const sim::SignalInfo &signal : interface.signals)
            contract.signals.insert(
                signal_line(name, std::string{signal.member}, std::string{signal.signature}));
    }
    return contract;
}

void expect_same(const std::set<std::string> &one, const char *one_name,
                 const std::set<std::string> &other, const char *other_name) {
    EXPECT_EQ(missing(one, other), "") << "in " << other_name << ", but not in " << one_name;
    EXPECT_EQ(missing(other, one), "") << "in " << one_name << ", but not in " << other_name;
}

TEST_F(LibraryOnTheBus, SendsAndAcceptsWhatTheFilesSay) {
    std::set<std::string> seen;
    for (const auto &[function, line] : observe_calls())
        seen.insert(line);
    expect_same(seen, "the library", contract_of_files().methods, "the files");
}

TEST_F(LibraryOnTheBus, HearsTheSignalsThatTheFilesSay) {
    expect_same(observe_events(), "the library", contract_of_files().signals, "the files");
}

// Not by the rows: an id that has a signal in the library and nowhere else is found as well.
TEST_F(LibraryOnTheBus, ListensForTheSignalsThatTheFilesName) {
    constexpr int kIds = 0x1000;
    for (int id = 0; id < kIds; ++id)
        ims_set_notification_cb(handle_, id, NotificationRecorder::callback, nullptr);
    std::set<std::string> heard;
    for (const ObservedSubscription &each : observed_subscriptions())
        heard.insert(each.interface + ":" + each.member);
    std::set<std::string> named;
    for (const std::string &line : contract_of_files().signals)
        named.insert(line.substr(0, line.find(' ')));
    expect_same(heard, "the library", named, "the files");
}

TEST(StandInContract, ServesWhatTheFilesSay) {
    const Contract files = contract_of_files();
    const Contract served = contract_of_stand_in();
    expect_same(served.methods, "the stand-in", files.methods, "the files");
    expect_same(served.signals, "the stand-in", files.signals, "the files");
}

// Every exported function is in a row and has its method in the stand-in; the list is printed.
TEST_F(LibraryOnTheBus, EveryExportedFunctionIsCovered) {
    const std::set<std::string> served = contract_of_stand_in().methods;
    const std::map<std::string, std::string> calls = observe_calls();
    std::set<std::string> covered{// These make no call.
                                  "ims_deinit",
                                  "ims_set_notification_cb",
                                  "ims_unset_notification_cb",
                                  "ims_call_list_info_clear",
                                  "ims_global_settings_clear",
                                  "ims_profile_clear",
                                  "ims_profile_list_clear"};
    for (const auto &[function, line] : calls) {
        std::cout << function << ": " << line << '\n';
        covered.insert(function);
        EXPECT_TRUE(served.contains(line)) << "the stand-in does not serve it: " << line;
    }
    std::set<std::string> declared;
    for (const auto &entry : std::filesystem::directory_iterator{IMS_TEST_INCLUDE_DIR})
        declared.merge(declared_functions(entry.path().filename()));
    EXPECT_EQ(missing(covered, declared), "") << "declared, but in no row";
    EXPECT_EQ(missing(declared, covered), "") << "in a row, but not declared";
    std::cout << declared.size() << " functions, " << calls.size() << " of them make a call\n";
}

} // namespace
} // namespace test
