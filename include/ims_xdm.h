/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_XDM_H
#define KELVO_IMS_XDM_H

/**
 * @file
 * @brief Group documents of push-to-talk: to create, to edit and to read.
 */

/**
 * @defgroup ims_xdm Group documents
 * @brief The documents of push-to-talk groups: `org.kelvo.ims.Xdm`.
 *
 * @section ims_xdm_life The life of a group document
 *
 * A group is a document that the network keeps, known by the group's URI: what the group is
 * (#ims_xdm_group_properties_s), who is in it (#ims_xdm_member_list_s), and rules that say who may
 * do what (#ims_xdm_group_rule_s). ims_xdm_create_group() makes it whole, the functions that add,
 * remove and modify change a part, ims_xdm_delete_group() ends it. Others see a change when they
 * fetch the document again: there are no events here. Calls to the group are made with @ref
 * ims_poc.
 *
 * @code{.c}
 * #include <ims.h>
 * #include <stdio.h>
 *
 * void on_group(ims_h handle, int result, void *data, void *user_data) {
 *     const ims_xdm_group_info_s *group = data; // gone after this function
 *     if (group != NULL && group->group_properties != NULL)
 *         printf("%s: %s\n", group->group_uri, group->group_properties->display_name);
 * }
 *
 * int create(ims_h handle) {
 *     ims_xdm_group_properties_s properties = {.display_name = "Crew", .max_participants = 8};
 *     ims_xdm_member_entry_s members[] = {{.uri = "tel:+15550100"}, {.uri = "tel:+15550101"}};
 *     ims_xdm_member_list_s list = {.contacts = members, .num_of_contacts = 2};
 *     const ims_xdm_group_info_s group = {.group_uri = "sip:crew@groups.invalid",
 *                                         .group_properties = &properties,
 *                                         .group_member_list = &list};
 *     return ims_xdm_create_group(handle, &group, NULL, NULL);
 * }
 *
 * int look(ims_h handle) {
 *     const ims_xdm_group_info_s group = {.group_uri = "sip:crew@groups.invalid"};
 *     return ims_xdm_fetch_shared_group(handle, &group, on_group, NULL);
 * }
 * @endcode
 *
 * @section ims_xdm_records Records
 *
 * The same records go both ways. What an application hands over is read during the call only: it
 * stays the application's. What a callback receives is the library's and gone after the callback:
 * copy what is to be kept.
 *
 *  - A text that is NULL is left out when it is sent, and NULL where the service left it out.
 *  - A text in a buffer always ends with a zero byte when it is received, and is cut to what the
 *    buffer holds, never inside a UTF-8 character. A buffer without a zero byte is sent up to its
 *    last byte but one.
 *  - An array is a pointer and a count. The count is sent as it is, the elements only when the
 *    pointer is set and the count at least 1: the array must then have that many. Received, an
 * array is NULL when the service's count is not the number of elements that came; the count is the
 *    service's.
 *  - A chain is linked through the field `next` and ends with NULL.
 *  - A value that the service left out, or sent with another type, is 0, false or NULL. Unknown
 * keys are ignored.
 *  - Numbers travel as 64-bit integers and are cut to 32 bits when received.
 *
 * On the bus a record is a dictionary `a{sv}`, a chain or an array of records an `aa{sv}`; the keys
 * are in the introspection data, dbus/interfaces/org.kelvo.ims.Xdm.xml. The values are the
 * service's, see @ref ims_values.
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * @defgroup ims_xdm_document The document
 * @brief A group, its properties, members and rules.
 * @{
 */

/** The sizes of the texts that are held in records, with the zero byte. */
enum {
    IMS_XDM_GROUP_URI_SIZE = 129,    /**< a group's URI */
    IMS_XDM_DISPLAY_NAME_SIZE = 101, /**< a group's display name */
    IMS_XDM_SUBJECT_SIZE = 257,      /**< a group's subject */
    IMS_XDM_RULE_ID_SIZE = 101,      /**< a rule's name */
    IMS_XDM_URI_SIZE = 1537,         /**< a member's URI */
    IMS_XDM_LIST_NAME_SIZE = 129     /**< a group list's name */
};

