// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <gio/gio.h>
#include <memory>
#include <string>
#include <utility>

namespace sim {

struct GObjectUnref {
    void operator()(gpointer object) const { g_object_unref(object); }
};
template <typename T>
using GObjectPtr = std::unique_ptr<T, GObjectUnref>;

template <auto kFree>
struct FreeWith {
    template <typename T>
    void operator()(T *pointer) const {
        kFree(pointer);
    }
};
using GText = std::unique_ptr<char, FreeWith<g_free>>;
using GMainLoopPtr = std::unique_ptr<GMainLoop, FreeWith<g_main_loop_unref>>;

// A source that leaves its context with its owner.
class GSourceGuard {
  public:
    GSourceGuard() = default;
    explicit GSourceGuard(GSource *owned) : source_(owned) {}
    GSourceGuard(GSourceGuard &&other) noexcept : source_(std::exchange(other.source_, nullptr)) {}
    GSourceGuard &operator=(GSourceGuard &&other) noexcept {
        std::swap(source_, other.source_);
        return *this;
    }
    ~GSourceGuard() {
        if (source_) {
            g_source_destroy(source_);
            g_source_unref(source_);
        }
    }
    GSource *get() const { return source_; }

  private:
    GSource *source_ = nullptr;
};

// An owned reference to a value. A floating one is sunk.
class Variant {
  public:
    Variant() = default;
    explicit Variant(GVariant *value) : value_(value ? g_variant_ref_sink(value) : nullptr) {}
    static Variant adopt(GVariant *owned) {
        Variant variant;
        variant.value_ = owned;
        return variant;
    }
    Variant(const Variant &other) : value_(other.value_ ? g_variant_ref(other.value_) : nullptr) {}
    Variant(Variant &&other) noexcept : value_(std::exchange(other.value_, nullptr)) {}
    Variant &operator=(Variant other) noexcept {
        std::swap(value_, other.value_);
        return *this;
    }
    ~Variant() {
        if (value_)
            g_variant_unref(value_);
    }

    GVariant *get() const { return value_; }
    explicit operator bool() const { return value_ != nullptr; }
    std::string print() const {
        return value_ ? std::string(GText(g_variant_print(value_, FALSE)).get()) : "()";
    }

  private:
    GVariant *value_ = nullptr;
};

// A GError to hand to a function as `&error.raw`.
struct ErrorSlot {
    GError *raw = nullptr;
    ErrorSlot() = default;
    ErrorSlot(const ErrorSlot &) = delete;
    ErrorSlot &operator=(const ErrorSlot &) = delete;
    ~ErrorSlot() { g_clear_error(&raw); }
    const char *message() const { return raw ? raw->message : "unknown error"; }
};

} // namespace sim
