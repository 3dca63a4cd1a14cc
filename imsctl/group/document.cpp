// SPDX-License-Identifier: Apache-2.0
#include "imsctl/group/document.hpp"

#include "imsctl/group/records.hpp"
#include "imsctl/line/suggestions.hpp"
#include "imsctl/output/failure.hpp"
#include "imsctl/output/files.hpp"
#include "imsctl/output/json_text.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <fmt/ranges.h>
#include <limits>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

// Where in a document something is: "group_member_list.contacts[2].uri".
using Path = std::string;

Path below(const Path &path, const std::string &name) {
    return path.empty() ? name : path + "." + name;
}

Path below(const Path &path, std::size_t index) {
    return fmt::format("{}[{}]", path, index);
}

class Problems {
  public:
    void add(const Path &path, const std::string &text) {
        texts_.push_back(path.empty() ? text : fmt::format("{}: {}", path, text));
    }
    const std::vector<std::string> &texts() const { return texts_; }

  private:
    std::vector<std::string> texts_;
};

// Reads the fields of one record from one object.
class Reader {
  public:
    Reader(const Json &object, Path path, Storage &storage, Problems &problems)
        : object_(object), path_(std::move(path)), storage_(storage), problems_(problems) {}

    void operator()(const char *name, bool &flag) {
        take(name, "true or false", &Json::is_boolean, [&](const Json &value) { flag = value; });
    }

    void operator()(const char *name, std::int32_t &number) {
        take(name, "a whole number", &Json::is_number_integer, [&](const Json &value) {
            using Limits = std::numeric_limits<std::int32_t>;
            const bool fits = value.is_number_unsigned()
                                  ? value.get<std::uint64_t>() <= Limits::max()
                                  : value.get<std::int64_t>() >= Limits::min();
            if (fits)
                number = value.get<std::int32_t>();
            else
                problems_.add(here(name), fmt::format("{} has more than 32 bits", value.dump()));
        });
    }

    void operator()(const char *name, char *&text) {
        take(name, "a text", &Json::is_string,
             [&](const Json &value) { text = storage_.keep(text_in(value, here(name))); });
    }

    template <std::size_t Size>
    void operator()(const char *name, char (&buffer)[Size]) {
        take(name, "a text", &Json::is_string, [&](const Json &value) {
            const std::string text = text_in(value, here(name));
            if (text.size() < Size)
                text.copy(buffer, Size - 1);
            else
                problems_.add(here(name), fmt::format("the text has {} bytes, and {} are the most",
                                                      text.size(), Size - 1));
        });
    }

    template <std::size_t Size>
    void required(const char *name, char (&buffer)[Size]) {
        if (object_.contains(name))
            return (*this)(name, buffer);
        known_.emplace_back(name);
        problems_.add(path_, fmt::format("there is no {}", quote(name)));
    }

    template <class Record>
    requires std::is_class_v<Record>
    void operator()(const char *name, Record &record) {
        take_object(name, [&](const Json &value) { read(value, here(name), record); });
    }

    template <class Record>
    requires std::is_class_v<Record>
    void operator()(const char *name, Record *&record) {
        if constexpr (Linked<Record>)
            take_list(name, [&](const Json &value) { record = chain(value, here(name), record); });
        else
            take_object(name, [&](const Json &value) {
                record = storage_.make<Record>();
                read(value, here(name), *record);
            });
    }

    template <class Element>
    void operator()(const char *name, Element *&elements, std::int32_t &count) {
        take_list(name, [&](const Json &value) {
            std::vector<Element> read_elements(value.size());
            for (std::size_t at = 0; at < value.size(); ++at)
                read_element(value[at], below(here(name), at), read_elements[at]);
            count = static_cast<std::int32_t>(value.size());
            elements = count == 0 ? nullptr : storage_.keep(std::move(read_elements));
        });
    }

    void identity(const char *name, void **&cell, std::int32_t type) {
        take_object(name, [&](const Json &value) {
            const bool has_record = with_identity_type(type, [&]<class Record>(Record *) {
                auto *record = storage_.make<Record>();
                cell = storage_.make<void *>();
                *cell = record;
                read(value, here(name), *record);
            });
            if (has_record)
                return;
            const auto found = object_.find(kIdentityType);
            if (found == object_.end() || found->is_null())
                problems_.add(path_, fmt::format("there is no {}, which an identity needs",
                                                 quote(kIdentityType)));
            else
                problems_.add(here(name),
                              fmt::format("the {} {} has no identity", kIdentityType, type));
        });
    }

    // The first of the links, in the list's order.
    template <class Link>
    Link *chain(const Json &list, const Path &path, Link *) {
        Link *first = nullptr;
        Link **next = &first;
        for (std::size_t at = 0; at < list.size(); ++at) {
            *next = storage_.make<Link>();
            read_element(list[at], below(path, at), **next);
            next = &(*next)->next;
        }
        return first;
    }