/** Which identity record a rule has. With any other value it has none. */
enum {
    IMS_XDM_IDENTITY_ENTRIES = 1, /**< #ims_xdm_identity_entries_s */
    IMS_XDM_IDENTITY_URLS = 2,    /**< #ims_xdm_identity_urls_s */
    IMS_XDM_IDENTITY_DOMAINS = 4  /**< #ims_xdm_identity_domains_s */
};

/** Which media are there. */
typedef struct ims_xdm_media_list_s {
    bool audio;               /**< audio */
    bool video;               /**< video */
    bool message;             /**< messages */
    bool file_transfer;       /**< files */
    bool group_advertisement; /**< group advertisements */
    bool pager_mode;          /**< messages outside a session */
    bool poc_speech;          /**< push-to-talk speech */
} ims_xdm_media_list_s;

/** A member's place in an organisation. */
typedef struct ims_xdm_member_status_s {
    char *assign;   /**< the assignment, or NULL */
    char *position; /**< the position, or NULL */
    char *rank;     /**< the rank, or NULL */
} ims_xdm_member_status_s;

/** One member. */
typedef struct ims_xdm_member_entry_s {
    char uri[IMS_XDM_URI_SIZE];     /**< the member's URI */
    char *disp_name;                /**< the display name, or NULL */
    ims_xdm_member_status_s status; /**< the place in the organisation */
    bool auto_join;                 /**< defined by the service */
    bool stt;                       /**< defined by the service */
    bool active;                    /**< defined by the service */
    /**
     * Defined by the service. Within lists and documents it is received only: what is sent as
     * "type" there is the flag @ref active. ims_xdm_modify_group_attributes() sends it.
     */
    int32_t type;
} ims_xdm_member_entry_s;

/** Members, by themselves and by reference. */
typedef struct ims_xdm_member_list_s {
    char **contact_lists;             /**< names of contact lists */
    int32_t num_of_ct_lists;          /**< how many contact_lists */
    ims_xdm_member_entry_s *contacts; /**< members, one record after the other */
    int32_t num_of_contacts;          /**< how many contacts */
    char **ext_ref;                   /**< references to external contact lists */
    int32_t num_of_ct_lists_ref;      /**< how many ext_ref */
    char **entry_ref;                 /**< references to contact entries */
    int32_t num_of_ct_ref;            /**< how many entry_ref */
} ims_xdm_member_list_s;

/** One period of a session policy. */
typedef struct ims_xdm_schedule_s {
    char *start_time;                /**< the beginning, or NULL */
    char *end_time;                  /**< the end, or NULL */
    struct ims_xdm_schedule_s *next; /**< the next period, or NULL */
} ims_xdm_schedule_s;

/** When a session of the group is active, and with whom. */
typedef struct ims_xdm_session_policy_s {
    int32_t min_participants;            /**< the fewest participants */
    int32_t max_duration;                /**< the longest duration; the unit is the service's */
    ims_xdm_member_list_s *participants; /**< the participants, or NULL: sent as an empty list */
    ims_xdm_schedule_s *schedule;        /**< the first period, or NULL */
} ims_xdm_session_policy_s;

/** One service that a group supports. */
typedef struct ims_xdm_supported_service_s {
    int32_t service_enabler;                  /**< which service */
    ims_xdm_media_list_s *media_list;         /**< its media, or NULL */
    struct ims_xdm_supported_service_s *next; /**< the next service, or NULL */
} ims_xdm_supported_service_s;

/** One restriction of age. Ages are texts, not numbers. */
typedef struct ims_xdm_age_restriction_s {
    char *from_age;                         /**< from this age, or NULL */
    char *to_age;                           /**< to this age, or NULL */
    struct ims_xdm_age_restriction_s *next; /**< the next restriction, or NULL */
} ims_xdm_age_restriction_s;

