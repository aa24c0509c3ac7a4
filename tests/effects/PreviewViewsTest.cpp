// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Views.h>
#include <EditorModel/library/ImportViews.h>

#include <gmock/gmock.h>

#include <string>
#include <utility>
#include <vector>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

using Lines = std::vector<std::string>;

/// Writes every callback with the tags of the objects. The default-constructed one has none: "-".
template <class T>
class Player : public Preview::Details::ObjectViewBase<T>
{
    using Base = Preview::Details::ObjectViewBase<T>;

public:
    using Base::preview;
    using Base::previewAdd;
    using Base::previewChange;
    using Base::previewForget;
    using Base::previewIsObserved;
    using Base::previewIsOwned;
    using Base::previewObserve;
    using Base::previewOwn;
    using Base::previewOwnerPointer;
    using Base::previewRemove;
    using Base::previews;

    Player(Lines& lines, const std::string& name) : m_lines(&lines), m_name(name) {}

protected:
    void previewAdded(const T* object) override { write("added", {object}); }
    void previewRemoved(const T* object) override { write("removed", {object}); }
    void previewChanged(const T* object, const T* oldValue, const T* newValue) override
    {
        write("changed", {object, oldValue, newValue});
    }
    void previewChanged(const T* object, const T* oldValue) override { write("changed", {object, oldValue}); }
    void previewChanged(const T* object) override { write("changed", {object}); }

private:
    void write(const std::string& callback, const std::vector<const T*>& objects)
    {
        std::string line = m_name + " " + callback;
        for (const T* object : objects)
            line += " " + (object->tag.isEmpty() ? std::string("-") : object->tag.toStdString());
        m_lines->push_back(line);
    }

    Lines* m_lines;
    std::string m_name;
};

template <class T>
class PreviewViews : public testing::Test
{
protected:
    Lines take() { return std::exchange(lines, Lines()); }

    Lines lines;
    Player<T> owner{lines, "owner"};
    Player<T> observer{lines, "observer"};
    T object;
};

using Previewed = testing::Types<Effect::Object, Transition::Object, Overlay::Preset, Import::Object>;

struct PreviewedNames
{
    template <class T>
    static std::string GetName(int)
    {
        const std::string name = T::NameInArchive();
        return name.substr(0, name.find(':'));
    }
};
TYPED_TEST_SUITE(PreviewViews, Previewed, PreviewedNames);

TYPED_TEST(PreviewViews, AnOwnerHearsOfTheArrival)
{
    this->owner.previewOwn(&this->object)->tag = "a";
    EXPECT_THAT(this->take(), ElementsAre("owner added a", "owner changed a - a", "owner changed a"));
    EXPECT_TRUE(this->owner.previewIsOwned(&this->object));
    EXPECT_TRUE(this->owner.previewIsObserved(&this->object));
    EXPECT_EQ(this->owner.previewOwnerPointer(&this->object), &this->object);
    EXPECT_EQ(this->owner.preview(), &this->object);
    EXPECT_THAT(this->owner.previews(), ElementsAre(&this->object));
}

TYPED_TEST(PreviewViews, AnObserverSeesTheOwnersObject)
{
    this->owner.previewOwn(&this->object)->tag = "a";
    this->take();
    this->observer.previewObserve(&this->object);
    EXPECT_THAT(this->take(),
                ElementsAre("observer added a", "observer changed a - a", "observer changed a"));
    EXPECT_TRUE(this->observer.previewIsObserved(&this->object));
    EXPECT_FALSE(this->observer.previewIsOwned(&this->object));
    EXPECT_EQ(this->observer.previewOwnerPointer(&this->object), nullptr);
}

TYPED_TEST(PreviewViews, AnObserversChangeIsCarriedOutByTheOwner)
{
    this->owner.previewOwn(&this->object)->tag = "a";
    this->observer.previewObserve(&this->object);
    this->take();
    {
        auto chain = this->observer.previewChange(&this->object);
        chain->tag = "b";
        EXPECT_EQ(this->object.tag, "a");
        EXPECT_THAT(this->take(), IsEmpty());
    }
    EXPECT_EQ(this->object.tag, "b");
    EXPECT_THAT(this->take(),
                ElementsAre("owner changed b a b", "owner changed b a", "owner changed b",
                            "observer changed b a b", "observer changed b a", "observer changed b"));
}

