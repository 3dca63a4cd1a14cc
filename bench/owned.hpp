// SPDX-License-Identifier: Apache-2.0
// Owners for what GLib hands out.
#pragma once

#include "src/wire/glib.hpp"

namespace bench {

using ims::Connection;
using ims::Owned;
using ims::Variant;
using Bytes = ims::Bytes;
using Message = Owned<GDBusMessage, g_object_unref>;
using MainLoop = Owned<GMainLoop, g_main_loop_unref>;

} // namespace bench
