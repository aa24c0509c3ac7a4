// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/PackageFetcher.h>

#include <functional>
#include <utility>
#include <vector>

namespace LibraryTests {

/// A module that knows where packs lie, and tells whoever asks.
class PackModule : public PubSub::Subscriber<Package::GetPackagesRequest>
{
public:
    using Directories = QMap<QString, QString>;

    explicit PackModule(Directories directories_ = {}, QSet<QString> texts_ = {})
        : directories(std::move(directories_)), texts(std::move(texts_))
    {
        subscribeAll<Package::Object>();
    }

    Directories directories;
    QSet<QString> texts;
    /// One for each request.
    std::vector<const Package::Object*> senders;
    std::function<void()> beforeAnswering;
    /// Answers come in the name of this package.
    const Package::Object* self = nullptr;

private:
    void notify(const Package::GetPackagesRequest& request) override
    {
        senders.push_back(request.sender);
        if (beforeAnswering)
            std::exchange(beforeAnswering, nullptr)();
        PubSub::publish(Package::GetPackagesNotification(self, directories, texts));
    }
};

} // namespace LibraryTests
