// SPDX-License-Identifier: Apache-2.0
#include "imsctl/ptt/push_key.hpp"

#include "imsctl/output/failure.hpp"

#include <algorithm>
#include <array>
#include <glib-unix.h>
#include <unistd.h>

namespace imsctl {

PushKey::PushKey(Actions actions) : actions_(std::move(actions)) {
    if (tcgetattr(STDIN_FILENO, &before_) != 0)
        throw Failure(FailureKind::kInput, "standard input is no terminal: it has no key to hold",
                      "leave --key out: then the floor is taken until SIGINT, SIGTERM or --for");
    termios by_key = before_;
    by_key.c_lflag &= ~static_cast<tcflag_t>(ICANON | ECHO);
    tcsetattr(STDIN_FILENO, TCSADRAIN, &by_key);
    input_.reset(g_unix_fd_source_new(STDIN_FILENO, static_cast<GIOCondition>(G_IO_IN | G_IO_HUP)));
    g_source_set_callback(input_.get(), G_SOURCE_FUNC(on_readable), this, nullptr);
    g_source_attach(input_.get(), nullptr);
}

PushKey::~PushKey() {
    tcsetattr(STDIN_FILENO, TCSADRAIN, &before_);
}

gboolean PushKey::on_readable(gint, GIOCondition, gpointer self) {
    static_cast<PushKey *>(self)->read();
    return G_SOURCE_CONTINUE;
}

void PushKey::read() {
    std::array<char, 64> typed{};
    const ssize_t count = ::read(STDIN_FILENO, typed.data(), typed.size());
    const char *end = typed.data() + std::max<ssize_t>(count, 0);
    wants_end_ = count <= 0 || std::find<const char *>(typed.data(), end, 'q') != end;
    if (wants_end_)
        input_.reset();
    else
        press();
}

void PushKey::press() {
    const bool is_held = pause_ != nullptr;
    pause_.reset(g_timeout_source_new(static_cast<guint>(kKeyPause * 1000)));
    g_source_set_callback(pause_.get(), on_pause, this, nullptr);
    g_source_attach(pause_.get(), nullptr);
    if (!is_held)
        actions_.pressed();
}

gboolean PushKey::on_pause(gpointer self) {
    static_cast<PushKey *>(self)->release();
    return G_SOURCE_CONTINUE;
}

void PushKey::release() {
    pause_.reset();
    actions_.released();
}

} // namespace imsctl
