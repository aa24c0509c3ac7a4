// SPDX-License-Identifier: Apache-2.0
#include "host/commands/Interrupt.h"

namespace Host {
namespace {

volatile std::sig_atomic_t raised = 0;

void note(int)
{
    raised = 1;
}

} // namespace

Interrupt::Interrupt()
{
    raised = 0;
    sigaction(SIGINT, nullptr, &m_before);
    if (m_before.sa_handler == SIG_IGN) {
        return;
    }
    struct sigaction noting = {};
    noting.sa_handler = note;
    sigemptyset(&noting.sa_mask);
    // Files that are being read are read on; the second signal finds the default again.
    noting.sa_flags = static_cast<int>(SA_RESTART | SA_RESETHAND);
    sigaction(SIGINT, &noting, nullptr);
}

Interrupt::~Interrupt()
{
    sigaction(SIGINT, &m_before, nullptr);
}

bool Interrupt::isRaised() const
{
    return raised != 0;
}

} // namespace Host
