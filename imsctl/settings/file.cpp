// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/file.hpp"

#include "imsctl/output/failure.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <fmt/ranges.h>
#include <iterator>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

// Which line the last character that was read stands in.
struct Progress {
    void read(char character) {
        line += line_is_over;
        line_is_over = character == '\n';
    }

    std::size_t line = 1;
    bool line_is_over = false;
};

// The parser reads through this, so that it is known how far it has come.
class Reader {
  public:
    using iterator_category = std::input_iterator_tag;
    using value_type = char;
    using difference_type = std::ptrdiff_t;
    using pointer = const char *;
    using reference = const char &;

    Reader(const char *at, Progress &progress) : at_(at), progress_(&progress) {}

    reference operator*() const { return *at_; }
    Reader &operator++() {
        progress_->read(*at_++);
        return *this;
    }
    bool operator==(const Reader &other) const { return at_ == other.at_; }
    bool operator!=(const Reader &other) const { return at_ != other.at_; }

  private:
    const char *at_;
    Progress *progress_;
};

struct Problem {
    std::size_t line;
    std::string text;
};

bool is_empty_text(const Json &json) {
    return json.is_string() && json.get_ref<const std::string &>().empty();
}

struct Entry {
    std::size_t line;
    std::string name;
    Json value;
};

class Entries {
  public:
    explicit Entries(const std::string &document) {
        const char *begin = document.data();
        Json::sax_parse(Reader(begin, progress_), Reader(begin + document.size(), progress_), this);
    }

    const std::vector<Entry> &found() const { return found_; }
    const std::vector<Problem> &problems() const { return problems_; }
    std::size_t first_line() const { return first_line_; }

    // What the parser calls.
    bool null() { return value(nullptr); }
    bool boolean(bool flag) { return value(flag); }
    bool number_integer(Json::number_integer_t number) { return value(number); }
    bool number_unsigned(Json::number_unsigned_t number) { return value(number); }
    bool number_float(Json::number_float_t number, const std::string &) { return value(number); }
    bool string(std::string &text) { return value(text); }
    bool binary(Json::binary_t &) { return false; } // not in JSON text
    bool start_object(std::size_t) { return start(Json::object()); }
    bool start_array(std::size_t) { return start(Json::array()); }
    bool end_object() { return end(); }
    bool end_array() { return end(); }

    bool key(const std::string &name) {
        if (depth_ == 1)
            found_.push_back({line(), name, {}});
        return true;
    }

    bool parse_error(std::size_t, const std::string &, const Json::exception &error) {
        std::string_view text = error.what();
        // What the parser has read may be a password.
        for (const std::string_view start : {"; last read: ", " parsing '"})
            text = text.substr(0, text.find(start));
        // The parser's own names for the error and the place stand in front.
        for (const std::string_view end : {"] ", ": "})
            if (const auto found = text.find(end); found != std::string_view::npos)
                text.remove_prefix(found + end.size());
        problems_.push_back({line(), escape(text)});
        return false;
    }

  private:
    bool value(Json value) {
        if (depth_ == 1)
            found_.back().value = std::move(value);
        return depth_ > 0 || no_object();
    }

    // Of a value that has parts it only matters that it is none of those expected.
    bool start(Json empty) {
        if (depth_ == 0 && !empty.is_object())
            return no_object();
        if (depth_ == 0)
            first_line_ = line();
        if (depth_ == 1)
            found_.back().value = std::move(empty);
        ++depth_;
        return true;
    }

    bool end() {
        --depth_;
        return true;
    }

    bool no_object() {
        problems_.push_back({line(), "this is not a JSON object"});
        return false;
    }

    std::size_t line() const { return progress_.line; }

    Progress progress_;
    std::size_t depth_ = 0;
    std::size_t first_line_ = 1;
    std::vector<Entry> found_;
    std::vector<Problem> problems_;
};

// More of them than anybody reads are only counted: a file without end costs no more to refuse.
constexpr std::size_t kToldProblems = 20;

class Checker {
  public:
    explicit Checker(const Entries &entries) : problems_(entries.problems()) {
        const auto &found = entries.found();
        const auto is_name = [](const Entry &entry) { return entry.name == "name"; };
        // The object that the parser gave up in may have had its name further on.
        if (problems_.empty() && std::none_of(found.begin(), found.end(), is_name))
            problems_.push_back(
                {entries.first_line(), "there is no \"name\"; it says which set is meant"});
        for (const Entry &entry : found)
            check(entry);
    }

    Assignments<SettingsRecord> assignments_or_failure(const std::string &name) const {
        if (problems_.empty())
            return assignments_;
        std::vector<std::string> texts;
        Numbers lines;
        for (const Problem &problem : problems_) {
            lines.push_back(static_cast<std::int32_t>(problem.line));
            texts.push_back(
                fmt::format("{}: line {}: {}", escape(name), problem.line, problem.text));
        }
        if (untold_ > 0)
            texts.push_back(fmt::format("and {} more", untold_));
        throw Failure(FailureKind::kInput, fmt::format("{}", fmt::join(texts, "\n")),
                      "help: imsctl settings import --help", {{"file", name}, {"lines", lines}});
    }

  private:
    void check(const Entry &entry) {
        const auto *key = find_key<SettingsRecord>(entry.name);
        if (key == nullptr)
            return refuse(entry, [&] { return unknown_key<SettingsRecord>(entry.name); });
        const auto is_same = [&](const Entry *each) { return each->name == entry.name; };
        const auto earlier = std::find_if(seen_.begin(), seen_.end(), is_same);
        if (earlier != seen_.end())
            return refuse(entry, [&] {
                return fmt::format("{} already stands in line {}", entry.name, (*earlier)->line);
            });
        seen_.push_back(&entry);
        if (entry.name == "name" && (entry.value.is_null() || is_empty_text(entry.value)))
            return refuse(entry,
                          [] { return "name: it says which set is meant: it cannot be empty"; });
        // The service left the key out when the file was made.
        if (entry.value.is_null())
            return;
        try {
            assignments_.push_back({key, value_from_json(type_of(*key), entry.value)});
        } catch (const WrongValue &wrong) {
            refuse(entry, [&] { return fmt::format("{}: {}", entry.name, wrong.what()); });
        }
    }

    // The text costs time: only one that is told is made.
    template <class Text>
    void refuse(const Entry &entry, const Text &text) {
        if (problems_.size() < kToldProblems)
            problems_.push_back({entry.line, text()});
        else
            ++untold_;
    }

    std::vector<const Entry *> seen_;
    std::vector<Problem> problems_;
    std::size_t untold_ = 0;
    Assignments<SettingsRecord> assignments_;
};

} // namespace

std::string settings_document(const SettingsRecord &settings) {
    Json object = Json::object();
    add_json(object, fields_of(settings));
    return object.dump(2, ' ', false, Json::error_handler_t::replace);
}

Assignments<SettingsRecord> parse_settings(const std::string &document, const std::string &name) {
    return Checker(Entries(document)).assignments_or_failure(name);
}

} // namespace imsctl
