// SPDX-License-Identifier: Apache-2.0
// The forwarding target, the one text in the lists.
#include "tests/library/ss/services.hpp"
#include "tests/support/released.hpp"
#include "tests/support/with_peer.hpp"

#include <optional>

namespace test {
namespace {

class ForwardingTarget : public WithPeer {
  protected:
    // The targets of all entries, as they were while the callback ran; nothing for NULL.
    std::vector<std::optional<std::string>> ask(const std::vector<std::string> &dictionaries) {
        peer().on(
            "org.kelvo.ims.Ss.GetCallForwarding",
            reply("(iuaa{sv})", list_reply(std::to_string(dictionaries.size()), dictionaries)));
        std::vector<std::optional<std::string>> targets;
        ResponseRecorder recorder{[&](const Response &, void *data) {
            ASSERT_NE(data, nullptr);
            const auto &list = *static_cast<ims_ss_status_list_s *>(data);
            for (std::size_t i = 0; i < list.count; ++i) {
                address_ = list.entries.call_forwarding[i].cf_uri;
                targets.push_back(address_ ? std::optional<std::string>{address_} : std::nullopt);
            }
        }};
        constexpr ims_ss_query_s query{1, 2};
        EXPECT_EQ(
            ims_ss_get_call_forwarding(handle_, &query, ResponseRecorder::callback, &recorder),
            IMS_ERROR_NONE);
        fence();
        EXPECT_EQ(recorder.count(), 1U);
        EXPECT_TRUE(take_log().empty());
        return targets;
    }

    using Targets = std::vector<std::optional<std::string>>;

    const char *address_ = nullptr; // the last one
};

TEST_F(ForwardingTarget, IsReadableThroughTheCallbackAndGoneAfterIt) {
    EXPECT_EQ(ask({"{'cf_uri': <'tel:+4912345'>}"}), Targets{"tel:+4912345"});
    expect_released(address_);
}

TEST_F(ForwardingTarget, OfEachEntryIsItsOwn) {
    EXPECT_EQ(ask({"{'cf_uri': <'a'>}", "{'ss_class': <1>}", "{'cf_uri': <''>}",
                   "{'cf_uri': <'zo\xc3\xab'>}"}),
              (Targets{"a", std::nullopt, "", "zo\xc3\xab"}));
}

TEST_F(ForwardingTarget, IsNotCutToItsLength) {
    EXPECT_EQ(ask({"{'cf_uri_length': <3>, 'cf_uri': <'tel:+4912345'>}"}), Targets{"tel:+4912345"});
    EXPECT_EQ(ask({"{'cf_uri_length': <-1>, 'cf_uri': <'tel:+4912345'>}"}),
              Targets{"tel:+4912345"});
}

TEST_F(ForwardingTarget, OfAnyLengthIsWhole) {
    const std::string large(100000, 'x');
    EXPECT_TRUE(ask({"{'cf_uri': <'" + large + "'>}"}) == Targets{large});
}

TEST_F(ForwardingTarget, OfAnotherTypeCountsAsMissing) {
    for (const char *value : {"7", "objectpath '/a'", "signature 's'", "['a']", "<'a'>", "b'a'",
                              "true", "@as []", "{'a': <'b'>}"}) {
        SCOPED_TRACE(value);
        EXPECT_EQ(ask({std::string{"{'cf_uri': <"} + value + ">}"}), Targets{std::nullopt});
    }
}

TEST_F(ForwardingTarget, GivenTwiceIsTheLater) {
    EXPECT_EQ(ask({"{'cf_uri': <'first'>, 'ss_class': <1>, 'cf_uri': <'second'>}"}),
              Targets{"second"});
    EXPECT_EQ(ask({"{'cf_uri': <'first'>, 'cf_uri': <7>}"}), Targets{"first"});
}

} // namespace
} // namespace test
