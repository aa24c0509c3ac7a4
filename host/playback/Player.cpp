// SPDX-License-Identifier: Apache-2.0
#include "host/playback/Player.h"

#include "host/timeline/TimelineOutline.h"

#include <chrono>
#include <thread>

namespace Host {

Player::Outputs::Outputs(const Playback::Object& playback) : m_playback(playback)
{
    processAddRequests();
}

/// They outlive the playback.
void Player::Outputs::release()
{
    for (const AudioOutput* output : objects()) {
        change(output)->setPlayback(nullptr);
    }
}

void Player::Outputs::addRequested(AudioOutput* output)
{
    output->setPlayback(&m_playback);
    View::addRequested(output);
}

Player::Player(const Timeline::Object& timeline) : m_range(0, lengthOf(timeline), 0, 0)
{
    markerOwn(&m_position);
    playerOwn(&m_playback)
        ->setVideo(&timeline)
        ->setAudio(&timeline)
        ->setPosition(&m_position)
        ->setBoundRange(&m_range);
}

Player::~Player()
{
    m_outputs.release();
    playerRemove(&m_playback);
    markerRemove(&m_position);
}

void Player::play(MTime step, Pace pace)
{
    const auto start = std::chrono::steady_clock::now();
    markerChange(&m_position)->setPosition(m_range.from);
    if (m_range.empty()) {
        return;
    }
    playerChange(&m_playback)->play();
    while (isPlaying() && step < m_range.to - m_position.position) {
        const MTime next = m_position.position + step;
        if (pace == RealTime) {
            std::this_thread::sleep_until(start + std::chrono::milliseconds(next));
        }
        markerChange(&m_position)->setPosition(next);
    }
    if (isPlaying()) {
        playerChange(&m_playback)->stop();
        markerChange(&m_position)->setPosition(m_range.to);
    }
}

} // namespace Host
