// SPDX-License-Identifier: Apache-2.0
// The modules that the program is made of, and what they come to together.
#pragma once

#include "imsctl/line/verbs.hpp"
#include "imsctl/output/events.hpp"

#include <span>
#include <string_view>
#include <vector>

namespace imsctl {

// What one module adds.
struct Module {
    std::span<const VerbGroup> groups; // one for each word of its verbs that other words follow
    std::vector<std::span<const Verb>> verbs;
    std::vector<std::span<const EventRow>> events;
};

class Catalogue {
  public:
    // The verbs stay in the order of the modules.
    explicit Catalogue(std::span<const Module> modules);

    std::span<const Verb> verbs() const { return verbs_; }

    // In the order of their ids.
    std::span<const EventRow> events() const { return events_; }

    // Empty for a word that no other follows.
    std::string_view group_summary(std::string_view path) const;

  private:
    std::vector<VerbGroup> groups_;
    std::vector<Verb> verbs_;
    std::vector<EventRow> events_;
};

} // namespace imsctl
