// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QString>

namespace Host {

/// Keeps the trackings of a project that another one is to replace. Saving a project drops what it doesn't
/// name, and the backup of the replaced one may need it.
class ReplacedTrackings
{
public:
    /// Sets the folder of trackings aside, if there is something in it, until settle(): it is named
    /// "trackings-replaced", with a number behind it if there is one already. An empty name is no folder.
    /// Throws Refusal.
    explicit ReplacedTrackings(const QString& folder);
    ReplacedTrackings(const ReplacedTrackings&) = delete;
    ReplacedTrackings& operator=(const ReplacedTrackings&) = delete;
    /// Without settle() the folder gets its name back, unless there is a new one.
    ~ReplacedTrackings();

    /// To be called when the new trackings stand in the folder. Where every file stands there as it was
    /// before, the old ones go. Otherwise they stay, and this is where; empty if there are none.
    QString settle();

private:
    const QString m_folder;
    /// Empty where nothing is set aside.
    QString m_aside;
};

} // namespace Host
