// SPDX-License-Identifier: Apache-2.0
// Any group document: each part may be missing, each count may lie, texts may fill their buffers.
#pragma once

#include "ims.h"

#include <deque>
#include <memory>
#include <random>
#include <string>
#include <vector>

namespace test {

class RandomGroup {
  public:
    explicit RandomGroup(unsigned seed) : random_{seed} { fill_group(); }
    RandomGroup(const RandomGroup &) = delete;
    RandomGroup &operator=(const RandomGroup &) = delete;

    const ims_xdm_group_info_s &record() const { return group_; }

  private:
    int below(int limit) { return std::uniform_int_distribution{0, limit - 1}(random_); }
    bool flag() { return below(2) != 0; }
    std::int32_t number();
    std::string words(std::size_t most_bytes);
    char *text(); // or none
    char *a_text();
    template <std::size_t Size>
    void fill(char (&buffer)[Size]);
    template <typename Record>
    Record *keep(const Record &record);
    template <typename Element, typename Make>
    void fill_array(Element *&elements, std::int32_t &count, const Make &make);

    void fill_group();
    ims_xdm_member_entry_s entry();
    ims_xdm_member_list_s members();
    ims_xdm_media_list_s media();
    ims_xdm_group_properties_s properties();
    ims_xdm_group_rule_s rule();
    void **identity(std::int32_t type);
    ims_xdm_domain_list_s *domains();
    ims_xdm_contact_list_s *contacts();

    std::mt19937 random_;
    std::vector<std::shared_ptr<void>> kept_;
    std::deque<std::string> texts_;
    ims_xdm_group_info_s group_{};
};

} // namespace test
