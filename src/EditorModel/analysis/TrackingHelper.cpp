// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/TrackingHelper.h>

#include <QScopeGuard>

#include <utility>

namespace MotionTracking {
namespace Details {

LoadTrackingNotification::LoadTrackingNotification(const MotionTracking::Data* about,
                                                   std::shared_ptr<const MotionTracking::Data> loaded)
    : Notification(about), data(std::move(loaded))
{}

LoadTrackingNotification::~LoadTrackingNotification() = default;

} // namespace Details

Helper::~Helper() = default;

bool Helper::isAvailable(const QString& id)
{
    const Data sender;
    subscribe(&sender);
    const auto leave = qScopeGuard([&] { unsubscribe(&sender); });
    PubSub::publish(Details::IsAvailableTrackingRequest(&sender, id));
    return available;
}

void Helper::notify(const Details::IsAvailableTrackingNotification& answer)
{
    available = answer.available;
}

void Helper::notify(const Details::LoadTrackingNotification& answer)
{
    data = answer.data;
}

} // namespace MotionTracking
