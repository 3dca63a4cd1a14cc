// SPDX-License-Identifier: Apache-2.0
// Texts in place of a TPDU's base64.
#pragma once

namespace test {

// No byte comes out of these: nothing there, nothing of the alphabet, not one whole group.
inline constexpr const char *kTextsOfNothing[] = {"",  " ",  "\n",  "!!!!",  "\xe2\x82\xac", "-_-_",
                                                  "Q", "QQ", "QUJ", "Q U J", "Q\n"};

// Something comes out of these, though a strict reader would refuse them.
inline constexpr const char *kDoubtfulTexts[] = {
    "aGVsbG8", "aGVs bG8=", "aGVs\nbG8=\n", "aGVs!bG8=",          "aGVsbG8=aGVsbG8=",
    "====",    "QQ==QQ",    "=aGVsbG8",     "not base64 at all!", "zo\xc3\xab@example"};

} // namespace test
