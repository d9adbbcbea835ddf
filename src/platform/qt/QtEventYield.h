#pragma once
#include "platform/EventYield.h"

namespace qv {

// Lets Qt run pending events (painting, input, timers) once.
class QtEventYield final : public EventYield {
public:
    void Yield() override;
};

}  // namespace qv
