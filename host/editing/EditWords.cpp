// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EditWords.h"

#include "host/commands/Refusal.h"
#include "host/text/TimeText.h"
#include "host/timeline/TimelineOutline.h"

#include <cmath>

namespace Host {

using Timeline::Clip;

namespace {

/// The sound of a video has its name, and is edited by way of the video.
bool isPartOfVideo(const Timeline::Object& timeline, const Clip* clip)
{
    return timeline.isNativeAudio(clip) && timeline.isSlave(clip);
}

} // namespace

QString quoted(const QString& word)
{
    return '"' + word + '"';
}

void reject(const QString& why)
{
    throw Refusal(QString(), why);
}

MTime timeAt(const QString& word)
{
    const auto time = timeOfText(word);
    if (!time) {
        reject(quoted(word) + " is no time: 1:02.5, 62.5 and 62500ms are");
    }
    return *time;
}

const Clip* clipOf(const Timeline::Object& timeline, const std::vector<const Clip*>& clips,
                   const QString& word)
{
    const Clip* found = numbered(clips, word);
    if (!found) {
        for (const Clip* clip : clips) {
            if (timeline.contains(clip) && nameOf(*clip) == word && !isPartOfVideo(timeline, clip)) {
                if (found) {
                    reject("there are several clips " + quoted(word) + ": give the number of one");
                }
                found = clip;
            }
        }
    }
    if (!found || !timeline.contains(found)) {
        reject("there is no clip " + quoted(word));
    }
    return found;
}

double factorAt(const QString& word)
{
    bool isNumber = false;
    const double factor = word.toDouble(&isNumber);
    if (!isNumber || !std::isfinite(factor)) {
        reject(quoted(word) + " is no speed: 2 and 0.5 are");
    }
    return factor;
}

Ripple rippleAt(const QStringList& words, int index)
{
    if (words.size() <= index) {
        return Ripple::No;
    }
    if (words[index] != "ripple") {
        reject(quoted(words[index]) + " is not understood: \"ripple\" may stand there");
    }
    return Ripple::Yes;
}

TrackType roleAt(const QString& word)
{
    const QString role = QString(word).replace('-', ' ').toLower();
    for (const TrackType type :
         {PrimaryTrack, ExtraVideoTrack, NativeAudioTrack, AudioTrack, TitleTrack, QuizTrack}) {
        if (role == QString::fromStdString(roleText(type))) {
            return type;
        }
    }
    reject(quoted(word) + " is no role of a track: primary, extra-video, native-audio, audio, title and quiz "
                          "are");
}

double numberAt(const QString& word)
{
    bool isNumber = false;
    const double number = word.toDouble(&isNumber);
    if (!isNumber || !std::isfinite(number)) {
        reject(quoted(word) + " is no number");
    }
    return number;
}

int percentAt(const QString& word)
{
    bool isNumber = false;
    const int percent = word.toInt(&isNumber);
    if (!isNumber || percent < 0) {
        reject(quoted(word) + " is no volume: whole percents are, from 0 on");
    }
    return percent;
}

int levelAt(const QString& word)
{
    bool isLevel = false;
    const int level = word.toInt(&isLevel);
    if (!isLevel) {
        reject(quoted(word) + " is no level");
    }
    return level;
}

} // namespace Host
