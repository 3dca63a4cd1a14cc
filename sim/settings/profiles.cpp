// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/rows.hpp"

namespace sim {

namespace {

constexpr SettingsRow kFirst[] = {
    number("id", 1),
    number("enabled", 1),
    text("name", "Example mobile"),
    text("mccmnc", "00101"),
    text("defaultMccMnc", "00101"),
    text("impi", "001010123456789@ims.mnc001.mcc001.3gppnetwork.org"),
    text("impu", "sip:001010123456789@ims.mnc001.mcc001.3gppnetwork.org"),
    text("domain", "ims.mnc001.mcc001.3gppnetwork.org"),
    text("pdn", "ims"),
    text("network", "lte"),
    text("service", "mmtel,smsip"),
    text("networkEnabled", "lte,wifi"),
    number("priority", 1),
    text("authname", "001010123456789@ims.mnc001.mcc001.3gppnetwork.org"),
    text("password", ""),
    text("pcscf", "pcscf.ims.example.org"),
    number("pcscfPref", 0),
    flag("roaming", true),
    number("port", 5060),
    text("transport", "udp"),
    text("ipver", "ipv4v6"),
    text("regiAlgo", "aka-md5"),
    flag("ipsec", true),
    number("saPortC", 6000),
    number("saPortS", 6001),
    text("encAlgo", "aes-cbc"),
    text("authAlgo", "hmac-sha-1-96"),
    flag("isEmergencySupport", true),
    number("rport", 0),
    flag("isRegEnabled", true),
    text("globalSettings", "default"),
    text("opmode", "ps-voice"),
    // Milliseconds, for a path with wireless links.
    number("timer1", 2000),
    number("timer2", 16000),
    number("timer4", 17000),
    number("timerA", 2000),
    number("timerB", 128000),
    number("timerC", 180000),
    number("timerD", 130000),
    number("timerE", 2000),
    number("timerF", 128000),
    number("timerG", 2000),
    number("timerH", 128000),
    number("timerI", 17000),
    number("timerJ", 128000),
    number("timerK", 17000),
    number("mtuSize", 1300),
    number("sipRegKeepAliveTimer", 120),
    number("vtSupported", 1),
    number("volteSupported", 1),
    number("network_environment_type", 0),
};

// The second profile where it differs from the first: a laboratory.
constexpr SettingsRow kSecond[] = {
    number("id", 2),
    text("name", "Example laboratory"),
    text("mccmnc", "99970"),
    text("defaultMccMnc", "99970"),
    text("impi", "+15550101@ims.example.org"),
    text("impu", "sip:+15550101@ims.example.org"),
    text("domain", "ims.example.org"),
    text("networkEnabled", "lte"),
    number("priority", 2),
    text("authname", "+15550101@ims.example.org"),
    text("pcscf", "192.0.2.20"),
    flag("roaming", false),
    text("transport", "tcp"),
    text("ipver", "ipv4"),
    text("regiAlgo", "md5"),
    flag("ipsec", false),
    number("vtSupported", 0),
    number("network_environment_type", 1),
};

} // namespace

const SettingsFields &profile_fields() {
    static const SettingsFields fields = [] {
        std::vector<SettingsField> made;
        for (const auto &row : kFirst)
            made.push_back(plain_field(row));
        return SettingsFields(std::move(made));
    }();
    return fields;
}

std::vector<SettingsRecord> shipped_profiles() {
    const auto first = profile_fields().shipped();
    auto second = first;
    for (const auto &row : kSecond)
        second[profile_fields().place_of(row.key)] = value_of(row);
    return {first, second};
}

} // namespace sim
