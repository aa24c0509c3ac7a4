// SPDX-License-Identifier: Apache-2.0
// What a class knows at run time alone stays out of every form and comes back with its defaults.
#include "tests/shared/DocumentForms.h"

#include <EditorModel/media/Media.h>

#include <gtest/gtest.h>

namespace {

class RunTimeFields : public ::testing::TestWithParam<Way>
{};

INSTANTIATE_TEST_SUITE_P(Ways, RunTimeFields, ::testing::ValuesIn(allWays),
                         [](const auto& instance) { return std::string(instance.param.name); });

TEST_P(RunTimeFields, OfAFileComeBackWithTheirDefaults)
{
    Media::File::Track::Audio audio;
    Media::File file;
    // Never looked into: the address alone counts.
    const auto* const somewhere = reinterpret_cast<const char*>(&audio);
    file.setPath(QStringLiteral("a.mov"))->setLength(MTime(5))->setOpened(true)->addTrack(&audio);
    file.setLastModified(12)->setUnsupportedCodecs({"exotic"});
    file.setMetadata(reinterpret_cast<const Media::Metadata*>(somewhere));
    file.setComposition(reinterpret_cast<const Composition::Object*>(somewhere));
    file.label = QStringLiteral("label");

    const auto graph = graphOf(documentOf({&file}, GetParam()));
    const auto* const loaded = graph.rootAs<Media::File>();
    ASSERT_TRUE(loaded);
    EXPECT_EQ(loaded->path, QStringLiteral("a.mov"));
    EXPECT_EQ(loaded->length, MTime(5));
    EXPECT_TRUE(loaded->isOpened);
    ASSERT_EQ(loaded->audioTracks.size(), 1u);
    EXPECT_EQ(loaded->audioTracks.front()->file, nullptr);
    EXPECT_EQ(loaded->lastModified, 0);
    EXPECT_TRUE(loaded->unsupportedCodecs.empty());
    EXPECT_EQ(loaded->metadata, nullptr);
    EXPECT_EQ(loaded->composition, nullptr);
    EXPECT_TRUE(loaded->label.isEmpty());
}

TEST_P(RunTimeFields, OfAPictureFormatComeBackWithTheirDefaults)
{
    Media::Video video;
    video.setGeometry(64, 48)->setOpaque(false)->setExportMode(true);
    const auto graph = graphOf(documentOf({&video}, GetParam()));
    const auto* const loaded = graph.rootAs<Media::Video>();
    ASSERT_TRUE(loaded);
    EXPECT_EQ(loaded->width, 64);
    EXPECT_TRUE(loaded->opaque);
    EXPECT_FALSE(loaded->exportMode);
}

TEST_P(RunTimeFields, AFileThatIsBeingOpenedComesBackSo)
{
    Media::File file;
    file.setOpening(true);
    const auto graph = graphOf(documentOf({&file}, GetParam()));
    EXPECT_TRUE(graph.rootAs<Media::File>()->isOpening);
}

} // namespace
