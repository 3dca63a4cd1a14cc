// SPDX-License-Identifier: Apache-2.0
// What the files in dbus/interfaces say, one line each method and signal, so that it can be held
// against what others say in the same words.
#pragma once

#include <set>
#include <string>

namespace test {

struct Contract {
    std::set<std::string> methods; // "org.kelvo.ims.Call.HoldCall (ii) -> (i)"
    std::set<std::string> signals; // "org.kelvo.ims.Call:CallEnded (ii)"
};

std::string method_line(const std::string &interface, const std::string &member,
                        const std::string &in, const std::string &out);
std::string signal_line(const std::string &interface, const std::string &member,
                        const std::string &type);

// Throws when a file is not what it should be: one interface, named like the file, whose arguments
// have names.
Contract contract_of_files();

// What the one has and the other has not, for messages.
std::string missing(const std::set<std::string> &from, const std::set<std::string> &expected);

} // namespace test
