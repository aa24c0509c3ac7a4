// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

namespace Timeline {

struct Clip;

/// That a clip, the slave, depends on another one. The timeline holds the link under the slave.
struct EDITORMODEL_EXPORT Link : public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Link)

public:
    /// Not owned.
    const Timeline::Clip* master = nullptr;
    /// How far the slave is from its master, as the modules measure it: the model stores and compares it, no
    /// more.
    MTime offset;

    /// No link yet, for one that is read.
    Link() = default;
    Link(const Timeline::Clip* master_, MTime offset_);
    Link(const Link&) = default;
    Link(Link&&) = default;
    Link& operator=(const Link&) = default;
    Link& operator=(Link&&) = default;
    ~Link() override;
};

EDITORMODEL_EXPORT bool operator==(const Link& a, const Link& b);

} // namespace Timeline

EDITORMODEL_ARCHIVE_NAME(Timeline::Link, "Timeline::Link")