/** What a group is. */
typedef struct ims_xdm_group_properties_s {
    char display_name[IMS_XDM_DISPLAY_NAME_SIZE];    /**< the display name */
    char subject[IMS_XDM_SUBJECT_SIZE];              /**< the subject */
    bool is_searchable;                              /**< whether a search finds the group */
    bool inv_members;                                /**< whether members are invited */
    int32_t max_participants;                        /**< the most participants of a session */
    char *as_id;                                     /**< defined by the service, or NULL */
    char *area_id;                                   /**< the area, or NULL */
    bool auto_grp_advertisements;                    /**< whether the group advertises itself */
    int32_t group_qoe;                               /**< the quality of experience */
    ims_xdm_session_policy_s *group_active_policy;   /**< the session policy, or NULL */
    ims_xdm_supported_service_s *supported_services; /**< the first service, or NULL */
    ims_xdm_age_restriction_s *age_restrictions;     /**< the first restriction, or NULL */
} ims_xdm_group_properties_s;

/** #IMS_XDM_IDENTITY_ENTRIES: a rule for these members. */
typedef struct ims_xdm_identity_entries_s {
    ims_xdm_member_entry_s *contacts; /**< members, one record after the other */
    int32_t num_of_contacts;          /**< how many contacts */
} ims_xdm_identity_entries_s;

/** #IMS_XDM_IDENTITY_URLS: a rule for the members of these contact lists. */
typedef struct ims_xdm_identity_urls_s {
    char **urls;                     /**< URLs of contact lists */
    int32_t num_of_contact_list_url; /**< how many urls */
} ims_xdm_identity_urls_s;

/** Domains of a rule. */
typedef struct ims_xdm_domain_list_s {
    char **domains;           /**< domains */
    int32_t num_of_domain_id; /**< how many domains */
} ims_xdm_domain_list_s;

/** Members of a rule. */
typedef struct ims_xdm_contact_list_s {
    ims_xdm_member_entry_s *contacts; /**< members, one record after the other */
    int32_t num_of_contact_id;        /**< how many contacts */
} ims_xdm_contact_list_s;

/** #IMS_XDM_IDENTITY_DOMAINS: a rule for everybody there, but for some. */
typedef struct ims_xdm_identity_domains_s {
    ims_xdm_domain_list_s *allow_domain_id;    /**< domains it is for, or NULL */
    ims_xdm_contact_list_s *allow_contact_id;  /**< members it is for, or NULL */
    ims_xdm_domain_list_s *except_domain_id;   /**< domains it is not for, or NULL */
    ims_xdm_contact_list_s *except_contact_id; /**< members it is not for, or NULL */
} ims_xdm_identity_domains_s;

/** One rule: whom it is for, and what they may do. */
typedef struct ims_xdm_group_rule_s {
    char rule_id[IMS_XDM_RULE_ID_SIZE]; /**< the rule's name */
    /**
     * A cell that holds the pointer to the identity record that @ref rule_identity_type says, or
     * NULL.
     */
    void **identity;
    int32_t rule_identity_type; /**< which identity record, or any other value for none */
    /**
     * The media, or NULL. The first four are sent, on purpose: the service takes no others in a
     * rule. All seven are received.
     */
    ims_xdm_media_list_s *media_list;
    bool is_list_member;                 /**< whether the rule is for members of the list */
    bool allow_conf_state;               /**< may watch the conference's state */
    bool allow_invite_users_dynamically; /**< may invite others */
    bool join_handling;                  /**< may join */
    bool allow_init_conf;                /**< may begin a conference */
    bool allow_sub_conf;                 /**< may begin a conference within one */
    bool allow_private_message;          /**< may send private messages */
    bool allow_media_handling;           /**< may add media */
    bool allow_anonymity;                /**< may stay anonymous */
    bool block_group_adver_send;         /**< must not send group advertisements */
    bool is_key_participant;             /**< is a key participant */
    bool remove_media_handling;          /**< may remove media */
    bool allow_expelling;                /**< may expel others */
    bool allow_hndl_multiple_streams;    /**< may use several streams */
    bool allow_ltd_participating_info;   /**< gets limited information on participants */
    struct ims_xdm_group_rule_s *next;   /**< the next rule, or NULL */
} ims_xdm_group_rule_s;

