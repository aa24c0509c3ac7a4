// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/InApp.h>

#include <gmock/gmock.h>

#include <string>
#include <utility>
#include <vector>

namespace {

using Package::InApp::Pack;
using Catalogue = Package::InApp::Object;
using testing::ElementsAre;
using testing::IsEmpty;
using Lines = std::vector<std::string>;

/// A catalogue is written as the number of its packs and its flag, a pack by its identifier and status.
std::string text(const Catalogue* catalogue)
{
    return std::to_string(catalogue->packs.size()) + "/" + std::to_string(catalogue->updateStatus);
}

std::string text(const Pack* pack)
{
    return (pack->appId.isEmpty() ? std::string("-") : pack->appId.toStdString()) + "/" +
           std::to_string(pack->installationStatus);
}

/// One module that deals with the catalogue and with its packs, and writes every callback.
class Shop : public Package::InApp::View, public Package::InApp::PackView
{
public:
    using Package::InApp::View::packInApp;
    using Package::InApp::View::packInAppAdd;
    using Package::InApp::View::packInAppChange;
    using Package::InApp::View::packInAppForget;
    using Package::InApp::View::packInAppIsObserved;
    using Package::InApp::View::packInAppIsOwned;
    using Package::InApp::View::packInAppObserve;
    using Package::InApp::View::packInAppOwn;
    using Package::InApp::View::packInAppOwnerPointer;
    using Package::InApp::View::packInAppRemove;
    using Package::InApp::View::packInApps;

    using Package::InApp::PackView::pack;
    using Package::InApp::PackView::packAdd;
    using Package::InApp::PackView::packChange;
    using Package::InApp::PackView::packForget;
    using Package::InApp::PackView::packIsObserved;
    using Package::InApp::PackView::packIsOwned;
    using Package::InApp::PackView::packObserve;
    using Package::InApp::PackView::packOwn;
    using Package::InApp::PackView::packOwnerPointer;
    using Package::InApp::PackView::packRemove;
    using Package::InApp::PackView::packs;

    Lines take() { return std::exchange(m_lines, {}); }

protected:
    void packInAppAdded(const Catalogue* object) override { write("added " + text(object)); }
    void packInAppRemoved(const Catalogue* object) override { write("removed " + text(object)); }
    void packInAppChanged(const Catalogue* object, const Catalogue* before, const Catalogue* after) override
    {
        write("changed " + text(before) + " to " + text(after));
        Package::InApp::View::packInAppChanged(object, before, after);
    }
    void packInAppChanged(const Catalogue*, const Catalogue* before) override
    {
        write("changed from " + text(before));
    }
    void packInAppChanged(const Catalogue* object) override { write("changed now " + text(object)); }
    void updateStatusChanged(const Catalogue* object) override { write("update " + text(object)); }

    void packAdded(const Pack* object) override { write("pack added " + text(object)); }
    void packRemoved(const Pack* object) override { write("pack removed " + text(object)); }
    void packChanged(const Pack*, const Pack* before, const Pack* after) override
    {
        write("pack changed " + text(before) + " to " + text(after));
    }
    void packChanged(const Pack*, const Pack* before) override { write("pack changed from " + text(before)); }
    void packChanged(const Pack* object) override { write("pack changed now " + text(object)); }

private:
    void write(const std::string& line) { m_lines.push_back(line); }

