// SPDX-License-Identifier: Apache-2.0
#include "sim/bus/service.hpp"

#include "sim/bus/form.hpp"
#include "sim/bus/introspection.hpp"
#include "sim/bus/wire.hpp"

#include <algorithm>
#include <fstream>
#include <utility>

namespace sim {

namespace {

constexpr std::string_view kIntrospectable = "org.freedesktop.DBus.Introspectable";
constexpr std::string_view kPeer = "org.freedesktop.DBus.Peer";
constexpr std::string_view kProperties = "org.freedesktop.DBus.Properties";

constexpr std::string_view kUnknownObject = "org.freedesktop.DBus.Error.UnknownObject";
constexpr std::string_view kUnknownInterface = "org.freedesktop.DBus.Error.UnknownInterface";
constexpr std::string_view kUnknownMethod = "org.freedesktop.DBus.Error.UnknownMethod";
constexpr std::string_view kUnknownProperty = "org.freedesktop.DBus.Error.UnknownProperty";
constexpr std::string_view kInvalidArgs = "org.freedesktop.DBus.Error.InvalidArgs";
constexpr std::string_view kFileNotFound = "org.freedesktop.DBus.Error.FileNotFound";

constexpr std::size_t kLongestPrint = 600;

std::string_view text_or_empty(const char *text) {
    return text ? text : "";
}

std::string printed(const Variant &value) {
    std::string text = value.print();
    if (text.size() > kLongestPrint)
        text = fmt::format("{}... ({} characters)", text.substr(0, kLongestPrint), text.size());
    return text;
}

std::string machine_id() {
    for (const char *path : {"/etc/machine-id", "/var/lib/dbus/machine-id"}) {
        std::string id;
        if (std::ifstream(path) >> id)
            return id;
    }
    return {};
}

} // namespace

// What a message says, before anything is believed.
struct Service::Call {
    explicit Call(GDBusMessage *raw)
        : message(raw), path(text_or_empty(g_dbus_message_get_path(raw))),
          interface(text_or_empty(g_dbus_message_get_interface(raw))),
          member(text_or_empty(g_dbus_message_get_member(raw))),
          connection(text_or_empty(g_dbus_message_get_sender(raw))),
          signature(fmt::format("({})", text_or_empty(g_dbus_message_get_signature(raw)))) {
        GVariant *raw_body = g_dbus_message_get_body(raw);
        body = Variant(raw_body ? raw_body : g_variant_new_tuple(nullptr, 0));
    }