/** A group document. */
typedef struct ims_xdm_group_info_s {
    char group_uri[IMS_XDM_GROUP_URI_SIZE];       /**< the group's URI */
    char *channel_id;                             /**< the channel, or NULL */
    char *version;                                /**< the document's version, or NULL */
    ims_xdm_group_properties_s *group_properties; /**< NULL: sent as none, with a log line */
    ims_xdm_member_list_s *group_member_list;     /**< NULL: sent as none, with a log line */
    ims_xdm_group_rule_s *group_rule_set;         /**< the first rule, or NULL */
} ims_xdm_group_info_s;

/** @} */

/**
 * @defgroup ims_xdm_changes Changes
 * @brief What some requests take that is no part of a document.
 * @{
 */

/** A service of a group's sessions, for ims_xdm_modify_group_session_service_list(). */
typedef struct ims_xdm_session_service_s {
    int32_t group_app;        /**< which service */
    bool audio;               /**< audio */
    bool video;               /**< video */
    bool message;             /**< messages */
    bool file_transfer;       /**< files */
    bool group_advertisement; /**< group advertisements */
    bool pager_mode;          /**< messages outside a session */
    bool poc_speech;          /**< push-to-talk speech */
} ims_xdm_session_service_s;

/** A member of a group, for ims_xdm_modify_group_attributes(). */
typedef struct ims_xdm_group_attributes_s {
    const char *group_uri;                /**< the group's URI; NULL is sent as an empty text */
    const ims_xdm_member_entry_s *member; /**< the member */
} ims_xdm_group_attributes_s;

/** A group's place in a list, for ims_xdm_modify_default_group(). */
typedef struct ims_xdm_default_group_s {
    const char *group_list_name; /**< the group list; NULL is sent as an empty text */
    const char *group_uri;       /**< the group's URI; NULL is sent as an empty text */
    bool is_default_group;       /**< whether the group is the list's default */
} ims_xdm_default_group_s;

/** @} */

/**
 * @defgroup ims_xdm_answers Answers
 * @brief What the callbacks of the reading requests receive, valid while the callback runs.
 * @{
 */

/** All shared groups, as the callback of ims_xdm_fetch_all_shared_groups() receives them. */
typedef struct ims_xdm_shared_group_list_s {
    char *version; /**< the list's version, or NULL */
    /** As many documents as count says, each of which may be NULL; or NULL. */
    ims_xdm_group_info_s **groups;
    int32_t count; /**< as the service sent it, also when groups is NULL */
} ims_xdm_shared_group_list_s;

/** A group of an advertisement. */
typedef struct ims_xdm_adv_group_s {
    int32_t type;                                    /**< defined by the service */
    char *display_name;                              /**< the display name, or NULL */
    ims_xdm_supported_service_s *supported_services; /**< the first service, or NULL */
    char *group_uri;                                 /**< the group's URI, or NULL */
} ims_xdm_adv_group_s;

/** A group advertisement. */
typedef struct ims_xdm_grp_adv_s {
    char *note;              /**< a note, or NULL */
    ims_xdm_adv_group_s grp; /**< the group */
} ims_xdm_grp_adv_s;

/** What an entry's URI is used for by several services. */
typedef struct ims_xdm_common_uri_usage_s {
    char *pc_id;               /**< defined by the service, or NULL */
    ims_xdm_grp_adv_s grp_adv; /**< the group's advertisement */
} ims_xdm_common_uri_usage_s;

/** What an entry's URI is used for. */
typedef struct ims_xdm_uri_usages_s {
    int32_t num_of_common_uri_usages;             /**< how many common_uri_usage */
    char *poc_usage;                              /**< for push-to-talk, or NULL */
    char *im_usage;                               /**< for messages, or NULL */
    ims_xdm_common_uri_usage_s *common_uri_usage; /**< an array, or NULL */
} ims_xdm_uri_usages_s;

