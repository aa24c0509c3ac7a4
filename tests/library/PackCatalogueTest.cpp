// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/Pack.h>
#include <EditorModel/library/PackCatalogue.h>
#include <EditorModel/persistence/streams/Streams.h>

#include <gmock/gmock.h>

#include <QBuffer>

#include <memory>
#include <type_traits>
#include <vector>

namespace {

using Package::InApp::Pack;
using Catalogue = Package::InApp::Object;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

static_assert(Testing::isVirtualBase<PubSub::Object, Catalogue>);
static_assert(std::is_base_of_v<Serialize::ISerializable, Catalogue>);
static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Catalogue>);

class PackCatalogue : public testing::Test
{
protected:
    PackCatalogue()
    {
        first.appId = "first";
        second.appId = "second";
        otherFirst.appId = "first";
    }

    Pack first;
    Pack second;
    /// Another pack of the same identifier.
    Pack otherFirst;
    Catalogue catalogue;
};

TEST_F(PackCatalogue, FindsNothingAtFirst)
{
    EXPECT_EQ(catalogue.findPack(QString()), nullptr);
}

TEST_F(PackCatalogue, KeepsPacksInTheOrderOfAdding)
{
    EXPECT_EQ(catalogue.addPack(&second), &catalogue);
    EXPECT_EQ(catalogue.addPack(&first), &catalogue);
    EXPECT_THAT(catalogue.packs, ElementsAre(&second, &first));
    EXPECT_EQ(catalogue.findPack("first"), &first);
    EXPECT_EQ(catalogue.findPack("second"), &second);
    EXPECT_EQ(catalogue.appId2pack.size(), 2);
}

TEST_F(PackCatalogue, FindsNothingUnderAnUnknownIdentifier)
{
    catalogue.addPack(&first);
    EXPECT_EQ(catalogue.findPack("third"), nullptr);
    EXPECT_EQ(catalogue.findPack("First"), nullptr);
    EXPECT_EQ(catalogue.findPack(QString()), nullptr);
    EXPECT_EQ(catalogue.appId2pack.size(), 1);
}

TEST_F(PackCatalogue, ListsBothPacksOfOneIdentifierAndFindsTheLater)
{
    catalogue.addPack(&first)->addPack(&otherFirst);
    EXPECT_THAT(catalogue.packs, ElementsAre(&first, &otherFirst));
    EXPECT_EQ(catalogue.findPack("first"), &otherFirst);
}

TEST_F(PackCatalogue, RemovesEveryMentionOfAPack)
{
    catalogue.addPack(&first)->addPack(&second)->addPack(&first);
    EXPECT_THAT(catalogue.packs, ElementsAre(&first, &second, &first));
    EXPECT_EQ(catalogue.removePack(&first), &catalogue);
    EXPECT_THAT(catalogue.packs, ElementsAre(&second));
    EXPECT_EQ(catalogue.findPack("first"), nullptr);
    EXPECT_EQ(catalogue.findPack("second"), &second);
}

TEST_F(PackCatalogue, RemovingOneOfTwoPacksOfOneIdentifierLeavesTheOtherUnfindable)
{
    for (const Pack* const removed : {&first, &otherFirst}) {
        Catalogue both;
        both.addPack(&first)->addPack(&otherFirst)->removePack(removed);
        EXPECT_THAT(both.packs, ElementsAre(removed == &first ? &otherFirst : &first));
        EXPECT_EQ(both.findPack("first"), nullptr);
    }
}

TEST_F(PackCatalogue, RemovingAPackThatIsNotListedHidesTheOneOfItsIdentifier)
{
    catalogue.addPack(&first)->addPack(&second)->removePack(&otherFirst);
    EXPECT_THAT(catalogue.packs, ElementsAre(&first, &second));
    EXPECT_EQ(catalogue.findPack("first"), nullptr);
    EXPECT_EQ(catalogue.findPack("second"), &second);
}

TEST_F(PackCatalogue, RemovingFromAnEmptyCatalogueChangesNothing)
{
    EXPECT_EQ(catalogue.removePack(&first), &catalogue);
    EXPECT_THAT(catalogue.packs, IsEmpty());
    EXPECT_THAT(catalogue.appId2pack, IsEmpty());
}

TEST_F(PackCatalogue, HasNoDifferenceFromItself)
{
    EXPECT_THAT(catalogue.packsDifference(catalogue), IsEmpty());
    catalogue.addPack(&second)->addPack(&first)->addPack(&second);
    EXPECT_THAT(catalogue.packsDifference(catalogue), IsEmpty());
    EXPECT_THAT(catalogue.packs, ElementsAre(&second, &first, &second));
}

