#pragma once

namespace qv {

// Lets pending window events run in the middle of long work on the one UI thread.
class EventYield {
public:
    virtual ~EventYield() = default;
    virtual void Yield() = 0;
};

// For code that runs without a window (tests, benchmarks).
class NoEventYield final : public EventYield {
public:
    void Yield() override { ++yields; }
    long yields = 0;
};

}  // namespace qv
