// SPDX-License-Identifier: Apache-2.0
// References to GLib's objects, and its errors as exceptions.
#pragma once

#include <gio/gio.h>

#include <memory>
#include <stdexcept>
#include <string>

namespace test {

struct ObjectUnref {
    void operator()(gpointer object) const { g_object_unref(object); }
};
template <typename Object>
using ObjectRef = std::unique_ptr<Object, ObjectUnref>;

// Takes the error over.
[[noreturn]] inline void throw_error(const std::string &what, GError *error) {
    const std::string why = error != nullptr ? error->message : "no reason given";
    g_clear_error(&error);
    throw std::runtime_error(what + ": " + why);
}

} // namespace test
