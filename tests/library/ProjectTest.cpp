// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <vector>

namespace ProjectExtraInfo {

/// What an application would hand to modules with a project.
class LoadContext
{
public:
    int version;
};

class SaveContext : public virtual PubSub::Object
{};

} // namespace ProjectExtraInfo

namespace {

using Project::Content;
using ProjectExtraInfo::LoadContext;
using ProjectExtraInfo::ProjectContentLoaded;
using ProjectExtraInfo::ProjectContentSaved;
using ProjectExtraInfo::SaveContext;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Content>);
static_assert(Testing::isVirtualBase<PubSub::Object, Content>);
static_assert(std::is_base_of_v<Message::Types::Notification<LoadContext>, ProjectContentLoaded>);
static_assert(std::is_base_of_v<Message::Types::Notification<SaveContext>, ProjectContentSaved>);

class ProjectContent : public ::testing::Test
{
protected:
    ProjectContent()
    {
        content.timeline = &timeline;
        content.userCollection = &collection;
        content.resourceTable = &table;
        content.portable = true;
    }

    Timeline::Object timeline;
    EditorCollection::UserObject collection;
    ResourceTable::Object table;
    Content content;
};

TEST_F(ProjectContent, IsMadeByItsName)
{
    Testing::expectMadeByName<Content>("Project::Content");
}

TEST_F(ProjectContent, WritesItsFieldsInOrder)
{
    EXPECT_THAT(Testing::fieldKeys(content),
                ElementsAre("timeline", "userCollection", "resourceTable", "portable"));
}

TEST_F(ProjectContent, LetsItsObjectsLive)
{
    timeline.setMarkerUpdateEnabled(false);
    {
        const Content copy(content);
    }
    EXPECT_FALSE(content.timeline->markerUpdateEnabled);
}

TEST_F(ProjectContent, EqualsWhatNamesTheSameObjects)
{
    EXPECT_TRUE(content == content);
    EXPECT_TRUE(content == Content(content));
    EXPECT_FALSE(content != Content(content));
    EXPECT_TRUE(Content() == Content());
}

TEST_F(ProjectContent, ThatIsPortableEqualsOneThatIsNot)
{
    Content other(content);
    other.portable = false;
    EXPECT_TRUE(content == other);
    EXPECT_FALSE(content != other);
}

TEST_F(ProjectContent, DiffersByEachOfItsObjects)
{
    Content other(content);
    other.timeline = nullptr;
    EXPECT_TRUE(content != other);
    EXPECT_FALSE(content == other);
    other = content;
    EditorCollection::UserObject equalCollection;
    other.userCollection = &equalCollection;
    EXPECT_FALSE(content == other);
    other = content;
    ResourceTable::Object equalTable;
    other.resourceTable = &equalTable;
    EXPECT_FALSE(content == other);
}

class Module : public PubSub::Subscriber<ProjectContentLoaded, ProjectContentSaved>
{
public:
    Module()
    {
        subscribeAll<LoadContext>();
        subscribeAll<SaveContext>();
    }

    void notify(const ProjectContentLoaded& message) override { loaded.push_back(message.sender); }
    void notify(const ProjectContentSaved& message) override { saved.push_back(message.sender); }

    std::vector<const LoadContext*> loaded;
    std::vector<const SaveContext*> saved;
};

TEST(ProjectExtraInfo, ModulesAreToldWithTheContextOfTheApplication)
{
    Module module;
    const LoadContext load{3};
    const SaveContext save;
    PubSub::publish(ProjectContentLoaded(&load));
    EXPECT_THAT(module.loaded, ElementsAre(&load));
    EXPECT_THAT(module.saved, IsEmpty());
    PubSub::publish(ProjectContentSaved(&save));
    PubSub::publish(ProjectContentSaved(nullptr));
    EXPECT_THAT(module.loaded, ElementsAre(&load));
    EXPECT_THAT(module.saved, ElementsAre(&save, nullptr));
}

} // namespace
