// SPDX-License-Identifier: Apache-2.0
// What the measurements and their peer say to each other beside the service's own interface.
#pragma once

namespace bench {

inline constexpr const char *kServiceName = "org.kelvo.ims";
inline constexpr const char *kObjectPath = "/org/kelvo/ims/sub0";
inline constexpr const char *kCallInterface = "org.kelvo.ims.Call";
inline constexpr const char *kCallEndedSignal = "CallEnded";

inline constexpr const char *kSettingsInterface = "org.kelvo.ims.Settings";
inline constexpr const char *kGetSettingsMethod = "GetGlobalSettings";
inline constexpr const char *kUpdateSettingsMethod = "UpdateGlobalSettings";
inline constexpr const char *kSettingsName = "default";

inline constexpr const char *kPeerInterface = "org.kelvo.ims.BenchPeer";
// "(ui)": send so many CallEnded signals whose sessions count from that number. No reply.
inline constexpr const char *kEmitMethod = "Emit";
// "(b)": with true, let every MakeCall wait; with false, answer those that wait. No reply.
inline constexpr const char *kHoldMethod = "Hold";
// "(a{sv})": answer GetGlobalSettings with this dictionary, and accept updates of as many entries.
// No reply.
inline constexpr const char *kServeMethod = "Serve";

} // namespace bench
