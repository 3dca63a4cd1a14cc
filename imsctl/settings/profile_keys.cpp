// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/keys.hpp"

#include <iterator>

namespace imsctl {
namespace {

// A name that cannot be another member's.
#define IMSCTL_KEY(member)                                                                         \
    { #member, &ProfileRecord::member, offsetof(ProfileRecord, member) }

constexpr Key<ProfileRecord> kProfileKeys[] = {
    // clang-format off
    IMSCTL_KEY(id), IMSCTL_KEY(enabled), IMSCTL_KEY(name), IMSCTL_KEY(mccmnc),
    IMSCTL_KEY(defaultMccMnc), IMSCTL_KEY(impi), IMSCTL_KEY(impu), IMSCTL_KEY(domain),
    IMSCTL_KEY(pdn), IMSCTL_KEY(network), IMSCTL_KEY(service), IMSCTL_KEY(networkEnabled),
    IMSCTL_KEY(priority), IMSCTL_KEY(authname), IMSCTL_KEY(password), IMSCTL_KEY(pcscf),
    IMSCTL_KEY(pcscfPref), IMSCTL_KEY(roaming), IMSCTL_KEY(port), IMSCTL_KEY(transport),
    IMSCTL_KEY(ipver), IMSCTL_KEY(regiAlgo), IMSCTL_KEY(ipsec), IMSCTL_KEY(saPortC),
    IMSCTL_KEY(saPortS), IMSCTL_KEY(encAlgo), IMSCTL_KEY(authAlgo), IMSCTL_KEY(isEmergencySupport),
    IMSCTL_KEY(rport), IMSCTL_KEY(isRegEnabled), IMSCTL_KEY(globalSettings), IMSCTL_KEY(opmode),
    IMSCTL_KEY(timer1), IMSCTL_KEY(timer2), IMSCTL_KEY(timer4), IMSCTL_KEY(timerA),
    IMSCTL_KEY(timerB), IMSCTL_KEY(timerC), IMSCTL_KEY(timerD), IMSCTL_KEY(timerE),
    IMSCTL_KEY(timerF), IMSCTL_KEY(timerG), IMSCTL_KEY(timerH), IMSCTL_KEY(timerI),
    IMSCTL_KEY(timerJ), IMSCTL_KEY(timerK), IMSCTL_KEY(mtuSize), IMSCTL_KEY(sipRegKeepAliveTimer),
    IMSCTL_KEY(vtSupported), IMSCTL_KEY(volteSupported), IMSCTL_KEY(network_environment_type),
    // clang-format on
};

#undef IMSCTL_KEY

static_assert(std::size(kProfileKeys) == 51);
static_assert(covers(kProfileKeys));

} // namespace

template <>
std::span<const Key<ProfileRecord>> keys_of() {
    return kProfileKeys;
}

} // namespace imsctl
