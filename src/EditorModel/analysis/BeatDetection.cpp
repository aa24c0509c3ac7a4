// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/BeatDetection.h>

#include <EditorModel/persistence/Fields.h>

namespace BeatDetection {

Object* Object::setInterval(MTime newInterval)
{
    interval = newInterval;
    return this;
}

Object* Object::setBeats(const std::map<long long, double>& newBeats)
{
    beats = newBeats;
    return this;
}

void fields(Serialize::Fields& f, Object& object)
{
    f("interval", object.interval)("beats", object.beats);
}

} // namespace BeatDetection

EDITORMODEL_PERSISTENT_CLASS(BeatDetection::Object)
