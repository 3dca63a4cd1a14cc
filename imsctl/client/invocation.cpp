// SPDX-License-Identifier: Apache-2.0
#include "imsctl/client/invocation.hpp"

#include <utility>

namespace imsctl {

void Invocation::request(Fields known, const Start &start, Decode decode) {
    for (Field &field : client().request(start, std::move(decode)))
        known.push_back(std::move(field));
    output_.result(known);
}

} // namespace imsctl
