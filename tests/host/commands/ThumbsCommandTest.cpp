// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/shared/Pictures.h"

#include "host/project/ProjectDocument.h"
#include "host/timeline/TimelineClipBox.h"
#include "host/timeline/TimelinePicture.h"
#include "host/timeline/TimelineStyle.h"

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using Host::ProjectDocument;
using Host::TimelinePicture;
using testing::IsEmpty;

/// A project of a patch that goes over grey for a second.
class ThumbsCommand : public testing::Test
{
protected:
    ThumbsCommand()
    {
        m_folder.copy("patch.mkv", "patch.mkv");
        EXPECT_EQ(editormodel({"new", "film.json", "--media", "patch.mkv"}, m_folder.path()).errors, "");
    }

    Outcome thumbs(const QStringList& more = {"film.png"}) const
    {
        return editormodel(QStringList{"thumbs", "film.json"} + more, m_folder.path());
    }

    /// The colour at a place in the body of the first clip's box, and in the lane behind it.
    QColor colourAt(double right, double down) const
    {
        const ProjectDocument document = ProjectDocument::load(m_folder.path("film.json"));
        const TimelinePicture picture(document.timeline(), "film");
        const QRectF body = Host::clipBody(picture.layout().boxOf(picture.outline().clips().front()));
        const QImage image(m_folder.path("film.png"));
        return image.pixelColor((QPointF(body.left() + right, body.top() + down) * Host::pngScale).toPoint());
    }

    const Folder m_folder{};
};

// A body of 37 units has pictures of 49.3 x 37. In picture n of 25 in a second the patch of 40 x 32 is at
// (22 + 2 n, 31 + n) of 160 x 120.
const QColor grey(128, 128, 128);

TEST_F(ThumbsCommand, DrawsPicturesIntoTheBoxes)
{
    const Outcome outcome = thumbs();
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_THAT(outcome.errors, IsEmpty());
    EXPECT_THAT(outcome.output, IsEmpty());
    // Left of the patch in the first picture, and right of it in the second.
    EXPECT_TRUE(isNear(colourAt(3.0, 33.0), grey)) << nameOf(colourAt(3.0, 33.0));
    EXPECT_TRUE(isNear(colourAt(49.3 + 45.0, 33.0), grey)) << nameOf(colourAt(94.3, 33.0));
    // Picture 10 is 604 ms from the start, in picture 15, where the patch is 16 to 28.4 units from the left.
    EXPECT_FALSE(isNear(colourAt(10 * 49.333 + 21.0, 21.0), grey));
    EXPECT_TRUE(isNear(colourAt(10 * 49.333 + 10.0, 21.0), grey));
    EXPECT_TRUE(isNear(colourAt(10 * 49.333 + 33.0, 21.0), grey));
    // The strip above is not covered.
    EXPECT_TRUE(isNear(colourAt(200.0, -8.0), Host::Style::coloursOf(Host::PictureKind).strip));
}

TEST_F(ThumbsCommand, DrawsPlainBoxesWhereMediaAreMissing)
{
    QFile::remove(m_folder.path("patch.mkv"));
    const Outcome outcome = thumbs();
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_EQ(outcome.errors, m_folder.path("patch.mkv").toStdString() + ": does not exist\n");
    EXPECT_TRUE(isNear(colourAt(94.3, 33.0), Host::Style::coloursOf(Host::PictureKind).body));
}

TEST_F(ThumbsCommand, DrawsReversedAndRetimedClips)
{
    ASSERT_EQ(
        editormodel({"edit", "film.json", "reverse", "1", "then", "speed", "1", "2"}, m_folder.path()).errors,
        "");
    EXPECT_THAT(thumbs().errors, IsEmpty());
    // The last picture of the video comes first: the patch is 21.6 to 33.9 units from the left.
    EXPECT_TRUE(isNear(colourAt(12.0, 33.0), grey));
    EXPECT_FALSE(isNear(colourAt(27.0, 25.0), grey));
}

TEST_F(ThumbsCommand, NamesThePictureItself)
{
    EXPECT_EQ(thumbs({}).output, "film-thumbs.png\n");
    EXPECT_FALSE(QImage(m_folder.path("film-thumbs.png")).isNull());
    EXPECT_EQ(thumbs({"film.gif"}).exitCode, 1);
}

TEST_F(ThumbsCommand, DrawsAnEmptyTimeline)
{
    const Timeline::Object empty;
    Document::saveFile(m_folder.path("empty.json"), {&empty}, Document::Json, Document::Stream);
    EXPECT_EQ(editormodel({"thumbs", "empty.json", "empty.png"}, m_folder.path()).exitCode, 0);
    EXPECT_FALSE(QImage(m_folder.path("empty.png")).isNull());
}

} // namespace
