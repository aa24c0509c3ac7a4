// SPDX-License-Identifier: Apache-2.0
#pragma once

// Everything but <EditorModel/persistence/Json.h> and <EditorModel/persistence/ObjectTracker.h>, which bring
// the headers of the archives' libraries along.

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>
#include <EditorModel/bus/Preview.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/bus/TypedView.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/effects/Animation.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/effects/PanAndZoom.h>
#include <EditorModel/effects/Transformation.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/media/Audio.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/FileAnalyzer.h>
#include <EditorModel/media/FileTarget.h>
#include <EditorModel/media/Media.h>
#include <EditorModel/media/Object.h>
#include <EditorModel/media/Resource.h>
#include <EditorModel/media/ResourceHooks.h>
#include <EditorModel/media/ResourceInfo.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/media/Video.h>
#include <EditorModel/media/Views.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/persistence/Serializer.h>
#include <EditorModel/persistence/Type.h>
#include <EditorModel/persistence/streams/Streams.h>
#include <EditorModel/services/AppEvents.h>
#include <EditorModel/services/Command.h>
#include <EditorModel/services/Report.h>
#include <EditorModel/services/Statistics.h>
#include <EditorModel/services/Task.h>
#include <EditorModel/services/Tutorial.h>
#include <EditorModel/types/AvTime.h>
#include <EditorModel/types/Decibel.h>
#include <EditorModel/types/FuzzyCompare.h>
#include <EditorModel/types/Image.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Norvel.h>
#include <EditorModel/types/Pen.h>
#include <EditorModel/types/Range.h>
#include <EditorModel/types/Rect.h>
#include <EditorModel/types/Transform.h>
#include <EditorModel/types/UniqueId.h>