/** The URI of an entry. */
typedef struct ims_xdm_entry_uri_s {
    int32_t uri_type;           /**< the URI's kind */
    char uri[IMS_XDM_URI_SIZE]; /**< the URI */
    char *disp_name;            /**< the display name, or NULL */
    bool is_group_uri;          /**< whether it is a group's */
} ims_xdm_entry_uri_s;

/** One group in a group list. */
typedef struct ims_xdm_group_entry_s {
    ims_xdm_entry_uri_s group_list_entry_uri; /**< the group */
    ims_xdm_uri_usages_s entry_uri_usages;    /**< what its URI is used for */
    bool is_default_group;                    /**< whether it is the list's default */
    bool is_start_up;                         /**< whether its session begins at start-up */
} ims_xdm_group_entry_s;

/** One list of groups that somebody takes part in. */
typedef struct ims_xdm_group_list_s {
    char group_list_name[IMS_XDM_LIST_NAME_SIZE]; /**< the list's name */
    int32_t num_of_groups;                        /**< how many group_entries */
    char *display_name;                           /**< the display name, or NULL */
    ims_xdm_group_entry_s *group_entries;         /**< an array, or NULL */
} ims_xdm_group_list_s;

/** As the callback of ims_xdm_fetch_all_participant_groups() receives it. */
typedef struct ims_xdm_participant_groups_s {
    char *version;                         /**< the version, or NULL */
    int32_t num_of_group_lists;            /**< how many group_list_info */
    ims_xdm_group_list_s *group_list_info; /**< an array, or NULL */
} ims_xdm_participant_groups_s;

/** The name of a person. */
typedef struct ims_xdm_person_name_s {
    char *given_name;  /**< the given name, or NULL */
    char *family_name; /**< the family name, or NULL */
    char *middle_name; /**< the middle name, or NULL */
    char *name_suffix; /**< what follows the name, or NULL */
    char *name_prefix; /**< what precedes the name, or NULL */
} ims_xdm_person_name_s;

/** A postal address. */
typedef struct ims_xdm_address_s {
    char *country;       /**< the country, or NULL */
    char *region;        /**< the region, or NULL */
    char *locality;      /**< the town, or NULL */
    char *area;          /**< the part of the town, or NULL */
    char *street_name;   /**< the street, or NULL */
    char *street_number; /**< the house, or NULL */
    char *postal_code;   /**< the postal code, or NULL */
} ims_xdm_address_s;

/**
 * As the callback of ims_xdm_fetch_shared_user_profile() receives it. The counts of its arrays are
 * what came: the service sends none.
 */
typedef struct ims_xdm_user_profile_s {
    char *user_uri;                       /**< the user's URI, or NULL */
    char *display_name;                   /**< the display name, or NULL */
    char *birth_day;                      /**< the day of birth, or NULL */
    char *gender;                         /**< the gender, or NULL */
    char *free_text;                      /**< a text of the user's own, or NULL */
    int32_t qoe;                          /**< the quality of experience */
    char *status;                         /**< the status, or NULL */
    char *dispatcher_id;                  /**< the dispatcher, or NULL */
    char *client_type;                    /**< the client's kind, or NULL */
    char **comm_info;                     /**< addresses to reach the user at, or NULL */
    int32_t num_of_comm_info;             /**< how many comm_info */
    ims_xdm_person_name_s name;           /**< the name */
    ims_xdm_address_s address;            /**< the address */
    ims_xdm_member_status_s company_info; /**< the place in the organisation */
    char **hobbies;                       /**< hobbies, or NULL */
    int32_t num_of_hobbies;               /**< how many hobbies */
    char **favourite_link;                /**< links, or NULL */
    int32_t num_of_favourite_links;       /**< how many favourite_link */
} ims_xdm_user_profile_s;

/** One participant of a session. */
typedef struct ims_xdm_conf_participant_s {
    ims_xdm_member_entry_s contact_list_entry; /**< who it is */
    int32_t user_state;                        /**< the state in the session */
    ims_xdm_media_list_s *media_info;          /**< the media in use, or NULL */
    int32_t user_qoe;                          /**< the quality of experience */
} ims_xdm_conf_participant_s;

