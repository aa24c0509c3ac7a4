// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>

#include <set>

namespace Timeline {
struct Clip;
}

namespace ClipSynchronization {

/// The sender of the question below and of its answer. It holds nothing: its identity is its use.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    ~Object() override;
};

namespace Details {

/// Asks whether the clips can be synchronized. Answered, before the publication ends, by an
/// InputDataCheckNotification with the same sender.
class EDITORMODEL_EXPORT InputDataCheckRequest : public ::Message::Types::Request<ClipSynchronization::Object>
{
public:
    InputDataCheckRequest(const ClipSynchronization::Object* about,
                          const std::set<const Timeline::Clip*>* toCheck)
        : Request(about), clips(toCheck)
    {}

    /// Lives only until the publication ends.
    const std::set<const Timeline::Clip*>* clips;
};

class EDITORMODEL_EXPORT InputDataCheckNotification
    : public ::Message::Types::Notification<ClipSynchronization::Object>
{
public:
    InputDataCheckNotification(const ClipSynchronization::Object* about, bool answer)
        : Notification(about), result(answer)
    {}

    bool result;
};

} // namespace Details

/// Asks the synchronizing module whether the clips can be synchronized, whatever they are and however
/// many. False if nobody answers; where several do, the last one decides.
EDITORMODEL_EXPORT bool canSynchronize(const std::set<const Timeline::Clip*>& clips);

} // namespace ClipSynchronization
