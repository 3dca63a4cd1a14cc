// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/command_line.hpp"
#include "imsctl/modules.hpp"

#include <clocale>
#include <csignal>
#include <fcntl.h>
#include <unistd.h>

namespace {

// A standard stream that was closed would be the number of the next thing that is opened: results
// would go into the connection to the bus. Its place is taken by what fails when it is used.
void occupy_standard_streams() {
    for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
        if (fcntl(descriptor, F_GETFD) < 0)
            open("/dev/null", descriptor == STDIN_FILENO ? O_WRONLY : O_RDONLY);
}

} // namespace

int main(int argc, char **argv) {
    occupy_standard_streams();
    // A reader that is gone is seen when writing.
    std::signal(SIGPIPE, SIG_IGN);
    std::setlocale(LC_ALL, "");
    const std::span<const char *const> words(argv, static_cast<std::size_t>(argc));
    return imsctl::run(imsctl::all_modules(), words.empty() ? words : words.subspan(1), stdout,
                       stderr);
}
