// SPDX-License-Identifier: Apache-2.0
// That docs/imsctl.md tells of everything there is.
#include "imsctl/output/failure.hpp"
#include "imsctl/sms/short_message.hpp"
#include "tests/imsctl/in_process.hpp"

#include <fmt/format.h>
#include <fstream>
#include <gtest/gtest.h>
#include <sstream>

namespace imsctl {
namespace {

std::string documentation() {
    std::stringstream text;
    text << std::ifstream(IMSCTL_DOCUMENTATION).rdbuf();
    return text.str();
}

class Documentation : public ::testing::Test {
  protected:
    bool tells(const std::string &text) const { return text_.find(text) != std::string::npos; }

  private:
    const std::string text_ = documentation();
};

TEST_F(Documentation, HasEveryVerb) {
    for (const Verb &verb : catalogue().verbs())
        EXPECT_TRUE(tells(fmt::format("`{}", verb.path)) ||
                    tells(fmt::format("\nimsctl {} ", verb.path)))
            << verb.path;
}

TEST_F(Documentation, HasEveryEventWithItsIdAndFields) {
    for (const EventRow &event : catalogue().events())
        EXPECT_TRUE(tells(
            fmt::format("\n| `{}` | {} | `{}`", event.name, event.id, event.fields.front().name)))
            << event.name;
}

TEST_F(Documentation, HasEveryModuleOfEvents) {
    for (const std::string &module : event_modules(catalogue().events()))
        EXPECT_TRUE(tells(fmt::format("`{}`", module))) << module;
}

TEST_F(Documentation, HasEveryKindOfFailure) {
    for (int kind = 0; to_string(static_cast<FailureKind>(kind)) != "unknown"; ++kind)
        EXPECT_TRUE(tells(fmt::format("\n| `{}` | ", to_string(static_cast<FailureKind>(kind)))))
            << kind;
}

TEST_F(Documentation, ShowsTheReferenceThatItsSampleMessageGets) {
    EXPECT_TRUE(tells(fmt::format("$ imsctl sms send +15550101 'See you at 8' --wait\n"
                                  "part=1 of=1 reference={} message_number=1\n",
                                  usual_reference("+15550101", "See you at 8"))));
}

} // namespace
} // namespace imsctl
