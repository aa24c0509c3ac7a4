// SPDX-License-Identifier: Apache-2.0
#include "PackageBuilder.h"
#include "tests/host/commands/Command.h"

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

TEST(PackagesCommand, ShowsWhatPackagesBringAndWhichCollectionTakesIt)
{
    const Outcome shown = editormodel({"packages", HOST_PACKAGES});
    EXPECT_EQ(shown.exitCode, 0);
    EXPECT_THAT(shown.errors, IsEmpty());
    EXPECT_THAT(shown.output, StartsWith("starter: Starter\n"));
    EXPECT_THAT(shown.output,
                hasLine({"overlay", "starter.lower-third", "Lower third", "Title", "lower_thirds"}));
    EXPECT_THAT(shown.output, hasLine({"transition", "starter.crossfade", "Crossfade", "Transitions"}));
    EXPECT_THAT(shown.output, hasLine({"effect", "starter.sepia", "Sepia", "Effects", "looks"}));
    EXPECT_THAT(shown.output, hasLine({"import", "starter.chime", "Chime", "Imports", "sample_audio"}));
}

TEST(PackagesCommand, TellsOfEveryFaultInALine)
{
    const Folder folder;
    writeEffectPackage(folder.path("sound"), "warm");
    writeEffectPackage(folder.path("torn"), "cold");
    folder.write("torn/warm.json", "no");
    QDir(folder.path()).mkdir("empty");
    const Outcome shown = editormodel({"packages", "sound", "torn", "empty", "missing"}, folder.path());
    EXPECT_EQ(shown.exitCode, 1);
    EXPECT_THAT(shown.output, hasLine({"effect", "warm", "Warm", "Effects", "looks"}));
    EXPECT_THAT(shown.errors, HasSubstr("empty: holds no package\n"));
    EXPECT_THAT(shown.errors, HasSubstr("missing: does not exist\n"));
    EXPECT_THAT(shown.errors, HasSubstr("torn: warm.json: is damaged: "));
    EXPECT_EQ(std::count(shown.errors.begin(), shown.errors.end(), '\n'), 3) << shown.errors;
}

} // namespace
