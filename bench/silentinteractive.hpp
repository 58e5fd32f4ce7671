#pragma once

#include "shell/interactive.hpp"

namespace arbolex::bench {

/// Message boxes nobody sees; every question gets `answer`.
class SilentInteractive : public shell::IInteractive {
public:
    void message(const QString &, const QString &, int) override { ++messages; }
    bool askYesNo(const QString &, const QString &) override { return answer; }
    int messages = 0;
    bool answer = false;
};

} // namespace arbolex::bench
