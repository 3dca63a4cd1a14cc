// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/tpdu.hpp"

#include <stdexcept>
#include <string>
#include <vector>

// Short messages for tests. What cannot be encoded is a mistake of the test.
namespace sim::test {

template <typename T>
T must(tpdu::Result<T> result) {
    if (!result)
        throw std::logic_error(result.error().message);
    return std::move(result).value();
}

inline tpdu::Submit submit_to(const std::string &number, const std::string &text,
                              std::uint8_t reference = 0) {
    const auto segmented = must(tpdu::segment(text));
    tpdu::Submit submit;
    submit.destination = must(tpdu::number_address(number));
    submit.message_reference = reference;
    submit.data_coding = tpdu::data_coding_for(segmented.alphabet);
    submit.user_data = segmented.parts.front();
    return submit;
}

inline std::vector<tpdu::Submit> submits_to(const std::string &number, const std::string &text) {
    const auto segmented = must(tpdu::segment(text, {.reference = 7}));
    std::vector<tpdu::Submit> submits;
    for (const auto &part : segmented.parts) {
        auto submit = submit_to(number, "", static_cast<std::uint8_t>(submits.size() + 1));
        submit.data_coding = tpdu::data_coding_for(segmented.alphabet);
        submit.user_data = part;
        submits.push_back(submit);
    }
    return submits;
}

} // namespace sim::test
