#pragma once

namespace qv {

// Start-up: the run header, settings, library and the first window; returns the exit code.
int RunQuorvane(int argc, char** argv);

}  // namespace qv
