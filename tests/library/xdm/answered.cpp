// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/answered.hpp"

namespace test {
namespace {

// Where a key stands, as the end of the keys on the way to it, and what it becomes.
struct Renaming {
    std::string_view sent;
    const char *answered;
};

constexpr Renaming kRenamings[] = {
    {"/group_properties/group_active_policy", "group_session_active_policy"},
    {"/group_member_list/contact_lists", "contact_list"},
    {"/group_member_list/ext_ref_url", "ext_ref_ct_lists"},
    {"/group_member_list/entry_ref_url", "entry_ref_contacts"},
    {"/participants/contact_lists", "contact_list"},
    {"/participants/ext_ref_url", "ext_ref_ct_lists"},
    {"/participants/entry_ref_url", "entry_ref_contacts"},
    {"/ext_ref_url/contact_ref_ct_list", "contact_ref_ct_list_v"},
    {"/ext_ref_url/num_of_ct_lists_ref", "num_of_ct_lists"},
    {"/entry_ref_url/entry_ref_contacts_v", "contact_ref_contact_v"},
    {"/group_rule_set/rule_condition", "rule_condition_v"},
    {"/group_rule_set/rule_action", "rule_action_v"},
    {"/rule_condition/rule_identity_type", "rule_identity_type_v"},
    {"/rule_identity/contacts_v", "ref_ct_list_url"},
    {"/rule_identity/contacts_v/contacts", "ref_ct_list_url"},
    {"_domain_id/contacts_v", "domain_id_v"},
    {"_domain_id/contacts_v/contacts", "domain_id"},
    {"_contact_id/contacts", "contacts_v"},
};

std::string answered_key(const std::string &path, const char *key) {
    for (const Renaming &renaming : kRenamings) {
        if (path.ends_with(renaming.sent))
            return renaming.answered;
    }
    return key;
}

GVariant *answered_at(const std::string &path, GVariant *value);

GVariant *answered_list(const std::string &path, GVariant *list) {
    GVariantBuilder builder;
    g_variant_builder_init(&builder, G_VARIANT_TYPE("aa{sv}"));
    for (gsize at = 0; at < g_variant_n_children(list); ++at) {
        const Variant child{g_variant_get_child_value(list, at)};
        g_variant_builder_add_value(&builder, answered_at(path, child.get()));
    }
    return g_variant_builder_end(&builder);
}

GVariant *answered_dictionary(const std::string &path, GVariant *dictionary) {
    GVariantBuilder builder;
    g_variant_builder_init(&builder, G_VARIANT_TYPE_VARDICT);
    GVariantIter entries;
    g_variant_iter_init(&entries, dictionary);
    const char *key = nullptr;
    GVariant *content = nullptr;
    while (g_variant_iter_next(&entries, "{&sv}", &key, &content)) {
        const Variant owner{content};
        const std::string here = path + "/" + key;
        const bool is_member_type =
            here.ends_with("/type") && g_variant_is_of_type(content, G_VARIANT_TYPE_BOOLEAN);
        g_variant_builder_add(&builder, "{sv}", answered_key(here, key).c_str(),
                              is_member_type ? g_variant_new_int64(kAnsweredType)
                                             : answered_at(here, content));
    }
    return g_variant_builder_end(&builder);
}

GVariant *answered_at(const std::string &path, GVariant *value) {
    if (g_variant_is_of_type(value, G_VARIANT_TYPE_VARDICT))
        return answered_dictionary(path, value);
    if (g_variant_is_of_type(value, G_VARIANT_TYPE("aa{sv}")))
        return answered_list(path, value);
    return value; // the builder takes a reference of its own
}

} // namespace

Variant answered(GVariant *sent_document) {
    return share(answered_at("", sent_document));
}

} // namespace test
