// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Tutorial.h>

#include <QMetaEnum>

#include <gtest/gtest.h>

namespace {

TEST(Tutorial, HasTenTypesThatTheMetaObjectNames)
{
    const char* const names[] = {"EditorStarted", "EffectsPage",   "TransitionsPage",  "TitlesPage",
                                 "CalloutsPage",  "StickersPage",  "ColorFiltersPage", "LutsPage",
                                 "SampleProject", "WebImportSaved"};
    const QMetaEnum types = QMetaEnum::fromType<Tutorial::Type>();
    ASSERT_EQ(10, types.keyCount());
    for (int value = 0; value < 10; ++value) {
        EXPECT_STREQ(names[value], types.valueToKey(value));
        EXPECT_EQ(value, types.keyToValue(names[value]));
    }
}

TEST(Tutorial, HasAMetaObjectOfItsOwn)
{
    EXPECT_STREQ("Tutorial", Tutorial::staticMetaObject.className());
    EXPECT_EQ(0, Tutorial::staticMetaObject.indexOfEnumerator("Type"));
}

TEST(Tutorial, KeepsItsNumbers)
{
    EXPECT_EQ(0, Tutorial::EditorStarted);
    EXPECT_EQ(4, Tutorial::CalloutsPage);
    EXPECT_EQ(9, Tutorial::WebImportSaved);
}

} // namespace
