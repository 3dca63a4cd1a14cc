// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/json_text.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <set>

namespace imsctl {
namespace {

// Sees the text once before it is parsed, and builds nothing but the keys of the open objects.
class Check : public nlohmann::json_sax<Json> {
  public:
    Check(const std::string &text, std::vector<std::string> &problems)
        : text_(text), problems_(problems) {}

    bool start_object(std::size_t) override {
        keys_.emplace_back();
        return true;
    }
    bool key(std::string &name) override {
        if (!keys_.back().insert(name).second)
            problems_.push_back(fmt::format("an object has the key {} twice", quote(name)));
        return true;
    }
    bool end_object() override {
        keys_.pop_back();
        return true;
    }
    bool parse_error(std::size_t byte, const std::string &, const Json::exception &) override {
        const auto end = static_cast<std::ptrdiff_t>(std::min(byte, text_.size()));
        const auto line = 1 + std::count(text_.begin(), text_.begin() + end, '\n');
        problems_.push_back(fmt::format("this is not JSON from line {} on", line));
        return false;
    }

    bool null() override { return true; }
    bool boolean(bool) override { return true; }
    bool number_integer(std::int64_t) override { return true; }
    bool number_unsigned(std::uint64_t) override { return true; }
    bool number_float(double, const std::string &) override { return true; }
    bool string(std::string &) override { return true; }
    bool binary(Json::binary_t &) override { return true; }
    bool start_array(std::size_t) override { return true; }
    bool end_array() override { return true; }

  private:
    const std::string &text_;
    std::vector<std::string> &problems_;
    std::vector<std::set<std::string>> keys_;
};

} // namespace

Json parse_json(const std::string &text, std::vector<std::string> &problems) {
    Check check(text, problems);
    return Json::sax_parse(text, &check) ? Json::parse(text) : Json();
}

} // namespace imsctl
