// SPDX-License-Identifier: Apache-2.0
#include "tests/imsctl/in_process.hpp"

#include "imsctl/line/command_line.hpp"
#include "imsctl/modules.hpp"

#include <cstdlib>

namespace imsctl {
namespace {

// A FILE that writes to memory.
class Memory {
  public:
    Memory() : file_(open_memstream(&data_, &size_)) {}
    ~Memory() {
        std::fclose(file_);
        std::free(data_);
    }
    Memory(const Memory &) = delete;
    Memory &operator=(const Memory &) = delete;

    std::FILE *file() { return file_; }
    std::string text() {
        std::fflush(file_);
        return {data_, size_};
    }

  private:
    char *data_ = nullptr;
    std::size_t size_ = 0;
    std::FILE *file_;
};

} // namespace

const Catalogue &catalogue() {
    static const Catalogue modules = all_modules();
    return modules;
}

Outcome run_words(const std::vector<std::string> &words) {
    std::vector<const char *> arguments;
    for (const std::string &word : words)
        arguments.push_back(word.c_str());
    Memory out;
    Memory err;
    const int status = run(catalogue(), arguments, out.file(), err.file());
    return {status, out.text(), err.text()};
}

std::vector<std::string> split(std::string_view line) {
    std::vector<std::string> words;
    bool quoted = false;
    bool inside = false;
    for (const char letter : line) {
        const bool is_space = !quoted && (letter == ' ' || letter == '\n');
        if (!is_space && !inside)
            words.emplace_back();
        inside = !is_space;
        if (letter == '\'')
            quoted = !quoted;
        else if (inside)
            words.back() += letter;
    }
    return words;
}

Outcome run_line(std::string_view line) {
    return run_words(split(line));
}

} // namespace imsctl
