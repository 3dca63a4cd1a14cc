// SPDX-License-Identifier: Apache-2.0
// What can go wrong, and the words for it.
#pragma once

#include "imsctl/output/fields.hpp"

#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>

namespace imsctl {

enum class FailureKind {
    kUsage,        // the command line is wrong
    kNotSupported, // the device has no IMS
    kRefused,      // the caller may not do this
    kUnreachable,  // no service, or none that answers
    kService,      // the service's own result
    kTimeout,      // the time that the user gave is over
    kInvalid,      // the library did not take an argument
    kSession,      // no session, or more than one, to choose from
    kCallEnded,    // the call that was followed ended
    kNotSent,      // the service centre did not take a message
    kOutput,       // nobody takes the output
    kInput,        // a file cannot be read, or what it says is wrong
    kFloor,        // the floor was not to be had, or taken away
    kProfile,      // no profile, or more than one, goes by what was given
};

// The "kind" of a JSON error object.
std::string_view to_string(FailureKind kind);

struct Failure : std::runtime_error {
    Failure(FailureKind failure_kind, const std::string &message, std::string what_to_type = "",
            Fields what_is_known = {})
        : std::runtime_error(message), kind(failure_kind), hint(std::move(what_to_type)),
          details(std::move(what_is_known)) {}

    // 2 for wrong usage, 1 for everything else.
    int exit_status() const { return kind == FailureKind::kUsage ? 2 : 1; }

    Json to_json() const;

    FailureKind kind;
    std::string hint; // what to type instead
    Fields details;   // for programs: the service's result, the session
};

// Nobody reads what is written any more: no reason to say anything.
struct ReaderGone {};

// What ims_init() said about a slot.
Failure connect_failure(int code, int slot);

Failure bus_break_failure();

// What a function of the library returned.
Failure library_failure(int code);

// What a request's callback received; never 0.
Failure response_failure(int result);

} // namespace imsctl
