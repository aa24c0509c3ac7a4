// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

namespace Timeline {

struct Object;

/// A named position.
struct EDITORMODEL_EXPORT Label : public virtual PubSub::Object, public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Label)

public:
    /// Not owned.
    const Timeline::Object* timeline = nullptr;
    /// In a time that the modules agree on: the model stores and compares it, no more.
    MTime position;
    QString name;

    Label() = default;
    Label(const Label&) = default;
    Label(Label&&) = default;
    Label& operator=(const Label&) = default;
    Label& operator=(Label&&) = default;
    ~Label() override;

    Label* setPosition(MTime newPosition);
    Label* setName(const QString& newName);
};

/// All fields are compared, the timeline by its address.
EDITORMODEL_EXPORT bool operator==(const Label& a, const Label& b);

} // namespace Timeline

EDITORMODEL_ARCHIVE_NAME(Timeline::Label, "Timeline::Label")
