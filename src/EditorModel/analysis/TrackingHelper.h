// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/analysis/TrackingData.h>
#include <EditorModel/bus/Messages.h>

#include <QString>

#include <memory>

namespace MotionTracking {

namespace Details {

/// Asks whether there is data of a tracking. Answered, before the publication ends, by an
/// IsAvailableTrackingNotification with the same sender.
class EDITORMODEL_EXPORT IsAvailableTrackingRequest : public ::Message::Types::Request<MotionTracking::Data>
{
public:
    IsAvailableTrackingRequest(const MotionTracking::Data* about, const QString& id_)
        : Request(about), id(id_)
    {}

    /// Of the tracking that is asked about; the sender's own doesn't count.
    QString id;
};

class EDITORMODEL_EXPORT IsAvailableTrackingNotification
    : public ::Message::Types::Notification<MotionTracking::Data>
{
public:
    IsAvailableTrackingNotification(const MotionTracking::Data* about, bool answer)
        : Notification(about), available(answer)
    {}

    bool available;
};

class EDITORMODEL_EXPORT LoadTrackingNotification
    : public ::Message::Types::Notification<MotionTracking::Data>
{
public:
    LoadTrackingNotification(const MotionTracking::Data* about,
                             std::shared_ptr<const MotionTracking::Data> loaded);
    ~LoadTrackingNotification() override;

    std::shared_ptr<const MotionTracking::Data> data;
};

} // namespace Details

/// Asks the holder of the trackings' data, in the name of a sender of its own. It is made anew for each
/// question: the last answer stays.
class EDITORMODEL_EXPORT Helper
    : public PubSub::Subscriber<Details::IsAvailableTrackingNotification, Details::LoadTrackingNotification>
{
public:
    /// The data that was loaded last, or null.
    std::shared_ptr<const MotionTracking::Data> data;
    bool available = false;

    ~Helper() override;

    /// Whether there is data of the tracking; false if nobody answers.
    bool isAvailable(const QString& id);

private:
    void notify(const Details::IsAvailableTrackingNotification& answer) override;
    void notify(const Details::LoadTrackingNotification& answer) override;
};

} // namespace MotionTracking
