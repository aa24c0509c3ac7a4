// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/timeline/Timeline.h>

#include <functional>
#include <vector>

namespace Host {

/// The module that owns the clips of one timeline, those that edits bring among them, and changes what a clip
/// says of itself. When it plays is the timeline's affair.
///
/// Native audio goes with the clip that it belongs to: a clip is switched together with its sound, and the
/// volume of a video is that of its sound. Native audio may be switched and set by itself as well.
///
/// Requests from other modules to change a clip are granted unless they bring a negative volume, or another
/// timeline, type, source duration or nested timeline, by which the timeline's rules go; requests to remove
/// one are refused. A clip that another module owns is left to it, and changed by asking.
class ClipKeeper : private Message::View<Timeline::Clip>,
                   private PubSub::Subscriber<Message::Types::Changed<Timeline::Object>>
{
public:
    /// The timeline and its clips outlive the keeper; nobody has claimed the clips constant.
    explicit ClipKeeper(const Timeline::Object* timeline);
    ClipKeeper(const ClipKeeper&) = delete;
    ClipKeeper& operator=(const ClipKeeper&) = delete;
    /// Ends the sharing of the clips.
    ~ClipKeeper() override;

    /// A clip that is as wished already is left as it is.
    EditResult setEnabled(const Timeline::Clip* clip, bool on);
    /// In percent of the source's. Refused where it is negative, and for a clip without sound.
    EditResult setVolume(const Timeline::Clip* clip, int percent);

private:
    using Clip = Timeline::Clip;
    using ClipView = Message::View<Clip>;
    using Clips = std::vector<const Clip*>;

    void notify(const Message::Types::Changed<Timeline::Object>& message) override;
    void changeRequested(Clip* clip, Clip* value) override;
    void removeRequested(Clip* clip) override;

    void follow();
    void letGo(const Clip* clip);
    Clips nativeAudioOf(const Clip* clip) const;
    EditResult set(const Clips& clips, const std::function<bool(const Clip&)>& isSet,
                   const std::function<void(Clip&)>& setter);

    const Timeline::Object* m_timeline;
};

} // namespace Host
