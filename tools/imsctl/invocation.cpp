// SPDX-License-Identifier: Apache-2.0
#include "invocation.hpp"

namespace imsctl {

void Invocation::request(Fields known, const Start &start, Decode decode) {
    for (Field &field : client().request(start, decode))
        known.push_back(std::move(field));
    output_.result(known);
}

} // namespace imsctl
