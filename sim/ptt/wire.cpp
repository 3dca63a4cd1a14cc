// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/wire.hpp"

#include "sim/bus/wire.hpp"

#include <algorithm>
#include <functional>
#include <limits>
#include <map>
#include <string>
#include <string_view>

namespace sim::ptt_wire {

namespace {

constexpr gsize kLongestList = 1024;

Refusal malformed(std::string_view what, std::string_view expected, const Variant &content) {
    return refuse(Result::kInvalidArgument, "{} is \"{}\", not \"{}\"", what, expected,
                  g_variant_get_type_string(content.get()));
}

// Where the value of a key goes, which says of what type it must be.
using Target = std::variant<std::int32_t *, bool *, std::string *, std::function<Status(Variant)>>;
using Keys = std::map<std::string_view, Target>;

Status store(std::string_view key, const Variant &value, const Target &target) {
    const auto wrong = [&](std::string_view expected) { return malformed(key, expected, value); };
    if (const auto *nested = std::get_if<std::function<Status(Variant)>>(&target))
        return (*nested)(value);
    if (auto *const *text = std::get_if<std::string *>(&target)) {
        if (!g_variant_is_of_type(value.get(), G_VARIANT_TYPE_STRING))
            return wrong("s");
        **text = g_variant_get_string(value.get(), nullptr);
        return Done{};
    }
    if (auto *const *flag = std::get_if<bool *>(&target)) {
        if (!g_variant_is_of_type(value.get(), G_VARIANT_TYPE_BOOLEAN))
            return wrong("b");
        **flag = g_variant_get_boolean(value.get()) != FALSE;
        return Done{};
    }
    if (!g_variant_is_of_type(value.get(), G_VARIANT_TYPE_INT64))
        return wrong("x");
    const gint64 number = g_variant_get_int64(value.get());
    using Limits = std::numeric_limits<std::int32_t>;
    if (number < Limits::min() || number > Limits::max())
        return refuse(Result::kInvalidArgument, "{} does not fit in 32 bits: {}", key, number);
    *std::get<std::int32_t *>(target) = static_cast<std::int32_t>(number);
    return Done{};
}

Status read_dictionary(std::string_view what, const Variant &member, const Keys &keys) {
    const Variant content = wire::peeled(member);
    if (!g_variant_is_of_type(content.get(), G_VARIANT_TYPE_VARDICT))
        return malformed(what, "a{sv}", content);
    for (gsize i = 0; i < g_variant_n_children(content.get()); ++i) {
        const auto entry = Variant::adopt(g_variant_get_child_value(content.get(), i));
        const auto name = Variant::adopt(g_variant_get_child_value(entry.get(), 0));
        const std::string_view key = g_variant_get_string(name.get(), nullptr);
        const auto target = keys.find(key);
        if (target == keys.end())
            return refuse(Result::kInvalidArgument, "{} has no key \"{}\"", what, key);
        const auto value = wire::peeled(Variant::adopt(g_variant_get_child_value(entry.get(), 1)));
        if (auto stored = store(key, value, target->second); !stored)
            return stored;
    }
    return Done{};
}

template <typename T, typename Read>
Answer<std::vector<T>> read_list(std::string_view what, const Variant &member, Read read) {
    const Variant content = wire::peeled(member);
    if (!g_variant_is_of_type(content.get(), G_VARIANT_TYPE("aa{sv}")))
        return malformed(what, "aa{sv}", content);
    if (g_variant_n_children(content.get()) > kLongestList)
        return refuse(Result::kInvalidArgument, "{} has more than {} entries", what, kLongestList);
    std::vector<T> list;
    for (gsize i = 0; i < g_variant_n_children(content.get()); ++i) {
        auto entry = read(Variant::adopt(g_variant_get_child_value(content.get(), i)));
        if (!entry)
            return entry.refusal();
        list.push_back(*std::move(entry));
    }
    return list;
}

template <typename T>
Answer<T> read_record(std::string_view what, const Variant &content, T &record, const Keys &keys) {
    const auto read = read_dictionary(what, content, keys);
    return read ? Answer<T>(std::move(record)) : read.refusal();
}

// Builds a dictionary key by key; empty texts are left out.
class Dictionary {
  public:
    Dictionary() { g_variant_builder_init(&builder_, G_VARIANT_TYPE_VARDICT); }
    Dictionary &add(const char *key, std::int32_t value) {
        return put(key, g_variant_new_int64(value));
    }
    Dictionary &add(const char *key, bool value) { return put(key, g_variant_new_boolean(value)); }
    Dictionary &add(const char *key, const std::string &value) {
        return value.empty() ? *this : put(key, g_variant_new_string(value.c_str()));
    }
    Dictionary &add(const char *key, const Variant &value) { return put(key, value.get()); }
    Dictionary &add(const char *key, const char *value) = delete; // would become a boolean
    Variant end() { return Variant(g_variant_builder_end(&builder_)); }

