// SPDX-License-Identifier: Apache-2.0
// One run of one verb.
#pragma once

#include "imsctl/client/client.hpp"

#include <functional>
#include <optional>

namespace imsctl {

class Invocation {
  public:
    Invocation(const Settings &settings, const Output &output)
        : settings_(settings), output_(output) {}

    const Settings &settings() const { return settings_; }
    const Output &output() const { return output_; }

    // Connects when it is first asked for.
    Client &client() { return client_ ? *client_ : client_.emplace(settings_, output_); }

    // Makes a request, waits and reports `known` and what the reply brought.
    void request(Fields known, const Start &start, Decode decode = nullptr);

  private:
    const Settings &settings_;
    const Output &output_;
    std::optional<Client> client_;
};

// What a verb does. Goes wrong by throwing a Failure.
using Action = std::function<void(Invocation &)>;

} // namespace imsctl
