// SPDX-License-Identifier: Apache-2.0
// Offering a file of this machine. The service sends it: the library tells what it is.
#include "imsctl/ptt/file.hpp"

#include "imsctl/line/requests.hpp"
#include "imsctl/ptt/parties.hpp"

#include <filesystem>
#include <fmt/format.h>
#include <gio/gio.h>
#include <limits>

namespace imsctl {
namespace {

struct FileArguments {
    Argument<std::string> file;
    PttTargets targets;
    Argument<std::int32_t> session;
    Argument<std::string> description;
    Argument<std::string> content_type;
    Argument<std::string> file_type;
    Argument<std::string> transfer_id;
    Argument<bool> push;
    Argument<std::int32_t> start;
    Argument<std::int32_t> end;
};

std::int32_t size_of(const std::string &file) {
    std::error_code problem;
    const std::uintmax_t size = std::filesystem::file_size(file, problem);
    if (problem)
        throw Failure(FailureKind::kInput,
                      fmt::format("cannot read {}: {}", quote(file), problem.message()), "",
                      {{"file", file}});
    if (size > std::numeric_limits<std::int32_t>::max())
        throw Failure(FailureKind::kInput,
                      fmt::format("{} has {} bytes, more than 32 bits can tell", quote(file), size),
                      "", {{"file", file}});
    return static_cast<std::int32_t>(size);
}

// "image/png"; by the name alone.
std::string guessed_type(const std::string &name) {
    const std::unique_ptr<gchar, decltype(&g_free)> type(
        g_content_type_guess(name.c_str(), nullptr, 0, nullptr), g_free);
    const std::unique_ptr<gchar, decltype(&g_free)> mime(g_content_type_get_mime_type(type.get()),
                                                         g_free);
    return mime == nullptr ? "application/octet-stream" : mime.get();
}

const char *or_null(const std::string &text) {
    return text.empty() ? nullptr : text.c_str();
}

} // namespace

Fields decode_transfer_result(void *data) {
    if (data == nullptr)
        return {};
    const auto &result = *static_cast<const ims_poc_transfer_result_s *>(data);
    return {{"value_1", std::int64_t{result.value_1}}, {"value_2", std::int64_t{result.value_2}}};
}

Action prepare_ptt_file_send(Arguments &arguments) {
    const FileArguments given{
        arguments.text("FILE", "the file"),
        ptt_targets(arguments),
        arguments.number("--session", "send it to the parties of this session", 0),
        arguments.text_or("--description", "what it is", ""),
        arguments.text_or("--type", "its media type; guessed from the name when left out", ""),
        arguments.text_or("--file-type", "a text that the service defines", ""),
        arguments.text_or("--id", "names the transfer; the service's when left out", ""),
        arguments.flag("--push", "the sender pushes the file"),
        arguments.number("--start", "the first byte to send, counted from 1", 0),
        arguments.number("--end", "the last byte to send; with both 0 the whole file", 0)};
    return [given](Invocation &run) {
        const std::string name = std::filesystem::path(*given.file).filename();
        const std::string type =
            given.content_type->empty() ? guessed_type(name) : *given.content_type;
        const ims_poc_file_attributes_s attributes{name.c_str(),
                                                   or_null(*given.description),
                                                   size_of(*given.file),
                                                   *given.push,
                                                   *given.start,
                                                   *given.end,
                                                   or_null(*given.transfer_id),
                                                   type.c_str(),
                                                   or_null(*given.file_type)};
        const PttPeerChain targets(given.targets);
        const ims_poc_file_transfer_s transfer{*given.session, targets.head(), &attributes,
                                               nullptr};
        run.request({}, with_record(ims_poc_transfer_file, transfer), decode_transfer_result);
    };
}

} // namespace imsctl
