// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/EffectHelper.h>

#include <gmock/gmock.h>

#include <functional>
#include <string>
#include <vector>

namespace {

using namespace Effect::Details;
using Effect::EffectHelper;
using testing::ElementsAre;
using testing::IsEmpty;

using Modification = void (*)(Effect::List&);
using Filter = Effect::List (*)(Effect::List&);

const std::vector<Filter> filters = {
    &EffectHelper::removeAllPiPEffects,         &EffectHelper::removeAllStaticEffects,
    &EffectHelper::removeAudioNormalizeEffects, &EffectHelper::removeCropTransposeEffects,
    &EffectHelper::removePreTransformEffects,
};

/// A module that hears all seven requests, writes their names and does what the test tells it to.
class Module : public PubSub::Subscriber<SortRequest, ExpandEffectsHoldersRequest, RemoveAllPiPEffectsRequest,
                                         RemoveAllStaticEffectsRequest, RemoveNormalizeEffectsRequest,
                                         RemoveCropTransposeEffectsRequest, RemovePreTransformEffectsRequest>
{
public:
    Module() { subscribeAll<Effect::Object>(); }

    std::vector<std::string> requests;
    std::vector<const Effect::Object*> senders;
    std::function<void(Effect::List&)> change;
    std::function<void(Effect::List&, Effect::List&)> filter;

private:
    void notify(const SortRequest& request) override { modify("sort", request); }
    void notify(const ExpandEffectsHoldersRequest& request) override { modify("expand", request); }
    void notify(const RemoveAllPiPEffectsRequest& request) override { move("picture in picture", request); }
    void notify(const RemoveAllStaticEffectsRequest& request) override { move("static", request); }
    void notify(const RemoveNormalizeEffectsRequest& request) override { move("normalize", request); }
    void notify(const RemoveCropTransposeEffectsRequest& request) override
    {
        move("crop and transpose", request);
    }
    void notify(const RemovePreTransformEffectsRequest& request) override { move("pre-transform", request); }

    void modify(const std::string& name, const EffectListModificationRequest& request)
    {
        requests.push_back(name);
        senders.push_back(request.sender);
        if (change)
            change(request.list);
    }

    void move(const std::string& name, const EffectListFilterRequest& request)
    {
        requests.push_back(name);
        senders.push_back(request.sender);
        EXPECT_THAT(request.result, IsEmpty());
        if (filter)
            filter(request.list, request.result);
    }
};

class EffectHelperTest : public testing::Test
{
protected:
    const Effect::Object a{"a"};
    const Effect::Object b{"b"};
    const Effect::Object c{"c"};
    Effect::List list = {&c, &a, &b};
};

TEST_F(EffectHelperTest, WithoutAModuleListsStayAsTheyAre)
{
    EffectHelper::sortEffects(list);
    EffectHelper::expandEffectsHolders(list);
    for (const Filter filter : filters)
        EXPECT_THAT(filter(list), IsEmpty());
    EXPECT_THAT(list, ElementsAre(&c, &a, &b));
}

TEST_F(EffectHelperTest, EveryOperationSendsItsOwnRequestWithoutASender)
{
    Module module;
    EffectHelper::sortEffects(list);
    EffectHelper::expandEffectsHolders(list);
    EffectHelper::removeAllPiPEffects(list);
    EffectHelper::removeAllStaticEffects(list);
    EffectHelper::removeAudioNormalizeEffects(list);
    EffectHelper::removeCropTransposeEffects(list);
    EffectHelper::removePreTransformEffects(list);
    EXPECT_THAT(module.requests, ElementsAre("sort", "expand", "picture in picture", "static", "normalize",
                                             "crop and transpose", "pre-transform"));
    EXPECT_EQ(module.senders, std::vector<const Effect::Object*>(7, nullptr));
}

TEST_F(EffectHelperTest, AModuleChangesTheListInPlace)
{
    Module module;
    const Effect::List* changed = nullptr;
    module.change = [&](Effect::List& given) {
        changed = &given;
        given = {&a, &b, &c, &c};
    };
    for (const Modification modification :
         {&EffectHelper::sortEffects, &EffectHelper::expandEffectsHolders}) {
        list = {&c, &a, &b};
        modification(list);
        EXPECT_EQ(changed, &list);
        EXPECT_THAT(list, ElementsAre(&a, &b, &c, &c));
    }
}

TEST_F(EffectHelperTest, WhatAModuleTakesOutIsReturned)
{
    Module module;
    module.filter = [](Effect::List& given, Effect::List& result) {
        result.push_back(given[1]);
        result.push_back(given[0]);
        given.erase(given.begin(), given.begin() + 2);
    };
    for (const Filter filter : filters) {
        list = {&c, &a, &b};
        EXPECT_THAT(filter(list), ElementsAre(&a, &c));
        EXPECT_THAT(list, ElementsAre(&b));
    }
}

TEST_F(EffectHelperTest, EveryCallStartsWithAnEmptyResult)
{
    Module module;
    module.filter = [](Effect::List& given, Effect::List& result) {
        result.push_back(given.front());
        given.pop_front();
    };
    EXPECT_THAT(EffectHelper::removeAllStaticEffects(list), ElementsAre(&c));
    EXPECT_THAT(EffectHelper::removeAllStaticEffects(list), ElementsAre(&a));
    EXPECT_THAT(list, ElementsAre(&b));
}

TEST_F(EffectHelperTest, TwoModulesWorkOnOneList)
{
    Module first, second;
    first.change = second.change = [&](Effect::List& given) { given.push_back(&b); };
    EffectHelper::sortEffects(list);
    EXPECT_THAT(list, ElementsAre(&c, &a, &b, &b, &b));
}

TEST_F(EffectHelperTest, AModuleThatWatchesSingleEffectsIsNotAsked)
{
    class Watcher : public PubSub::Subscriber<SortRequest>
    {
    public:
        int count = 0;

    private:
        void notify(const SortRequest&) override { ++count; }
    };
    Watcher watcher;
    watcher.subscribe(&a);
    EffectHelper::sortEffects(list);
    EXPECT_EQ(watcher.count, 0);
    PubSub::publish(SortRequest(&a, list));
    EXPECT_EQ(watcher.count, 1);
}

} // namespace
