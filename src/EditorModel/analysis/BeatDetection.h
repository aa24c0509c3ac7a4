// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <map>

namespace BeatDetection {

/// The beats that were found in a clip's sound.
class EDITORMODEL_EXPORT Object : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// Its meaning is a matter of the analysing module: the model stores it and never reads it.
    MTime interval = 2000;
    /// The units of keys and values are a matter of the analysing module.
    std::map<long long, double> beats;

    Object* setInterval(MTime newInterval);
    Object* setBeats(const std::map<long long, double>& newBeats);
};

} // namespace BeatDetection

EDITORMODEL_ARCHIVE_NAME(BeatDetection::Object, "BeatDetection::Object")
