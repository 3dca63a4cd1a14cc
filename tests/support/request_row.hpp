// SPDX-License-Identifier: Apache-2.0
// One row for each exported function that makes a call: what it is named, what it sends, what it
// refuses and what its reply becomes. The same checks run over every row.
#pragma once

#include "ims.h"

#include <ostream>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace test {

// Makes the row's request with its sample arguments.
using Request = int (*)(ims_h handle, ims_response_cb callback, void *user_data);

// The same with one argument that is not acceptable.
struct Variation {
    std::string what;
    Request call;
};

struct Module {
    const char *unit;      // "ims_call.cpp"
    const char *interface; // "org.kelvo.ims.Call"
};

struct RequestRow {
    std::string function; // "ims_call_hold_call"
    std::string unit;
    std::string handler; // "on_response_call_hold_call"
    std::string interface;
    std::string method;
    std::string sent_type; // empty: no parameters
    std::string sent;      // with 42 where the application id stands
    Request call = nullptr;
    int (*call_with_nothing)() = nullptr; // every argument 0 or NULL
    std::vector<Variation> missing_pointers;
    std::vector<Variation> bad_texts;
    std::string reply_type = "(i)"; // the result comes first
    std::string reply = "(0,)";
    void (*check_data)(void *data) = nullptr; // not set: the data is NULL
    // What a result that is not 0 is logged with, up to the number; the data is NULL then. Not set:
    // no line, and the data is what it always is.
    std::string refused_message;
};

struct QueryRow {
    std::string function;
    std::string unit;
    std::string interface;
    std::string method;
    std::string sent_type;
    std::string sent;
    int (*call)(ims_h handle) = nullptr;
    int (*call_with_nothing)() = nullptr;
    struct Missing {
        std::string what;
        int (*call)(ims_h handle);
    };
    std::vector<Missing> missing_pointers;
    std::string reply_type;
    std::string reply;         // a success
    std::string refused_reply; // with a result that is not 0
    std::string refused_message;
};

inline void PrintTo(const RequestRow &row, std::ostream *out) {
    *out << row.function;
}
inline void PrintTo(const QueryRow &row, std::ostream *out) {
    *out << row.function;
}

// The functions that the rows are about, for comparing with what a header declares.
inline std::set<std::string> functions_of(const std::vector<RequestRow> &requests,
                                          const std::vector<QueryRow> &queries = {}) {
    std::set<std::string> functions;
    for (const RequestRow &row : requests)
        functions.insert(row.function);
    for (const QueryRow &row : queries)
        functions.insert(row.function);
    return functions;
}

// No text may be sent that holds this.
inline constexpr const char *kNotUtf8 = "caf\xe9";

template <auto Function>
int with_nothing() {
    return []<typename... Arguments>(int (*function)(Arguments...)) {
        return function(Arguments{}...);
    }(Function);
}

// The part of a row that follows from the names.
template <auto Function>
RequestRow named_row(const Module &module, const char *function, const char *method,
                     const char *sent_type, const char *sent) {
    RequestRow row;
    row.function = function;
    row.unit = module.unit;
    row.handler = "on_response_" + row.function.substr(sizeof "ims_" - 1);
    row.interface = module.interface;
    row.method = method;
    row.sent_type = sent_type;
    row.sent = sent;
    row.call_with_nothing = with_nothing<Function>;
    return row;
}

// f(handle, callback, user_data)
template <auto Function>
RequestRow plain_row(const Module &module, const char *function, const char *method,
                     const char *sent_type, const char *sent) {
    RequestRow row = named_row<Function>(module, function, method, sent_type, sent);
    row.call = [](ims_h handle, ims_response_cb callback, void *user_data) {
        return Function(handle, callback, user_data);
    };
    row.missing_pointers = {{"handle", [](ims_h, ims_response_cb callback, void *user_data) {
                                 return Function(nullptr, callback, user_data);
                             }}};
    return row;
}

// f(handle, value, callback, user_data)
template <auto Function, auto Value>
RequestRow value_row(const Module &module, const char *function, const char *method,
                     const char *sent_type, const char *sent) {
    RequestRow row = named_row<Function>(module, function, method, sent_type, sent);
    row.call = [](ims_h handle, ims_response_cb callback, void *user_data) {
        return Function(handle, Value, callback, user_data);
    };
    row.missing_pointers = {{"handle", [](ims_h, ims_response_cb callback, void *user_data) {
                                 return Function(nullptr, Value, callback, user_data);
                             }}};
    return row;
}

// f(handle, record, callback, user_data) where only the handle must be there
template <auto Function, const auto &Record>
RequestRow unchecked_record_row(const Module &module, const char *function, const char *method,
                                const char *sent_type, const char *sent) {
    RequestRow row = named_row<Function>(module, function, method, sent_type, sent);
    row.call = [](ims_h handle, ims_response_cb callback, void *user_data) {
        return Function(handle, &Record, callback, user_data);
    };
    row.missing_pointers = {{"handle", [](ims_h, ims_response_cb callback, void *user_data) {
                                 return Function(nullptr, &Record, callback, user_data);
                             }}};
    return row;
}

// f(handle, record, callback, user_data)
template <auto Function, const auto &Record>
RequestRow record_row(const Module &module, const char *function, const char *method,
                      const char *sent_type, const char *sent) {
    RequestRow row =
        unchecked_record_row<Function, Record>(module, function, method, sent_type, sent);
    row.missing_pointers.push_back(
        {"record", [](ims_h handle, ims_response_cb callback, void *user_data) {
             return Function(handle, nullptr, callback, user_data);
         }});
    return row;
}

inline RequestRow with_reply(RequestRow row, const char *type, const char *value,
                             void (*check_data)(void *) = nullptr) {
    row.reply_type = type;
    row.reply = value;
    row.check_data = check_data;
    return row;
}

inline RequestRow with_bad_texts(RequestRow row, std::vector<Variation> bad_texts) {
    row.bad_texts = std::move(bad_texts);
    return row;
}

// For the functions that use their pointers without a look.
inline RequestRow without_checks(RequestRow row) {
    row.missing_pointers.clear();
    return row;
}

// The record with a text that is not UTF-8 in one field.
template <auto Function, const auto &Record, auto Field>
Variation bad_text(const char *field) {
    return {field, [](ims_h handle, ims_response_cb callback, void *user_data) {
                auto record = Record;
                record.*Field = kNotUtf8;
                return Function(handle, &record, callback, user_data);
            }};
}

// The record with a pointer to another record that holds such a text.
template <auto Function, const auto &Record, auto Field, const auto &Bad>
Variation bad_part(const char *what) {
    return {what, [](ims_h handle, ims_response_cb callback, void *user_data) {
                auto record = Record;
                record.*Field = &Bad;
                return Function(handle, &record, callback, user_data);
            }};
}

} // namespace test
