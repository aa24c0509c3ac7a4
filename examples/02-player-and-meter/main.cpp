// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/VUMeter.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/media/Audio.h>
#include <EditorModel/services/Playback.h>

#include <iostream>

class Player : public Message::View<Playback::Object>
{
public:
    Player() { own(&m_playback); }
    ~Player() override { remove(&m_playback); } // everybody lets go of it before it ends

private:
    // The owner's word on a request.
    void changeRequested(Playback::Object* playback, Playback::Object* wanted) override
    {
        if (wanted->state == Playback::Object::Playing && !wanted->audio) {
            std::cout << "player: nothing to play\n";
            return; // refused, and nobody hears of it
        }
        View::changeRequested(playback, wanted); // granted: written, and everybody is told
    }

    Playback::Object m_playback;
};

class Meter : public Message::View<Playback::Object> // watches the player
{
public:
    Meter()
    {
        m_levels.own(&m_level)->setSourceID("player");
        observeAll();
    }
    ~Meter() override { m_levels.remove(&m_level); }

    /// What the sound card reports: the amplitude of the sound, from 0 to 1.
    void heard(double amplitude)
    {
        const Playback::Object* playback = object();
        if (playback && playback->state == Playback::Object::Playing) {
            m_levels.change(&m_level)->setLeftChannelLevel(Decibel::fromRelativeLevel(amplitude));
        }
    }

private:
    VUMeter::Object m_level;
    Message::View<VUMeter::Object> m_levels; // owns the level
};

class Window : public Message::View<VUMeter::Object> // knows neither of the two
{
public:
    Window() { observeAll(); }

private:
    void changed(const VUMeter::Object* level, const VUMeter::Object*) override
    {
        std::cout << level->sourceID.toStdString() << ": " << level->leftChannelLevel.level() << " dB\n";
    }
};

int main()
{
    const Media::Audio music; // outlives all that points at it
    const Player player;
    Meter meter;
    const Window window;

    Message::View<Playback::Object> button;
    button.observeAll();
    button.change(button.object())->play();                   // refused
    button.change(button.object())->setAudio(&music)->play(); // granted
    meter.heard(0.1);
    meter.heard(1.0);
    button.change(button.object())->stop();
    meter.heard(0.5); // nothing plays
}
