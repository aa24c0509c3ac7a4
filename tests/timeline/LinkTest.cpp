// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <type_traits>

namespace {

using testing::ElementsAre;
using Testing::FieldText;
using testing::StartsWith;
using Timeline::Clip;
using Timeline::Link;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Link>);
static_assert(!std::is_base_of_v<PubSub::Object, Link>);

const Clip someClip;
const Clip otherClip;

TEST(Link, NamesAMasterAndAnOffset)
{
    const Link link(&someClip, 250);
    EXPECT_EQ(link.master, &someClip);
    EXPECT_EQ(link.offset, MTime(250));
}

TEST(Link, ToBeReadNamesNone)
{
    const Link link;
    EXPECT_EQ(link.master, nullptr);
    EXPECT_EQ(link.offset, MTime());
}

TEST(Link, IsMadeByName)
{
    Testing::expectMadeByName<Link>("Timeline::Link");
}

TEST(Link, IsWrittenInTheOrderOfItsFields)
{
    EXPECT_THAT(Testing::fieldTexts(Link(nullptr, 250)),
                ElementsAre(FieldText("master", "null"), FieldText("offset", "250ms")));
    EXPECT_THAT(Testing::fieldTexts(Link(&someClip, 250)).front().second, StartsWith("Timeline::Clip #"));
}

TEST(Link, IsEqualInBothFields)
{
    EXPECT_TRUE(Link() == Link(nullptr, 0));
    EXPECT_TRUE(Link(&someClip, 250) == Link(&someClip, 250));
    EXPECT_FALSE(Link(&someClip, 250) == Link(&otherClip, 250));
    EXPECT_FALSE(Link(&someClip, 250) == Link(&someClip, 251));
}

} // namespace
