// SPDX-License-Identifier: Apache-2.0
// One row for each exported function that makes a call: the function with sample arguments, what it
// sends, what it refuses and what its reply becomes. The same checks run over every row.
//
//     {.function = request<ims_call_hold_call, kSession>(),
//      .method = "HoldCall",
//      .type = "(ii)",
//      .arguments = "(42, 7)"},
#pragma once

#include "ims.h"
#include "tests/support/function_name.hpp"

#include <functional>
#include <memory>
#include <ostream>
#include <set>
#include <stdexcept>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <typeindex>
#include <utility>
#include <vector>

namespace test {

// No text may be sent that holds this.
inline constexpr const char *kNotUtf8 = "caf\xe9";

struct Module {
    const char *unit = nullptr;      // "ims_call.cpp"
    const char *interface = nullptr; // "org.kelvo.ims.Call"
    // The name of its functions' handlers; not set: each has one that is named like it.
    const char *handler = nullptr;
};

using MakeRequest = std::function<int(ims_h handle, ims_response_cb callback, void *user_data)>;
using MakeQuery = std::function<int(ims_h handle)>;

// The same with one argument that is not acceptable.
template <typename Make>
struct Variation {
    std::string what;
    Make call;
};

// What makes the sample record of a row unacceptable.
struct BadText {
    std::string what;
    std::type_index record;
    std::function<void(void *record)> spoil;
};

// An exported function that makes a request, and how to call it with the sample arguments.
struct RequestFunction {
    std::string name;
    int (*call_with_nothing)() = nullptr; // every argument 0 or NULL
    MakeRequest call;
    Variation<MakeRequest> no_handle;
    std::vector<Variation<MakeRequest>> null_arguments; // NULL for a record or a text
    std::vector<Variation<MakeRequest>> bad_texts;      // for a text that is an argument itself
    // With a copy of the record, spoilt.
    int (*call_spoilt)(const BadText &bad, ims_h handle, ims_response_cb callback,
                       void *user_data) = nullptr;
};

// An exported function that asks and waits for the answer.
struct QueryFunction {
    std::string name;
    int (*call_with_nothing)() = nullptr;
    MakeQuery call;
    std::vector<Variation<MakeQuery>> null_arguments; // the handle and the record
};

// Which NULL arguments a function refuses.
enum class Checked { kEveryPointer, kHandle, kNothing };

struct RequestRow {
    RequestFunction function = {};
    std::string method = {};
    std::string type = {};      // of the arguments as they are sent; empty: there are none
    std::string arguments = {}; // with 42 where the application id stands
    Checked checked = Checked::kEveryPointer;
    std::vector<BadText> bad_texts = {};
    std::string reply_type = "(i)"; // the result comes first
    std::string reply = "(0,)";
    void (*check_data)(void *data) = nullptr; // not set: the data is NULL
    // What a result that is not 0 is logged with, up to the number; the data is NULL then. Not set:
    // no line, and the data is what it always is.
    std::string refused_message = {};
    std::string handler = {}; // not set: as the module has it
    Module module = {};       // requests_of() says it
};

struct QueryRow {
    QueryFunction function = {};
    std::string method = {};
    std::string type = {};
    std::string arguments = {};
    std::string reply_type = {};
    std::string reply = {};         // a success
    std::string refused_reply = {}; // with a result that is not 0
    std::string refused_message = {};
    Module module = {};
};

inline void PrintTo(const RequestRow &row, std::ostream *out) {
    *out << row.function.name;
}
inline void PrintTo(const QueryRow &row, std::ostream *out) {
    *out << row.function.name;
}

// The functions that the rows are about, for comparing with what a header declares.
inline std::set<std::string> functions_of(const std::vector<RequestRow> &requests,
                                          const std::vector<QueryRow> &queries = {}) {
    std::set<std::string> functions;
    for (const RequestRow &row : requests)
        functions.insert(row.function.name);
    for (const QueryRow &row : queries)
        functions.insert(row.function.name);
    return functions;
}

// "hold_call" of "ims_hold_call"
inline std::string without_prefix(const std::string &function) {
    return function.substr(sizeof "ims_" - 1);
}

inline std::vector<RequestRow> joined(const std::vector<std::vector<RequestRow>> &parts) {
    std::vector<RequestRow> rows;
    for (const std::vector<RequestRow> &part : parts)
        rows.insert(rows.end(), part.begin(), part.end());
    return rows;
}

// What the rows of a module have in common is put into each.
inline std::vector<RequestRow> requests_of(const Module &module, std::vector<RequestRow> rows) {
    for (RequestRow &row : rows) {
        row.module = module;
        if (!row.handler.empty())
            continue;
        row.handler = module.handler != nullptr
                          ? module.handler
                          : "on_response_" + without_prefix(row.function.name);
    }
    return rows;
}

inline std::vector<QueryRow> queries_of(const Module &module, std::vector<QueryRow> rows) {
    for (QueryRow &row : rows)
        row.module = module;
    return rows;
}

// "org.kelvo.ims.Call.HoldCall"
template <typename Row>
std::string full_method(const Row &row) {
    return std::string{row.module.interface} + "." + row.method;
}

// What a row says its function refuses.
inline std::vector<Variation<MakeRequest>> null_arguments(const RequestRow &row) {
    if (row.checked == Checked::kNothing)
        return {};
    std::vector<Variation<MakeRequest>> all{row.function.no_handle};
    if (row.checked == Checked::kEveryPointer)
        all.insert(all.end(), row.function.null_arguments.begin(),
                   row.function.null_arguments.end());
    return all;
}

inline std::vector<Variation<MakeRequest>> bad_texts(const RequestRow &row) {
    std::vector<Variation<MakeRequest>> all = row.function.bad_texts;
    for (const BadText &bad : row.bad_texts)
        all.push_back({bad.what, [bad, call = row.function.call_spoilt](
                                     ims_h handle, ims_response_cb callback, void *user_data) {
                           return call(bad, handle, callback, user_data);
                       }});
    return all;
}

// A bad record, made of the sample by a function of the row's own.
template <typename Record>
BadText spoilt(std::string what, void (*spoil)(Record &record)) {
    return {std::move(what), typeid(Record),
            [spoil](void *record) { spoil(*static_cast<Record *>(record)); }};
}

// One whose field is no UTF-8.
template <auto Field>
BadText bad_text() {
    return []<typename Record, typename Text>(Text Record::*) {
        return spoilt<Record>(std::string{name_of<Field>()}, [](Record &record) {
            static char text[] = "caf\xe9";
            record.*Field = text;
        });
    }(Field);
}

// One that points to a part that holds such a text.
template <auto Field, const auto &Part>
BadText bad_part(std::string what) {
    return [&]<typename Record, typename Text>(Text Record::*) {
        return spoilt<Record>(std::move(what), [](Record &record) { record.*Field = &Part; });
    }(Field);
}

template <typename Function>
struct Signature;
template <typename... Parameters>
struct Signature<int (*)(Parameters...)> {
    using All = std::tuple<Parameters...>;
};
// The parameter at this position behind the handle.
template <auto Function, std::size_t At>
using Parameter = std::tuple_element_t<At + 1, typename Signature<decltype(Function)>::All>;

// A record is passed by its address, everything else as it is.
template <typename Wanted, typename Sample>
Wanted as_argument(const Sample &sample) {
    if constexpr (std::is_convertible_v<const Sample &, Wanted>)
        return sample;
    else
        return &sample;
}

// f(handle, samples..., callback, user_data)
template <auto Function, const auto &...Samples>
class SampleRequest {
    using Positions = std::index_sequence_for<decltype(Samples)...>;
    using Copies = std::tuple<std::decay_t<decltype(Samples)>...>;

