// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

namespace Resource {

/// What is known of the file behind a resource.
class EDITORMODEL_EXPORT FileInfo : public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(FileInfo)

public:
    QString path;
    /// The number of the track within the file.
    int track = 0;
    MTime duration;

    FileInfo() = default;
    FileInfo(const FileInfo&) = default;
    FileInfo(FileInfo&&) = default;
    FileInfo& operator=(const FileInfo&) = default;
    FileInfo& operator=(FileInfo&&) = default;
    ~FileInfo() override;
};

EDITORMODEL_EXPORT bool operator==(const FileInfo& a, const FileInfo& b);

/// How a resource behaves in time.
class EDITORMODEL_EXPORT Timing : public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Timing)

public:
    /// What getTimings() makes of it. Other values are reached by a cast and leave a position as it is.
    enum Mode : int
    {
        Described = 0, ///< the engine's describer decides
        Stretched = 1, ///< one pass of the resource fills the range
        Looped = 3,    ///< the resource repeats without end
    };

    Mode mode = Described;
    /// This and the two below are stored and compared; getTimings() doesn't read them.
    MTime intro;
    MTime outro;
    int loopMinCount = 0;

    Timing() = default;
    Timing(const Timing&) = default;
    Timing(Timing&&) = default;
    Timing& operator=(const Timing&) = default;
    Timing& operator=(Timing&&) = default;
    ~Timing() override;
};

EDITORMODEL_EXPORT bool operator==(const Timing& a, const Timing& b);

/// A position within a resource, and the length over which positions go.
struct ResourceTiming
{
    MTime position;
    MTime duration;

    constexpr ResourceTiming(MTime position_, MTime duration_) : position(position_), duration(duration_) {}
};

/// Where in a resource a position of a clip falls. `rangeBegin` and `rangeEnd` bound the stretch that is
/// mapped, in the time of `position`, which may lie outside of it; `resourceDuration` is the length of one
/// pass. Both results are zero where the ends of the range are equal or `resourceDuration` isn't positive;
/// otherwise the engine's describer is asked for the resource's own timing, whatever the mode. The results by
/// the mode of `timing`, position first:
///
/// - Described: `position` and 0 where the describer's own mode is that as well, else
///   `position - rangeBegin` and `rangeEnd - rangeBegin`
/// - Stretched: the part of the range that has passed, of `resourceDuration`, rounded; `resourceDuration`
/// - Looped: `position` modulo `resourceDuration`, never negative; `resourceDuration`
/// - any other: `position` and `resourceDuration`
EDITORMODEL_EXPORT ResourceTiming getTimings(MTime position, MTime resourceDuration, MTime rangeBegin,
                                             MTime rangeEnd, const ResourceRef& resource,
                                             const Timing& timing);

} // namespace Resource

EDITORMODEL_ARCHIVE_NAME(Resource::FileInfo, "Resource::FileInfo")
EDITORMODEL_ARCHIVE_NAME(Resource::Timing, "Resource::Timing")
