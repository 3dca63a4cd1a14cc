// SPDX-License-Identifier: Apache-2.0
// Group documents and parts of them from JSON.
#pragma once

#include "imsctl/output/fields.hpp"

#include <deque>
#include <ims.h>
#include <memory>
#include <string>
#include <vector>

namespace imsctl {

// What the records point to, for as long as they are used.
class Storage {
  public:
    char *keep(std::string text) { return texts_.emplace_back(std::move(text)).data(); }

    template <class Element>
    Element *keep(std::vector<Element> elements) {
        const auto kept = std::make_shared<std::vector<Element>>(std::move(elements));
        records_.push_back(kept);
        return kept->data();
    }

    template <class Record>
    Record *make() {
        return keep(std::vector<Record>(1));
    }

  private:
    std::deque<std::string> texts_;
    std::vector<std::shared_ptr<void>> records_;
};

// Each reads a file, "-" for standard input, and throws an input failure that names everything that
// is wrong with it and where.
ims_xdm_group_info_s *read_group(const std::string &file, Storage &storage);
ims_xdm_member_list_s *read_members(const std::string &file, Storage &storage);
ims_xdm_session_policy_s *read_policy(const std::string &file, Storage &storage);
// One rule, or a list of rules.
ims_xdm_group_rule_s *read_rules(const std::string &file, Storage &storage);

} // namespace imsctl