    template <std::size_t... At>
    static auto arguments(const Copies &copies, std::index_sequence<At...> /*all*/) {
        return std::tuple<Parameter<Function, At>...>{
            as_argument<Parameter<Function, At>>(std::get<At>(copies))...};
    }

    // With one argument replaced.
    template <std::size_t At>
    static Variation<MakeRequest> with(const char *what, Parameter<Function, At> value) {
        return {"argument " + std::to_string(At + 1) + " " + what,
                [value](ims_h handle, ims_response_cb callback, void *user_data) {
                    const Copies copies{Samples...};
                    auto all = arguments(copies, Positions{});
                    std::get<At>(all) = value;
                    return call(handle, all, callback, user_data);
                }};
    }

    template <typename... Arguments>
    static int call(ims_h handle, const std::tuple<Arguments...> &all, ims_response_cb callback,
                    void *user_data) {
        return std::apply(
            [&](auto... each) { return Function(handle, each..., callback, user_data); }, all);
    }

    template <std::size_t At>
    static void add_variations(RequestFunction &function) {
        if constexpr (std::is_pointer_v<Parameter<Function, At>>)
            function.null_arguments.push_back(with<At>("is NULL", nullptr));
        if constexpr (std::is_same_v<Parameter<Function, At>, const char *>)
            function.bad_texts.push_back(with<At>("is no UTF-8", kNotUtf8));
    }

