// SPDX-License-Identifier: Apache-2.0
#include "tests/library/PackModule.h"

#include <gmock/gmock.h>

#include <string>
#include <type_traits>

namespace {

using LibraryTests::PackModule;
using Package::GetPackagesNotification;
using Package::GetPackagesRequest;
using Package::PackageFetcher;
using Directories = QMap<QString, QString>;
using Texts = QSet<QString>;
using testing::ElementsAre;

static_assert(std::is_base_of_v<Message::Types::Request<Package::Object>, GetPackagesRequest>);
static_assert(std::is_base_of_v<Message::Types::Notification<Package::Object>, GetPackagesNotification>);
static_assert(std::is_base_of_v<PubSub::Subscriber<GetPackagesNotification>, PackageFetcher>);

TEST(PackageFetcher, IsEmptyIfNobodyAnswers)
{
    const PackageFetcher fetcher;
    EXPECT_EQ(fetcher.appId2directory, Directories());
    EXPECT_EQ(fetcher.reservedTexts, Texts());
}

TEST(PackageFetcher, HasItsAnswerWhenItIsConstructed)
{
    const PackModule module({{"weather", "/packs/weather"}, {"sport", "/packs/sport"}}, {"a", "b"});
    const PackageFetcher fetcher;
    EXPECT_EQ(fetcher.appId2directory,
              (Directories{{"weather", "/packs/weather"}, {"sport", "/packs/sport"}}));
    EXPECT_EQ(fetcher.reservedTexts, (Texts{"a", "b"}));
}

TEST(PackageFetcher, AsksOnceAndInNobodysName)
{
    const PackModule module;
    const PackageFetcher fetcher;
    EXPECT_THAT(module.senders, ElementsAre(nullptr));
}

TEST(PackageFetcher, TakesAnAnswerInAnyPackagesName)
{
    const Package::Object package;
    PackModule module({{"weather", "/packs/weather"}});
    module.self = &package;
    EXPECT_EQ(PackageFetcher().appId2directory, (Directories{{"weather", "/packs/weather"}}));
}

TEST(PackageFetcher, TheLaterOfTwoAnswersReplacesBothMembersOfTheEarlier)
{
    PackModule module({{"sport", "/packs/sport"}}, {"late"});
    module.beforeAnswering = [] {
        PubSub::publish(GetPackagesNotification(nullptr, {{"weather", "/packs/weather"}}, {"early"}));
    };
    const PackageFetcher fetcher;
    EXPECT_EQ(fetcher.appId2directory, (Directories{{"sport", "/packs/sport"}}));
    EXPECT_EQ(fetcher.reservedTexts, (Texts{"late"}));
}

TEST(PackageFetcher, AnEmptyLaterAnswerReplacesAFullOne)
{
    PackModule module;
    module.beforeAnswering = [] {
        PubSub::publish(GetPackagesNotification(nullptr, {{"weather", "/packs/weather"}}, {"early"}));
    };
    const PackageFetcher fetcher;
    EXPECT_EQ(fetcher.appId2directory, Directories());
    EXPECT_EQ(fetcher.reservedTexts, Texts());
}

TEST(PackageFetcher, OfTwoModulesTheOneThatAnswersLaterWins)
{
    std::string last;
    PackModule first({{"weather", "/first"}}, {"first"});
    PackModule second({{"weather", "/second"}}, {"second"});
    first.beforeAnswering = [&] { last = "first"; };
    second.beforeAnswering = [&] { last = "second"; };
    const PackageFetcher fetcher;
    EXPECT_EQ(first.senders.size(), 1u);
    EXPECT_EQ(second.senders.size(), 1u);
    EXPECT_EQ(fetcher.appId2directory["weather"], QString::fromStdString("/" + last));
    EXPECT_EQ(fetcher.reservedTexts, (Texts{QString::fromStdString(last)}));
}

TEST(PackageFetcher, DoesNotSeeLaterChanges)
{
    const PackModule module({{"weather", "/packs/weather"}}, {"a"});
    const PackageFetcher fetcher;
    PubSub::publish(GetPackagesNotification(nullptr, {}, {}));
    EXPECT_EQ(PackageFetcher().appId2directory.size(), 1);
    EXPECT_EQ(fetcher.appId2directory, (Directories{{"weather", "/packs/weather"}}));
    EXPECT_EQ(fetcher.reservedTexts, (Texts{"a"}));
    EXPECT_FALSE(fetcher.isSubscribedAll<Package::Object>());
}

TEST(PackageFetcher, CopiesItsAnswerWithoutAskingAgain)
{
    const PackModule module({{"weather", "/packs/weather"}}, {"a"});
    const PackageFetcher fetcher;
    const PackageFetcher copy(fetcher);
    EXPECT_EQ(copy.appId2directory, fetcher.appId2directory);
    EXPECT_EQ(copy.reservedTexts, fetcher.reservedTexts);
    EXPECT_EQ(module.senders.size(), 1u);
}

TEST(PackageFetcher, AQuestionWithinAQuestionIsAnsweredAsWell)
{
    PackModule module({{"weather", "/packs/weather"}});
    Directories inner;
    module.beforeAnswering = [&] { inner = PackageFetcher().appId2directory; };
    EXPECT_EQ(PackageFetcher().appId2directory, module.directories);
    EXPECT_EQ(inner, module.directories);
    EXPECT_EQ(module.senders.size(), 2u);
}

TEST(PackageFetcher, ItsMessagesHoldWhatTheyWereMadeWith)
{
    const Package::Object package;
    EXPECT_EQ(GetPackagesRequest().sender, nullptr);
    EXPECT_EQ(GetPackagesRequest(&package).sender, &package);
    const GetPackagesNotification answer(&package, {{"weather", "/packs/weather"}}, {"a"});
    EXPECT_EQ(answer.sender, &package);
    EXPECT_EQ(answer.appId2directory, (Directories{{"weather", "/packs/weather"}}));
    EXPECT_EQ(answer.reservedTexts, (Texts{"a"}));
}

} // namespace
