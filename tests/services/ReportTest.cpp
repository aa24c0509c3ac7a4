// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Report.h>

#include <gtest/gtest.h>

namespace {

Report::Progress everyFieldSet()
{
    Report::Progress progress;
    progress.setTotal(12)
        ->setPassed(5)
        ->setLabel(QStringLiteral("5 of 12"))
        ->setTitle(QStringLiteral("Analysing"));
    progress.setCancelButtonText(QStringLiteral("Stop"))->cancel(true)->setUniqueModal(false);
    return progress;
}

void expectEveryFieldSet(const Report::Progress& progress)
{
    EXPECT_EQ(progress.total, 12);
    EXPECT_EQ(progress.passed, 5);
    EXPECT_EQ(progress.label, QStringLiteral("5 of 12"));
    EXPECT_EQ(progress.title, QStringLiteral("Analysing"));
    EXPECT_EQ(progress.cancelButtonText, QStringLiteral("Stop"));
    EXPECT_TRUE(progress.cancelled);
    EXPECT_FALSE(progress.uniqueModal);
}

TEST(Progress, ShowsNothingByDefault)
{
    const Report::Progress progress;
    EXPECT_EQ(progress.total, 0);
    EXPECT_EQ(progress.passed, 0);
    EXPECT_TRUE(progress.label.isEmpty());
    EXPECT_TRUE(progress.title.isEmpty());
    EXPECT_TRUE(progress.cancelButtonText.isEmpty());
    EXPECT_FALSE(progress.cancelled);
    EXPECT_TRUE(progress.uniqueModal);
}

TEST(Progress, SettersStoreAndChain)
{
    expectEveryFieldSet(everyFieldSet());
}

TEST(Progress, EverySetterReturnsTheProgress)
{
    Report::Progress progress;
    EXPECT_EQ(progress.setTotal(1), &progress);
    EXPECT_EQ(progress.setPassed(1), &progress);
    EXPECT_EQ(progress.setLabel(QString()), &progress);
    EXPECT_EQ(progress.setTitle(QString()), &progress);
    EXPECT_EQ(progress.setCancelButtonText(QString()), &progress);
    EXPECT_EQ(progress.cancel(true), &progress);
    EXPECT_EQ(progress.setUniqueModal(false), &progress);
}

TEST(Progress, TheWishToCancelCanBeTakenBack)
{
    Report::Progress progress;
    progress.cancel(true);
    EXPECT_TRUE(progress.cancelled);
    progress.cancel(false);
    EXPECT_FALSE(progress.cancelled);
}

TEST(Progress, CopiesAndAssignsAllFields)
{
    const Report::Progress progress = everyFieldSet();
    expectEveryFieldSet(Report::Progress(progress));
    Report::Progress assigned;
    assigned = progress;
    expectEveryFieldSet(assigned);
    const Report::Progress& itself = assigned;
    assigned = itself;
    expectEveryFieldSet(assigned);
}

} // namespace
