// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/playback/PlaybackViews.h"

#include <EditorModel/services/Device.h>
#include <EditorModel/timeline/Timeline.h>

namespace Host {

/// The module that plays a timeline: it owns the playback with its position, and every sound output that is
/// added on the bus, which plays this playback from then on. Whoever knows the playback may stop it.
///
/// It renders nothing. It moves the position, and those who observe that do what there is to be done.
class Player : private PlayerViewBase, private MarkerViewBase
{
public:
    enum Pace : int
    {
        /// A step takes as long as it is.
        RealTime,
        /// Without waiting.
        Dry,
    };

    /// The timeline outlives the player, and all of it is played.
    explicit Player(const Timeline::Object& timeline);
    Player(const Player&) = delete;
    ~Player() override;

    /// The playback.
    using PlayerViewBase::player;

    /// Plays from the beginning: the position goes from one multiple of `step`, which is more than zero, to
    /// the next as long as they are before the end of the timeline. Then the playback stops, and the position
    /// is set to the end. Where somebody else stops the playback, the position stays where it is.
    void play(MTime step, Pace pace);

private:
    using AudioOutput = Device::Output<Media::Audio>;

    class Outputs : public Message::View<AudioOutput>
    {
    public:
        explicit Outputs(const Playback::Object& playback);
        void release();

    protected:
        void addRequested(AudioOutput* output) override;

    private:
        const Playback::Object& m_playback;
    };

    bool isPlaying() const { return m_playback.state == Playback::Object::Playing; }

    Playback::Object m_playback;
    Composition::Marker m_position;
    const Composition::Range m_range;
    Outputs m_outputs{m_playback};
};

} // namespace Host