  private:
    Dictionary &put(const char *key, GVariant *value) {
        g_variant_builder_add(&builder_, "{sv}", key, value);
        return *this;
    }
    GVariantBuilder builder_;
};

template <typename T, typename Make>
Variant list_of(const std::vector<T> &entries, Make make) {
    GVariantBuilder list;
    g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
    for (const auto &entry : entries)
        g_variant_builder_add_value(&list, make(entry).get());
    return Variant(g_variant_builder_end(&list));
}

} // namespace

Answer<std::vector<std::int32_t>> integers(const Variant &member) {
    const Variant content = wire::peeled(member);
    if (!g_variant_is_of_type(content.get(), G_VARIANT_TYPE("ai")))
        return malformed("a set of integers", "ai", content);
    gsize count = 0;
    const auto *values = static_cast<const std::int32_t *>(
        g_variant_get_fixed_array(content.get(), &count, sizeof(std::int32_t)));
    if (count > kLongestList)
        return refuse(Result::kInvalidArgument, "a set has more than {} integers", kLongestList);
    return std::vector<std::int32_t>(values, values + count);
}

Answer<FourIntegers> four_integers(const Variant &content) {
    const auto values = integers(content);
    if (!values)
        return values.refusal();
    FourIntegers four{};
    if (values->size() != four.size())
        return refuse(Result::kInvalidArgument, "a set has four integers, and {} came",
                      values->size());
    std::ranges::copy(*values, four.begin());
    return four;
}

Answer<PttPeer> peer(const Variant &content) {
    PttPeer peer;
    auto read = read_record("a peer", content, peer,
                            {{"uri_type", &peer.uri_type},
                             {"uri", &peer.uri},
                             {"display_name", &peer.display_name},
                             {"is_group_uri", &peer.is_group}});
    if (read && (read->uri_type < 0 || read->uri_type > 1))
        return refuse(Result::kInvalidArgument, "a uri_type is 0 (tel) or 1 (sip), not {}",
                      read->uri_type);
    return read;
}

Answer<std::vector<PttPeer>> peers(const Variant &content) {
    return read_list<PttPeer>("a list of targets", content,
                              [](const Variant &entry) { return peer(entry); });
}

Answer<std::vector<PttPeer>> names(const Variant &content) {
    return read_list<PttPeer>("a list of parties", content, [](const Variant &entry) {
        PttPeer party;
        return read_record("a party", entry, party,
                           {{"uri", &party.uri}, {"display_name", &party.display_name}});
    });
}

Answer<std::vector<PttUser>> users(const Variant &content, std::int32_t count) {
    auto read = read_list<PttUser>("a user list", content, [](const Variant &entry) {
        PttUser user;
        std::int32_t without_effect = 0;
        const auto read_peer = [&](const Variant &value) -> Status {
            auto found = peer(value);
            if (!found)
                return found.refusal();
            user.peer = *found;
            return Done{};
        };
        return read_record("a user", entry, user,
                           {{"uri_gv", std::function<Status(Variant)>(read_peer)},
                            {"is_anonymous", &user.anonymous},
                            {"participant_state", &without_effect},
                            {"uri_usage_type", &without_effect}});
    });
    if (read && (count < 1 || static_cast<std::size_t>(count) != read->size()))
        return refuse(Result::kInvalidArgument, "the count says {}, and {} users came", count,
                      read->size());
    return read;
}

Answer<std::vector<PttContent>> contents(const Variant &content) {
    PttContent record;
    std::string without_effect;
    const auto read = read_dictionary("a content", content,
                                      {{"content_type", &record.type},
                                       {"content_disposition", &record.disposition},
                                       {"content_id", &without_effect},
                                       {"content_encoding_type", &without_effect},
                                       {"content_description", &without_effect},
                                       {"content", &record.bytes}});
    if (!read)
        return read.refusal();
    if (g_variant_n_children(wire::peeled(content).get()) == 0)
        return std::vector<PttContent>{};
    return std::vector<PttContent>{std::move(record)};
}

Answer<PttFileAttributes> attributes(const Variant &content) {
    PttFileAttributes file;
    return read_record("file attributes", content, file,
                       {{"file_name", &file.name},
                        {"file_description", &file.description},
                        {"file_size", &file.size},
                        {"push", &file.push},
                        {"start", &file.start},
                        {"end", &file.end},
                        {"transfer_id", &file.transfer_id},
                        {"content_type", &file.content_type},
                        {"file_type", &file.file_type}});
}

Variant peer(const PttPeer &peer) {
    return Dictionary()
        .add("uri_type", peer.uri_type)
        .add("uri", peer.uri)
        .add("display_name", peer.display_name)
        .add("is_group_uri", peer.is_group)
        .end();
}

Variant route(const std::vector<PttPeer> &parties) {
    return list_of(parties, [](const PttPeer &party) {
        return Dictionary().add("uri", party.uri).add("display_name", party.display_name).end();
    });
}

Variant attributes(const PttFileAttributes &file) {
    return Dictionary()
        .add("file_name", file.name)
        .add("file_description", file.description)
        .add("file_size", file.size)
        .add("push", file.push)
        .add("start", file.start)
        .add("end", file.end)
        .add("transfer_id", file.transfer_id)
        .add("content_type", file.content_type)
        .add("file_type", file.file_type)
        .end();
}

Variant recording(const PttRecordingInfo &info) {
    return Dictionary()
        .add("session_id", info.session)
        .add("record_state", static_cast<std::int32_t>(info.state))
        .add("record_error", info.error)
        .add("record_file_path", info.path)
        .end();
}

Variant floor_status(const std::vector<PttFloorStatus> &statuses) {
    return list_of(statuses, [](const PttFloorStatus &status) {
        return Dictionary()
            .add("session_id", status.session)
            .add("status", static_cast<std::int32_t>(status.state))
            .add("participant_count", status.participants)
            .add("floor_taken_uri", status.speaker_uri)
            .end();
    });
}

Variant advertisement(const PttGroupAdvertisement &advertisement) {
    const auto contents = list_of(advertisement.contents, [](const PttContent &content) {
        return Dictionary()
            .add("content_byte", wire::encode_base64(content.bytes))
            .add("content_type", content.type)
            .add("content_disposition", content.disposition)
            .end();
    });
    return Dictionary()
        .add("subject", advertisement.subject)
        .add("call_info", advertisement.call_info)
        .add("remote_uri", peer(advertisement.remote))
        .add("group_advertisement_content", contents)
        .end();
}

} // namespace sim::ptt_wire