    template <class Record>
    void read(const Json &object, const Path &path, Record &record) {
        Reader reader(object, path, storage_, problems_);
        visit_fields(reader, record);
        reader.refuse_unknown();
    }

    void accept(const char *name) { known_.emplace_back(name); }

    void refuse_unknown() const {
        for (const auto &[name, value] : object_.items()) {
            if (std::find(known_.begin(), known_.end(), name) == known_.end())
                problems_.add(path_, fmt::format("there is no key {}{}", quote(name),
                                                 did_you_mean(name, known_)));
        }
    }

  private:
    using Check = bool (Json::*)() const noexcept;

    Path here(const char *name) const { return below(path_, name); }

    // What is left out or null stays as it is.
    template <class Use>
    void take(const char *name, const char *what, Check fits, const Use &use) {
        known_.emplace_back(name);
        const auto found = object_.find(name);
        if (found == object_.end() || found->is_null())
            return;
        if (((*found).*fits)())
            use(*found);
        else
            problems_.add(here(name), fmt::format("this has to be {}", what));
    }

    template <class Use>
    void take_object(const char *name, const Use &use) {
        take(name, "an object", &Json::is_object, use);
    }
    template <class Use>
    void take_list(const char *name, const Use &use) {
        take(name, "a list", &Json::is_array, use);
    }

    void read_element(const Json &value, const Path &path, char *&text) {
        if (value.is_string())
            text = storage_.keep(text_in(value, path));
        else if (!value.is_null())
            problems_.add(path, "this has to be a text");
    }
    template <class Record>
    void read_element(const Json &value, const Path &path, Record &record) {
        if (value.is_object())
            read(value, path, record);
        else
            problems_.add(path, "this has to be an object");
    }

    std::string text_in(const Json &value, const Path &path) {
        std::string text = value;
        if (text.find('\0') != std::string::npos)
            problems_.add(path, "a text cannot hold a zero character");
        return text;
    }

    const Json &object_;
    Path path_;
    Storage &storage_;
    Problems &problems_;
    std::vector<std::string> known_;
};

// Reads a file whose problems are told in one failure.
template <class Record, class Use>
Record *read_file_as(const std::string &file, const char *what, bool (*fits)(const Json &),
                     const Use &use) {
    std::vector<std::string> wrong;
    const Json document = parse_json(read_file(file), wrong);
    Problems problems;
    for (const std::string &problem : wrong)
        problems.add("", problem);
    Record *record = nullptr;
    if (problems.texts().empty() && !fits(document))
        problems.add("", fmt::format("this is not {}", what));
    if (problems.texts().empty())
        record = use(document, problems);
    if (problems.texts().empty())
        return record;
    std::vector<std::string> lines;
    Texts told;
    for (const std::string &problem : problems.texts()) {
        lines.push_back(fmt::format("{}: {}", escape(file), problem));
        told.emplace_back(problem);
    }
    throw Failure(FailureKind::kInput, fmt::format("{}", fmt::join(lines, "\n")),
                  "help: imsctl group create --help", {{"file", file}, {"problems", told}});
}

bool is_object(const Json &document) {
    return document.is_object();
}

bool is_object_or_list(const Json &document) {
    return document.is_object() || (document.is_array() && !document.empty());
}

template <class Record>
Record *read_object(const std::string &file, Storage &storage) {
    return read_file_as<Record>(file, "a JSON object", is_object,
                                [&](const Json &document, Problems &problems) {
                                    auto *record = storage.make<Record>();
                                    Reader reader(document, "", storage, problems);
                                    // What `group show --json` and editors put there.
                                    reader.accept("verb");
                                    reader.accept("$schema");
                                    visit_fields(reader, *record);
                                    reader.refuse_unknown();
                                    return record;
                                });
}

} // namespace

ims_xdm_group_info_s *read_group(const std::string &file, Storage &storage) {
    return read_object<ims_xdm_group_info_s>(file, storage);
}

ims_xdm_member_list_s *read_members(const std::string &file, Storage &storage) {
    return read_object<ims_xdm_member_list_s>(file, storage);
}

ims_xdm_session_policy_s *read_policy(const std::string &file, Storage &storage) {
    return read_object<ims_xdm_session_policy_s>(file, storage);
}

ims_xdm_group_rule_s *read_rules(const std::string &file, Storage &storage) {
    return read_file_as<ims_xdm_group_rule_s>(
        file, "a JSON object or a list of them", is_object_or_list,
        [&](const Json &document, Problems &problems) {
            const Json list = document.is_array() ? document : Json::array({document});
            Reader reader(list, "", storage, problems);
            return reader.chain<ims_xdm_group_rule_s>(list, "", nullptr);
        });
}

} // namespace imsctl
