// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/UniqueId.h>

#include <QRegularExpression>
#include <QSet>

#include <gtest/gtest.h>

namespace {

TEST(UniqueId, HasBracesAndLowerCaseDigits)
{
    const QRegularExpression form("^\\{[0-9a-f]{8}(-[0-9a-f]{4}){3}-[0-9a-f]{12}\\}$");
    for (int i = 0; i < 20; ++i) {
        const QString id = Types::nextUniqueId();
        EXPECT_TRUE(form.match(id).hasMatch()) << qPrintable(id);
    }
}

TEST(UniqueId, DoesNotComeTwice)
{
    QSet<QString> ids;
    for (int i = 0; i < 1000; ++i)
        ids.insert(Types::nextUniqueId());
    EXPECT_EQ(1000, ids.size());
}

} // namespace
