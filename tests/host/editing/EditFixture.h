// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "Edits.h"

#include <gmock/gmock.h>

#include <limits>
#include <string>
#include <vector>

namespace EditTests {

/// A session with a track of each kind, and a module that watches. Every move goes through done() or
/// refused().
class EditFixture : public testing::Test
{
protected:
    EditFixture()
    {
        for (const Track* const added : {primary, extra, native, audio, title}) {
            done(session.addTrack(added));
        }
    }

    /// The source is 10 s long unless it is told otherwise.
    Clip* clip(const char* name, Clip::ClipType type, MTime source)
    {
        Clip* const made = session.makeClip(type);
        return made->setName(name)->setSourceDuration(source);
    }
    Clip* picture(const char* name, MTime source = 10000) { return clip(name, Clip::VideoClip, source); }
    Clip* sound(const char* name, MTime source = 10000) { return clip(name, Clip::AudioClip, source); }
    Clip* overlay(const char* name) { return clip(name, Clip::OverlayClip, 10000); }
    /// Of 2 s, where nothing is wished.
    Transition::Object* transition() { return session.makeTransition("dissolve"); }

    void lay(const Clip* laid, const Track* where, MTime at, MTime duration, int level = 0)
    {
        done(session.overwrite({laid, where, level, 0, duration}, at));
    }

    /// Lets a clip follow what is tracked in another one, as another module asks for it.
    void track(const Clip* follower, const Clip* followed)
    {
        watcher.change(session.timeline())
            ->addTrackingLink(follower, Timeline::TrackingLinkInfo({followed, "face"}, QPointF(1, 2)));
        watcher.changes = 0;
        m_before = now();
    }

    /// The move was done, and everybody has heard of one change.
    void done(const EditResult& result)
    {
        EXPECT_EQ(result.refusal, "");
        EXPECT_EQ(watcher.changes, 1);
        EXPECT_TRUE(haveSameContent(watcher.old, m_before));
        EXPECT_TRUE(haveSameContent(watcher.now, now()));
        EXPECT_THAT(faultTexts(now()), testing::IsEmpty());
        watcher.changes = 0;
        m_before = now();
    }

    /// The move was refused for a reason that names all of these, and nothing has changed.
    void refused(const EditResult& result, const std::vector<std::string>& named)
    {
        EXPECT_FALSE(result);
        for (const std::string& part : named) {
            EXPECT_THAT(result.refusal.toStdString(), testing::HasSubstr(part));
        }
        EXPECT_THAT(result.refusal.toStdString(), testing::EndsWith("."));
        EXPECT_EQ(watcher.changes, 0);
        EXPECT_TRUE(haveSameContent(m_before, now()));
    }

    const Timeline::Object& now() const { return *session.timeline(); }
    std::string row(const Track* shown) const { return EditTests::row(now(), shown); }
    std::vector<std::string> links() const { return linkTexts(now()); }

    EditSession session;
    Watcher watcher{session.timeline()};
    Track* primary = session.makeTrack(PrimaryTrack);
    Track* extra = session.makeTrack(ExtraVideoTrack);
    Track* native = session.makeTrack(NativeAudioTrack);
    Track* audio = session.makeTrack(AudioTrack);
    Track* title = session.makeTrack(TitleTrack);

private:
    Timeline::Object m_before;
};

/// Three clips in a row on the primary track, and one that lies nowhere.
class ThreeInARow : public EditFixture
{
protected:
    ThreeInARow()
    {
        lay(a, primary, 0, 1000);
        lay(b, primary, 1000, 2000);
        lay(c, primary, 3000, 1000);
    }

    Clip* a = picture("a");
    Clip* b = picture("b");
    Clip* c = picture("c");
    Clip* x = picture("x");
};

} // namespace EditTests
