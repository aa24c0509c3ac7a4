// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "Command.h"
#include "tests/host/shared/Samples.h"

#include "host/project/ProjectDocument.h"
#include "host/timeline/TimelineOutline.h"

#include <gtest/gtest.h>

#include <cstddef>

namespace HostTests {

/// A project of a film of 2 s with its sound, a picture, a longer film with its sound, which begins at 6 s
/// and lasts 4 s, and speech of 1.5 s. The clips have the numbers 1 to 3, their sounds 4 and 5, the speech 6.
class FilmProject
{
public:
    FilmProject()
    {
        const Outcome made = editormodel(
            {"new", path(), "--media", "film.mp4", "picture.png", "long.mkv", "speech.wav"}, sample(""));
        EXPECT_EQ(made.exitCode, 0);
        EXPECT_EQ(made.errors, "");
        EXPECT_EQ(made.output, "");
    }

    QString path() const { return m_folder.path("film.json"); }

    Outcome edit(const QString& words) const
    {
        return editormodel(QStringList({"edit", path()}) + words.split(' '), sample(""));
    }

    /// The edit must succeed.
    Host::ProjectDocument edited(const QString& words) const
    {
        const Outcome outcome = edit(words);
        EXPECT_EQ(outcome.exitCode, 0) << words.toStdString();
        EXPECT_EQ(outcome.errors, "");
        EXPECT_EQ(outcome.output, "");
        return Host::ProjectDocument::load(path());
    }

private:
    const Folder m_folder{};
};

inline const Timeline::Clip* clipAt(const Host::ProjectDocument& document, int number)
{
    return Host::TimelineOutline(document.timeline()).clips().at(static_cast<std::size_t>(number) - 1);
}

inline const Timeline::ClipTiming& timingAt(const Host::ProjectDocument& document, int number)
{
    return document.timeline().clipTiming(clipAt(document, number));
}

} // namespace HostTests
