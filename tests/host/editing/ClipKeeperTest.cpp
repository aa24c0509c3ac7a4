// SPDX-License-Identifier: Apache-2.0
#include "EditFixture.h"

#include "host/editing/ClipKeeper.h"

namespace {

using namespace EditTests;
using Host::ClipKeeper;
using testing::ElementsAre;
using testing::IsEmpty;
using Lines = std::vector<std::string>;

/// Another module that watches clips, and writes down what becomes of them.
class ClipWatcher : public Message::View<Clip>
{
public:
    void watch(const Clip* clip)
    {
        observe(clip);
        lines.clear();
    }

    Lines lines;

private:
    static std::string textOf(const Clip& clip)
    {
        return clip.name.toStdString() + " " + std::to_string(clip.volume) + (clip.enabled ? " on" : " off");
    }

    using View::changed;
    void changed(const Clip* clip, const Clip* oldValue) override
    {
        lines.push_back(textOf(*oldValue) + " -> " + textOf(*clip));
    }
    void removed(const Clip* clip) override { lines.push_back("without " + clip->name.toStdString()); }
};

/// A film of 4 s with its sound, music of 2 s, and a title.
class KeptClips : public EditFixture
{
protected:
    KeptClips()
    {
        done(session.append({film, primary, 0, 0, 4000, filmSound}));
        lay(music, audio, 0, 2000);
        lay(heading, title, 0, 2000);
        for (const Clip* const clip : {film, filmSound, music, heading}) {
            watched.watch(clip);
        }
    }

