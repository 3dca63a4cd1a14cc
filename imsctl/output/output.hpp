// SPDX-License-Identifier: Apache-2.0
// The two forms of everything that imsctl says: lines for people, JSON objects for programs.
#pragma once

#include "imsctl/output/events.hpp"
#include "imsctl/output/failure.hpp"

#include <cstdio>
#include <string>
#include <utility>

namespace imsctl {

// An event that arrived.
struct Event {
    const EventRow *row;
    Fields fields;
    std::int64_t time; // microseconds since 1970

    // nullptr when the event has no such field.
    const Value *find(std::string_view name) const;
    std::optional<std::int64_t> number(std::string_view name) const;
};

// "12:34:56.789"
std::string local_clock_time(std::int64_t time);

// "session_id=1 reason=16", and the summary of an event that has one
std::string to_text(const EventRow &row, const Fields &fields);

// "12:34:56.789 call-ended session_id=1 reason=16"
std::string to_text(const Event &event);
Json to_json(const Event &event, int slot);

// Texts made beforehand, to be written from where nothing else can be done any more.
struct LastWords {
    std::string to_stdout;
    std::string to_stderr;
};

class Output {
  public:
    Output(bool json, std::FILE *out, std::FILE *err) : json_(json), out_(out), err_(err) {}

    bool json() const { return json_; }

    // Names the verb in what follows.
    void set_verb(std::string verb) { verb_ = std::move(verb); }

    // What a verb came to.
    void result(const Fields &fields) const;
    // The fields of an event's record.
    void result(const EventRow &row, const Fields &fields) const;
    void result(const Json &object, const std::string &text) const;

    // At once; and the same with the end of the line. Throw ReaderGone when nobody reads any more.
    void text(const std::string &text) const;
    void line(const std::string &text) const { this->text(text + '\n'); }

    // For people, beside the result.
    void note(const std::string &text) const;

    void failure(const Failure &failure) const;

    // What failure() writes.
    LastWords failure_texts(const Failure &failure) const;

    // Where results go, or -1.
    int descriptor() const { return fileno(out_); }

  private:
    bool json_;
    std::FILE *out_;
    std::FILE *err_;
    std::string verb_;
};

} // namespace imsctl
