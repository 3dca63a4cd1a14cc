// SPDX-License-Identifier: Apache-2.0
#include "imsctl/group/schema.hpp"

#include "imsctl/group/records.hpp"

#include <limits>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

// What a record is called in the schema.
constexpr const char *kind(const ims_xdm_media_list_s *) {
    return "media";
}
constexpr const char *kind(const ims_xdm_member_status_s *) {
    return "member-status";
}
constexpr const char *kind(const ims_xdm_member_entry_s *) {
    return "member";
}
constexpr const char *kind(const ims_xdm_member_list_s *) {
    return "member-list";
}
constexpr const char *kind(const ims_xdm_schedule_s *) {
    return "schedule";
}
constexpr const char *kind(const ims_xdm_session_policy_s *) {
    return "session-policy";
}
constexpr const char *kind(const ims_xdm_supported_service_s *) {
    return "supported-service";
}
constexpr const char *kind(const ims_xdm_age_restriction_s *) {
    return "age-restriction";
}
constexpr const char *kind(const ims_xdm_group_properties_s *) {
    return "properties";
}
constexpr const char *kind(const ims_xdm_identity_entries_s *) {
    return "identity-entries";
}
constexpr const char *kind(const ims_xdm_identity_urls_s *) {
    return "identity-urls";
}
constexpr const char *kind(const ims_xdm_identity_domains_s *) {
    return "identity-domains";
}
constexpr const char *kind(const ims_xdm_domain_list_s *) {
    return "domains";
}
constexpr const char *kind(const ims_xdm_contact_list_s *) {
    return "contacts";
}
constexpr const char *kind(const ims_xdm_group_rule_s *) {
    return "rule";
}

Json or_null(const char *type) {
    return {{"type", Json::array({type, "null"})}};
}

class SchemaWriter {
  public:
    explicit SchemaWriter(Json &definitions) : definitions_(definitions) {}

    void operator()(const char *name, bool) { properties[name] = or_null("boolean"); }
    void operator()(const char *name, std::int32_t) {
        Json number = or_null("integer");
        number["minimum"] = std::numeric_limits<std::int32_t>::min();
        number["maximum"] = std::numeric_limits<std::int32_t>::max();
        properties[name] = number;
    }
    void operator()(const char *name, char *&) { properties[name] = or_null("string"); }
    template <std::size_t Size>
    void operator()(const char *name, char (&)[Size]) {
        properties[name] = or_null("string");
        properties[name]["maxLength"] = Size - 1;
    }
    template <std::size_t Size>
    void required(const char *name, char (&)[Size]) {
        properties[name] = {{"type", "string"}, {"maxLength", Size - 1}};
        required_names.push_back(name);
    }
    template <class Record>
    requires std::is_class_v<Record>
    void operator()(const char *name, Record &) { properties[name] = record_or_null<Record>(); }
    template <class Record>
    requires std::is_class_v<Record>
    void operator()(const char *name, Record *) {
        if constexpr (Linked<Record>)
            properties[name] = list_of(reference<Record>());
        else
            properties[name] = record_or_null<Record>();
    }
    template <class Element>
    void operator()(const char *name, Element *, std::int32_t) {
        if constexpr (std::is_same_v<Element, char *>)
            properties[name] = list_of(or_null("string"));
        else
            properties[name] = list_of(reference<Element>());
    }
    void identity(const char *name, void **, std::int32_t) {
        properties[name] = or_null("object");
        properties[name]["description"] = "what it holds is said by rule_identity_type";
        Json types = Json::array();
        for (const std::int32_t type :
             {IMS_XDM_IDENTITY_ENTRIES, IMS_XDM_IDENTITY_URLS, IMS_XDM_IDENTITY_DOMAINS})
            with_identity_type(type, [&]<class Record>(Record *) {
                types.push_back(type);
                conditions.push_back(
                    {{"if", identity_type_is({{"const", type}})},
                     {"then", {{"properties", {{name, record_or_null<Record>()}}}}}});
            });
        conditions.push_back({{"if", identity_type_is({{"enum", types}})},
                              {"else", {{"properties", {{name, {{"type", "null"}}}}}}}});
    }

    Json properties = Json::object();
    Json required_names = Json::array();
    // What ties properties to each other.
    Json conditions = Json::array();

  private:
    static Json identity_type_is(const Json &value) {
        return {{"properties", {{kIdentityType, value}}},
                {"required", Json::array({kIdentityType})}};
    }

    static Json list_of(const Json &items) {
        Json list = or_null("array");
        list["items"] = items;
        return list;
    }

    template <class Record>
    Json record_or_null() {
        return {{"anyOf", Json::array({{{"type", "null"}}, reference<Record>()})}};
    }

    // The record is defined once, when it is first met.
    template <class Record>
    Json reference();

    Json &definitions_;
};

Json object_schema(const SchemaWriter &writer) {
    Json schema = {{"type", "object"},
                   {"properties", writer.properties},
                   {"required", writer.required_names},
                   {"additionalProperties", false}};
    if (!writer.conditions.empty())
        schema["allOf"] = writer.conditions;
    return schema;
}

template <class Record>
Json SchemaWriter::reference() {
    const std::string name = kind(static_cast<const Record *>(nullptr));
    if (!definitions_.contains(name)) {
        SchemaWriter writer(definitions_);
        Record record{};
        visit_fields(writer, record);
        definitions_[name] = object_schema(writer);
    }
    return {{"$ref", "#/$defs/" + name}};
}

} // namespace

Json group_schema() {
    Json definitions = Json::object();
    SchemaWriter writer(definitions);
    ims_xdm_group_info_s group{};
    visit_fields(writer, group);
    writer.properties["verb"] = {{"description", "not read: stands in what imsctl shows"}};
    writer.properties["$schema"] = {{"type", "string"}};
    Json schema = {
        {"$schema", "https://json-schema.org/draft/2020-12/schema"},
        {"title", "A group document"},
        {"description",
         "What imsctl group create takes and imsctl --json group show prints. A key that is left "
         "out or null is empty. Lengths are in bytes of UTF-8, which a validator counts as "
         "characters."}};
    schema.update(object_schema(writer));
    schema["$defs"] = definitions;
    return schema;
}

} // namespace imsctl