    GDBusMessage *message;
    std::string_view path;
    std::string_view interface;
    std::string_view member;
    std::string connection;
    std::string signature;
    Variant body;
    int slot = -1;
};

Service::Service(Bus &bus, const Log &log, Applications &applications, int slots)
    : bus_(bus), log_(log), applications_(applications), slots_(slots) {}

std::string Service::slot_path(int slot) {
    return fmt::format("{}/sub{}", kPath, slot);
}

namespace {

std::optional<int> slot_of(std::string_view path, int slots) {
    for (int slot = 0; slot < slots; ++slot)
        if (path == Service::slot_path(slot))
            return slot;
    return std::nullopt;
}

} // namespace

bool Service::is_node(std::string_view path) const {
    return path == "/" || kPath == path || kPath.starts_with(fmt::format("{}/", path));
}

const Interface *Service::find_interface(std::string_view name) const {
    const auto found = std::ranges::find(interfaces_, name, &Interface::name);
    return found == interfaces_.end() ? nullptr : &*found;
}

const Interface *Service::find_owner(std::string_view member) const {
    const auto found = std::ranges::find_if(interfaces_, [&](const Interface &interface) {
        return std::ranges::find(interface.methods, member, &Method::member) !=
               interface.methods.end();
    });
    return found == interfaces_.end() ? nullptr : &*found;
}

void Service::handle(GDBusMessage *message) {
    Call call(message);
    if (const auto slot = slot_of(call.path, slots_))
        call.slot = *slot;
    handling_ = true;
    const Outcome outcome = dispatch(call);
    handling_ = false;
    respond(call, outcome);
    for (const auto &signal : std::exchange(pending_, {}))
        send_signal(signal.slot, signal.interface, signal.member, signal.body);
}

Service::Outcome Service::dispatch(const Call &call) {
    if (call.slot < 0 && !is_node(call.path))
        return Fault{kUnknownObject, fmt::format("there is no object {}: the slots are {} to {}",
                                                 call.path, slot_path(0), slot_path(slots_ - 1))};
    if (call.interface.starts_with("org.freedesktop.DBus."))
        return dispatch_standard(call);
    if (call.slot < 0)
        return Fault{kUnknownInterface,
                     fmt::format("{} has no interface {}: the modules are on {} and its like",
                                 call.path, call.interface, slot_path(0))};
    // A call may leave its interface out; the member then has to tell.
    const Interface *interface =
        call.interface.empty() ? find_owner(call.member) : find_interface(call.interface);
    if (interface)
        return invoke(call, *interface);
    if (call.interface.empty())
        return Fault{kUnknownMethod, fmt::format("no interface has a method {}", call.member)};
    return Fault{kUnknownInterface,
                 fmt::format("{} has no interface {}", call.path, call.interface)};
}

Service::Outcome Service::invoke(const Call &call, const Interface &interface) {
    std::string expected;
    for (const auto &method : interface.methods) {
        if (method.member != call.member)
            continue;
        if (method.in == call.signature)
            return run(call, method);
        expected += fmt::format("{}\"{}\"", expected.empty() ? "" : " or ", method.in);
    }
    if (expected.empty())
        return Fault{kUnknownMethod,
                     fmt::format("{} has no method {}", interface.name, call.member)};
    return Fault{kInvalidArgs, fmt::format("{} takes {}, and \"{}\" came", call.member, expected,
                                           call.signature)};
}

Service::Outcome Service::run(const Call &call, const Method &method) {
    auto refused = refuse_caller(call, method);
    Answer<Variant> answer = refused ? Answer<Variant>(*std::move(refused))
                                     : method.handler({call.slot, call.connection, call.body});
    if (answer)
        return *answer;
    return Refused{answer.refusal(), wire::refusal(method.out, method.result_index, answer.code())};
}

std::optional<Refusal> Service::refuse_caller(const Call &call, const Method &method) const {
    switch (method.caller) {
    case Caller::kAnybody:
        return std::nullopt;
    case Caller::kConnection:
        if (applications_.latest(call.slot, call.connection))
            return std::nullopt;
        return refuse(Result::kUnknownApplication,
                      "connection {} has no application on slot {}: call RegisterApplication first",
                      call.connection, call.slot);
    case Caller::kFirstArgument:
    case Caller::kLastArgument:
        break;
    }
    gint32 id = 0;
    const gsize last = g_variant_n_children(call.body.get()) - 1;
    g_variant_get_child(call.body.get(), method.caller == Caller::kFirstArgument ? 0 : last, "i",
                        &id);
    if (applications_.known(call.slot, id))
        return std::nullopt;
    return refuse(Result::kUnknownApplication,
                  "there is no application {} on slot {}: call RegisterApplication first", id,
                  call.slot);
}

Service::Outcome Service::dispatch_standard(const Call &call) {
    if (call.interface == kIntrospectable && call.member == "Introspect" && call.signature == "()")
        return wire::pack(introspect(call.path));
    if (call.interface == kPeer && call.member == "Ping" && call.signature == "()")
        return Variant(g_variant_new_tuple(nullptr, 0));
    if (call.interface == kPeer && call.member == "GetMachineId" && call.signature == "()") {
        const auto id = machine_id();
        return id.empty() ? Outcome(Fault{kFileNotFound, "this machine has no id"})
                          : Outcome(wire::pack(id));
    }
    if (call.interface == kProperties)
        return properties(call);
    const bool known = call.interface == kIntrospectable || call.interface == kPeer;
    return Fault{known ? kUnknownMethod : kUnknownInterface,
                 fmt::format("{} takes no {}{}", call.interface, call.member, call.signature)};
}

// No module has properties; clients that ask for them in passing get a proper answer.
Service::Outcome Service::properties(const Call &call) {
    struct Form {
        std::string_view member;
        std::string_view signature;
    };
    constexpr Form kForms[] = {{"Get", "(ss)"}, {"GetAll", "(s)"}, {"Set", "(ssv)"}};
    const auto form = std::ranges::find(kForms, call.member, &Form::member);
    if (form == std::end(kForms))
        return Fault{kUnknownMethod, fmt::format("{} has no method {}", kProperties, call.member)};
    if (form->signature != call.signature)
        return Fault{kInvalidArgs, fmt::format("{} takes \"{}\", and \"{}\" came", call.member,
                                               form->signature, call.signature)};
    const char *interface = nullptr;
    g_variant_get_child(call.body.get(), 0, "&s", &interface);
    const std::string_view name = interface;
    const bool known = name == kIntrospectable || name == kPeer || name == kProperties ||
                       (call.slot >= 0 && find_interface(name));
    if (!known)
        return Fault{kUnknownInterface, fmt::format("{} has no interface {}", call.path, name)};
    if (call.member == "GetAll")
        return Variant(g_variant_new("(a{sv})", nullptr));
    return Fault{kUnknownProperty, fmt::format("{} has no properties", name)};
}

std::string Service::introspect(std::string_view path) const {
    if (slot_of(path, slots_))
        return introspection::of_object(interfaces_);
    if (path != kPath) {
        // The next step on the way to the slots.
        const auto rest = kPath.substr(path == "/" ? 1 : path.size() + 1);
        return introspection::of_node({std::string(rest.substr(0, rest.find('/')))});
    }
    std::vector<std::string> children;
    children.reserve(static_cast<std::size_t>(slots_));
    for (int slot = 0; slot < slots_; ++slot)
        children.push_back(fmt::format("sub{}", slot));
    return introspection::of_node(children);
}

std::string Service::describe(const Call &call) const {
    const auto where = call.slot >= 0 ? fmt::format("sub{}", call.slot) : std::string(call.path);
    const auto name = applications_.name_of(call.connection);
    return fmt::format("{} {} {} from {}{}", where, call.member, describe_arguments(call),
                       call.connection, name.empty() ? "" : fmt::format(" ({})", name));
}

// By the member alone: a password is also one when the call goes astray.
std::string Service::describe_arguments(const Call &call) const {
    const auto *const owner = find_owner(call.member);
    if (!owner)
        return printed(call.body);
    const auto method = std::ranges::find(owner->methods, call.member, &Method::member);
    if (!method->password)
        return printed(call.body);
    if (method->in != call.signature)
        return "(not shown)";
    std::string text = "(";
    for (gsize i = 0; i < g_variant_n_children(call.body.get()); ++i) {
        const auto argument = Variant::adopt(g_variant_get_child_value(call.body.get(), i));
        text += fmt::format("{}{}", i == 0 ? "" : ", ",
                            i == *method->password ? "***" : printed(argument));
    }
    return text + ")";
}

void Service::respond(const Call &call, const Outcome &outcome) {
    const bool silent =
        (g_dbus_message_get_flags(call.message) & G_DBUS_MESSAGE_FLAGS_NO_REPLY_EXPECTED) != 0;
    Message reply;
    if (const auto *fault = std::get_if<Fault>(&outcome)) {
        log_.note("{} malformed: {} ({})", describe(call), fault->text, fault->name);
        reply.reset(g_dbus_message_new_method_error_literal(
            call.message, std::string(fault->name).c_str(), fault->text.c_str()));
    } else {
        reply.reset(g_dbus_message_new_method_reply(call.message));
        const auto *refused = std::get_if<Refused>(&outcome);
        const Variant &body = refused ? refused->body : std::get<Variant>(outcome);
        if (refused)
            log_.note("{} refused with {}: {}", describe(call),
                      static_cast<int>(refused->refusal.code), refused->refusal.reason);
        else if (log_.verbose())
            // What an object says of itself is long and of no interest here.
            log_.trace("{} -> {}", describe(call),
                       call.interface == kIntrospectable ? "its description" : printed(body));
        g_dbus_message_set_body(reply.get(), body.get());
    }
    if (!silent)
        bus_.send(reply.get());
}

void Service::emit(int slot, std::string_view interface, std::string_view member,
                   const Variant &body) {
    if (handling_)
        pending_.push_back({slot, interface, member, body});
    else
        send_signal(slot, interface, member, body);
}

void Service::send_signal(int slot, std::string_view interface, std::string_view member,
                          const Variant &body) {
    if (log_.verbose())
        log_.trace("sub{} signal {} {}", slot, member, printed(body));
    const Message signal(g_dbus_message_new_signal(
        slot_path(slot).c_str(), std::string(interface).c_str(), std::string(member).c_str()));
    g_dbus_message_set_body(signal.get(), body.get());
    bus_.send(signal.get());
}

} // namespace sim