    static bool spoil(const BadText &bad, auto &sample) {
        const bool is_it = bad.record == typeid(sample);
        if (is_it)
            bad.spoil(&sample);
        return is_it;
    }

  public:
    static int call_sample(ims_h handle, ims_response_cb callback, void *user_data) {
        const Copies copies{Samples...};
        return call(handle, arguments(copies, Positions{}), callback, user_data);
    }

    static int call_spoilt(const BadText &bad, ims_h handle, ims_response_cb callback,
                           void *user_data) {
        Copies copies{Samples...};
        if (!std::apply([&](auto &...each) { return (spoil(bad, each) || ...); }, copies))
            throw std::logic_error(bad.what + " belongs to a record of another function");
        return call(handle, arguments(copies, Positions{}), callback, user_data);
    }

    static void add_all_variations(RequestFunction &function) {
        [&]<std::size_t... At>(std::index_sequence<At...>) {
            (add_variations<At>(function), ...);
        }
        (Positions{});
    }
};

template <auto Function, const auto &...Samples>
RequestFunction request() {
    using Sample = SampleRequest<Function, Samples...>;
    RequestFunction function{
        .name = std::string{name_of<Function>()},
        .call_with_nothing = with_nothing<Function>,
        .call = Sample::call_sample,
        .no_handle = {"no handle",
                      [](ims_h, ims_response_cb callback, void *user_data) {
                          return Sample::call_sample(nullptr, callback, user_data);
                      }},
        .null_arguments = {},
        .bad_texts = {},
        .call_spoilt = Sample::call_spoilt,
    };
    Sample::add_all_variations(function);
    return function;
}

// What an application releases of a record that a query filled.
template <typename Record>
void clear(Record & /*record*/) {}
inline void clear(ims_call_list_info_s &list) {
    ims_call_list_info_clear(&list);
}
inline void clear(ims_global_settings_s &settings) {
    ims_global_settings_clear(&settings);
}
inline void clear(ims_profile_list_s &list) {
    ims_profile_list_clear(&list);
}

// f(handle, samples..., record)
template <auto Function, const auto &...Samples>
struct SampleQuery {
    using Record = std::remove_pointer_t<Parameter<Function, sizeof...(Samples)>>;

    static int call(ims_h handle) {
        const auto record = std::make_unique<Record>();
        const int result = Function(handle, Samples..., record.get());
        clear(*record);
        return result;
    }
    static int call_without_handle(ims_h /*handle*/) { return call(nullptr); }
    static int call_without_record(ims_h handle) { return Function(handle, Samples..., nullptr); }
};

template <auto Function, const auto &...Samples>
QueryFunction query() {
    using Sample = SampleQuery<Function, Samples...>;
    return {
        .name = std::string{name_of<Function>()},
        .call_with_nothing = with_nothing<Function>,
        .call = Sample::call,
        .null_arguments = {{"no handle", Sample::call_without_handle},
                           {"no record", Sample::call_without_record}},
    };
}

} // namespace test
