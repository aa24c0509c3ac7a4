// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/Import.h>

#include <gmock/gmock.h>

#include <string>
#include <utility>
#include <vector>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using Lines = std::vector<std::string>;

/// Writes every callback with the tags of the objects; the default-constructed one has none: "-".
class Player : public Preview::Details::ObjectViewBase<Import::Object>
{
    using Base = Preview::Details::ObjectViewBase<Import::Object>;

public:
    using Base::preview;
    using Base::previewChange;
    using Base::previewForget;
    using Base::previewIsOwned;
    using Base::previewObserve;
    using Base::previewOwn;
    using Base::previewRemove;
    using Base::previews;

    Lines take() { return std::exchange(m_lines, {}); }

protected:
    void previewAdded(const Import::Object* object) override { write("added", {object}); }
    void previewRemoved(const Import::Object* object) override { write("removed", {object}); }
    void previewChanged(const Import::Object* object, const Import::Object* before,
                        const Import::Object* after) override
    {
        write("changed", {object, before, after});
    }
    void previewChanged(const Import::Object* object, const Import::Object* before) override
    {
        write("changed", {object, before});
    }
    void previewChanged(const Import::Object* object) override { write("changed", {object}); }

private:
    void write(std::string line, const std::vector<const Import::Object*>& objects)
    {
        for (const Import::Object* const object : objects)
            line += " " + (object->tag.isEmpty() ? std::string("-") : object->tag.toStdString());
        m_lines.push_back(line);
    }

    Lines m_lines;
};

TEST(ImportPreview, OwnerAndObserverHearTheSame)
{
    Import::Object object;
    Player owner;
    Player observer;
    owner.previewOwn(&object)->tag = "rain";
    observer.previewObserve(&object);
    const Lines arrival = {"added rain", "changed rain - rain", "changed rain"};
    EXPECT_EQ(owner.take(), arrival);
    EXPECT_EQ(observer.take(), arrival);
    EXPECT_TRUE(owner.previewIsOwned(&object));
    EXPECT_FALSE(observer.previewIsOwned(&object));
    EXPECT_EQ(observer.preview(), &object);

    observer.previewChange(&object)->tag = "sun";
    EXPECT_EQ(object.tag, "sun");
    const Lines change = {"changed sun rain sun", "changed sun rain", "changed sun"};
    EXPECT_EQ(owner.take(), change);
    EXPECT_EQ(observer.take(), change);

    owner.previewRemove(&object);
    const Lines departure = {"changed sun sun -", "changed sun", "removed sun"};
    EXPECT_EQ(owner.take(), departure);
    EXPECT_EQ(observer.take(), departure);
    EXPECT_THAT(owner.previews(), IsEmpty());
    EXPECT_THAT(observer.previews(), IsEmpty());
}

TEST(ImportPreview, ChangesTheAddressesOfAnItemAsAWhole)
{
    Import::Object object;
    Player owner;
    owner.previewOwn(&object);
    {
        auto chain = owner.previewChange(&object);
        chain->setLocation("/media/rain.mov");
        chain->setRemoteSize(7);
        EXPECT_EQ(object.location(), QString());
    }
    EXPECT_EQ(object.location(), "/media/rain.mov");
    EXPECT_EQ(object.remoteSize(), 7);
    EXPECT_THAT(owner.previews(), ElementsAre(&object));
}

} // namespace
