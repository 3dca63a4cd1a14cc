// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/recorder.hpp"

#include "sim/ptt/media.hpp"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <system_error>
#include <unistd.h>

namespace sim {

namespace {

constexpr int kMostNames = 1000;

} // namespace

int PttRecorder::File::create(const std::filesystem::path &path) {
    directory_ = Descriptor(open(path.parent_path().c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    if (!directory_)
        return errno;
    name_ = path.filename();
    descriptor_ = Descriptor(openat(directory_.number(), name_.c_str(),
                                    O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, 0600));
    return descriptor_ ? 0 : errno;
}

void PttRecorder::File::remove() const {
    struct stat own {};
    struct stat there {};
    if (fstat(descriptor_.number(), &own) != 0 ||
        fstatat(directory_.number(), name_.c_str(), &there, AT_SYMLINK_NOFOLLOW) != 0)
        return;
    if (own.st_dev == there.st_dev && own.st_ino == there.st_ino)
        unlinkat(directory_.number(), name_.c_str(), 0);
}

void PttRecorder::File::write(std::string_view text) const {
    while (!text.empty()) {
        const ssize_t written = ::write(descriptor_.number(), text.data(), text.size());
        if (written < 0 && errno == EINTR)
            continue;
        // A full disk makes the recording short and harms nothing else.
        if (written <= 0)
            return;
        text.remove_prefix(static_cast<std::size_t>(written));
    }
}

Answer<std::string> PttRecorder::create(Key key, const std::string &path, File &file) {
    const auto cannot = [](const std::string &name, int error) {
        return refuse(Result::kFailed, "{} cannot be made: {}", name,
                      std::generic_category().message(error));
    };
    if (!path.empty()) {
        if (!path.starts_with('/'))
            return refuse(Result::kInvalidArgument, "\"{}\" is no absolute path", path);
        const int error = file.create(path);
        return error == 0 ? Answer<std::string>(path) : cannot(path, error);
    }
    std::error_code none;
    const auto directory = std::filesystem::temp_directory_path(none);
    int error = EEXIST;
    std::string name;
    for (int number = 1; error == EEXIST && number <= kMostNames; ++number) {
        name = directory / fmt::format("ims-sim-{}-sub{}-session{}-{}.txt", getpid(), key.first,
                                       key.second, number);
        error = file.create(name);
    }
    return error == 0 ? Answer<std::string>(name) : cannot(name, error);
}

Answer<PttRecordingInfo> PttRecorder::start(int slot, const PttRecordRequest &request) {
    const auto with = calls_.talking_to(slot, request.session);
    if (!with)
        return with.refusal();
    const Key key{slot, request.session};
    if (recordings_.contains(key))
        return refuse(Result::kWrongState, "session {} is being recorded already", request.session);
    if (request.source < PttRecordSource::kAll || request.source > PttRecordSource::kOthers)
        return refuse(Result::kInvalidArgument,
                      "what is recorded is 0 (all), 1 (this slot) or 2 (the others), not {}",
                      request.source);
    if (auto refusal = bad_seconds(request.longest, "the longest recording"))
        return *refusal;
    Recording recording;
    const auto path = create(key, request.path, recording.file);
    if (!path)
        return path.refusal();
    recording.source = request.source;
    if (request.longest > 0)
        recording.limit = timers_.after_waiting(std::chrono::seconds(request.longest),
                                                [this, key] { finish(key, "the time is over"); });
    note(recording,
         fmt::format("recording of session {} of slot {} with {}", request.session, slot, *with));
    const auto floor = calls_.floor().status(slot, {request.session});
    if (floor && !floor->front().speaker_uri.empty())
        note_speaker(recording, floor->front().speaker_uri,
                     floor->front().state == PttFloorState::kGranted);
    recordings_[key] = std::move(recording);
    return PttRecordingInfo{request.session, PttRecordState::kRecording, 0, *path};
}

Answer<PttRecorder::Recording *> PttRecorder::running(Key key) {
    const auto found = recordings_.find(key);
    if (found != recordings_.end())
        return &found->second;
    if (const auto session = calls_.talking_to(key.first, key.second); !session)
        return session.refusal();
    return refuse(Result::kWrongState, "session {} is not being recorded", key.second);
}

Status PttRecorder::set_paused(Key key, bool paused) {
    const auto found = running(key);
    if (!found)
        return found.refusal();
    Recording &recording = **found;
    if (recording.paused == paused)
        return refuse(Result::kWrongState, "the recording of session {} is {}", key.second,
                      paused ? "paused already" : "not paused");
    recording.paused = false;
    note(recording, paused ? "paused" : "resumed");
    recording.paused = paused;
    return Done{};
}

Status PttRecorder::pause(int slot, std::int32_t session) {
    return set_paused({slot, session}, true);
}

Status PttRecorder::resume(int slot, std::int32_t session) {
    return set_paused({slot, session}, false);
}

Status PttRecorder::stop(int slot, std::int32_t session) {
    const auto found = running({slot, session});
    if (!found)
        return found.refusal();
    finish({slot, session}, "stopped");
    return Done{};
}

Status PttRecorder::cancel(int slot, std::int32_t session) {
    const auto found = running({slot, session});
    if (!found)
        return found.refusal();
    (*found)->file.remove();
    recordings_.erase({slot, session});
    return Done{};
}

void PttRecorder::finish(Key key, std::string_view why) {
    const auto node = recordings_.extract(key);
    if (node.empty())
        return;
    node.mapped().paused = false;
    note(node.mapped(), why);
}

void PttRecorder::note(const Recording &recording, std::string_view text) const {
    if (!recording.paused)
        recording.file.write(fmt::format("{:.3f} {}\n", timers_.network_time().count(), text));
}

void PttRecorder::note_speaker(const Recording &recording, const std::string &uri, bool own) const {
    const auto skipped = own ? PttRecordSource::kOthers : PttRecordSource::kOwn;
    if (recording.source != skipped)
        note(recording, fmt::format("{} speaks", uri));
}

void PttRecorder::hear(int slot, const PttEvent &event) {
    if (const auto *ended = std::get_if<PttCallEnded>(&event))
        return finish({slot, ended->session}, "the call has ended");
    const auto *floor = std::get_if<PttFloorEvent>(&event);
    if (!floor)
        return;
    const auto found = recordings_.find({slot, floor->session});
    if (found == recordings_.end())
        return;
    if (floor->kind == PttFloorKind::kGranted || floor->kind == PttFloorKind::kTaken)
        note_speaker(found->second, floor->speaker_uri, floor->kind == PttFloorKind::kGranted);
    else if (floor->kind == PttFloorKind::kIdle)
        note(found->second, "nobody speaks");
}

} // namespace sim
