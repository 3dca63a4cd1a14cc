// SPDX-License-Identifier: Apache-2.0
#include "sim/group/interface.hpp"

#include "sim/bus/ask.hpp"
#include "sim/group/answer_fields.hpp"
#include "sim/group/edits.hpp"
#include "sim/group/profile.hpp"
#include "sim/group/reader.hpp"
#include "sim/group/wire.hpp"
#include "sim/group/writer.hpp"

#include <algorithm>

namespace sim {

namespace {

template <typename T>
concept GroupRecord = requires(GroupWriter &writer, const T &record) {
    describe(writer, record);
};

} // namespace

namespace wire {

// Records come as they are written and are answered as they are read.
template <GroupRecord Record>
struct Form<Record> {
    static constexpr std::string_view kSignature = "a{sv}";
    static Answer<Record> read(const Variant &member) {
        const auto dictionary = read_dictionary(member.get());
        if (!dictionary)
            return dictionary.refusal();
        return read_record<Record>(*dictionary, GroupForm::kWritten);
    }
    static void write(Tuple &tuple, const Record &record) {
        tuple.put(write_dictionary(write_record(record, GroupForm::kRead)).get());
    }
};

template <GroupRecord Record>
struct Form<const Record *> {
    static constexpr std::string_view kSignature = Form<Record>::kSignature;
    static void write(Tuple &tuple, const Record *record) { tuple.add(*record); }
};

template <GroupRecord Record>
struct Form<std::vector<Record>> {
    static constexpr std::string_view kSignature = "aa{sv}";
    static Answer<std::vector<Record>> read(const Variant &member) {
        const auto list = read_dictionaries(member.get());
        if (!list)
            return list.refusal();
        return read_records<Record>(*list, GroupForm::kWritten);
    }
};

} // namespace wire

namespace {

using std::int32_t;
using std::string;
using enum Caller;

template <typename Argument>
Argument argument_of(Status (*)(GroupDocument &, const Argument &));
template <typename Property>
Property type_of(Property GroupProperties::*);

// What a function of sim/group/edits.hpp does with the second argument.
template <auto kEdit>
Status edit(GroupModel &groups, const string &uri, const decltype(argument_of(kEdit)) &argument) {
    return groups.edit(uri, [&](GroupDocument &group) { return kEdit(group, argument); });
}

// The second argument becomes this property.
template <auto kProperty>
Status set_property(GroupModel &groups, const string &uri,
                    const decltype(type_of(kProperty)) &property) {
    return groups.edit(uri, [&](GroupDocument &group) -> Status {
        made(group.properties).*kProperty = property;
        return Done{};
    });
}

Status modify_group_attributes(GroupModel &groups, const string &uri, const string &member,
                               const string &name, bool stt, bool active, int32_t type,
                               bool auto_join, const MemberStatus &status) {
    const GroupMember contact{
        member, name.empty() ? OptionalText() : name, stt, active, type, auto_join, status};
    return groups.edit(uri, [&](GroupDocument &group) { return replace_contact(group, contact); });
}

} // namespace

ParticipantGroups GroupInterface::fetch_participant_groups(int slot, const string &user) const {
    return groups_.participant_groups(user_of(slot, user));
}

Answer<UserProfile> GroupInterface::fetch_profile(int slot, const string &named) const {
    const auto user = user_of(slot, named);
    for (int each = 0; each < plan_.slots(); ++each)
        if (const auto uri = to_uri(plan_.number_of(each)); same_user(uri, user))
            return profile_of_slot(each, uri);
    return refuse(Result::kUnknownRecord, "nobody knows a profile of \"{}\"", user);
}

Status GroupInterface::set_default(int slot, const string &list, const string &uri,
                                   bool is_default) {
    return groups_.set_default(user_of(slot, ""), list, uri, is_default);
}

Answer<ParticipantInfo> GroupInterface::participant_info(int slot, const string &text) const {
    const auto sessions = sessions_(slot);
    const auto session = std::ranges::find_if(sessions, [&](const auto &running) {
        return !text.empty() && (running.session_uri == text || running.list_service_uri == text);
    });
    if (session == sessions.end())
        return refuse(Result::kUnknownSession,
                      "the slot has no push-to-talk session \"{}\", and none of such a group",
                      text);
    return *session;
}

string GroupInterface::user_of(int slot, const string &user) const {
    return user.empty() ? to_uri(plan_.number_of(slot)) : user;
}

Interface GroupInterface::describe() {
    using Properties = GroupProperties;
    static constexpr MethodRow<GroupInterface, GroupModel> kMethods[] = {
        {"XdmCreateGroup", ask<&GroupModel::create>, kConnection},
        {"XdmDeleteGroup", ask<&GroupModel::remove>, kConnection},
        {"XdmFetchSharedGroup", ask<&GroupModel::find>, kConnection},
        {"XdmFetchAllSharedGroups", ask<&GroupModel::shared_groups>, kConnection},
        {"XdmFetchAllParticipantGroups", ask<&GroupInterface::fetch_participant_groups>,
         kConnection},
        {"XdmFetchSharedUserProfile", ask<&GroupInterface::fetch_profile>, kConnection},
        {"XdmAddUserToSharedGroup", ask<&edit<add_members>>, kConnection},
        {"XdmRemoveUserFromSharedGroup", ask<&edit<remove_members>>, kConnection},
        {"XdmAddGroupRule", ask<&edit<add_rules>>, kConnection},
        {"XdmModifyGroupRule", ask<&edit<replace_rules>>, kConnection},
        {"XdmDeleteGroupRule", ask<&edit<delete_rule>>, kConnection},
        {"XdmModifyGroupDisplayName", ask<&set_property<&Properties::display_name>>, kConnection},
        {"XdmModifyGroupSubject", ask<&set_property<&Properties::subject>>, kConnection},
        {"XdmModifyGroupSearchable", ask<&set_property<&Properties::is_searchable>>, kConnection},
        {"XdmModifyGroupInviteMembers", ask<&set_property<&Properties::inv_members>>, kConnection},
        {"XdmModifyGroupMaxParticipants", ask<&set_property<&Properties::max_participants>>,
         kConnection},
        {"XdmModifyGroupAutoAdvertisements",
         ask<&set_property<&Properties::auto_grp_advertisements>>, kConnection},
        {"XdmModifyGroupQoe", ask<&set_property<&Properties::group_qoe>>, kConnection},
        {"XdmModifyGroupSessionActivePolicy", ask<&edit<set_active_policy>>, kConnection},
        {"XdmModifyGroupSessionServiceList", ask<&edit<set_service>>, kConnection},
        {"XdmModifyGroupAgeRestriction", ask<&edit<set_age_restrictions>>, kConnection},
        {"XdmModifyGroupAttributes", ask<modify_group_attributes>, kConnection},
        {"XdmModifyDefaultGroup", ask<&GroupInterface::set_default>, kConnection},
        {"XdmGetParticipantInfo", ask<&GroupInterface::participant_info>, kConnection},
    };
    auto methods = bind_methods(kMethods, *this, groups_);
    // The network keeps the groups: without a radio they cannot be reached.
    for (auto &method : methods)
        method.handler = [this, handler = std::move(method.handler)](const Request &request) {
            const auto off = registrations_.radio_off(request.slot);
            return off ? Answer<Variant>(*off) : handler(request);
        };
    return {"org.kelvo.ims.Xdm", std::move(methods), {}};
}

} // namespace sim
