// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <csignal>

namespace Host {

/// While it lives, the first SIGINT (Ctrl-C) is only noted; a second one ends the process, as ever. Where the
/// signal was ignored it stays so. There is one at a time.
class Interrupt
{
public:
    Interrupt();
    Interrupt(const Interrupt&) = delete;
    Interrupt& operator=(const Interrupt&) = delete;
    ~Interrupt();

    bool isRaised() const;

private:
    struct sigaction m_before = {};
};

} // namespace Host
