// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/services/AppEvents.h>
#include <EditorModel/services/Command.h>
#include <EditorModel/services/Statistics.h>

#include <gtest/gtest.h>

#include <set>
#include <vector>

namespace {

template <class T>
class Heard : public PubSub::Subscriber<PubSub::Message<T>>
{
public:
    std::vector<const T*> senders;

private:
    void notify(const PubSub::Message<T>& message) override { senders.push_back(message.sender); }
};

template <class T>
void hearsOnlyTheObjectSubscribedTo(const T* global)
{
    const T another;
    Heard<T> heard;
    heard.subscribe(global);
    PubSub::publish(PubSub::Message<T>(global));
    PubSub::publish(PubSub::Message<T>(&another));
    EXPECT_EQ(std::vector<const T*>{global}, heard.senders);
}

TEST(ApplicationObjects, AreAlwaysTheSame)
{
    EXPECT_EQ(AppEvents::globalObject(), AppEvents::globalObject());
    EXPECT_EQ(Command::globalObject(), Command::globalObject());
    EXPECT_EQ(EditorCollection::globalObject(), EditorCollection::globalObject());
    EXPECT_EQ(Statistics::globalObject(), Statistics::globalObject());
}

TEST(ApplicationObjects, HaveFourAddresses)
{
    const std::set<const PubSub::Object*> objects = {AppEvents::globalObject(), Command::globalObject(),
                                                     EditorCollection::globalObject(),
                                                     Statistics::globalObject()};
    EXPECT_EQ(4u, objects.size());
    EXPECT_EQ(0u, objects.count(nullptr));
}

TEST(ApplicationObjects, SendMessages)
{
    hearsOnlyTheObjectSubscribedTo(AppEvents::globalObject());
    hearsOnlyTheObjectSubscribedTo(Command::globalObject());
    hearsOnlyTheObjectSubscribedTo(EditorCollection::globalObject());
    hearsOnlyTheObjectSubscribedTo(Statistics::globalObject());
}

TEST(ApplicationObjects, WriteStatisticsUnderANameThatMakesNothing)
{
    const Serialize::ISerializable* statistics = Statistics::globalObject();
    EXPECT_EQ("Statistics::Object", statistics->GetNameInArchive());
    EXPECT_STREQ("Statistics::Object", Statistics::Object::NameInArchive());
    EXPECT_EQ(nullptr, Serialize::findCreator("Statistics::Object"));
}

} // namespace
