// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/random_group.hpp"

#include <array>
#include <limits>

namespace test {
namespace {

// One to four bytes each.
constexpr const char *kCharacters[] = {"a", "Z", " ", "'", "é", "ß", "€", "語", "😀"};

} // namespace

std::int32_t RandomGroup::number() {
    const std::int32_t numbers[] = {0,
                                    1,
                                    -1,
                                    below(1000),
                                    std::numeric_limits<std::int32_t>::max(),
                                    std::numeric_limits<std::int32_t>::min()};
    return numbers[below(std::size(numbers))];
}

std::string RandomGroup::words(std::size_t most_bytes) {
    std::string words;
    for (;;) {
        const std::string next = kCharacters[below(std::size(kCharacters))];
        if (words.size() + next.size() > most_bytes)
            return words;
        words += next;
    }
}

char *RandomGroup::a_text() {
    return texts_.emplace_back(words(below(40))).data();
}

char *RandomGroup::text() {
    return below(3) == 0 ? nullptr : a_text();
}

template <std::size_t Size>
void RandomGroup::fill(char (&buffer)[Size]) {
    const std::size_t most = below(4) == 0 ? Size - 1 : static_cast<std::size_t>(below(Size));
    words(most).copy(buffer, Size - 1);
}

template <typename Record>
Record *RandomGroup::keep(const Record &record) {
    auto kept = std::make_shared<Record>(record);
    kept_.push_back(kept);
    return kept.get();
}

// The count may say anything where there is no array, and nothing positive where there is one that
// is not meant.
template <typename Element, typename Make>
void RandomGroup::fill_array(Element *&elements, std::int32_t &count, const Make &make) {
    elements = nullptr;
    count = number();
    if (below(3) == 0)
        return;
    const int size = 1 + below(4);
    const auto array = std::make_shared<std::vector<Element>>();
    for (int at = 0; at < size; ++at)
        array->push_back(make());
    kept_.push_back(array);
    elements = array->data();
    count = below(4) == 0 ? -below(3) : size;
}

ims_xdm_member_entry_s RandomGroup::entry() {
    ims_xdm_member_entry_s entry{};
    fill(entry.uri);
    entry.disp_name = text();
    entry.status = {text(), text(), text()};
    entry.auto_join = flag();
    entry.stt = flag();
    entry.active = flag();
    entry.type = number();
    return entry;
}

ims_xdm_member_list_s RandomGroup::members() {
    ims_xdm_member_list_s list{};
    const auto a_text = [this] { return text(); };
    fill_array(list.contact_lists, list.num_of_ct_lists, a_text);
    fill_array(list.contacts, list.num_of_contacts, [this] { return entry(); });
    fill_array(list.ext_ref, list.num_of_ct_lists_ref, a_text);
    fill_array(list.entry_ref, list.num_of_ct_ref, a_text);
    return list;
}

ims_xdm_media_list_s RandomGroup::media() {
    return {flag(), flag(), flag(), flag(), flag(), flag(), flag()};
}

ims_xdm_group_properties_s RandomGroup::properties() {
    ims_xdm_group_properties_s properties{};
    fill(properties.display_name);
    fill(properties.subject);
    properties.is_searchable = flag();
    properties.inv_members = flag();
    properties.max_participants = number();
    properties.as_id = text();
    properties.area_id = text();
    properties.auto_grp_advertisements = flag();
    properties.group_qoe = number();
    if (flag()) {
        ims_xdm_session_policy_s policy{number(), number(), nullptr, nullptr};
        if (flag())
            policy.participants = keep(members());
        for (int links = below(3); links > 0; --links)
            policy.schedule = keep(ims_xdm_schedule_s{text(), text(), policy.schedule});
        properties.group_active_policy = keep(policy);
    }
    for (int links = below(3); links > 0; --links)
        properties.supported_services = keep(ims_xdm_supported_service_s{
            number(), flag() ? keep(media()) : nullptr, properties.supported_services});
    for (int links = below(3); links > 0; --links)
        properties.age_restrictions =
            keep(ims_xdm_age_restriction_s{text(), text(), properties.age_restrictions});
    return properties;
}

ims_xdm_domain_list_s *RandomGroup::domains() {
    if (flag())
        return nullptr;
    ims_xdm_domain_list_s list{};
    fill_array(list.domains, list.num_of_domain_id, [this] { return text(); });
    return keep(list);
}

ims_xdm_contact_list_s *RandomGroup::contacts() {
    if (flag())
        return nullptr;
    ims_xdm_contact_list_s list{};
    fill_array(list.contacts, list.num_of_contact_id, [this] { return entry(); });
    return keep(list);
}

void **RandomGroup::identity(std::int32_t type) {
    void *record = nullptr;
    if (type == IMS_XDM_IDENTITY_ENTRIES) {
        ims_xdm_identity_entries_s entries{};
        fill_array(entries.contacts, entries.num_of_contacts, [this] { return entry(); });
        record = keep(entries);
    } else if (type == IMS_XDM_IDENTITY_URLS) {
        ims_xdm_identity_urls_s urls{};
        fill_array(urls.urls, urls.num_of_contact_list_url, [this] { return text(); });
        record = keep(urls);
    } else if (type == IMS_XDM_IDENTITY_DOMAINS) {
        ims_xdm_identity_domains_s all{domains(), contacts(), domains(), contacts()};
        record = keep(all);
    }
    return flag() && record == nullptr ? nullptr : keep(record);
}

ims_xdm_group_rule_s RandomGroup::rule() {
    ims_xdm_group_rule_s rule{};
    fill(rule.rule_id);
    rule.rule_identity_type = below(6);
    rule.identity = below(4) == 0 ? nullptr : identity(rule.rule_identity_type);
    if (flag())
        rule.media_list = keep(media());
    for (bool *action = &rule.is_list_member; action <= &rule.allow_ltd_participating_info;
         ++action)
        *action = flag();
    return rule;
}

void RandomGroup::fill_group() {
    fill(group_.group_uri);
    group_.channel_id = text();
    group_.version = text();
    if (below(4) != 0)
        group_.group_properties = keep(properties());
    if (below(4) != 0)
        group_.group_member_list = keep(members());
    for (int links = below(4); links > 0; --links) {
        ims_xdm_group_rule_s next = rule();
        next.next = group_.group_rule_set;
        group_.group_rule_set = keep(next);
    }
}

} // namespace test
