// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

/// The part that a track plays on its timeline. 0 is none.
enum TrackType : int
{
    PrimaryTrack = 16,
    ExtraVideoTrack = 32,
    NativeAudioTrack = 48,
    AudioTrack = 64,
    TitleTrack = 80,
    QuizTrack = 96,
};

namespace Timeline {

struct Object;

/// A row of the timeline that clips lie on.
struct EDITORMODEL_EXPORT Track : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Track)

public:
    TrackType type{};
    /// Silences the clips on the track.
    bool muted = false;
    /// Hides the clips on the track.
    bool hidden = false;
    /// Tells the linked audio track from the detached one.
    bool linked = false;
    /// Stored and compared, no more.
    bool gapless = false;
    /// What Timeline::Object::findUsedTracks() goes by.
    bool used = true;
    /// The timeline that holds the track; not owned. Orders of clips find the track's index through it.
    const Timeline::Object* timeline = nullptr;

    Track() = default;
    explicit Track(TrackType type_);
    Track(const Track&) = default;
    Track(Track&&) = default;
    Track& operator=(const Track&) = default;
    Track& operator=(Track&&) = default;
    ~Track() override;

    Track* setType(TrackType newType);
    Track* setMuted(bool on);
    Track* setHidden(bool on);
    Track* setLinked(bool on);
    Track* setGapless(bool on);
    Track* setUsed(bool on);
    Track* setTimeline(const Timeline::Object* newTimeline);
};

/// All fields are compared, the timeline by its address.
EDITORMODEL_EXPORT bool operator==(const Track& a, const Track& b);
EDITORMODEL_EXPORT bool operator!=(const Track& a, const Track& b);

} // namespace Timeline

EDITORMODEL_ARCHIVE_NAME(Timeline::Track, "Timeline::Track")
