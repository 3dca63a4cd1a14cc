// SPDX-License-Identifier: Apache-2.0
#include "sim/group/profile.hpp"

#include <fmt/format.h>

namespace sim {

UserProfile profile_of_slot(int slot, const std::string &uri) {
    UserProfile profile;
    profile.user_uri = uri;
    profile.display_name = fmt::format("Example user {}", slot);
    profile.birth_day = "1990-01-01";
    profile.gender = "unspecified";
    profile.free_text = fmt::format("The user of slot {}", slot);
    profile.status = "available";
    profile.dispatcher_id = "dispatcher@ims.example.org";
    profile.client_type = "handset";
    profile.comm_info = {uri, fmt::format("mailto:user{}@ims.example.org", slot)};
    profile.name = {"Example", fmt::format("User {}", slot), "", "", ""};
    profile.address = {"Exampleland", "North", "Exampleton", "Centre", "Main Street", "1", "12345"};
    profile.company = {"field team", "technician", "3"};
    profile.hobbies = {"radio", "cycling"};
    profile.favourite_links = {"https://www.example.org/"};
    return profile;
}

} // namespace sim