    Lines m_lines;
};

TEST(PackViews, TellOfARequestedUpdate)
{
    Catalogue catalogue;
    Shop owner;
    Shop observer;
    owner.packInAppOwn(&catalogue);
    observer.packInAppObserve(&catalogue);
    const Lines arrival = {"added 0/0", "changed 0/0 to 0/0", "changed now 0/0"};
    EXPECT_EQ(owner.take(), arrival);
    EXPECT_EQ(observer.take(), arrival);

    observer.packInAppChange(&catalogue)->update();
    const Lines update = {"changed 0/0 to 0/1", "update 0/1", "changed from 0/0", "changed now 0/1"};
    EXPECT_EQ(owner.take(), update);
    EXPECT_EQ(observer.take(), update);

    owner.packInAppChange(&catalogue)->updateStatus = 0;
    const Lines answer = {"changed 0/1 to 0/0", "update 0/0", "changed from 0/1", "changed now 0/0"};
    EXPECT_EQ(owner.take(), answer);
    EXPECT_EQ(observer.take(), answer);
}

TEST(PackViews, TellOfNoUpdateWhereOnlyThePacksDiffer)
{
    const Pack pack;
    Catalogue catalogue;
    catalogue.update();
    Shop shop;
    shop.packInAppOwn(&catalogue);
    shop.take();
    shop.packInAppChange(&catalogue)->addPack(&pack)->update();
    EXPECT_THAT(shop.take(), ElementsAre("changed 0/1 to 1/1", "changed from 0/1", "changed now 1/1"));
}

TEST(PackViews, TellOfAnUpdateThatWasRequestedBeforeTheArrivalAndOfItsEnd)
{
    const Pack pack;
    Catalogue catalogue;
    catalogue.addPack(&pack)->update();
    Shop owner;
    Shop observer;
    owner.packInAppOwn(&catalogue);
    EXPECT_THAT(owner.take(),
                ElementsAre("added 1/1", "changed 0/0 to 1/1", "update 1/1", "changed now 1/1"));
    observer.packInAppObserve(&catalogue);
    observer.take();

    owner.packInAppRemove(&catalogue);
    // The new value of a catalogue that departs is an empty one.
    const Lines departure = {"changed 1/1 to 0/0", "update 0/0", "changed now 1/1", "removed 1/1"};
    EXPECT_EQ(observer.take(), departure);
    EXPECT_EQ(owner.take(), departure);
}

TEST(PackViews, TellWhatHappensToAPack)
{
    Pack pack;
    pack.appId = "weather";
    Shop owner;
    Shop observer;
    owner.packOwn(&pack);
    observer.packObserve(&pack);
    const Lines arrival = {"pack added weather/0", "pack changed -/0 to weather/0",
                           "pack changed now weather/0"};
    EXPECT_EQ(owner.take(), arrival);
    EXPECT_EQ(observer.take(), arrival);

    observer.packChange(&pack)->setInstallationStatus(Pack::Installed);
    EXPECT_TRUE(pack.isInstalled());
    const Lines change = {"pack changed weather/0 to weather/1", "pack changed from weather/0",
                          "pack changed now weather/1"};
    EXPECT_EQ(owner.take(), change);
    EXPECT_EQ(observer.take(), change);

    observer.packRemove(&pack);
    const Lines departure = {"pack changed weather/1 to -/0", "pack changed now weather/1",
                             "pack removed weather/1"};
    EXPECT_EQ(owner.take(), departure);
    EXPECT_EQ(observer.take(), departure);
}

TEST(PackViews, OfOneModuleKeepCatalogueAndPacksApart)
{
    Pack pack;
    Catalogue catalogue;
    Shop shop;
    shop.packInAppOwn(&catalogue);
    shop.packObserve(&pack);
    EXPECT_EQ(shop.packInApp(), &catalogue);
    EXPECT_THAT(shop.packInApps(), ElementsAre(&catalogue));
    EXPECT_TRUE(shop.packInAppIsOwned(&catalogue));
    EXPECT_TRUE(shop.packInAppIsObserved(&catalogue));
    EXPECT_EQ(shop.packInAppOwnerPointer(&catalogue), &catalogue);
    EXPECT_EQ(shop.pack(), &pack);
    EXPECT_THAT(shop.packs(), ElementsAre(&pack));
    EXPECT_FALSE(shop.packIsOwned(&pack));
    EXPECT_TRUE(shop.packIsObserved(&pack));
    EXPECT_EQ(shop.packOwnerPointer(&pack), nullptr);
    shop.packForget(&pack);
    EXPECT_THAT(shop.packs(), IsEmpty());
    EXPECT_THAT(shop.packInApps(), ElementsAre(&catalogue));
    shop.packInAppForget(&catalogue);
    EXPECT_EQ(shop.packInApp(), nullptr);
}

TEST(PackViews, AddToWhoeverTakesAdds)
{
    Message::View<Catalogue> catalogues;
    Message::View<Pack> packs;
    catalogues.processAddRequests();
    packs.processAddRequests();
    Pack pack;
    Catalogue catalogue;
    Shop shop;
    shop.packAdd(&pack)->setInstallationStatus(Pack::Installed);
    shop.packInAppAdd(&catalogue)->addPack(&pack);
    EXPECT_TRUE(packs.isOwned(&pack));
    EXPECT_TRUE(catalogues.isOwned(&catalogue));
    EXPECT_THAT(shop.take(), ElementsAre("pack added -/1", "pack changed -/0 to -/1", "pack changed now -/1",
                                         "added 1/0", "changed 0/0 to 1/0", "changed now 1/0"));
}

/// A module that leaves the callbacks as they are hears nothing and is no trouble to others.
TEST(PackViews, CanBeUsedWithoutReplacingTheirCallbacks)
{
    struct Quiet : Package::InApp::View, Package::InApp::PackView
    {
        using Package::InApp::PackView::packObserve;
        using Package::InApp::View::packInAppObserve;
    };
    Pack pack;
    Catalogue catalogue;
    Shop owner;
    owner.packOwn(&pack);
    owner.packInAppOwn(&catalogue);
    Quiet quiet;
    quiet.packObserve(&pack);
    quiet.packInAppObserve(&catalogue);
    owner.take();
    owner.packInAppChange(&catalogue)->update();
    owner.packChange(&pack)->setInstallationStatus(Pack::Installed);
    EXPECT_EQ(owner.take().size(), 7u);
}

} // namespace
