// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Report.h>

#include <gtest/gtest.h>

namespace {

TEST(Progress, TheWishToCancelCanBeTakenBack)
{
    Report::Progress progress;
    progress.cancel(true);
    EXPECT_TRUE(progress.cancelled);
    progress.cancel(false);
    EXPECT_FALSE(progress.cancelled);
}

} // namespace
