// SPDX-License-Identifier: Apache-2.0
// D-Bus tuple signatures as compile-time values.
#pragma once

#include <array>
#include <cstddef>
#include <string_view>

namespace ims {

// A string literal that can be a template argument.
template <std::size_t Size>
struct Literal {
    char text[Size]{};

    consteval Literal(const char (&literal)[Size]) {
        for (std::size_t at = 0; at < Size; ++at)
            text[at] = literal[at];
    }
    constexpr std::string_view view() const { return {text, Size - 1}; }
};

// The tuple that a literal such as "(iu@aa{sv})" describes. As in GLib's own format strings, '@'
// marks a member that is handed over as a ready value; it is not part of the type.
template <Literal Format>
class Signature {
    static constexpr std::size_t type_length(std::string_view rest) {
        const char first = rest.at(0);
        if (first == 'a')
            return 1 + type_length(rest.substr(1));
        if (first == '(' || first == '{') {
            const char last = first == '(' ? ')' : '}';
            std::size_t length = 1;
            while (rest.at(length) != last)
                length += type_length(rest.substr(length));
            return length + 1;
        }
        // Throwing here is a compile-time error: the literal is not a signature.
        return std::string_view{"bynqiuxtdsogv"}.find(first) == std::string_view::npos
                   ? throw "not a D-Bus type"
                   : 1;
    }

    // One past the last character of the tuple's type text, without the marks.
    static constexpr std::size_t stripped_size() {
        std::size_t size = 0;
        for (const char c : Format.view())
            size += c == '@' ? 0 : 1;
        return size;
    }

    static constexpr auto strip() {
        std::array<char, stripped_size() + 1> type{};
        std::size_t at = 0;
        for (const char c : Format.view()) {
            if (c != '@')
                type[at++] = c;
        }
        return type;
    }

    static constexpr auto stripped = strip();

  public:
    static constexpr const char *type() { return stripped.data(); }

    static constexpr std::size_t size() {
        const std::string_view tuple{type(), stripped_size()};
        if (tuple.size() < 2 || tuple.front() != '(' || type_length(tuple) != tuple.size())
            throw "not a tuple";
        std::size_t members = 0;
        for (std::size_t at = 1; at + 1 < tuple.size(); ++members)
            at += type_length(tuple.substr(at));
        return members;
    }

    static constexpr std::string_view member(std::size_t index) {
        const std::string_view tuple{type(), stripped_size()};
        std::size_t at = 1;
        for (; index > 0; --index)
            at += type_length(tuple.substr(at));
        return tuple.substr(at, type_length(tuple.substr(at)));
    }
};

} // namespace ims
