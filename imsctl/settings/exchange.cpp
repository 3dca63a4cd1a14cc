// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/exchange.hpp"

#include "imsctl/output/files.hpp"
#include "imsctl/settings/actions.hpp"
#include "imsctl/settings/file.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <fmt/ranges.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

using Names = std::vector<std::string_view>;

// "a, b, c, d, e and 7 more"
std::string first_of(const Names &names) {
    constexpr std::size_t kTold = 5;
    if (names.size() <= kTold)
        return fmt::format("{}", fmt::join(names, ", "));
    return fmt::format("{} and {} more", fmt::join(std::span(names).first(kTold), ", "),
                       names.size() - kTold);
}

// What a file says, and what becomes of it.
class Import {
  public:
    Import(Invocation &run, const std::string &file)
        : run_(run), file_(file), assignments_(parse_settings(read_file(file), file)),
          name_(std::get<std::string>(find("name")->value)) {}

    void carry_out(const Shown &shown) {
        if (const auto set = read_if_there())
            change(*set);
        else
            add();
        show(shown);
    }

  private:
    const Assignment<SettingsRecord> *find(std::string_view key) const {
        const auto found =
            std::find_if(assignments_.begin(), assignments_.end(),
                         [&](const auto &assignment) { return assignment.key->name == key; });
        return found == assignments_.end() ? nullptr : &*found;
    }

    Failure wrong(const std::string &what) const {
        return {
            FailureKind::kInput, fmt::format("{}: {}", escape(file_), what), "", {{"file", file_}}};
    }

    // The library does not tell a set that does not exist from a service that does not answer.
    RecordPtr<SettingsRecord> read_if_there() {
        Client &client = run_.client();
        try {
            return read_set(client, name_);
        } catch (const Failure &failure) {
            if (failure.kind != FailureKind::kUnreachable)
                throw;
            return nullptr;
        }
    }

    void change(SettingsRecord &set) {
        changes_ = change_record<SettingsRecord>(run_, ims_update_global_settings, set,
                                                 writable_part(set));
        action_ = changes_.empty() ? "unchanged" : "changed";
    }

    // A part of a set is enough to change one, but not to make one: that would hide a slip in the
    // name.
    void add() {
        Names missing;
        for (const auto &key : keys_of<SettingsRecord>())
            if (!is_read_only(key) && find(key.name) == nullptr)
                missing.push_back(key.name);
        if (!missing.empty())
            throw wrong(fmt::format("the set {} cannot be read, and for a new one the file has "
                                    "no value for {}",
                                    quote(name_), first_of(missing)));
        const auto set = new_record<SettingsRecord>();
        fill_gaps(*set);
        assign_all(*set, writable_part(*set));
        send_record<SettingsRecord>(run_, ims_add_global_settings, *set);
        action_ = "added";
    }

    // Leaves out what cannot be written, and remembers what the set will lack for it.
    Assignments<SettingsRecord> writable_part(const SettingsRecord &set) {
        Assignments<SettingsRecord> part;
        for (const auto &assignment : assignments_) {
            if (!is_read_only(*assignment.key))
                part.push_back(assignment);
            else if (value_of(set, *assignment.key) != assignment.value)
                not_written_.push_back(assignment.key->name);
        }
        return part;
    }

    void show(const Shown &shown) const {
        note_not_written(run_, not_written_);
        Json not_written = Json::array();
        for (const std::string_view key : not_written_)
            not_written.push_back(std::string(key));
        const std::string lines = shown.changes(changes_, "->");
        run_.output().result(
            {{"name", name_},
             {"action", action_},
             {"changed", to_json(changes_, "from", "to")},
             {"not_written", not_written}},
            fmt::format("{} {}{}{}", quote(name_), action_, lines.empty() ? "" : "\n", lines));
    }

    Invocation &run_;
    const std::string &file_;
    const Assignments<SettingsRecord> assignments_;
    const std::string name_;
    std::string action_;
    Changes changes_;
    Names not_written_;
};

} // namespace

Action prepare_export(Arguments &arguments) {
    const auto name = arguments.text("NAME", "the set");
    const auto file = arguments.text("FILE", "where to; - is standard output");
    return [=](Invocation &run) {
        const std::string document = settings_document(*read_set(run.client(), *name));
        // The document is all that a reader of standard output expects.
        if (*file == kStandardStream)
            return run.output().line(document);
        write_file(*file, document + '\n');
        run.output().result({{"name", *name}, {"file", *file}});
    };
}

Action prepare_import(Arguments &arguments) {
    const auto file = arguments.text("FILE", "where from; - is standard input");
    const auto secrets = secrets_flag(arguments);
    return [=](Invocation &run) { Import(run, *file).carry_out(Shown(*secrets)); };
}

} // namespace imsctl