/**
 * As the callback of ims_xdm_get_participant_info() receives it. The count of its array is what
 * came: the service sends none.
 */
typedef struct ims_xdm_participant_info_s {
    char *list_service_uri;           /**< the list service's URI, or NULL */
    char *session_uri;                /**< the session's URI, or NULL */
    char *disp_name;                  /**< the display name, or NULL */
    int32_t session_type;             /**< the session's kind */
    ims_xdm_media_list_s *media_list; /**< the session's media, or NULL */
    int32_t qoe;                      /**< the quality of experience */
    char *area_id;                    /**< the area, or NULL */
    char *seu_id;                     /**< defined by the service, or NULL */
    char *flow_id;                    /**< defined by the service, or NULL */
    char *inviting_user;              /**< who invited, or NULL */
    bool is_emergency_flag;           /**< whether it is an emergency */
    bool is_one_many_one_flag;        /**< whether all talk to one */
    char *expiry_time;                /**< when the session expires: a text; or NULL */
    bool is_full_duplex;              /**< whether all may talk at once */
    ims_xdm_conf_participant_s *conf_participant_entry; /**< an array, or NULL */
    int32_t num_of_conf_participants;                   /**< how many conf_participant_entry */
} ims_xdm_participant_info_s;

/** @} */

/**
 * @defgroup ims_xdm_requests Requests
 * @brief To create, change, read and delete group documents.
 *
 * What all requests share is said in @ref ims_requests and @ref ims_errors. Where nothing else is
 * said, sent are the arguments in their order, or a record's fields in theirs: no method carries
 * the application id. The reply is `(i)`, the result, and the callback's data is NULL. A reading
 * request expects `(ia{sv})`: the result, and the record that is named with it, which its
 * callback's data points to; NULL when the result is not 0.
 * @{
 */

/**
 * Creates a group document.
 *
 * Properties, supported services or a member list that are NULL are each logged, and do not stop
 * the request.
 *
 * D-Bus: `XdmCreateGroup`, sends `(a{sv})`.
 *
 * @param group  the document
 */
IMS_API int ims_xdm_create_group(ims_h handle, const ims_xdm_group_info_s *group,
                                 ims_response_cb callback, void *user_data);

/**
 * Deletes a group document.
 *
 * D-Bus: `XdmDeleteGroup`, sends `(s)`.
 *
 * @param group_uri  the group's URI
 */
IMS_API int ims_xdm_delete_group(ims_h handle, const char *group_uri, ims_response_cb callback,
                                 void *user_data);

/**
 * Asks for one group document.
 *
 * D-Bus: `XdmFetchSharedGroup`, sends `(ss)`: the URI and the channel of the record; expects
 * `(ia{sv})`: #ims_xdm_group_info_s.
 *
 * @param group  the group: its group_uri and channel_id are read, a NULL channel_id as an empty
 *               text
 */
IMS_API int ims_xdm_fetch_shared_group(ims_h handle, const ims_xdm_group_info_s *group,
                                       ims_response_cb callback, void *user_data);

/**
 * Asks for all group documents.
 *
 * D-Bus: `XdmFetchAllSharedGroups`, sends `(s)`; expects `(ia{sv})`: #ims_xdm_shared_group_list_s.
 *
 * @param text  defined by the service; NULL is sent as an empty text
 */
IMS_API int ims_xdm_fetch_all_shared_groups(ims_h handle, const char *text,
                                            ims_response_cb callback, void *user_data);

/**
 * Asks for the lists of groups that the user takes part in.
 *
 * D-Bus: `XdmFetchAllParticipantGroups`, sends `(s)`; expects `(ia{sv})`:
 * #ims_xdm_participant_groups_s.
 *
 * @param text  defined by the service; NULL is sent as an empty text
 */
IMS_API int ims_xdm_fetch_all_participant_groups(ims_h handle, const char *text,
                                                 ims_response_cb callback, void *user_data);

