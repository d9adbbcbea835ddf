// A stand-in for the emulator, started as a real process by the launch tests.
// Usage: test_emulator [--classic|--current] [--seconds N] [--fps X | --speed X] [anything...]
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <thread>

int main(int argc, char** argv) {
    bool classic = false;
    double seconds = 0;
    std::string fps, speed;
    for (int i = 1; i < argc; ++i) {
        const std::string arg = argv[i];
        if (arg == "--classic") classic = true;
        else if (arg == "--current") classic = false;
        else if (arg == "--seconds" && i + 1 < argc) seconds = std::atof(argv[++i]);
        else if (arg == "--fps" && i + 1 < argc) fps = argv[++i];
        else if (arg == "--speed" && i + 1 < argc) speed = argv[++i];
    }
    if (classic)
        std::printf("M.A.M.E. v0.78 (Nov  1 2003) - Multiple Arcade Machine Emulator\n");
    else
        std::printf("MAME v0.251 (unknown)\n");
    std::printf("arguments:");
    for (int i = 1; i < argc; ++i) std::printf(" [%s]", argv[i]);
    std::printf("\n");
    std::fflush(stdout);
    if (seconds > 0)
        std::this_thread::sleep_for(std::chrono::milliseconds(static_cast<long>(seconds * 1000)));
    if (!fps.empty()) std::printf("Average FPS: %s (%d frames)\n", fps.c_str(), 600);
    if (!speed.empty()) std::printf("Average speed: %s%% (%d seconds)\n", speed.c_str(), static_cast<int>(seconds));
    return 0;
}
