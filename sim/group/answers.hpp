// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/records.hpp"

#include <functional>

// What is answered about groups beside their documents.
namespace sim {

// Documents are borrowed.
struct SharedGroup {
    const GroupDocument *document = nullptr;
};

struct SharedGroups {
    std::string version;
    std::vector<SharedGroup> groups;
};

struct GroupUri {
    std::int32_t uri_type = 0;
    std::string uri;
    std::string disp_name;
    bool is_group_uri = false;
};

// What a group advertises of itself.
struct GroupAdvertisement {
    std::string note;
    std::int32_t type = 0;
    std::string display_name;
    std::vector<SupportedService> supported_services;
    std::string group_uri;
};

struct GroupUsage {
    std::string pc_id;
    GroupAdvertisement advertisement;
};

struct GroupListEntry {
    GroupUri uri;
    std::string poc_usage;
    std::string im_usage;
    std::vector<GroupUsage> usages;
    bool is_default_group = false;
    bool is_start_up = false;
};

struct GroupList {
    std::string name;
    std::string display_name;
    std::vector<GroupListEntry> entries;
};

// The groups that a user is a member of.
struct ParticipantGroups {
    std::string version;
    std::vector<GroupList> lists;
};

struct UserProfile {
    struct Name {
        std::string given_name;
        std::string family_name;
        std::string middle_name;
        std::string name_suffix;
        std::string name_prefix;
    };
    struct Address {
        std::string country;
        std::string region;
        std::string locality;
        std::string area;
        std::string street_name;
        std::string street_number;
        std::string postal_code;
    };
    std::string user_uri;
    std::string display_name;
    std::string birth_day;
    std::string gender;
    std::string free_text;
    std::int32_t qoe = 0;
    std::string status;
    std::string dispatcher_id;
    std::string client_type;
    std::vector<std::string> comm_info;
    Name name;
    Address address;
    MemberStatus company;
    std::vector<std::string> hobbies;
    std::vector<std::string> favourite_links;
};

struct SessionParticipant {
    GroupMember member;
    std::int32_t user_state = 0;
    GroupMedia media;
    std::int32_t user_qoe = 0;
};

// A push-to-talk session and who takes part in it.
struct ParticipantInfo {
    std::string list_service_uri; // of the group
    std::string session_uri;
    std::string disp_name;
    std::int32_t session_type = 0;
    GroupMedia media;
    std::int32_t qoe = 0;
    std::string area_id;
    std::string seu_id;
    std::string flow_id;
    std::string inviting_user;
    bool is_emergency = false;
    bool is_one_many_one = false;
    std::string expiry_time;
    bool is_full_duplex = false;
    std::vector<SessionParticipant> participants;
};

// The push-to-talk sessions that this slot takes part in.
using RunningSessions = std::function<std::vector<ParticipantInfo>(int slot)>;

} // namespace sim
