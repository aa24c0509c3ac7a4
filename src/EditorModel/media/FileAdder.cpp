// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/FileAdder.h>

#include <QScopeGuard>

namespace FileAdder {

Object::~Object() = default;

const FileAdder::Object* globalObject()
{
    static const FileAdder::Object object;
    return &object;
}

TimelineContext::TimelineContext(const Timeline::Object* timeline_) : timeline(timeline_) {}

TimelineContext::TimelineContext(const Timeline::Object* timeline_, const Timeline::Track* track_,
                                 int trackLevel_, MTime position_)
    : timeline(timeline_), track(track_), position(position_), trackLevel(trackLevel_)
{}

TimelineContext::TimelineContext(const Timeline::Object* timeline_, const Timeline::Track* track_,
                                 MTime position_, Timeline::Clip::ClipType clipType_, int trackLevel_,
                                 bool flag_)
    : timeline(timeline_),
      track(track_),
      position(position_),
      clipType(clipType_),
      trackLevel(trackLevel_),
      flag(flag_)
{}

TimelineContext::TimelineContext(const Timeline::Object* timeline_, Timeline::ClipBuildingStrategy strategy)
    : timeline(timeline_), clipBuildingStrategy(strategy)
{}

ResourceTableContext::ResourceTableContext(const ResourceTable::Object* table_) : table(table_) {}

Contexts& Contexts::setContext(const FileAdder::TimelineContext& context)
{
    timeline = context;
    return *this;
}

Contexts& Contexts::setContext(const FileAdder::UserCollectionContext& context)
{
    userCollection = context;
    return *this;
}

Contexts& Contexts::setContext(const FileAdder::ResourceTableContext& context)
{
    resourceTable = context;
    return *this;
}

AddMediaFiles::AddMediaFiles(const QStringList& files_, FileAdder::Asrc source_,
                             const FileAdder::Contexts& contexts_)
    : Request(globalObject()), files(files_), source(source_), contexts(contexts_)
{}

AddMediaFiles::~AddMediaFiles() = default;

AddMediaFilesResult::AddMediaFilesResult(FileAdder::AddedResult result_, const QStringList& files_)
    : Notification(globalObject()), result(result_), files(files_)
{}

AddMediaFilesResult::~AddMediaFilesResult() = default;

Helper::~Helper() = default;

FileAdder::AddedResult Helper::addMediaFiles(const QStringList& files, FileAdder::Asrc source,
                                             const FileAdder::Contexts& contexts)
{
    subscribe(globalObject());
    const auto leave = qScopeGuard([this] { unsubscribe(globalObject()); });
    PubSub::publish(AddMediaFiles(files, source, contexts));
    return result;
}

void Helper::notify(const FileAdder::AddMediaFilesResult& answer)
{
    result = answer.result;
}

FileAdder::AddedResult addMediaFiles(const QStringList& files, FileAdder::Asrc source,
                                     const FileAdder::Contexts& contexts)
{
    Helper helper;
    helper.result = NotAnswered;
    return helper.addMediaFiles(files, source, contexts);
}

} // namespace FileAdder