/**
 * Asks for a shared user profile.
 *
 * D-Bus: `XdmFetchSharedUserProfile`, sends `(s)`; expects `(ia{sv})`: #ims_xdm_user_profile_s.
 *
 * @param text  defined by the service; NULL is sent as an empty text
 */
IMS_API int ims_xdm_fetch_shared_user_profile(ims_h handle, const char *text,
                                              ims_response_cb callback, void *user_data);

/**
 * Adds members to a group.
 *
 * D-Bus: `XdmAddUserToSharedGroup`, sends `(sa{sv})`.
 *
 * @param group_uri  the group's URI
 * @param members    the members
 */
IMS_API int ims_xdm_add_user_to_shared_group(ims_h handle, const char *group_uri,
                                             const ims_xdm_member_list_s *members,
                                             ims_response_cb callback, void *user_data);

/**
 * Removes members from a group.
 *
 * D-Bus: `XdmRemoveUserFromSharedGroup`, sends `(sa{sv})`.
 *
 * @param group_uri  the group's URI
 * @param members    the members
 */
IMS_API int ims_xdm_remove_user_from_shared_group(ims_h handle, const char *group_uri,
                                                  const ims_xdm_member_list_s *members,
                                                  ims_response_cb callback, void *user_data);

/**
 * Adds rules to a group.
 *
 * D-Bus: `XdmAddGroupRule`, sends `(saa{sv})`.
 *
 * @param group_uri  the group's URI
 * @param rules      the first of the rules
 */
IMS_API int ims_xdm_add_group_rule(ims_h handle, const char *group_uri,
                                   const ims_xdm_group_rule_s *rules, ims_response_cb callback,
                                   void *user_data);

/**
 * Replaces rules of a group.
 *
 * D-Bus: `XdmModifyGroupRule`, sends `(saa{sv})`.
 *
 * @param group_uri  the group's URI
 * @param rules      the first of the rules
 */
IMS_API int ims_xdm_modify_group_rule(ims_h handle, const char *group_uri,
                                      const ims_xdm_group_rule_s *rules, ims_response_cb callback,
                                      void *user_data);

/**
 * Deletes a rule of a group.
 *
 * D-Bus: `XdmDeleteGroupRule`, sends `(ss)`.
 *
 * @param group_uri  the group's URI
 * @param rule_id    the rule's name
 */
IMS_API int ims_xdm_delete_group_rule(ims_h handle, const char *group_uri, const char *rule_id,
                                      ims_response_cb callback, void *user_data);

/**
 * Sets a group's display name.
 *
 * D-Bus: `XdmModifyGroupDisplayName`, sends `(ss)`.
 *
 * @param group_uri     the group's URI
 * @param display_name  the display name
 */
IMS_API int ims_xdm_modify_group_display_name(ims_h handle, const char *group_uri,
                                              const char *display_name, ims_response_cb callback,
                                              void *user_data);

/**
 * Sets a group's subject.
 *
 * D-Bus: `XdmModifyGroupSubject`, sends `(ss)`.
 *
 * @param group_uri  the group's URI
 * @param subject    the subject
 */
IMS_API int ims_xdm_modify_group_subject(ims_h handle, const char *group_uri, const char *subject,
                                         ims_response_cb callback, void *user_data);

/**
 * Says whether a search finds a group.
 *
 * D-Bus: `XdmModifyGroupSearchable`, sends `(sb)`.
 *
 * @param group_uri   the group's URI
 * @param searchable  whether it is found
 */
IMS_API int ims_xdm_modify_group_searchable(ims_h handle, const char *group_uri, bool searchable,
                                            ims_response_cb callback, void *user_data);

/**
 * Says whether the members of a group are invited.
 *
 * D-Bus: `XdmModifyGroupInviteMembers`, sends `(sb)`.
 *
 * @param group_uri       the group's URI
 * @param invite_members  whether they are invited
 */
IMS_API int ims_xdm_modify_group_invite_members(ims_h handle, const char *group_uri,
                                                bool invite_members, ims_response_cb callback,
                                                void *user_data);

