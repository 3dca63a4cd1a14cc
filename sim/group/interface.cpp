// SPDX-License-Identifier: Apache-2.0
#include "sim/group/interface.hpp"

#include "sim/bus/replies.hpp"
#include "sim/group/answer_fields.hpp"
#include "sim/group/edits.hpp"
#include "sim/group/profile.hpp"
#include "sim/group/reader.hpp"
#include "sim/group/wire.hpp"
#include "sim/group/writer.hpp"

#include <algorithm>

namespace sim {

namespace {

using std::int32_t;
using std::string;
using enum Caller;

// Second arguments as an edit takes them.
template <typename Record>
Answer<Record> read_argument(GVariant *argument, std::type_identity<Record>) {
    const auto dictionary = wire::read_dictionary(argument);
    if (!dictionary)
        return dictionary.refusal();
    return read_record<Record>(*dictionary, GroupForm::kWritten);
}

template <typename Record>
Answer<std::vector<Record>> read_argument(GVariant *argument,
                                          std::type_identity<std::vector<Record>>) {
    const auto list = wire::read_dictionaries(argument);
    if (!list)
        return list.refusal();
    return read_records<Record>(*list, GroupForm::kWritten);
}

Answer<string> read_argument(GVariant *argument, std::type_identity<string>) {
    return wire::read<string>(argument);
}

template <typename Argument>
std::type_identity<Argument> argument_of(Status (*)(GroupDocument &, const Argument &));

template <typename Property>
std::type_identity<Property> type_of(Property GroupProperties::*);

template <typename Record>
Answer<Variant> answer(const Record &record) {
    return wire::pack(Result::kOk, wire::write_dictionary(write_record(record, GroupForm::kRead)));
}

} // namespace

template <auto kEdit>
Answer<Variant> XdmInterface::edit(const Request &request) {
    const auto [uri, raw] = request.unpack<string, Variant>();
    const auto argument = read_argument(raw.get(), decltype(argument_of(kEdit))());
    if (!argument)
        return argument.refusal();
    return result_of(
        groups_.edit(uri, [&](GroupDocument &group) { return kEdit(group, *argument); }));
}

template <auto kProperty>
Answer<Variant> XdmInterface::set_property(const Request &request) {
    using Property = typename decltype(type_of(kProperty))::type;
    const auto arguments = request.unpack<string, Property>();
    return result_of(groups_.edit(std::get<0>(arguments), [&](GroupDocument &group) -> Status {
        made(group.properties).*kProperty = std::get<1>(arguments);
        return Done{};
    }));
}

const MethodRow<XdmInterface> XdmInterface::kMethods[] = {
    {"XdmCreateGroup", "(a{sv})", "(i)", kConnection, &XdmInterface::create_group},
    {"XdmDeleteGroup", "(s)", "(i)", kConnection, &XdmInterface::delete_group},
    {"XdmFetchSharedGroup", "(ss)", "(ia{sv})", kConnection, &XdmInterface::fetch_shared_group},
    {"XdmFetchAllSharedGroups", "(s)", "(ia{sv})", kConnection,
     &XdmInterface::fetch_all_shared_groups},
    {"XdmFetchAllParticipantGroups", "(s)", "(ia{sv})", kConnection,
     &XdmInterface::fetch_all_participant_groups},
    {"XdmFetchSharedUserProfile", "(s)", "(ia{sv})", kConnection,
     &XdmInterface::fetch_shared_user_profile},
    {"XdmAddUserToSharedGroup", "(sa{sv})", "(i)", kConnection, &XdmInterface::edit<add_members>},
    {"XdmRemoveUserFromSharedGroup", "(sa{sv})", "(i)", kConnection,
     &XdmInterface::edit<remove_members>},
    {"XdmAddGroupRule", "(saa{sv})", "(i)", kConnection, &XdmInterface::edit<add_rules>},
    {"XdmModifyGroupRule", "(saa{sv})", "(i)", kConnection, &XdmInterface::edit<replace_rules>},
    {"XdmDeleteGroupRule", "(ss)", "(i)", kConnection, &XdmInterface::edit<delete_rule>},
    {"XdmModifyGroupDisplayName", "(ss)", "(i)", kConnection,
     &XdmInterface::set_property<&GroupProperties::display_name>},
    {"XdmModifyGroupSubject", "(ss)", "(i)", kConnection,
     &XdmInterface::set_property<&GroupProperties::subject>},
    {"XdmModifyGroupSearchable", "(sb)", "(i)", kConnection,
     &XdmInterface::set_property<&GroupProperties::is_searchable>},
    {"XdmModifyGroupInviteMembers", "(sb)", "(i)", kConnection,
     &XdmInterface::set_property<&GroupProperties::inv_members>},
    {"XdmModifyGroupMaxParticipants", "(si)", "(i)", kConnection,
     &XdmInterface::set_property<&GroupProperties::max_participants>},
    {"XdmModifyGroupAutoAdvertisements", "(sb)", "(i)", kConnection,
     &XdmInterface::set_property<&GroupProperties::auto_grp_advertisements>},
    {"XdmModifyGroupQoe", "(si)", "(i)", kConnection,
     &XdmInterface::set_property<&GroupProperties::group_qoe>},
    {"XdmModifyGroupSessionActivePolicy", "(sa{sv})", "(i)", kConnection,
     &XdmInterface::edit<set_active_policy>},
    {"XdmModifyGroupSessionServiceList", "(sa{sv})", "(i)", kConnection,
     &XdmInterface::edit<set_service>},
    {"XdmModifyGroupAgeRestriction", "(saa{sv})", "(i)", kConnection,
     &XdmInterface::edit<set_age_restrictions>},
    {"XdmModifyGroupAttributes", "(sssbbiba{sv})", "(i)", kConnection,
     &XdmInterface::modify_group_attributes},
    {"XdmModifyDefaultGroup", "(ssb)", "(i)", kConnection, &XdmInterface::modify_default_group},
    {"XdmGetParticipantInfo", "(s)", "(ia{sv})", kConnection, &XdmInterface::get_participant_info},
};

Interface XdmInterface::describe() {
    auto methods = bind_methods<XdmInterface>(*this, kMethods);
    // The network keeps the groups: without a radio they cannot be reached.
    for (auto &method : methods)
        method.handler = [this, handler = std::move(method.handler)](const Request &request) {
            const auto off = registrations_.radio_off(request.slot);
            return off ? Outcome(*off) : handler(request);
        };
    return {"org.kelvo.ims.Xdm", std::move(methods), {}};
}

std::string XdmInterface::user_of(const Request &request) const {
    const auto [user] = request.unpack<string>();
    return user.empty() ? to_uri(plan_.number_of(request.slot)) : user;
}

Answer<Variant> XdmInterface::create_group(const Request &request) {
    const auto [raw] = request.unpack<Variant>();
    const auto group = read_argument(raw.get(), std::type_identity<GroupDocument>());
    return group ? result_of(groups_.create(*group)) : group.refusal();
}

Answer<Variant> XdmInterface::delete_group(const Request &request) {
    const auto [uri] = request.unpack<string>();
    return result_of(groups_.remove(uri));
}

Answer<Variant> XdmInterface::fetch_shared_group(const Request &request) {
    const auto [uri, channel] = request.unpack<string, string>();
    const auto group = groups_.find(uri, channel);
    return group ? answer(**group) : group.refusal();
}

Answer<Variant> XdmInterface::fetch_all_shared_groups(const Request &request) {
    const auto [user] = request.unpack<string>();
    return answer(groups_.shared_groups(user));
}

Answer<Variant> XdmInterface::fetch_all_participant_groups(const Request &request) {
    return answer(groups_.participant_groups(user_of(request)));
}

Answer<Variant> XdmInterface::fetch_shared_user_profile(const Request &request) {
    const auto user = user_of(request);
    for (int slot = 0; slot < plan_.slots(); ++slot)
        if (const auto uri = to_uri(plan_.number_of(slot)); same_user(uri, user))
            return answer(profile_of_slot(slot, uri));
    return refuse(Result::kUnknownRecord, "nobody knows a profile of \"{}\"", user);
}

Answer<Variant> XdmInterface::modify_group_attributes(const Request &request) {
    const auto [uri, member, name, stt, active, type, auto_join, raw] =
        request.unpack<string, string, string, bool, bool, int32_t, bool, Variant>();
    const auto status = read_argument(raw.get(), std::type_identity<MemberStatus>());
    if (!status)
        return status.refusal();
    const GroupMember contact{
        member, name.empty() ? OptionalText() : name, stt, active, type, auto_join, *status};
    return result_of(
        groups_.edit(uri, [&](GroupDocument &group) { return replace_contact(group, contact); }));
}

Answer<Variant> XdmInterface::modify_default_group(const Request &request) {
    const auto [list, uri, is_default] = request.unpack<string, string, bool>();
    return result_of(
        groups_.set_default(to_uri(plan_.number_of(request.slot)), list, uri, is_default));
}

Answer<Variant> XdmInterface::get_participant_info(const Request &request) {
    const auto [text] = request.unpack<string>();
    const auto sessions = sessions_(request.slot);
    const auto session = std::ranges::find_if(sessions, [&, &named = text](const auto &running) {
        return !named.empty() &&
               (running.session_uri == named || running.list_service_uri == named);
    });
    if (session == sessions.end())
        return refuse(Result::kUnknownSession,
                      "the slot has no push-to-talk session \"{}\", and none of such a group",
                      text);
    return answer(*session);
}

} // namespace sim
