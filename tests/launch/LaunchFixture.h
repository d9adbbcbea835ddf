#pragma once
#include <chrono>
#include <ctime>
#include <filesystem>
#include <string>
#include <thread>

#include "app/ActivityLog.h"
#include "launch/GameLauncher.h"
#include "launch/GameWatch.h"
#include "platform/EventYield.h"
#include "platform/PosixProcessLauncher.h"
#include "platform/Regional.h"
#include "reference/Speaker.h"
#include "support/RecordingSpeechEngine.h"
#include "support/ScriptedPrompt.h"
#include "support/TempDir.h"

namespace qv::test {

// RunGame's collaborators with a real application folder, a real activity log and the real
// process launcher; speech and message boxes are recorded.
struct LaunchFixture {
    struct FixedClock final : Clock {
        std::time_t Now() const override { return 1079537400; }
    };

    TempDir app;
    EnglishRegional regional;
    FixedClock clock;
    NoEventYield yield;
    ActivityLog log{app / "quorvane.log", regional, clock, yield};
    Options options;
    MyClass records;
    PosixProcessLauncher launcher;
    GameWatch watch{launcher};
    RecordingSpeechEngine engine;
    Speaker speaker{engine, options, log};
    ScriptedPrompt prompt;

    LaunchFixture() {
        log.SetEnabled(true);
        speaker.SetReady(true);
        options.Sound = true;
        options.Joystick = false;
        options.LogGameOutput = true;
    }

    GameLauncherServices Services() {
        return GameLauncherServices{records, options, HostConventions::Posix(),
                                    app.path().string(), log, launcher, watch, speaker,
                                    prompt, clock, regional};
    }

    // Uses the given program as the emulator: MamePath is its folder, MameExec its name.
    void UseEmulator(const std::filesystem::path& program) {
        options.MamePath = program.parent_path().string() + "/";
        options.MameExec = program.filename().string();
    }

    MyClass& AddGame(const std::string& key, const std::string& title) {
        MyClass* game = records.Add(key);
        game->RomFile = key;
        game->Title = title;
        game->Working = true;
        game->Present = true;
        return *game;
    }

    // Ticks the watch every `interval` until the game has ended (at most `limit`).
    GameWatch::TickResult TickUntilEnd(const std::string& selectedKey,
                                       std::chrono::milliseconds interval,
                                       std::chrono::seconds limit = std::chrono::seconds(30)) {
        const auto deadline = std::chrono::steady_clock::now() + limit;
        while (std::chrono::steady_clock::now() < deadline) {
            std::this_thread::sleep_for(interval);
            const GameWatch::TickResult tick = watch.Tick(records, selectedKey);
            if (tick.ended) return tick;
        }
        return {};
    }

    std::string LogText() const { return app.Read("quorvane.log"); }
};

}  // namespace qv::test
