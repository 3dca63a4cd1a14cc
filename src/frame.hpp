// SPDX-License-Identifier: Apache-2.0
// What every exported function shares: gate and argument checks, the asynchronous request with its
// answer, the synchronous query.
//
// An exported function admits its arguments, packs its tuple and requests:
//
//     if (const int refused = admit({handle}))
//         return refused;
//     return request(handle, kInterface, "MergeCalls", pack<"(i)">(handle->app_id),
//                    {answer<"on_response_call_merge_calls", "(ii)", kSecondByPointer>, callback,
//                     user_data});
//
// answer<> is the handler of the response: its name as log lines have it, the signature of the
// reply, how the application gets what is in the reply.
#pragma once

#include "client.hpp"
#include "log.hpp"
#include "wire/wire.hpp"

#include <initializer_list>

namespace ims {

inline constexpr const char *kServiceName = "org.kelvo.ims";
inline constexpr int kRequestTimeoutMs = 60000;

// 0 when the device has the IMS feature and none of the pointers is NULL, in this order.
int admit(std::initializer_list<const void *> required = {}, Site site = here()) noexcept;

// Logs and returns what a bad argument earns.
int invalid_parameter(Site site = here()) noexcept;

// Who takes the answer to a request.
struct Response {
    GAsyncReadyCallback handler;
    ims_response_cb callback;
    void *user_data;
};

// Queues one method call. A tuple that could not be packed is an invalid parameter; an empty one is
// sent as no parameters.
int request(ims_h handle, const char *interface, const char *method, const Variant &tuple,
            Response response, Site site = here()) noexcept;

// Makes one method call, waits for its reply and stores it.
int query(ims_h handle, const char *interface, const char *method, const Variant &tuple,
          Variant &reply, int timeout_ms = kRequestTimeoutMs, Site site = here()) noexcept;

// The number of entries that a list of dictionaries really has, when the service's count says the
// same: at most the capacity. Otherwise none; both are worth a line.
std::uint32_t checked_count(const char *subject, std::uint32_t count, GVariant *list,
                            std::uint32_t capacity, Site site) noexcept;

// The application's side of a finished request.
class Completion {
  public:
    Completion(gpointer context, Site site) noexcept
        : context_{static_cast<ims_request_ctx_s *>(context)}, site_{site} {}

    bool is_wanted() const noexcept { return context_ && context_->callback != nullptr; }
    void operator()(int result, void *data = nullptr) const noexcept {
        if (is_wanted())
            context_->callback(context_->handle, result, data, context_->user_data);
    }

    // The handler's, for the lines of a delivery.
    Site site() const noexcept { return site_; }

  private:
    std::unique_ptr<ims_request_ctx_s> context_;
    Site site_;
};

// How an application usually gets a reply: the result alone whatever follows it, a pointer to the
// second member, the second member itself in the pointer's place, a record of all members but the
// first.
inline constexpr auto kResultOnly = [](const Completion &done, std::int32_t result,
                                       const auto &...) { done(result); };
inline constexpr auto kSecondByPointer = [](const Completion &done, std::int32_t result,
                                            auto &second) { done(result, &second); };
inline constexpr auto kSecondInPlace = [](const Completion &done, std::int32_t result,
                                          std::int32_t second) {
    // NOLINTNEXTLINE(performance-no-int-to-ptr): applications read the value from the pointer.
    done(result, reinterpret_cast<void *>(static_cast<std::intptr_t>(second)));
};
template <typename Record>
inline constexpr auto kRestAsRecord =
    [](const Completion &done, std::int32_t result, const auto &...rest) {
        Record record{rest...};
        done(result, &record);
    };

namespace frame {

// What the members of a reply are unpacked to: texts are borrowed from the reply.
template <char Letter>
struct ReplyMember {
    using Type = Variant;
};
template <>
struct ReplyMember<'b'> {
    using Type = bool;
};
template <>
struct ReplyMember<'i'> {
    using Type = std::int32_t;
};
template <>
struct ReplyMember<'u'> {
    using Type = std::uint32_t;
};
template <>
struct ReplyMember<'s'> {
    using Type = const char *;
};

template <Literal Format, std::size_t... Index>
auto reply_members(std::index_sequence<Index...>)
    -> std::tuple<typename ReplyMember<Signature<Format>::member(Index)[0]>::Type...>;

// The reply, or nothing: then the application has been told what it is to know of the failure.
Variant finish(GObject *source, GAsyncResult *outcome, const Completion &done) noexcept;

template <Literal Format, auto Deliver>
void complete(GObject *source, GAsyncResult *outcome, gpointer context, Site site) noexcept {
    const Completion done{context, site};
    const Variant reply = finish(source, outcome, done);
    if (!reply)
        return;
    decltype(reply_members<Format>(
        std::make_index_sequence<Signature<Format>::size()>{})) members{};
    const auto unpack_members = [&reply](auto &...member) {
        return unpack<Format>(reply.get(), member...);
    };
    if (std::apply(unpack_members, members))
        std::apply([&](auto &...member) { Deliver(done, member...); }, members);
    else
        done(IMS_RESPONSE_FAILED);
}

// The name of a handler, and where it stands: the place of its request. A template argument, so
// that a pending request carries nothing for a line that is hardly ever written.
template <std::size_t Size>
struct HandlerSite {
    Literal<Size> function;
    char file[32]{};
    int line;

    consteval HandlerSite(const char (&name)[Size], const char *path = __builtin_FILE(),
                          int at_line = __builtin_LINE())
        : function{name}, line{at_line} {
        std::size_t at = 0;
        for (const char c : std::string_view{file_name(path)})
            file[at++] = c;
    }
    constexpr Site site() const { return {file, function.text, line}; }
};

} // namespace frame

// Ends a request: `Deliver` gets the completion and the members of the reply, and calls the
// completion. A reply of another signature is a failed call.
template <frame::HandlerSite Handler, Literal Format = "(i)", auto Deliver = kResultOnly>
void answer(GObject *source, GAsyncResult *outcome, gpointer context) noexcept {
    frame::complete<Format, Deliver>(source, outcome, context, Handler.site());
}

} // namespace ims
