// SPDX-License-Identifier: Apache-2.0
#include "sim/call/ussd.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr std::chrono::milliseconds kNetworkTime{500};
constexpr std::chrono::seconds kUserTime{60};
constexpr std::string_view kNumberMark = "{number}";

// A path is the code and the replies that led there.
struct Page {
    std::string_view path;
    std::string_view text;
    bool asks = false;
};

constexpr Page kPages[] = {
    {"*100#", "Your balance is 12.50"},         {"*101#", "1 Balance\n2 My number\n3 Data", true},
    {"*101#/1", "Your balance is 12.50"},       {"*101#/2", kNumberMark},
    {"*101#/3", "1 Today\n2 This month", true}, {"*101#/3/1", "120 MB used today"},
    {"*101#/3/2", "2.4 GB used this month"},    {"*102#", kNumberMark},
};

bool is_code(std::string_view text) {
    const auto is_letter = [](char letter) {
        return (letter >= '0' && letter <= '9') || letter == '*' || letter == '#';
    };
    return text.size() > 1 && (text.front() == '*' || text.front() == '#') && text.back() == '#' &&
           std::ranges::all_of(text, is_letter);
}

} // namespace

UssdService::UssdService(const NumberPlan &plan, Timers &timers, const Registrations &registrations,
                         Sink sink)
    : plan_(plan), timers_(timers), registrations_(registrations), sink_(std::move(sink)),
      dialogues_(plan.slots()) {}

void UssdService::drop_dialogue(int slot) {
    if (dialogues_[slot].state != State::kIdle)
        release(slot, "Flight mode");
}

Status UssdService::send(int slot, UssdRequest type, int coding_scheme, const std::string &text) {
    if (coding_scheme < 0 || coding_scheme > 255)
        return refuse(Result::kInvalidArgument, "a data coding scheme is 0 to 255, not {}",
                      coding_scheme);
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    switch (type) {
    case UssdRequest::kStart:
        return start(slot, coding_scheme, text);
    case UssdRequest::kReply:
        return reply(slot, coding_scheme, text);
    case UssdRequest::kCancel:
        if (dialogues_[slot].state == State::kIdle)
            return refuse(Result::kWrongState, "there is no USSD dialogue to cancel");
        dialogues_[slot].state = State::kIdle;
        dialogues_[slot].timer.cancel();
        return Done{};
    }
    return refuse(Result::kInvalidArgument,
                  "a type is 1 (request), 2 (reply) or 3 (cancel), not {}", type);
}

Status UssdService::start(int slot, int coding_scheme, const std::string &code) {
    Dialogue &here = dialogues_[slot];
    if (here.state != State::kIdle)
        return refuse(Result::kWrongState, "USSD dialogue {} is open: reply or cancel it first",
                      here.number);
    if (!is_code(code))
        return refuse(Result::kInvalidArgument, "\"{}\" is no USSD code: write *100# or the like",
                      code);
    ++here.number;
    here.coding_scheme = coding_scheme;
    here.path = code;
    await_network(slot);
    return Done{};
}

Status UssdService::reply(int slot, int coding_scheme, const std::string &text) {
    Dialogue &here = dialogues_[slot];
    if (here.state != State::kUserAnswers)
        return refuse(Result::kWrongState, "the network has asked nothing by USSD");
    if (text.empty())
        return refuse(Result::kInvalidArgument, "the reply is empty");
    here.coding_scheme = coding_scheme;
    // One choice a reply: what holds the separator is none.
    here.path = text.find('/') == std::string::npos ? here.path + "/" + text : std::string();
    await_network(slot);
    return Done{};
}

void UssdService::await_network(int slot) {
    dialogues_[slot].state = State::kNetworkAnswers;
    dialogues_[slot].timer = timers_.after(kNetworkTime, [this, slot] { turn_page(slot); });
}

void UssdService::turn_page(int slot) {
    Dialogue &here = dialogues_[slot];
    const auto page = std::ranges::find(kPages, here.path, &Page::path);
    here.state = State::kIdle;
    if (page == std::end(kPages))
        return indicate(slot, UssdAnswer::kUnknownCode, "Unknown code or choice");
    if (page->asks) {
        here.state = State::kUserAnswers;
        here.timer = timers_.after_unscaled(kUserTime, [this, slot] { release(slot, "No reply"); });
    }
    indicate(slot, page->asks ? UssdAnswer::kReplyExpected : UssdAnswer::kFinal,
             page->text == kNumberMark ? plan_.number_of(slot) : std::string(page->text));
}

void UssdService::release(int slot, std::string why) {
    dialogues_[slot].state = State::kIdle;
    dialogues_[slot].timer.cancel();
    indicate(slot, UssdAnswer::kReleased, std::move(why));
}

void UssdService::indicate(int slot, UssdAnswer type, std::string text) {
    const Dialogue &here = dialogues_[slot];
    sink_(slot, CallUssdIndication{type, here.coding_scheme, here.number, std::move(text)});
}

} // namespace sim
