// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/analysis/BeatDetection.h>
#include <EditorModel/analysis/Stabilization.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Composition.h>
#include <EditorModel/timeline/Timeline.h>

#include <QString>

#include <cstddef>
#include <deque>

namespace Testing {

/// A timeline with all that one can hold, and all that it points at: three timelines nested in a ring, clips
/// of every type and source, links and transitions of every shape, objects that several clips share beside
/// objects that are only equal. It owns everything, so that a test can change any of it.
///
/// Clips have names of their own, and transitions identifiers.
class FullTimeline
{
public:
    FullTimeline();
    FullTimeline(const FullTimeline&) = delete;
    FullTimeline& operator=(const FullTimeline&) = delete;

    /// The clip must be there.
    Timeline::Clip& clip(const char* name);

    /// Gives values to the fields that no document keeps.
    void setFieldsThatAreNotStored();

    /// How many objects there are for pointers to name.
    std::size_t objectCount() const;

    Timeline::Object timeline;
    /// Shown by a clip of `timeline`; one of its clips shows `timeline` again.
    Timeline::Object nested;
    /// Shown by a clip of `nested`, and by one of its own.
    Timeline::Object innermost;

    std::deque<Timeline::Clip> clips;
    std::deque<Timeline::Track> tracks;
    std::deque<Timeline::Label> labels;
    std::deque<Transition::Object> transitions;
    std::deque<Media::File> files;
    std::deque<Media::File::Track::Video> videoTracks;
    std::deque<Media::File::Track::Audio> audioTracks;
    std::deque<Effect::Object> effects;
    std::deque<VolumeEnvelope> volumeEnvelopes;
    std::deque<TransformationEnvelope> transformationEnvelopes;
    std::deque<Overlay::Preset> overlays;
    std::deque<Quiz::Preset> quizzes;
    std::deque<BeatDetection::Object> rhythms;
    std::deque<Stabilization::Object> stabilizations;

private:
    void addFiles();
    void addTracks();
    void addEffects();
    void addEnvelopes();
    void addPresets();
    void addAnalyses();
    void addIntro();
    void addPictures();
    void addSound();
    void addOverlays();
    void addNestedClips();
    void addLabels();
    void addLinks();
    void addTransitions();

    Timeline::Clip& addClip(Timeline::Object& owner, const char* name, Timeline::Clip::ClipType type,
                            const Timeline::ClipTiming& timing);

    Composition::Range m_range;
    Composition::Object m_composition;
};

} // namespace Testing
