// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/library/Project.h>

#include <QString>
#include <QStringList>

#include <map>
#include <memory>
#include <vector>

namespace Host {

/// The module that holds the data of trackings, and answers whether there is data of one: with the data by
/// LoadTrackingNotification first, then with IsAvailableTrackingNotification. There is one in a process.
///
/// When a project has been read it takes the trackings beside it in place of those that it has, and when one
/// has been written it writes them there: a folder of Json documents, one a tracking. Each file is replaced
/// as a whole. Data that was handed out stays as it is.
class TrackingStore : private PubSub::Subscriber<MotionTracking::Details::IsAvailableTrackingRequest,
                                                 ProjectExtraInfo::ProjectContentLoaded,
                                                 ProjectExtraInfo::ProjectContentSaved>
{
public:
    using Data = MotionTracking::Data;

    /// A file that holds no tracking: damaged, or not the one that its name says.
    struct Damage
    {
        QString path;
        QString reason;
    };

    TrackingStore();
    TrackingStore(const TrackingStore&) = delete;
    ~TrackingStore() override;

    /// Takes the place of what has the same identifier.
    void put(const Data& tracking);
    void remove(const QString& id);
    /// Null if there is none.
    std::shared_ptr<const Data> find(const QString& id) const;
    QStringList ids() const;

    /// Takes what is in the folder in place of what there is; a folder that is missing is an empty one. Files
    /// that cannot be read are in damages(), and their trackings are lost.
    void load(const QString& folder);
    /// Makes the folder if there is something to put in it. Files of trackings that were removed go; other
    /// files, and damaged ones that nothing has replaced, stay. Throws Document::Error.
    void save(const QString& folder);
    const std::vector<Damage>& damages() const { return m_damages; }

    /// Where the trackings of a project are.
    static QString folderOf(const QString& projectPath);
    /// The name of a tracking's file: another one for every identifier, also where file names know no case,
    /// and never longer than 120 characters.
    static QString fileNameOf(const QString& id);

private:
    void notify(const MotionTracking::Details::IsAvailableTrackingRequest& request) override;
    void notify(const ProjectExtraInfo::ProjectContentLoaded& message) override;
    void notify(const ProjectExtraInfo::ProjectContentSaved& message) override;

    void loadFile(const QString& path);
    bool isDamaged(const QString& path) const;

    std::map<QString, std::shared_ptr<const Data>> m_trackings;
    std::vector<Damage> m_damages;
};

} // namespace Host