/**
 * Limits the participants of a group's sessions.
 *
 * D-Bus: `XdmModifyGroupMaxParticipants`, sends `(si)`.
 *
 * @param group_uri         the group's URI
 * @param max_participants  the most participants
 */
IMS_API int ims_xdm_modify_group_max_participants(ims_h handle, const char *group_uri,
                                                  int32_t max_participants,
                                                  ims_response_cb callback, void *user_data);

/**
 * Says whether a group advertises itself.
 *
 * D-Bus: `XdmModifyGroupAutoAdvertisements`, sends `(sb)`.
 *
 * @param group_uri            the group's URI
 * @param auto_advertisements  whether it does
 */
IMS_API int ims_xdm_modify_group_auto_advertisements(ims_h handle, const char *group_uri,
                                                     bool auto_advertisements,
                                                     ims_response_cb callback, void *user_data);

/**
 * Sets a group's quality of experience.
 *
 * D-Bus: `XdmModifyGroupQoe`, sends `(si)`.
 *
 * @param group_uri  the group's URI
 * @param qoe        the quality, defined by the service
 */
IMS_API int ims_xdm_modify_group_qoe(ims_h handle, const char *group_uri, int32_t qoe,
                                     ims_response_cb callback, void *user_data);

/**
 * Sets a group's session policy.
 *
 * D-Bus: `XdmModifyGroupSessionActivePolicy`, sends `(sa{sv})`.
 *
 * @param group_uri  the group's URI
 * @param policy     the policy
 */
IMS_API int ims_xdm_modify_group_session_active_policy(ims_h handle, const char *group_uri,
                                                       const ims_xdm_session_policy_s *policy,
                                                       ims_response_cb callback, void *user_data);

/**
 * Sets a service of a group's sessions.
 *
 * D-Bus: `XdmModifyGroupSessionServiceList`, sends `(sa{sv})`.
 *
 * @param group_uri  the group's URI
 * @param service    the service
 */
IMS_API int ims_xdm_modify_group_session_service_list(ims_h handle, const char *group_uri,
                                                      const ims_xdm_session_service_s *service,
                                                      ims_response_cb callback, void *user_data);

/**
 * Sets a group's restrictions of age.
 *
 * D-Bus: `XdmModifyGroupAgeRestriction`, sends `(saa{sv})`.
 *
 * @param group_uri     the group's URI
 * @param restrictions  the first of the restrictions
 */
IMS_API int ims_xdm_modify_group_age_restriction(ims_h handle, const char *group_uri,
                                                 const ims_xdm_age_restriction_s *restrictions,
                                                 ims_response_cb callback, void *user_data);

/**
 * Sets what one member of a group is.
 *
 * D-Bus: `XdmModifyGroupAttributes`, sends `(sssbbiba{sv})`: the group, then the member's uri,
 * disp_name, stt, active, type, auto_join and status.
 *
 * @param attributes  the group and the member. A NULL disp_name is sent as an empty text; a NULL
 *                    member is refused without a log line
 */
IMS_API int ims_xdm_modify_group_attributes(ims_h handle,
                                            const ims_xdm_group_attributes_s *attributes,
                                            ims_response_cb callback, void *user_data);

/**
 * Sets or clears the default group of a list.
 *
 * D-Bus: `XdmModifyDefaultGroup`, sends `(ssb)`.
 *
 * @param default_group  the list, the group and the flag
 */
IMS_API int ims_xdm_modify_default_group(ims_h handle, const ims_xdm_default_group_s *default_group,
                                         ims_response_cb callback, void *user_data);

/**
 * Asks who takes part in a session.
 *
 * D-Bus: `XdmGetParticipantInfo`, sends `(s)`; expects `(ia{sv})`: #ims_xdm_participant_info_s.
 *
 * @param text  the session or group to ask about
 */
IMS_API int ims_xdm_get_participant_info(ims_h handle, const char *text, ims_response_cb callback,
                                         void *user_data);

/** @} */

/** @} */

#ifdef __cplusplus
}
#endif

#endif
