#pragma once
#include <chrono>
#include <filesystem>
#include <string>
#include <thread>

#include "launch/GameLauncher.h"
#include "platform/PosixProcessLauncher.h"
#include "support/FixedLog.h"
#include "support/RecordingSpeechEngine.h"
#include "support/ScriptedPrompt.h"

namespace qv::test {

// RunGame's collaborators on a real application folder, log and process launcher; speech and
// message boxes are recorded.
struct LaunchFixture : LogFixture {
    Options options;
    MyClass records;
    PosixProcessLauncher launcher;
    GameWatch watch{launcher};
    RecordingSpeechEngine engine;
    Speaker speaker{engine, options, log};
    ScriptedPrompt prompt;

    LaunchFixture() {
        speaker.SetReady(true);
        options.Sound = true;
        options.Joystick = false;
        options.LogGameOutput = true;
    }
    GameLauncherServices Services() {
        return {records, options, HostConventions::Posix(), dir.path().string(), log, launcher,
                watch, speaker, prompt, clock, regional};
    }
    // MamePath is the program's folder, MameExec its name.
    void UseEmulator(const std::filesystem::path& program) {
        options.MamePath = program.parent_path().string() + "/";
        options.MameExec = program.filename().string();
    }
    MyClass& AddGame(const std::string& key, const std::string& title) {
        MyClass* game = records.Add(key);
        game->RomFile = key;
        game->Title = title;
        game->Working = game->Present = true;
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
};

}  // namespace qv::test
