// SPDX-License-Identifier: Apache-2.0
#include "ClassTable.h"

#include <EditorModel/analysis/ClipSynchronization.h>
#include <EditorModel/analysis/TrackingHelper.h>
#include <EditorModel/library/ImportState.h>
#include <EditorModel/library/PackageFetcher.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/library/UserBlob.h>
#include <EditorModel/media/FileAdder.h>
#include <EditorModel/media/ResourceTable.h>

namespace FieldTests {

template <>
struct Values<FileAdder::Contexts>
{
    static std::vector<FileAdder::Contexts> all()
    {
        using namespace FileAdder;
        std::vector<Contexts> values(4);
        values[0].setContext(TimelineContext(somewhere<Timeline::Object>(0x1000)));
        values[1].setContext(UserCollectionContext());
        values[2].setContext(ResourceTableContext(somewhere<ResourceTable::Object>(0x1000)));
        return values;
    }
    static bool same(const FileAdder::Contexts& a, const FileAdder::Contexts& b)
    {
        const auto timelineOf = [](const FileAdder::Contexts& contexts) {
            return contexts.timeline ? contexts.timeline->timeline : nullptr;
        };
        const auto tableOf = [](const FileAdder::Contexts& contexts) {
            return contexts.resourceTable ? contexts.resourceTable->table : nullptr;
        };
        return timelineOf(a) == timelineOf(b) && tableOf(a) == tableOf(b) &&
               a.userCollection.has_value() == b.userCollection.has_value();
    }
};

namespace {

ClassTable timelineContext()
{
    using Context = FileAdder::TimelineContext;
    return ClassOf<Context>("FileAdder::TimelineContext",
                            [](void* memory) { ::new (memory) Context(nullptr); })
        .field<&Context::timeline>("timeline", nullptr)
        .field<&Context::track>("track", nullptr)
        .field<&Context::position>("position", -1)
        .field<&Context::clipType>("clipType", Timeline::Clip::ClipType(0))
        .field<&Context::trackLevel>("trackLevel", -1)
        .field<&Context::flag>("flag", false)
        .field<&Context::clipBuildingStrategy>("clipBuildingStrategy", Timeline::ClipBuildingStrategy(0));
}

ClassTable resourceTableContext()
{
    using Context = FileAdder::ResourceTableContext;
    return ClassOf<Context>("FileAdder::ResourceTableContext",
                            [](void* memory) { ::new (memory) Context(nullptr); })
        .field<&Context::table>("table", nullptr);
}

ClassTable addMediaFiles()
{
    using Request = FileAdder::AddMediaFiles;
    return ClassOf<Request>("FileAdder::AddMediaFiles",
                            [](void* memory) { ::new (memory) Request({}, FileAdder::Asrc(0), {}); })
        .field<&Request::sender>("sender", FileAdder::globalObject())
        .field<&Request::files>("files", {})
        .field<&Request::source>("source", FileAdder::Asrc(0))
        .field<&Request::contexts>("contexts", {});
}

ClassTable addMediaFilesResult()
{
    using Result = FileAdder::AddMediaFilesResult;
    return ClassOf<Result>("FileAdder::AddMediaFilesResult",
                           [](void* memory) { ::new (memory) Result(FileAdder::AddedResult(0), {}); })
        .field<&Result::sender>("sender", FileAdder::globalObject())
        .field<&Result::result>("result", FileAdder::AddedResult(0))
        .field<&Result::files>("files", {});
}

ClassTable addFilesToTableRequest()
{
    using Request = ResourceTable::AddFilesToTableRequest;
    return ClassOf<Request>("ResourceTable::AddFilesToTableRequest",
                            [](void* memory) { ::new (memory) Request(nullptr, {}); })
        .field<&Request::sender>("sender", nullptr)
        .field<&Request::files>("files", {});
}

ClassTable inputDataCheckRequest()
{
    using Request = ClipSynchronization::Details::InputDataCheckRequest;
    return ClassOf<Request>("ClipSynchronization::Details::InputDataCheckRequest",
                            [](void* memory) { ::new (memory) Request(nullptr, nullptr); })
        .field<&Request::sender>("sender", nullptr)
        .field<&Request::clips>("clips", nullptr);
}

ClassTable inputDataCheckNotification()
{
    using Answer = ClipSynchronization::Details::InputDataCheckNotification;
    return ClassOf<Answer>("ClipSynchronization::Details::InputDataCheckNotification",
                           [](void* memory) { ::new (memory) Answer(nullptr, false); })
        .field<&Answer::sender>("sender", nullptr)
        .field<&Answer::result>("result", false);
}

ClassTable isAvailableTrackingRequest()
{
    using Request = MotionTracking::Details::IsAvailableTrackingRequest;
    return ClassOf<Request>("MotionTracking::Details::IsAvailableTrackingRequest",
                            [](void* memory) { ::new (memory) Request(nullptr, ""); })
        .field<&Request::sender>("sender", nullptr)
        .field<&Request::id>("id", "");
}

ClassTable isAvailableTrackingNotification()
{
    using Answer = MotionTracking::Details::IsAvailableTrackingNotification;
    return ClassOf<Answer>("MotionTracking::Details::IsAvailableTrackingNotification",
                           [](void* memory) { ::new (memory) Answer(nullptr, false); })
        .field<&Answer::sender>("sender", nullptr)
        .field<&Answer::available>("available", false);
}

ClassTable loadTrackingNotification()
{
    using Answer = MotionTracking::Details::LoadTrackingNotification;
    return ClassOf<Answer>("MotionTracking::Details::LoadTrackingNotification",
                           [](void* memory) { ::new (memory) Answer(nullptr, nullptr); })
        .field<&Answer::sender>("sender", nullptr)
        .field<&Answer::data>("data", nullptr);
}

ClassTable trackingHelper()
{
    using MotionTracking::Helper;
    return ClassOf<Helper>("MotionTracking::Helper")
        .field<&Helper::data>("data", nullptr)
        .field<&Helper::available>("available", false);
}

template <class Message>
ClassTable importStateRequest(const char* name)
{
    return ClassOf<Message>(name, [](void* memory) { ::new (memory) Message(nullptr, nullptr); })
        .template field<&Message::sender>("sender", nullptr)
        .template field<&Message::object>("object", nullptr);
}

ClassTable acquireStateNotification()
{
    using Answer = Import::Details::AcquireStateNotification;
    return ClassOf<Answer>("Import::Details::AcquireStateNotification",
                           [](void* memory) { ::new (memory) Answer(nullptr, nullptr); })
        .field<&Answer::sender>("sender", nullptr)
        .field<&Answer::state>("state", nullptr);
}

ClassTable stateAcquier()
{
    using Import::StateAcquier;
    return ClassOf<StateAcquier>("Import::StateAcquier").field<&StateAcquier::state>("state", nullptr);
}

ClassTable getPackagesRequest()
{
    using Request = Package::GetPackagesRequest;
    return ClassOf<Request>("Package::GetPackagesRequest").field<&Request::sender>("sender", nullptr);
}

ClassTable getPackagesNotification()
{
    using Answer = Package::GetPackagesNotification;
    return ClassOf<Answer>("Package::GetPackagesNotification",
                           [](void* memory) { ::new (memory) Answer(nullptr, {}, {}); })
        .field<&Answer::sender>("sender", nullptr)
        .field<&Answer::appId2directory>("appId2directory", {})
        .field<&Answer::reservedTexts>("reservedTexts", {});
}

ClassTable packageFetcher()
{
    using Package::PackageFetcher;
    return ClassOf<PackageFetcher>("Package::PackageFetcher")
        .field<&PackageFetcher::reservedTexts>("reservedTexts", {})
        .field<&PackageFetcher::appId2directory>("appId2directory", {});
}

ClassTable createLutNotification()
{
    using Answer = UserBlob::Details::CreateLutNotification;
    return ClassOf<Answer>("UserBlob::Details::CreateLutNotification",
                           [](void* memory) { ::new (memory) Answer(nullptr, nullptr); })
        .field<&Answer::sender>("sender", nullptr)
        .field<&Answer::result>("result", nullptr);
}

ClassTable getUserBlobsNotification()
{
    using Answer = UserBlob::Details::GetUserBlobsNotification;
    return ClassOf<Answer>("UserBlob::Details::GetUserBlobsNotification",
                           [](void* memory) { ::new (memory) Answer(nullptr, {}); })
        .field<&Answer::sender>("sender", nullptr)
        .field<&Answer::registeredBlobId2Path>("registeredBlobId2Path", {});
}

template <class Message>
ClassTable bareMessage(const char* name)
{
    return ClassOf<Message>(name, [](void* memory) { ::new (memory) Message(nullptr); })
        .template field<&Message::sender>("sender", nullptr);
}

} // namespace

std::vector<ClassTable> messageClasses()
{
    return {timelineContext(),
            resourceTableContext(),
            addMediaFiles(),
            addMediaFilesResult(),
            addFilesToTableRequest(),
            inputDataCheckRequest(),
            inputDataCheckNotification(),
            isAvailableTrackingRequest(),
            isAvailableTrackingNotification(),
            loadTrackingNotification(),
            trackingHelper(),
            importStateRequest<Import::Details::AcquireState>("Import::Details::AcquireState"),
            importStateRequest<Import::Details::ReleaseState>("Import::Details::ReleaseState"),
            acquireStateNotification(),
            stateAcquier(),
            getPackagesRequest(),
            getPackagesNotification(),
            packageFetcher(),
            createLutNotification(),
            getUserBlobsNotification(),
            bareMessage<UserBlob::Details::GetUserBlobsRequest>("UserBlob::Details::GetUserBlobsRequest"),
            bareMessage<ProjectExtraInfo::ProjectContentLoaded>("ProjectExtraInfo::ProjectContentLoaded"),
            bareMessage<ProjectExtraInfo::ProjectContentSaved>("ProjectExtraInfo::ProjectContentSaved")};
}

} // namespace FieldTests
