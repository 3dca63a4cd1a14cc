// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/descriptor.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/model.hpp"

#include <cstdint>
#include <filesystem>
#include <map>
#include <string>
#include <string_view>
#include <utility>

namespace sim {

struct PttRecordRequest {
    std::int32_t session = 0;
    PttRecordSource source = PttRecordSource::kAll;
    std::int32_t longest = 0; // seconds; 0 without limit
    std::string path;         // empty: one of the stand-in's own
};

struct PttRecordingInfo {
    std::int32_t session = 0;
    PttRecordState state = PttRecordState::kRecording;
    std::int32_t error = 0;
    std::string path;
};

// The device's recordings of calls. There is no sound, so what a file holds is who spoke when, a
// line each.
class PttRecorder {
  public:
    PttRecorder(PttCalls &calls, Timers &timers) : calls_(calls), timers_(timers) {}

    Answer<PttRecordingInfo> start(int slot, const PttRecordRequest &request);
    Status pause(int slot, std::int32_t session);
    Status resume(int slot, std::int32_t session);
    // The file stays, or goes.
    Status stop(int slot, std::int32_t session);
    Status cancel(int slot, std::int32_t session);

    // What the slot is told of its calls.
    void hear(int slot, const PttEvent &event);

  private:
    // A file that did not exist before.
    class File {
      public:
        // 0, or what errno says.
        int create(const std::filesystem::path &path);
        void write(std::string_view text) const;
        // Whatever has taken its place in the directory meanwhile stays.
        void remove() const;

      private:
        Descriptor directory_; // the one it was made in, whatever its path leads to later
        std::string name_;
        Descriptor descriptor_;
    };
    struct Recording {
        File file;
        PttRecordSource source = PttRecordSource::kAll;
        bool paused = false;
        Timer limit;
    };
    using Key = std::pair<int, std::int32_t>; // slot and session

    Answer<Recording *> running(Key key);
    Status set_paused(Key key, bool paused);
    Answer<std::string> create(Key key, const std::string &path, File &file);
    void note(const Recording &recording, std::string_view text) const;
    void note_speaker(const Recording &recording, const std::string &uri, bool own) const;
    void finish(Key key, std::string_view why);

    PttCalls &calls_;
    Timers &timers_;
    std::map<Key, Recording> recordings_;
};

} // namespace sim
