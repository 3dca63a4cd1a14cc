// SPDX-License-Identifier: Apache-2.0
// An exported function's name, from the function itself.
#pragma once

#include "ims.h"

#include <string_view>

namespace test {

// What the compiler calls a template argument: a function, or a member as "record::member".
template <auto Named>
constexpr std::string_view name_of() {
    constexpr std::string_view mark = "Named = ";
    std::string_view text = __PRETTY_FUNCTION__;
    text.remove_prefix(text.find(mark) + mark.size());
    if (text.starts_with('&'))
        text.remove_prefix(1);
    return text.substr(0, text.find_first_of(";]"));
}

static_assert(name_of<ims_init>() == "ims_init");
static_assert(name_of<&ims_call_make_info_s::number>() == "ims_call_make_info_s::number");

// Calls it with every argument 0 or NULL.
template <auto Function>
int with_nothing() {
    return []<typename... Arguments>(int (*function)(Arguments...)) {
        return function(Arguments{}...);
    }(Function);
}

} // namespace test
