// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/PackageFetcher.h>

namespace Package {

PackageFetcher::PackageFetcher()
{
    subscribeAll<Package::Object>();
    PubSub::publish(GetPackagesRequest());
    unsubscribeAll<Package::Object>();
}

void PackageFetcher::notify(const GetPackagesNotification& message)
{
    reservedTexts = message.reservedTexts;
    appId2directory = message.appId2directory;
}

} // namespace Package