TEST_F(PackCatalogue, DiffersByThePacksThatTheOtherDoesNotHold)
{
    Catalogue other;
    catalogue.addPack(&second)->addPack(&first);
    other.addPack(&first)->addPack(&otherFirst);
    EXPECT_THAT(catalogue.packsDifference(other), UnorderedElementsAre(&second));
    EXPECT_THAT(other.packsDifference(catalogue), UnorderedElementsAre(&otherFirst));
    EXPECT_THAT(catalogue.packsDifference(Catalogue()), UnorderedElementsAre(&first, &second));
    EXPECT_THAT(Catalogue().packsDifference(catalogue), IsEmpty());
}

TEST_F(PackCatalogue, ComparesPacksByAddressAndNotByContent)
{
    ASSERT_TRUE(first == otherFirst);
    Catalogue other;
    catalogue.addPack(&first);
    other.addPack(&otherFirst);
    EXPECT_THAT(catalogue.packsDifference(other), UnorderedElementsAre(&first));
}

TEST_F(PackCatalogue, APackThatBothHoldIsNoDifferenceHoweverOftenItIsListed)
{
    Catalogue other;
    catalogue.addPack(&first)->addPack(&first)->addPack(&second)->addPack(&second);
    other.addPack(&first);
    EXPECT_THAT(catalogue.packsDifference(other), UnorderedElementsAre(&second));
}

TEST_F(PackCatalogue, UpdatingRaisesItsFlagAndNothingElse)
{
    catalogue.addPack(&first);
    EXPECT_EQ(catalogue.update(), &catalogue);
    EXPECT_EQ(catalogue.updateStatus, 1);
    catalogue.update();
    EXPECT_EQ(catalogue.updateStatus, 1);
    EXPECT_THAT(catalogue.packs, ElementsAre(&first));
    EXPECT_FALSE(first.isInstalled());
}

TEST_F(PackCatalogue, WritesItsPacksAlone)
{
    catalogue.addPack(&first)->addPack(&second)->addPack(&first)->update();
    EXPECT_THAT(Testing::fieldKeys(catalogue), ElementsAre("packs"));
    const std::string packs = Testing::fieldTexts(catalogue).front().second;
    EXPECT_THAT(packs, testing::StartsWith("\n  3 items\n  item 1\n  item: Package::InApp::Pack #2\n"
                                           "    appId: Q\"first\"\n"));
    EXPECT_THAT(packs, testing::EndsWith("\n  item 3\n  item: Package::InApp::Pack #2"));
}

TEST_F(PackCatalogue, ThatWasLoadedListsItsPacksAndFindsNoneUntilItIsAdded)
{
    catalogue.addPack(&second)->addPack(&first)->addPack(&second)->update();
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const auto graph = graphOf(documentOf({&catalogue}, way));
        ASSERT_TRUE(graph.rootAs<Catalogue>());
        Catalogue loaded = *graph.rootAs<Catalogue>();
        ASSERT_EQ(loaded.packs.size(), 3);
        EXPECT_EQ(loaded.packs[0]->appId, "second");
        EXPECT_EQ(loaded.packs[1]->appId, "first");
        EXPECT_EQ(loaded.packs[2], loaded.packs[0]);
        EXPECT_EQ(loaded.updateStatus, 0);
        EXPECT_THAT(loaded.appId2pack, IsEmpty());
        EXPECT_EQ(loaded.findPack("first"), nullptr);
        EXPECT_EQ(loaded.findPack("second"), nullptr);
        loaded.addPack(loaded.packs[1]);
        EXPECT_EQ(loaded.findPack("first"), loaded.packs[1]);
        EXPECT_EQ(loaded.findPack("second"), nullptr);
    }
}

TEST_F(PackCatalogue, PutsThePacksOfAFieldStreamBehindItsOwn)
{
    catalogue.addPack(&second)->addPack(&first);
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(Document::Json, buffer);
    writer->writeObject(catalogue);
    writer->finish();

    Catalogue filled;
    filled.addPack(&otherFirst);
    const auto reader = Serialize::makeStreamReader(Document::Json, buffer.data());
    reader->readObject(filled);
    std::vector<std::unique_ptr<Serialize::ISerializable>> made(reader->made().begin(), reader->made().end());
    ASSERT_EQ(filled.packs.size(), 3);
    EXPECT_EQ(filled.packs[0], &otherFirst);
    EXPECT_EQ(filled.packs[1]->appId, "second");
    EXPECT_EQ(filled.packs[2]->appId, "first");
    EXPECT_EQ(filled.findPack("first"), &otherFirst);
}

TEST_F(PackCatalogue, IsMadeByName)
{
    Testing::expectMadeByName<Catalogue>("Package::InApp::Object");
}

} // namespace
