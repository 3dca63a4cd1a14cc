// SPDX-License-Identifier: Apache-2.0
#include "sim/base/log.hpp"

#include <gtest/gtest.h>

namespace sim {
namespace {

TEST(Printable, LeavesTextOfAnyScriptAsItIs) {
    EXPECT_EQ(printable(""), "");
    EXPECT_EQ(printable("sub0 \"zo\xc3\xab\" \xe2\x82\xac \\n"),
              "sub0 \"zo\xc3\xab\" \xe2\x82\xac \\n");
}

// Else an application could write lines of its own, or command the terminal.
TEST(Printable, SpellsControlCharactersOut) {
    EXPECT_EQ(printable("a\nims-sim: b\x1b[2J\t\x7f"), "a\\x0aims-sim: b\\x1b[2J\\x09\\x7f");
}

TEST(Printable, CutsWhatIsLongBetweenTwoLetters) {
    const std::string euro = "\xe2\x82\xac";
    std::string text(899, 'x');
    text += euro + euro;
    const auto shown = printable(text);
    EXPECT_EQ(shown, std::string(899, 'x') + "... (905 bytes)");
    EXPECT_EQ(printable(std::string(900, 'y')), std::string(900, 'y'));
    EXPECT_LT(printable(std::string(std::size_t{16} << 20, '\n')).size(), 3700U);
}

} // namespace
} // namespace sim