TYPED_TEST(PreviewViews, AnOwnersChangeReachesTheObserver)
{
    this->owner.previewOwn(&this->object)->tag = "a";
    this->observer.previewObserve(&this->object);
    this->take();
    this->owner.previewChange(nullptr)->tag = "b";
    EXPECT_THAT(this->take(),
                ElementsAre("owner changed b a b", "owner changed b a", "owner changed b",
                            "observer changed b a b", "observer changed b a", "observer changed b"));
}

TYPED_TEST(PreviewViews, ObserversLetGoBeforeTheOwner)
{
    this->owner.previewOwn(&this->object)->tag = "a";
    this->observer.previewObserve(&this->object);
    this->take();
    this->owner.previewRemove(&this->object);
    EXPECT_THAT(this->take(),
                ElementsAre("observer changed a a -", "observer changed a", "observer removed a",
                            "owner changed a a -", "owner changed a", "owner removed a"));
    EXPECT_THAT(this->owner.previews(), IsEmpty());
    EXPECT_THAT(this->observer.previews(), IsEmpty());
}

TYPED_TEST(PreviewViews, ForgettingIsNobodyElsesConcern)
{
    this->owner.previewOwn(&this->object)->tag = "a";
    this->observer.previewObserve(&this->object);
    this->take();
    this->observer.previewForget(&this->object);
    EXPECT_THAT(this->take(),
                ElementsAre("observer changed a a -", "observer changed a", "observer removed a"));
    EXPECT_FALSE(this->observer.previewIsObserved(&this->object));
    EXPECT_TRUE(this->owner.previewIsOwned(&this->object));
}

TYPED_TEST(PreviewViews, AnAddReachesTheViewThatTakesAdds)
{
    Message::View<TypeParam> open;
    open.processAddRequests();
    this->observer.previewAdd(&this->object)->tag = "a";
    EXPECT_THAT(this->take(),
                ElementsAre("observer added a", "observer changed a - a", "observer changed a"));
    EXPECT_TRUE(open.isOwned(&this->object));
    EXPECT_FALSE(this->observer.previewIsOwned(&this->object));
    this->observer.previewRemove(&this->object);
    EXPECT_THAT(this->take(),
                ElementsAre("observer changed a a -", "observer changed a", "observer removed a"));
    EXPECT_FALSE(open.isObserved(&this->object));
}

TYPED_TEST(PreviewViews, ACopyWatchesWhatTheOriginalWatches)
{
    this->owner.previewOwn(&this->object)->tag = "a";
    this->observer.previewObserve(&this->object);
    Player<TypeParam> copy(this->observer);
    EXPECT_THAT(copy.previews(), ElementsAre(&this->object));
    this->observer.previewForget(&this->object);
    this->take();
    this->owner.previewChange(&this->object)->tag = "b";
    EXPECT_THAT(this->take(),
                ElementsAre("owner changed b a b", "owner changed b a", "owner changed b",
                            "observer changed b a b", "observer changed b a", "observer changed b"));
}

TEST(PreviewChange, CommitsWhatTheSettersStored)
{
    Lines lines;
    Effect::Object effect;
    Overlay::Preset preset;
    Player<Effect::Object> effects(lines, "effects");
    Player<Overlay::Preset> presets(lines, "presets");
    effects.previewOwn(&effect);
    presets.previewOwn(&preset);
    effects.previewChange(&effect)->setTag("Soft")->setBypass(true);
    presets.previewChange(&preset)->setTag("Titles")->appendItem(Overlay::Item().setText("a"));
    EXPECT_EQ(effect.tag, "Soft");
    EXPECT_TRUE(effect.bypass);
    EXPECT_EQ(preset.items.size(), 1u);
    EXPECT_THAT(lines, testing::Contains("effects changed Soft - Soft"));
    EXPECT_THAT(lines, testing::Contains("presets changed Titles - Titles"));
}

TEST(PreviewChange, CommitsTheAddressesOfAnImportAsAWhole)
{
    Lines lines;
    Import::Object object;
    Player<Import::Object> owner(lines, "owner");
    owner.previewOwn(&object);
    {
        auto chain = owner.previewChange(&object);
        chain->setLocation("/media/rain.mov");
        chain->setRemoteSize(7);
        EXPECT_EQ(object.location(), QString());
        EXPECT_EQ(object.remoteSize(), -1);
    }
    EXPECT_EQ(object.location(), "/media/rain.mov");
    EXPECT_EQ(object.remoteSize(), 7);
}

} // namespace
