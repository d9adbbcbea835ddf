#pragma once
#include <ctime>

namespace qv {

// Wall-clock time, behind an interface so tests can fix "now".
class Clock {
public:
    virtual ~Clock() = default;
    virtual std::time_t Now() const = 0;
};

class SystemClock final : public Clock {
public:
    std::time_t Now() const override { return std::time(nullptr); }
};

}  // namespace qv