    Clip* film = picture("film");
    Clip* filmSound = sound("film's sound");
    Clip* music = sound("music");
    Clip* heading = overlay("heading");
    ClipKeeper keeper{session.timeline()};
    ClipWatcher watched;
};

TEST_F(KeptClips, AreSwitchedWithTheirSound)
{
    EXPECT_TRUE(keeper.setEnabled(film, false));
    EXPECT_THAT(watched.lines,
                ElementsAre("film 100 on -> film 100 off", "film's sound 100 on -> film's sound 100 off"));
    watched.lines.clear();
    EXPECT_TRUE(keeper.setEnabled(heading, false));
    EXPECT_TRUE(keeper.setEnabled(film, true));
    EXPECT_THAT(watched.lines, ElementsAre("heading 100 on -> heading 100 off", "film 100 off -> film 100 on",
                                           "film's sound 100 off -> film's sound 100 on"));
    EXPECT_EQ(watcher.changes, 0);
}

TEST_F(KeptClips, OfSoundAreSwitchedByThemselves)
{
    EXPECT_TRUE(keeper.setEnabled(filmSound, false));
    EXPECT_TRUE(keeper.setEnabled(music, false));
    EXPECT_THAT(watched.lines,
                ElementsAre("film's sound 100 on -> film's sound 100 off", "music 100 on -> music 100 off"));
    EXPECT_TRUE(film->enabled);
}

TEST_F(KeptClips, AnnounceNothingWhereTheyAreAsWishedAlready)
{
    EXPECT_TRUE(keeper.setEnabled(film, true));
    EXPECT_TRUE(keeper.setVolume(music, 100));
    EXPECT_THAT(watched.lines, IsEmpty());
    // Only the sound is off.
    EXPECT_TRUE(keeper.setEnabled(filmSound, false));
    watched.lines.clear();
    EXPECT_TRUE(keeper.setEnabled(film, false));
    EXPECT_THAT(watched.lines, ElementsAre("film 100 on -> film 100 off"));
}

TEST_F(KeptClips, HaveTheVolumeOfTheirSound)
{
    EXPECT_TRUE(keeper.setVolume(music, 0));
    EXPECT_TRUE(keeper.setVolume(film, 250));
    EXPECT_TRUE(keeper.setVolume(filmSound, 80));
    EXPECT_THAT(watched.lines,
                ElementsAre("music 100 on -> music 0 on", "film's sound 100 on -> film's sound 250 on",
                            "film's sound 250 on -> film's sound 80 on"));
    EXPECT_EQ(film->volume, 100);
}

TEST_F(KeptClips, RefuseAVolumeThatMakesNoSense)
{
    Clip* const elsewhere = sound("elsewhere");
    EXPECT_EQ(keeper.setVolume(heading, 50).refusal,
              "The clip \"heading\" at 00:00:00.000 has no sound, and so no volume.");
    EXPECT_EQ(keeper.setVolume(music, -1).refusal,
              "The clip \"music\" at 00:00:00.000 can't have a volume of -1 %.");
    EXPECT_EQ(keeper.setVolume(elsewhere, 50).refusal, "The clip \"elsewhere\" is not on the timeline.");
    EXPECT_EQ(keeper.setEnabled(elsewhere, false).refusal, "The clip \"elsewhere\" is not on the timeline.");
    EXPECT_EQ(keeper.setEnabled(nullptr, false).refusal, "There is no clip to edit.");
    EXPECT_THAT(watched.lines, IsEmpty());
    EXPECT_EQ(elsewhere->volume, 100);
}

TEST_F(KeptClips, ComeAndGoWithTheTimeline)
{
    const EditResult cut = session.split(music, 1000);
    ASSERT_TRUE(cut);
    EXPECT_TRUE(watched.enumerateAll().count(cut.clip));
    EXPECT_TRUE(keeper.setVolume(cut.clip, 30));
    EXPECT_EQ(cut.clip->volume, 30);
    EXPECT_EQ(music->volume, 100);
    EXPECT_TRUE(session.lift(music));
    EXPECT_THAT(watched.lines, ElementsAre("without music"));
    EXPECT_FALSE(watched.enumerateAll().count(music));
}

TEST_F(KeptClips, AreChangedForOtherModulesToo)
{
    watched.change(music)->setVolume(70)->setName("loud");
    EXPECT_THAT(watched.lines, ElementsAre("music 100 on -> loud 70 on"));
    watched.lines.clear();
    watched.change(music)->setVolume(-70);
    watched.change(music)->setType(Clip::VideoClip);
    watched.change(music)->setSourceDuration(5);
    watched.change(music)->setUnlimitedDuration(true);
    watched.change(music)->setTimeline(nullptr);
    watched.change(film)->setNestedTimeline(session.timeline());
    watched.remove(music);
    EXPECT_THAT(watched.lines, IsEmpty());
    EXPECT_EQ(music->volume, 70);
    EXPECT_EQ(music->type, Clip::AudioClip);
    EXPECT_TRUE(watched.enumerateAll().count(music));
    // A volume that was negative before is no reason not to switch the clip off.
    Clip* const strange = sound("strange");
    strange->setVolume(-5);
    lay(strange, audio, 2000, 1000);
    watched.watch(strange);
    watched.change(strange)->setEnabled(false);
    EXPECT_FALSE(strange->enabled);
}

TEST_F(KeptClips, AreLetGoWithTheirKeeper)
{
    Clip* const theme = sound("theme");
    EditSession other;
    {
        Track* const track = other.makeTrack(AudioTrack);
        EXPECT_TRUE(other.addTrack(track));
        theme->setTimeline(other.timeline());
        EXPECT_TRUE(other.append({theme, track}));
        const ClipKeeper brief(other.timeline());
        watched.watch(theme);
        EXPECT_TRUE(watched.enumerateAll().count(theme));
    }
    EXPECT_THAT(watched.lines, ElementsAre("without theme"));
    EXPECT_FALSE(watched.enumerateAll().count(theme));
}

/// A module that owns a clip already, and lets others set no volume.
class StubbornOwner : public Message::View<Clip>
{
    void changeRequested(Clip* clip, Clip* value) override
    {
        if (value->volume == clip->volume) {
            View::changeRequested(clip, value);
        }
    }
};

TEST_F(EditFixture, LeavesAClipToTheModuleThatOwnsIt)
{
    Clip* const music = sound("music");
    lay(music, audio, 1000, 2000);
    StubbornOwner owner;
    owner.own(music);
    {
        ClipKeeper keeper(session.timeline());
        EXPECT_TRUE(keeper.setEnabled(music, false));
        EXPECT_FALSE(music->enabled);
        EXPECT_EQ(keeper.setVolume(music, 50).refusal,
                  "The clip \"music\" at 00:00:01.000 is not changed by the module that owns it.");
        EXPECT_EQ(music->volume, 100);
    }
    EXPECT_TRUE(owner.isOwned(music));
}

} // namespace
